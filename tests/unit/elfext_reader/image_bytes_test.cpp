// SPDX-License-Identifier: Apache-2.0
//
// The bytes of an image, in memory or in a file: what is read for a look, and when. A small image
// takes one call, of a large one only what is looked at is read, and addresses stay. Bytes outside,
// files that shrink, a host that fails and memory that is not to be had are failures that stay
// failures.

#include "elfext/src/bytes/image_bytes.h"

#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <cstring>

namespace elfext {

namespace {

constexpr uint64_t Large = 0x40000;

std::string pattern(size_t size) {
  std::string bytes(size, '\0');
  for (size_t i = 0; i < size; ++i)
    bytes[i] = static_cast<char>(i * 7 + (i >> 8));
  return bytes;
}

} // namespace

class ImageBytesTest : public testing::Test {
protected:
  // Bytes behind two others.
  support::FileHandle open(const std::string& bytes) {
    m_Bytes = bytes;
    m_Memory.addFile("lib", "::" + bytes + "tail");
    support::FileHandle file;
    EXPECT_EQ(m_Host.openForReading("lib", file), 0);
    return file;
  }

  void expectBytes(ImageBytes& image, uint64_t offset, uint64_t size) {
    const uint8_t* bytes = image.view(offset, size);
    ASSERT_NE(bytes, nullptr);
    EXPECT_EQ(std::memcmp(bytes, m_Bytes.data() + offset, size), 0);
  }

