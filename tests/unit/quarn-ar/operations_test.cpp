// SPDX-License-Identifier: Apache-2.0
//
// Each operation on a library in memory: which member a word means, where new ones go, what their
// headers hold, and what keeps the old archive.

#include "tests/unit/quarn-ar/ar_fixture.h"

namespace quarn_ar {

namespace {

class OperationsTest : public ArTest {
protected:
  // "lib.a" with a member for each pair of name and text.
  void givenMembers(const std::vector<std::pair<std::string, std::string>>& members) {
    testsupport::ArchiveBuilder library = testsupport::archive();
    for (const auto& [name, text] : members)
      library.member(name, objectBytes(text));
    m_Host.addFile("lib.a", library.bytes());
  }
  // Date, owner, group and mode of the first member, as they stand in its header.
  [[nodiscard]] Words numbers() const {
    const testsupport::ParsedMember member = members().front();
    return {member.numbers.begin(), member.numbers.begin() + 4};
  }
  void expectFailure(const Words& words, std::string_view report) {
    const bool isThere = m_Host.has("lib.a");
    const std::string before = isThere ? m_Host.read("lib.a") : std::string();
    const RunOutcome outcome = ar(words);
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.errors, "quarn-ar: Error: " + std::string(report) + "\n");
    EXPECT_EQ(m_Host.has("lib.a"), isThere);
    if (isThere) {
      EXPECT_EQ(m_Host.read("lib.a"), before);
    }
  }
};

TEST_F(OperationsTest, CreatesWithoutDatesAndOwners) {
  givenFile("d/a.o", "1");
  const RunOutcome outcome = ar({"r", "lib.a", "d/a.o"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_EQ(outcome.errors, "quarn-ar: Creating archive 'lib.a'\n");
  ASSERT_THAT(names(), ElementsAre("a.o"));
  EXPECT_THAT(numbers(), ElementsAre("0", "0", "0", "644"));
}

TEST_F(OperationsTest, KeepsDateOwnerAndModeOfFilesWithU) {
  auto& file = m_Host.addFile("a.o", objectBytes("1"));
  file.modificationTime = 1234;
  file.uid = 7;
  file.gid = 999999;
  EXPECT_EQ(ar({"rcU", "lib.a", "a.o"}).status, 0);
  EXPECT_THAT(numbers(), ElementsAre("1234", "7", "999999", "100644"));
  file.gid = 1000000;
  expectFailure({"rcU", "lib.a", "a.o"}, "the owner of 'a.o' has too many digits for 'U'");
  EXPECT_EQ(ar({"rc", "lib.a", "a.o"}).status, 0);
}

// What goes into no header need not fit one.
TEST_F(OperationsTest, TakesFilesOfAnyDateAndOwnerWithoutU) {
  auto& file = m_Host.addFile("a.o", testsupport::objectThatDefines("main").bytes());
  for (const int64_t number : {int64_t{-1}, int64_t{0xFFFFFFFE}, int64_t{1} << 40}) {
    for (int64_t* field : {&file.modificationTime, &file.uid, &file.gid}) {
      const int64_t before = *field;
      *field = number;
      EXPECT_EQ(ar({"rcu", "lib.a", "a.o"}).status, 0) << number;
      EXPECT_THAT(numbers(), ElementsAre("0", "0", "0", "644"));
      EXPECT_EQ(m_Host.read("lib.a").substr(8, 2), "/ ");
      EXPECT_EQ(ar({"qU", "lib.a", "a.o"}).status, 1) << number;
      *field = before;
      EXPECT_EQ(m_Host.remove("lib.a"), 0);
    }
  }
}

TEST_F(OperationsTest, WorksOnAnArchiveOfAnyDateAndOwner) {
  givenMembers({{"a.o", "1"}});
  const std::string bytes = m_Host.read("lib.a");
  for (const int64_t number : {int64_t{-1}, int64_t{0xFFFFFFFE}, int64_t{1} << 40}) {
    auto& file = m_Host.addFile("lib.a", bytes);
    file.modificationTime = file.uid = file.gid = number;
    EXPECT_EQ(ar({"t", "lib.a"}).output, "a.o\n") << number;
    EXPECT_EQ(ar({"d", "lib.a", "a.o"}).status, 0) << number;
    EXPECT_THAT(names(), IsEmpty());
  }
}

TEST_F(OperationsTest, AppendsWithoutALookAtTheNames) {
  givenMembers({{"a.o", "1"}});
  givenFile("a.o", "2");
  givenFile("d/a.o", "3");
  EXPECT_EQ(ar({"qv", "lib.a", "a.o", "d/a.o"}).output, "a - a.o\na - d/a.o\n");
  EXPECT_THAT(names(), ElementsAre("a.o", "a.o", "a.o"));
  EXPECT_THAT(texts(), ElementsAre("1", "2", "3"));
}

TEST_F(OperationsTest, ReplacesTheFirstMemberOfExactlyThatName) {
  givenMembers({{"A.O", "0"}, {"a.o", "1"}, {"a.o", "2"}, {"?.o", "3"}});
  givenFile("a.o", "new");
  EXPECT_EQ(ar({"rv", "lib.a", "a.o"}).output, "r - a.o\n");
  EXPECT_THAT(texts(), ElementsAre("0", "new", "2", "3"));
}

// As one does in a run for the members of a library that has two of a name.
TEST_F(OperationsTest, ReplacesOneMemberForEachFileOfAName) {
  givenMembers({{"a.o", "1"}, {"a.o", "2"}});
  givenFile("x/a.o", "new 1");
  givenFile("y/a.o", "new 2");
  givenFile("z/a.o", "new 3");
  EXPECT_EQ(ar({"rv", "lib.a", "x/a.o", "y/a.o", "z/a.o"}).output,
            "r - x/a.o\nr - y/a.o\na - z/a.o\n");
  EXPECT_THAT(texts(), ElementsAre("new 1", "new 2", "new 3"));
}

TEST_F(OperationsTest, ReplacesOnlyWhatIsOlderWithU) {
  testsupport::ArchiveBuilder library = testsupport::archive();
  library.member("a.o", objectBytes("1"));
  m_Host.addFile("lib.a", library.bytes());
  givenFile("a.o", "2", OldDate);
  EXPECT_EQ(ar({"ruU", "lib.a", "a.o"}).status, 0);
  const std::string first = texts().front();
  givenFile("a.o", "3", OldDate);
  EXPECT_EQ(ar({"ruUv", "lib.a", "a.o"}).output, "");
  EXPECT_THAT(texts(), ElementsAre(first));
  givenFile("a.o", "4", OldDate + 1);
  EXPECT_EQ(ar({"ruUv", "lib.a", "a.o"}).output, "r - a.o\n");
  EXPECT_THAT(texts(), ElementsAre("4"));
}

TEST_F(OperationsTest, PutsNewMembersInTheirPlace) {
  givenMembers({{"a.o", "1"}, {"b.o", "2"}, {"c.o", "3"}});
  for (const char* name : {"x.o", "y.o", "b.o"})
    givenFile(name, "new");
  EXPECT_EQ(ar({"ra", "a.o", "lib.a", "x.o", "b.o", "y.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("a.o", "x.o", "y.o", "b.o", "c.o"));
  givenFile("z.o");
  EXPECT_EQ(ar({"rb", "dir/a.o", "lib.a", "z.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("z.o", "a.o", "x.o", "y.o", "b.o", "c.o"));
  givenFile("w.o");
  expectFailure({"ri", "none.o", "lib.a", "w.o"}, "L6841E: Position 'none.o' not found");
}

TEST_F(OperationsTest, TakesAnArchiveAsAFile) {
  m_Host.addFile("other.a", testsupport::archive().member("x.o", "x").bytes());
  EXPECT_EQ(ar({"rc", "lib.a", "other.a"}).errors, "");
  EXPECT_THAT(names(), ElementsAre("other.a"));
}

TEST_F(OperationsTest, MakesAnArchiveWithoutMembers) {
  EXPECT_EQ(ar({"rc", "lib.a"}).status, 0);
  EXPECT_THAT(names(), IsEmpty());
}

TEST_F(OperationsTest, RefusesFilesThatCannotBeMembers) {
  givenMembers({{"a.o", "1"}});
  givenFile("d/\nb");
  expectFailure({"r", "lib.a", "gone.o"}, "L6833E: File 'gone.o' does not exist");
  m_Host.addFile("secret.o", objectBytes("2")).isUnreadable = true;
  expectFailure({"r", "lib.a", "secret.o"}, "L6835E: Reading file 'secret.o' : Permission denied");
  m_Host.addDirectory("folder");
  m_Host.addSpecial("device");
  expectFailure({"r", "lib.a", "folder"}, "L6835E: Reading file 'folder' : Is a directory");
  expectFailure({"q", "lib.a", "device"}, "L6835E: Reading file 'device' : Invalid argument");
  expectFailure({"r", "lib.a", "lib.a"},
                "'lib.a' is the archive itself, and can't be a member of it");
  expectFailure({"rP", "lib.a", "d/\nb"}, "no member can have the name 'd/\nb'");
  EXPECT_EQ(ar({"r", "lib.a", "d/\nb"}).status, 0);
}

TEST_F(OperationsTest, CutsNamesWithF) {
  givenFile("a_name_of_20_chars.o", "1");
  EXPECT_EQ(ar({"rcf", "lib.a", "a_name_of_20_chars.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("a_name_of_20_ch"));
  EXPECT_EQ(ar({"rfv", "lib.a", "a_name_of_20_chars.o"}).output, "r - a_name_of_20_chars.o\n");
  EXPECT_THAT(names(), ElementsAre("a_name_of_20_ch"));
}

TEST_F(OperationsTest, KeepsFoldersWithP) {
  givenFile("x/a.o", "1");
  givenFile("y/a.o", "2");
  EXPECT_EQ(ar({"rcP", "lib.a", "x/a.o", "y/a.o"}).status, 0);
  EXPECT_EQ(ar({"t", "lib.a"}).output, "x/a.o\ny/a.o\n");
  EXPECT_EQ(ar({"tP", "lib.a", "y/a.o"}).output, "y/a.o\n");
  EXPECT_EQ(ar({"t", "lib.a", "y/a.o"}).status, 1);
  givenFile("y/a.o", "3");
  EXPECT_EQ(ar({"rPv", "lib.a", "y/a.o"}).output, "r - y/a.o\n");
  // They also stay in a run that is not told of them.
  EXPECT_EQ(ar({"s", "lib.a"}).status, 0);
  EXPECT_EQ(ar({"t", "lib.a"}).output, "x/a.o\ny/a.o\n");
}

TEST_F(OperationsTest, DeletesOneMemberForEachWord) {
  givenMembers({{"a.o", "1"}, {"b.o", "2"}, {"a.o", "3"}, {"a.o", "4"}});
  EXPECT_EQ(ar({"dv", "lib.a", "a.o", "d/a.o"}).output, "d - a.o\nd - d/a.o\n");
  EXPECT_THAT(texts(), ElementsAre("2", "4"));
  const RunOutcome outcome = ar({"d", "lib.a", "A.O", "*.o"});
  EXPECT_EQ(outcome.status, 0);
  EXPECT_EQ(outcome.errors, "quarn-ar: Warning: L6831E: 'A.O' not present in archive 'lib.a'\n"
                            "quarn-ar: Warning: L6831E: '*.o' not present in archive 'lib.a'\n");
  EXPECT_THAT(texts(), ElementsAre("2", "4"));
}

TEST_F(OperationsTest, CountsTheMembersOfANameWithN) {
  givenMembers({{"a.o", "1"}, {"b.o", "2"}, {"a.o", "3"}});
  EXPECT_EQ(ar({"xN", "2", "lib.a", "a.o"}).status, 0);
  EXPECT_EQ(m_Host.read("a.o"), objectBytes("3"));
  EXPECT_EQ(ar({"xN", "3", "lib.a", "a.o"}).status, 1);
  EXPECT_EQ(ar({"dN", "2", "lib.a", "a.o", "a.o"}).status, 0);
  EXPECT_THAT(texts(), ElementsAre("1", "2"));
}

TEST_F(OperationsTest, MovesMembersToTheEndOrToAPlace) {
  givenMembers({{"a.o", "1"}, {"b.o", "2"}, {"c.o", "3"}, {"d.o", "4"}});
  EXPECT_EQ(ar({"mv", "lib.a", "b.o", "a.o"}).output, "m - b.o\nm - a.o\n");
  EXPECT_THAT(names(), ElementsAre("c.o", "d.o", "b.o", "a.o"));
  EXPECT_EQ(ar({"ma", "c.o", "lib.a", "a.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("c.o", "a.o", "d.o", "b.o"));
  EXPECT_EQ(ar({"mb", "a.o", "lib.a", "a.o", "b.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("c.o", "a.o", "b.o", "d.o"));
  EXPECT_EQ(ar({"ma", "a.o", "lib.a", "a.o", "d.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("c.o", "a.o", "d.o", "b.o"));
  expectFailure({"m", "lib.a", "a.o", "none.o"}, "L6831E: 'none.o' not present in archive 'lib.a'");
  expectFailure({"ma", "none.o", "lib.a", "a.o"}, "L6841E: Position 'none.o' not found");
}

TEST_F(OperationsTest, ListsAsBuildSystemsReadIt) {
  givenMembers({{"a.o", "1"}, {"b.o", "2"}, {"a.o", "3"}});
  EXPECT_EQ(ar({"t", "lib.a"}).output, "a.o\nb.o\na.o\n");
  EXPECT_EQ(ar({"t", "lib.a", "b.o", "a.o"}).output, "b.o\na.o\n");
  givenFile("x.o", "");
  EXPECT_EQ(ar({"rc", "new.a", "x.o"}).status, 0);
  const std::string size = std::to_string(objectBytes("").size());
  EXPECT_EQ(ar({"tv", "new.a"}).output, "rw-r--r-- 0/0 " + std::string(6 - size.size(), ' ') +
                                            size + " Jan  1 00:00 1970 x.o\n");
  expectFailure({"t", "lib.a", "none.o"}, "L6831E: 'none.o' not present in archive 'lib.a'");
}

// As plain archivers have it; a word that comes too often still means a member that is there.
TEST_F(OperationsTest, TakesTheNextMemberOfANameForEachWord) {
  givenMembers({{"a.o", "1"}, {"b.o", "2"}, {"a.o", "3"}});
  const Words three = {"a.o", "d/a.o", "a.o"};
  const auto words = [&three](const char* letters) {
    Words all = {letters, "lib.a"};
    all.insert(all.end(), three.begin(), three.end());
    return all;
  };
  EXPECT_EQ(ar(words("p")).output, objectBytes("1") + objectBytes("3"));
  EXPECT_EQ(ar(words("t")).output, "a.o\na.o\n");
  const RunOutcome extraction = ar(words("xv"));
  EXPECT_EQ(extraction.status, 0);
  EXPECT_EQ(extraction.output, "x - a.o\nx - a.o\n");
  EXPECT_EQ(m_Host.read("a.o"), objectBytes("3"));
  const RunOutcome move = ar(words("mv"));
  EXPECT_EQ(move.status, 0);
  EXPECT_EQ(move.output, "m - a.o\nm - d/a.o\n");
  EXPECT_THAT(texts(), ElementsAre("2", "1", "3"));
}

TEST_F(OperationsTest, ListsRightsBeyondThoseToReadWriteAndExecute) {
  Words modes;
  for (const uint32_t mode : {0104755U, 0104644U, 0102755U, 0102644U, 0101777U, 0101776U}) {
    m_Host.addFile("x.o", objectBytes("")).mode = mode;
    EXPECT_EQ(ar({"rcU", "lib.a", "x.o"}).status, 0);
    modes.push_back(ar({"tv", "lib.a"}).output.substr(0, 9));
  }
  EXPECT_THAT(modes, ElementsAre("rwsr-xr-x", "rwSr--r--", "rwxr-sr-x", "rw-r-Sr--", "rwxrwxrwt",
                                 "rwxrwxrwT"));
}

TEST_F(OperationsTest, PrintsMembers) {
  givenMembers({{"a.o", "1"}, {"b.o", "2"}});
  EXPECT_EQ(ar({"p", "lib.a", "b.o"}).output, objectBytes("2"));
  EXPECT_EQ(ar({"pv", "lib.a", "a.o", "b.o"}).output,
            "\n<a.o>\n\n" + objectBytes("1") + "\n<b.o>\n\n" + objectBytes("2"));
}

TEST_F(OperationsTest, ExtractsWithModesAndOnDemandWithDates) {
  auto& file = m_Host.addFile("a.o", objectBytes("1"));
  file.mode = 0100751;
  file.modificationTime = 1234;
  EXPECT_EQ(ar({"rcU", "lib.a", "a.o"}).status, 0);
  EXPECT_EQ(m_Host.remove("a.o"), 0);
  EXPECT_EQ(ar({"xv", "lib.a"}).output, "x - a.o\n");
  support::FileStatus status;
  EXPECT_EQ(m_Host.status("a.o", status), 0);
  EXPECT_EQ(status.mode & 07777, 0751U);
  EXPECT_NE(status.modificationTime, 1234);
  EXPECT_EQ(ar({"xo", "lib.a"}).status, 0);
  EXPECT_EQ(m_Host.status("a.o", status), 0);
  EXPECT_EQ(status.modificationTime, 1234);
  EXPECT_THAT(refusal({"xC", "lib.a"}), HasSubstr("L6836E: 'a.o' already exists"));
}

// Whoever made the archive must not choose where files are written.
TEST_F(OperationsTest, ExtractsIntoTheCurrentFolderAlone) {
  givenFile("x/a.o", "1");
  EXPECT_EQ(ar({"rcP", "lib.a", "x/a.o"}).status, 0);
  EXPECT_EQ(m_Host.remove("x/a.o"), 0);
  EXPECT_EQ(ar({"x", "lib.a"}).status, 0);
  EXPECT_FALSE(m_Host.has("x/a.o"));
  EXPECT_EQ(m_Host.read("a.o"), objectBytes("1"));
}

// It is a character like any other here.
TEST_F(OperationsTest, ExtractsBackslashesAsTheyAre) {
  givenFile("d/back\\slash.o", "1");
  EXPECT_EQ(ar({"rc", "lib.a", "d/back\\slash.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("back\\slash.o"));
  EXPECT_EQ(ar({"x", "lib.a"}).status, 0);
  EXPECT_EQ(m_Host.read("back\\slash.o"), objectBytes("1"));
  EXPECT_FALSE(m_Host.has("slash.o"));
}

// Of another format, or damaged: with the first write the names would be lost.
TEST_F(OperationsTest, RefusesArchivesWhoseNamesItCannotRead) {
  const std::string other = "#1/12           ";
  testsupport::ArchiveBuilder library = testsupport::archive();
  m_Host.addFile("lib.a", library.member("a.o", objectBytes("1")).bytes());
  std::string bytes = m_Host.read("lib.a");
  m_Host.addFile("lib.a", bytes.replace(8, other.size(), other));
  givenFile("b.o");
  for (const Words& words : {Words{"r", "lib.a", "b.o"},
                             {"q", "lib.a", "b.o"},
                             {"d", "lib.a", "b.o"},
                             {"m", "lib.a"},
                             {"s", "lib.a"},
                             {"t", "lib.a"},
                             {"p", "lib.a"},
                             {"x", "lib.a"}}) {
    EXPECT_THAT(refusal(words),
                HasSubstr("'lib.a' has a member without a name, as in another format"));
    EXPECT_EQ(m_Host.read("lib.a"), bytes);
  }
}

// It is made anew like any other; what is left of the archive is in the common format.
TEST_F(OperationsTest, TakesAWideSymbolTableForWhatItIs) {
  const std::string wide = "/SYM64/         ";
  testsupport::ArchiveBuilder library = testsupport::archive();
  library.member("table", std::string(8, '\0'));
  m_Host.addFile("a.o", testsupport::objectThatDefines("main").bytes());
  library.member("a.o", m_Host.read("a.o"));
  std::string bytes = library.bytes();
  m_Host.addFile("lib.a", bytes.replace(8, wide.size(), wide));
  const RunOutcome listing = ar({"t", "lib.a"});
  EXPECT_EQ(listing.output, "a.o\n");
  EXPECT_EQ(listing.errors, "");
  EXPECT_EQ(ar({"r", "lib.a", "a.o"}).status, 0);
  EXPECT_EQ(m_Host.read("lib.a").substr(8, 16), "/               ");
  EXPECT_THAT(names(), ElementsAre("a.o"));
  m_Host.addFile("lib.a", bytes);
  EXPECT_EQ(ar({"dS", "lib.a"}).status, 0);
  EXPECT_EQ(m_Host.read("lib.a").substr(8, 4), "a.o/");
}

TEST_F(OperationsTest, LeavesTheSymbolTableOutWithS) {
  m_Host.addFile("a.o", testsupport::objectThatDefines("main").bytes());
  EXPECT_EQ(ar({"rcS", "lib.a", "a.o"}).status, 0);
  EXPECT_EQ(m_Host.read("lib.a").find("main"), m_Host.read("lib.a").rfind("main"));
  EXPECT_EQ(ar({"s", "lib.a"}).status, 0);
  EXPECT_NE(m_Host.read("lib.a").find("main"), m_Host.read("lib.a").rfind("main"));
}

// A linker that finds a table looks for nothing that is not in it, and one that finds none looks
// into the members.
TEST_F(OperationsTest, LeavesTheSymbolTableOutWhereNoMemberIsAnObject) {
  m_Host.addFile("a.bc", "no object");
  EXPECT_EQ(ar({"rcs", "lib.a", "a.bc"}).status, 0);
  EXPECT_EQ(m_Host.read("lib.a").substr(8, 5), "a.bc/");
  givenFile("a.o", "object");
  EXPECT_EQ(ar({"r", "lib.a", "a.o"}).status, 0);
  EXPECT_EQ(m_Host.read("lib.a").substr(8, 2), "/ ");
  EXPECT_EQ(ar({"d", "lib.a", "a.o"}).status, 0);
  EXPECT_EQ(m_Host.read("lib.a").substr(8, 5), "a.bc/");
}

TEST_F(OperationsTest, NeedAnArchiveUnlessFilesGoIn) {
  for (const Words& words : {Words{"d"}, {"m"}, {"p"}, {"s"}, {"t"}, {"x"}}) {
    expectFailure({words.front(), "lib.a"},
                  "L6832E: Archive 'lib.a' not found : No such file or directory");
  }
}

TEST_F(OperationsTest, RanlibMakesTheTablesOfAllArchives) {
  givenMembers({{"a.o", "1"}});
  m_Host.addFile("b.a", testsupport::archive().member("b.o", objectBytes("")).bytes());
  EXPECT_EQ(ranlib({"lib.a", "b.a"}).status, 0);
  for (const char* name : {"lib.a", "b.a"})
    EXPECT_EQ(m_Host.read(name).substr(8, 2), "/ ") << name;
}

TEST_F(OperationsTest, RanlibStopsAtTheFirstThatFails) {
  givenMembers({{"a.o", "1"}});
  const std::string before = m_Host.read("lib.a");
  const RunOutcome outcome = ranlib({"gone.a", "lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "quarn-ranlib: Error: L6832E: Archive 'gone.a' not found : "
                            "No such file or directory\n");
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

} // namespace

} // namespace quarn_ar
