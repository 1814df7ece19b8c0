// SPDX-License-Identifier: Apache-2.0
//
// The placement forest: whatever is linked and removed, in whatever order, the distances that are
// left are those that were told. Distances come from files: sums beyond 64 bits must be refused,
// and a long chain must cost no more than its length.

#include "elfext/interface/placement_node.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <optional>
#include <random>
#include <vector>

namespace elfext {
namespace {

constexpr uint64_t Furthest = 0xFFFFFFFFFFFFFFFF;

// How far `second` is behind `first`; nothing if nobody knows.
std::optional<int64_t> distance(PlacementNode& first, PlacementNode& second) {
  uint64_t firstOffset = 0;
  uint64_t secondOffset = 0;
  if (first.find(&firstOffset) != second.find(&secondOffset)) return std::nullopt;
  return static_cast<int64_t>(secondOffset - firstOffset);
}

bool isRoot(PlacementNode& node) {
  uint64_t offset = 1;
  return node.find(&offset) == &node && offset == 0;
}

TEST(PlacementTest, StartsAsATreeOfOne) {
  PlacementNode first;
  PlacementNode second;
  EXPECT_TRUE(isRoot(first));
  EXPECT_FALSE(distance(first, second));
}

TEST(PlacementTest, LinksAtADistance) {
  PlacementNode first;
  PlacementNode second;
  EXPECT_TRUE(PlacementNode::link(first, second, 100));
  EXPECT_EQ(distance(first, second), 100);
  EXPECT_TRUE(isRoot(first));
  EXPECT_FALSE(isRoot(second));
}

TEST(PlacementTest, AgreesToTheSameDistanceAgainAndToNoOther) {
  PlacementNode first;
  PlacementNode second;
  ASSERT_TRUE(PlacementNode::link(first, second, 100));
  EXPECT_TRUE(PlacementNode::link(first, second, 100));
  EXPECT_FALSE(PlacementNode::link(first, second, 101));
  EXPECT_FALSE(PlacementNode::link(second, first, 100));
  EXPECT_FALSE(PlacementNode::link(second, first, 0));
  EXPECT_EQ(distance(first, second), 100);
}

TEST(PlacementTest, AddsDistancesUp) {
  std::array<PlacementNode, 4> nodes;
  ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[1], 10));
  ASSERT_TRUE(PlacementNode::link(nodes[2], nodes[3], 5));
  ASSERT_TRUE(PlacementNode::link(nodes[1], nodes[3], 7));
  EXPECT_EQ(distance(nodes[0], nodes[2]), 12);
  EXPECT_EQ(distance(nodes[0], nodes[3]), 17);
  EXPECT_TRUE(isRoot(nodes[0]));
}

TEST(PlacementTest, MakesTheLowestPlacedOneTheRoot) {
  std::array<PlacementNode, 4> nodes;
  ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[1], 10));
  ASSERT_TRUE(PlacementNode::link(nodes[2], nodes[3], 50));
  // nodes[2] is 30 before nodes[0].
  ASSERT_TRUE(PlacementNode::link(nodes[1], nodes[3], 10));
  EXPECT_TRUE(isRoot(nodes[2]));
  EXPECT_EQ(distance(nodes[2], nodes[0]), 30);
}

TEST(PlacementTest, RefusesDistancesBeyond64Bits) {
  std::array<PlacementNode, 4> nodes;
  ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[1], Furthest));
  EXPECT_FALSE(PlacementNode::link(nodes[1], nodes[2], 1));
  EXPECT_FALSE(distance(nodes[1], nodes[2]));
  ASSERT_TRUE(PlacementNode::link(nodes[2], nodes[3], 5));
  // nodes[3] would be 5 too far, though nodes[2] is not.
  EXPECT_FALSE(PlacementNode::link(nodes[0], nodes[2], Furthest));
  EXPECT_FALSE(distance(nodes[0], nodes[2]));
  EXPECT_TRUE(PlacementNode::link(nodes[0], nodes[2], Furthest - 5));
  EXPECT_EQ(distance(nodes[1], nodes[3]), 0);
}

TEST(PlacementTest, KeepsDistancesWhenTheRootGoes) {
  std::array<PlacementNode, 5> nodes;
  for (size_t index = 1; index < nodes.size(); ++index)
    ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[index], 100 - 10 * index));
  nodes[0].remove();
  EXPECT_TRUE(isRoot(nodes[0]));
  EXPECT_FALSE(distance(nodes[0], nodes[1]));
  EXPECT_TRUE(isRoot(nodes[4]));
  EXPECT_EQ(distance(nodes[4], nodes[1]), 30);
  EXPECT_EQ(distance(nodes[3], nodes[2]), 10);
}

