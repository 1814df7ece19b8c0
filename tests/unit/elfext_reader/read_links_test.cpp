// SPDX-License-Identifier: Apache-2.0
//
// What the link and info fields of section headers name: sections, symbols and counts, by section
// type. Any of these may be any number; a link with a meaning is checked before one without, and
// each is reported once.

#include "tests/support/reader_fixture.h"

namespace elfext {

using ReadLinksTest = ReaderTest;

namespace {

// Sections 1 to 5: .text, .symtab, .strtab, .dynsym, .dynstr; section 6 is for the test, and the
// last one is section 7.
ObjectBuilder linkedObject() {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).zeros(4);
  file.section(".symtab", SHT_SYMTAB).link(3).symbol({.name = "main", .section = 1});
  file.section(".strtab", SHT_STRTAB);
  file.section(".dynsym", SHT_DYNSYM).link(5).symbol({.name = "entry", .section = 1});
  file.section(".dynstr", SHT_STRTAB);
  return file;
}

struct LinkCase {
  uint32_t type;
  const char* who;
  const char* what;
  const char* wanted;
  bool isMendable;
};

const LinkCase LinkCases[] = {
    {SHT_ZEV_PREEMPTMAP, "Preemption map section", "string table section", "SHT_STRTAB", false},
    {SHT_DYNAMIC, "Dynamic section", "string table section", "SHT_STRTAB", false},
    {SHT_SYMTAB, "Symbol table section", "string table section", "SHT_STRTAB", false},
    {SHT_DYNSYM, "Symbol table section", "string table section", "SHT_STRTAB", false},
    {SHT_REL, "Relocation section", "symbol table section", "SHT_SYMTAB or SHT_DYNSYM", true},
    {SHT_RELA, "Relocation section", "symbol table section", "SHT_SYMTAB or SHT_DYNSYM", true},
    {SHT_HASH, "Hash section", "symbol table section", "SHT_DYNSYM", false},
    {SHT_GROUP, "Group section", "symbol table section", "SHT_SYMTAB or SHT_DYNSYM", true},
    {SHT_SYMTAB_SHNDX, "SHT_SYMTAB_SHNDX section", "symbol table section",
     "SHT_SYMTAB or SHT_DYNSYM", true},
};

std::string refersTo(const LinkCase& each, uint32_t link) {
  return std::string(each.who) + " #6 refers to " + each.what + " #" + std::to_string(link);
}

} // namespace

TEST_F(ReadLinksTest, NoLinkNamesASectionBeyondTheLast) {
  for (const LinkCase& each : LinkCases) {
    for (const uint32_t link : {8U, 0xFFFFFFFFU}) {
      ObjectBuilder file = linkedObject();
      file.section(".test", each.type).link(link);
      const std::string text = refersTo(each, link) + " but the last section is #7";
      if (each.isMendable)
        expectMended(file, text);
      else
        expectFinal(file, text);
    }
  }
}

TEST_F(ReadLinksTest, NoLinkNamesASectionOfAnotherType) {
  for (const LinkCase& each : LinkCases) {
    ObjectBuilder file = linkedObject();
    file.section(".test", each.type).link(1);
    const std::string text = refersTo(each, 1) +
                             " but that section has type #1 (SHT_PROGBITS) instead of " +
                             each.wanted;
    if (each.isMendable)
      expectMended(file, text);
    else
      expectFinal(file, text);
  }
}

TEST_F(ReadLinksTest, ATypeWithoutANameIsANumberOnly) {
  ObjectBuilder file = object();
  file.section(".odd", 0x60000001);
  file.section(".dynamic", SHT_DYNAMIC).link(1);
  expectFinal(file, "Dynamic section #2 refers to string table section #1 but that section has "
                    "type #1610612737 instead of SHT_STRTAB");
}

