// SPDX-License-Identifier: Apache-2.0
//
// The symbols that say by their names how a module, a section or a symbol was built: when they are
// made, when they stay, and when they go since what they say holds anyway or no longer.

#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes_writer.h"
#include "tests/unit/elfext_attributes/attribute_module_fixture.h"

#include <string>
#include <vector>

namespace elfext {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const std::string V4 = "$ZEV_ISAv4$A:L22$X:L11$S22$IEEE1$IW";
const std::string V5 = "$ZEV_ISAv5$A:L22$X:L11$S22$IEEE1$IW";

class DecorationSymbolsTest : public AttributeModuleTest {
protected:
  std::vector<std::string> names() const {
    std::vector<std::string> result;
    for (const Symbol* symbol : m_Module.getSymbols())
      result.emplace_back(symbol->getName() == nullptr ? "(none)" : symbol->getName());
    return result;
  }

  // What a symbol in front of an object's text is named.
  static std::string effectiveName(const ObjectWithBuildAttributes& object) {
    BuildAttributes attributes;
    object.getEffectiveBuildAttributes(attributes);
    return "BuildAttributes$" + printAttributeString(attributes.getFullAttr());
  }
};

TEST_F(DecorationSymbolsTest, AModuleAlwaysHasOne) {
  updateDecorationSymbols(m_Module);
  ASSERT_THAT(names(), ElementsAre("BuildAttributes$$A:L22$X:L11$S22$IEEE1$IW$USESV6$~STKCKD$USESV7"
                                   "$~SHL$OSPACE$EBA8$EABIv2"));
  const Symbol& symbol = *m_Module.getSymbols().front();
  EXPECT_EQ(symbol.getCategory(), Symbol::Category_Absolute);
  EXPECT_EQ(symbol.getAbsoluteValue(), 0u);
  EXPECT_EQ(symbol.getSize(), 0u);
  EXPECT_EQ(symbol.getType(), uint32_t{STT_NOTYPE});
  EXPECT_EQ(symbol.getBinding(), uint32_t{STB_LOCAL});
  EXPECT_EQ(symbol.getVisibility(), uint32_t{STV_DEFAULT});
  EXPECT_TRUE(symbol.isBuildAttributesSymbol());
}

TEST_F(DecorationSymbolsTest, AModuleWithoutDefaultsHasNone) {
  ownTags(m_Module, tag(64, 0));
  updateDecorationSymbols(m_Module);
  EXPECT_THAT(names(), IsEmpty());
}

TEST_F(DecorationSymbolsTest, StandForModuleSectionsAndSymbols) {
  Section* section = makeSection();
  Symbol* absolute = makeAbsolute("constant");
  Symbol* hosted = makeHosted("main", section);
  ownText(m_Module, V4);
  ownText(*section, V5);
  ownText(*hosted, V4);
  ownText(*absolute, V5);
  updateDecorationSymbols(m_Module);
  ASSERT_THAT(names(), ElementsAre("constant", "main", effectiveName(m_Module),
                                   effectiveName(*section), "constant$$" + effectiveName(*absolute),
                                   "main$$" + effectiveName(*hosted)));
  const Symbol& ofSection = *m_Module.getSymbols()[3];
  ASSERT_EQ(ofSection.getCategory(), Symbol::Category_Hosted);
  EXPECT_EQ(ofSection.getHostedSymbolSection(), section);
  EXPECT_EQ(ofSection.getHostedSymbolOffset(), 0u);
  EXPECT_EQ(ofSection.getBinding(), uint32_t{STB_LOCAL});
  for (const size_t index : {2U, 4U, 5U})
    EXPECT_EQ(m_Module.getSymbols()[index]->getCategory(), Symbol::Category_Absolute);
}

TEST_F(DecorationSymbolsTest, SayNothingThatHoldsAnyway) {
  Section* section = makeSection();
  Symbol* hosted = makeHosted("main", section);
  Symbol* nameless = makeHosted(nullptr, section);
  ownText(m_Module, V4);
  ownText(*section, V4);
  ownText(*hosted, V4);
  ownText(*nameless, V5);
  updateDecorationSymbols(m_Module);
  EXPECT_THAT(names(), ElementsAre("main", "(none)", effectiveName(m_Module)));
}

TEST_F(DecorationSymbolsTest, StayWhereTheyAreRight) {
  Section* section = makeSection();
  ownText(m_Module, V4);
  ownText(*section, V5);
  Symbol* ofModule = makeAbsolute(effectiveName(m_Module).c_str());
  Symbol* other = makeHosted("main", section);
  ownText(*other, V4);
  Symbol* ofSymbol = makeAbsolute(("main$$" + effectiveName(*other)).c_str());
  Symbol* ofSection = makeHosted(effectiveName(*section).c_str(), section);
  updateDecorationSymbols(m_Module);
  EXPECT_THAT(m_Module.getSymbols(), ElementsAre(ofModule, other, ofSymbol, ofSection));
  // Once more, after they were made.
  updateDecorationSymbols(m_Module);
  EXPECT_THAT(m_Module.getSymbols(), ElementsAre(ofModule, other, ofSymbol, ofSection));
}

TEST_F(DecorationSymbolsTest, GoWhereTheyAreWrong) {
  Section* section = makeSection();
  Section* bare = makeSection();
  ownText(m_Module, V4);
  ownText(*section, V5);
  const std::string ofModule = effectiveName(m_Module);
  const std::string ofSection = effectiveName(*section);
  makeAbsolute("BuildAttributes$$other");
  makeHosted(ofSection.c_str(), bare);
  makeHosted(ofModule.c_str(), section);
  makeAbsolute(("gone$$" + ofModule).c_str());
  Symbol* right = makeAbsolute(ofModule.c_str());
  makeAbsolute(ofModule.c_str()); // a second one
  Symbol* undefined =
      m_Module.createUndefinedSymbol(ofModule.c_str(), 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT);
  Symbol* hosted = makeHosted(("main$$" + ofModule).c_str(), section);
  m_Module.createAbsoluteDynamicSymbol(ofModule.c_str(), 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT);
  updateDecorationSymbols(m_Module);
  ASSERT_EQ(m_Module.getSymbols().size(), 4u);
  EXPECT_EQ(m_Module.getSymbols()[0], right);
  // Neither of these is a decoration.
  EXPECT_EQ(m_Module.getSymbols()[1], undefined);
  EXPECT_EQ(m_Module.getSymbols()[2], hosted);
  EXPECT_EQ(m_Module.getSymbols()[3]->getName(), ofSection);
  EXPECT_THAT(m_Module.getDynamicSymbols(), IsEmpty());
}

TEST_F(DecorationSymbolsTest, AreMadeOnceForSymbolsOfOneName) {
  Section* section = makeSection();
  ownText(m_Module, V4);
  for (int i = 0; i < 3; ++i)
    ownText(*makeHosted("local", section), V5);
  updateDecorationSymbols(m_Module);
  EXPECT_EQ(m_Module.getSymbols().size(), 5u);
}

} // namespace
} // namespace elfext
