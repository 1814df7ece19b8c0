// SPDX-License-Identifier: Apache-2.0
//
// What the objects of one module share of their build attributes: blocks, and sets of attributes.
// All of it lives as long as the cache, and never changes.
//
// Objects hold its pointers and compare by them. A hostile object can make as many sets as it has
// bytes for, and no more: the reader's budget ends that.
#pragma once

#include "elfext/interface/build_attributes.h"
#include "elfext/interface/build_attributes_block.h"

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>

namespace elfext {

class BuildAttributesCache {
public:
  /// The block of that vendor and those bytes, which are copied if it is new.
  const BuildAttributesBlock* getBlock(std::string_view vendor, std::span<const uint8_t> data);

  /// The set that equals the given one. Of sets that compare equal, though they differ in what
  /// comparison leaves out, the first one stays.
  const BuildAttributes* getBuildAttributes(const BuildAttributes& attributes);

  /// The set that an attribute text stands for.
  const BuildAttributes& getBuildAttributesOf(std::string_view text);

private:
  struct AttributesHash {
    size_t operator()(const BuildAttributes& attributes) const { return attributes.getHash(); }
  };
  /// Vendors are pooled, so their addresses tell them apart.
  struct BlockKey {
    const std::string* vendor;
    std::string_view data;

    bool operator==(const BlockKey&) const = default;
  };
  struct BlockHash {
    size_t operator()(const BlockKey& key) const {
      return std::hash<const void*>{}(key.vendor) ^ std::hash<std::string_view>{}(key.data);
    }
  };

  std::unordered_set<std::string> m_Vendors;
  std::deque<std::string> m_Data; ///< of the blocks
  std::deque<BuildAttributesBlock> m_Blocks;
  std::unordered_map<BlockKey, const BuildAttributesBlock*, BlockHash> m_BlocksByContent;
  std::unordered_set<BuildAttributes, AttributesHash> m_Attributes;
  std::unordered_map<std::string, BuildAttributes> m_AttributesByText;
};

} // namespace elfext
