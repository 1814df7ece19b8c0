// SPDX-License-Identifier: Apache-2.0
//
// The relocations of a section, those that are objects and those that are still rows of a file.
// Rows become objects when somebody asks or when what they refer to changes; whoever counts or
// searches must see the same either way.

#include "elfext/interface/relocation.h"
#include "elfext/interface/relocation_rows.h"
#include "module_fixture.h"

namespace elfext {
namespace {

class SectionRelocationsTest : public ModuleTest {
protected:
  std::vector<Relocation*> all() {
    std::vector<Relocation*> relocations;
    for (uint32_t index = 0; index < section->getRelocationCount(); ++index)
      relocations.push_back(section->getRelocation(index));
    return relocations;
  }
  std::vector<uint64_t> offsets() {
    std::vector<uint64_t> result;
    for (const Relocation* relocation : all())
      result.push_back(relocation->getOffset());
    return result;
  }

  Section* section = makeSection();
  Symbol* symbol = makeUndefined("a");
  Symbol* dynamicSymbol = makeUndefinedDynamic("b");
  RelocationList found;
};

TEST_F(SectionRelocationsTest, AreKeptInTheOrderOfAdding) {
  Relocation* first = section->addRelocation(8, 1, symbol);
  Relocation* second = section->addRelocation(4, 1, symbol, 5);
  EXPECT_EQ(section->getRelocationCount(), 2u);
  EXPECT_EQ(section->getRelocation(0), first);
  EXPECT_EQ(section->getRelocation(1), second);
  EXPECT_EQ(section->getRelocationIndex(second), 1u);
}

TEST_F(SectionRelocationsTest, ApplyToRelocatableSectionsOnly) {
  Section* note = makeSection(".note", SHT_NOTE);
  EXPECT_ASSERTION(note->addRelocation(0, 0, symbol), "m_IsRelocatable");
  EXPECT_ASSERTION(note->addRelocation(0, 0, symbol, 1), "m_IsRelocatable");
  ModuleBuilder::setRelocatable(*note, true);
  note->addRelocation(0, 0, symbol);
  EXPECT_EQ(note->getRelocationCount(), 1u);
}

TEST_F(SectionRelocationsTest, StayAsTheyAreWhileIndexesAreFrozen) {
  Relocation* relocation = section->addRelocation(0, 0, symbol);
  module.setIndexesFrozen(true);
  const char* expression = "!m_ObjectModule->m_IndexesFrozen";
  EXPECT_ASSERTION(section->addRelocation(0, 0, symbol), expression);
  EXPECT_ASSERTION(section->setRelocationIndex(relocation, 0), expression);
  EXPECT_ASSERTION(section->removeRelocation(relocation), expression);
  EXPECT_ASSERTION(section->removeAllRelocations(), expression);
}

TEST_F(SectionRelocationsTest, AreFoundByTheirOwnSectionOnly) {
  Relocation* foreign = makeSection()->addRelocation(0, 0, symbol);
  EXPECT_ASSERTION((void)section->getRelocationIndex(nullptr), "relocation != NULL");
  EXPECT_ASSERTION((void)section->getRelocationIndex(foreign), "relocation->m_Section == this");
  EXPECT_ASSERTION(section->removeRelocation(foreign), "relocation->m_Section == this");
  Relocation* relocation = section->addRelocation(0, 0, symbol);
  section->removeRelocation(relocation);
  EXPECT_EQ(section->getRelocationIndex(relocation), 0x80000000u);
}

TEST_F(SectionRelocationsTest, MoveAmongEachOther) {
  Relocation* first = section->addRelocation(1, 0, symbol);
  Relocation* second = section->addRelocation(2, 0, symbol);
  Relocation* third = section->addRelocation(3, 0, symbol);
  section->setRelocationIndex(first, 2);
  EXPECT_THAT(all(), testing::ElementsAre(second, third, first));
  section->setRelocationIndex(first, 0);
  EXPECT_THAT(all(), testing::ElementsAre(first, second, third));
  EXPECT_FALSE(makesStale([&] { section->setRelocationIndex(first, 0); }));
  EXPECT_ASSERTION(section->setRelocationIndex(first, 3), "index < m_Relocations.getSize()");
}

TEST_F(SectionRelocationsTest, AreRemoved) {
  Relocation* first = section->addRelocation(1, 0, symbol);
  Relocation* second = section->addRelocation(2, 0, symbol);
  EXPECT_TRUE(makesStale([&] { section->removeRelocation(first); }));
  EXPECT_THAT(all(), testing::ElementsAre(second));
  section->getRelocationsInRange(0, 9, &found);
  EXPECT_EQ(found.getSize(), 1u);
  EXPECT_TRUE(makesStale([&] { section->removeAllRelocations(); }));
  EXPECT_EQ(section->getRelocationCount(), 0u);
  section->getRelocationsInRange(0, 9, &found);
  EXPECT_EQ(found.getSize(), 0u);
}

TEST_F(SectionRelocationsTest, AreOfFourKinds) {
  const auto kinds = [this] {
    return std::vector<bool>{
        section->hasStaticRelocationsWithAddend(), section->hasStaticRelocationsWithoutAddend(),
        section->hasDynamicRelocationsWithAddend(), section->hasDynamicRelocationsWithoutAddend()};
  };
  EXPECT_THAT(kinds(), testing::ElementsAre(false, false, false, false));
  section->addRelocation(0, 0, symbol, 1);
  EXPECT_THAT(kinds(), testing::ElementsAre(true, false, false, false));
  section->addRelocation(0, 0, dynamicSymbol);
  EXPECT_THAT(kinds(), testing::ElementsAre(true, false, false, true));
  section->addRelocation(0, 0, symbol);
  EXPECT_THAT(kinds(), testing::ElementsAre(true, true, false, true));
  section->addRelocation(0, 0, dynamicSymbol, 1);
  EXPECT_THAT(kinds(), testing::ElementsAre(true, true, true, true));
}

TEST_F(SectionRelocationsTest, CountJumpSlotsByTheMachinesType) {
  const auto add = [this](int count, uint32_t type, bool hasAddend) {
    for (; count > 0; --count) {
      if (hasAddend)
        section->addRelocation(0, type, dynamicSymbol, 1);
      else
        section->addRelocation(0, type, dynamicSymbol);
      section->addRelocation(0, type, symbol);
    }
  };
  const auto counts = [this] {
    return std::vector<uint32_t>{
        section->getJumpSlotCountWithoutAddend(), section->getJumpSlotCountWithAddend(),
        section->getOtherDynamicCountWithoutAddend(), section->getOtherDynamicCountWithAddend()};
  };
  add(1, 22, false);
  add(2, 22, true);
  add(3, 1026, false);
  add(4, 1026, true);
  EXPECT_THAT(counts(), testing::ElementsAre(1, 2, 3, 4));
  module.setMachine(EM_ZEV64);
  EXPECT_THAT(counts(), testing::ElementsAre(3, 4, 1, 2));
}

TEST_F(SectionRelocationsTest, AreFoundByTheirOffsets) {
  Relocation* at8 = section->addRelocation(8, 1, symbol);
  Relocation* at4 = section->addRelocation(4, 2, symbol);
  Relocation* alsoAt8 = section->addRelocation(8, 3, symbol);
  Relocation* at16 = section->addRelocation(16, 4, symbol);
  section->getRelocationsInRange(4, 8, &found);
  EXPECT_THAT(elements(found), testing::ElementsAre(at4, at8, alsoAt8));
  section->getRelocationsInRange(5, 16, &found);
  EXPECT_THAT(elements(found), testing::ElementsAre(at8, alsoAt8, at16));
  section->getRelocationsInRange(9, 15, &found);
  EXPECT_EQ(found.getSize(), 0u);
  section->getRelocationsInRange(16, 4, &found);
  EXPECT_EQ(found.getSize(), 0u);
  EXPECT_ASSERTION(section->getRelocationsInRange(0, 1, nullptr), "relocations != NULL");
}

TEST_F(SectionRelocationsTest, AreFoundAgainAfterAChange) {
  Relocation* relocation = section->addRelocation(8, 1, symbol);
  section->getRelocationsInRange(8, 8, &found);
  EXPECT_EQ(found.getSize(), 1u);
  relocation->setOffset(20);
  section->getRelocationsInRange(8, 8, &found);
  EXPECT_EQ(found.getSize(), 0u);
  section->addRelocation(8, 1, symbol);
  section->getRelocationsInRange(8, 20, &found);
  EXPECT_EQ(found.getSize(), 2u);
}

// ---- Rows

// Rows at these offsets, against the first symbol of the table that their section goes with.
class TestRows final : public RelocationRows {
public:
  TestRows(RelocationSection* section, std::vector<uint64_t> offsets)
      : m_Section(section), m_Offsets(std::move(offsets)) {
    ModuleBuilder::setRows(*section, this, static_cast<uint32_t>(m_Offsets.size()));
  }

