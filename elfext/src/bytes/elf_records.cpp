// SPDX-License-Identifier: Apache-2.0
//
// The fields of each record in file order, as codeSymbol has those of symbols. One function serves
// both directions, so that what is written can't come to differ from what is read. The names are
// those of the ELF standard without their prefixes; the widths are the class's.
//
// Nothing is judged here: each value is passed on as it stands, whatever it says, and the tables
// decide what it may be. That the bytes are there has been checked by who calls.
#include "elfext/src/bytes/elf_records.h"

#include "elfext/interface/elf_constants.h"

namespace elfext {

namespace {

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
  // p_flags moved up in class 2, where it keeps the 8-byte fields behind it aligned.
  if (codec.isWide()) codec.field(record.flags);
  codec.wideField(record.offset);
  codec.wideField(record.vaddr);
  codec.wideField(record.paddr);
  codec.wideField(record.filesz);
  codec.wideField(record.memsz);
  if (!codec.isWide()) codec.field(record.flags);
  codec.wideField(record.align);
}

} // namespace

uint64_t expectedEntrySize(uint32_t type, uint32_t elfClass) {
  const bool isWide = elfClass == ELFCLASS64;
  switch (type) {
  case SHT_SYMTAB:
  case SHT_DYNSYM:
    return symbolRowSize(isWide);
  case SHT_REL:
  case SHT_RELA:
    return relocationRowSize(isWide, type == SHT_RELA);
  // Both are tables of 32-bit words in either class.
  case SHT_GROUP:
  case SHT_SYMTAB_SHNDX:
    return sizeof(uint32_t);
  default:
    return 0;
  }
}

void getRecord(RecordFormat format, const uint8_t* bytes, FileHeader& record) {
  codeFileHeader(FieldGetter(format, bytes), record);
}
void putRecord(RecordFormat format, const FileHeader& record, uint8_t* bytes) {
  codeFileHeader(FieldPutter(format, bytes), record);
}

void getRecord(RecordFormat format, const uint8_t* bytes, SectionHeader& record) {
  codeSectionHeader(FieldGetter(format, bytes), record);
}
void putRecord(RecordFormat format, const SectionHeader& record, uint8_t* bytes) {
  codeSectionHeader(FieldPutter(format, bytes), record);
}

void getRecord(RecordFormat format, const uint8_t* bytes, ProgramHeader& record) {
  codeProgramHeader(FieldGetter(format, bytes), record);
}
void putRecord(RecordFormat format, const ProgramHeader& record, uint8_t* bytes) {
  codeProgramHeader(FieldPutter(format, bytes), record);
}

// Its other half is inline, in the header.
void putRecord(RecordFormat format, const SymbolRow& record, uint8_t* bytes) {
  codeSymbol(FieldPutter(format, bytes), record);
}

// A class 1 r_info has the symbol in its upper 24 bits and the type in the low 8; a class 2 one
// has 32 bits for each. A class 1 addend keeps its sign.
void getRecord(RecordFormat format, bool hasAddend, const uint8_t* bytes, RelocationRow& record) {
  FieldGetter codec(format, bytes);
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
  FieldPutter codec(format, bytes);
  const uint64_t symbol = record.symbol;
  codec.wideField(record.offset);
  codec.wideField(format.isWide ? symbol << 32 | record.type : symbol << 8 | (record.type & 0xFF));
  if (hasAddend) codec.wideField(static_cast<uint64_t>(record.addend));
}

} // namespace elfext