TEST(PlacementTest, KeepsDistancesWhenAnInnerNodeGoes) {
  std::array<PlacementNode, 5> nodes;
  ASSERT_TRUE(PlacementNode::link(nodes[1], nodes[2], 1));
  ASSERT_TRUE(PlacementNode::link(nodes[1], nodes[3], 2));
  // nodes[1] keeps its children under a new root.
  ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[1], 40));
  nodes[1].remove();
  EXPECT_FALSE(distance(nodes[0], nodes[1]));
  EXPECT_EQ(distance(nodes[0], nodes[2]), 41);
  EXPECT_EQ(distance(nodes[2], nodes[3]), 1);
}

TEST(PlacementTest, KeepsDistancesWhenALeafGoes) {
  std::array<PlacementNode, 3> nodes;
  ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[1], 1));
  ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[2], 2));
  nodes[1].remove();
  EXPECT_EQ(distance(nodes[0], nodes[2]), 2);
  nodes[2].remove();
  EXPECT_TRUE(isRoot(nodes[0]));
  EXPECT_TRUE(isRoot(nodes[2]));
}

TEST(PlacementTest, CanBeLinkedAgainAfterRemoval) {
  std::array<PlacementNode, 2> nodes;
  ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[1], Furthest));
  nodes[0].remove();
  EXPECT_TRUE(PlacementNode::link(nodes[1], nodes[0], Furthest));
  EXPECT_TRUE(isRoot(nodes[1]));
}

TEST(PlacementTest, LetsANodeGoThatIsDestroyed) {
  PlacementNode first;
  PlacementNode third;
  {
    PlacementNode second;
    ASSERT_TRUE(PlacementNode::link(first, second, 5));
    ASSERT_TRUE(PlacementNode::link(second, third, 5));
  }
  EXPECT_EQ(distance(first, third), 10);
}

TEST(PlacementTest, KeepsTheDistancesBetweenThoseThatStay) {
  std::array<PlacementNode, 6> nodes;
  for (size_t index = 1; index < 4; ++index)
    ASSERT_TRUE(PlacementNode::link(nodes[0], nodes[index], 10 * index));
  ASSERT_TRUE(PlacementNode::link(nodes[4], nodes[5], 7));
  const std::array<PlacementNode*, 4> staying = {&nodes[3], &nodes[2], &nodes[4], &nodes[5]};
  PlacementNode::keepOnly(staying);
  nodes[0].forget();
  nodes[1].forget();
  EXPECT_TRUE(isRoot(nodes[0]));
  EXPECT_TRUE(isRoot(nodes[1]));
  EXPECT_TRUE(isRoot(nodes[2]));
  EXPECT_EQ(distance(nodes[2], nodes[3]), 10);
  EXPECT_EQ(distance(nodes[4], nodes[5]), 7);
  EXPECT_FALSE(distance(nodes[2], nodes[4]));
}

// True places decide which links are possible; the forest may never contradict them.
TEST(PlacementTest, NeverContradictsTheTruePlaces) {
  std::mt19937 random(1);
  std::vector<PlacementNode> nodes(60);
  std::vector<uint64_t> places(nodes.size());
  for (uint64_t& place : places)
    place = random() % 1000;
  const auto pick = [&] { return random() % nodes.size(); };
  for (int step = 0; step < 3000; ++step) {
    const size_t one = pick();
    const size_t other = pick();
    const size_t lower = places[one] <= places[other] ? one : other;
    const size_t upper = lower == one ? other : one;
    if (random() % 8 == 0) {
      nodes[one].remove();
    } else if (lower != upper) {
      ASSERT_TRUE(PlacementNode::link(nodes[lower], nodes[upper], places[upper] - places[lower]));
    }
    for (int look = 0; look < 5; ++look) {
      const size_t from = pick();
      const size_t to = pick();
      const std::optional<int64_t> found = distance(nodes[from], nodes[to]);
      if (!found) continue;
      ASSERT_EQ(*found, static_cast<int64_t>(places[to] - places[from]));
    }
  }
}

TEST(PlacementTest, TakesALongChainQuickly) {
  std::vector<PlacementNode> nodes(100'000);
  for (size_t index = nodes.size() - 1; index > 0; --index)
    ASSERT_TRUE(PlacementNode::link(nodes[index - 1], nodes[index], 1));
  for (size_t index = 0; index < nodes.size(); ++index)
    ASSERT_EQ(distance(nodes[0], nodes[index]), static_cast<int64_t>(index));
  // Each would hand all others to the next as it goes.
  for (PlacementNode& node : nodes)
    node.forget();
}

} // namespace
} // namespace elfext
