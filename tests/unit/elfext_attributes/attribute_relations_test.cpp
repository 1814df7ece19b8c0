// SPDX-License-Identifier: Apache-2.0
//
// What two attribute records are to each other, and what they come to together: relations, merging,
// intersection, difference and clashes. The cases are held rule by rule, and the laws (a merge is
// commutative and associative, a difference on top of the other gives the record back) on many
// generated records. A linker's choice of a build, and a report of a clash, follow from these.

#include "elfext/interface/attribute_relations.h"

#include "elfext/interface/attribute_string.h"
#include "tests/unit/elfext_attributes/generated_records.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace elfext {
namespace {

using namespace features;
using testing::ElementsAre;
using testing::IsEmpty;

FullAttr of(std::string_view text) {
  return parseAttributeString(text);
}

FullAttr withFeatures(FeatureSet features) {
  FullAttr record;
  record.m_Features = features;
  return record;
}

FullAttr withFlags(uint64_t flags) {
  FullAttr record;
  record.m_Flags = flags;
  return record;
}

FullAttr withAccess(const AccessWords& access) {
  FullAttr record;
  record.m_Access = access;
  return record;
}

// ---- Relations

struct RelationRow {
  uint64_t a;
  uint32_t mode;
  uint64_t b;
  uint32_t result;
};

TEST(RelationTest, ComparesWords) {
  const RelationRow rows[] = {
      // Equal ones have every mode, and are equal.
      {5, 0, 5, 1},
      {5, 1, 5, 1},
      {5, 2, 5, 3},
      {5, 3, 5, 3},
      {5, 4, 5, 5},
      {5, 5, 5, 5},
      {5, 6, 5, 7},
      // Contained.
      {1, 1, 5, 0},
      {1, 2, 5, 2},
      {1, 3, 5, 2},
      {1, 4, 5, 0},
      {1, 5, 5, 0},
      // Containing.
      {5, 2, 1, 0},
      {5, 3, 1, 0},
      {5, 4, 1, 4},
      {5, 5, 1, 4},
      // Neither.
      {6, 1, 5, 0},
      {6, 3, 5, 0},
      {6, 5, 5, 0},
      // Of both directions no question is made.
      {6, 6, 5, 6},
      {6, 7, 5, 6},
      // The whole word counts.
      {uint64_t{1} << 63, 3, 0, 0},
      {0, 3, uint64_t{1} << 63, 2},
  };
  for (const RelationRow& row : rows)
    EXPECT_EQ(relateWord(row.a, row.mode, row.b), row.result)
        << row.a << ' ' << row.mode << ' ' << row.b;
}

TEST(RelationTest, ComparesFeaturesOverBothWords) {
  const FullAttr low = withFeatures(ZEV_ISAv4);
  const FullAttr both = withFeatures(ZEV_ISAv4 | V81_ISA);
  EXPECT_EQ(relateFeatures(low, FitsUnder, both), uint32_t{Relation_Contained});
  EXPECT_EQ(relateFeatures(both, Covers, low), uint32_t{Relation_Contains});
  EXPECT_EQ(relateFeatures(both, FitsUnder, low), 0u);
  EXPECT_EQ(relateFeatures(both, FitsUnder, both), FitsUnder);
  // A low bit on one side and a high one on the other: neither.
  EXPECT_EQ(relateFeatures(withFeatures(V81_ISA), FitsUnder, low), 0u);
  EXPECT_EQ(relateFeatures(withFeatures(V81_ISA), Covers, low), 0u);
  // What is beyond the defined bits doesn't count.
  EXPECT_EQ(relateFeatures(withFeatures({3, 0x20}), FitsUnder, low), FitsUnder);
  EXPECT_EQ(relateFeatures(withFeatures({3, 0x10}), FitsUnder, low), 0u);
}

TEST(RelationTest, ComparesEachAccessWord) {
  const AccessWords some = AccessWords::all(0x80);
  for (const AccessWords& more : {AccessWords{0x81, 0x80, 0x80, 0x80},
                                  {0x80, 0x81, 0x80, 0x80},
                                  {0x80, 0x80, 0x81, 0x80},
                                  {0x80, 0x80, 0x80, 0x81}}) {
    EXPECT_EQ(relateAccess(withAccess(some), FitsUnder, withAccess(some)), FitsUnder);
    EXPECT_EQ(relateAccess(withAccess(some), FitsUnder, withAccess(more)),
              uint32_t{Relation_Contained});
    EXPECT_EQ(relateAccess(withAccess(more), FitsUnder, withAccess(some)), 0u);
    EXPECT_EQ(relateAccess(withAccess(more), Covers, withAccess(some)),
              uint32_t{Relation_Contains});
  }
  EXPECT_EQ(relateAccess(withAccess({0x81, 0x80, 0x80, 0x80}), FitsUnder,
                         withAccess({0x80, 0x80, 0x80, 0x81})),
            0u);
}

TEST(RelationTest, OfRecordsIsThatOfTheirFields) {
  const FullAttr base = of("$ZEV_ISAv4$A:L22$IEEE1$IW");
  EXPECT_EQ(relateFullAttr(base, FitsUnder, base), FitsUnder);
  for (const char* more : {"$ZEV_ISAv5$A:L22$IEEE1$IW", "$ZEV_ISAv4$A:L22$S22$IEEE1$IW",
                           "$ZEV_ISAv4$A:L22$IEEE1$IW$ROPI"}) {
    EXPECT_EQ(relateFullAttr(base, FitsUnder, of(more)), uint32_t{Relation_Contained}) << more;
    EXPECT_EQ(relateFullAttr(base, Covers, of(more)), 0u) << more;
    EXPECT_EQ(relateFullAttr(of(more), Covers, base), uint32_t{Relation_Contains}) << more;
    EXPECT_FALSE(isSameBuild(base, of(more)));
  }
  // One field more, another one less.
  EXPECT_EQ(relateFullAttr(of("$ZEV_ISAv5$A:L22$IEEE1"), FitsUnder, base), 0u);
  // The rest doesn't count.
  FullAttr other = of("$ZEV_ISAv4$A:L22$IEEE1$IW$REQ8$PRES8$EABIv2");
  other.m_TargetClass = {1, 1};
  EXPECT_EQ(relateFullAttr(base, FitsUnder, other), FitsUnder);
  EXPECT_TRUE(isSameBuild(base, other));
}

TEST(RelationTest, IsSatisfiedByEqualRecordsToo) {
  const FullAttr less = of("$ZEV_ISAv4");
  const FullAttr more = of("$ZEV_ISAv5");
  for (const uint32_t mode : {0U, 1U, 2U, 3U, 4U, 5U})
    EXPECT_TRUE(fullAttrSatisfies(less, mode, less)) << mode;
  EXPECT_TRUE(fullAttrSatisfies(less, Relation_Contained, more));
  EXPECT_TRUE(fullAttrSatisfies(less, FitsUnder, more));
  EXPECT_FALSE(fullAttrSatisfies(less, Relation_Equal, more));
  EXPECT_FALSE(fullAttrSatisfies(less, Covers, more));
  EXPECT_TRUE(fullAttrSatisfies(more, Covers, less));
  EXPECT_TRUE(fullAttrSatisfies(more, Relation_Contains, less));
  EXPECT_FALSE(fullAttrSatisfies(more, FitsUnder, less));
}

// ---- Merging

TEST(MergeTest, PutsRecordsTogether) {
  FullAttr a = of("$ZEV_ISAv4$A:L22$IEEE1$IW$REQ8$PRES8$EABIv2");
  FullAttr b = of("$E$S41$IEEE1$ROPI$PRES8");
  a.m_TargetClass = {1, 4};
  b.m_TargetClass = {2, 4};
  FullAttr wanted = of("$ZEV_ISAv4$E$A:L22$S41$IEEE1$IW$ROPI$REQ8$PRES8");
  wanted.m_TargetClass = {3, 4};
  FullAttr merged;
  EXPECT_TRUE(mergeFullAttr(merged, a, b));
  EXPECT_EQ(merged, wanted);
  FullAttr onto = a;
  EXPECT_TRUE(mergeFullAttr(onto, onto, b));
  EXPECT_EQ(onto, wanted);
  onto = b;
  EXPECT_TRUE(mergeFullAttr(onto, a, onto));
  EXPECT_EQ(onto, wanted);
}

TEST(MergeTest, RequiresMoreAndPreservesLess) {
  const auto merged = [](uint64_t a, uint64_t b) {
    FullAttr left;
    FullAttr right;
    left.m_Stack8 = a;
    right.m_Stack8 = b;
    mergeFullAttr(left, left, right);
    return left.m_Stack8;
  };
  EXPECT_EQ(merged(1, 0), 1u);
  EXPECT_EQ(merged(0, 1), 1u);
  EXPECT_EQ(merged(2, 0), 0u);
  EXPECT_EQ(merged(0, 2), 0u);
  EXPECT_EQ(merged(2, 2), 2u);
  EXPECT_EQ(merged(3, 2), 3u);
  EXPECT_EQ(merged(3, 1), 1u);
}

TEST(MergeTest, DoesntCloseTheFeatures) {
  FullAttr merged;
  EXPECT_TRUE(mergeFullAttr(merged, of("$ZEV_ISAv5"), of("$KRL_ISAv1")));
  EXPECT_EQ(merged.m_Features, ZEV_ISAv5 | KRELL_ISAv1);
}

struct ClashRow {
  const char* a;
  const char* b;
};

TEST(MergeTest, FailsOnAClashAndIsCompleteAllTheSame) {
  const ClashRow rows[] = {
      {"$KCPv3", "$HFUi1"},     {"$PE", "$ME"},          {"$ZEV_ISAv3", "$KRL_ISAv3M"},
      {"$HFUi2", "$ZEV_ISAv4"}, {"$STKCKD", "$~STKCKD"}, {"$EBA4", "$EBA8"},
      {"$X:UL41", "$W:L41"},
  };
  for (const ClashRow& row : rows) {
    const FullAttr a = of(row.a);
    const FullAttr b = of(row.b);
    FullAttr merged;
    EXPECT_FALSE(mergeFullAttr(merged, a, b)) << row.a;
    EXPECT_EQ(merged.m_Features, a.m_Features | b.m_Features);
    EXPECT_EQ(merged.m_Access, a.m_Access | b.m_Access);
    EXPECT_EQ(merged.m_Flags, a.m_Flags | b.m_Flags);
  }
  FullAttr merged;
  EXPECT_FALSE(mergeFullAttr(merged, withFeatures(Z64_ISA), withFeatures(SOFTFP)));
  // Prefetches of pairs, and the wide instruction set, come with the registers.
  EXPECT_TRUE(mergeFullAttr(merged, of("$HFUi2"), of("$P")));
  EXPECT_TRUE(mergeFullAttr(merged, of("$HFUi2"), of("$Z64_ISAv8")));
  EXPECT_TRUE(mergeFullAttr(merged, of("$HFUi1"), of("$ZEV_ISAv4")));
}

TEST(MergeTest, OfARecordWithItselfKeepsIt) {
  GeneratedRecords generated;
  for (int i = 0; i < ManyRecords; ++i) {
    const FullAttr record = generated.record();
    FullAttr merged;
    mergeFullAttr(merged, record, record);
    ASSERT_EQ(merged, record);
  }
}

TEST(MergeTest, IsCommutativeAndAssociative) {
  GeneratedRecords generated;
  for (int i = 0; i < ManyRecords; ++i) {
    const FullAttr a = generated.record();
    const FullAttr b = generated.record();
    const FullAttr c = generated.record();
    FullAttr ab;
    FullAttr ba;
    ASSERT_EQ(mergeFullAttr(ab, a, b), mergeFullAttr(ba, b, a));
    ASSERT_EQ(ab, ba);
    FullAttr bc;
    mergeFullAttr(bc, b, c);
    FullAttr left;
    FullAttr right;
    ASSERT_EQ(mergeFullAttr(left, ab, c), mergeFullAttr(right, a, bc));
    ASSERT_EQ(left, right);
    // Both fit under what is needed for both.
    ASSERT_TRUE(fullAttrSatisfies(a, FitsUnder, ab));
    ASSERT_TRUE(fullAttrSatisfies(ab, Covers, b));
  }
}

TEST(IntersectionTest, KeepsWhatBothHave) {
  FullAttr a = of("$ZEV_ISAv5$E$A:L22$IEEE1$IW$ROPI$REQ8$PRES8$EABIv2");
  const FullAttr b = of("$ZEV_ISAv4$J$A:L22$S41$IEEE1$IW$PRES8$EABIv2");
  a.m_TargetClass = {7, 7};
  FullAttr wanted = of("$ZEV_ISAv4$A:L22$IEEE1$IW$PRES8$EABIv2");
  wanted.m_TargetClass = {7, 7};
  EXPECT_EQ(intersectFullAttr(a, b), wanted);
  GeneratedRecords generated;
  for (int i = 0; i < ManyRecords; ++i) {
    const FullAttr left = generated.record();
    const FullAttr right = generated.record();
    const FullAttr common = intersectFullAttr(left, right);
    ASSERT_EQ(intersectFullAttr(right, left), common);
    ASSERT_TRUE(fullAttrSatisfies(common, FitsUnder, left));
    ASSERT_TRUE(fullAttrSatisfies(common, FitsUnder, right));
  }
}

// ---- Differences

FullAttr difference(const FullAttr& a, const FullAttr& b) {
  FullAttr result;
  differenceFullAttr(result, a, b);
  return result;
}

struct DifferenceRow {
  FeatureSet a;
  FeatureSet b;
  FeatureSet result;
};

TEST(DifferenceTest, ClosesFeatures) {
  const DifferenceRow rows[] = {
      {ZEV_ISAv5, ZEV_ISAv5, ZEV_ISAv3},
      {{}, {}, {}},
      {KRELL_ISAv2, {}, KRELL_ISAv2},
      {KRELL_ISAv3, KRELL_ISAv2, KRELL_ISAv3},
      {ZEV_ISAv5, ZEV_ISAv4, ZEV_ISAv5},
      {ZEV_ISAv7, ZEV_ISAv4, ZEV_ISAv7},
      {ZEV_ISAv4, {}, ZEV_ISAv4},
      {ZEV_ISAv4 | DSP_MULT, ZEV_ISAv4, ZEV_ISAv3 | DSP_MULT},
      {ZEV_ISAv4 | KRELL_ISAv2, ZEV_ISAv4 | KRELL_ISAv1, ZEV_ISAv3 | KRELL_ISAv2},
      {ZEV_ISAv5 | KRELL_ISAv1, {}, ZEV_ISAv5 | KRELL_ISAv2},
      // The level keeps a division from being that of the M profile.
      {ZEV_ISAv4 | KRELL_DIVIDE, ZEV_ISAv4, ZEV_ISAv3 | KRELL_DIVIDE},
      {KRELL_ISAv3 | KRELL_DIVIDE, KRELL_ISAv3, KRELL_DIVIDE | M_PROFILE},
      {HFU_ISAv1 | PURE_DOUBLES | KCP_ISA, HFU_ISAv1 | PURE_DOUBLES, KCP_ISA | MIXED_DOUBLES},
      {HFU_ISAv3 | PURE_DOUBLES, HFU_ISAv2 | PURE_DOUBLES, HFU_ISAv3 | PURE_DOUBLES},
      {V81_ISA | HFU_HALF, HFU_HALF, V81_ISA},
  };
  for (const DifferenceRow& row : rows)
    EXPECT_EQ(difference(withFeatures(row.a), withFeatures(row.b)).m_Features, row.result)
        << std::hex << row.a.low << ' ' << row.b.low;
  EXPECT_EQ(difference(withFeatures({0, 0x3F}), {}).m_Features.high & ~uint64_t{0x1F}, 0u);
}

TEST(DifferenceTest, IsTakenWordByWord) {
  const FullAttr a = withAccess({0x83, 0x82, 0x81, 0x4080});
  const FullAttr b = withAccess({0x80, 0x02, 0x81, 0x0080});
  EXPECT_EQ(difference(a, b).m_Access, (AccessWords{0x03, 0x80, 0, 0x4000}));
  const FullAttr more = of("$REQ8$PRES8$EABIv2");
  EXPECT_EQ(difference(more, of("$PRES8")).m_Stack8, 1u);
  EXPECT_EQ(difference(more, of("$REQ8")).m_Stack8, 2u);
  EXPECT_EQ(difference(of("$REQ8"), more).m_Stack8, 0u);
  EXPECT_EQ(difference(more, of("")).m_AbiLevel, 2u);
  EXPECT_EQ(difference(more, more).m_AbiLevel, 0u);
}

TEST(DifferenceTest, CompletesGroupsOfFlags) {
  const auto flags = [](uint64_t a, uint64_t b) {
    return difference(withFlags(a), withFlags(b)).m_Flags;
  };
  EXPECT_EQ(flags(0x30000, 0x10000), 0x30000u);
  EXPECT_EQ(flags(0x30000, 0x20000), 0x10000u);
  EXPECT_EQ(flags(0x700000, 0x300000), 0x700000u);
  EXPECT_EQ(flags(0x700000, 0x100000), 0x700000u);
  EXPECT_EQ(flags(0x300000, 0x100000), 0x300000u);
  EXPECT_EQ(flags(0x300000, 0x200000), 0x100000u);
  EXPECT_EQ(flags(0x300000, 0x300000), 0u);
  EXPECT_EQ(flags(0x880003, 0x800001), 0x80002u);
}

// Either both together give the record back, or the text of what is between them can't say it.
TEST(DifferenceTest, GivesTheRecordBackOnTopOfTheOther) {
  GeneratedRecords generated;
  for (int i = 0; i < ManyRecords; ++i) {
    const FullAttr b = generated.record();
    FullAttr a = generated.record();
    a.m_Features = closeFeatures(a.m_Features | b.m_Features);
    mergeFullAttr(a, a, b);
    const FullAttr between = difference(a, b);
    const FeatureSet whole = b.m_Features | between.m_Features;
    ASSERT_TRUE(whole.contains(a.m_Features));
    ASSERT_EQ(b.m_Access | between.m_Access, a.m_Access);
    ASSERT_EQ(b.m_Flags | between.m_Flags, a.m_Flags | (between.m_Flags & 0x730000));
    ASSERT_EQ(b.m_Stack8 | between.m_Stack8, a.m_Stack8 | b.m_Stack8);
    // Nothing comes by itself but what closing brings, and the lowest level.
    ASSERT_TRUE(closeFeatures(a.m_Features.without(b.m_Features) | ZEV_ISAv3)
                    .contains(between.m_Features.without(M_PROFILE)));
  }
}

TEST(DifferenceTest, OfCommonLevelsAndFlagsGivesTheRecordBack) {
  for (const char* common :
       {"$ZEV_ISAv4$IEEE1$IW", "$KRL_ISAv2$IEEE1", "$ZEV_ISAv5$P$HFUv2$IEEE1"}) {
    for (const char* more : {"$ZEV_ISAv6$IEEE1", "$E$J$IEEE1$OTIME", "$A:L41$S41$IEEE1$IEEEX",
                             "$WMMX2$PLD4$IEEE1$REQ8$EABIv2"}) {
      const FullAttr b = of(common);
      FullAttr a = b;
      addAttributeString(a, more);
      FullAttr whole = parseAttributeString(printAttributeString(difference(a, b)));
      whole.m_Features = closeFeatures(whole.m_Features | b.m_Features);
      whole.m_Access = whole.m_Access | b.m_Access;
      whole.m_Flags |= b.m_Flags;
      EXPECT_EQ(whole.m_Features, a.m_Features) << common << ' ' << more;
      EXPECT_EQ(whole.m_Access, a.m_Access) << common << ' ' << more;
      EXPECT_EQ(whole.m_Flags, a.m_Flags) << common << ' ' << more;
    }
  }
}

// ---- Clashes

std::vector<std::string> clashesOf(FullAttr record) {
  std::vector<std::string> result;
  Clash clash;
  while (takeClash(record, clash))
    result.push_back(std::string(clash.first) + " * " + std::string(clash.second));
  EXPECT_FALSE(featuresClash(record) || accessClash(record) || flagsClash(record));
  return result;
}

TEST(ClashTest, OfARecordAreTakenOneByOne) {
  FullAttr record = of("$EBA4$EBA8$STKCKD$~STKCKD$A:L41$A:UL41");
  record.m_Features =
      KCP_ISA | HFU_ISAv1 | PURE_DOUBLES | MIXED_DOUBLES | ZEV_ISAv3 | M_PROFILE | Z64_ISA | SOFTFP;
  EXPECT_THAT(clashesOf(record),
              ElementsAre("KCP * HFU", "pure-endian double * mixed-endian double",
                          "zev-isa * m-profile", "Z64 * SoftHFU", "L/S * UL/US",
                          "stack-checked * not-stack-checked",
                          "require 4-byte alignment of 8-byte datatypes * "
                          "require 8-byte alignment of 8-byte datatypes"));
  EXPECT_THAT(clashesOf(of("$ZEV_ISAv4$P$HFUv2$STKCKD$EBA8$A:L41")), IsEmpty());
}

TEST(ClashTest, IsTakenOutOfTheRecord) {
  FullAttr record = withFeatures(KCP_ISA | HFU_ISAv2 | DSP_MULT);
  Clash clash;
  EXPECT_TRUE(featuresClash(record));
  ASSERT_TRUE(takeFeaturesClash(record, clash));
  EXPECT_EQ(record.m_Features, HFU_ISAv2.without(HFU_ISAv1) | DSP_MULT);
  EXPECT_FALSE(takeFeaturesClash(record, clash));
  record = withFlags(0x31);
  ASSERT_TRUE(takeFlagsClash(record, clash));
  EXPECT_EQ(record.m_Flags, 1u);
  EXPECT_FALSE(takeFlagsClash(record, clash));
  record = withAccess({0x4040, 0xC001, 0xFFFF, 0xFFFF});
  ASSERT_TRUE(takeAccessClash(record, clash));
  EXPECT_EQ(record.m_Access, (AccessWords{0x40, 1, 0x3FF, 0xFFFF}));
  EXPECT_FALSE(takeAccessClash(record, clash));
}

TEST(ClashTest, OfAccessesIsBetweenUnalignedAndWideOnes) {
  EXPECT_TRUE(accessClash(withAccess({0x4000, 0, 0x40, 0})));
  EXPECT_TRUE(accessClash(withAccess({0x40, 0, 0x4000, 0})));
  EXPECT_TRUE(accessClash(withAccess({0, 0x4040, 0, 0})));
  EXPECT_FALSE(accessClash(withAccess({0, 0, 0, 0x4040})));
  EXPECT_FALSE(accessClash(withAccess({0x40, 0, 0, 0x4000})));
  EXPECT_FALSE(accessClash(of("$US41")));
  EXPECT_TRUE(accessClash(of("$X:UL41$W:L41")));
  for (uint32_t i = 0; i < 16; ++i) {
    const auto bit = static_cast<uint16_t>(1u << i);
    const bool isWide = (0x16E & bit) != 0;
    EXPECT_EQ(accessClash(withAccess({0x400, 0, bit, 0})), isWide) << i;
    const bool isUnaligned = i >= 10;
    EXPECT_EQ(accessClash(withAccess({0x2, bit, 0, 0})), isUnaligned) << i;
  }
}

TEST(ClashTest, OfARecordsFeaturesNeedsNoRowOfATable) {
  EXPECT_TRUE(hasClash(of("$HFUv2")));
  EXPECT_FALSE(featuresClash(of("$HFUv2")));
  EXPECT_FALSE(hasClash(of("$HFUv2$P")));
  EXPECT_FALSE(hasClash(of("$HFUv2$Z64_ISAv8")));
  EXPECT_FALSE(hasClash(of("$HFUv1")));
  EXPECT_TRUE(hasClash(of("$PE$ME")));
  EXPECT_FALSE(hasClash(of("$STKCKD$~STKCKD$X:UL41$W:L41")));
}

} // namespace
} // namespace elfext
