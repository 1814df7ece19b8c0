// SPDX-License-Identifier: Apache-2.0
//
// Which files an archive may make where names lead to more than files: on such a host no member can
// open a device or a stream, nor take the place of a file of another name.

#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

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
