// SPDX-License-Identifier: Apache-2.0
//
// The general region: its thresholds, its reuse of discarded memory, and its states. The thresholds
// are tested on both sides (10239 and 10240 bytes, 120 and 128), and blocks of many generated
// sequences must never overlap. Sizes near the end of the type must be out of memory and never
// wrap.

#include "region_fixture.h"

#include <cstring>
#include <sstream>

namespace alloclib {
namespace {

using testing::ElementsAre;
using testing::ExitedWithCode;
using Peer = RegionGeneralPeer;

class RegionGeneralTest : public RegionTest {
protected:
  void SetUp() override {
    RegionTest::SetUp();
    makeRegion(1);
  }
  void TearDown() override {
    region->Destroy(true);
    EXPECT_THAT(parent.discards, testing::UnorderedElementsAreArray(parent.allocations));
    RegionTest::TearDown();
  }

  void makeRegion(uint32_t flagsState) {
    if (region != nullptr) region->Destroy(true);
    region = Peer::create(&parent, flagsState);
  }

  char* allocate(size_t size, size_t alignment = 8) {
    auto* block = static_cast<char*>(region->allocate(size, alignment));
    std::memset(block, 'x', size);
    return block;
  }

  // Discards pieces of the size until more than 10240 bytes are in the buckets.
  void fillBucket(size_t size) {
    std::vector<char*> pieces;
    for (size_t bytes = 0; bytes <= 10240; bytes += size)
      pieces.push_back(allocate(size));
    for (char* piece : pieces)
      region->discard(piece, size);
  }

  RecordingRegion parent;
  RegionGeneral* region = nullptr;
};

using RegionGeneralDeathTest = RegionGeneralTest;

TEST_F(RegionGeneralTest, ItStandsBehindTheHeaderOfAFirstBlockOfOnePage) {
  EXPECT_THAT(parent.allocations, ElementsAre(4096));
  EXPECT_EQ(reinterpret_cast<uintptr_t>(region) % 4096, 16u);
  EXPECT_EQ(allocate(8), reinterpret_cast<char*>(region) + 96);
  EXPECT_EQ(Peer::getWorkingEnd(region), reinterpret_cast<char*>(region) - 16 + 4096);
}

TEST_F(RegionGeneralTest, SizesAreRoundedUpToEight) {
  char* first = allocate(1);
  char* second = allocate(8);
  char* third = allocate(9);
  char* fourth = allocate(24);
  EXPECT_EQ(second, first + 8);
  EXPECT_EQ(third, second + 8);
  EXPECT_EQ(fourth, third + 16);
}

TEST_F(RegionGeneralTest, ABlockIsUsedToItsLastByte) {
  const auto room = static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region));
  allocate(room);
  EXPECT_EQ(parent.allocations.size(), 1u);
  allocate(1);
  EXPECT_EQ(parent.allocations.size(), 2u);
}

TEST_F(RegionGeneralTest, AnEmptyRequestYieldsAnAddress) {
  EXPECT_NE(region->allocate(0), nullptr);
  region->discard(region->allocate(0), 0);
  EXPECT_EQ(Peer::getBucketBytes(region), 0u);
}

TEST_F(RegionGeneralTest, ANewBlockHasAReserveAndIsCutToPages) {
  allocate(5000);
  EXPECT_EQ(parent.allocations.back(), (5000 + 3000 + 15 + 4096) / 4096 * 4096);
  allocate(10000);
  EXPECT_EQ(parent.allocations.back(), (10000 + 3000 + 15 + 4096) / 4096 * 4096);
}

TEST_F(RegionGeneralTest, TenThousandTwoHundredAndFortyBytesGetABlockOfTheirOwn) {
  char* block = allocate(10240);
  EXPECT_TRUE(Peer::hasLargeBlocks(region));
  EXPECT_EQ(parent.allocations.back(), (10240 + 23 + 4096) / 4096 * 4096);
  EXPECT_EQ(reinterpret_cast<uintptr_t>(block) % 4096, 24u);
  region->discard(block, 10240);
  EXPECT_THAT(parent.discards, ElementsAre(12288));
  EXPECT_FALSE(Peer::hasLargeBlocks(region));
}

TEST_F(RegionGeneralTest, OneByteLessComesFromABlock) {
  char* block = allocate(10239);
  EXPECT_FALSE(Peer::hasLargeBlocks(region));
  EXPECT_EQ(reinterpret_cast<uintptr_t>(block) % 4096, 16u);
  region->discard(block, 10239);
  EXPECT_TRUE(parent.discards.empty());
  // The piece serves again, as a working block.
  EXPECT_EQ(allocate(8000), block);
}

