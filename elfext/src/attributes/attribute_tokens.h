// SPDX-License-Identifier: Apache-2.0
//
// The vocabulary of attribute texts, in the order in which it is printed.
//
// The tables are the format: archives that were written with them are read for ever, so a row's
// token and bits never change, and the order of rows decides which of several tokens is printed.
// Compile-time checks below hold the order.
#pragma once

#include "elfext/interface/full_attr.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace elfext {

enum class TokenUse : uint8_t { Both, Read, Print };

struct FeatureToken {
  std::string_view token;
  FeatureSet set;
  TokenUse use;
};

struct FlagToken {
  std::string_view token;
  uint64_t bits;
};

namespace features {

constexpr FeatureSet SingleAndDouble = HFU_SINGLE | HFU_DOUBLE;
constexpr FeatureSet FusedAndHalf = VFMA_EXTENSION | FP16 | SingleAndDouble;

} // namespace features

// clang-format off
// A token hides those behind it that its set contains.
constexpr FeatureToken FeatureTokens[] = {
    {"KRL_ISAv5",     features::KRELL_ISAv5,                         TokenUse::Both},
    {"KRL_ISAv4",     features::KRELL_ISAv4,                         TokenUse::Both},
    {"KRL_ISAv3M",    features::KRELL_ISAv3 | features::M_PROFILE,   TokenUse::Both},
    {"KRL_ISAv3",     features::KRELL_ISAv3,                         TokenUse::Both},
    {"KRL_ISAv2",     features::KRELL_ISAv2,                         TokenUse::Both},
    {"KRL_ISAv1",     features::KRELL_ISAv1,                         TokenUse::Both},
    {"KRELL_ISAv5",   features::KRELL_ISAv5,                         TokenUse::Read},
    {"KRELL_ISAv4",   features::KRELL_ISAv4,                         TokenUse::Read},
    {"KRELL_ISAv3",   features::KRELL_ISAv3,                         TokenUse::Read},
    {"KRELL_ISAv2",   features::KRELL_ISAv2,                         TokenUse::Read},
    {"KRELL_ISAv1",   features::KRELL_ISAv1,                         TokenUse::Read},
    {"ZEV_ISAv8",     features::ZEV_ISAv8,                           TokenUse::Both},
    {"Z64_ISAv8",     features::Z64_ISA,                             TokenUse::Both},
    {"ZEV_ISAv7",     features::ZEV_ISAv7,                           TokenUse::Both},
    {"ZEV_ISAv6",     features::ZEV_ISAv6,                           TokenUse::Both},
    {"ZEV_ISAv5",     features::ZEV_ISAv5,                           TokenUse::Both},
    {"ZEV_ISAv4",     features::ZEV_ISAv4,                           TokenUse::Both},
    {"ZEV_ISAv3",     features::ZEV_ISAv3,                           TokenUse::Both},
    {"X",             features::K2EE_ISA,                            TokenUse::Both},
    {"E",             features::DSP_MULT,                            TokenUse::Both},
    {"P",             features::PAIR_PREFETCH,                       TokenUse::Both},
    {"J",             features::JAVA_STATE,                          TokenUse::Both},
    {"Z",             features::SAFEZONE_ISA,                        TokenUse::Both},
    {"N",             features::VECTA_ISA,                           TokenUse::Both},
    {"DE",            features::DIVIDE_EXTENSION,                    TokenUse::Both},
    {"D",             features::KRELL_DIVIDE,                        TokenUse::Both},
    {"K",             features::KERNEL_ISA,                          TokenUse::Both},
    {"B",             features::V6T2_ISA,                            TokenUse::Both},
    {"S",             features::OS_EXTENSION,                        TokenUse::Both},
    {"7EM",           features::V7EM_EXTENSION,                      TokenUse::Both},
    {"8M",            features::V8M_INSNS,                           TokenUse::Both},
    {"FP_ZEVv8_FP16", features::FusedAndHalf | features::FP_ISA_ZEVv8 | features::EXTREGS_D32 |
                          features::HFU_HALF,                        TokenUse::Both},
    {"FP_ZEVv8",      features::FusedAndHalf | features::FP_ISA_ZEVv8 | features::EXTREGS_D32,
                                                                     TokenUse::Both},
    {"FP_ZEVv8_D16",  features::FusedAndHalf | features::FP_ISA_ZEVv8 | features::EXTREGS_D16,
                                                                     TokenUse::Both},
    {"HFUv5_D16",     features::FusedAndHalf | features::HFU_ISAv5 | features::EXTREGS_D16,
                                                                     TokenUse::Both},
    {"HFUv4",         features::FusedAndHalf | features::HFU_ISAv3 | features::EXTREGS_D32,
                                                                     TokenUse::Both},
    {"HFUv3",         features::SingleAndDouble | features::HFU_ISAv3 | features::EXTREGS_D32,
                                                                     TokenUse::Both},
    {"HFUv3_D16",     features::SingleAndDouble | features::HFU_ISAv3 | features::EXTREGS_D16,
                                                                     TokenUse::Both},
    {"HFUv2",         features::SingleAndDouble | features::HFU_ISAv2 | features::EXTREGS_D16,
                                                                     TokenUse::Both},
    {"HFUv1",         features::SingleAndDouble | features::HFU_ISAv1 | features::EXTREGS_D16,
                                                                     TokenUse::Both},
    {"HFUi5",         features::HFU_ISAv5,                           TokenUse::Both},
    {"FPiv8",         features::FP_ISA_ZEVv8,                        TokenUse::Both},
    {"FPiv8_2",       features::FP_ISA_ZEVv8 | features::HFU_HALF,   TokenUse::Read},
    {"HFUi3",         features::HFU_ISAv3,                           TokenUse::Both},
    {"HFUi2",         features::HFU_ISAv2,                           TokenUse::Both},
    {"HFUi1",         features::HFU_ISAv1,                           TokenUse::Both},
    {"EXTD32",        features::EXTREGS_D32,                         TokenUse::Both},
    {"EXTD16",        features::EXTREGS_D16,                         TokenUse::Both},
    {"HFUS",          features::HFU_SINGLE,                          TokenUse::Both},
    {"HFUD",          features::HFU_DOUBLE,                          TokenUse::Both},
    {"VFMA",          features::VFMA_EXTENSION,                      TokenUse::Both},
    {"PE",            features::PURE_DOUBLES,                        TokenUse::Both},
    {"ME",            features::MIXED_DOUBLES,                       TokenUse::Both},
    {"FZ_POSZERO",    features::FZ_POSZERO,                          TokenUse::Both},
    {"PLD8",          features::PLD8,                                TokenUse::Both},
    {"PLD6",          features::PLD6,                                TokenUse::Both},
    {"PLD5",          features::PLD5,                                TokenUse::Both},
    {"PLD4",          features::PLD4,                                TokenUse::Both},
    {"PLD3",          features::PLD3,                                TokenUse::Both},
    {"PLD2",          features::PLD2,                                TokenUse::Both},
    {"PLD1",          features::PLD1,                                TokenUse::Both},
    {"PLD9",          features::PLD9,                                TokenUse::Both},
    {"PLD7",          features::PLD7,                                TokenUse::Both},
    {"WMMX2",         features::WMMX2_ISA,                           TokenUse::Both},
    {"WMMX",          features::WMMX_ISA,                            TokenUse::Both},
    {"MD",            features::MARVELL_DIV,                         TokenUse::Both},
    {"MPE",           features::MP_EXTENSIONS,                       TokenUse::Both},
    {"v8.1",          features::V81_ISA,                             TokenUse::Print},
    {"v8.1",          features::V81_SIMD,                            TokenUse::Print},
    {"KCPv3",         features::KCP_ISA,                             TokenUse::Both},
};

