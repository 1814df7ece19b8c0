// SPDX-License-Identifier: Apache-2.0
//
// Files that are opened once, whatever their names lead to later: replaced, removed, written to, or
// closed in between because others wanted room. Each must stay the file that it was, or fail with
// ESTALE; the host in memory plays who is at work on them.

#include "support/interface/source_file.h"

#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gtest/gtest.h>

#include <array>
#include <cerrno>

namespace support {

namespace {

class SourceFileTest : public testing::Test {
protected:
  std::shared_ptr<SourceFile> open(const std::string& name, const std::string& bytes) {
    m_Disk.addFile(name, bytes);
    std::shared_ptr<SourceFile> file;
    EXPECT_EQ(m_Files.open(name.c_str(), file), 0);
    return file;
  }

  // The whole file, or the error.
  static std::string textOf(SourceFile& file) {
    std::array<uint8_t, 100> bytes;
    size_t done = 0;
    const HostError error = file.readAt(bytes, 0, done);
    if (error != 0) return "error " + std::to_string(error);
    return {bytes.begin(), bytes.begin() + static_cast<ptrdiff_t>(done)};
  }

  testsupport::MemoryHost m_Disk;
  testsupport::FaultyHost m_Host{m_Disk};
  SourceFiles m_Files{m_Host, 3};
};

const std::string Stale = "error " + std::to_string(FileHasChanged);

} // namespace

TEST_F(SourceFileTest, StaysTheFileThatItWas) {
  const auto file = open("a", "old");
  m_Disk.addFile("a", "new and longer");
  EXPECT_EQ(textOf(*file), "old");
  EXPECT_EQ(file->getStatus().size, 3);
  EXPECT_STREQ(file->getName(), "a");
  EXPECT_EQ(file->checkUnchanged(), 0);
}

TEST_F(SourceFileTest, TellsWhyItCannotBeOpened) {
  std::shared_ptr<SourceFile> file;
  EXPECT_EQ(m_Files.open("gone", file), ENOENT);
  m_Disk.addFile("a", "x");
  m_Host.failCall(2, EIO);
  EXPECT_EQ(m_Files.open("a", file), EIO);
  EXPECT_EQ(m_Host.getFailedOperation(), "statusOf");
  EXPECT_EQ(m_Disk.openHandles(), 0u);
}

TEST_F(SourceFileTest, IsOpenedAgainWhereItHadToMakeRoom) {
  std::vector<std::shared_ptr<SourceFile>> files;
  for (const char* name : {"a", "b", "c", "d", "e"})
    files.push_back(open(name, std::string("in ") + name));
  EXPECT_EQ(m_Disk.openHandles(), 3u);
  for (const auto& file : files)
    EXPECT_EQ(textOf(*file), std::string("in ") + file->getName());
  EXPECT_EQ(m_Disk.openHandles(), 3u);
  files.clear();
  EXPECT_EQ(m_Disk.openHandles(), 0u);
}

TEST_F(SourceFileTest, IsLostWhereItsNameLeadsToAnotherFileByThen) {
  const auto replaced = open("a", "old");
  const auto grown = open("b", "old");
  const auto touched = open("c", "old");
  const auto touchedALittle = open("d", "old");
  const auto removed = open("e", "old");
  for (const auto& file : {replaced, grown, touched, touchedALittle, removed})
    file->close();
  m_Disk.addFile("a", "old");
  m_Disk.at("b").bytes = "older";
  m_Disk.at("c").modificationTime += 1;
  m_Disk.at("d").modificationNanoseconds += 1;
  EXPECT_EQ(m_Disk.remove("e"), 0);
  EXPECT_EQ(textOf(*replaced), Stale);
  EXPECT_EQ(textOf(*grown), Stale);
  EXPECT_EQ(textOf(*touched), Stale);
  EXPECT_EQ(textOf(*touchedALittle), Stale);
  EXPECT_EQ(textOf(*removed), "error " + std::to_string(ENOENT));
  EXPECT_EQ(m_Disk.openHandles(), 0u);
}

TEST_F(SourceFileTest, NoticesThatItWasWrittenTo) {
  const auto file = open("a", "1234");
  EXPECT_EQ(file->checkUnchanged(), 0);
  m_Disk.at("a").bytes = "12345";
  EXPECT_EQ(file->checkUnchanged(), FileHasChanged);
  m_Disk.at("a").bytes = "5678";
  m_Disk.at("a").modificationNanoseconds = 1;
  EXPECT_EQ(file->checkUnchanged(), FileHasChanged);
}

TEST_F(SourceFileTest, MakesRoomWhereTheHostHasNone) {
  const auto file = open("a", "first");
  m_Disk.addFile("b", "second");
  std::shared_ptr<SourceFile> other;
  m_Host.failCall(1, EMFILE);
  EXPECT_EQ(m_Files.open("b", other), 0);
  EXPECT_EQ(m_Disk.openHandles(), 1u);
  EXPECT_EQ(textOf(*file), "first");
  file->close();
  other->close();
  m_Host.failCall(1, ENFILE);
  EXPECT_EQ(textOf(*file), "error " + std::to_string(ENFILE));
}

TEST_F(SourceFileTest, IsKeptOpenWhileItIsLocked) {
  m_Disk.addFile("lib", "locked");
  std::shared_ptr<SourceFile> locked;
  ASSERT_EQ(m_Files.openForUpdate("lib", locked), 0);
  EXPECT_EQ(locked->lock(), 0);
  std::vector<std::shared_ptr<SourceFile>> files;
  for (const char* name : {"a", "b", "c", "d"})
    files.push_back(open(name, "x"));
  EXPECT_EQ(m_Disk.openHandles(), 4u);
  m_Disk.addFile("lib", "another");
  EXPECT_EQ(textOf(*locked), "locked");
}

// Nothing has been read of it before.
TEST_F(SourceFileTest, IsWhatItIsWhenItIsLocked) {
  m_Disk.addFile("lib", "before");
  m_Disk.setLocks([&] {
    m_Disk.at("lib").bytes = "in the meantime";
    m_Disk.at("lib").modificationTime += 1;
    return 0;
  });
  std::shared_ptr<SourceFile> locked;
  ASSERT_EQ(m_Files.openForUpdate("lib", locked), 0);
  EXPECT_EQ(locked->lock(), 0);
  EXPECT_EQ(locked->getStatus().size, 15);
  EXPECT_EQ(locked->checkUnchanged(), 0);
}

TEST_F(SourceFileTest, MakesRoomForOtherFiles) {
  const auto first = open("a", "first");
  const auto second = open("b", "second");
  std::vector<size_t> openHandles;
  const auto lackRoom = [&] {
    openHandles.push_back(m_Disk.openHandles());
    return m_Disk.openHandles() < 2 ? 0 : EMFILE;
  };
  EXPECT_EQ(m_Files.openOther(lackRoom), 0);
  EXPECT_EQ(openHandles, std::vector<size_t>({2, 1}));
  EXPECT_EQ(m_Files.openOther([] { return ENFILE; }), ENFILE);
  EXPECT_EQ(m_Disk.openHandles(), 0u);
  EXPECT_EQ(m_Files.openOther([] { return EIO; }), EIO);
  EXPECT_EQ(textOf(*first), "first");
}

TEST_F(SourceFileTest, MayBeRememberedBeforeItIsOpened) {
  m_Disk.addFile("a", "bytes");
  FileStatus status;
  ASSERT_EQ(m_Disk.status("a", status), 0);
  const auto file = m_Files.remember("a", status);
  EXPECT_EQ(m_Disk.openHandles(), 0u);
  EXPECT_EQ(textOf(*file), "bytes");
  const auto other = m_Files.remember("a", status);
  m_Disk.addFile("a", "bytes");
  EXPECT_EQ(textOf(*other), Stale);
}

TEST_F(SourceFileTest, TellsOfTheFirstFailedCloseOnce) {
  const auto first = open("a", "x");
  const auto second = open("b", "x");
  m_Host.failCall(1, EIO);
  first->close();
  m_Host.failCall(1, ENOSPC);
  second->close();
  std::string name;
  EXPECT_EQ(m_Files.takeCloseError(name), EIO);
  EXPECT_EQ(name, "a");
  EXPECT_EQ(m_Files.takeCloseError(name), 0);
}

TEST_F(SourceFileTest, OutlivesWhatHasOpenedIt) {
  std::shared_ptr<SourceFile> file;
  {
    SourceFiles files(m_Host, 1);
    m_Disk.addFile("a", "x");
    ASSERT_EQ(files.open("a", file), 0);
  }
  EXPECT_EQ(textOf(*file), "x");
  const FileHandle handle = file->giveHandle();
  file.reset();
  EXPECT_EQ(m_Disk.openHandles(), 1u);
  EXPECT_EQ(m_Host.close(handle), 0);
}

// ---- Small files that are kept

TEST_F(SourceFileTest, IsReadOnceAndClosedIfItIsSmall) {
  m_Disk.addFile("a", "small");
  std::shared_ptr<SourceFile> file;
  ASSERT_EQ(m_Files.openToKeep("a", file), 0);
  EXPECT_TRUE(file->isKept());
  EXPECT_EQ(m_Disk.openHandles(), 0u);
  m_Disk.addFile("a", "another");
  EXPECT_EQ(textOf(*file), "small");
  EXPECT_EQ(file->checkUnchanged(), 0);
  EXPECT_EQ(file->getKept().size(), 5u);
  EXPECT_EQ(m_Disk.readCalls(), 1u);
  std::array<uint8_t, 4> bytes;
  size_t done = 0;
  EXPECT_EQ(file->readAt(bytes, 3, done), 0);
  EXPECT_EQ(done, 2u);
  EXPECT_EQ(file->readAt(bytes, UINT64_MAX, done), 0);
  EXPECT_EQ(done, 0u);
}

TEST_F(SourceFileTest, IsKeptOnlyAsLongAsThereIsRoom) {
  m_Files.setMostKept(10);
  m_Disk.addFile("a", "123456");
  m_Disk.addFile("b", "12345");
  m_Disk.addFile("c", "1234");
  std::shared_ptr<SourceFile> first;
  std::shared_ptr<SourceFile> second;
  std::shared_ptr<SourceFile> third;
  ASSERT_EQ(m_Files.openToKeep("a", first), 0);
  ASSERT_EQ(m_Files.openToKeep("b", second), 0);
  ASSERT_EQ(m_Files.openToKeep("c", third), 0);
  EXPECT_TRUE(first->isKept());
  EXPECT_FALSE(second->isKept());
  EXPECT_TRUE(third->isKept());
  EXPECT_EQ(textOf(*second), "12345");
  first.reset();
  ASSERT_EQ(m_Files.openToKeep("b", second), 0);
  EXPECT_TRUE(second->isKept());
}

TEST_F(SourceFileTest, IsNotKeptIfItIsLarge) {
  m_Disk.addFile("a", std::string(SourceFiles::LargestKept + 1, 'x'));
  std::shared_ptr<SourceFile> file;
  ASSERT_EQ(m_Files.openToKeep("a", file), 0);
  EXPECT_FALSE(file->isKept());
  EXPECT_EQ(m_Disk.readCalls(), 0u);
}

// A failure now is nobody's: it shows when the bytes are wanted, if it is still there.
TEST_F(SourceFileTest, IsNotKeptIfItCannotBeReadAsItIs) {
  m_Disk.addFile("a", "small");
  std::shared_ptr<SourceFile> file;
  m_Host.failCall(3, EIO);
  ASSERT_EQ(m_Files.openToKeep("a", file), 0);
  EXPECT_EQ(m_Host.getFailedOperation(), "readAt");
  EXPECT_FALSE(file->isKept());
  m_Host.failCall(0, 0);
  EXPECT_EQ(textOf(*file), "small");
  for (const uint64_t call : {3u, 4u}) {
    file.reset();
    m_Disk.addFile("a", "small");
    m_Host.disturbCall(call, [&] { m_Disk.at("a").bytes = "smaller"; });
    ASSERT_EQ(m_Files.openToKeep("a", file), 0);
    EXPECT_FALSE(file->isKept());
    EXPECT_EQ(file->checkUnchanged(), FileHasChanged);
  }
}

// What is made up as it is read says that it is empty.
TEST_F(SourceFileTest, IsNotKeptIfItHasMoreThanItSays) {
  m_Disk.addFile("a", "small").toldSize = 0;
  m_Disk.addFile("empty", "");
  std::shared_ptr<SourceFile> file;
  std::shared_ptr<SourceFile> empty;
  ASSERT_EQ(m_Files.openToKeep("a", file), 0);
  ASSERT_EQ(m_Files.openToKeep("empty", empty), 0);
  EXPECT_FALSE(file->isKept());
  EXPECT_EQ(textOf(*file), "small");
  EXPECT_TRUE(empty->isKept());
}

} // namespace support
