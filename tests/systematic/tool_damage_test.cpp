// SPDX-License-Identifier: Apache-2.0
//
// The tool on every damaged form of a good archive: it never crashes or hangs, every line it prints
// is one of its reports, and the file is as it was when the run failed.
//
// The forms are those of damaged_archives.h; for each of them the tool lists, extracts and edits.

#include "tests/support/tool_folder.h"
#include "tests/systematic/damaged_archives.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <regex>

namespace testsupport {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

// The lines that a damaged archive may cost.
bool isReport(const std::string& line) {
  static const std::regex Report(
      "Warning: L6974W: 'lib\\.a': malformed archive: (Archive|Padding) .*"
      "|Error: L6829E: 'lib\\.a': malformed archive: (Archive|End of file|Error reading member) .*"
      "|Error: L6826E: 'lib\\.a' not in archive format"
      "|Error: L6835E: Reading file 'lib\\.a' : Unexpected end of file"
      "|Error: L6843E: Writing file '.*' : .*");
  return std::regex_match(line, Report);
}

void expectReports(const ToolRun& run) {
  size_t start = 0;
  while (start < run.errors.size()) {
    const size_t end = std::min(run.errors.find('\n', start), run.errors.size());
    const std::string line = run.errors.substr(start, end - start);
    EXPECT_TRUE(isReport(line)) << line;
    start = end + 1;
  }
  EXPECT_TRUE(run.status == 0 || run.status == 1) << run.status;
  EXPECT_EQ(run.status == 1, run.errors.find("Error: ") != std::string::npos);
}

// The library is tried with every changed byte. What the tool makes of its answers shows with one
// in seven as well; the long form of the tests tries all of them here, too.
size_t getStep() {
  return std::getenv("QUARN_LONG_TESTS") != nullptr ? 1 : 7;
}

class DamagedArchiveInTheTool : public testing::Test {
public:
  DamagedArchiveInTheTool() { m_Folder.write("new.o", object().bytes()); }

  void list(const std::string& what, const std::string& bytes) {
    SCOPED_TRACE(what);
    m_Folder.write("lib.a", bytes);
    const ToolRun run = m_Folder.run({"-t", "lib.a"});
    expectReports(run);
    expectOldFile(bytes);
  }

  void extract(const std::string& what, const std::string& bytes) {
    SCOPED_TRACE(what);
    m_Folder.write("lib.a", bytes);
    const ToolRun run = m_Folder.run({"-x", "lib.a"});
    expectReports(run);
    EXPECT_EQ(m_Folder.read("lib.a"), bytes);
    m_Folder.removeAllBut({"lib.a", "new.o"});
  }

  void insert(const std::string& what, const std::string& bytes) {
    SCOPED_TRACE(what);
    m_Folder.write("lib.a", bytes);
    const ToolRun run = m_Folder.run({"-r", "lib.a", "new.o"});
    expectReports(run);
    EXPECT_THAT(m_Folder.leaves(), ElementsAre("lib.a", "new.o"));
    if (run.status != 0) {
      expectOldFile(bytes);
      return;
    }
    std::string error;
    const std::vector<ParsedMember> members = parseArchive(m_Folder.read("lib.a"), error);
    EXPECT_EQ(error, "");
    ASSERT_FALSE(members.empty());
    EXPECT_EQ(members.back().name, "new.o");
    EXPECT_EQ(members.back().contents, object().bytes());
  }

  void expectOldFile(const std::string& bytes) {
    EXPECT_EQ(m_Folder.read("lib.a"), bytes);
    EXPECT_THAT(m_Folder.leaves(), ElementsAre("lib.a", "new.o"));
  }

  using Work = void (DamagedArchiveInTheTool::*)(const std::string&, const std::string&);
  DamageVisitor each(Work work) {
    return [this, work](const std::string& what, const std::string& bytes) {
      (this->*work)(what, bytes);
    };
  }

  ToolFolder m_Folder;
};

} // namespace

TEST_F(DamagedArchiveInTheTool, IsNoneAtFirst) {
  m_Folder.write("lib.a", goodArchive());
  const ToolRun run = m_Folder.run({"-t", "lib.a"});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.errors, "");
  EXPECT_EQ(run.output, "a.o\nb_with_a_long_name\nc\n");
}

TEST_F(DamagedArchiveInTheTool, IsListedAtEveryPrefix) {
  forEachPrefix(each(&DamagedArchiveInTheTool::list));
}

TEST_F(DamagedArchiveInTheTool, IsExtractedAtEveryPrefix) {
  forEachPrefix(each(&DamagedArchiveInTheTool::extract));
}

TEST_F(DamagedArchiveInTheTool, IsEditedAtEveryPrefix) {
  forEachPrefix(each(&DamagedArchiveInTheTool::insert));
}

TEST_F(DamagedArchiveInTheTool, IsListedForChangedBytes) {
  forEachChangedByte(each(&DamagedArchiveInTheTool::list), getStep());
}

TEST_F(DamagedArchiveInTheTool, IsExtractedForChangedBytes) {
  forEachChangedByte(each(&DamagedArchiveInTheTool::extract), getStep());
}

TEST_F(DamagedArchiveInTheTool, IsEditedForChangedBytes) {
  forEachChangedByte(each(&DamagedArchiveInTheTool::insert), getStep());
}

} // namespace testsupport
