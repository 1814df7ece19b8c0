// SPDX-License-Identifier: Apache-2.0
//
// From the description of an object to its bytes, in both classes and byte orders. First all
// contents are put together, since putting a name may make a string table grow; then they are
// placed, each at a multiple of the class's word; then headers are written, in which every told
// value stands in place of the right one. The records are written from their description (field,
// width, order), and share nothing with the product's but the constants' names.
//
// The layout is made anew by each question about it: tests ask little, and what was told in between
// counts.

#include "tests/support/object_builder.h"

#include "elfext/interface/elf_constants.h"

#include <algorithm>
#include <unordered_map>

namespace testsupport {

using namespace elfext;

namespace {

// Where the table has the text with its terminator, or npos.
size_t findText(const std::string& table, const std::string& text) {
  return table.find(text + '\0');
}

} // namespace

SectionBuilder& SectionBuilder::add(Piece piece) {
  m_Pieces.push_back(std::move(piece));
  return *this;
}

SectionBuilder& SectionBuilder::bytes(std::string_view bytes) {
  return add({Piece::Kind::Bytes, std::string(bytes), 0, 0, {}, {}});
}

SectionBuilder& SectionBuilder::word(uint64_t value, size_t width) {
  return add({Piece::Kind::Word, {}, value, width, {}, {}});
}

SectionBuilder& SectionBuilder::symbol(SymbolSpec symbol) {
  return add({Piece::Kind::Symbol, {}, 0, 0, std::move(symbol), {}});
}

SectionBuilder& SectionBuilder::relocation(RelocationSpec relocation) {
  return add({Piece::Kind::Relocation, {}, 0, 0, {}, relocation});
}

SectionBuilder& SectionBuilder::dynamic(uint64_t tag, uint64_t value) {
  return addressWord(tag).addressWord(value);
}

SectionBuilder& SectionBuilder::dynamicText(uint64_t tag, std::string text) {
  return addressWord(tag).add({Piece::Kind::TextAddress, std::move(text), 0, 0, {}, {}});
}

SectionBuilder& SectionBuilder::textOffset(std::string text) {
  return add({Piece::Kind::TextOffset, std::move(text), 0, 4, {}, {}});
}

SectionBuilder& SectionBuilder::note(std::string_view name, uint32_t type,
                                     std::vector<uint32_t> words) {
  const std::string terminated = std::string(name) + '\0';
  word(static_cast<uint32_t>(terminated.size()));
  word(static_cast<uint32_t>(words.size() * 4)).word(type);
  bytes(terminated).zeros((4 - terminated.size() % 4) % 4);
  for (const uint32_t each : words)
    word(each);
  return *this;
}

ObjectBuilder& ObjectBuilder::header(HeaderField field, uint64_t value) {
  m_Header[field] = value;
  return *this;
}

ObjectBuilder& ObjectBuilder::byteAt(size_t position, uint8_t value) {
  m_Overwritten.emplace_back(position, value);
  return *this;
}

ObjectBuilder& ObjectBuilder::tail(std::string_view bytes) {
  m_Tail += bytes;
  return *this;
}

ObjectBuilder& ObjectBuilder::nameless() {
  m_IsNameless = true;
  return *this;
}

ObjectBuilder& ObjectBuilder::separateTexts() {
  m_SharesEndings = false;
  return *this;
}

ObjectBuilder& ObjectBuilder::relocationsLast() {
  m_PutsRelocationsLast = true;
  return *this;
}

ObjectBuilder& ObjectBuilder::extendedNumbering() {
  m_IsExtended = true;
  return *this;
}

SectionBuilder& ObjectBuilder::section(std::string name, uint32_t type) {
  return m_Sections.emplace_back(std::move(name), type);
}

ObjectBuilder& ObjectBuilder::segment(SegmentSpec segment) {
  m_Segments.push_back(segment);
  return *this;
}

// Everything that must be known before a byte can be put. Vectors are indexed by section.
struct ObjectBuilder::Layout {
  std::vector<SectionBuilder> sections;
  std::vector<std::string> contents;
  std::vector<bool> mayGrow;
  std::vector<uint32_t> names;
  std::vector<uint64_t> offsets;
  uint32_t nameTable = 0; // 0: none
  uint64_t programHeaders = 0;
  uint64_t sectionHeaders = 0;
  bool sharesEndings = true;
  std::vector<std::unordered_map<std::string, uint32_t>> places; // of the texts met so far

