// SPDX-License-Identifier: Apache-2.0
//
// Decides what two records are to each other: which one fits under the other, what they come to
// together, and what can't be together at all. The archive groups members into variants by it, and
// sets of tags ask whether they can be combined. All of it is arithmetic on the fields of the
// record: sets are compared as bits, and each relation is asked of features, access words and flags
// alike.
//
// A record may come from any text that a file has: feature bits that nobody has defined are left
// out of comparisons.
#include "elfext/interface/attribute_relations.h"

#include <algorithm>

namespace elfext {

namespace {

using namespace features;

struct FeaturesClash {
  FeatureSet mask;
  Clash names;
};

// Looked through in this order; each row is told and taken out by itself.
constexpr FeaturesClash FeaturesClashes[] = {
    {KCP_ISA | HFU_ISAv1, {"KCP", "HFU"}},
    {PURE_DOUBLES | MIXED_DOUBLES, {"pure-endian double", "mixed-endian double"}},
    {ZEV_ISAv3 | M_PROFILE, {"zev-isa", "m-profile"}},
    {Z64_ISA | SOFTFP, {"Z64", "SoftHFU"}},
};

struct FlagsClash {
  uint64_t mask;
  Clash names;
};

constexpr FlagsClash FlagsClashes[] = {
    {Flag_StackChecked | Flag_NotStackChecked, {"stack-checked", "not-stack-checked"}},
    {Flag_Align4 | Flag_Align8,
     {"require 4-byte alignment of 8-byte datatypes",
      "require 8-byte alignment of 8-byte datatypes"}},
};

constexpr Clash AccessClash = {"L/S", "UL/US"};
// The ordinary accesses among the bits of a word, L88 to L11; those above may be unaligned.
constexpr uint16_t AlignedAccesses = 0x3FF;

const FeaturesClash* findFeaturesClash(const FullAttr& record) {
  const auto* clash =
      std::ranges::find_if(FeaturesClashes, [&record](const FeaturesClash& candidate) {
        return record.m_Features.contains(candidate.mask);
      });
  return clash == std::end(FeaturesClashes) ? nullptr : clash;
}

const FlagsClash* findFlagsClash(const FullAttr& record) {
  const auto* clash = std::ranges::find_if(FlagsClashes, [&record](const FlagsClash& candidate) {
    return (record.m_Flags & candidate.mask) == candidate.mask;
  });
  return clash == std::end(FlagsClashes) ? nullptr : clash;
}

// Both where the values have no difference in the way that counts.
uint32_t relate(bool areEqual, bool isContained, bool contains, uint32_t mode) {
  if (areEqual) return mode | Relation_Equal;
  const uint32_t wanted = mode & ~uint32_t{Relation_Equal};
  if (wanted == Relation_Contained) return isContained ? wanted : 0;
  if (wanted == Relation_Contains) return contains ? wanted : 0;
  return wanted;
}

// What a difference leaves of a level is its highest bit alone, which has no token: the level's
// lower bits come back, so that the text names it.
uint64_t completeFlags(uint64_t flags) {
  if ((flags & 0x20000) != 0) flags |= Flag_OptimizeTime;
  if ((flags & 0x400000) != 0)
    flags |= Flag_IeeeFull;
  else if ((flags & 0x200000) != 0)
    flags |= Flag_IeeePart;
  return flags;
}

// With a ZEV level in the remainder its text can be read back on top of one: without it, a
// division of its own would be taken for that of the M profile.
FeatureSet featuresDifference(FeatureSet a, FeatureSet b) {
  const FeatureSet remainder = a.without(b) & Defined;
  if ((remainder | b).intersects(ZEV_ISAv8)) return closeFeatures(remainder | ZEV_ISAv3);
  return closeFeatures(remainder);
}

} // namespace

uint32_t relateWord(uint64_t a, uint32_t mode, uint64_t b) {
  return relate(a == b, (a & ~b) == 0, (b & ~a) == 0, mode);
}

uint32_t relateFeatures(const FullAttr& a, uint32_t mode, const FullAttr& b) {
  const FeatureSet left = a.m_Features & Defined;
  const FeatureSet right = b.m_Features & Defined;
  return relate(left == right, right.contains(left), left.contains(right), mode);
}

uint32_t relateAccess(const FullAttr& a, uint32_t mode, const FullAttr& b) {
  // True of the record only where it is true of each word.
  return relateWord(a.m_Access.code, mode, b.m_Access.code) &
         relateWord(a.m_Access.readOnlyData, mode, b.m_Access.readOnlyData) &
         relateWord(a.m_Access.data, mode, b.m_Access.data) &
         relateWord(a.m_Access.stores, mode, b.m_Access.stores);
}

uint32_t relateFullAttr(const FullAttr& a, uint32_t mode, const FullAttr& b) {
  return relateFeatures(a, mode, b) & relateAccess(a, mode, b) &
         relateWord(a.m_Flags, mode, b.m_Flags);
}

bool fullAttrSatisfies(const FullAttr& a, uint32_t mode, const FullAttr& b) {
  const uint32_t asked = mode | Relation_Equal;
  const uint32_t relation = relateFullAttr(a, asked, b);
  const uint32_t result = (relation & Relation_Equal) != 0 ? Relation_Equal : relation;
  return (result & asked) != 0;
}

bool isSameBuild(const FullAttr& a, const FullAttr& b) {
  return (relateFullAttr(a, Relation_Equal, b) & Relation_Equal) != 0;
}

bool mergeFullAttr(FullAttr& result, const FullAttr& a, const FullAttr& b) {
  // One part that needs the alignment makes the whole need it; one that does not keep it spoils it
  // for the whole.
  const uint64_t requires8 = (a.m_Stack8 | b.m_Stack8) & Stack8_Requires;
  const uint64_t preserves8 = a.m_Stack8 & b.m_Stack8 & Stack8_Preserves;
  result = {.m_Features = a.m_Features | b.m_Features,
            .m_TargetClass = {a.m_TargetClass.low | b.m_TargetClass.low,
                              a.m_TargetClass.high | b.m_TargetClass.high},
            .m_Access = a.m_Access | b.m_Access,
            .m_Flags = a.m_Flags | b.m_Flags,
            .m_Stack8 = requires8 | preserves8,
            .m_AbiLevel = std::min(a.m_AbiLevel, b.m_AbiLevel)};
  // Behind the merge: the result is whole either way, for who wants to name the clash.
  return !hasClash(result) && !accessClash(result) && !flagsClash(result);
}

FullAttr intersectFullAttr(const FullAttr& a, const FullAttr& b) {
  return {.m_Features = a.m_Features & b.m_Features,
          .m_TargetClass = a.m_TargetClass,
          .m_Access = a.m_Access & b.m_Access,
          .m_Flags = a.m_Flags & b.m_Flags,
          .m_Stack8 = a.m_Stack8 & b.m_Stack8,
          .m_AbiLevel = a.m_AbiLevel & b.m_AbiLevel};
}

void differenceFullAttr(FullAttr& result, const FullAttr& a, const FullAttr& b) {
  result = {.m_Features = featuresDifference(a.m_Features, b.m_Features),
            .m_TargetClass = a.m_TargetClass,
            .m_Access = a.m_Access.without(b.m_Access),
            .m_Flags = completeFlags(a.m_Flags & ~b.m_Flags),
            .m_Stack8 = a.m_Stack8 & ~b.m_Stack8,
            .m_AbiLevel = a.m_AbiLevel & ~b.m_AbiLevel};
}

bool hasClash(const FullAttr& record) {
  const FeatureSet features = record.m_Features;
  if (features.contains(HFU_ISAv2) && !features.intersects(PAIR_PREFETCH | Z64_ISA)) return true;
  return featuresClash(record);
}

bool featuresClash(const FullAttr& record) {
  return findFeaturesClash(record) != nullptr;
}

bool flagsClash(const FullAttr& record) {
  return findFlagsClash(record) != nullptr;
}

bool accessClash(const FullAttr& record) {
  // Two access words side by side: data in the upper half, all three or-ed in the lower.
  constexpr uint32_t UnalignedBits = ~uint32_t{0x03FF03FF};
  constexpr uint32_t WideBits = 0x016E016E;
  const AccessWords& access = record.m_Access;
  const uint32_t words =
      uint32_t{access.data} << 16 | access.code | access.readOnlyData | access.data;
  return (words & UnalignedBits) != 0 && (words & WideBits) != 0;
}

bool takeFeaturesClash(FullAttr& record, Clash& clash) {
  const FeaturesClash* row = findFeaturesClash(record);
  if (row == nullptr) return false;
  clash = row->names;
  // Both sides go, so a caller that takes clash after clash comes to an end.
  record.m_Features = record.m_Features.without(row->mask);
  return true;
}

bool takeFlagsClash(FullAttr& record, Clash& clash) {
  const FlagsClash* row = findFlagsClash(record);
  if (row == nullptr) return false;
  clash = row->names;
  record.m_Flags &= ~row->mask;
  return true;
}

bool takeAccessClash(FullAttr& record, Clash& clash) {
  if (!accessClash(record)) return false;
  clash = AccessClash;
  record.m_Access.code &= AlignedAccesses;
  record.m_Access.readOnlyData &= AlignedAccesses;
  record.m_Access.data &= AlignedAccesses;
  return true;
}

bool takeClash(FullAttr& record, Clash& clash) {
  return takeFeaturesClash(record, clash) || takeAccessClash(record, clash) ||
         takeFlagsClash(record, clash);
}

} // namespace elfext
