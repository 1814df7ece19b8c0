// SPDX-License-Identifier: Apache-2.0
//
// Layout first, then one straight pass: updateAuxiliaryMembers has given each member its offset,
// and the pass asserts at each member that it has arrived there.
#include "arlib/interface/archive_file_writer.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_format.h"
#include "arlib/interface/contents_reader.h"
#include "arlib/src/read_symbol_table.h"
#include "support/interface/path.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstring>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace arlib {

namespace {

using support::FileKind;
using support::FileStatus;

// Small pieces are gathered up to this size; what is larger is written as it is.
constexpr size_t BufferSize = 0x40000;

// Permission bits that a file begins with, of which the user's mask takes some away.
constexpr uint32_t UsualMode = 0666;
constexpr uint32_t PrivateMode = 0600;

// Without so many bytes of its leaf that any number finds room, and no half of a character at the
// end.
std::string_view withoutEnd(std::string_view name, support::PathStyle style) {
  constexpr size_t LongestNumber = sizeof ".4294967295";
  constexpr int LongestRest = 3; // of a character in UTF-8
  size_t size = name.size() - std::min(LongestNumber, support::leafOf(name, style).size() / 2);
  const auto isInside = [&] {
    return size > 0 && (static_cast<uint8_t>(name[size]) & 0xC0) == 0x80;
  };
  for (int i = 0; i < LongestRest && isInside(); ++i)
    --size;
  return name.substr(0, size);
}

// Collects small pieces and writes large ones.
class GatheringOutput {
public:
  GatheringOutput(support::Host& host, support::FileHandle file) : m_Host(host), m_File(file) {
    m_Buffer.reserve(BufferSize);
  }

  [[nodiscard]] int write(std::span<const uint8_t> bytes) {
    m_Position += bytes.size();
    if (bytes.size() > BufferSize - m_Buffer.size()) {
      if (const int error = drain(); error != 0) return error;
      if (bytes.size() >= BufferSize) return m_Host.write(m_File, bytes);
    }
    m_Buffer.insert(m_Buffer.end(), bytes.begin(), bytes.end());
    return 0;
  }

  // Writes what is held back.
  [[nodiscard]] int drain() {
    if (m_Buffer.empty()) return 0;
    const int error = m_Host.write(m_File, m_Buffer);
    m_Buffer.clear();
    return error;
  }

  [[nodiscard]] uint64_t getPosition() const { return m_Position; }

private:
  support::Host& m_Host;
  support::FileHandle m_File;
  std::vector<uint8_t> m_Buffer;
  uint64_t m_Position = 0;
};

std::span<const uint8_t> asBytes(std::string_view text) {
  return {reinterpret_cast<const uint8_t*>(text.data()), text.size()};
}

std::string nameField(const ArchiveMember& member) {
  if (member.getType() == FileNameTableArchiveMemberType::getInstance()) return "//";
  if (member.getType() == SymbolTableArchiveMemberType::getInstance()) return "/";
  if (isLongName(member.getName())) {
    return "/" + std::to_string(member.getFileNameTableOffset());
  }
  return std::string(member.getName()) + "/";
}

} // namespace

class ArchiveFileWriter {
public:
  // What becomes of a file that somebody else has put in the place meanwhile.
  enum class Others { AreReported, Overtake, OvertakeIfThereIsAny };

  ArchiveFileWriter(const char* fileName, Archive& archive, Others others)
      : m_FileName(fileName), m_Archive(archive), m_Host(archive.getHost()), m_Contents(archive),
        m_Others(others) {}

  bool write();
  [[nodiscard]] WriteEnd writeToTheEnd() {
    if (write()) return WriteEnd::Written;
    return m_WasOvertaken ? WriteEnd::Overtaken : WriteEnd::Failed;
  }

private:
  [[nodiscard]] bool mustBeNew() const { return m_Others == Others::OvertakeIfThereIsAny; }
  [[nodiscard]] bool isOvertaken(int error) const;
  [[nodiscard]] bool replacesFile() const { return m_OldStatus.kind == FileKind::RegularFile; }
  bool checkTarget();
  int tryNames(const std::function<int(const char*)>& step);
  bool createTemporary();
  int nameTemporary();
  int closeTemporary();
  bool writeTemporary();
  int flushToDisk();
  bool writeMember(GatheringOutput& output, const ArchiveMember& member);
  static int writeHeader(GatheringOutput& output, const ArchiveMember& member);
  bool writeContents(GatheringOutput& output, const ArchiveMember& member);
  bool finishTemporary();
  bool replaceTarget();
  // 0 if the file to replace is the one that was read, or the reason not to replace it.
  [[nodiscard]] int checkIsOwnTarget() const;
  void letGoOfFiles();
  // Does it until it doesn't give EBUSY any more, but not for ever.
  int takeStep(const std::function<int()>& step);
  int replaceOwnTarget();
  int takeFreeName();
  bool takeName();
  bool removeTemporary();
  void relocateMembers();
  bool failToWrite(int error) {
    return m_Archive.fail(&ErrorHandler::reportWriteError, m_TemporaryName.c_str(), error);
  }

