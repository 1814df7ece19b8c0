// SPDX-License-Identifier: Apache-2.0
//
// Sorted once by name, ignoring the case of ASCII letters, and by position among equals: a run with
// 10,000 words looks each up in a few steps. A library may hold one name thousands of times, and
// each replacement takes the next of them, so how many are done with is kept at the first.
#include "quarn/member_names.h"

#include "arlib/interface/name_order.h"

#include <algorithm>

namespace quarn {

using arlib::ArchiveMember;
using arlib::compareIgnoringCase;

MemberNames::MemberNames(const arlib::Archive& archive) {
  m_Members.reserve(archive.getMembers().size());
  for (ArchiveMember* member : archive.getMembers()) {
    if (!member->isAuxiliary()) m_Members.push_back(member);
  }
  std::stable_sort(m_Members.begin(), m_Members.end(),
                   [](const ArchiveMember* left, const ArchiveMember* right) {
                     return compareIgnoringCase(left->getName(), right->getName()) < 0;
                   });
  m_Skip.resize(m_Members.size());
}

MemberNames::Range MemberNames::rangeOf(std::string_view name) const {
  const auto first =
      std::partition_point(m_Members.begin(), m_Members.end(), [name](const ArchiveMember* member) {
        return compareIgnoringCase(member->getName(), name) < 0;
      });
  const auto last =
      std::partition_point(first, m_Members.end(), [name](const ArchiveMember* member) {
        return compareIgnoringCase(member->getName(), name) == 0;
      });
  return {static_cast<size_t>(first - m_Members.begin()),
          static_cast<size_t>(last - m_Members.begin())};
}

std::span<ArchiveMember* const> MemberNames::find(std::string_view name) const {
  const Range range = rangeOf(name);
  return std::span(m_Members).subspan(range.first, range.last - range.first);
}

ArchiveMember* MemberNames::findUnmodified(std::string_view name) {
  const Range range = rangeOf(name);
  if (range.first == range.last) return nullptr;
  uint32_t& skip = m_Skip[range.first];
  while (range.first + skip < range.last && m_Members[range.first + skip]->isModified())
    ++skip;
  return range.first + skip < range.last ? m_Members[range.first + skip] : nullptr;
}

} // namespace quarn
