// SPDX-License-Identifier: Apache-2.0
//
// Questions about files, on a host in memory that lists its folders backwards: answers must not
// depend on the host's order, and a host that can't tell must count as nothing there.

#include "support/interface/host_files.h"

#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>

namespace support {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testsupport::FaultyHost;
using testsupport::MemoryHost;

} // namespace

TEST(HostFiles, TellTheKindOfAName) {
  MemoryHost host;
  host.addFile("file", "");
  host.addDirectory("dir");
  host.addSpecial("fifo");
  host.addLink("dangling", "nowhere");
  EXPECT_EQ(fileKind(host, "file"), FileKind::RegularFile);
  EXPECT_EQ(fileKind(host, "dir"), FileKind::Directory);
  EXPECT_EQ(fileKind(host, "fifo"), FileKind::Special);
  EXPECT_EQ(fileKind(host, "dangling"), FileKind::Nothing);
  EXPECT_EQ(fileKind(host, "gone"), FileKind::Nothing);
}

TEST(HostFiles, CountForNothingWhereTheHostDoesNotTell) {
  MemoryHost disk;
  disk.addFile("file", "");
  FaultyHost host(disk);
  host.failCall(1, EACCES);
  EXPECT_EQ(fileKind(host, "file"), FileKind::Nothing);
  host.failCall(1, EACCES);
  EXPECT_EQ(fileTime(host, "file"), -1);
}

TEST(HostFiles, TakeADriveForAFolderWhereThereAreDrives) {
  MemoryHost host;
  EXPECT_EQ(fileKind(host, "c:"), FileKind::Nothing);
  host.setPathStyle(PathStyle_Windows);
  EXPECT_EQ(fileKind(host, "c:"), FileKind::Directory);
  EXPECT_EQ(fileKind(host, "c:\\"), FileKind::Nothing);
  host.addFile("d:", "");
  EXPECT_EQ(fileKind(host, "d:"), FileKind::RegularFile);
}

TEST(HostFiles, TellTheirTime) {
  MemoryHost host;
  host.addFile("file", "").modificationTime = 77;
  EXPECT_EQ(fileTime(host, "file"), 77);
  EXPECT_EQ(fileTime(host, "gone"), -1);
}

TEST(HostFiles, KnowTwoWildcards) {
  EXPECT_TRUE(hasWildcard("a*"));
  EXPECT_TRUE(hasWildcard("?"));
  EXPECT_FALSE(hasWildcard("[ab]{c}\\d"));
  EXPECT_FALSE(hasWildcard(""));
}

TEST(HostFiles, SplitAWordAtItsLastSlash) {
  EXPECT_EQ(directoryPart("a/b/*.o"), "a/b/");
  EXPECT_EQ(directoryPart("/x"), "/");
  EXPECT_EQ(directoryPart("a\\b"), "");
  EXPECT_EQ(directoryPart("x"), "");
}

TEST(WildcardSearch, SortsByBytesWhateverTheHostsOrder) {
  MemoryHost host;
  for (const char* name : {"b.o", "a.o", "B.o", ".c.o", "z.txt", "\xE9.o"})
    host.addFile(name, "");
  EXPECT_THAT(wildcardSearch(host, "", "*.o"), ElementsAre(".c.o", "B.o", "a.o", "b.o", "\xE9.o"));
}

TEST(WildcardSearch, CountsLetterCase) {
  MemoryHost host;
  host.addFile("a.o", "");
  host.addFile("A.O", "");
  EXPECT_THAT(wildcardSearch(host, "", "a.?"), ElementsAre("a.o"));
}

TEST(WildcardSearch, LooksInOneDirectoryAlone) {
  MemoryHost host;
  host.addFile("x.o", "");
  host.addFile("dir/y.o", "");
  host.addFile("dir/sub/z.o", "");
  host.addDirectory("dir/folder.o");
  EXPECT_THAT(wildcardSearch(host, "dir/", "*.o"), ElementsAre("folder.o", "y.o"));
}

TEST(WildcardSearch, FindsNothingWhereNothingIsOrCanBeListed) {
  MemoryHost disk;
  disk.addFile("x.o", "");
  EXPECT_THAT(wildcardSearch(disk, "", "*.c"), IsEmpty());
  FaultyHost host(disk);
  host.failCall(1, EACCES);
  EXPECT_THAT(wildcardSearch(host, "", "*"), IsEmpty());
}

} // namespace support
