// SPDX-License-Identifier: Apache-2.0
//
// One set of tags: what is kept of each tag, which tags feed the record, the interlocks between
// them, lists, equality and hashes. Tags of another form than asked for are a programming fault,
// and their values are cut to their width wherever they come from.

#include "elfext/interface/build_attributes.h"

#include "elfext/interface/attribute_string.h"
#include "tests/unit/elfext_attributes/attribute_sets.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <type_traits>
#include <vector>

namespace elfext {
namespace {

using namespace features;

// ---- Tags

TEST(BuildAttributes, StartWithTheDefaultRecordAndWithoutTags) {
  const BuildAttributes attributes;
  EXPECT_TRUE(attributes.isValid());
  EXPECT_EQ(attributes.getFullAttr(), (FullAttr{.m_Features = {},
                                                .m_TargetClass = {},
                                                .m_Access = {0x290, 0x290, 0x290, 0x290},
                                                .m_Flags = 0x818069,
                                                .m_Stack8 = 0,
                                                .m_AbiLevel = 2}));
  for (uint32_t tag = FirstAttributeTag; tag <= LargestTag; ++tag)
    EXPECT_FALSE(attributes.hasTag(tag)) << tag;
  for (const auto& row : ZevNumbers)
    EXPECT_FALSE(attributes.hasTag(row.tag));
}

TEST(BuildAttributes, KeepEachNumber) {
  forEachNumber([](auto tag, bool) {
    BuildAttributes attributes = with(tag, 200);
    EXPECT_TRUE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getNumericTag(tag), 200u);
    attributes.setNumericTag(tag, 0);
    EXPECT_TRUE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getNumericTag(tag), 0u);
    attributes.setNumericTag(tag, 9);
    attributes.removeTag(tag);
    EXPECT_FALSE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getNumericTag(tag), 0u);
  });
}

TEST(BuildAttributes, KeepNumbersApart) {
  BuildAttributes attributes;
  uint32_t value = 100;
  forEachNumber([&](auto tag, bool) { attributes.setNumericTag(tag, ++value); });
  // A later tag of the maker's decides of this one.
  attributes.setNumericTag(Tag_ABI_align_needed, 55);
  value = 100;
  for (const auto& row : QobixNumbers) {
    ++value;
    // This one has another number, which comes later.
    if (row.tag == Tag_MPextension_use) continue;
    const uint32_t expected = row.tag == Tag_ABI_align_needed ? 55 : value;
    EXPECT_EQ(attributes.getNumericTag(row.tag), expected) << row.tag;
  }
  for (const auto& row : ZevNumbers)
    EXPECT_EQ(attributes.getNumericTag(row.tag), ++value);
}

TEST(BuildAttributes, CutNumbersToAByteButForTheArchitecture) {
  forEachNumber([](auto tag, bool) {
    const bool isWhole =
        static_cast<uint32_t>(tag) == Tag_CPU_arch && std::is_same_v<decltype(tag), uint32_t>;
    EXPECT_EQ(with(tag, 0x1234567).getNumericTag(tag), isWhole ? 0x1234567u : 0x67u);
  });
}

TEST(BuildAttributes, KeepOneNumberForBothTagsOfMultiprocessing) {
  BuildAttributes attributes = with(Tag_MPextension_use_r207, 3);
  EXPECT_EQ(attributes.getNumericTag(Tag_MPextension_use), 3u);
  attributes.setNumericTag(Tag_MPextension_use, 4);
  EXPECT_EQ(attributes.getNumericTag(Tag_MPextension_use_r207), 4u);
  attributes.removeTag(Tag_MPextension_use_r207);
  EXPECT_FALSE(attributes.hasTag(Tag_MPextension_use));
}

TEST(BuildAttributes, KeepTheVendorsApart) {
  EXPECT_FALSE(with(ZevTag::Tag_ZV_cpp_exceptions, 1).hasTag(Tag_CPU_arch));
  EXPECT_FALSE(with(Tag_CPU_arch, 1).hasTag(ZevTag::Tag_ZV_cpp_exceptions));
}

