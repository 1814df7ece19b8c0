// SPDX-License-Identifier: Apache-2.0
//
// The root region: what it counts, how it aligns, and how it refuses what the host cannot have. Its
// balance is how a forgotten block is found at all.

#include "region_fixture.h"

#include <cstring>

namespace alloclib {
namespace {

using testing::ExitedWithCode;

using RegionMallocFreeTest = RegionTest;
using RegionMallocFreeDeathTest = RegionTest;

TEST_F(RegionMallocFreeTest, ItCountsWhatItHolds) {
  RegionMallocFree* region = RegionMallocFree::Create("heap");
  void* first = region->AllocFull(100, 8, nullptr);
  void* second = region->AllocFull(1000, 8, nullptr);
  std::memset(second, 1, 1000);
  EXPECT_EQ(region->getCurrentSize(), 1100u);
  region->DiscardFull(first, 100, 8);
  EXPECT_EQ(region->getCurrentSize(), 1000u);
  region->DiscardFull(second, 1000, 8);
  region->Destroy(true);
}

TEST_F(RegionMallocFreeTest, ItAlignsForPages) {
  RegionMallocFree* region = RegionMallocFree::Create("heap");
  void* block = region->AllocFull(10, 4096, nullptr);
  EXPECT_EQ(reinterpret_cast<uintptr_t>(block) % 4096, 0u);
  region->DiscardFull(block, 10, 4096);
  region->Destroy(true);
}

TEST_F(RegionMallocFreeDeathTest, ItGivesNoEmptyBlocks) {
  EXPECT_EXIT((void)getDefaultParent()->AllocFull(0, 8, nullptr), ExitedWithCode(1),
              "^Internal alloclib error: Cannot allocate 0 bytes of memory from the system\n$");
}

TEST_F(RegionMallocFreeDeathTest, ItCannotEndWhileMemoryIsOut) {
  RegionMallocFree* region = RegionMallocFree::Create("heap");
  void* block = region->AllocFull(1, 8, nullptr);
  EXPECT_EXIT(region->Destroy(true), ExitedWithCode(1),
              "^Internal alloclib error: RegionMallocFree cannot free memory on Destroy\\(\\)\n$");
  region->DiscardFull(block, 1, 8);
  region->Destroy(true);
}

TEST_F(RegionMallocFreeTest, ItEndsWithMemoryOutIfNothingIsToBeFreed) {
  RegionMallocFree* region = RegionMallocFree::Create("heap");
  void* block = region->AllocFull(1, 8, nullptr);
  region->Destroy(false);
  std::free(block);
}

TEST_F(RegionMallocFreeDeathTest, ASizeThatTheHostCannotHaveIsOutOfMemory) {
  EXPECT_EXIT((void)getDefaultParent()->AllocFull(SIZE_MAX - 100, 8, nullptr), ExitedWithCode(1),
              "^Out of memory. Allocation of 18446744073709551515 bytes failed");
}

TEST_F(RegionMallocFreeTest, PagesAreReportedAs4096Bytes) {
  EXPECT_EQ(getDefaultParent()->getPageSize(), 4096u);
  getDefaultParent()->updateStats();
}

} // namespace
} // namespace alloclib
