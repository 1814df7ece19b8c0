// SPDX-License-Identifier: Apache-2.0
//
// The formatter, against the C library's own where that can be asked; and what that leaves open:
// arguments that don't fit, positions mixed with turns, widths beyond all numbers. Whatever a
// format says, only arguments that were passed are read.

#include "messages/interface/format.h"

#include "messages/src/format_reader.h"

#include <gtest/gtest.h>

#include <climits>
#include <clocale>
#include <cstdio>
#include <vector>

namespace messages {

namespace {

struct Result {
  FormatStatus status;
  std::string text;
};

std::vector<FormatPiece> piecesOf(std::string_view format) {
  std::vector<FormatPiece> pieces;
  FormatReader reader(format);
  for (FormatPiece piece; reader.read(piece);)
    pieces.push_back(piece);
  return pieces;
}

// A format comes to the same whether it is read beforehand or as it is filled.
template <class... Arguments>
Result format(std::string_view text, const Arguments&... arguments) {
  const std::vector<Argument> list{Argument(arguments)...};
  Result result{};
  result.status = appendFormatted(result.text, text, list);
  std::string filled;
  EXPECT_EQ(appendPieces(filled, piecesOf(text), list), result.status) << text;
  EXPECT_EQ(filled, result.text) << text;
  return result;
}

template <class... Arguments>
std::string good(std::string_view text, const Arguments&... arguments) {
  const Result result = format(text, arguments...);
  EXPECT_EQ(result.status, FormatStatus::Done) << text;
  return result.text;
}

template <class... Arguments>
bool isBad(std::string_view text, const Arguments&... arguments) {
  return format(text, arguments...).status == FormatStatus::BadFormat;
}

// The formats come from the test's tables, which the compiler can't check.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral"
template <class Value>
std::string byLibrary(const std::string& text, Value value) {
  char buffer[256];
  std::snprintf(buffer, sizeof buffer, text.c_str(), value);
  return buffer;
}
#pragma GCC diagnostic pop

const char* const FlagSets[] = {"",   "-",  "0",   "+",  " ",   "#",   "-0",  "+0",
                                " 0", "#0", "-#0", "+ ", "-+0", "# 0", "+#0", "- "};
const char* const Widths[] = {"", "1", "6", "12"};
const char* const Precisions[] = {"", ".", ".0", ".1", ".5", ".11"};

// Every combination of flags, width and precision with one conversion letter.
std::vector<std::string> formatsWith(std::string_view letter) {
  std::vector<std::string> formats;
  for (const char* flags : FlagSets) {
    for (const char* width : Widths) {
      for (const char* precision : Precisions) {
        formats.push_back(std::string("[%") + flags + width + precision + std::string(letter) +
                          "]");
      }
    }
  }
  return formats;
}

} // namespace

TEST(Format, CopiesWhatIsNoConversion) {
  EXPECT_EQ(good(""), "");
  EXPECT_EQ(good("no archive"), "no archive");
  EXPECT_EQ(good("100%% of %s", "it"), "100% of it");
  EXPECT_EQ(good("%%"), "%");
  EXPECT_EQ(good("%%%%s%%d%s", "!"), "%%s%d!");
}

TEST(Format, RendersSignedNumbersAsTheLibraryDoes) {
  for (const char* letter : {"d", "i"}) {
    for (const std::string& text : formatsWith(letter)) {
      for (const int value : {0, 1, -1, 42, -98765, INT_MAX, INT_MIN}) {
        EXPECT_EQ(good(text, value), byLibrary(text, value)) << text;
      }
    }
  }
}

TEST(Format, RendersUnsignedNumbersAsTheLibraryDoes) {
  for (const char* letter : {"u", "x", "X", "o"}) {
    for (const std::string& text : formatsWith(letter)) {
      for (const unsigned value : {0u, 1u, 8u, 0xABCu, UINT_MAX}) {
        EXPECT_EQ(good(text, value), byLibrary(text, value)) << text;
      }
    }
  }
}

TEST(Format, RendersStringsAndCharactersAsTheLibraryDoes) {
  for (const char* flags : {"", "-"}) {
    for (const char* width : Widths) {
      const std::string start = std::string("[%") + flags + width;
      EXPECT_EQ(good(start + "c]", 'x'), byLibrary(start + "c]", 'x'));
      for (const char* precision : Precisions) {
        const std::string text = start + precision + "s]";
        EXPECT_EQ(good(text, "member"), byLibrary(text, "member")) << text;
        EXPECT_EQ(good(text, ""), byLibrary(text, "")) << text;
      }
    }
  }
}

TEST(Format, ShowsWideNumbersWhole) {
  EXPECT_EQ(good("%d %u", INT64_MIN, UINT64_MAX), "-9223372036854775808 18446744073709551615");
  EXPECT_EQ(good("%x %o", UINT64_MAX, UINT64_MAX), "ffffffffffffffff 1777777777777777777777");
}

TEST(Format, ReadsPastLengthLettersAsTheArgumentKnowsItsWidth) {
  EXPECT_EQ(good("%lld %hu %zu %lx %jd %td %hhd", 1, 2u, 3u, 255u, 5, 6, 7), "1 2 3 ff 5 6 7");
  EXPECT_EQ(good("%d", UINT64_MAX), "-1");
}

TEST(Format, LetsTheConversionDecideAboutTheSign) {
  EXPECT_EQ(good("%d", 0xFFFFFFFFu), "-1");
  EXPECT_EQ(good("%u", -1), "4294967295");
  EXPECT_EQ(good("%u", int16_t{-1}), "4294967295");
}

TEST(Format, TakesWidthAndPrecisionFromArguments) {
  EXPECT_EQ(good("[%*d]", 5, 42), "[   42]");
  EXPECT_EQ(good("[%*d]", -5, 42), "[42   ]");
  EXPECT_EQ(good("[%.*s]", 2, "abc"), "[ab]");
  EXPECT_EQ(good("[%.*s]", -1, "abc"), "[abc]");
  EXPECT_EQ(good("[%0*d]", 4, 7), "[0007]");
  EXPECT_EQ(good("[%*.*d]", 6, 3, 7), "[   007]");
}

TEST(Format, TakesArgumentsByPosition) {
  EXPECT_EQ(good("%2$s in %1$s", "lib.a", "x.o"), "x.o in lib.a");
  EXPECT_EQ(good("%1$s %1$s", "a"), "a a");
  EXPECT_EQ(good("[%2$*1$d]", 4, 42), "[  42]");
  EXPECT_EQ(good("[%3$-*1$.*2$s]", 5, 2, "abc"), "[ab   ]");
  EXPECT_EQ(good("%1$5s|%2$05d", "a", 3), "    a|00003");
}

TEST(Format, KeepsTextsFromOutsideUnread) {
  EXPECT_EQ(good("'%s'", "100%s %d%n"), "'100%s %d%n'");
  EXPECT_EQ(good("%s", std::string_view("a\0b", 3)), std::string("a\0b", 3));
  EXPECT_EQ(good("%s", static_cast<const char*>(nullptr)), "(null)");
}

TEST(Format, IgnoresArgumentsThatItDoesNotName) {
  EXPECT_EQ(good("%s", "a", 1, "b"), "a");
}

TEST(Format, HandlesTwentyArguments) {
  const std::vector<Argument> arguments(25, Argument(7));
  std::string twenty;
  for (int i = 0; i < 20; ++i)
    twenty += "%d";
  std::string text;
  EXPECT_EQ(appendFormatted(text, twenty, arguments), FormatStatus::Done);
  EXPECT_EQ(text, std::string(20, '7'));
  EXPECT_EQ(appendFormatted(text, twenty + "%d", arguments), FormatStatus::TooManyArguments);
  EXPECT_EQ(appendFormatted(text, "%20$d", arguments), FormatStatus::Done);
  EXPECT_EQ(appendFormatted(text, "%21$d", arguments), FormatStatus::TooManyArguments);
  EXPECT_EQ(appendFormatted(text, "%99999999999999999999$d", arguments),
            FormatStatus::TooManyArguments);
  EXPECT_EQ(appendFormatted(text, "%1$*21$d", arguments), FormatStatus::TooManyArguments);
}

TEST(Format, RefusesAConversionThatDoesNotFitItsArgument) {
  EXPECT_TRUE(isBad("%s", 1));
  EXPECT_TRUE(isBad("%d", "a"));
  EXPECT_TRUE(isBad("%c", 65));
  EXPECT_TRUE(isBad("%s", 'a'));
  EXPECT_TRUE(isBad("%x", 'a'));
  EXPECT_TRUE(isBad("%*d", "a", 1));
}

TEST(Format, RefusesAConversionWithoutArgument) {
  EXPECT_TRUE(isBad("%s"));
  EXPECT_TRUE(isBad("%s %s", "a"));
  EXPECT_TRUE(isBad("%2$s", "a"));
  EXPECT_TRUE(isBad("%0$s", "a"));
  EXPECT_TRUE(isBad("%*d", 1));
}

TEST(Format, RefusesConversionsThatItDoesNotKnow) {
  for (const char* text : {"%n", "%p", "%f", "%q", "%", "%5", "%l", "%-", "%.", "%1$", "%S"}) {
    EXPECT_TRUE(isBad(text, 1)) << text;
  }
}

TEST(Format, RefusesToMixPositionsWithTurns) {
  EXPECT_TRUE(isBad("%1$s %s", "a", "b"));
  EXPECT_TRUE(isBad("%s %2$s", "a", "b"));
}

TEST(Format, RefusesWidthsThatNoNumberHolds) {
  EXPECT_TRUE(isBad("%2147483648d", 1));
  EXPECT_TRUE(isBad("%.99999999999999999999d", 1));
  EXPECT_TRUE(isBad("%*d", INT64_MAX, 1));
}

TEST(Format, KeepsWhatCameOutBeforeTheFault) {
  EXPECT_EQ(format("a%s b%d c", "1", "2").text, "a1 b");
  EXPECT_EQ(format("a%s b%*d", "1", "2").text, "a1 b");
  EXPECT_EQ(format("a%s b%q", "1", "2").text, "a1 b");
  EXPECT_EQ(format("a%1$s b%21$s", "1").text, "a1 b");
}

// What is wrong with the format itself comes behind what is wrong with an argument in front of it.
TEST(Format, TellsTheFirstFaultOfAConversion) {
  EXPECT_EQ(format("%1$*2$.*21$d", 1, "a").status, FormatStatus::BadFormat);
  EXPECT_EQ(format("%1$*3$.*21$d", 1, 2).status, FormatStatus::BadFormat);
  EXPECT_EQ(format("%1$*2$.*3$d", 1, 2, "a").status, FormatStatus::BadFormat);
  EXPECT_EQ(format("%1$*2$.*3$d", 1, 2).status, FormatStatus::BadFormat);
  EXPECT_EQ(format("%1$*2$.*21$d", 1, 2).status, FormatStatus::TooManyArguments);
  EXPECT_EQ(format("%21$*2$.*2$d", 1, 2).status, FormatStatus::TooManyArguments);
  EXPECT_EQ(format("%21$*2$.*2$", 1, 2).status, FormatStatus::BadFormat);
}

TEST(Format, IsReadOnceAndFilledManyTimes) {
  constexpr std::string_view Text = "%2$-*3$s from %1$.4s at %4$5d, 100%%\n";
  const std::vector<FormatPiece> pieces = piecesOf(Text);
  for (int round = 0; round < 1000; ++round) {
    const std::string name = "name" + std::to_string(round);
    const std::vector<Argument> arguments = {"member.o", name, round % 20 - 10, round};
    std::string filled = "before ";
    std::string expected = "before ";
    ASSERT_EQ(appendPieces(filled, pieces, arguments), FormatStatus::Done);
    ASSERT_EQ(appendFormatted(expected, Text, arguments), FormatStatus::Done);
    ASSERT_EQ(filled, expected);
  }
  // A width that came from an argument is not kept.
  std::string text;
  ASSERT_EQ(appendPieces(text, pieces, std::vector<Argument>{"m", "n", 3, 1}), FormatStatus::Done);
  EXPECT_EQ(text, "n   from m at     1, 100%\n");
}

TEST(Format, IsReadByTheCompiler) {
  constexpr FormatPiece Piece = [] {
    FormatPiece piece;
    FormatReader("in %-20.3s").read(piece);
    return piece;
  }();
  static_assert(Piece.literal == "in " && Piece.hasConversion && Piece.argument == 0);
  static_assert(Piece.conversion.width == 20 && Piece.conversion.precision == 3);
  static_assert(Piece.conversion.isLeftAligned && Piece.conversion.letter == 's');
}

TEST(Format, HasAPieceForEachConversionAndTheRest) {
  EXPECT_TRUE(piecesOf("").empty());
  EXPECT_EQ(piecesOf("text").size(), 1u);
  EXPECT_EQ(piecesOf("%s").size(), 1u);
  EXPECT_EQ(piecesOf("%s\n").size(), 2u);
  EXPECT_EQ(piecesOf("%s%21$s%s").size(), 2u) << "nothing counts behind a fault";
}

TEST(Format, KnowsNoLocale) {
  const std::string before = std::setlocale(LC_ALL, nullptr);
  std::setlocale(LC_ALL, "");
  EXPECT_EQ(good("%d", 1234567), "1234567");
  std::setlocale(LC_ALL, before.c_str());
}

} // namespace messages
