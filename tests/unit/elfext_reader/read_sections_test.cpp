// SPDX-License-Identifier: Apache-2.0
//
// Sections as the section header table tells them: their classes, contents and names. Row sizes,
// lengths and extents may be any number; string tables must begin and end with a zero byte before a
// name is looked up in them.

#include "tests/support/reader_fixture.h"

#include <cstring>

namespace elfext {

using ReadSectionsTest = ReaderTest;
using ReadSectionsOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadSectionsOfEachFormTest, testing::ValuesIn(AllForms), formName);

namespace {

std::string contentsOf(Section* section) {
  const auto* bytes = reinterpret_cast<const char*>(section->getContents());
  return bytes == nullptr ? "" : std::string(bytes, section->getContentsSize());
}

// .text, a symbol table with one symbol, and its strings.
ObjectBuilder smallObject(const Form& form) {
  ObjectBuilder file = form.object();
  file.section(".text", SHT_PROGBITS).bytes("CODE");
  file.section(".symtab", SHT_SYMTAB).link(3).symbol({.name = "main", .section = 1});
  file.section(".strtab", SHT_STRTAB);
  return file;
}

} // namespace

TEST_P(ReadSectionsOfEachFormTest, HaveWhatTheirHeadersSay) {
  ObjectBuilder file = GetParam().object();
  file.section(".text", SHT_PROGBITS)
      .flags(SHF_ALLOC | SHF_EXECINSTR)
      .address(0x8000)
      .alignment(12) // no power of two, which nobody minds here
      .entrySize(7)
      .info(77)
      .link(1)
      .bytes("some code");
  const ReadResult result = readGood(file);
  Section* section = result.section(1);
  EXPECT_STREQ(section->getName(), ".text");
  EXPECT_EQ(section->getType(), SHT_PROGBITS);
  EXPECT_EQ(section->getFlags(), SHF_ALLOC | SHF_EXECINSTR);
  EXPECT_EQ(section->getAddress(), 0x8000U);
  EXPECT_EQ(section->getAlignment(), 12U);
  EXPECT_EQ(section->getEntrySize(), 7U);
  EXPECT_EQ(section->getInfo(), 77U);
  EXPECT_EQ(section->getLink(), section);
  EXPECT_EQ(section->getSize(), 9U);
  EXPECT_EQ(contentsOf(section), "some code");
  uint64_t offset = 0;
  uint64_t size = 0;
  EXPECT_TRUE(section->getFileExtent(&offset, &size));
  EXPECT_EQ(offset, file.offsetOf(1));
  EXPECT_EQ(size, 9U);
  EXPECT_EQ(result.section(0)->getName(), nullptr);
}

TEST_F(ReadSectionsTest, HaveTheClassOfTheirType) {
  ObjectBuilder file = object();
  file.section("", SHT_NULL);
  file.section(".dynstr", SHT_STRTAB);
  file.section(".dynsym", SHT_DYNSYM).link(2);
  file.section(".rela", SHT_RELA).link(3).info(1);
  file.section(".hash", SHT_HASH).link(3);
  file.section(".dynamic", SHT_DYNAMIC).link(2);
  file.section(".map", SHT_ZEV_PREEMPTMAP).link(2);
  file.section(".verdef", SHT_GNU_verdef);
  file.section(".verneed", SHT_GNU_verneed);
  file.section(".versym", SHT_GNU_versym);
  file.section(".attributes", SHT_ZEV_ATTRIBUTES).bytes("A");
  file.section(".overlay", SHT_ZEV_DEBUGOVERLAY);
  file.section(".exidx", SHT_ZEV_EXIDX);
  const ReadResult result = readGood(file);
  const ObjectModule& module = *result.module;
  EXPECT_THAT(module.getStringTableSections(), ElementsAre(result.section(2), result.section(14)));
  EXPECT_THAT(module.getDynsymSections(), ElementsAre(result.section(3)));
  EXPECT_EQ(result.section(4)->asRelocationSection(), result.section(4));
  EXPECT_THAT(module.getHashSections(), ElementsAre(result.section(5)));
  EXPECT_THAT(module.getDynamicSections(), ElementsAre(result.section(6)));
  EXPECT_THAT(module.getPreemptionMapSections(), ElementsAre(result.section(7)));
  EXPECT_THAT(module.getVerdefSections(), ElementsAre(result.section(8)));
  EXPECT_THAT(module.getVerneedSections(), ElementsAre(result.section(9)));
  EXPECT_THAT(module.getVersymSections(), ElementsAre(result.section(10)));
  EXPECT_THAT(module.getBuildAttributesSections(), ElementsAre(result.section(11)));
  EXPECT_THAT(module.getDebugOverlaySections(), ElementsAre(result.section(12)));
  for (uint32_t i = 0; i < 13; ++i)
    EXPECT_TRUE(result.section(i)->isAuxiliary()) << i;
  EXPECT_FALSE(result.section(13)->isAuxiliary());
  EXPECT_FALSE(module.areAuxiliarySectionsUpToDate());
}

