// SPDX-License-Identifier: Apache-2.0
//
// Moving and deleting members, and the tables that an edit leaves: where each word's members go,
// what happens if one is not there, and in which runs a symbol table is made.

#include "tests/unit/quarn/driver_fixture.h"

#include <utility>

namespace quarn {

class MoveActionTest : public DriverTest {
protected:
  MoveActionTest() { givenLibrary({"a.o", "b.o", "c.o", "d.o"}); }

  Words namesAfter(const Words& words) {
    EXPECT_EQ(run(words).status, 0);
    return names();
  }
};

TEST_F(MoveActionTest, MovesToTheEndInTheOrderOfTheWords) {
  EXPECT_THAT(namesAfter({"-m", "lib.a", "b.o", "a.o"}), ElementsAre("c.o", "d.o", "b.o", "a.o"));
}

TEST_F(MoveActionTest, MovesInFrontOfAMember) {
  EXPECT_THAT(namesAfter({"-m", "-b", "a.o", "lib.a", "d.o", "c.o"}),
              ElementsAre("d.o", "c.o", "a.o", "b.o"));
}

TEST_F(MoveActionTest, MovesBehindAMember) {
  EXPECT_THAT(namesAfter({"-m", "-a", "b.o", "lib.a", "a.o"}),
              ElementsAre("b.o", "a.o", "c.o", "d.o"));
}

// Each word means one member: the first one in the order that has been reached.
TEST_F(MoveActionTest, MovesOneMemberForEachWord) {
  EXPECT_THAT(namesAfter({"-m", "lib.a", "*"}), ElementsAre("b.o", "c.o", "d.o", "a.o"));
  EXPECT_THAT(namesAfter({"-m", "lib.a", "*", "*"}), ElementsAre("d.o", "a.o", "b.o", "c.o"));
}

TEST_F(MoveActionTest, KeepsTheArchiveIfAMemberIsNotThere) {
  const std::string before = m_Host.read("lib.a");
  const RunOutcome outcome = run({"-m", "lib.a", "a.o", "none.o"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6831E: 'none.o' not present in archive 'lib.a'\n");
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

class DeleteActionTest : public DriverTest {
protected:
  DeleteActionTest() { givenLibrary({"a.o", "b.o", "a.o", "c.txt"}); }
};

TEST_F(DeleteActionTest, DeletesAllThatAWordMeansFromTheBack) {
  EXPECT_EQ(run({"-dv", "lib.a", "*.o"}).output, "d - a.o\nd - b.o\nd - a.o\n");
  EXPECT_THAT(names(), ElementsAre("c.txt"));
}

TEST_F(DeleteActionTest, OnlyWarnsOfAMemberThatIsNotThere) {
  const RunOutcome outcome = run({"-d", "lib.a", "none.o", "b.o", "b.o"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_EQ(outcome.errors, "Warning: L6831E: 'none.o' not present in archive 'lib.a'\n"
                            "Warning: L6831E: 'b.o' not present in archive 'lib.a'\n");
  EXPECT_THAT(names(), ElementsAre("a.o", "a.o", "c.txt"));
}

TEST_F(DeleteActionTest, DeletesNothingWithoutWords) {
  EXPECT_EQ(run({"-d", "lib.a"}).status, 0);
  EXPECT_EQ(names().size(), 4u);
}

// ---- The symbol table

class WrittenTableTest : public DriverTest {
protected:
  WrittenTableTest() {
    m_Host.addFile("lib.a", testsupport::archive()
                                .member("a.o", testsupport::objectThatDefines("alpha").bytes())
                                .bytes());
  }

  bool hasTable() {
    std::string error;
    const auto members = testsupport::parseArchive(m_Host.read("lib.a"), error);
    return !members.empty() && members.front().nameField == "/";
  }
};

TEST_F(WrittenTableTest, IsMadeByEachRunThatWrites) {
  ASSERT_EQ(run({"-d", "lib.a"}).status, 0);
  EXPECT_EQ(run({"--zs", "lib.a"}).output,
            "alpha                from a.o        at offset     82\n");
}

TEST_F(WrittenTableTest, IsNotMadeByARunThatReads) {
  ASSERT_EQ(run({"-t", "lib.a"}).status, 0);
  EXPECT_FALSE(hasTable());
}

TEST_F(WrittenTableTest, IsLeftOutOnDemand) {
  ASSERT_EQ(run({"-s", "lib.a"}).status, 0);
  EXPECT_TRUE(hasTable());
  ASSERT_EQ(run({"-n", "-s", "lib.a"}).status, 0);
  EXPECT_FALSE(hasTable());
}

// ---- Turns, where a disk replaces no open file

class LostTurnTest : public DriverTest {
protected:
  // Somebody else has the archive open, and has added a member to it when this run tries again.
  void givenSomebodyFaster() {
    ASSERT_EQ(m_Host.openForReading("lib.a", m_Other), 0);
    m_Host.keepOpenFiles([this] {
      if (!m_Other.isOpen()) return;
      EXPECT_EQ(m_Host.close(std::exchange(m_Other, {})), 0);
      givenLibrary({"a.o", "theirs.o"});
    });
  }

private:
  support::FileHandle m_Other;
};

TEST_F(LostTurnTest, BeginsTheRunAnewAndSaysItOnce) {
  givenLibrary({"a.o"});
  givenFile("mine.o");
  givenSomebodyFaster();
  const RunOutcome outcome = run({"-rv", "lib.a", "mine.o"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_EQ(outcome.output, "a - mine.o\n");
  EXPECT_EQ(outcome.errors, "");
  EXPECT_THAT(names(), ElementsAre("a.o", "theirs.o", "mine.o"));
}

TEST_F(LostTurnTest, TellsOfWhatTheOtherHasLeft) {
  givenLibrary({"a.o", "old.o"});
  givenSomebodyFaster();
  const RunOutcome outcome = run({"-dv", "lib.a", "old.o"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_EQ(outcome.output, "");
  EXPECT_THAT(outcome.errors, HasSubstr("'old.o' not present in archive 'lib.a'"));
  EXPECT_THAT(names(), ElementsAre("a.o", "theirs.o"));
}

} // namespace quarn
