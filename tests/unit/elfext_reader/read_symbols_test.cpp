// SPDX-License-Identifier: Apache-2.0
//
// Symbols as the rows of their tables tell them, in each class and byte order: name, section and
// kind are checked in this order, extended section indexes need their table, and of many bad rows
// the first is the one that is reported.

#include "tests/support/reader_fixture.h"

namespace elfext {

using ReadSymbolsTest = ReaderTest;
using ReadSymbolsOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadSymbolsOfEachFormTest, testing::ValuesIn(AllForms), formName);

using testsupport::SymbolSpec;

namespace {

// Sections 1 to 3: .text at 0x8000, the symbol table of the type, its strings.
ObjectBuilder withSymbols(ObjectBuilder file, uint32_t type,
                          const std::vector<SymbolSpec>& symbols) {
  file.section(".text", SHT_PROGBITS).address(0x8000).zeros(8);
  SectionBuilder& table = file.section(".symtab", type).link(3);
  for (const SymbolSpec& symbol : symbols)
    table.symbol(symbol);
  file.section(".strtab", SHT_STRTAB);
  return file;
}

ObjectBuilder withSymbol(const SymbolSpec& symbol, uint32_t type = SHT_SYMTAB) {
  return withSymbols(object(), type, {symbol});
}

} // namespace

TEST_P(ReadSymbolsOfEachFormTest, HaveWhatTheirRowsSay) {
  for (const uint32_t type : {SHT_SYMTAB, SHT_DYNSYM}) {
    const ObjectBuilder file = withSymbols(
        GetParam().object(), type,
        {{.name = "hosted",
          .section = 1,
          .value = 5,
          .size = 3,
          .type = 2,
          .binding = 2,
          .other = 0xFE},
         {.name = "absolute", .section = 0xFFF1, .value = 0x1234, .type = 1, .binding = 10},
         {.name = "common", .section = 0xFFF2, .value = 8, .size = 40, .type = 1},
         {.name = "undefined", .section = 0, .value = 7, .binding = 13}});
    const ReadResult result = readGood(file);
    const bool isDynamic = type == SHT_DYNSYM;
    const auto symbols =
        isDynamic ? result.module->getDynamicSymbols() : result.module->getSymbols();
    ASSERT_THAT(symbols, SizeIs(4));
    EXPECT_THAT(isDynamic ? result.module->getSymbols() : result.module->getDynamicSymbols(),
                IsEmpty());
    const Symbol& hosted = *symbols[0];
    EXPECT_STREQ(hosted.getName(), "hosted");
    EXPECT_EQ(hosted.getHostedSymbolSection(), result.section(1));
    EXPECT_EQ(hosted.getHostedSymbolOffset(), 5U);
    EXPECT_EQ(hosted.getSize(), 3U);
    EXPECT_EQ(hosted.getType(), STT_FUNC);
    EXPECT_EQ(hosted.getBinding(), STB_WEAK);
    EXPECT_EQ(hosted.getVisibility(), STV_HIDDEN);
    EXPECT_EQ(hosted.isDynamic(), isDynamic);
    EXPECT_EQ(hosted.getIndex(), 1U);
    EXPECT_EQ(symbols[1]->getAbsoluteValue(), 0x1234U);
    EXPECT_EQ(symbols[1]->getBinding(), 10U);
    EXPECT_EQ(symbols[2]->getCommonAlignment(), 8U);
    EXPECT_EQ(symbols[2]->getSize(), 40U);
    EXPECT_EQ(symbols[3]->getUndefinedValue(), 7U);
    EXPECT_EQ(symbols[3]->getBinding(), 13U);
    EXPECT_EQ(symbols[3]->getIndex(), 4U);
  }
}

TEST_P(ReadSymbolsOfEachFormTest, OfALinkedFileAreAtAnAddress) {
  for (const uint32_t type : {ET_EXEC, ET_DYN, ET_CORE}) {
    ObjectBuilder file = GetParam().object();
    file.type(static_cast<uint16_t>(type));
    const ReadResult result =
        readGood(withSymbols(file, SHT_SYMTAB, {{.name = "main", .section = 1, .value = 0x8005}}));
    EXPECT_EQ(result.symbol(1)->getHostedSymbolOffset(), 5U);
    EXPECT_EQ(result.symbol(1)->getAddress(), 0x8005U);
  }
}

TEST_F(ReadSymbolsTest, ATableMayHaveNoRows) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB).link(2);
  file.section(".strtab", SHT_STRTAB);
  EXPECT_EQ(readGood(file).module->getSymbolCount(), 0U);
}

TEST_F(ReadSymbolsTest, SeveralTablesFollowOneAnother) {
  ObjectBuilder file = withSymbol({.name = "first", .section = 1});
  file.section(".symtab2", SHT_SYMTAB).link(3).symbol({.name = "second", .section = 1});
  const ReadResult result = readGood(file);
  EXPECT_EQ(result.module->getSymbolCount(), 3U);
  EXPECT_STREQ(result.symbol(1)->getName(), "first");
  EXPECT_STREQ(result.symbol(2)->getName(), "second");
}

TEST_F(ReadSymbolsTest, ANameOfZeroIsNone) {
  const ReadResult result = readGood(withSymbols(
      object(), SHT_SYMTAB, {{.section = 1}, {.name = "x", .section = 1, .nameOffset = 2}}));
  EXPECT_EQ(result.symbol(1)->getName(), nullptr);
  EXPECT_STREQ(result.symbol(2)->getName(), "");
}

