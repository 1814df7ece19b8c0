// SPDX-License-Identifier: Apache-2.0
//
// One member: its contents, wherever they are (the archive, a file, memory, a temporary), and what
// edits of it make stale. Files go, shrink and fail under it: contents are whole, or reported as
// lost, and no temporary stays behind.

#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

namespace {

class ArchiveMemberTest : public ArchiveTest {
protected:
  ArchiveMemberTest() { m_Host.addFile("a.o", "contents"); }

  std::vector<std::string> filesBeside() {
    std::vector<std::string> names = m_Host.getNames();
    std::erase(names, "a.o");
    return names;
  }
};

// A member on a host of which one call fails.
class FailingContents : public testing::Test {
protected:
  FailingContents() {
    m_Disk.addFile("a.o", "contents");
    m_Archive.setErrorHandler(&m_Handler);
    m_Archive.getSourceFiles().setMostKept(0);
    m_Member = m_Archive.addMemberFromFile("a.o");
    m_InMemory = m_Archive.addMember("b.o", 0, 0, 0, 0);
    m_InMemory->setContents("memory", 6);
  }

  MemoryHost m_Disk;
  FaultyHost m_Host{m_Disk};
  RecordingHandler m_Handler;
  Archive m_Archive{m_Host};
  ArchiveMember* m_Member = nullptr;
  ArchiveMember* m_InMemory = nullptr;
};

} // namespace

TEST_F(ArchiveMemberTest, StartsEmptyAndOfUnknownType) {
  const ArchiveMember fresh(&m_Archive);
  EXPECT_EQ(fresh.getName(), "");
  EXPECT_EQ(fresh.getSize(), 0u);
  EXPECT_EQ(fresh.getType(), UnknownArchiveMemberType::getInstance());
  EXPECT_FALSE(fresh.hasContents());
  EXPECT_FALSE(fresh.getContentsLocation().has_value());
  EXPECT_FALSE(fresh.isModified());
  EXPECT_EQ(fresh.getFileNameTableOffset(), ArchiveMember::NoFileNameTableOffset);
  EXPECT_EQ(fresh.getArchive(), &m_Archive);
}

TEST_F(ArchiveMemberTest, LoadsItsBytesOnDemandAndOnce) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  EXPECT_FALSE(added->hasContents());
  EXPECT_TRUE(added->loadContents());
  EXPECT_EQ(textOf(added->getContents()), "contents");
  m_Host.remove("a.o");
  EXPECT_TRUE(added->loadContents());
}

TEST_F(ArchiveMemberTest, HasItsBytesFromTheFileThatItWasMadeOf) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  m_Host.addFile("a.o", "somebody else's");
  EXPECT_EQ(contentsOf(added), "contents");
}

TEST_F(ArchiveMemberTest, ReportsAFileThatIsGone) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  m_Archive.closeFiles();
  m_Host.remove("a.o");
  EXPECT_FALSE(added->loadContents());
  EXPECT_FALSE(added->hasContents());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o': No such file or directory"));
}

TEST_F(ArchiveMemberTest, ReportsAFileThatHasBecomeShorterWithoutAReason) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  m_Host.at("a.o").bytes = "content";
  EXPECT_FALSE(added->loadContents());
  EXPECT_FALSE(added->hasContents());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o'"));
}

// Opening the file again, asking what it is, reading it, and asking once more.
TEST_F(FailingContents, AreReportedAndNotKept) {
  for (uint64_t call = 1; call <= 4; ++call) {
    m_Archive.closeFiles();
    m_Host.failCall(call, EIO);
    EXPECT_FALSE(m_Member->loadContents());
    EXPECT_FALSE(m_Member->hasContents());
    EXPECT_THAT(m_Handler.take(),
                ElementsAre("0 I/O error reading file 'a.o': Input/output error"));
  }
  m_Archive.closeFiles();
  EXPECT_EQ(m_Disk.openHandles(), 0u);
  m_Host.failCall(0, 0);
  EXPECT_TRUE(m_Member->loadContents());
}

