// SPDX-License-Identifier: Apache-2.0
#include "elfext/src/extents.h"

#include <algorithm>
#include <numeric>

namespace elfext {

namespace {

bool startsBefore(const Extent& left, const Extent& right) {
  return left.start != right.start ? left.start < right.start : left.id < right.id;
}

// Good files have their sections in the order of their offsets.
std::vector<Extent> sortedByStart(std::span<const Extent> extents) {
  std::vector<Extent> sorted(extents.begin(), extents.end());
  if (!std::is_sorted(sorted.begin(), sorted.end(), startsBefore))
    std::sort(sorted.begin(), sorted.end(), startsBefore);
  return sorted;
}

bool hasOverlap(std::span<const Extent> sorted) {
  uint64_t reached = 0;
  for (const Extent& extent : sorted) {
    if (extent.start < reached) return true;
    reached = extent.end;
  }
  return false;
}

// How many of the sorted numbers are below the limit.
size_t countBelow(const std::vector<uint64_t>& sorted, uint64_t limit) {
  return static_cast<size_t>(std::lower_bound(sorted.begin(), sorted.end(), limit) -
                             sorted.begin());
}

// The lowest value of those with a key not below a limit, over keys that are known beforehand.
class LowestFrom {
public:
  explicit LowestFrom(std::vector<uint64_t> sortedKeys)
      : m_Keys(std::move(sortedKeys)), m_Lowest(m_Keys.size() + 1, NoExtent) {}

  void add(uint64_t key, uint32_t value) {
    for (size_t i = rankFromTop(key); i < m_Lowest.size(); i += i & (0 - i))
      m_Lowest[i] = std::min(m_Lowest[i], value);
  }

  [[nodiscard]] uint32_t find(uint64_t limit) const {
    uint32_t lowest = NoExtent;
    for (size_t i = rankFromTop(limit); i > 0; i -= i & (0 - i))
      lowest = std::min(lowest, m_Lowest[i]);
    return lowest;
  }

private:
  // How many keys are not below this one.
  [[nodiscard]] size_t rankFromTop(uint64_t key) const {
    return m_Keys.size() - countBelow(m_Keys, key);
  }

  std::vector<uint64_t> m_Keys;
  // A binary indexed tree: element i has the lowest of the i & -i keys that end at rank i.
  std::vector<uint32_t> m_Lowest;
};

std::vector<uint64_t> sortedEnds(std::span<const Extent> extents) {
  std::vector<uint64_t> ends;
  ends.reserve(extents.size());
  for (const Extent& extent : extents)
    ends.push_back(extent.end);
  std::sort(ends.begin(), ends.end());
  return ends;
}

} // namespace

// An extent overlaps another exactly when more extents than itself start below its end and do not
// end at or before its start.
std::optional<std::pair<uint32_t, uint32_t>> findFirstOverlap(std::span<const Extent> extents) {
  const std::vector<Extent> sorted = sortedByStart(extents);
  if (!hasOverlap(sorted)) return std::nullopt;
  const std::vector<uint64_t> ends = sortedEnds(extents);
  std::vector<uint64_t> starts;
  starts.reserve(sorted.size());
  for (const Extent& extent : sorted)
    starts.push_back(extent.start);
  const auto overlapsAny = [&](const Extent& extent) {
    const size_t ended = static_cast<size_t>(
        std::upper_bound(ends.begin(), ends.end(), extent.start) - ends.begin());
    return countBelow(starts, extent.end) - ended > 1;
  };
  const auto first = std::find_if(extents.begin(), extents.end(), overlapsAny);
  const auto second = std::find_if(first + 1, extents.end(), [&](const Extent& other) {
    return other.start < first->end && first->start < other.end;
  });
  return std::pair(first->id, second->id);
}

// Both sides in the order of their starts: when an inner extent's turn comes, the outer ones that
// start at or before it are known, and only the ends are left to compare.
std::vector<uint32_t> findFirstHolders(std::span<const Extent> outer,
                                       std::span<const Extent> inner) {
  std::vector<uint32_t> holders(inner.size(), NoExtent);
  const std::vector<Extent> outerSorted = sortedByStart(outer);
  LowestFrom lowest(sortedEnds(outer));
  std::vector<uint32_t> order(inner.size());
  std::iota(order.begin(), order.end(), 0);
  const auto comesFirst = [&](uint32_t left, uint32_t right) {
    return inner[left].start != inner[right].start ? inner[left].start < inner[right].start
                                                   : left < right;
  };
  std::sort(order.begin(), order.end(), comesFirst);
  auto next = outerSorted.begin();
  for (const uint32_t i : order) {
    for (; next != outerSorted.end() && next->start <= inner[i].start; ++next)
      lowest.add(next->end, next->id);
    holders[i] = lowest.find(inner[i].end);
  }
  return holders;
}

} // namespace elfext
