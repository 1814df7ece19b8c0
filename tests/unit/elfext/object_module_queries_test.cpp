// SPDX-License-Identifier: Apache-2.0
//
// Look-ups by name and by address, and the lists that they fill. What sorting and halving find must
// be what going through all objects finds, in its order; generated places with fixed seeds put that
// to the test.

#include "elfext/interface/relocation.h"
#include "elfext/interface/relocation_list.h"
#include "elfext/interface/section_list.h"
#include "elfext/interface/segment.h"
#include "module_fixture.h"

#include <random>

namespace elfext {
namespace {

class QueryTest : public ModuleTest {
protected:
  std::vector<Symbol*> result() const { return elements(found); }

  SymbolList found;
};

TEST_F(QueryTest, FindsSectionsByNameInIndexOrder) {
  Section* first = makeSection("a");
  makeSection("b");
  makeSection(nullptr);
  Section* second = makeSection("a");
  SectionList sections;
  EXPECT_TRUE(module.getSectionsByName("a", &sections));
  EXPECT_THAT(elements(sections), testing::ElementsAre(first, second));
  EXPECT_FALSE(module.getSectionsByName("c", &sections));
  EXPECT_EQ(sections.getSize(), 0u);
  EXPECT_ASSERTION(module.getSectionsByName(nullptr, &sections), "name != NULL");
  EXPECT_ASSERTION(module.getSectionsByName("a", nullptr), "sections != NULL");
}

TEST_F(QueryTest, FindsSymbolsByNameInIndexOrder) {
  makeAbsolute("b");
  Symbol* first = makeAbsolute("a", 9);
  makeAbsolute(nullptr);
  Symbol* second = makeUndefined("a");
  Symbol* dynamic = makeUndefinedDynamic("a");
  EXPECT_TRUE(module.getSymbolsByName("a", &found));
  EXPECT_THAT(result(), testing::ElementsAre(first, second));
  EXPECT_TRUE(module.getDynamicSymbolsByName("a", &found));
  EXPECT_THAT(result(), testing::ElementsAre(dynamic));
  EXPECT_TRUE(module.areSortedViewsUpToDate());
}

TEST_F(QueryTest, AnswersFalseForANameThatIsAbsent) {
  EXPECT_FALSE(module.getSymbolsByName("a", &found));
  EXPECT_EQ(found.getSize(), 0u);
  makeAbsolute("b");
  makeUndefinedDynamic("b");
  EXPECT_TRUE(module.getSymbolsByName("b", &found));
  EXPECT_FALSE(module.getSymbolsByName("a", &found));
  EXPECT_EQ(found.getSize(), 0u);
  EXPECT_FALSE(module.getSymbolsByName("c", &found));
  EXPECT_FALSE(module.getSymbolsByName("", &found));
  EXPECT_FALSE(module.getDynamicSymbolsByName("a", &found));
}

TEST_F(QueryTest, ComparesNamesAsUnsignedBytes) {
  // In a signed comparison the umlaut would come first and the search miss one of the two.
  Symbol* high = makeAbsolute("\xC3\xA4");
  Symbol* low = makeAbsolute("a");
  Symbol* empty = makeAbsolute("");
  EXPECT_TRUE(module.getSymbolsByName("\xC3\xA4", &found));
  EXPECT_THAT(result(), testing::ElementsAre(high));
  EXPECT_TRUE(module.getSymbolsByName("a", &found));
  EXPECT_THAT(result(), testing::ElementsAre(low));
  EXPECT_TRUE(module.getSymbolsByName("", &found));
  EXPECT_THAT(result(), testing::ElementsAre(empty));
}

TEST_F(QueryTest, FindsEightSymbolsOfOneNameInIndexOrder) {
  std::vector<Symbol*> all;
  for (int count = 0; count < 8; ++count)
    all.push_back(makeAbsolute("same", static_cast<uint64_t>(9 - count)));
  EXPECT_TRUE(module.getSymbolsByName("same", &found));
  EXPECT_EQ(result(), all);
}

TEST_F(QueryTest, FindsEachOfManyNames) {
  for (int number = 0; number < 300; ++number)
    makeAbsolute(std::to_string(number * 7919 % 300).c_str());
  for (int number = 0; number < 300; ++number) {
    ASSERT_TRUE(module.getSymbolsByName(std::to_string(number).c_str(), &found));
    ASSERT_EQ(found.getSize(), 1u);
    ASSERT_EQ(found[0]->getName(), std::to_string(number));
  }
}

TEST_F(QueryTest, WantsANameAndAList) {
  EXPECT_ASSERTION(module.getSymbolsByName(nullptr, &found), "name != NULL");
  EXPECT_ASSERTION(module.getSymbolsByName("a", nullptr), "symbols != NULL");
  EXPECT_ASSERTION(module.getDynamicSymbolsByName(nullptr, &found), "name != NULL");
  EXPECT_ASSERTION(module.getDynamicSymbolsByName("a", nullptr), "symbols != NULL");
  EXPECT_ASSERTION(module.getSymbolsInRange(0, 1, 7, nullptr), "symbols != NULL");
  EXPECT_ASSERTION(module.getSymbolsAtAddress(0, 7, nullptr), "symbols != NULL");
  EXPECT_ASSERTION(module.getPrecedingSymbols(0, 7, nullptr), "symbols != NULL");
  EXPECT_ASSERTION(module.getFollowingSymbols(0, 7, nullptr), "symbols != NULL");
}

class AddressQueryTest : public QueryTest {
protected:
  AddressQueryTest() {
    section->setAddress(0x100);
    makeUndefinedDynamic("dynamic");
  }

