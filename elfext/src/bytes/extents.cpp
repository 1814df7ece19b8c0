// SPDX-License-Identifier: Apache-2.0
//
// Overlaps and holders among many extents. The tables ask whether sections overlap in the file and
// which segment holds each section, of every object that is read; so the usual case, extents that
// ascend, must cost one pass, and the worst no more than sorting. The answers are those of trying
// all pairs in the order of their ids, since reports and models depend on which pair is named
// first.
//
// Extents come from headers that anybody may have written: they leave the image, wrap, repeat each
// other or all share one byte. Ends are already cut to the largest number by who asks.
#include "elfext/src/bytes/extents.h"

#include "elfext/src/bytes/first_holders.h"

#include <algorithm>
#include <array>
#include <iterator>

namespace elfext {

namespace {

bool startsBefore(const Extent& left, const Extent& right) {
  return left.start != right.start ? left.start < right.start : left.id < right.id;
}

// Beyond these, dealing and merging cost more than a sort does.
constexpr size_t MostRuns = 4;
constexpr size_t FewExtents = 64; // that are sorted sooner than dealt
using Runs = std::array<std::vector<Extent>, MostRuns>;

// False if there are more runs than it is worth to merge.
bool dealIntoRuns(std::span<const Extent> extents, Runs& runs) {
  for (const Extent& extent : extents) {
    const auto run = std::find_if(runs.begin(), runs.end(), [&](const std::vector<Extent>& other) {
      return other.empty() || startsBefore(other.back(), extent);
    });
    if (run == runs.end()) return false;
    // One reservation, as nearly all of them may come to lie here.
    if (run->empty()) run->reserve(extents.size());
    run->push_back(extent);
  }
  return true;
}

// Takes the runs apart.
std::vector<Extent> mergeRuns(Runs& runs) {
  std::vector<Extent> sorted;
  for (std::vector<Extent>& run : runs) {
    if (sorted.empty()) {
      sorted = std::move(run);
    } else if (!run.empty()) {
      std::vector<Extent> merged;
      merged.reserve(sorted.size() + run.size());
      std::merge(sorted.begin(), sorted.end(), run.begin(), run.end(), std::back_inserter(merged),
                 startsBefore);
      sorted = std::move(merged);
    }
  }
  return sorted;
}

// Good files have their sections in the order of their offsets, or in a few such orders that take
// turns, as code and the relocations for it do.
std::vector<Extent> sortedByStart(std::span<const Extent> extents) {
  Runs runs;
  if (extents.size() > FewExtents && dealIntoRuns(extents, runs)) return mergeRuns(runs);
  std::vector<Extent> sorted(extents.begin(), extents.end());
  std::sort(sorted.begin(), sorted.end(), startsBefore);
  return sorted;
}

// Also true of extents that are in no order.
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
  // Extents that ascend without touching, as most files have them, are done after one look.
  if (!hasOverlap(extents)) return std::nullopt;
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
    // No extent is empty, so those that end at or before this start also start below this end, and
    // the difference counts exactly those that share a byte with it: itself and the others.
    return countBelow(starts, extent.end) - ended > 1;
  };
  const auto first = std::find_if(extents.begin(), extents.end(), overlapsAny);
  // The partner comes later in the list: had it come earlier, it would have been the first itself.
  const auto second = std::find_if(first + 1, extents.end(), [&](const Extent& other) {
    return other.start < first->end && first->start < other.end;
  });
  return std::pair(first->id, second->id);
}

std::vector<uint32_t> findFirstHolders(std::span<const Extent> outer,
                                       std::span<const Extent> inner) {
  std::vector<Holder> holders;
  holders.reserve(outer.size());
  for (const Extent& extent : outer)
    holders.push_back({.start = extent.start, .size = extent.end - extent.start, .id = extent.id});
  std::vector<Guest> guests;
  guests.reserve(inner.size());
  for (const Extent& extent : inner)
    guests.push_back({.start = extent.start, .size = extent.end - extent.start});
  return findFirstHolders(holders, guests);
}

} // namespace elfext
