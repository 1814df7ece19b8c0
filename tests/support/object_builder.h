// SPDX-License-Identifier: Apache-2.0
//
// ELF objects for tests, told section by section:
//
//   ObjectBuilder file = object(ElfClass::Class64, ElfData::Big);
//   file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(16);
//   file.section(".symtab", SHT_SYMTAB).link(3).symbol({.name = "main", .section = 1});
//   file.section(".strtab", SHT_STRTAB);
//
// Sections have their indices in the order of the calls, from 1; section 0 is made, and the
// section-name table comes last. String tables fill themselves with the names of those that link
// to them. The file is: ELF header, program headers, contents, section headers. Every field of
// every header may be given another value than the right one.
#pragma once

#include <cstdint>
#include <deque>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace testsupport {

enum class ElfClass : uint8_t { Class32 = 1, Class64 = 2 };
enum class ElfData : uint8_t { Little = 1, Big = 2 };

// Fields of the ELF header, under their standard names.
enum class HeaderField {
  Type,
  Machine,
  Version,
  Entry,
  PhOff,
  ShOff,
  Flags,
  EhSize,
  PhEntSize,
  PhNum,
  ShEntSize,
  ShNum,
  ShStrNdx,
};

struct SymbolSpec {
  std::string name = {};
  uint16_t section = 0; // st_shndx
  uint64_t value = 0;
  uint64_t size = 0;
  uint8_t type = 0;
  uint8_t binding = 1; // STB_GLOBAL
  uint8_t other = 0;
  std::optional<uint32_t> nameOffset = {}; // instead of the name's place
};

struct RelocationSpec {
  uint64_t offset = 0;
  uint32_t symbol = 0;
  uint32_t type = 0;
  int64_t addend = 0; // SHT_RELA only
};

struct SegmentSpec {
  uint32_t type = 1; // PT_LOAD
  uint32_t flags = 0;
  uint64_t offset = 0;
  uint64_t vaddr = 0;
  uint64_t paddr = 0;
  uint64_t filesz = 0;
  uint64_t memsz = 0;
  uint64_t align = 0;
};

class SectionBuilder {
public:
  SectionBuilder(std::string name, uint32_t type) : m_Name(std::move(name)), m_Type(type) {}

  SectionBuilder& flags(uint64_t value) { return set(m_Flags, value); }
  SectionBuilder& address(uint64_t value) { return set(m_Address, value); }
  SectionBuilder& link(uint32_t value) { return set(m_Link, value); }
  SectionBuilder& info(uint32_t value) { return set(m_Info, value); }
  SectionBuilder& alignment(uint64_t value) { return set(m_Alignment, value); }
  // Instead of the right ones.
  SectionBuilder& entrySize(uint64_t value) { return set(m_EntrySize, value); }
  SectionBuilder& size(uint64_t value) { return set(m_Size, value); }
  SectionBuilder& offset(uint64_t value) { return set(m_Offset, value); }
  SectionBuilder& nameOffset(uint32_t value) { return set(m_NameOffset, value); }

  // Contents, one behind the other. Words have the file's byte order.
  SectionBuilder& bytes(std::string_view bytes);
  SectionBuilder& zeros(size_t count) { return bytes(std::string(count, '\0')); }
  SectionBuilder& half(uint16_t value) { return word(value, 2); }
  SectionBuilder& word(uint32_t value) { return word(value, 4); }
  // 4 bytes in class 1, 8 in class 2.
  SectionBuilder& addressWord(uint64_t value) { return word(value, 0); }
  SectionBuilder& symbol(SymbolSpec symbol);
  SectionBuilder& relocation(RelocationSpec relocation);
  // The value is the place of the text in the string table, if a text is given.
  SectionBuilder& dynamic(uint64_t tag, uint64_t value);
  SectionBuilder& dynamicText(uint64_t tag, std::string text);
  // 4 bytes: where in the linked string table the text is.
  SectionBuilder& textOffset(std::string text);
  // A whole note; name and descriptor are padded to 4 bytes.
  SectionBuilder& note(std::string_view name, uint32_t type, std::vector<uint32_t> words);

private:
  friend class ObjectBuilder;

  // One piece of the contents. Width 0 is that of an address.
  struct Piece {
    enum class Kind { Bytes, Word, Symbol, Relocation, TextOffset, TextAddress } kind;
    std::string text;
    uint64_t value;
    size_t width;
    SymbolSpec symbol;
    RelocationSpec relocation;
  };

  template <class Field, class Value>
  SectionBuilder& set(Field& field, Value value) {
    field = value;
    return *this;
  }
  SectionBuilder& word(uint64_t value, size_t width);
  SectionBuilder& add(Piece piece);

