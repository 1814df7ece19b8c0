// SPDX-License-Identifier: Apache-2.0
//
// Which members a word means: names and patterns in any letter case, folders in front that don't
// count, words that mean nothing, and that the archive's own tables are never meant by a name.

#include "quarn/member_selection.h"

#include "arlib/interface/archive_file_reader.h"
#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

class MemberSelectionTest : public DriverTest {
protected:
  static Words namesOf(const std::vector<arlib::ArchiveMember*>& found) {
    Words names;
    for (const arlib::ArchiveMember* member : found)
      names.emplace_back(member->getName());
    return names;
  }

  void givenMembers(const Words& names) {
    for (const std::string& name : names)
      m_Archive.addMember(name.c_str(), 0, 0, 0, 0);
  }

  // With a symbol table and a table of long names in front.
  void givenTables() {
    m_Host.addFile("lib.a", testsupport::archive()
                                .symbolTable({})
                                .longNames({"a_rather_long_name.o"})
                                .member("a_rather_long_name.o", "")
                                .bytes());
    ASSERT_TRUE(arlib::readFile("lib.a", m_Archive));
  }

  Words found(std::string_view word) { return namesOf(MemberSelection(m_Archive).find(word)); }

  arlib::Archive m_Archive{m_Host};
};

// Notes the names of the members that it is called for.
class NameTaker final : public MemberRoutine {
public:
  void operator()(arlib::ArchiveMember& member) override { names.emplace_back(member.getName()); }
  Words names;
};

TEST_F(MemberSelectionTest, FindsAllMembersOfANameInArchiveOrder) {
  givenMembers({"b.o", "a.o", "c.o", "a.o"});
  const MemberSelection selection(m_Archive);
  const auto members = m_Archive.getMembers();
  EXPECT_THAT(selection.find("a.o"), ElementsAre(members[1], members[3]));
  EXPECT_THAT(selection.find("d.o"), IsEmpty());
}

TEST_F(MemberSelectionTest, FindsWhatAPatternMatchesInArchiveOrder) {
  givenMembers({"ba.o", "a.o", "ab.o", "x.txt"});
  EXPECT_THAT(found("*.o"), ElementsAre("ba.o", "a.o", "ab.o"));
  EXPECT_THAT(found("a?.o"), ElementsAre("ab.o"));
  EXPECT_THAT(found("?"), IsEmpty());
}

TEST_F(MemberSelectionTest, PassesOverTheCaseOfLetters) {
  givenMembers({"Main.o", "MAIN.O"});
  EXPECT_THAT(found("main.O"), ElementsAre("Main.o", "MAIN.O"));
  EXPECT_THAT(found("M*N.o"), ElementsAre("Main.o", "MAIN.O"));
}

TEST_F(MemberSelectionTest, PassesOverTheFoldersOfAWord) {
  givenMembers({"a.o"});
  for (const char* word : {"out/a.o", "/a.o", "out\\a.o", "out/*"})
    EXPECT_THAT(found(word), ElementsAre("a.o")) << word;
  EXPECT_THAT(found("a.o/"), IsEmpty());
}

TEST_F(MemberSelectionTest, KnowsNoSetsOfCharacters) {
  givenMembers({"a.o", "[ab].o"});
  EXPECT_THAT(found("[ab].o"), ElementsAre("[ab].o"));
  EXPECT_THAT(found("[ab].*"), ElementsAre("[ab].o"));
}

TEST_F(MemberSelectionTest, NeverFindsTheTables) {
  givenTables();
  EXPECT_THAT(found("*"), ElementsAre("a_rather_long_name.o"));
  EXPECT_THAT(found(""), IsEmpty());
}

TEST_F(MemberSelectionTest, TakesWordForWord) {
  givenMembers({"a.o", "b.o", "c.o"});
  NameTaker taker;
  forEachSelectedMember(m_Archive, {"c.o", "?.o"}, taker);
  EXPECT_THAT(taker.names, ElementsAre("c.o", "a.o", "b.o", "c.o"));
}

TEST_F(MemberSelectionTest, TakesAllMembersWithoutWords) {
  givenTables();
  NameTaker taker;
  forEachSelectedMember(m_Archive, {}, taker);
  EXPECT_THAT(taker.names, ElementsAre("a_rather_long_name.o"));
}

TEST_F(MemberSelectionTest, ReportsAWordThatMeansNothingAndGoesOn) {
  givenMembers({"a.o"});
  m_Archive.setFileName("lib.a");
  NameTaker taker;
  forEachSelectedMember(m_Archive, {"none.o", "a.o"}, taker);
  EXPECT_THAT(taker.names, ElementsAre("a.o"));
  EXPECT_EQ(getErrorText(), "Error: L6831E: 'none.o' not present in archive 'lib.a'\n");
}

// A position may be a table's place; the other selections never are.
TEST_F(MemberSelectionTest, MatchesATableByAPatternForTheEmptyName) {
  givenTables();
  EXPECT_TRUE(memberMatches(*m_Archive.getMembers()[0], "*"));
  EXPECT_FALSE(memberMatches(*m_Archive.getMembers()[0], "?*"));
}

} // namespace quarn
