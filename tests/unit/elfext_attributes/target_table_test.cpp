// SPDX-License-Identifier: Apache-2.0
//
// The table of processors, architectures and units, as rules for all of its rows: names are unique,
// rows of a kind stand together, a row has all that its base has, sets are complete and free of
// clashes. A row that is typed wrongly fails one of these; and look-ups find what they should in
// any letter case.

#include "elfext/interface/target_table.h"

#include "elfext/interface/attribute_relations.h"
#include "elfext/src/attributes/target_rows.h"
#include "support/interface/letters.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>

namespace elfext {
namespace {

using namespace features;

std::string lowered(std::string text) {
  std::ranges::transform(text, text.begin(), support::lowered);
  return text;
}

TEST(TargetTable, HasAllItsRows) {
  EXPECT_EQ(procAndArchList().size(), 296u);
}

TEST(TargetTable, HasEachNameOnce) {
  std::set<std::string> names;
  for (const TargetEntry& row : procAndArchList())
    EXPECT_TRUE(names.insert(lowered(row.name)).second) << row.name;
}

TEST(TargetTable, KeepsTheRowsOfAKindTogether) {
  std::vector<uint32_t> kinds;
  for (const TargetEntry& row : procAndArchList()) {
    if (kinds.empty() || kinds.back() != row.kind) kinds.push_back(row.kind);
  }
  EXPECT_THAT(kinds, testing::ElementsAre(TargetKind_Architecture, TargetKind_FloatingPointUnit,
                                          TargetKind_Other, TargetKind_Further));
}

TEST(TargetTable, HasInEachRowAllOfItsBase) {
  for (const TargetEntry& row : procAndArchList()) {
    if (row.base == nullptr) continue;
    const auto isBase = [&](const TargetEntry& other) {
      return std::string(row.base) == other.name;
    };
    const auto base = std::ranges::find_if(procAndArchList(), isBase);
    ASSERT_NE(base, procAndArchList().end()) << row.name;
    EXPECT_TRUE(row.features.contains(base->features)) << row.name;
  }
}

TEST(TargetTable, HasOnlyCompleteSets) {
  for (const TargetEntry& row : procAndArchList())
    EXPECT_EQ(closeFeatures(row.features), row.features) << row.name;
}

TEST(TargetTable, HasNoProcessorThatCannotBe) {
  for (const TargetEntry& row : procAndArchList()) {
    if (row.kind == TargetKind_FloatingPointUnit) continue;
    EXPECT_FALSE(hasClash({.m_Features = row.features})) << row.name;
  }
}

TEST(TargetTable, FillsEveryFieldOfEachRow) {
  for (const TargetEntry& row : procAndArchList()) {
    EXPECT_NE(std::string(row.family), "") << row.name;
    EXPECT_LE(row.isPublic, 1u) << row.name;
    EXPECT_TRUE(row.hints == 2 || row.hints == 6) << row.name;
  }
}

TEST(TargetTable, FindsATargetInAnyLetterCase) {
  const Target target = findTarget("8-a.64");
  EXPECT_EQ(target.features, Z64_ISA | A_PROFILE);
  EXPECT_EQ(target.targetClass, (TargetClass{TargetKind_Architecture, 0}));
  EXPECT_EQ(findTarget("8-A.64").features, target.features);
}

TEST(TargetTable, GivesNothingForAnUnknownTarget) {
  for (const char* name : {"no such target", "8-A.64 ", static_cast<const char*>(nullptr)}) {
    const Target target = findTarget(name);
    EXPECT_TRUE(target.features.isEmpty());
    EXPECT_EQ(target.targetClass, TargetClass{});
  }
}

TEST(TargetTable, HasAnEmptyNameWithoutFeatures) {
  const Target target = findTarget("");
  EXPECT_TRUE(target.features.isEmpty());
  EXPECT_EQ(target.targetClass.low, TargetKind_Architecture);
}

TEST(TargetTable, KnowsTheNamesThatDecideOfAccesses) {
  EXPECT_EQ(findTarget("v6").features, findTargetForArchitecture(6, 0).features);
  EXPECT_EQ(findTarget("Krell").features, KRELL_ISAv1);
}

struct NumberedTarget {
  uint32_t number;
  uint32_t profile;
  FeatureSet features;
};

// clang-format off
constexpr FeatureSet DspAndPrefetch = DSP_MULT | PAIR_PREFETCH;
constexpr FeatureSet Basic6 = ZEV_ISAv6 | DspAndPrefetch | JAVA_STATE;
constexpr FeatureSet Basic7 = KRELL_ISAv4 | V6T2_ISA | PAIR_PREFETCH | KERNEL_ISA;
constexpr FeatureSet Micro7 = Basic7 | OS_EXTENSION | M_PROFILE | KRELL_DIVIDE;
constexpr FeatureSet Mixed7 = Basic7 | Basic6 | ZEV_ISAv7;
constexpr FeatureSet Mixed8 = Mixed7 | ZEV_ISAv8 | KRELL_ISAv5 | DIVIDE_EXTENSION;
constexpr NumberedTarget NumberedTargets[] = {
    {0,  0,   {}},
    {1,  0,   ZEV_ISAv4},
    {2,  0,   ZEV_ISAv4 | KRELL_ISAv1},
    {3,  0,   ZEV_ISAv5 | KRELL_ISAv2},
    {4,  0,   ZEV_ISAv5 | KRELL_ISAv2 | DspAndPrefetch},
    {5,  0,   ZEV_ISAv5 | KRELL_ISAv2 | DspAndPrefetch | JAVA_STATE},
    {6,  0,   Basic6 | KRELL_ISAv3},
    {7,  0,   Basic6 | KRELL_ISAv3 | KERNEL_ISA | SAFEZONE_ISA},
    {8,  0,   Basic6 | KRELL_ISAv4 | V6T2_ISA},
    {9,  0,   Basic6 | KRELL_ISAv3 | KERNEL_ISA},
    {10, 0,   Basic7},
    {10, 'B', Basic7},
    {10, 'A', Mixed7 | A_PROFILE},
    {10, 'M', Micro7},
    {10, 'R', Mixed7 | R_PROFILE | KRELL_DIVIDE},
    {10, 'S', Mixed7},
    {11, 0,   KRELL_ISAv3 | M_PROFILE},
    {12, 0,   KRELL_ISAv3 | M_PROFILE | OS_EXTENSION},
    {13, 0,   Micro7 | DSP_MULT | V7EM_EXTENSION},
    {14, 0,   Mixed8 | A_PROFILE},
    {14, 'A', Mixed8 | A_PROFILE},
    {14, 'M', Mixed8 | A_PROFILE},
    {14, 'R', Mixed8 | R_PROFILE},
    {14, 'S', Mixed8},
    {15, 0,   Mixed8 | R_PROFILE},
    {15, 'A', Mixed8 | R_PROFILE},
    {16, 0,   KRELL_ISAv3 | M_PROFILE | OS_EXTENSION | V8M_INSNS | KRELL_DIVIDE},
    {17, 0,   Micro7 | V8M_INSNS},
    {17, 'A', Micro7 | V8M_INSNS},
    {18, 0,   {}},
    {~0u, 'M', {}},
};
// clang-format on

TEST(TargetTable, FindsArchitecturesByNumberAndProfile) {
  for (const NumberedTarget& expected : NumberedTargets) {
    const Target target = findTargetForArchitecture(expected.number, expected.profile);
    EXPECT_EQ(target.features, expected.features) << expected.number << " " << expected.profile;
    EXPECT_EQ(target.targetClass.low, TargetKind_Architecture) << expected.number;
  }
}

TEST(TargetTable, TellsWhetherAnArchitectureHasAllOfASet) {
  EXPECT_TRUE(hasFullFeatures(13, 'M', V7EM_EXTENSION));
  EXPECT_TRUE(hasFullFeatures(10, 'A', ZEV_ISAv7 | A_PROFILE));
  EXPECT_FALSE(hasFullFeatures(10, 'A', ZEV_ISAv7 | R_PROFILE));
  EXPECT_FALSE(hasFullFeatures(99, 0, ZEV_ISAv3));
  EXPECT_TRUE(hasFullFeatures(99, 0, {}));
}

TEST(TargetTable, HasAFirstFloatingPointUnit) {
  const TargetEntry& unit = getFirstFloatingPointUnit();
  EXPECT_EQ(unit.kind, TargetKind_FloatingPointUnit);
  EXPECT_NE((&unit - 1)->kind, TargetKind_FloatingPointUnit);
}

TEST(TargetTableDeathTest, StopsTheProgramWithoutAnyFloatingPointUnit) {
  EXPECT_EXIT(static_cast<void>(firstFloatingPointUnitIn(procAndArchList().first(1))),
              testing::ExitedWithCode(1), "^Did not find any FPU's in procAndArchList\n$");
}

} // namespace
} // namespace elfext
