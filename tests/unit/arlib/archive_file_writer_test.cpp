// SPDX-License-Identifier: Apache-2.0
//
// Writing an archive: the bytes of the file, and every step that can go wrong. The result is taken
// apart by the builder's own parser; a target that must not be replaced (a folder, a device, a
// read-only file) and a layout that has no room in 32 bits must be refused, and leave the old file.

#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>
#include <utility>

namespace arlib {

namespace {

const std::string LongName = "a_name_of_seventeen.o";

class ArchiveFileWriterTest : public ArchiveTest {
protected:
  bool write() { return writeFile("lib.a", m_Archive); }
  std::string written() { return m_Host.read("lib.a"); }
};

// Writing through a host of which one call fails.
class FailingWrite : public testing::Test {
protected:
  FailingWrite() {
    m_Disk.addFile("lib.a", m_Old);
    m_Disk.addFile("a.o", "new bytes");
  }

  // Fails the n-th call of an operation, from 1, of those that writeFile makes.
  bool writeFailing(std::string_view operation, int occurrence, int error) {
    for (uint64_t call = 1;; ++call) {
      m_Disk.addFile("lib.a", m_Old);
      m_Handler.take();
      Archive archive(m_Host);
      archive.setErrorHandler(&m_Handler);
      archive.getSourceFiles().setMostKept(0);
      m_Host.failCall(0, 0);
      EXPECT_TRUE(readFile("lib.a", archive));
      archive.addMemberFromFile("a.o");
      // As if they had been closed to make room for others.
      archive.closeFiles();
      m_Host.failCall(call, error);
      const bool isWritten = writeFile("lib.a", archive);
      const std::string& failed = m_Host.getFailedOperation();
      EXPECT_NE(failed, "") << "there is no such call";
      if (failed.empty() || (failed == operation && --occurrence == 0)) return isWritten;
    }
  }

  void expectOldArchive() {
    EXPECT_EQ(m_Disk.read("lib.a"), m_Old);
    EXPECT_THAT(m_Disk.getNames(), ElementsAre("a.o", "lib.a"));
    EXPECT_EQ(m_Disk.openHandles(), 0u);
  }

  MemoryHost m_Disk;
  FaultyHost m_Host{m_Disk};
  RecordingHandler m_Handler;
  const std::string m_Old = archive().member("old.o", "old bytes").bytes();
};

} // namespace

TEST_F(ArchiveFileWriterTest, WritesTheBareMagicForNoMembers) {
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), "!<arch>\n");
}

TEST_F(ArchiveFileWriterTest, WritesHeadersContentsAndPadding) {
  m_Host.addFile("odd.o", "odd").mode = 0100640;
  m_Host.at("odd.o").modificationTime = 77;
  m_Host.addFile("even.o", "even");
  m_Archive.addMemberFromFile("odd.o");
  m_Archive.addMemberFromFile("even.o");
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), archive()
                           .member("odd.o", "odd")
                           .numbers(77, 1, 2, "100640")
                           .member("even.o", "even")
                           .bytes());
}

TEST_F(ArchiveFileWriterTest, PutsNamesOfUpToFifteenCharactersInTheHeader) {
  add("exactly_15_ch.o", "x");
  add("exactly_16_chr.o", "y");
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), archive()
                           .longNames({"exactly_16_chr.o"})
                           .member("exactly_15_ch.o", "x")
                           .member("exactly_16_chr.o", "y")
                           .bytes());
}

TEST_F(ArchiveFileWriterTest, WritesAnEmptyNameAsABareSlash) {
  read(archive().member("a.o", "").memberWithNameField("/ ", "x"));
  m_Archive.moveMember(member(1), 0);
  EXPECT_TRUE(write());
  EXPECT_EQ(written().substr(8, 16), "/               ");
  // It stands where a symbol table would.
  EXPECT_FALSE(readFile("lib.a", m_Archive));
}

TEST_F(ArchiveFileWriterTest, CutsNumbersThatAreTooLongForTheirField) {
  ArchiveMember* added = add("a.o", "");
  added->setDate(0x1FFFFFFFF);
  added->setUid(1234567);
  added->setGid(4294967295);
  added->setMode(0100000644);
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), "!<arch>\na.o/            4294967295  1234564294961000006"
                       "40         `\n");
}

