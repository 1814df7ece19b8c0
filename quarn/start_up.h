// SPDX-License-Identifier: Apache-2.0
//
// The process's first and last steps: regions, messages and names are brought up here, and taken
// down again on every way out.
#pragma once

namespace alloclib {
class RegionGeneral;
}
namespace support {
class Host;
}

namespace quarn {

// The work of a program: `toolName` is the name that the user called it by; `memory` outlives the
// run. Whether anything went wrong is in the message library's counters.
using Work = void (*)(int argc, const char* const* argv, const char* toolName, support::Host& host,
                      alloclib::RegionGeneral& memory);

// Brings everything up, does the work, and ends the process. The exit status is 0 if no message
// came out at error severity or above, and 1 otherwise.
[[noreturn]] void startUp(int argc, const char* const* argv, support::Host& host, Work work);

// The ordered end of the process, from anywhere in the driver.
[[noreturn]] void shutDown(int code);

} // namespace quarn
