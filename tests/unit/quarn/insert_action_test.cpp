// SPDX-License-Identifier: Apache-2.0
//
// What goes into an archive: where it stands, what it replaces, and what its header says. Dates of
// members and files decide in the update modes; a file that is not there must leave the old archive
// as it was.

#include "tests/support/faulty_host.h"
#include "tests/unit/quarn/driver_fixture.h"

#include <cerrno>

namespace quarn {

// ---- Positions

class InsertPositionTest : public DriverTest {
protected:
  InsertPositionTest() {
    givenLibrary({"a.o", "b.o", "c.o"});
    for (const char* name : {"x.o", "y.o", "b.o"})
      givenFile(name);
  }

  Words namesAfter(const Words& words) {
    EXPECT_EQ(run(words).status, 0);
    return names();
  }
};

TEST_F(InsertPositionTest, IsTheEndIfNoneIsGiven) {
  EXPECT_THAT(namesAfter({"-r", "lib.a", "y.o", "x.o"}),
              ElementsAre("a.o", "b.o", "c.o", "y.o", "x.o"));
}

TEST_F(InsertPositionTest, IsBehindAMember) {
  EXPECT_THAT(namesAfter({"-r", "-a", "a.o", "lib.a", "y.o", "x.o"}),
              ElementsAre("a.o", "y.o", "x.o", "b.o", "c.o"));
}

TEST_F(InsertPositionTest, IsInFrontOfAMember) {
  EXPECT_THAT(namesAfter({"-r", "-b", "a.o", "lib.a", "y.o", "x.o"}),
              ElementsAre("y.o", "x.o", "a.o", "b.o", "c.o"));
}

TEST_F(InsertPositionTest, LeavesReplacedMembersInTheirPlaces) {
  EXPECT_THAT(namesAfter({"-r", "-a", "c.o", "lib.a", "b.o", "x.o"}),
              ElementsAre("a.o", "b.o", "c.o", "x.o"));
}

TEST_F(InsertPositionTest, IsThatOfTheFirstMemberThatMatches) {
  EXPECT_THAT(namesAfter({"-r", "-a", "out/?.O", "lib.a", "x.o"}),
              ElementsAre("a.o", "x.o", "b.o", "c.o"));
}

TEST_F(InsertPositionTest, MayBeThatOfATable) {
  ASSERT_EQ(run({"-s", "lib.a"}).status, 0);
  EXPECT_THAT(namesAfter({"-r", "-b", "*", "lib.a", "x.o"}),
              ElementsAre("x.o", "a.o", "b.o", "c.o"));
}

TEST_F(InsertPositionTest, KeepsTheArchiveIfItIsNotThere) {
  const std::string before = m_Host.read("lib.a");
  const RunOutcome outcome = run({"-r", "-a", "none.o", "lib.a", "x.o"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6841E: Position 'none.o' not found\n");
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

// ---- Update modes

struct UpdateCase {
  const char* name;
  Words option;
  bool takesOlder;
  bool takesEqual;
};

void PrintTo(const UpdateCase& updateCase, std::ostream* stream) {
  *stream << updateCase.name;
}

class UpdateModeTest : public DriverTest, public testing::WithParamInterface<UpdateCase> {
protected:
  // Whether a file of that date takes the place of the member.
  bool replaces(int64_t date) {
    givenLibrary({"a.o"});
    givenFile("a.o", "new", date);
    Words words = {"-r", "lib.a", "a.o"};
    words.insert(words.begin(), GetParam().option.begin(), GetParam().option.end());
    EXPECT_EQ(run(words).status, 0);
    return texts() == Words{"new"};
  }
};

TEST_P(UpdateModeTest, ReplacesByTheDatesOfMemberAndFile) {
  EXPECT_EQ(replaces(OldDate - 1), GetParam().takesOlder);
  EXPECT_EQ(replaces(OldDate), GetParam().takesEqual);
  EXPECT_TRUE(replaces(OldDate + 1));
}

INSTANTIATE_TEST_SUITE_P(Options, UpdateModeTest,
                         testing::Values(UpdateCase{"Always", {}, true, true},
                                         UpdateCase{"NotNewer", {"-u"}, false, true},
                                         UpdateCase{"Older", {"--new_files_only"}, false, false}),
                         [](const auto& given) { return given.param.name; });

// ---- What is inserted

using InsertActionTest = DriverTest;

TEST_F(InsertActionTest, TakesDateOwnerAndModeOfTheFile) {
  givenLibrary({});
  givenFile("a.o", "", 1234567890);
  ASSERT_EQ(run({"-r", "lib.a", "a.o"}).status, 0);
  EXPECT_THAT(members().front().numbers, ElementsAre("1234567890", "1", "2", "100644", "52"));
}

TEST_F(InsertActionTest, NormalisesTheHeadersOfWhatItInserts) {
  givenLibrary({"a.o", "b.o"});
  givenFile("b.o");
  ASSERT_EQ(run({"-r", "--normalise=7", "lib.a", "b.o"}).status, 0);
  EXPECT_EQ(members()[0].numbers[0], std::to_string(OldDate));
  EXPECT_THAT(members()[1].numbers, ElementsAre("7", "0", "0", "100644", "52"));
}

TEST_F(InsertActionTest, ReplacesOneMemberOfANameForEachWord) {
  givenLibrary({"a.o", "a.o", "a.o"});
  givenFile("a.o", "new");
  ASSERT_EQ(run({"-r", "lib.a", "a.o", "a.o"}).status, 0);
  EXPECT_THAT(texts(), ElementsAre("new", "new", "a.o"));
}

TEST_F(InsertActionTest, InsertsTheMembersOfAnArchive) {
  givenLibrary({"a.o", "b.o"});
  m_Host.addFile("other.a", m_Host.read("lib.a"));
  givenLibrary({"b.o"});
  const RunOutcome outcome = run({"-rv", "lib.a", "other.a"});
  EXPECT_EQ(outcome.output, "a - a.o\nr - b.o\n");
  EXPECT_THAT(names(), ElementsAre("b.o", "a.o"));
}

// So long that they are looked for all at once.
TEST_F(InsertActionTest, ReplacesMembersOfVeryLongNamesByThoseOfAnArchive) {
  const std::string first = std::string(2000, 'n') + "1.o";
  const std::string second = std::string(2000, 'n') + "2.o";
  const std::string other = std::string(2000, 'N') + "2.O";
  const auto library = [](const Words& names, const std::string& text) {
    testsupport::ArchiveBuilder builder = testsupport::archive();
    builder.longNames(names);
    for (size_t i = 0; i < names.size(); ++i)
      builder.member(names[i], objectBytes(text + std::to_string(i)));
    return builder.bytes();
  };
  m_Host.addFile("lib.a", library({first, second, first}, "old"));
  // In one letter of a name, and the case of letters counts for nothing.
  m_Host.addFile("other.a", library({other, first, first, first}, "new"));
  EXPECT_EQ(run({"-r", "lib.a", "other.a"}).status, 0);
  EXPECT_THAT(texts(), ElementsAre("new1", "new0", "new2", "new3"));
}

// The member stays; its header becomes that of the source all the same.
TEST_F(InsertActionTest, TakesTheHeaderOfATooOldMemberOfAnArchive) {
  m_Host.addFile("other.a", testsupport::archive()
                                .member("a.o", objectBytes("old"))
                                .numbers(OldDate - 1, 7, 8, "100600")
                                .bytes());
  givenLibrary({"a.o"});
  EXPECT_EQ(run({"-ruv", "lib.a", "other.a"}).output, "");
  EXPECT_THAT(texts(), ElementsAre("a.o"));
  EXPECT_EQ(members()[0].numbers[1], "7");
}

TEST_F(InsertActionTest, WarnsOnceOfMembersThatAreNoObjects) {
  givenLibrary({});
  m_Host.addFile("one.txt", "1");
  m_Host.addFile("two.txt", "2");
  EXPECT_EQ(run({"-r", "lib.a", "one.txt", "two.txt"}).errors,
            "Warning: L6875W: Adding non-ELF object 'one.txt' to archive 'lib.a'\n");
  EXPECT_THAT(names(), ElementsAre("one.txt", "two.txt"));
}

TEST_F(InsertActionTest, KeepsTheArchiveIfAFileIsNotThere) {
  givenLibrary({"a.o"});
  givenFile("x.o");
  const std::string before = m_Host.read("lib.a");
  const RunOutcome outcome = run({"-r", "lib.a", "none.o", "x.o"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6833E: File 'none.o' does not exist\n");
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

// What could not be looked at may be anything, an archive, too, so its date doesn't count. The run
// goes on with the next word.
TEST_F(InsertActionTest, KeepsTheArchiveIfAFileCannotBeRead) {
  givenLibrary({"a.o"});
  givenFile("a.o", "older", OldDate - 1);
  m_Host.at("a.o").isUnreadable = true;
  givenFile("b.o");
  const std::string before = m_Host.read("lib.a");
  const RunOutcome outcome = run({"-rv", "--new_files_only", "lib.a", "a.o", "b.o"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.errors, "Error: L6835E: Reading file 'lib.a' : Permission denied\n");
  EXPECT_EQ(outcome.output, "a - b.o\n");
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

// As a file that it is not it would go in whole.
TEST_F(InsertActionTest, TakesAnArchiveForAPlainFileOnlyIfItsBytesAreAtFault) {
  givenLibrary({"a.o"});
  const std::string large(100000, 'x');
  m_Host.addFile("bad.a", "!<arch>\n" + large);
  const RunOutcome malformed = run({"-r", "--diag_suppress=6875", "lib.a", "bad.a"});
  EXPECT_EQ(malformed.status, 0);
  EXPECT_EQ(malformed.errors, "");
  EXPECT_THAT(names(), ElementsAre("a.o", "bad.a"));
  m_Host.addFile("good.a", testsupport::archive().member("b.o", large).bytes());
  const std::string before = m_Host.read("lib.a");
  testsupport::FaultyHost faulty(m_Host);
  uint32_t failures = 0;
  for (uint64_t call = 1; failures == 0 || !faulty.getFailedOperation().empty(); ++call) {
    faulty.failCall(call, EIO);
    const RunOutcome outcome =
        runWork(quarnMain, "quarn", {"-r", "--diag_suppress=6875", "lib.a", "good.a"}, faulty);
    if (faulty.getFailedName() != "good.a" || outcome.status == 0) {
      m_Host.addFile("lib.a", before);
      continue;
    }
    failures += outcome.errors.starts_with("Error: L6835E: Reading file 'lib.a' : Input/output");
    EXPECT_EQ(m_Host.read("lib.a"), before);
  }
  EXPECT_GT(failures, 4U);
}

TEST_F(InsertActionTest, MakesANewArchiveAndSaysSo) {
  givenFile("a.o");
  const RunOutcome outcome = run({"-r", "lib.a", "a.o"});
  EXPECT_EQ(outcome.errors, "Creating archive 'lib.a'\n");
  EXPECT_THAT(names(), ElementsAre("a.o"));
}

TEST_F(InsertActionTest, MakesNoArchiveOfNothing) {
  EXPECT_EQ(run({"-r", "lib.a"}).status, 0);
  EXPECT_EQ(run({"--create", "lib.a"}).status, 1);
  EXPECT_FALSE(m_Host.has("lib.a"));
}

TEST_F(InsertActionTest, PutsACreatedArchiveInThePlaceOfAnOldOne) {
  givenLibrary({"a.o", "b.o"});
  givenFile("x.o");
  EXPECT_EQ(run({"--create", "lib.a", "x.o"}).errors, "");
  EXPECT_THAT(names(), ElementsAre("x.o"));
}

// ---- Others at work

namespace {

// Somebody makes the archive whenever it is about to be written, and removes it before it is
// opened.
class BusyHost final : public testsupport::FaultyHost {
public:
  explicit BusyHost(testsupport::MemoryHost& host) : FaultyHost(host), m_Files(host) {}

  support::HostError openForReading(const char* name, support::FileHandle& file) override {
    removeArchive(name);
    return FaultyHost::openForReading(name, file);
  }
  support::HostError openForUpdate(const char* name, support::FileHandle& file) override {
    removeArchive(name);
    return FaultyHost::openForUpdate(name, file);
  }
  support::HostError createTemporary(const char* name, uint32_t mode,
                                     support::TemporaryFile& file) override {
    m_Files.addFile("lib.a", testsupport::archive().bytes());
    ++m_Times;
    return FaultyHost::createTemporary(name, mode, file);
  }
  [[nodiscard]] int getTimes() const { return m_Times; }

private:
  void removeArchive(std::string_view name) {
    if (name != "lib.a" || !m_Files.has(name)) return;
    EXPECT_EQ(m_Files.remove("lib.a"), 0);
  }

  testsupport::MemoryHost& m_Files;
  int m_Times = 0;
};

} // namespace

TEST_F(InsertActionTest, GivesUpWhereAnotherIsAlwaysFaster) {
  givenFile("a.o");
  BusyHost host(m_Host);
  const RunOutcome outcome = runWork(quarnMain, "quarn", {"-rv", "lib.a", "a.o"}, host);
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "");
  EXPECT_EQ(outcome.errors, "Error: L6830E: Writing file 'lib.a' : File exists\n");
  EXPECT_EQ(host.getTimes(), 100);
  EXPECT_EQ(m_Host.read("lib.a"), testsupport::archive().bytes());
}

} // namespace quarn
