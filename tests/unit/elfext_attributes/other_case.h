// SPDX-License-Identifier: Apache-2.0
//
// Words whose letter case doesn't matter, in the other one: what is read in one case must be read
// in the other.

#pragma once

#include <cctype>
#include <string>

namespace elfext {

inline std::string inOtherCase(std::string text) {
  for (char& letter : text) {
    const auto byte = static_cast<unsigned char>(letter);
    letter = static_cast<char>(std::isupper(byte) ? std::tolower(byte) : std::toupper(byte));
  }
  return text;
}

} // namespace elfext
