// SPDX-License-Identifier: Apache-2.0
//
// Relocations as rows of an object: fields in each class and byte order, the symbol table that a
// row's symbol is of, and rows that name a symbol that there is not. They become objects only when
// somebody asks.

#include "elfext/interface/relocation.h"
#include "tests/support/reader_fixture.h"

namespace elfext {

using ReadRelocationsTest = ReaderTest;
using ReadRelocationsOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadRelocationsOfEachFormTest, testing::ValuesIn(AllForms),
                         formName);

namespace {

// Sections 1 to 3: .text, a symbol table of the type with two symbols, its strings.
ObjectBuilder withTable(ObjectBuilder file, uint32_t type = SHT_SYMTAB,
                        uint32_t targetType = SHT_PROGBITS) {
  file.section(".text", targetType).zeros(8);
  file.section(".symtab", type)
      .link(3)
      .symbol({.name = "one", .section = 1})
      .symbol({.name = "two"});
  file.section(".strtab", SHT_STRTAB);
  return file;
}

} // namespace

TEST_P(ReadRelocationsOfEachFormTest, HaveWhatTheirRowsSay) {
  ObjectBuilder file = withTable(GetParam().object());
  file.section(".rel", SHT_REL).link(2).info(1).relocation({.offset = 4, .symbol = 2, .type = 7});
  file.section(".rela", SHT_RELA)
      .link(2)
      .info(1)
      .relocation({.offset = 0x7FFFFFF0, .symbol = 1, .type = 0xAB, .addend = -5})
      .relocation({.offset = 1, .symbol = 0, .type = 1, .addend = 5});
  const ReadResult result = readGood(file);
  Section* target = result.section(1);
  ASSERT_EQ(target->getRelocationCount(), 3U);
  const Relocation& rel = *target->getRelocation(0);
  EXPECT_EQ(rel.getOffset(), 4U);
  EXPECT_EQ(rel.getType(), 7U);
  EXPECT_EQ(rel.getTarget(), result.symbol(2));
  EXPECT_FALSE(rel.hasAddend());
  EXPECT_FALSE(rel.isDynamic());
  EXPECT_EQ(rel.getSection(), target);
  const Relocation& rela = *target->getRelocation(1);
  EXPECT_EQ(rela.getOffset(), 0x7FFFFFF0U);
  EXPECT_EQ(rela.getType(), 0xABU);
  EXPECT_EQ(rela.getTarget(), result.symbol(1));
  EXPECT_EQ(rela.getAddend(), -5);
  const Relocation& toNothing = *target->getRelocation(2);
  EXPECT_EQ(toNothing.getTarget(), nullptr);
  EXPECT_FALSE(toNothing.isDynamic());
  EXPECT_EQ(toNothing.getAddend(), 5);
}

TEST_P(ReadRelocationsOfEachFormTest, OfDynamicSymbolsAreDynamicEvenWithoutSymbol) {
  ObjectBuilder file = withTable(GetParam().object(), SHT_DYNSYM);
  file.section(".rela.dyn", SHT_RELA)
      .link(2)
      .info(1)
      .relocation({.symbol = 0})
      .relocation({.symbol = 1});
  const ReadResult result = readGood(file);
  EXPECT_TRUE(result.section(1)->getRelocation(0)->isDynamic());
  EXPECT_EQ(result.section(1)->getRelocation(0)->getTarget(), nullptr);
  EXPECT_TRUE(result.section(1)->getRelocation(1)->isDynamic());
}

TEST_P(ReadRelocationsOfEachFormTest, TheirSymbolsAreInTheTable) {
  for (const uint32_t type : {SHT_REL, SHT_RELA}) {
    for (const uint32_t symbol : {3U, 0xFFFFFFU}) {
      ObjectBuilder file = withTable(GetParam().object());
      file.section(".rel", type)
          .link(2)
          .info(1)
          .relocation({.symbol = 2})
          .relocation({.symbol = symbol});
      expectFinal(file, "Relocation #1 in relocation section #4 refers to symbol #" +
                            std::to_string(symbol) +
                            " but its associated symbol table section #2 only contains 3 symbols");
    }
  }
}

TEST_F(ReadRelocationsTest, ATableWithoutRowsHasNotEvenTheNullSymbol) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB).link(2);
  file.section(".strtab", SHT_STRTAB);
  file.section(".rel", SHT_REL).link(1).info(0).relocation({.symbol = 0});
  expectFinal(file, "Relocation #0 in relocation section #3 refers to symbol #0 but its "
                    "associated symbol table section #1 only contains 0 symbols");
}

TEST_F(ReadRelocationsTest, AnySectionMayBeTheTarget) {
  ObjectBuilder file = withTable(object(), SHT_SYMTAB, SHT_NOTE);
  file.section(".rel", SHT_REL).link(2).info(1).relocation({.symbol = 1});
  file.section(".rel2", SHT_REL).link(2).info(3).relocation({.symbol = 1});
  file.section(".rel3", SHT_REL).link(2).info(0).relocation({.symbol = 1});
  const ReadResult result = readGood(file);
  for (const uint32_t target : {0U, 1U, 3U}) {
    EXPECT_EQ(result.section(target)->getRelocationCount(), 1U);
    EXPECT_EQ(result.section(target)->getRelocation(0)->getTarget(), result.symbol(1));
  }
  EXPECT_FALSE(result.section(1)->isRelocatable());
  EXPECT_FALSE(result.section(3)->isRelocatable());
  EXPECT_TRUE(result.section(0)->isRelocatable());
}

TEST_F(ReadRelocationsTest, SymbolsAreThoseOfTheLinkedTable) {
  ObjectBuilder file = withTable(object());
  file.section(".symtab2", SHT_SYMTAB).link(3).symbol({.name = "three", .section = 1});
  file.section(".rel", SHT_REL).link(4).info(1).relocation({.symbol = 1});
  const ReadResult result = readGood(file);
  EXPECT_STREQ(result.section(1)->getRelocation(0)->getTarget()->getName(), "three");
}

TEST_F(ReadRelocationsTest, BecomeObjectsOnlyWhenSomebodyAsks) {
  ObjectBuilder file = withTable(object());
  SectionBuilder& rows = file.section(".rel", SHT_REL).link(2).info(1);
  for (uint32_t i = 0; i < 100; ++i)
    rows.relocation({.offset = i, .symbol = i % 3});
  const ReadResult result = readGood(file);
  const auto* section = static_cast<RelocationSection*>(result.section(4));
  EXPECT_EQ(result.section(1)->getRelocationCount(), 100U);
  EXPECT_TRUE(result.section(1)->hasStaticRelocationsWithoutAddend());
  EXPECT_EQ(section->getPendingRowCount(), 100U);
  EXPECT_EQ(result.section(1)->getRelocation(99)->getOffset(), 99U);
  EXPECT_EQ(section->getPendingRowCount(), 0U);
}

} // namespace elfext