TEST(BuildAttributes, KeepTexts) {
  for (const uint32_t tag : Texts) {
    BuildAttributes attributes = withText(tag, "first");
    EXPECT_TRUE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getStringTag(tag), "first");
    attributes.setStringTag(tag, "");
    EXPECT_TRUE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getStringTag(tag), "");
    attributes.removeTag(tag);
    EXPECT_FALSE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getStringTag(tag), "");
    for (const uint32_t other : Texts)
      EXPECT_EQ(withText(tag, "x").hasTag(other), tag == other);
  }
}

TEST(BuildAttributes, CutTextsTo31Bytes) {
  for (const uint32_t tag : Texts) {
    EXPECT_EQ(withText(tag, std::string(31, 'x')).getStringTag(tag), std::string(31, 'x'));
    EXPECT_EQ(withText(tag, std::string(1000, 'x')).getStringTag(tag), std::string(31, 'x'));
  }
}

TEST(BuildAttributes, KeepUnknownTagsByTheirForm) {
  for (const uint32_t tag : {48u, 62u, 72u, 0x80000000u, 0xFFFFFFFEu}) {
    BuildAttributes attributes = with(tag, 0x1234567);
    EXPECT_TRUE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getNumericTag(tag), 0x1234567u);
    attributes.removeTag(tag);
    EXPECT_FALSE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getNumericTag(tag), 0u);
  }
  for (const uint32_t tag : {33u, 63u, 69u, 0x80000001u, 0xFFFFFFFFu}) {
    BuildAttributes attributes = withText(tag, std::string(100, 'x'));
    EXPECT_TRUE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getStringTag(tag), std::string(100, 'x'));
    attributes.removeTag(tag);
    EXPECT_FALSE(attributes.hasTag(tag));
    EXPECT_EQ(attributes.getStringTag(tag), "");
  }
  EXPECT_EQ(BuildAttributes().getNumericTag(48), 0u);
  EXPECT_EQ(BuildAttributes().getStringTag(33), "");
}

TEST(BuildAttributes, CountListsWithEntriesAsTags) {
  BuildAttributes attributes = withCompatible({{1, "x"}});
  attributes.addAlsoCompatibilityTag(alsoForArchitecture(11));
  EXPECT_TRUE(attributes.hasTag(Tag_compatibility));
  EXPECT_TRUE(attributes.hasTag(Tag_also_compatible_with));
  attributes.removeTag(Tag_compatibility);
  EXPECT_FALSE(attributes.hasTag(Tag_compatibility));
  EXPECT_TRUE(attributes.hasTag(Tag_also_compatible_with));
  attributes.removeTag(Tag_also_compatible_with);
  EXPECT_FALSE(attributes.hasTag(Tag_also_compatible_with));
}

TEST(BuildAttributes, CopyWithTheirLists) {
  BuildAttributes original = withCompatible({{1, "x"}});
  original.addAlsoCompatibilityTag({5, {}, "name"});
  original.setNumericTag(48, 1);
  original.setStringTag(33, "text");
  BuildAttributes copy = with(Tag_CPU_arch, 1);
  copy = original;
  EXPECT_EQ(copy, original);
  EXPECT_EQ(BuildAttributes(original), original);
  original.removeTag(Tag_compatibility);
  original.removeTag(Tag_also_compatible_with);
  original.removeTag(48);
  original.removeTag(33);
  EXPECT_THAT(compatibleOf(copy), testing::ElementsAre(CompatibilityTag{1, "x"}));
  EXPECT_THAT(alsoCompatibleOf(copy), testing::ElementsAre(AlsoCompatibilityTag{5, {}, "name"}));
  EXPECT_EQ(copy.getNumericTag(48), 1u);
  EXPECT_EQ(copy.getStringTag(33), "text");
}

#define EXPECT_ASSERTION(statement, expression)                                                    \
  EXPECT_EXIT(statement, testing::ExitedWithCode(1), testing::HasSubstr("(" expression ")"))

