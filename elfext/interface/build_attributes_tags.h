// SPDX-License-Identifier: Apache-2.0
//
// The tags of build attributes. Those of vendor "qobix" are the public ABI's, those of vendor "ZEV"
// the maker's own; the two count separately. The form of a tag's value follows from its number.
//
// Numbers are those of the public ABI and of the maker, and stand in files: none ever changes. Any
// number from 4 on may come from a file, so the classifier answers for all of them.
#pragma once

#include <cstdint>
#include <string_view>

namespace elfext {

constexpr std::string_view QobixVendor = "qobix";
constexpr std::string_view ZevVendor = "ZEV";

/// What a run of attributes in a section holds for.
enum AttributeScope : uint32_t { Tag_File = 1, Tag_Section = 2, Tag_Symbol = 3 };
[[nodiscard]] constexpr bool isAttributeScope(uint32_t kind) {
  return kind >= Tag_File && kind <= Tag_Symbol;
}

enum QobixTag : uint32_t {
  Tag_CPU_raw_name = 4,
  Tag_CPU_name = 5,
  Tag_CPU_arch = 6,
  Tag_CPU_arch_profile = 7,
  Tag_ZEV_ISA_use = 8,
  Tag_KRELL_ISA_use = 9,
  Tag_FP_arch = 10,
  Tag_WMMX_arch = 11,
  Tag_Advanced_SIMD_arch = 12,
  Tag_PCS_config = 13,
  Tag_ABI_PCS_R9_use = 14,
  Tag_ABI_PCS_RW_data = 15,
  Tag_ABI_PCS_RO_data = 16,
  Tag_ABI_PCS_GOT_use = 17,
  Tag_ABI_PCS_wchar_t = 18,
  Tag_ABI_FP_rounding = 19,
  Tag_ABI_FP_denormal = 20,
  Tag_ABI_FP_exceptions = 21,
  Tag_ABI_FP_user_exceptions = 22,
  Tag_ABI_FP_number_model = 23,
  Tag_ABI_align_needed = 24,
  Tag_ABI_align_preserved = 25,
  Tag_ABI_enum_size = 26,
  Tag_ABI_HardFP_use = 27,
  Tag_ABI_HFU_args = 28,
  Tag_ABI_WMMX_args = 29,
  Tag_ABI_optimization_goals = 30,
  Tag_ABI_FP_optimization_goals = 31,
  Tag_compatibility = 32,
  Tag_CPU_unaligned_access = 34,
  Tag_FP_HP_extension = 36,
  Tag_ABI_FP_16bit_format = 38,
  Tag_Z64_ISA_use = 40,
  Tag_MPextension_use = 42,
  Tag_DIV_use = 44,
  Tag_DSP_extension = 46,
  Tag_nodefaults = 64,
  Tag_also_compatible_with = 65,
  Tag_K2EE_use = 66,
  Tag_conformance = 67,
  Tag_Virtualization_use = 68,
  /// An older number of Tag_MPextension_use; both are one tag.
  Tag_MPextension_use_r207 = 70,
};

enum class ZevTag : uint32_t {
  Tag_ZV_interworking = 4,
  Tag_ZV_cpp_exceptions = 6,
  Tag_ZV_mdivide = 8,
  Tag_ZV_standardlib = 10,
  Tag_ZV_microlib = 12,
  Tag_ZV_require8 = 14,
  Tag_ZV_eba = 16,
  Tag_ZV_version = 18,
  Tag_ZV_pld = 20,
  Tag_ZV_full_isa = 22,
};

/// The lowest number that an attribute may have; smaller ones are scopes.
constexpr uint32_t FirstAttributeTag = 4;
/// Tags above this one say by being even or odd whether they are numbers or texts.
constexpr uint32_t LastIrregularTag = 32;

/// Which form the value of a tag has.
class BuildAttributesTagClassifier {
public:
  /// A negative number stands for one of 0x80000000 and above.
  [[nodiscard]] static constexpr bool isQobixNumericTag(uint32_t tag) {
    return isQobixNumericTag(static_cast<int32_t>(tag));
  }
  [[nodiscard]] static constexpr bool isQobixStringTag(uint32_t tag) {
    return isQobixStringTag(static_cast<int32_t>(tag));
  }
  [[nodiscard]] static constexpr bool isQobixNumericAndStringTag(uint32_t tag) {
    return isQobixNumericAndStringTag(static_cast<int32_t>(tag));
  }
  [[nodiscard]] static constexpr bool isQobixNumericTag(int32_t tag) {
    return (tag >= 6 && tag <= 31) || (isRegular(tag) && isEven(tag));
  }
  [[nodiscard]] static constexpr bool isQobixStringTag(int32_t tag) {
    return tag == 4 || tag == 5 || (isRegular(tag) && !isEven(tag));
  }
  [[nodiscard]] static constexpr bool isQobixNumericAndStringTag(int32_t tag) { return tag == 32; }
  [[nodiscard]] static constexpr bool isZevNumericTag(uint32_t tag) {
    return tag >= FirstAttributeTag && tag % 2 == 0;
  }
  [[nodiscard]] static constexpr bool isZevStringTag(uint32_t tag) {
    return tag >= FirstAttributeTag && tag % 2 != 0;
  }

private:
  [[nodiscard]] static constexpr bool isRegular(int32_t tag) { return tag < 0 || tag > 32; }
  [[nodiscard]] static constexpr bool isEven(int32_t tag) { return tag % 2 == 0; }
};

} // namespace elfext
