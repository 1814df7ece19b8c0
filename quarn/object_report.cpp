// SPDX-License-Identifier: Apache-2.0
//
// The reports of sizes and entry points. They always cover the whole archive, whatever the words
// of the command line say.
#include "quarn/actions.h"

#include "quarn/reporting.h"

#include <cstdint>

namespace quarn {

namespace {

// In bytes.
struct ObjectSizes {
  uint32_t code = 0;
  uint32_t readOnlyData = 0;
  uint32_t readWriteData = 0;
  uint32_t zeroInitialised = 0;
  uint32_t debug = 0;
};

void printSizes(const ObjectSizes& sizes, std::string_view name) {
  messages::listingMessage(messages::SizesRow, sizes.code, sizes.readOnlyData, sizes.readWriteData,
                           sizes.zeroInitialised, sizes.debug, name);
}

} // namespace

void reportObjects(Run& run, uint32_t flags) {
  if (isMissing(run)) return;
  const ObjectSizes totals;
  if ((flags & Report_Sizes) != 0) {
    messages::listingMessage(messages::SizesHeader);
    // The row is followed by an empty line.
    printSizes(totals, "TOTAL\n");
  }
  if ((flags & Report_Entries) != 0) messages::listingMessage(messages::NoEntryPoints);
}

} // namespace quarn
