// SPDX-License-Identifier: Apache-2.0
//
// Files become members. A name that is looked up is looked up among the members that were there at
// the start: two files of one name in one run are two members.
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/file_probe.h"
#include "quarn-ar/named_members.h"
#include "quarn-ar/operations.h"
#include "quarn-ar/refusal.h"
#include "quarn/reporting.h"

#include <algorithm>
#include <array>

namespace quarn_ar {

using arlib::ArchiveMember;
using arlib::FileProbe;

namespace {

constexpr uint32_t PlainMode = 0644;
constexpr uint32_t LargestOwner = 999999; // six digits are the room that a header has
// What ends a name in the long-name table.
constexpr std::string_view NameEnd = "/\n";
// How intermediate code begins that compilers write instead of objects.
constexpr std::array<uint8_t, 4> IntermediateMagic = {'B', 'C', 0xC0, 0xDE};

bool isIntermediateCode(const FileProbe& probe) {
  const std::span<const uint8_t> bytes = probe.getFirstBytes();
  return bytes.size() >= IntermediateMagic.size() &&
         std::equal(IntermediateMagic.begin(), IntermediateMagic.end(), bytes.begin());
}

// Linkers look into members themselves where there is no table, and nowhere else.
bool willHaveTable(const arlib::Archive& archive) {
  const std::span<ArchiveMember* const> members = archive.getMembers();
  return archive.getSymbolTable() != nullptr ||
         std::any_of(members.begin(), members.end(), [](const ArchiveMember* member) {
           return member->getType()->isObjectModule();
         });
}

// Numbers that go into no header need not fit one; the date is still asked for.
void fitNumbers(support::FileStatus& status) {
  status.uid = 0;
  status.gid = 0;
  status.modificationTime = std::clamp<int64_t>(status.modificationTime, 0, INT32_MAX);
}

class Insertion {
public:
  Insertion(quarn::Run& run, const Request& request)
      : m_Request(request), m_Archive(run.archive), m_Members(run.archive, request) {}

  void insert(const std::string& file);
  void warnOfIntermediateCode() const;
  [[nodiscard]] const std::vector<ArchiveMember*>& getAdded() const { return m_Added; }

private:
  [[nodiscard]] bool canTake(const std::string& file, const FileProbe& probe) const;
  [[nodiscard]] bool add(const std::string& file, const FileProbe& probe);
  [[nodiscard]] bool replace(ArchiveMember& member, const std::string& file,
                             const FileProbe& probe);
  void setNumbers(ArchiveMember& member) const;

  const Request& m_Request;
  arlib::Archive& m_Archive;
  NamedMembers m_Members;
  std::vector<ArchiveMember*> m_Added;
  std::string m_IntermediateCode; // the first file of its kind
};

void Insertion::insert(const std::string& file) {
  FileProbe probe = arlib::probeFile(m_Archive.getSourceFiles(), file.c_str());
  if (!m_Request.realNumbers) fitNumbers(probe.status);
  if (!canTake(file, probe)) return;
  ArchiveMember* member =
      m_Request.operation == Operation::Replace ? m_Members.take(file) : nullptr;
  if (member != nullptr && m_Request.newerOnly &&
      probe.status.modificationTime <= member->getDate()) {
    return;
  }
  if (!(member == nullptr ? add(file, probe) : replace(*member, file, probe))) return;
  if (m_IntermediateCode.empty() && isIntermediateCode(probe)) m_IntermediateCode = file;
  quarn::verboseMessage(m_Request.settings,
                        member == nullptr ? messages::AddedMember : messages::ReplacedMember, file);
}

void Insertion::warnOfIntermediateCode() const {
  if (m_IntermediateCode.empty() || m_Request.settings.suppressSymbolTable) return;
  if (!willHaveTable(m_Archive)) return;
  messages::reportFormat(messages::WarningWord, nullptr,
                         "'%s' is intermediate code, of which the symbol table tells nothing",
                         m_IntermediateCode);
}

bool Insertion::canTake(const std::string& file, const FileProbe& probe) const {
  if (!probe.exists()) {
    quarn::reportMessage(messages::ErrorWord, messages::FileDoesNotExist, file);
    return false;
  }
  // The library would tell it of the archive.
  if (const int error = probe.getRefusal(); error != 0) {
    quarn::reportMessage(messages::ErrorWord, messages::ReadingFile, file,
                         quarn::hostErrorText(error));
    return false;
  }
  const auto& own = m_Archive.getOwnFile();
  if (own != nullptr && own->getStatus().isSameFile(probe.status))
    return refuse("'%s' is the archive itself, and can't be a member of it", file);
  if (memberNameOf(file, m_Request).find(NameEnd) != std::string_view::npos)
    return refuse("no member can have the name '%s'", file);
  const bool hasRoom = probe.status.uid <= LargestOwner && probe.status.gid <= LargestOwner;
  if (m_Request.realNumbers && !hasRoom)
    return refuse("the owner of '%s' has too many digits for 'U'", file);
  return true;
}

bool Insertion::add(const std::string& file, const FileProbe& probe) {
  ArchiveMember* member = m_Archive.addMemberFromFile(file.c_str(), probe);
  if (member == nullptr) return false;
  member->setName(memberNameOf(file, m_Request));
  setNumbers(*member);
  m_Added.push_back(member);
  return true;
}

bool Insertion::replace(ArchiveMember& member, const std::string& file, const FileProbe& probe) {
  if (!member.setContentsFromFile(file.c_str(), probe)) return false;
  setNumbers(member);
  return true;
}

// The same files give the same archive for everybody, unless somebody wants to know.
void Insertion::setNumbers(ArchiveMember& member) const {
  if (m_Request.realNumbers) return;
  member.setDate(0);
  member.setUid(0);
  member.setGid(0);
  member.setMode(PlainMode);
}

} // namespace

void insertFiles(quarn::Run& run, const Request& request) {
  Insertion insertion(run, request);
  for (const std::string& file : request.files)
    insertion.insert(file);
  insertion.warnOfIntermediateCode();
  const std::vector<ArchiveMember*>& added = insertion.getAdded();
  if (request.place == Place::End || quarn::hasErrors()) return;
  const auto place = findPlace(run.archive, request, {added.begin(), added.end()});
  if (place) run.archive.moveMembers(added, *place);
}

} // namespace quarn_ar
