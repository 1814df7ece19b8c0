// SPDX-License-Identifier: Apache-2.0
//
// What every host promises, held by the one that the process runs on: real files in a real folder.
// The numbers of failures are the same on all of them, and so are their texts. What links, FIFOs
// and signals do, and what consoles and drives, stands in the tests of one host.

#include "tests/support/bytes.h"
#include "tests/unit/support/host_fixture.h"

#include <gmock/gmock.h>

#include <cerrno>
#include <chrono>
#include <ctime>
#include <thread>

namespace support {

using testsupport::bytesOf;

namespace fs = std::filesystem;

namespace {

constexpr uint32_t KindBits = 0170000;
constexpr FileHandle NoHandle = {123456789};
const std::string Japanese = "\xE8\xA1\xA8\xE7\xA4\xBA \xE3\x82\xA2.o";

} // namespace

TEST_F(HostTest, ReadsAtAnyOffsetAndTellsTheEnd) {
  make("file", "0123456789");
  FileHandle file;
  ASSERT_EQ(m_Host.openForReading(at("file").c_str(), file), 0);
  EXPECT_EQ(readAt(file, 2), "2345");
  EXPECT_EQ(readAt(file, 8), "89");
  EXPECT_EQ(readAt(file, 10), "");
  EXPECT_EQ(readAt(file, 100), "");
  EXPECT_EQ(readAt(file, uint64_t{1} << 40), "");
  EXPECT_EQ(readAt(file, 0), "0123");
  size_t done = 99;
  EXPECT_EQ(m_Host.readAt(file, {}, 3, done), 0);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, RefusesAnOffsetThatNoFileHas) {
  make("file", "0123456789");
  FileHandle file;
  ASSERT_EQ(m_Host.openForReading(at("file").c_str(), file), 0);
  std::array<uint8_t, 4> bytes;
  size_t done = 99;
  EXPECT_EQ(m_Host.readAt(file, bytes, uint64_t{1} << 63, done), EINVAL);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, ReadsFromBeginningToEnd) {
  make("file", "0123456789");
  FileHandle file;
  ASSERT_EQ(m_Host.openSequential(at("file").c_str(), file), 0);
  std::array<uint8_t, 6> bytes;
  size_t done = 99;
  EXPECT_EQ(m_Host.readNext(file, bytes, done), 0);
  EXPECT_EQ(done, 6u);
  EXPECT_EQ(m_Host.readNext(file, bytes, done), 0);
  EXPECT_EQ(done, 4u);
  EXPECT_EQ(bytes[3], '9');
  EXPECT_EQ(m_Host.readNext(file, bytes, done), 0);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, CreatesNoFileWhereOneIs) {
  make("file", "old");
  FileHandle file;
  EXPECT_EQ(m_Host.createForWriting(at("file").c_str(), file), EEXIST);
  EXPECT_EQ(read("file"), "old");
  ASSERT_EQ(m_Host.createForWriting(at("new").c_str(), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
  EXPECT_EQ(m_Host.endWriting(file, at("new").c_str(), true), 0);
  EXPECT_EQ(read("new"), "text");
  ASSERT_EQ(m_Host.createForWriting(at("half").c_str(), file), 0);
  EXPECT_EQ(m_Host.endWriting(file, at("half").c_str(), false), 0);
  EXPECT_FALSE(fs::exists(pathOf("half")));
}

TEST_F(HostTest, FailsToOpenWithTheErrorNumber) {
  make("file", "");
  fs::create_directory(pathOf("dir"));
  FileHandle file;
  EXPECT_EQ(m_Host.openForReading(at("gone").c_str(), file), ENOENT);
  EXPECT_FALSE(file.isOpen());
  EXPECT_EQ(m_Host.openForReading("", file), ENOENT);
  EXPECT_EQ(m_Host.openForUpdate(at("gone").c_str(), file), ENOENT);
  EXPECT_EQ(m_Host.openForUpdate(at("dir").c_str(), file), EISDIR);
  EXPECT_EQ(m_Host.openSequential(at("gone").c_str(), file), ENOENT);
  EXPECT_EQ(m_Host.openForWriting("", file), ENOENT);
  EXPECT_EQ(m_Host.openForWriting(at("dir").c_str(), file), EISDIR);
  EXPECT_EQ(m_Host.openForWriting(".", file), EISDIR);
  EXPECT_EQ(m_Host.openForWriting(at("no/such").c_str(), file), ENOENT);
  EXPECT_EQ(createNamed(at("no/such"), file), ENOENT);
  for (const char* below : {"file/x", "file/x/y"}) {
    EXPECT_EQ(m_Host.openForReading(at(below).c_str(), file), ENOTDIR) << below;
    EXPECT_EQ(m_Host.openForWriting(at(below).c_str(), file), ENOTDIR) << below;
    EXPECT_EQ(createNamed(at(below), file), ENOTDIR) << below;
  }
}

TEST_F(HostTest, LeavesNoHandleBehindAFailure) {
  for (const std::string& name : {at("gone/x"), getFolder(), at(std::string(256, 'x'))}) {
    FileHandle file = NoHandle;
    EXPECT_NE(m_Host.openForWriting(name.c_str(), file), 0);
    EXPECT_FALSE(file.isOpen()) << name;
    file = NoHandle;
    EXPECT_NE(m_Host.openForUpdate(name.c_str(), file), 0);
    EXPECT_FALSE(file.isOpen()) << name;
    file = NoHandle;
    EXPECT_NE(createNamed(name, file), 0);
    EXPECT_FALSE(file.isOpen()) << name;
  }
}

TEST_F(HostTest, RefusesNamesThatAreTooLong) {
  const std::string name = at(std::string(256, 'x'));
  FileHandle file;
  FileStatus status;
  std::vector<std::string> names;
  EXPECT_EQ(m_Host.openForReading(name.c_str(), file), ENAMETOOLONG);
  EXPECT_EQ(m_Host.openForWriting(name.c_str(), file), ENAMETOOLONG);
  EXPECT_EQ(createNamed(name, file), ENAMETOOLONG);
  EXPECT_EQ(m_Host.status(name.c_str(), status), ENAMETOOLONG);
  EXPECT_EQ(m_Host.listDirectory(name.c_str(), names), ENAMETOOLONG);
  EXPECT_EQ(m_Host.remove(name.c_str()), ENAMETOOLONG);
  EXPECT_EQ(m_Host.openForWriting(at(std::string(255, 'x')).c_str(), file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, FailsOnNamesAndHandlesThatAreNot) {
  FileStatus status;
  EXPECT_EQ(m_Host.rename(at("gone").c_str(), at("x").c_str()), ENOENT);
  EXPECT_EQ(m_Host.renameNew(at("gone").c_str(), at("x").c_str()), ENOENT);
  EXPECT_EQ(m_Host.remove(at("gone").c_str()), ENOENT);
  EXPECT_EQ(m_Host.remove(getFolder().c_str()), EISDIR);
  EXPECT_TRUE(fs::exists(m_Folder));
  EXPECT_EQ(m_Host.status(at("gone").c_str(), status), ENOENT);
  EXPECT_EQ(m_Host.close(NoHandle), EBADF);
  EXPECT_EQ(m_Host.write(NoHandle, bytesOf("x")), EBADF);
  EXPECT_EQ(m_Host.lock(NoHandle), EBADF);
  EXPECT_EQ(m_Host.statusOf(NoHandle, status), EBADF);
  EXPECT_EQ(status.kind, FileKind::Nothing);
  m_Host.setPermissions(NoHandle, 0600);
  m_Host.setTimes(NoHandle, 0);
}

TEST_F(HostTest, ReportsTheReadOfADirectory) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForReading(getFolder().c_str(), file), 0);
  std::array<uint8_t, 4> bytes;
  size_t done = 99;
  EXPECT_EQ(m_Host.readAt(file, bytes, 0, done), EISDIR);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
  ASSERT_EQ(m_Host.openSequential(getFolder().c_str(), file), 0);
  EXPECT_EQ(m_Host.readNext(file, bytes, done), EISDIR);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, WritesAllBytes) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("a\nc")), 0);
  EXPECT_EQ(m_Host.write(file, {}), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("def")), 0);
  EXPECT_EQ(m_Host.flush(file), 0);
  EXPECT_EQ(m_Host.flushToDisk(file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(read("file"), "a\ncdef");
}

TEST_F(HostTest, EmptiesAFileThatIsOpenedForWriting) {
  make("file", "old text");
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(read("file"), "");
}

TEST_F(HostTest, MakesATemporaryOnlyWhereNothingIs) {
  make("file", "somebody's");
  fs::create_directory(pathOf("dir"));
  FileHandle file;
  EXPECT_EQ(createNamed(at("file"), file), EEXIST);
  EXPECT_EQ(createNamed(at("dir"), file), EEXIST);
  EXPECT_EQ(read("file"), "somebody's");
  ASSERT_EQ(createNamed(at("new"), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(read("new"), "text");
  EXPECT_EQ(m_Host.remove(at("new").c_str()), 0);
}

// Whatever it was in between: when it is whole others find it.
TEST_F(HostTest, GivesATemporaryItsName) {
  TemporaryFile file;
  ASSERT_EQ(m_Host.createTemporary(at("new").c_str(), 0600, file), 0);
  EXPECT_EQ(leaves().size(), file.hasName ? 1U : 0U);
  EXPECT_EQ(m_Host.write(file.handle, bytesOf("text")), 0);
  EXPECT_EQ(m_Host.giveName(file, at("new").c_str()), 0);
  EXPECT_TRUE(file.hasName);
  EXPECT_EQ(m_Host.close(file.handle), 0);
  EXPECT_EQ(read("new"), "text");
  EXPECT_EQ(m_Host.rename(at("new").c_str(), at("old").c_str()), 0);
  EXPECT_THAT(leaves(), testing::ElementsAre("old"));
}

TEST_F(HostTest, KeepsAFileThatIsWhole) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
  EXPECT_EQ(m_Host.endWriting(file, at("file").c_str(), true), 0);
  EXPECT_EQ(read("file"), "text");
  m_Host.removeUnfinished();
  EXPECT_THAT(leaves(), testing::ElementsAre("file"));
}

TEST_F(HostTest, RemovesAFileThatIsNotWhole) {
  make("file", "old text");
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("te")), 0);
  EXPECT_EQ(m_Host.endWriting(file, at("file").c_str(), false), 0);
  EXPECT_THAT(leaves(), testing::IsEmpty());
}

