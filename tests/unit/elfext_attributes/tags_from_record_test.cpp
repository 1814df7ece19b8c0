// SPDX-License-Identifier: Apache-2.0
//
// The tags that follow from a record, rule by rule. Not all of a record can be said in tags: what
// is lost on the way is held here too, since the way back can't bring it.

#include "elfext/interface/build_attributes.h"
#include "elfext/src/attributes/architecture_number.h"
#include "tests/unit/elfext_attributes/attribute_sets.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>
#include <vector>

namespace elfext {
namespace {

using namespace features;

constexpr FeatureSet Nothing = {};

BuildAttributes derivedFromFlags(uint64_t flags) {
  return derivedFrom({.m_Flags = flags});
}

template <class Tag>
std::optional<uint32_t> valueOf(const BuildAttributes& attributes, Tag tag) {
  if (!attributes.hasTag(tag)) return {};
  return attributes.getNumericTag(tag);
}

std::vector<uint32_t> alsoArchitecturesOf(const BuildAttributes& attributes) {
  std::vector<uint32_t> numbers;
  for (uint32_t i = 0; i < attributes.getAlsoCompatibilityTagCount(); ++i) {
    AlsoCompatibilityTag entry;
    attributes.getAlsoCompatibilityTag(i, entry);
    EXPECT_EQ(entry, alsoForArchitecture(entry.number.value()));
    numbers.push_back(*entry.number);
  }
  return numbers;
}

// ---- Architecture

struct ArchitectureRow {
  FeatureSet features;
  uint32_t number;
  uint32_t profile;
};

// clang-format off
constexpr ArchitectureRow ArchitectureRows[] = {
    {Nothing,                                               0,  0},
    {Z64_ISA,                                               14, 0},
    {Z64_ISA | ZEV_ISAv8 | R_PROFILE,                       14, 'R'},
    {Z64_ISA | KRELL_ISAv1,                                 14, 0},
    {ZEV_ISAv3,                                             0,  0},
    {ZEV_ISAv3 | KRELL_ISAv2,                               0,  0},
    {ZEV_ISAv4,                                             1,  0},
    {ZEV_ISAv4 | OS_EXTENSION,                              2,  0},
    {ZEV_ISAv4 | KRELL_ISAv1,                               2,  0},
    {ZEV_ISAv4 | KRELL_ISAv5,                               2,  'S'},
    {ZEV_ISAv5,                                             3,  0},
    {ZEV_ISAv5 | JAVA_STATE,                                3,  0},
    {ZEV_ISAv5 | DSP_MULT,                                  4,  0},
    {ZEV_ISAv5 | DSP_MULT | JAVA_STATE,                     5,  0},
    {ZEV_ISAv6,                                             6,  0},
    {ZEV_ISAv6 | SAFEZONE_ISA,                              6,  0},
    {ZEV_ISAv6 | KRELL_ISAv3,                               6,  0},
    {ZEV_ISAv6 | KERNEL_ISA,                                9,  0},
    {ZEV_ISAv6 | KERNEL_ISA | V6T2_ISA,                     9,  0},
    {ZEV_ISAv6 | KERNEL_ISA | SAFEZONE_ISA,                 7,  0},
    {ZEV_ISAv6 | V6T2_ISA,                                  8,  0},
    {ZEV_ISAv6 | KRELL_ISAv4,                               8,  'S'},
    {ZEV_ISAv6 | KRELL_ISAv5,                               6,  'S'},
    {ZEV_ISAv6 | M_PROFILE,                                 6,  0},
    {ZEV_ISAv7,                                             10, 'S'},
    {ZEV_ISAv7 | A_PROFILE,                                 10, 'A'},
    {ZEV_ISAv7 | R_PROFILE,                                 10, 'R'},
    {ZEV_ISAv7 | A_PROFILE | R_PROFILE,                     10, 'A'},
    {ZEV_ISAv7 | M_PROFILE | A_PROFILE,                     10, 'M'},
    {ZEV_ISAv7 | V8M_INSNS,                                 10, 'S'},
    {ZEV_ISAv7 | KRELL_ISAv3 | V8M_INSNS,                   10, 0},
    {ZEV_ISAv7 | KRELL_ISAv4 | V8M_INSNS,                   10, 0},
    {ZEV_ISAv8,                                             14, 'S'},
    {ZEV_ISAv8 | A_PROFILE,                                 14, 'A'},
    {ZEV_ISAv8 | R_PROFILE,                                 15, 'R'},
    {KRELL_ISAv1,                                           2,  0},
    {KRELL_ISAv2,                                           3,  0},
    {KRELL_ISAv2 | DSP_MULT,                                4,  0},
    {KRELL_ISAv2 | DSP_MULT | JAVA_STATE,                   5,  0},
    {KRELL_ISAv3,                                           6,  0},
    {KRELL_ISAv3 | KERNEL_ISA,                              9,  0},
    {KRELL_ISAv3 | KERNEL_ISA | SAFEZONE_ISA,               7,  0},
    {KRELL_ISAv3 | V6T2_ISA,                                8,  0},
    {KRELL_ISAv3 | V8M_INSNS,                               6,  0},
    {KRELL_ISAv3 | M_PROFILE,                               11, 0},
    {KRELL_ISAv3 | M_PROFILE | OS_EXTENSION,                12, 0},
    {KRELL_ISAv3 | M_PROFILE | V8M_INSNS,                   16, 0},
    {KRELL_ISAv3 | M_PROFILE | OS_EXTENSION | V8M_INSNS,    16, 0},
    {KRELL_ISAv4,                                           8,  'S'},
    {KRELL_ISAv4 | V7EM_EXTENSION,                          8,  'S'},
    {KRELL_ISAv4 | V8M_INSNS,                               17, 0},
    {KRELL_ISAv4 | V8M_INSNS | KERNEL_ISA | V7EM_EXTENSION, 17, 0},
    {KRELL_ISAv4 | KERNEL_ISA,                              10, 'S'},
    {KRELL_ISAv4 | KERNEL_ISA | M_PROFILE,                  10, 'M'},
    {KRELL_ISAv4 | KERNEL_ISA | A_PROFILE,                  10, 'A'},
    {KRELL_ISAv4 | KERNEL_ISA | R_PROFILE,                  10, 'R'},
    {KRELL_ISAv4 | KERNEL_ISA | M_PROFILE | V7EM_EXTENSION, 13, 'M'},
    {KRELL_ISAv5,                                           14, 'S'},
    {KRELL_ISAv5 | R_PROFILE,                               15, 'R'},
    {KRELL_ISAv5 | V8M_INSNS | M_PROFILE,                   14, 'M'},
    // Only a whole level counts.
    {ZEV_ISAv5.without(ZEV_ISAv4),                          0,  0},
    {ZEV_ISAv8.without(ZEV_ISAv7) | ZEV_ISAv4,              1,  0},
    {KRELL_ISAv5.without(KRELL_ISAv4) | KRELL_ISAv1,        2,  0},
};
// clang-format on

TEST(ArchitectureNumber, FollowsFromTheFeatures) {
  for (const ArchitectureRow& row : ArchitectureRows) {
    SCOPED_TRACE(testing::Message() << std::hex << row.features.low);
    EXPECT_EQ(getArchitectureNumber(row.features), row.number);
    EXPECT_EQ(getArchitectureProfile(row.features), row.profile);
  }
}

TEST(TagsFromRecord, SayTheArchitecture) {
  for (const ArchitectureRow& row : ArchitectureRows) {
    SCOPED_TRACE(testing::Message() << std::hex << row.features.low);
    const BuildAttributes attributes = derivedFrom(row.features);
    const IsaLevels levels = getIsaLevels(row.features);
    if (levels.zev + levels.krell + levels.z64 == 0) continue;
    EXPECT_EQ(valueOf(attributes, Tag_CPU_arch), row.number);
    EXPECT_EQ(valueOf(attributes, Tag_CPU_arch_profile), row.profile);
  }
}

TEST(TagsFromRecord, SayNothingOfAnArchitectureWithoutInstructions) {
  for (const FeatureSet features : {Nothing, A_PROFILE | KERNEL_ISA | V8M_INSNS}) {
    const BuildAttributes attributes = derivedFrom(features);
    for (const uint32_t tag : {Tag_CPU_arch, Tag_CPU_arch_profile, Tag_ZEV_ISA_use,
                               Tag_KRELL_ISA_use, Tag_Z64_ISA_use, Tag_also_compatible_with})
      EXPECT_FALSE(attributes.hasTag(tag)) << tag;
    EXPECT_TRUE(attributes.hasTag(Tag_WMMX_arch));
  }
}

TEST(TagsFromRecord, SayTheLevelsOfInstructions) {
  constexpr FeatureSet Zev[] = {ZEV_ISAv3, ZEV_ISAv4, ZEV_ISAv5, ZEV_ISAv6, ZEV_ISAv7, ZEV_ISAv8};
  constexpr FeatureSet Krell[] = {KRELL_ISAv1, KRELL_ISAv2, KRELL_ISAv3, KRELL_ISAv4, KRELL_ISAv5};
  for (uint32_t i = 0; i < std::size(Zev); ++i)
    EXPECT_EQ(getIsaLevels(Zev[i]).zev, 3 + i);
  for (uint32_t i = 0; i < std::size(Krell); ++i)
    EXPECT_EQ(getIsaLevels(Krell[i]).krell, 1 + i);
  EXPECT_EQ(getIsaLevels(Z64_ISA).z64, 8u);
  EXPECT_EQ(getIsaLevels(Nothing).zev, 0u);
  EXPECT_EQ(getIsaLevels(Nothing).krell, 0u);
  EXPECT_EQ(getIsaLevels(Nothing).z64, 0u);
}

TEST(TagsFromRecord, SayWhichInstructionsAreUsed) {
  struct Row {
    FeatureSet features;
    uint32_t zev;
    uint32_t krell;
    uint32_t z64;
  };
  constexpr Row Rows[] = {
      {ZEV_ISAv3, 1, 0, 0},
      {ZEV_ISAv8, 1, 0, 0},
      {KRELL_ISAv1, 0, 1, 0},
      {KRELL_ISAv3, 0, 1, 0},
      {KRELL_ISAv4, 0, 2, 0},
      {KRELL_ISAv5, 0, 2, 0},
      {KRELL_ISAv3 | V8M_INSNS, 0, 3, 0},
      {KRELL_ISAv5 | V8M_INSNS, 0, 3, 0},
      {ZEV_ISAv4 | V8M_INSNS, 1, 0, 0},
      {Z64_ISA, 0, 0, 1},
      {ZEV_ISAv5 | KRELL_ISAv2, 1, 1, 0},
  };
  for (const Row& row : Rows) {
    const BuildAttributes attributes = derivedFrom(row.features);
    EXPECT_EQ(valueOf(attributes, Tag_ZEV_ISA_use), row.zev);
    EXPECT_EQ(valueOf(attributes, Tag_KRELL_ISA_use), row.krell);
    EXPECT_EQ(valueOf(attributes, Tag_Z64_ISA_use), row.z64);
  }
}

TEST(TagsFromRecord, SayWhereElseTheCodeCanBeUsed) {
  struct Row {
    FeatureSet features;
    std::vector<uint32_t> architectures;
  };
  const Row rows[] = {
      {ZEV_ISAv8, {15}},
      {ZEV_ISAv8 | KRELL_ISAv5, {15}},
      {ZEV_ISAv8 | Z64_ISA, {15}},
      {ZEV_ISAv8 | A_PROFILE, {}},
      {ZEV_ISAv8 | R_PROFILE, {}},
      {ZEV_ISAv7, {}},
      {KRELL_ISAv5, {}},
      {KRELL_ISAv1, {11}},
      {KRELL_ISAv3, {11}},
      {KRELL_ISAv3 | A_PROFILE, {11}},
      {KRELL_ISAv3 | M_PROFILE, {}},
      {KRELL_ISAv3 | OS_EXTENSION, {}},
      {KRELL_ISAv4, {}},
      {KRELL_ISAv1 | ZEV_ISAv3, {}},
      {KRELL_ISAv1 | Z64_ISA, {}},
  };
  for (const Row& row : rows)
    EXPECT_EQ(alsoArchitecturesOf(derivedFrom(row.features)), row.architectures)
        << std::hex << row.features.low;
}

TEST(TagsFromRecord, SayWhereElseTheCodeCanBeUsedOnce) {
  BuildAttributes attributes;
  attributes.addAlsoCompatibilityTag(alsoForArchitecture(11));
  attributes.setFullAttr({.m_Features = KRELL_ISAv1});
  attributes.deriveStandardTags();
  attributes.deriveStandardTags();
  EXPECT_EQ(alsoArchitecturesOf(attributes), std::vector<uint32_t>{11});
}

// ---- Extensions

TEST(TagsFromRecord, SayTheExtensions) {
  EXPECT_EQ(valueOf(derivedFrom(Nothing), Tag_WMMX_arch), 0u);
  EXPECT_EQ(valueOf(derivedFrom(WMMX_ISA), Tag_WMMX_arch), 1u);
  EXPECT_EQ(valueOf(derivedFrom(WMMX2_ISA), Tag_WMMX_arch), 2u);
  EXPECT_EQ(valueOf(derivedFrom(WMMX2_ISA.without(WMMX_ISA)), Tag_WMMX_arch), 0u);

  EXPECT_EQ(valueOf(derivedFrom(Nothing), Tag_Virtualization_use), 0u);
  EXPECT_EQ(valueOf(derivedFrom(SAFEZONE_ISA), Tag_Virtualization_use), 1u);
  EXPECT_EQ(valueOf(derivedFrom(VIRTUALIZATION_EXTENSION), Tag_Virtualization_use), 2u);
  EXPECT_EQ(valueOf(derivedFrom(SAFEZONE_ISA | VIRTUALIZATION_EXTENSION), Tag_Virtualization_use),
            3u);

  EXPECT_EQ(valueOf(derivedFrom(Nothing), Tag_K2EE_use), 0u);
  EXPECT_EQ(valueOf(derivedFrom(K2EE_ISA), Tag_K2EE_use), 1u);

  EXPECT_EQ(valueOf(derivedFrom(Nothing), Tag_MPextension_use), 0u);
  EXPECT_EQ(valueOf(derivedFrom(MP_EXTENSIONS), Tag_MPextension_use), 1u);
}

struct UnitRow {
  FeatureSet features;
  uint32_t level;
  uint32_t architecture; // of Tag_FP_arch, without D32
  uint32_t half;         // of Tag_FP_HP_extension, then
};

constexpr FeatureSet Fused = FP16 | VFMA_EXTENSION;

// clang-format off
constexpr UnitRow UnitRows[] = {
    {Nothing,                              0, 0, 0},
    {Fused,                                0, 0, 0},
    {KCP_ISA,                              0, 0, 0},
    {HFU_ISAv1,                            1, 1, 0},
    {HFU_ISAv1 | Fused,                    1, 1, 0},
    {HFU_ISAv2,                            2, 2, 0},
    {HFU_ISAv2 | FP16,                     2, 2, 0},
    {HFU_ISAv3,                            3, 4, 0},
    {HFU_ISAv3 | FP16,                     3, 4, 1},
    {HFU_ISAv3 | VFMA_EXTENSION,           3, 4, 0},
    {HFU_ISAv3 | Fused,                    4, 6, 1},
    {HFU_ISAv5,                            5, 8, 1},
    {HFU_ISAv5 | Fused,                    5, 8, 1},
    {FP_ISA_ZEVv8,                         6, 8, 1},
    {FP_ISA_ZEVv8 | Fused,                 6, 8, 1},
    {HFU_ISAv1 | KCP_ISA,                  7, 8, 1},
    {FP_ISA_ZEVv8 | KCP_ISA,               7, 8, 1},
};
// clang-format on

TEST(TagsFromRecord, SayTheFloatingPointUnit) {
  for (const UnitRow& row : UnitRows) {
    SCOPED_TRACE(testing::Message() << std::hex << row.features.low);
    EXPECT_EQ(getFloatingPointLevel(row.features), row.level);
    const BuildAttributes attributes = derivedFrom(row.features);
    EXPECT_EQ(valueOf(attributes, Tag_FP_arch), row.architecture);
    EXPECT_EQ(valueOf(attributes, Tag_FP_HP_extension), row.half);
    const BuildAttributes wide = derivedFrom(row.features | EXTREGS_D32);
    EXPECT_EQ(valueOf(wide, Tag_FP_arch), row.architecture - (row.level >= 3 ? 1 : 0));
    EXPECT_EQ(valueOf(wide, Tag_FP_HP_extension), row.half);
    EXPECT_EQ(valueOf(derivedFrom(row.features | EXTREGS_D16), Tag_FP_arch), row.architecture);
  }
}

TEST(TagsFromRecord, SayTheVectorUnit) {
  for (const UnitRow& row : UnitRows) {
    const auto simd = [&row](FeatureSet more) {
      return valueOf(derivedFrom(row.features | more), Tag_Advanced_SIMD_arch);
    };
    SCOPED_TRACE(testing::Message() << std::hex << row.features.low);
    EXPECT_EQ(simd(Nothing), 0u);
    EXPECT_EQ(simd(V81_SIMD | HFU_HALF), 0u);
    EXPECT_EQ(simd(VECTA_ISA), row.level < 4 ? 1u : row.level == 4 ? 2u : 3u);
    const uint32_t newest = row.level < 4 ? 1 : row.level == 4 ? 2 : 4;
    EXPECT_EQ(simd(VECTA_ISA | V81_SIMD), newest);
    EXPECT_EQ(simd(VECTA_ISA | HFU_HALF), newest);
  }
}

TEST(TagsFromRecord, SayThePrecisionOfTheUnit) {
  EXPECT_EQ(valueOf(derivedFrom(HFU_SINGLE | HFU_DOUBLE), Tag_ABI_HardFP_use), 0u);
  EXPECT_EQ(valueOf(derivedFrom(HFU_SINGLE), Tag_ABI_HardFP_use), 1u);
  EXPECT_EQ(valueOf(derivedFrom(HFU_DOUBLE), Tag_ABI_HardFP_use), 2u);
  EXPECT_EQ(valueOf(derivedFrom(Nothing), Tag_ABI_HardFP_use), std::nullopt);
  BuildAttributes attributes;
  attributes.setNumericTag(Tag_ABI_HardFP_use, 3);
  attributes.deriveStandardTags();
  EXPECT_EQ(valueOf(attributes, Tag_ABI_HardFP_use), 3u);
}

TEST(TagsFromRecord, SayThatCodeDividesWhereTheArchitectureLeavesItOpen) {
  const auto division = [](FeatureSet features) {
    return valueOf(derivedFrom(features), Tag_DIV_use);
  };
  EXPECT_EQ(division(ZEV_ISAv7 | DIVIDE_EXTENSION), 2u);
  EXPECT_EQ(division(KRELL_ISAv4 | KERNEL_ISA | DIVIDE_EXTENSION), 2u);
  EXPECT_EQ(division(ZEV_ISAv7 | KRELL_DIVIDE), 0u);
  EXPECT_EQ(division(ZEV_ISAv7), 0u);
  EXPECT_EQ(division(ZEV_ISAv8 | DIVIDE_EXTENSION), 0u);
  EXPECT_EQ(division(DIVIDE_EXTENSION), 0u);
}

TEST(TagsFromRecord, SayThatCodeUsesSignalInstructionsWhereTheArchitectureHasNone) {
  const auto dsp = [](FeatureSet features) {
    return valueOf(derivedFrom(features), Tag_DSP_extension);
  };
  EXPECT_EQ(dsp(Nothing), 0u);
  EXPECT_EQ(dsp(V7EM_EXTENSION), 1u);
  EXPECT_EQ(dsp(ZEV_ISAv5 | DSP_MULT), 0u);
  EXPECT_EQ(dsp(ZEV_ISAv8 | V7EM_EXTENSION), 1u);
  EXPECT_EQ(dsp(KRELL_ISAv3 | M_PROFILE | V8M_INSNS | V7EM_EXTENSION), 1u);
  EXPECT_EQ(dsp(KRELL_ISAv4 | KERNEL_ISA | M_PROFILE | V7EM_EXTENSION), 0u) << "has it anyway";
}

TEST(TagsFromRecord, SayHowFloatingPointArgumentsArePassed) {
  const auto passing = [](FeatureSet features) {
    return valueOf(derivedFrom(features), Tag_ABI_HFU_args);
  };
  EXPECT_EQ(passing(HFU_ISAv1), 1u);
  EXPECT_EQ(passing(HFU_ISAv1 | PURE_DOUBLES), 1u);
  EXPECT_EQ(passing(HFU_ISAv1 | SOFTFP), 3u);
  EXPECT_EQ(passing(HFU_ISAv1 | SOFTFP | PURE_DOUBLES), 0u);
  EXPECT_EQ(passing(PURE_DOUBLES), 0u);
  EXPECT_EQ(passing(Nothing), 3u);
}

// ---- Flags

TEST(TagsFromRecord, SayWhetherUnalignedDataIsAccessed) {
  const auto unaligned = [](const AccessWords& access) {
    return valueOf(derivedFrom({.m_Access = access}), Tag_CPU_unaligned_access);
  };
  EXPECT_EQ(unaligned({.data = 0x4000}), 1u);
  EXPECT_EQ(unaligned({.data = 0xBFFF}), 0u);
  EXPECT_EQ(unaligned({.code = 0x4000, .readOnlyData = 0x4000, .stores = 0x4000}), 0u);
}

TEST(TagsFromRecord, SayHowDataIsAddressed) {
  EXPECT_EQ(valueOf(derivedFromFlags(0), Tag_ABI_PCS_RO_data), 0u);
  EXPECT_EQ(valueOf(derivedFromFlags(0x40000), Tag_ABI_PCS_RO_data), 1u);
  EXPECT_EQ(valueOf(derivedFromFlags(0), Tag_ABI_PCS_GOT_use), 1u);
  EXPECT_EQ(valueOf(derivedFromFlags(0x20000000), Tag_ABI_PCS_GOT_use), 2u);
  struct Row {
    uint64_t flags;
    uint32_t r9;
    uint32_t readWrite;
  };
  constexpr Row Rows[] = {
      {0, 3, 0}, {0x8, 0, 0},       {0x8000000, 3, 1}, {0x8000008, 0, 1},
      {4, 1, 2}, {0x4 | 0x8, 1, 2}, {0x8000004, 1, 2},
  };
  for (const Row& row : Rows) {
    const BuildAttributes attributes = derivedFromFlags(row.flags);
    EXPECT_EQ(valueOf(attributes, Tag_ABI_PCS_R9_use), row.r9) << row.flags;
    EXPECT_EQ(valueOf(attributes, Tag_ABI_PCS_RW_data), row.readWrite) << row.flags;
  }
}

TEST(TagsFromRecord, SayWhetherTheAlignmentOfTheStackIsKept) {
  EXPECT_EQ(valueOf(derivedFrom({.m_Stack8 = 1}), Tag_ABI_align_preserved), 0u);
  EXPECT_EQ(valueOf(derivedFrom({.m_Stack8 = 2}), Tag_ABI_align_preserved), 1u);
  EXPECT_EQ(valueOf(derivedFrom({.m_Stack8 = 3}), Tag_ABI_align_preserved), 1u);
}

TEST(TagsFromRecord, SayTheGoalsOfOptimization) {
  EXPECT_EQ(valueOf(derivedFromFlags(0), Tag_ABI_optimization_goals), 0u);
  EXPECT_EQ(valueOf(derivedFromFlags(0x10000), Tag_ABI_optimization_goals), 4u);
  EXPECT_EQ(valueOf(derivedFromFlags(0x20000), Tag_ABI_optimization_goals), 0u);
  EXPECT_EQ(valueOf(derivedFromFlags(0x30000), Tag_ABI_optimization_goals), 2u);
}

struct Model {
  uint32_t rounding;
  uint32_t denormal;
  std::optional<uint32_t> exceptions;
  uint32_t userExceptions;
  uint32_t numberModel;

