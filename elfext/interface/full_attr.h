// SPDX-License-Identifier: Apache-2.0
//
// Build attributes in their packed form, on which all comparisons work: what code needs of its
// target, which memory accesses it makes, and how it was compiled.
//
// It comes from an attribute text, from a set of tags, from a library's name or from a known
// target, and all of these meet here: four words of accesses, three of flags, and a set of
// features.
#pragma once

#include "elfext/interface/feature_set.h"

#include <cstdint>

namespace elfext {

/// Bits of the access words: load or store of so many bytes, with so many of alignment guaranteed.
enum AccessBit : uint16_t {
  Access_44 = 0x10,
  Access_11 = 0x200,
  Access_U41 = 0x4000,
};

/// Access words that targets have.
enum AccessWord : uint16_t {
  AccessWord_Bytes = 0x210,      ///< no target is known
  AccessWord_Halves = 0x290,     ///< every target has these
  AccessWord_Unaligned = 0xC290, ///< targets that load and store from any address
};

/// Which memory accesses are used, in words of the bits above, the same for loads and stores.
struct AccessWords {
  uint16_t code = 0;
  uint16_t readOnlyData = 0;
  uint16_t data = 0;
  uint16_t stores = 0;

  [[nodiscard]] static constexpr AccessWords all(uint16_t word) { return {word, word, word, word}; }
  friend constexpr AccessWords operator|(const AccessWords& a, const AccessWords& b) {
    return {static_cast<uint16_t>(a.code | b.code),
            static_cast<uint16_t>(a.readOnlyData | b.readOnlyData),
            static_cast<uint16_t>(a.data | b.data), static_cast<uint16_t>(a.stores | b.stores)};
  }
  friend constexpr AccessWords operator&(const AccessWords& a, const AccessWords& b) {
    return {static_cast<uint16_t>(a.code & b.code),
            static_cast<uint16_t>(a.readOnlyData & b.readOnlyData),
            static_cast<uint16_t>(a.data & b.data), static_cast<uint16_t>(a.stores & b.stores)};
  }
  /// What this has and the other hasn't.
  [[nodiscard]] constexpr AccessWords without(const AccessWords& other) const {
    const auto complement = [](uint16_t word) { return static_cast<uint16_t>(~word); };
    return *this & AccessWords{complement(other.code), complement(other.readOnlyData),
                               complement(other.data), complement(other.stores)};
  }
  friend constexpr bool operator==(const AccessWords&, const AccessWords&) = default;
};

/// Bits of m_Flags. Those of one subject that stand for levels contain the levels below.
enum Flag : uint64_t {
  Flag_Interwork = 0x1,
  Flag_NoInterwork = 0x2,
  Flag_Rwpi = 0x4,
  Flag_UsesV6 = 0x8,
  Flag_StackChecked = 0x10,
  Flag_NotStackChecked = 0x20,
  Flag_UsesV7 = 0x40,
  Flag_HardFp = 0x100,
  Flag_SoftFp = 0x200,
  Flag_EnumInt = 0x800,
  Flag_WChar32 = 0x1000,
  Flag_NotShared = 0x8000,
  Flag_OptimizeSpace = 0x10000,
  Flag_OptimizeTime = 0x30000,
  Flag_Ropi = 0x40000,
  Flag_Align4 = 0x80000,
  Flag_IeeeJava = 0x100000,
  Flag_IeeePart = 0x300000,
  Flag_IeeeFull = 0x700000,
  Flag_Align8 = 0x800000,
  Flag_Exceptions = 0x4000000,
  Flag_FpicCode = 0x8000000,
  Flag_Krell2Library = 0x10000000,
  Flag_Indirect = 0x20000000,
  Flag_StandardLibrary = 0x40000000,
  Flag_MicroLibrary = 0x80000000,
  Flag_ThreadedCxx = 0x100000000,
};

/// Bits of m_Stack8: 8-byte alignment of the stack.
enum Stack8 : uint64_t { Stack8_Requires = 1, Stack8_Preserves = 2 };

/// Of m_AbiLevel.
enum AbiLevel : uint64_t { AbiLevel_2 = 2 };

/// Classes of the targets that a record stems from.
struct TargetClass {
  uint32_t low = 0;
  uint32_t high = 0;

  friend constexpr bool operator==(const TargetClass&, const TargetClass&) = default;
};

struct FullAttr {
  FeatureSet m_Features = {};
  TargetClass m_TargetClass = {};
  AccessWords m_Access = {};
  uint64_t m_Flags = 0;
  uint64_t m_Stack8 = 0;
  uint64_t m_AbiLevel = 0;

  friend constexpr bool operator==(const FullAttr&, const FullAttr&) = default;
};

/// What holds of an object that says nothing of itself.
constexpr FullAttr DefaultFullAttr = {.m_Access = AccessWords::all(AccessWord_Halves),
                                      .m_Flags = Flag_Align8 | Flag_OptimizeSpace | Flag_NotShared |
                                                 Flag_UsesV7 | Flag_NotStackChecked | Flag_UsesV6 |
                                                 Flag_Interwork,
                                      .m_AbiLevel = AbiLevel_2};

/// What a library's attributes start from.
constexpr FullAttr LibraryFullAttr = {
    .m_Access = {Access_44, AccessWord_Bytes, AccessWord_Bytes, AccessWord_Bytes}};

} // namespace elfext
