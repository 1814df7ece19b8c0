// SPDX-License-Identifier: Apache-2.0
//
// The placement forest: regions that must keep a fixed distance from each other in the file are in
// one tree, whose root is the lowest-placed of them. Only distances are known; where a tree starts
// is for the layout to say. All offsets are in bytes and not negative.
//
// Finding a root shortens the path to it, so links may be made in any order at nearly no cost.
//
// Hostile files have ten thousands of regions with offsets up to 2^64 - 1: a distance that would
// not fit is refused before anything is linked.
#pragma once

#include <cstdint>
#include <span>

namespace elfext {

class PlacementNode {
public:
  PlacementNode() = default;
  /// A node that goes leaves the distances between the others as they are.
  ~PlacementNode() { remove(); }
  PlacementNode(const PlacementNode&) = delete;
  PlacementNode& operator=(const PlacementNode&) = delete;

  /// The root of the node's tree; stores the node's distance from it.
  PlacementNode* find(uint64_t* offset);

  /// Says that `second` starts `delta` bytes after `first`. False, with the forest as it was, if
  /// the two are in one tree already at another distance, or if a distance does not fit 64 bits.
  static bool link(PlacementNode& first, PlacementNode& second, uint64_t delta);

  /// Takes the node out of its tree.
  void remove();

  /// Keeps only these nodes in their trees, at the distances that they have; the caller then makes
  /// all others forget. Linear, where taking the others out one by one might not be.
  static void keepOnly(std::span<PlacementNode* const> nodes);
  /// Makes the node a tree of its own without a look at its neighbours, which go the same way.
  void forget();

private:
  void hangUnder(PlacementNode* parent, uint64_t offset);
  void unhang();
  void promoteLowestChild();
  void giveChildrenToParent();

  PlacementNode* m_Parent = nullptr;
  /// From the parent; 0 in a root.
  uint64_t m_Offset = 0;
  /// In a root: no node of the tree is further away.
  uint64_t m_Reach = 0;
  PlacementNode* m_FirstChild = nullptr;
  PlacementNode* m_PreviousSibling = nullptr;
  PlacementNode* m_NextSibling = nullptr;
};

} // namespace elfext