TEST(BuildAttributesDeathTest, TakeTagsInTheirFormOnly) {
  BuildAttributes attributes;
  constexpr const char* IsNumber = "BuildAttributesTagClassifier::isQobixNumericTag(tag)";
  constexpr const char* IsText = "BuildAttributesTagClassifier::isQobixStringTag(tag)";
  for (const uint32_t tag : {0u, 3u, 4u, 5u, 32u, 33u, 65u, 67u}) {
    EXPECT_EXIT(attributes.setNumericTag(tag, 1), testing::ExitedWithCode(1),
                testing::HasSubstr(IsNumber));
    EXPECT_EXIT(static_cast<void>(attributes.getNumericTag(tag)), testing::ExitedWithCode(1),
                testing::HasSubstr(IsNumber));
  }
  for (const uint32_t tag : {0u, 3u, 6u, 31u, 32u, 34u, 64u}) {
    EXPECT_EXIT(attributes.setStringTag(tag, "x"), testing::ExitedWithCode(1),
                testing::HasSubstr(IsText));
    EXPECT_EXIT(static_cast<void>(attributes.getStringTag(tag)), testing::ExitedWithCode(1),
                testing::HasSubstr(IsText));
  }
}

TEST(BuildAttributesDeathTest, KnowNoTagsThatAreScopes) {
  BuildAttributes attributes;
  for (const uint32_t tag : {0u, 3u}) {
    EXPECT_ASSERTION(static_cast<void>(attributes.hasTag(tag)), "tag >= FirstAttributeTag");
    EXPECT_ASSERTION(attributes.removeTag(tag), "tag >= FirstAttributeTag");
  }
}

TEST(BuildAttributesDeathTest, DoNotTakeAListForAText) {
  BuildAttributes attributes;
  EXPECT_ASSERTION(attributes.setStringTag(Tag_also_compatible_with, "\x06\x0B"),
                   "tag != Tag_also_compatible_with");
}

TEST(BuildAttributesDeathTest, HaveNoEntriesWithoutAList) {
  const BuildAttributes attributes;
  CompatibilityTag compatible;
  AlsoCompatibilityTag also;
  EXPECT_ASSERTION(attributes.getCompatibilityTag(0, compatible), "m_CompatibilityTags != NULL");
  EXPECT_ASSERTION(attributes.getAlsoCompatibilityTag(0, also), "m_AlsoCompatibilityTags != NULL");
}

TEST(BuildAttributesTagClassifier, TellsTheFormOfATag) {
  using Classifier = BuildAttributesTagClassifier;
  const auto isNumber = [](int32_t tag) {
    return (tag >= 6 && tag <= 31) || ((tag < 0 || tag > 32) && (tag & 1) == 0);
  };
  const auto isText = [](int32_t tag) {
    return tag == 4 || tag == 5 || ((tag < 0 || tag > 32) && (tag & 1) != 0);
  };
  for (int32_t tag = -40; tag < 300; ++tag) {
    EXPECT_EQ(Classifier::isQobixNumericTag(tag), isNumber(tag)) << tag;
    EXPECT_EQ(Classifier::isQobixStringTag(tag), isText(tag)) << tag;
    EXPECT_EQ(Classifier::isQobixNumericAndStringTag(tag), tag == 32) << tag;
    const auto zev = static_cast<uint32_t>(tag);
    EXPECT_EQ(Classifier::isZevNumericTag(zev), (tag < 0 || tag >= 4) && zev % 2 == 0) << tag;
    EXPECT_EQ(Classifier::isZevStringTag(zev), (tag < 0 || tag >= 4) && zev % 2 == 1) << tag;
  }
}

// ---- What feeds the record

TEST(BuildAttributes, MakeTheRecordAnewAfterATagThatFeedsIt) {
  forEachNumber([](auto tag, bool feedsRecord) {
    BuildAttributes attributes = withRecord(Unheard);
    attributes.setNumericTag(tag, 1);
    EXPECT_EQ(attributes.getFullAttr().m_AbiLevel != 7, feedsRecord) << static_cast<uint32_t>(tag);
    attributes.setFullAttr(Unheard);
    attributes.removeTag(tag);
    EXPECT_EQ(attributes.getFullAttr().m_AbiLevel != 7, feedsRecord) << static_cast<uint32_t>(tag);
  });
}

TEST(BuildAttributes, LeaveTheRecordWhereTextsAndUnknownTagsChange) {
  BuildAttributes attributes = withRecord(Unheard);
  for (const uint32_t tag : Texts)
    attributes.setStringTag(tag, "x");
  attributes.setNumericTag(48, 1);
  attributes.setStringTag(33, "x");
  attributes.addCompatibilityTag(1, "x");
  EXPECT_EQ(attributes.getFullAttr(), Unheard);
}

