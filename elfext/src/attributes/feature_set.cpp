// SPDX-License-Identifier: Apache-2.0
//
// What features bring with them. A set that was put together from tokens, or is left of a larger
// one, is completed here before anybody compares or prints it: both look at bits alone and must
// find a level's lower levels set. The rules are taken in one order and once each; a later one may
// count on what an earlier one has brought.
#include "elfext/interface/feature_set.h"

#include "elfext/src/attributes/feature_chains.h"

#include <array>
#include <span>

namespace elfext {

namespace {

using namespace features;

// Each level contains the one below it, and more.
constexpr bool isCumulative(std::span<const FeatureSet> chain) {
  FeatureSet below;
  for (const FeatureSet level : chain) {
    if (!level.contains(below) || level == below) return false;
    below = level;
  }
  return true;
}

// The functions below count on it.
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
    // A bit of the level alone: such sets are what differences leave.
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
  // Division without the other instruction sets is that of the M profile.
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
