// SPDX-License-Identifier: Apache-2.0
//
// The order of the two streams and their failures. Control bytes in names come out as numbers.

#include "messages/interface/output.h"

#include "messages/interface/catalogue.h"
#include "tests/support/messages_fixture.h"

#include <cerrno>
#include <new>

namespace messages {

namespace {

struct OutputTest : MessagesTest {};

constexpr size_t MoreThanTheBuffer = 200000; // bytes

// What a sink does with stdout shows only in the order of writes to both.
class OrderedSink final : public OutputSink {
public:
  explicit OrderedSink(std::string& all) : m_All(all) {}
  int write(std::string_view bytes) override {
    m_All += bytes;
    return 0;
  }

private:
  std::string& m_All;
};

} // namespace

TEST_F(OutputTest, StdoutIsGatheredAndFlushedAtTheEnd) {
  writeText(Stream::Output, "a\n");
  writeRaw("b");
  EXPECT_EQ(m_Output.writeCount(), 0u);
  EXPECT_TRUE(flushAll());
  EXPECT_EQ(m_Output.getText(), "a\nb");
  EXPECT_EQ(m_Output.writeCount(), 1u);
}

TEST_F(OutputTest, WhatComesFirstComesFirst) {
  std::string all;
  OrderedSink output(all);
  OrderedSink error(all);
  setOutputSinks(&output, &error);
  listingMessage(ListedMember, "a.o");
  writeRaw("contents");
  report(ErrorWord, nullptr, NoArchiveSpecified);
  writeText(Stream::Output, "banner\n");
  writeText(Stream::Error, "plain\n");
  listingMessage(ListedMember, "b.o");
  flushAll();
  EXPECT_EQ(all, "a.o\ncontentsError: L6838E: No archive specified\nbanner\nplain\nb.o\n");
  setOutputSinks(&m_Output, &m_Error);
}

TEST_F(OutputTest, RawBytesPassUnchanged) {
  const std::string bytes("\0\001\r\n\177\xff%s", 8);
  writeRaw(bytes);
  EXPECT_EQ(outputText(), bytes);
}

TEST_F(OutputTest, TextIsEscapedOnBothStreams) {
  const std::string text("\0\037 ~\177\x80\t\n", 8);
  writeText(Stream::Output, text);
  writeText(Stream::Error, text);
  EXPECT_EQ(outputText(), "\\000\\037 ~\\177\x80\t\n");
  EXPECT_EQ(getErrorText(), outputText());
}

TEST_F(OutputTest, TextLeavesInTheCodePageOnBothStreams) {
  if (!setLocale("1252")) GTEST_SKIP() << "a host without code pages";
  const std::string text("caf\u00e9 \u3042 \xff \001\u00e9\n");
  writeText(Stream::Output, text);
  writeText(Stream::Error, text);
  EXPECT_EQ(outputText(), "caf\xe9 ? ? \\001\xe9\n");
  EXPECT_EQ(getErrorText(), outputText());
}

TEST_F(OutputTest, TextsOfOneRunDoNotMixInTheCodePage) {
  if (!setLocale("1252")) GTEST_SKIP() << "a host without code pages";
  HeldOutput held;
  held.hold();
  writeText(Stream::Output, "\u00e9\n");
  writeText(Stream::Output, "a\n");
  writeText(Stream::Output, "\u00fc\n");
  held.release();
  EXPECT_EQ(outputText(), "\xe9\na\n\xfc\n");
}

TEST_F(OutputTest, RawBytesPassUnchangedInAnyCodePage) {
  if (!setLocale("1252")) GTEST_SKIP() << "a host without code pages";
  writeRaw("\u00e9\xff\001");
  EXPECT_EQ(outputText(), "\u00e9\xff\001");
}

TEST_F(OutputTest, MessagesAndMembersNamesLeaveInTheCodePage) {
  if (!setLocale("1252")) GTEST_SKIP() << "a host without code pages";
  listingMessage(ListedMember, "\u00e9.o");
  report(ErrorWord, nullptr, FileDoesNotExist, "\u30a2");
  EXPECT_EQ(outputText(), "\xe9.o\n");
  EXPECT_EQ(getErrorText(), "Error: L6833E: File '?' does not exist\n");
}

TEST_F(OutputTest, InUtf8TextPassesAsItIs) {
  ASSERT_TRUE(setLocale("65001"));
  writeText(Stream::Output, "\u00e9\xff\u0080\n");
  EXPECT_EQ(outputText(), "\u00e9\xff\u0080\n");
}

TEST_F(OutputTest, TheChineseCodePageIsTakenOnAnyHost) {
  ASSERT_TRUE(setLocale("gb2312"));
  writeText(Stream::Output, "\u4e2d\n");
  const std::string text = outputText();
  EXPECT_TRUE(text == "\xd6\xd0\n" || text == "\u4e2d\n") << text;
}

TEST_F(OutputTest, AByteIsEscapedWhereverItStands) {
  constexpr size_t Size = 70;
  std::string expected;
  for (int byte = 0; byte < 256; ++byte) {
    const bool isEscaped = (byte < 32 && byte != '\t' && byte != '\n') || byte == 127;
    char octal[8];
    std::snprintf(octal, sizeof octal, "\\%.3o", static_cast<unsigned>(byte));
    for (size_t at = 0; at < Size; ++at) {
      std::string text(Size, 'x');
      text[at] = static_cast<char>(byte);
      writeText(Stream::Output, text);
      expected += isEscaped ? std::string(at, 'x') + octal + std::string(Size - at - 1, 'x') : text;
    }
  }
  EXPECT_EQ(outputText(), expected);
}

TEST_F(OutputTest, LargePiecesKeepTheirPlace) {
  const std::string large(MoreThanTheBuffer, 'x');
  writeRaw("a");
  writeRaw(large);
  writeRaw("b");
  EXPECT_EQ(outputText(), "a" + large + "b");
}

TEST_F(OutputTest, ManySmallPiecesComeOutWhole) {
  std::string expected;
  for (int i = 0; i < 50000; ++i) {
    const std::string piece = std::to_string(i) + "\n";
    writeRaw(piece);
    expected += piece;
  }
  EXPECT_EQ(outputText(), expected);
  EXPECT_LT(m_Output.writeCount(), 10u);
}

TEST_F(OutputTest, TheLinesOfAListingGoOutTogether) {
  std::string expected;
  for (int i = 0; i < 10000; ++i) {
    listingMessage(ListedSymbol, "function_" + std::to_string(i), "a.o", i);
    char line[100];
    std::snprintf(line, sizeof line, "function_%-11d from a.o        at offset %6d\n", i, i);
    expected += line;
  }
  EXPECT_EQ(outputText(), expected);
  EXPECT_LT(m_Output.writeCount(), 10u);
}

TEST_F(OutputTest, AListingEndsWhereStdoutFails) {
  for (int i = 0; i < 5000; ++i)
    listingMessage(ListedMember, "before.o");
  report(WarningWord, nullptr, NoArchiveSpecified);
  const std::string before = m_Output.getText();
  EXPECT_EQ(before.size(), 5000u * 9);
  m_Output.failWith(ENOSPC);
  for (int i = 0; i < 20000; ++i)
    listingMessage(ListedMember, "after.o");
  m_Output.failWith(0);
  listingMessage(ListedMember, "late.o");
  EXPECT_FALSE(flushAll());
  EXPECT_EQ(getStdoutError(), ENOSPC);
  EXPECT_EQ(m_Output.getText(), before);
}

TEST_F(OutputTest, AFailureOfStdoutIsRememberedAndTheRestDropped) {
  m_Output.failWith(ENOSPC);
  writeRaw("a");
  EXPECT_FALSE(hasStdoutFailed());
  EXPECT_FALSE(flushAll());
  EXPECT_TRUE(hasStdoutFailed());
  EXPECT_EQ(getStdoutError(), ENOSPC);
  m_Output.failWith(0);
  writeRaw(std::string(MoreThanTheBuffer, 'x'));
  writeRaw("b");
  EXPECT_FALSE(flushAll());
  EXPECT_EQ(m_Output.getText(), "");
}

TEST_F(OutputTest, AFailureOfALargePieceIsRememberedToo) {
  m_Output.failWith(EPIPE);
  writeRaw(std::string(MoreThanTheBuffer, 'x'));
  EXPECT_EQ(getStdoutError(), EPIPE);
}

TEST_F(OutputTest, AFailureOfStderrStopsNothing) {
  m_Error.failWith(ENOSPC);
  EXPECT_TRUE(report(WarningWord, nullptr, NoArchiveSpecified));
  m_Error.failWith(0);
  EXPECT_TRUE(report(WarningWord, nullptr, NoArchiveSpecified));
  EXPECT_EQ(m_Error.writeCount(), 1u);
  EXPECT_FALSE(hasStdoutFailed());
  EXPECT_TRUE(hasStderrFailed());
  setOutputSinks(&m_Output, &m_Error);
  EXPECT_FALSE(hasStderrFailed());
}

// ---- Output that is held back

struct HeldOutputTest : MessagesTest {
  void SetUp() override {
    MessagesTest::SetUp();
    setOutputSinks(&m_Sink, &m_Sink);
  }