TEST_F(ArchiveMemberTest, GoesToATemporaryFileWhenItsBytesAreNowhereElse) {
  ArchiveMember* added = m_Archive.addMember("b.o", 0, 0, 0, 0);
  added->setContents("memory", 6);
  EXPECT_TRUE(added->flushContents());
  EXPECT_TRUE(added->hasContents());
  ASSERT_TRUE(added->getContentsLocation().has_value());
  EXPECT_TRUE(added->getContentsLocation()->isTemporary);
  EXPECT_EQ(added->getContentsLocation()->offset, 0u);
  EXPECT_EQ(m_Host.read(added->getContentsLocation()->fileName), "memory");
  EXPECT_TRUE(added->flushContents());
  EXPECT_EQ(filesBeside().size(), 1u);
}

TEST_F(ArchiveMemberTest, MayBeEditedInPlaceOnceItsTypeIsCleared) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  EXPECT_TRUE(added->clearType());
  added->getModifiableContents()[0] = 'C';
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(textOf(added->getContents()), "Contents");
  EXPECT_DEATH(static_cast<void>(added->getModifiableContents()), "m_Type == NULL");
}

TEST_F(ArchiveMemberTest, FindsTheIndexOfASymbol) {
  m_Host.addFile("lib.a",
                 archive().symbolTable({{"s", "a.o"}, {"t", "a.o"}}).member("a.o", "x").bytes());
  ASSERT_TRUE(readFile("lib.a", m_Archive));
  const ArchiveMember* defining = m_Archive.getMembers()[1];
  EXPECT_EQ(defining->getSymbolIndex(m_Archive.getSymbols()[1]), 1u);
  Archive other(m_Host);
  ASSERT_TRUE(readFile("lib.a", other));
  EXPECT_EQ(defining->getSymbolIndex(other.getSymbols()[1]), Archive::NotFound);
  EXPECT_DEATH(static_cast<void>(defining->getSymbolIndex(nullptr)), "symbol != NULL");
}

TEST_F(ArchiveMemberTest, NeedsNoTemporaryFileForWhatIsOnDisk) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  EXPECT_TRUE(added->loadContents());
  EXPECT_TRUE(added->discardContents());
  EXPECT_FALSE(added->hasContents());
  EXPECT_THAT(filesBeside(), IsEmpty());
  EXPECT_EQ(contentsOf(added), "contents");
}

TEST_F(ArchiveMemberTest, ComesBackFromItsTemporaryFile) {
  ArchiveMember* added = m_Archive.addMember("b.o", 0, 0, 0, 0);
  added->setContents("memory", 6);
  EXPECT_TRUE(added->discardContents());
  EXPECT_FALSE(added->hasContents());
  EXPECT_EQ(contentsOf(added), "memory");
}

TEST_F(FailingContents, LeaveNoTemporaryFileBehind) {
  m_Host.failCall(1, EACCES);
  EXPECT_FALSE(m_InMemory->flushContents());
  m_Host.failCall(2, ENOSPC);
  EXPECT_FALSE(m_InMemory->flushContents());
  m_Host.failCall(3, EIO);
  EXPECT_FALSE(m_InMemory->flushContents());
  m_Host.failCall(4, EIO);
  EXPECT_FALSE(m_InMemory->flushContents());
  m_Host.failCall(5, EIO);
  EXPECT_FALSE(m_InMemory->flushContents());
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error writing file '': Permission denied",
                          "0 I/O error writing file '/tmp/quarn.0': No space left on device",
                          "0 I/O error writing file '/tmp/quarn.1': Input/output error",
                          "0 I/O error writing file '/tmp/quarn.2': Input/output error",
                          "0 I/O error closing file '/tmp/quarn.3': Input/output error"));
  EXPECT_THAT(m_Disk.getNames(), ElementsAre("a.o"));
  m_Archive.closeFiles();
  EXPECT_EQ(m_Disk.openHandles(), 0u);
  EXPECT_FALSE(m_InMemory->getContentsLocation().has_value());
  EXPECT_TRUE(m_InMemory->flushContents());
}

// The files that other members come from make room.
TEST_F(FailingContents, HaveAPlaceToGoAlsoWhereTooManyFilesAreOpen) {
  m_Host.failCall(1, EMFILE);
  EXPECT_TRUE(m_InMemory->flushContents());
  EXPECT_THAT(m_Handler.reports, IsEmpty());
  EXPECT_TRUE(m_Member->loadContents());
}

