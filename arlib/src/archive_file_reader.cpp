// SPDX-License-Identifier: Apache-2.0
//
// From the bytes of an archive to its members: magic, then for each member header, name, contents
// and padding, in the order in which a forward reader meets them, since the first failure is the
// one that is told. Fields and their places are those of archive_format.h.
//
// Sizes, offsets and indices are the file's word against ours: each is compared with the bytes that
// are there before anything rests on it. A member that claims more than the file has, a long name
// whose index leads out of its table or into the middle of an end, a number field with letters, a
// second long-name table: each has its report here. No pass is longer than the file, and memory
// grows with the members that there are, not with those that a header promises.
#include "arlib/src/archive_file_reader.h"

#include "arlib/interface/archive_file_reader.h"
#include "arlib/src/read_symbol_table.h"
#include "support/interface/host_files.h"
#include "support/interface/path.h"

#include <algorithm>
#include <cerrno>
#include <cstring>

namespace arlib {

namespace {

bool isBlank(std::string_view field) {
  return field.find_first_not_of(' ') == std::string_view::npos;
}

// Header fields are shown as they stand, up to a NUL.
std::string_view untilNul(std::string_view field) {
  return field.substr(0, field.find('\0'));
}

std::string_view asText(std::span<const uint8_t> bytes) {
  return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

} // namespace

bool readFile(const char* fileName, Archive& archive) {
  QUARN_ASSERT(1, fileName != NULL);
  return ArchiveFileReader(archive).read(fileName);
}

bool readFile(const std::shared_ptr<support::SourceFile>& file, Archive& archive) {
  QUARN_ASSERT(1, file != NULL);
  return ArchiveFileReader(archive).read(file);
}

void ArchiveFileReader::start(const char* fileName) {
  m_Archive.clear();
  m_Archive.setFileName(fileName);
  m_Archive.m_ReadOnly = false;
  m_Archive.m_SymbolTableMode = SymbolTableMode::IfSymbols;
}

bool ArchiveFileReader::read(const char* fileName) {
  start(fileName);
  // A device or a socket is not even opened: that could have effects, or fail in words of its own.
  if (support::fileKind(m_Host, fileName) == support::FileKind::Special) {
    return m_Archive.stop(&ErrorHandler::reportReadError, nullptr, EINVAL);
  }
  if (const int error = m_Archive.m_SourceFiles.open(fileName, m_File); error != 0) {
    return m_Archive.stop(&ErrorHandler::reportReadError, nullptr, error);
  }
  return readTables();
}

bool ArchiveFileReader::read(const std::shared_ptr<support::SourceFile>& file) {
  m_File = file;
  start(file->getName());
  return readTables();
}

bool ArchiveFileReader::readTables() {
  if (!readOpenFile() || !checkUnchanged() || !readSymbolTable()) {
    m_Archive.clear();
    return false;
  }
  m_Archive.m_OwnFile = m_File;
  m_Archive.m_ReadOnly = !m_Host.isWritable(m_File->getName());
  return true;
}

// Headers of one state of the file and tables of another would name wrong members.
bool ArchiveFileReader::checkUnchanged() {
  const int error = m_File->checkUnchanged();
  return error == 0 || m_Archive.stop(&ErrorHandler::reportReadError, nullptr, error);
}

bool ArchiveFileReader::readOpenFile() {
  m_Status = m_File->getStatus();
  if (m_Status.kind != support::FileKind::RegularFile) {
    const int error = m_Status.kind == support::FileKind::Directory ? EISDIR : EINVAL;
    return m_Archive.stop(&ErrorHandler::reportReadError, nullptr, error);
  }
  m_Window.setFile(m_File.get());
  return readMagic() && readMembers();
}

bool ArchiveFileReader::readMagic() {
  int error = 0;
  const std::string_view magic = asText(m_Window.fetch(0, ArchiveMagic.size(), error));
  if (magic.size() < ArchiveMagic.size()) {
    return m_Archive.stop(&ErrorHandler::reportReadError, nullptr, error);
  }
  if (magic != ArchiveMagic) return m_Archive.stop(&ErrorHandler::reportBadArchiveMagic);
  return checkToldSize();
}

// A file that the host makes up as it is read says that it is empty. Taken at its word, it would be
// an archive without members.
bool ArchiveFileReader::checkToldSize() {
  if (static_cast<uint64_t>(m_Status.size) >= ArchiveMagic.size()) return true;
  return checkUnchanged() && m_Archive.stop(&ErrorHandler::reportReadError, nullptr, EINVAL);
}

bool ArchiveFileReader::readMembers() {
  m_Offset = ArchiveMagic.size();
  for (;;) {
    const Pass pass = readMember();
    if (pass == Pass::End) break;
    if (pass == Pass::Failure) return false;
    ++m_Counter;
  }
  m_Archive.noteTablesUpToDate();
  // The table that they belong in has yet to be made.
  if (m_HasFoldersInHeaders) m_Archive.noteEdit(Edit::NewName);
  return true;
}

ArchiveFileReader::Pass ArchiveFileReader::readMember() {
  if (const Pass pass = readHeader(); pass != Pass::Member) return pass;
  std::string_view name;
  if (!parseHeader() || !parseName(name)) return Pass::Failure;
  ArchiveMember* member = addMember(name);
  if (member == nullptr) return Pass::Failure;
  const std::string_view nameField = field(NameField);
  if (m_Counter == 0 && (nameField == SymbolTableName || m_IsWideSymbolTable)) {
    m_Archive.m_SymbolTable = member;
    member->m_Type = SymbolTableArchiveMemberType::getInstance();
    m_HasWideSymbols = m_IsWideSymbolTable;
  }
  if (m_Counter <= 1 && nameField == FileNameTableName && m_Archive.m_FileNameTable == nullptr) {
    m_Archive.m_FileNameTable = member;
    member->m_Type = FileNameTableArchiveMemberType::getInstance();
  }
  if (!(areContentsTaken(member) ? takeAuxiliaryContents(member) : skipContents()) ||
      !skipPadding()) {
    return Pass::Failure;
  }
  m_Offset = nextHeaderOffset(m_Offset, m_Numbers.size);
  return Pass::Member;
}

// Takes the first bytes of the contents along with the header: they decide the member's type.
ArchiveFileReader::Pass ArchiveFileReader::readHeader() {
  int error = 0;
  const std::span<const uint8_t> bytes =
      m_Window.fetch(m_Offset, MemberHeaderSize + elfext::RecognizedBytes, error);
  if (error != 0) {
    m_Archive.stop(&ErrorHandler::reportReadError, nullptr, error);
    return Pass::Failure;
  }
  if (bytes.empty()) return Pass::End;
  if (bytes.size() < MemberHeaderSize) {
    m_Archive.stop(&ErrorHandler::reportTruncatedMemberHeader, m_Offset);
    return Pass::Failure;
  }
  std::memcpy(m_HeaderBytes, bytes.data(), MemberHeaderSize);
  m_Header = std::string_view(m_HeaderBytes, MemberHeaderSize);
  m_FirstBytes.assign(bytes.begin() + MemberHeaderSize, bytes.end());
  return Pass::Member;
}

bool ArchiveFileReader::parseHeader() {
  const std::string_view name = field(NameField);
  m_IsWideSymbolTable = m_Counter == 0 && name == WideSymbolTableName &&
                        m_Archive.getMachines() == elfext::ObjectOutline::Machines::Any;
  m_MayBeBlank = name == SymbolTableName || name == FileNameTableName || m_IsWideSymbolTable;
  if (field(MagicField) != MemberMagic &&
      !m_Archive.goOn(&ErrorHandler::reportBadMemberMagic, m_Offset)) {
    return false;
  }
  return parseNumber(DateField, 10, &ErrorHandler::reportBadDate, m_Numbers.date) &&
         parseNumber(UidField, 10, &ErrorHandler::reportBadUid, m_Numbers.uid) &&
         parseNumber(GidField, 10, &ErrorHandler::reportBadGid, m_Numbers.gid) &&
         parseNumber(ModeField, 8, &ErrorHandler::reportBadMode, m_Numbers.mode) && parseSize();
}

bool ArchiveFileReader::parseNumber(HeaderField which, uint32_t base, FieldReport report,
                                    uint32_t& value) {
  const std::string_view text = field(which);
  if (parseHeaderNumber(text, base, which.width, value)) return true;
  value = 0;
  if (m_MayBeBlank && isBlank(text)) return true;
  return m_Archive.goOn(report, m_Offset, untilNul(text));
}

bool ArchiveFileReader::parseSize() {
  const std::string_view text = field(SizeField);
  if (parseHeaderNumber(text, 10, SizeField.width, m_Numbers.size)) return true;
  return m_Archive.stop(&ErrorHandler::reportBadSize, m_Offset, untilNul(text));
}

bool ArchiveFileReader::parseName(std::string_view& name) {
  m_LongNameIndex = ArchiveMember::NoFileNameTableOffset;
  name = {};
  if (m_MayBeBlank) return true;
  const std::string_view text = field(NameField);
  if (text[0] == '/' && text[1] >= '0' && text[1] <= '9')
    return parseLongName(text.substr(1), name);
  return parseShortName(text, name);
}

bool ArchiveFileReader::parseLongName(std::string_view digits, std::string_view& name) {
  if (m_Archive.m_FileNameTable == nullptr) {
    return m_Archive.goOn(&ErrorHandler::reportNoLongNameTable, m_Offset);
  }
  uint32_t index = 0;
  const auto width = static_cast<uint32_t>(digits.size());
  if (!parseHeaderNumber(digits, 10, width, index)) {
    return m_Archive.goOn(&ErrorHandler::reportBadLongNameIndex, m_Offset, untilNul(digits));
  }
  m_LongNameIndex = index;
  const std::optional<std::string_view> found = m_LongNames.nameAt(index);
  if (!found) {
    return m_Archive.goOn(&ErrorHandler::reportLongNameIndexOutOfRange, m_Offset, index,
                          static_cast<uint32_t>(m_LongNames.getSize()));
  }
  name = *found;
  return true;
}

// Some archivers write folders of short names here.
bool ArchiveFileReader::parseShortName(std::string_view field, std::string_view& name) {
  const size_t slash = m_Archive.m_KeepFolders ? field.rfind('/') : field.find('/');
  if (slash == std::string_view::npos)
    return m_Archive.goOn(&ErrorHandler::reportNoNameTerminator, m_Offset);
  // What ends a long name can't be a part of a name either.
  const bool hasEndInside = field.substr(0, slash + 1).find(LongNameTerminator) < slash;
  if (hasEndInside || !isBlank(field.substr(slash + 1))) {
    return m_Archive.goOn(&ErrorHandler::reportTrailingNameCharacter, m_Offset);
  }
  name = untilNul(field.substr(0, slash));
  return true;
}

// The host's numbers must fit the format, also for an archive that is only read. Asked once, and
// only if there is a member at all.
bool ArchiveFileReader::checkHostFile() {
  if (m_HostFileIsChecked) return true;
  m_HostFileIsChecked = true;
  support::FileStatus status = m_Status;
  if (m_Archive.m_TakeAnyNumbers) status.modificationTime = status.uid = status.gid = 0;
  const int error = refusalOf(status);
  if (error == 0) return true;
  return m_Archive.stop(&ErrorHandler::reportReadError, m_File->getName(), error);
}

ArchiveMember* ArchiveFileReader::addMember(std::string_view name) {
  if (!checkHostFile()) return nullptr;
  auto offset = static_cast<uint32_t>(m_Offset + MemberHeaderSize);
  uint32_t size = m_Numbers.size;
  if (!m_Archive.cutToFile(m_File->getName(), name, offset, size, m_Status.size)) return nullptr;
  ArchiveMember* member = m_Archive.appendFileMember(memberNameOf(name), m_File, offset, size);
  member->m_NameIsLeaf = !m_Archive.m_KeepFolders;
  member->m_FileNameTableOffset = m_LongNameIndex;
  member->m_Date = m_Numbers.date;
  member->m_Uid = m_Numbers.uid;
  member->m_Gid = m_Numbers.gid;
  member->m_Mode = m_Numbers.mode;
  member->m_Offset = static_cast<uint32_t>(m_Offset);
  member->m_Modified = false;
  const std::span<const uint8_t> first = m_FirstBytes;
  member->m_Type = ArchiveMemberType::decide(first.first(std::min<size_t>(first.size(), size)));
  return member;
}

// A long name is a view of the table, which stays; a short one stands in a buffer that doesn't.
std::string_view ArchiveFileReader::memberNameOf(std::string_view name) {
  if (m_LongNameIndex != ArchiveMember::NoFileNameTableOffset)
    return m_Archive.m_KeepFolders ? name : m_LongNames.leafOf(name);
  const std::string_view memberName = m_Archive.memberNameOf(name);
  m_HasFoldersInHeaders |= isLongName(memberName);
  return {m_Archive.copyToRegion(memberName), memberName.size()};
}

bool ArchiveFileReader::areContentsTaken(const ArchiveMember* member) const {
  return member == m_Archive.m_FileNameTable ||
         (member == m_Archive.m_SymbolTable && m_Archive.m_AreSymbolsWanted);
}

bool ArchiveFileReader::takeAuxiliaryContents(ArchiveMember* member) {
  const std::span<uint8_t> bytes = member->replaceContents(member->m_Size);
  member->m_ContentsAreViewed = true;
  size_t done = 0;
  const int error = m_File->readAt(bytes, m_Offset + MemberHeaderSize, done);
  if (error != 0 || done < m_Numbers.size) {
    return m_Archive.stop(&ErrorHandler::reportReadError, nullptr, error);
  }
  if (member == m_Archive.m_FileNameTable) m_LongNames = LongNames(asText(bytes));
  return true;
}

// A handler may have accepted a member that reaches beyond the end of the file; there is then
// nothing to go on with behind it.
bool ArchiveFileReader::skipContents() {
  if (m_Offset + MemberHeaderSize + m_Numbers.size <= static_cast<uint64_t>(m_Status.size)) {
    return true;
  }
  return m_Archive.stop(&ErrorHandler::reportReadError, nullptr, 0);
}

bool ArchiveFileReader::skipPadding() {
  if (m_Numbers.size % 2 == 0) return true;
  const uint64_t offset = m_Offset + MemberHeaderSize + m_Numbers.size;
  int error = 0;
  // The next header comes along, as it will be wanted next.
  const std::span<const uint8_t> bytes =
      m_Window.fetch(offset, 1 + MemberHeaderSize + elfext::RecognizedBytes, error);
  if (bytes.empty()) return m_Archive.stop(&ErrorHandler::reportReadError, nullptr, error);
  if (bytes[0] == PaddingByte) return true;
  return m_Archive.goOn(&ErrorHandler::reportBadPadding, offset, static_cast<int8_t>(bytes[0]));
}

bool ArchiveFileReader::readSymbolTable() {
  QUARN_ASSERT(1, m_Archive.m_SymbolTableUpToDate);
  m_Archive.m_Symbols.setSize(0);
  m_Archive.noteEdit(Edit::ReadSymbols);
  if (m_Archive.m_SymbolTable == nullptr) return true;
  if (m_HasWideSymbols) {
    // Nobody looks into it, and it is never written again.
    m_Archive.noteEdit(Edit::Publishing);
    return true;
  }
  auto table = std::make_unique<ReadSymbolTable>(getSymbolTableSource(), m_Archive.getMembers());
  if (!table->check(m_Archive)) return false;
  m_Archive.m_ReadSymbolTable = std::move(table);
  // Bytes that have only passed by may be newer than the headers.
  return m_Archive.m_AreSymbolsWanted || checkUnchanged();
}

TableSource ArchiveFileReader::getSymbolTableSource() const {
  const ArchiveMember* table = m_Archive.m_SymbolTable;
  const uint64_t size = table->getSize();
  if (table->hasContents()) return {.text = asText(table->getContents()), .size = size};
  return {.file = m_File.get(), .offset = table->getContentsLocation()->offset, .size = size};
}

} // namespace arlib
