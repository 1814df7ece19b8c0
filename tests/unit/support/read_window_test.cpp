// SPDX-License-Identifier: Apache-2.0
//
// Reading ahead: what is asked of the file, and how often. The file is on a host in memory that
// counts its reads; bytes must be the same in whatever order they are looked at, and an error must
// leave nothing behind that looks like bytes.

#include "support/interface/read_window.h"

#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <string>

namespace support {

namespace {

class ReadWindowTest : public testing::Test {
protected:
  void SetUp() override {
    for (size_t i = 0; i < 200'000; ++i)
      m_Bytes += static_cast<char>(i ^ (i >> 8));
    m_Disk.addFile("file", m_Bytes);
    ASSERT_EQ(m_Files.open("file", m_File), 0);
    m_Window.setFile(m_File.get());
    m_Host.failCall(0, 0);
  }

  std::string fetch(uint64_t offset, size_t size) {
    const std::span<const uint8_t> bytes = m_Window.fetch(offset, size, m_Error);
    return {bytes.begin(), bytes.end()};
  }

  testsupport::MemoryHost m_Disk;
  testsupport::FaultyHost m_Host{m_Disk};
  SourceFiles m_Files{m_Host};
  std::string m_Bytes;
  std::shared_ptr<SourceFile> m_File;
  ReadWindow m_Window;
  HostError m_Error = 0;
};

} // namespace

TEST_F(ReadWindowTest, AWalkThroughManySmallPiecesTakesFewReads) {
  for (size_t offset = 0; offset + 3000 <= m_Bytes.size(); offset += 3060)
    ASSERT_EQ(fetch(offset, 3000), m_Bytes.substr(offset, 3000));
  EXPECT_LE(m_Host.getCallCount(), 8u);
}

TEST_F(ReadWindowTest, PiecesMayComeInAnyOrder) {
  for (const size_t offset : {150'000u, 10u, 199'000u, 0u, 10u, 32'700u, 32'900u, 150'000u})
    EXPECT_EQ(fetch(offset, 900), m_Bytes.substr(offset, 900));
}

TEST_F(ReadWindowTest, APieceMayBeLargerThanWhatIsReadAhead) {
  EXPECT_EQ(fetch(1, 150'000), m_Bytes.substr(1, 150'000));
  EXPECT_EQ(fetch(150'001, 10), m_Bytes.substr(150'001, 10));
}

TEST_F(ReadWindowTest, NothingIsReadBehindTheEnd) {
  m_Disk.addFile("small", "12345");
  std::shared_ptr<SourceFile> small;
  ASSERT_EQ(m_Files.open("small", small), 0);
  m_Window.setFile(small.get());
  m_Host.failCall(0, 0);
  EXPECT_EQ(fetch(0, 5), "12345");
  EXPECT_EQ(fetch(3, 2), "45");
  EXPECT_EQ(m_Host.getCallCount(), 1u);
  EXPECT_EQ(fetch(3, 10), "45") << "fewer bytes where the file ends";
  EXPECT_EQ(fetch(5, 1), "");
  EXPECT_EQ(fetch(UINT64_MAX - 10, 5), "");
  EXPECT_EQ(m_Error, 0);
}

TEST_F(ReadWindowTest, AnErrorIsToldAndLeavesNothingBehind) {
  m_Host.failCall(1, EIO);
  EXPECT_EQ(fetch(0, 5), "");
  EXPECT_EQ(m_Error, EIO);
  EXPECT_EQ(fetch(0, 5), m_Bytes.substr(0, 5));
  EXPECT_EQ(m_Error, 0);
}

TEST_F(ReadWindowTest, AnotherFileHasItsOwnBytes) {
  EXPECT_EQ(fetch(0, 3), m_Bytes.substr(0, 3));
  m_Disk.addFile("other", "other bytes");
  std::shared_ptr<SourceFile> other;
  ASSERT_EQ(m_Files.open("other", other), 0);
  m_Window.setFile(other.get());
  EXPECT_EQ(fetch(0, 5), "other");
}

} // namespace support
