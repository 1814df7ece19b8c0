// SPDX-License-Identifier: Apache-2.0
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
  if (delta > Furthest - firstOffset) return false;
  // Where `second` is, as the first root and as its own root see it.
  const uint64_t wanted = firstOffset + delta;
  PlacementNode* lower = wanted >= secondOffset ? firstRoot : secondRoot;
  PlacementNode* upper = wanted >= secondOffset ? secondRoot : firstRoot;
  const uint64_t distance = std::max(wanted, secondOffset) - std::min(wanted, secondOffset);
  if (distance > Furthest - upper->m_Reach) return false;
  lower->m_Reach = std::max(lower->m_Reach, distance + upper->m_Reach);
  upper->hangUnder(lower, distance);
  return true;
}

void PlacementNode::promoteLowestChild() {
  PlacementNode* lowest = m_FirstChild;
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
    const uint64_t offset = child->m_Offset + m_Offset;
    child->unhang();
    child->hangUnder(m_Parent, offset);
  }
}

void PlacementNode::remove() {
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
