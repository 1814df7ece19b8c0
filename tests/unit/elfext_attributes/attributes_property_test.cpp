// SPDX-License-Identifier: Apache-2.0
//
// What holds for all sets of attributes, on many generated ones, the same in each run: what is
// encoded can be decoded, equal sets have equal hashes and bytes, unions, differences and
// intersections keep their laws, and tags come back from the record that follows from them.

#include "elfext/interface/attribute_relations.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes.h"
#include "elfext/interface/build_attributes_parsers.h"
#include "tests/support/bytes.h"
#include "tests/unit/elfext_attributes/attribute_sets.h"
#include "tests/unit/elfext_attributes/generated_records.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <vector>

namespace elfext {
namespace {

using namespace features;

constexpr int ManySets = 5000;

struct Encoded {
  std::string qobix;
  std::string zev;

  explicit Encoded(const BuildAttributes& attributes) {
    attributes.encodeQobix(qobix);
    attributes.encodeZev(zev);
  }
  // False if either was malformed.
  bool decodeInto(BuildAttributes& attributes) const {
    return QobixBuildAttributesDecodingParser(attributes).parse(testsupport::bytesOf(qobix)) &&
           ZevBuildAttributesDecodingParser(attributes).parse(testsupport::bytesOf(zev));
  }
  bool operator==(const Encoded&) const = default;
};

// ---- Sets of any tags

class GeneratedSets {
public:
  // `hasUnknownTags`: also those that decoders leave in the bytes.
  BuildAttributes set(bool hasUnknownTags) {
    BuildAttributes attributes;
    // Now sparse, now nearly full.
    m_OneIn = 1 + m_Random.below(6);
    for (uint32_t tag = FirstAttributeTag; tag <= Tag_MPextension_use_r207; ++tag)
      addKnownTag(attributes, tag);
    addLists(attributes);
    if (hasUnknownTags) addUnknownTags(attributes);
    for (uint32_t tag = 4; tag <= 22; tag += 2) {
      if (happens()) attributes.setNumericTag(ZevTag{tag}, number() % 256);
    }
    return attributes;
  }

private:
  bool happens() { return m_Random.below(m_OneIn) == 0; }
  uint32_t number() {
    return m_Random.below(2) == 0 ? m_Random.below(5) : static_cast<uint32_t>(m_Random.bits());
  }
  std::string text(uint32_t atLeast) {
    std::string result(atLeast + m_Random.below(8), '?');
    for (char& letter : result)
      letter = static_cast<char>('a' + m_Random.below(2));
    return result;
  }

  void addKnownTag(BuildAttributes& attributes, uint32_t tag) {
    if (!happens()) return;
    if (tag <= Tag_CPU_name || tag == Tag_conformance)
      attributes.setStringTag(tag, text(0));
    else if (tag < Tag_compatibility || isKnownEvenTag(tag))
      attributes.setNumericTag(tag, number());
  }

  static bool isKnownEvenTag(uint32_t tag) {
    for (const uint32_t known : {34u, 36u, 38u, 40u, 42u, 44u, 46u, 64u, 66u, 68u, 70u}) {
      if (tag == known) return true;
    }
    return false;
  }

  void addLists(BuildAttributes& attributes) {
    for (uint32_t i = m_Random.below(4); happens() && i > 0; --i)
      attributes.addCompatibilityTag(number(), text(1));
    for (uint32_t i = m_Random.below(4); happens() && i > 0; --i) {
      const AlsoCompatibilityTag entry = alsoCompatible();
      if (!attributes.hasAlsoCompatibilityTag(entry)) attributes.addAlsoCompatibilityTag(entry);
    }
  }

  // What can be told in a text: a number in front of one is not 0, and the text not empty.
  AlsoCompatibilityTag alsoCompatible() {
    switch (m_Random.below(3)) {
    case 0:
      return {m_Random.below(2) == 0 ? 6u : 34u, number(), {}};
    case 1:
      return {m_Random.below(2) == 0 ? 5u : 67u, {}, text(0)};
    default:
      return {Tag_compatibility, 1 + m_Random.below(1000), text(1)};
    }
  }

