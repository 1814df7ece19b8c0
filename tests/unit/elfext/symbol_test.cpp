// SPDX-License-Identifier: Apache-2.0
//
// Symbols: what defines them, what their values are, and the lists that they move between. A change
// of category must leave them in exactly one list of the module or of a section.

#include "elfext/interface/symbol.h"

#include "elfext/interface/file_version_definition.h"
#include "elfext/interface/symbol_version_definition.h"
#include "elfext/interface/symbol_version_requirement.h"
#include "module_fixture.h"

namespace elfext {
namespace {

class SymbolTest : public ModuleTest {
protected:
  // The symbols of each list in which one is.
  std::vector<Symbol*> absolute() {
    return list(&ObjectModule::getAbsoluteSymbolCount, &ObjectModule::getAbsoluteSymbol);
  }
  std::vector<Symbol*> common() {
    return list(&ObjectModule::getCommonSymbolCount, &ObjectModule::getCommonSymbol);
  }
  std::vector<Symbol*> undefined() {
    return list(&ObjectModule::getUndefinedSymbolCount, &ObjectModule::getUndefinedSymbol);
  }
  std::vector<Symbol*> absoluteDynamic() {
    return list(&ObjectModule::getAbsoluteDynamicSymbolCount,
                &ObjectModule::getAbsoluteDynamicSymbol);
  }
  std::vector<Symbol*> commonDynamic() {
    return list(&ObjectModule::getCommonDynamicSymbolCount, &ObjectModule::getCommonDynamicSymbol);
  }
  std::vector<Symbol*> undefinedDynamic() {
    return list(&ObjectModule::getUndefinedDynamicSymbolCount,
                &ObjectModule::getUndefinedDynamicSymbol);
  }

private:
  std::vector<Symbol*> list(uint32_t (ObjectModule::*count)() const,
                            Symbol* (ObjectModule::*get)(uint32_t) const) {
    std::vector<Symbol*> all;
    for (uint32_t index = 0; index < (module.*count)(); ++index)
      all.push_back((module.*get)(index));
    return all;
  }
};

TEST_F(SymbolTest, IsMadeInEachCategoryStaticAndDynamic) {
  Section* section = makeSection();
  Symbol* symbols[] = {
      module.createAbsoluteSymbol("a", 1, STT_OBJECT, STB_WEAK, STV_HIDDEN),
      module.createHostedSymbol("b", 2, STT_FUNC, STB_LOCAL, STV_PROTECTED, section),
      module.createCommonSymbol("c", 3, STT_COMMON, STB_GLOBAL, STV_DEFAULT),
      module.createUndefinedSymbol("d", 4, STT_TLS, 13, STV_INTERNAL),
      module.createAbsoluteDynamicSymbol("a", 1, STT_OBJECT, STB_WEAK, STV_HIDDEN),
      module.createHostedDynamicSymbol("b", 2, STT_FUNC, STB_LOCAL, STV_PROTECTED, section),
      module.createCommonDynamicSymbol("c", 3, STT_COMMON, STB_GLOBAL, STV_DEFAULT),
      module.createUndefinedDynamicSymbol("d", 4, STT_TLS, 13, STV_INTERNAL),
  };
  for (uint32_t index = 0; index < 8; ++index) {
    const Symbol& symbol = *symbols[index];
    EXPECT_EQ(symbol.getCategory(), index % 4);
    EXPECT_EQ(symbol.isDynamic(), index >= 4);
    EXPECT_EQ(symbol.getIndex(), index % 4 + 1);
    EXPECT_EQ(symbol.getObjectModule(), &module);
    EXPECT_EQ(symbol.getSize(), 0u);
    EXPECT_EQ(std::string(symbol.getName()), std::string(1, static_cast<char>('a' + index % 4)));
  }
  for (uint32_t index : {0u, 4u}) {
    EXPECT_EQ(symbols[index]->getAbsoluteValue(), 1u);
    EXPECT_EQ(symbols[index]->getType(), STT_OBJECT);
    EXPECT_EQ(symbols[index]->getBinding(), STB_WEAK);
    EXPECT_EQ(symbols[index]->getVisibility(), STV_HIDDEN);
    EXPECT_EQ(symbols[index + 1]->getHostedSymbolOffset(), 2u);
    EXPECT_EQ(symbols[index + 1]->getHostedSymbolSection(), section);
    EXPECT_EQ(symbols[index + 2]->getCommonAlignment(), 3u);
    EXPECT_EQ(symbols[index + 3]->getUndefinedValue(), 4u);
    EXPECT_EQ(symbols[index + 3]->getBinding(), 13u);
  }
  EXPECT_THAT(absolute(), testing::ElementsAre(symbols[0]));
  EXPECT_THAT(common(), testing::ElementsAre(symbols[2]));
  EXPECT_THAT(undefined(), testing::ElementsAre(symbols[3]));
  EXPECT_THAT(absoluteDynamic(), testing::ElementsAre(symbols[4]));
  EXPECT_THAT(commonDynamic(), testing::ElementsAre(symbols[6]));
  EXPECT_THAT(undefinedDynamic(), testing::ElementsAre(symbols[7]));
  EXPECT_EQ(section->getHostedSymbol(0), symbols[1]);
  EXPECT_EQ(section->getHostedDynamicSymbol(0), symbols[5]);
}

TEST_F(SymbolTest, HasTheNumbersOfItsCategories) {
  EXPECT_EQ(Symbol::Category_Absolute, 0);
  EXPECT_EQ(Symbol::Category_Hosted, 1);
  EXPECT_EQ(Symbol::Category_Common, 2);
  EXPECT_EQ(Symbol::Category_Undefined, 3);
}

TEST_F(SymbolTest, KeepsTheBitsThatATableHas) {
  const Symbol* symbol = module.createAbsoluteSymbol(nullptr, 0, 0x1F, 0x2E, 0x7);
  EXPECT_EQ(symbol->getName(), nullptr);
  EXPECT_EQ(symbol->getType(), 0xFu);
  EXPECT_EQ(symbol->getBinding(), 0xEu);
  EXPECT_EQ(symbol->getVisibility(), 3u);
}

TEST_F(SymbolTest, AnswersForItsOwnCategoryOnly) {
  const Symbol* absolute = makeAbsolute("a");
  const Symbol* undefined = makeUndefined("u");
  EXPECT_ASSERTION((void)undefined->getAbsoluteValue(), "m_Category == Category_Absolute");
  EXPECT_ASSERTION((void)absolute->getCommonAlignment(), "m_Category == Category_Common");
  EXPECT_ASSERTION((void)absolute->getHostedSymbolSection(), "m_Category == Category_Hosted");
  EXPECT_ASSERTION((void)absolute->getHostedSymbolOffset(), "m_Category == Category_Hosted");
  EXPECT_ASSERTION((void)absolute->getUndefinedValue(), "m_Category == Category_Undefined");
}

TEST_F(SymbolTest, KnowsItsAddress) {
  Section* section = makeSection();
  section->setAddress(0x8000);
  EXPECT_EQ(makeAbsolute("a", 77)->getAddress(), 77u);
  EXPECT_EQ(makeHosted("h", section, 4)->getAddress(), 0x8004u);
  EXPECT_EQ(module.createCommonSymbol("c", 8, 0, 0, 0)->getAddress(), 0u);
  EXPECT_EQ(module.createUndefinedSymbol("u", 8, 0, 0, 0)->getAddress(), 0u);
}

TEST_F(SymbolTest, LeavesTheInstructionSetMarkOutOfItsAbiValue) {
  Section* section = makeSection();
  section->setAddress(0x8000);
  const Symbol* function = module.createHostedSymbol("f", 0x101, STT_FUNC, 1, 0, section);
  for (uint32_t type : {ET_EXEC, ET_DYN, ET_CORE}) {
    module.setFileType(type);
    EXPECT_EQ(function->getAbiValue(), 0x8100u) << type;
    EXPECT_EQ(function->getAddress(), 0x8101u) << type;
  }
  for (uint32_t type : {ET_NONE, ET_REL, 5u}) {
    module.setFileType(type);
    EXPECT_EQ(function->getAbiValue(), 0x100u) << type;
  }
  const Symbol* object = module.createHostedSymbol("o", 0x101, STT_OBJECT, 1, 0, section);
  EXPECT_EQ(object->getAbiValue(), 0x101u);
}

TEST_F(SymbolTest, HasItsWordAsAbiValueWhenAbsoluteOrCommon) {
  EXPECT_EQ(module.createAbsoluteSymbol("a", 7, STT_FUNC, 1, 0)->getAbiValue(), 6u);
  EXPECT_EQ(module.createAbsoluteSymbol("a", 7, STT_OBJECT, 1, 0)->getAbiValue(), 7u);
  EXPECT_EQ(module.createCommonSymbol("c", 8, STT_OBJECT, 1, 0)->getAbiValue(), 8u);
  EXPECT_EQ(module.createCommonSymbol("c", 9, STT_FUNC, 1, 0)->getAbiValue(), 8u);
}

TEST_F(SymbolTest, HasNoAbiValueWhenUndefined) {
  EXPECT_EQ(module.createUndefinedSymbol("u", 44, STT_FUNC, 1, 0)->getAbiValue(), 0u);
}

TEST_F(SymbolTest, CarriesBuildAttributesByItsName) {
  Section* section = makeSection();
  EXPECT_TRUE(makeHosted("BuildAttributes$x", section)->isBuildAttributesSymbol());
  EXPECT_FALSE(makeHosted("base$$BuildAttributes$x", section)->isBuildAttributesSymbol());
  EXPECT_FALSE(makeHosted("BuildAttributes", section)->isBuildAttributesSymbol());
  EXPECT_FALSE(makeHosted(nullptr, section)->isBuildAttributesSymbol());
  EXPECT_TRUE(makeAbsolute("BuildAttributes$")->isBuildAttributesSymbol());
  EXPECT_TRUE(makeAbsolute("base$$BuildAttributes$x")->isBuildAttributesSymbol());
  EXPECT_TRUE(makeAbsolute("$$BuildAttributes$x")->isBuildAttributesSymbol());
  EXPECT_FALSE(makeAbsolute("base$BuildAttributes$x")->isBuildAttributesSymbol());
  EXPECT_FALSE(makeAbsolute(nullptr)->isBuildAttributesSymbol());
  EXPECT_FALSE(makeUndefined("BuildAttributes$x")->isBuildAttributesSymbol());
  EXPECT_FALSE(
      module.createCommonSymbol("BuildAttributes$x", 8, 0, 1, 0)->isBuildAttributesSymbol());
}

TEST_F(SymbolTest, CopiesItsNameUnlessItIsInTheBuffer) {
  char name[] = "name";
  Symbol* symbol = makeAbsolute(name);
  EXPECT_NE(symbol->getName(), name);
  EXPECT_STREQ(symbol->getName(), "name");
  ModuleBuilder::setNamesInBuffer(module, true);
  EXPECT_EQ(makeAbsolute(name)->getName(), name);
  // A name that is set later is the client's, not the buffer's.
  symbol->setName(name + 1);
  EXPECT_NE(symbol->getName(), name + 1);
  EXPECT_STREQ(symbol->getName(), "ame");
}

TEST_F(SymbolTest, ChangesItsNameAndTheViewsWithIt) {
  Section* section = makeSection();
  Symbol* symbol = makeHosted("old", section);
  SymbolList found;
  EXPECT_TRUE(module.getSymbolsByName("old", &found));
  EXPECT_TRUE(section->getSymbolsByName("old", &found));
  EXPECT_FALSE(makesStale([&] { symbol->setName("old"); }));
  EXPECT_TRUE(module.areSortedViewsUpToDate());
  EXPECT_TRUE(makesStale([&] { symbol->setName("new"); }));
  EXPECT_FALSE(module.areSortedViewsUpToDate());
  EXPECT_FALSE(module.getSymbolsByName("old", &found));
  EXPECT_TRUE(module.getSymbolsByName("new", &found));
  EXPECT_TRUE(section->getSymbolsByName("new", &found));
  symbol->setName(nullptr);
  EXPECT_EQ(symbol->getName(), nullptr);
}

TEST_F(SymbolTest, MakesTheAuxiliarySectionsStaleWithEachSetter) {
  Symbol* symbol = makeAbsolute("a");
  EXPECT_TRUE(makesStale([&] { symbol->setSize(5); }));
  EXPECT_TRUE(makesStale([&] { symbol->setType(STT_FUNC); }));
  EXPECT_TRUE(makesStale([&] { symbol->setBinding(STB_WEAK); }));
  EXPECT_TRUE(makesStale([&] { symbol->setVisibility(STV_HIDDEN); }));
  EXPECT_EQ(symbol->getSize(), 5u);
  EXPECT_EQ(symbol->getType(), STT_FUNC);
  EXPECT_EQ(symbol->getBinding(), STB_WEAK);
  EXPECT_EQ(symbol->getVisibility(), STV_HIDDEN);
}

// ---- Change of category

TEST_F(SymbolTest, MovesBetweenTheListsOfItsModule) {
  Symbol* first = makeAbsolute("first");
  Symbol* second = makeAbsolute("second");
  Symbol* third = makeAbsolute("third");
  second->makeCommon(8);
  EXPECT_THAT(absolute(), testing::ElementsAre(first, third));
  EXPECT_THAT(common(), testing::ElementsAre(second));
  EXPECT_EQ(second->getCommonAlignment(), 8u);
  first->makeUndefined();
  EXPECT_THAT(undefined(), testing::ElementsAre(first));
  EXPECT_EQ(first->getUndefinedValue(), 0u);
  second->makeAbsolute(5);
  EXPECT_THAT(absolute(), testing::ElementsAre(third, second));
  EXPECT_THAT(common(), testing::ElementsAre());
  EXPECT_EQ(second->getAbsoluteValue(), 5u);
}

TEST_F(SymbolTest, MovesBetweenModuleAndSections) {
  Section* section = makeSection();
  Section* other = makeSection();
  Symbol* symbol = makeUndefined("a");
  symbol->makeHosted(section, 4);
  EXPECT_THAT(undefined(), testing::ElementsAre());
  EXPECT_EQ(section->getHostedSymbolCount(), 1u);
  EXPECT_EQ(symbol->getHostedSymbolOffset(), 4u);
  symbol->makeHosted(other, 8);
  EXPECT_EQ(section->getHostedSymbolCount(), 0u);
  EXPECT_EQ(other->getHostedSymbol(0), symbol);
  SymbolList found;
  EXPECT_TRUE(other->getSymbolsByName("a", &found));
  symbol->makeAbsolute(1);
  EXPECT_FALSE(other->getSymbolsByName("a", &found));
  EXPECT_THAT(absolute(), testing::ElementsAre(symbol));
}

TEST_F(SymbolTest, MovesAmongTheDynamicListsWhenDynamic) {
  Section* section = makeSection();
  Symbol* symbol = makeUndefinedDynamic("a");
  symbol->makeHosted(section, 4);
  EXPECT_EQ(section->getHostedDynamicSymbolCount(), 1u);
  EXPECT_EQ(section->getHostedSymbolCount(), 0u);
  symbol->makeCommon(4);
  EXPECT_THAT(commonDynamic(), testing::ElementsAre(symbol));
  EXPECT_THAT(common(), testing::ElementsAre());
  EXPECT_EQ(section->getHostedDynamicSymbolCount(), 0u);
}

TEST_F(SymbolTest, StaysInItsListWhenTheCategoryStays) {
  Section* section = makeSection();
  Symbol* first = makeHosted("$a", section, 0);
  Symbol* second = makeHosted("$d", section, 8);
  SymbolList found;
  EXPECT_TRUE(section->getPrecedingSymbols(20, Symbol::Class_All, &found));
  EXPECT_EQ(found[0], second);
  first->makeHosted(section, 16);
  EXPECT_EQ(section->getHostedSymbol(0), first);
  EXPECT_EQ(first->getHostedSymbolOffset(), 16u);
  EXPECT_TRUE(section->getPrecedingSymbols(20, Symbol::Class_All, &found));
  EXPECT_EQ(found[0], first);
  Symbol* third = makeAbsolute("a", 1);
  Symbol* fourth = makeAbsolute("b", 2);
  third->makeAbsolute(3);
  EXPECT_THAT(absolute(), testing::ElementsAre(third, fourth));
  EXPECT_EQ(third->getAbsoluteValue(), 3u);
}

TEST_F(SymbolTest, MakesViewsAndAuxiliarySectionsStaleWithItsCategory) {
  Symbol* symbol = makeAbsolute("a", 1);
  SymbolList found;
  for (int category = 0; category < 4; ++category) {
    (void)module.getSymbolsByName("a", &found);
    ASSERT_TRUE(module.areSortedViewsUpToDate());
    EXPECT_TRUE(makesStale([&] {
      if (category == 0) symbol->makeAbsolute(2);
      if (category == 1) symbol->makeUndefined();
      if (category == 2) symbol->makeCommon(4);
      if (category == 3) symbol->makeHosted(makeSection(), 4);
    }));
    EXPECT_FALSE(module.areSortedViewsUpToDate());
  }
}

TEST_F(SymbolTest, KeepsItsCategoryWhileIndexesAreFrozen) {
  Section* section = makeSection();
  Symbol* symbol = makeAbsolute("a");
  module.setIndexesFrozen(true);
  const char* expression = "!m_ObjectModule->indexesAreFrozen()";
  EXPECT_ASSERTION(symbol->makeUndefined(), expression);
  EXPECT_ASSERTION(symbol->makeAbsolute(1), expression);
  EXPECT_ASSERTION(symbol->makeCommon(1), expression);
  EXPECT_ASSERTION(symbol->makeHosted(section, 1), expression);
}

// ---- Versions and associated symbols

TEST_F(SymbolTest, HasVersionsWhenDynamic) {
  const FileVersionDefinition* version = module.createFileVersionDefinition("V1", 2, 0);
  EXPECT_STREQ(version->name, "V1");
  EXPECT_EQ(version->index, 2u);
  Symbol* symbol = makeHostedDynamic("a", makeSection());
  symbol->setVersionDefinition(version, true);
  EXPECT_EQ(symbol->getVersionDefinition()->version, version);
  EXPECT_TRUE(symbol->getVersionDefinition()->isHidden);
  symbol->clearVersionDefinition();
  EXPECT_EQ(symbol->getVersionDefinition(), nullptr);
  symbol->setVersionRequirement(3, "V3", "lib.so", false);
  EXPECT_EQ(symbol->getVersionRequirement()->version, 3u);
  EXPECT_STREQ(symbol->getVersionRequirement()->versionName, "V3");
  EXPECT_STREQ(symbol->getVersionRequirement()->fileName, "lib.so");
  EXPECT_FALSE(symbol->getVersionRequirement()->isHidden);
  symbol->clearVersionRequirement();
  EXPECT_EQ(symbol->getVersionRequirement(), nullptr);
}

TEST_F(SymbolTest, HasNoVersionsWhenStatic) {
  Symbol* symbol = makeAbsolute("a");
  EXPECT_ASSERTION(symbol->setVersionDefinition(nullptr, false), "m_IsDynamic");
  EXPECT_ASSERTION(symbol->setVersionRequirement(1, "", "", false), "m_IsDynamic");
  EXPECT_ASSERTION(symbol->clearVersionDefinition(), "m_IsDynamic");
  EXPECT_ASSERTION(symbol->clearVersionRequirement(), "m_IsDynamic");
  Symbol* undefined = makeUndefinedDynamic("u");
  EXPECT_ASSERTION(undefined->setVersionDefinition(nullptr, false),
                   "getCategory() != Category_Undefined");
}

TEST_F(SymbolTest, LosesTheVersionThatNoLongerFits) {
  const FileVersionDefinition* version = module.createFileVersionDefinition("V1", 2, 0);
  Symbol* symbol = makeHostedDynamic("a", makeSection());
  symbol->setVersionDefinition(version, false);
  symbol->makeCommon(4);
  EXPECT_NE(symbol->getVersionDefinition(), nullptr);
  symbol->makeUndefined();
  EXPECT_EQ(symbol->getVersionDefinition(), nullptr);
  symbol->setVersionRequirement(3, "V3", "lib.so", false);
  symbol->makeUndefined();
  EXPECT_NE(symbol->getVersionRequirement(), nullptr);
  symbol->makeAbsolute(1);
  EXPECT_EQ(symbol->getVersionRequirement(), nullptr);
}

TEST_F(SymbolTest, IsAssociatedWithASymbolOfItsModule) {
  ObjectModule other;
  Symbol* foreign = other.createAbsoluteSymbol("f", 0, 0, 0, 0);
  Symbol* symbol = makeAbsolute("a");
  Symbol* partner = makeAbsolute("b");
  symbol->setAssociatedSymbol(partner);
  EXPECT_EQ(symbol->getAssociatedSymbol(), partner);
  symbol->setAssociatedSymbol(nullptr);
  EXPECT_EQ(symbol->getAssociatedSymbol(), nullptr);
  EXPECT_ASSERTION(symbol->setAssociatedSymbol(foreign),
                   "symbol == NULL || symbol->getObjectModule() == m_ObjectModule");
}

TEST_F(SymbolTest, HasTheAttributesOfItsSectionOrModule) {
  Section* section = makeSection();
  Symbol* hosted = makeHosted("h", section);
  Symbol* absolute = makeAbsolute("a");
  module.setOwnBuildAttributes(attributesWithArchitecture(4));
  EXPECT_TRUE(hosted->inheritsBuildAttributes());
  EXPECT_EQ(inheritedArchitecture(*hosted), 4u);
  section->setOwnBuildAttributes(attributesWithArchitecture(10));
  EXPECT_EQ(inheritedArchitecture(*hosted), 10u);
  EXPECT_EQ(inheritedArchitecture(*absolute), 4u);
}

// ---- Classes by name

TEST_F(SymbolTest, IsOfAClassByItsName) {
  for (const char* name : {"$a", "$d", "$t", "$x", "$d.foo", "$t.", "$a.$b", "$x.0"})
    EXPECT_EQ(makeAbsolute(name)->getClass(), Symbol::Class_Mapping) << name;
  for (const char* name : {"$b", "$f", "$p", "$v", "$p.1", "$vfoo", "$b$"})
    EXPECT_EQ(makeAbsolute(name)->getClass(), Symbol::Class_Tag) << name;
  for (const char* name : {"", "$", "$ab", "$dd.", "$$a", "a", "a$d", "$A", "$e", "$."})
    EXPECT_EQ(makeAbsolute(name)->getClass(), Symbol::Class_Ordinary) << name;
  EXPECT_EQ(makeAbsolute(nullptr)->getClass(), Symbol::Class_Ordinary);
}

} // namespace
} // namespace elfext