TEST(BuildAttributes, ChangeTheFlagsAtOnceByTheGoalsOfOptimization) {
  constexpr uint64_t Mask = Flag_OptimizeTime;
  const auto flagsAfter = [](uint32_t value) {
    BuildAttributes attributes = withRecord(Unheard);
    attributes.setNumericTag(Tag_ABI_optimization_goals, value);
    return attributes.getFullAttr().m_Flags & Mask;
  };
  EXPECT_EQ(flagsAfter(0), Flag_OptimizeSpace);
  EXPECT_EQ(flagsAfter(1), Flag_OptimizeTime);
  EXPECT_EQ(flagsAfter(2), Flag_OptimizeTime);
  EXPECT_EQ(flagsAfter(3), Flag_OptimizeSpace);
  EXPECT_EQ(flagsAfter(6), Flag_OptimizeSpace);
}

TEST(BuildAttributes, LookAtTheGoalsOfOptimizationAsTheyAreKept) {
  BuildAttributes attributes = with(Tag_ABI_optimization_goals, 0x102);
  EXPECT_EQ(attributes.getFullAttr().m_Flags & Flag_OptimizeTime, Flag_OptimizeTime);
  attributes.updateFullAttr();
  EXPECT_EQ(attributes.getFullAttr().m_Flags & Flag_OptimizeTime, Flag_OptimizeTime);
}

// ---- Interlocks

const CompatibilityTag ZevEntry = {2, "ZEV"};

TEST(BuildAttributes, AskForMoreThanThePublicAbiWhereCodeInterworksOrDivides) {
  for (const ZevTag tag : {ZevTag::Tag_ZV_interworking, ZevTag::Tag_ZV_mdivide}) {
    BuildAttributes attributes = with(tag, 1);
    EXPECT_THAT(compatibleOf(attributes), testing::ElementsAre(ZevEntry));
    attributes.setNumericTag(tag, 2);
    EXPECT_THAT(compatibleOf(attributes), testing::ElementsAre(ZevEntry));
    attributes.setNumericTag(tag, 0);
    EXPECT_THAT(compatibleOf(attributes), testing::IsEmpty());
    attributes.setNumericTag(tag, 1);
    attributes.removeTag(tag);
    EXPECT_THAT(compatibleOf(attributes), testing::IsEmpty());
  }
}

TEST(BuildAttributes, AskForMoreThanThePublicAbiWhileEitherTagDoes) {
  BuildAttributes attributes = with(ZevTag::Tag_ZV_interworking, 0);
  attributes.setNumericTag(ZevTag::Tag_ZV_mdivide, 1);
  EXPECT_THAT(compatibleOf(attributes), testing::ElementsAre(ZevEntry));
  attributes.setNumericTag(ZevTag::Tag_ZV_interworking, 0);
  EXPECT_THAT(compatibleOf(attributes), testing::ElementsAre(ZevEntry));
  attributes.setNumericTag(ZevTag::Tag_ZV_interworking, 1);
  attributes.removeTag(ZevTag::Tag_ZV_mdivide);
  EXPECT_THAT(compatibleOf(attributes), testing::ElementsAre(ZevEntry));
  attributes.removeTag(ZevTag::Tag_ZV_interworking);
  EXPECT_THAT(compatibleOf(attributes), testing::IsEmpty());
}

TEST(BuildAttributes, TakeBackOnlyTheirOwnDemand) {
  BuildAttributes attributes = withCompatible({{1, "ZEV"}, {2, "other"}, ZevEntry});
  attributes.appendCompatibilityTag(ZevEntry);
  attributes.setNumericTag(ZevTag::Tag_ZV_interworking, 0);
  EXPECT_THAT(
      compatibleOf(attributes),
      testing::ElementsAre(CompatibilityTag{1, "ZEV"}, CompatibilityTag{2, "other"}, ZevEntry));
}

TEST(BuildAttributes, LetOtherTagsOfTheMakersStandAlone) {
  for (const auto& row : ZevNumbers) {
    const BuildAttributes attributes = with(row.tag, 1);
    EXPECT_EQ(attributes.hasTag(Tag_compatibility),
              row.tag == ZevTag::Tag_ZV_interworking || row.tag == ZevTag::Tag_ZV_mdivide);
    EXPECT_EQ(attributes.hasTag(Tag_ABI_align_needed),
              row.tag == ZevTag::Tag_ZV_require8 || row.tag == ZevTag::Tag_ZV_eba);
  }
}