TEST_F(ReadLinksTest, OnlyDynamicAndPreemptionMapSectionsNeedNoLink) {
  for (const LinkCase& each : LinkCases) {
    ObjectBuilder file = linkedObject();
    file.section(".test", each.type);
    const bool needsNone = each.type == SHT_ZEV_PREEMPTMAP || each.type == SHT_DYNAMIC;
    EXPECT_EQ(read(file).isRead, needsNone) << each.who;
    if (!needsNone) {
      EXPECT_THAT(read(file).reports,
                  ElementsAre(HasSubstr("#0 but that section has type #0 (SHT_NULL)")));
    }
  }
}

TEST_F(ReadLinksTest, AGroupMustGoWithTheStaticSymbols) {
  ObjectBuilder file = linkedObject();
  file.section(".group", SHT_GROUP).link(4);
  expectMended(file, "Group section #6 refers to symbol table section #4 but that section has "
                     "type #11 (SHT_DYNSYM) instead of SHT_SYMTAB or SHT_DYNSYM");
}

TEST_F(ReadLinksTest, AHashTableMustGoWithTheDynamicSymbols) {
  ObjectBuilder file = linkedObject();
  file.section(".hash", SHT_HASH).link(2);
  expectFinal(file, "Hash section #6 refers to symbol table section #2 but that section has type "
                    "#2 (SHT_SYMTAB) instead of SHT_DYNSYM");
}

TEST_F(ReadLinksTest, SymbolTablesAndHashTablesAreLinkedBothWays) {
  ObjectBuilder file = linkedObject();
  file.section(".hash", SHT_HASH).link(4);
  const ReadResult result = readGood(file);
  const auto* dynsym = static_cast<SymbolTableSection*>(result.section(4));
  EXPECT_EQ(dynsym->getHashSection(), result.section(6));
  EXPECT_EQ(result.section(6)->getLink(), dynsym);
}

TEST_F(ReadLinksTest, StringTablesKnowWhoUsesThem) {
  ObjectBuilder file = linkedObject();
  file.section(".dynamic", SHT_DYNAMIC).link(5);
  file.section(".other", SHT_PROGBITS).link(3);
  const ReadResult result = readGood(file);
  const auto* strtab = static_cast<StringTableSection*>(result.section(3));
  const auto* dynstr = static_cast<StringTableSection*>(result.section(5));
  EXPECT_TRUE(strtab->isLinkedBySymtab());
  EXPECT_FALSE(strtab->isLinkedByDynsym());
  EXPECT_TRUE(strtab->isLinkedByOther());
  EXPECT_FALSE(dynstr->isLinkedBySymtab());
  EXPECT_TRUE(dynstr->isLinkedByDynsym());
  EXPECT_TRUE(dynstr->isLinkedByOther());
  EXPECT_FALSE(dynstr->isSectionNameTable());
}

TEST_F(ReadLinksTest, RelocationsJoinTheListOfTheirTarget) {
  ObjectBuilder file = linkedObject();
  file.section(".rel", SHT_REL).link(2).info(1);
  file.section(".rela.dyn", SHT_RELA).link(4).info(1);
  const ReadResult result = readGood(file);
  auto* rel = static_cast<RelocationSection*>(result.section(6));
  auto* rela = static_cast<RelocationSection*>(result.section(7));
  EXPECT_EQ(rel->getTarget(), result.section(1));
  EXPECT_FALSE(rel->isDynamic());
  EXPECT_TRUE(rela->isDynamic());
  EXPECT_THAT(result.section(1)->getStaticRelocationSections(), ElementsAre(rel));
  EXPECT_THAT(result.section(1)->getDynamicRelocationSections(), ElementsAre(rela));
}

TEST_F(ReadLinksTest, ARelocationTargetIsASection) {
  ObjectBuilder file = linkedObject();
  file.section(".rel", SHT_REL).link(2).info(8).relocation({.symbol = 99});
  const ReadResult mended = expectMended(
      file, "Relocation section #6 refers to target section #8 but the last section is #7");
  EXPECT_EQ(static_cast<RelocationSection*>(mended.section(6))->getTarget(), nullptr);
}