// This is the order of the two steps; the report has told of the loss.
TEST_F(FailingContents, AreLostIfDiscardedWithoutAPlaceToGo) {
  m_Host.failCall(2, ENOSPC);
  EXPECT_TRUE(m_InMemory->discardContents());
  EXPECT_FALSE(m_InMemory->hasContents());
  EXPECT_EQ(m_Handler.reports.size(), 1u);
}

TEST_F(ArchiveMemberTest, DeletesOnlyATemporaryFileWithItsLocation) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  EXPECT_TRUE(added->loadContents());
  EXPECT_TRUE(added->releaseContentsLocation());
  EXPECT_FALSE(added->getContentsLocation().has_value());
  EXPECT_TRUE(m_Host.has("a.o"));
  EXPECT_TRUE(added->flushContents());
  EXPECT_TRUE(added->releaseContentsLocation());
  EXPECT_THAT(filesBeside(), IsEmpty());
  EXPECT_TRUE(added->releaseContentsLocation());
}

TEST_F(FailingContents, ReportADeletionAndForgetTheLocation) {
  EXPECT_TRUE(m_InMemory->flushContents());
  m_Host.failCall(1, EACCES);
  EXPECT_FALSE(m_InMemory->releaseContentsLocation());
  EXPECT_THAT(m_Handler.reports,
              ElementsAre("0 I/O error deleting file '/tmp/quarn.0': Permission denied"));
  EXPECT_FALSE(m_InMemory->getContentsLocation().has_value());
  EXPECT_TRUE(m_InMemory->releaseContentsLocation());
}

TEST_F(ArchiveMemberTest, TakesNewBytesAndATypeFromThem) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  const std::string image = object().bytes();
  added->setContents(image.data(), static_cast<uint32_t>(image.size()));
  EXPECT_EQ(added->getType(), ElfImageArchiveMemberType::getInstance());
  EXPECT_EQ(added->getSize(), image.size());
  EXPECT_TRUE(added->isModified());
  EXPECT_FALSE(added->getContentsLocation().has_value());
  EXPECT_EQ(contentsOf(added), image);
  added->setContents("", 0);
  EXPECT_EQ(added->getType(), UnknownArchiveMemberType::getInstance());
  EXPECT_EQ(contentsOf(added), "");
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), archive().member("a.o", "").bytes());
}

TEST_F(ArchiveMemberTest, TakesAPartOfItsOwnBytes) {
  ArchiveMember* added = m_Archive.addMemberFromFile("a.o");
  EXPECT_TRUE(added->loadContents());
  added->setContents(added->getContents().data() + 1, 7);
  EXPECT_EQ(contentsOf(added), "ontents");
}

TEST_F(ArchiveMemberTest, TakesTheContentsAndNumbersOfAFile) {
  read(archive().member("x.o", "old"));
  testsupport::MemoryHost::File& file = m_Host.addFile("new.o", object().bytes());
  file.modificationTime = 11;
  file.uid = 12;
  file.gid = 13;
  file.mode = 0100600;
  EXPECT_TRUE(member(0)->loadContents());
  EXPECT_TRUE(member(0)->setContentsFromFile("new.o"));
  EXPECT_EQ(member(0)->getName(), "x.o");
  EXPECT_EQ(member(0)->getDate(), 11);
  EXPECT_EQ(member(0)->getUid(), 12u);
  EXPECT_EQ(member(0)->getGid(), 13u);
  EXPECT_EQ(member(0)->getMode(), 0100600u);
  EXPECT_EQ(member(0)->getSize(), object().bytes().size());
  EXPECT_EQ(member(0)->getType(), ElfImageArchiveMemberType::getInstance());
  EXPECT_TRUE(member(0)->isModified());
  EXPECT_EQ(contentsOf(member(0)), object().bytes());
}