  const char* m_FileName;
  Archive& m_Archive;
  support::Host& m_Host;
  std::string m_Target; // the file that the name leads to
  FileStatus m_OldStatus;
  FileStatus m_NewStatus; // of the complete temporary
  std::string m_TemporaryName;
  uint32_t m_TemporaryNumber = 0; // of the next name that is tried
  support::TemporaryFile m_Temporary;
  ContentsReader m_Contents;
  Others m_Others;
  bool m_HasLetGo = false;
  bool m_WasOvertaken = false; // which has not been reported
};

bool writeFile(const char* fileName, Archive& archive) {
  QUARN_ASSERT(1, fileName != NULL);
  return ArchiveFileWriter(fileName, archive, ArchiveFileWriter::Others::AreReported).write();
}

WriteEnd writeNewFile(const char* fileName, Archive& archive) {
  QUARN_ASSERT(1, fileName != NULL);
  constexpr auto Others = ArchiveFileWriter::Others::OvertakeIfThereIsAny;
  return ArchiveFileWriter(fileName, archive, Others).writeToTheEnd();
}

WriteEnd writeInTurn(const char* fileName, Archive& archive) {
  QUARN_ASSERT(1, fileName != NULL);
  constexpr auto Others = ArchiveFileWriter::Others::Overtake;
  return ArchiveFileWriter(fileName, archive, Others).writeToTheEnd();
}

// Whether a name that is taken, or a file that is another one, is somebody else's good work.
bool ArchiveFileWriter::isOvertaken(int error) const {
  if (mustBeNew()) return error == EEXIST;
  return m_Others == Others::Overtake && m_HasLetGo && error == support::FileHasChanged;
}

bool ArchiveFileWriter::checkTarget() {
  // A target that the host can't tell about (a circle of links) is not taken for a new file.
  // Nor is a link replaced that the host can't follow.
  if (const int error = m_Host.resolveLinks(m_FileName, m_Target); error != 0) {
    return m_Archive.fail(&ErrorHandler::reportWriteError, m_FileName, error);
  }
  const int statusError = m_Host.status(m_Target.c_str(), m_OldStatus);
  if (statusError != 0 && statusError != ENOENT) {
    return m_Archive.fail(&ErrorHandler::reportWriteError, m_FileName, statusError);
  }
  m_WasOvertaken = mustBeNew() && statusError == 0;
  if (m_WasOvertaken) return false;
  if (statusError == 0 && !m_Host.isWritable(m_Target.c_str())) {
    return m_Archive.fail(&ErrorHandler::reportReadOnlyOutput, m_FileName);
  }
  return true;
}

bool ArchiveFileWriter::write() {
  if (!checkTarget()) return false;
  // A table that could not be rebuilt has been reported. The old one would lead to wrong members.
  if (!m_Archive.updateAuxiliaryMembers()) return false;
  if (m_Archive.computeFileSize() > MaximumFileSize) {
    return m_Archive.fail(&ErrorHandler::reportWriteError, m_FileName, EFBIG);
  }
  if (!createTemporary()) return false;
  if (!writeTemporary() || !finishTemporary() || !replaceTarget()) return removeTemporary();
  [[maybe_unused]] const int error = closeTemporary();
  m_Archive.setFileName(m_FileName);
  relocateMembers();
  return true;
}

