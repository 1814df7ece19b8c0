// SPDX-License-Identifier: Apache-2.0
//
// Sets of processor features over two words, and their closure: what each feature brings with it,
// in the order of the rules. On generated sets a closure only adds, and adds everything at once.

#include "elfext/interface/feature_set.h"

#include "tests/unit/elfext_attributes/generated_records.h"

#include <gtest/gtest.h>

#include <vector>

namespace elfext {
namespace {

using namespace features;

TEST(FeatureSetTest, HoldsBitsOfBothWords) {
  constexpr FeatureSet Both = V81_ISA | DSP_MULT;
  EXPECT_TRUE(Both.contains(V81_ISA));
  EXPECT_TRUE(Both.contains(Both));
  EXPECT_FALSE(Both.contains(Both | HFU_HALF));
  EXPECT_FALSE(Both.contains(Both | JAVA_STATE));
  EXPECT_TRUE(Both.contains({}));
  EXPECT_TRUE(Both.intersects(V81_ISA | HFU_HALF));
  EXPECT_TRUE(Both.intersects(DSP_MULT | HFU_HALF));
  EXPECT_FALSE(Both.intersects(HFU_HALF | JAVA_STATE));
  EXPECT_EQ(Both.without(V81_ISA), DSP_MULT);
  EXPECT_EQ(Both.without(DSP_MULT), V81_ISA);
  EXPECT_EQ(Both & V81_ISA, V81_ISA);
  EXPECT_FALSE(V81_ISA.isEmpty());
  EXPECT_FALSE(DSP_MULT.isEmpty());
  EXPECT_TRUE(Both.without(Both).isEmpty());
  FeatureSet set = Both;
  set.put(HFU_HALF, true);
  EXPECT_EQ(set, Both | HFU_HALF);
  set.put(V81_ISA | JAVA_STATE, false);
  EXPECT_EQ(set, DSP_MULT | HFU_HALF);
}

TEST(FeatureSetTest, ClosureOfALevelBringsTheLevelsBelow) {
  const std::vector<std::vector<FeatureSet>> chains = {
      {KRELL_ISAv1, KRELL_ISAv2, KRELL_ISAv3, KRELL_ISAv4, KRELL_ISAv5},
      {ZEV_ISAv3, ZEV_ISAv4, ZEV_ISAv5, ZEV_ISAv6, ZEV_ISAv7, ZEV_ISAv8},
      {WMMX_ISA, WMMX2_ISA},
      {PLD7, PLD9, PLD1, PLD2, PLD3, PLD4, PLD5, PLD6, PLD8},
      {HFU_ISAv1, HFU_ISAv2, HFU_ISAv3, HFU_ISAv5, FP_ISA_ZEVv8},
      {EXTREGS_D16, EXTREGS_D32},
  };
  for (const std::vector<FeatureSet>& chain : chains) {
    FeatureSet below;
    for (const FeatureSet level : chain) {
      const FeatureSet pure = level.intersects(FP_ISA_ZEVv8) ? PURE_DOUBLES : FeatureSet();
      EXPECT_EQ(closeFeatures(level.without(below)), level | pure) << std::hex << level.low;
      EXPECT_EQ(closeFeatures(level), level | pure) << std::hex << level.low;
      below = level;
    }
  }
}

struct Rule {
  FeatureSet from;
  FeatureSet brings;
};

TEST(FeatureSetTest, ClosureBringsWhatFollows) {
  const std::vector<Rule> rules = {
      {HFU_HALF, FP_ISA_ZEVv8 | PURE_DOUBLES},
      {KRELL_DIVIDE, M_PROFILE},
      {KRELL_DIVIDE | KRELL_ISAv5, M_PROFILE},
      {KRELL_DIVIDE | ZEV_DIVIDE, {}},
      {KRELL_DIVIDE | ZEV_ISAv3, {}},
      {KRELL_DIVIDE | ZEV_ISAv8, {}},
      {KRELL_DIVIDE | JAVA_STATE, {}},
      {ZEV_DIVIDE, {}},
      {V8M_INSNS, M_PROFILE},
      {V8M_INSNS | ZEV_ISAv3, M_PROFILE},
      {ZEV_ISAv5 | KRELL_ISAv1, KRELL_ISAv2},
      {ZEV_ISAv6 | KRELL_ISAv1, KRELL_ISAv2},
      {ZEV_ISAv4 | KRELL_ISAv1, {}},
      {ZEV_ISAv5, {}},
      {VIRTUALIZATION_EXTENSION, DIVIDE_EXTENSION},
      {HFU_ISAv1, PURE_DOUBLES},
      {KCP_ISA, MIXED_DOUBLES},
      {KCP_ISA | HFU_ISAv1, PURE_DOUBLES},
      {HFU_SINGLE, {}},
      {HFU_DOUBLE, {}},
      {EXTREGS_D16, {}},
      {VFMA_EXTENSION | HFU_ISAv3, FP16 | PURE_DOUBLES},
      {VFMA_EXTENSION | HFU_ISAv2, PURE_DOUBLES},
      {VFMA_EXTENSION, {}},
      {A_PROFILE | R_PROFILE | Z64_ISA | SAFEZONE_ISA | V81_ISA | SOFTFP, {}},
  };
  for (const Rule& rule : rules)
    EXPECT_EQ(closeFeatures(rule.from), rule.from | rule.brings)
        << std::hex << rule.from.high << ' ' << rule.from.low;
}

// The division rules are looked at before virtualization brings both divisions.
TEST(FeatureSetTest, ClosureTakesTheRulesInTheirOrder) {
  EXPECT_EQ(closeFeatures(KRELL_DIVIDE | VIRTUALIZATION_EXTENSION),
            DIVIDE_EXTENSION | VIRTUALIZATION_EXTENSION | M_PROFILE);
  // The highest bit of a level is enough for the rules that look at it.
  constexpr FeatureSet ZevBit5 = ZEV_ISAv5.without(ZEV_ISAv4);
  EXPECT_EQ(closeFeatures(ZevBit5 | KRELL_ISAv1 | KRELL_DIVIDE),
            ZEV_ISAv5 | KRELL_ISAv2 | KRELL_DIVIDE);
}

TEST(FeatureSetTest, ClosureOnlyAddsAndAddsAllAtOnce) {
  GeneratedRecords generated;
  for (int i = 0; i < ManyRecords; ++i) {
    const FeatureSet set = generated.features();
    const FeatureSet closed = closeFeatures(set);
    ASSERT_TRUE(closed.contains(set));
    ASSERT_EQ(closeFeatures(closed), closed) << std::hex << set.high << ' ' << set.low;
  }
}

} // namespace
} // namespace elfext
