// SPDX-License-Identifier: Apache-2.0
//
// The step from what was written on the command line to what the run is to do.
#pragma once

#include "quarn/settings.h"

namespace tabledrivenparser {
class Parser;
}

namespace quarn {

// Turns the parsed values into the settings of the run, in a fixed order: that order, and not the
// one on the command line, decides among options that contradict each other. Prints what
// --show_cmdline and --version_number ask for; the latter ends the process.
void processOptions(const tabledrivenparser::Parser& parser, const char* toolName,
                    Settings& settings);

} // namespace quarn
