// SPDX-License-Identifier: Apache-2.0
//
// Patterns with "*" and "?": by cases, against the definition on all short words of a small
// alphabet, and with many stars, which must not take longer than anyone waits.

#include "support/interface/pattern.h"

#include <gtest/gtest.h>

#include <string>

namespace support {

namespace {

bool matches(std::string_view pattern, std::string_view text) {
  return matchesPattern(pattern, text, true);
}

// The definition itself, in as many steps as it likes.
bool matchesPlainly(std::string_view pattern, std::string_view text) {
  if (pattern.empty()) return text.empty();
  if (pattern.front() == '*') {
    return matchesPlainly(pattern.substr(1), text) ||
           (!text.empty() && matchesPlainly(pattern, text.substr(1)));
  }
  if (text.empty() || (pattern.front() != '?' && pattern.front() != text.front())) return false;
  return matchesPlainly(pattern.substr(1), text.substr(1));
}

// The count-th word over the letters, shortest first.
std::string wordOf(std::string_view letters, size_t count) {
  std::string word;
  for (; count > 0; count = (count - 1) / letters.size()) {
    word += letters[(count - 1) % letters.size()];
  }
  return word;
}

} // namespace

TEST(Pattern, WithoutWildcardsMatchesOnlyItself) {
  EXPECT_TRUE(matches("a.o", "a.o"));
  EXPECT_FALSE(matches("a.o", "a.oo"));
  EXPECT_FALSE(matches("a.o", "a."));
  EXPECT_TRUE(matches("", ""));
  EXPECT_FALSE(matches("", "a"));
  EXPECT_FALSE(matches("a", ""));
}

TEST(Pattern, QuestionMarkMatchesExactlyOneCharacter) {
  EXPECT_TRUE(matches("?.o", "a.o"));
  EXPECT_FALSE(matches("?.o", ".o"));
  EXPECT_FALSE(matches("?.o", "ab.o"));
}

TEST(Pattern, StarMatchesAnyRunAlsoTheEmptyOne) {
  EXPECT_TRUE(matches("*", ""));
  EXPECT_TRUE(matches("a*", "a"));
  EXPECT_TRUE(matches("*.o", ".o"));
  EXPECT_TRUE(matches("a*b*c", "aXbYbZc"));
  EXPECT_TRUE(matches("a**b", "ab"));
  EXPECT_TRUE(matches("ab***", "ab"));
  EXPECT_FALSE(matches("*.o", "x.obj"));
}

TEST(Pattern, KnowsNoSetsBracesOrEscapes) {
  EXPECT_FALSE(matches("[ab]", "a"));
  EXPECT_TRUE(matches("[ab]", "[ab]"));
  EXPECT_FALSE(matches("\\*", "*"));
}

TEST(Pattern, ComparesAsciiLettersInEitherCaseIfAsked) {
  EXPECT_TRUE(matchesPattern("FOO?*.o", "fooZ.O", false));
  EXPECT_FALSE(matchesPattern("FOO.o", "foo.O", true));
  EXPECT_FALSE(matchesPattern("[", "{", false));
  EXPECT_FALSE(matchesPattern("@", "`", false));
}

TEST(Pattern, ComparesBytesAbove127AsTheyStand) {
  EXPECT_TRUE(matchesPattern("\xe9*", "\xe9\xff", false));
  EXPECT_FALSE(matchesPattern("\xc9", "\xe9", false));
}

TEST(Pattern, OfManyStarsIsDecidedAtOnce) {
  std::string pattern;
  for (int i = 0; i < 500; ++i)
    pattern += "*a";
  const std::string text(1029, 'a');
  EXPECT_TRUE(matches(pattern, text));
  EXPECT_FALSE(matches(pattern + "b", text));
}

TEST(Pattern, AgreesWithTheDefinitionOnAllShortWords) {
  constexpr size_t PatternCount = 1 + 4 + 16 + 64 + 256;
  constexpr size_t TextCount = 1 + 2 + 4 + 8 + 16 + 32;
  for (size_t p = 0; p < PatternCount; ++p) {
    for (size_t t = 0; t < TextCount; ++t) {
      const std::string pattern = wordOf("ab*?", p);
      const std::string text = wordOf("ab", t);
      ASSERT_EQ(matches(pattern, text), matchesPlainly(pattern, text)) << pattern << " " << text;
    }
  }
}

} // namespace support