// The first free name of lib.a.0, lib.a.1 and so on, beside the target, so that the rename stays
// within one file system. A name of almost the greatest length has room for a number only when it
// loses its end.
int ArchiveFileWriter::tryNames(const std::function<int(const char*)>& step) {
  std::string_view beginning = m_Target;
  int error = EEXIST;
  while (error == EEXIST) {
    m_TemporaryName = std::string(beginning) + "." + std::to_string(m_TemporaryNumber++);
    error = step(m_TemporaryName.c_str());
    if (error != ENAMETOOLONG || beginning.size() < m_Target.size()) continue;
    beginning = withoutEnd(beginning, m_Host.getPathStyle());
    error = EEXIST;
    m_TemporaryNumber = 0;
  }
  return error;
}

// What takes the place of an old archive is nobody else's to read before it is as protected as that
// one was.
bool ArchiveFileWriter::createTemporary() {
  const uint32_t mode = replacesFile() ? PrivateMode : UsualMode;
  const int error = tryNames([&](const char* name) {
    return m_Archive.m_SourceFiles.openOther(
        [&] { return m_Host.createTemporary(name, mode, m_Temporary); });
  });
  return error == 0 || failToWrite(error);
}

// The name that was free in the beginning may be taken by now.
int ArchiveFileWriter::nameTemporary() {
  const int error = m_Host.giveName(m_Temporary, m_TemporaryName.c_str());
  if (error != EEXIST) return error;
  return tryNames([this](const char* name) { return m_Host.giveName(m_Temporary, name); });
}

int ArchiveFileWriter::closeTemporary() {
  const support::FileHandle handle = std::exchange(m_Temporary.handle, {});
  return handle.isOpen() ? m_Host.close(handle) : 0;
}

bool ArchiveFileWriter::writeTemporary() {
  GatheringOutput output(m_Host, m_Temporary.handle);
  // So small a piece is only gathered.
  int error = output.write(asBytes(ArchiveMagic));
  QUARN_ASSERT(1, error == 0);
  for (const ArchiveMember* member : m_Archive.getMembers()) {
    if (!writeMember(output, *member)) return false;
  }
  if (!m_Contents.finish()) return failToWrite(m_Contents.getError());
  error = m_Archive.closeInputs();
  if (error == 0) error = output.drain();
  if (error == 0) error = m_Host.flush(m_Temporary.handle);
  if (error == 0) error = flushToDisk();
  if (error == 0) error = m_Host.statusOf(m_Temporary.handle, m_NewStatus);
  return error == 0 || failToWrite(error);
}

// Names may be on the disk before the bytes are: a power failure would then leave an empty file
// where the old archive was, and with it members that are nowhere else. What a new archive is made
// of is still there.
int ArchiveFileWriter::flushToDisk() {
  return replacesFile() ? m_Host.flushToDisk(m_Temporary.handle) : 0;
}

bool ArchiveFileWriter::writeMember(GatheringOutput& output, const ArchiveMember& member) {
  QUARN_ASSERT(1, output.getPosition() == member.getOffset());
  if (const int error = writeHeader(output, member); error != 0) return failToWrite(error);
  if (!writeContents(output, member)) return false;
  if (member.getSize() % 2 == 0) return true;
  const int error = output.write({&PaddingByte, 1});
  return error == 0 || failToWrite(error);
}

int ArchiveFileWriter::writeHeader(GatheringOutput& output, const ArchiveMember& member) {
  std::array<uint8_t, MemberHeaderSize> header;
  putMemberHeader(header, nameField(member),
                  {static_cast<uint32_t>(member.getDate()), member.getUid(), member.getGid(),
                   member.getMode(), member.getSize()});
  return output.write(header);
}

bool ArchiveFileWriter::writeContents(GatheringOutput& output, const ArchiveMember& member) {
  if (!m_Contents.start(member)) return failToWrite(m_Contents.getError());
  for (;;) {
    std::span<const uint8_t> piece;
    if (!m_Contents.read(piece)) return failToWrite(m_Contents.getError());
    if (piece.empty()) return true;
    if (const int error = output.write(piece); error != 0) return failToWrite(error);
  }
}

// One that has no name yet is gone when it is closed: it gets one when it is going to be renamed at
// once, so that whatever ends the process in between finds almost no time to leave it behind.
bool ArchiveFileWriter::finishTemporary() {
  if (replacesFile()) m_Host.copyProtection(m_Target.c_str(), m_OldStatus, m_Temporary.handle);
  if (!m_Temporary.hasName) return true;
  const int error = closeTemporary();
  if (error == 0) return true;
  return m_Archive.fail(&ErrorHandler::reportCloseError, m_TemporaryName.c_str(), error);
}