TEST_P(ReadSectionsOfEachFormTest, TablesMustHaveRowsOfTheRightSize) {
  struct Table {
    uint32_t type;
    uint64_t entrySize;
  };
  const bool isWide = GetParam().isWide();
  for (const Table& table : {Table{SHT_SYMTAB, isWide ? 24U : 16U},
                             {SHT_DYNSYM, isWide ? 24U : 16U},
                             {SHT_REL, isWide ? 16U : 8U},
                             {SHT_RELA, isWide ? 24U : 12U},
                             {SHT_GROUP, 4},
                             {SHT_SYMTAB_SHNDX, 4}}) {
    ObjectBuilder file = GetParam().object();
    file.section(".symtab", SHT_SYMTAB).link(2).zeros(isWide ? 24 : 16);
    file.section(".strtab", SHT_STRTAB);
    SectionBuilder& section = file.section(".table", table.type);
    const bool isSymbolTable = table.type == SHT_SYMTAB || table.type == SHT_DYNSYM;
    section.link(isSymbolTable ? 2 : 1).zeros(table.entrySize);
    EXPECT_EQ(readGood(file).section(3)->getEntrySize(), table.entrySize);
    section.entrySize(0);
    EXPECT_EQ(readGood(file).section(3)->getEntrySize(), 0U);
    section.entrySize(table.entrySize + 1);
    const ReadResult mended = expectMended(
        file, "Section #3 specifies its entry size as " + std::to_string(table.entrySize + 1) +
                  " (should be " + std::to_string(table.entrySize) + ")");
    EXPECT_EQ(mended.section(3)->getEntrySize(), table.entrySize);
  }
}

TEST_P(ReadSectionsOfEachFormTest, TablesMustHaveWholeRows) {
  ObjectBuilder file = smallObject(GetParam());
  file.section(".table", SHT_SYMTAB).link(3).zeros(GetParam().isWide() ? 24 : 16).bytes("x");
  const ReadResult mended = expectMended(
      file, GetParam().isWide() ? "Section #4 has length 25, which is not a multiple of 24"
                                : "Section #4 has length 17, which is not a multiple of 16");
  EXPECT_EQ(mended.section(4)->getSize(), GetParam().isWide() ? 24U : 16U);
}

TEST_F(ReadSectionsTest, TheEntrySizeIsCheckedBeforeTheLength) {
  ObjectBuilder file = object();
  file.section(".group", SHT_GROUP).entrySize(8).bytes("abc");
  EXPECT_THAT(read(file).reports,
              ElementsAre("Section #1 specifies its entry size as 8 (should be 4)"));
}

