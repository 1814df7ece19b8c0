// SPDX-License-Identifier: Apache-2.0
//
// What counts as a letter and as white space, whatever the locale: bytes above 127 are plain
// characters. The C library's own functions would ask the locale, and may not be given a negative
// char. Option names, patterns, attribute texts and words of via files all go by these.

#pragma once

#include <cstddef>
#include <string_view>

namespace support {

/// A-Z become a-z; every other byte is itself.
[[nodiscard]] constexpr char lowered(char character) {
  return character >= 'A' && character <= 'Z' ? static_cast<char>(character - 'A' + 'a')
                                              : character;
}

[[nodiscard]] constexpr bool isLetter(char character) {
  return lowered(character) >= 'a' && lowered(character) <= 'z';
}

/// Blank, tab, line feed, vertical tab, form feed, carriage return.
[[nodiscard]] constexpr bool isWhiteSpace(char character) {
  return character == ' ' || (character >= '\t' && character <= '\r');
}

/// Over the whole of both texts, and for A-Z only.
[[nodiscard]] constexpr bool equalIgnoringCase(std::string_view left, std::string_view right) {
  if (left.size() != right.size()) return false;
  for (size_t at = 0; at < left.size(); ++at) {
    if (lowered(left[at]) != lowered(right[at])) return false;
  }
  return true;
}

} // namespace support
