// SPDX-License-Identifier: Apache-2.0
//
// The tool with each of its host calls failing in turn, or interrupted by a signal: the old archive
// whole or the new one complete, extracted files whole or absent, no temporary left, and an error
// told whenever what was asked for was not done. A run that ends well has done and said what an
// undisturbed one does and says, to the byte: the host's failure is nothing of an object's.
//
// It is the fault test of the library once more, from the command line down: the real program on
// the faulty host, its exit status, what it says and what is on disk afterwards.

#include "tests/support/archive_builder.h"
#include "tests/support/object_builder.h"
#include "tests/support/tool_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cerrno>
#include <csignal>

namespace testsupport {

namespace {

using Words = std::vector<std::string>;

const std::string LongName = "member_with_a_long_name.o";

// Files of more than 64 KiB are not read whole when they are looked at, nor are such objects.
std::string objectOf(const std::string& symbol, size_t size) {
  ObjectBuilder builder = objectThatDefines(symbol);
  builder.section(".data", 1).flags(3).bytes(std::string(size, 'd'));
  return builder.bytes();
}

bool isOneOf(const std::string& bytes, const Words& all) {
  return std::find(all.begin(), all.end(), bytes) != all.end();
}

bool hasError(const std::string& errors) {
  return errors.find("Error: ") != std::string::npos ||
         errors.find("Fatal error: ") != std::string::npos;
}

class FaultInTheTool : public testing::TestWithParam<Words> {
protected:
  static std::string oldArchive() {
    return archive()
        .symbolTable({{"f", LongName}})
        .longNames({LongName})
        .member("a.o", "odd")
        .member(LongName, objectOf("f", 3000))
        .member("big.o", objectOf("g", 70000))
        .bytes();
  }

  void fill() {
    m_Folder.removeAllBut({});
    m_Folder.write("lib.a", oldArchive());
    m_Folder.write("a.o", objectThatDefines("new").bytes());
    m_Folder.write("large.o", objectOf("large", 80000));
    m_Folder.write("map", "lib* $IEEE1$P\n");
    m_Folder.write("other.a", archive()
                                  .symbolTable({{"in", "in.o"}})
                                  .member("in.o", objectOf("in", 1000))
                                  .member("out.o", objectOf("out", 90000))
                                  .bytes());
    m_Folder.write("words", "lib.a a.o\n");
  }

  [[nodiscard]] ToolRun runFailing(uint64_t call, int error) {
    uint64_t calls = 0;
    return m_Folder.runOnFaultyHost(GetParam(), {.call = call, .error = error}, calls);
  }

  // What the run was asked for is done as if nothing had happened, or an error is told.
  static void expectAllOrAnError(const ToolRun& run, const ToolRun& undisturbed) {
    ASSERT_TRUE(run.status == 0 || run.status == 1) << run.status;
    EXPECT_EQ(run.status == 1, hasError(run.errors)) << run.errors;
    if (run.status == 1) return;
    EXPECT_TRUE(run.output == undisturbed.output);
    // All of a via file has been read when it is closed.
    if (run.errors != "Warning: L3913W: Could not close via file 'words'.\n") {
      EXPECT_EQ(run.errors, undisturbed.errors);
    }
  }

