// SPDX-License-Identifier: Apache-2.0
//
// The order of member names: byte by byte as unsigned values, with ASCII letters in lower case.
#pragma once

#include "support/interface/letters.h"

#include <algorithm>
#include <cstddef>
#include <string_view>

namespace arlib {

[[nodiscard]] constexpr unsigned char foldCase(char character) {
  return static_cast<unsigned char>(support::lowered(character));
}

/// Below, above or equal to 0.
[[nodiscard]] constexpr int compareIgnoringCase(std::string_view left, std::string_view right) {
  const size_t common = std::min(left.size(), right.size());
  for (size_t i = 0; i < common; ++i) {
    const int difference = foldCase(left[i]) - foldCase(right[i]);
    if (difference != 0) return difference;
  }
  if (left.size() == right.size()) return 0;
  return left.size() < right.size() ? -1 : 1;
}

} // namespace arlib
