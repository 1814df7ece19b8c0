// SPDX-License-Identifier: Apache-2.0
//
// Where objects stand in the lists of a module, and how they move there. An index is what other
// objects and the file's tables refer to, so after each move all lists are looked at, not only the
// one that was told to change.

#include "elfext/interface/group.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/segment.h"
#include "module_fixture.h"

namespace elfext {
namespace {

using IndexTest = ModuleTest;

// One list of a module: the operations of its family, and four objects that are in it.
template <class Object>
struct Family {
  ObjectModule& module;
  uint32_t (ObjectModule::*count)() const;
  Object* (ObjectModule::*get)(uint32_t index) const;
  uint32_t (ObjectModule::*getIndex)(const Object* object) const;
  void (ObjectModule::*setIndex)(Object* object, uint32_t index);
  uint32_t firstIndex = 0;
  std::vector<Object*> objects = {};

  void move(size_t number, uint32_t index) const { (module.*setIndex)(objects[number], index); }
};

template <class Object>
void expectOrder(const Family<Object>& family, const std::vector<size_t>& order) {
  for (uint32_t place = 0; place < order.size(); ++place) {
    Object* expected = family.objects[order[place]];
    EXPECT_EQ((family.module.*family.get)(place + family.firstIndex), expected);
    EXPECT_EQ((family.module.*family.getIndex)(expected), place + family.firstIndex);
  }
}

// `make` makes an object of that name, which joins the list.
template <class Object, class Make>
void expectFamilyWorks(Family<Object> family, Make make) {
  for (const char* name : {"0", "1", "2", "3"})
    family.objects.push_back(make(name));
  const uint32_t first = family.firstIndex;
  EXPECT_EQ((family.module.*family.count)(), 4 + first);
  expectOrder(family, {0, 1, 2, 3});
  family.move(0, first + 2);
  expectOrder(family, {1, 2, 0, 3});
  family.move(3, first);
  expectOrder(family, {3, 1, 2, 0});
  family.move(1, first + 1);
  expectOrder(family, {3, 1, 2, 0});
  ModuleBuilder::setAuxiliarySectionsUpToDate(family.module, true);
  family.move(3, first + 3);
  expectOrder(family, {1, 2, 0, 3});
  EXPECT_FALSE(family.module.areAuxiliarySectionsUpToDate());
  family.module.setIndexesFrozen(true);
  EXPECT_ASSERTION(family.move(0, first), "!m_IndexesFrozen");
  family.module.setIndexesFrozen(false);
}

TEST_F(IndexTest, MovesSections) {
  const auto make = [this](const char* name) { return makeSection(name); };
  expectFamilyWorks<Section>({module, &ObjectModule::getSectionCount, &ObjectModule::getSection,
                              &ObjectModule::getSectionIndex, &ObjectModule::setSectionIndex},
                             make);
  EXPECT_ASSERTION(module.setSectionIndex(module.getSection(0), 4), "index < m_Sections.getSize()");
  EXPECT_ASSERTION((void)module.getSectionIndex(nullptr), "section != NULL");
}

TEST_F(IndexTest, MovesSectionsInARegionOfItsOwn) {
  Section* section = makeSection();
  testing::internal::CaptureStderr();
  alloclib::setTraceLevel(1);
  module.setSectionIndex(section, 0);
  alloclib::setTraceLevel(0);
  EXPECT_THAT(testing::internal::GetCapturedStderr(),
              testing::HasSubstr("setSectionIndex() temp region"));
}

TEST_F(IndexTest, MovesSymbols) {
  const auto make = [this](const char* name) { return makeAbsolute(name); };
  expectFamilyWorks<Symbol>({module, &ObjectModule::getSymbolCount, &ObjectModule::getSymbol,
                             &ObjectModule::getSymbolIndex, &ObjectModule::setSymbolIndex, 1},
                            make);
  const char* expression = "index != 0 && index <= m_Symbols.getSize()";
  EXPECT_ASSERTION(module.setSymbolIndex(module.getSymbol(1), 0), expression);
  EXPECT_ASSERTION(module.setSymbolIndex(module.getSymbol(1), 5), expression);
  EXPECT_ASSERTION((void)module.getSymbol(0), "index != 0");
  EXPECT_ASSERTION((void)module.getSymbolIndex(nullptr), "symbol != NULL");
}

TEST_F(IndexTest, MovesDynamicSymbols) {
  const auto make = [this](const char* name) { return makeUndefinedDynamic(name); };
  expectFamilyWorks<Symbol>({module, &ObjectModule::getDynamicSymbolCount,
                             &ObjectModule::getDynamicSymbol, &ObjectModule::getDynamicSymbolIndex,
                             &ObjectModule::setDynamicSymbolIndex, 1},
                            make);
  const char* expression = "index != 0 && index <= m_DynamicSymbols.getSize()";
  EXPECT_ASSERTION(module.setDynamicSymbolIndex(module.getDynamicSymbol(1), 0), expression);
  EXPECT_ASSERTION(module.setDynamicSymbolIndex(module.getDynamicSymbol(1), 5), expression);
  EXPECT_ASSERTION((void)module.getDynamicSymbol(0), "index != 0");
  EXPECT_ASSERTION((void)module.getDynamicSymbolIndex(nullptr), "symbol != NULL");
}

TEST_F(IndexTest, KeepsTheTwoSymbolTablesApart) {
  Symbol* plain = makeAbsolute("a");
  Symbol* dynamic = makeUndefinedDynamic("b");
  EXPECT_EQ(plain->getIndex(), 1u);
  EXPECT_EQ(dynamic->getIndex(), 1u);
  EXPECT_ASSERTION((void)module.getSymbolIndex(dynamic), "!symbol->isDynamic()");
  EXPECT_ASSERTION((void)module.getDynamicSymbolIndex(plain), "symbol->isDynamic()");
  EXPECT_ASSERTION(module.setSymbolIndex(dynamic, 1), "!symbol->isDynamic()");
  EXPECT_ASSERTION(module.setDynamicSymbolIndex(plain, 1), "symbol->isDynamic()");
}

TEST_F(IndexTest, CountsTheNullSymbolWhereThereAreSymbols) {
  EXPECT_EQ(module.getSymbolCount(), 0u);
  EXPECT_EQ(module.getDynamicSymbolCount(), 0u);
  makeAbsolute("a");
  EXPECT_EQ(module.getSymbolCount(), 2u);
  EXPECT_EQ(module.getDynamicSymbolCount(), 0u);
  makeUndefinedDynamic("a");
  EXPECT_EQ(module.getDynamicSymbolCount(), 2u);
}

TEST_F(IndexTest, PutsEqualSymbolsInTheirNewOrder) {
  Symbol* first = makeAbsolute("same");
  Symbol* second = makeAbsolute("same");
  SymbolList found;
  EXPECT_TRUE(module.getSymbolsByName("same", &found));
  EXPECT_THAT(elements(found), testing::ElementsAre(first, second));
  module.setSymbolIndex(second, 1);
  EXPECT_TRUE(module.getSymbolsByName("same", &found));
  EXPECT_THAT(elements(found), testing::ElementsAre(second, first));
}

TEST_F(IndexTest, MovesSymbolsWithinTheirCategory) {
  const auto absolute = [this](const char* name) { return makeAbsolute(name); };
  expectFamilyWorks<Symbol>(
      {module, &ObjectModule::getAbsoluteSymbolCount, &ObjectModule::getAbsoluteSymbol,
       &ObjectModule::getAbsoluteSymbolIndex, &ObjectModule::setAbsoluteSymbolIndex},
      absolute);
  const auto common = [this](const char* name) {
    return module.createCommonSymbol(name, 4, 0, 1, 0);
  };
  expectFamilyWorks<Symbol>({module, &ObjectModule::getCommonSymbolCount,
                             &ObjectModule::getCommonSymbol, &ObjectModule::getCommonSymbolIndex,
                             &ObjectModule::setCommonSymbolIndex},
                            common);
  const auto undefined = [this](const char* name) { return makeUndefined(name); };
  expectFamilyWorks<Symbol>(
      {module, &ObjectModule::getUndefinedSymbolCount, &ObjectModule::getUndefinedSymbol,
       &ObjectModule::getUndefinedSymbolIndex, &ObjectModule::setUndefinedSymbolIndex},
      undefined);
  EXPECT_ASSERTION(module.setAbsoluteSymbolIndex(module.getAbsoluteSymbol(0), 4),
                   "index < list.getSize()");
  EXPECT_EQ(module.getCommonSymbolIndex(module.getAbsoluteSymbol(0)), 0x80000000u);
  EXPECT_ASSERTION((void)module.getAbsoluteSymbolIndex(nullptr), "symbol != NULL");
}

TEST_F(IndexTest, MovesDynamicSymbolsWithinTheirCategory) {
  const auto absolute = [this](const char* name) {
    return module.createAbsoluteDynamicSymbol(name, 4, 0, 1, 0);
  };
  expectFamilyWorks<Symbol>({module, &ObjectModule::getAbsoluteDynamicSymbolCount,
                             &ObjectModule::getAbsoluteDynamicSymbol,
                             &ObjectModule::getAbsoluteDynamicSymbolIndex,
                             &ObjectModule::setAbsoluteDynamicSymbolIndex},
                            absolute);
  const auto common = [this](const char* name) {
    return module.createCommonDynamicSymbol(name, 4, 0, 1, 0);
  };
  expectFamilyWorks<Symbol>(
      {module, &ObjectModule::getCommonDynamicSymbolCount, &ObjectModule::getCommonDynamicSymbol,
       &ObjectModule::getCommonDynamicSymbolIndex, &ObjectModule::setCommonDynamicSymbolIndex},
      common);
  const auto undefined = [this](const char* name) { return makeUndefinedDynamic(name); };
  expectFamilyWorks<Symbol>({module, &ObjectModule::getUndefinedDynamicSymbolCount,
                             &ObjectModule::getUndefinedDynamicSymbol,
                             &ObjectModule::getUndefinedDynamicSymbolIndex,
                             &ObjectModule::setUndefinedDynamicSymbolIndex},
                            undefined);
}

TEST_F(IndexTest, MovesGroups) {
  const auto make = [this](const char* name) { return module.createGroup(name, nullptr, 0); };
  expectFamilyWorks<Group>({module, &ObjectModule::getGroupCount, &ObjectModule::getGroup,
                            &ObjectModule::getGroupIndex, &ObjectModule::setGroupIndex},
                           make);
  EXPECT_ASSERTION(module.setGroupIndex(module.getGroup(0), 4), "index < m_Groups.getSize()");
  EXPECT_ASSERTION((void)module.getGroupIndex(nullptr), "group != NULL");
}

TEST_F(IndexTest, MovesSegments) {
  const auto make = [this](const char*) {
    return module.createSegment(PT_LOAD, 0, 0, 0, 0, 0, 0, 0);
  };
  expectFamilyWorks<Segment>({module, &ObjectModule::getSegmentCount, &ObjectModule::getSegment,
                              &ObjectModule::getSegmentIndex, &ObjectModule::setSegmentIndex},
                             make);
  EXPECT_ASSERTION(module.setSegmentIndex(module.getSegment(0), 4), "index < m_Segments.getSize()");
  EXPECT_ASSERTION((void)module.getSegmentIndex(nullptr), "segment != NULL");
}

TEST_F(IndexTest, MovesNeededLibraries) {
  const auto make = [this](const char* name) { return module.createNeededLibrary(name); };
  expectFamilyWorks<NeededLibrary>(
      {module, &ObjectModule::getNeededLibraryCount, &ObjectModule::getNeededLibrary,
       &ObjectModule::getNeededLibraryIndex, &ObjectModule::setNeededLibraryIndex},
      make);
  EXPECT_ASSERTION(module.setNeededLibraryIndex(module.getNeededLibrary(0), 4),
                   "index < m_NeededLibraries.getSize()");
  EXPECT_ASSERTION((void)module.getNeededLibraryIndex(nullptr), "neededLibrary != NULL");
}

TEST_F(IndexTest, MovesLibrarySearchPaths) {
  const auto make = [this](const char* path) { return module.createLibrarySearchPath(path, 15); };
  expectFamilyWorks<LibrarySearchPath>(
      {module, &ObjectModule::getLibrarySearchPathCount, &ObjectModule::getLibrarySearchPath,
       &ObjectModule::getLibrarySearchPathIndex, &ObjectModule::setLibrarySearchPathIndex},
      make);
  EXPECT_ASSERTION(module.setLibrarySearchPathIndex(module.getLibrarySearchPath(0), 4),
                   "index < m_LibrarySearchPaths.getSize()");
  EXPECT_ASSERTION((void)module.getLibrarySearchPathIndex(nullptr), "librarySearchPath != NULL");
}

TEST_F(IndexTest, MovesPreemptions) {
  const auto make = [this](const char* name) { return module.createPreemption(name, "dll"); };
  expectFamilyWorks<Preemption>({module, &ObjectModule::getPreemptionCount,
                                 &ObjectModule::getPreemption, &ObjectModule::getPreemptionIndex,
                                 &ObjectModule::setPreemptionIndex},
                                make);
  EXPECT_ASSERTION(module.setPreemptionIndex(module.getPreemption(0), 4),
                   "index < m_Preemptions.getSize()");
  EXPECT_ASSERTION((void)module.getPreemptionIndex(nullptr), "preemption != NULL");
}

TEST_F(IndexTest, KnowsItsOwnObjectsOnly) {
  ObjectModule other;
  const Section* section = other.createSection("", SHT_PROGBITS, 0);
  const Symbol* symbol = other.createAbsoluteSymbol("", 0, 0, 0, 0);
  const Symbol* dynamic = other.createAbsoluteDynamicSymbol("", 0, 0, 0, 0);
  const Group* group = other.createGroup("", "", 0);
  const Segment* segment = other.createSegment(0, 0, 0, 0, 0, 0, 0, 0);
  const NeededLibrary* neededLibrary = other.createNeededLibrary("");
  const LibrarySearchPath* path = other.createLibrarySearchPath("", 0);
  const Preemption* preemption = other.createPreemption("", "");
  EXPECT_ASSERTION((void)module.getSectionIndex(section), "section->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getSymbolIndex(symbol), "symbol->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getDynamicSymbolIndex(dynamic), "symbol->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getAbsoluteSymbolIndex(symbol), "symbol->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getGroupIndex(group), "group->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getSegmentIndex(segment), "segment->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getNeededLibraryIndex(neededLibrary),
                   "neededLibrary->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getLibrarySearchPathIndex(path),
                   "librarySearchPath->m_ObjectModule == this");
  EXPECT_ASSERTION((void)module.getPreemptionIndex(preemption),
                   "preemption->m_ObjectModule == this");
}

} // namespace
} // namespace elfext
