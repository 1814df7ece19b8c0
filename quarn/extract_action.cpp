// SPDX-License-Identifier: Apache-2.0
//
// Extraction and printing. Contents pass through in pieces, so that a member of any size needs no
// memory of its size.
#include "quarn/actions.h"

#include "arlib/interface/contents_reader.h"
#include "messages/interface/output.h"
#include "quarn/member_selection.h"
#include "quarn/reporting.h"

#include <cerrno>
#include <string>

namespace quarn {

using arlib::ArchiveMember;
using arlib::ContentsReader;

namespace {

constexpr size_t LongestFileName = 260; // of any host that archives are exchanged with
constexpr size_t LongestHostName = 255; // of this one

class Extraction final : public MemberRoutine {
public:
  explicit Extraction(const Run& run)
      : m_Settings(run.settings), m_Files(run.archive.getSourceFiles()),
        m_Host(run.archive.getHost()), m_ArchiveStatus(run.archive.getOwnFile()->getStatus()),
        m_Contents(run.archive) {}

  void operator()(ArchiveMember& member) override;

private:
  [[nodiscard]] std::string outputName(std::string_view name) const;
  [[nodiscard]] bool mayWrite(const std::string& name) const;
  bool copy(const ArchiveMember& member, support::FileHandle file, int& writeError);
  void write(const ArchiveMember& member, const std::string& name, support::FileHandle file);

  const Settings& m_Settings;
  support::SourceFiles& m_Files;
  support::Host& m_Host;
  const support::FileStatus& m_ArchiveStatus;
  ContentsReader m_Contents;
};

std::string Extraction::outputName(std::string_view name) const {
  if (!m_Settings.truncateNames) return std::string(name);
  return std::string(name.substr(0, LongestFileName).substr(0, LongestHostName));
}

// A member that is called like the archive would be written over it before its bytes are read.
bool Extraction::mayWrite(const std::string& name) const {
  support::FileStatus status;
  if (m_Host.status(name.c_str(), status) != 0) return true;
  return m_Settings.overwriteOnExtract && !status.isSameFile(m_ArchiveStatus);
}

void Extraction::operator()(ArchiveMember& member) {
  if (member.getName().size() > LongestFileName && !m_Settings.truncateNames) {
    reportMessage(messages::ErrorWord, messages::FilenameTooLong, member.getName());
    return;
  }
  const std::string name = outputName(member.getName());
  if (!mayWrite(name)) {
    reportMessage(messages::ErrorWord, messages::AlreadyExists, name);
    return;
  }
  support::FileHandle file;
  const int error = m_Files.openOther([&] { return m_Host.openForWriting(name.c_str(), file); });
  if (error != 0) {
    reportMessage(messages::ErrorWord, messages::WritingExtractedFile, member.getName(),
                  hostErrorText(error));
    return;
  }
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

// Half a file looks like a whole one to whoever uses it, so it is removed.
void Extraction::write(const ArchiveMember& member, const std::string& name,
                       support::FileHandle file) {
  int error = 0;
  const bool isRead = copy(member, file, error);
  if (error == 0) error = m_Host.flush(file);
  const int closeError = m_Host.close(file);
  if (error == 0) error = closeError;
  if (isRead && error == 0) return;
  if (isRead) {
    reportMessage(messages::ErrorWord, messages::WritingExtractedFile, member.getName(),
                  hostErrorText(error));
  }
  [[maybe_unused]] const int removeError = m_Host.remove(name.c_str());
}

class Printing final : public MemberRoutine {
public:
  explicit Printing(const Run& run) : m_Settings(run.settings), m_Contents(run.archive) {}

  void operator()(ArchiveMember& member) override {
    verboseMessage(m_Settings, messages::PrintedMember, member.getName());
    if (!m_Contents.start(member)) return;
    std::span<const uint8_t> piece;
    while (m_Contents.read(piece) && !piece.empty()) {
      messages::writeRaw({reinterpret_cast<const char*>(piece.data()), piece.size()});
    }
  }

  // Too late to take anything back, but not to tell.
  void finish() { m_Contents.finish(); }

private:
  const Settings& m_Settings;
  ContentsReader m_Contents;
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
