// SPDX-License-Identifier: Apache-2.0
// The one look at a file that decides whether and as what it is taken.
#include "arlib/interface/file_probe.h"

#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

TEST(FileProbeTest, TellsArchivesByTheirMagic) {
  MemoryHost host;
  host.addFile("lib.a", "!<arch>\n");
  host.addFile("short", "!<arch>");
  host.addFile("other", "!<thin>\nmore");
  EXPECT_TRUE(probeFile(host, "lib.a").hasArchiveMagic());
  EXPECT_FALSE(probeFile(host, "short").hasArchiveMagic());
  EXPECT_FALSE(probeFile(host, "other").hasArchiveMagic());
}

TEST(FileProbeTest, TakesTheFirstBytesOfRegularFilesOnly) {
  MemoryHost host;
  host.addFile("file", std::string(100, 'x'));
  host.addFile("locked", "secret").isUnreadable = true;
  host.addSpecial("fifo").bytes = "never looked at";
  EXPECT_EQ(probeFile(host, "file").firstBytes().size(), elfext::RecognizedBytes);
  EXPECT_TRUE(probeFile(host, "file").exists());
  EXPECT_EQ(probeFile(host, "locked").firstBytes().size(), 0u);
  EXPECT_EQ(probeFile(host, "locked").refusal(), 0);
  EXPECT_EQ(probeFile(host, "fifo").firstBytes().size(), 0u);
  EXPECT_FALSE(probeFile(host, "gone").exists());
  EXPECT_EQ(host.openHandles(), 0u);
}

TEST(FileProbeTest, SaysWhyAFileCannotBeTaken) {
  MemoryHost host;
  host.addFile("file", "x");
  host.addFile("big", "x").toldSize = int64_t{1} << 31;
  host.addDirectory("dir");
  host.addSpecial("fifo");
  EXPECT_EQ(probeFile(host, "file").refusal(), 0);
  EXPECT_EQ(probeFile(host, "big").refusal(), EOVERFLOW);
  EXPECT_EQ(probeFile(host, "dir").refusal(), EISDIR);
  EXPECT_EQ(probeFile(host, "fifo").refusal(), EINVAL);
  EXPECT_EQ(probeFile(host, "gone").refusal(), ENOENT);
}

} // namespace arlib
