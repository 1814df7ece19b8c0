// SPDX-License-Identifier: Apache-2.0
//
// How the text of a via file falls into words: quotes, parentheses, backslashes, comments, line
// ends, and words as long as the buffer. The reader gives pieces of any size, so that each border
// between two reads is met; a NUL is found before any word of its piece.

#include "tool_table.h"

#include "tabledrivenparser/interface/dummy_via_file.h"
#include "tabledrivenparser/interface/via_file.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::ElementsAreArray;
using testing::IsEmpty;

// The words of a file, and "!" with the report behind them if it failed.
Lines wordsOf(const std::string& contents, size_t pieceSize = 1024) {
  Session session;
  session.m_Files.m_Contents["f"] = contents;
  session.m_Files.m_PieceSize = pieceSize;
  ViaFile file(session.parser(), session.m_Files, "f");
  Lines words;
  while (const char* word = file.nextToken())
    words.push_back(word);
  EXPECT_EQ(file.nextToken(), nullptr);
  for (const std::string& line : session.getReports())
    words.push_back("!" + line);
  return words;
}

constexpr const char* Malformed = "!fatal: Malformed via file 'f'.";
constexpr const char* TooLong = "!fatal: Via file 'f' command too long for buffer.";
constexpr const char* Binary = "!fatal: '\\0' character found in via file 'f' - possible binary "
                               "file.  Aborting via file parse.";

TEST(ViaWords, AreNoneInAnEmptyFile) {
  EXPECT_THAT(wordsOf(""), IsEmpty());
  EXPECT_THAT(wordsOf(" \t\r\n\v\f"), IsEmpty());
}

TEST(ViaWords, AreSeparatedByWhiteSpace) {
  EXPECT_THAT(wordsOf(" a\tb\nc\r\nd\ve\ff  g"), ElementsAre("a", "b", "c", "d", "e", "f", "g"));
}

TEST(ViaWords, NeedNoFinalLineEnd) {
  EXPECT_THAT(wordsOf("a"), ElementsAre("a"));
  EXPECT_THAT(wordsOf("a\n"), ElementsAre("a"));
}

TEST(ViaWords, KeepBytesAbove127) {
  EXPECT_THAT(wordsOf("\xc3\xa9 \xff\x85\xa0"), ElementsAre("\xc3\xa9", "\xff\x85\xa0"));
}