TEST_F(RegionGeneralTest, TheInlinePathNeverServesALargeRequest) {
  RegionGeneral* roomy = Peer::create(&parent, 1, 40960);
  char* cursor = Peer::getCursor(roomy);
  EXPECT_EQ(Peer::getFastLimit(roomy), cursor + 10240);
  void* block = roomy->allocate(10240);
  EXPECT_EQ(Peer::getCursor(roomy), cursor);
  EXPECT_TRUE(Peer::hasLargeBlocks(roomy));
  roomy->discard(block, 10240);
  EXPECT_EQ(roomy->allocate(10232), cursor);
  EXPECT_EQ(roomy->allocate(10239), cursor + 10232);
  roomy->Destroy(true);
}

TEST_F(RegionGeneralTest, TheFastLimitIsTheEndIfNoMoreThan10240BytesRemain) {
  for (size_t remaining : {10232u, 10240u, 10248u}) {
    RegionGeneral* roomy = Peer::create(&parent, 1, 40960);
    Peer::setCursor(roomy, Peer::getWorkingEnd(roomy) - remaining);
    Peer::setBlockWorkingState(roomy);
    EXPECT_EQ(Peer::getWorkingEnd(roomy) - Peer::getFastLimit(roomy), remaining > 10240 ? 8 : 0);
    roomy->Destroy(true);
  }
}

TEST_F(RegionGeneralTest, LargeBlocksAreUnlinkedFromAnyPlaceInTheirList) {
  char* first = allocate(20000);
  char* second = allocate(30000);
  char* third = allocate(40000);
  region->discard(second, 30000);
  region->discard(first, 20000);
  region->discard(third, 40000);
  EXPECT_THAT(parent.discards, ElementsAre(32768, 20480, 40960));
  EXPECT_FALSE(Peer::hasLargeBlocks(region));
}

TEST_F(RegionGeneralTest, ADiscardOf120BytesGoesToABucket) {
  region->discard(allocate(120), 120);
  EXPECT_EQ(Peer::getBucketBytes(region), 120u);
}

TEST_F(RegionGeneralTest, ADiscardOf128BytesGoesToTheFreeChunks) {
  char* chunk = allocate(128);
  region->discard(chunk, 128);
  EXPECT_EQ(Peer::getBucketBytes(region), 0u);
  // Once the working block is used up, the chunk takes its place.
  allocate(static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region)));
  EXPECT_EQ(allocate(100), chunk);
  EXPECT_EQ(allocate(24), chunk + 104);
}

TEST_F(RegionGeneralTest, SizesFrom121To127RoundUpToTheFreeChunks) {
  region->discard(allocate(121), 121);
  EXPECT_EQ(Peer::getBucketBytes(region), 0u);
  fillBucket(120);
  allocate(127);
}

TEST_F(RegionGeneralTest, TheFirstFreeChunkThatFitsIsTaken) {
  char* small = allocate(200);
  char* large = allocate(400);
  char* latest = allocate(160);
  region->discard(large, 400);
  region->discard(small, 200);
  region->discard(latest, 160);
  allocate(static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region)));
  EXPECT_EQ(allocate(300), large);
  // What is left of the first one is used before the next comes.
  EXPECT_EQ(allocate(96), large + 304);
  EXPECT_EQ(allocate(152), latest);
  EXPECT_EQ(allocate(200), small);
  EXPECT_EQ(parent.allocations.size(), 1u);
}

TEST_F(RegionGeneralTest, ASearchInVainIsNotMadeAgainBeforeALargerChunkComes) {
  char* small = allocate(200);
  char* large = allocate(4800);
  region->discard(small, 200);
  EXPECT_EQ(Peer::getLargestChunk(region), 200u);
  allocate(static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region)));
  allocate(184, 256);
  EXPECT_EQ(Peer::getLargestChunk(region), 200u) << "it is passed over for where it starts";
  allocate(static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region)));
  EXPECT_EQ(allocate(200), small);
  allocate(8192);
  EXPECT_EQ(Peer::getLargestChunk(region), 200u) << "larger than any, so none is looked at";
  allocate(static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region)));
  region->discard(allocate(160), 160);
  allocate(static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region)));
  allocate(168);
  EXPECT_EQ(Peer::getLargestChunk(region), 167u) << "a search in vain";
  allocate(static_cast<size_t>(Peer::getWorkingEnd(region) - Peer::getCursor(region)));
  region->discard(large, 4800);
  EXPECT_EQ(allocate(4000), large);
}

