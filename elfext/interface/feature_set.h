// SPDX-License-Identifier: Apache-2.0
//
// What code needs of its target, as a set of 128 bits: instruction sets, extensions, register
// files. A level of a chain contains the levels below it.
//
// Texts and tags name features; the bits are this library's own. `Defined` has all that comparisons
// look at.
#pragma once

#include <cstdint>

namespace elfext {

struct FeatureSet {
  uint64_t low = 0;
  uint64_t high = 0;

  [[nodiscard]] constexpr bool isEmpty() const { return (low | high) == 0; }
  /// All of the other set.
  [[nodiscard]] constexpr bool contains(FeatureSet other) const {
    return (low & other.low) == other.low && (high & other.high) == other.high;
  }
  /// Any of the other set.
  [[nodiscard]] constexpr bool intersects(FeatureSet other) const {
    return ((low & other.low) | (high & other.high)) != 0;
  }
  [[nodiscard]] constexpr FeatureSet without(FeatureSet other) const {
    return {low & ~other.low, high & ~other.high};
  }
  /// Holds the other set, or nothing of it.
  constexpr void put(FeatureSet other, bool isThere) {
    *this = isThere ? *this | other : without(other);
  }

  friend constexpr FeatureSet operator|(FeatureSet a, FeatureSet b) {
    return {a.low | b.low, a.high | b.high};
  }
  friend constexpr FeatureSet operator&(FeatureSet a, FeatureSet b) {
    return {a.low & b.low, a.high & b.high};
  }
  constexpr FeatureSet& operator|=(FeatureSet other) { return *this = *this | other; }
  constexpr FeatureSet& operator&=(FeatureSet other) { return *this = *this & other; }
  friend constexpr bool operator==(const FeatureSet&, const FeatureSet&) = default;
};

namespace features {

// clang-format off
/// The chains, each from its lowest level to its highest.
constexpr FeatureSet ZEV_ISAv3{0x1};
constexpr FeatureSet ZEV_ISAv4{0x3};
constexpr FeatureSet ZEV_ISAv5{0x7};
constexpr FeatureSet ZEV_ISAv6{0xF};
constexpr FeatureSet ZEV_ISAv7{0x1F};
constexpr FeatureSet ZEV_ISAv8{0x3F};
constexpr FeatureSet KRELL_ISAv1{0x40};
constexpr FeatureSet KRELL_ISAv2{0xC0};
constexpr FeatureSet KRELL_ISAv3{0x1C0};
constexpr FeatureSet KRELL_ISAv4{0x3C0};
constexpr FeatureSet KRELL_ISAv5{0x7C0};
constexpr FeatureSet WMMX_ISA{0x4000};
constexpr FeatureSet WMMX2_ISA{0xC000};
constexpr FeatureSet PLD7{0x10000000};
constexpr FeatureSet PLD9{0x30000000};
constexpr FeatureSet PLD1{0x70000000};
constexpr FeatureSet PLD2{0xF0000000};
constexpr FeatureSet PLD3{0x1F0000000};
constexpr FeatureSet PLD4{0x3F0000000};
constexpr FeatureSet PLD5{0x7F0000000};
constexpr FeatureSet PLD6{0x1007F0000000};
constexpr FeatureSet PLD8{0x5007F0000000};
constexpr FeatureSet HFU_ISAv1{0x80000000000000};
constexpr FeatureSet HFU_ISAv2{0x180000000000000};
constexpr FeatureSet HFU_ISAv3{0x380000000000000};
constexpr FeatureSet HFU_ISAv5{0x381000000000000};
constexpr FeatureSet FP_ISA_ZEVv8{0x383000000000000};
constexpr FeatureSet EXTREGS_D16{0x8000000000000};
constexpr FeatureSet EXTREGS_D32{0x18000000000000};

/// The rest, by bit.
constexpr FeatureSet V6T2_ISA{0x800};
constexpr FeatureSet M_PROFILE{0x1000};
constexpr FeatureSet V8M_INSNS{0x2000};
constexpr FeatureSet K2EE_ISA{0x10000};
constexpr FeatureSet PAIR_PREFETCH{0x20000};
constexpr FeatureSet DSP_MULT{0x40000};
constexpr FeatureSet JAVA_STATE{0x80000};
constexpr FeatureSet KERNEL_ISA{0x100000};
constexpr FeatureSet OS_EXTENSION{0x200000};
constexpr FeatureSet V7EM_EXTENSION{0x400000};
constexpr FeatureSet A_PROFILE{0x800000};
constexpr FeatureSet SAFEZONE_ISA{0x1000000};
constexpr FeatureSet VECTA_ISA{0x2000000};
constexpr FeatureSet MARVELL_DIV{0x4000000};
constexpr FeatureSet MP_EXTENSIONS{0x8000000};
constexpr FeatureSet VIRTUALIZATION_EXTENSION{0x1000000000};
constexpr FeatureSet KRELL_DIVIDE{0x4000000000};
constexpr FeatureSet ZEV_DIVIDE{0x8000000000};
constexpr FeatureSet DIVIDE_EXTENSION{0xC000000000};
constexpr FeatureSet Z64_ISA{0x10000000000};
constexpr FeatureSet R_PROFILE{0x200000000000};
constexpr FeatureSet V81_SIMD{0x800000000000};
constexpr FeatureSet VFMA_EXTENSION{0x4000000000000};
constexpr FeatureSet HFU_SINGLE{0x20000000000000};
constexpr FeatureSet HFU_DOUBLE{0x40000000000000};
constexpr FeatureSet FP16{0x400000000000000};
constexpr FeatureSet KCP_ISA{0x800000000000000};
constexpr FeatureSet SOFTFP{0x1000000000000000};
constexpr FeatureSet PURE_DOUBLES{0x2000000000000000};
constexpr FeatureSet MIXED_DOUBLES{0x4000000000000000};
constexpr FeatureSet FZ_POSZERO{0x8000000000000000};
constexpr FeatureSet V81_ISA{0, 0x1};
constexpr FeatureSet HFU_HALF{0, 0x2};
// clang-format on

/// What comparisons look at.
constexpr FeatureSet Defined{~uint64_t{0}, 0x1F};

} // namespace features

/// Completes a set: a level brings the levels below it, and some features bring others.
[[nodiscard]] FeatureSet closeFeatures(FeatureSet features);

} // namespace elfext