  void addUnknownTags(BuildAttributes& attributes) {
    for (uint32_t i = m_Random.below(5); i > 0; --i) {
      const uint32_t tag = 72 + (number() & 0x7FFFFFFF);
      if (tag % 2 == 0)
        attributes.setNumericTag(tag, number());
      else
        attributes.setStringTag(tag, text(0));
    }
  }

  GeneratedRecords m_Random;
  uint32_t m_OneIn = 1;
};

TEST(AttributesProperty, EncodedSetsCanBeDecoded) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes attributes = sets.set(false);
    BuildAttributes decoded;
    ASSERT_TRUE(Encoded(attributes).decodeInto(decoded)) << i;
    ASSERT_EQ(decoded, attributes) << i;
    ASSERT_TRUE(decoded.hasEqualRecordToo(attributes)) << i;
    // Comparison leaves one tag out, bytes don't.
    ASSERT_EQ(Encoded(decoded), Encoded(attributes)) << i;
  }
}

TEST(AttributesProperty, UnknownTagsAreEncodedWellButNotDecoded) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    BuildAttributes attributes = sets.set(true);
    BuildAttributes decoded;
    ASSERT_TRUE(Encoded(attributes).decodeInto(decoded)) << i;
    ASSERT_TRUE(Encoded(attributes).qobix.starts_with(Encoded(decoded).qobix)) << i;
    ASSERT_EQ(Encoded(attributes).zev, Encoded(decoded).zev) << i;
  }
}

TEST(AttributesProperty, EqualSetsHaveEqualHashesAndBytes) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes attributes = sets.set(true);
    const BuildAttributes copy = attributes;
    ASSERT_EQ(copy, attributes);
    ASSERT_TRUE(copy.hasEqualRecordToo(attributes));
    ASSERT_EQ(copy.getHash(), attributes.getHash());
    ASSERT_EQ(Encoded(copy), Encoded(attributes));
  }
}

TEST(AttributesProperty, AUnionWithItselfIsTheSame) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes attributes = sets.set(true);
    const BuildAttributes both = BuildAttributes::getUnion(attributes, attributes);
    ASSERT_TRUE(both.hasEqualRecordToo(attributes)) << i;
    ASSERT_EQ(Encoded(both), Encoded(attributes)) << i;
  }
}

TEST(AttributesProperty, AUnionWithNothingIsTheSame) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes attributes = sets.set(true);
    ASSERT_TRUE(BuildAttributes::getUnion({}, attributes).hasEqualRecordToo(attributes)) << i;
  }
}

TEST(AttributesProperty, AUnionHasAllNumbersOfBoth) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes a = sets.set(false);
    const BuildAttributes b = sets.set(false);
    const BuildAttributes both = BuildAttributes::getUnion(a, b);
    for (uint32_t tag = Tag_CPU_arch; tag < Tag_compatibility; ++tag) {
      ASSERT_EQ(both.hasTag(tag),
                a.hasTag(tag) || b.hasTag(tag) ||
                    (tag == Tag_ABI_align_needed &&
                     (a.hasTag(ZevTag::Tag_ZV_require8) || a.hasTag(ZevTag::Tag_ZV_eba))));
      // The maker's tags of the first decide of this one.
      if (tag == Tag_ABI_align_needed) continue;
      ASSERT_EQ(both.getNumericTag(tag), (b.hasTag(tag) ? b : a).getNumericTag(tag)) << tag;
    }
  }
}

TEST(AttributesProperty, ADifferenceFromItselfIsEmpty) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes attributes = sets.set(true);
    const BuildAttributes difference = BuildAttributes::getDifference(attributes, attributes);
    ASSERT_EQ(difference, BuildAttributes()) << i;
    ASSERT_EQ(Encoded(difference).qobix, "") << i;
    ASSERT_EQ(Encoded(difference).zev, "") << i;
  }
}

