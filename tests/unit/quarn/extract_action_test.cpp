// SPDX-License-Identifier: Apache-2.0
//
// Which files an archive may make: none where something is and shall stay, nor where the host can't
// tell. Where names lead to more than files no member can open a device or a stream, nor take the
// place of a file of another name.

#include "tests/support/faulty_host.h"
#include "tests/unit/quarn/driver_fixture.h"

#include <cerrno>

namespace quarn {

using ExtractTest = DriverTest;

// With -C a link is there, wherever it leads.
TEST_F(ExtractTest, LeavesLinksThatLeadNowhere) {
  givenLibrary({"a.o"});
  m_Host.addLink("a.o", "nowhere");
  const RunOutcome outcome = run({"-xC", "lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6836E: 'a.o' already exists, so will not be extracted\n");
  EXPECT_FALSE(m_Host.has("nowhere"));
  EXPECT_EQ(run({"-x", "lib.a"}).status, 0);
  EXPECT_TRUE(m_Host.has("nowhere"));
}

// Somebody else makes the file just when it is going to be made.
TEST_F(ExtractTest, LeavesWhatHasComeToStandThereMeanwhile) {
  class HurriedHost final : public testsupport::FaultyHost {
  public:
    explicit HurriedHost(testsupport::MemoryHost& host) : FaultyHost(host), m_Files(host) {}
    support::HostError createForWriting(const char* name, support::FileHandle& file) override {
      m_Files.addFile(name, "somebody's");
      return FaultyHost::createForWriting(name, file);
    }

  private:
    testsupport::MemoryHost& m_Files;
  };
  givenLibrary({"a.o"});
  HurriedHost host(m_Host);
  const RunOutcome outcome = runWork(quarnMain, "quarn", {"-xC", "lib.a"}, host);
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6836E: 'a.o' already exists, so will not be extracted\n");
  EXPECT_EQ(m_Host.read("a.o"), "somebody's");
}

// It may be the archive itself, or a file that was to stay.
TEST_F(ExtractTest, WritesNothingWhereTheHostCannotTellWhatIsThere) {
  givenLibrary({"a.o"});
  m_Host.addFile("a.o", "old");
  testsupport::FaultyHost faulty(m_Host);
  uint32_t failures = 0;
  for (uint64_t call = 1; failures == 0; ++call) {
    faulty.failCall(call, EIO);
    const RunOutcome outcome = runWork(quarnMain, "quarn", {"-xC", "lib.a"}, faulty);
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(m_Host.read("a.o"), "old") << faulty.getFailedOperation();
    if (faulty.getFailedOperation() != "status" || faulty.getFailedName() != "a.o") continue;
    ++failures;
    EXPECT_EQ(outcome.errors, "Error: L6843E: Writing file 'a.o' : Input/output error\n");
  }
}

class WindowsExtractTest : public DriverTest {
protected:
  WindowsExtractTest() { m_Host.setPathStyle(support::PathStyle_Windows); }
};

TEST_F(WindowsExtractTest, MakesNoFileOfANameThatIsMore) {
  const Words names = {"con", "Nul.o", "com1.txt", "a:b", "x.", "x "};
  givenLibrary(names);
  const RunOutcome outcome = run({"-xv", "lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "");
  std::string expected;
  for (const std::string& name : names)
    expected += "Error: L6843E: Writing file '" + name + "' : Invalid argument\n";
  EXPECT_EQ(outcome.errors, expected);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a"));
}

TEST_F(WindowsExtractTest, MakesTheOthers) {
  givenLibrary({"nul", "console.o", "c\\d\\aux.o.x", "e.o"});
  const RunOutcome outcome = run({"-x", "lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("console.o", "e.o", "lib.a"));
}

TEST_F(WindowsExtractTest, TakesADriveForNoPartOfAMembersName) {
  givenFile("c:a.o");
  EXPECT_EQ(run({"-rcv", "lib.a", "c:a.o"}).output, "a - a.o\n");
  EXPECT_EQ(run({"-rv", "lib.a", "c:a.o"}).output, "r - a.o\n");
  EXPECT_EQ(run({"-t", "lib.a"}).output, "a.o\n");
}

} // namespace quarn
