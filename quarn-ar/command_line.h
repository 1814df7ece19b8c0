// SPDX-License-Identifier: Apache-2.0
//
// The words of `ar` and `ranlib`. The first word may be letters without a dash, as build systems
// have written them for decades; all other options begin with one.
#pragma once

#include "quarn-ar/request.h"
#include "quarn-ar/usage.h"

#include <string>
#include <vector>

namespace quarn_ar {

enum class Answer {
  Refused, // after a report
  Run,
  Help,
  Version,
};

// Reads the words, response files done, into a request.
[[nodiscard]] Answer readCommandLine(Program program, const std::vector<std::string>& words,
                                     Request& request);

} // namespace quarn_ar
