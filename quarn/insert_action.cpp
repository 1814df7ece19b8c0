// SPDX-License-Identifier: Apache-2.0
//
// Names are looked up in a sorted view made once: members that this run has made or replaced are
// never found again, so the view stays true while the list grows. New members gather at the end
// of the list, and go to the position in one step when all words are done.
#include "quarn/actions.h"

#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/file_probe.h"
#include "checking/interface/checking.h"
#include "quarn/long_name_matches.h"
#include "quarn/member_names.h"
#include "quarn/reporting.h"
#include "support/interface/path.h"

#include <span>
#include <string>
#include <vector>

namespace quarn {

using arlib::ArchiveMember;
using arlib::FileProbe;

namespace {

constexpr uint32_t NormalisedMode = 0100644;

bool mayReplace(UpdateMode mode, int64_t memberTime, int64_t newTime) {
  switch (mode) {
  case Update_Always:
    return true;
  case Update_IfNotNewer:
    return memberTime <= newTime;
  case Update_IfOlder:
    return memberTime < newTime;
  }
  QUARN_ASSERT(1, false);
  return false;
}

// Of an archive that is inserted.
struct SourceNames {
  arlib::CopiedNames copied;
  LongNameMatches matches;
};

// Hears of a file that is tried as an archive. What is wrong with its bytes is nothing to tell: it
// is a plain file then. What the host can't do says nothing of the file.
class TrialListener final : public arlib::ErrorHandler {
public:
  bool report(const arlib::Archive&, arlib::Severity, std::string_view) override { return false; }
  bool reportReadError(const arlib::Archive&, const char*, int errorNumber) override {
    m_HostError = errorNumber;
    return false;
  }
  [[nodiscard]] int getHostError() const { return m_HostError; }

private:
  int m_HostError = 0;
};

class Insertion {
public:
  explicit Insertion(Run& run)
      : m_Run(run), m_Archive(run.archive), m_Names(run.archive),
        m_FirstNew(static_cast<uint32_t>(run.archive.getMembers().size())) {}

  void insert(const std::string& word);
  void moveNewMembers();

private:
  [[nodiscard]] bool insertArchive(const FileProbe& probe);
  void failToRead(const char* fileName, int error) {
    m_Archive.fail(&arlib::ErrorHandler::reportReadError, fileName, error);
  }
  ArchiveMember* findUnmodified(std::string_view name, SourceNames& names);
  void insertMemberOf(const ArchiveMember& source, SourceNames& names);
  void insertPlainFile(const std::string& word, const FileProbe& probe);
  ArchiveMember* addPlainFile(const std::string& word, const FileProbe& probe);
  bool replacePlainFile(ArchiveMember& member, const std::string& word, const FileProbe& probe);
  void normalise(ArchiveMember& member) const;
  void warnIfNotElf(const ArchiveMember& member);
  void tell(messages::Key key, const ArchiveMember& member) const {
    verboseMessage(m_Run.settings, key, member.getName());
  }

