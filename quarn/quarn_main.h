// SPDX-License-Identifier: Apache-2.0
//
// The driver's work, between the start of the process and its end.
#pragma once

#include "alloclib/interface/region_general.h"
#include "support/interface/host.h"

namespace quarn {

// The work of one run: reads the command line, opens one archive, does one action, and writes the
// archive back if nothing went wrong. Whether anything did is in the message library's counters.
// `toolName` is the name that the user called the tool by; `memory` outlives the run.
void quarnMain(int argc, const char* const* argv, const char* toolName, support::Host& host,
               alloclib::RegionGeneral& memory);

} // namespace quarn