TEST_F(ArchiveFileWriterTest, GivesEachMemberAPlaceInTheNewFile) {
  m_Host.addFile("lib.a", archive().member("a.o", "odd").bytes());
  ASSERT_TRUE(readFile("lib.a", m_Archive));
  add("b.o", "more");
  EXPECT_TRUE(write());
  for (const ArchiveMember* each : m_Archive.getMembers()) {
    EXPECT_STREQ(each->getContentsLocation()->fileName, "lib.a");
    EXPECT_EQ(each->getContentsLocation()->offset, each->getOffset() + 60);
    EXPECT_FALSE(each->getContentsLocation()->isTemporary);
  }
  EXPECT_TRUE(member(1)->isModified());
  EXPECT_FALSE(member(0)->isModified());
}

TEST_F(ArchiveFileWriterTest, ReadsEverythingFromTheNewFileWhenItWritesAgain) {
  add("a.o", "first");
  add(LongName.c_str(), "second");
  EXPECT_TRUE(write());
  const std::string before = written();
  m_Host.remove("a.o");
  m_Host.remove(LongName.c_str());
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), before);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a"));
}

TEST_F(ArchiveFileWriterTest, WritesWhatIsInMemoryAlone) {
  ArchiveMember* added = m_Archive.addMember("a.o", 5, 6, 7, 0100600);
  added->setContents("bytes", 5);
  m_Archive.addMember("b.o", 5, 6, 7, 0100600);
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), archive()
                           .member("a.o", "bytes")
                           .numbers(5, 6, 7, "100600")
                           .member("b.o", "")
                           .numbers(5, 6, 7, "100600")
                           .bytes());
  EXPECT_TRUE(added->hasContents());
}

TEST_F(ArchiveFileWriterTest, HoldsNoMembersBytesAfterwards) {
  add("a.o", "bytes");
  EXPECT_TRUE(write());
  EXPECT_FALSE(member(0)->hasContents());
}

TEST_F(ArchiveFileWriterTest, RemovesTheTemporaryFilesOfMembers) {
  ArchiveMember* added = m_Archive.addMember("a.o", 5, 6, 7, 0100600);
  added->setContents("bytes", 5);
  EXPECT_TRUE(added->discardContents());
  EXPECT_THAT(m_Host.getNames(), ElementsAre("/tmp/quarn.0"));
  EXPECT_TRUE(write());
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a"));
  EXPECT_EQ(contentsOf(added), "bytes");
}

TEST_F(ArchiveFileWriterTest, CopiesLargeAndSmallMembersAlike) {
  std::string large(1'000'003, 'x');
  for (size_t i = 0; i < large.size(); ++i)
    large[i] = static_cast<char>(i * 7 + i / 251);
  add("large.o", large);
  add("small.o", "small");
  add("exact.o", std::string(0x40000, 'e'));
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), archive()
                           .member("large.o", large)
                           .member("small.o", "small")
                           .member("exact.o", std::string(0x40000, 'e'))
                           .bytes());
}

TEST_F(ArchiveFileWriterTest, ReadsEachBodyOnce) {
  add("large.o", std::string(10'000'000, 'x'));
  const uint64_t before = m_Host.getBytesRead();
  EXPECT_TRUE(write());
  EXPECT_LT(m_Host.getBytesRead() - before, 10'100'000u);
}

TEST_F(ArchiveFileWriterTest, TakesTheFirstFreeTemporaryName) {
  m_Host.addFile("lib.a", "!<arch>\n");
  m_Host.addFile("lib.a.0", "somebody's");
  m_Host.addFile("lib.a.1", "somebody's");
  m_Host.setRoom(0);
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error writing file 'lib.a.2': No space left on device"));
  m_Host.setEndlessRoom();
  EXPECT_TRUE(write());
  EXPECT_EQ(m_Host.read("lib.a.0"), "somebody's");
  EXPECT_EQ(m_Host.read("lib.a.1"), "somebody's");
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a", "lib.a.0", "lib.a.1"));
}

