// SPDX-License-Identifier: Apache-2.0
//
// One relocation as an object: what its row says, when it is dynamic, and that it follows its
// target. It may refer to symbols of its own module only, and every setter makes the auxiliary
// sections stale.

#include "elfext/interface/relocation.h"

#include "module_fixture.h"

namespace elfext {
namespace {

class RelocationTest : public ModuleTest {
protected:
  Section* section = makeSection();
  Symbol* symbol = makeUndefined("a");
  Symbol* dynamicSymbol = makeUndefinedDynamic("b");
};

TEST_F(RelocationTest, HoldsWhatItsRowSays) {
  const Relocation* plain = section->addRelocation(4, 2, symbol);
  EXPECT_EQ(plain->getOffset(), 4u);
  EXPECT_EQ(plain->getType(), 2u);
  EXPECT_EQ(plain->getTarget(), symbol);
  EXPECT_EQ(plain->getSection(), section);
  EXPECT_FALSE(plain->hasAddend());
  EXPECT_FALSE(plain->isDynamic());
  const Relocation* withAddend = section->addRelocation(8, 3, symbol, -12);
  EXPECT_TRUE(withAddend->hasAddend());
  EXPECT_EQ(withAddend->getAddend(), -12);
}

TEST_F(RelocationTest, KeepsTheLow16BitsOfItsType) {
  Relocation* relocation = section->addRelocation(0, 0x12345, symbol);
  EXPECT_EQ(relocation->getType(), 0x2345u);
  relocation->setType(0x54321);
  EXPECT_EQ(relocation->getType(), 0x4321u);
}

TEST_F(RelocationTest, IsDynamicAsItsTargetIs) {
  EXPECT_FALSE(section->addRelocation(0, 0, symbol)->isDynamic());
  EXPECT_TRUE(section->addRelocation(0, 0, dynamicSymbol)->isDynamic());
  EXPECT_FALSE(section->addRelocation(0, 0, nullptr)->isDynamic());
  EXPECT_TRUE(section->addRelocation(0, 0, dynamicSymbol, 1)->isDynamic());
}

TEST_F(RelocationTest, IsMarkedDynamicWithoutATargetOnly) {
  Relocation* untargeted = section->addRelocation(0, 0, nullptr);
  untargeted->setDynamic();
  EXPECT_TRUE(untargeted->isDynamic());
  Relocation* targeted = section->addRelocation(0, 0, symbol);
  EXPECT_ASSERTION(targeted->setDynamic(), "m_Target == NULL");
}

TEST_F(RelocationTest, FollowsANewTargetAndKeepsTheMarkWithoutOne) {
  Relocation* relocation = section->addRelocation(0, 0, symbol);
  relocation->setTarget(dynamicSymbol);
  EXPECT_TRUE(relocation->isDynamic());
  relocation->setTarget(nullptr);
  EXPECT_EQ(relocation->getTarget(), nullptr);
  EXPECT_TRUE(relocation->isDynamic());
  relocation->setTarget(symbol);
  EXPECT_FALSE(relocation->isDynamic());
}

TEST_F(RelocationTest, TargetsSymbolsOfItsModuleOnly) {
  ObjectModule other;
  Symbol* foreign = other.createAbsoluteSymbol("f", 0, 0, 0, 0);
  Relocation* relocation = section->addRelocation(0, 0, symbol);
  EXPECT_ASSERTION(relocation->setTarget(foreign),
                   "(target == NULL) || (m_Section->m_ObjectModule == target->m_ObjectModule)");
  EXPECT_ASSERTION(section->addRelocation(0, 0, foreign),
                   "(target == NULL) || (target->m_ObjectModule == m_ObjectModule)");
  EXPECT_ASSERTION(Relocation(section, 0, 0, foreign),
                   "(target == NULL) || (section->m_ObjectModule == target->m_ObjectModule)");
  EXPECT_ASSERTION(Relocation(nullptr, 0, 0, nullptr), "section != NULL");
}

TEST_F(RelocationTest, GetsAndLosesItsAddend) {
  Relocation* relocation = section->addRelocation(0, 0, symbol);
  EXPECT_ASSERTION((void)relocation->getAddend(), "m_HasAddend");
  relocation->setAddend(-1);
  EXPECT_EQ(relocation->getAddend(), -1);
  relocation->clearAddend();
  EXPECT_FALSE(relocation->hasAddend());
}

TEST_F(RelocationTest, MakesTheAuxiliarySectionsStaleWithEachSetter) {
  Relocation* relocation = section->addRelocation(0, 0, nullptr);
  EXPECT_TRUE(makesStale([&] { relocation->setOffset(1); }));
  EXPECT_TRUE(makesStale([&] { relocation->setType(1); }));
  EXPECT_TRUE(makesStale([&] { relocation->setAddend(1); }));
  EXPECT_TRUE(makesStale([&] { relocation->clearAddend(); }));
  EXPECT_TRUE(makesStale([&] { relocation->setDynamic(); }));
  EXPECT_TRUE(makesStale([&] { relocation->setTarget(symbol); }));
}

} // namespace
} // namespace elfext
