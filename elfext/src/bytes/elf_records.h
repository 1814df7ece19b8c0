// SPDX-License-Identifier: Apache-2.0
//
// The records of the ELF standard, in the wide form of class 2, with the standard's field names
// without their prefixes. Class 1 values are widened when got and cut when put. Nothing is laid
// over the file's bytes: each record is taken apart field by field, so it may stand at any address
// and in either byte order. The caller has made sure that the record's bytes are there.
#pragma once

#include "elfext/interface/section_header.h"

#include <array>
#include <bit>
#include <cstdint>
#include <cstring>
#include <type_traits>

namespace elfext {

// How the words of one object are laid out, e_ident[EI_CLASS] and e_ident[EI_DATA] in short. It is
// passed by value: two objects may be read in turns, and no byte order is a state of the program.
struct RecordFormat {
  bool isWide = false; // class 2
  bool isLittle = true;

  [[nodiscard]] bool operator==(const RecordFormat&) const = default;
};

// Places in `ident`.
constexpr size_t EI_CLASS = 4;
constexpr size_t EI_DATA = 5;
constexpr size_t EI_VERSION = 6;
constexpr size_t EI_OSABI = 7;
constexpr size_t EI_ABIVERSION = 8;

// Elf32_Ehdr and Elf64_Ehdr.
struct FileHeader {
  std::array<uint8_t, 16> ident = {};
  uint16_t type = 0;
  uint16_t machine = 0;
  uint32_t version = 0;
  uint64_t entry = 0;
  uint64_t phoff = 0;
  uint64_t shoff = 0;
  uint32_t flags = 0;
  uint16_t ehsize = 0;
  uint16_t phentsize = 0;
  uint16_t phnum = 0;
  uint16_t shentsize = 0;
  uint16_t shnum = 0;
  uint16_t shstrndx = 0;
};

// Elf32_Phdr and Elf64_Phdr, whose flags stand at different places; the order here is that of class
// 2. Section headers are public, as sections keep theirs.
struct ProgramHeader {
  uint32_t type = 0;
  uint32_t flags = 0;
  uint64_t offset = 0;
  uint64_t vaddr = 0;
  uint64_t paddr = 0;
  uint64_t filesz = 0;
  uint64_t memsz = 0;
  uint64_t align = 0;
};

// Elf32_Sym and Elf64_Sym.
struct SymbolRow {
  uint32_t name = 0;
  uint8_t info = 0;
  uint8_t other = 0;
  uint16_t shndx = 0;
  uint64_t value = 0;
  uint64_t size = 0;

  [[nodiscard]] uint32_t getType() const { return info & 0xFU; }
  [[nodiscard]] uint32_t getBinding() const { return info >> 4U; }
};

// r_info, taken apart as the class says. Of a row without addend the addend is 0.
struct RelocationRow {
  uint64_t offset = 0;
  uint32_t symbol = 0;
  uint32_t type = 0;
  int64_t addend = 0;
};

// Bytes that each record takes in the file.
[[nodiscard]] constexpr uint32_t fileHeaderSize(bool isWide) {
  return isWide ? 64 : 52;
}
[[nodiscard]] constexpr uint32_t sectionHeaderSize(bool isWide) {
  return isWide ? 64 : 40;
}
[[nodiscard]] constexpr uint32_t programHeaderSize(bool isWide) {
  return isWide ? 56 : 32;
}
[[nodiscard]] constexpr uint32_t symbolRowSize(bool isWide) {
  return isWide ? 24 : 16;
}
[[nodiscard]] constexpr uint32_t relocationRowSize(bool isWide, bool hasAddend) {
  return (isWide ? 8U : 4U) * (hasAddend ? 3U : 2U);
}
// What sh_entsize should be in a table of fixed rows; 0 for all other types. Bytes.
[[nodiscard]] uint64_t expectedEntrySize(uint32_t type, uint32_t elfClass);

// Plain shifts, which both compilers turn into one instruction.
[[nodiscard]] inline uint16_t swapBytes(uint16_t word) {
  return static_cast<uint16_t>(word << 8 | word >> 8);
}
[[nodiscard]] inline uint32_t swapBytes(uint32_t word) {
  return word << 24 | (word & 0xFF00) << 8 | (word >> 8 & 0xFF00) | word >> 24;
}
[[nodiscard]] inline uint64_t swapBytes(uint64_t word) {
  return uint64_t{swapBytes(static_cast<uint32_t>(word))} << 32 |
         swapBytes(static_cast<uint32_t>(word >> 32));
}

// A word in the file's byte order, at any address.
template <class Word>
[[nodiscard]] Word getWord(const uint8_t* bytes, bool isLittle) {
  Word word;
  // Not a cast: the bytes may stand at any address.
  std::memcpy(&word, bytes, sizeof word);
  return isLittle == (std::endian::native == std::endian::little) ? word : swapBytes(word);
}

template <class Word>
void putWord(Word word, bool isLittle, uint8_t* bytes) {
  if (isLittle != (std::endian::native == std::endian::little)) word = swapBytes(word);
  std::memcpy(bytes, &word, sizeof word);
}

// A format that the compiler knows, as a constant of a type of its own.
template <bool IsWide, bool IsLittle>
using FixedFormat = std::integral_constant<RecordFormat, RecordFormat{IsWide, IsLittle}>;

// Calls the function with the fixed format: loops over rows then have no more to decide for each of
// them.
template <class Function>
auto withFixedFormat(RecordFormat format, Function function) {
  if (format.isWide)
    return format.isLittle ? function(FixedFormat<true, true>())
                           : function(FixedFormat<true, false>());
  return format.isLittle ? function(FixedFormat<false, true>())
                         : function(FixedFormat<false, false>());
}

// ---- How a record is taken apart and put together: told once for both directions, by a function
// that names the fields in file order to a codec, which either loads a field or stores it.

class FieldGetter {
public:
  FieldGetter(RecordFormat format, const uint8_t* bytes) : m_Format(format), m_Bytes(bytes) {}