TEST_F(ArchiveMemberTest, TakesAPieceOfAFile) {
  read(archive().member("x.o", "old"));
  m_Host.addFile("src", "......" + object().bytes() + "......");
  const auto size = static_cast<uint32_t>(object().bytes().size());
  EXPECT_TRUE(member(0)->setContentsFromFileRegion("src", 6, size));
  EXPECT_EQ(member(0)->getType(), ElfImageArchiveMemberType::getInstance());
  EXPECT_EQ(contentsOf(member(0)), object().bytes());
  EXPECT_TRUE(member(0)->setContentsFromFileRegion("src", 3, 3));
  EXPECT_EQ(member(0)->getType(), UnknownArchiveMemberType::getInstance());
  EXPECT_EQ(contentsOf(member(0)), "...");
}

TEST_F(ArchiveMemberTest, StaysAsItIsWhereAFileCannotBeTaken) {
  read(archive().member("x.o", "old"));
  m_Host.addDirectory("dir");
  m_Host.addSpecial("fifo");
  m_Host.addFile("big", "").toldSize = 0x80000000;
  m_Host.addFile("src", "12345");
  EXPECT_FALSE(member(0)->setContentsFromFile("gone"));
  EXPECT_FALSE(member(0)->setContentsFromFile("dir"));
  EXPECT_FALSE(member(0)->setContentsFromFile("fifo"));
  EXPECT_FALSE(member(0)->setContentsFromFile("big"));
  EXPECT_FALSE(member(0)->setContentsFromFileRegion("gone", 0, 0));
  EXPECT_FALSE(member(0)->setContentsFromFileRegion("src", 2, 4));
  EXPECT_THAT(reports(),
              ElementsAre("0 I/O error reading file 'gone': No such file or directory",
                          "0 I/O error reading file 'dir': Is a directory",
                          "0 I/O error reading file 'fifo': Invalid argument",
                          "0 I/O error reading file 'big': Value too large for defined data type",
                          "0 I/O error reading file 'gone': No such file or directory",
                          "0 Error reading region from file 'src' at offset 2 with size 4: file is "
                          "only 5 bytes long"));
  EXPECT_EQ(contentsOf(member(0)), "old");
  EXPECT_FALSE(member(0)->isModified());
}

TEST_F(ArchiveMemberTest, LeavesATemporaryFileAloneWhenItTakesAnother) {
  ArchiveMember* added = m_Archive.addMember("b.o", 0, 0, 0, 0);
  added->setContents("memory", 6);
  EXPECT_TRUE(added->flushContents());
  EXPECT_TRUE(added->setContentsFromFile("a.o"));
  EXPECT_TRUE(m_Host.has("/tmp/quarn.0"));
  EXPECT_EQ(contentsOf(added), "contents");
}

TEST_F(ArchiveMemberTest, IsLoadedAndOfNoTypeWhileItIsEdited) {
  read(archive().member("x.o", "old"));
  EXPECT_TRUE(member(0)->clearType());
  EXPECT_EQ(member(0)->getType(), nullptr);
  EXPECT_TRUE(member(0)->hasContents());
  EXPECT_TRUE(member(0)->isModified());
  EXPECT_TRUE(member(0)->determineType());
  EXPECT_EQ(member(0)->getType(), UnknownArchiveMemberType::getInstance());
  EXPECT_FALSE(member(0)->getContentsLocation().has_value());
}

TEST_F(ArchiveMemberTest, TakesANewNameAndIsFoundByIt) {
  read(archive().member("x.o", "old").member("y.o", ""));
  ArchiveMemberList list;
  EXPECT_TRUE(m_Archive.findMembers("x.o", list));
  member(0)->setName("z.o");
  EXPECT_FALSE(m_Archive.findMembers("x.o", list));
  EXPECT_TRUE(m_Archive.findMembers("z.o", list));
  EXPECT_EQ(list[0], member(0));
  EXPECT_FALSE(member(0)->isModified());
}

TEST_F(ArchiveMemberTest, CopiesItsName) {
  read(archive().member("x.o", "old"));
  std::string name = "z.o";
  member(0)->setName(name);
  name = "q.o";
  EXPECT_EQ(member(0)->getName(), "z.o");
}

TEST_F(ArchiveMemberTest, TakesNewNumbers) {
  read(archive().member("x.o", "old"));
  member(0)->setDate(1);
  member(0)->setUid(2);
  member(0)->setGid(3);
  member(0)->setMode(0100777);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"),
            archive().member("x.o", "old").numbers(1, 2, 3, "100777").bytes());
}

} // namespace arlib
