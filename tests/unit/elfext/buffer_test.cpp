// SPDX-License-Identifier: Apache-2.0
//
// Buffers in each of their modes: own bytes, a view of somebody else's, an image not yet looked
// at, and data outside of the model.
//
// Offsets and sizes near the end of their types must be refused and never wrap; borrowed bytes must
// stay as they are until the first change, which copies them.

#include "elfext/interface/buffer.h"

#include "module_fixture.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <string>

namespace elfext {
namespace {

constexpr uint64_t HugeOffset = 0xFFFFFFFFFFFFFFFF;

class BufferTest : public ModuleTest {
protected:
  BufferTest() : buffer(&module) {}

  void fill(const std::vector<uint8_t>& bytes) {
    buffer.setSize(bytes.size());
    if (!bytes.empty()) buffer.write(0, bytes.data(), bytes.size());
  }
  std::vector<uint8_t> contents() const {
    const uint8_t* bytes = buffer.getContents();
    return {bytes, bytes + buffer.getSize()};
  }

  Buffer buffer;
};

TEST_F(BufferTest, HasNoContentsWhenEmpty) {
  EXPECT_EQ(buffer.getSize(), 0u);
  EXPECT_EQ(buffer.getContents(), nullptr);
  fill({1, 2});
  EXPECT_NE(buffer.getContents(), nullptr);
  buffer.setSize(0);
  EXPECT_EQ(buffer.getContents(), nullptr);
}

TEST_F(BufferTest, ReadsAndWritesBytes) {
  fill({1, 2, 3});
  buffer.setByte(1, 9);
  EXPECT_EQ(buffer.getByte(1), 9u);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 9, 3));
}

TEST_F(BufferTest, ReadsWordsInTheModulesByteOrder) {
  fill({1, 2, 3, 4, 5, 6, 7, 8});
  EXPECT_EQ(buffer.get16(2), 0x0403u);
  EXPECT_EQ(buffer.get32(0), 0x04030201u);
  EXPECT_EQ(buffer.getUnaligned32(0), 0x04030201u);
  EXPECT_EQ(buffer.get64(0), 0x0807060504030201u);
  module.setLittleEndian(0);
  EXPECT_EQ(buffer.get16(2), 0x0304u);
  EXPECT_EQ(buffer.get32(0), 0x01020304u);
  EXPECT_EQ(buffer.getUnaligned32(0), 0x01020304u);
  EXPECT_EQ(buffer.get64(0), 0x0102030405060708u);
}

TEST_F(BufferTest, WritesWordsInTheModulesByteOrder) {
  fill(std::vector<uint8_t>(16));
  buffer.set16(0, 0x0102);
  buffer.set32(4, 0x01020304);
  buffer.set64(8, 0x0102030405060708);
  EXPECT_THAT(contents(), testing::ElementsAre(2, 1, 0, 0, 4, 3, 2, 1, 8, 7, 6, 5, 4, 3, 2, 1));
  module.setLittleEndian(0);
  buffer.set16(0, 0x0102);
  buffer.set32(4, 0x01020304);
  buffer.set64(8, 0x0102030405060708);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 2, 0, 0, 1, 2, 3, 4, 1, 2, 3, 4, 5, 6, 7, 8));
}

TEST_F(BufferTest, ReadsUnalignedWordsAnywhere) {
  fill({0, 1, 2, 3, 4, 5, 6, 7, 8});
  EXPECT_EQ(buffer.getUnaligned16(1), 0x0201u);
  EXPECT_EQ(buffer.getUnaligned32(3), 0x06050403u);
  EXPECT_EQ(buffer.getUnaligned64(1), 0x0807060504030201u);
}

TEST_F(BufferTest, WantsAlignedWordsAligned) {
  fill(std::vector<uint8_t>(16));
  EXPECT_ASSERTION((void)buffer.get16(1), "offset % 2 == 0");
  EXPECT_ASSERTION((void)buffer.get32(2), "offset % 4 == 0");
  EXPECT_ASSERTION((void)buffer.get64(4), "offset % 8 == 0");
  EXPECT_ASSERTION(buffer.set16(1, 0), "offset % 2 == 0");
  EXPECT_ASSERTION(buffer.set32(2, 0), "offset % 4 == 0");
  EXPECT_ASSERTION(buffer.set64(4, 0), "offset % 8 == 0");
}

TEST_F(BufferTest, WantsWordsWithinTheBuffer) {
  fill(std::vector<uint8_t>(9));
  EXPECT_ASSERTION((void)buffer.getByte(9), "offset < m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.get16(8), "offset + 2 <= m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.get32(8), "offset + 4 <= m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.get64(8), "offset + 8 <= m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.getUnaligned16(8), "offset + 2 <= m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.getUnaligned32(6), "offset + 4 <= m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.getUnaligned64(2), "offset + 8 <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.setByte(9, 0), "offset < m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.set16(8, 0), "offset + 2 <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.set32(8, 0), "offset + 4 <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.set64(8, 0), "offset + 8 <= m_Contents.getSize()");
}