  std::string m_Name;
  uint32_t m_Type;
  uint64_t m_Flags = 0;
  uint64_t m_Address = 0;
  uint32_t m_Link = 0;
  uint32_t m_Info = 0;
  uint64_t m_Alignment = 0;
  std::optional<uint64_t> m_EntrySize;
  std::optional<uint64_t> m_Size;
  std::optional<uint64_t> m_Offset;
  std::optional<uint32_t> m_NameOffset;
  std::vector<Piece> m_Pieces;
};

class ObjectBuilder {
public:
  ObjectBuilder(ElfClass elfClass, ElfData data) : m_Class(elfClass), m_Data(data) {}

  ObjectBuilder& machine(uint16_t value) { return header(HeaderField::Machine, value); }
  ObjectBuilder& type(uint16_t value) { return header(HeaderField::Type, value); }
  ObjectBuilder& osAbi(uint8_t value) { return byteAt(7, value); }
  // A field of the ELF header, instead of the right value.
  ObjectBuilder& header(HeaderField field, uint64_t value);
  // Overwrites a byte of the finished file.
  ObjectBuilder& byteAt(size_t position, uint8_t value);
  // Bytes at the end of the file.
  ObjectBuilder& tail(std::string_view bytes);
  // No section-name table.
  ObjectBuilder& nameless();
  // No text of a string table starts within another one: for tables of very many texts, where the
  // search for such an ending would take the time.
  ObjectBuilder& separateTexts();
  // The rows of relocation sections come behind all other contents, as compilers write them.
  ObjectBuilder& relocationsLast();
  // Counts and indices that need more than 16 bits are told by section 0.
  ObjectBuilder& extendedNumbering();

  // The next section, to be described further. Valid as long as the builder.
  SectionBuilder& section(std::string name, uint32_t type);
  // What is written of section 0: its fields, for extended numbering.
  SectionBuilder& sectionZero() { return m_Sections.front(); }
  ObjectBuilder& segment(SegmentSpec segment);

  [[nodiscard]] std::string bytes() const;
  // Where the contents of a section are in bytes(), and how many they are.
  [[nodiscard]] uint64_t offsetOf(uint32_t section) const;
  [[nodiscard]] uint64_t sizeOf(uint32_t section) const;
  // Where the header of a section, or of a segment, is.
  [[nodiscard]] uint64_t headerOffsetOf(uint32_t section) const;
  [[nodiscard]] uint64_t segmentHeaderOffsetOf(uint32_t segment) const;
  // The index of the section-name table.
  [[nodiscard]] uint32_t nameTable() const { return static_cast<uint32_t>(m_Sections.size()); }

private:
  struct Layout;

  void put(std::string& text, uint64_t value, size_t width) const;
  void putAddress(std::string& text, uint64_t value) const { put(text, value, isWide() ? 8 : 4); }
  void putPiece(std::string& text, const SectionBuilder& section,
                const SectionBuilder::Piece& piece, Layout& layout) const;
  void putSymbol(std::string& text, const SymbolSpec& symbol, uint32_t name) const;
  void putRelocation(std::string& text, const RelocationSpec& relocation, bool hasAddend) const;
  void putSectionHeader(std::string& text, uint32_t index, const Layout& layout) const;
  void putSegment(std::string& text, const SegmentSpec& segment) const;
  [[nodiscard]] std::string headerBytes(const Layout& layout) const;
  [[nodiscard]] Layout layOut() const;
  void placeContents(Layout& layout) const;
  [[nodiscard]] uint64_t rightEntrySize(uint32_t type) const;
  [[nodiscard]] bool isWide() const { return m_Class == ElfClass::Class64; }

  ElfClass m_Class;
  ElfData m_Data;
  std::map<HeaderField, uint64_t> m_Header;
  std::deque<SectionBuilder> m_Sections = {SectionBuilder("", 0)};
  std::vector<SegmentSpec> m_Segments;
  std::vector<std::pair<size_t, uint8_t>> m_Overwritten;
  std::string m_Tail;
  bool m_IsNameless = false;
  bool m_SharesEndings = true;
  bool m_PutsRelocationsLast = false;
  bool m_IsExtended = false;
};

inline ObjectBuilder object(ElfClass elfClass = ElfClass::Class32, ElfData data = ElfData::Little) {
  return {elfClass, data};
}

// An object whose sections 1 to 3 are 4 bytes of code, a table of these symbols, and its strings.
ObjectBuilder objectWithSymbols(const std::vector<SymbolSpec>& symbols);
// The same with one global symbol, in the code.
inline ObjectBuilder objectThatDefines(std::string name) {
  return objectWithSymbols({{.name = std::move(name), .section = 1}});
}

} // namespace testsupport