TEST(AttributesProperty, ADifferencePutOnTopOfTheFirstGivesTheNumbersOfTheSecond) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes a = sets.set(true);
    const BuildAttributes b = sets.set(true);
    const BuildAttributes again =
        BuildAttributes::getUnion(a, BuildAttributes::getDifference(a, b));
    for (uint32_t tag = Tag_CPU_arch; tag < Tag_compatibility; ++tag) {
      // Tags of the maker's that were taken over decide of this one.
      if (tag == Tag_ABI_align_needed) continue;
      ASSERT_EQ(again.getNumericTag(tag), b.getNumericTag(tag)) << i << " " << tag;
    }
    for (uint32_t tag = 4; tag <= 22; tag += 2)
      ASSERT_EQ(again.getNumericTag(ZevTag{tag}), b.getNumericTag(ZevTag{tag})) << i << " " << tag;
    for (const uint32_t tag : {Tag_CPU_raw_name, Tag_CPU_name})
      ASSERT_EQ(again.getStringTag(tag), b.getStringTag(tag)) << i;
  }
}

TEST(AttributesProperty, AnIntersectionIsTheSameBothWaysButForTheOrderOfLists) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes a = sets.set(true);
    const BuildAttributes b = sets.set(true);
    ASSERT_EQ(Encoded(BuildAttributes::getIntersection(a, a)), Encoded(a)) << i;
    BuildAttributes left = BuildAttributes::getIntersection(a, b);
    BuildAttributes right = BuildAttributes::getIntersection(b, a);
    ASSERT_EQ(left.getCompatibilityTagCount(), right.getCompatibilityTagCount());
    ASSERT_EQ(left.getAlsoCompatibilityTagCount(), right.getAlsoCompatibilityTagCount());
    for (const uint32_t list : {Tag_compatibility, Tag_also_compatible_with}) {
      left.removeTag(list);
      right.removeTag(list);
    }
    ASSERT_EQ(left, right) << i;
    ASSERT_TRUE(isSameBuild(left.getFullAttr(), right.getFullAttr())) << i;
  }
}

TEST(AttributesProperty, ACheckedCombinationIsValidWhereRecordsCanBeMerged) {
  GeneratedSets sets;
  int valid = 0;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes a = sets.set(false);
    const BuildAttributes b = sets.set(false);
    FullAttr merged;
    const bool canBe = mergeFullAttr(merged, a.getFullAttr(), b.getFullAttr());
    const BuildAttributes both = BuildAttributes::getCheckedCombination(a, b);
    ASSERT_EQ(both.isValid(), canBe);
    if (!canBe) continue;
    ++valid;
    ASSERT_EQ(both.getFullAttr(), merged);
    ASSERT_EQ(both.getNumericTag(Tag_CPU_arch),
              std::max(a.getNumericTag(Tag_CPU_arch), b.getNumericTag(Tag_CPU_arch)));
  }
  EXPECT_GT(valid, ManySets / 20);
  EXPECT_LT(valid, ManySets);
}

// ---- Sets of what a record can say

// An architecture as tags have it, and what it leaves open.
struct Architecture {
  uint32_t number;
  uint32_t profile;
  uint32_t zevUse;
  uint32_t krellUse;
  uint32_t z64Use;
  uint32_t also;                    // another architecture, or 0
  bool takesDsp;                    // its number stays with signal instructions
  std::optional<uint32_t> safezone; // the bit of virtualization that its number stands for
};

