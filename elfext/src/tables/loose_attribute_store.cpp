// SPDX-License-Identifier: Apache-2.0
//
// Attributes by holder, in a hash table that has entries only for who got some: of ten thousand
// symbols mostly none did. The outline makes one for each object and asks it for the file's
// attributes alone. Symbols are not stored at all but decoded from their rows when one is asked
// for.
#include "elfext/src/tables/loose_attribute_store.h"

#include "elfext/interface/elf_constants.h"
#include "elfext/src/tables/build_attributes_injector.h"

#include <algorithm>

namespace elfext {

namespace {

uint64_t countSectionBytes(const ObjectTables& tables) {
  uint64_t bytes = 0;
  for (const SectionHeader& header : tables.sectionHeaders) {
    if (header.type == SHT_ZEV_ATTRIBUTES) bytes += header.size;
  }
  return bytes;
}

} // namespace

LooseAttributeStore::LooseAttributeStore(const ObjectTables& tables, bool isWanted)
    : m_Tables(tables) {
  for (const SymbolTable& table : tables.symbolTables) {
    if (table.isDynamic) continue;
    m_Parts.push_back({m_SymbolCount, &table});
    // Tables with contents only, so there is a null symbol to leave out.
    m_SymbolCount += table.rowCount - 1;
  }
  // Reports must not depend on whether attributes are wanted: whether a section uses up the budget
  // is only known by taking all the steps.
  if (isWanted || !InjectionBudget::alwaysCovers(countSectionBytes(tables))) m_Cache.emplace();
}

AttributeSymbol LooseAttributeStore::getSymbol(uint32_t index) const {
  const auto startsBehind = [](uint32_t wanted, const Part& part) {
    return wanted < part.firstIndex;
  };
  // The last part that starts at the index or before.
  const Part& part = *(std::upper_bound(m_Parts.begin(), m_Parts.end(), index, startsBehind) - 1);
  const uint32_t rowIndex = index - part.firstIndex + 1;
  const SymbolRow row = m_Tables.getSymbolRow(*part.table, rowIndex);
  const SymbolHome home = m_Tables.homeOf(*part.table, rowIndex, row);
  return {part.table->nameOf(row), home.category, home.section};
}

uint32_t LooseAttributeStore::getBlockCount(AttributeHolder holder) const {
  const auto held = m_Held.find(holder);
  return held == m_Held.end() ? 0 : static_cast<uint32_t>(held->second.blocks.size());
}

void LooseAttributeStore::setBlock(AttributeHolder holder, const BuildAttributesBlock* block) {
  std::vector<const BuildAttributesBlock*>& blocks = m_Held[holder].blocks;
  const auto sameVendor = [block](const BuildAttributesBlock* other) {
    return other->getVendor() == block->getVendor();
  };
  // One vendor or two; of more, the injector has taken each look from its budget.
  const auto found = std::find_if(blocks.begin(), blocks.end(), sameVendor);
  if (found == blocks.end())
    blocks.push_back(block);
  else
    *found = block;
}

const BuildAttributes* LooseAttributeStore::getOwn(AttributeHolder holder) const {
  const auto held = m_Held.find(holder);
  return held == m_Held.end() ? nullptr : held->second.own;
}

void LooseAttributeStore::setOwn(AttributeHolder holder, const BuildAttributes* attributes) {
  m_Held[holder].own = attributes;
}

void LooseAttributeStore::drop() {
  for (auto& [holder, held] : m_Held)
    held.own = nullptr;
  m_HighestTagsVersion = 0;
}

void LooseAttributeStore::raiseHighestTagsVersion(uint32_t version) {
  m_HighestTagsVersion = std::max(m_HighestTagsVersion, version);
}

} // namespace elfext
