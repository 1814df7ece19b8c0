// SPDX-License-Identifier: Apache-2.0
//
// Keeps the forest in shape: a disjoint-set forest whose links carry distances. The reader links
// the regions of a file that overlap, editing takes single nodes out, and pruning keeps only some.
// A file may have ten thousands of regions that all hang in one tree, and sizes that don't fit 64
// bits when added up; so no walk recurses, and `m_Reach` says in advance whether a sum would wrap.
#include "elfext/interface/placement_node.h"

#include "elfext/interface/hash_table.h"

#include <algorithm>
#include <limits>
#include <vector>

namespace elfext {

void PlacementNode::hangUnder(PlacementNode* parent, uint64_t offset) {
  m_Parent = parent;
  m_Offset = offset;
  m_PreviousSibling = nullptr;
  m_NextSibling = parent->m_FirstChild;
  if (m_NextSibling != nullptr) m_NextSibling->m_PreviousSibling = this;
  parent->m_FirstChild = this;
}

void PlacementNode::unhang() {
  if (m_Parent == nullptr) return;
  // Children are linked both ways, so that one of ten thousand siblings leaves without a search.
  if (m_PreviousSibling != nullptr)
    m_PreviousSibling->m_NextSibling = m_NextSibling;
  else
    m_Parent->m_FirstChild = m_NextSibling;
  if (m_NextSibling != nullptr) m_NextSibling->m_PreviousSibling = m_PreviousSibling;
  m_Parent = nullptr;
  m_PreviousSibling = nullptr;
  m_NextSibling = nullptr;
  m_Offset = 0;
}

PlacementNode* PlacementNode::find(uint64_t* offset) {
  PlacementNode* root = this;
  *offset = 0;
  for (; root->m_Parent != nullptr; root = root->m_Parent)
    *offset += root->m_Offset;
  // Path compression, in a second walk: each node that was passed now hangs at the root. What is
  // still above it is what its own distance leaves of the whole.
  uint64_t distance = *offset;
  for (PlacementNode* node = this; node != root && node->m_Parent != root;) {
    PlacementNode* parent = node->m_Parent;
    const uint64_t distanceOfParent = distance - node->m_Offset;
    node->unhang();
    node->hangUnder(root, distance);
    node = parent;
    distance = distanceOfParent;
  }
  return root;
}

bool PlacementNode::link(PlacementNode& first, PlacementNode& second, uint64_t delta) {
  constexpr uint64_t Furthest = std::numeric_limits<uint64_t>::max();
  uint64_t firstOffset = 0;
  uint64_t secondOffset = 0;
  PlacementNode* firstRoot = first.find(&firstOffset);
  PlacementNode* secondRoot = second.find(&secondOffset);
  if (firstRoot == secondRoot)
    return firstOffset <= secondOffset && secondOffset - firstOffset == delta;
  // Offsets are not negative, so a tree can only be told of what fits: distances come from the
  // file.
  if (delta > Furthest - firstOffset) return false;
  // Where `second` is, as the first root and as its own root see it.
  const uint64_t wanted = firstOffset + delta;
  PlacementNode* lower = wanted >= secondOffset ? firstRoot : secondRoot;
  PlacementNode* upper = wanted >= secondOffset ? secondRoot : firstRoot;
  const uint64_t distance = std::max(wanted, secondOffset) - std::min(wanted, secondOffset);
  // No node of the upper tree may come to lie at a distance that wraps, now or after later finds.
  if (distance > Furthest - upper->m_Reach) return false;
  lower->m_Reach = std::max(lower->m_Reach, distance + upper->m_Reach);
  upper->hangUnder(lower, distance);
  return true;
}

void PlacementNode::promoteLowestChild() {
  PlacementNode* lowest = m_FirstChild;
  // The first of equally low ones, in the order of the list.
  for (PlacementNode* child = m_FirstChild; child != nullptr; child = child->m_NextSibling)
    if (child->m_Offset < lowest->m_Offset) lowest = child;
  const uint64_t distance = lowest->m_Offset;
  lowest->unhang();
  lowest->m_Reach = m_Reach - distance;
  while (PlacementNode* child = m_FirstChild) {
    const uint64_t offset = child->m_Offset - distance;
    child->unhang();
    child->hangUnder(lowest, offset);
  }
}

void PlacementNode::giveChildrenToParent() {
  while (PlacementNode* child = m_FirstChild) {
    // No more than the root's reach, so this can't wrap.
    const uint64_t offset = child->m_Offset + m_Offset;
    child->unhang();
    child->hangUnder(m_Parent, offset);
  }
}

void PlacementNode::remove() {
  // Either way the nodes that stay keep their distances from each other.
  if (m_Parent != nullptr)
    giveChildrenToParent();
  else if (m_FirstChild != nullptr)
    promoteLowestChild();
  unhang();
  m_Reach = 0;
}

void PlacementNode::forget() {
  m_Parent = nullptr;
  m_FirstChild = nullptr;
  m_PreviousSibling = nullptr;
  m_NextSibling = nullptr;
  m_Offset = 0;
  m_Reach = 0;
}

// A tree of which nodes go keeps its distances; its lowest node that stays becomes the root, the
// first one of these in the order given.
void PlacementNode::keepOnly(std::span<PlacementNode* const> nodes) {
  // All places are read first: as soon as one node forgets, the walks to its root end early.
  struct Place {
    PlacementNode* root;
    uint64_t offset;
  };
  std::vector<Place> places(nodes.size());
  HashTable<PlacementNode*, size_t> lowestOfRoot;
  for (size_t index = 0; index < nodes.size(); ++index) {
    places[index].root = nodes[index]->find(&places[index].offset);
    size_t* lowest = lowestOfRoot.find(places[index].root);
    if (lowest == nullptr)
      lowestOfRoot.put(places[index].root, index);
    else if (places[index].offset < places[*lowest].offset)
      *lowest = index;
  }
  for (PlacementNode* node : nodes)
    node->forget();
  for (size_t index = 0; index < nodes.size(); ++index) {
    const size_t lowest = lowestOfRoot.get(places[index].root);
    if (lowest == index) continue;
    const uint64_t distance = places[index].offset - places[lowest].offset;
    nodes[index]->hangUnder(nodes[lowest], distance);
    nodes[lowest]->m_Reach = std::max(nodes[lowest]->m_Reach, distance);
  }
}

} // namespace elfext