TEST_F(RegionGeneralTest, BucketsServeOnceTheyHoldMoreThan10240Bytes) {
  fillBucket(64);
  ASSERT_EQ(Peer::getBucketBytes(region), 10304u);
  EXPECT_EQ(Peer::getState(region), 2u);
  char* cursor = Peer::getCursor(region);
  allocate(57);
  EXPECT_EQ(Peer::getCursor(region), cursor);
  EXPECT_EQ(Peer::getBucketBytes(region), 10240u);
  // No more than that: from now on memory is fresh.
  EXPECT_EQ(Peer::getState(region), 1u);
  EXPECT_EQ(allocate(64), cursor);
}

TEST_F(RegionGeneralTest, BucketsAreLeftAloneUpTo10240Bytes) {
  std::vector<char*> pieces;
  for (int count = 0; count < 160; ++count)
    pieces.push_back(allocate(64));
  for (char* piece : pieces)
    region->discard(piece, 64);
  ASSERT_EQ(Peer::getBucketBytes(region), 10240u);
  EXPECT_EQ(Peer::getState(region), 1u);
  char* cursor = Peer::getCursor(region);
  EXPECT_EQ(allocate(64), cursor);
}

TEST_F(RegionGeneralTest, ASizeWhoseBucketIsEmptyComesFromTheWorkingBlock) {
  fillBucket(64);
  char* cursor = Peer::getCursor(region);
  EXPECT_EQ(allocate(72), cursor);
  EXPECT_EQ(Peer::getState(region), 2u);
  EXPECT_EQ(Peer::getFastLimit(region), Peer::getCursor(region));
}

TEST_F(RegionGeneralTest, AnAlignedRequestTakesALargerPieceAndReturnsTheRest) {
  fillBucket(64);
  char* cursor = Peer::getCursor(region);
  // 64 bytes aligned for 8 hold 40 bytes aligned for 32.
  char* block = allocate(40, 32);
  EXPECT_EQ(reinterpret_cast<uintptr_t>(block) % 32, 0u);
  EXPECT_EQ(Peer::getCursor(region), cursor);
  EXPECT_EQ(Peer::getBucketBytes(region), 10304u - 40);
}

TEST_F(RegionGeneralTest, AlignedRequestsAreAligned) {
  for (size_t alignment : {1u, 2u, 4u, 8u, 16u, 64u, 512u, 4096u})
    for (size_t size : {1u, 100u, 5000u, 10240u, 200000u}) {
      char* block = allocate(size, alignment);
      EXPECT_EQ(reinterpret_cast<uintptr_t>(block) % alignment, 0u);
      allocate(8);
      region->discard(block, size, alignment);
    }
}

TEST_F(RegionGeneralTest, BlocksNeverOverlapInAnySequence) {
  for (uint32_t flagsState : {1u, 5u}) {
    makeRegion(flagsState);
    struct Piece {
      char* start;
      size_t size;
      size_t alignment;
      char mark;
    };
    std::vector<Piece> pieces;
    uint32_t random = 7;
    for (int round = 0; round < 20000; ++round) {
      random = random * 1664525 + 1013904223;
      if (random >> 31 != 0 && !pieces.empty()) {
        std::swap(pieces[random % pieces.size()], pieces.back());
        const Piece piece = pieces.back();
        pieces.pop_back();
        for (size_t index = 0; index < piece.size; ++index)
          ASSERT_EQ(piece.start[index], piece.mark);
        region->discard(piece.start, piece.size, piece.alignment);
        continue;
      }
      const size_t size = 1 + (random >> 8) % (random % 50 == 0 ? 12000 : 150);
      const size_t alignment = random % 5 == 0 ? 32 : 8;
      const Piece piece{allocate(size, alignment), size, alignment, static_cast<char>(round)};
      std::memset(piece.start, piece.mark, size);
      pieces.push_back(piece);
    }
  }
}

TEST_F(RegionGeneralTest, DestroyingGivesEveryBlockBack) {
  allocate(5000);
  allocate(20000);
  allocate(9000);
  // The fixture compares what went out with what came in.
}

TEST_F(RegionGeneralTest, DestroyingWithFalseFreesNothing) {
  RecordingRegion other;
  RegionGeneral* doomed = Peer::create(&other);
  auto* large = static_cast<char*>(doomed->allocate(20000)) - 24;
  doomed->Destroy(false);
  EXPECT_TRUE(other.discards.empty());
  RecordingRegion::release(large);
  RecordingRegion::release(reinterpret_cast<char*>(doomed) - 16);
}