TEST_F(ArchiveFileWriterTest, KeepsThePermissionsOfTheOldFile) {
  read(archive().member("a", "x"));
  m_Host.at("lib.a").mode = 0100600;
  EXPECT_TRUE(write());
  EXPECT_EQ(m_Host.at("lib.a").mode, 0100600u);
  EXPECT_TRUE(writeFile("new.a", m_Archive));
  EXPECT_EQ(m_Host.at("new.a").mode, 0100644u);
}

TEST_F(ArchiveFileWriterTest, KeepsOwnerAndGroupOfTheOldFile) {
  m_Host.addFile("out.a", "").uid = 77;
  m_Host.at("out.a").gid = 78;
  ASSERT_TRUE(writeFile("out.a", m_Archive));
  EXPECT_EQ(m_Host.at("out.a").uid, 77);
  EXPECT_EQ(m_Host.at("out.a").gid, 78);
}

// Somebody looks at what is being written, at any moment of it.
TEST_F(ArchiveFileWriterTest, KeepsWhatItWritesFromOthersUntilItIsComplete) {
  FaultyHost host(m_Host);
  bool isSeen = false;
  for (uint64_t call = 1;; ++call) {
    m_Host.addFile("lib.a", archive().member("a.o", "secret").bytes()).mode = 0100600;
    Archive secret(host);
    host.disturbCall(call, [&] {
      if (!m_Host.has("lib.a.0")) return;
      isSeen = true;
      EXPECT_EQ(m_Host.at("lib.a.0").mode & 0777U, 0600U) << call;
    });
    ASSERT_TRUE(readFile("lib.a", secret));
    ASSERT_TRUE(writeFile("lib.a", secret));
    if (host.getFailedOperation().empty()) break;
  }
  EXPECT_TRUE(isSeen);
}

// Else a power failure could leave neither.
TEST_F(ArchiveFileWriterTest, ReplacesAFileOnlyByOneThatIsOnTheDisk) {
  m_Host.addFile("out.a", "!<arch>\n");
  add("a.o", "x");
  ASSERT_TRUE(writeFile("out.a", m_Archive));
  EXPECT_TRUE(m_Host.at("out.a").isOnDisk);
}

TEST_F(ArchiveFileWriterTest, DoesNotWaitForTheDiskWhereNothingIsReplaced) {
  ASSERT_TRUE(writeFile("new.a", m_Archive));
  EXPECT_FALSE(m_Host.at("new.a").isOnDisk);
}

TEST_F(ArchiveFileWriterTest, GivesANewFileTheUsualPermissions) {
  ASSERT_TRUE(writeFile("new.a", m_Archive));
  EXPECT_EQ(m_Host.at("new.a").mode, 0100644U);
}

TEST_F(ArchiveFileWriterTest, GivesTheFileANameOnlyWhenItIsComplete) {
  m_Host.hideTemporaries();
  FaultyHost host(m_Host);
  std::vector<std::string> named;
  for (uint64_t call = 1;; ++call) {
    m_Host.addFile("lib.a", archive().member("a.o", "text").bytes());
    Archive copy(host);
    host.disturbCall(call, [&] {
      if (m_Host.has("lib.a.0")) named.push_back(host.getFailedOperation());
    });
    ASSERT_TRUE(readFile("lib.a", copy));
    ASSERT_TRUE(writeFile("lib.a", copy));
    if (host.getFailedOperation().empty()) break;
  }
  EXPECT_THAT(named, ElementsAre("rename"));
}

TEST_F(ArchiveFileWriterTest, TakesAnotherNameWhereOneIsTakenMeanwhile) {
  m_Host.hideTemporaries();
  FaultyHost host(m_Host);
  std::string operation;
  for (uint64_t call = 1; operation != "giveName"; ++call) {
    static_cast<void>(m_Host.remove("lib.a.0"));
    m_Host.addFile("lib.a", archive().member("a.o", "text").bytes());
    Archive copy(host);
    host.disturbCall(call, [&] { m_Host.addFile("lib.a.0", "somebody's"); });
    ASSERT_TRUE(readFile("lib.a", copy));
    ASSERT_TRUE(writeFile("lib.a", copy));
    operation = host.getFailedOperation();
    ASSERT_NE(operation, "");
  }
  EXPECT_EQ(m_Host.read("lib.a.0"), "somebody's");
  EXPECT_THAT(m_Host.getNames(), testing::Not(testing::Contains("lib.a.1")));
}

