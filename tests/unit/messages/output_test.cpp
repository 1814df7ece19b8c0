// SPDX-License-Identifier: Apache-2.0
//
// The order of the two streams, their failures, and the way out. On pipes and files of its own it
// meets what tools are started with: streams that are closed from the start, a reader that is gone
// or slow, a disk that is full, an interruption. Control bytes in names come out as numbers.

#include "messages/interface/output.h"

#include "messages/src/descriptor_sink.h"
#include "tests/support/messages_fixture.h"

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <fcntl.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

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

struct Pipe {
  Pipe() { EXPECT_EQ(pipe(m_Ends), 0); }
  ~Pipe() {
    close(m_Ends[0]);
    closeWriting();
  }
  int writing() const { return m_Ends[1]; }
  void closeWriting() {
    if (m_Ends[1] >= 0) close(m_Ends[1]);
    m_Ends[1] = -1;
  }
  std::string readAll(size_t pieceSize = 4096) const {
    std::string all;
    std::string piece(pieceSize, '\0');
    for (ssize_t count; (count = read(m_Ends[0], piece.data(), piece.size())) != 0;) {
      if (count > 0) all.append(piece, 0, static_cast<size_t>(count));
    }
    return all;
  }

private:
  int m_Ends[2] = {-1, -1};
};

// Runs the action in a child process; returns what it wrote to the pipe's descriptor.
template <class Action>
std::string inChild(Action action) {
  Pipe pipe;
  // What the test program has gathered for its own stdout is not the child's to write.
  std::fflush(stdout);
  const pid_t child = fork();
  if (child == 0) {
    closeStreams();
    action(pipe.writing());
    _exit(0);
  }
  pipe.closeWriting();
  const std::string text = pipe.readAll();
  int status = 0;
  EXPECT_EQ(waitpid(child, &status, 0), child);
  EXPECT_EQ(status, 0);
  return text;
}

void onAlarm(int) {}

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
}

TEST(DescriptorSink, ClosedFromTheStartDropsEverything) {
  DescriptorSink sink;
  EXPECT_EQ(sink.write("a"), 0);
  sink.open(-1);
  EXPECT_EQ(sink.write("a"), 0);
  EXPECT_EQ(sink.close(), 0);
}

TEST(DescriptorSink, WritesToItsOwnDuplicate) {
  Pipe pipe;
  DescriptorSink sink;
  sink.open(pipe.writing());
  pipe.closeWriting();
  EXPECT_EQ(sink.write("text"), 0);
  EXPECT_EQ(sink.close(), 0);
  EXPECT_EQ(pipe.readAll(), "text");
}

TEST(DescriptorSink, TellsTheHostsErrorNumber) {
  const int full = open("/dev/full", O_WRONLY);
  if (full < 0) GTEST_SKIP() << "the host has no full device";
  DescriptorSink sink;
  sink.open(full);
  close(full);
  EXPECT_EQ(sink.write("a"), ENOSPC);
  EXPECT_EQ(sink.close(), 0);
}

TEST(DescriptorSink, WaitsForRoomInAPipeThatDoesNotBlock) {
  Pipe pipe;
  ASSERT_EQ(fcntl(pipe.writing(), F_SETFL, O_NONBLOCK), 0);
  DescriptorSink sink;
  sink.open(pipe.writing());
  pipe.closeWriting();
  const std::string large(1000000, 'x');
  std::string received;
  std::thread reader([&] { received = pipe.readAll(1000); });
  EXPECT_EQ(sink.write(large), 0);
  sink.close();
  reader.join();
  EXPECT_EQ(received, large);
}

TEST(DescriptorSink, GoesOnAfterAnInterruption) {
  struct sigaction action {};
  struct sigaction before {};
  action.sa_handler = onAlarm; // without SA_RESTART, so that writes come back interrupted
  ASSERT_EQ(sigaction(SIGUSR1, &action, &before), 0);
  Pipe pipe;
  DescriptorSink sink;
  sink.open(pipe.writing());
  pipe.closeWriting();
  const std::string large(1000000, 'x');
  const pthread_t writer = pthread_self();
  std::string received;
  std::thread reader([&] {
    for (int i = 0; i < 20; ++i) {
      std::this_thread::sleep_for(std::chrono::milliseconds(2));
      pthread_kill(writer, SIGUSR1);
    }
    received = pipe.readAll();
  });
  EXPECT_EQ(sink.write(large), 0);
  sink.close();
  reader.join();
  EXPECT_EQ(received, large);
  sigaction(SIGUSR1, &before, nullptr);
}

TEST(Streams, AClosedStdoutIsDroppedAndDoesNotComeOutOfStderr) {
  EXPECT_EQ(inChild([](int descriptor) {
              dup2(descriptor, STDERR_FILENO);
              close(STDOUT_FILENO);
              openStreams();
              writeText(Stream::Output, "lost\n");
              writeText(Stream::Error, "kept\n");
              if (!flushAll() || hasStdoutFailed()) _exit(1);
            }),
            "kept\n");
}

TEST(Streams, AClosedStderrIsDroppedAndDoesNotComeOutOfStdout) {
  EXPECT_EQ(inChild([](int descriptor) {
              dup2(descriptor, STDOUT_FILENO);
              close(STDERR_FILENO);
              openStreams();
              writeText(Stream::Error, "lost\n");
              writeText(Stream::Output, "kept\n");
              flushAll();
            }),
            "kept\n");
}

TEST(Streams, AFileThatGetsTheNumberOfAClosedStdoutIsNotWritten) {
  EXPECT_EQ(inChild([](int descriptor) {
              close(STDOUT_FILENO);
              openStreams();
              if (dup(descriptor) != STDOUT_FILENO) _exit(1);
              writeText(Stream::Output, "lost\n");
              flushAll();
            }),
            "");
}

TEST(Streams, ClosingFlushesAndDropsTheRest) {
  EXPECT_EQ(inChild([](int descriptor) {
              dup2(descriptor, STDOUT_FILENO);
              openStreams();
              writeText(Stream::Output, "kept\n");
              closeStreams();
              writeText(Stream::Output, "lost\n");
              flushAll();
            }),
            "kept\n");
}

TEST(ProcessEnd, FlushesAndExitsByDefault) {
  EXPECT_EQ(inChild([](int descriptor) {
              dup2(descriptor, STDOUT_FILENO);
              openStreams();
              const pid_t child = fork();
              if (child == 0) {
                writeText(Stream::Output, "kept\n");
                endProcess(7);
              }
              int status = 0;
              waitpid(child, &status, 0);
              if (!WIFEXITED(status) || WEXITSTATUS(status) != 7) _exit(1);
            }),
            "kept\n");
}

TEST(ProcessEnd, AShutDownThatFailsDoesNotGoRoundInCircles) {
  EXPECT_EQ(inChild([](int descriptor) {
              dup2(descriptor, STDOUT_FILENO);
              openStreams();
              setExitHandler([](int) {
                writeText(Stream::Output, "once\n");
                endProcess(5);
              });
              const pid_t child = fork();
              if (child == 0) endProcess(0);
              int status = 0;
              waitpid(child, &status, 0);
              if (!WIFEXITED(status) || WEXITSTATUS(status) != 5) _exit(1);
            }),
            "once\n");
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
