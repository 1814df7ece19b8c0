// SPDX-License-Identifier: Apache-2.0
//
// The vocabulary of tags: where a set of attributes keeps each, and what depends on it. The order
// is that of the sets' fields.
//
// Tag numbers have gaps and two vendors; places have none, so a set is an array of bytes with a bit
// for the presence of each. The row of a tag also says whether it feeds the record: one that does
// makes the record stale.
#pragma once

#include "elfext/interface/build_attributes_tags.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <iterator>

namespace elfext {

struct NumericTagRow {
  uint32_t number;
  bool isZev;
  bool feedsRecord;

  constexpr NumericTagRow(QobixTag tag, bool feeds)
      : number(tag), isZev(false), feedsRecord(feeds) {}
  constexpr NumericTagRow(ZevTag tag, bool feeds)
      : number(static_cast<uint32_t>(tag)), isZev(true), feedsRecord(feeds) {}
};

// clang-format off
constexpr NumericTagRow NumericTagRows[] = {
    {Tag_CPU_arch,                    true},
    {Tag_CPU_arch_profile,            true},
    {Tag_ZEV_ISA_use,                 true},
    {Tag_KRELL_ISA_use,               true},
    {Tag_Z64_ISA_use,                 true},
    {Tag_FP_arch,                     true},
    {Tag_WMMX_arch,                   true},
    {Tag_Advanced_SIMD_arch,          true},
    {Tag_PCS_config,                  true},
    {Tag_ABI_PCS_R9_use,              true},
    {Tag_ABI_PCS_RW_data,             true},
    {Tag_ABI_PCS_RO_data,             true},
    {Tag_ABI_PCS_GOT_use,             true},
    {Tag_ABI_PCS_wchar_t,             false},
    {Tag_ABI_FP_rounding,             true},
    {Tag_ABI_FP_denormal,             true},
    {Tag_ABI_FP_exceptions,           true},
    {Tag_ABI_FP_user_exceptions,      true},
    {Tag_ABI_FP_number_model,         true},
    {Tag_ABI_align_needed,            true},
    {Tag_ABI_align_preserved,         true},
    {Tag_ABI_enum_size,               false},
    {Tag_ABI_HardFP_use,              false},
    {Tag_ABI_HFU_args,                true},
    {Tag_ABI_WMMX_args,               false},
    {Tag_ABI_optimization_goals,      false}, // it changes the record at once
    {Tag_ABI_FP_optimization_goals,   false},
    {Tag_CPU_unaligned_access,        true},
    {Tag_FP_HP_extension,             true},
    {Tag_ABI_FP_16bit_format,         false},
    {Tag_DSP_extension,               true},
    {Tag_nodefaults,                  false},
    {Tag_K2EE_use,                    true},
    {Tag_Virtualization_use,          true},
    {Tag_MPextension_use,             false},
    {Tag_DIV_use,                     false},
    {ZevTag::Tag_ZV_interworking,     true},
    {ZevTag::Tag_ZV_cpp_exceptions,   true},
    {ZevTag::Tag_ZV_mdivide,          true},
    {ZevTag::Tag_ZV_standardlib,      true},
    {ZevTag::Tag_ZV_microlib,         true},
    {ZevTag::Tag_ZV_require8,         true},
    {ZevTag::Tag_ZV_eba,              true},
    {ZevTag::Tag_ZV_version,          false},
    {ZevTag::Tag_ZV_pld,              true},
    {ZevTag::Tag_ZV_full_isa,         true},
};

constexpr uint32_t TextTags[] = {
    Tag_CPU_raw_name,
    Tag_CPU_name,
    Tag_conformance,
};
// clang-format on

// Longer texts are cut.
constexpr size_t LongestText = 31;

constexpr uint8_t NoPlace = 0xFF;
constexpr uint32_t LastQobixTag = Tag_MPextension_use_r207;
constexpr uint32_t LastZevTag = static_cast<uint32_t>(ZevTag::Tag_ZV_full_isa);

// The place of a number, or NoPlace.
constexpr uint8_t placeOf(uint32_t tag) {
  constexpr auto Places = [] {
    std::array<uint8_t, LastQobixTag + 1> places{};
    places.fill(NoPlace);
    for (size_t i = 0; i < std::size(NumericTagRows); ++i) {
      if (!NumericTagRows[i].isZev) places[NumericTagRows[i].number] = static_cast<uint8_t>(i);
    }
    // Two numbers, one tag: objects may use either.
    places[Tag_MPextension_use_r207] = places[Tag_MPextension_use];
    return places;
  }();
  // Tags are the file's, and any 32-bit number.
  return tag <= LastQobixTag ? Places[tag] : NoPlace;
}

constexpr uint8_t placeOf(ZevTag tag) {
  constexpr auto Places = [] {
    std::array<uint8_t, LastZevTag + 1> places{};
    places.fill(NoPlace);
    for (size_t i = 0; i < std::size(NumericTagRows); ++i) {
      if (NumericTagRows[i].isZev) places[NumericTagRows[i].number] = static_cast<uint8_t>(i);
    }
    return places;
  }();
  const auto number = static_cast<uint32_t>(tag);
  return number <= LastZevTag ? Places[number] : NoPlace;
}

// The place of a text, or NoPlace.
constexpr uint8_t textPlaceOf(uint32_t tag) {
  for (size_t i = 0; i < std::size(TextTags); ++i) {
    if (TextTags[i] == tag) return static_cast<uint8_t>(i);
  }
  return NoPlace;
}

} // namespace elfext
