// SPDX-License-Identifier: Apache-2.0
//
// The case of ASCII letters doesn't count. A library may hold one name thousands of times, and each
// replacement takes the next of them, so how many are done with is kept at the first.
#include "quarn/member_names.h"

#include "arlib/interface/name_order.h"

namespace quarn {

using arlib::ArchiveMember;

MemberNames::MemberNames(const arlib::Archive& archive)
    : m_Index(arlib::getNamedMembers(archive.getMembers()), arlib::compareIgnoringCase),
      m_Skip(archive.getMembers().size()) {}

std::span<ArchiveMember* const> MemberNames::find(std::string_view name) const {
  return m_Index.getMembers(m_Index.find(name));
}

ArchiveMember* MemberNames::findUnmodified(std::string_view name) {
  const arlib::NameIndex::Range named = m_Index.find(name);
  const std::span<ArchiveMember* const> members = m_Index.getMembers(named);
  if (members.empty()) return nullptr;
  uint32_t& skip = m_Skip[named.first];
  while (skip < members.size() && members[skip]->isModified())
    ++skip;
  return skip < members.size() ? members[skip] : nullptr;
}

} // namespace quarn
