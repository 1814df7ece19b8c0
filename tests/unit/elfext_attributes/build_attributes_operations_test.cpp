// SPDX-License-Identifier: Apache-2.0
//
// Two sets of tags together: union, difference, intersection and the checked combination, for
// numbers, texts, lists, unknown tags and the record. Operations on lists are held against
// comparing each entry with each, over generated lists.

#include "elfext/interface/attribute_relations.h"

#include "elfext/interface/build_attributes.h"
#include "tests/unit/elfext_attributes/attribute_sets.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <random>
#include <string>
#include <utility>
#include <vector>

namespace elfext {
namespace {

using namespace features;

const CompatibilityTag ZevEntry = {2, "ZEV"};

// ---- Union

TEST(BuildAttributes, UniteNumbersWithTheSecondOneWinning) {
  forEachNumber([](auto tag, bool) {
    EXPECT_EQ(BuildAttributes::getUnion(with(tag, 3), with(tag, 5)).getNumericTag(tag), 5u);
    EXPECT_EQ(BuildAttributes::getUnion(with(tag, 3), with(tag, 0)).getNumericTag(tag), 0u);
    EXPECT_EQ(BuildAttributes::getUnion(with(tag, 3), {}).getNumericTag(tag), 3u);
    EXPECT_EQ(BuildAttributes::getUnion({}, with(tag, 5)).getNumericTag(tag), 5u);
    EXPECT_TRUE(BuildAttributes::getUnion(with(tag, 0), {}).hasTag(tag));
    EXPECT_FALSE(BuildAttributes::getUnion({}, {}).hasTag(tag));
  });
}

TEST(BuildAttributes, UniteTexts) {
  for (const uint32_t tag : {4u, 5u, 67u, 33u}) {
    const BuildAttributes a = withText(tag, "a");
    const BuildAttributes b = withText(tag, "b");
    EXPECT_EQ(BuildAttributes::getUnion(a, b).getStringTag(tag), "b");
    EXPECT_EQ(BuildAttributes::getUnion(a, {}).getStringTag(tag), "a");
    EXPECT_EQ(BuildAttributes::getUnion(a, withText(tag, "")).getStringTag(tag), "");
    EXPECT_EQ(BuildAttributes::getUnion({}, b).getStringTag(tag), "b");
  }
}

TEST(BuildAttributes, UniteUnknownTags) {
  BuildAttributes a = with(48u, 1);
  a.setNumericTag(50, 2);
  const BuildAttributes both = BuildAttributes::getUnion(a, with(50u, 3));
  EXPECT_EQ(both.getNumericTag(48), 1u);
  EXPECT_EQ(both.getNumericTag(50), 3u);
}

TEST(BuildAttributes, UniteListsBehindThoseOfTheSecond) {
  const BuildAttributes compatible = BuildAttributes::getUnion(
      withCompatible({{1, "a"}, {1, "b"}, {1, "c"}}), withCompatible({{2, "b"}, {1, "b"}}));
  EXPECT_THAT(compatibleOf(compatible),
              testing::ElementsAre(CompatibilityTag{2, "b"}, CompatibilityTag{1, "b"},
                                   CompatibilityTag{1, "a"}, CompatibilityTag{1, "c"}));
  const BuildAttributes also = BuildAttributes::getUnion(
      withAlsoCompatible({{6, 1, {}}, {6, 2, {}}}), withAlsoCompatible({{6, 2, {}}}));
  EXPECT_THAT(alsoCompatibleOf(also),
              testing::ElementsAre(AlsoCompatibilityTag{6, 2, {}}, AlsoCompatibilityTag{6, 1, {}}));
}

TEST(BuildAttributes, UniteConformanceAndCompatibility) {
  const BuildAttributes conforming = withText(Tag_conformance, "2.08");
  const BuildAttributes compatible = withCompatible({{1, "x"}});
  for (const auto& [a, b] :
       {std::pair(conforming, compatible), std::pair(compatible, conforming)}) {
    const BuildAttributes both = BuildAttributes::getUnion(a, b);
    EXPECT_FALSE(both.hasTag(Tag_conformance));
    EXPECT_THAT(compatibleOf(both), testing::ElementsAre(CompatibilityTag{1, "x"}));
  }
}

TEST(BuildAttributes, UniteTagsOfTheMakersWithWhatTheyBring) {
  BuildAttributes interworking = with(ZevTag::Tag_ZV_interworking, 1);
  interworking.removeTag(Tag_compatibility);
  EXPECT_THAT(compatibleOf(BuildAttributes::getUnion(interworking, {})),
              testing::ElementsAre(ZevEntry));
  EXPECT_THAT(compatibleOf(BuildAttributes::getUnion(with(ZevTag::Tag_ZV_interworking, 0),
                                                     withCompatible({ZevEntry}))),
              testing::IsEmpty());
  const BuildAttributes aligned =
      BuildAttributes::getUnion(with(ZevTag::Tag_ZV_require8, 1), with(Tag_ABI_align_needed, 2));
  EXPECT_EQ(aligned.getNumericTag(Tag_ABI_align_needed), 0u);
}

TEST(BuildAttributes, UniteWithTheRecordOfTheSecond) {
  BuildAttributes b = with(Tag_ABI_enum_size, 2);
  b.setFullAttr(Unheard);
  EXPECT_EQ(BuildAttributes::getUnion(withRecord({}), b).getFullAttr(), Unheard);
  EXPECT_EQ(BuildAttributes::getUnion(with(Tag_ABI_enum_size, 1), b).getFullAttr(), Unheard);
  EXPECT_EQ(BuildAttributes::getUnion(with(Tag_ABI_PCS_wchar_t, 4), b).getFullAttr(), Unheard);
}

TEST(BuildAttributes, UniteIntoARecordMadeAnewWhereTagsWereMissing) {
  BuildAttributes b = with(Tag_ABI_enum_size, 2);
  b.setFullAttr(Unheard);
  const FullAttr record = BuildAttributes::getUnion(with(Tag_K2EE_use, 1), b).getFullAttr();
  EXPECT_TRUE(record.m_Features.contains(K2EE_ISA));
  EXPECT_EQ(record.m_Flags & Flag_EnumInt, Flag_EnumInt);
  EXPECT_EQ(record.m_AbiLevel, 2u);
}

TEST(BuildAttributes, UniteTheGoalsOfOptimizationAtOnce) {
  const BuildAttributes timely = with(Tag_ABI_optimization_goals, 2);
  const FullAttr record = BuildAttributes::getUnion(timely, withRecord(Unheard)).getFullAttr();
  EXPECT_EQ(record.m_Flags, Flag_OptimizeTime);
  EXPECT_EQ(record.m_AbiLevel, 7u);
}

TEST(BuildAttributes, UniteWithoutMakingListsThatNobodyNeeds) {
  BuildAttributes emptied = with(48u, 1);
  emptied.setStringTag(33, "x");
  emptied.addCompatibilityTag(1, "x");
  emptied.addAlsoCompatibilityTag({6, 11, {}});
  for (const uint32_t tag : {48u, 33u, 32u, 65u})
    emptied.removeTag(tag);
  EXPECT_EQ(BuildAttributes::getUnion(emptied, {}), BuildAttributes());
  EXPECT_EQ(BuildAttributes::getUnion({}, emptied), emptied);
}

TEST(BuildAttributes, UniteOnlyWhatIsValid) {
  EXPECT_FALSE(BuildAttributes::getUnion(invalid(), {}).isValid());
  EXPECT_FALSE(BuildAttributes::getUnion({}, invalid()).isValid());
}

// ---- Difference

TEST(BuildAttributes, DifferInNumbersWithMissingOnesAsZero) {
  forEachNumber([](auto tag, bool) {
    if (static_cast<uint32_t>(tag) == Tag_nodefaults) return;
    const auto difference = [tag](std::optional<uint32_t> a, std::optional<uint32_t> b) {
      const auto make = [tag](std::optional<uint32_t> value) {
        return value ? with(tag, *value) : BuildAttributes();
      };
      const BuildAttributes result = BuildAttributes::getDifference(make(a), make(b));
      return result.hasTag(tag) ? std::optional(result.getNumericTag(tag)) : std::nullopt;
    };
    EXPECT_EQ(difference({}, {}), std::nullopt);
    EXPECT_EQ(difference(0, {}), std::nullopt);
    EXPECT_EQ(difference({}, 0), std::nullopt);
    EXPECT_EQ(difference(3, 3), std::nullopt);
    EXPECT_EQ(difference({}, 5), 5u);
    EXPECT_EQ(difference(0, 5), 5u);
    EXPECT_EQ(difference(3, 5), 5u);
    EXPECT_EQ(difference(3, 0), 0u);
    EXPECT_EQ(difference(3, {}), 0u) << static_cast<uint32_t>(tag);
  });
}

TEST(BuildAttributes, DifferInTheLackOfDefaultsOnlyWhereItIsNew) {
  const auto difference = [](const BuildAttributes& a, const BuildAttributes& b) {
    return BuildAttributes::getDifference(a, b);
  };
  EXPECT_EQ(difference({}, with(Tag_nodefaults, 1)).getNumericTag(Tag_nodefaults), 1u);
  EXPECT_TRUE(difference({}, with(Tag_nodefaults, 0)).hasTag(Tag_nodefaults));
  EXPECT_FALSE(difference(with(Tag_nodefaults, 1), {}).hasTag(Tag_nodefaults));
  EXPECT_FALSE(difference(with(Tag_nodefaults, 1), with(Tag_nodefaults, 2)).hasTag(Tag_nodefaults));
}

TEST(BuildAttributes, DifferInTextsWithMissingOnesAsEmpty) {
  for (const uint32_t tag : Texts) {
    const auto difference = [tag](const BuildAttributes& a, const BuildAttributes& b) {
      const BuildAttributes result = BuildAttributes::getDifference(a, b);
      return result.hasTag(tag) ? std::optional(result.getStringTag(tag) == "b") : std::nullopt;
    };
    const BuildAttributes a = withText(tag, "a");
    const BuildAttributes b = withText(tag, "b");
    EXPECT_EQ(difference(b, b), std::nullopt);
    EXPECT_EQ(difference(withText(tag, ""), {}), std::nullopt);
    EXPECT_EQ(difference({}, withText(tag, "")), std::nullopt);
    EXPECT_EQ(difference(a, b), true);
    EXPECT_EQ(difference({}, b), true);
    EXPECT_EQ(difference(a, {}), false) << "there, and empty";
  }
}

TEST(BuildAttributes, DifferInConformanceOnlyWithoutCompatibility) {
  const BuildAttributes difference =
      BuildAttributes::getDifference(withText(Tag_conformance, "2.08"), withCompatible({{1, "x"}}));
  EXPECT_FALSE(difference.hasTag(Tag_conformance));
  EXPECT_TRUE(difference.hasTag(Tag_compatibility));
}

TEST(BuildAttributes, DifferInTheEntriesThatTheFirstLacks) {
  const BuildAttributes compatible = BuildAttributes::getDifference(
      withCompatible({{1, "a"}, {1, "b"}}), withCompatible({{1, "c"}, {1, "b"}, {2, "b"}}));
  EXPECT_THAT(compatibleOf(compatible),
              testing::ElementsAre(CompatibilityTag{1, "c"}, CompatibilityTag{2, "b"}));
  const BuildAttributes also = BuildAttributes::getDifference(
      withAlsoCompatible({{6, 1, {}}, {6, 2, {}}}), withAlsoCompatible({{6, 2, {}}, {6, 3, {}}}));
  EXPECT_THAT(alsoCompatibleOf(also), testing::ElementsAre(AlsoCompatibilityTag{6, 3, {}}));
}

TEST(BuildAttributes, DifferInUnknownTagsThatAreNewOrOther) {
  BuildAttributes a = with(48u, 1);
  a.setNumericTag(50, 1);
  a.setStringTag(33, "x");
  a.setStringTag(35, "x");
  a.setNumericTag(56, 9);
  BuildAttributes b = with(48u, 1);
  b.setNumericTag(50, 2);
  b.setNumericTag(52, 0);
  b.setStringTag(33, "x");
  b.setStringTag(35, "y");
  b.setStringTag(37, "");
  EXPECT_EQ(bytesOf(BuildAttributes::getDifference(a, b)),
            std::string("\x23y\0\x25\0\x32\x02\x34\0", 9));
}

TEST(BuildAttributes, DifferInTheirRecords) {
  BuildAttributes a = with(Tag_WMMX_arch, 1);
  BuildAttributes b = with(Tag_WMMX_arch, 1);
  b.setNumericTag(Tag_K2EE_use, 1);
  FullAttr expected;
  differenceFullAttr(expected, b.getFullAttr(), a.getFullAttr());
  EXPECT_EQ(BuildAttributes::getDifference(a, b).getFullAttr(), expected);
  EXPECT_TRUE(expected.m_Features.contains(K2EE_ISA));
}

TEST(BuildAttributes, DifferOnlyInWhatIsDifferent) {
  BuildAttributes b = with(ZevTag::Tag_ZV_require8, 1);
  const BuildAttributes difference = BuildAttributes::getDifference({}, b);
  EXPECT_FALSE(difference.hasTag(Tag_ABI_align_needed)) << "it is 0, as without";
  EXPECT_TRUE(difference.hasTag(ZevTag::Tag_ZV_require8));
}

TEST(BuildAttributes, DifferFromThemselvesInNothing) {
  const BuildAttributes attributes("$ZEV_ISAv5$KRL_ISAv2$HFUv2$P$IEEE1$IW$ENUMINT");
  const BuildAttributes difference = BuildAttributes::getDifference(attributes, attributes);
  EXPECT_EQ(difference, BuildAttributes());
  EXPECT_EQ(bytesOf(difference), "");
}

TEST(BuildAttributes, DifferOnlyWhereTheyAreValid) {
  EXPECT_FALSE(BuildAttributes::getDifference(invalid(), {}).isValid());
  EXPECT_FALSE(BuildAttributes::getDifference({}, invalid()).isValid());
}

// ---- Intersection and checked combination

TEST(BuildAttributes, HaveInCommonWhatIsEqual) {
  forEachNumber([](auto tag, bool) {
    const auto common = [tag](const BuildAttributes& a, const BuildAttributes& b) {
      return BuildAttributes::getIntersection(a, b).hasTag(tag);
    };
    EXPECT_TRUE(common(with(tag, 3), with(tag, 3)));
    EXPECT_FALSE(common(with(tag, 3), with(tag, 5)));
    EXPECT_FALSE(common(with(tag, 3), {}));
    EXPECT_FALSE(common({}, with(tag, 3)));
    EXPECT_FALSE(common({}, {}));
  });
  for (const uint32_t tag : {4u, 5u, 67u, 33u}) {
    const auto common = [](const BuildAttributes& a, const BuildAttributes& b) {
      return BuildAttributes::getIntersection(a, b);
    };
    EXPECT_EQ(common(withText(tag, "a"), withText(tag, "a")).getStringTag(tag), "a");
    EXPECT_FALSE(common(withText(tag, "a"), withText(tag, "b")).hasTag(tag));
    EXPECT_FALSE(common(withText(tag, "a"), {}).hasTag(tag));
    EXPECT_FALSE(common({}, withText(tag, "a")).hasTag(tag));
  }
}

TEST(BuildAttributes, HaveEntriesInCommonInTheOrderOfTheFirst) {
  const BuildAttributes common = BuildAttributes::getIntersection(
      withCompatible({{1, "a"}, {1, "b"}, {1, "c"}}), withCompatible({{1, "c"}, {1, "a"}}));
  EXPECT_THAT(compatibleOf(common),
              testing::ElementsAre(CompatibilityTag{1, "a"}, CompatibilityTag{1, "c"}));
  const BuildAttributes also = BuildAttributes::getIntersection(
      withAlsoCompatible({{6, 1, {}}, {6, 2, {}}}), withAlsoCompatible({{6, 3, {}}, {6, 2, {}}}));
  EXPECT_THAT(alsoCompatibleOf(also), testing::ElementsAre(AlsoCompatibilityTag{6, 2, {}}));
}

TEST(BuildAttributes, HaveUnknownTagsInCommonWithEqualValues) {
  BuildAttributes a = with(48u, 1);
  a.setNumericTag(50, 1);
  BuildAttributes b = with(48u, 1);
  b.setNumericTag(50, 2);
  EXPECT_EQ(bytesOf(BuildAttributes::getIntersection(a, b)), std::string("\x30\x01", 2));
}

TEST(BuildAttributes, HaveInCommonWhatBothRecordsHave) {
  const BuildAttributes a("$ZEV_ISAv5$HFUv1$IEEE1$IW$ROPI");
  const BuildAttributes b("$ZEV_ISAv4$WMMX$IEEE1$IW");
  const BuildAttributes common = BuildAttributes::getIntersection(a, b);
  EXPECT_EQ(common.getFullAttr(), intersectFullAttr(a.getFullAttr(), b.getFullAttr()));
  EXPECT_EQ(common.getFullAttr().m_Features, ZEV_ISAv4);
}

TEST(BuildAttributes, HaveInCommonOnlyWhatIsValid) {
  EXPECT_FALSE(BuildAttributes::getIntersection(invalid(), {}).isValid());
  EXPECT_FALSE(BuildAttributes::getIntersection({}, invalid()).isValid());
}

TEST(BuildAttributes, CombineLikeAUnionWithTheHigherArchitecture) {
  BuildAttributes a = with(Tag_CPU_arch, 6);
  a.setStringTag(Tag_CPU_name, "a");
  a.setNumericTag(Tag_ABI_enum_size, 1);
  BuildAttributes b = with(Tag_CPU_arch, 2);
  b.setStringTag(Tag_CPU_name, "b");
  for (const auto& [first, second] : {std::pair(a, b), std::pair(b, a)}) {
    const BuildAttributes both = BuildAttributes::getCheckedCombination(first, second);
    ASSERT_TRUE(both.isValid());
    EXPECT_EQ(both.getNumericTag(Tag_CPU_arch), 6u);
    EXPECT_EQ(both.getStringTag(Tag_CPU_name), second.getStringTag(Tag_CPU_name));
    EXPECT_EQ(both.getNumericTag(Tag_ABI_enum_size), 1u);
    FullAttr merged;
    EXPECT_TRUE(mergeFullAttr(merged, first.getFullAttr(), second.getFullAttr()));
    EXPECT_EQ(both.getFullAttr(), merged);
  }
  EXPECT_FALSE(BuildAttributes::getCheckedCombination({}, {}).hasTag(Tag_CPU_arch));
  EXPECT_EQ(BuildAttributes::getCheckedCombination(a, {}).getNumericTag(Tag_CPU_arch), 6u);
  EXPECT_EQ(BuildAttributes::getCheckedCombination({}, a).getNumericTag(Tag_CPU_arch), 6u);
}

TEST(BuildAttributes, CombineOnlyWhatGoesTogether) {
  const BuildAttributes checked("$IEEE1$STKCKD");
  const BuildAttributes unchecked("$IEEE1$~STKCKD");
  EXPECT_FALSE(BuildAttributes::getCheckedCombination(checked, unchecked).isValid());
  EXPECT_TRUE(BuildAttributes::getCheckedCombination(checked, checked).isValid());
  EXPECT_FALSE(BuildAttributes::getCheckedCombination(invalid(), {}).isValid());
  EXPECT_FALSE(BuildAttributes::getCheckedCombination({}, invalid()).isValid());
}

// ---- Lists, held against going through one for each entry of the other

template <class Entry>
bool isIn(const std::vector<Entry>& list, const Entry& entry) {
  return std::find(list.begin(), list.end(), entry) != list.end();
}

// The entries of the one and behind them those of the other, each where it is not there yet.
template <class Entry>
std::vector<Entry> plainUnion(std::vector<Entry> united, const std::vector<Entry>& others) {
  for (const Entry& entry : others) {
    if (!isIn(united, entry)) united.push_back(entry);
  }
  return united;
}

template <class Entry>
std::vector<Entry> plainSelection(const std::vector<Entry>& list, const std::vector<Entry>& other,
                                  bool areWantedIn) {
  std::vector<Entry> selection;
  for (const Entry& entry : list) {
    if (isIn(other, entry) == areWantedIn) selection.push_back(entry);
  }
  return selection;
}

// Of few different entries, some of them more than once where that may be.
BuildAttributes randomLists(std::mt19937& random) {
  BuildAttributes attributes;
  for (uint64_t i = random() % 10; i > 0; --i)
    attributes.addCompatibilityTag(static_cast<uint32_t>(random() % 3),
                                   std::string(1, "abc"[random() % 3]));
  for (uint64_t i = random() % 10; i > 0; --i) {
    const std::string text(1, "abc"[random() % 3]);
    if (random() % 2 == 0)
      attributes.addAlsoCompatibilityTag({6, static_cast<uint32_t>(random() % 4), {}});
    else
      attributes.addAlsoCompatibilityTag({65, {}, text});
  }
  return attributes;
}

TEST(BuildAttributes, HaveTheListsThatComparingAllEntriesGives) {
  std::mt19937 random(1);
  for (uint32_t round = 0; round < 1000; ++round) {
    SCOPED_TRACE(round);
    const BuildAttributes a = randomLists(random);
    const BuildAttributes b = randomLists(random);
    const BuildAttributes both = BuildAttributes::getUnion(a, b);
    EXPECT_EQ(compatibleOf(both), plainUnion(compatibleOf(b), compatibleOf(a)));
    EXPECT_EQ(alsoCompatibleOf(both), plainUnion(alsoCompatibleOf(b), alsoCompatibleOf(a)));
    const BuildAttributes difference = BuildAttributes::getDifference(a, b);
    EXPECT_EQ(compatibleOf(difference), plainSelection(compatibleOf(b), compatibleOf(a), false));
    EXPECT_EQ(alsoCompatibleOf(difference),
              plainSelection(alsoCompatibleOf(b), alsoCompatibleOf(a), false));
    const BuildAttributes common = BuildAttributes::getIntersection(a, b);
    EXPECT_EQ(compatibleOf(common), plainSelection(compatibleOf(a), compatibleOf(b), true));
    EXPECT_EQ(alsoCompatibleOf(common),
              plainSelection(alsoCompatibleOf(a), alsoCompatibleOf(b), true));
  }
}

} // namespace
} // namespace elfext
