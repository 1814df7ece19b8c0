// SPDX-License-Identifier: Apache-2.0
//
// Reading: from header to header, through a small window, with the long names at hand by the time a
// member needs one, since their table stands in front. Writing: the two tables are computed whole
// from the members' sizes, and then everything goes out in order, once.
//
// Members of the old library that lie side by side and keep their headers are one range, which is
// copied as one: in a library of which one member changes that is nearly all of it. Only good
// libraries come here; what is checked is what a reader has to look at anyway.

#include "bench/compare/limit_library.h"

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <optional>

namespace bench {

using namespace arlib;

namespace {

// Enough for a few small members; little is read in vain behind a large one.
constexpr size_t HeaderWindow = 32 * 1024;

void setNameField(MemberHeader& header, std::string_view field) {
  std::fill_n(header.begin(), NameField.width, ' ');
  std::copy(field.begin(), field.end(), header.begin());
}

MemberHeader makeHeader(std::string_view nameField, const MemberHeaderNumbers& numbers) {
  std::array<uint8_t, MemberHeaderSize> bytes;
  putMemberHeader(bytes, nameField, numbers);
  MemberHeader header;
  std::memcpy(header.data(), bytes.data(), header.size());
  return header;
}

std::string_view textOf(const MemberHeader& header) {
  return {header.data(), header.size()};
}

uint32_t wordAt(std::string_view bytes, size_t place) {
  return getBigEndian32(reinterpret_cast<const uint8_t*>(bytes.data()) + place);
}

// The table of the long names, and what stands for each member's name in its header.
struct NameFields {
  explicit NameFields(const std::vector<Member>& members);
  std::string table;
  std::vector<std::string> fields;
};

NameFields::NameFields(const std::vector<Member>& members) {
  for (const Member& member : members) {
    if (member.name.size() <= MaximumShortName) {
      fields.push_back(member.name + "/");
      continue;
    }
    fields.push_back("/" + std::to_string(table.size()));
    table += member.name;
    table += LongNameTerminator;
  }
}

uint64_t spaceOf(uint64_t size) {
  return nextHeaderOffset(0, size);
}

std::string symbolTable(const std::vector<Member>& members, const PublishedNames& names,
                        uint64_t longNames) {
  uint32_t count = 0;
  for (const uint32_t each : names.counts)
    count += each;
  std::string table(4 + 4 * size_t{count}, '\0');
  auto* place = reinterpret_cast<uint8_t*>(table.data());
  putBigEndian32(place, count);
  // The symbol table comes first, so its own size is part of every offset in it.
  uint64_t offset = ArchiveMagic.size() + spaceOf(table.size() + names.texts.size());
  if (longNames != 0) offset += spaceOf(longNames);
  for (size_t i = 0; i < members.size(); ++i) {
    for (uint32_t left = names.counts[i]; left > 0; --left)
      putBigEndian32(place += 4, static_cast<uint32_t>(offset));
    offset += spaceOf(members[i].getSize());
  }
  return table;
}

class LibraryWriter {
public:
  LibraryWriter(const std::string& path, const InputFile* old) : m_Output(path), m_Old(old) {
    m_Output.put(ArchiveMagic);
  }

  // In two pieces, so that offsets and names of a large symbol table need not be put together.
  void putTable(std::string_view nameField, std::string_view first, std::string_view second);
  void putMember(Member& member, std::string_view nameField);
  void finish();

private:
  void putOldMember(const Member& member, std::string_view nameField);
  void putFile(Member& member, std::string_view nameField);
  void putPadding(uint64_t size);
  void copyRange();

