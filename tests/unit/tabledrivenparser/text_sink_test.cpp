// SPDX-License-Identifier: Apache-2.0
//
// The bounded text: that it counts on when it is full and writes nothing behind its end, where
// separators stand, and which values get quotes.

#include "tabledrivenparser/interface/text_sink.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace tabledrivenparser {

TEST(TextSink, GoesOnCountingWhenItIsFull) {
  std::array<char, 4> buffer{};
  TextSink sink(buffer, TextSink::QuoteMode::Never, ' ');
  sink.put("abcdef");
  sink.put('g');
  EXPECT_EQ(sink.getUsed(), 7u);
  EXPECT_EQ(std::string(buffer.data(), buffer.size()), "abcd");
}

TEST(TextSink, CountsWithoutAnyBuffer) {
  TextSink sink({}, TextSink::QuoteMode::Never, ' ');
  sink.put("abc");
  EXPECT_EQ(sink.getUsed(), 3u);
}

TEST(TextSink, SeparatesEntriesAfterTheFirst) {
  std::array<char, 16> buffer{};
  TextSink sink(buffer, TextSink::QuoteMode::Never, ',');
  for (const char* text : {"a", "b", "c"}) {
    sink.startEntry();
    sink.put(text);
  }
  sink.startList();
  sink.startEntry();
  sink.put("d");
  EXPECT_STREQ(buffer.data(), "a,b,cd");
}

std::string valueText(TextSink::QuoteMode mode, bool quoteEmpty, std::string_view value) {
  std::array<char, 64> buffer{};
  TextSink sink(buffer, mode, ' ');
  sink.setQuoteEmpty(quoteEmpty);
  sink.putValue("p=", value);
  return std::string(buffer.data(), sink.getUsed());
}

TEST(TextSink, QuotesAValueWithABlankOrATab) {
  EXPECT_EQ(valueText(TextSink::QuoteMode::Blanks, false, "a b"), "p=\"a b\"");
  EXPECT_EQ(valueText(TextSink::QuoteMode::Blanks, false, "\t"), "p=\"\t\"");
  EXPECT_EQ(valueText(TextSink::QuoteMode::Blanks, false, "ab"), "p=ab");
  EXPECT_EQ(valueText(TextSink::QuoteMode::Never, true, "a b"), "p=a b");
}

TEST(TextSink, QuotesAnEmptyValueOnDemand) {
  EXPECT_EQ(valueText(TextSink::QuoteMode::Blanks, false, ""), "p=");
  EXPECT_EQ(valueText(TextSink::QuoteMode::Blanks, true, ""), "p=\"\"");
  EXPECT_EQ(valueText(TextSink::QuoteMode::Never, true, ""), "p=");
}

} // namespace tabledrivenparser
