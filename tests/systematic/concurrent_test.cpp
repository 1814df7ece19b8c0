// SPDX-License-Identifier: Apache-2.0
//
// Many runs of the tool at once on one library, as a parallel build starts them. Each puts one file
// in; all succeed, and the library has all of them, whoever made it. QUARN_CONCURRENT_ROUNDS says
// how often, for a longer look than the suite takes.
//
// What it looks for: an update that is lost because two have read the same library, a reader that
// finds half a library, and a run that waits for ever.

#include "tests/support/archive_builder.h"
#include "tests/support/tool_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <map>

namespace testsupport {

namespace {

using Words = std::vector<std::string>;

constexpr int Writers = 24;
constexpr int RoundsOfTheSuite = 10;

int roundCount() {
  const char* text = std::getenv("QUARN_CONCURRENT_ROUNDS");
  return text == nullptr ? RoundsOfTheSuite : std::atoi(text);
}

// Of different sizes, so that bytes taken from a wrong place show.
std::string contentsOf(int writer) {
  return std::string(static_cast<size_t>(writer * 37 % 500), static_cast<char>('a' + writer)) +
         "end of " + std::to_string(writer);
}

std::string nameOf(int writer) {
  return "member_" + std::to_string(writer) + (writer % 2 == 0 ? ".o" : "_with_a_long_name.o");
}

class ConcurrentRuns : public testing::TestWithParam<Words> {
protected:
  ConcurrentRuns() {
    for (int writer = 0; writer < Writers; ++writer)
      m_Folder.write(nameOf(writer), contentsOf(writer));
  }

  // All at once; the words of GetParam, then the library and the writer's file.
  void runWriters() {
    std::vector<Words> runs;
    for (int writer = 0; writer < Writers; ++writer) {
      Words words = GetParam();
      words.insert(words.end(), {"lib.a", nameOf(writer)});
      runs.push_back(words);
    }
    for (const ToolRun& run : m_Folder.runAtOnce(runs)) {
      EXPECT_EQ(run.status, 0) << run.errors;
      EXPECT_EQ(run.errors.find("Error"), std::string::npos) << run.errors;
    }
  }

  void expectAllMembers(size_t others) {
    std::string error;
    std::map<std::string, std::string> members;
    for (const ParsedMember& member : parseArchive(m_Folder.read("lib.a"), error))
      members[member.name] = member.contents;
    EXPECT_EQ(error, "");
    for (int writer = 0; writer < Writers; ++writer)
      EXPECT_EQ(members[nameOf(writer)], contentsOf(writer)) << nameOf(writer);
    EXPECT_EQ(m_Folder.leaves().size(), Writers + 1u + others);
  }

  ToolFolder m_Folder;
};

} // namespace

TEST_P(ConcurrentRuns, AllMakeOneLibrary) {
  for (int round = 0; round < roundCount() && !HasFailure(); ++round) {
    SCOPED_TRACE("round " + std::to_string(round));
    m_Folder.remove("lib.a");
    runWriters();
    expectAllMembers(0);
  }
}

TEST_P(ConcurrentRuns, AllAddToOneLibrary) {
  m_Folder.write("old", "as it was");
  for (int round = 0; round < roundCount() && !HasFailure(); ++round) {
    SCOPED_TRACE("round " + std::to_string(round));
    m_Folder.write("lib.a", archive().member("old", "as it was").bytes());
    runWriters();
    expectAllMembers(1);
  }
}

INSTANTIATE_TEST_SUITE_P(Tool, ConcurrentRuns,
                         testing::Values(Words{"-r"}, Words{"-rv"}, Words{"-r", "-c"},
                                         Words{"-q", "--diag_suppress=L6875"}));

// Readers see one library or the next, and never wait for a writer.
TEST(ConcurrentReaders, SeeOneWholeLibrary) {
  ToolFolder folder;
  const std::string small = archive().member("a", "1").member("b", "22").bytes();
  const std::string large =
      archive().member("a", std::string(5000, '1')).member("b", std::string(5000, '2')).bytes();
  folder.write("lib.a", small);
  folder.write("small.a", small);
  folder.write("large.a", large);
  for (int round = 0; round < roundCount(); ++round) {
    std::vector<Words> runs;
    for (int i = 0; i < 6; ++i) {
      runs.push_back({"-r", "lib.a", i % 2 == 0 ? "large.a" : "small.a"});
      runs.push_back({"-p", "lib.a"});
    }
    for (const ToolRun& run : folder.runAtOnce(runs)) {
      EXPECT_EQ(run.status, 0) << run.errors;
      const bool isWhole = run.output.empty() || run.output == "122" ||
                           run.output == std::string(5000, '1') + std::string(5000, '2');
      EXPECT_TRUE(isWhole) << run.output.size();
    }
  }
}

} // namespace testsupport
