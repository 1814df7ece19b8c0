// SPDX-License-Identifier: Apache-2.0
//
// The one look at a file that decides whether and as what it is taken: an archive by its magic, an
// object by its first bytes, and nothing that is no regular file. The file that was looked at is
// the one that is used.

#include "arlib/interface/file_probe.h"

#include "tests/support/faulty_host.h"
#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

namespace {

FileProbe probe(MemoryHost& host, const char* fileName) {
  support::SourceFiles files(host);
  return probeFile(files, fileName);
}

} // namespace

TEST(FileProbeTest, TellsArchivesByTheirMagic) {
  MemoryHost host;
  host.addFile("lib.a", "!<arch>\n");
  host.addFile("short", "!<arch>");
  host.addFile("other", "!<thin>\nmore");
  EXPECT_TRUE(probe(host, "lib.a").hasArchiveMagic());
  EXPECT_FALSE(probe(host, "short").hasArchiveMagic());
  EXPECT_FALSE(probe(host, "other").hasArchiveMagic());
}

TEST(FileProbeTest, TakesTheFirstBytesOfRegularFilesOnly) {
  MemoryHost host;
  host.addFile("file", std::string(100, 'x'));
  host.addSpecial("fifo").bytes = "never looked at";
  EXPECT_EQ(probe(host, "file").getFirstBytes().size(), elfext::RecognizedBytes);
  EXPECT_TRUE(probe(host, "file").exists());
  EXPECT_EQ(probe(host, "fifo").getFirstBytes().size(), 0u);
  EXPECT_FALSE(probe(host, "gone").exists());
  EXPECT_EQ(host.openHandles(), 0u);
}

TEST(FileProbeTest, SaysWhyAFileCannotBeTaken) {
  MemoryHost host;
  host.addFile("file", "x");
  host.addFile("big", "x").toldSize = int64_t{1} << 31;
  host.addDirectory("dir");
  host.addSpecial("fifo");
  host.addFile("untold", "x").mode = 0;
  host.addFile("locked", "secret").isUnreadable = true;
  EXPECT_EQ(probe(host, "file").getRefusal(), 0);
  EXPECT_EQ(probe(host, "untold").getRefusal(), EINVAL);
  EXPECT_EQ(probe(host, "big").getRefusal(), EOVERFLOW);
  EXPECT_EQ(probe(host, "dir").getRefusal(), EISDIR);
  EXPECT_EQ(probe(host, "fifo").getRefusal(), EINVAL);
  EXPECT_EQ(probe(host, "gone").getRefusal(), ENOENT);
  EXPECT_EQ(probe(host, "locked").getRefusal(), EACCES);
}

// Of files that are made up as they are read nobody knows the size.
TEST(FileProbeTest, RefusesAFileThatSaysItIsEmptyAndIsNot) {
  MemoryHost host;
  host.addFile("empty", "");
  host.addFile("made up", "x").toldSize = 0;
  EXPECT_EQ(probe(host, "empty").getRefusal(), 0);
  EXPECT_EQ(probe(host, "made up").getRefusal(), EINVAL);
}

// What a file is nobody knows without its bytes. That one of the calls fails which would keep a
// small file in memory only costs the memory.
TEST(FileProbeTest, IsRefusedWhereTheHostFails) {
  MemoryHost host;
  host.addFile("large", std::string(100000, 'x'));
  testsupport::FaultyHost faulty(host);
  const auto probeFailing = [&](uint64_t call) {
    faulty.failCall(call, EIO);
    support::SourceFiles files(faulty);
    return probeFile(files, "large").getRefusal();
  };
  std::vector<std::string> failed;
  for (uint64_t call = 1; probeFailing(call) != 0; ++call)
    failed.push_back(faulty.getFailedOperation());
  EXPECT_THAT(failed, ElementsAre("status", "openForReading", "statusOf", "readAt"));
}

// What is read of it later is read of the file that was looked at.
TEST(FileProbeTest, KeepsTheFileThatItHasLookedAt) {
  MemoryHost host;
  host.addFile("file", "old bytes");
  const FileProbe old = probe(host, "file");
  host.addFile("file", "new");
  EXPECT_EQ(old.status.size, 9);
  std::array<uint8_t, 9> bytes;
  size_t done = 0;
  EXPECT_EQ(old.file->readAt(bytes, 0, done), 0);
  EXPECT_EQ(textOf(bytes), "old bytes");
}

} // namespace arlib
