// SPDX-License-Identifier: Apache-2.0
//
// Decides which number Tag_CPU_arch has for a set of features, and the profile and floating-point
// level that go with it. It is the way back from feature_set.h to the public ABI's numbers, for
// tags_from_record.cpp; the way there is the target table. The highest level that a set holds whole
// decides, and single features choose among the numbers of that level; what no number stands for is
// told by other tags.
#include "elfext/src/attributes/architecture_number.h"

#include "elfext/src/attributes/feature_chains.h"

#include <span>

namespace elfext {

namespace {

using namespace features;

// The number of the highest level that the features hold whole; the lowest has number `first`.
uint32_t highestLevel(FeatureSet features, std::span<const FeatureSet> levels, uint32_t first) {
  // From the top, as each level contains those below it.
  for (size_t i = levels.size(); i > 0; --i) {
    if (features.contains(levels[i - 1])) return first + static_cast<uint32_t>(i) - 1;
  }
  return 0;
}

uint32_t numberOfLevel4(FeatureSet features, uint32_t krell) {
  return features.contains(OS_EXTENSION) || krell > 0 ? 2 : 1;
}

uint32_t numberOfLevel5(FeatureSet features) {
  if (!features.contains(DSP_MULT)) return 3;
  return features.contains(JAVA_STATE) ? 5 : 4;
}

uint32_t numberOfLevel6(FeatureSet features, uint32_t krell) {
  if (features.contains(KERNEL_ISA)) return features.contains(SAFEZONE_ISA) ? 7 : 9;
  return features.contains(V6T2_ISA) || krell == 4 ? 8 : 6;
}

uint32_t numberOfLevel8(FeatureSet features) {
  return features.contains(R_PROFILE) ? 15 : 14;
}

uint32_t numberOfKrell3(FeatureSet features) {
  if (!features.contains(M_PROFILE)) return numberOfLevel6(features, 3);
  if (features.contains(V8M_INSNS)) return 16;
  return features.contains(OS_EXTENSION) ? 12 : 11;
}

uint32_t numberOfKrell4(FeatureSet features) {
  if (features.contains(V8M_INSNS)) return 17;
  if (!features.contains(KERNEL_ISA)) return 8;
  return features.contains(V7EM_EXTENSION) ? 13 : 10;
}

uint32_t numberOfKrellAlone(FeatureSet features, uint32_t krell) {
  switch (krell) {
  case 1:
    return 2;
  case 2:
    return numberOfLevel5(features);
  case 3:
    return numberOfKrell3(features);
  case 4:
    return numberOfKrell4(features);
  case 5:
    return numberOfLevel8(features);
  default:
    return 0;
  }
}

} // namespace

IsaLevels getIsaLevels(FeatureSet features) {
  return {.zev = highestLevel(features, ZevChain, 3),
          .krell = highestLevel(features, KrellChain, 1),
          .z64 = features.contains(Z64_ISA) ? 8u : 0u};
}

uint32_t getArchitectureNumber(FeatureSet features) {
  // The number of the architecture that brought it.
  if (features.contains(Z64_ISA)) return 14;
  const IsaLevels levels = getIsaLevels(features);
  switch (levels.zev) {
  case 0:
    return numberOfKrellAlone(features, levels.krell);
  case 4:
    return numberOfLevel4(features, levels.krell);
  case 5:
    return numberOfLevel5(features);
  case 6:
    return numberOfLevel6(features, levels.krell);
  case 7:
    return 10;
  case 8:
    return numberOfLevel8(features);
  default:
    return 0;
  }
}

// KRELL levels 4 and 5 came with ZEV levels 7 and 8.
uint32_t getArchitectureProfile(FeatureSet features) {
  const IsaLevels levels = getIsaLevels(features);
  if (levels.zev < 7 && levels.krell < 4) return 0;
  if (features.contains(V8M_INSNS) && (levels.krell == 3 || levels.krell == 4)) return 0;
  if (features.contains(M_PROFILE)) return 'M';
  if (features.contains(A_PROFILE)) return 'A';
  return features.contains(R_PROFILE) ? 'R' : 'S';
}

uint32_t getFloatingPointLevel(FeatureSet features) {
  if (features.intersects(FP_ISA_ZEVv8) && features.contains(KCP_ISA)) return 7;
  if (features.contains(FP_ISA_ZEVv8)) return 6;
  if (features.contains(HFU_ISAv5)) return 5;
  // Level 4 is level 3 with both extensions.
  if (features.contains(HFU_ISAv3)) return features.contains(FP16 | VFMA_EXTENSION) ? 4 : 3;
  if (features.contains(HFU_ISAv2)) return 2;
  return features.contains(HFU_ISAv1) ? 1 : 0;
}

} // namespace elfext
