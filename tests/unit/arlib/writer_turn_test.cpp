// SPDX-License-Identifier: Apache-2.0
//
// Writers of one archive take turns, and none replaces what it has not read. The host's answer to a
// lock is the moment in which somebody else has replaced, removed or written to the archive; what
// is there when the turn has come is what the run reads.

#include "arlib/interface/writer_turn.h"

#include "tests/support/faulty_host.h"
#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

namespace {

class WriterTurnTest : public ArchiveTest {
protected:
  void put(std::string_view contents) {
    m_Host.addFile("lib.a", archive().member("a.o", contents).bytes());
  }

  // What this writer would add to.
  std::string readInTurn() {
    const auto file = takeTurn(m_Archive.getSourceFiles(), "lib.a", m_Kind, m_Error);
    if (file == nullptr || !readFile(file, m_Archive)) return "(none)";
    return contentsOf(member(0));
  }

  support::FileKind m_Kind = support::FileKind::Special;
  support::HostError m_Error = 0;
};

const std::string StaleWrite = "0 I/O error writing file 'lib.a': Stale file handle";

} // namespace

TEST_F(WriterTurnTest, ReadsTheFileThatItHasLocked) {
  put("first");
  EXPECT_EQ(readInTurn(), "first");
}

TEST_F(WriterTurnTest, LooksAgainWhenItsTurnHasCome) {
  put("first");
  int waits = 0;
  m_Host.setLocks([&] {
    if (++waits <= 2) put("by writer " + std::to_string(waits));
    return 0;
  });
  EXPECT_EQ(readInTurn(), "by writer 2");
  EXPECT_EQ(waits, 3);
}

TEST_F(WriterTurnTest, EndsWhereTheFileIsGoneWhenItsTurnHasCome) {
  put("first");
  m_Host.setLocks([&] { return m_Host.remove("lib.a"); });
  EXPECT_EQ(readInTurn(), "(none)");
  EXPECT_EQ(m_Kind, support::FileKind::Nothing);
}

TEST_F(WriterTurnTest, EndsWhereTheHostTellsOfAFileThatItDoesNotOpen) {
  class Dreaming final : public testsupport::FaultyHost {
  public:
    using FaultyHost::FaultyHost;
    support::HostError openForUpdate(const char*, support::FileHandle&) override { return ENOENT; }
  } host(m_Host);
  put("first");
  support::SourceFiles files(host);
  EXPECT_NE(takeTurn(files, "lib.a", m_Kind, m_Error), nullptr);
}

// It has read nothing yet, and so there is nothing that could be old.
TEST_F(WriterTurnTest, ReadsWhatWasWrittenInPlaceWhileItWaited) {
  put("first");
  m_Host.setLocks([&] {
    m_Host.at("lib.a").bytes = archive().member("a.o", "by another").bytes();
    m_Host.at("lib.a").modificationTime += 1;
    return 0;
  });
  EXPECT_EQ(readInTurn(), "by another");
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
}

// A file that appears behind the look is one that this writer has no turn at: he must not be told
// of it as if he had.
TEST_F(WriterTurnTest, TellsWhatWasThereWhenItLooked) {
  FaultyHost host(m_Host);
  support::SourceFiles files(host);
  host.disturbCall(2, [&] { put("first"); });
  EXPECT_EQ(takeTurn(files, "lib.a", m_Kind, m_Error), nullptr);
  EXPECT_EQ(m_Kind, support::FileKind::Nothing);
}

TEST_F(WriterTurnTest, GoesOnWithoutLocksWhereThereAreNone) {
  put("first");
  m_Host.setLocks([] { return ENOLCK; });
  EXPECT_EQ(readInTurn(), "first");
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
}

TEST_F(WriterTurnTest, DoesNotLockWhatItMayNotWrite) {
  put("first");
  m_Host.at("lib.a").isReadOnly = true;
  m_Host.setLocks([] {
    ADD_FAILURE() << "locked";
    return 0;
  });
  EXPECT_EQ(readInTurn(), "first");
  EXPECT_TRUE(m_Archive.isReadOnly());
}

TEST_F(WriterTurnTest, OpensNeitherDirectoriesNorDevices) {
  m_Host.addDirectory("dir");
  m_Host.addSpecial("pipe");
  const std::vector<std::pair<const char*, support::FileKind>> places = {
      {"dir", support::FileKind::Directory},
      {"pipe", support::FileKind::Special},
      {"gone", support::FileKind::Nothing}};
  for (const auto& [name, kind] : places) {
    EXPECT_EQ(takeTurn(m_Archive.getSourceFiles(), name, m_Kind, m_Error), nullptr);
    EXPECT_EQ(m_Kind, kind);
  }
}

