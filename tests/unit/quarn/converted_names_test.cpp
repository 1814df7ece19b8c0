// SPDX-License-Identifier: Apache-2.0
//
// Runs of the tool with names that only a conversion leads to files, as a path converter makes them
// possible: every file of a run must be reached by them, or the run would read one file and replace
// another.

#include "support/interface/converting_host.h"
#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

namespace {

class ConvertedNamesTest : public DriverTest {
protected:
  // "/m/a" is "a".
  RunOutcome runConverted(const Words& words) {
    support::ConvertingHost host(m_Host, [](std::string_view name) {
      return std::string(name.starts_with("/m/") ? name.substr(3) : name);
    });
    return runWork(quarnMain, "quarn", words, host);
  }
};

} // namespace

TEST_F(ConvertedNamesTest, LeadToANewLibrary) {
  givenFile("a.o");
  const RunOutcome outcome = runConverted({"--create", "/m/lib.a", "/m/a.o"});
  EXPECT_EQ(outcome.status, 0) << outcome.errors;
  EXPECT_THAT(names(), ElementsAre("a.o"));
  EXPECT_THAT(m_Host.getNames(), ElementsAre("a.o", "lib.a"));
}

TEST_F(ConvertedNamesTest, LeadToTheLibraryThatIsReplaced) {
  givenLibrary({"a.o", "b.o"});
  givenFile("c.o");
  const RunOutcome outcome = runConverted({"-r", "/m/lib.a", "/m/c.o"});
  EXPECT_EQ(outcome.status, 0) << outcome.errors;
  EXPECT_THAT(names(), ElementsAre("a.o", "b.o", "c.o"));
  EXPECT_THAT(m_Host.getNames(), ElementsAre("c.o", "lib.a"));
}

TEST_F(ConvertedNamesTest, AreShownAsTheyWereGiven) {
  EXPECT_THAT(runConverted({"-t", "/m/gone.a"}).errors, HasSubstr("'/m/gone.a'"));
}

TEST_F(ConvertedNamesTest, LeadToTheFilesOfAPattern) {
  for (const char* name : {"b.o", "a.o"})
    givenFile(name);
  const RunOutcome outcome = runConverted({"--create", "/m/lib.a", "/m/*.o"});
  EXPECT_EQ(outcome.status, 0) << outcome.errors;
  EXPECT_THAT(names(), ElementsAre("a.o", "b.o"));
}

TEST_F(ConvertedNamesTest, LeadToViaFiles) {
  givenLibrary({"a.o"});
  m_Host.addFile("words", "-t /m/lib.a\n");
  EXPECT_EQ(runConverted({"--via", "/m/words"}).output, "a.o\n");
}

TEST_F(ConvertedNamesTest, LeadToAttributeMaps) {
  givenLibrary({"a.o"});
  m_Host.addFile("map", "* $IEEE1$\n");
  const uint64_t callsBefore = m_Host.readCalls();
  EXPECT_EQ(runConverted({"-t", "/m/lib.a"}).status, 0);
  const uint64_t callsWithout = m_Host.readCalls() - callsBefore;
  EXPECT_EQ(runConverted({"-t", "--libattrmap", "/m/map", "/m/lib.a"}).status, 0);
  EXPECT_GT(m_Host.readCalls() - callsBefore, 2 * callsWithout);
}

} // namespace quarn