  OutputFile m_Output;
  const InputFile* m_Old;
  uint64_t m_RangeStart = 0; // of what is to be copied as it stands
  uint64_t m_RangeEnd = 0;
};

void LibraryWriter::putTable(std::string_view nameField, std::string_view first,
                             std::string_view second) {
  const uint64_t size = first.size() + second.size();
  MemberHeaderNumbers numbers;
  numbers.size = static_cast<uint32_t>(size);
  m_Output.put(textOf(makeHeader(nameField, numbers)));
  m_Output.put(first);
  m_Output.put(second);
  putPadding(size);
}

void LibraryWriter::putMember(Member& member, std::string_view nameField) {
  if (member.isOld()) return putOldMember(member, nameField);
  copyRange();
  putFile(member, nameField);
}

void LibraryWriter::putOldMember(const Member& member, std::string_view nameField) {
  MemberHeader header = member.header;
  setNameField(header, nameField);
  // The header stays and the member follows the range: the range grows by it.
  if (header == member.header && member.offset == m_RangeEnd) {
    m_RangeEnd = member.getEnd();
    return;
  }
  copyRange();
  m_Output.put(textOf(header));
  m_RangeStart = member.getContentsOffset();
  m_RangeEnd = member.getEnd();
}

void LibraryWriter::putFile(Member& member, std::string_view nameField) {
  std::optional<InputFile> file;
  if (member.kept.empty()) describe(member, file.emplace(member.path));
  setNameField(member.header, nameField);
  m_Output.put(textOf(member.header));
  if (file)
    m_Output.copy(*file, 0, file->getSize());
  else
    m_Output.put(member.kept);
  putPadding(member.getSize());
}

void LibraryWriter::putPadding(uint64_t size) {
  if (size % 2 != 0) m_Output.put(static_cast<char>(PaddingByte));
}

void LibraryWriter::copyRange() {
  if (m_RangeStart < m_RangeEnd) m_Output.copy(*m_Old, m_RangeStart, m_RangeEnd - m_RangeStart);
  m_RangeStart = m_RangeEnd = 0;
}

void LibraryWriter::finish() {
  copyRange();
  m_Output.flush();
}

} // namespace

uint32_t headerNumber(const MemberHeader& header, HeaderField field, uint32_t base) {
  uint32_t number = 0;
  parseHeaderNumber({header.data() + field.position, field.width}, base, field.width, number);
  return number;
}

Library::Library(const std::string& path) : file(path) {
  Window window(file, HeaderWindow);
  std::string longNames;
  Member member;
  for (uint64_t offset = ArchiveMagic.size(); offset < file.getSize(); offset = member.getEnd()) {
    const std::string_view header = window.at(offset, MemberHeaderSize);
    std::copy(header.begin(), header.end(), member.header.begin());
    member.offset = offset;
    const std::string_view field = header.substr(0, NameField.width);
    if (field == SymbolTableName) {
      m_SymbolTableOffset = member.getContentsOffset();
      m_SymbolTableSize = member.getSize();
    } else if (field == FileNameTableName) {
      longNames.resize(member.getSize());
      file.read(longNames.data(), member.getContentsOffset(), longNames.size());
    } else {
      const size_t place = field[0] == '/' ? std::strtoul(field.data() + 1, nullptr, 10) : 0;
      // A short name ends at its "/" as a long one does.
      const std::string_view text = field[0] == '/' ? longNames : field;
      member.name = text.substr(place, text.find('/', place) - place);
      members.push_back(member);
    }
  }
}

std::string Library::readSymbolTable() const {
  std::string bytes(m_SymbolTableSize, '\0');
  file.read(bytes.data(), m_SymbolTableOffset, m_SymbolTableSize);
  return bytes;
}

// Each offset must be within the file, and there must be as many names as offsets.
void Library::checkSymbolTable() const {
  if (m_SymbolTableSize == 0) return;
  Window window(file, HeaderWindow);
  const auto forEachPiece = [&](uint64_t start, uint64_t end, auto look) {
    for (uint64_t place = start; place < end; place += HeaderWindow)
      look(window.at(m_SymbolTableOffset + place, std::min<uint64_t>(HeaderWindow, end - place)));
  };
  uint64_t names = 0;
  uint32_t largest = 0;
  const uint32_t count = wordAt(window.at(m_SymbolTableOffset, 4), 0);
  const uint64_t firstName = 4 + 4 * uint64_t{count};
  forEachPiece(4, firstName, [&](std::string_view offsets) {
    for (size_t i = 0; i < offsets.size(); i += 4)
      largest = std::max(largest, wordAt(offsets, i));
  });
  forEachPiece(firstName, m_SymbolTableSize, [&](std::string_view texts) {
    names += static_cast<uint64_t>(std::count(texts.begin(), texts.end(), '\0'));
  });
  if (largest >= file.getSize() || names != count) fail("symbol table");
}

Member memberFromFile(const std::string& path) {
  return {.name = path.substr(path.rfind('/') + 1), .path = path};
}

void describe(Member& member, const InputFile& file) {
  const struct stat& status = file.getStatus();
  member.header = makeHeader("", {.date = static_cast<uint32_t>(status.st_mtime),
                                  .uid = status.st_uid,
                                  .gid = status.st_gid,
                                  .mode = status.st_mode,
                                  .size = static_cast<uint32_t>(status.st_size)});
}

void writeLibrary(const std::string& path, std::vector<Member>& members,
                  const PublishedNames* names, const InputFile* old) {
  // As the tool does it: a temporary and a rename are part of what a job costs at least.
  const std::string temporary = path + ".new";
  const NameFields nameFields(members);
  LibraryWriter writer(temporary, old);
  if (names != nullptr)
    writer.putTable("/", symbolTable(members, *names, nameFields.table.size()), names->texts);
  if (!nameFields.table.empty()) writer.putTable("//", nameFields.table, {});
  for (size_t i = 0; i < members.size(); ++i)
    writer.putMember(members[i], nameFields.fields[i]);
  writer.finish();
  if (std::rename(temporary.c_str(), path.c_str()) != 0) fail(path);
}

} // namespace bench