// Without locks somebody else may have been faster, and what he has made must stay.
int ArchiveFileWriter::checkIsOwnTarget() const {
  const support::SourceFile* own = m_Archive.getOwnFile().get();
  if (own == nullptr || std::strcmp(m_FileName, own->getName()) != 0) return 0;
  FileStatus now;
  const int error = m_Host.status(m_Target.c_str(), now);
  if (error != 0 && error != ENOENT) return error;
  return support::isUnchanged(own->getStatus(), now) ? 0 : support::FileHasChanged;
}

// Everything is copied, so what is open can be let go of where it is in the way. The lock goes with
// it: somebody else may write before the next try, and is noticed there.
void ArchiveFileWriter::letGoOfFiles() {
  m_HasLetGo = true;
  m_Archive.m_SourceFiles.closeAll();
  if (m_Archive.getOwnFile() != nullptr) m_Archive.getOwnFile()->close();
}

// Not every disk replaces a file that somebody has open: first of all oneself. And who looks at
// each file that is new or being read, as a virus scanner does, keeps it for moments.
int ArchiveFileWriter::takeStep(const std::function<int()>& step) {
  int error = step();
  if (error != EBUSY) return error;
  letGoOfFiles();
  error = step();
  for (const uint32_t wait : {10U, 20U, 40U, 80U, 160U, 320U, 640U}) {
    if (error != EBUSY) return error;
    m_Host.pause(wait);
    error = step();
  }
  return error;
}

int ArchiveFileWriter::replaceOwnTarget() {
  const support::SourceFile* own = m_Archive.getOwnFile().get();
  return m_Host.replaceAlone(own != nullptr ? own->getStatus() : m_OldStatus, [this] {
    int error = checkIsOwnTarget();
    if (error == 0) error = nameTemporary();
    return error != 0 ? error : m_Host.rename(m_TemporaryName.c_str(), m_Target.c_str());
  });
}

int ArchiveFileWriter::takeFreeName() {
  const int error = nameTemporary();
  return error != 0 ? error : m_Host.renameNew(m_TemporaryName.c_str(), m_Target.c_str());
}

bool ArchiveFileWriter::takeName() {
  const int error = takeStep([this] { return mustBeNew() ? takeFreeName() : replaceOwnTarget(); });
  m_WasOvertaken = isOvertaken(error);
  if (error == 0 || m_WasOvertaken) return error == 0;
  return m_Archive.fail(&ErrorHandler::reportWriteError, m_FileName, error);
}

// Only a regular file is ever replaced: a directory or a device stays what it is.
bool ArchiveFileWriter::replaceTarget() {
  if (m_OldStatus.kind == FileKind::Directory || m_OldStatus.kind == FileKind::Special) {
    const int reason = m_OldStatus.kind == FileKind::Directory ? EISDIR : EINVAL;
    return m_Archive.fail(&ErrorHandler::reportDeleteError, m_FileName, reason);
  }
  return takeName();
}

// The one way out of every failure. What made it necessary has been reported, so a temporary that
// can't be removed is not told of as well.
bool ArchiveFileWriter::removeTemporary() {
  [[maybe_unused]] const int closeError = closeTemporary();
  if (!m_Temporary.hasName) return false;
  [[maybe_unused]] const int error =
      takeStep([this] { return m_Host.remove(m_TemporaryName.c_str()); });
  return false;
}

// The old files are let go of, and with them the lock on the old archive.
void ArchiveFileWriter::relocateMembers() {
  std::shared_ptr<support::SourceFile> file =
      m_Archive.m_SourceFiles.remember(m_Archive.getFileName(), m_NewStatus);
  uint64_t offset = ArchiveMagic.size();
  for (ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    member->releaseContentsLocation();
    member->setLocation(file, static_cast<uint32_t>(offset + MemberHeaderSize), false);
    offset = nextHeaderOffset(offset, member->m_Size);
  }
  m_Archive.dropMadeTables();
  if (!m_Archive.m_AreSymbolsWanted) m_Archive.m_ReadSymbolTable.reset();
  m_Archive.m_HeldFiles.assign(1, file);
  m_Archive.m_OwnFile = std::move(file);
  // They have been read to the end, and the archive is written.
  std::string name;
  static_cast<void>(m_Archive.m_SourceFiles.takeCloseError(name));
}

} // namespace arlib
