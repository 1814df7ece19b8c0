// SPDX-License-Identifier: Apache-2.0
//
// The order of the tags is fixed: equal sets must give equal bytes, as blocks are compared by them.
//
// Each attribute is its tag as a LEB128 number and then a number, a text with its zero, or both, as
// build_attributes_parsers.cpp takes them apart.
#include "elfext/interface/build_attributes.h"
#include "elfext/src/attributes/standard_tags.h"
#include "elfext/src/bytes/leb128.h"

namespace elfext {

namespace {

constexpr uint32_t QobixOrder[] = {
    Tag_conformance,
    Tag_CPU_raw_name,
    Tag_CPU_name,
    Tag_CPU_arch,
    Tag_CPU_arch_profile,
    Tag_ZEV_ISA_use,
    Tag_KRELL_ISA_use,
    Tag_Z64_ISA_use,
    Tag_FP_arch,
    Tag_WMMX_arch,
    Tag_Advanced_SIMD_arch,
    Tag_PCS_config,
    Tag_ABI_PCS_R9_use,
    Tag_ABI_PCS_RW_data,
    Tag_ABI_PCS_RO_data,
    Tag_ABI_PCS_GOT_use,
    Tag_ABI_PCS_wchar_t,
    Tag_ABI_FP_rounding,
    Tag_ABI_FP_denormal,
    Tag_ABI_FP_exceptions,
    Tag_ABI_FP_user_exceptions,
    Tag_ABI_FP_number_model,
    Tag_ABI_align_needed,
    Tag_ABI_align_preserved,
    Tag_ABI_enum_size,
    Tag_ABI_HardFP_use,
    Tag_ABI_HFU_args,
    Tag_ABI_WMMX_args,
    Tag_ABI_optimization_goals,
    Tag_ABI_FP_optimization_goals,
    Tag_CPU_unaligned_access,
    Tag_FP_HP_extension,
    Tag_ABI_FP_16bit_format,
    Tag_DSP_extension,
    Tag_nodefaults,
    Tag_K2EE_use,
    Tag_Virtualization_use,
    Tag_MPextension_use,
    Tag_DIV_use,
};

void appendNumber(std::string& bytes, uint32_t tag, uint32_t value) {
  appendUleb(bytes, tag);
  appendUleb(bytes, value);
}

void appendText(std::string& bytes, std::string_view text) {
  bytes += text;
  bytes += '\0';
}

void appendAlsoCompatible(std::string& bytes, const AlsoCompatibilityTag& entry) {
  appendUleb(bytes, Tag_also_compatible_with);
  appendUleb(bytes, entry.tag);
  if (entry.number) appendUleb(bytes, *entry.number);
  if (entry.text) appendText(bytes, *entry.text);
  // A number of 0 ends the text that holds it by itself.
  else if (entry.number && *entry.number != 0)
    bytes += '\0';
}

} // namespace

void BuildAttributes::encodeQobix(std::string& bytes) const {
  for (const uint32_t tag : QobixOrder) {
    if (!hasTag(tag)) continue;
    if (const uint8_t place = placeOf(tag); place != NoPlace) {
      appendNumber(bytes, tag, getNumber(place));
    } else {
      appendUleb(bytes, tag);
      appendText(bytes, getStringTag(tag));
    }
  }
  if (m_CompatibilityTags) {
    for (const CompatibilityTag& entry : *m_CompatibilityTags) {
      appendNumber(bytes, Tag_compatibility, entry.flag);
      appendText(bytes, entry.vendor);
    }
  }
  if (m_AlsoCompatibilityTags) {
    for (const AlsoCompatibilityTag& entry : *m_AlsoCompatibilityTags)
      appendAlsoCompatible(bytes, entry);
  }
  encodeOtherTags(bytes);
}

// In rising order of the tags; numbers have even ones, texts odd ones.
void BuildAttributes::encodeOtherTags(std::string& bytes) const {
  // In the place of maps that most sets never make.
  static const std::map<uint32_t, uint32_t> NoNumbers;
  static const std::map<uint32_t, std::string> NoTexts;
  const auto& numbers = m_OtherNumericTags ? *m_OtherNumericTags : NoNumbers;
  const auto& texts = m_OtherStringTags ? *m_OtherStringTags : NoTexts;
  auto number = numbers.begin();
  auto text = texts.begin();
  while (number != numbers.end() || text != texts.end()) {
    if (text == texts.end() || (number != numbers.end() && number->first < text->first)) {
      appendNumber(bytes, number->first, number->second);
      ++number;
    } else {
      appendUleb(bytes, text->first);
      appendText(bytes, text->second);
      ++text;
    }
  }
}

void BuildAttributes::encodeZev(std::string& bytes) const {
  for (uint32_t place = 0; place < NumberCount; ++place) {
    if (NumericTagRows[place].isZev && hasNumber(place))
      appendNumber(bytes, NumericTagRows[place].number, getNumber(place));
  }
}

} // namespace elfext
