// SPDX-License-Identifier: Apache-2.0
//
// The symbols of a section and the queries over them, by offset and by name, held against a plain
// search through the list.

#include "module_fixture.h"

namespace elfext {
namespace {

class SectionSymbolsTest : public ModuleTest {
protected:
  std::vector<Symbol*> result() const { return elements(found); }

  Section* section = makeSection();
  SymbolList found;
};

TEST_F(SectionSymbolsTest, AreListedInTheOrderOfMaking) {
  Symbol* first = makeHosted("a", section, 8);
  Symbol* dynamic = makeHostedDynamic("d", section);
  Symbol* second = makeHosted("b", section, 4);
  EXPECT_EQ(section->getHostedSymbolCount(), 2u);
  EXPECT_EQ(section->getHostedSymbol(0), first);
  EXPECT_EQ(section->getHostedSymbolIndex(second), 1u);
  EXPECT_EQ(section->getHostedDynamicSymbolCount(), 1u);
  EXPECT_EQ(section->getHostedDynamicSymbol(0), dynamic);
  EXPECT_EQ(section->getHostedDynamicSymbolIndex(dynamic), 0u);
}

TEST_F(SectionSymbolsTest, HaveIndexesInTheirOwnListOnly) {
  Symbol* plain = makeHosted("a", section);
  Symbol* dynamic = makeHostedDynamic("d", section);
  Symbol* elsewhere = makeHosted("b", makeSection());
  Symbol* dynamicElsewhere = makeHostedDynamic("b", makeSection());
  EXPECT_ASSERTION((void)section->getHostedSymbolIndex(nullptr), "symbol != NULL");
  EXPECT_ASSERTION((void)section->getHostedSymbolIndex(dynamic), "!symbol->isDynamic()");
  EXPECT_ASSERTION((void)section->getHostedSymbolIndex(elsewhere),
                   "symbol->getHostedSymbolSection() == this");
  EXPECT_ASSERTION((void)section->getHostedDynamicSymbolIndex(nullptr), "symbol != NULL");
  EXPECT_ASSERTION((void)section->getHostedDynamicSymbolIndex(plain), "symbol->isDynamic()");
  EXPECT_ASSERTION((void)section->getHostedDynamicSymbolIndex(dynamicElsewhere),
                   "symbol->getHostedSymbolSection() == this");
}

TEST_F(SectionSymbolsTest, MoveAmongEachOther) {
  Symbol* first = makeHosted("same", section, 4);
  Symbol* second = makeHosted("same", section, 4);
  EXPECT_TRUE(section->getSymbolsByName("same", &found));
  EXPECT_THAT(result(), testing::ElementsAre(first, second));
  EXPECT_TRUE(makesStale([&] { section->setHostedSymbolIndex(first, 1); }));
  EXPECT_EQ(section->getHostedSymbol(0), second);
  EXPECT_TRUE(section->getSymbolsByName("same", &found));
  EXPECT_THAT(result(), testing::ElementsAre(second, first));
  Symbol* dynamic = makeHostedDynamic("d", section);
  Symbol* other = makeHostedDynamic("e", section);
  section->setHostedDynamicSymbolIndex(other, 0);
  EXPECT_EQ(section->getHostedDynamicSymbol(1), dynamic);
}

TEST_F(SectionSymbolsTest, MoveOnlyWhereThatIsPossible) {
  Symbol* plain = makeHosted("a", section);
  Symbol* dynamic = makeHostedDynamic("d", section);
  EXPECT_ASSERTION(section->setHostedSymbolIndex(nullptr, 0), "symbol != NULL");
  EXPECT_ASSERTION(section->setHostedSymbolIndex(dynamic, 0), "!symbol->isDynamic()");
  EXPECT_ASSERTION(section->setHostedSymbolIndex(plain, 1), "index < m_HostedSymbols.getSize()");
  EXPECT_ASSERTION(section->setHostedDynamicSymbolIndex(plain, 0), "symbol->isDynamic()");
  EXPECT_ASSERTION(section->setHostedDynamicSymbolIndex(dynamic, 1),
                   "index < m_HostedDynamicSymbols.getSize()");
  module.setIndexesFrozen(true);
  EXPECT_ASSERTION(section->setHostedSymbolIndex(plain, 0), "!m_ObjectModule->m_IndexesFrozen");
  EXPECT_ASSERTION(section->setHostedDynamicSymbolIndex(dynamic, 0),
                   "!m_ObjectModule->m_IndexesFrozen");
}

// ---- By offset

TEST_F(SectionSymbolsTest, AreFoundInARangeIfTheyAreMappingSymbols) {
  Symbol* last = makeHosted("$d", section, 8);
  Symbol* first = makeHosted("$a", section, 4);
  makeHosted("ordinary", section, 4);
  makeHosted("$b", section, 6);
  Symbol* same = makeHosted("$t.x", section, 8);
  EXPECT_TRUE(section->getSymbolsInRange(4, 8, &found));
  EXPECT_THAT(result(), testing::ElementsAre(first, last, same));
  EXPECT_TRUE(section->getSymbolsInRange(5, 8, &found));
  EXPECT_THAT(result(), testing::ElementsAre(last, same));
  EXPECT_FALSE(section->getSymbolsInRange(5, 7, &found));
  EXPECT_EQ(found.getSize(), 0u);
  EXPECT_FALSE(section->getSymbolsInRange(9, 20, &found));
  EXPECT_FALSE(section->getSymbolsInRange(0, 3, &found));
  EXPECT_FALSE(section->getSymbolsInRange(8, 4, &found));
}

TEST_F(SectionSymbolsTest, AreFoundInNoRangeOfASectionWithoutSymbols) {
  EXPECT_FALSE(section->getSymbolsInRange(0, ~uint64_t{0}, &found));
  EXPECT_FALSE(section->getPrecedingSymbols(~uint64_t{0}, Symbol::Class_All, &found));
  EXPECT_FALSE(section->getFollowingMappingSymbols(0, &found));
  EXPECT_FALSE(section->getSymbolsByName("a", &found));
}

TEST_F(SectionSymbolsTest, CompareOffsetsWithoutASign) {
  Symbol* high = makeHosted("$a", section, 0xFFFFFFFFFFFFFFFF);
  Symbol* low = makeHosted("$d", section, 1);
  EXPECT_TRUE(section->getSymbolsInRange(0, ~uint64_t{0}, &found));
  EXPECT_THAT(result(), testing::ElementsAre(low, high));
}

TEST_F(SectionSymbolsTest, AreFoundBeforeAnOffset) {
  Symbol* mapping = makeHosted("$t", section, 4);
  Symbol* ordinary = makeHosted("f", section, 4);
  Symbol* tag = makeHosted("$b", section, 4);
  makeHosted("$d", section, 8);
  EXPECT_TRUE(section->getPrecedingSymbols(7, Symbol::Class_Ordinary, &found));
  EXPECT_THAT(result(), testing::ElementsAre(ordinary));
  EXPECT_TRUE(section->getPrecedingSymbols(4, Symbol::Class_Mapping, &found));
  EXPECT_THAT(result(), testing::ElementsAre(mapping));
  EXPECT_TRUE(section->getPrecedingSymbols(7, Symbol::Class_Tag, &found));
  EXPECT_THAT(result(), testing::ElementsAre(tag));
  EXPECT_TRUE(section->getPrecedingSymbols(7, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(mapping, ordinary, tag));
  EXPECT_TRUE(section->getPrecedingSymbols(9, Symbol::Class_Ordinary, &found));
  EXPECT_THAT(result(), testing::ElementsAre(ordinary));
  EXPECT_TRUE(section->getPrecedingSymbols(9, Symbol::Class_Ordinary | Symbol::Class_Tag, &found));
  EXPECT_THAT(result(), testing::ElementsAre(ordinary, tag));
  EXPECT_FALSE(section->getPrecedingSymbols(3, Symbol::Class_All, &found));
  EXPECT_EQ(found.getSize(), 0u);
}

TEST_F(SectionSymbolsTest, AreNotFoundBeforeAnOffsetIfNonePasses) {
  makeHosted("$t", section, 4);
  EXPECT_FALSE(section->getPrecedingSymbols(7, Symbol::Class_Ordinary, &found));
}

TEST_F(SectionSymbolsTest, AreOrdinaryWithoutAName) {
  Symbol* nameless = makeHosted(nullptr, section, 4);
  EXPECT_TRUE(section->getPrecedingSymbols(7, Symbol::Class_Ordinary, &found));
  EXPECT_THAT(result(), testing::ElementsAre(nameless));
}

TEST_F(SectionSymbolsTest, AreFoundBehindAnOffsetIfTheyAreMappingSymbols) {
  makeHosted("f", section, 4);
  makeHosted("g", section, 8);
  Symbol* first = makeHosted("$a", section, 8);
  makeHosted("$v", section, 8);
  Symbol* second = makeHosted("$d", section, 8);
  makeHosted("$t", section, 12);
  EXPECT_TRUE(section->getFollowingMappingSymbols(4, &found));
  EXPECT_THAT(result(), testing::ElementsAre(first, second));
  EXPECT_TRUE(section->getFollowingMappingSymbols(8, &found));
  EXPECT_EQ(found.getSize(), 2u);
  EXPECT_TRUE(section->getFollowingMappingSymbols(9, &found));
  EXPECT_EQ(found.getSize(), 1u);
  EXPECT_FALSE(section->getFollowingMappingSymbols(13, &found));
  EXPECT_EQ(found.getSize(), 0u);
}

TEST_F(SectionSymbolsTest, WantAListForTheirResults) {
  EXPECT_ASSERTION(section->getSymbolsInRange(0, 1, nullptr), "symbols != NULL");
  EXPECT_ASSERTION(section->getPrecedingSymbols(0, 1, nullptr), "symbols != NULL");
  EXPECT_ASSERTION(section->getFollowingMappingSymbols(0, nullptr), "symbols != NULL");
  EXPECT_ASSERTION(section->getSymbolsByName("a", nullptr), "symbols != NULL");
  EXPECT_ASSERTION(section->getDynamicSymbolsInRange(0, 1, nullptr), "symbols != NULL");
  EXPECT_ASSERTION(section->getDynamicSymbolsByName("a", nullptr), "symbols != NULL");
}

// ---- By name

TEST_F(SectionSymbolsTest, AreFoundByName) {
  Symbol* b = makeHosted("b", section, 1);
  makeHosted(nullptr, section, 2);
  Symbol* a = makeHosted("a", section, 3);
  Symbol* secondB = makeHosted("b", section, 0);
  makeHosted("b", makeSection());
  EXPECT_TRUE(section->getSymbolsByName("b", &found));
  EXPECT_THAT(result(), testing::ElementsAre(b, secondB));
  EXPECT_TRUE(section->getSymbolsByName("a", &found));
  EXPECT_THAT(result(), testing::ElementsAre(a));
  EXPECT_FALSE(section->getSymbolsByName("c", &found));
  EXPECT_FALSE(section->getSymbolsByName("", &found));
  EXPECT_ASSERTION(section->getSymbolsByName(nullptr, &found), "name != NULL");
}

TEST_F(SectionSymbolsTest, AreFoundInTheirDynamicViewsToo) {
  Symbol* b = makeHostedDynamic("b", section, 8);
  Symbol* a = makeHostedDynamic("a", section, 4);
  makeHosted("a", section, 4);
  EXPECT_TRUE(section->getDynamicSymbolsInRange(4, 8, &found));
  EXPECT_THAT(result(), testing::ElementsAre(a, b));
  EXPECT_TRUE(section->getDynamicSymbolsByName("a", &found));
  EXPECT_THAT(result(), testing::ElementsAre(a));
  EXPECT_ASSERTION(section->getDynamicSymbolsByName(nullptr, &found), "name != NULL");
}

TEST_F(SectionSymbolsTest, AreFoundWhenTheyCameAfterAQuery) {
  makeHosted("$a", section, 4);
  EXPECT_TRUE(section->getSymbolsInRange(0, 100, &found));
  EXPECT_EQ(found.getSize(), 1u);
  makeHosted("$d", section, 8);
  EXPECT_TRUE(section->getSymbolsInRange(0, 100, &found));
  EXPECT_EQ(found.getSize(), 2u);
}

// Against a plain search, for all small cases.
TEST_F(SectionSymbolsTest, AreFoundAsAPlainSearchFindsThem) {
  const uint64_t offsets[] = {5, 1, 3, 3, 9, 5, 5, 0, 7, 3};
  for (uint64_t offset : offsets)
    makeHosted("$a", section, offset);
  for (uint64_t from = 0; from < 11; ++from) {
    for (uint64_t to = 0; to < 11; ++to) {
      const auto expected = std::count_if(std::begin(offsets), std::end(offsets),
                                          [=](uint64_t o) { return from <= o && o <= to; });
      EXPECT_EQ(section->getSymbolsInRange(from, to, &found), expected != 0);
      EXPECT_EQ(found.getSize(), expected);
    }
  }
}

} // namespace
} // namespace elfext