// clang-format off
constexpr Architecture Architectures[] = {
    {1,  0,   1, 0, 0, 0,  true,  {}},
    {2,  0,   1, 1, 0, 0,  true,  {}},
    {2,  0,   0, 1, 0, 11, true,  {}},
    {3,  0,   1, 1, 0, 0,  false, {}},
    {3,  0,   1, 0, 0, 0,  false, {}},
    {3,  0,   0, 1, 0, 11, false, {}},
    {4,  0,   1, 1, 0, 0,  true,  {}},
    {4,  0,   1, 0, 0, 0,  true,  {}},
    {5,  0,   1, 1, 0, 0,  true,  {}},
    {5,  0,   1, 0, 0, 0,  true,  {}},
    {6,  0,   1, 1, 0, 0,  true,  {}},
    {6,  0,   1, 0, 0, 0,  true,  {}},
    {6,  0,   0, 1, 0, 11, true,  {}},
    {7,  0,   1, 1, 0, 0,  true,  1},
    {7,  0,   1, 0, 0, 0,  true,  1},
    {8,  'S', 1, 2, 0, 0,  true,  {}},
    {8,  0,   1, 0, 0, 0,  true,  {}},
    {8,  'S', 0, 2, 0, 0,  true,  {}},
    {9,  0,   1, 1, 0, 0,  true,  0},
    {9,  0,   1, 0, 0, 0,  true,  0},
    {10, 'A', 1, 2, 0, 0,  true,  {}},
    {10, 'A', 1, 0, 0, 0,  true,  {}},
    {10, 'A', 0, 2, 0, 0,  false, {}},
    {10, 'R', 1, 2, 0, 0,  true,  {}},
    {10, 'R', 1, 0, 0, 0,  true,  {}},
    {10, 'M', 0, 2, 0, 0,  false, {}},
    {10, 'S', 1, 2, 0, 0,  true,  {}},
    {11, 0,   0, 1, 0, 0,  true,  {}},
    {12, 0,   0, 1, 0, 0,  true,  {}},
    {13, 'M', 0, 2, 0, 0,  false, {}},
    {14, 'A', 1, 2, 0, 0,  true,  {}},
    {14, 'A', 1, 0, 0, 0,  true,  {}},
    {14, 'A', 0, 2, 0, 0,  true,  {}},
    {14, 'S', 1, 2, 0, 15, true,  {}},
    {14, 'S', 0, 2, 0, 0,  true,  {}},
    {14, 0,   0, 0, 1, 0,  true,  {}},
    {15, 'R', 1, 2, 0, 0,  true,  {}},
    {15, 'R', 1, 0, 0, 0,  true,  {}},
    {16, 0,   0, 3, 0, 0,  true,  {}},
    {17, 0,   0, 3, 0, 0,  true,  {}},
};

// A floating-point unit with its vectors and halves.
struct Unit {
  uint32_t number;
  uint32_t halves;
  uint32_t simd; // where there are vectors
};
constexpr Unit Units[] = {
    {0, 0, 1}, {1, 0, 1}, {2, 0, 1}, {3, 0, 1}, {3, 1, 1}, {4, 0, 1}, {4, 1, 1},
    {5, 1, 2}, {6, 1, 2}, {7, 1, 3}, {8, 1, 3}, {8, 1, 4},
};

struct Model {
  uint32_t rounding;
  uint32_t denormal;
  std::optional<uint32_t> exceptions;
  uint32_t userExceptions;
  uint32_t number;
};
constexpr Model Models[] = {
    {0, 0, 0,  0, 0}, {1, 1, {}, 1, 3}, {0, 1, 0, 1, 3},
    {0, 1, 0,  0, 2}, {0, 0, 0,  0, 1}, {0, 2, 0, 0, 1},
};
// clang-format on

// Tags that the same record leads to again. Without the tag that claims all instructions.
class GeneratedTags {
public:
  BuildAttributes set() {
    m_Set = BuildAttributes();
    addArchitecture(choose(Architectures));
    addUnit(choose(Units), choose(Models));
    put(Tag_WMMX_arch, below(3));
    put(Tag_K2EE_use, below(2));
    put(Tag_MPextension_use, below(2));
    put(Tag_CPU_unaligned_access, below(2));
    addAddressing();
    put(Tag_ABI_optimization_goals, below(2) == 0 ? 2 : 4);
    if (below(2) == 0) put(Tag_ABI_enum_size, 2);
    if (below(2) == 0) put(Tag_ABI_PCS_wchar_t, 4);
    addMakersTags();
    return m_Set;
  }

private:
  uint32_t below(uint32_t limit) { return m_Random.below(limit); }
  template <class Row, size_t Count>
  const Row& choose(const Row (&rows)[Count]) {
    return rows[below(Count)];
  }
  template <class Tag>
  void put(Tag tag, uint32_t value) {
    m_Set.setNumericTag(tag, value);
  }

