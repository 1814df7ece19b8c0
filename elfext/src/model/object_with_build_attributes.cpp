// SPDX-License-Identifier: Apache-2.0
//
// What an object has of its own, what it inherits (a section from its module, a hosted symbol from
// its section), and what comes to hold of it: its own on top of the inherited, unless
// Tag_nodefaults cuts it off. Blocks are the bytes behind the attributes, one a vendor; both are
// the module cache's.
#include "elfext/interface/object_with_build_attributes.h"

#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/object_module.h"

namespace elfext {

void ObjectWithBuildAttributes::getEffectiveBuildAttributes(BuildAttributes& result) const {
  if (m_BuildAttributes == nullptr) {
    getInheritedBuildAttributes(result);
  } else if (m_BuildAttributes->hasTag(Tag_nodefaults)) {
    result = BuildAttributes();
  } else if (!inheritsBuildAttributes()) {
    result = *m_BuildAttributes;
  } else {
    BuildAttributes inherited;
    getInheritedBuildAttributes(inherited);
    result = BuildAttributes::getUnion(inherited, *m_BuildAttributes);
  }
}

void ObjectWithBuildAttributes::setOwnBuildAttributes(const BuildAttributes* attributes) {
  m_BuildAttributes = attributes;
  m_ObjectModule->markBuildAttributesChanged();
}

void ObjectWithBuildAttributes::forgetBuildAttributes() {
  m_BuildAttributes = nullptr;
  m_Blocks = nullptr;
}

uint32_t ObjectWithBuildAttributes::getBlockCount() const {
  return m_Blocks == nullptr ? 0 : m_Blocks->getSize();
}

const BuildAttributesBlock* ObjectWithBuildAttributes::getBlock(uint32_t index) const {
  QUARN_ASSERT(1, index < getBlockCount());
  return (*m_Blocks)[index];
}

uint32_t ObjectWithBuildAttributes::findBlockIndex(std::string_view vendor) const {
  uint32_t index = 0;
  while (index < getBlockCount() && (*m_Blocks)[index]->getVendor() != vendor)
    ++index;
  return index;
}

const BuildAttributesBlock* ObjectWithBuildAttributes::findBlock(std::string_view vendor) const {
  const uint32_t index = findBlockIndex(vendor);
  return index < getBlockCount() ? (*m_Blocks)[index] : nullptr;
}

const BuildAttributesBlock* ObjectWithBuildAttributes::setBlock(std::string_view vendor,
                                                                std::span<const uint8_t> data) {
  const BuildAttributesBlock* block =
      m_ObjectModule->getBuildAttributesCache().getBlock(vendor, data);
  setBlock(block);
  return block;
}

void ObjectWithBuildAttributes::setBlock(const BuildAttributesBlock* block) {
  alloclib::RegionGeneral& region = m_ObjectModule->getContainerRegion();
  // Most objects never have any.
  if (m_Blocks == nullptr)
    m_Blocks = alloclib::create<FastArray<const BuildAttributesBlock*>>(region, &region);
  const uint32_t index = findBlockIndex(block->getVendor());
  if (index < m_Blocks->getSize())
    (*m_Blocks)[index] = block;
  else
    m_Blocks->append(block);
  m_ObjectModule->markBuildAttributesChanged();
}

bool ObjectWithBuildAttributes::removeBlockAt(uint32_t index) {
  if (index >= getBlockCount()) return false;
  m_Blocks->remove(index);
  m_ObjectModule->markBuildAttributesChanged();
  return true;
}

bool ObjectWithBuildAttributes::removeBlock(const BuildAttributesBlock* block) {
  uint32_t index = 0;
  while (index < getBlockCount() && (*m_Blocks)[index] != block)
    ++index;
  return removeBlockAt(index);
}

bool ObjectWithBuildAttributes::removeBlock(std::string_view vendor) {
  return removeBlockAt(findBlockIndex(vendor));
}

} // namespace elfext