TEST_F(ReadSymbolsTest, NamesAreInTheStringTable) {
  // "\0x\0"
  expectFinal(withSymbol({.name = "x", .section = 1, .nameOffset = 3}),
              "Symbol #1 in symbol table section #2 refers to offset 3 in string table section "
              "#3, which is only 3 bytes long");
  expectFinal(withSymbol({.name = "x", .section = 1, .nameOffset = 0xFFFFFFFF}, SHT_DYNSYM),
              "Symbol #1 in dynamic symbol table section #2 refers to offset 4294967295 in string "
              "table section #3, which is only 3 bytes long");
}

TEST_F(ReadSymbolsTest, ReservedIndexesAreSectionIndexes) {
  for (const uint16_t index : std::initializer_list<uint16_t>{5, 0xFF00, 0xFFF0, 0xFFF3, 0xFFFE})
    expectFinal(withSymbol({.name = "x", .section = index}),
                "Symbol #1 in symbol table section #2 is defined in section #" +
                    std::to_string(index) + " but the last section is #4");
  expectFinal(withSymbol({.name = "x", .section = 0xFF00}, SHT_DYNSYM),
              "Symbol #1 in dynamic symbol table section #2 is defined in section #65280 but the "
              "last section is #4");
}

TEST_F(ReadSymbolsTest, AnExtendedIndexNeedsAnIndexSection) {
  expectFinal(withSymbol({.name = "x", .section = 0xFFFF}),
              "Symbol #1 in symbol table section #2 has SHN_XINDEX section field, but there is no "
              "SHT_SYMTAB_SHNDX section associated with the symbol table");
  expectFinal(withSymbol({.name = "x", .section = 0xFFFF}, SHT_DYNSYM),
              "Symbol #1 in dynamic symbol table section #2 has SHN_XINDEX section field, but "
              "there is no SHT_SYMTAB_SHNDX section associated with the symbol table");
}

TEST_P(ReadSymbolsOfEachFormTest, ExtendedIndexesAreSectionIndexesAsTheyStand) {
  const auto withIndex = [](uint32_t index) {
    ObjectBuilder file =
        withSymbols(GetParam().object(), SHT_SYMTAB, {{.name = "x", .section = 0xFFFF}});
    file.section(".shndx", SHT_SYMTAB_SHNDX).link(2).word(99).word(index);
    return file;
  };
  EXPECT_EQ(readGood(withIndex(1)).symbol(1)->getHostedSymbolSection()->getIndex(), 1U);
  // No special meaning here: 0 is section 0.
  EXPECT_EQ(readGood(withIndex(0)).symbol(1)->getHostedSymbolSection()->getIndex(), 0U);
  expectFinal(withIndex(0xFFF1), "Symbol #1 in symbol table section #2 is defined in section "
                                 "#65521 but the last section is #5");
}

TEST_F(ReadSymbolsTest, SectionSymbolsAreInASection) {
  for (const uint16_t index : std::initializer_list<uint16_t>{0, 0xFFF1, 0xFFF2}) {
    expectFinal(withSymbol({.section = index, .type = 3}),
                "Symbol #1 in symbol table section #2 has type STT_SECTION but is not defined "
                "relative to a section");
    expectFinal(withSymbol({.section = index, .type = 3}, SHT_DYNSYM),
                "Symbol #1 in dynamic symbol table section #2 has type STT_SECTION but is not "
                "defined relative to a section");
  }
  readGood(withSymbol({.section = 1, .type = 3}));
}

TEST_F(ReadSymbolsTest, ATableThatIsSectionZeroIsNotNamed) {
  ObjectBuilder file = object();
  file.section(".strtab", SHT_STRTAB);
  file.section(".symtab", SHT_SYMTAB).link(1).symbol({.section = 0, .type = 3});
  const std::string bytes = file.bytes();
  // The header of section 2 in the place of that of section 0.
  std::string swapped = bytes;
  swapped.replace(file.headerOffsetOf(0), 40, bytes, file.headerOffsetOf(2), 40);
  swapped.replace(file.headerOffsetOf(2), 40, std::string(40, '\0'));
  EXPECT_THAT(
      read(swapped).reports,
      ElementsAre("Symbol #1 has type STT_SECTION but is not defined relative to a section"));
}

TEST_F(ReadSymbolsTest, ARowIsCheckedFromNameToSectionToKind) {
  EXPECT_THAT(read(withSymbol({.section = 0xFF00, .type = 3, .nameOffset = 99})).reports,
              ElementsAre(HasSubstr("refers to offset 99")));
  EXPECT_THAT(read(withSymbol({.section = 0xFF00, .type = 3})).reports,
              ElementsAre(HasSubstr("is defined in section #65280")));
}

TEST_F(ReadSymbolsTest, TheNullSymbolIsNotLookedAt) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB).link(2).bytes(std::string(16, '\xFF'));
  file.section(".strtab", SHT_STRTAB);
  EXPECT_EQ(readGood(file).module->getSymbolCount(), 0U);
}

TEST_F(ReadSymbolsTest, TheFirstBadRowIsTheOneReported) {
  EXPECT_THAT(
      read(withSymbols(object(), SHT_SYMTAB, {{.section = 1}, {.section = 77}, {.section = 88}}))
          .reports,
      ElementsAre(HasSubstr("Symbol #2")));
}

} // namespace elfext