  static void writeBoth() {
    writeText(Stream::Output, "out 1\n");
    writeText(Stream::Error, "err\n");
    writeRaw("out 2\n");
  }

  std::string written() {
    flushAll();
    return m_All;
  }

  static constexpr const char* Both = "out 1\nerr\nout 2\n";
  std::string m_All;
  OrderedSink m_Sink{m_All};
};

TEST_F(HeldOutputTest, ComesOutInItsOrder) {
  HeldOutput held;
  held.hold();
  writeBoth();
  EXPECT_EQ(m_All, "");
  held.release();
  EXPECT_EQ(written(), Both);
  EXPECT_FALSE(held.drop());
}

TEST_F(HeldOutputTest, MayBeDroppedAndBegunAgain) {
  HeldOutput held;
  for (int i = 0; i < 3; ++i) {
    held.hold();
    writeBoth();
    EXPECT_TRUE(held.drop());
  }
  held.hold();
  writeBoth();
  held.release();
  EXPECT_EQ(written(), Both);
}

TEST_F(HeldOutputTest, ComesOutWhereMemoryHasRunOut) {
  HeldOutput held;
  held.hold();
  writeText(Stream::Output, "out\n");
  EXPECT_EQ(statusOf([] { std::get_new_handler()(); }), 1);
  EXPECT_EQ(m_All, "out\nFatal error: L6800U: Out of memory\n");
}

TEST_F(HeldOutputTest, ComesOutAtTheEnd) {
  {
    HeldOutput held;
    held.hold();
    writeBoth();
  }
  EXPECT_EQ(written(), Both);
  HeldOutput held;
  held.hold();
  writeBoth();
  EXPECT_EQ(written(), std::string(Both) + Both);
}

TEST_F(HeldOutputTest, ComesOutWhenItIsTooMuch) {
  HeldOutput held;
  held.hold();
  const std::string line(1000, 'x');
  for (int i = 0; i < 2000; ++i)
    writeRaw(line);
  EXPECT_FALSE(held.drop());
  EXPECT_EQ(written().size(), 2'000'000u);
}

} // namespace messages
