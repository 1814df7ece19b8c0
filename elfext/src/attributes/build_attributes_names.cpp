// SPDX-License-Identifier: Apache-2.0
//
// The names of tags and the sentences for their values, for dumps. Rows are in rising order,
// checked by the compiler, so that nothing stands twice; a tag or value without a row is shown by
// its number and never an error.
#include "elfext/interface/build_attributes_names.h"

#include "elfext/interface/build_attributes_tags.h"

#include <algorithm>
#include <iterator>
#include <span>
#include <string_view>

namespace elfext {

namespace {

struct TagName {
  uint32_t tag;
  std::string_view name;
};

struct ValueName {
  uint32_t tag;
  uint32_t value;
  std::string_view name;
};

// The maker's tags, as numbers like those of the public ABI.
namespace zev {
constexpr auto Tag_ZV_interworking = static_cast<uint32_t>(ZevTag::Tag_ZV_interworking);
constexpr auto Tag_ZV_cpp_exceptions = static_cast<uint32_t>(ZevTag::Tag_ZV_cpp_exceptions);
constexpr auto Tag_ZV_mdivide = static_cast<uint32_t>(ZevTag::Tag_ZV_mdivide);
constexpr auto Tag_ZV_standardlib = static_cast<uint32_t>(ZevTag::Tag_ZV_standardlib);
constexpr auto Tag_ZV_microlib = static_cast<uint32_t>(ZevTag::Tag_ZV_microlib);
constexpr auto Tag_ZV_require8 = static_cast<uint32_t>(ZevTag::Tag_ZV_require8);
constexpr auto Tag_ZV_eba = static_cast<uint32_t>(ZevTag::Tag_ZV_eba);
constexpr auto Tag_ZV_version = static_cast<uint32_t>(ZevTag::Tag_ZV_version);
constexpr auto Tag_ZV_pld = static_cast<uint32_t>(ZevTag::Tag_ZV_pld);
} // namespace zev

// clang-format off
constexpr TagName QobixTagNames[] = {
    {Tag_CPU_raw_name,              "Tag_CPU_raw_name"},
    {Tag_CPU_name,                  "Tag_CPU_name"},
    {Tag_CPU_arch,                  "Tag_CPU_arch"},
    {Tag_CPU_arch_profile,          "Tag_CPU_arch_profile"},
    {Tag_ZEV_ISA_use,               "Tag_ZEV_ISA_use"},
    {Tag_KRELL_ISA_use,             "Tag_KRELL_ISA_use"},
    {Tag_FP_arch,                   "Tag_FP_arch"},
    {Tag_WMMX_arch,                 "Tag_WMMX_arch"},
    {Tag_Advanced_SIMD_arch,        "Tag_Advanced_SIMD_arch"},
    {Tag_PCS_config,                "Tag_PCS_config"},
    {Tag_ABI_PCS_R9_use,            "Tag_ABI_PCS_R9_use"},
    {Tag_ABI_PCS_RW_data,           "Tag_ABI_PCS_RW_data"},
    {Tag_ABI_PCS_RO_data,           "Tag_ABI_PCS_RO_data"},
    {Tag_ABI_PCS_GOT_use,           "Tag_ABI_PCS_GOT_use"},
    {Tag_ABI_PCS_wchar_t,           "Tag_ABI_PCS_wchar_t"},
    {Tag_ABI_FP_rounding,           "Tag_ABI_FP_rounding"},
    {Tag_ABI_FP_denormal,           "Tag_ABI_FP_denormal"},
    {Tag_ABI_FP_exceptions,         "Tag_ABI_FP_exceptions"},
    {Tag_ABI_FP_user_exceptions,    "Tag_ABI_FP_user_exceptions"},
    {Tag_ABI_FP_number_model,       "Tag_ABI_FP_number_model"},
    {Tag_ABI_align_needed,          "Tag_ABI_align_needed"},
    {Tag_ABI_align_preserved,       "Tag_ABI_align_preserved"},
    {Tag_ABI_enum_size,             "Tag_ABI_enum_size"},
    {Tag_ABI_HardFP_use,            "Tag_ABI_HardFP_use"},
    {Tag_ABI_HFU_args,              "Tag_ABI_HFU_args"},
    {Tag_ABI_WMMX_args,             "Tag_ABI_WMMX_args"},
    {Tag_ABI_optimization_goals,    "Tag_ABI_optimization_goals"},
    {Tag_ABI_FP_optimization_goals, "Tag_ABI_FP_optimization_goals"},
    {Tag_compatibility,             "Tag_compatibility"},
    {Tag_CPU_unaligned_access,      "Tag_CPU_unaligned_access"},
    {Tag_FP_HP_extension,           "Tag_FP_HP_extension"},
    {Tag_ABI_FP_16bit_format,       "Tag_ABI_FP_16bit_format"},
    {Tag_Z64_ISA_use,               "Tag_Z64_ISA_use"},
    {Tag_MPextension_use,           "Tag_MPextension_use"},
    {Tag_DIV_use,                   "Tag_DIV_use"},
    {Tag_DSP_extension,             "Tag_DSP_extension"},
    {Tag_nodefaults,                "Tag_nodefaults"},
    {Tag_also_compatible_with,      "Tag_also_compatible_with"},
    {Tag_K2EE_use,                  "Tag_K2EE_use"},
    {Tag_conformance,               "Tag_conformance"},
    {Tag_Virtualization_use,        "Tag_Virtualization_use"},
    {Tag_MPextension_use_r207,      "Tag_MPextension_use_r207"},
};

constexpr ValueName QobixValueNames[] = {
    {Tag_CPU_arch,                  0,   "Architecture before version 4"},
    {Tag_CPU_arch,                  1,   "Architecture version 4"},
    {Tag_CPU_arch,                  2,   "Architecture version 4 with the KRELL instructions"},
    {Tag_CPU_arch,                  3,   "Architecture version 5 with the KRELL instructions"},
    {Tag_CPU_arch,                  4,   "Architecture version 5 with the KRELL and DSP instructions"},
    {Tag_CPU_arch,                  5,   "Architecture version 5 with the KRELL and DSP instructions and Java state"},
    {Tag_CPU_arch,                  6,   "Architecture version 6"},
    {Tag_CPU_arch,                  7,   "Architecture version 6 with the kernel and safe zone extensions"},
    {Tag_CPU_arch,                  8,   "Architecture version 6 with the second KRELL instructions"},
    {Tag_CPU_arch,                  9,   "Architecture version 6 with the kernel extension"},
    {Tag_CPU_arch,                  10,  "Architecture version 7"},
    {Tag_CPU_arch,                  11,  "Architecture version 6 for microcontrollers"},
    {Tag_CPU_arch,                  12,  "Architecture version 6 for microcontrollers, with the operating system extension"},
    {Tag_CPU_arch,                  13,  "Architecture version 7 for microcontrollers, with the DSP instructions"},
    {Tag_CPU_arch,                  14,  "Architecture version 8"},
    {Tag_CPU_arch,                  15,  "Architecture version 8 for real time"},
    {Tag_CPU_arch,                  16,  "Architecture version 8 for microcontrollers, base"},
    {Tag_CPU_arch,                  17,  "Architecture version 8 for microcontrollers, main"},
    {Tag_CPU_arch_profile,          0,   "No architecture profile, or one that the architecture implies"},
    {Tag_CPU_arch_profile,          'A', "Application profile"},
    {Tag_CPU_arch_profile,          'B', "Basic profile"},
    {Tag_CPU_arch_profile,          'M', "Microcontroller profile"},
    {Tag_CPU_arch_profile,          'R', "Real-time profile"},
    {Tag_CPU_arch_profile,          'S', "Application or real-time profile"},
    {Tag_ZEV_ISA_use,               0,   "ZEV instructions are not used"},
    {Tag_ZEV_ISA_use,               1,   "ZEV instructions are used"},
    {Tag_KRELL_ISA_use,             0,   "KRELL instructions are not used"},
    {Tag_KRELL_ISA_use,             1,   "16-bit KRELL instructions are used"},
    {Tag_KRELL_ISA_use,             2,   "16-bit and 32-bit KRELL instructions are used"},
    {Tag_KRELL_ISA_use,             3,   "KRELL instructions are used as far as the architecture has them"},
    {Tag_FP_arch,                   0,   "Floating-point instructions are not used"},
    {Tag_FP_arch,                   1,   "Floating-point instructions of version 1 are used"},
    {Tag_FP_arch,                   2,   "Floating-point instructions of version 2 are used"},
    {Tag_FP_arch,                   3,   "Floating-point instructions of version 3 with 32 registers are used"},
    {Tag_FP_arch,                   4,   "Floating-point instructions of version 3 with 16 registers are used"},
    {Tag_FP_arch,                   5,   "Floating-point instructions of version 4 with 32 registers are used"},
    {Tag_FP_arch,                   6,   "Floating-point instructions of version 4 with 16 registers are used"},
    {Tag_FP_arch,                   7,   "Floating-point instructions of version 8 with 32 registers are used"},
    {Tag_FP_arch,                   8,   "Floating-point instructions of version 8 with 16 registers are used"},
    {Tag_WMMX_arch,                 0,   "WMMX instructions are not used"},
    {Tag_WMMX_arch,                 1,   "WMMX instructions of version 1 are used"},
    {Tag_WMMX_arch,                 2,   "WMMX instructions of version 2 are used"},
    {Tag_Advanced_SIMD_arch,        0,   "Advanced SIMD instructions are not used"},
    {Tag_Advanced_SIMD_arch,        1,   "Advanced SIMD instructions of version 1 are used"},
    {Tag_Advanced_SIMD_arch,        2,   "Advanced SIMD instructions of version 2, with fused operations, are used"},
    {Tag_Advanced_SIMD_arch,        3,   "Advanced SIMD instructions of version 8 are used"},
    {Tag_Advanced_SIMD_arch,        4,   "Advanced SIMD instructions of version 8.1 are used"},
    {Tag_PCS_config,                0,   "No standard configuration of the procedure call standard, or no information recorded"},
    {Tag_PCS_config,                1,   "Procedure call standard for a bare platform"},
    {Tag_PCS_config,                2,   "Procedure call standard for an application on a hosted platform"},
    {Tag_PCS_config,                3,   "Procedure call standard for a shared library on a hosted platform"},
    {Tag_PCS_config,                4,   "Procedure call standard for an application on a handheld platform"},
    {Tag_PCS_config,                5,   "Procedure call standard for a shared library on a handheld platform"},
    {Tag_PCS_config,                6,   "Procedure call standard is reserved for the first future configuration"},
    {Tag_PCS_config,                7,   "Procedure call standard is reserved for the second future configuration"},
    {Tag_ABI_PCS_R9_use,            0,   "R9 is used as a plain register"},
    {Tag_ABI_PCS_R9_use,            1,   "R9 is used as the static base"},
    {Tag_ABI_PCS_R9_use,            2,   "R9 is used as the thread pointer"},
    {Tag_ABI_PCS_R9_use,            3,   "R9 is not used"},
    {Tag_ABI_PCS_RW_data,           0,   "Writable data is addressed absolutely"},
    {Tag_ABI_PCS_RW_data,           1,   "Writable data is addressed relative to the PC"},
    {Tag_ABI_PCS_RW_data,           2,   "Writable data is addressed relative to the static base"},
    {Tag_ABI_PCS_RW_data,           3,   "Writable data is not addressed"},
    {Tag_ABI_PCS_RO_data,           0,   "Read-only data is addressed absolutely"},
    {Tag_ABI_PCS_RO_data,           1,   "Read-only data is addressed relative to the PC"},
    {Tag_ABI_PCS_RO_data,           2,   "Read-only data is not addressed"},
    {Tag_ABI_PCS_GOT_use,           0,   "Imported data is not addressed"},
    {Tag_ABI_PCS_GOT_use,           1,   "Imported data is addressed directly"},
    {Tag_ABI_PCS_GOT_use,           2,   "Imported data is addressed indirectly through the GOT"},
    {Tag_ABI_PCS_wchar_t,           0,   "wchar_t is not used"},
    {Tag_ABI_PCS_wchar_t,           2,   "Size of wchar_t is 2"},
    {Tag_ABI_PCS_wchar_t,           4,   "Size of wchar_t is 4"},
    {Tag_ABI_FP_rounding,           0,   "Floating-point results are rounded to nearest"},
    {Tag_ABI_FP_rounding,           1,   "Floating-point rounding is chosen at run time"},
    {Tag_ABI_FP_denormal,           0,   "Denormal numbers may be flushed to positive zero"},
    {Tag_ABI_FP_denormal,           1,   "Denormal numbers are as IEEE 754 has them"},
    {Tag_ABI_FP_denormal,           2,   "Denormal numbers may be flushed to a zero of their sign"},
    {Tag_ABI_FP_exceptions,         0,   "Floating-point exceptions are not checked"},
    {Tag_ABI_FP_exceptions,         1,   "Floating-point exceptions are checked"},
    {Tag_ABI_FP_user_exceptions,    0,   "User floating-point exception handlers are not enabled"},
    {Tag_ABI_FP_user_exceptions,    1,   "User floating-point exception handlers may be enabled"},
    {Tag_ABI_FP_number_model,       0,   "Floating-point numbers are not used"},
    {Tag_ABI_FP_number_model,       1,   "Floating-point numbers are finite"},
    {Tag_ABI_FP_number_model,       2,   "Floating-point numbers may be infinite or the one NaN"},
    {Tag_ABI_FP_number_model,       3,   "Floating-point numbers are all those of IEEE 754"},
    {Tag_ABI_align_needed,          0,   "Code needs no alignment of 8-byte data"},
    {Tag_ABI_align_needed,          1,   "Code needs 8-byte alignment of 8-byte data"},
    {Tag_ABI_align_needed,          2,   "Code needs 4-byte alignment of 8-byte data"},
    {Tag_ABI_align_preserved,       0,   "Code preserves no 8-byte alignment of the stack"},
    {Tag_ABI_align_preserved,       1,   "Code preserves 8-byte alignment of the stack, except in leaf functions"},
    {Tag_ABI_align_preserved,       2,   "Code preserves 8-byte alignment of the stack"},
    {Tag_ABI_enum_size,             0,   "Enum containers are not used"},
    {Tag_ABI_enum_size,             1,   "Enum containers are the smallest that fit"},
    {Tag_ABI_enum_size,             2,   "Enum containers are 32-bit"},
    {Tag_ABI_enum_size,             3,   "Enum containers are 32-bit where they are visible to other code"},
    {Tag_ABI_HardFP_use,            0,   "Floating-point precisions are used as Tag_FP_arch has them"},
    {Tag_ABI_HardFP_use,            1,   "Single precision only is used in hardware"},
    {Tag_ABI_HardFP_use,            2,   "Double precision only is used in hardware"},
    {Tag_ABI_HardFP_use,            3,   "Single and double precision are used in hardware"},
    {Tag_ABI_HFU_args,              0,   "Floating-point arguments are passed in core registers"},
    {Tag_ABI_HFU_args,              1,   "Floating-point arguments are passed in HFU registers"},
    {Tag_ABI_HFU_args,              2,   "Floating-point arguments are passed as the tool chain has it"},
    {Tag_ABI_HFU_args,              3,   "No arguments or results are floating-point numbers"},
    {Tag_ABI_WMMX_args,             0,   "WMMX arguments are passed in core registers"},
    {Tag_ABI_WMMX_args,             1,   "WMMX arguments are passed in WMMX registers"},
    {Tag_ABI_WMMX_args,             2,   "WMMX arguments are passed as the tool chain has it"},
    {Tag_ABI_optimization_goals,    0,   "No particular optimization goals, or no information recorded"},
    {Tag_ABI_optimization_goals,    1,   "Optimized for speed"},
    {Tag_ABI_optimization_goals,    2,   "Optimized aggressively for speed"},
    {Tag_ABI_optimization_goals,    3,   "Optimized for small size"},
    {Tag_ABI_optimization_goals,    4,   "Optimized aggressively for small size"},
    {Tag_ABI_optimization_goals,    5,   "Optimized for debugging"},
    {Tag_ABI_optimization_goals,    6,   "Optimized for the best debugging"},
    {Tag_ABI_FP_optimization_goals, 0,   "No particular floating-point optimization goals, or no information recorded"},
    {Tag_ABI_FP_optimization_goals, 1,   "Floating point is optimized for speed"},
    {Tag_ABI_FP_optimization_goals, 2,   "Floating point is optimized aggressively for speed"},
    {Tag_ABI_FP_optimization_goals, 3,   "Floating point is optimized for small size"},
    {Tag_ABI_FP_optimization_goals, 4,   "Floating point is optimized aggressively for small size"},
    {Tag_ABI_FP_optimization_goals, 5,   "Floating point is optimized for accuracy"},
    {Tag_ABI_FP_optimization_goals, 6,   "Floating point is optimized for the best accuracy"},
    {Tag_CPU_unaligned_access,      0,   "Unaligned accesses are not made"},
    {Tag_CPU_unaligned_access,      1,   "Unaligned accesses may be made"},
    {Tag_FP_HP_extension,           0,   "Half-precision instructions are not used beyond those that Tag_FP_arch has"},
    {Tag_FP_HP_extension,           1,   "Half-precision conversions are used"},
    {Tag_ABI_FP_16bit_format,       0,   "16-bit floating-point numbers are not used"},
    {Tag_ABI_FP_16bit_format,       1,   "16-bit floating-point numbers are in the IEEE 754 format"},
    {Tag_ABI_FP_16bit_format,       2,   "16-bit floating-point numbers are in the alternative format"},
    {Tag_Z64_ISA_use,               0,   "Z64 instructions are not used"},
    {Tag_Z64_ISA_use,               1,   "Z64 instructions are used"},
    {Tag_MPextension_use,           0,   "Multiprocessing instructions are not used"},
    {Tag_MPextension_use,           1,   "Multiprocessing instructions are used"},
    {Tag_DIV_use,                   0,   "Divide instructions are used as far as the architecture has them"},
    {Tag_DIV_use,                   1,   "Divide instructions are not used"},
    {Tag_DIV_use,                   2,   "Divide instructions are used"},
    {Tag_DSP_extension,             0,   "DSP instructions are used as far as the architecture has them"},
    {Tag_DSP_extension,             1,   "DSP instructions are used"},
    {Tag_nodefaults,                0,   "Attributes that are not stated have no defaults"},
    {Tag_K2EE_use,                  0,   "K2EE instructions are not used"},
    {Tag_K2EE_use,                  1,   "K2EE instructions are used"},
    {Tag_Virtualization_use,        0,   "Virtualization is not used"},
    {Tag_Virtualization_use,        1,   "Safe zone instructions are used"},
    {Tag_Virtualization_use,        2,   "Virtualization instructions are used"},
    {Tag_Virtualization_use,        3,   "Safe zone and virtualization instructions are used"},
};

constexpr TagName ZevTagNames[] = {
    {zev::Tag_ZV_interworking,   "Tag_ZV_interworking"},
    {zev::Tag_ZV_cpp_exceptions, "Tag_ZV_cpp_exceptions"},
    {zev::Tag_ZV_mdivide,        "Tag_ZV_mdivide"},
    {zev::Tag_ZV_standardlib,    "Tag_ZV_standardlib"},
    {zev::Tag_ZV_microlib,       "Tag_ZV_microlib"},
    {zev::Tag_ZV_require8,       "Tag_ZV_require8"},
    {zev::Tag_ZV_eba,            "Tag_ZV_eba"},
    {zev::Tag_ZV_version,        "Tag_ZV_version"},
    {zev::Tag_ZV_pld,            "Tag_ZV_pld"},
};

constexpr ValueName ZevValueNames[] = {
    {zev::Tag_ZV_interworking,   0, "Interworking is supported"},
    {zev::Tag_ZV_interworking,   1, "Interworking is not supported"},
    {zev::Tag_ZV_cpp_exceptions, 0, "C++ exceptions are not used"},
    {zev::Tag_ZV_cpp_exceptions, 1, "C++ exceptions are used"},
    {zev::Tag_ZV_mdivide,        0, "The maker's divide instructions are not used"},
    {zev::Tag_ZV_mdivide,        1, "The maker's divide instructions are used"},
    {zev::Tag_ZV_standardlib,    0, "Standard library is not required"},
    {zev::Tag_ZV_standardlib,    1, "Standard library is required"},
    {zev::Tag_ZV_microlib,       0, "Micro library is not required"},
    {zev::Tag_ZV_microlib,       1, "Micro library is required"},
    {zev::Tag_ZV_require8,       0, "8-byte alignment of the stack is required"},
    {zev::Tag_ZV_require8,       1, "8-byte alignment of the stack is not required"},
    {zev::Tag_ZV_eba,            0, "8-byte data is aligned to 8 bytes"},
    {zev::Tag_ZV_eba,            1, "Alignment of 8-byte data is not guaranteed"},
    {zev::Tag_ZV_eba,            2, "8-byte data is aligned to 4 bytes"},
    {zev::Tag_ZV_pld,            0, "Preload instructions are not used"},
    {zev::Tag_ZV_pld,            1, "Preload instructions of level 1 are used"},
    {zev::Tag_ZV_pld,            2, "Preload instructions of level 2 are used"},
    {zev::Tag_ZV_pld,            3, "Preload instructions of level 3 are used"},
    {zev::Tag_ZV_pld,            4, "Preload instructions of level 4 are used"},
};
// clang-format on

constexpr bool isBefore(const TagName& a, const TagName& b) {
  return a.tag < b.tag;
}

constexpr bool isBefore(const ValueName& a, const ValueName& b) {
  return a.tag != b.tag ? a.tag < b.tag : a.value < b.value;
}

// Each row stands once, in order.
template <class Rows>
constexpr bool isRising(const Rows& rows) {
  for (size_t i = 1; i < std::size(rows); ++i) {
    if (!isBefore(rows[i - 1], rows[i])) return false;
  }
  return true;
}

static_assert(std::size(QobixTagNames) == 42);
static_assert(std::size(ZevTagNames) == 9);
static_assert(isRising(QobixTagNames));
static_assert(isRising(ZevTagNames));
static_assert(isRising(QobixValueNames));
static_assert(isRising(ZevValueNames));

std::string withNumber(std::string_view name, uint32_t number) {
  return std::string(name) + " (=" + std::to_string(static_cast<int32_t>(number)) + ")";
}

std::string tagName(std::span<const TagName> rows, uint32_t tag) {
  const auto row = std::ranges::find(rows, tag, &TagName::tag);
  return row != rows.end() ? std::string(row->name) : withNumber("unknown tag", tag);
}

std::string valueName(std::span<const ValueName> rows, uint32_t tag, uint32_t value) {
  const auto row = std::ranges::find_if(
      rows, [&](const ValueName& each) { return each.tag == tag && each.value == value; });
  return withNumber(row != rows.end() ? row->name : "unknown parameter", value);
}

} // namespace

std::string getQobixTagName(uint32_t tag) {
  return tagName(QobixTagNames, tag);
}

std::string getZevTagName(uint32_t tag) {
  return tagName(ZevTagNames, tag);
}

std::string getQobixTagValueName(uint32_t tag, uint32_t value) {
  // Two numbers of one tag.
  if (tag == Tag_MPextension_use_r207) tag = Tag_MPextension_use;
  return valueName(QobixValueNames, tag, value);
}

std::string getZevTagValueName(uint32_t tag, uint32_t value) {
  // Every version is a known one.
  if (tag == zev::Tag_ZV_version)
    return "Tags version " + std::to_string(static_cast<int32_t>(value));
  return valueName(ZevValueNames, tag, value);
}

} // namespace elfext
