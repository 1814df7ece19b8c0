// SPDX-License-Identifier: Apache-2.0
//
// What one run is to do: the command line as one record. Options are written as those of `quarn`.
#pragma once

#include "alloclib/interface/region_general.h"
#include "quarn/settings.h"
#include "tabledrivenparser/interface/option_table.h"

#include <span>
#include <string>
#include <vector>

namespace quarn_json {

struct Request {
  quarn::Settings settings;
  std::vector<std::string> libraries;
};

enum class Answer {
  Refused, // after a report
  Run,
  Help,
  Version,
};

// Reads the words behind the program's name. One that is no option ends the process.
[[nodiscard]] Answer readCommandLine(int argc, const char* const* argv, support::Host& host,
                                     alloclib::RegionGeneral& memory, Request& request);

// How options are written, for who compares.
[[nodiscard]] std::span<const tabledrivenparser::MatchString> getOptionRows();

} // namespace quarn_json
