// SPDX-License-Identifier: Apache-2.0
//
// What keeps a run from making a document, and that there is none then.
#include "quarn-json/command_line.h"
#include "quarn-json/usage.h"
#include "tests/unit/quarn-json/json_fixture.h"

#include <regex>

namespace quarn_json {

namespace {

using JsonCommandLineTest = JsonTest;

TEST_F(JsonCommandLineTest, HelpNamesEachOption) {
  const RunOutcome outcome = json({"--help"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_EQ(outcome.output, helpText("quarn-json"));
  for (const tabledrivenparser::MatchString& row : getOptionRows()) {
    if (row.name.empty()) continue;
    EXPECT_THAT(outcome.output, HasSubstr("\n  --" + std::string(row.name)));
  }
}

TEST_F(JsonCommandLineTest, TellsTheVersion) {
  const RunOutcome outcome = json({"--version", "lib.a"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_TRUE(
      std::regex_match(outcome.output, std::regex("quarn-json [0-9]+\\.[0-9]+\\.[0-9]+\n")));
}

TEST_F(JsonCommandLineTest, WantsALibrary) {
  const RunOutcome outcome = json({"--qobix_buildattr"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "");
  EXPECT_EQ(outcome.errors, "quarn-json: Error: L6838E: No archive specified\n");
}

TEST_F(JsonCommandLineTest, EndsAtAWordThatIsNoOption) {
  givenLibrary({"a.o"});
  const RunOutcome outcome = json({"lib.a", "--nothing"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "");
  EXPECT_THAT(outcome.errors, HasSubstr("Unrecognized option '--nothing'"));
}

TEST_F(JsonCommandLineTest, TakesWordsBehindTwoDashesForLibraries) {
  givenLibrary({"a.o"});
  m_Host.addFile("--help", m_Host.read("lib.a"));
  EXPECT_EQ(libraryOf({"--", "--help"}).at("file"), "--help");
}

// Each of them is told of, and the good one between them makes no document.
TEST_F(JsonCommandLineTest, LibrariesThatCannotBeReadLeaveNoDocument) {
  givenLibrary({"a.o"});
  m_Host.addFile("text.a", std::string(100, 'x'));
  const RunOutcome outcome = json({"nothere.a", "lib.a", "text.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "");
  EXPECT_THAT(outcome.errors,
              HasSubstr("quarn-json: Error: L6832E: Archive 'nothere.a' not found"));
  EXPECT_THAT(outcome.errors, HasSubstr("'text.a'"));
}

TEST_F(JsonCommandLineTest, MakesNoArchiveThatIsNotThere) {
  json({"nothere.a"});
  EXPECT_FALSE(m_Host.has("nothere.a"));
}

} // namespace

} // namespace quarn_json
