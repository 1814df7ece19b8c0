// SPDX-License-Identifier: Apache-2.0
//
// Via files through the host: in pieces, several at a time, and with the host's failures told.

#include "quarn/host_via_file_reader.h"

#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <string>

namespace quarn {

class HostViaFileReaderTest : public testing::Test {
protected:
  HostViaFileReaderTest() {
    m_Disk.addFile("a.via", "0123456789");
    m_Disk.addFile("b.via", "abc");
    m_Disk.addDirectory("dir");
  }

  std::string read(void* file, size_t size) {
    std::string bytes(size, '\0');
    const ptrdiff_t count = m_Reader.read(file, bytes.data(), size);
    return count < 0 ? "error" : bytes.substr(0, static_cast<size_t>(count));
  }

  testsupport::MemoryHost m_Disk;
  testsupport::FaultyHost m_Host{m_Disk};
  HostViaFileReader m_Reader{m_Host};
};

TEST_F(HostViaFileReaderTest, ReadsSeveralFilesOnFromWhereEachStands) {
  void* first = m_Reader.open("a.via");
  EXPECT_EQ(read(first, 4), "0123");
  void* second = m_Reader.open("b.via");
  EXPECT_EQ(read(second, 8), "abc");
  EXPECT_EQ(read(first, 8), "456789");
  EXPECT_EQ(read(first, 8), "");
  EXPECT_TRUE(m_Reader.close(second));
  EXPECT_TRUE(m_Reader.close(first));
  EXPECT_EQ(m_Disk.openHandles(), 0u);
}

TEST_F(HostViaFileReaderTest, CannotOpenWhatIsNotThere) {
  EXPECT_EQ(m_Reader.open("none"), nullptr);
}

TEST_F(HostViaFileReaderTest, CannotReadADirectory) {
  void* file = m_Reader.open("dir");
  ASSERT_NE(file, nullptr);
  EXPECT_EQ(read(file, 8), "error");
  EXPECT_TRUE(m_Reader.close(file));
}

TEST_F(HostViaFileReaderTest, TellsOfAReadAndOfACloseThatFails) {
  void* file = m_Reader.open("a.via");
  m_Host.failCall(1, EIO);
  EXPECT_EQ(read(file, 4), "error");
  m_Host.failCall(1, EIO);
  EXPECT_FALSE(m_Reader.close(file));
  EXPECT_EQ(m_Disk.openHandles(), 0u);
}

} // namespace quarn