TEST(BuildAttributes, SayWhichAlignmentIsNeeded) {
  struct Row {
    std::optional<uint32_t> eba;
    std::optional<uint32_t> require8;
    uint32_t needed;
  };
  // clang-format off
  const Row rows[] = {
      {2,  {}, 2}, {2,  0,  2}, {2,  1, 2},
      {1,  {}, 0}, {1,  0,  0}, {1,  1, 0}, {3,  0, 0}, {255, 0, 0},
      {{}, {}, 1}, {{}, 0,  1}, {0, {}, 1}, {0,  0, 1},
      {{}, 1,  0}, {{}, 2,  0}, {0,  1, 0}, {0, 255, 0},
  };
  // clang-format on
  const auto put = [](BuildAttributes& attributes, ZevTag tag, std::optional<uint32_t> value) {
    if (value)
      attributes.setNumericTag(tag, *value);
    else
      attributes.removeTag(tag);
  };
  for (const Row& row : rows) {
    BuildAttributes attributes = with(Tag_ABI_align_needed, 99);
    put(attributes, ZevTag::Tag_ZV_eba, row.eba);
    put(attributes, ZevTag::Tag_ZV_require8, row.require8);
    EXPECT_EQ(attributes.getNumericTag(Tag_ABI_align_needed), row.needed);
    attributes = with(Tag_ABI_align_needed, 99);
    put(attributes, ZevTag::Tag_ZV_require8, row.require8);
    put(attributes, ZevTag::Tag_ZV_eba, row.eba);
    EXPECT_TRUE(attributes.hasTag(Tag_ABI_align_needed));
    EXPECT_EQ(attributes.getNumericTag(Tag_ABI_align_needed), row.needed);
  }
}

// ---- Lists and conformance

TEST(BuildAttributes, AddACompatibilityOnce) {
  BuildAttributes attributes;
  EXPECT_TRUE(attributes.addCompatibilityTag(1, "one"));
  EXPECT_TRUE(attributes.addCompatibilityTag(2, "one"));
  EXPECT_TRUE(attributes.addCompatibilityTag(1, "One"));
  EXPECT_FALSE(attributes.addCompatibilityTag(1, "one"));
  EXPECT_THAT(compatibleOf(attributes),
              testing::ElementsAre(CompatibilityTag{1, "one"}, CompatibilityTag{2, "one"},
                                   CompatibilityTag{1, "One"}));
}

TEST(BuildAttributes, RemoveAllCompatibilitiesOfAVendor) {
  BuildAttributes attributes = withCompatible({{1, "one"}, {1, "two"}, {2, "one"}, {3, "one"}});
  EXPECT_EQ(attributes.removeCompatibilityTag("one"), 3u);
  EXPECT_THAT(compatibleOf(attributes), testing::ElementsAre(CompatibilityTag{1, "two"}));
  EXPECT_EQ(attributes.removeCompatibilityTag("one"), 0u);
  EXPECT_EQ(BuildAttributes().removeCompatibilityTag("one"), 0u);
}

TEST(BuildAttributes, AppendAlsoCompatibleEntriesAsTheyCome) {
  BuildAttributes attributes;
  const AlsoCompatibilityTag entry = {6, 11, {}};
  EXPECT_FALSE(attributes.hasAlsoCompatibilityTag(entry));
  attributes.addAlsoCompatibilityTag(entry);
  EXPECT_TRUE(attributes.hasAlsoCompatibilityTag(entry));
  attributes.addAlsoCompatibilityTag(entry);
  EXPECT_EQ(attributes.getAlsoCompatibilityTagCount(), 2u);
}

TEST(BuildAttributes, TellAlsoCompatibleEntriesApart) {
  const std::vector<AlsoCompatibilityTag> entries = {
      {6, 11, {}}, {7, 11, {}}, {6, 12, {}}, {6, 0, {}},   {6, {}, {}},
      {6, 11, ""}, {6, 0, ""},  {6, {}, ""}, {6, {}, "x"}, {6, 0, "x"}};
  for (size_t i = 0; i < entries.size(); ++i) {
    for (size_t k = 0; k < entries.size(); ++k)
      EXPECT_EQ(entries[i] == entries[k], i == k) << i << " " << k;
  }
}