TEST_F(ArchiveFileWriterTest, RemovesNothingWhereItsFileHasNoName) {
  m_Host.hideTemporaries();
  m_Host.setRoom(20);
  m_Host.addFile("lib.a", archive().member("a.o", "text").bytes());
  FaultyHost host(m_Host);
  Archive copy(host);
  ASSERT_TRUE(readFile("lib.a", copy));
  host.disturbCall(host.getCallCount() + 1, [&] { m_Host.addFile("lib.a.0", "somebody's"); });
  EXPECT_FALSE(writeFile("lib.a", copy));
  EXPECT_EQ(m_Host.read("lib.a.0"), "somebody's");
}

TEST_F(ArchiveFileWriterTest, CutsANameThatLeavesNoRoomForANumber) {
  m_Host.setLongestName(20);
  m_Host.setRoom(0);
  const auto temporaryOf = [this](const std::string& name) {
    EXPECT_FALSE(writeFile(name.c_str(), m_Archive));
    const std::string report = m_Handler.take().at(0);
    const size_t start = report.find('\'') + 1;
    return report.substr(start, report.find('\'', start) - start);
  };
  EXPECT_EQ(temporaryOf("abcdefghijklmnop.a"), "abcdefghijklmnop.a.0");
  EXPECT_EQ(temporaryOf("abcdefghijklmnopq.a"), "abcdefghij.0");
  EXPECT_EQ(temporaryOf("abcdefghijklmnopqr.a"), "abcdefghij.0");
  // Each of these characters is three bytes.
  EXPECT_EQ(
      temporaryOf("\xE8\xA1\xA8\xE8\xA1\xA8\xE8\xA1\xA8\xE8\xA1\xA8\xE8\xA1\xA8\xE8\xA1\xA8.a"),
      "\xE8\xA1\xA8\xE8\xA1\xA8\xE8\xA1\xA8.0");
  // The folder is never cut: it would be another one.
  m_Host.setLongestName(9);
  EXPECT_EQ(temporaryOf("folder/ab"), "folder/a.0");
}

TEST_F(ArchiveFileWriterTest, WritesThroughALink) {
  m_Host.addLink("link.a", "dir/real.a");
  m_Host.addFile("dir/real.a", "!<arch>\n");
  add("a.o", "x");
  EXPECT_TRUE(writeFile("link.a", m_Archive));
  EXPECT_EQ(m_Host.at("link.a").link, "dir/real.a");
  EXPECT_EQ(m_Host.read("dir/real.a"), archive().member("a.o", "x").bytes());
  m_Host.remove("dir/real.a");
  EXPECT_TRUE(member(0)->loadContents() == false);
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error reading file 'link.a': No such file or directory"));
}

TEST_F(ArchiveFileWriterTest, MakesTheFileThatADanglingLinkNames) {
  m_Host.addLink("link.a", "dir/real.a");
  add("a.o", "x");
  EXPECT_TRUE(writeFile("link.a", m_Archive));
  EXPECT_EQ(m_Host.read("dir/real.a"), archive().member("a.o", "x").bytes());
}

TEST_F(ArchiveFileWriterTest, StoresTheFilesName) {
  m_Archive.setFileName("lib.a");
  EXPECT_TRUE(writeFile("other.a", m_Archive));
  EXPECT_STREQ(m_Archive.getFileName(), "other.a");
}

TEST_F(ArchiveFileWriterTest, RefusesAReadOnlyTarget) {
  m_Host.addFile("lib.a", "old").isReadOnly = true;
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(), ElementsAre("0 Output file 'lib.a' is read-only"));
  EXPECT_EQ(written(), "old");
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a"));
}