// Somebody who doesn't lock was faster.
TEST_F(WriterTurnTest, KeepsWhatAnotherHasPutInTheArchivesPlace) {
  put("first");
  EXPECT_EQ(readInTurn(), "first");
  put("other");
  EXPECT_FALSE(writeFile("lib.a", m_Archive));
  EXPECT_THAT(reports(), ElementsAre(StaleWrite));
  EXPECT_EQ(m_Host.read("lib.a"), archive().member("a.o", "other").bytes());
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a"));
  EXPECT_EQ(m_Host.remove("lib.a"), 0);
  EXPECT_FALSE(writeFile("lib.a", m_Archive));
  EXPECT_THAT(reports(), ElementsAre(StaleWrite));
  EXPECT_THAT(m_Host.getNames(), IsEmpty());
}

TEST_F(WriterTurnTest, KeepsAnArchiveThatWasWrittenToInPlace) {
  put("first");
  EXPECT_EQ(readInTurn(), "first");
  m_Archive.removeMember(member(0));
  m_Host.at("lib.a").bytes += "more";
  EXPECT_FALSE(writeFile("lib.a", m_Archive));
  EXPECT_THAT(reports(), ElementsAre(StaleWrite));
}

TEST_F(WriterTurnTest, MayReplaceAFileUnderAnotherName) {
  put("first");
  EXPECT_EQ(readInTurn(), "first");
  m_Host.addFile("other.a", "anything");
  EXPECT_TRUE(writeFile("other.a", m_Archive));
  EXPECT_EQ(m_Host.read("other.a"), m_Host.read("lib.a"));
}

TEST_F(WriterTurnTest, HasTheNewFileForItsOwnAfterAWrite) {
  put("first");
  EXPECT_EQ(readInTurn(), "first");
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.openHandles(), 0u);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  put("other");
  EXPECT_FALSE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), archive().member("a.o", "other").bytes());
}

// Its members are read from the file that was written, and from no other that takes its place.
TEST_F(WriterTurnTest, FindsItsMembersInTheFileThatItHasWritten) {
  put("first");
  EXPECT_EQ(readInTurn(), "first");
  member(0)->discardContents();
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  put("other");
  EXPECT_FALSE(member(0)->loadContents());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'lib.a': Stale file handle"));
}

TEST_F(WriterTurnTest, MakesANewArchiveWhereThereIsNone) {
  add("a.o", "x");
  EXPECT_EQ(writeNewFile("lib.a", m_Archive), WriteEnd::Written);
  EXPECT_EQ(m_Host.read("lib.a"), archive().member("a.o", "x").bytes());
  EXPECT_EQ(writeNewFile("lib.a", m_Archive), WriteEnd::Overtaken);
  EXPECT_THAT(reports(), IsEmpty());
}

// Another makes the archive at each moment of the write.
TEST_F(WriterTurnTest, NeverReplacesAnArchiveThatHasAppeared) {
  const std::string others = archive().member("other.o", "y").bytes();
  uint64_t appearances = 0;
  for (uint64_t call = 1;; ++call) {
    MemoryHost disk;
    disk.addFile("a.o", "x");
    FaultyHost host(disk);
    Archive mine(host);
    mine.setErrorHandler(&m_Handler);
    mine.addMemberFromFile("a.o");
    host.disturbCall(call, [&] { disk.addFile("lib.a", others); });
    const WriteEnd result = writeNewFile("lib.a", mine);
    const bool isLate = host.getFailedOperation().empty();
    if (result == WriteEnd::Overtaken) {
      ++appearances;
      EXPECT_EQ(disk.read("lib.a"), others);
      EXPECT_THAT(disk.getNames(), ElementsAre("a.o", "lib.a"));
    }
    EXPECT_NE(result, WriteEnd::Failed);
    if (isLate) break;
  }
  EXPECT_GT(appearances, 5u);
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(WriterTurnTest, ReportsANewFileThatCannotBeMade) {
  m_Host.setRoom(0);
  add("a.o", "x");
  EXPECT_EQ(writeNewFile("lib.a", m_Archive), WriteEnd::Failed);
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error writing file 'lib.a.0': No space left on device"));
}

} // namespace arlib
