// SPDX-License-Identifier: Apache-2.0
//
// What the reports on objects show of each: sizes in the five columns that users know, and the
// sections that the entry point is in.
#pragma once

#include "elfext/interface/object_outline.h"
#include "elfext/interface/sizes_statistics.h"

#include <cstdint>
#include <vector>

namespace quarn {

// In bytes.
struct ObjectSizes {
  uint64_t code = 0; // with literal pools
  uint64_t readOnlyData = 0;
  uint64_t readWriteData = 0;
  uint64_t zeroInitialised = 0;
  uint64_t debug = 0;
};

[[nodiscard]] ObjectSizes columnsOf(const elfext::SizesStatistics& totals);

// The names, empty for a section without one. Texts live as long as the outline's; a hostile object
// lets many of them share their bytes.
[[nodiscard]] std::vector<const char*> entrySectionsOf(const elfext::ObjectOutline& outline);

} // namespace quarn
