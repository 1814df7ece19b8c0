// SPDX-License-Identifier: Apache-2.0
//
// Extraction and printing. Contents pass through in pieces, so that a member of any size needs no
// memory of its size.
#include "messages/interface/output.h"
#include "quarn/actions.h"
#include "quarn/extraction.h"
#include "quarn/reporting.h"
#include "support/interface/path.h"

#include <cerrno>
#include <string>

namespace quarn {

using arlib::ArchiveMember;

namespace {

constexpr size_t LongestFileName = 260;   // of any host that archives are exchanged with
constexpr size_t LongestHostName = 255;   // of this one
constexpr uint32_t PermissionBits = 0777; // and none that gives a program its owner's rights

} // namespace

Extraction::Extraction(const Run& run)
    : m_Settings(run.settings), m_Files(run.archive.getSourceFiles()),
      m_Host(run.archive.getHost()), m_ArchiveStatus(run.archive.getOwnFile()->getStatus()),
      m_Contents(run.archive) {}

// A folder in a name is not followed: an archive must not choose where files are written.
std::string Extraction::outputName(std::string_view name) const {
  // Where names keep their folders, only what the host takes for one ends a folder.
  const bool isPosixName =
      m_Settings.keepFolders && m_Host.getPathStyle() == support::PathStyle_Posix;
  const std::string_view leaf = isPosixName ? support::leafOf(name, support::PathStyle_Posix)
                                            : support::lastPathComponent(name);
  if (!m_Settings.truncateNames) return std::string(leaf);
  return std::string(leaf.substr(0, LongestFileName).substr(0, LongestHostName));
}

// A member that is called like the archive would be written over it before its bytes are read, and
// nobody knows whether it is where the host can't tell.
bool Extraction::mayWrite(const ArchiveMember& member, const std::string& name) const {
  support::FileStatus status;
  const int error = m_Host.status(name.c_str(), status);
  if (error != 0 && error != ENOENT) return failToWrite(member, error);
  // A symbolic link that leads nowhere is there as well.
  std::string place = name;
  const int linkError = error == 0 ? 0 : m_Host.resolveLinks(name.c_str(), place);
  if (linkError != 0) return failToWrite(member, linkError);
  const bool exists = error == 0 || place != name;
  if (!exists) return true;
  if (m_Settings.overwriteOnExtract && !status.isSameFile(m_ArchiveStatus)) return true;
  return failToOverwrite(name);
}

// What has come to stand there since it was looked at must stay as well.
bool Extraction::open(const ArchiveMember& member, const std::string& name,
                      support::FileHandle& file) {
  const int error = m_Files.openOther([&] {
    return m_Settings.overwriteOnExtract ? m_Host.openForWriting(name.c_str(), file)
                                         : m_Host.createForWriting(name.c_str(), file);
  });
  if (error == 0) return true;
  const bool isTaken = error == EEXIST && !m_Settings.overwriteOnExtract;
  return isTaken ? failToOverwrite(name) : failToWrite(member, error);
}

bool Extraction::failToOverwrite(const std::string& name) {
  reportMessage(messages::ErrorWord, messages::AlreadyExists, name);
  return false;
}

bool Extraction::failToWrite(const ArchiveMember& member, int error) {
  reportMessage(messages::ErrorWord, messages::WritingExtractedFile, member.getName(),
                hostErrorText(error));
  return false;
}

void Extraction::operator()(ArchiveMember& member) {
  if (member.getName().size() > LongestFileName && !m_Settings.truncateNames) {
    reportMessage(messages::ErrorWord, messages::FilenameTooLong, member.getName());
    return;
  }
  const std::string name = outputName(member.getName());
  // Nor may it open a device, or a stream that no listing of the folder shows.
  if (!support::isPlainLeaf(name, m_Host.getPathStyle())) {
    failToWrite(member, EINVAL);
    return;
  }
  if (!mayWrite(member, name)) return;
  support::FileHandle file;
  if (!open(member, name, file)) return;
  verboseMessage(m_Settings, messages::ExtractedMember, member.getName());
  write(member, name, file);
}

// False if the member could not be read, or changed meanwhile, which has been reported. A failed
// write ends the copy.
bool Extraction::copy(const ArchiveMember& member, support::FileHandle file, int& writeError) {
  if (!m_Contents.start(member)) return false;
  while (writeError == 0) {
    std::span<const uint8_t> piece;
    if (!m_Contents.read(piece)) return false;
    if (piece.empty()) return m_Contents.finish();
    writeError = m_Host.write(file, piece);
  }
  return true;
}

// Archives of tools that know no modes have 0 there, and nobody could read such a file.
void Extraction::restoreStatus(const ArchiveMember& member, support::FileHandle file) {
  const uint32_t mode = member.getMode() & PermissionBits;
  if (m_Settings.restoreModes && mode != 0) m_Host.setPermissions(file, mode);
  if (m_Settings.restoreDates) m_Host.setTimes(file, member.getDate());
}

// Half a file looks like a whole one to whoever uses it, so it is removed.
void Extraction::write(const ArchiveMember& member, const std::string& name,
                       support::FileHandle file) {
  int error = 0;
  const bool isRead = copy(member, file, error);
  if (error == 0) error = m_Host.flush(file);
  restoreStatus(member, file);
  const int closeError = m_Host.endWriting(file, name.c_str(), isRead && error == 0);
  if (error == 0) error = closeError;
  if (isRead && error != 0) failToWrite(member, error);
}

void ContentsPrinter::print(const ArchiveMember& member) {
  if (!m_Contents.start(member)) return;
  std::span<const uint8_t> piece;
  while (m_Contents.read(piece) && !piece.empty()) {
    messages::writeRaw({reinterpret_cast<const char*>(piece.data()), piece.size()});
  }
}

namespace {

class Printing final : public MemberRoutine {
public:
  explicit Printing(const Run& run) : m_Settings(run.settings), m_Printer(run.archive) {}

  void operator()(ArchiveMember& member) override {
    verboseMessage(m_Settings, messages::PrintedMember, member.getName());
    m_Printer.print(member);
  }
  void finish() { m_Printer.finish(); }

private:
  const Settings& m_Settings;
  ContentsPrinter m_Printer;
};

} // namespace

void extractMembers(Run& run) {
  Extraction extraction(run);
  forEachSelectedMember(run.archive, run.settings.fileList, extraction);
}

void printMembers(Run& run) {
  Printing printing(run);
  forEachSelectedMember(run.archive, run.settings.fileList, printing);
  printing.finish();
}

} // namespace quarn