TEST_F(BufferTest, IsNotFooledByOffsetsThatWrap) {
  fill(std::vector<uint8_t>(16));
  EXPECT_ASSERTION((void)buffer.getUnaligned16(HugeOffset), "offset <= m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.getUnaligned32(HugeOffset), "offset <= m_Contents.getSize()");
  EXPECT_ASSERTION((void)buffer.getUnaligned64(HugeOffset), "offset <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.setByte(HugeOffset, 0), "offset <= UINT32_MAX");
  EXPECT_ASSERTION(buffer.set16(HugeOffset - 1, 0), "offset <= UINT32_MAX");
  EXPECT_ASSERTION(buffer.set32(HugeOffset - 3, 0), "offset <= UINT32_MAX");
  EXPECT_ASSERTION(buffer.set64(HugeOffset - 7, 0), "offset <= UINT32_MAX");
}

TEST_F(BufferTest, ReadsAndWritesRanges) {
  fill({1, 2, 3, 4});
  uint8_t bytes[2] = {};
  buffer.read(1, bytes, 2);
  EXPECT_EQ(bytes[0], 2u);
  EXPECT_EQ(bytes[1], 3u);
  buffer.write(2, bytes, 2);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 2, 2, 3));
  buffer.read(4, bytes, 0);
  buffer.write(4, bytes, 0);
}

TEST_F(BufferTest, WantsRangesWithinTheBuffer) {
  fill(std::vector<uint8_t>(4));
  uint8_t bytes[16] = {};
  EXPECT_ASSERTION(buffer.read(HugeOffset, bytes, 2), "offset + count >= offset");
  EXPECT_ASSERTION(buffer.read(0, nullptr, 1), "buffer != NULL");
  EXPECT_ASSERTION(buffer.read(5, bytes, 0), "offset <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.read(0, bytes, 5), "count <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.read(2, bytes, 3), "offset + count <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.write(0, nullptr, 1), "buffer != NULL");
  EXPECT_ASSERTION(buffer.write(uint64_t{1} << 32, bytes, 1), "offset <= UINT32_MAX");
  EXPECT_ASSERTION(buffer.write(0, bytes, uint64_t{1} << 32), "count <= UINT32_MAX");
  EXPECT_ASSERTION(buffer.write(5, bytes, 0), "offset <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.write(0, bytes, 5), "count <= m_Contents.getSize()");
  EXPECT_ASSERTION(buffer.write(2, bytes, 3), "offset + count <= m_Contents.getSize()");
}

TEST_F(BufferTest, HoldsNoMoreThan32Bits) {
  EXPECT_ASSERTION(buffer.setSize(uint64_t{1} << 32), "size <= UINT32_MAX");
  EXPECT_ASSERTION(buffer.reserve(uint64_t{1} << 32), "size <= UINT32_MAX");
}

TEST_F(BufferTest, AppendsAndReturnsTheOldSize) {
  buffer.reserve(100);
  EXPECT_EQ(buffer.getSize(), 0u);
  EXPECT_EQ(buffer.append64(0x0102030405060708), 0u);
  EXPECT_EQ(buffer.append32(0x01020304), 8u);
  EXPECT_EQ(buffer.append16(0x0102), 12u);
  EXPECT_EQ(buffer.appendByte(7), 14u);
  EXPECT_THAT(contents(), testing::ElementsAre(8, 7, 6, 5, 4, 3, 2, 1, 4, 3, 2, 1, 2, 1, 7));
}

TEST_F(BufferTest, AppendsWordsToWholeWordsOnly) {
  fill({1});
  EXPECT_ASSERTION(buffer.append16(0), "m_Contents.getSize() % 2 == 0");
  EXPECT_ASSERTION(buffer.append32(0), "m_Contents.getSize() % 4 == 0");
  EXPECT_ASSERTION(buffer.append64(0), "m_Contents.getSize() % 8 == 0");
}

TEST_F(BufferTest, ShowsOldBytesAgainAfterShrinking) {
  fill({1, 2, 3});
  buffer.setSize(1);
  EXPECT_EQ(buffer.getSize(), 1u);
  buffer.setSize(3);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 2, 3));
}

// ---- Somebody else's bytes

TEST_F(BufferTest, ShowsBorrowedBytesWithoutACopy) {
  const uint8_t bytes[] = {4, 3, 2, 1};
  buffer.borrow(bytes, 4);
  EXPECT_EQ(buffer.getContents(), bytes);
  EXPECT_EQ(buffer.getSize(), 4u);
  EXPECT_EQ(buffer.get32(0), 0x01020304u);
  EXPECT_EQ(buffer.getContents(), bytes);
}