// The flags that a text claims unless it has this token, which is always printed.
constexpr FlagToken ComplementToken = {"IEEE1", Flag_IeeePart};

constexpr FlagToken FlagTokens[] = {
    {"IW",          Flag_Interwork},
    {"~IW",         Flag_NoInterwork},
    {"RWPI",        Flag_Rwpi},
    {"USESV6",      Flag_UsesV6},
    {"STKCKD",      Flag_StackChecked},
    {"~STKCKD",     Flag_NotStackChecked},
    {"USESV7",      Flag_UsesV7},
    {"HARDFP",      Flag_HardFp},
    {"SOFTFP",      Flag_SoftFp},
    {"WCHAR32",     Flag_WChar32},
    {"ENUMINT",     Flag_EnumInt},
    {"~SHL",        Flag_NotShared},
    {"OTIME",       Flag_OptimizeTime},
    {"OSPACE",      Flag_OptimizeSpace},
    {"ROPI",        Flag_Ropi},
    {"IEEEX",       Flag_IeeeFull},
    {"IEEEF",       Flag_IeeePart},
    {"IEEEJ",       Flag_IeeeJava},
    {"EBA4",        Flag_Align4},
    {"EBA8",        Flag_Align8},
    {"UX",          Flag_Exceptions},
    {"FPIC",        Flag_FpicCode},
    {"INDIRECT",    Flag_Indirect},
    {"STANDARDLIB", Flag_StandardLibrary},
    {"MICROLIB",    Flag_MicroLibrary},
    {"KRELL2LIB",   Flag_Krell2Library},
    {"THREADEDCXX", Flag_ThreadedCxx},
};

constexpr FlagToken Stack8Tokens[] = {
    {"REQ8",  Stack8_Requires},
    {"PRES8", Stack8_Preserves},
};

constexpr FlagToken AbiLevelTokens[] = {
    {"EABIv2", AbiLevel_2},
};

// "L" for a load, "S" for a store, "U" where it may be unaligned; bytes, and bytes of alignment.
// Name i is bit i; those of stores follow those of loads.
constexpr uint32_t LoadNameCount = 16;
constexpr std::string_view AccessNames[] = {
    "L88",  "L84",  "L82",  "L81",  "L44",  "L42",  "L41",  "L22",
    "L21",  "L11",  "UL84", "UL82", "UL81", "UL42", "UL41", "UL21",
    "S88",  "S84",  "S82",  "S81",  "S44",  "S42",  "S41",  "S22",
    "S21",  "S11",  "US84", "US82", "US81", "US42", "US41", "US21",
};
// clang-format on

// A set that stood behind a part of it would lose that part to it. One does: "FPiv8" is only read.
consteval bool standBeforeTheirParts() {
  for (const FeatureToken& token : FeatureTokens) {
    if (token.use == TokenUse::Read || token.token == "FPiv8") continue;
    for (const FeatureToken* before = FeatureTokens; before != &token; ++before) {
      const bool isPart = token.set.contains(before->set) && token.set != before->set;
      if (before->use != TokenUse::Read && isPart) return false;
    }
  }
  return true;
}
static_assert(standBeforeTheirParts());

template <size_t Count>
consteval bool standBeforeTheirParts(const FlagToken (&tokens)[Count]) {
  for (const FlagToken& token : tokens) {
    for (const FlagToken* before = tokens; before != &token; ++before) {
      if ((token.bits & before->bits) == before->bits) return false;
    }
  }
  return true;
}
static_assert(standBeforeTheirParts(FlagTokens));
static_assert(standBeforeTheirParts(Stack8Tokens));

} // namespace elfext