TEST_F(ArchiveFileWriterTest, NeverReplacesADirectoryOrADevice) {
  m_Host.addDirectory("dir");
  m_Host.addSpecial("pipe");
  EXPECT_FALSE(writeFile("dir", m_Archive));
  EXPECT_THAT(reports(), ElementsAre("0 I/O error deleting file 'dir': Is a directory"));
  EXPECT_FALSE(writeFile("pipe", m_Archive));
  EXPECT_THAT(reports(), ElementsAre("0 I/O error deleting file 'pipe': Invalid argument"));
  EXPECT_THAT(m_Host.getNames(), ElementsAre("dir", "pipe"));
}

TEST_F(ArchiveFileWriterTest, RefusesALayoutOfTwoGibibytesBeforeItBegins) {
  for (const char* name : {"a", "b"}) {
    m_Host.addFile(name, std::string(elfext::RecognizedBytes, 'x')).toldSize = 0x40000000;
    ASSERT_NE(m_Archive.addMemberFromFile(name), nullptr);
  }
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error writing file 'lib.a': File too large"));
  EXPECT_FALSE(m_Host.has("lib.a"));
  EXPECT_FALSE(m_Host.has("lib.a.0"));
}

// Sizes are even. Where the largest isn't refused, it comes to light that nobody has the bytes.
TEST_F(ArchiveFileWriterTest, TakesTheLargestLayoutBelowTwoGibibytes) {
  constexpr int64_t Largest = 0x7FFFFFFE - 8 - 60;
  m_Host.addFile("a", std::string(elfext::RecognizedBytes, 'x')).toldSize = Largest;
  ASSERT_NE(m_Archive.addMemberFromFile("a"), nullptr);
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error reading file 'a'", "0 I/O error writing file 'lib.a.0'"));
  m_Archive.clear();
  m_Host.at("a").toldSize = Largest + 1;
  ASSERT_NE(m_Archive.addMemberFromFile("a"), nullptr);
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error writing file 'lib.a': File too large"));
}

TEST_F(ArchiveFileWriterTest, ReportsAMemberThatHasBecomeShorter) {
  read(archive().member("old", "x"));
  const std::string before = written();
  add("a.o", "ten bytes.");
  m_Host.at("a.o").bytes = "nine byte";
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error reading file 'a.o'", "0 I/O error writing file 'lib.a.0'"));
  EXPECT_EQ(written(), before);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("a.o", "lib.a"));
}

TEST_F(ArchiveFileWriterTest, WritesAMemberWhoseFileIsGoneButOpen) {
  add("a.o", "x");
  m_Host.remove("a.o");
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), archive().member("a.o", "x").bytes());
}

TEST_F(ArchiveFileWriterTest, ReportsAMemberWhoseFileIsGone) {
  add("a.o", "x");
  m_Archive.closeFiles();
  m_Host.remove("a.o");
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error reading file 'a.o': No such file or directory",
                          "0 I/O error writing file 'lib.a.0': No such file or directory"));
  EXPECT_THAT(m_Host.getNames(), IsEmpty());
}

// The old table would give the members wrong names.
TEST_F(ArchiveFileWriterTest, WritesNothingWhereATableCouldNotBeRebuilt) {
  read(archive().longNames({LongName}).member(LongName, "x"));
  const std::string before = written();
  member(0)->discardContents();
  member(1)->setName("another_name_of_some_length.o");
  m_Archive.closeFiles();
  m_Host.at("lib.a").isUnreadable = true;
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'lib.a': Permission denied"));
  EXPECT_EQ(written(), before);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a"));
}

TEST_F(ArchiveFileWriterTest, IsSilentWithoutAHandler) {
  Archive archive(m_Host);
  m_Host.addFile("lib.a", "old").isReadOnly = true;
  EXPECT_FALSE(writeFile("lib.a", archive));
  EXPECT_EQ(written(), "old");
}

TEST_F(ArchiveFileWriterTest, LeavesTheArchiveAsItWasWhenItFails) {
  read(archive().member("old", "x"));
  add("a.o", "new");
  m_Host.setRoom(100);
  EXPECT_FALSE(write());
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error writing file 'lib.a.0': No space left on device"));
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("old", "a.o"));
  m_Host.setEndlessRoom();
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), archive().member("old", "x").member("a.o", "new").bytes());
}

