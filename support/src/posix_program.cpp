// SPDX-License-Identifier: Apache-2.0
//
// Words are bytes here, and a name on disk is the same bytes.

#include "support/interface/program.h"

namespace support {

CommandLine getCommandLine(int argc, const char* const* argv) {
  return {argc, argv};
}

// Names have one form here: there is nothing to convert.
Host& getProgramHost() {
  return getNativeHost();
}

} // namespace support