  ToolFolder m_Folder;
};

const Words AllFiles = {"a.o", "large.o", "lib.a", "map", "other.a", "words"};

using FaultInAnEdit = FaultInTheTool;
using FaultInARunThatReads = FaultInTheTool;

} // namespace

TEST_P(FaultInAnEdit, KeepsTheOldArchiveOrMakesTheNewOne) {
  uint64_t needed = 0;
  fill();
  const ToolRun undisturbed = m_Folder.runOnFaultyHost(GetParam(), {}, needed);
  ASSERT_EQ(undisturbed.status, 0);
  const std::string newArchive = m_Folder.read("lib.a");
  ASSERT_GT(needed, 5u);
  for (const int error : {EIO, EMFILE}) {
    for (uint64_t call = 1; call <= needed + 1; ++call) {
      SCOPED_TRACE("error " + std::to_string(error) + " at call " + std::to_string(call) + " of " +
                   std::to_string(needed));
      fill();
      const ToolRun run = runFailing(call, error);
      EXPECT_EQ(m_Folder.leaves(), AllFiles);
      expectAllOrAnError(run, undisturbed);
      EXPECT_TRUE(m_Folder.read("lib.a") == (run.status == 0 ? newArchive : oldArchive()));
    }
  }
}

// A signal that can be caught leaves nothing behind; one that can't leaves at most the new archive
// beside the old one.
TEST_P(FaultInAnEdit, KeepsTheOldArchiveOrTheNewOneAtASignal) {
  uint64_t needed = 0;
  fill();
  ASSERT_EQ(m_Folder.runOnFaultyHost(GetParam(), {}, needed).status, 0);
  const std::string newArchive = m_Folder.read("lib.a");
  for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGPIPE, SIGKILL}) {
    bool isOldKept = false;
    for (uint64_t call = 1; call <= needed; ++call) {
      SCOPED_TRACE("signal " + std::to_string(signal) + " at call " + std::to_string(call) +
                   " of " + std::to_string(needed));
      fill();
      uint64_t calls = 0;
      const ToolRun run =
          m_Folder.runOnFaultyHost(GetParam(), {.call = call, .signal = signal}, calls);
      EXPECT_EQ(run.signal, signal);
      const std::string now = m_Folder.read("lib.a");
      isOldKept |= now == oldArchive();
      EXPECT_TRUE(now == oldArchive() || now == newArchive);
      if (signal == SIGKILL) m_Folder.removeAllBut(AllFiles);
      EXPECT_EQ(m_Folder.leaves(), AllFiles);
    }
    EXPECT_TRUE(isOldKept);
  }
}

INSTANTIATE_TEST_SUITE_P(
    Tool, FaultInAnEdit,
    testing::Values(Words{"-r", "--normalise=5", "lib.a", "a.o", "large.o"},
                    Words{"-q", "--normalise=5", "lib.a", "other.a"},
                    Words{"-r", "--normalise=5", "-b", "a.o", "lib.a", "other.a"},
                    Words{"-r", "--normalise=5", "--via", "words"},
                    Words{"-s", "--libattrmap=map", "lib.a"}, Words{"-d", "lib.a", "a.o"},
                    Words{"-m", "lib.a", "a.o"}, Words{"-s", "lib.a"}, Words{"-n", "-s", "lib.a"},
                    Words{"--create", "--normalise=5", "lib.a", "a.o", "other.a"},
                    Words{"quarn-ar", "rcsD", "lib.a", "a.o", "large.o"},
                    Words{"quarn-ar", "ds", "lib.a", "a.o"}, Words{"quarn-ar", "sD", "lib.a"},
                    Words{"quarn-ar", "qD", "lib.a", "large.o"}));

// Once, and for good: what is told then needs no memory.
TEST_P(FaultInAnEdit, KeepsTheOldArchiveWithoutMemory) {
  uint64_t needed = 0;
  fill();
  const ToolRun undisturbed = m_Folder.runWithoutMemory(GetParam(), 0, 0, needed);
  ASSERT_EQ(undisturbed.status, 0);
  const std::string newArchive = m_Folder.read("lib.a");
  ASSERT_GT(needed, 20u);
  for (uint64_t first = 1; first <= needed; ++first) {
    for (const uint64_t last : {first, UINT64_MAX}) {
      SCOPED_TRACE("allocation " + std::to_string(first) + " to " + std::to_string(last) + " of " +
                   std::to_string(needed));
      fill();
      uint64_t made = 0;
      const ToolRun run = m_Folder.runWithoutMemory(GetParam(), first, last, made);
      EXPECT_EQ(m_Folder.leaves(), AllFiles);
      // Memory may still run out when the new archive is in its place.
      const std::string now = m_Folder.read("lib.a");
      EXPECT_TRUE(now == newArchive || (run.status == 1 && now == oldArchive()));
      ASSERT_TRUE(run.status == 0 || run.status == 1) << run.signal << run.errors;
      const bool isTold = run.errors.find("Out of memory") != std::string::npos;
      EXPECT_EQ(run.status == 1, isTold) << run.errors;
      if (run.status == 0) {
        EXPECT_EQ(run.errors, undisturbed.errors);
      }
    }
  }
}