TEST_P(ReadSectionsOfEachFormTest, ContentsMustBeInTheFile) {
  ObjectBuilder file = GetParam().object();
  SectionBuilder& section = file.section(".text", SHT_PROGBITS);
  section.bytes("CODE");
  const uint64_t size = file.bytes().size();
  section.offset(size - 4);
  for (const auto& [offset, length] : {std::pair<uint64_t, uint64_t>{size - 3, 4},
                                       {size, 1},
                                       {size + 1, 1},
                                       {52, size - 51},
                                       {1, 0xFFFFFFFF},
                                       {0xFFFFFFFF, 1}}) {
    section.offset(offset).size(length);
    expectFinal(file, Truncated);
  }
  if (!GetParam().isWide()) return;
  for (const auto& [offset, length] :
       {std::pair<uint64_t, uint64_t>{UINT64_MAX, 1}, {1, UINT64_MAX}, {UINT64_MAX, UINT64_MAX}}) {
    section.offset(offset).size(length);
    expectFinal(file, Truncated);
  }
}

TEST_P(ReadSectionsOfEachFormTest, SectionsWithoutBytesMayBeAnywhere) {
  ObjectBuilder file = GetParam().object();
  file.section(".bss", SHT_NOBITS).offset(0xFFFFFFF0).size(0xFFFFFFF0);
  file.section(".null", SHT_NULL).offset(0xFFFFFFF0).size(0xFFFFFFF0);
  file.section(".empty", SHT_PROGBITS).offset(0xFFFFFFF0);
  const ReadResult result = readGood(file);
  EXPECT_EQ(result.section(1)->getSize(), 0xFFFFFFF0U);
  EXPECT_EQ(result.section(1)->getFileSize(), 0U);
  EXPECT_EQ(result.section(2)->getSize(), 0U);
  EXPECT_EQ(result.section(3)->getSize(), 0U);
  EXPECT_EQ(result.section(3)->getContents(), nullptr);
}

TEST_P(ReadSectionsOfEachFormTest, ALoadSegmentRoundASectionMustBeInTheFile) {
  ObjectBuilder file = GetParam().object();
  file.type(ET_EXEC);
  file.section(".text", SHT_PROGBITS).bytes("CODE");
  ObjectBuilder good = file;
  good.segment({.offset = 0, .filesz = 200, .memsz = 200});
  readGood(good);
  file.segment({.offset = 0, .filesz = 100000});
  expectFinal(file, Truncated);
}

TEST_F(ReadSectionsTest, AStringTableOfNoBytesIsReported) {
  ObjectBuilder file = object();
  file.section(".strtab", SHT_STRTAB).size(0);
  const ReadResult mended = expectMended(file, "String table section #1 is completely empty");
  EXPECT_EQ(mended.section(1)->getSize(), 1U);
  EXPECT_EQ(contentsOf(mended.section(1)), std::string(1, '\0'));
  EXPECT_TRUE(mended.section(1)->isAuxiliary());
}

TEST_F(ReadSectionsTest, AStringTableStartsAndEndsWithAZeroByte) {
  struct Ends {
    std::string bytes;
    std::string report;
    std::string mended;
  };
  for (const Ends& each : {Ends{"xay", "starts and ends", std::string("\0a\0", 3)},
                           {std::string("xa\0", 3), "starts", std::string("\0a\0", 3)},
                           {std::string("\0ay", 3), "ends", std::string("\0a\0", 3)},
                           {"x", "starts and ends", std::string(1, '\0')}}) {
    ObjectBuilder file = object();
    file.section(".strtab", SHT_STRTAB).bytes(each.bytes);
    const ReadResult mended = expectMended(file, "String table section #1 " + each.report +
                                                     " with a non-zero byte value");
    EXPECT_EQ(contentsOf(mended.section(1)), each.mended);
    EXPECT_TRUE(mended.section(1)->isAuxiliary());
  }
}

TEST_F(ReadSectionsTest, SymbolNamesEndWithAMendedTable) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.section = 1, .nameOffset = 1});
  file.section(".strtab", SHT_STRTAB).bytes(std::string("\0mainx", 6));
  const ReadResult mended =
      expectMended(file, "String table section #2 ends with a non-zero byte value");
  EXPECT_STREQ(mended.symbol(1)->getName(), "main");
}

