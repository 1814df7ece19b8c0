// SPDX-License-Identifier: Apache-2.0
//
// Members are collected word by word and leave the list together, so that a long list of words
// costs one pass over the members.
#include "quarn/actions.h"

#include "quarn/member_selection.h"
#include "quarn/reporting.h"

#include <unordered_set>

namespace quarn {

using arlib::ArchiveMember;

void deleteMembers(Run& run) {
  const MemberSelection selection(run.archive);
  std::vector<ArchiveMember*> doomed;
  std::unordered_set<const ArchiveMember*> isDoomed;
  for (const std::string& word : run.settings.fileList) {
    const size_t before = doomed.size();
    std::vector<ArchiveMember*> members = selection.find(word);
    for (auto member = members.rbegin(); member != members.rend(); ++member) {
      if (!isDoomed.insert(*member).second) continue;
      doomed.push_back(*member);
      verboseMessage(run.settings, messages::DeletedMember, (*member)->getName());
    }
    if (doomed.size() == before) {
      reportMessage(messages::WarningWord, messages::NotPresentInArchive, word,
                    run.getArchiveName());
    }
  }
  if (!doomed.empty()) run.archive.removeMembers(doomed);
}

} // namespace quarn
