// SPDX-License-Identifier: Apache-2.0
//
// The tool with each of its host calls failing in turn, or interrupted by a signal: the old archive
// whole or the new one complete, extracted files whole or absent, no temporary left, and an error
// told whenever what was asked for was not done.
//
// It is the fault test of the library once more, from the command line down: the real program on
// the faulty host, its exit status, what it says and what is on disk afterwards.

#include "tests/support/archive_builder.h"
#include "tests/support/object_builder.h"
#include "tests/support/tool_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <csignal>
#include <cstring>

namespace testsupport {

namespace {

using testing::ElementsAre;
using Words = std::vector<std::string>;

const std::string LongName = "member_with_a_long_name.o";

class FaultInTheTool : public testing::TestWithParam<Words> {
protected:
  static std::string oldArchive() {
    return archive()
        .symbolTable({{"s", "a.o"}})
        .longNames({LongName})
        .member("a.o", "odd")
        .member(LongName, std::string(3000, 'x'))
        .bytes();
  }

  void fill() {
    m_Folder.removeAllBut({});
    m_Folder.write("lib.a", oldArchive());
    m_Folder.write("a.o", object().bytes());
    m_Folder.write("other.a", archive().member("in.o", object().bytes()).bytes());
  }

  static bool isOneOf(const std::string& bytes, const Words& all) {
    return std::find(all.begin(), all.end(), bytes) != all.end();
  }

  // An input archive that can't be looked at is an input file like any other.
  static void expectPlainFile(const std::string& bytes, const std::string& errors) {
    std::string error;
    Words names;
    for (const ParsedMember& member : parseArchive(bytes, error))
      names.push_back(member.name);
    EXPECT_EQ(error, "");
    EXPECT_TRUE(isOneOf("other.a", names)) << errors;
    EXPECT_THAT(errors, testing::HasSubstr("Warning: L6875W"));
  }

  ToolFolder m_Folder;
};

using FaultInAnEdit = FaultInTheTool;
using FaultInARunThatReads = FaultInTheTool;

} // namespace

TEST_P(FaultInAnEdit, KeepsTheOldArchiveOrMakesTheNewOne) {
  uint64_t calls = 0;
  fill();
  ASSERT_EQ(m_Folder.runOnFaultyHost(GetParam(), {}, calls).status, 0);
  const std::string newArchive = m_Folder.read("lib.a");
  const uint64_t needed = calls;
  ASSERT_GT(needed, 5u);
  for (uint64_t call = 1; call <= needed + 1; ++call) {
    SCOPED_TRACE("call " + std::to_string(call) + " of " + std::to_string(needed));
    fill();
    const ToolRun run = m_Folder.runOnFaultyHost(GetParam(), {call, EIO}, calls);
    const std::string now = m_Folder.read("lib.a");
    EXPECT_THAT(m_Folder.leaves(), ElementsAre("a.o", "lib.a", "other.a"));
    if (run.status == 1) {
      EXPECT_EQ(now, oldArchive());
      EXPECT_THAT(run.errors, testing::HasSubstr("Error: "));
      continue;
    }
    EXPECT_EQ(run.status, 0) << run.errors;
    EXPECT_EQ(run.errors.find("Error: "), std::string::npos) << run.errors;
    if (now != newArchive) expectPlainFile(now, run.errors);
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
      if (signal == SIGKILL) m_Folder.removeAllBut({"a.o", "lib.a", "other.a"});
      EXPECT_THAT(m_Folder.leaves(), ElementsAre("a.o", "lib.a", "other.a"));
    }
    EXPECT_TRUE(isOldKept);
  }
}

INSTANTIATE_TEST_SUITE_P(Tool, FaultInAnEdit,
                         testing::Values(Words{"-r", "--normalise=5", "lib.a", "a.o"},
                                         Words{"-q", "--normalise=5", "lib.a", "other.a"},
                                         Words{"-r", "--normalise=5", "-b", "a.o", "lib.a",
                                               "other.a"},
                                         Words{"-d", "lib.a", "a.o"}, Words{"-m", "lib.a", "a.o"},
                                         Words{"-s", "lib.a"}, Words{"-n", "-s", "lib.a"},
                                         Words{"--create", "--normalise=5", "lib.a", "a.o"}));

TEST_P(FaultInARunThatReads, LeavesTheArchiveAndNoHalfFile) {
  uint64_t needed = 0;
  fill();
  m_Folder.removeAllBut({"lib.a"});
  ASSERT_EQ(m_Folder.runOnFaultyHost(GetParam(), {}, needed).status, 0);
  const Words wholeLeaves = m_Folder.leaves();
  ASSERT_GT(needed, 3u);
  for (uint64_t call = 1; call <= needed; ++call) {
    SCOPED_TRACE("call " + std::to_string(call) + " of " + std::to_string(needed));
    fill();
    m_Folder.removeAllBut({"lib.a"});
    uint64_t calls = 0;
    const ToolRun run = m_Folder.runOnFaultyHost(GetParam(), {call, EIO}, calls);
    EXPECT_EQ(m_Folder.read("lib.a"), oldArchive());
    EXPECT_TRUE(run.status == 0 || run.status == 1) << run.status;
    EXPECT_EQ(run.status == 1, run.errors.find("Error: ") != std::string::npos) << run.errors;
    if (run.status == 0) {
      EXPECT_EQ(m_Folder.leaves(), wholeLeaves);
    }
    for (const std::string& leaf : m_Folder.leaves()) {
      EXPECT_TRUE(isOneOf(m_Folder.read(leaf), {oldArchive(), "odd", std::string(3000, 'x')}))
          << leaf;
    }
  }
}

INSTANTIATE_TEST_SUITE_P(Tool, FaultInARunThatReads,
                         testing::Values(Words{"-x", "lib.a"}, Words{"-t", "lib.a"},
                                         Words{"-tv", "lib.a"}, Words{"-p", "lib.a"},
                                         Words{"--zs", "lib.a"}));

} // namespace testsupport
