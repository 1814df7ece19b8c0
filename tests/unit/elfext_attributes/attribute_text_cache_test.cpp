// SPDX-License-Identifier: Apache-2.0
//
// The cache that spares reading the same text again: each text is computed once, nothing is kept of
// texts that are too long, and it starts again when there are too many, so that a library of
// different texts costs no more memory than its bound. What it says must be what the text says.

#include "elfext/interface/attribute_text_cache.h"

#include "elfext/interface/attribute_string.h"
#include "tests/unit/elfext_attributes/generated_records.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace elfext {
namespace {

using RecordCache = AttributeTextCache<FullAttr>;

uint32_t computeCount = 0;

std::string countAndQuote(std::string_view text) {
  ++computeCount;
  return '"' + std::string(text) + '"';
}

struct AttributeTextCacheTest : testing::Test {
  void SetUp() override { computeCount = 0; }

  AttributeTextCache<std::string> m_Cache{countAndQuote};
};

TEST_F(AttributeTextCacheTest, ComputesEachTextOnce) {
  for (int round = 0; round < 100; ++round) {
    for (const char* text : {"$IEEE1", "", "$IEEE1", "$IEEE1$IW", "$ieee1", "$IEEE1"})
      EXPECT_EQ(m_Cache.get(text), '"' + std::string(text) + '"');
  }
  EXPECT_EQ(computeCount, 4u);
}

TEST_F(AttributeTextCacheTest, ComputesNothingBeforeItIsAsked) {
  EXPECT_EQ(computeCount, 0u);
  EXPECT_EQ(m_Cache.get(std::string_view()), "\"\"");
  EXPECT_EQ(computeCount, 1u);
}

TEST_F(AttributeTextCacheTest, KeepsACopyOfTheText) {
  std::string text = "$IEEE1";
  EXPECT_EQ(m_Cache.get(text), "\"$IEEE1\"");
  text[1] = 'X';
  EXPECT_EQ(m_Cache.get(text), "\"$XEEE1\"");
  EXPECT_EQ(m_Cache.get("$IEEE1"), "\"$IEEE1\"");
  EXPECT_EQ(computeCount, 2u);
}

TEST_F(AttributeTextCacheTest, TellsTextsApartBehindANul) {
  EXPECT_EQ(m_Cache.get(std::string_view("$I\0W", 4)).size(), 6u);
  EXPECT_EQ(m_Cache.get(std::string_view("$I\0X", 4)).size(), 6u);
  EXPECT_EQ(m_Cache.get("$I").size(), 4u);
  EXPECT_EQ(computeCount, 3u);
}

TEST_F(AttributeTextCacheTest, DoesntKeepALongText) {
  const std::string longest(m_Cache.LongestText, '$');
  const std::string tooLong(m_Cache.LongestText + 1, '$');
  for (int round = 0; round < 3; ++round) {
    EXPECT_EQ(m_Cache.get(longest), '"' + longest + '"');
    EXPECT_EQ(m_Cache.get(tooLong), '"' + tooLong + '"');
  }
  EXPECT_EQ(computeCount, 1u + 3u);
}

// Its memory has a bound, and what it says is right all the same.
TEST_F(AttributeTextCacheTest, StartsAgainWhenThereAreTooMany) {
  const auto textOf = [](size_t number) { return "$text" + std::to_string(number); };
  for (size_t i = 0; i < m_Cache.MostTexts; ++i)
    static_cast<void>(m_Cache.get(textOf(i)));
  EXPECT_EQ(m_Cache.get(textOf(0)), "\"$text0\"");
  EXPECT_EQ(computeCount, m_Cache.MostTexts);
  for (size_t i = 0; i < 5 * m_Cache.MostTexts; ++i)
    ASSERT_EQ(m_Cache.get(textOf(i)), '"' + textOf(i) + '"');
  const uint32_t countBefore = computeCount;
  EXPECT_EQ(m_Cache.get(textOf(0)), "\"$text0\"");
  EXPECT_EQ(computeCount, countBefore + 1) << "the first ones are gone";
}

TEST(AttributeRecordCacheTest, SaysWhatTheTextsSay) {
  GeneratedRecords generated;
  std::vector<std::string> texts;
  for (int i = 0; i < 3000; ++i)
    texts.push_back(printAttributeString(generated.record()));
  RecordCache records(parseAttributeString);
  for (int round = 0; round < 2; ++round) {
    for (const std::string& text : texts)
      ASSERT_EQ(records.get(text), parseAttributeString(text)) << text;
  }
}

// All words at once, each as long as it gets, are a text that is kept.
TEST(AttributeRecordCacheTest, KeepsTheTextOfAllThereIs) {
  FullAttr record;
  record.m_Features = {~uint64_t{0}, ~uint64_t{0}};
  record.m_Access = AccessWords::all(0xFFFF);
  record.m_Flags = ~uint64_t{0};
  record.m_Stack8 = ~uint64_t{0};
  record.m_AbiLevel = ~uint64_t{0};
  EXPECT_LE(printAttributeString(record).size(), RecordCache::LongestText);
}

} // namespace
} // namespace elfext
