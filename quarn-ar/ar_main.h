// SPDX-License-Identifier: Apache-2.0
//
// `quarn-ar` and `quarn-ranlib`: the words that build systems use, on the libraries and the road of
// `quarn`. An archive that they write has the symbol table that `quarn` gives it, minor variants
// included; it also publishes objects of all other machines, so that any library stays usable.
#pragma once

#include "alloclib/interface/region_general.h"
#include "support/interface/host.h"

namespace quarn_ar {

// The work of one run. Which of the programs it is, the name says that the user called it by.
void arMain(int argc, const char* const* argv, const char* toolName, support::Host& host,
            alloclib::RegionGeneral& memory);

} // namespace quarn_ar