// A disk on which nobody can replace a file that somebody has open.
class BusyTarget : public ArchiveFileWriterTest {
protected:
  BusyTarget() {
    m_Host.addFile("lib.a", m_Old);
    m_Host.addFile("a.o", "new");
    m_Host.keepOpenFiles();
    m_Archive.setErrorHandler(&m_Handler);
    EXPECT_TRUE(readFile("lib.a", m_Archive));
    m_Archive.addMemberFromFile("a.o");
  }

  // Somebody else opens the archive, and lets go of it at the end of the test at the latest.
  void openElsewhere() { ASSERT_EQ(m_Host.openForReading("lib.a", m_Other), 0); }
  void TearDown() override {
    if (m_Other.isOpen()) static_cast<void>(m_Host.close(m_Other));
  }

  support::FileHandle m_Other;
  const std::string m_Old = archive().member("old", "x").bytes();
  const std::string m_New = archive().member("old", "x").member("a.o", "new").bytes();
};

TEST_F(BusyTarget, IsReplacedOnceTheOwnFilesAreLetGoOf) {
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), m_New);
  EXPECT_EQ(m_Host.getTimePaused(), 0u);
}

TEST_F(BusyTarget, IsReplacedWhenSomebodyElseLetsGoOfIt) {
  openElsewhere();
  int pauses = 0;
  m_Host.keepOpenFiles([&] {
    if (++pauses != 3) return;
    EXPECT_EQ(m_Host.close(std::exchange(m_Other, {})), 0);
  });
  EXPECT_TRUE(write());
  EXPECT_EQ(written(), m_New);
  EXPECT_EQ(m_Host.getTimePaused(), 70u);
}

TEST_F(BusyTarget, StaysAsItIsAfterAWhile) {
  openElsewhere();
  EXPECT_FALSE(write());
  EXPECT_EQ(m_Host.getTimePaused(), 1270u);
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file 'lib.a': Device or resource busy"));
  EXPECT_EQ(written(), m_Old);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("a.o", "lib.a"));
}

// The lock had to be let go of, and somebody came in.
TEST_F(BusyTarget, IsNotReplacedWhenSomebodyElseHasWrittenMeanwhile) {
  openElsewhere();
  const std::string others = archive().member("old", "x").member("b.o", "other").bytes();
  m_Host.keepOpenFiles([&] { m_Host.addFile("lib.a", others); });
  EXPECT_FALSE(write());
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file 'lib.a': Stale file handle"));
  EXPECT_EQ(written(), others);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("a.o", "lib.a"));
}

TEST_F(BusyTarget, IsLeftToWhoWasFasterByOneWhoseTurnItWas) {
  openElsewhere();
  const std::string others = archive().member("b.o", "other").bytes();
  m_Host.keepOpenFiles([&] { m_Host.addFile("lib.a", others); });
  EXPECT_EQ(writeInTurn("lib.a", m_Archive), WriteEnd::Overtaken);
  EXPECT_THAT(m_Handler.reports, IsEmpty());
  EXPECT_EQ(written(), others);
  EXPECT_THAT(m_Host.getNames(), ElementsAre("a.o", "lib.a"));
}

// The lock was kept, so this one has not waited for it.
TEST_F(BusyTarget, IsReportedWhereNothingHadToBeLetGoOf) {
  m_Host.addFile("lib.a", archive().member("b.o", "other").bytes());
  EXPECT_EQ(writeInTurn("lib.a", m_Archive), WriteEnd::Failed);
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file 'lib.a': Stale file handle"));
}

TEST_F(FailingWrite, AtTheAccessTestCountsAsReadOnly) {
  EXPECT_FALSE(writeFailing("isWritable", 1, EIO));
  EXPECT_THAT(m_Handler.reports, ElementsAre("0 Output file 'lib.a' is read-only"));
  expectOldArchive();
}