TEST(ViaWords, LoseTheirDoubleQuotes) {
  EXPECT_THAT(wordsOf(R"("a b" a"b c"d "it's")"), ElementsAre("a b", "ab cd", "it's"));
}

TEST(ViaWords, LoseTheirSingleQuotes) {
  EXPECT_THAT(wordsOf(R"('a "b" c' d)"), ElementsAre(R"(a "b" c)", "d"));
}

TEST(ViaWords, MayBeEmptyInQuotes) {
  EXPECT_THAT(wordsOf(R"("" '' a)"), ElementsAre("", "", "a"));
}

TEST(ViaWords, MayHoldBlanksInParentheses) {
  EXPECT_THAT(wordsOf("name(a b)c d"), ElementsAre("name(a b)c", "d"));
}

TEST(ViaWords, DoNotNestParentheses) {
  EXPECT_THAT(wordsOf("(a (b c) d)"), ElementsAre("(a (b c)", "d)"));
}

TEST(ViaWords, KeepQuotesInParentheses) {
  EXPECT_THAT(wordsOf(R"((a "b' c) d)"), ElementsAre(R"((a "b' c))", "d"));
}

TEST(ViaWords, KeepParenthesesInQuotes) {
  EXPECT_THAT(wordsOf(R"("a(b" c)"), ElementsAre("a(b", "c"));
  EXPECT_THAT(wordsOf(R"('a)b' c)"), ElementsAre("a)b", "c"));
}

TEST(ViaWords, KeepBackslashesOutsideQuotes) {
  EXPECT_THAT(wordsOf(R"(dir\file.o \\server\share \'x \)"),
              ElementsAre(R"(dir\file.o)", R"(\\server\share)", R"(\'x)", R"(\)"));
}

TEST(ViaWords, KeepAQuoteBehindABackslash) {
  EXPECT_THAT(wordsOf(R"(a\"b "c\"d e" 'f\"g' (h\"i))"),
              ElementsAre(R"(a"b)", R"(c"d e)", R"(f"g)", R"((h"i))"));
}

TEST(ViaWords, KeepASingleQuoteBehindABackslashOnlyInSingleQuotes) {
  EXPECT_THAT(wordsOf(R"('a\'b c' "d\'e")"), ElementsAre("a'b c", R"(d\'e)"));
}

TEST(ViaWords, HalveBackslashesInQuotes) {
  EXPECT_THAT(wordsOf(R"("a\\b" 'c\\d' (e\\f) g\\h)"),
              ElementsAre(R"(a\b)", R"(c\d)", R"((e\\f))", R"(g\\h)"));
}

TEST(ViaWords, KeepOtherEscapesInQuotes) {
  EXPECT_THAT(wordsOf(R"("a\nb\ c" (d\ e))"), ElementsAre(R"(a\nb\ c)", R"((d\ e))"));
}

TEST(ViaWords, EndAtABlankOrLineEndBehindABackslash) {
  EXPECT_THAT(wordsOf("C:\\dir\\ next\\\nlast\\"), ElementsAre("C:\\dir\\", "next\\", "last\\"));
}

TEST(ViaWords, OpenParenthesesBehindABackslashToo) {
  EXPECT_THAT(wordsOf("dir\\(a b)\\c d"), ElementsAre("dir\\(a b)\\c", "d"));
  EXPECT_THAT(wordsOf("(a b\\) c"), ElementsAre("(a b\\)", "c"));
}

TEST(ViaWords, AreMalformedIfTheLineEndsInsideQuotesOrParentheses) {
  for (const char* open : {"\"b", "'b", "(b", "\"b\\", "x(\""}) {
    for (const char* end : {"\n", "\r", "\r\n", ""}) {
      EXPECT_THAT(wordsOf(std::string("a ") + open + end), ElementsAre("a", Malformed));
    }
  }
}

TEST(ViaComments, StartAnywhereAndTakeTheLineEndAlong) {
  EXPECT_THAT(wordsOf("a#x\nb"), ElementsAre("ab"));
  EXPECT_THAT(wordsOf("a;x\rb"), ElementsAre("ab"));
  EXPECT_THAT(wordsOf("a #x\nb"), ElementsAre("a", "b"));
  EXPECT_THAT(wordsOf("\"a;b\nc\" d"), ElementsAre("ac", "d"));
  EXPECT_THAT(wordsOf("\\#x\nb"), ElementsAre("\\b"));
}

TEST(ViaComments, EndAtTheFirstCharacterOfALineEnd) {
  EXPECT_THAT(wordsOf("a#x\r\nb"), ElementsAre("a", "b"));
}

TEST(ViaComments, MayEndWithTheFile) {
  EXPECT_THAT(wordsOf("a#x"), ElementsAre("a"));
  EXPECT_THAT(wordsOf("#"), IsEmpty());
}

TEST(ViaComments, HoldOtherCommentSigns) {
  EXPECT_THAT(wordsOf("#;#\na;#\nb"), ElementsAre("ab"));
}

TEST(ViaComments, MayBeLongerThanAnyBuffer) {
  EXPECT_THAT(wordsOf("a#" + std::string(5000, 'x') + "\nb"), ElementsAre("ab"));
}

TEST(NulInAViaFile, IsFoundBeforeAnyWordOfItsPiece) {
  using namespace std::string_literals;
  EXPECT_THAT(wordsOf("a b \0 c"s), ElementsAre(Binary));
  EXPECT_THAT(wordsOf("a # \0\n"s), ElementsAre(Binary));
  EXPECT_THAT(wordsOf("\0"s), ElementsAre(Binary));
  EXPECT_THAT(wordsOf("a " + std::string(990, ' ') + "\0"s, 10), ElementsAre(Binary));
}

TEST(NulInAViaFile, LeavesTheWordsOfEarlierPieces) {
  using namespace std::string_literals;
  const std::string contents = "a b" + std::string(1500, ' ') + "\0"s;
  EXPECT_THAT(wordsOf(contents), ElementsAre("a", "b", Binary));
}

TEST(ViaBuffer, HoldsTwoNeighboursWithTheirTerminators) {
  const std::string half(511, 'x');
  EXPECT_THAT(wordsOf(half + " " + half), ElementsAre(half, half));
  EXPECT_THAT(wordsOf(half + " " + half + "x"), ElementsAre(half, TooLong));
  EXPECT_THAT(wordsOf(half + "x " + half), ElementsAre(half + "x", TooLong));
  EXPECT_THAT(wordsOf(half + "x " + std::string(510, 'y') + " " + half + "x"),
              ElementsAre(half + "x", std::string(510, 'y'), half + "x"));
}

TEST(ViaBuffer, HoldsAWordOfItsOwn) {
  EXPECT_THAT(wordsOf(std::string(1023, 'x')), ElementsAre(std::string(1023, 'x')));
  EXPECT_THAT(wordsOf(std::string(1024, 'x')), ElementsAre(TooLong));
  EXPECT_THAT(wordsOf("\n\n" + std::string(1023, 'x') + "\n"), ElementsAre(std::string(1023, 'x')));
}

TEST(ViaBuffer, CountsQuotesAndNoComments) {
  EXPECT_THAT(wordsOf("\"" + std::string(1021, 'x') + "\""), ElementsAre(std::string(1021, 'x')));
  EXPECT_THAT(wordsOf("\"" + std::string(1022, 'x') + "\""), ElementsAre(TooLong));
  const std::string word(600, 'x');
  EXPECT_THAT(wordsOf(word + "#" + word + "\n" + std::string(423, 'x')),
              ElementsAre(std::string(1023, 'x')));
}

TEST(ViaBuffer, CountsNoWhiteSpaceBetweenWords) {
  const std::string half(511, 'x');
  EXPECT_THAT(wordsOf(half + std::string(3000, ' ') + half), ElementsAre(half, half));
}

class ViaBufferBounds : public testing::TestWithParam<size_t> {};

TEST_P(ViaBufferBounds, CutNoWordHoweverTheFileFallsOnThem) {
  const std::string longWord(700, 'l');
  const std::string text =
      "a \"b c\" d\\e #comment\n'f\\'g' (h i) " + longWord + " j\r\nk \"\" end";
  const Lines expected = {"a", "b c", "d\\e", "f'g", "(h i)", longWord, "j", "k", "", "end"};
  for (size_t pieceSize : {1u, 7u, 1024u}) {
    const std::string shift(GetParam(), ' ');
    EXPECT_THAT(wordsOf(shift + text, pieceSize), ElementsAreArray(expected)) << pieceSize;
  }
}

INSTANTIATE_TEST_SUITE_P(Shift, ViaBufferBounds,
                         testing::Range(size_t{0}, size_t{1025}, size_t{32}));

// What is in front moves the words: blanks, a comment, or other words.
TEST(ViaBuffer, CutsNoWordAtAnyPosition) {
  const std::string text =
      "ab \"c d\"\r\ne\\\\f\r\n'\\'' x#y\nz \\\" \"\\\"\\\\\" (g h)\t\"\" \\ last";
  const Lines expected = {"ab",   "c d",   "e\\\\f", "'",  "xz",  "\"",
                          "\"\\", "(g h)", "",       "\\", "last"};
  std::string otherWords = "\r\n";
  Lines otherAndExpected = expected;
  for (size_t shift = 0; shift <= ViaFile::BufferSize; ++shift) {
    const std::string blanks(shift, ' ');
    ASSERT_THAT(wordsOf(blanks + text), ElementsAreArray(expected)) << shift;
    ASSERT_THAT(wordsOf(blanks + text + "\n"), ElementsAreArray(expected)) << shift;
    ASSERT_THAT(wordsOf("#" + blanks + "\n" + text), ElementsAreArray(expected)) << shift;
    ASSERT_THAT(wordsOf(otherWords + text), ElementsAreArray(otherAndExpected)) << shift;
    if (shift % 2 == 0) otherAndExpected.insert(otherAndExpected.begin(), "o");
    otherWords.insert(0, shift % 2 == 0 ? "o" : " ");
  }
}

TEST(ViaFileTest, KeepsAWordUntilTheSecondCall) {
  Session session;
  session.m_Files.m_Contents["f"] = "one two three";
  ViaFile file(session.parser(), session.m_Files, "f");
  const char* one = file.nextToken();
  const char* two = file.nextToken();
  EXPECT_STREQ(one, "one");
  EXPECT_STREQ(two, "two");
  const char* three = file.nextToken();
  EXPECT_STREQ(two, "two");
  EXPECT_STREQ(three, "three");
}

TEST(ViaFileTest, ClosesItselfInTheEnd) {
  Session session;
  session.m_Files.m_Contents["f"] = "one";
  session.m_Files.m_FailingClose = "f";
  {
    const ViaFile file(session.parser(), session.m_Files, "f");
    EXPECT_EQ(session.m_Files.m_OpenCount, 1);
  }
  EXPECT_EQ(session.m_Files.m_OpenCount, 0);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(ViaFileTest, ReportsABadCloseOnce) {
  Session session;
  session.m_Files.m_Contents["f"] = "one";
  session.m_Files.m_FailingClose = "f";
  {
    ViaFile file(session.parser(), session.m_Files, "f");
    file.close();
    file.close();
  }
  EXPECT_THAT(session.getReports(), ElementsAre("warning: Could not close via file 'f'."));
}

Lines wordsOfText(const char* text) {
  Session session;
  DummyViaFile file(session.parser(), text);
  Lines words;
  while (const char* word = file.nextToken())
    words.push_back(word);
  for (const std::string& line : session.getReports())
    words.push_back("!" + line);
  return words;
}

TEST(DummyViaFileTest, ScansATextInMemory) {
  EXPECT_THAT(wordsOfText("-a \"b c\"\nd\\\"e"), ElementsAre("-a", "b c", "d\"e"));
  EXPECT_THAT(wordsOfText(""), IsEmpty());
}

TEST(DummyViaFileTest, HasNoComments) {
  EXPECT_THAT(wordsOfText("a#b ;c"), ElementsAre("a#b", ";c"));
}

TEST(DummyViaFileTest, HasNoLimit) {
  const std::string word(5000, 'x');
  EXPECT_THAT(wordsOfText((word + " " + word).c_str()), ElementsAre(word, word));
}

TEST(DummyViaFileTest, ReportsMalformedText) {
  EXPECT_THAT(wordsOfText("a \"b"), ElementsAre("a", "!fatal: Malformed via file ''."));
}

} // namespace tabledrivenparser::tool
