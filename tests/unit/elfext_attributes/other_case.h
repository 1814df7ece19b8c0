// SPDX-License-Identifier: Apache-2.0
//
// Words whose case doesn't matter, in the other one.
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
