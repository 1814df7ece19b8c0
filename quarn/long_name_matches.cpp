// SPDX-License-Identifier: Apache-2.0
//
// Equal names get equal numbers, ignoring the case of ASCII letters.
#include "quarn/long_name_matches.h"

#include "arlib/interface/name_order.h"
#include "support/interface/path.h"
#include "support/interface/text_numbers.h"

namespace quarn {

using arlib::ArchiveMember;

namespace {

std::vector<ArchiveMember*> longNamed(const arlib::Archive& archive) {
  std::vector<ArchiveMember*> members;
  for (ArchiveMember* member : archive.getMembers()) {
    if (LongNameMatches::isForThese(member->getName())) members.push_back(member);
  }
  return members;
}

} // namespace

LongNameMatches::LongNameMatches(const arlib::Archive& archive, const arlib::Archive& source) {
  const std::vector<ArchiveMember*> sources = longNamed(source);
  if (sources.empty()) return;
  const std::vector<ArchiveMember*> members = longNamed(archive);
  std::vector<std::string_view> names;
  for (const auto* list : {&sources, &members}) {
    for (const ArchiveMember* member : *list)
      names.push_back(member->getName());
  }
  const std::vector<uint64_t> numbers = support::numberTexts(names, arlib::foldCase);
  for (size_t i = 0; i < sources.size(); ++i)
    m_Numbers[{names[i].data(), names[i].size()}] = numbers[i];
  for (size_t i = 0; i < members.size(); ++i)
    m_Members[numbers[sources.size() + i]].members.push_back(members[i]);
}

bool LongNameMatches::isForThese(std::string_view name) {
  return name.size() > support::LongestPathComponent;
}

ArchiveMember* LongNameMatches::findUnmodified(std::string_view sourceName) {
  const auto found = m_Members.find(m_Numbers.at({sourceName.data(), sourceName.size()}));
  if (found == m_Members.end()) return nullptr;
  auto& [members, skip] = found->second;
  while (skip < members.size() && members[skip]->isModified())
    ++skip;
  return skip < members.size() ? members[skip] : nullptr;
}

} // namespace quarn
