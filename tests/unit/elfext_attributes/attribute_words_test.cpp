// SPDX-License-Identifier: Apache-2.0
//
// The look-up of words, against the plain search through their tables: each word in either letter
// case, and what is nearly a word, longer than any, or begins with one.

#include "elfext/src/attributes/attribute_words.h"

#include "elfext/src/attributes/attribute_tokens.h"
#include "support/interface/letters.h"
#include "tests/unit/elfext_attributes/other_case.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <string>
#include <vector>

namespace elfext {
namespace {

using support::equalIgnoringCase;

constexpr uint32_t AccessNameCount = std::size(AccessNames);

FeatureSet searchFeature(std::string_view word) {
  const auto* row = std::ranges::find_if(FeatureTokens, [word](const FeatureToken& token) {
    return token.use != TokenUse::Print && equalIgnoringCase(token.token, word);
  });
  return row == std::end(FeatureTokens) ? FeatureSet() : row->set;
}

template <size_t Count>
uint64_t searchBits(const FlagToken (&rows)[Count], std::string_view word) {
  const auto* row = std::ranges::find_if(
      rows, [word](const FlagToken& token) { return equalIgnoringCase(token.token, word); });
  return row == std::end(rows) ? 0 : row->bits;
}

// Whether the look-up says the same as a search through each table.
bool isFoundAsBySearch(std::string_view word) {
  const AttributeWord* found = findAttributeWord(word);
  const AttributeWord said = found == nullptr ? AttributeWord() : *found;
  return said.features == searchFeature(word) && said.flags == searchBits(FlagTokens, word) &&
         said.stack8 == searchBits(Stack8Tokens, word) &&
         said.abiLevel == searchBits(AbiLevelTokens, word) &&
         said.takesFlagsBack == equalIgnoringCase(ComplementToken.token, word);
}

uint32_t searchAccessName(std::string_view text) {
  const auto* name = std::ranges::find_if(
      AccessNames, [text](std::string_view candidate) { return text.starts_with(candidate); });
  return static_cast<uint32_t>(name - std::begin(AccessNames));
}

std::vector<std::string> allTokens() {
  std::vector<std::string> tokens = {std::string(ComplementToken.token)};
  for (const FeatureToken& row : FeatureTokens)
    tokens.emplace_back(row.token);
  for (const FlagToken& row : FlagTokens)
    tokens.emplace_back(row.token);
  for (const FlagToken& row : Stack8Tokens)
    tokens.emplace_back(row.token);
  for (const FlagToken& row : AbiLevelTokens)
    tokens.emplace_back(row.token);
  return tokens;
}

TEST(AttributeWordsTest, FindsEachWordInEitherCase) {
  for (const std::string& token : allTokens()) {
    EXPECT_EQ(findAttributeWord(token) != nullptr, token != "v8.1") << token;
    EXPECT_EQ(findAttributeWord(token), findAttributeWord(inOtherCase(token))) << token;
    EXPECT_TRUE(isFoundAsBySearch(token)) << token;
  }
}

TEST(AttributeWordsTest, FindsNothingThatIsNearlyAWord) {
  for (const std::string& token : allTokens()) {
    for (size_t length = 0; length < token.size(); ++length)
      EXPECT_TRUE(isFoundAsBySearch(token.substr(0, length))) << token << ' ' << length;
    for (const char* more : {"x", "0", " ", "$", "M", "_D16", "E"})
      EXPECT_TRUE(isFoundAsBySearch(token + more)) << token << more;
    EXPECT_EQ(findAttributeWord(token + '\0'), nullptr) << token;
    EXPECT_EQ(findAttributeWord('\0' + token), nullptr) << token;
    for (size_t at = 0; at < token.size(); ++at) {
      for (int byte = 0; byte < 256; ++byte) {
        std::string changed = token;
        changed[at] = static_cast<char>(byte);
        ASSERT_TRUE(isFoundAsBySearch(changed)) << token << ' ' << at << ' ' << byte;
      }
    }
  }
}

TEST(AttributeWordsTest, FindsNoLongWord) {
  for (size_t size = 0; size < 40; ++size)
    EXPECT_EQ(findAttributeWord(std::string(size, '~')), nullptr) << size;
  EXPECT_EQ(findAttributeWord("FP_ZEVv8_FP16" + std::string(1000000, 'x')), nullptr);
  EXPECT_EQ(findAttributeWord("FP_ZEVv8_FP16" + std::string(3, '\0')), nullptr);
}

TEST(AttributeWordsTest, FindsTheAccessNameThatATextBeginsWith) {
  for (uint32_t number = 0; number < AccessNameCount; ++number) {
    const std::string name(AccessNames[number]);
    for (const char* rest : {"", "x", "1", "L88", "\xff"})
      EXPECT_EQ(findAccessName(name + rest), number) << name << rest;
    EXPECT_EQ(findAccessName(inOtherCase(name)), AccessNameCount) << name;
  }
}

// Every text of up to five bytes of those that names are made of, and others around them.
TEST(AttributeWordsTest, FindsNoAccessNameInAnythingElse) {
  const std::string bytes = std::string("LSUl01248x\xff", 11) + '\0';
  std::vector<std::string> texts = {""};
  for (size_t first = 0, length = 0; length < 5; ++length) {
    const size_t end = texts.size();
    for (; first < end; ++first) {
      ASSERT_EQ(findAccessName(texts[first]), searchAccessName(texts[first])) << texts[first];
      for (const char byte : bytes)
        texts.push_back(texts[first] + byte);
    }
  }
  for (const std::string& text : texts)
    ASSERT_EQ(findAccessName(text), searchAccessName(text)) << text;
}

} // namespace
} // namespace elfext