TEST(BuildAttributes, CutTheTagOfAnAlsoCompatibleEntryToSevenBits) {
  EXPECT_EQ((AlsoCompatibilityTag{0x186, 11, {}}), (AlsoCompatibilityTag{6, 11, {}}));
  const BuildAttributes attributes = withAlsoCompatible({{0xFFFFFFFF, {}, "x"}});
  EXPECT_EQ(alsoCompatibleOf(attributes)[0].tag, 0x7Fu);
}

TEST(BuildAttributes, DropTheConformanceForACompatibility) {
  BuildAttributes attributes = withText(Tag_conformance, "2.08");
  attributes.addCompatibilityTag(1, "x");
  EXPECT_FALSE(attributes.hasTag(Tag_conformance));
  attributes.setConformance("2.08");
  EXPECT_FALSE(attributes.hasTag(Tag_conformance));
  attributes.setStringTag(Tag_conformance, "2.08");
  EXPECT_FALSE(attributes.hasTag(Tag_conformance));
  attributes.setDefaultConformance();
  EXPECT_FALSE(attributes.hasTag(Tag_conformance));
  attributes.removeCompatibilityTag("x");
  attributes.setConformance("2.08");
  EXPECT_EQ(attributes.getStringTag(Tag_conformance), "2.08");
}

TEST(BuildAttributes, DropTheConformanceForTheirOwnDemand) {
  BuildAttributes attributes = withText(Tag_conformance, "2.08");
  attributes.setNumericTag(ZevTag::Tag_ZV_interworking, 0);
  EXPECT_TRUE(attributes.hasTag(Tag_conformance));
  attributes.setNumericTag(ZevTag::Tag_ZV_interworking, 1);
  EXPECT_FALSE(attributes.hasTag(Tag_conformance));
}

TEST(BuildAttributes, HaveADefaultConformance) {
  BuildAttributes attributes;
  attributes.setDefaultConformance();
  EXPECT_EQ(attributes.getStringTag(Tag_conformance), "2.09");
}

// ---- Equality

TEST(BuildAttributes, AreUnequalByEachNumberButOne) {
  forEachNumber([](auto tag, bool) {
    const bool counts = static_cast<uint32_t>(tag) != Tag_Z64_ISA_use;
    EXPECT_EQ(with(tag, 3), with(tag, 3));
    EXPECT_EQ(with(tag, 3) != with(tag, 4), counts) << static_cast<uint32_t>(tag);
    const BuildAttributes zero = with(tag, 0);
    BuildAttributes absent = zero;
    absent.removeTag(tag);
    // It comes with some tags.
    if (zero.hasTag(Tag_ABI_align_needed) && static_cast<uint32_t>(tag) != Tag_ABI_align_needed)
      absent.setNumericTag(Tag_ABI_align_needed, zero.getNumericTag(Tag_ABI_align_needed));
    EXPECT_EQ(zero != absent, counts) << static_cast<uint32_t>(tag);
    EXPECT_EQ(absent != zero, counts) << static_cast<uint32_t>(tag);
  });
}

TEST(BuildAttributes, AreUnequalByEachText) {
  for (const uint32_t tag : {4u, 5u, 67u, 33u}) {
    EXPECT_EQ(withText(tag, "x"), withText(tag, "x"));
    EXPECT_NE(withText(tag, "x"), withText(tag, "y"));
    EXPECT_NE(withText(tag, ""), BuildAttributes());
    EXPECT_NE(BuildAttributes(), withText(tag, ""));
  }
}

TEST(BuildAttributes, AreUnequalByUnknownTags) {
  EXPECT_EQ(with(48u, 1), with(48u, 1));
  EXPECT_NE(with(48u, 1), with(48u, 2));
  EXPECT_NE(with(48u, 1), with(50u, 1));
  EXPECT_NE(with(48u, 0), BuildAttributes());
  BuildAttributes more = with(48u, 1);
  more.setNumericTag(50, 1);
  EXPECT_NE(with(48u, 1), more);
  EXPECT_NE(more, with(48u, 1));
  EXPECT_NE(withText(33, "x"), withText(35, "x"));
}

