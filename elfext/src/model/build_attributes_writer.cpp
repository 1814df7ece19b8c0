// SPDX-License-Identifier: Apache-2.0
#include "elfext/interface/build_attributes_writer.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/prune_criterion.h"
#include "elfext/src/bytes/leb128.h"
#include "elfext/src/model/module_builder.h"

#include <algorithm>
#include <string>
#include <unordered_map>
#include <vector>

namespace elfext {

namespace {

std::span<const uint8_t> asBytes(const std::string& text) {
  return {reinterpret_cast<const uint8_t*>(text.data()), text.size()};
}

void putBlock(ObjectWithBuildAttributes& object, std::string_view vendor,
              const std::string& bytes) {
  if (bytes.empty())
    object.removeBlock(vendor);
  else
    object.setBlock(vendor, asBytes(bytes));
}

void updateBlocks(ObjectWithBuildAttributes& object) {
  const BuildAttributes* own = object.getOwnBuildAttributes();
  std::string qobix;
  std::string zev;
  if (own != nullptr) {
    BuildAttributes inherited;
    BuildAttributes effective;
    object.getInheritedBuildAttributes(inherited);
    object.getEffectiveBuildAttributes(effective);
    if (own->hasTag(Tag_nodefaults)) {
      const BuildAttributes* ofModule = object.getObjectModule()->getOwnBuildAttributes();
      effective.setNumericTag(Tag_nodefaults,
                              ofModule == nullptr ? 0 : ofModule->getNumericTag(Tag_nodefaults));
    }
    if (own->hasTag(Tag_nodefaults) || !(inherited == effective)) {
      const BuildAttributes difference = BuildAttributes::getDifference(inherited, effective);
      difference.encodeQobix(qobix);
      difference.encodeZev(zev);
    }
  }
  putBlock(object, QobixVendor, qobix);
  putBlock(object, ZevVendor, zev);
}

// The bytes of a whole attribute section.
class SectionImage {
public:
  explicit SectionImage(const ObjectModule& module) : m_Module(module) {}

  [[nodiscard]] std::string make() {
    collectVendors();
    m_Bytes = "A";
    for (const std::string_view vendor : m_Vendors)
      appendSubsection(vendor);
    return std::move(m_Bytes);
  }

private:
  // In the order in which they are met, but the public ABI's first.
  void collectVendors() {
    collectVendors(m_Module);
    for (const Section* section : listedSections())
      collectVendors(*section);
    for (const Symbol* symbol : m_Module.getSymbols())
      collectVendors(*symbol);
    const auto publicVendor = std::ranges::find(m_Vendors, QobixVendor);
    if (publicVendor != m_Vendors.end())
      std::rotate(m_Vendors.begin(), publicVendor, publicVendor + 1);
  }

  void collectVendors(const ObjectWithBuildAttributes& object) {
    for (uint32_t i = 0; i < object.getBlockCount(); ++i) {
      const std::string_view vendor = object.getBlock(i)->getVendor();
      if (std::ranges::find(m_Vendors, vendor) == m_Vendors.end()) m_Vendors.push_back(vendor);
    }
  }

  void appendSubsection(std::string_view vendor) {
    const size_t start = m_Bytes.size();
    appendWord(0);
    m_Bytes += vendor;
    m_Bytes += '\0';
    if (const BuildAttributesBlock* block = m_Module.findBlock(vendor); block != nullptr) {
      appendUleb(m_Bytes, Tag_File);
      appendWord(static_cast<uint32_t>(block->getData().size() + 5));
      appendData(*block);
    }
    appendScope(Tag_Section, vendor, listedSections());
    appendScope(Tag_Symbol, vendor, m_Module.getSymbols());
    patchSize(start, start);
  }

  // All but the null section: in a list, its index would be the end.
  [[nodiscard]] std::span<Section* const> listedSections() const {
    const std::span<Section* const> sections = m_Module.getSections();
    return sections.empty() ? sections : sections.subspan(1);
  }

  // A sub-subsection for each block, with the indices, from 1, of all that have it.
  template <class Object>
  void appendScope(AttributeScope scope, std::string_view vendor,
                   std::span<Object* const> objects) {
    std::vector<const BuildAttributesBlock*> blocks;
    std::unordered_map<const BuildAttributesBlock*, std::vector<uint32_t>> indices;
    for (uint32_t i = 0; i < objects.size(); ++i) {
      const BuildAttributesBlock* block = objects[i]->findBlock(vendor);
      if (block == nullptr) continue;
      std::vector<uint32_t>& ofBlock = indices[block];
      if (ofBlock.empty()) blocks.push_back(block);
      ofBlock.push_back(i + 1);
    }
    for (const BuildAttributesBlock* block : blocks) {
      const size_t start = m_Bytes.size();
      appendUleb(m_Bytes, scope);
      appendWord(0);
      for (const uint32_t index : indices[block])
        appendUleb(m_Bytes, index);
      m_Bytes += '\0';
      appendData(*block);
      patchSize(start + 1, start);
    }
  }

  void appendData(const BuildAttributesBlock& block) {
    m_Bytes.append(reinterpret_cast<const char*>(block.getData().data()), block.getData().size());
  }

  void appendWord(uint32_t value) {
    m_Bytes.append(4, '\0');
    putWord(m_Bytes.size() - 4, value);
  }

  void putWord(size_t position, uint32_t value) {
    for (uint32_t i = 0; i < 4; ++i) {
      const uint32_t shift = 8 * (m_Module.isLittleEndian() ? i : 3 - i);
      m_Bytes[position + i] = static_cast<char>(value >> shift);
    }
  }

  // The size field at `position` says how many bytes there are from `start` to the end.
  void patchSize(size_t position, size_t start) {
    putWord(position, static_cast<uint32_t>(m_Bytes.size() - start));
  }

  const ObjectModule& m_Module;
  std::vector<std::string_view> m_Vendors;
  std::string m_Bytes;
};

// The module's first attribute section, which is then its only one.
BuildAttributesSection& onlySection(ObjectModule& module) {
  struct Surplus final : PruneCriterion {
    explicit Surplus(std::span<BuildAttributesSection* const> sections) : m_Sections(sections) {}
    using PruneCriterion::goes;
    bool goes(const Section& section) const override {
      return std::ranges::find(m_Sections.subspan(1), &section) != m_Sections.end();
    }
    std::span<BuildAttributesSection* const> m_Sections;
  };
  const auto sections = module.getBuildAttributesSections();
  if (sections.empty()) return *module.createBuildAttributesSection(".ZEV.attributes", 0);
  BuildAttributesSection& first = *sections.front();
  if (sections.size() > 1) module.prune(Surplus(sections));
  return first;
}

} // namespace

void updateBuildAttributesBlocks(ObjectModule& module) {
  updateBlocks(module);
  for (Section* section : module.getSections())
    updateBlocks(*section);
  for (Symbol* symbol : module.getSymbols())
    updateBlocks(*symbol);
}

void updateBuildAttributesSection(ObjectModule& module) {
  if (module.isBuildAttributesSectionUpToDate()) return;
  BuildAttributesSection& section = onlySection(module);
  const std::string bytes = SectionImage(module).make();
  ModuleBuilder::adoptSize(section, bytes.size());
  ModuleBuilder::getBuffer(section).setSize(bytes.size());
  ModuleBuilder::getBuffer(section).write(0, bytes.data(), bytes.size());
  ModuleBuilder::setBuildAttributesSectionUpToDate(module, true);
}

} // namespace elfext
