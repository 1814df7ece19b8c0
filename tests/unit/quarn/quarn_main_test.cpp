// SPDX-License-Identifier: Apache-2.0
//
// What keeps a run from working, and in which order it is told: help, missing words, bad options,
// an archive that is not there or not to be written. In each of these the archive must be as it
// was, with nothing open and no temporary left.

#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

using QuarnMainTest = DriverTest;

TEST_F(QuarnMainTest, ShowsTheHelpWithoutWords) {
  const RunOutcome outcome = run({});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_THAT(outcome.output, HasSubstr("Command format:"));
}

TEST_F(QuarnMainTest, ShowsTheHelpInPlaceOfAnAction) {
  givenLibrary({"a.o"});
  const RunOutcome outcome = run({"-h", "-d", "lib.a", "a.o"});
  EXPECT_THAT(outcome.output, HasSubstr("Command format:"));
  EXPECT_THAT(names(), ElementsAre("a.o"));
}

TEST_F(QuarnMainTest, WantsAnArchive) {
  const RunOutcome outcome = run({"-t"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_THAT(outcome.errors, testing::StartsWith("Error: L6838E: "));
  EXPECT_EQ(run({"-t", ""}).errors, outcome.errors);
}

TEST_F(QuarnMainTest, WantsAnAction) {
  givenLibrary({"a.o"});
  const RunOutcome outcome = run({"lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_THAT(outcome.errors, testing::StartsWith("Error: L6839E: "));
}

TEST_F(QuarnMainTest, ShowsTheVersionWithoutAComplaintOfTheArchive) {
  const RunOutcome outcome = run({"--vsn"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_THAT(outcome.output, testing::StartsWith("Product: "));
}

TEST_F(QuarnMainTest, EndsAtAWordThatIsNoOption) {
  givenLibrary({"a.o"});
  const RunOutcome outcome = run({"--nothing", "-t", "lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "");
  EXPECT_EQ(outcome.errors, "Fatal error: L3900U: Unrecognized option '--nothing'.\n");
}

TEST_F(QuarnMainTest, ReportsAnArchiveThatIsNotThere) {
  const RunOutcome outcome = run({"-t", "lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors,
            "Error: L6832E: Archive 'lib.a' not found : No such file or directory\n");
}

TEST_F(QuarnMainTest, KeepsAnArchiveThatMayNotBeWritten) {
  givenLibrary({"a.o"});
  m_Host.at("lib.a").isReadOnly = true;
  const std::string before = m_Host.read("lib.a");
  const RunOutcome outcome = run({"-d", "lib.a", "a.o"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6979E: Output file 'lib.a' is read-only\n");
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

// The table is made in front of the one look at the errors that were counted.
// A map that isn't there gives way to the built-in one; who has one wants no other.
TEST_F(QuarnMainTest, KeepsTheArchiveIfItsMapCannotBeRead) {
  givenLibrary({"a.o"});
  const std::string before = m_Host.read("lib.a");
  m_Host.addFile("map", "lib* $IEEE1$P").isUnreadable = true;
  const RunOutcome outcome = run({"-s", "--libattrmap=map", "lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6835E: Reading file 'map' : Permission denied\n");
  EXPECT_EQ(m_Host.read("lib.a"), before);
  EXPECT_EQ(run({"-s", "--libattrmap=none", "lib.a"}).status, 0);
}

TEST_F(QuarnMainTest, KeepsTheArchiveIfAWarningOfTheTableIsAnError) {
  givenLibrary({"a.o"});
  m_Host.addFile("bad.o", testsupport::object().machine(3).bytes());
  const std::string before = m_Host.read("lib.a");
  EXPECT_EQ(run({"-r", "--diag_error=L6974", "lib.a", "bad.o"}).status, 1);
  EXPECT_EQ(m_Host.read("lib.a"), before);
  EXPECT_EQ(run({"-r", "lib.a", "bad.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("a.o", "bad.o"));
}

TEST_F(QuarnMainTest, LeavesNothingOpenAndNoTemporaryFile) {
  givenLibrary({"a.o"});
  givenFile("x.o");
  ASSERT_EQ(run({"-r", "lib.a", "x.o"}).status, 0);
  EXPECT_EQ(m_Host.openHandles(), 0u);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a", "x.o"));
}

} // namespace quarn
