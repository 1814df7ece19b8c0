// SPDX-License-Identifier: Apache-2.0
//
// What an array and its region owe each other: when memory is asked for, what stands at the end of
// a block, and what goes back when the array or the region goes first.

#include "elfext/interface/fast_array.h"

#include "alloclib/interface/region_objects.h"
#include "counting_region.h"

#include <array>
#include <cstdint>

namespace elfext {
namespace {

// The one block that is out.
template <class T>
void expectBlockOf(const CountingRegion& region, const FastArray<T>& array, size_t size) {
  ASSERT_EQ(region.getBlocks().size(), 1u);
  const auto& [start, block] = *region.getBlocks().begin();
  EXPECT_EQ(static_cast<const void*>(array.begin()), start);
  EXPECT_EQ(block.size, size);
  EXPECT_EQ(block.alignment, 8u);
  void* lastWord = nullptr;
  std::memcpy(&lastWord, static_cast<char*>(start) + size - 8, 8);
  EXPECT_EQ(lastWord, start);
}

using ThreeBytes = std::array<char, 3>;

TEST(FastArrayTest, EndsItsBlockWithTheBlocksAddress) {
  CountingRegion region;
  {
    const FastArray<char> array(&region);
    expectBlockOf(region, array, 8 + 8);
  }
  {
    const FastArray<ThreeBytes> array(&region, 3);
    expectBlockOf(region, array, 16 + 8);
  }
  const FastArray<uint64_t> array(&region, 5);
  expectBlockOf(region, array, 40 + 8);
}

TEST(FastArrayTest, EndsEveryLaterBlockSoToo) {
  CountingRegion region;
  FastArray<ThreeBytes> array(&region);
  array.append(ThreeBytes{});
  for (size_t capacity : {2u, 4u, 7u, 11u}) {
    while (array.getSize() < capacity)
      array.append(ThreeBytes{});
    expectBlockOf(region, array, alloclib::roundUp(capacity * 3, 8) + 8);
  }
}

TEST(FastArrayTest, AllocatesForTheSecondElementNotTheFirst) {
  CountingRegion region;
  FastArray<int> array(&region);
  EXPECT_EQ(region.getAllocations(), 1u);
  array.append(1);
  EXPECT_EQ(region.getAllocations(), 1u);
  array.append(2);
  EXPECT_EQ(region.getAllocations(), 2u);
  EXPECT_EQ(array.getCapacity(), 2u);
}

TEST(FastArrayTest, GivesItsBlockBackWhenItGoes) {
  CountingRegion region;
  {
    FastArray<int> array(&region);
    for (int value = 0; value < 1000; ++value)
      array.append(value);
    EXPECT_EQ(region.getBlocks().size(), 1u);
  }
  EXPECT_TRUE(region.getBlocks().empty());
}

TEST(FastArrayTest, StartsWithElementsToFill) {
  CountingRegion region;
  FastArray<uint16_t> array(&region, 3);
  EXPECT_EQ(array.getSize(), 3u);
  EXPECT_EQ(array.getCapacity(), 3u);
  EXPECT_EQ(array[2], 0xA5A5u);
}

TEST(FastArrayTest, HasRoomForOneWhenMadeWithNone) {
  CountingRegion region;
  const FastArray<int> array(&region, 0);
  EXPECT_EQ(array.getSize(), 0u);
  EXPECT_EQ(array.getCapacity(), 1u);
}

TEST(FastArrayTest, LeavesNewElementsAsTheyAreInMemory) {
  CountingRegion region;
  FastArray<uint16_t> array(&region);
  array.append(1);
  array.setSize(3);
  EXPECT_EQ(array[0], 1u);
  EXPECT_EQ(array[2], 0xA5A5u);
}

TEST(FastArrayTest, MayGoWithItsRegion) {
  alloclib::initialise();
  {
    const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(4096, "container tests"));
    auto* array = alloclib::create<FastArray<uint64_t>>(*region, region.get());
    for (uint64_t value = 0; value < 10000; ++value)
      array->append(value);
    for (uint32_t index = 0; index < 10000; ++index)
      ASSERT_EQ((*array)[index], index);
  }
  alloclib::shutDown();
}

TEST(FastArrayTest, MustHaveARegion) {
  EXPECT_FAILED_ASSERTION(FastArray<int>{noRegion}, "region != NULL");
  EXPECT_FAILED_ASSERTION(FastArray<int>(noRegion, 3), "region != NULL");
}

} // namespace
} // namespace elfext
