// SPDX-License-Identifier: Apache-2.0
//
// Which members a file_list word means.
#pragma once

#include "arlib/interface/archive.h"
#include "quarn/member_names.h"

#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace quarn {

// Whether a member's name matches a word. Both are cut to what stands behind their last "/" or
// "\"; "*" and "?" are wildcards, and letter case doesn't count.
[[nodiscard]] bool memberMatches(const arlib::ArchiveMember& member, std::string_view word);

// Finds the members that words mean, in archive order and without the tables. The archive's list
// must not change while a selection is in use. A word without wildcards is looked up, and not
// compared with every member.
class MemberSelection {
public:
  explicit MemberSelection(const arlib::Archive& archive) : m_Archive(archive), m_Names(archive) {}

  [[nodiscard]] std::vector<arlib::ArchiveMember*> find(std::string_view word) const;

  // Whether a word means the members of one name, which `findNamed` has for it without a copy.
  [[nodiscard]] static bool isName(std::string_view word);
  [[nodiscard]] std::span<arlib::ArchiveMember* const> findNamed(std::string_view word) const;
  // The same span, if any word can name the member.
  [[nodiscard]] std::span<arlib::ArchiveMember* const>
  findNamesakes(const arlib::ArchiveMember& member) const;

private:
  const arlib::Archive& m_Archive;
  MemberNames m_Names;
};

// What to do with a selected member.
class MemberRoutine {
public:
  virtual ~MemberRoutine() = default;
  virtual void operator()(arlib::ArchiveMember& member) = 0;
};

// Calls the routine for the members that each word means, word by word, or for all members if
// there are no words. A word that means no member is reported as an error.
void forEachSelectedMember(arlib::Archive& archive, const std::vector<std::string>& words,
                           MemberRoutine& routine);

} // namespace quarn