TEST_F(RegionGeneralTest, TracingSendsEachAllocationTheSlowWay) {
  makeRegion(5);
  EXPECT_EQ(Peer::getFastLimit(region), Peer::getCursor(region));
  RegionStats& stats = Peer::getStats(region);
  const uint64_t empty = stats.getCurrentSize();
  EXPECT_EQ(empty, 16u + 96u);
  char* block = allocate(10);
  EXPECT_EQ(stats.getAllocations(), 1u);
  EXPECT_EQ(stats.getCurrentSize(), empty + 10);
  region->discard(block, 10);
  EXPECT_EQ(stats.getFrees(), 1u);
  // The piece counts as fragmentation, beside the array of the buckets.
  EXPECT_EQ(stats.getCurrentSize(), empty + 16 + 128);
  fillBucket(64);
  EXPECT_EQ(Peer::getState(region), 6u);
  allocate(64);
  allocate(64);
  EXPECT_EQ(Peer::getState(region), 5u);
}

TEST_F(RegionGeneralTest, ALargeBlockLeavesNoTraceInTheCounts) {
  makeRegion(5);
  RegionStats& stats = Peer::getStats(region);
  const uint64_t before = stats.getCurrentSize();
  char* block = allocate(10240);
  EXPECT_EQ(stats.getCurrentSize(), before + 12288);
  region->discard(block, 10240);
  EXPECT_EQ(stats.getCurrentSize(), before);
  EXPECT_EQ(stats.getMaximumSize(), before + 12288);
}

TEST_F(RegionGeneralTest, APlainRegionCountsItsBlocks) {
  RegionStats& stats = Peer::getStats(region);
  EXPECT_FALSE(stats.isAccurate());
  EXPECT_EQ(stats.getCurrentSize(), 4096u);
  char* block = allocate(10240);
  EXPECT_EQ(stats.getCurrentSize(), 4096u + 12288u);
  region->discard(block, 10240);
  EXPECT_EQ(stats.getCurrentSize(), 4096u);
  EXPECT_EQ(stats.getAllocations(), 2u);
  EXPECT_EQ(stats.getFrees(), 1u);
}

#ifndef ASAN_POISON_MEMORY_REGION
TEST_F(RegionGeneralTest, MoreThanFourGibibytesInOnePieceKeepTheirSize) {
  constexpr size_t Size = (size_t{5} << 30) + 1;
  char* block = static_cast<char*>(region->allocate(Size));
  EXPECT_EQ(parent.allocations.back(), (size_t{5} << 30) + 4096);
  block[Size - 1] = 1;
  region->discard(block, Size);
  EXPECT_THAT(parent.discards, ElementsAre((size_t{5} << 30) + 4096));
}
#endif

TEST_F(RegionGeneralDeathTest, ASizeThatWouldWrapIsOutOfMemory) {
  for (size_t size : {SIZE_MAX, SIZE_MAX - 7, SIZE_MAX - 4096, SIZE_MAX / 2})
    for (size_t alignment : {8u, 4096u})
      EXPECT_EXIT((void)region->allocate(size, alignment), ExitedWithCode(1),
                  "^Out of memory. Allocation of " + std::to_string(size) + " bytes failed");
}

TEST_F(RegionGeneralDeathTest, AlignmentsArePowersOfTwoUpToAPage) {
  EXPECT_EXIT((void)region->allocate(8, 24), ExitedWithCode(1), "^Assertion failed");
  EXPECT_EXIT((void)region->allocate(8, 8192), ExitedWithCode(1), "^Assertion failed");
}

TEST_F(RegionGeneralDeathTest, AnUnknownStateIsAFault) {
  char* block = allocate(8);
  for (uint32_t state : {0u, 4u, 7u, 8u}) {
    EXPECT_EXIT(
        {
          Peer::setState(region, state);
          (void)region->AllocFull(8, 8, nullptr);
        },
        ExitedWithCode(1),
        "^Internal alloclib error: Unknown flags state in RegionGeneral::AllocFull\n$");
    EXPECT_EXIT(
        {
          Peer::setState(region, state);
          region->DiscardFull(block, 8, 8);
        },
        ExitedWithCode(1),
        "^Internal alloclib error: Unknown flags state in RegionGeneral::DiscardFull\n$");
    EXPECT_EXIT(
        {
          Peer::setState(region, state);
          Peer::setFastLimit(region);
        },
        ExitedWithCode(1), "^Internal alloclib error: Invalid flags in SetBlockWorkingState\n$");
  }
  EXPECT_EXIT(
      {
        Peer::setState(region, 0);
        Peer::setBlockWorkingState(region);
      },
      ExitedWithCode(1), "^Internal alloclib error: Unknown flags in SetBlockWorkingState\n$");
  EXPECT_EXIT(
      {
        Peer::setState(region, 3);
        Peer::setBlockWorkingState(region);
      },
      ExitedWithCode(1),
      "^Internal alloclib error: SLOW_TRANSPARENT occurred in SetBlockWorkingState\n$");
}

