// SPDX-License-Identifier: Apache-2.0
//
// The names of tags and the sentences for their values, as a dump shows them: exactly the known
// tags have names, each value has words of its own, and what is unknown shows its number.

#include "elfext/interface/build_attributes_names.h"

#include "elfext/interface/build_attributes_tags.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>
#include <vector>

namespace elfext {
namespace {

using testing::ElementsAre;
using testing::EndsWith;

constexpr uint32_t zev(ZevTag tag) {
  return static_cast<uint32_t>(tag);
}

// The numbers below 300 that a naming function has a name for.
template <class Function>
std::vector<uint32_t> knownNumbers(Function name) {
  std::vector<uint32_t> numbers;
  for (uint32_t number = 0; number < 300; ++number) {
    if (!name(number).starts_with("unknown ")) numbers.push_back(number);
  }
  return numbers;
}

std::vector<uint32_t> knownQobixValues(uint32_t tag) {
  return knownNumbers([tag](uint32_t value) { return getQobixTagValueName(tag, value); });
}

std::vector<uint32_t> knownZevValues(ZevTag tag) {
  return knownNumbers([tag](uint32_t value) { return getZevTagValueName(zev(tag), value); });
}

TEST(BuildAttributesNames, NamesTheTagsOfThePublicAbi) {
  EXPECT_EQ(getQobixTagName(Tag_CPU_raw_name), "Tag_CPU_raw_name");
  EXPECT_EQ(getQobixTagName(Tag_compatibility), "Tag_compatibility");
  EXPECT_EQ(getQobixTagName(Tag_also_compatible_with), "Tag_also_compatible_with");
  EXPECT_EQ(getQobixTagName(42), "Tag_MPextension_use");
  EXPECT_EQ(getQobixTagName(70), "Tag_MPextension_use_r207");
}

TEST(BuildAttributesNames, KnowsAllTagsOfThePublicAbiAndNoOthers) {
  std::vector<uint32_t> expected;
  for (uint32_t tag = 4; tag <= 32; ++tag)
    expected.push_back(tag);
  for (const uint32_t tag : {34u, 36u, 38u, 40u, 42u, 44u, 46u, 64u, 65u, 66u, 67u, 68u, 70u})
    expected.push_back(tag);
  EXPECT_EQ(expected.size(), 42u);
  EXPECT_EQ(knownNumbers(getQobixTagName), expected);
}

TEST(BuildAttributesNames, KnowsTheMakersTagsButTheLast) {
  EXPECT_EQ(knownNumbers(getZevTagName), (std::vector<uint32_t>{4, 6, 8, 10, 12, 14, 16, 18, 20}));
  EXPECT_EQ(getZevTagName(4), "Tag_ZV_interworking");
  EXPECT_EQ(getZevTagName(20), "Tag_ZV_pld");
}

TEST(BuildAttributesNames, ShowsTheNumbersOfUnknownTags) {
  EXPECT_EQ(getQobixTagName(33), "unknown tag (=33)");
  EXPECT_EQ(getQobixTagName(~0u), "unknown tag (=-1)");
  EXPECT_EQ(getZevTagName(22), "unknown tag (=22)");
  EXPECT_EQ(getZevTagName(0), "unknown tag (=0)");
}

TEST(BuildAttributesNames, SaysValuesInSentences) {
  EXPECT_EQ(getQobixTagValueName(Tag_ABI_optimization_goals, 0),
            "No particular optimization goals, or no information recorded (=0)");
  EXPECT_EQ(getQobixTagValueName(Tag_ABI_PCS_wchar_t, 2), "Size of wchar_t is 2 (=2)");
  EXPECT_EQ(getQobixTagValueName(Tag_ABI_enum_size, 2), "Enum containers are 32-bit (=2)");
  EXPECT_EQ(getQobixTagValueName(Tag_CPU_arch_profile, 'A'), "Application profile (=65)");
  EXPECT_EQ(getZevTagValueName(zev(ZevTag::Tag_ZV_interworking), 0),
            "Interworking is supported (=0)");
}

TEST(BuildAttributesNames, SaysTheVersionOfTagsAsItIs) {
  EXPECT_EQ(getZevTagValueName(zev(ZevTag::Tag_ZV_version), 0), "Tags version 0");
  EXPECT_EQ(getZevTagValueName(zev(ZevTag::Tag_ZV_version), 255), "Tags version 255");
}

TEST(BuildAttributesNames, HasTwoNumbersForOneTag) {
  for (const uint32_t value : {0u, 1u, 2u})
    EXPECT_EQ(getQobixTagValueName(70, value), getQobixTagValueName(42, value));
}

TEST(BuildAttributesNames, CallsOtherValuesUnknownParameters) {
  EXPECT_EQ(getQobixTagValueName(Tag_ABI_PCS_wchar_t, 3), "unknown parameter (=3)");
  EXPECT_EQ(getQobixTagValueName(Tag_ABI_PCS_wchar_t, ~0u), "unknown parameter (=-1)");
  EXPECT_EQ(getQobixTagValueName(Tag_CPU_name, 0), "unknown parameter (=0)");
  EXPECT_EQ(getQobixTagValueName(1000, 1), "unknown parameter (=1)");
  EXPECT_EQ(getZevTagValueName(zev(ZevTag::Tag_ZV_full_isa), 1), "unknown parameter (=1)");
}

std::vector<uint32_t> upTo(uint32_t last) {
  std::vector<uint32_t> numbers;
  for (uint32_t number = 0; number <= last; ++number)
    numbers.push_back(number);
  return numbers;
}

TEST(BuildAttributesNames, KnowsTheValuesOfArchitecturesAndUnits) {
  EXPECT_EQ(knownQobixValues(Tag_CPU_arch), upTo(17));
  EXPECT_THAT(knownQobixValues(Tag_CPU_arch_profile), ElementsAre(0, 'A', 'B', 'M', 'R', 'S'));
  EXPECT_EQ(knownQobixValues(Tag_FP_arch), upTo(8));
  EXPECT_EQ(knownQobixValues(Tag_Advanced_SIMD_arch), upTo(4));
  EXPECT_EQ(knownQobixValues(Tag_PCS_config), upTo(7));
  EXPECT_EQ(knownZevValues(ZevTag::Tag_ZV_pld), upTo(4));
}

// Sentences are told apart, so that a dump says what was recorded.
TEST(BuildAttributesNames, SaysEachValueInItsOwnWords) {
  for (const uint32_t tag : knownNumbers(getQobixTagName)) {
    std::set<std::string> sentences;
    for (const uint32_t value : knownQobixValues(tag)) {
      const std::string sentence = getQobixTagValueName(tag, value);
      const std::string number = " (=" + std::to_string(value) + ")";
      EXPECT_THAT(sentence, EndsWith(number));
      const std::string words = sentence.substr(0, sentence.size() - number.size());
      EXPECT_TRUE(sentences.insert(words).second) << sentence;
    }
  }
}

TEST(BuildAttributesNames, HasASentenceForEachNumericTag) {
  for (const uint32_t tag : knownNumbers(getQobixTagName)) {
    const bool isNumeric = BuildAttributesTagClassifier::isQobixNumericTag(static_cast<int>(tag));
    EXPECT_EQ(!knownQobixValues(tag).empty(), isNumeric) << tag;
  }
  for (const uint32_t tag : knownNumbers(getZevTagName))
    EXPECT_FALSE(knownZevValues(ZevTag{tag}).empty()) << tag;
}

} // namespace
} // namespace elfext
