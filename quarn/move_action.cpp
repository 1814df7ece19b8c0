// SPDX-License-Identifier: Apache-2.0
//
// Each move changes the order in which the next word is matched, so moves are done one by one.
#include "quarn/actions.h"

#include "quarn/member_selection.h"
#include "quarn/reporting.h"

namespace quarn {

using arlib::ArchiveMember;

namespace {

ArchiveMember* findFirst(const arlib::Archive& archive, const std::string& word) {
  for (ArchiveMember* member : archive.getMembers()) {
    if (!member->isAuxiliary() && memberMatches(*member, word)) return member;
  }
  return nullptr;
}

// Where the member goes, counted without it; the position moves on behind it.
uint32_t takeTarget(Run& run, const ArchiveMember* member) {
  if (run.position < 0) return static_cast<uint32_t>(run.archive.getMembers().size()) - 1;
  const uint32_t old = run.archive.getMemberIndex(member);
  if (old < static_cast<uint32_t>(run.position)) --run.position;
  return static_cast<uint32_t>(run.position++);
}

} // namespace

void moveMembers(Run& run) {
  if (isMissing(run)) return;
  for (const std::string& word : run.settings.fileList) {
    ArchiveMember* member = findFirst(run.archive, word);
    if (member == nullptr) {
      reportMessage(messages::ErrorWord, messages::NotPresentInArchive, word, run.archiveName());
      continue;
    }
    run.archive.moveMember(member, takeTarget(run, member));
    verboseMessage(run.settings, messages::MovedMember, member->getName());
  }
}

} // namespace quarn
