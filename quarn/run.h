// SPDX-License-Identifier: Apache-2.0
//
// What the actions of one run share.
#pragma once

#include "arlib/interface/archive.h"
#include "messages/interface/messages.h"
#include "quarn/settings.h"

#include <cstdint>

namespace quarn {

// What opening the archive found; hung on the archive as its client data.
struct ArchiveOpenStatus {
  bool missing = false; // the archive was not read: it is new
  int errorNumber = 0;  // why, as the host's error number; 0 when --create replaces a file
};

// Where insertions and moves go: an index in the member list, or one of these.
constexpr int32_t PositionAtEnd = -1;

struct Run {
  arlib::Archive& archive;
  const Settings& settings;
  ArchiveOpenStatus& openStatus;
  int32_t position = PositionAtEnd;
  bool isCancelled = false; // there is nothing to do: nothing is written

  [[nodiscard]] const char* getArchiveName() const { return archive.getFileName(); }
};

// Prints a line like "a - %s" on stdout, where -v asks for it.
template <class... Arguments>
void verboseMessage(const Settings& settings, messages::Key key, const Arguments&... arguments) {
  if (settings.verbose) messages::listingMessage(key, arguments...);
}

} // namespace quarn
