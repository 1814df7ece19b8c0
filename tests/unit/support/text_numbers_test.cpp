// SPDX-License-Identifier: Apache-2.0
//
// Numbers of texts, compared with what a look at each pair of them says.
#include "support/interface/text_numbers.h"

#include "support/interface/letters.h"

#include <gtest/gtest.h>

#include <string>

namespace support {

namespace {

char asItIs(char character) {
  return character;
}

template <class Fold>
void expectNumbers(const std::vector<std::string_view>& texts, Fold fold) {
  const auto folded = [fold](std::string_view text) {
    std::string result(text);
    std::transform(result.begin(), result.end(), result.begin(), fold);
    return result;
  };
  const std::vector<uint64_t> numbers = numberTexts(texts, fold);
  const std::vector<bool> isFirst = findFirst(numbers);
  ASSERT_EQ(numbers.size(), texts.size());
  for (size_t i = 0; i < texts.size(); ++i) {
    bool isNew = true;
    for (size_t j = 0; j < i; ++j) {
      const bool isSame = folded(texts[i]) == folded(texts[j]);
      ASSERT_EQ(numbers[i] == numbers[j], isSame) << texts[i] << " and " << texts[j];
      isNew = isNew && !isSame;
    }
    ASSERT_EQ(isFirst[i], isNew) << texts[i];
  }
}

// All ends of these.
std::vector<std::string_view> endsOf(const std::vector<std::string>& wholes) {
  std::vector<std::string_view> texts;
  for (const std::string& whole : wholes) {
    for (size_t i = 0; i <= whole.size(); ++i)
      texts.push_back(std::string_view(whole).substr(i));
  }
  return texts;
}

} // namespace

TEST(TextNumbersTest, AreNoneForNoTexts) {
  EXPECT_TRUE(numberTexts({}, asItIs).empty());
  EXPECT_TRUE(findFirst({}).empty());
}

TEST(TextNumbersTest, AreTheSameForEqualTextsWhereverTheyStand) {
  const std::string again = "first";
  expectNumbers({"first", "second", again, "", "st", again.c_str(), std::string_view()}, asItIs);
}

TEST(TextNumbersTest, TellAllEndsOfTextsApart) {
  const std::vector<std::string> wholes = {"abcabc", "xbcabc", "abc", "", "cabc", "abcab", "aaaa"};
  expectNumbers(endsOf(wholes), asItIs);
}

TEST(TextNumbersTest, PassOverWhatIsToBeEqual) {
  expectNumbers(endsOf({"name.O", "NAME.o", "xame.o", "Name.c", "ame.o"}), lowered);
}

TEST(TextNumbersTest, AreRightForAnyTexts) {
  uint32_t state = 1;
  for (int round = 0; round < 20; ++round) {
    std::vector<std::string> wholes(12);
    for (std::string& whole : wholes) {
      state = state * 1664525 + 1013904223;
      for (uint32_t bits = state >> 8 | 1; bits > 1; bits /= 4)
        whole += "aAbb"[bits % 4];
    }
    expectNumbers(endsOf(wholes), lowered);
  }
}

} // namespace support