  [[nodiscard]] bool isWide() const { return m_Format.isWide; }

  void field(uint8_t& value) { value = *m_Bytes++; }
  template <class Word>
  void field(Word& value) {
    value = getWord<Word>(m_Bytes, m_Format.isLittle);
    m_Bytes += sizeof value;
  }

  // A field of 4 bytes in class 1 and of 8 in class 2.
  void wideField(uint64_t& value) {
    if (isWide()) return field(value);
    uint32_t narrow = 0;
    field(narrow);
    value = narrow;
  }

private:
  RecordFormat m_Format;
  const uint8_t* m_Bytes;
};

class FieldPutter {
public:
  FieldPutter(RecordFormat format, uint8_t* bytes) : m_Format(format), m_Bytes(bytes) {}

  [[nodiscard]] bool isWide() const { return m_Format.isWide; }

  void field(const uint8_t& value) { *m_Bytes++ = value; }
  template <class Word>
  void field(const Word& value) {
    putWord(value, m_Format.isLittle, m_Bytes);
    m_Bytes += sizeof value;
  }

  void wideField(const uint64_t& value) {
    if (isWide()) return field(value);
    field(static_cast<uint32_t>(value));
  }

private:
  RecordFormat m_Format;
  uint8_t* m_Bytes;
};

// The record is const when it is put.
template <class Codec, class Record>
void codeSymbol(Codec codec, Record& record) {
  codec.field(record.name);
  if (!codec.isWide()) {
    codec.wideField(record.value);
    codec.wideField(record.size);
  }
  codec.field(record.info);
  codec.field(record.other);
  codec.field(record.shndx);
  if (!codec.isWide()) return;
  codec.field(record.value);
  codec.field(record.size);
}

// The record at the bytes, or the bytes of the record.
void getRecord(RecordFormat format, const uint8_t* bytes, FileHeader& record);
void putRecord(RecordFormat format, const FileHeader& record, uint8_t* bytes);
void getRecord(RecordFormat format, const uint8_t* bytes, SectionHeader& record);
void putRecord(RecordFormat format, const SectionHeader& record, uint8_t* bytes);
void getRecord(RecordFormat format, const uint8_t* bytes, ProgramHeader& record);
void putRecord(RecordFormat format, const ProgramHeader& record, uint8_t* bytes);
// Inline, as symbol rows are the most of what is read.
inline void getRecord(RecordFormat format, const uint8_t* bytes, SymbolRow& record) {
  codeSymbol(FieldGetter(format, bytes), record);
}
void putRecord(RecordFormat format, const SymbolRow& record, uint8_t* bytes);
void getRecord(RecordFormat format, bool hasAddend, const uint8_t* bytes, RelocationRow& record);
void putRecord(RecordFormat format, bool hasAddend, const RelocationRow& record, uint8_t* bytes);

} // namespace elfext