TEST_F(HostTest, RemovesWhatIsUnfinishedWhereTheProcessEnds) {
  FileHandle temporary;
  FileHandle output;
  ASSERT_EQ(createNamed(at("temporary"), temporary), 0);
  ASSERT_EQ(m_Host.openForWriting(at("output").c_str(), output), 0);
  m_Host.removeUnfinished();
  EXPECT_EQ(m_Host.close(temporary), 0);
  EXPECT_EQ(m_Host.close(output), 0);
  EXPECT_THAT(leaves(), testing::IsEmpty());
}

TEST_F(HostTest, FindsANameForATemporaryByItself) {
  testsupport::setTemporaryPlace(getFolder().c_str());
  std::string first;
  std::string second;
  FileHandle file;
  EXPECT_EQ(m_Host.createUnnamedTemporary(first, file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
  EXPECT_EQ(readAt(file, 0), "text");
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(m_Host.createUnnamedTemporary(second, file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_NE(first, second);
  EXPECT_EQ(pathFrom(first).parent_path(), m_Folder);
  EXPECT_EQ(m_Host.remove(first.c_str()), 0);
  EXPECT_EQ(m_Host.remove(second.c_str()), 0);
  testsupport::setTemporaryPlace(at("no/such/place").c_str());
  EXPECT_EQ(m_Host.createUnnamedTemporary(first, file), ENOENT);
  EXPECT_FALSE(file.isOpen());
  fs::create_directory(pathOf(Japanese));
  testsupport::setTemporaryPlace(at(Japanese).c_str());
  EXPECT_EQ(m_Host.createUnnamedTemporary(first, file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(pathFrom(first).parent_path(), pathOf(Japanese));
  EXPECT_EQ(m_Host.remove(first.c_str()), 0);
  testsupport::setTemporaryPlace(nullptr);
}

TEST_F(HostTest, WorksWithMoreTemporariesThanItCanRemember) {
  for (int i = 0; i < 40; ++i) {
    FileHandle file;
    ASSERT_EQ(createNamed(at(std::to_string(i)), file), 0);
    EXPECT_EQ(m_Host.close(file), 0);
  }
  for (int i = 0; i < 40; ++i)
    EXPECT_EQ(m_Host.remove(at(std::to_string(i)).c_str()), 0);
  EXPECT_TRUE(leaves().empty());
}

TEST_F(HostTest, PutsOneFileInThePlaceOfAnother) {
  make("old", "old");
  make("new", "new");
  EXPECT_EQ(m_Host.rename(at("new").c_str(), at("old").c_str()), 0);
  EXPECT_EQ(read("old"), "new");
  EXPECT_EQ(m_Host.rename(at("old").c_str(), at("other").c_str()), 0);
  EXPECT_THAT(leaves(), testing::ElementsAre("other"));
}

TEST_F(HostTest, ReplacesNoDirectory) {
  make("file", "text");
  fs::create_directory(pathOf("dir"));
  EXPECT_EQ(m_Host.rename(at("file").c_str(), at("dir").c_str()), EISDIR);
  EXPECT_EQ(m_Host.renameNew(at("file").c_str(), at("dir").c_str()), EEXIST);
  EXPECT_THAT(leaves(), testing::ElementsAre("dir", "file"));
}

TEST_F(HostTest, GivesAFileANameThatMustBeNew) {
  make("old", "old");
  make("new", "new");
  EXPECT_EQ(m_Host.renameNew(at("new").c_str(), at("old").c_str()), EEXIST);
  EXPECT_EQ(read("old"), "old");
  EXPECT_EQ(m_Host.renameNew(at("new").c_str(), at("other").c_str()), 0);
  EXPECT_EQ(read("other"), "new");
  EXPECT_THAT(leaves(), testing::ElementsAre("old", "other"));
}

TEST_F(HostTest, KeepsWhatIsOpenWhenItsNameGoes) {
  make("replaced", "old 1");
  make("removed", "old 2");
  make("new", "new");
  FileHandle replaced;
  FileHandle removed;
  ASSERT_EQ(m_Host.openForReading(at("replaced").c_str(), replaced), 0);
  ASSERT_EQ(m_Host.openForReading(at("removed").c_str(), removed), 0);
  const HostError renameError = m_Host.rename(at("new").c_str(), at("replaced").c_str());
  EXPECT_THAT(renameError, testing::AnyOf(0, EBUSY));
  EXPECT_EQ(m_Host.remove(at("removed").c_str()), 0);
  EXPECT_EQ(readAt(replaced, 1), "ld 1");
  EXPECT_EQ(readAt(removed, 1), "ld 2");
  EXPECT_EQ(m_Host.close(replaced), 0);
  EXPECT_EQ(m_Host.close(removed), 0);
  // Where it could not be replaced while it was open, it can be now.
  if (renameError != 0) {
    EXPECT_EQ(m_Host.rename(at("new").c_str(), at("replaced").c_str()), 0);
  }
  EXPECT_EQ(read("replaced"), "new");
  EXPECT_THAT(leaves(), testing::ElementsAre("replaced"));
}

TEST_F(HostTest, SharesAFileWithWhoWritesToIt) {
  FileHandle writer;
  FileHandle reader;
  FileHandle updater;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), writer), 0);
  ASSERT_EQ(m_Host.openForReading(at("file").c_str(), reader), 0);
  ASSERT_EQ(m_Host.openForUpdate(at("file").c_str(), updater), 0);
  EXPECT_EQ(m_Host.write(writer, bytesOf("text")), 0);
  EXPECT_EQ(readAt(reader, 0), "text");
  EXPECT_EQ(readAt(updater, 1), "ext");
  for (const FileHandle file : {writer, reader, updater})
    EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, TellsWhatAFileIs) {
  make("file", "12345");
  fs::create_directory(pathOf("dir"));
  fs::create_hard_link(pathOf("file"), pathOf("second name"));
  make("other", "12345");
  FileStatus status;
  FileStatus other;
  ASSERT_EQ(m_Host.status(at("file").c_str(), status), 0);
  EXPECT_EQ(status.kind, FileKind::RegularFile);
  EXPECT_EQ(status.size, 5);
  EXPECT_EQ(status.mode & KindBits, 0100000u);
  EXPECT_NEAR(static_cast<double>(status.modificationTime), static_cast<double>(time(nullptr)), 60);
  EXPECT_LT(status.modificationNanoseconds, 1'000'000'000u);
  ASSERT_EQ(m_Host.status(at("second name").c_str(), other), 0);
  EXPECT_TRUE(other.isSameFile(status));
  ASSERT_EQ(m_Host.status(at("other").c_str(), other), 0);
  EXPECT_FALSE(other.isSameFile(status));
  FileHandle file;
  ASSERT_EQ(m_Host.openForReading(at("file").c_str(), file), 0);
  ASSERT_EQ(m_Host.statusOf(file, other), 0);
  EXPECT_TRUE(other.isSameFile(status));
  EXPECT_EQ(other.mode, status.mode);
  EXPECT_EQ(other.modificationTime, status.modificationTime);
  EXPECT_EQ(other.modificationNanoseconds, status.modificationNanoseconds);
  EXPECT_EQ(m_Host.close(file), 0);
  ASSERT_EQ(m_Host.status(at("dir").c_str(), status), 0);
  EXPECT_EQ(status.kind, FileKind::Directory);
  EXPECT_EQ(status.mode & KindBits, 0040000u);
}

TEST_F(HostTest, TellsWhatAFileWillBeWhenItIsClosed) {
  FileHandle file;
  ASSERT_EQ(createNamed(at("file"), file), 0);
  ASSERT_EQ(m_Host.write(file, bytesOf("text")), 0);
  std::this_thread::sleep_for(std::chrono::milliseconds(50));
  ASSERT_EQ(m_Host.flush(file), 0);
  FileStatus before;
  FileStatus after;
  ASSERT_EQ(m_Host.statusOf(file, before), 0);
  std::this_thread::sleep_for(std::chrono::milliseconds(50));
  EXPECT_EQ(m_Host.close(file), 0);
  ASSERT_EQ(m_Host.status(at("file").c_str(), after), 0);
  EXPECT_TRUE(after.isSameFile(before));
  EXPECT_EQ(after.size, before.size);
  EXPECT_EQ(after.modificationTime, before.modificationTime);
  EXPECT_EQ(after.modificationNanoseconds, before.modificationNanoseconds);
  EXPECT_EQ(m_Host.remove(at("file").c_str()), 0);
}

TEST_F(HostTest, NothingIsTheSameFileAsNothing) {
  EXPECT_FALSE(FileStatus().isSameFile(FileStatus()));
}

TEST_F(HostTest, AsksWhetherAFileMayBeWritten) {
  make("file", "");
  EXPECT_TRUE(m_Host.isWritable(at("file").c_str()));
  EXPECT_TRUE(m_Host.isWritable(getFolder().c_str()));
  EXPECT_FALSE(m_Host.isWritable(at("gone").c_str()));
  EXPECT_FALSE(m_Host.isWritable(at("file/x").c_str()));
}

TEST_F(HostTest, AsksAlsoWhileTheFileIsInUse) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  EXPECT_TRUE(m_Host.isWritable(at("file").c_str()));
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, TakesTheRightToWriteAndGivesItBack) {
  FileHandle file;
  FileStatus status;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  m_Host.setPermissions(file, 0100444);
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.mode, 0100444u);
  m_Host.setPermissions(file, 0666);
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.mode, 0100666u);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, RemovesAndReplacesWhatMayNotBeWritten) {
  FileHandle file;
  ASSERT_EQ(createNamed(at("file"), file), 0);
  m_Host.setPermissions(file, 0444);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(m_Host.rename(at("file").c_str(), at("renamed").c_str()), 0);
  EXPECT_EQ(m_Host.remove(at("renamed").c_str()), 0);
  EXPECT_TRUE(leaves().empty());
}

TEST_F(HostTest, SetsTimes) {
  FileHandle file;
  FileStatus status;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  for (const int64_t seconds :
       {int64_t{0}, int64_t{1}, int64_t{1'000'000'000}, int64_t{0x7FFFFFFF}}) {
    m_Host.setTimes(file, seconds);
    ASSERT_EQ(m_Host.statusOf(file, status), 0);
    EXPECT_EQ(status.modificationTime, seconds);
    EXPECT_EQ(status.modificationNanoseconds, 0u);
  }
  EXPECT_EQ(m_Host.close(file), 0);
  ASSERT_EQ(m_Host.status(at("file").c_str(), status), 0);
  EXPECT_EQ(status.modificationTime, 0x7FFFFFFF);
}

TEST_F(HostTest, SurvivesTimesThatNoFileHas) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  for (const int64_t seconds :
       {INT64_MIN, int64_t{-11'644'473'601}, int64_t{999'999'999'999}, INT64_MAX})
    m_Host.setTimes(file, seconds);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, TellsTimesBefore1970) {
  FileHandle file;
  FileStatus status;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  m_Host.setTimes(file, -86400);
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.modificationTime, -86400);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(HostTest, ReturnsANameThatIsNoLink) {
  make("file", "");
  for (const char* leaf : {"file", "gone", "file/x"})
    EXPECT_EQ(m_Host.followLinks(at(leaf).c_str()), at(leaf));
  EXPECT_EQ(m_Host.followLinks("no/such"), "no/such");
  EXPECT_EQ(m_Host.followLinks(""), "");
}

TEST_F(HostTest, ListsADirectoryWithoutItsDots) {
  make("b", "");
  make(".hidden", "");
  make(Japanese, "");
  fs::create_directory(pathOf("dir"));
  std::vector<std::string> names = {"old"};
  EXPECT_EQ(m_Host.listDirectory(getFolder().c_str(), names), 0);
  EXPECT_THAT(names, testing::UnorderedElementsAre("b", ".hidden", "dir", Japanese));
  EXPECT_EQ(m_Host.listDirectory(at("dir").c_str(), names), 0);
  EXPECT_THAT(names, testing::IsEmpty());
  names = {"old"};
  EXPECT_EQ(m_Host.listDirectory(at("gone").c_str(), names), ENOENT);
  EXPECT_THAT(names, testing::IsEmpty());
  EXPECT_EQ(m_Host.listDirectory(at("b").c_str(), names), ENOTDIR);
}

TEST_F(HostTest, FindsNamesByAPattern) {
  for (const char* leaf : {"b.o", "a.o", "c.obj", "x"})
    make(leaf, "");
  make(Japanese, "");
  std::vector<std::string> names = {"old"};
  EXPECT_EQ(m_Host.findNames(getFolder() + "/", "?.o", names), 0);
  EXPECT_THAT(names, testing::ElementsAre("a.o", "b.o"));
  EXPECT_EQ(m_Host.findNames(getFolder() + "/", "x", names), 0);
  EXPECT_THAT(names, testing::ElementsAre("x"));
  EXPECT_EQ(m_Host.findNames(getFolder() + "/", "\xE8\xA1\xA8*.o", names), 0);
  EXPECT_THAT(names, testing::ElementsAre(Japanese));
}

TEST_F(HostTest, FindsNothingWithoutAFailure) {
  make("file", "");
  std::vector<std::string> names = {"old"};
  EXPECT_EQ(m_Host.findNames(getFolder() + "/", "*.o", names), 0);
  EXPECT_THAT(names, testing::IsEmpty());
  EXPECT_EQ(m_Host.findNames(at("gone") + "/", "*", names), ENOENT);
  EXPECT_EQ(m_Host.findNames(at("file") + "/", "*", names), ENOTDIR);
}

TEST_F(HostTest, TakesAnyNameThatIsUtf8) {
  for (const std::string& leaf : {Japanese, std::string("caf\xC3\xA9"),
                                  std::string("\xF0\x9F\x98\x80.a"), std::string("a  b")}) {
    FileHandle file;
    FileStatus status;
    ASSERT_EQ(createNamed(at(leaf), file), 0);
    EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
    EXPECT_EQ(m_Host.close(file), 0);
    EXPECT_EQ(read(leaf), "text");
    EXPECT_EQ(m_Host.status(at(leaf).c_str(), status), 0);
    EXPECT_TRUE(m_Host.isWritable(at(leaf).c_str()));
    EXPECT_EQ(m_Host.rename(at(leaf).c_str(), at("plain").c_str()), 0);
    EXPECT_EQ(m_Host.renameNew(at("plain").c_str(), at(leaf).c_str()), 0);
    EXPECT_THAT(leaves(), testing::ElementsAre(leaf));
    EXPECT_EQ(m_Host.remove(at(leaf).c_str()), 0);
  }
}

TEST_F(HostTest, PausesAsLongAsItSays) {
  const auto before = std::chrono::steady_clock::now();
  m_Host.pause(30);
  EXPECT_GE(std::chrono::steady_clock::now() - before, std::chrono::milliseconds(25));
}

namespace {

constexpr int GotTheLock = 0;
constexpr int GotAnError = 1;
constexpr int StillWaits = 7;

[[noreturn]] void tryToLock(Host& host, const std::string& name) {
  FileHandle file;
  if (host.openForUpdate(name.c_str(), file) != 0) std::_Exit(GotAnError);
  std::thread([] {
    std::this_thread::sleep_for(std::chrono::milliseconds(300));
    std::_Exit(StillWaits);
  }).detach();
  std::_Exit(host.lock(file) == 0 ? GotTheLock : GotAnError);
}

} // namespace

TEST_F(HostTest, LetsProcessesWaitForALock) {
  make("file", "text");
  FileHandle file;
  FileHandle reader;
  ASSERT_EQ(m_Host.openForUpdate(at("file").c_str(), file), 0);
  if (!m_IsBegunAnew) {
    ASSERT_EQ(m_Host.lock(file), 0);
  }
  EXPECT_EXIT(tryToLock(m_Host, at("file")), testing::ExitedWithCode(StillWaits), "");
  // The lock belongs to the opening, and keeps nobody from reading.
  ASSERT_EQ(m_Host.openForReading(at("file").c_str(), reader), 0);
  EXPECT_EQ(readAt(reader, 0), "text");
  EXPECT_EQ(m_Host.close(reader), 0);
  EXPECT_EXIT(tryToLock(m_Host, at("file")), testing::ExitedWithCode(StillWaits), "");
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EXIT(tryToLock(m_Host, at("file")), testing::ExitedWithCode(GotTheLock), "");
}

TEST_F(HostTest, ReplacesAFileThatIsLocked) {
  make("file", "old");
  make("new", "new");
  FileHandle file;
  ASSERT_EQ(m_Host.openForUpdate(at("file").c_str(), file), 0);
  ASSERT_EQ(m_Host.lock(file), 0);
  EXPECT_THAT(m_Host.rename(at("new").c_str(), at("file").c_str()), testing::AnyOf(0, EBUSY));
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST(HostErrorText, IsTheSameOnEveryHost) {
  const struct {
    HostError error;
    const char* text;
  } rows[] = {
      {EPERM, "Operation not permitted"},
      {ENOENT, "No such file or directory"},
      {EIO, "Input/output error"},
      {ENXIO, "No such device or address"},
      {EBADF, "Bad file descriptor"},
      {ENOMEM, "Cannot allocate memory"},
      {EACCES, "Permission denied"},
      {EBUSY, "Device or resource busy"},
      {EEXIST, "File exists"},
      {EXDEV, "Invalid cross-device link"},
      {ENOTDIR, "Not a directory"},
      {EISDIR, "Is a directory"},
      {EINVAL, "Invalid argument"},
      {ENFILE, "Too many open files in system"},
      {EMFILE, "Too many open files"},
      {EFBIG, "File too large"},
      {ENOSPC, "No space left on device"},
      {EROFS, "Read-only file system"},
      {EPIPE, "Broken pipe"},
      {ENAMETOOLONG, "File name too long"},
      {ENOSYS, "Function not implemented"},
      {EOVERFLOW, "Value too large for defined data type"},
      {ELOOP, "Too many levels of symbolic links"},
      {EILSEQ, "Invalid or incomplete multibyte or wide character"},
      {FileHasChanged, "Stale file handle"},
      {9999, "Unknown error 9999"},
  };
  for (const auto& row : rows)
    EXPECT_EQ(hostErrorText(row.error), row.text) << row.error;
}

} // namespace support
