// SPDX-License-Identifier: Apache-2.0
//
// The page allocator: its map, its search, its chunks and its overflow. Runs are asked for across
// every border that there is: words, half words, chunks, the end of the map; and pages that a
// client gives back wrongly must be named, not taken.

#include "region_fixture.h"

#include <cstring>
#include <set>

namespace alloclib {
namespace {

using testing::ElementsAre;
using testing::ExitedWithCode;

constexpr size_t Page = 4096;
constexpr size_t Chunk = size_t{1} << 20;

class RegionLargeBlockTest : public RegionTest {
protected:
  void SetUp() override {
    RegionTest::SetUp();
    pages = RegionLargeBlockPeer::create(&parent);
  }
  void TearDown() override {
    pages->Destroy(true);
    EXPECT_EQ(parent.allocations.size(), parent.discards.size());
    RegionTest::TearDown();
  }

  char* allocate(size_t count) {
    return static_cast<char*>(pages->AllocFull(count * Page, 8, nullptr));
  }
  void discard(char* block, size_t count) { pages->DiscardFull(block, count * Page, 8); }

  RecordingRegion parent;
  RegionLargeBlock* pages = nullptr;
};

using RegionLargeBlockDeathTest = RegionLargeBlockTest;

TEST_F(RegionLargeBlockTest, TheFirstChunkIsMadeAtConstruction) {
  EXPECT_THAT(parent.allocations, ElementsAre(sizeof(RegionLargeBlock), Chunk));
}

TEST_F(RegionLargeBlockTest, PagesComeFirstFitAndAreAligned) {
  char* first = allocate(1);
  char* second = allocate(2);
  EXPECT_EQ(first, RegionLargeBlockPeer::getChunk(pages, 0));
  EXPECT_EQ(second, first + Page);
  EXPECT_EQ(reinterpret_cast<uintptr_t>(first) % Page, 0u);
  discard(first, 1);
  EXPECT_EQ(allocate(1), first);
}

TEST_F(RegionLargeBlockTest, ARunSkipsAHoleThatIsTooSmall) {
  char* first = allocate(1);
  char* second = allocate(1);
  discard(first, 1);
  EXPECT_EQ(allocate(2), second + Page);
  EXPECT_EQ(allocate(1), first);
}

TEST_F(RegionLargeBlockTest, ARunIsBrokenByAWordOfTakenPages) {
  // Free are the last eight pages of the first word and all of the third.
  RegionLargeBlockPeer::setBits(pages, 0, 24, false);
  RegionLargeBlockPeer::setBits(pages, 32, 32, false);
  EXPECT_EQ(allocate(20), RegionLargeBlockPeer::getChunk(pages, 0) + 64 * Page);
  EXPECT_EQ(allocate(8), RegionLargeBlockPeer::getChunk(pages, 0) + 24 * Page);
}

TEST_F(RegionLargeBlockTest, TheNextChunkComesWhenTheFirstIsFull) {
  for (int count = 0; count < 256; ++count)
    allocate(1);
  EXPECT_EQ(parent.allocations.size(), 2u);
  allocate(1);
  EXPECT_THAT(parent.allocations, ElementsAre(sizeof(RegionLargeBlock), Chunk, Chunk));
}

TEST_F(RegionLargeBlockTest, ARunNeverSpansTwoChunks) {
  for (int count = 0; count < 8; ++count)
    allocate(31);
  // Eight pages are left in the first chunk; all of the next one is free.
  char* run = allocate(31);
  EXPECT_EQ(run, RegionLargeBlockPeer::getChunk(pages, 1));
  EXPECT_EQ(allocate(8), RegionLargeBlockPeer::getChunk(pages, 0) + 248 * Page);
}

TEST_F(RegionLargeBlockTest, ARunOf32PagesGoesToTheParent) {
  char* block = allocate(32);
  EXPECT_EQ(parent.allocations.back(), 32 * Page);
  discard(block, 32);
  EXPECT_THAT(parent.discards, ElementsAre(32 * Page));
}

TEST_F(RegionLargeBlockTest, SinglePagesMoveTheHintAndDiscardsBringItBack) {
  char* first = allocate(1);
  for (int count = 0; count < 64; ++count)
    allocate(1);
  EXPECT_EQ(RegionLargeBlockPeer::getHint(pages), 2u);
  discard(first, 1);
  EXPECT_EQ(RegionLargeBlockPeer::getHint(pages), 0u);
}

TEST_F(RegionLargeBlockTest, RunsLeaveTheHint) {
  for (int count = 0; count < 4; ++count)
    allocate(20);
  EXPECT_EQ(RegionLargeBlockPeer::getHint(pages), 0u);
}

TEST_F(RegionLargeBlockTest, AFullMapChainsAnOverflow) {
  RegionLargeBlockPeer::setBits(pages, 0, 10240, false);
  char* block = allocate(1);
  RegionLargeBlock* overflow = RegionLargeBlockPeer::getOverflow(pages);
  ASSERT_NE(overflow, nullptr);
  EXPECT_EQ(RegionLargeBlockPeer::getHint(pages), 321u);
  EXPECT_EQ(block, RegionLargeBlockPeer::getChunk(overflow, 0));
}

TEST_F(RegionLargeBlockTest, AnExhaustedMapIsSearchedAgainOnlyAfterADiscard) {
  char* first = allocate(1);
  RegionLargeBlockPeer::setBits(pages, 1, 10239, false);
  char* second = allocate(1);
  RegionLargeBlockPeer::setBits(pages, 1, 1, true);
  EXPECT_EQ(allocate(1), second + Page);
  discard(first, 1);
  EXPECT_EQ(allocate(1), first);
}

TEST_F(RegionLargeBlockTest, DiscardsFindTheirWayIntoTheOverflow) {
  RegionLargeBlockPeer::setBits(pages, 0, 10240, false);
  char* block = allocate(3);
  discard(block, 3);
  EXPECT_EQ(allocate(3), block);
}

TEST_F(RegionLargeBlockTest, TheLastPageOfTheMapIsServed) {
  RegionLargeBlockPeer::setBits(pages, 0, 10239, false);
  char* block = allocate(1);
  EXPECT_EQ(block, RegionLargeBlockPeer::getChunk(pages, 39) + 255 * Page);
  EXPECT_EQ(RegionLargeBlockPeer::getOverflow(pages), nullptr);
}

TEST_F(RegionLargeBlockTest, AFreeHighHalfWordIsFound) {
  RegionLargeBlockPeer::setBits(pages, 0, 16, false);
  EXPECT_EQ(allocate(20), RegionLargeBlockPeer::getChunk(pages, 0) + 16 * Page);
}

TEST_F(RegionLargeBlockTest, BlocksNeverOverlap) {
  std::set<char*> inUse;
  uint32_t random = 1;
  std::vector<std::pair<char*, size_t>> blocks;
  for (int round = 0; round < 2000; ++round) {
    random = random * 1664525 + 1013904223;
    if (random >> 30 == 0 && !blocks.empty()) {
      auto [block, count] = blocks[random % blocks.size()];
      std::erase(blocks, std::pair(block, count));
      for (size_t index = 0; index < count; ++index)
        inUse.erase(block + index * Page);
      discard(block, count);
      continue;
    }
    const size_t count = 1 + random / 7 % 31;
    char* block = allocate(count);
    for (size_t index = 0; index < count; ++index)
      ASSERT_TRUE(inUse.insert(block + index * Page).second);
    blocks.emplace_back(block, count);
  }
}

TEST_F(RegionLargeBlockTest, DiscardedMemoryIsFilledOnRequest) {
  pages->setFillDiscarded(true);
  char* first = allocate(1);
  char* second = allocate(1);
  std::memset(first, 'x', Page);
  std::memset(second, 'x', Page);
  discard(first, 1);
  discard(second, 1);
  unpoison(first, 2 * Page);
  EXPECT_EQ(first[0], 0);
  EXPECT_EQ(first[Page - 1], 0);
  EXPECT_EQ(second[0], 1);
  EXPECT_EQ(second[Page - 1], 1);
}

TEST_F(RegionLargeBlockTest, DestroyingWithFalseFreesNothing) {
  RecordingRegion other;
  RegionLargeBlock* doomed = RegionLargeBlockPeer::create(&other);
  RegionLargeBlockPeer::setBits(doomed, 0, 10240, false);
  doomed->AllocFull(Page, 8, nullptr);
  RegionLargeBlock* overflow = RegionLargeBlockPeer::getOverflow(doomed);
  doomed->Destroy(false);
  EXPECT_TRUE(other.discards.empty());
  for (RegionLargeBlock* region : {overflow, doomed}) {
    RecordingRegion::release(RegionLargeBlockPeer::getChunk(region, 0));
    RecordingRegion::release(region);
  }
}

TEST_F(RegionLargeBlockDeathTest, OnlyWholePagesGoInAndOut) {
  for (size_t size : {size_t{0}, size_t{1}, Page - 1, Page + 1, size_t{0x20001}}) {
    EXPECT_EXIT((void)pages->AllocFull(size, 8, nullptr), ExitedWithCode(1),
                "^Internal alloclib error: Invalid allocation using RegionLargeBlock\n$");
    EXPECT_EXIT(pages->DiscardFull(nullptr, size, 8), ExitedWithCode(1),
                "^Internal alloclib error: Invalid discard using RegionLargeBlock\n$");
  }
}

TEST_F(RegionLargeBlockDeathTest, AForeignPointerIsNamed) {
  char foreign = 0;
  EXPECT_EXIT(discard(&foreign, 1), ExitedWithCode(1),
              "^Internal alloclib error: RegionLargeBlock: discard of invalid pointer: .+\n\n$");
}

TEST_F(RegionLargeBlockDeathTest, TheMapHasAnEnd) {
  for (auto [bit, count] : {std::pair{10240u, 1u}, {10239u, 2u}, {10241u, 0u}, {5u, ~0u}})
    EXPECT_EXIT(RegionLargeBlockPeer::setBits(pages, bit, count, true), ExitedWithCode(1),
                "^Internal alloclib error: SetBits outside of bitmap\n$");
}

using RegionFastOldTest = RegionTest;
using RegionFastOldDeathTest = RegionTest;

TEST_F(RegionFastOldTest, TheTransparentModeForwardsEverything) {
  setDebugMode(Debug_Transparent);
  RegionLargeBlock* region = RegionFastOld::Create("pages");
  EXPECT_EQ(RegionLargeBlockPeer::getChunk(region, 0), nullptr);
  void* block = region->AllocFull(Page, 8, nullptr);
  EXPECT_EQ(RegionLargeBlockPeer::getChunk(region, 0), nullptr);
  EXPECT_THAT(getReport(false, false), testing::HasSubstr(", all memory,"));
  region->DiscardFull(block, Page, 8);
  region->Destroy(true);
  EXPECT_THAT(getReport(false, false), testing::Not(testing::HasSubstr("all memory")));
}

TEST_F(RegionFastOldTest, TheOtherModesMakeAPlainOne) {
  for (int mode : {Debug_Off, Debug_Plain, Debug_Tracing}) {
    setDebugMode(mode);
    RegionLargeBlock* region = RegionFastOld::Create("pages");
    EXPECT_NE(RegionLargeBlockPeer::getChunk(region, 0), nullptr);
    region->Destroy(true);
  }
}

TEST_F(RegionFastOldDeathTest, AnUnknownModeIsAFault) {
  for (int mode : {-1, 4})
    EXPECT_EXIT(
        {
          setDebugMode(mode);
          RegionFastOld::Create("pages");
        },
        ExitedWithCode(1),
        "^Internal alloclib error: Unsupported debug mode in RegionFastOld::Create\n$");
}

} // namespace
} // namespace alloclib