TEST_F(ReadLinksTest, BrokenSectionsArePassedOver) {
  ObjectBuilder file = linkedObject();
  file.section(".rel", SHT_REL).link(1).info(99).relocation({.symbol = 99});
  expectMended(file, "Relocation section #6 refers to symbol table section #1 but that section "
                     "has type #1 (SHT_PROGBITS) instead of SHT_SYMTAB or SHT_DYNSYM");
  ObjectBuilder group = linkedObject();
  group.section(".group", SHT_GROUP).link(99).info(99).word(1).word(99);
  const ReadResult mended = expectMended(
      group, "Group section #6 refers to symbol table section #99 but the last section is #7");
  EXPECT_EQ(mended.module->getGroupCount(), 0U);
}

TEST_F(ReadLinksTest, AGroupSignatureIsASymbolOfTheTable) {
  ObjectBuilder file = linkedObject();
  file.section(".group", SHT_GROUP).link(2).info(1).word(1);
  const ReadResult result = readGood(file);
  EXPECT_EQ(static_cast<GroupSection*>(result.section(6))->getSignatureSymbolIndex(), 1U);
  ObjectBuilder bad = linkedObject();
  bad.section(".group", SHT_GROUP).link(2).info(2).word(1);
  expectFinal(bad, "Group section #6 refers to symbol #2 but its associated symbol table section "
                   "#2 only contains 2 symbols");
}

TEST_F(ReadLinksTest, ASymbolTableHasOneIndexSection) {
  ObjectBuilder file = linkedObject();
  file.section(".shndx", SHT_SYMTAB_SHNDX).link(4).word(0).word(0);
  const ReadResult result = readGood(file);
  EXPECT_EQ(static_cast<SymbolTableSection*>(result.section(4))->getShndxSection(),
            result.section(6));
  file.section(".shndx2", SHT_SYMTAB_SHNDX).link(4).word(0).word(0);
  expectFinal(file, "SHT_SYMTAB_SHNDX sections #6 and #7 are both associated with the same symbol "
                    "table section #4");
}

TEST_F(ReadLinksTest, AnIndexSectionHasAWordForEachSymbol) {
  ObjectBuilder file = linkedObject();
  file.section(".shndx", SHT_SYMTAB_SHNDX).link(2).word(0);
  expectFinal(file, "SHT_SYMTAB_SHNDX section #6 contains 1 entries, but its associated symbol "
                    "table section #2 contains 2");
}

TEST_F(ReadLinksTest, TheOtherSectionsLinkToAnySection) {
  ObjectBuilder file = object();
  file.section(".exidx", SHT_ZEV_EXIDX).link(3);
  file.section(".data", SHT_PROGBITS).link(0);
  file.section("", SHT_NULL).link(1);
  const ReadResult result = readGood(file);
  EXPECT_EQ(result.section(1)->getLink(), result.section(3));
  EXPECT_EQ(result.section(2)->getLink(), nullptr);
  EXPECT_EQ(result.section(3)->getLink(), result.section(1));
  EXPECT_THAT(result.section(1)->getLinkingSections(), ElementsAre(result.section(3)));
}

// A file of five sections.
TEST_F(ReadLinksTest, TheLastSectionIsTheCountLessOne) {
  ObjectBuilder file = object();
  file.section(".data", SHT_PROGBITS).link(5);
  file.section(".more", SHT_PROGBITS);
  file.section(".even", SHT_PROGBITS);
  expectFinal(file,
              "Link field of section #1 refers to target section #5 but the last section is #4");
}

TEST_F(ReadLinksTest, LinksThatHaveAMeaningAreCheckedBeforeThoseWithout) {
  ObjectBuilder file = object();
  file.section(".data", SHT_PROGBITS).link(99);
  file.section(".symtab", SHT_SYMTAB).link(98);
  EXPECT_THAT(read(file).reports, ElementsAre(HasSubstr("string table section #98")));
}

TEST_F(ReadLinksTest, ABrokenLinkIsReportedOnce) {
  ObjectBuilder file = linkedObject();
  file.section(".rel", SHT_REL).link(99);
  EXPECT_THAT(readOn(file).reports, SizeIs(1));
}

} // namespace elfext
