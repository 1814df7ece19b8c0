// SPDX-License-Identifier: Apache-2.0
//
// A host in memory whose files lie elsewhere than their names say. Each call is made with such a
// name, and must come to the file; the names that come back must be good for another call.

#include "support/interface/converting_host.h"

#include "support/interface/host_files.h"
#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <cerrno>

namespace support {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

// "/m/a" is "disk/a"; other names are the host's own.
std::string convertMount(std::string_view name) {
  return name.starts_with("/m/") ? "disk/" + std::string(name.substr(3)) : std::string(name);
}

class ConvertingHostTest : public testing::Test {
protected:
  ConvertingHostTest() {
    m_Disk.addDirectory("disk");
    m_Disk.addFile("disk/a", "text");
  }

  std::string textOf(FileHandle file) {
    std::array<uint8_t, 100> bytes;
    size_t done = 0;
    EXPECT_EQ(m_Host.readAt(file, bytes, 0, done), 0);
    return {bytes.begin(), bytes.begin() + static_cast<ptrdiff_t>(done)};
  }
  void writeTo(FileHandle file) {
    const std::array<uint8_t, 3> bytes = {'n', 'e', 'w'};
    EXPECT_EQ(m_Host.write(file, bytes), 0);
    EXPECT_EQ(m_Host.flush(file), 0);
    EXPECT_EQ(m_Host.flushToDisk(file), 0);
    EXPECT_EQ(m_Host.close(file), 0);
  }

  testsupport::MemoryHost m_Disk;
  ConvertingHost m_Host{m_Disk, convertMount};
  FileHandle m_File;
};

} // namespace

TEST_F(ConvertingHostTest, OpensForReading) {
  ASSERT_EQ(m_Host.openForReading("/m/a", m_File), 0);
  EXPECT_EQ(textOf(m_File), "text");
}

TEST_F(ConvertingHostTest, OpensForUpdateAndLocks) {
  ASSERT_EQ(m_Host.openForUpdate("/m/a", m_File), 0);
  m_Disk.setLocks([] { return ENOSYS; });
  EXPECT_EQ(m_Host.lock(m_File), ENOSYS);
}

TEST_F(ConvertingHostTest, ReadsFromBeginningToEnd) {
  ASSERT_EQ(m_Host.openSequential("/m/a", m_File), 0);
  std::array<uint8_t, 3> bytes;
  size_t done = 0;
  EXPECT_EQ(m_Host.readNext(m_File, bytes, done), 0);
  EXPECT_EQ(done, 3U);
  EXPECT_EQ(m_Host.readNext(m_File, bytes, done), 0);
  EXPECT_EQ(done, 1U);
}

TEST_F(ConvertingHostTest, OpensForWriting) {
  ASSERT_EQ(m_Host.openForWriting("/m/new", m_File), 0);
  writeTo(m_File);
  EXPECT_EQ(m_Disk.read("disk/new"), "new");
}

TEST_F(ConvertingHostTest, RemovesWhatIsNotWhole) {
  ASSERT_EQ(m_Host.openForWriting("/m/new", m_File), 0);
  EXPECT_EQ(m_Host.endWriting(m_File, "/m/new", false), 0);
  EXPECT_FALSE(m_Disk.has("disk/new"));
}

TEST_F(ConvertingHostTest, PutsATemporaryInTheFilesPlace) {
  m_Disk.hideTemporaries();
  TemporaryFile temporary;
  ASSERT_EQ(m_Host.createTemporary("/m/new", 0666, temporary), 0);
  ASSERT_EQ(m_Host.giveName(temporary, "/m/new"), 0);
  m_File = temporary.handle;
  FileStatus model;
  model.mode = 0100600;
  m_Host.copyProtection("/m/a", model, m_File);
  m_Host.setTimes(m_File, 77);
  writeTo(m_File);
  EXPECT_EQ(m_Host.rename("/m/new", "/m/a"), 0);
  EXPECT_EQ(m_Disk.read("disk/a"), "new");
  EXPECT_EQ(m_Disk.at("disk/a").mode & 0777U, 0600U);
  EXPECT_FALSE(m_Disk.has("disk/new"));
}

TEST_F(ConvertingHostTest, PutsNothingInThePlaceOfAnother) {
  m_Disk.addFile("disk/b", "");
  EXPECT_EQ(m_Host.renameNew("/m/a", "/m/b"), EEXIST);
  EXPECT_EQ(m_Host.renameNew("/m/a", "/m/c"), 0);
  EXPECT_EQ(m_Disk.read("disk/c"), "text");
}

