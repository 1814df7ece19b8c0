// SPDX-License-Identifier: Apache-2.0
//
// The fields of each record in file order, told once for both directions: a codec either loads the
// field or stores it.
#include "elfext/src/elf_records.h"

namespace elfext {

namespace {

class Getter {
public:
  Getter(RecordFormat format, const uint8_t* bytes) : m_Format(format), m_Bytes(bytes) {}

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

class Putter {
public:
  Putter(RecordFormat format, uint8_t* bytes) : m_Format(format), m_Bytes(bytes) {}

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

// In the functions below a record is const when it is put.

template <class Codec, class Record>
void codeFileHeader(Codec codec, Record& record) {
  for (auto& byte : record.ident)
    codec.field(byte);
  codec.field(record.type);
  codec.field(record.machine);
  codec.field(record.version);
  codec.wideField(record.entry);
  codec.wideField(record.phoff);
  codec.wideField(record.shoff);
  codec.field(record.flags);
  codec.field(record.ehsize);
  codec.field(record.phentsize);
  codec.field(record.phnum);
  codec.field(record.shentsize);
  codec.field(record.shnum);
  codec.field(record.shstrndx);
}

template <class Codec, class Record>
void codeSectionHeader(Codec codec, Record& record) {
  codec.field(record.name);
  codec.field(record.type);
  codec.wideField(record.flags);
  codec.wideField(record.addr);
  codec.wideField(record.offset);
  codec.wideField(record.size);
  codec.field(record.link);
  codec.field(record.info);
  codec.wideField(record.addralign);
  codec.wideField(record.entsize);
}

template <class Codec, class Record>
void codeProgramHeader(Codec codec, Record& record) {
  codec.field(record.type);
  if (codec.isWide()) codec.field(record.flags);
  codec.wideField(record.offset);
  codec.wideField(record.vaddr);
  codec.wideField(record.paddr);
  codec.wideField(record.filesz);
  codec.wideField(record.memsz);
  if (!codec.isWide()) codec.field(record.flags);
  codec.wideField(record.align);
}

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

} // namespace

void getRecord(RecordFormat format, const uint8_t* bytes, FileHeader& record) {
  codeFileHeader(Getter(format, bytes), record);
}
void putRecord(RecordFormat format, const FileHeader& record, uint8_t* bytes) {
  codeFileHeader(Putter(format, bytes), record);
}

void getRecord(RecordFormat format, const uint8_t* bytes, SectionHeader& record) {
  codeSectionHeader(Getter(format, bytes), record);
}
void putRecord(RecordFormat format, const SectionHeader& record, uint8_t* bytes) {
  codeSectionHeader(Putter(format, bytes), record);
}

void getRecord(RecordFormat format, const uint8_t* bytes, ProgramHeader& record) {
  codeProgramHeader(Getter(format, bytes), record);
}
void putRecord(RecordFormat format, const ProgramHeader& record, uint8_t* bytes) {
  codeProgramHeader(Putter(format, bytes), record);
}

void getRecord(RecordFormat format, const uint8_t* bytes, SymbolRow& record) {
  codeSymbol(Getter(format, bytes), record);
}
void putRecord(RecordFormat format, const SymbolRow& record, uint8_t* bytes) {
  codeSymbol(Putter(format, bytes), record);
}

// A class 1 r_info has the symbol in its upper 24 bits and the type in the low 8; a class 2 one
// has 32 bits for each. A class 1 addend keeps its sign.
void getRecord(RecordFormat format, bool hasAddend, const uint8_t* bytes, RelocationRow& record) {
  Getter codec(format, bytes);
  uint64_t info = 0;
  uint64_t addend = 0;
  codec.wideField(record.offset);
  codec.wideField(info);
  if (hasAddend) codec.wideField(addend);
  record.symbol = static_cast<uint32_t>(format.isWide ? info >> 32 : info >> 8);
  record.type = static_cast<uint32_t>(format.isWide ? info : info & 0xFF);
  record.addend = format.isWide ? static_cast<int64_t>(addend)
                                : static_cast<int32_t>(static_cast<uint32_t>(addend));
}
void putRecord(RecordFormat format, bool hasAddend, const RelocationRow& record, uint8_t* bytes) {
  Putter codec(format, bytes);
  const uint64_t symbol = record.symbol;
  codec.wideField(record.offset);
  codec.wideField(format.isWide ? symbol << 32 | record.type : symbol << 8 | (record.type & 0xFF));
  if (hasAddend) codec.wideField(static_cast<uint64_t>(record.addend));
}

} // namespace elfext
