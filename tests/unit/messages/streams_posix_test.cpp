// SPDX-License-Identifier: Apache-2.0
//
// What tools are started with on POSIX, on pipes and files of its own: streams that are closed from
// the start, a reader that is gone or slow, a disk that is full, an interruption; and the way out.

#include "messages/interface/output.h"

#include "messages/interface/messages.h"
#include "messages/interface/process_end.h"
#include "messages/src/descriptor_sink.h"
#include "tests/support/sanitized.h"

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace messages {

namespace {

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

// The limit may leave room for one duplicate, or for none.
TEST(Streams, WhatHasNoDuplicateServesItself) {
  // The sanitizer looks at memory through a pipe.
  if (testsupport::IsSanitized) GTEST_SKIP() << "the sanitizer wants descriptors, too";
  for (const rlim_t limit : {rlim_t{STDERR_FILENO + 1}, rlim_t{STDERR_FILENO + 2}}) {
    EXPECT_EQ(inChild([limit](int descriptor) {
                dup2(descriptor, STDOUT_FILENO);
                dup2(descriptor, STDERR_FILENO);
                for (int other = STDERR_FILENO + 1; other < 100; ++other)
                  close(other);
                const rlimit few{limit, limit};
                if (setrlimit(RLIMIT_NOFILE, &few) != 0) _exit(1);
                openStreams();
                writeText(Stream::Output, "out\n");
                writeText(Stream::Error, "err\n");
                writeText(Stream::Output, "out again\n");
                closeStreams();
                if (hasStdoutFailed() || hasStderrFailed()) _exit(1);
              }),
              "out\nerr\nout again\n");
  }
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

} // namespace messages
