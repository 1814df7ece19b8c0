// SPDX-License-Identifier: Apache-2.0
//
// Places are halved again and again. Of the holders at some places, those at all of them have only
// their numbers left to compare; the others are left to the halves. Numbers are compared by a
// sweep: when a guest's turn comes, the holders that start at or before its start are known, and it
// takes the lowest id of those that end late enough.
//
// Each holder is compared at no more than two sets of places on each level of halving, so n holders
// and m guests take about (n + m) log^2 steps, where trying all pairs would let a file of ten
// thousand segments and sections take a hundred million. It serves extents, all at one place, and
// questions that want a place in the file and a range of addresses at once.
#include "elfext/src/bytes/first_holders.h"

#include <algorithm>
#include <utility>

namespace elfext {

namespace {

// Where numbers end, which may be beyond the largest one: whether it is, and the rest.
using End = std::pair<bool, uint64_t>;

End exactEndOf(uint64_t start, uint64_t size) {
  // The sum may wrap: the flag then stands for 2^64, so that ends compare as they are and not cut.
  const uint64_t end = start + size;
  return {end < start, end};
}

template <class Number>
void keepOneOfEach(std::vector<Number>& numbers) {
  std::sort(numbers.begin(), numbers.end());
  numbers.erase(std::unique(numbers.begin(), numbers.end()), numbers.end());
}

// How many of the sorted numbers are below the limit.
template <class Number>
uint32_t countBelow(const std::vector<Number>& sorted, const Number& limit) {
  return static_cast<uint32_t>(std::lower_bound(sorted.begin(), sorted.end(), limit) -
                               sorted.begin());
}

std::vector<uint64_t> placesOf(std::span<const Guest> guests) {
  std::vector<uint64_t> places;
  places.reserve(guests.size());
  for (const Guest& guest : guests)
    places.push_back(guest.place);
  keepOneOfEach(places);
  return places;
}

std::vector<End> endsOf(std::span<const Holder> holders) {
  std::vector<End> ends;
  ends.reserve(holders.size());
  for (const Holder& holder : holders)
    ends.push_back(exactEndOf(holder.start, holder.size));
  keepOneOfEach(ends);
  return ends;
}

// The lowest of the ids that were added with a rank not below another. Ranks count from 1.
class LowestIds {
public:
  explicit LowestIds(size_t rankCount) : m_Lowest(rankCount + 1, NoExtent) {}

  // i & -i is the lowest set bit of i: stepping down or up by it visits log n elements.
  void add(uint32_t rank, uint32_t id) {
    for (size_t i = rank; i != 0; i -= i & (0 - i))
      m_Lowest[i] = std::min(m_Lowest[i], id);
  }
  // Whoever forgets one has to forget all.
  void forget(uint32_t rank) {
    for (size_t i = rank; i != 0; i -= i & (0 - i))
      m_Lowest[i] = NoExtent;
  }
  [[nodiscard]] uint32_t find(uint32_t rank) const {
    uint32_t lowest = NoExtent;
    for (size_t i = rank; i < m_Lowest.size(); i += i & (0 - i))
      lowest = std::min(lowest, m_Lowest[i]);
    return lowest;
  }

private:
  // A binary indexed tree: element i has the lowest of the i & -i ranks from i on.
  std::vector<uint32_t> m_Lowest;
};

// Places and ends are known by their ranks; the places of the guests are all that count.
struct RankedHolder {
  uint64_t start;
  uint32_t firstPlace;
  uint32_t lastPlace;
  uint32_t end;
  uint32_t id;
};

struct RankedGuest {
  uint64_t start;
  uint32_t place;
  uint32_t end;
  uint32_t index;
};

// Of those that start together, any order leads to the same lowest ids.
template <class Party>
void sortByStart(std::vector<Party>& parties) {
  std::sort(parties.begin(), parties.end(),
            [](const Party& left, const Party& right) { return left.start < right.start; });
}

class HolderSearch {
public:
  HolderSearch(std::span<const Holder> holders, std::span<const Guest> guests)
      : m_Places(placesOf(guests)), m_Ends(endsOf(holders)), m_Lowest(m_Ends.size()),
        m_Answers(guests.size(), NoExtent) {
    std::vector<RankedHolder> rankedHolders = rank(holders);
    std::vector<RankedGuest> rankedGuests = rank(guests);
    sortByStart(rankedHolders);
    sortByStart(rankedGuests);
    const auto placeCount = static_cast<uint32_t>(m_Places.size());
    search({0, placeCount}, std::move(rankedHolders), rankedGuests);
  }