TEST_F(ConvertingHostTest, LeavesTheHostItsOwnTemporaries) {
  std::string name;
  ASSERT_EQ(m_Host.createUnnamedTemporary(name, m_File), 0);
  EXPECT_TRUE(m_Disk.has(name));
  EXPECT_EQ(m_Host.remove(name.c_str()), 0);
  EXPECT_FALSE(m_Disk.has(name));
}

TEST_F(ConvertingHostTest, Removes) {
  EXPECT_EQ(m_Host.remove("/m/a"), 0);
  EXPECT_FALSE(m_Disk.has("disk/a"));
}

TEST_F(ConvertingHostTest, TellsWhatAFileIs) {
  FileStatus byName;
  FileStatus byHandle;
  ASSERT_EQ(m_Host.status("/m/a", byName), 0);
  ASSERT_EQ(m_Host.openForReading("/m/a", m_File), 0);
  ASSERT_EQ(m_Host.statusOf(m_File, byHandle), 0);
  EXPECT_EQ(byName.size, 4);
  EXPECT_TRUE(byName.isSameFile(byHandle));
}

TEST_F(ConvertingHostTest, TellsWhetherAFileCanBeWritten) {
  EXPECT_TRUE(m_Host.isWritable("/m/a"));
  m_Disk.at("disk/a").isReadOnly = true;
  EXPECT_FALSE(m_Host.isWritable("/m/a"));
}

TEST_F(ConvertingHostTest, AsksTheHostBehindForItsWays) {
  EXPECT_EQ(m_Host.getPathStyle(), PathStyle_Posix);
  m_Disk.setPathStyle(PathStyle_Windows);
  EXPECT_EQ(m_Host.getPathStyle(), PathStyle_Windows);
  m_Host.pause(12);
  EXPECT_EQ(m_Disk.getTimePaused(), 12U);
}

TEST_F(ConvertingHostTest, CreatesFilesThatAreNotThere) {
  FileHandle file;
  ASSERT_EQ(m_Host.createForWriting("/m/new", file), 0);
  EXPECT_EQ(m_Host.endWriting(file, "/m/new", true), 0);
  EXPECT_TRUE(m_Disk.has("disk/new"));
  EXPECT_EQ(m_Host.createForWriting("/m/new", file), EEXIST);
}

TEST_F(ConvertingHostTest, SetsPermissionsOfAnOpenFile) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting("/m/new", file), 0);
  m_Host.setPermissions(file, 0100600);
  EXPECT_EQ(m_Host.endWriting(file, "/m/new", true), 0);
  EXPECT_EQ(m_Disk.at("disk/new").mode & 0777, 0600U);
}

TEST_F(ConvertingHostTest, HasTheHostBehindRemoveWhatIsUnfinished) {
  class Counting final : public testsupport::FaultyHost {
  public:
    using FaultyHost::FaultyHost;
    void removeUnfinished() override { ++m_Times; }
    int m_Times = 0;
  } behind(m_Disk);
  ConvertingHost(behind, [](std::string_view name) {
    return std::string(name);
  }).removeUnfinished();
  EXPECT_EQ(behind.m_Times, 1);
}

TEST_F(ConvertingHostTest, FollowsLinks) {
  m_Disk.addLink("disk/link", "disk/a");
  EXPECT_EQ(m_Host.followLinks("/m/link"), "disk/a");
  EXPECT_EQ(m_Host.followLinks("/m/a"), "/m/a");
}

TEST_F(ConvertingHostTest, ListsDirectories) {
  m_Disk.addFile("disk/b", "");
  std::vector<std::string> names;
  EXPECT_EQ(m_Host.listDirectory("/m/", names), 0);
  EXPECT_THAT(names, UnorderedElementsAre("a", "b"));
}

TEST_F(ConvertingHostTest, FindsNames) {
  m_Disk.addFile("disk/b.o", "");
  m_Disk.addFile("disk/a.o", "");
  std::vector<std::string> names;
  EXPECT_EQ(m_Host.findNames("/m/", "*.o", names), 0);
  EXPECT_THAT(names, ElementsAre("a.o", "b.o"));
  EXPECT_THAT(wildcardSearch(m_Host, "/m/", "*.c"), IsEmpty());
}

// Only a converter knows where a folder lies that a pattern begins with.
TEST_F(ConvertingHostTest, ConvertsAPatternAsAWhole) {
  std::vector<std::string> asked;
  ConvertingHost host(m_Disk, [&asked](std::string_view name) {
    asked.emplace_back(name);
    return "disk/" + std::string(name.substr(1));
  });
  std::vector<std::string> names;
  EXPECT_EQ(host.findNames("/", "?", names), 0);
  EXPECT_THAT(asked, ElementsAre("/?"));
  EXPECT_THAT(names, ElementsAre("a"));
}

} // namespace support
