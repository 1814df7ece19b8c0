// SPDX-License-Identifier: Apache-2.0
//
// Copies of texts that may be ends of one another, as names in a string table are: each byte is
// copied once, however many texts it belongs to. That is a matter of safety: a string table of a
// megabyte without a NUL but its last, and a symbol for each of its bytes, would otherwise come to
// half a terabyte of copies.

#pragma once

#include <algorithm>
#include <cstddef>
#include <functional>
#include <span>
#include <string_view>
#include <vector>

namespace support {

/// Views of the copies, in the order of the texts. `copy` makes the copy of one text, which lives
/// as long as the views are used.
template <class Copy>
[[nodiscard]] std::vector<std::string_view> copyShared(std::span<const char* const> texts,
                                                       Copy copy) {
  std::vector<const char*> sorted(texts.begin(), texts.end());
  std::sort(sorted.begin(), sorted.end(), std::less<>());
  // By place. A text that starts within the one before it, or at its end, is an end of that.
  std::vector<std::string_view> wholes;
  std::vector<std::string_view> copies;
  for (const char* text : sorted) {
    if (!wholes.empty() && !std::less<>()(wholes.back().data() + wholes.back().size(), text))
      continue;
    wholes.emplace_back(text);
    copies.push_back(copy(wholes.back()));
  }
  const auto startsBehind = [](const char* text, std::string_view whole) {
    return std::less<>()(text, whole.data());
  };
  std::vector<std::string_view> views;
  for (const char* text : texts) {
    const auto next = std::upper_bound(wholes.begin(), wholes.end(), text, startsBehind);
    const auto index = static_cast<size_t>(next - wholes.begin()) - 1;
    views.push_back(copies[index].substr(static_cast<size_t>(text - wholes[index].data())));
  }
  return views;
}

} // namespace support
