// SPDX-License-Identifier: Apache-2.0
//
// How a word is matched with a member's name: by the leaf alone, cut to what a host's path
// component can hold, so that a name in an archive can't be made to match by what stands in front
// of a slash. A word without wildcards is looked up; only a pattern is held against every member.
#include "quarn/member_selection.h"

#include "quarn/reporting.h"
#include "support/interface/host_files.h"
#include "support/interface/path.h"
#include "support/interface/pattern.h"

namespace quarn {

using arlib::ArchiveMember;

namespace {

std::string_view leafOf(std::string_view name) {
  return support::lastPathComponent(name).substr(0, support::LongestPathComponent);
}

// The archives of this program keep no folders: a name is all leaf, and not searched for one.
bool leafMatches(std::string_view pattern, const ArchiveMember& member) {
  const std::string_view leaf = member.getName().substr(0, support::LongestPathComponent);
  return support::matchesPattern(pattern, leaf, false);
}

} // namespace

bool memberMatches(const ArchiveMember& member, std::string_view word) {
  return leafMatches(leafOf(word), member);
}

// A name that is cut for the comparison is not the name that the look-up knows.
bool MemberSelection::isName(std::string_view word) {
  const std::string_view pattern = leafOf(word);
  return !support::hasWildcard(pattern) && pattern.size() < support::LongestPathComponent;
}

std::span<ArchiveMember* const> MemberSelection::findNamed(std::string_view word) const {
  return m_Names.find(leafOf(word));
}

std::span<ArchiveMember* const> MemberSelection::findNamesakes(const ArchiveMember& member) const {
  return m_Names.find(member.getName());
}

std::vector<ArchiveMember*> MemberSelection::find(std::string_view word) const {
  if (isName(word)) {
    const std::span<ArchiveMember* const> named = findNamed(word);
    return {named.begin(), named.end()};
  }
  const std::string_view pattern = leafOf(word);
  std::vector<ArchiveMember*> found;
  for (ArchiveMember* member : m_Archive.getMembers()) {
    if (!member->isAuxiliary() && leafMatches(pattern, *member)) found.push_back(member);
  }
  return found;
}

void forEachSelectedMember(arlib::Archive& archive, const std::vector<std::string>& words,
                           MemberRoutine& routine) {
  if (words.empty()) {
    for (ArchiveMember* member : archive.getMembers()) {
      if (!member->isAuxiliary()) routine(*member);
    }
    return;
  }
  const MemberSelection selection(archive);
  for (const std::string& word : words) {
    const std::vector<ArchiveMember*> members = selection.find(word);
    for (ArchiveMember* member : members)
      routine(*member);
    if (members.empty()) {
      reportMessage(messages::ErrorWord, messages::NotPresentInArchive, word,
                    archive.getFileName());
    }
  }
}

} // namespace quarn