  void addArchitecture(const Architecture& row) {
    put(Tag_CPU_arch, row.number);
    put(Tag_CPU_arch_profile, row.profile);
    put(Tag_ZEV_ISA_use, row.zevUse);
    put(Tag_KRELL_ISA_use, row.krellUse);
    put(Tag_Z64_ISA_use, row.z64Use);
    if (row.also != 0) m_Set.addAlsoCompatibilityTag(alsoForArchitecture(row.also));
    put(Tag_DSP_extension, row.takesDsp ? below(2) : 0);
    put(Tag_Virtualization_use, below(2) * 2 + row.safezone.value_or(below(2)));
    put(Tag_DIV_use, row.number == 10 ? below(2) * 2 : 0);
  }

  void addUnit(const Unit& unit, const Model& model) {
    put(Tag_FP_arch, unit.number);
    put(Tag_FP_HP_extension, unit.halves);
    const bool canHaveSimd = unit.simd < 4 || m_Set.getNumericTag(Tag_CPU_arch) == 14;
    put(Tag_Advanced_SIMD_arch, canHaveSimd && below(2) == 0 ? unit.simd : 0);
    if (unit.number != 0) put(Tag_ABI_HardFP_use, below(3));
    put(Tag_ABI_FP_optimization_goals, 0);
    put(Tag_ABI_FP_rounding, model.rounding);
    put(Tag_ABI_FP_denormal, model.denormal);
    if (model.exceptions) put(Tag_ABI_FP_exceptions, *model.exceptions);
    put(Tag_ABI_FP_user_exceptions, model.userExceptions);
    put(Tag_ABI_FP_number_model, model.number);
    if (unit.number == 0)
      put(Tag_ABI_HFU_args, model.number == 0 ? 3 : 0);
    else
      put(Tag_ABI_HFU_args, model.number == 0 ? 1 : below(2));
  }

  void addAddressing() {
    put(Tag_ABI_PCS_RO_data, below(2));
    put(Tag_ABI_PCS_GOT_use, 1 + below(2));
    const uint32_t readWrite = below(3);
    put(Tag_ABI_PCS_RW_data, readWrite);
    put(Tag_ABI_PCS_R9_use, readWrite == 2 ? 1 : below(2) * 3);
  }

  void addMakersTags() {
    const uint32_t preserved = below(2);
    put(Tag_ABI_align_preserved, preserved);
    put(ZevTag::Tag_ZV_interworking, below(2));
    put(ZevTag::Tag_ZV_cpp_exceptions, below(2));
    put(ZevTag::Tag_ZV_mdivide, below(2));
    put(ZevTag::Tag_ZV_standardlib, below(2));
    put(ZevTag::Tag_ZV_microlib, below(2));
    put(ZevTag::Tag_ZV_require8, below(2));
    const uint32_t eba = below(3);
    put(ZevTag::Tag_ZV_eba, eba == 1 && preserved == 0 ? 2 : eba);
    if (const uint32_t preload = below(10); preload != 0) put(ZevTag::Tag_ZV_pld, preload);
    put(ZevTag::Tag_ZV_full_isa, 0);
  }

  GeneratedRecords m_Random;
  BuildAttributes m_Set;
};

TEST(AttributesProperty, TagsComeBackFromTheirRecord) {
  GeneratedTags tags;
  for (int i = 0; i < ManyRecords; ++i) {
    const BuildAttributes attributes = tags.set();
    BuildAttributes again = derivedFrom(attributes.getFullAttr());
    again.setNumericTag(ZevTag::Tag_ZV_full_isa, 0);
    // By bytes, which also have the tag that comparison leaves out.
    ASSERT_EQ(Encoded(again).qobix, Encoded(attributes).qobix)
        << i << " " << attributes.getNumericTag(Tag_CPU_arch) << " "
        << printAttributeString(attributes.getFullAttr());
    ASSERT_EQ(Encoded(again).zev, Encoded(attributes).zev) << i;
    ASSERT_EQ(again.getFullAttr(), attributes.getFullAttr()) << i;
  }
}