  uint32_t textPlace(uint32_t table, const std::string& text) {
    if (text.empty() || table >= contents.size()) return 0;
    std::string& bytes = contents[table];
    // A table whose bytes the test has given itself stays as it is.
    if (!mayGrow[table]) {
      const size_t found = findText(bytes, text);
      return found == std::string::npos ? 0 : static_cast<uint32_t>(found);
    }
    const auto [place, isNew] =
        places[table].try_emplace(text, static_cast<uint32_t>(bytes.size()));
    if (!isNew) return place->second;
    const size_t shared = sharesEndings ? findText(bytes, text) : std::string::npos;
    if (shared == std::string::npos)
      bytes += text + '\0';
    else
      place->second = static_cast<uint32_t>(shared);
    return place->second;
  }
};

void ObjectBuilder::put(std::string& text, uint64_t value, size_t width) const {
  for (size_t i = 0; i < width; ++i) {
    const size_t place = m_Data == ElfData::Little ? i : width - 1 - i;
    text += static_cast<char>(value >> (8 * place) & 0xFF);
  }
}

void ObjectBuilder::putSymbol(std::string& text, const SymbolSpec& symbol, uint32_t name) const {
  put(text, name, 4);
  if (!isWide()) {
    put(text, symbol.value, 4);
    put(text, symbol.size, 4);
  }
  put(text, static_cast<uint64_t>(symbol.binding << 4 | symbol.type), 1);
  put(text, symbol.other, 1);
  put(text, symbol.section, 2);
  if (!isWide()) return;
  put(text, symbol.value, 8);
  put(text, symbol.size, 8);
}

void ObjectBuilder::putRelocation(std::string& text, const RelocationSpec& relocation,
                                  bool hasAddend) const {
  const uint64_t symbol = relocation.symbol;
  putAddress(text, relocation.offset);
  putAddress(text, isWide() ? symbol << 32 | relocation.type : symbol << 8 | relocation.type);
  if (hasAddend) putAddress(text, static_cast<uint64_t>(relocation.addend));
}

void ObjectBuilder::putPiece(std::string& text, const SectionBuilder& section,
                             const SectionBuilder::Piece& piece, Layout& layout) const {
  using Kind = SectionBuilder::Piece::Kind;
  switch (piece.kind) {
  case Kind::Bytes:
    text += piece.text;
    return;
  case Kind::Word:
    return piece.width == 0 ? putAddress(text, piece.value) : put(text, piece.value, piece.width);
  case Kind::Symbol: {
    const uint32_t place = layout.textPlace(section.m_Link, piece.symbol.name);
    return putSymbol(text, piece.symbol, piece.symbol.nameOffset.value_or(place));
  }
  case Kind::Relocation:
    return putRelocation(text, piece.relocation, section.m_Type == SHT_RELA);
  case Kind::TextOffset:
    return put(text, layout.textPlace(section.m_Link, piece.text), 4);
  case Kind::TextAddress:
    return putAddress(text, layout.textPlace(section.m_Link, piece.text));
  }
}

uint64_t ObjectBuilder::rightEntrySize(uint32_t type) const {
  switch (type) {
  case SHT_SYMTAB:
  case SHT_DYNSYM:
    return isWide() ? 24 : 16;
  case SHT_REL:
  case SHT_DYNAMIC:
    return isWide() ? 16 : 8;
  case SHT_RELA:
    return isWide() ? 24 : 12;
  case SHT_GROUP:
  case SHT_SYMTAB_SHNDX:
    return 4;
  default:
    return 0;
  }
}

ObjectBuilder::Layout ObjectBuilder::layOut() const {
  Layout layout;
  layout.sharesEndings = m_SharesEndings;
  if (m_Sections.size() > 1 || m_IsExtended)
    layout.sections.assign(m_Sections.begin(), m_Sections.end());
  if (!layout.sections.empty() && !m_IsNameless) {
    layout.nameTable = static_cast<uint32_t>(layout.sections.size());
    layout.sections.emplace_back(".shstrtab", SHT_STRTAB);
  }
  for (const SectionBuilder& section : layout.sections) {
    const bool isTable =
        section.m_Type == SHT_STRTAB && section.m_Pieces.empty() && !section.m_Size.has_value();
    layout.mayGrow.push_back(isTable);
    layout.contents.emplace_back(isTable ? 1 : 0, '\0');
  }
  layout.places.resize(layout.sections.size());
  for (size_t i = 0; i < layout.sections.size(); ++i) {
    for (const SectionBuilder::Piece& piece : layout.sections[i].m_Pieces) {
      // Putting a piece may make a string table grow, never this section.
      std::string text;
      // The null symbol comes by itself.
      if (piece.kind == SectionBuilder::Piece::Kind::Symbol && layout.contents[i].empty())
        text.assign(rightEntrySize(SHT_SYMTAB), '\0');
      putPiece(text, layout.sections[i], piece, layout);
      layout.contents[i] += text;
    }
  }
  for (const SectionBuilder& section : layout.sections)
    layout.names.push_back(
        layout.nameTable == 0 ? 0 : layout.textPlace(layout.nameTable, section.m_Name));
  placeContents(layout);
  return layout;
}

void ObjectBuilder::placeContents(Layout& layout) const {
  const uint64_t unit = isWide() ? 8 : 4;
  uint64_t end = isWide() ? 64 : 52;
  if (!m_Segments.empty()) layout.programHeaders = end;
  end += m_Segments.size() * (isWide() ? 56 : 32);
  layout.offsets.resize(layout.sections.size());
  const auto place = [&](size_t section) {
    end = (end + unit - 1) / unit * unit;
    layout.offsets[section] = end;
    end += layout.contents[section].size();
  };
  const auto isLast = [&](size_t section) {
    const uint32_t type = layout.sections[section].m_Type;
    return m_PutsRelocationsLast && (type == SHT_REL || type == SHT_RELA);
  };
  for (size_t i = 1; i < layout.sections.size(); ++i) {
    if (!isLast(i)) place(i);
  }
  for (size_t i = 1; i < layout.sections.size(); ++i) {
    if (isLast(i)) place(i);
  }
  end = (end + unit - 1) / unit * unit;
  if (!layout.sections.empty()) layout.sectionHeaders = end;
}

std::string ObjectBuilder::headerBytes(const Layout& layout) const {
  const auto count = layout.sections.size();
  const auto field = [this](HeaderField name, uint64_t right) {
    const auto found = m_Header.find(name);
    return found == m_Header.end() ? right : found->second;
  };
  std::string text = "\x7F"
                     "ELF";
  text += static_cast<char>(m_Class);
  text += static_cast<char>(m_Data);
  text += '\1'; // EI_VERSION
  text.resize(16, '\0');
  put(text, field(HeaderField::Type, ET_REL), 2);
  put(text, field(HeaderField::Machine, EM_ZEV), 2);
  put(text, field(HeaderField::Version, 1), 4);
  putAddress(text, field(HeaderField::Entry, 0));
  putAddress(text, field(HeaderField::PhOff, layout.programHeaders));
  putAddress(text, field(HeaderField::ShOff, layout.sectionHeaders));
  put(text, field(HeaderField::Flags, 0), 4);
  put(text, field(HeaderField::EhSize, isWide() ? 64 : 52), 2);
  put(text, field(HeaderField::PhEntSize, m_Segments.empty() ? 0 : isWide() ? 56 : 32), 2);
  put(text, field(HeaderField::PhNum, m_Segments.size()), 2);
  put(text, field(HeaderField::ShEntSize, isWide() ? 64 : 40), 2);
  put(text, field(HeaderField::ShNum, m_IsExtended ? 0 : count), 2);
  put(text, field(HeaderField::ShStrNdx, m_IsExtended ? SHN_XINDEX : layout.nameTable), 2);
  return text;
}

void ObjectBuilder::putSegment(std::string& text, const SegmentSpec& segment) const {
  put(text, segment.type, 4);
  if (isWide()) put(text, segment.flags, 4);
  putAddress(text, segment.offset);
  putAddress(text, segment.vaddr);
  putAddress(text, segment.paddr);
  putAddress(text, segment.filesz);
  putAddress(text, segment.memsz);
  if (!isWide()) put(text, segment.flags, 4);
  putAddress(text, segment.align);
}

void ObjectBuilder::putSectionHeader(std::string& text, uint32_t index,
                                     const Layout& layout) const {
  const SectionBuilder& section = layout.sections[index];
  const bool tellsCounts = index == 0 && m_IsExtended;
  const uint64_t size = tellsCounts ? layout.sections.size() : layout.contents[index].size();
  const uint32_t link = tellsCounts && section.m_Link == 0 ? layout.nameTable : section.m_Link;
  put(text, section.m_NameOffset.value_or(layout.names[index]), 4);
  put(text, section.m_Type, 4);
  putAddress(text, section.m_Flags);
  putAddress(text, section.m_Address);
  putAddress(text, section.m_Offset.value_or(layout.offsets[index]));
  putAddress(text, section.m_Size.value_or(size));
  put(text, link, 4);
  put(text, section.m_Info, 4);
  putAddress(text, section.m_Alignment);
  putAddress(text, section.m_EntrySize.value_or(rightEntrySize(section.m_Type)));
}

std::string ObjectBuilder::bytes() const {
  const Layout layout = layOut();
  std::string text = headerBytes(layout);
  for (const SegmentSpec& segment : m_Segments)
    putSegment(text, segment);
  if (!layout.sections.empty()) text.resize(layout.sectionHeaders, '\0');
  for (uint32_t i = 1; i < layout.sections.size(); ++i)
    text.replace(layout.offsets[i], layout.contents[i].size(), layout.contents[i]);
  for (uint32_t i = 0; i < layout.sections.size(); ++i)
    putSectionHeader(text, i, layout);
  text += m_Tail;
  for (const auto& [position, value] : m_Overwritten)
    // Last of all, and within the file: a position outside is a fault of the test.
    text.at(position) = static_cast<char>(value);
  return text;
}

uint64_t ObjectBuilder::offsetOf(uint32_t section) const {
  return layOut().offsets.at(section);
}

uint64_t ObjectBuilder::sizeOf(uint32_t section) const {
  return layOut().contents.at(section).size();
}

uint64_t ObjectBuilder::headerOffsetOf(uint32_t section) const {
  return layOut().sectionHeaders + section * uint64_t{isWide() ? 64U : 40U};
}

uint64_t ObjectBuilder::segmentHeaderOffsetOf(uint32_t segment) const {
  return layOut().programHeaders + segment * uint64_t{isWide() ? 56U : 32U};
}

ObjectBuilder objectWithSymbols(const std::vector<SymbolSpec>& symbols) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(4);
  SectionBuilder& table = file.section(".symtab", SHT_SYMTAB).link(3);
  for (const SymbolSpec& symbol : symbols)
    table.symbol(symbol);
  file.section(".strtab", SHT_STRTAB);
  return file;
}

} // namespace testsupport
