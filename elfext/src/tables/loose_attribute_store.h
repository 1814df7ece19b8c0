// SPDX-License-Identifier: Apache-2.0
//
// The build attributes of an object of which no model is made.
//
// It serves the outline. Most objects have attributes for the file alone, so a holder costs nothing
// until it gets some.
#pragma once

#include "elfext/interface/build_attributes_cache.h"
#include "elfext/src/tables/attribute_store.h"
#include "elfext/src/tables/object_tables.h"

#include <functional>
#include <optional>
#include <unordered_map>
#include <vector>

namespace elfext {

class LooseAttributeStore final : public AttributeStore {
public:
  // The tables must outlive the store. Attributes that nobody wants are kept all the same where it
  // takes them to know whether there are too many.
  LooseAttributeStore(const ObjectTables& tables, bool isWanted);

  // What the object as a whole has; null for nothing.
  [[nodiscard]] const BuildAttributes* getOwnOfFile() const { return getOwn({}); }

  [[nodiscard]] bool isKept() const override { return m_Cache.has_value(); }
  [[nodiscard]] uint32_t getSectionCount() const override { return m_Tables.getSectionCount(); }
  [[nodiscard]] uint32_t getSymbolCount() const override { return m_SymbolCount; }
  [[nodiscard]] AttributeSymbol getSymbol(uint32_t index) const override;
  [[nodiscard]] BuildAttributesCache& getCache() override { return *m_Cache; }
  [[nodiscard]] uint32_t getBlockCount(AttributeHolder holder) const override;
  void setBlock(AttributeHolder holder, const BuildAttributesBlock* block) override;
  [[nodiscard]] const BuildAttributes* getOwn(AttributeHolder holder) const override;
  void setOwn(AttributeHolder holder, const BuildAttributes* attributes) override;
  void markSectionsTaken() override {}
  void drop() override;
  [[nodiscard]] uint32_t getHighestTagsVersion() const override { return m_HighestTagsVersion; }
  void raiseHighestTagsVersion(uint32_t version) override;

private:
  struct HolderHash {
    size_t operator()(AttributeHolder holder) const {
      return std::hash<uint64_t>{}(uint64_t{holder.index} << 2 |
                                   static_cast<uint64_t>(holder.kind));
    }
  };
  struct Held {
    // At most one a vendor.
    std::vector<const BuildAttributesBlock*> blocks = {};
    const BuildAttributes* own = nullptr;
  };

  // A static symbol table, and how many symbols there are before its first one.
  struct Part {
    uint32_t firstIndex;
    const SymbolTable* table;
  };

  const ObjectTables& m_Tables;
  std::vector<Part> m_Parts;
  uint32_t m_SymbolCount = 0;
  std::optional<BuildAttributesCache> m_Cache;
  std::unordered_map<AttributeHolder, Held, HolderHash> m_Held;
  uint32_t m_HighestTagsVersion = 0;
};

} // namespace elfext