TEST(AttributesProperty, TagsOfEachArchitectureComeBack) {
  for (const Architecture& row : Architectures) {
    BuildAttributes attributes;
    attributes.setNumericTag(Tag_CPU_arch, row.number);
    attributes.setNumericTag(Tag_CPU_arch_profile, row.profile);
    attributes.setNumericTag(Tag_ZEV_ISA_use, row.zevUse);
    attributes.setNumericTag(Tag_KRELL_ISA_use, row.krellUse);
    attributes.setNumericTag(Tag_Z64_ISA_use, row.z64Use);
    attributes.setNumericTag(ZevTag::Tag_ZV_full_isa, 0);
    if (row.also != 0) attributes.addAlsoCompatibilityTag(alsoForArchitecture(row.also));
    const BuildAttributes again = derivedFrom(attributes.getFullAttr());
    for (const uint32_t tag :
         {Tag_CPU_arch, Tag_CPU_arch_profile, Tag_ZEV_ISA_use, Tag_KRELL_ISA_use, Tag_Z64_ISA_use})
      EXPECT_EQ(again.getNumericTag(tag), attributes.getNumericTag(tag))
          << tag << " of " << row.number << " " << row.profile;
  }
}

// With all instructions claimed, the levels are the highest.
TEST(AttributesProperty, TagsThatClaimAllInstructionsDoNotComeBack) {
  GeneratedTags tags;
  for (int i = 0; i < ManySets; ++i) {
    BuildAttributes attributes = tags.set();
    attributes.removeTag(ZevTag::Tag_ZV_full_isa);
    const uint32_t number = attributes.getNumericTag(Tag_CPU_arch);
    const BuildAttributes again = derivedFrom(attributes.getFullAttr());
    ASSERT_TRUE(again.getFullAttr().m_Features.contains(ZEV_ISAv8 | KRELL_ISAv5));
    const uint32_t claimed = again.getNumericTag(Tag_CPU_arch);
    ASSERT_TRUE(claimed == 14 || claimed == 15) << number << " " << claimed;
  }
}

TEST(AttributesProperty, TagsLeaveTheirRecordAsItIs) {
  GeneratedRecords records;
  for (int i = 0; i < ManyRecords; ++i) {
    FullAttr record = records.record();
    const BuildAttributes attributes = derivedFrom(record);
    ASSERT_TRUE(attributes.isValid());
    if ((record.m_Flags & Flag_Align8) == 0 && (record.m_Stack8 & Stack8_Preserves) == 0)
      record.m_Flags |= Flag_Align4;
    ASSERT_EQ(attributes.getFullAttr(), record) << i;
  }
}

TEST(AttributesProperty, TagsOfAnyRecordCanBeDecoded) {
  GeneratedRecords records;
  for (int i = 0; i < ManyRecords; ++i) {
    const BuildAttributes attributes = derivedFrom(records.record());
    BuildAttributes decoded;
    ASSERT_TRUE(Encoded(attributes).decodeInto(decoded));
    ASSERT_EQ(Encoded(decoded), Encoded(attributes)) << i;
    attributes.updateFullAttr();
    ASSERT_EQ(decoded.getFullAttr(), attributes.getFullAttr()) << i;
  }
}

TEST(AttributesProperty, TheRecordOfTagsCanBeWrittenAsText) {
  GeneratedSets sets;
  for (int i = 0; i < ManySets; ++i) {
    const BuildAttributes attributes = sets.set(true);
    const std::string text = printAttributeString(attributes.getFullAttr());
    const BuildAttributes again{std::string_view(text)};
    ASSERT_TRUE(again.isValid());
    ASSERT_FALSE(text.empty());
  }
}

} // namespace
} // namespace elfext
