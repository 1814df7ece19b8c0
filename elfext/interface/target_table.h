// SPDX-License-Identifier: Apache-2.0
//
// The known targets: architectures, processors, floating-point units. A target stands for a set of
// features.
//
// Tags name an architecture by number, texts and users a target by name; both come to a set of
// features here. The rows are in src/attributes/target_rows.h.
#pragma once

#include "elfext/interface/full_attr.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace elfext {

/// Classes, in TargetClass::low.
enum TargetKind : uint32_t {
  TargetKind_Architecture = 0x10000000,
  TargetKind_FloatingPointUnit = 0x20000000,
  TargetKind_Other = 0x40000000,
  TargetKind_Further = 0x80000000,
};

/// A row of the table; texts are constants of the program.
struct TargetEntry {
  const char* name;
  const char* base; ///< of the row that this one extends; null for none
  const char* family;
  uint32_t isPublic; ///< 0 for rows that are not shown
  uint32_t kind;     ///< TargetKind
  uint32_t hints;    ///< for attributes
  FeatureSet features;
};

/// What a look-up gives: nothing for an unknown target.
struct Target {
  FeatureSet features;
  TargetClass targetClass;
};

/// All rows, those of one kind together; the set of each contains that of its base.
[[nodiscard]] std::span<const TargetEntry> procAndArchList();

/// By name, in any letter case. A null name is as good as an unknown one.
[[nodiscard]] Target findTarget(const char* name);

/// By the values of Tag_CPU_arch and Tag_CPU_arch_profile; the target of the empty name for numbers
/// that are not known.
[[nodiscard]] Target findTargetForArchitecture(uint32_t number, uint32_t profile);

/// Whether that target has all of the set.
[[nodiscard]] bool hasFullFeatures(uint32_t number, uint32_t profile, FeatureSet features);

/// The first floating-point unit of the table.
[[nodiscard]] const TargetEntry& getFirstFloatingPointUnit();

} // namespace elfext