TEST_F(BufferTest, CopiesBorrowedBytesBeforeTheFirstChange) {
  const uint8_t bytes[] = {1, 2, 3, 4};
  buffer.borrow(bytes, 4);
  buffer.setByte(0, 9);
  EXPECT_THAT(contents(), testing::ElementsAre(9, 2, 3, 4));
  EXPECT_EQ(bytes[0], 1u);
}

TEST_F(BufferTest, CopiesBorrowedBytesToGrow) {
  const uint8_t bytes[] = {1, 2};
  buffer.borrow(bytes, 2);
  EXPECT_EQ(buffer.appendByte(3), 2u);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 2, 3));
}

TEST_F(BufferTest, ShowsLessOfBorrowedBytes) {
  const uint8_t bytes[] = {1, 2, 3};
  buffer.borrow(bytes, 3);
  buffer.setSize(2);
  EXPECT_EQ(buffer.getContents(), bytes);
  EXPECT_EQ(buffer.getSize(), 2u);
}

TEST_F(BufferTest, ReplacesItsOwnBytesByBorrowedOnes) {
  const uint8_t bytes[] = {1, 2};
  fill({7, 8, 9});
  buffer.borrow(bytes, 2);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 2));
  EXPECT_NE(buffer.getModifiableContents(), bytes);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 2));
}

class CountingImage final : public ImageSource {
public:
  const uint8_t* view(uint64_t offset, uint64_t size) override {
    ++views;
    return isBroken || offset + size > bytes.size() ? nullptr : bytes.data() + offset;
  }
  [[nodiscard]] support::HostError getHostError() const override { return isBroken ? EIO : 0; }

  std::vector<uint8_t> bytes = {0, 1, 2, 3, 4, 5, 6, 7};
  bool isBroken = false;
  int views = 0;
};

TEST_F(BufferTest, AsksTheImageOnceAndOnlyWhenLookedAt) {
  CountingImage image;
  buffer.defer(image, 2, 4);
  EXPECT_EQ(buffer.getSize(), 4u);
  EXPECT_EQ(image.views, 0);
  EXPECT_EQ(buffer.getContents(), image.bytes.data() + 2);
  EXPECT_EQ(buffer.getByte(3), 5u);
  EXPECT_EQ(image.views, 1);
}

TEST_F(BufferTest, DoesNotAskTheImageForNothing) {
  CountingImage image;
  buffer.defer(image, 2, 0);
  EXPECT_EQ(buffer.getContents(), nullptr);
  EXPECT_EQ(image.views, 0);
}

TEST_F(BufferTest, CopiesBytesOfTheImageBeforeTheFirstChange) {
  CountingImage image;
  buffer.defer(image, 2, 4);
  buffer.set16(0, 0x0908);
  EXPECT_THAT(contents(), testing::ElementsAre(8, 9, 4, 5));
  EXPECT_EQ(image.bytes[2], 2u);
}

class ReadErrorNotes final : public ErrorHandler {
public:
  bool report(const ObjectModule&, uint32_t, const std::string& text) override {
    texts.push_back(text);
    return true;
  }

  std::vector<std::string> texts;
};

class LostBytesTest : public BufferTest {
protected:
  LostBytesTest() {
    module.setErrorHandler(&notes);
    image.isBroken = true;
    buffer.defer(image, 2, 4);
  }

  ReadErrorNotes notes;
  CountingImage image;
};

TEST_F(LostBytesTest, AreToldOfOnceAndNeverLookLikeData) {
  uint8_t bytes[4] = {9, 9, 9, 9};
  EXPECT_FALSE(module.hasLostContents());
  EXPECT_EQ(buffer.getContents(), nullptr);
  EXPECT_FALSE(buffer.read(0, bytes, 4));
  EXPECT_THAT(bytes, testing::ElementsAre(9, 9, 9, 9));
  EXPECT_EQ(buffer.get32(0), 0u);
  EXPECT_EQ(buffer.getSize(), 4u);
  EXPECT_TRUE(module.hasLostContents());
  EXPECT_THAT(notes.texts, testing::ElementsAre("I/O error reading file: Input/output error"));
}

TEST_F(LostBytesTest, AreNotAskedForAgain) {
  EXPECT_EQ(buffer.getContents(), nullptr);
  image.isBroken = false;
  EXPECT_EQ(buffer.getContents(), nullptr);
  EXPECT_EQ(image.views, 1);
}

