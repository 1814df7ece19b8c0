// SPDX-License-Identifier: Apache-2.0
#include "elfext/interface/feature_set.h"

#include <array>
#include <span>

namespace elfext {

namespace {

using namespace features;

constexpr std::array KrellChain = {KRELL_ISAv1, KRELL_ISAv2, KRELL_ISAv3, KRELL_ISAv4, KRELL_ISAv5};
constexpr std::array ZevChain = {ZEV_ISAv3, ZEV_ISAv4, ZEV_ISAv5, ZEV_ISAv6, ZEV_ISAv7, ZEV_ISAv8};
constexpr std::array WmmxChain = {WMMX_ISA, WMMX2_ISA};
constexpr std::array PldChain = {PLD7, PLD9, PLD1, PLD2, PLD3, PLD4, PLD5, PLD6, PLD8};
constexpr std::array HfuChain = {HFU_ISAv1, HFU_ISAv2, HFU_ISAv3, HFU_ISAv5, FP_ISA_ZEVv8};

// Each level contains the one below it, and more.
constexpr bool isCumulative(std::span<const FeatureSet> chain) {
  FeatureSet below;
  for (const FeatureSet level : chain) {
    if (!level.contains(below) || level == below) return false;
    below = level;
  }
  return true;
}

static_assert(isCumulative(KrellChain));
static_assert(isCumulative(ZevChain));
static_assert(isCumulative(WmmxChain));
static_assert(isCumulative(PldChain));
static_assert(isCumulative(HfuChain));
static_assert(isCumulative(std::array{EXTREGS_D16, EXTREGS_D32}));

// What a level has beyond the one below it brings all of the level.
FeatureSet closeChain(FeatureSet features, std::span<const FeatureSet> chain) {
  FeatureSet below;
  for (const FeatureSet level : chain) {
    if (features.intersects(level.without(below))) features |= level;
    below = level;
  }
  return features;
}

} // namespace

FeatureSet closeFeatures(FeatureSet features) {
  features = closeChain(features, KrellChain);
  features = closeChain(features, ZevChain);
  features = closeChain(features, WmmxChain);
  features = closeChain(features, PldChain);
  features = closeChain(features, HfuChain);
  const auto bring = [&features](bool isCalledFor, FeatureSet more) {
    if (isCalledFor) features |= more;
  };
  bring(features.contains(HFU_HALF), FP_ISA_ZEVv8);
  bring(features.contains(EXTREGS_D32.without(EXTREGS_D16)), EXTREGS_D32);
  bring(features.contains(KRELL_DIVIDE) &&
            !features.intersects(ZEV_DIVIDE | ZEV_ISAv3 | JAVA_STATE),
        M_PROFILE);
  bring(features.contains(V8M_INSNS), M_PROFILE);
  bring(features.contains(ZEV_ISAv5 | KRELL_ISAv1), KRELL_ISAv2);
  bring(features.contains(VIRTUALIZATION_EXTENSION), DIVIDE_EXTENSION);
  const bool hasHfu = features.intersects(FP_ISA_ZEVv8);
  bring(hasHfu, PURE_DOUBLES);
  bring(!hasHfu && features.contains(KCP_ISA), MIXED_DOUBLES);
  bring(features.contains(VFMA_EXTENSION | HFU_ISAv3), FP16);
  return features;
}

} // namespace elfext