  bool operator==(const Model&) const = default;
};

Model modelOf(const BuildAttributes& attributes) {
  EXPECT_EQ(valueOf(attributes, Tag_ABI_FP_optimization_goals), 0u);
  return {.rounding = valueOf(attributes, Tag_ABI_FP_rounding).value(),
          .denormal = valueOf(attributes, Tag_ABI_FP_denormal).value(),
          .exceptions = valueOf(attributes, Tag_ABI_FP_exceptions),
          .userExceptions = valueOf(attributes, Tag_ABI_FP_user_exceptions).value(),
          .numberModel = valueOf(attributes, Tag_ABI_FP_number_model).value()};
}

TEST(TagsFromRecord, SayTheFloatingPointModel) {
  const auto model = [](FeatureSet features, uint64_t flags) {
    return modelOf(derivedFrom({.m_Features = features, .m_Flags = flags}));
  };
  EXPECT_EQ(model(FZ_POSZERO, 0x700000), (Model{0, 0, 0, 0, 0}));
  EXPECT_EQ(model(PURE_DOUBLES, 0x700000), (Model{1, 1, {}, 1, 3}));
  EXPECT_EQ(model(PURE_DOUBLES, 0x300000), (Model{0, 1, 0, 1, 3}));
  EXPECT_EQ(model(PURE_DOUBLES, 0x100000), (Model{0, 1, 0, 0, 2}));
  EXPECT_EQ(model(PURE_DOUBLES, 0x500000), (Model{0, 1, 0, 0, 2}));
  EXPECT_EQ(model(PURE_DOUBLES, 0x600000), (Model{0, 2, 0, 0, 1}));
  EXPECT_EQ(model(PURE_DOUBLES, 0), (Model{0, 2, 0, 0, 1}));
  EXPECT_EQ(model(PURE_DOUBLES | FZ_POSZERO, 0), (Model{0, 0, 0, 0, 1}));
}

TEST(TagsFromRecord, LeaveExceptionsOfTheFullModelAsTheyAre) {
  BuildAttributes attributes;
  attributes.setNumericTag(Tag_ABI_FP_exceptions, 1);
  attributes.setNumericTag(Tag_ABI_FP_optimization_goals, 5);
  attributes.setFullAttr({.m_Features = PURE_DOUBLES, .m_Flags = 0x700000});
  attributes.deriveStandardTags();
  EXPECT_EQ(modelOf(attributes), (Model{1, 1, 1, 1, 3}));
}

TEST(TagsFromRecord, SayWhatTheMakersTagsSay) {
  struct Row {
    ZevTag tag;
    uint64_t flag;
    uint32_t without;
    uint32_t with;
  };
  constexpr Row Rows[] = {
      {ZevTag::Tag_ZV_interworking, 0x1, 1, 0},
      {ZevTag::Tag_ZV_cpp_exceptions, 0x4000000, 0, 1},
      {ZevTag::Tag_ZV_standardlib, 0x40000000, 0, 1},
      {ZevTag::Tag_ZV_microlib, 0x80000000, 0, 1},
  };
  for (const Row& row : Rows) {
    EXPECT_EQ(valueOf(derivedFromFlags(~row.flag), row.tag), row.without);
    EXPECT_EQ(valueOf(derivedFromFlags(row.flag), row.tag), row.with);
  }
  EXPECT_EQ(valueOf(derivedFrom(Nothing), ZevTag::Tag_ZV_mdivide), 0u);
  EXPECT_EQ(valueOf(derivedFrom(MARVELL_DIV), ZevTag::Tag_ZV_mdivide), 1u);
  EXPECT_EQ(valueOf(derivedFrom({.m_Stack8 = 2}), ZevTag::Tag_ZV_require8), 1u);
  EXPECT_EQ(valueOf(derivedFrom({.m_Stack8 = 1}), ZevTag::Tag_ZV_require8), 0u);
}

TEST(TagsFromRecord, SayTheAlignmentOf8ByteData) {
  struct Row {
    uint64_t flags;
    uint64_t stack8;
    uint32_t eba;
    uint64_t flagsAfter;
    uint32_t needed;
  };
  constexpr uint64_t To4 = 0x80000;
  constexpr uint64_t To8 = 0x800000;
  constexpr Row Rows[] = {
      {To8, 1, 0, To8, 1}, {To8, 0, 0, To8, 0}, {To8 | To4, 1, 0, To8 | To4, 1},
      {To8, 3, 0, To8, 1}, {To4, 0, 2, To4, 2}, {To4, 3, 2, To4, 2},
      {0, 0, 2, To4, 2},   {0, 1, 2, To4, 2},   {0, 2, 1, 0, 0},
      {0, 3, 1, 0, 0},
  };
  for (const Row& row : Rows) {
    const BuildAttributes attributes = derivedFrom({.m_Flags = row.flags, .m_Stack8 = row.stack8});
    EXPECT_EQ(valueOf(attributes, ZevTag::Tag_ZV_eba), row.eba);
    EXPECT_EQ(attributes.getFullAttr().m_Flags, row.flagsAfter);
    EXPECT_EQ(valueOf(attributes, Tag_ABI_align_needed), row.needed);
  }
}

TEST(TagsFromRecord, SayWhichPreloadsAreUsed) {
  struct Row {
    FeatureSet features;
    std::optional<uint32_t> preload;
  };
  const Row rows[] = {
      {Nothing, {}},
      {PLD7, 8},
      {PLD9, 6},
      {PLD1, 1},
      {PLD2, 2},
      {PLD3, 3},
      {PLD4, 4},
      {PLD5, 5},
      {PLD6, 7},
      {PLD8, 9},
      {PLD9.without(PLD7), {}},
      {PLD8.without(PLD6), {}},
  };
  for (const Row& row : rows)
    EXPECT_EQ(valueOf(derivedFrom(row.features), ZevTag::Tag_ZV_pld), row.preload)
        << std::hex << row.features.low;
}

TEST(TagsFromRecord, SayTheSizesOfDataOnlyWhereTheyAreKnown) {
  const BuildAttributes none = derivedFromFlags(~uint64_t{0x1800});
  EXPECT_FALSE(none.hasTag(Tag_ABI_enum_size));
  EXPECT_FALSE(none.hasTag(Tag_ABI_PCS_wchar_t));
  EXPECT_EQ(valueOf(derivedFromFlags(0x800), Tag_ABI_enum_size), 2u);
  EXPECT_EQ(valueOf(derivedFromFlags(0x1000), Tag_ABI_PCS_wchar_t), 4u);
}

TEST(TagsFromRecord, AskForMoreThanThePublicAbiWhereCodeInterworksOrDivides) {
  const auto entry = [](const BuildAttributes& attributes) {
    CompatibilityTag result;
    if (attributes.getCompatibilityTagCount() == 1) attributes.getCompatibilityTag(0, result);
    return result;
  };
  constexpr uint64_t Interworks = 0x1;
  const CompatibilityTag zev = {2, "ZEV"};
  EXPECT_EQ(entry(derivedFromFlags(0)), zev);
  EXPECT_EQ(entry(derivedFromFlags(Interworks)), CompatibilityTag());
  EXPECT_EQ(entry(derivedFrom({.m_Features = MARVELL_DIV, .m_Flags = Interworks})), zev);

  BuildAttributes attributes;
  attributes.addCompatibilityTag(2, "ZEV");
  attributes.setFullAttr({.m_Flags = Interworks});
  attributes.deriveStandardTags();
  EXPECT_FALSE(attributes.hasTag(Tag_compatibility));
}

TEST(TagsFromRecord, LeaveTheRecordAsItIs) {
  constexpr FullAttr Record = {.m_Features = ZEV_ISAv3 | KCP_ISA | HFU_ISAv1,
                               .m_TargetClass = {1, 2},
                               .m_Access = {1, 2, 3, 4},
                               .m_Flags = Flag_Align8 | Flag_StackChecked,
                               .m_Stack8 = 3,
                               .m_AbiLevel = 7};
  EXPECT_EQ(derivedFrom(Record).getFullAttr(), Record);
}

TEST(TagsFromRecord, LeaveTheTagsThatRecordsDoNotHave) {
  BuildAttributes attributes;
  for (const uint32_t tag :
       {Tag_PCS_config, Tag_ABI_WMMX_args, Tag_ABI_FP_16bit_format, Tag_nodefaults})
    attributes.setNumericTag(tag, 77);
  attributes.setNumericTag(ZevTag::Tag_ZV_version, 77);
  attributes.setNumericTag(ZevTag::Tag_ZV_full_isa, 77);
  attributes.setStringTag(Tag_CPU_name, "name");
  attributes.deriveStandardTags();
  for (const uint32_t tag :
       {Tag_PCS_config, Tag_ABI_WMMX_args, Tag_ABI_FP_16bit_format, Tag_nodefaults})
    EXPECT_EQ(valueOf(attributes, tag), 77u) << tag;
  EXPECT_EQ(valueOf(attributes, ZevTag::Tag_ZV_version), 77u);
  EXPECT_EQ(valueOf(attributes, ZevTag::Tag_ZV_full_isa), 77u);
  EXPECT_EQ(attributes.getStringTag(Tag_CPU_name), "name");
}

} // namespace
} // namespace elfext