  [[nodiscard]] std::vector<uint32_t>& getAnswers() { return m_Answers; }

private:
  // Ranks from the first to the one before the end.
  struct Places {
    uint32_t first;
    uint32_t end;
  };

  [[nodiscard]] std::vector<RankedHolder> rank(std::span<const Holder> holders) const {
    std::vector<RankedHolder> ranked;
    ranked.reserve(holders.size());
    for (const Holder& holder : holders) {
      const auto behindLast =
          std::upper_bound(m_Places.begin(), m_Places.end(), holder.lastPlace) - m_Places.begin();
      const uint32_t first = countBelow(m_Places, holder.firstPlace);
      // No guest is at any of its places, so it is nobody's holder.
      if (first >= behindLast) continue;
      ranked.push_back({.start = holder.start,
                        .firstPlace = first,
                        .lastPlace = static_cast<uint32_t>(behindLast) - 1,
                        .end = 1 + countBelow(m_Ends, exactEndOf(holder.start, holder.size)),
                        .id = holder.id});
    }
    return ranked;
  }

  [[nodiscard]] std::vector<RankedGuest> rank(std::span<const Guest> guests) const {
    std::vector<RankedGuest> ranked;
    ranked.reserve(guests.size());
    for (const Guest& guest : guests)
      ranked.push_back({.start = guest.start,
                        .place = countBelow(m_Places, guest.place),
                        .end = 1 + countBelow(m_Ends, exactEndOf(guest.start, guest.size)),
                        .index = static_cast<uint32_t>(ranked.size())});
    return ranked;
  }

  // Of holders at some of these places, and of all guests there; both in the order of their starts.
  void search(Places places, std::vector<RankedHolder> holders, std::span<RankedGuest> guests) {
    const auto isAtAll = [=](const RankedHolder& holder) {
      return holder.firstPlace <= places.first && holder.lastPlace >= places.end - 1;
    };
    const auto others = std::stable_partition(holders.begin(), holders.end(), isAtAll);
    compareNumbers({holders.begin(), others}, guests);
    // Both partitions are stable: the order by start, which the sweep needs, reaches every half.
    holders.erase(holders.begin(), others);
    if (holders.empty()) return;
    const uint32_t middle = places.first + (places.end - places.first) / 2;
    std::vector<RankedHolder> ofFirstHalf;
    std::copy_if(holders.begin(), holders.end(), std::back_inserter(ofFirstHalf),
                 [=](const RankedHolder& holder) { return holder.firstPlace < middle; });
    std::erase_if(holders, [=](const RankedHolder& holder) { return holder.lastPlace < middle; });
    const auto secondHalf =
        std::stable_partition(guests.begin(), guests.end(),
                              [=](const RankedGuest& guest) { return guest.place < middle; });
    search({places.first, middle}, std::move(ofFirstHalf), {guests.begin(), secondHalf});
    search({middle, places.end}, std::move(holders), {secondHalf, guests.end()});
  }

  void compareNumbers(std::span<const RankedHolder> holders, std::span<const RankedGuest> guests) {
    size_t known = 0;
    for (const RankedGuest& guest : guests) {
      for (; known < holders.size() && holders[known].start <= guest.start; ++known)
        m_Lowest.add(holders[known].end, holders[known].id);
      m_Answers[guest.index] = std::min(m_Answers[guest.index], m_Lowest.find(guest.end));
    }
    // Only what was added is taken back. Clearing the whole tree for each set of places would be
    // quadratic.
    for (const RankedHolder& holder : holders.first(known))
      m_Lowest.forget(holder.end);
  }

  std::vector<uint64_t> m_Places; // of the guests
  std::vector<End> m_Ends;        // of the holders
  LowestIds m_Lowest;
  std::vector<uint32_t> m_Answers;
};

} // namespace

std::vector<uint32_t> findFirstHolders(std::span<const Holder> holders,
                                       std::span<const Guest> guests) {
  if (holders.empty() || guests.empty()) return std::vector<uint32_t>(guests.size(), NoExtent);
  return std::move(HolderSearch(holders, guests).getAnswers());
}

} // namespace elfext
