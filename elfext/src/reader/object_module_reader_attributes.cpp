// SPDX-License-Identifier: Apache-2.0
//
// A module as what build attributes hang on.
//
// The steps, their order and what hostile attributes run into are those of
// tables/build_attributes_reader; this is only where a model keeps what it gets: blocks and sets in
// its own cache, one for equal contents.
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"
#include "elfext/src/tables/build_attributes_reader.h"

namespace elfext {

namespace {

class ModuleAttributeStore final : public AttributeStore {
public:
  explicit ModuleAttributeStore(ObjectModule& module) : m_Module(module) {}

  [[nodiscard]] bool isKept() const override { return true; }
  [[nodiscard]] uint32_t getSectionCount() const override { return m_Module.getSectionCount(); }
  [[nodiscard]] uint32_t getSymbolCount() const override {
    return static_cast<uint32_t>(m_Module.getSymbols().size());
  }
  [[nodiscard]] AttributeSymbol getSymbol(uint32_t index) const override {
    const Symbol& symbol = *m_Module.getSymbols()[index];
    const bool isHosted = symbol.getCategory() == Symbol::Category_Hosted;
    return {symbol.getName(), symbol.getCategory(),
            isHosted ? symbol.getHostedSymbolSection()->getIndex() : 0};
  }
  [[nodiscard]] BuildAttributesCache& getCache() override {
    return m_Module.getBuildAttributesCache();
  }
  [[nodiscard]] uint32_t getBlockCount(AttributeHolder holder) const override {
    return get(holder).getBlockCount();
  }
  void setBlock(AttributeHolder holder, const BuildAttributesBlock* block) override {
    get(holder).setBlock(block);
  }
  [[nodiscard]] const BuildAttributes* getOwn(AttributeHolder holder) const override {
    return get(holder).getOwnBuildAttributes();
  }
  void setOwn(AttributeHolder holder, const BuildAttributes* attributes) override {
    get(holder).setOwnBuildAttributes(attributes);
  }
  void markSectionsTaken() override {
    ModuleBuilder::setBuildAttributesSectionUpToDate(m_Module, true);
  }
  void drop() override { ModuleBuilder::dropBuildAttributes(m_Module); }
  [[nodiscard]] uint32_t getHighestTagsVersion() const override {
    return m_Module.getHighestTagsVersion();
  }
  void raiseHighestTagsVersion(uint32_t version) override {
    ModuleBuilder::raiseHighestTagsVersion(m_Module, version);
  }

private:
  [[nodiscard]] ObjectWithBuildAttributes& get(AttributeHolder holder) const {
    // Indexes have been compared with the counts that this store answers.
    switch (holder.kind) {
    case AttributeHolder::Kind::Section:
      return *m_Module.getSection(holder.index);
    case AttributeHolder::Kind::Symbol:
      return *m_Module.getSymbols()[holder.index];
    case AttributeHolder::Kind::File:
      break;
    }
    return m_Module;
  }

  ObjectModule& m_Module;
};

} // namespace

bool giveBuildAttributes(ReadContext& context) {
  ModuleAttributeStore store(context.module);
  return readBuildAttributes(context, store);
}

} // namespace elfext
