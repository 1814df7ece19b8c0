// SPDX-License-Identifier: Apache-2.0
//
// Overlaps among many extents, and who holds a place: what sorting finds is what looking at all
// pairs finds, the first pair included, since that is the one that is reported. Extents may reach
// the largest number.

#include "elfext/src/bytes/extents.h"

#include <gtest/gtest.h>

#include <random>

namespace elfext {

namespace {

std::vector<Extent> randomExtents(std::mt19937& random, size_t count, uint64_t range,
                                  bool mayBeEmpty) {
  std::vector<Extent> extents;
  for (uint32_t i = 0; i < count; ++i) {
    const uint64_t start = random() % range;
    const uint64_t size = random() % 8 + (mayBeEmpty ? 0 : 1);
    extents.push_back({start, start + size, i * 2});
  }
  return extents;
}

bool overlap(const Extent& left, const Extent& right) {
  return left.start < right.end && right.start < left.end;
}

std::optional<std::pair<uint32_t, uint32_t>> plainOverlap(const std::vector<Extent>& extents) {
  for (size_t i = 0; i < extents.size(); ++i) {
    for (size_t j = i + 1; j < extents.size(); ++j) {
      if (overlap(extents[i], extents[j])) return std::pair(extents[i].id, extents[j].id);
    }
  }
  return std::nullopt;
}

uint32_t plainHolder(const std::vector<Extent>& outer, const Extent& inner) {
  for (const Extent& extent : outer) {
    if (extent.start <= inner.start && inner.end <= extent.end) return extent.id;
  }
  return NoExtent;
}

} // namespace

TEST(ExtentsTest, FindsTheFirstPairThatOverlaps) {
  EXPECT_EQ(findFirstOverlap({}), std::nullopt);
  const Extent touching[] = {{0, 4, 1}, {4, 8, 2}, {8, 12, 3}};
  EXPECT_EQ(findFirstOverlap(touching), std::nullopt);
  const Extent late[] = {{100, 104, 1}, {0, 4, 2}, {50, 60, 3}, {55, 56, 4}, {103, 104, 5}};
  EXPECT_EQ(findFirstOverlap(late), std::pair(1U, 5U));
  const Extent same[] = {{0, 4, 1}, {0, 4, 2}, {0, 4, 3}};
  EXPECT_EQ(findFirstOverlap(same), std::pair(1U, 2U));
}

TEST(ExtentsTest, FindsTheSamePairAsAllComparisonsDo) {
  std::mt19937 random(1);
  for (int round = 0; round < 2000; ++round) {
    const std::vector<Extent> extents = randomExtents(random, random() % 12, 100, false);
    EXPECT_EQ(findFirstOverlap(extents), plainOverlap(extents));
  }
}

// Code and what belongs to it take turns, each kind going up by itself; then what is found rests on
// these being put together well. Of too many such kinds it rests on sorting.
TEST(ExtentsTest, FindsTheSamePairWhereSomeOrdersTakeTurns) {
  std::mt19937 random(3);
  for (int round = 0; round < 500; ++round) {
    const auto orders = static_cast<uint32_t>(1 + random() % 6);
    std::vector<uint64_t> next(orders);
    for (uint32_t i = 0; i < orders; ++i)
      next[i] = i * uint64_t{2000};
    std::vector<Extent> extents;
    for (uint32_t id = 0; id < 65 + random() % 40; ++id) {
      uint64_t& start = next[random() % orders];
      const uint64_t size = 1 + random() % 8;
      extents.push_back({start, start + size, id});
      // Now and then one touches or overlaps the one in front of it.
      start += random() % 100 == 0 ? random() % size : size + random() % 8;
    }
    EXPECT_EQ(findFirstOverlap(extents), plainOverlap(extents));
  }
}

TEST(ExtentsTest, FindsTheSameHolderAsAllComparisonsDo) {
  std::mt19937 random(2);
  for (int round = 0; round < 2000; ++round) {
    const std::vector<Extent> outer = randomExtents(random, random() % 12, 20, true);
    const std::vector<Extent> inner = randomExtents(random, random() % 12, 20, true);
    const std::vector<uint32_t> holders = findFirstHolders(outer, inner);
    ASSERT_EQ(holders.size(), inner.size());
    for (size_t i = 0; i < inner.size(); ++i)
      EXPECT_EQ(holders[i], plainHolder(outer, inner[i]));
  }
}

TEST(ExtentsTest, ReachTheLargestNumber) {
  const Extent outer[] = {{5, UINT64_MAX, 3}};
  const Extent inner[] = {{UINT64_MAX - 1, UINT64_MAX, 0}, {4, 6, 0}};
  EXPECT_EQ(findFirstHolders(outer, inner), (std::vector<uint32_t>{3, NoExtent}));
}

} // namespace elfext
