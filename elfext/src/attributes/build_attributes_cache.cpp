// SPDX-License-Identifier: Apache-2.0
//
// One object for equal blocks and one for equal sets, so that the objects of a module share them
// and tell them apart by address. A hostile section has thousands of different ones: all look-ups
// are by hash, and what is kept is bounded by the section's bytes and by the injector's budget.
//
// Deques and node-based tables, since what has been handed out must not move.
#include "elfext/interface/build_attributes_cache.h"

namespace elfext {

namespace {

std::string_view asText(std::span<const uint8_t> data) {
  return {reinterpret_cast<const char*>(data.data()), data.size()};
}

} // namespace

const BuildAttributesBlock* BuildAttributesCache::getBlock(std::string_view vendor,
                                                           std::span<const uint8_t> data) {
  // Pooled first: the key of a block has the vendor by address.
  const std::string& pooledVendor = *m_Vendors.emplace(vendor).first;
  const auto found = m_BlocksByContent.find({&pooledVendor, asText(data)});
  if (found != m_BlocksByContent.end()) return found->second;
  const std::string& pooledData = m_Data.emplace_back(asText(data));
  const BuildAttributesBlock& block = m_Blocks.emplace_back(
      pooledVendor,
      std::span(reinterpret_cast<const uint8_t*>(pooledData.data()), pooledData.size()));
  m_BlocksByContent.emplace(BlockKey{&pooledVendor, pooledData}, &block);
  return &block;
}

const BuildAttributes* BuildAttributesCache::getBuildAttributes(const BuildAttributes& attributes) {
  return &*m_Attributes.insert(attributes).first;
}

const BuildAttributes& BuildAttributesCache::getBuildAttributesOf(std::string_view text) {
  return m_AttributesByText.try_emplace(std::string(text), text).first->second;
}

} // namespace elfext
