// SPDX-License-Identifier: Apache-2.0
//
// Which architecture a set of features is that of, in the numbers of tags.
//
// A record from a text or from tags may have features that no architecture has together; the answer
// is then that of a level, or 0, and never a failure.
#pragma once

#include "elfext/interface/feature_set.h"

#include <cstdint>

namespace elfext {

// The levels of the instruction sets, 0 for none.
struct IsaLevels {
  uint32_t zev;   // 3 to 8
  uint32_t krell; // 1 to 5
  uint32_t z64;   // 8
};

[[nodiscard]] IsaLevels getIsaLevels(FeatureSet features);

// The value of Tag_CPU_arch; 0 if it is that of no architecture.
[[nodiscard]] uint32_t getArchitectureNumber(FeatureSet features);

// The value of Tag_CPU_arch_profile: a letter, or 0 where none is needed.
[[nodiscard]] uint32_t getArchitectureProfile(FeatureSet features);

// 0 for no floating point, up to 7.
[[nodiscard]] uint32_t getFloatingPointLevel(FeatureSet features);

} // namespace elfext
