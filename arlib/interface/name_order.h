// SPDX-License-Identifier: Apache-2.0
//
// The order of member names: byte by byte as unsigned values, with ASCII letters in lower case.
// What is the same as it stands is passed over fast, as names may be long.
#pragma once

#include "support/interface/letters.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

namespace arlib {

[[nodiscard]] constexpr unsigned char foldCase(char character) {
  return static_cast<unsigned char>(support::lowered(character));
}

/// Whether both have the same eight bytes there.
[[nodiscard]] inline bool hasSameWordAt(std::string_view left, std::string_view right,
                                        size_t index) {
  uint64_t leftWord = 0;
  uint64_t rightWord = 0;
  if (std::min(left.size(), right.size()) - index < sizeof leftWord) return false;
  std::memcpy(&leftWord, left.data() + index, sizeof leftWord);
  std::memcpy(&rightWord, right.data() + index, sizeof rightWord);
  return leftWord == rightWord;
}

/// Below, above or equal to 0.
[[nodiscard]] inline int compareIgnoringCase(std::string_view left, std::string_view right) {
  const size_t common = std::min(left.size(), right.size());
  for (size_t i = 0; i < common;) {
    if (hasSameWordAt(left, right, i)) {
      i += sizeof(uint64_t);
      continue;
    }
    for (const size_t end = std::min(i + sizeof(uint64_t), common); i < end; ++i) {
      const int difference = foldCase(left[i]) - foldCase(right[i]);
      if (difference != 0) return difference;
    }
  }
  if (left.size() == right.size()) return 0;
  return left.size() < right.size() ? -1 : 1;
}

} // namespace arlib
