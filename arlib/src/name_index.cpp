// SPDX-License-Identifier: Apache-2.0
//
// Names are compared only with those of their length, and only when somebody asks for one of it. A
// long-name table lets thousands of members share the bytes of one name, so each text is compared
// once, wherever it stands, and not once for each member that has it.
#include "arlib/interface/name_index.h"

#include <algorithm>
#include <functional>
#include <numeric>
#include <utility>

namespace arlib {

namespace {

using Members = std::span<ArchiveMember* const>;

// Places in the list, so that members of one text stand together. The order of texts shows nowhere;
// mostly it is that of the members, as a reader meets them.
std::vector<size_t> sortByText(Members members) {
  std::vector<size_t> places(members.size());
  std::iota(places.begin(), places.end(), size_t{0});
  const auto isInFront = [members](size_t left, size_t right) {
    return std::less<>()(members[left]->getName().data(), members[right]->getName().data());
  };
  if (!std::is_sorted(places.begin(), places.end(), isInFront))
    std::sort(places.begin(), places.end(), isInFront);
  return places;
}

// For each member the number of its name, in the order of names.
std::vector<size_t> numberNames(Members members, NameIndex::Compare compare) {
  const auto nameOf = [members](size_t place) { return members[place]->getName(); };
  const std::vector<size_t> places = sortByText(members);
  std::vector<size_t> textOf(members.size()); // the first place of its text
  std::vector<size_t> texts;
  for (const size_t place : places) {
    const bool isNew = texts.empty() || nameOf(texts.back()).data() != nameOf(place).data();
    if (isNew) texts.push_back(place);
    textOf[place] = texts.back();
  }
  std::stable_sort(texts.begin(), texts.end(), [&](size_t left, size_t right) {
    return compare(nameOf(left), nameOf(right)) < 0;
  });
  std::vector<size_t> numbers(members.size());
  for (size_t i = 1; i < texts.size(); ++i) {
    const bool isSame = compare(nameOf(texts[i - 1]), nameOf(texts[i])) == 0;
    numbers[texts[i]] = numbers[texts[i - 1]] + (isSame ? 0 : 1);
  }
  for (size_t place = 0; place < members.size(); ++place)
    numbers[place] = numbers[textOf[place]];
  return numbers;
}

} // namespace

NameIndex::NameIndex(std::vector<ArchiveMember*> members, Compare compare)
    : m_Compare(compare), m_Members(std::move(members)), m_IsSorted(m_Members.size()) {
  std::stable_sort(m_Members.begin(), m_Members.end(),
                   [](const ArchiveMember* left, const ArchiveMember* right) {
                     return left->getName().size() < right->getName().size();
                   });
}

void NameIndex::sortByName(Range sameLength) const {
  if (sameLength.first == sameLength.last || m_IsSorted[sameLength.first]) return;
  m_IsSorted[sameLength.first] = true;
  const Members sorted = getMembers(sameLength);
  const std::vector<ArchiveMember*> members(sorted.begin(), sorted.end());
  const std::vector<size_t> numbers = numberNames(members, m_Compare);
  // Where the next member of each name goes.
  std::vector<size_t> next(members.size() + 1);
  for (const size_t number : numbers)
    ++next[number + 1];
  std::partial_sum(next.begin(), next.end(), next.begin());
  for (size_t place = 0; place < members.size(); ++place)
    m_Members[sameLength.first + next[numbers[place]]++] = members[place];
}

NameIndex::Range NameIndex::find(std::string_view name) const {
  const auto partition = [this](Range range, auto isInFront) {
    const std::span<ArchiveMember* const> members = getMembers(range);
    const auto place = std::partition_point(members.begin(), members.end(), isInFront);
    return range.first + static_cast<size_t>(place - members.begin());
  };
  Range range = {0, m_Members.size()};
  range.first = partition(range, [name](const ArchiveMember* member) {
    return member->getName().size() < name.size();
  });
  range.last = partition(range, [name](const ArchiveMember* member) {
    return member->getName().size() == name.size();
  });
  sortByName(range);
  range.first = partition(
      range, [&](const ArchiveMember* member) { return m_Compare(member->getName(), name) < 0; });
  range.last = partition(
      range, [&](const ArchiveMember* member) { return m_Compare(member->getName(), name) == 0; });
  return range;
}

std::vector<ArchiveMember*> getNamedMembers(std::span<ArchiveMember* const> archiveMembers) {
  std::vector<ArchiveMember*> named;
  named.reserve(archiveMembers.size());
  for (ArchiveMember* member : archiveMembers) {
    if (!member->isAuxiliary()) named.push_back(member);
  }
  return named;
}

} // namespace arlib