  testsupport::MemoryHost m_Memory;
  testsupport::FaultyHost m_Host{m_Memory};
  std::string m_Bytes;
};

TEST_F(ImageBytesTest, MemoryIsViewedWhereItIs) {
  const uint8_t bytes[] = {1, 2, 3};
  ImageBytes image(bytes);
  EXPECT_TRUE(image.prepare());
  EXPECT_EQ(image.getSize(), 3U);
  EXPECT_EQ(image.view(1, 2), bytes + 1);
  EXPECT_EQ(image.view(3, 0), bytes + 3);
}

TEST_F(ImageBytesTest, BytesOutsideAreAFailure) {
  const uint8_t bytes[] = {1, 2, 3};
  ImageBytes image(bytes);
  EXPECT_TRUE(image.prepare());
  EXPECT_EQ(image.getFailure(), ImageFailure::None);
  for (const auto& [offset, size] : {std::pair<uint64_t, uint64_t>{0, 4},
                                     {4, 0},
                                     {2, 2},
                                     {1, UINT64_MAX},
                                     {UINT64_MAX, 1},
                                     {UINT64_MAX, UINT64_MAX}}) {
    EXPECT_EQ(image.view(offset, size), nullptr);
    EXPECT_EQ(image.getFailure(), ImageFailure::Outside);
  }
}

TEST_F(ImageBytesTest, ASmallImageIsReadInOneCall) {
  ImageBytes image(m_Host, open(pattern(ImageBytes::WholeReadLimit)), 2, ImageBytes::WholeReadLimit,
                   true);
  m_Host.failCall(0, 0);
  EXPECT_TRUE(image.prepare());
  EXPECT_TRUE(image.prepare());
  EXPECT_EQ(m_Host.getCallCount(), 1U);
  expectBytes(image, 0, ImageBytes::WholeReadLimit);
  EXPECT_EQ(m_Host.getCallCount(), 1U);
}

TEST_F(ImageBytesTest, OfALargeImageOnlyTheBlocksThatAreLookedAtAreRead) {
  ImageBytes image(m_Host, open(pattern(Large)), 2, Large, true);
  EXPECT_TRUE(image.prepare());
  EXPECT_EQ(m_Memory.getBytesRead(), 0U);
  expectBytes(image, 0x20010, 16);
  EXPECT_EQ(m_Memory.getBytesRead(), 0x1000U);
  expectBytes(image, 0x20000, 0x1000);
  EXPECT_EQ(m_Memory.getBytesRead(), 0x1000U);
}

TEST_F(ImageBytesTest, BytesKeepTheirAddresses) {
  ImageBytes image(m_Host, open(pattern(Large)), 2, Large, true);
  EXPECT_TRUE(image.prepare());
  const uint8_t* first = image.view(0x10000, 1);
  expectBytes(image, 0, Large);
  EXPECT_EQ(image.view(0x10000, 1), first);
}

TEST_F(ImageBytesTest, LooksInAnyOrderGiveTheSameBytes) {
  ImageBytes image(m_Host, open(pattern(Large - 5)), 2, Large - 5, true);
  EXPECT_TRUE(image.prepare());
  for (uint64_t i = 0; i < 300; ++i) {
    const uint64_t offset = i * 7919 % (Large - 5);
    const uint64_t size = std::min<uint64_t>(i * 131 % 9000, Large - 5 - offset);
    expectBytes(image, offset, size);
  }
  EXPECT_LE(m_Memory.getBytesRead(), Large);
}

TEST_F(ImageBytesTest, MayBeReadToItsEnd) {
  const support::FileHandle file = open(pattern(Large));
  ImageBytes image(m_Host, file, 2, Large, false);
  EXPECT_TRUE(image.prepare());
  expectBytes(image, 0x20010, 16);
  EXPECT_TRUE(image.loadAll());
  EXPECT_EQ(m_Memory.getBytesRead(), Large);
  image.forgetFile();
  EXPECT_EQ(m_Host.close(file), 0);
  expectBytes(image, 0, Large);
  EXPECT_TRUE(image.loadAll());
}

TEST_F(ImageBytesTest, SharesAFileWithOthers) {
  const support::FileHandle handle = open(pattern(Large));
  EXPECT_EQ(m_Host.close(handle), 0);
  support::SourceFiles files(m_Host);
  std::shared_ptr<support::SourceFile> file;
  ASSERT_EQ(files.open("lib", file), 0);
  {
    ImageBytes image(file, 2, Large);
    ImageBytes other(file, 2 + 0x20000, 16);
    file.reset();
    EXPECT_TRUE(image.prepare());
    EXPECT_TRUE(other.prepare());
    m_Memory.addFile("lib", "another file");
    expectBytes(image, 0x20010, 16);
    EXPECT_EQ(m_Memory.openHandles(), 1U);
  }
  EXPECT_EQ(m_Memory.openHandles(), 0U);
}

TEST_F(ImageBytesTest, WhoReadsOnIsReadAheadFor) {
  ImageBytes image(m_Host, open(pattern(Large)), 2, Large, true);
  EXPECT_TRUE(image.prepare());
  m_Host.failCall(0, 0);
  for (uint64_t offset = 0; offset < Large; offset += 0x100)
    expectBytes(image, offset, 0x100);
  EXPECT_LE(m_Host.getCallCount(), 1 + Large / 0x10000 + 1);
}

TEST_F(ImageBytesTest, AHostFailureIsKept) {
  ImageBytes image(m_Host, open(pattern(Large)), 2, Large, true);
  EXPECT_TRUE(image.prepare());
  m_Host.failCall(1, EIO);
  EXPECT_EQ(image.view(0, 16), nullptr);
  EXPECT_EQ(image.getFailure(), ImageFailure::Unreadable);
  EXPECT_EQ(image.getHostError(), EIO);
  // The next look tries again.
  expectBytes(image, 0, 16);
}

TEST_F(ImageBytesTest, AFileThatHasBecomeShorterIsUnreadableWithoutAnErrorNumber) {
  const support::FileHandle file = open(pattern(Large));
  ImageBytes image(m_Host, file, 2, Large, true);
  EXPECT_TRUE(image.prepare());
  m_Memory.at("lib").bytes.resize(0x1000);
  EXPECT_EQ(image.view(0, 0x1000), nullptr);
  EXPECT_EQ(image.getFailure(), ImageFailure::Unreadable);
  EXPECT_EQ(image.getHostError(), 0);
}

TEST_F(ImageBytesTest, MemoryThatIsNotToBeHadIsAFailure) {
  ImageBytes image(m_Host, open("x"), 2, uint64_t{1} << 62, true);
  EXPECT_FALSE(image.prepare());
  EXPECT_EQ(image.getFailure(), ImageFailure::NoMemory);
}

TEST_F(ImageBytesTest, ClosesWhatIsItsOwn) {
  const support::FileHandle lent = open("abc");
  { ImageBytes image(m_Host, lent, 2, 3, false); }
  EXPECT_EQ(m_Memory.openHandles(), 1U);
  { ImageBytes image(m_Host, lent, 2, 3, true); }
  EXPECT_EQ(m_Memory.openHandles(), 0U);
}

TEST_F(ImageBytesTest, MayLeaveAFileOpenOrForgetIt) {
  {
    ImageBytes image(m_Host, open("abc"), 2, 3, true);
    image.leaveFileOpen();
  }
  EXPECT_EQ(m_Memory.openHandles(), 1U);
  const support::FileHandle file = open(pattern(Large));
  ImageBytes image(m_Host, file, 2, Large, true);
  EXPECT_TRUE(image.prepare());
  expectBytes(image, 0, 16);
  image.forgetFile();
  expectBytes(image, 0, 16);
  EXPECT_EQ(image.view(0x20000, 1), nullptr);
  EXPECT_EQ(m_Memory.openHandles(), 2U);
}

} // namespace elfext