TEST_F(RegionGeneralDeathTest, ACursorBehindTheBlockIsAFault) {
  EXPECT_EXIT(
      {
        Peer::setCursor(region, Peer::getWorkingEnd(region) + 8);
        Peer::setBlockWorkingState(region);
      },
      ExitedWithCode(1),
      "^Internal alloclib error: allocation went beyond the end of the working block\n$");
}

using RegionGeneralCreateTest = RegionTest;
using RegionGeneralCreateDeathTest = RegionTest;

TEST_F(RegionGeneralCreateTest, AFreshRegionIsOnePageWhateverTheInitialSize) {
  RegionGeneral* region = RegionGeneral::Create(100000, "large wish");
  EXPECT_EQ(Peer::getState(region), 1u);
  EXPECT_EQ(Peer::getWorkingEnd(region) - reinterpret_cast<char*>(region), 4080);
  region->Destroy(true);
}

TEST_F(RegionGeneralCreateTest, TheTracingModeMakesAccurateRegions) {
  setDebugMode(Debug_Tracing);
  RegionGeneral* region = RegionGeneral::Create(0, "traced");
  EXPECT_EQ(Peer::getState(region), 5u);
  EXPECT_TRUE(Peer::getStats(region).isAccurate());
  region->Destroy(true);
}

TEST_F(RegionGeneralCreateTest, TheTransparentModeForwardsToARegionOfItsOwn) {
  setDebugMode(Debug_Transparent);
  RegionGeneral* region = RegionGeneral::Create(20000, "shell");
  EXPECT_EQ(Peer::getState(region), 3u);
  void* small = region->allocate(10);
  void* second = region->allocate(10);
  EXPECT_NE(small, second);
  void* large = region->allocate(20000);
  region->discard(small, 10);
  region->discard(large, 20000);
  EXPECT_EQ(Peer::getState(region), 3u);
  // The initial size is that of the inner region's first block.
  EXPECT_THAT(getReport(false, false), testing::HasSubstr("shell,               20480,"));
  region->Destroy(true);
}

TEST_F(RegionGeneralCreateTest, ATraceTellsOfEachNewBlockInEveryMode) {
  setTraceLevel(1);
  for (int mode : {Debug_Plain, Debug_Tracing}) {
    setDebugMode(mode);
    testing::internal::CaptureStderr();
    RegionGeneral* region = RegionGeneral::Create(0, "grows");
    (void)region->allocate(8000);
    (void)region->allocate(20000);
    region->Destroy(true);
    std::istringstream trace(testing::internal::GetCapturedStderr());
    int count = 0;
    for (std::string line; std::getline(trace, line);)
      count += line.starts_with("(grows:") && line.ends_with(") region extended");
    EXPECT_EQ(count, 3) << trace.str();
  }
}

TEST_F(RegionGeneralCreateDeathTest, AnUnknownModeIsAFault) {
  for (int mode : {-1, 4})
    EXPECT_EXIT(
        {
          setDebugMode(mode);
          RegionGeneral::Create(0, "none");
        },
        ExitedWithCode(1),
        "^Internal alloclib error: Unsupported debug mode in RegionGeneral::Create\n$");
}

TEST_F(RegionGeneralCreateDeathTest, AWishThatWouldWrapIsOutOfMemory) {
  EXPECT_EXIT(
      {
        setDebugMode(Debug_Transparent);
        RegionGeneral::Create(SIZE_MAX, "too large");
      },
      ExitedWithCode(1), "^Out of memory. Allocation of 18446744073709551615 bytes failed");
}

#ifdef ASAN_POISON_MEMORY_REGION
TEST_F(RegionGeneralDeathTest, TheSanitizerSeesUsesAfterADiscardAndBehindABlock) {
  char* block = allocate(20);
  EXPECT_DEATH(block[20] = 1, "use-after-poison");
  region->discard(block, 20);
  EXPECT_DEATH(block[16] = 1, "use-after-poison");
}
#endif

} // namespace
} // namespace alloclib
