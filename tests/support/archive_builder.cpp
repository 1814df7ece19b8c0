// SPDX-License-Identifier: Apache-2.0
//
// The archive format once more, from its description and not from the product: 60 bytes of header
// in fields of 16, 12, 6, 6, 8, 10 and 2, contents, and a newline behind an odd size. Symbol tables
// are filled in when the bytes are asked for, as the offsets of all members are known only then.
// The parser is strict where the product's reader is patient: what the product writes must be plain
// to any archiver.

#include "tests/support/archive_builder.h"

#include <cstdlib>

namespace testsupport {

namespace {

constexpr size_t HeaderSize = 60;
constexpr std::array<size_t, 7> FieldWidths = {16, 12, 6, 6, 8, 10, 2};

std::string padded(std::string_view text, size_t width) {
  std::string field(text.substr(0, width));
  field.resize(width, ' ');
  return field;
}

std::string trimmed(std::string_view field) {
  const size_t last = field.find_last_not_of(' ');
  return std::string(field.substr(0, last == field.npos ? 0 : last + 1));
}

std::string joined(const std::vector<std::string>& names) {
  std::string table;
  for (const std::string& name : names)
    table += name + "/\n";
  return table;
}

bool isNumber(std::string_view text) {
  return !text.empty() && text.find_first_not_of("0123456789") == text.npos;
}

// The name that a header's field stands for, or an error.
std::string lookUpName(std::string_view field, std::string_view longNames, std::string& error) {
  if (field == "/" || field == "//") return {};
  if (field.size() > 1 && field.front() == '/') {
    const size_t start = std::strtoul(std::string(field.substr(1)).c_str(), nullptr, 10);
    const size_t end = longNames.find("/\n", start);
    // An offset into the middle of a name would read as a shorter name, and pass.
    const bool isBehindAName = start > 1 && start <= longNames.size();
    if (start > 0 && (!isBehindAName || longNames.substr(start - 2, 2) != "/\n")) {
      error = "a long name's offset is not the start of an entry";
    }
    if (end == longNames.npos) {
      error = "a long name is not in the table";
      return {};
    }
    return std::string(longNames.substr(start, end - start));
  }
  if (field.empty() || field.back() != '/' || field.find('/') != field.size() - 1) {
    error = "a name field has no slash at its end";
  }
  return std::string(field.substr(0, field.size() - 1));
}

} // namespace

ArchiveBuilder& ArchiveBuilder::badMagic(std::string_view magic) {
  m_Magic = magic;
  return *this;
}

ArchiveBuilder& ArchiveBuilder::append(std::string_view name, std::string_view nameField,
                                       std::string_view contents) {
  Member member;
  member.name = name;
  member.fields = {std::string(nameField), "1000000000", "1", "2", "100644", "", "`\n"};
  member.contents = contents;
  if (contents.size() % 2 != 0) member.padding = "\n";
  m_Members.push_back(member);
  return setField(Field_Size, std::to_string(contents.size()));
}

ArchiveBuilder& ArchiveBuilder::symbolTable(const std::vector<Symbol>& symbols) {
  size_t size = 4;
  for (const Symbol& symbol : symbols)
    size += 4 + symbol.name.size() + 1;
  symbolTableBytes(std::string(size, '\0'));
  m_Members.back().symbols = symbols;
  return *this;
}

ArchiveBuilder& ArchiveBuilder::symbolTableBytes(std::string_view contents) {
  return append("", "/", contents).numbers(0, 0, 0, "0");
}

ArchiveBuilder& ArchiveBuilder::longNames(const std::vector<std::string>& names) {
  return longNamesText(joined(names));
}

ArchiveBuilder& ArchiveBuilder::longNamesText(std::string_view contents) {
  m_LongNames = contents;
  return append("", "//", contents).numbers(0, 0, 0, "0");
}

ArchiveBuilder& ArchiveBuilder::member(std::string_view name, std::string_view contents) {
  const std::string entry = std::string(name) + "/";
  if (name.size() <= 15) return append(name, entry, contents);
  return append(name, "/" + std::to_string(m_LongNames.find(entry + "\n")), contents);
}

ArchiveBuilder& ArchiveBuilder::memberWithNameField(std::string_view field,
                                                    std::string_view contents) {
  return append("", field, contents);
}

ArchiveBuilder& ArchiveBuilder::setField(Field field, std::string_view text) {
  m_Members.back().fields[field] = text;
  return *this;
}

ArchiveBuilder& ArchiveBuilder::numbers(int64_t date, uint32_t uid, uint32_t gid,
                                        std::string_view octalMode) {
  setField(Field_Date, std::to_string(date));
  setField(Field_Uid, std::to_string(uid));
  setField(Field_Gid, std::to_string(gid));
  return setField(Field_Mode, octalMode);
}

ArchiveBuilder& ArchiveBuilder::blankNumbers() {
  for (const Field field : {Field_Date, Field_Uid, Field_Gid, Field_Mode})
    setField(field, "");
  return *this;
}

ArchiveBuilder& ArchiveBuilder::badPadding(char padding) {
  m_Members.back().padding = std::string(1, padding);
  return *this;
}

ArchiveBuilder& ArchiveBuilder::noPadding() {
  m_Members.back().padding.clear();
  return *this;
}

ArchiveBuilder& ArchiveBuilder::tail(std::string_view bytes) {
  m_Tail += bytes;
  return *this;
}

uint32_t ArchiveBuilder::offsetOf(std::string_view name) const {
  size_t offset = m_Magic.size();
  for (const Member& member : m_Members) {
    if (member.name == name && member.fields[Field_Name] != "/" &&
        member.fields[Field_Name] != "//")
      break;
    offset += HeaderSize + member.contents.size() + member.padding.size();
  }
  return static_cast<uint32_t>(offset);
}

std::string ArchiveBuilder::contentsOf(const Member& member) const {
  if (!member.symbols) return member.contents;
  std::string words = bigEndian(static_cast<uint32_t>(member.symbols->size()));
  std::string names;
  for (const Symbol& symbol : *member.symbols) {
    words += bigEndian(symbol.member.empty() ? symbol.offset : offsetOf(symbol.member));
    names += symbol.name + '\0';
  }
  return words + names;
}

std::string ArchiveBuilder::bytes() const {
  std::string text = m_Magic;
  for (const Member& member : m_Members) {
    for (size_t i = 0; i < FieldWidths.size(); ++i)
      text += padded(member.fields[i], FieldWidths[i]);
    text += contentsOf(member) + member.padding;
  }
  return text + m_Tail;
}

std::vector<ParsedMember> parseArchive(std::string_view bytes, std::string& error) {
  std::vector<ParsedMember> members;
  error.clear();
  if (!bytes.starts_with("!<arch>\n")) error = "no magic";
  std::string longNames;
  size_t offset = 8;
  while (error.empty() && offset < bytes.size()) {
    if (bytes.size() - offset < HeaderSize) {
      error = "a header is cut off";
      break;
    }
    ParsedMember member;
    member.offset = static_cast<uint32_t>(offset);
    size_t position = offset;
    for (size_t i = 0; i < FieldWidths.size(); ++i) {
      const std::string text = trimmed(bytes.substr(position, FieldWidths[i]));
      position += FieldWidths[i];
      if (i == 0) member.nameField = text;
      if (i > 0 && i < 6) member.numbers[i - 1] = text;
      if (i > 0 && i < 6 && !isNumber(text)) error = "a header field is no number";
      if (i == 6 && text != "`\n") error = "no member magic";
    }
    if (!error.empty()) break;
    const size_t size = std::strtoul(member.numbers[4].c_str(), nullptr, 10);
    const size_t paddedSize = size + size % 2;
    if (paddedSize > bytes.size() - position) {
      error = "contents are cut off";
      break;
    }
    member.contents = bytes.substr(position, size);
    if (size % 2 != 0 && bytes[position + size] != '\n') error = "wrong padding";
    if (member.nameField == "//") {
      if (members.size() > 1 || !longNames.empty()) error = "a misplaced long-name table";
      longNames = member.contents;
    }
    member.name = lookUpName(member.nameField, longNames, error);
    members.push_back(member);
    offset = position + paddedSize;
  }
  return members;
}

} // namespace testsupport
