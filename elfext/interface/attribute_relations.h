// SPDX-License-Identifier: Apache-2.0
//
// How two records of build attributes stand to each other: whether one fits under the other,
// whether they can be used together, and what one has beyond the other.
//
// The archive groups the variants of a module by these and orders them; sets of tags are merged by
// them too. Records that come from hostile texts may clash in every way: nothing here fails, it
// only answers.
#pragma once

#include "elfext/interface/full_attr.h"

#include <cstdint>
#include <string_view>

namespace elfext {

/// What is asked of two values, and what is true of them; a set of bits.
enum RelationBit : uint32_t {
  Relation_Equal = 1,
  Relation_Contained = 2, ///< the left one in the right one
  Relation_Contains = 4,  ///< the left one the right one
};

constexpr uint32_t FitsUnder = Relation_Equal | Relation_Contained;
constexpr uint32_t Covers = Relation_Equal | Relation_Contains;

/// The part of `mode` that is true, with Relation_Equal where the values are equal. For records: of
/// each of the features, the access words and the flags.
[[nodiscard]] uint32_t relateWord(uint64_t a, uint32_t mode, uint64_t b);
[[nodiscard]] uint32_t relateFeatures(const FullAttr& a, uint32_t mode, const FullAttr& b);
[[nodiscard]] uint32_t relateAccess(const FullAttr& a, uint32_t mode, const FullAttr& b);
[[nodiscard]] uint32_t relateFullAttr(const FullAttr& a, uint32_t mode, const FullAttr& b);
/// Whether the relation holds; equality always does.
[[nodiscard]] bool fullAttrSatisfies(const FullAttr& a, uint32_t mode, const FullAttr& b);

/// Whether features, access words and flags are equal. The stack and the ABI level don't count.
[[nodiscard]] bool isSameBuild(const FullAttr& a, const FullAttr& b);

/// What is needed where both are used together. Whether they can be; the record is whole in any
/// case. `result` may be one of the others.
bool mergeFullAttr(FullAttr& result, const FullAttr& a, const FullAttr& b);

/// What both have, field by field. The target class is that of `a`.
[[nodiscard]] FullAttr intersectFullAttr(const FullAttr& a, const FullAttr& b);

/// What `a` has beyond `b`, completed so that its text can be read back.
void differenceFullAttr(FullAttr& result, const FullAttr& a, const FullAttr& b);

/// Whether the features of a record can be on one target.
[[nodiscard]] bool hasClash(const FullAttr& record);

/// Two things that exclude each other, by name.
struct Clash {
  std::string_view first;
  std::string_view second;
};

[[nodiscard]] bool featuresClash(const FullAttr& record);
[[nodiscard]] bool flagsClash(const FullAttr& record);
[[nodiscard]] bool accessClash(const FullAttr& record);

/// Takes the next clash out of the record, and names it; false if there is none left.
bool takeFeaturesClash(FullAttr& record, Clash& clash);
bool takeFlagsClash(FullAttr& record, Clash& clash);
bool takeAccessClash(FullAttr& record, Clash& clash);
/// Of any of the three, in this order: features, accesses, flags.
bool takeClash(FullAttr& record, Clash& clash);

} // namespace elfext
