// SPDX-License-Identifier: Apache-2.0
//
// What the programs say of themselves. Build systems read it: the first line of the version tells
// which words are understood, and the help which letters there are.
#pragma once

#include <string>
#include <string_view>

namespace quarn_ar {

enum class Program { Ar, Ranlib };

// Which of the two the program is, by the name that it was called by: "ranlib" at its end, as the
// names of cross tools begin with their target.
[[nodiscard]] Program programNamed(std::string_view toolName);

[[nodiscard]] std::string versionText(Program program);
[[nodiscard]] std::string helpText(Program program, std::string_view toolName);

} // namespace quarn_ar