TEST_P(FaultInARunThatReads, TellsAllAndLeavesNoHalfFile) {
  uint64_t needed = 0;
  fill();
  m_Folder.removeAllBut({"lib.a"});
  const ToolRun undisturbed = m_Folder.runOnFaultyHost(GetParam(), {}, needed);
  ASSERT_EQ(undisturbed.status, 0);
  const Words wholeLeaves = m_Folder.leaves();
  const Words wholeFiles = {oldArchive(), "odd", objectOf("f", 3000), objectOf("g", 70000)};
  ASSERT_GT(needed, 3u);
  for (const int error : {EIO, EMFILE}) {
    for (uint64_t call = 1; call <= needed; ++call) {
      SCOPED_TRACE("error " + std::to_string(error) + " at call " + std::to_string(call) + " of " +
                   std::to_string(needed));
      fill();
      m_Folder.removeAllBut({"lib.a"});
      const ToolRun run = runFailing(call, error);
      EXPECT_TRUE(m_Folder.read("lib.a") == oldArchive());
      expectAllOrAnError(run, undisturbed);
      if (run.status == 0) {
        EXPECT_EQ(m_Folder.leaves(), wholeLeaves);
      }
      for (const std::string& leaf : m_Folder.leaves()) {
        EXPECT_TRUE(isOneOf(m_Folder.read(leaf), wholeFiles)) << leaf;
      }
    }
  }
}

TEST_P(FaultInARunThatReads, TellsThatMemoryRanOut) {
  uint64_t needed = 0;
  fill();
  m_Folder.removeAllBut({"lib.a"});
  const ToolRun undisturbed = m_Folder.runWithoutMemory(GetParam(), 0, 0, needed);
  ASSERT_EQ(undisturbed.status, 0);
  const Words wholeLeaves = m_Folder.leaves();
  const Words wholeFiles = {oldArchive(), "odd", objectOf("f", 3000), objectOf("g", 70000)};
  ASSERT_GT(needed, 10u);
  for (uint64_t first = 1; first <= needed; ++first) {
    for (const uint64_t last : {first, UINT64_MAX}) {
      SCOPED_TRACE("allocation " + std::to_string(first) + " to " + std::to_string(last) + " of " +
                   std::to_string(needed));
      m_Folder.removeAllBut({"lib.a"});
      uint64_t made = 0;
      const ToolRun run = m_Folder.runWithoutMemory(GetParam(), first, last, made);
      ASSERT_TRUE(run.status == 0 || run.status == 1) << run.signal << run.errors;
      const bool isTold = run.errors.find("Out of memory") != std::string::npos;
      EXPECT_EQ(run.status == 1, isTold) << run.errors;
      if (run.status == 0) {
        EXPECT_TRUE(run.output == undisturbed.output);
        EXPECT_EQ(m_Folder.leaves(), wholeLeaves);
      }
      for (const std::string& leaf : m_Folder.leaves()) {
        EXPECT_TRUE(isOneOf(m_Folder.read(leaf), wholeFiles)) << leaf;
      }
    }
  }
}

INSTANTIATE_TEST_SUITE_P(
    Tool, FaultInARunThatReads,
    testing::Values(Words{"-x", "lib.a"}, Words{"-t", "lib.a"}, Words{"-tv", "lib.a"},
                    Words{"-p", "lib.a"}, Words{"--zs", "lib.a"}, Words{"--sizes", "lib.a"},
                    Words{"--entries", "lib.a"}, Words{"--zt", "lib.a"},
                    Words{"quarn-ar", "xo", "lib.a"}, Words{"quarn-ar", "tv", "lib.a"},
                    Words{"quarn-ar", "p", "lib.a"}, Words{"quarn-json", "lib.a"}));

} // namespace testsupport
