// SPDX-License-Identifier: Apache-2.0
//
// Symbols that are told by their names, as Symbol::Class has them. A null name is that of none.
// Mapping symbols ($a, $d, $t, $x) say what kind of bytes begin at a place of a section of code,
// and tag symbols ($b, $f, $p, $v) are a class of their own; neither is a name that a program has
// chosen. The model's symbols and the tables ask here, so that both roads tell the same.
#pragma once

#include <string_view>

namespace elfext {

// Whether the name starts with a dollar and one of the letters.
[[nodiscard]] inline bool startsWithDollar(const char* name, std::string_view letters) {
  return name != nullptr && name[0] == '$' && letters.find(name[1]) != std::string_view::npos;
}

[[nodiscard]] inline bool isMappingSymbolName(const char* name) {
  return startsWithDollar(name, "adtx") && (name[2] == '\0' || name[2] == '.');
}

[[nodiscard]] inline bool isTagSymbolName(const char* name) {
  return startsWithDollar(name, "bfpv");
}

} // namespace elfext