TEST_F(LostBytesTest, CannotBeWrittenTo) {
  const uint8_t byte = 7;
  EXPECT_EQ(buffer.getModifiableContents(), nullptr);
  EXPECT_FALSE(buffer.write(0, &byte, 1));
  buffer.setByte(0, 1);
  buffer.set32(0, 1);
  buffer.appendByte(2);
  buffer.reserve(100);
  EXPECT_EQ(buffer.getSize(), 5u);
  EXPECT_EQ(buffer.getContents(), nullptr);
  EXPECT_EQ(notes.texts.size(), 1u);
}

TEST_F(LostBytesTest, GiveWayToOthers) {
  EXPECT_EQ(buffer.getContents(), nullptr);
  const uint8_t bytes[] = {1, 2};
  buffer.borrow(bytes, 2);
  EXPECT_THAT(contents(), testing::ElementsAre(1, 2));
  buffer.defer(image, 2, 4);
  EXPECT_EQ(buffer.getContents(), nullptr);
  EXPECT_EQ(notes.texts.size(), 2u);
  buffer.setSize(0);
  buffer.appendByte(3);
  EXPECT_THAT(contents(), testing::ElementsAre(3));
}

TEST_F(BufferTest, MayBeLargerThan4GiBWhenItsBytesAreElsewhere) {
  CountingImage image;
  buffer.defer(image, 0, uint64_t{1} << 33);
  EXPECT_EQ(buffer.getSize(), uint64_t{1} << 33);
}

// ---- Data outside of the model

struct External {
  std::vector<uint8_t> bytes = {1, 2, 3, 4, 5, 6, 7, 8, 9};
  uint64_t atMost = 3;
  int calls = 0;
};

uint64_t deliver(void* handle, uint64_t offset, void* destination, uint64_t count) {
  auto* external = static_cast<External*>(handle);
  ++external->calls;
  const uint64_t size = std::min(count, external->atMost);
  if (size != 0) std::memcpy(destination, external->bytes.data() + offset, size);
  return size;
}

class ExternalBufferTest : public BufferTest {
protected:
  ExternalBufferTest() { buffer.setExternalData(&deliver, &external, external.bytes.size()); }

  External external;
};

TEST_F(ExternalBufferTest, ReadsThroughTheFunctionUntilAllIsThere) {
  uint8_t bytes[7] = {};
  buffer.read(1, bytes, 7);
  EXPECT_THAT(bytes, testing::ElementsAre(2, 3, 4, 5, 6, 7, 8));
  EXPECT_EQ(external.calls, 3);
}

TEST_F(ExternalBufferTest, ReadsNothingWithoutACall) {
  uint8_t byte = 0;
  buffer.read(9, &byte, 0);
  EXPECT_EQ(external.calls, 0);
}

TEST_F(ExternalBufferTest, ReadsWords) {
  EXPECT_EQ(buffer.getByte(8), 9u);
  EXPECT_EQ(buffer.get16(2), 0x0403u);
  EXPECT_EQ(buffer.get32(4), 0x08070605u);
  EXPECT_EQ(buffer.get64(0), 0x0807060504030201u);
  EXPECT_EQ(buffer.getUnaligned32(1), 0x05040302u);
  EXPECT_ASSERTION((void)buffer.get32(2), "offset % 4 == 0");
  EXPECT_ASSERTION((void)buffer.getUnaligned32(6), "offset + count <= m_ExternalDataSize");
}

TEST_F(ExternalBufferTest, WantsRangesWithinTheData) {
  uint8_t bytes[16] = {};
  EXPECT_ASSERTION(buffer.read(0, bytes, 10), "count <= m_ExternalDataSize");
  EXPECT_ASSERTION(buffer.read(8, bytes, 2), "offset + count <= m_ExternalDataSize");
}

TEST_F(ExternalBufferTest, WantsAtLeastOneByteOfEachCall) {
  uint8_t byte = 0;
  external.atMost = 0;
  EXPECT_ASSERTION(buffer.read(0, &byte, 1), "ret > 0");
}

TEST_F(ExternalBufferTest, JustRecordsASize) {
  EXPECT_EQ(buffer.getSize(), 9u);
  buffer.setSize(uint64_t{1} << 40);
  EXPECT_EQ(buffer.getSize(), uint64_t{1} << 40);
  buffer.reserve(uint64_t{1} << 40);
}

TEST_F(ExternalBufferTest, IsNeitherWrittenNorShown) {
  const uint8_t byte = 0;
  EXPECT_ASSERTION((void)buffer.getContents(), "!m_ExternalDataFunction");
  EXPECT_ASSERTION((void)buffer.getModifiableContents(), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.setByte(0, 0), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.set16(0, 0), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.set32(0, 0), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.set64(0, 0), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.write(0, &byte, 1), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.appendByte(0), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.append16(0), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.append32(0), "!m_ExternalDataFunction");
  EXPECT_ASSERTION(buffer.append64(0), "!m_ExternalDataFunction");
}

} // namespace
} // namespace elfext
