// SPDX-License-Identifier: Apache-2.0
//
// A file in which everything is wrong: what is reported is what the earliest step finds, wherever
// in the file it is. One fault after the other is mended, so that the whole order of the checks is
// held.

#include "tests/support/reader_fixture.h"

#include <iterator>

namespace elfext {

namespace {

// The sections of the file below.
enum SectionIndex : uint32_t {
  Section_Attributes = 1,
  Section_Note,
  Section_Overlay,
  Section_GroupTable,
  Section_Relocations,
  Section_Plain,
  Section_SymbolTable,
  Section_Strings,
  Section_Debug,
  Section_OverlappingOne,
  Section_OverlappingOther,
  Section_Count = Section_OverlappingOther + 2, // with section 0 and the section-name table
};

// The problems in the order of the steps that find them.
const char* const Reports[] = {
    "Section #4 specifies its entry size as 8 (should be 4)",
    "String table section #8 starts with a non-zero byte value",
    "ELF header refers to section-name string table section #99 but the last section is #12",
    "Section name field for section #1 specifies a string table offset 4096",
    "Symbol table section #7 refers to string table section #99 but the last section is #12",
    "Link field of section #6 refers to target section #99 but the last section is #12",
    "Symbol #1 in symbol table section #7 is defined in section #77 but the last section is #12",
    "Relocation #0 in relocation section #5 refers to symbol #9",
    "Group section #4 refers to member section #99 but the last section is #12",
    "Sections #10 and #11 overlap in the file",
    "I/O error writing file 'a.o': Unknown error -1",
    "Record #0 in debug overlay section #3 refers to section #6 which is not a debug section",
    "Section/segment mapping in SHT_NOTE section #2 maps section #6 to segment #9",
    "Build attributes in section #1 are corrupted",
};

// With the problems from that number on.
ObjectBuilder withProblemsFrom(size_t first) {
  const auto has = [first](size_t problem) { return problem >= first; };
  const auto either = [&](size_t problem, uint32_t bad, uint32_t good) {
    return has(problem) ? bad : good;
  };
  ObjectBuilder file = object().type(ET_EXEC);
  file.segment({.type = PT_NOTE, .offset = 0, .filesz = either(10, 100000, 0)});
  SectionBuilder& attributes = file.section(".attributes", SHT_ZEV_ATTRIBUTES);
  attributes.bytes(has(13) ? "Z" : "A");
  if (has(3)) attributes.nameOffset(4096);
  file.section(".note", SHT_NOTE).note("ZEV", 0x40000000, {either(12, 9, 0)});
  file.section(".overlay", SHT_ZEV_DEBUGOVERLAY)
      .entrySize(8)
      .word(1)
      .half(static_cast<uint16_t>(either(11, Section_Plain, Section_Debug)))
      .half(Section_Plain);
  file.section(".group", SHT_GROUP)
      .link(Section_SymbolTable)
      .entrySize(either(0, 8, 4))
      .word(1)
      .word(either(8, 99, Section_Plain));
  file.section(".rel", SHT_REL)
      .link(Section_SymbolTable)
      .info(Section_Plain)
      .relocation({.symbol = either(7, 9, 1)});
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC).zeros(4).link(either(5, 99, 0));
  file.section(".symtab", SHT_SYMTAB)
      .link(either(4, 99, Section_Strings))
      .symbol({.section = static_cast<uint16_t>(either(6, 77, Section_Plain))});
  file.section(".strtab", SHT_STRTAB).bytes(has(1) ? std::string("x\0", 2) : std::string(2, '\0'));
  file.section(".debug", SHT_PROGBITS).zeros(4);
  file.section(".one", SHT_PROGBITS).zeros(4);
  SectionBuilder& other = file.section(".other", SHT_PROGBITS).zeros(4);
  if (has(9)) other.offset(file.offsetOf(Section_OverlappingOne));
  if (has(2)) file.header(HeaderField::ShStrNdx, 99);
  return file;
}

} // namespace

using ReadOrderTest = ReaderTest;

TEST_F(ReadOrderTest, TheEarliestStepReports) {
  for (size_t first = 0; first < std::size(Reports); ++first)
    EXPECT_THAT(read(withProblemsFrom(first)).reports, ElementsAre(HasSubstr(Reports[first])));
  const ReadResult good = readGood(withProblemsFrom(std::size(Reports)));
  EXPECT_EQ(good.module->getSectionCount(), Section_Count);
}

} // namespace elfext