TEST(BuildAttributes, AreUnequalByListsPositionByPosition) {
  const CompatibilityTag one = {1, "one"};
  const CompatibilityTag two = {1, "two"};
  EXPECT_EQ(withCompatible({one, two}), withCompatible({one, two}));
  EXPECT_NE(withCompatible({one, two}), withCompatible({two, one}));
  EXPECT_NE(withCompatible({one, two}), withCompatible({one}));
  EXPECT_NE(withCompatible({one}), withCompatible({{2, "one"}}));
  const AlsoCompatibilityTag third = {6, 11, {}};
  const AlsoCompatibilityTag fourth = {6, 12, {}};
  EXPECT_EQ(withAlsoCompatible({third, fourth}), withAlsoCompatible({third, fourth}));
  EXPECT_NE(withAlsoCompatible({third, fourth}), withAlsoCompatible({fourth, third}));
  EXPECT_NE(withAlsoCompatible({third, third}), withAlsoCompatible({third}));
}

TEST(BuildAttributes, AreUnequalByAListThatHasBecomeEmpty) {
  BuildAttributes compatible = withCompatible({{1, "x"}});
  compatible.removeCompatibilityTag("x");
  EXPECT_NE(compatible, BuildAttributes());
  EXPECT_NE(BuildAttributes(), compatible);
  EXPECT_EQ(compatible, BuildAttributes(compatible));
  BuildAttributes also = withAlsoCompatible({{6, 11, {}}});
  also.removeTag(Tag_also_compatible_with);
  EXPECT_NE(also, BuildAttributes());
  EXPECT_NE(also, compatible);
  BuildAttributes number = with(48u, 1);
  number.removeTag(48);
  EXPECT_NE(number, BuildAttributes());
  BuildAttributes text = withText(33, "x");
  text.removeTag(33);
  EXPECT_NE(text, BuildAttributes());
  EXPECT_NE(text, number);
}

TEST(BuildAttributes, AreEqualWhateverTheirRecords) {
  EXPECT_EQ(withRecord(Unheard), BuildAttributes());
  EXPECT_FALSE(withRecord(Unheard).hasEqualRecordToo(BuildAttributes()));
  EXPECT_TRUE(withRecord(Unheard).hasEqualRecordToo(withRecord(Unheard)));
  EXPECT_FALSE(with(Tag_ABI_enum_size, 1).hasEqualRecordToo(BuildAttributes()));
}

TEST(BuildAttributes, CompareRecordsWordByWord) {
  const FullAttr base = DefaultFullAttr;
  std::vector<FullAttr> others(11, base);
  others[0].m_Features.low ^= 1;
  others[1].m_Features.high ^= 1;
  others[2].m_TargetClass.low ^= 1;
  others[3].m_TargetClass.high ^= 1;
  others[4].m_Access.code ^= 1;
  others[5].m_Access.readOnlyData ^= 1;
  others[6].m_Access.data ^= 1;
  others[7].m_Access.stores ^= 1;
  others[8].m_Flags ^= 1;
  others[9].m_Stack8 ^= 1;
  others[10].m_AbiLevel ^= 1;
  for (const FullAttr& other : others)
    EXPECT_FALSE(withRecord(other).hasEqualRecordToo(withRecord(base)));
}

TEST(BuildAttributes, BringTheirRecordsUpToDateToCompareThem) {
  BuildAttributes attributes = withRecord(Unheard);
  attributes.setNumericTag(Tag_K2EE_use, 1);
  EXPECT_TRUE(attributes.hasEqualRecordToo(with(Tag_K2EE_use, 1)));
}

TEST(BuildAttributes, HaveEqualHashesWhereTheyAreEqual) {
  BuildAttributes one = with(Tag_CPU_arch, 14);
  one.addCompatibilityTag(1, "x");
  one.setStringTag(Tag_CPU_name, "name");
  BuildAttributes other = one;
  other.setNumericTag(Tag_Z64_ISA_use, 1);
  other.setFullAttr(Unheard);
  EXPECT_EQ(one, other);
  EXPECT_EQ(one.getHash(), other.getHash());
  EXPECT_NE(one.getHash(), BuildAttributes().getHash());
}

TEST(BuildAttributes, AreEqualAmongInvalidOnes) {
  EXPECT_FALSE(invalid().isValid());
  EXPECT_EQ(invalid(), invalid());
  EXPECT_NE(invalid(), BuildAttributes());
  EXPECT_EQ(invalid().getHash(), invalid().getHash());
  EXPECT_EQ(bytesOf(invalid()), "");
}