TEST_F(FailingWrite, AtTheCreationNamesTheTemporary) {
  EXPECT_FALSE(writeFailing("createTemporary", 1, EACCES));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file 'lib.a.0': Permission denied"));
  expectOldArchive();
}

TEST_F(FailingWrite, AtAMembersFileIsReportedTwice) {
  EXPECT_FALSE(writeFailing("openForReading", 1, EMFILE));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error reading file 'lib.a': Too many open files",
                          "0 I/O error writing file 'lib.a.0': Too many open files"));
  expectOldArchive();
  EXPECT_FALSE(writeFailing("readAt", 2, EIO));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error reading file 'a.o': Input/output error",
                          "0 I/O error writing file 'lib.a.0': Input/output error"));
  expectOldArchive();
  EXPECT_FALSE(writeFailing("close", 1, EIO));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error closing file 'a.o': Input/output error",
                          "0 I/O error writing file 'lib.a.0': Input/output error"));
  expectOldArchive();
}

TEST_F(FailingWrite, AtAWriteRemovesTheTemporary) {
  EXPECT_FALSE(writeFailing("write", 1, ENOSPC));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file 'lib.a.0': No space left on device"));
  expectOldArchive();
}

TEST_F(FailingWrite, AtTheFlushCountsAsAWrite) {
  EXPECT_FALSE(writeFailing("flush", 1, EFBIG));
  EXPECT_THAT(m_Handler.reports, ElementsAre("0 I/O error writing file 'lib.a.0': File too large"));
  expectOldArchive();
}

TEST_F(FailingWrite, OnTheWayToTheDiskCountsAsAWrite) {
  EXPECT_FALSE(writeFailing("flushToDisk", 1, EIO));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file 'lib.a.0': Input/output error"));
  expectOldArchive();
}

TEST_F(FailingWrite, AtTheCloseRemovesTheTemporary) {
  EXPECT_FALSE(writeFailing("close", 2, EIO));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error closing file 'lib.a.0': Input/output error"));
  expectOldArchive();
}

TEST_F(FailingWrite, AtTheRenameNamesTheArchiveAndKeepsIt) {
  EXPECT_FALSE(writeFailing("rename", 1, EACCES));
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file 'lib.a': Permission denied"));
  expectOldArchive();
}

// Somebody looks at the new file for a moment.
TEST_F(FailingWrite, AtABusyRenameIsTriedAgain) {
  EXPECT_TRUE(writeFailing("rename", 1, EBUSY));
  EXPECT_THAT(m_Handler.reports, IsEmpty());
  EXPECT_THAT(m_Disk.getNames(), ElementsAre("a.o", "lib.a"));
}

TEST_F(FailingWrite, AtABusyNewNameIsTriedAgain) {
  std::string failed = "none";
  for (uint64_t call = 1; failed != "renameNew" && !failed.empty(); ++call) {
    static_cast<void>(m_Disk.remove("new.a"));
    Archive archive(m_Host);
    archive.setErrorHandler(&m_Handler);
    m_Host.failCall(call, EBUSY);
    const WriteEnd result = writeNewFile("new.a", archive);
    failed = m_Host.getFailedOperation();
    EXPECT_TRUE(failed != "renameNew" || result == WriteEnd::Written);
  }
  EXPECT_EQ(failed, "renameNew");
  EXPECT_THAT(m_Disk.getNames(), ElementsAre("a.o", "lib.a", "new.a"));
}

// A disk that is full, and somebody who looks at what has arrived.
TEST_F(BusyTarget, LeavesNoTemporaryThatIsBusyForAMoment) {
  m_Host.setRoom(100);
  m_Host.keepRemovedFiles(2);
  EXPECT_FALSE(write());
  EXPECT_THAT(m_Host.getNames(), ElementsAre("a.o", "lib.a"));
  EXPECT_EQ(m_Host.getTimePaused(), 10u);
}

TEST_F(FailingWrite, AtThePermissionsIsNoFailure) {
  EXPECT_TRUE(writeFailing("copyProtection", 1, EPERM));
  EXPECT_THAT(m_Handler.reports, IsEmpty());
}

} // namespace arlib
