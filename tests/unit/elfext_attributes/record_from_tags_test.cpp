// SPDX-License-Identifier: Apache-2.0
//
// The record that follows from tags, rule by rule: architecture, instruction sets in use,
// extensions, floating point, accesses. Rules come in an order, and later ones take back what
// earlier ones gave; each is tested where it makes the difference.

#include "elfext/interface/build_attributes.h"
#include "elfext/interface/target_table.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <initializer_list>
#include <optional>
#include <utility>

namespace elfext {
namespace {

using namespace features;

using Numbers = std::initializer_list<std::pair<uint32_t, uint32_t>>;
using ZevNumbers = std::initializer_list<std::pair<ZevTag, uint32_t>>;

BuildAttributes with(Numbers numbers, ZevNumbers zevNumbers = {}) {
  BuildAttributes attributes;
  for (const auto& [tag, value] : numbers)
    attributes.setNumericTag(tag, value);
  for (const auto& [tag, value] : zevNumbers)
    attributes.setNumericTag(tag, value);
  return attributes;
}

FullAttr recordOf(const BuildAttributes& attributes) {
  attributes.updateFullAttr();
  return attributes.getFullAttr();
}

FullAttr recordOf(Numbers numbers, ZevNumbers zevNumbers = {}) {
  return recordOf(with(numbers, zevNumbers));
}

FeatureSet featuresOf(Numbers numbers, ZevNumbers zevNumbers = {}) {
  return recordOf(numbers, zevNumbers).m_Features;
}

uint64_t flagsOf(Numbers numbers, ZevNumbers zevNumbers = {}) {
  return recordOf(numbers, zevNumbers).m_Flags;
}

FeatureSet architecture(uint32_t number, uint32_t profile = 0) {
  return findTargetForArchitecture(number, profile).features;
}

// What is left of the default flags where no tag says more: no alignment to 8, no word about it.
constexpr uint64_t BareFlags = 0x818069 & ~uint64_t{0x800000};

// Keeps the levels of the instruction sets as the other tags have them.
constexpr std::pair<ZevTag, uint32_t> NoFullIsa = {ZevTag::Tag_ZV_full_isa, 0};

// ---- Without tags

TEST(RecordFromTags, StartsFromTheDefaultOne) {
  EXPECT_EQ(recordOf({}), (FullAttr{.m_Features = {},
                                    .m_TargetClass = {0x10000000, 0},
                                    .m_Access = {0x290, 0x290, 0x290, 0x290},
                                    .m_Flags = BareFlags,
                                    .m_Stack8 = 0,
                                    .m_AbiLevel = 2}));
}

TEST(RecordFromTags, ForgetsWhatItWas) {
  BuildAttributes attributes = with({{Tag_ABI_optimization_goals, 2}});
  attributes.setFullAttr({.m_Features = Defined,
                          .m_TargetClass = {5, 5},
                          .m_Access = AccessWords::all(0xFFFF),
                          .m_Flags = ~uint64_t{0},
                          .m_Stack8 = 3,
                          .m_AbiLevel = 9});
  EXPECT_EQ(recordOf(attributes), recordOf({{Tag_ABI_optimization_goals, 2}}));
}

// ---- The target

TEST(RecordFromTags, HasTheFeaturesOfTheArchitecture) {
  for (uint32_t number = 0; number <= 18; ++number) {
    for (const uint32_t profile : {0u, 65u, 77u, 82u, 83u}) {
      const FullAttr record = recordOf({{Tag_CPU_arch, number},
                                        {Tag_CPU_arch_profile, profile},
                                        {Tag_ZEV_ISA_use, 1},
                                        {Tag_KRELL_ISA_use, 1}},
                                       {NoFullIsa});
      const Target target = findTargetForArchitecture(number, profile);
      FeatureSet expected = target.features;
      // No signal instructions but those of the architecture.
      EXPECT_EQ(record.m_Features, expected) << number << " " << profile;
      EXPECT_EQ(record.m_TargetClass, target.targetClass);
    }
  }
}

TEST(RecordFromTags, HasOnlyTheInstructionSetsInUse) {
  constexpr std::pair<uint32_t, uint32_t> Arch = {Tag_CPU_arch, 6};
  const auto levels = [&](uint32_t zev, uint32_t krell) {
    return featuresOf({Arch, {Tag_ZEV_ISA_use, zev}, {Tag_KRELL_ISA_use, krell}}, {NoFullIsa});
  };
  EXPECT_EQ(levels(1, 1), architecture(6));
  EXPECT_EQ(levels(0, 1), architecture(6).without(ZEV_ISAv8));
  EXPECT_EQ(levels(1, 0), architecture(6).without(KRELL_ISAv5));
  EXPECT_EQ(levels(2, 3), architecture(6));
  const FeatureSet neither = architecture(6).without(ZEV_ISAv8 | KRELL_ISAv5);
  EXPECT_EQ(levels(0, 0), neither);
  EXPECT_EQ(featuresOf({Arch}), neither);
}

TEST(RecordFromTags, HasTheWideInstructionSetOfOneArchitecture) {
  const FullAttr wide = recordOf({{Tag_CPU_arch, 14}, {Tag_Z64_ISA_use, 1}});
  EXPECT_EQ(wide.m_Features, Z64_ISA | A_PROFILE);
  EXPECT_EQ(wide.m_Access, AccessWords::all(0xC290));
  EXPECT_EQ(featuresOf({{Tag_CPU_arch, 14}, {Tag_CPU_arch_profile, 'R'}, {Tag_Z64_ISA_use, 2}}),
            Z64_ISA | A_PROFILE);
  EXPECT_EQ(featuresOf({{Tag_CPU_arch, 15}, {Tag_Z64_ISA_use, 1}}), FeatureSet());
  EXPECT_EQ(recordOf({{Tag_CPU_arch, 15}, {Tag_Z64_ISA_use, 1}}).m_Access,
            AccessWords::all(0xC290));
  EXPECT_EQ(featuresOf({{Tag_CPU_arch, 14}, {Tag_Z64_ISA_use, 0}}),
            architecture(14).without(ZEV_ISAv8 | KRELL_ISAv5));
  EXPECT_EQ(featuresOf({{Tag_Z64_ISA_use, 1}}), FeatureSet());
}

TEST(RecordFromTags, HasTheAccessesOfTheArchitecture) {
  const auto access = [](uint32_t number) { return recordOf({{Tag_CPU_arch, number}}).m_Access; };
  EXPECT_EQ(access(0), AccessWords::all(0x210));
  EXPECT_EQ(recordOf({}).m_Access, AccessWords::all(0x290));
  for (uint32_t number = 1; number <= 5; ++number)
    EXPECT_EQ(access(number), AccessWords::all(0x290)) << number;
  for (uint32_t number = 6; number <= 17; ++number)
    EXPECT_EQ(access(number), AccessWords::all(0xC290)) << number;
  EXPECT_EQ(access(18), AccessWords::all(0x290));
  EXPECT_EQ(access(0x10006), AccessWords::all(0x290));
}

// ---- Other architectures

FullAttr recordForBoth(uint32_t number, const AlsoCompatibilityTag& entry) {
  BuildAttributes attributes =
      with({{Tag_CPU_arch, number}, {Tag_ZEV_ISA_use, 1}, {Tag_KRELL_ISA_use, 1}}, {NoFullIsa});
  attributes.addAlsoCompatibilityTag(entry);
  return recordOf(attributes);
}

TEST(RecordFromTags, IsNarrowedByOtherArchitectures) {
  const FullAttr narrowed = recordForBoth(6, alsoForArchitecture(11));
  EXPECT_EQ(narrowed.m_Features, KRELL_ISAv3);
  EXPECT_EQ(narrowed.m_Access, AccessWords::all(0xC290));
  EXPECT_EQ(recordForBoth(6, alsoForArchitecture(2)).m_Features, ZEV_ISAv4 | KRELL_ISAv1);
  EXPECT_EQ(recordForBoth(6, alsoForArchitecture(2)).m_Access, AccessWords::all(0x290));
  EXPECT_EQ(recordForBoth(6, alsoForArchitecture(0)).m_Features, FeatureSet());
  EXPECT_EQ(recordForBoth(6, alsoForArchitecture(0)).m_Access, AccessWords::all(0x210));
  EXPECT_EQ(recordForBoth(14, alsoForArchitecture(15)).m_Features,
            architecture(14) & architecture(15));
}

TEST(RecordFromTags, IsNarrowedByEachOtherArchitecture) {
  BuildAttributes attributes = with({{Tag_CPU_arch, 6}, {Tag_KRELL_ISA_use, 1}}, {NoFullIsa});
  attributes.addAlsoCompatibilityTag(alsoForArchitecture(11));
  attributes.addAlsoCompatibilityTag(alsoForArchitecture(2));
  EXPECT_EQ(recordOf(attributes).m_Features, KRELL_ISAv1);
}

TEST(RecordFromTags, IsNotNarrowedByOtherTags) {
  EXPECT_EQ(recordForBoth(6, {Tag_CPU_arch_profile, 11, {}}).m_Features, architecture(6));
  EXPECT_EQ(recordForBoth(6, {Tag_CPU_arch, {}, "11"}).m_Features, architecture(6));
}

TEST(RecordFromTags, IsNarrowedBeforeExtensionsCome) {
  BuildAttributes attributes = with({{Tag_CPU_arch, 6}, {Tag_K2EE_use, 1}}, {NoFullIsa});
  attributes.addAlsoCompatibilityTag(alsoForArchitecture(0));
  EXPECT_EQ(recordOf(attributes).m_Features, K2EE_ISA);
}

// ---- Extensions

// What the tag of this value does to an architecture that has the feature, or hasn't.
std::optional<bool> effect(uint32_t tag, std::optional<uint32_t> value, FeatureSet feature,
                           uint32_t architectureWithIt) {
  BuildAttributes attributes = with({{Tag_CPU_arch, architectureWithIt}});
  if (value) attributes.setNumericTag(tag, *value);
  const bool isKept = recordOf(attributes).m_Features.contains(feature);
  attributes.removeTag(Tag_CPU_arch);
  const bool isAdded = recordOf(attributes).m_Features.contains(feature);
  if (isKept != isAdded) return {};
  return isKept;
}

TEST(RecordFromTags, HasOrLacksExtensionsAsTagsSay) {
  const auto wmmx = [](uint32_t value) { return featuresOf({{Tag_WMMX_arch, value}}); };
  EXPECT_EQ(wmmx(0), FeatureSet());
  EXPECT_EQ(wmmx(1), WMMX_ISA);
  EXPECT_EQ(wmmx(2), WMMX2_ISA);
  EXPECT_EQ(wmmx(3), WMMX2_ISA);

  const auto simd = [](uint32_t value) { return featuresOf({{Tag_Advanced_SIMD_arch, value}}); };
  EXPECT_EQ(simd(0), FeatureSet());
  EXPECT_EQ(simd(1), VECTA_ISA);
  EXPECT_EQ(simd(4), VECTA_ISA);

  const auto k2ee = [](uint32_t value) { return featuresOf({{Tag_K2EE_use, value}}); };
  EXPECT_EQ(k2ee(0), FeatureSet());
  EXPECT_EQ(k2ee(1), K2EE_ISA);
  EXPECT_EQ(k2ee(2), K2EE_ISA);

  const auto multi = [](uint32_t value) { return featuresOf({{Tag_MPextension_use, value}}); };
  EXPECT_EQ(multi(0), FeatureSet());
  EXPECT_EQ(multi(1), MP_EXTENSIONS);
  EXPECT_EQ(multi(2), MP_EXTENSIONS);
}

TEST(RecordFromTags, HasOrLacksVirtualizationBitByBit) {
  const auto use = [](uint32_t value) { return featuresOf({{Tag_Virtualization_use, value}}); };
  EXPECT_EQ(use(0), FeatureSet());
  EXPECT_EQ(use(1), SAFEZONE_ISA);
  EXPECT_EQ(use(2), VIRTUALIZATION_EXTENSION);
  EXPECT_EQ(use(3), SAFEZONE_ISA | VIRTUALIZATION_EXTENSION);
  EXPECT_EQ(use(4), FeatureSet());
  // Architecture 7 has it.
  EXPECT_EQ(effect(Tag_Virtualization_use, {}, SAFEZONE_ISA, 7), std::nullopt);
  EXPECT_EQ(effect(Tag_Virtualization_use, 0, SAFEZONE_ISA, 7), false);
  EXPECT_EQ(effect(Tag_Virtualization_use, 1, SAFEZONE_ISA, 7), true);
}

TEST(RecordFromTags, HasDivisionWhereATagAsksForIt) {
  // Architecture 14 has it.
  EXPECT_EQ(effect(Tag_DIV_use, {}, DIVIDE_EXTENSION, 14), std::nullopt);
  EXPECT_EQ(effect(Tag_DIV_use, 0, DIVIDE_EXTENSION, 14), std::nullopt);
  EXPECT_EQ(effect(Tag_DIV_use, 1, DIVIDE_EXTENSION, 14), std::nullopt);
  EXPECT_EQ(effect(Tag_DIV_use, 2, DIVIDE_EXTENSION, 14), true);
}

// ---- Floating point

TEST(RecordFromTags, HasTheFloatingPointUnit) {
  constexpr FeatureSet Both = HFU_SINGLE | HFU_DOUBLE;
  constexpr FeatureSet Fused = VFMA_EXTENSION | FP16;
  const auto unit = [](uint32_t value) { return featuresOf({{Tag_FP_arch, value}}); };
  EXPECT_EQ(unit(0), FeatureSet());
  EXPECT_EQ(unit(1), HFU_ISAv1 | EXTREGS_D16 | Both);
  EXPECT_EQ(unit(2), HFU_ISAv2 | EXTREGS_D16 | Both);
  EXPECT_EQ(unit(3), HFU_ISAv3 | EXTREGS_D32 | Both);
  EXPECT_EQ(unit(4), HFU_ISAv3 | EXTREGS_D16 | Both);
  EXPECT_EQ(unit(5), HFU_ISAv3 | EXTREGS_D32 | Both | Fused);
  EXPECT_EQ(unit(6), HFU_ISAv3 | EXTREGS_D16 | Both | Fused);
  EXPECT_EQ(unit(7), FP_ISA_ZEVv8 | EXTREGS_D32 | Both | Fused);
  EXPECT_EQ(unit(8), HFU_ISAv5 | EXTREGS_D16 | Both | Fused);
  EXPECT_EQ(unit(9), FeatureSet());
  EXPECT_EQ(unit(255), FeatureSet());
}

TEST(RecordFromTags, HasThePrecisionOfTheUnit) {
  constexpr FeatureSet Both = HFU_SINGLE | HFU_DOUBLE;
  for (uint32_t unit = 0; unit <= 9; ++unit) {
    const auto precision = [&](uint32_t use) {
      return featuresOf({{Tag_FP_arch, unit}, {Tag_ABI_HardFP_use, use}}) & Both;
    };
    const bool hasUnit = unit >= 1 && unit <= 8;
    EXPECT_EQ(precision(0), hasUnit ? Both : FeatureSet());
    EXPECT_EQ(precision(1), hasUnit ? HFU_SINGLE : FeatureSet());
    EXPECT_EQ(precision(2), hasUnit ? HFU_DOUBLE : FeatureSet());
    EXPECT_EQ(precision(3), hasUnit ? Both : FeatureSet());
  }
  EXPECT_EQ(featuresOf({{Tag_ABI_HardFP_use, 1}}), FeatureSet());
}

TEST(RecordFromTags, HasHalvesWhereTheUnitMayHaveThem) {
  for (uint32_t unit = 0; unit <= 9; ++unit) {
    const auto hasHalves = [&](uint32_t extension) {
      return featuresOf({{Tag_FP_arch, unit}, {Tag_FP_HP_extension, extension}}).contains(FP16);
    };
    const bool always = unit >= 5 && unit <= 8;
    EXPECT_EQ(hasHalves(0), always) << unit;
    EXPECT_EQ(hasHalves(1), always || unit == 3 || unit == 4) << unit;
    EXPECT_EQ(hasHalves(2), always) << unit;
  }
  EXPECT_EQ(featuresOf({{Tag_FP_HP_extension, 1}}), FeatureSet());
}

TEST(RecordFromTags, HasTheNewestVectorInstructions) {
  const auto has = [](uint32_t number, uint32_t unit, uint32_t simd) {
    return featuresOf({{Tag_CPU_arch, number}, {Tag_FP_arch, unit}, {Tag_Advanced_SIMD_arch, simd}})
        .contains(V81_SIMD);
  };
  EXPECT_TRUE(has(14, 8, 4));
  EXPECT_TRUE(has(14, 8, 5));
  EXPECT_FALSE(has(14, 8, 3));
  EXPECT_FALSE(has(14, 7, 4));
  EXPECT_FALSE(has(15, 8, 4));
}

// ---- Passing of arguments, and signal instructions

TEST(RecordFromTags, PassesFloatingPointInIntegersUnlessToldOtherwise) {
  const auto isSoft = [](Numbers numbers) { return featuresOf(numbers).contains(SOFTFP); };
  EXPECT_FALSE(isSoft({}));
  EXPECT_FALSE(isSoft({{Tag_ABI_FP_number_model, 0}}));
  EXPECT_TRUE(isSoft({{Tag_ABI_FP_number_model, 1}}));
  EXPECT_TRUE(isSoft({{Tag_ABI_FP_number_model, 3}, {Tag_ABI_HFU_args, 0}}));
  EXPECT_FALSE(isSoft({{Tag_ABI_FP_number_model, 1}, {Tag_ABI_HFU_args, 1}}));
  EXPECT_TRUE(isSoft({{Tag_ABI_FP_number_model, 1}, {Tag_ABI_HFU_args, 2}}));
  EXPECT_FALSE(isSoft({{Tag_ABI_FP_number_model, 0}, {Tag_ABI_HFU_args, 3}}));
}

TEST(RecordFromTags, HasSignalInstructionsByTheirTagOrTheArchitecture) {
  EXPECT_EQ(featuresOf({{Tag_DSP_extension, 1}}), DSP_MULT | V7EM_EXTENSION);
  EXPECT_EQ(featuresOf({{Tag_DSP_extension, 0}}), FeatureSet());
  EXPECT_EQ(featuresOf({{Tag_DSP_extension, 2}}), FeatureSet());
  for (const uint32_t value : {0u, 1u, 2u}) {
    const FeatureSet features = featuresOf({{Tag_CPU_arch, 13}, {Tag_DSP_extension, value}});
    EXPECT_TRUE(features.contains(DSP_MULT | V7EM_EXTENSION)) << value;
  }
  EXPECT_TRUE(featuresOf({{Tag_CPU_arch, 4}, {Tag_DSP_extension, 0}}).contains(DSP_MULT));
}

// ---- Accesses and addressing

TEST(RecordFromTags, AccessesUnalignedDataAsTheTagSays) {
  const auto access = [](uint32_t number, uint32_t value) {
    return recordOf({{Tag_CPU_arch, number}, {Tag_CPU_unaligned_access, value}}).m_Access;
  };
  EXPECT_EQ(access(6, 0), AccessWords::all(0x290));
  EXPECT_EQ(access(6, 1), AccessWords::all(0xC290));
  EXPECT_EQ(access(6, 2), AccessWords::all(0xC290));
  EXPECT_EQ(access(4, 0), AccessWords::all(0x290));
  EXPECT_EQ(access(4, 1), AccessWords::all(0xC290));
  EXPECT_EQ(access(4, 2), AccessWords::all(0x290));
  EXPECT_EQ(recordOf({{Tag_CPU_unaligned_access, 1}}).m_Access, AccessWords::all(0xC290));
}

// The bits that say how data is addressed.
constexpr uint64_t Ropi = 0x40000;
constexpr uint64_t Rwpi = 0x4;
constexpr uint64_t UsesV6 = 0x8;
constexpr uint64_t Fpic = 0x8000000;
constexpr uint64_t Indirect = 0x20000000;
constexpr uint64_t Addressing = Ropi | Rwpi | UsesV6 | Fpic | Indirect;

uint64_t addressing(std::optional<uint32_t> readOnly, std::optional<uint32_t> readWrite,
                    std::optional<uint32_t> got, std::optional<uint32_t> r9) {
  BuildAttributes attributes;
  const auto put = [&attributes](uint32_t tag, std::optional<uint32_t> value) {
    if (value) attributes.setNumericTag(tag, *value);
  };
  put(Tag_ABI_PCS_RO_data, readOnly);
  put(Tag_ABI_PCS_RW_data, readWrite);
  put(Tag_ABI_PCS_GOT_use, got);
  put(Tag_ABI_PCS_R9_use, r9);
  return recordOf(attributes).m_Flags & Addressing;
}

TEST(RecordFromTags, AddressesDataAsTheTagsSay) {
  struct Row {
    std::optional<uint32_t> readOnly;
    std::optional<uint32_t> readWrite;
    std::optional<uint32_t> got;
    std::optional<uint32_t> r9;
    uint64_t flags;
  };
  // clang-format off
  const Row rows[] = {
      {{}, {}, {}, {}, UsesV6},
      // Read-only data.
      {0,  {}, {}, {}, UsesV6},
      {1,  {}, {}, {}, UsesV6 | Ropi},
      {2,  {}, {}, {}, UsesV6},
      // Data, by way of a register, or of a table.
      {{}, 0,  {}, {}, UsesV6},
      {{}, 1,  {}, {}, UsesV6 | Fpic},
      {0,  1,  {}, {}, UsesV6 | Fpic},
      {1,  1,  {}, {}, UsesV6 | Fpic | Ropi},
      {2,  1,  2,  {}, UsesV6 | Fpic | Indirect},
      {1,  1,  1,  {}, UsesV6 | Fpic | Ropi},
      {1,  1,  2,  {}, UsesV6 | Fpic | Ropi | Indirect},
      {1,  1,  2,  3,  Fpic | Ropi | Indirect},
      {{}, 2,  {}, {}, UsesV6},
      {{}, 2,  {}, 1,  Rwpi},
      {1,  2,  2,  1,  Rwpi | Ropi | Indirect},
      {{}, 2,  {}, 2,  0},
      {{}, 2,  {}, 0,  UsesV6},
      {{}, 3,  {}, {}, UsesV6},
      {1,  3,  2,  3,  Ropi | Indirect},
      {{}, 4,  {}, {}, UsesV6},
      // The table.
      {{}, {}, 0,  {}, UsesV6},
      {{}, {}, 1,  {}, UsesV6},
      {{}, {}, 2,  {}, UsesV6 | Indirect},
      {{}, {}, 3,  {}, UsesV6},
      // The register.
      {{}, {}, {}, 0,  UsesV6},
      {{}, {}, {}, 1,  0},
      {{}, {}, {}, 3,  0},
  };
  // clang-format on
  for (const Row& row : rows) {
    const auto shown = [](std::optional<uint32_t> value) { return value ? int(*value) : -1; };
    EXPECT_EQ(addressing(row.readOnly, row.readWrite, row.got, row.r9), row.flags)
        << shown(row.readOnly) << " " << shown(row.readWrite) << " " << shown(row.got) << " "
        << shown(row.r9);
  }
}

// ---- Alignment and optimization

TEST(RecordFromTags, AlignsAsTheTagsOfThePublicAbiSay) {
  struct Row {
    uint32_t needed;
    uint64_t flags;
    uint64_t stack8;
  };
  constexpr Row Rows[] = {{0, 0, 0}, {1, 0x800000, 1}, {2, 0x80000, 0}, {3, 0, 0}};
  for (const Row& row : Rows) {
    const FullAttr record = recordOf({{Tag_ABI_align_needed, row.needed}});
    EXPECT_EQ(record.m_Flags, BareFlags | row.flags);
    EXPECT_EQ(record.m_Stack8, row.stack8);
  }
  const auto preserves = [](uint32_t value) {
    return recordOf({{Tag_ABI_align_preserved, value}}).m_Stack8;
  };
  EXPECT_EQ(preserves(0), 0u);
  EXPECT_EQ(preserves(1), 2u);
  EXPECT_EQ(preserves(2), 2u);
  EXPECT_EQ(preserves(3), 0u);
}

TEST(RecordFromTags, IsOptimizedAsTheTagSays) {
  for (const uint32_t goals : {0u, 3u, 4u, 5u})
    EXPECT_EQ(flagsOf({{Tag_ABI_optimization_goals, goals}}), BareFlags) << goals;
  for (const uint32_t goals : {1u, 2u})
    EXPECT_EQ(flagsOf({{Tag_ABI_optimization_goals, goals}}), BareFlags | 0x20000) << goals;
}

// ---- Floating-point model

struct Model {
  std::optional<uint32_t> model;
  std::optional<uint32_t> rounding;
  std::optional<uint32_t> exceptions;
  std::optional<uint32_t> denormal;
  uint64_t ieee;
  FeatureSet features;
};

TEST(RecordFromTags, HasTheFloatingPointModel) {
  constexpr uint64_t Full = 0x700000;
  constexpr uint64_t Part = 0x300000;
  constexpr uint64_t Java = 0x100000;
  constexpr FeatureSet Pure = PURE_DOUBLES;
  // clang-format off
  const Model rows[] = {
      {{}, {}, {}, {}, 0,    {}},
      {{}, 1,  1,  1,  0,    {}},
      {0,  1,  1,  1,  0,    {}},
      {1,  1,  {}, {}, Full, Pure},
      {2,  1,  1,  1,  Full, Pure},
      {3,  1,  0,  1,  Full, Pure},
      {1,  0,  1,  {}, Part, Pure},
      {1,  2,  1,  1,  Part, Pure},
      {3,  {}, {}, {}, Part, Pure},
      {3,  0,  0,  1,  Part, Pure},
      {1,  {}, {}, 1,  Java, Pure},
      {2,  0,  2,  1,  Java, Pure},
      {1,  {}, {}, {}, 0,    Pure | FZ_POSZERO},
      {1,  0,  0,  0,  0,    Pure | FZ_POSZERO},
      {2,  0,  0,  2,  0,    Pure},
      {4,  0,  0,  3,  0,    Pure},
  };
  // clang-format on
  for (const Model& row : rows) {
    BuildAttributes attributes = with({{Tag_ABI_HFU_args, 1}});
    const auto put = [&attributes](uint32_t tag, std::optional<uint32_t> value) {
      if (value) attributes.setNumericTag(tag, *value);
    };
    put(Tag_ABI_FP_number_model, row.model);
    put(Tag_ABI_FP_rounding, row.rounding);
    put(Tag_ABI_FP_exceptions, row.exceptions);
    put(Tag_ABI_FP_denormal, row.denormal);
    const FullAttr record = recordOf(attributes);
    EXPECT_EQ(record.m_Flags, BareFlags | row.ieee);
    EXPECT_EQ(record.m_Features, row.features);
  }
}

// ---- The maker's tags

// What each value of a tag gives, on top of the other tags; nullopt stands for no tag.
template <class Function>
void expectEach(ZevTag tag, Numbers numbers, Function part,
                std::initializer_list<std::pair<std::optional<uint32_t>, uint64_t>> rows) {
  for (const auto& [value, expected] : rows) {
    BuildAttributes attributes;
    if (value) attributes.setNumericTag(tag, *value);
    for (const auto& [other, otherValue] : numbers)
      attributes.setNumericTag(other, otherValue);
    EXPECT_EQ(part(recordOf(attributes)), expected)
        << static_cast<uint32_t>(tag) << " " << (value ? int(*value) : -1);
  }
}

constexpr auto FlagsIn(uint64_t mask) {
  return [mask](const FullAttr& record) { return record.m_Flags & mask; };
}

TEST(RecordFromTags, HasTheFlagsOfTheMakersTags) {
  expectEach(ZevTag::Tag_ZV_interworking, {}, FlagsIn(0x3), {{{}, 1}, {0, 1}, {1, 2}, {2, 1}});
  expectEach(ZevTag::Tag_ZV_cpp_exceptions, {}, FlagsIn(0x4000000),
             {{{}, 0}, {0, 0}, {1, 0x4000000}, {2, 0}});
  expectEach(ZevTag::Tag_ZV_standardlib, {}, FlagsIn(0x40000000),
             {{{}, 0}, {0, 0}, {1, 0x40000000}, {2, 0}});
  expectEach(ZevTag::Tag_ZV_microlib, {}, FlagsIn(0x80000000),
             {{{}, 0}, {0, 0}, {1, 0x80000000}, {2, 0}});
}

TEST(RecordFromTags, HasTheDivisionOfTheMaker) {
  const auto has = [](const FullAttr& record) -> uint64_t {
    return record.m_Features.contains(MARVELL_DIV);
  };
  expectEach(ZevTag::Tag_ZV_mdivide, {}, has, {{{}, 0}, {0, 0}, {1, 1}, {2, 0}});
}

TEST(RecordFromTags, LetsTheMakersTagsDecideOfAlignment) {
  constexpr uint64_t To4 = 0x80000;
  constexpr uint64_t To8 = 0x800000;
  const auto stack8 = [](const FullAttr& record) { return record.m_Stack8; };
  // Whatever the tag of the public ABI says.
  expectEach(ZevTag::Tag_ZV_require8, {{Tag_ABI_align_needed, 1}}, stack8,
             {{{}, 1}, {0, 1}, {1, 0}, {2, 1}});
  expectEach(ZevTag::Tag_ZV_require8, {{Tag_ABI_align_needed, 0}}, stack8,
             {{{}, 0}, {0, 1}, {1, 0}, {2, 0}});
  expectEach(ZevTag::Tag_ZV_eba, {{Tag_ABI_align_needed, 1}}, FlagsIn(To4 | To8),
             {{{}, To8}, {0, To8}, {1, 0}, {2, To4}, {3, To8}});
  expectEach(ZevTag::Tag_ZV_eba, {{Tag_ABI_align_needed, 0}}, FlagsIn(To4 | To8),
             {{{}, 0}, {0, To8}, {1, 0}, {2, To4}, {3, 0}});
  expectEach(ZevTag::Tag_ZV_eba, {{Tag_ABI_align_needed, 2}}, FlagsIn(To4 | To8),
             {{{}, To4}, {0, To8}, {1, 0}, {2, To4}, {3, To4}});
}

TEST(RecordFromTags, HasThePreloads) {
  constexpr FeatureSet Expected[] = {{}, PLD1, PLD2, PLD3, PLD4, PLD5, PLD9, PLD6, PLD7, PLD8, {}};
  for (uint32_t value = 0; value < std::size(Expected); ++value)
    EXPECT_EQ(featuresOf({}, {{ZevTag::Tag_ZV_pld, value}}), Expected[value]) << value;
}

TEST(RecordFromTags, HasAllInstructionsUnlessToldOtherwise) {
  const auto features = [](std::optional<uint32_t> full, Numbers numbers) {
    BuildAttributes attributes = with(numbers);
    if (full) attributes.setNumericTag(ZevTag::Tag_ZV_full_isa, *full);
    return recordOf(attributes).m_Features;
  };
  for (const std::optional<uint32_t> full : {std::optional<uint32_t>(), std::optional(1u)}) {
    EXPECT_EQ(features(full, {}), FeatureSet());
    EXPECT_EQ(features(full, {{Tag_ZEV_ISA_use, 1}}), ZEV_ISAv8);
    EXPECT_EQ(features(full, {{Tag_KRELL_ISA_use, 1}}), KRELL_ISAv5);
    EXPECT_EQ(features(full, {{Tag_ZEV_ISA_use, 0}, {Tag_KRELL_ISA_use, 0}}),
              ZEV_ISAv8 | KRELL_ISAv5)
        << "even where they are not used";
  }
  for (const uint32_t full : {0u, 2u})
    EXPECT_EQ(features(full, {{Tag_ZEV_ISA_use, 1}, {Tag_KRELL_ISA_use, 1}}), FeatureSet());
}

TEST(RecordFromTags, HasTheSizesOfData) {
  for (uint32_t value = 0; value <= 5; ++value) {
    EXPECT_EQ(flagsOf({{Tag_ABI_enum_size, value}}), BareFlags | (value == 2 ? 0x800 : 0));
    EXPECT_EQ(flagsOf({{Tag_ABI_PCS_wchar_t, value}}), BareFlags | (value == 4 ? 0x1000 : 0));
  }
}

// ---- Other tags

TEST(RecordFromTags, DoesNotLookAtOtherTags) {
  BuildAttributes attributes = with({{Tag_PCS_config, 1},
                                     {Tag_ABI_FP_user_exceptions, 1},
                                     {Tag_ABI_WMMX_args, 1},
                                     {Tag_ABI_FP_optimization_goals, 1},
                                     {Tag_ABI_FP_16bit_format, 1},
                                     {Tag_nodefaults, 1},
                                     {48, 1}},
                                    {{ZevTag::Tag_ZV_version, 1}});
  attributes.setStringTag(Tag_CPU_raw_name, "NCores-1");
  attributes.setStringTag(Tag_CPU_name, "NCores-1");
  attributes.addCompatibilityTag(1, "x");
  EXPECT_EQ(recordOf(attributes), recordOf({}));
}

} // namespace
} // namespace elfext