TEST_F(ReadSectionsTest, StringTablesAreCheckedInTheOrderOfTheContents) {
  ObjectBuilder file = object();
  file.section(".strtab", SHT_STRTAB).bytes("x");
  file.section(".text", SHT_PROGBITS).size(100000);
  EXPECT_THAT(read(file).reports, ElementsAre(HasSubstr("starts and ends")));
  EXPECT_THAT(readOn(file).reports, ElementsAre(HasSubstr("starts and ends"), Truncated));
}

TEST_F(ReadSectionsTest, NamesComeFromTheNameTable) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS);
  file.section("", SHT_PROGBITS);
  const ReadResult result = readGood(file);
  EXPECT_STREQ(result.section(1)->getName(), ".text");
  EXPECT_EQ(result.section(2)->getName(), nullptr);
  EXPECT_STREQ(result.section(3)->getName(), ".shstrtab");
  EXPECT_TRUE(static_cast<StringTableSection*>(result.section(3))->isSectionNameTable());
}

TEST_F(ReadSectionsTest, TheNameTableMustBeASection) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS);
  expectFinal(ObjectBuilder(file).header(HeaderField::ShStrNdx, 3),
              "ELF header refers to section-name string table section #3 but the last section is "
              "#2");
  expectFinal(ObjectBuilder(file).header(HeaderField::ShStrNdx, 0xFF00),
              "ELF header refers to section-name string table section #65280 but the last section "
              "is #2");
}

TEST_F(ReadSectionsTest, TheNameTableMustBeAStringTable) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS);
  expectFinal(file.header(HeaderField::ShStrNdx, 1),
              "ELF header refers to section-name string table section #1 but that section has "
              "type #1 (SHT_PROGBITS) instead of SHT_STRTAB");
}

TEST_F(ReadSectionsTest, AnExtendedNameTableIndexIsInTheFirstSectionHeader) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS);
  file.header(HeaderField::ShStrNdx, SHN_XINDEX);
  file.sectionZero().link(2);
  EXPECT_STREQ(readGood(file).section(1)->getName(), ".text");
  file.sectionZero().link(9);
  expectFinal(file, "ELF header refers to section-name string table section #9 but the last "
                    "section is #2");
}

TEST_F(ReadSectionsTest, ANameWithoutNameTableEndsTheSearchForNames) {
  ObjectBuilder file = object().nameless();
  file.section("", SHT_PROGBITS);
  readGood(file);
  file.section("", SHT_PROGBITS).nameOffset(1);
  file.section("", SHT_PROGBITS).nameOffset(2);
  const ReadResult mended = expectMended(
      file, "Section name field for section #2 specifies a nonzero string table offset, but there "
            "is no section-name string table");
  EXPECT_EQ(mended.section(2)->getName(), nullptr);
}

TEST_F(ReadSectionsTest, ANameOutsideTheNameTableIsLeftOut) {
  ObjectBuilder file = object();
  SectionBuilder& section = file.section("", SHT_PROGBITS);
  file.section(".data", SHT_PROGBITS);
  // "\0.data\0.shstrtab\0"
  section.nameOffset(16);
  EXPECT_STREQ(readGood(file).section(1)->getName(), "");
  section.nameOffset(17);
  const ReadResult mended = expectMended(
      file, "Section name field for section #1 specifies a string table offset 17 which is beyond "
            "the end of the section-name string table (length 17)");
  EXPECT_EQ(mended.section(1)->getName(), nullptr);
  EXPECT_STREQ(mended.section(2)->getName(), ".data");
}

TEST_F(ReadSectionsTest, NamesMadeLaterAreCopies) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS);
  const ReadResult result = readGood(file);
  std::string name = "new";
  result.section(1)->setName(name.c_str());
  name[0] = 'x';
  EXPECT_STREQ(result.section(1)->getName(), "new");
}

} // namespace elfext