  void appendTo(Section& target) override {
    ++calls;
    ObjectModule& module = *target.getObjectModule();
    Symbol* symbol = m_Section->isDynamic() ? module.getDynamicSymbol(1) : module.getSymbol(1);
    for (uint64_t offset : m_Offsets)
      if (m_Section->hasAddends())
        target.addRelocation(offset, 1, symbol, 7);
      else
        target.addRelocation(offset, 1, symbol);
  }

  int calls = 0;

private:
  RelocationSection* m_Section;
  std::vector<uint64_t> m_Offsets;
};

class PendingRowsTest : public SectionRelocationsTest {
protected:
  RelocationSection* makeRelocationSection(uint32_t type, bool isDynamic) {
    RelocationSection* relocationSection = module.createRelocationSection("", type, 0);
    ModuleBuilder::setTarget(*relocationSection, section, isDynamic);
    return relocationSection;
  }

  RelocationSection* dynamicRela = makeRelocationSection(SHT_RELA, true);
  RelocationSection* staticRel = makeRelocationSection(SHT_REL, false);
  RelocationSection* secondRel = makeRelocationSection(SHT_REL, false);
  TestRows third{secondRel, {30, 31}};
  TestRows second{staticRel, {20}};
  TestRows first{dynamicRela, {10, 11}};
};

TEST_F(PendingRowsTest, KnowTheirSections) {
  EXPECT_EQ(staticRel->getTarget(), section);
  EXPECT_FALSE(staticRel->isDynamic());
  EXPECT_TRUE(dynamicRela->isDynamic());
  EXPECT_THAT(elements(section->getStaticRelocationSections()),
              testing::ElementsAre(staticRel, secondRel));
  EXPECT_THAT(elements(section->getDynamicRelocationSections()), testing::ElementsAre(dynamicRela));
}

TEST_F(PendingRowsTest, AreCountedWithoutBecomingObjects) {
  EXPECT_EQ(section->getRelocationCount(), 5u);
  EXPECT_EQ(dynamicRela->getPendingRowCount(), 2u);
  EXPECT_TRUE(section->hasStaticRelocationsWithoutAddend());
  EXPECT_FALSE(section->hasStaticRelocationsWithAddend());
  EXPECT_TRUE(section->hasDynamicRelocationsWithAddend());
  EXPECT_FALSE(section->hasDynamicRelocationsWithoutAddend());
  EXPECT_EQ(first.calls + second.calls + third.calls, 0);
}

TEST_F(PendingRowsTest, BecomeObjectsInTheOrderOfTheirSections) {
  EXPECT_THAT(offsets(), testing::ElementsAre(10, 11, 20, 30, 31));
  EXPECT_THAT(offsets(), testing::ElementsAre(10, 11, 20, 30, 31));
  EXPECT_EQ(section->getRelocationCount(), 5u);
  EXPECT_EQ(dynamicRela->getPendingRowCount(), 0u);
  EXPECT_EQ(first.calls, 1);
  EXPECT_EQ(second.calls, 1);
  EXPECT_EQ(third.calls, 1);
  EXPECT_TRUE(section->getRelocation(0)->isDynamic());
  EXPECT_EQ(section->getRelocation(0)->getAddend(), 7);
  EXPECT_FALSE(section->getRelocation(4)->isDynamic());
}

TEST_F(PendingRowsTest, ComeBeforeWhatIsAddedLater) {
  section->addRelocation(99, 1, symbol);
  EXPECT_THAT(offsets(), testing::ElementsAre(10, 11, 20, 30, 31, 99));
}

TEST_F(PendingRowsTest, BecomeObjectsForASearch) {
  section->getRelocationsInRange(11, 30, &found);
  EXPECT_EQ(found.getSize(), 3u);
  EXPECT_EQ(section->getOtherDynamicCountWithAddend(), 2u);
}

TEST_F(PendingRowsTest, BecomeObjectsWhereNothingMayChange) {
  ModuleBuilder::setRelocatable(*section, false);
  module.setIndexesFrozen(true);
  ModuleBuilder::setAuxiliarySectionsUpToDate(module, true);
  EXPECT_THAT(offsets(), testing::ElementsAre(10, 11, 20, 30, 31));
  EXPECT_FALSE(section->isRelocatable());
  EXPECT_TRUE(module.indexesAreFrozen());
  EXPECT_TRUE(module.areAuxiliarySectionsUpToDate());
}

TEST_F(PendingRowsTest, GoUnseenWithAllRelocations) {
  section->removeAllRelocations();
  EXPECT_EQ(section->getRelocationCount(), 0u);
  EXPECT_FALSE(section->hasStaticRelocationsWithoutAddend());
  EXPECT_TRUE(offsets().empty());
  EXPECT_EQ(first.calls + second.calls + third.calls, 0);
}

TEST_F(PendingRowsTest, BecomeObjectsBeforeTheirSectionTurnsElsewhere) {
  Section* other = makeSection();
  ModuleBuilder::setTarget(*staticRel, other, true);
  EXPECT_EQ(second.calls, 1);
  EXPECT_EQ(section->getRelocationCount(), 5u);
  EXPECT_THAT(elements(section->getStaticRelocationSections()), testing::ElementsAre(secondRel));
  EXPECT_THAT(elements(other->getDynamicRelocationSections()), testing::ElementsAre(staticRel));
}

TEST_F(PendingRowsTest, BecomeObjectsBeforeSymbolsMove) {
  makeUndefined("c");
  module.setSymbolIndex(symbol, 2);
  EXPECT_EQ(second.calls, 1);
  EXPECT_EQ(section->getRelocation(2)->getTarget(), symbol);
}

TEST_F(PendingRowsTest, BecomeObjectsBeforeSectionsMove) {
  module.setSectionIndex(secondRel, 0);
  EXPECT_THAT(offsets(), testing::ElementsAre(10, 11, 20, 30, 31));
}

TEST_F(PendingRowsTest, BecomeObjectsBeforeSymbolsGo) {
  Symbol* other = makeUndefined("c");
  Relocation* kept = section->addRelocation(99, 1, other);
  module.deleteSymbol(symbol);
  EXPECT_THAT(offsets(), testing::ElementsAre(10, 11, 99));
  EXPECT_EQ(section->getRelocation(2), kept);
}

TEST_F(PendingRowsTest, StayAsObjectsWhenTheirSectionGoes) {
  module.deleteSection(staticRel);
  EXPECT_THAT(offsets(), testing::ElementsAre(10, 11, 20, 30, 31));
}

TEST_F(PendingRowsTest, AreForgottenWhenTheModuleIsCleared) {
  module.clear();
  EXPECT_EQ(first.calls + second.calls + third.calls, 0);
}

TEST_F(PendingRowsTest, NeedATarget) {
  RelocationSection* loose = module.createRelocationSection("", SHT_REL, 0);
  EXPECT_ASSERTION(TestRows(loose, {1}), "m_Target != NULL");
  EXPECT_ASSERTION(TestRows(staticRel, {1}), "m_Rows == NULL");
  EXPECT_ASSERTION(ModuleBuilder::setTarget(*loose, nullptr, false), "target != NULL");
}

} // namespace
} // namespace elfext
