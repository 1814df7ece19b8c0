// SPDX-License-Identifier: Apache-2.0
//
// Deleting: what goes along, what is let go of, and that everything that stays is as it was. Each
// kind of reference between objects has its test, since one that is forgotten would lead to what is
// no longer there.

#include "elfext/interface/group.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/prune_criterion.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/relocation.h"
#include "elfext/interface/segment.h"
#include "module_fixture.h"

namespace elfext {
namespace {

class PrunerTest : public ModuleTest {
protected:
  std::vector<Section*> sections() const { return elements(module.getSections()); }
  std::vector<Symbol*> symbols() const { return elements(module.getSymbols()); }
  std::vector<Symbol*> dynamicSymbols() const { return elements(module.getDynamicSymbols()); }

  RelocationSection* makeRelocationSection(Section* target, bool isDynamic = false) {
    RelocationSection* section = module.createRelocationSection("", SHT_REL, 0);
    ModuleBuilder::setTarget(*section, target, isDynamic);
    return section;
  }
  Segment* makeSegment(uint64_t filesz = 100) {
    return module.createSegment(PT_LOAD, 0, 0, 0, filesz, filesz, 0, 1);
  }
};

TEST_F(PrunerTest, LeavesSectionsDense) {
  Section* first = makeSection();
  Section* doomed = makeSection();
  Section* third = makeSection();
  EXPECT_TRUE(makesStale([&] { module.deleteSection(doomed); }));
  EXPECT_THAT(sections(), testing::ElementsAre(first, third));
  EXPECT_EQ(third->getIndex(), 1u);
  EXPECT_EQ(makeSection()->getIndex(), 2u);
}

TEST_F(PrunerTest, TakesSymbolsAlongWithTheirSection) {
  Section* doomed = makeSection();
  Section* section = makeSection();
  makeHosted("a", doomed);
  Symbol* kept = makeHosted("b", section);
  makeHostedDynamic("c", doomed);
  Symbol* keptDynamic = makeHostedDynamic("d", section);
  Symbol* absolute = makeAbsolute("e");
  module.deleteSection(doomed);
  EXPECT_THAT(symbols(), testing::ElementsAre(kept, absolute));
  EXPECT_THAT(dynamicSymbols(), testing::ElementsAre(keptDynamic));
  EXPECT_EQ(kept->getIndex(), 1u);
  EXPECT_EQ(absolute->getIndex(), 2u);
  EXPECT_EQ(keptDynamic->getIndex(), 1u);
  EXPECT_EQ(section->getHostedSymbolCount(), 1u);
  EXPECT_EQ(section->getHostedDynamicSymbolCount(), 1u);
}

TEST_F(PrunerTest, TakesRelocationSectionsAlongWithTheirTarget) {
  Section* doomed = makeSection();
  Section* section = makeSection();
  RelocationSection* going = makeRelocationSection(doomed);
  makeRelocationSection(going);
  makeRelocationSection(doomed, true);
  RelocationSection* staying = makeRelocationSection(section);
  module.deleteSection(doomed);
  EXPECT_THAT(sections(), testing::ElementsAre(section, staying));
  EXPECT_EQ(staying->getTarget(), section);
}

TEST_F(PrunerTest, LeavesTheTargetOfARelocationSection) {
  Section* section = makeSection();
  Relocation* relocation = section->addRelocation(0, 0, nullptr);
  RelocationSection* doomed = makeRelocationSection(section);
  RelocationSection* doomedDynamic = makeRelocationSection(section, true);
  module.deleteSection(doomed);
  module.deleteSection(doomedDynamic);
  EXPECT_THAT(sections(), testing::ElementsAre(section));
  EXPECT_TRUE(section->getStaticRelocationSections().empty());
  EXPECT_TRUE(section->getDynamicRelocationSections().empty());
  EXPECT_EQ(section->getRelocation(0), relocation);
}

TEST_F(PrunerTest, TakesRelocationsAlongWithTheirSymbol) {
  Section* section = makeSection();
  Symbol* doomed = makeUndefined("a");
  Symbol* symbol = makeUndefined("b");
  section->addRelocation(0, 0, doomed);
  Relocation* kept = section->addRelocation(4, 0, symbol);
  section->addRelocation(8, 0, doomed, 1);
  Relocation* untargeted = section->addRelocation(12, 0, nullptr);
  module.deleteSymbol(doomed);
  EXPECT_EQ(section->getRelocationCount(), 2u);
  EXPECT_EQ(section->getRelocation(0), kept);
  EXPECT_EQ(section->getRelocation(1), untargeted);
  RelocationList found;
  section->getRelocationsInRange(0, 100, &found);
  EXPECT_EQ(found.getSize(), 2u);
}

TEST_F(PrunerTest, LetsGoOfLinksToASection) {
  Section* doomed = makeSection();
  Section* linked = makeSection();
  Section* other = makeSection();
  linked->setLink(doomed);
  doomed->setLink(other);
  module.deleteSection(doomed);
  EXPECT_EQ(linked->getLink(), nullptr);
  EXPECT_TRUE(other->getLinkingSections().empty());
}

TEST_F(PrunerTest, LetsGoOfTheHelpersOfASymbolTable) {
  for (uint32_t type : {SHT_SYMTAB, SHT_DYNSYM}) {
    SymbolTableSection* table = module.createSymbolTableSection("", type, 0);
    ShndxSection* shndx = module.createShndxSection("", 0);
    HashSection* hash = module.createHashSection("", 0);
    ModuleBuilder::setShndxSection(*table, shndx);
    ModuleBuilder::setHashSection(*table, hash);
    module.deleteSection(shndx);
    EXPECT_EQ(table->getShndxSection(), nullptr);
    EXPECT_EQ(table->getHashSection(), hash);
    module.deleteSection(hash);
    EXPECT_EQ(table->getHashSection(), nullptr);
  }
}

TEST_F(PrunerTest, TakesSectionsFromTheListsOfTheirTypes) {
  std::vector<Section*> all;
  for (uint32_t type : {SHT_STRTAB, SHT_SYMTAB, SHT_DYNSYM, SHT_GROUP, SHT_SYMTAB_SHNDX, SHT_HASH,
                        SHT_ZEV_PREEMPTMAP, SHT_GNU_verdef, SHT_GNU_verneed, SHT_GNU_versym,
                        SHT_DYNAMIC, SHT_ZEV_ATTRIBUTES, SHT_ZEV_DEBUGOVERLAY})
    all.push_back(module.createSectionOfType("", type, 0));
  for (Section* section : all)
    module.deleteSection(section);
  EXPECT_TRUE(module.getStringTableSections().empty());
  EXPECT_TRUE(module.getSymtabSections().empty());
  EXPECT_TRUE(module.getDynsymSections().empty());
  EXPECT_TRUE(module.getGroupSections().empty());
  EXPECT_TRUE(module.getShndxSections().empty());
  EXPECT_TRUE(module.getHashSections().empty());
  EXPECT_TRUE(module.getPreemptionMapSections().empty());
  EXPECT_TRUE(module.getVerdefSections().empty());
  EXPECT_TRUE(module.getVerneedSections().empty());
  EXPECT_TRUE(module.getVersymSections().empty());
  EXPECT_TRUE(module.getDynamicSections().empty());
  EXPECT_TRUE(module.getBuildAttributesSections().empty());
  EXPECT_TRUE(module.getDebugOverlaySections().empty());
}

TEST_F(PrunerTest, TakesOverlayRecordsAlongWithTheirSections) {
  Section* debug = makeSection();
  Section* section = makeSection();
  Section* doomed = makeSection();
  module.addDebugOverlayRecord({1, debug, doomed});
  module.addDebugOverlayRecord({2, debug, section});
  module.addDebugOverlayRecord({3, doomed, section});
  module.deleteSection(doomed);
  ASSERT_EQ(module.getDebugOverlayRecords().size(), 1u);
  EXPECT_EQ(module.getDebugOverlayRecords()[0].word, 2u);
}

TEST_F(PrunerTest, LeavesSymbolsDenseInAllTheirLists) {
  Section* section = makeSection();
  for (bool isDynamic : {false, true}) {
    std::vector<Symbol*> doomed;
    for (int round = 0; round < 2; ++round) {
      if (isDynamic) {
        doomed = {module.createAbsoluteDynamicSymbol("a", 0, 0, 0, 0),
                  module.createCommonDynamicSymbol("a", 0, 0, 0, 0), makeUndefinedDynamic("a"),
                  makeHostedDynamic("a", section)};
      } else {
        doomed = {makeAbsolute("a"), module.createCommonSymbol("a", 0, 0, 0, 0), makeUndefined("a"),
                  makeHosted("a", section)};
      }
    }
    for (Symbol* symbol : doomed)
      module.deleteSymbol(symbol);
  }
  EXPECT_EQ(module.getSymbolCount(), 5u);
  EXPECT_EQ(module.getDynamicSymbolCount(), 5u);
  for (uint32_t index = 1; index < 5; ++index) {
    EXPECT_EQ(module.getSymbol(index)->getIndex(), index);
    EXPECT_EQ(module.getDynamicSymbol(index)->getIndex(), index);
  }
  EXPECT_EQ(module.getAbsoluteSymbolCount(), 1u);
  EXPECT_EQ(module.getCommonSymbolCount(), 1u);
  EXPECT_EQ(module.getUndefinedSymbolCount(), 1u);
  EXPECT_EQ(module.getAbsoluteDynamicSymbolCount(), 1u);
  EXPECT_EQ(module.getCommonDynamicSymbolCount(), 1u);
  EXPECT_EQ(module.getUndefinedDynamicSymbolCount(), 1u);
  EXPECT_EQ(section->getHostedSymbolCount(), 1u);
  EXPECT_EQ(section->getHostedDynamicSymbolCount(), 1u);
}

TEST_F(PrunerTest, TakesSymbolsFromTheViews) {
  Section* section = makeSection();
  Symbol* doomed = makeHosted("a", section);
  SymbolList found;
  EXPECT_TRUE(module.getSymbolsByName("a", &found));
  EXPECT_TRUE(section->getSymbolsByName("a", &found));
  module.deleteSymbol(doomed);
  EXPECT_FALSE(module.getSymbolsByName("a", &found));
  EXPECT_FALSE(section->getSymbolsByName("a", &found));
}

TEST_F(PrunerTest, LetsGoOfAnAssociatedSymbol) {
  Symbol* doomed = makeAbsolute("a");
  Symbol* symbol = makeAbsolute("b");
  Symbol* dynamic = makeUndefinedDynamic("c");
  symbol->setAssociatedSymbol(doomed);
  dynamic->setAssociatedSymbol(doomed);
  doomed->setAssociatedSymbol(symbol);
  module.deleteSymbol(doomed);
  EXPECT_EQ(symbol->getAssociatedSymbol(), nullptr);
  EXPECT_EQ(dynamic->getAssociatedSymbol(), nullptr);
}

TEST_F(PrunerTest, TakesTheSectionOfAGroupAlongAndFreesItsMembers) {
  Group* doomed = module.createGroup("sig", "", GRP_COMDAT);
  GroupSection* groupSection = module.createGroupSection(".group", 0);
  ModuleBuilder::setGroupSection(*doomed, groupSection);
  Section* member = makeSection();
  doomed->addMember(member);
  Group* second = module.createGroup("sig", "", GRP_COMDAT);
  Group* other = module.createGroup("other", "", GRP_COMDAT);
  module.deleteGroup(doomed);
  EXPECT_THAT(sections(), testing::ElementsAre(member));
  EXPECT_EQ(member->getGroup(), nullptr);
  EXPECT_EQ(module.getGroupCount(), 2u);
  EXPECT_EQ(second->getIndex(), 0u);
  EXPECT_EQ(other->getIndex(), 1u);
  EXPECT_EQ(module.findComdatGroup("sig"), second);
  EXPECT_EQ(module.findComdatGroup("other"), other);
  module.deleteGroup(second);
  EXPECT_EQ(module.findComdatGroup("sig"), nullptr);
}

TEST_F(PrunerTest, LeavesAGroupWithoutASectionOfIts) {
  Group* group = module.createGroup("sig", "", 0);
  GroupSection* groupSection = module.createGroupSection(".group", 0);
  ModuleBuilder::setGroupSection(*group, groupSection);
  Section* member = makeSection();
  Section* doomed = makeSection();
  group->addMember(doomed);
  group->addMember(member);
  module.deleteSection(doomed);
  EXPECT_EQ(group->getMemberCount(), 1u);
  EXPECT_EQ(group->getMember(0), member);
  module.deleteSection(groupSection);
  EXPECT_EQ(group->getGroupSection(), nullptr);
  EXPECT_EQ(module.getGroupCount(), 1u);
  EXPECT_EQ(member->getGroup(), group);
}

TEST_F(PrunerTest, TakesRawDataBlocksAlongWithTheirSegment) {
  Segment* doomed = makeSegment();
  Segment* segment = makeSegment();
  Section* section = makeSection();
  Section* other = makeSection();
  ModuleBuilder::setSegment(*section, doomed);
  ModuleBuilder::setSegment(*other, segment);
  RawDataBlock* going = module.createRawDataBlock(doomed, 4);
  RawDataBlock* staying = module.createRawDataBlock(segment, 4);
  ASSERT_TRUE(FileRegion::link(*doomed, *going, 4));
  module.deleteSegment(doomed);
  EXPECT_EQ(module.getSegmentCount(), 1u);
  EXPECT_EQ(segment->getIndex(), 0u);
  EXPECT_THAT(elements(module.getRawDataBlocks()), testing::ElementsAre(staying));
  EXPECT_EQ(section->getSegment(), nullptr);
  EXPECT_EQ(other->getSegment(), segment);
}

TEST_F(PrunerTest, KeepsTheDistancesOfWhatStays) {
  Segment* doomed = makeSegment();
  Section* first = makeSection({1});
  Section* second = makeSection({1});
  Section* third = makeSection({1});
  ASSERT_TRUE(FileRegion::link(*doomed, *first, 10));
  ASSERT_TRUE(FileRegion::link(*doomed, *second, 30));
  ASSERT_TRUE(FileRegion::link(module.getElfHeader(), *third, 30));
  module.deleteSegment(doomed);
  EXPECT_TRUE(FileRegion::link(*first, *second, 20));
  EXPECT_FALSE(FileRegion::link(*first, *second, 21));
  EXPECT_FALSE(FileRegion::link(module.getElfHeader(), *third, 31));
  module.deleteSection(third);
  uint64_t offset = 1;
  EXPECT_EQ(module.getElfHeader().getPlacement().find(&offset),
            &module.getElfHeader().getPlacement());
}

TEST_F(PrunerTest, LeavesTheSmallListsDense) {
  NeededLibrary* library = module.createNeededLibrary("a");
  NeededLibrary* otherLibrary = module.createNeededLibrary("b");
  LibrarySearchPath* path = module.createLibrarySearchPath("a", 15);
  LibrarySearchPath* otherPath = module.createLibrarySearchPath("b", 15);
  Preemption* preemption = module.createPreemption("a", "b");
  Preemption* otherPreemption = module.createPreemption("c", "d");
  module.deleteNeededLibrary(library);
  module.deleteLibrarySearchPath(path);
  module.deletePreemption(preemption);
  EXPECT_EQ(module.getNeededLibraryCount(), 1u);
  EXPECT_EQ(module.getNeededLibrary(0), otherLibrary);
  EXPECT_EQ(otherLibrary->getIndex(), 0u);
  EXPECT_EQ(module.getLibrarySearchPathCount(), 1u);
  EXPECT_EQ(otherPath->getIndex(), 0u);
  EXPECT_EQ(module.getPreemptionCount(), 1u);
  EXPECT_EQ(otherPreemption->getIndex(), 0u);
}

TEST_F(PrunerTest, TakesWhatACriterionSays) {
  struct LocalsAndNotes final : PruneCriterion {
    using PruneCriterion::goes;
    bool goes(const Symbol& symbol) const override { return symbol.getBinding() == STB_LOCAL; }
    bool goes(const Section& section) const override { return section.getType() == SHT_NOTE; }
  };
  Section* text = makeSection();
  makeSection(".note", SHT_NOTE);
  Section* data = makeSection();
  module.createAbsoluteSymbol("local", 0, 0, STB_LOCAL, 0);
  Symbol* global = makeAbsolute("global");
  module.createAbsoluteDynamicSymbol("local", 0, 0, STB_LOCAL, 0);
  Group* group = module.createGroup("g", "", 0);
  module.prune(LocalsAndNotes());
  EXPECT_THAT(sections(), testing::ElementsAre(text, data));
  EXPECT_THAT(symbols(), testing::ElementsAre(global));
  EXPECT_TRUE(dynamicSymbols().empty());
  EXPECT_EQ(module.getGroup(0), group);
}

TEST_F(PrunerTest, TakesNothingByDefault) {
  struct Nothing final : PruneCriterion {};
  Section* section = makeSection();
  Symbol* symbol = makeHosted("a", section);
  module.prune(Nothing());
  EXPECT_THAT(sections(), testing::ElementsAre(section));
  EXPECT_THAT(symbols(), testing::ElementsAre(symbol));
}

TEST_F(PrunerTest, DeletesItsOwnObjectsOnly) {
  ObjectModule other;
  Section* foreign = other.createSection("", SHT_PROGBITS, 0);
  EXPECT_ASSERTION(module.deleteSection(foreign), "object->getObjectModule() == this");
  EXPECT_ASSERTION(module.deleteSymbol(nullptr), "object != NULL");
}

// ---- Clearing

TEST_F(PrunerTest, ClearsAnEmptyModule) {
  module.clear();
  module.clear();
  EXPECT_TRUE(module.isEmpty());
}

TEST_F(PrunerTest, ClearsEverything) {
  Section* section = makeSection();
  section->addRelocation(0, 0, makeHosted("a", section));
  makeUndefinedDynamic("b");
  makeRelocationSection(section);
  Segment* segment = makeSegment();
  RawDataBlock* block = module.createRawDataBlock(segment, 4);
  ASSERT_TRUE(FileRegion::link(module.getElfHeader(), *segment, 0));
  ASSERT_TRUE(FileRegion::link(*segment, *block, 4));
  ASSERT_TRUE(FileRegion::link(*segment, *section, 8));
  module.createGroup("g", "", GRP_COMDAT)->addMember(section);
  module.createNeededLibrary("l");
  module.createLibrarySearchPath("p", 15);
  module.createPreemption("s", "d");
  module.setFileVersionDefinition(module.createFileVersionDefinition("v", 1, 1));
  module.addDebugOverlayRecord({1, section, section});
  module.setSoname("so");
  module.addDynamicFlags(1);
  module.setDynamicValue(DynamicValue_Init, 4);
  ModuleBuilder::setReadConditions(module, ReadCondition_WasRead);
  ModuleBuilder::setSectionHeaderOffset(module, 100);
  ModuleBuilder::setStoredSectionCount(module, 3);
  module.getSectionHeaderTable().setEntryCount(3);
  module.getSectionHeaderTable().setFileOffset(100);
  module.clear();
  EXPECT_TRUE(module.isEmpty());
  EXPECT_EQ(module.getSegmentCount(), 0u);
  EXPECT_TRUE(module.getRawDataBlocks().empty());
  EXPECT_TRUE(module.getDebugOverlayRecords().empty());
  EXPECT_EQ(module.findComdatGroup("g"), nullptr);
  EXPECT_EQ(module.getSoname(), nullptr);
  EXPECT_FALSE(module.hasDynamicFlags());
  EXPECT_FALSE(module.hasDynamicValue(DynamicValue_Init));
  EXPECT_EQ(module.getReadConditions(), 0u);
  EXPECT_EQ(module.getSectionHeaderOffset(), 0u);
  EXPECT_EQ(module.getStoredSectionCount(), 0u);
  EXPECT_EQ(module.getSectionHeaderTable().getFileSize(), 0u);
  EXPECT_FALSE(module.getSectionHeaderTable().getFileExtent(nullptr, nullptr));
}

TEST_F(PrunerTest, ForgetsTheDistancesOfHeadersWhenCleared) {
  Segment* segment = makeSegment();
  ASSERT_TRUE(FileRegion::link(module.getElfHeader(), *segment, 0));
  ASSERT_TRUE(FileRegion::link(*segment, module.getProgramHeaderTable(), 52));
  module.clear();
  EXPECT_TRUE(FileRegion::link(module.getElfHeader(), module.getProgramHeaderTable(), 64));
}

TEST_F(PrunerTest, KeepsNamesAndHeaderWhenCleared) {
  module.setFileName("lib.a");
  module.setObjectName("lib.a", "a.o");
  module.setMachine(EM_ZEV64);
  makeSection();
  module.clear();
  EXPECT_STREQ(module.getFileName(), "lib.a");
  EXPECT_STREQ(module.getObjectName(), "lib.a(a.o)");
  EXPECT_EQ(module.getMachine(), EM_ZEV64);
}

TEST_F(PrunerTest, CanBeFilledAgainAfterClearing) {
  makeHosted("a", makeSection());
  module.clear();
  Section* section = makeSection();
  Symbol* symbol = makeHosted("a", section);
  EXPECT_EQ(section->getIndex(), 0u);
  EXPECT_EQ(symbol->getIndex(), 1u);
  SymbolList found;
  EXPECT_TRUE(module.getSymbolsByName("a", &found));
  EXPECT_EQ(found[0], symbol);
}

// A quadratic sweep would take minutes.
TEST_F(PrunerTest, TakesTensOfThousandsOfObjectsQuickly) {
  constexpr uint32_t Count = 40'000;
  Section* hub = makeSection();
  Segment* segment = makeSegment(Count * 4);
  Group* group = module.createGroup("g", "", GRP_COMDAT);
  Symbol* target = makeUndefined("t");
  for (uint32_t number = 1; number < Count; ++number) {
    Section* section = makeSection();
    section->setLink(hub);
    group->addMember(section);
    ASSERT_TRUE(FileRegion::link(*segment, *section, number * 4));
    makeHosted("s", hub, number);
    hub->addRelocation(number, 0, target);
    makeRelocationSection(hub);
  }
  struct Most final : PruneCriterion {
    using PruneCriterion::goes;
    bool goes(const Section& section) const override { return section.getIndex() % 4 != 0; }
    bool goes(const Symbol& symbol) const override { return symbol.getIndex() == 1; }
  };
  module.prune(Most());
  EXPECT_EQ(hub->getRelocationCount(), 0u);
  module.clear();
  EXPECT_TRUE(module.isEmpty());
}

} // namespace
} // namespace elfext