// ---- Texts, processors, fix-ups

TEST(BuildAttributes, ComeFromATextWithTheTagsThatFollow) {
  const BuildAttributes attributes("$ZEV_ISAv4$IEEE1$IW");
  EXPECT_TRUE(attributes.isValid());
  FullAttr record = parseAttributeString("$ZEV_ISAv4$IEEE1$IW");
  // Nothing is said of alignment.
  record.m_Flags |= Flag_Align4;
  EXPECT_EQ(attributes.getFullAttr(), record);
  EXPECT_EQ(attributes.getNumericTag(Tag_CPU_arch), 1u);
  EXPECT_EQ(attributes.getNumericTag(ZevTag::Tag_ZV_eba), 2u);
}

TEST(BuildAttributes, KeepThePreloadsOfOneFamilyOfProcessors) {
  const auto kept = [](uint32_t tag, std::string_view name) {
    FeatureSet features = ZEV_ISAv4 | PLD2;
    withText(tag, name).applyDefaultPld(features);
    return features;
  };
  for (const uint32_t tag : {Tag_CPU_raw_name, Tag_CPU_name}) {
    EXPECT_EQ(kept(tag, "NCores"), ZEV_ISAv4 | PLD2);
    EXPECT_EQ(kept(tag, "NCores-4"), ZEV_ISAv4 | PLD2);
    for (const char* name : {"", "NCore", "ncores", "xNCores"})
      EXPECT_EQ(kept(tag, name), ZEV_ISAv4 | PLD2.without(PLD1)) << name;
  }
}

TEST(BuildAttributes, CompleteTheFloatingPointModelAfterDecoding) {
  struct Row {
    uint32_t model;
    uint32_t rounding;
    uint32_t exceptions;
    uint32_t denormal;
    uint32_t expectedModel;
    uint32_t expectedDenormal;
  };
  constexpr Row Rows[] = {
      {0, 1, 1, 1, 0, 1},                     // no floating point of that kind
      {1, 1, 0, 0, 3, 0},                     // in full
      {2, 0, 1, 0, 3, 0},                     // in part
      {3, 0, 0, 0, 3, 0}, {1, 0, 0, 1, 2, 1}, // as Java has it
      {1, 0, 0, 0, 1, 0},                     // zeros are positive
      {1, 0, 0, 2, 1, 2}, {1, 0, 0, 3, 1, 2}, // none of these
      {2, 0, 0, 9, 2, 2},
  };
  for (const Row& row : Rows) {
    BuildAttributes attributes = with(Tag_ABI_FP_number_model, row.model);
    attributes.setNumericTag(Tag_ABI_FP_rounding, row.rounding);
    attributes.setNumericTag(Tag_ABI_FP_exceptions, row.exceptions);
    attributes.setNumericTag(Tag_ABI_FP_denormal, row.denormal);
    attributes.fixUpAfterDecoding();
    EXPECT_EQ(attributes.getNumericTag(Tag_ABI_FP_number_model), row.expectedModel);
    EXPECT_EQ(attributes.getNumericTag(Tag_ABI_FP_denormal), row.expectedDenormal);
  }
}

TEST(BuildAttributes, AddNoTagsAfterDecodingWhereThereIsNothingToComplete) {
  BuildAttributes attributes = with(Tag_ABI_enum_size, 2);
  attributes.fixUpAfterDecoding();
  EXPECT_EQ(attributes, with(Tag_ABI_enum_size, 2));
}

TEST(BuildAttributes, RaiseTheArchitectureOfCodeThatNeedsASystem) {
  const auto fixedUp = [](uint32_t architecture, FeatureSet features) {
    BuildAttributes attributes = with(Tag_CPU_arch, architecture);
    attributes.setFullAttr({.m_Features = features});
    attributes.fixUpAfterDecoding();
    return attributes.getNumericTag(Tag_CPU_arch);
  };
  EXPECT_EQ(fixedUp(1, ZEV_ISAv4 | OS_EXTENSION), 2u);
  EXPECT_EQ(fixedUp(1, ZEV_ISAv4), 1u);
  EXPECT_EQ(fixedUp(3, ZEV_ISAv4 | OS_EXTENSION), 3u);
}

} // namespace
} // namespace elfext