  Section* section = makeSection();
  Symbol* high = makeAbsolute("high", 0xFFFFFFFFFFFFFFFF);
  Symbol* mapping = makeHosted("$a", section, 4);
  Symbol* absolute = makeAbsolute("absolute", 0x102);
  Symbol* function = makeHosted("function", section, 4);
};

TEST_F(AddressQueryTest, FindsARange) {
  EXPECT_TRUE(module.getSymbolsInRange(0x102, 0x104, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(absolute, mapping, function));
  EXPECT_TRUE(module.getSymbolsInRange(0x102, 0x104, Symbol::Class_Ordinary, &found));
  EXPECT_THAT(result(), testing::ElementsAre(absolute, function));
  EXPECT_TRUE(module.getSymbolsInRange(0x103, ~uint64_t{0}, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(mapping, function, high));
  EXPECT_FALSE(module.getSymbolsInRange(0x105, 0x200, Symbol::Class_All, &found));
  EXPECT_FALSE(module.getSymbolsInRange(0x102, 0x103, Symbol::Class_Mapping, &found));
  EXPECT_EQ(found.getSize(), 0u);
  EXPECT_FALSE(module.getSymbolsInRange(0x104, 0x102, Symbol::Class_All, &found));
}

TEST_F(AddressQueryTest, FindsOneAddress) {
  EXPECT_TRUE(module.getSymbolsAtAddress(0x104, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(mapping, function));
  EXPECT_TRUE(module.getSymbolsAtAddress(0x104, Symbol::Class_Mapping, &found));
  EXPECT_THAT(result(), testing::ElementsAre(mapping));
  EXPECT_FALSE(module.getSymbolsAtAddress(0x103, Symbol::Class_All, &found));
}

TEST_F(AddressQueryTest, FindsTheHighestAddressNotAbove) {
  EXPECT_TRUE(module.getPrecedingSymbols(0x1000, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(mapping, function));
  EXPECT_TRUE(module.getPrecedingSymbols(0x104, Symbol::Class_Ordinary, &found));
  EXPECT_THAT(result(), testing::ElementsAre(function));
  EXPECT_TRUE(module.getPrecedingSymbols(0x103, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(absolute));
  EXPECT_FALSE(module.getPrecedingSymbols(0x103, Symbol::Class_Mapping, &found));
  EXPECT_FALSE(module.getPrecedingSymbols(0x101, Symbol::Class_All, &found));
  EXPECT_EQ(found.getSize(), 0u);
}

TEST_F(AddressQueryTest, FindsTheLowestAddressNotBelow) {
  EXPECT_TRUE(module.getFollowingSymbols(0, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(absolute));
  EXPECT_TRUE(module.getFollowingSymbols(0, Symbol::Class_Mapping, &found));
  EXPECT_THAT(result(), testing::ElementsAre(mapping));
  EXPECT_TRUE(module.getFollowingSymbols(0x105, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(high));
  EXPECT_FALSE(module.getFollowingSymbols(0x105, Symbol::Class_Mapping, &found));
  EXPECT_EQ(found.getSize(), 0u);
}

TEST_F(AddressQueryTest, SeesTheInstructionSetMark) {
  const Symbol* marked = module.createHostedSymbol("marked", 9, STT_FUNC, 1, 0, section);
  EXPECT_FALSE(module.getSymbolsAtAddress(0x108, Symbol::Class_All, &found));
  EXPECT_TRUE(module.getSymbolsAtAddress(0x109, Symbol::Class_All, &found));
  EXPECT_EQ(found[0], marked);
}

TEST_F(AddressQueryTest, PutsSymbolsWithoutAPlaceAt0) {
  Symbol* undefined = makeUndefined("u");
  Symbol* common = module.createCommonSymbol("c", 8, 0, 1, 0);
  EXPECT_TRUE(module.getSymbolsAtAddress(0, Symbol::Class_All, &found));
  EXPECT_THAT(result(), testing::ElementsAre(undefined, common));
}

// ---- The lists

template <class List, class Object>
void expectListWorks(Object* object, Object* other) {
  List list;
  EXPECT_EQ(list.getSize(), 0u);
  list.setSize(9);
  for (uint32_t index = 0; index < 9; ++index)
    list.set(index, index < 7 ? object : other);
  EXPECT_EQ(list.getSize(), 9u);
  EXPECT_EQ(list[6], object);
  EXPECT_EQ(list[7], other);
  list.setSize(8);
  list.set(7, object);
  EXPECT_EQ(list[7], object);
  EXPECT_ASSERTION((void)list[8], "index < m_Size");
  EXPECT_ASSERTION(list.set(8, object), "index < m_Size");
}

TEST_F(QueryTest, FillsListsBeyondTheirSevenInlinePlaces) {
  Section* section = makeSection();
  Section* otherSection = makeSection();
  expectListWorks<SectionList>(section, otherSection);
  expectListWorks<SymbolList>(makeAbsolute("a"), makeAbsolute("b"));
  expectListWorks<RelocationList>(section->addRelocation(0, 0, nullptr),
                                  section->addRelocation(0, 0, nullptr));
}

TEST_F(QueryTest, PutsNoNullIntoLists) {
  SectionList sections;
  SymbolList symbols;
  RelocationList relocations;
  EXPECT_ASSERTION(sections.set(0, nullptr), "section != NULL");
  EXPECT_ASSERTION(symbols.set(0, nullptr), "symbol != NULL");
  EXPECT_ASSERTION(relocations.set(0, nullptr), "relocation != NULL");
}

// ---- Segments

// Segments and sections in a few trees, some alone, of few different places and sizes.
class HoldersTest : public ModuleTest {
protected:
  void place(uint32_t seed) {
    std::mt19937 random(seed);
    module.clear();
    m_Roots.clear();
    for (uint64_t i = random() % 4; i > 0; --i)
      m_Roots.push_back(module.createSegment(PT_NULL, 0, 0, 0, 0, 0, 0, 0));
    for (uint64_t i = random() % 12; i > 0; --i)
      tie(random, *module.createSegment(PT_LOAD, 0, 0, 0, random() % 12, 0, 0, 0));
    for (uint64_t i = random() % 12; i > 0; --i) {
      Section* section = makeSection(".x", random() % 4 == 0 ? SHT_NOBITS : SHT_PROGBITS);
      ModuleBuilder::adoptSize(*section, random() % 5);
      tie(random, *section);
    }
  }

  static Segment* plainHolder(Section& section, std::span<Segment* const> segments) {
    for (Segment* segment : segments) {
      if (section.isWithin(*segment)) return segment;
    }
    return nullptr;
  }

  // Returns how many sections have a holder.
  size_t expectPlainHolders(std::span<Segment* const> segments) {
    std::vector<Segment*> expected;
    for (Section* section : module.getSections())
      expected.push_back(plainHolder(*section, segments));
    EXPECT_EQ(module.findHolders(segments), expected);
    const auto none = std::count(expected.begin(), expected.end(), nullptr);
    return expected.size() - static_cast<size_t>(none);
  }

private:
  void tie(std::mt19937& random, FileRegion& region) {
    const size_t root = random() % (m_Roots.size() + 1);
    if (root == m_Roots.size()) return;
    EXPECT_TRUE(FileRegion::link(*m_Roots[root], region, random() % 8));
  }

  std::vector<Segment*> m_Roots;
};

TEST_F(HoldersTest, AreNoneWhereThereIsNothing) {
  EXPECT_THAT(module.findHolders({}), testing::IsEmpty());
  makeSection();
  EXPECT_THAT(module.findHolders({}), testing::ElementsAre(nullptr));
}

TEST_F(HoldersTest, MayReachTheLastPlace) {
  Segment* segment = module.createSegment(PT_LOAD, 0, 0, 0, UINT64_MAX, 0, 0, 0);
  Section* section = makeSection();
  ModuleBuilder::adoptSize(*section, 2);
  ASSERT_TRUE(FileRegion::link(*segment, *section, UINT64_MAX - 2));
  EXPECT_THAT(module.findHolders(module.getSegments()), testing::ElementsAre(segment));
  ModuleBuilder::adoptSize(*section, 3);
  EXPECT_THAT(module.findHolders(module.getSegments()), testing::ElementsAre(nullptr));
}

TEST_F(HoldersTest, AreThoseThatGoingThroughTheSegmentsFinds) {
  size_t foundCount = 0;
  size_t sectionCount = 0;
  for (uint32_t round = 0; round < 1000; ++round) {
    SCOPED_TRACE("round " + std::to_string(round));
    place(round);
    const std::span<Segment* const> all = module.getSegments();
    expectPlainHolders(all.subspan(all.size() / 2));
    foundCount += expectPlainHolders(all);
    sectionCount += module.getSectionCount();
  }
  // The forests are neither hopeless nor trivial.
  EXPECT_GT(foundCount, sectionCount / 10);
  EXPECT_LT(foundCount, sectionCount * 9 / 10);
}

TEST_F(HoldersTest, AreThoseOfEachSectionAskedByItself) {
  for (uint32_t round = 0; round < 100; ++round) {
    place(round);
    const std::vector<Segment*> holders = module.findHolders(module.getSegments());
    for (Section* section : module.getSections()) {
      const Segment* holder = holders[section->getIndex()];
      uint32_t index = 99;
      EXPECT_EQ(section->isInSegment(&index), holder != nullptr);
      EXPECT_EQ(index, holder == nullptr ? 99 : holder->getIndex());
    }
  }
}

} // namespace
} // namespace elfext