  Run& m_Run;
  arlib::Archive& m_Archive;
  MemberNames m_Names;
  uint32_t m_FirstNew;
  bool m_NonElfWarned = false;
};

void Insertion::insert(const std::string& word) {
  const FileProbe probe = arlib::probeFile(m_Archive.getSourceFiles(), word.c_str());
  if (!probe.exists()) {
    reportMessage(messages::ErrorWord, messages::FileDoesNotExist, word);
    return;
  }
  // It may be anything, an archive, too.
  if (probe.hostError != 0) return failToRead(word.c_str(), probe.hostError);
  if (probe.hasArchiveMagic() && insertArchive(probe)) return;
  insertPlainFile(word, probe);
}

// False for a file that begins like an archive and isn't one.
bool Insertion::insertArchive(const FileProbe& probe) {
  arlib::Archive source(m_Archive.getHost());
  TrialListener listener;
  source.setErrorHandler(&listener);
  if (!arlib::readFile(probe.file, source)) {
    const int error = listener.getHostError();
    if (error != 0) failToRead(probe.file->getName(), error);
    return error != 0;
  }
  SourceNames names = {arlib::CopiedNames(source), LongNameMatches(m_Archive, source)};
  for (const ArchiveMember* member : source.getMembers()) {
    if (!member->isAuxiliary()) insertMemberOf(*member, names);
  }
  return true;
}

ArchiveMember* Insertion::findUnmodified(std::string_view name, SourceNames& names) {
  if (LongNameMatches::isForThese(name)) return names.matches.findUnmodified(name);
  return m_Names.findUnmodified(name);
}

// Of a member that is too new to be replaced the header's numbers still become those of the source.
void Insertion::insertMemberOf(const ArchiveMember& source, SourceNames& names) {
  ArchiveMember* target = findUnmodified(source.getName(), names);
  const bool isNew = target == nullptr;
  const bool isKept =
      !isNew && !mayReplace(m_Run.settings.updateMode, target->getDate(), source.getDate());
  if (isNew) {
    target = m_Archive.addMemberFromMember(source, names.copied);
  } else if (isKept) {
    target->takeHeaderNumbers(source);
  } else {
    target->setContentsFromMember(source);
  }
  warnIfNotElf(*target);
  if (!isKept) tell(isNew ? messages::AddedMember : messages::ReplacedMember, *target);
}

void Insertion::insertPlainFile(const std::string& word, const FileProbe& probe) {
  const std::string_view name = support::withoutDrive(word, m_Archive.getHost().getPathStyle());
  const std::string_view leaf =
      support::lastPathComponent(name).substr(0, support::LongestPathComponent);
  if (ArchiveMember* existing = m_Names.findUnmodified(leaf); existing != nullptr) {
    const int64_t time = probe.status.modificationTime;
    if (time > 0 && !mayReplace(m_Run.settings.updateMode, existing->getDate(), time)) {
      warnIfNotElf(*existing);
      return;
    }
    if (!replacePlainFile(*existing, word, probe)) return;
    warnIfNotElf(*existing);
    tell(messages::ReplacedMember, *existing);
    return;
  }
  ArchiveMember* added = addPlainFile(word, probe);
  if (added == nullptr) return;
  warnIfNotElf(*added);
  tell(messages::AddedMember, *added);
}

ArchiveMember* Insertion::addPlainFile(const std::string& word, const FileProbe& probe) {
  ArchiveMember* member = m_Archive.addMemberFromFile(word.c_str(), probe);
  if (member != nullptr) normalise(*member);
  return member;
}

bool Insertion::replacePlainFile(ArchiveMember& member, const std::string& word,
                                 const FileProbe& probe) {
  if (!member.setContentsFromFile(word.c_str(), probe)) return false;
  normalise(member);
  return true;
}

void Insertion::normalise(ArchiveMember& member) const {
  if (!m_Run.settings.normaliseHeaders) return;
  member.setUid(0);
  member.setGid(0);
  member.setMode(NormalisedMode);
  member.setDate(m_Run.settings.normaliseTime);
}

void Insertion::warnIfNotElf(const ArchiveMember& member) {
  if (m_NonElfWarned || member.getType() == arlib::ElfImageArchiveMemberType::getInstance()) return;
  reportMessage(messages::WarningWord, messages::AddingNonElfObject, member.getName(),
                m_Run.getArchiveName());
  m_NonElfWarned = true;
}

void Insertion::moveNewMembers() {
  if (m_Run.position < 0) return;
  const std::span<ArchiveMember* const> added = m_Archive.getMembers().subspan(m_FirstNew);
  m_Archive.moveMembers(std::vector(added.begin(), added.end()),
                        static_cast<uint32_t>(m_Run.position));
}

} // namespace

void insertFiles(Run& run) {
  if (run.openStatus.missing && run.settings.fileList.empty()) {
    if (run.settings.createArchive) {
      reportMessage(messages::ErrorWord, messages::NoMembersForCreate);
    }
    run.isCancelled = true;
    return;
  }
  Insertion insertion(run);
  for (const std::string& word : run.settings.fileList)
    insertion.insert(word);
  insertion.moveNewMembers();
}

} // namespace quarn
