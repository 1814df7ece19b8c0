// SPDX-License-Identifier: Apache-2.0
//
// Which texts are equal, where thousands of them may be ends of one long text, as names in a string
// table are. To compare or to hash each of them would take the sum of their lengths, and a megabyte
// of table gives half a terabyte of that. Here each byte is looked at a few times, however many
// texts it belongs to.
//
// Texts with a common end lie within the longest of them, the whole. The wholes are sorted by what
// they are backwards, so that those with an end in common stand together; and of how many bytes
// this end is, is known for neighbours. A text of n bytes gets the number of the first whole from
// which on all have the last n bytes in common.

#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <numeric>
#include <span>
#include <string_view>
#include <vector>

namespace support {

namespace numbering {

/// Length of the end that both have in common.
template <class Fold>
[[nodiscard]] size_t commonEnd(std::string_view left, std::string_view right, Fold fold) {
  const size_t most = std::min(left.size(), right.size());
  size_t count = 0;
  while (count < most &&
         fold(left[left.size() - 1 - count]) == fold(right[right.size() - 1 - count]))
    ++count;
  return count;
}

/// Whether the left text comes before the right one, both read backwards.
template <class Fold>
[[nodiscard]] bool isBefore(std::string_view left, std::string_view right, Fold fold) {
  const size_t common = commonEnd(left, right, fold);
  if (common == left.size() || common == right.size()) return left.size() < right.size();
  return fold(left[left.size() - 1 - common]) < fold(right[right.size() - 1 - common]);
}

/// A whole text, and which of the texts are ends of it.
struct Whole {
  std::string_view text;
  std::span<const size_t> ends;
};

/// The texts by where they end; `order` becomes that order.
[[nodiscard]] inline std::vector<Whole> findWholes(std::span<const std::string_view> texts,
                                                   std::vector<size_t>& order) {
  const auto endOf = [texts](size_t index) { return texts[index].data() + texts[index].size(); };
  order.resize(texts.size());
  std::iota(order.begin(), order.end(), size_t{0});
  std::sort(order.begin(), order.end(), [&](size_t left, size_t right) {
    if (endOf(left) != endOf(right)) return std::less<>()(endOf(left), endOf(right));
    return texts[left].size() > texts[right].size();
  });
  std::vector<Whole> wholes;
  for (size_t first = 0, last = 0; first < order.size(); first = last) {
    while (last < order.size() && endOf(order[last]) == endOf(order[first]))
      ++last;
    wholes.push_back({texts[order[first]], std::span(order).subspan(first, last - first)});
  }
  return wholes;
}

/// From whole `first` on, up to the one at hand, all have the last `size` bytes in common.
struct CommonEnd {
  size_t size;
  size_t first;
};

/// Goes on to the next whole, which has `common` bytes at its end in common with the one before.
/// The list is by size, and begins with the empty end.
inline void stepTo(size_t number, size_t size, size_t common, std::vector<CommonEnd>& ends) {
  size_t first = number;
  while (ends.back().size > common) {
    first = ends.back().first;
    ends.pop_back();
  }
  if (ends.back().size < common) ends.push_back({common, first});
  if (ends.back().size < size) ends.push_back({size, number});
}

/// Of the text of that size at the end of the whole at hand.
inline uint64_t numberOf(size_t size, const std::vector<CommonEnd>& ends) {
  const auto end =
      std::lower_bound(ends.begin(), ends.end(), size,
                       [](const CommonEnd& each, size_t wanted) { return each.size < wanted; });
  return uint64_t{end->first} << 32 | size;
}

} // namespace numbering

/// What is one number for all texts that are equal, but for what `fold` makes equal of characters,
/// and another one for any other text. No text may be longer than 4 GiB.
template <class Fold>
[[nodiscard]] std::vector<uint64_t> numberTexts(std::span<const std::string_view> texts,
                                                Fold fold) {
  using namespace numbering;
  std::vector<size_t> order;
  std::vector<Whole> wholes = findWholes(texts, order);
  std::sort(wholes.begin(), wholes.end(), [fold](const Whole& left, const Whole& right) {
    return isBefore(left.text, right.text, fold);
  });
  std::vector<uint64_t> numbers(texts.size());
  std::vector<CommonEnd> ends = {{0, 0}};
  for (size_t i = 0; i < wholes.size(); ++i) {
    const std::string_view text = wholes[i].text;
    stepTo(i, text.size(), i == 0 ? 0 : commonEnd(wholes[i - 1].text, text, fold), ends);
    for (const size_t index : wholes[i].ends)
      numbers[index] = numberOf(texts[index].size(), ends);
  }
  return numbers;
}

/// Of each number, whether it stands for the first time there.
[[nodiscard]] inline std::vector<bool> findFirst(std::span<const uint64_t> numbers) {
  std::vector<size_t> order(numbers.size());
  std::iota(order.begin(), order.end(), size_t{0});
  std::stable_sort(order.begin(), order.end(),
                   [numbers](size_t left, size_t right) { return numbers[left] < numbers[right]; });
  std::vector<bool> isFirst(numbers.size());
  for (size_t i = 0; i < order.size(); ++i)
    isFirst[order[i]] = i == 0 || numbers[order[i]] != numbers[order[i - 1]];
  return isFirst;
}

} // namespace support
