// SPDX-License-Identifier: Apache-2.0
//
// From UTF-8 to pages of the host, and which numbers are taken. A case is skipped on a host that
// lacks the page that it is about; those of one byte for a character are on every host that has
// any.

#include "support/interface/code_page.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

namespace support {

namespace {

constexpr uint32_t WesternPage = 1252;
constexpr uint32_t ShiftJis = 932;
constexpr uint32_t Gb2312 = 20936;
constexpr uint32_t Gb18030 = 54936;
constexpr uint32_t Latin1 = 28591;

struct CodePageTest : testing::Test {
  ~CodePageTest() override { m_Page.close(); }

  std::string converted(std::string_view text) const {
    std::string result = "|";
    m_Page.append(result, text);
    return result.substr(1);
  }

  CodePage m_Page;
};

std::string everyAsciiText() {
  std::string text = "\t\n";
  for (char character = ' '; character < '\x7F'; ++character)
    text += character;
  return text;
}

} // namespace

TEST_F(CodePageTest, AsciiStaysInEveryPage) {
  for (const uint32_t number : {437u, 850u, 866u, ShiftJis, 936u, 949u, 950u, 1250u, 1251u,
                                WesternPage, 20127u, 20866u, Gb2312, Latin1, 28605u, Gb18030}) {
    if (m_Page.open(number)) {
      EXPECT_EQ(converted(everyAsciiText()), everyAsciiText()) << number;
      EXPECT_EQ(converted(""), "") << number;
    }
  }
}

TEST_F(CodePageTest, JapaneseComesOutInShiftJis) {
  if (!m_Page.open(ShiftJis)) GTEST_SKIP();
  EXPECT_EQ(converted("ア: 表 'ｱ'\n"), "\x83\x41: \x95\x5c '\xb1'\n");
}

TEST_F(CodePageTest, ChineseComesOutInGb2312) {
  if (!m_Page.open(Gb2312)) GTEST_SKIP();
  EXPECT_EQ(converted("中文 アa"), "\xd6\xd0\xce\xc4 \xa5\xa2"
                                   "a");
}

TEST_F(CodePageTest, AccentsComeOutInPagesOfTheWest) {
  if (!m_Page.open(WesternPage)) GTEST_SKIP();
  EXPECT_EQ(converted("caf\u00e9 \u20ac"), "caf\xe9 \x80");
  if (!m_Page.open(Latin1)) GTEST_SKIP();
  EXPECT_EQ(converted("caf\u00e9 \u20ac"), "caf\xe9 ?");
}

TEST_F(CodePageTest, CyrillicComesOutInItsPages) {
  if (!m_Page.open(1251)) GTEST_SKIP();
  EXPECT_EQ(converted("\u0416"), "\xc6");
  if (!m_Page.open(866)) GTEST_SKIP();
  EXPECT_EQ(converted("\u0416"), "\x86");
  if (!m_Page.open(20866)) GTEST_SKIP();
  EXPECT_EQ(converted("\u0416"), "\xf6");
}

TEST_F(CodePageTest, EachCharacterThatIsLackingIsAQuestionMark) {
  if (!m_Page.open(WesternPage)) GTEST_SKIP();
  EXPECT_EQ(converted("a\u3042\u30a2b"), "a??b");
  // Two units of UTF-16, and a mark that some take for nothing.
  EXPECT_EQ(converted("<\U0001F600>"), "<?>");
  EXPECT_EQ(converted("<\U000E0041>"), "<?>");
  // Others would put something in its place that looks like it.
  EXPECT_EQ(converted("\u221e \uff0f \u0101"), "? ? ?");
}

TEST_F(CodePageTest, NothingTurnsIntoAscii) {
  if (!m_Page.open(ShiftJis)) GTEST_SKIP();
  EXPECT_EQ(converted("\u00a5\u203e"), "??");
}

TEST_F(CodePageTest, NothingTurnsIntoAControlByte) {
  if (!m_Page.open(Latin1)) GTEST_SKIP();
  EXPECT_EQ(converted("\u0080\u009b\u009f\u00a0"), "???\xa0");
}

TEST_F(CodePageTest, EachMalformedByteIsAQuestionMark) {
  if (!m_Page.open(WesternPage)) GTEST_SKIP();
  EXPECT_EQ(converted("\x80 \xff\xfe x\xc3"), "? ?? x?");
  EXPECT_EQ(converted("\xe3\x81"), "??");
  EXPECT_EQ(converted("\xe3\x81\xe9"), "???");
  EXPECT_EQ(converted("\xc3("), "?(");
  // Longer than needed, half a pair, beyond Unicode.
  EXPECT_EQ(converted("\xc0\xaf \xe0\x80\xaf"), "?? ???");
  EXPECT_EQ(converted("\xed\xa0\x80"), "???");
  EXPECT_EQ(converted("\xf4\x90\x80\x80 \xf0\x80\x80\x80 \xf5\x80\x80\x80"), "???? ???? ????");
}

TEST_F(CodePageTest, AByteBehindAMalformedOneIsReadAfresh) {
  if (!m_Page.open(WesternPage)) GTEST_SKIP();
  EXPECT_EQ(converted("\xe3\x81\u00e9\xc3\u00e9"), "??\xe9?\xe9");
}

TEST_F(CodePageTest, APageOfAllCharactersHasThemAll) {
  if (!m_Page.open(Gb18030)) GTEST_SKIP();
  EXPECT_EQ(converted("\u30a2\U0001F600"), "\xa5\xa2\x94\x39\xfc\x36");
}

TEST_F(CodePageTest, NumbersThatAreNoPagesForTextsAreRefused) {
  // The machine's own, symbols, mainframes, wide ones, those with escapes, none at all.
  for (const uint32_t number :
       {0u,     1u,     2u,     3u,     42u,    37u,    500u,   1026u,  1047u,
        1140u,  1200u,  1201u,  12000u, 12001u, 20273u, 50220u, 50221u, 50225u,
        50227u, 52936u, 57002u, 65000u, 65001u, 65002u, 65535u, 65536u, 0xFFFFFFFFu}) {
    EXPECT_FALSE(m_Page.open(number)) << number;
    EXPECT_FALSE(m_Page.isOpen());
  }
}

TEST_F(CodePageTest, ARefusedNumberLeavesThePageThatWasOpen) {
  if (!m_Page.open(WesternPage)) GTEST_SKIP();
  EXPECT_FALSE(m_Page.open(1200));
  EXPECT_TRUE(m_Page.isOpen());
  EXPECT_EQ(converted("\u00e9"), "\xe9");
}

TEST_F(CodePageTest, AClosedPageCanBeOpenedAgain) {
  if (!m_Page.open(WesternPage)) GTEST_SKIP();
  m_Page.close();
  EXPECT_FALSE(m_Page.isOpen());
  m_Page.close();
  EXPECT_TRUE(m_Page.open(WesternPage));
  EXPECT_EQ(converted("\u00e9"), "\xe9");
}

} // namespace support
