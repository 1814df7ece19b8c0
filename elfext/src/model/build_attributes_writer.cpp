// SPDX-License-Identifier: Apache-2.0
//
// Writes what the objects of a module say of how they were built: first blocks, for each object
// what it has beyond what it inherits; then the section's bytes from all blocks. The format is that
// of build_attributes_parsers.h, and what is written here is read there. For those who write
// modules; the tool does not.
//
// Thousands of sections may share a few blocks, or each have its own: equal blocks are one object,
// so they are gathered by address in one walk, and their order is that in which they are met.
#include "elfext/interface/build_attributes_writer.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/prune_criterion.h"
#include "elfext/src/bytes/leb128.h"
#include "elfext/src/model/module_builder.h"

#include <algorithm>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
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
    // The effective set of such an object starts from nothing; the tag itself must still be in the
    // bytes.
    if (own->hasTag(Tag_nodefaults)) {
      const BuildAttributes* ofModule = object.getObjectModule()->getOwnBuildAttributes();
      effective.setNumericTag(Tag_nodefaults,
                              ofModule == nullptr ? 0 : ofModule->getNumericTag(Tag_nodefaults));
    }
    if (own->hasTag(Tag_nodefaults) || !(inherited == effective)) {
      // A reader puts the difference on top of what is inherited, and has the effective set again.
      const BuildAttributes difference = BuildAttributes::getDifference(inherited, effective);
      difference.encodeQobix(qobix);
      difference.encodeZev(zev);
    }
  }
  putBlock(object, QobixVendor, qobix);
  putBlock(object, ZevVendor, zev);
}

// A block, and the indices, from 1, of all that have it.
struct Run {
  const BuildAttributesBlock* block;
  std::vector<uint32_t> indices = {};
};

// What the objects of a module have from one vendor.
struct Subsection {
  std::string_view vendor;
  const BuildAttributesBlock* ofFile = nullptr;
  std::vector<Run> ofSections = {};
  std::vector<Run> ofSymbols = {};
};

// Vendors and their blocks in the order in which they are met. Both may be as many as the objects,
// so these are gone through once, and not for each vendor.
class SubsectionList {
public:
  explicit SubsectionList(const ObjectModule& module) {
    for (uint32_t i = 0; i < module.getBlockCount(); ++i)
      find(module.getBlock(i)->getVendor()).ofFile = module.getBlock(i);
    add(listedSections(module), &Subsection::ofSections);
    add(module.getSymbols(), &Subsection::ofSymbols);
  }

  // The public ABI's comes first.
  [[nodiscard]] std::vector<Subsection> take() {
    const auto publicVendor = std::ranges::find(m_Subsections, QobixVendor, &Subsection::vendor);
    if (publicVendor != m_Subsections.end())
      std::rotate(m_Subsections.begin(), publicVendor, publicVendor + 1);
    return std::move(m_Subsections);
  }

private:
  // All but the null section: in a list, its index would be the end.
  static std::span<Section* const> listedSections(const ObjectModule& module) {
    const std::span<Section* const> sections = module.getSections();
    return sections.empty() ? sections : sections.subspan(1);
  }

  Subsection& find(std::string_view vendor) {
    const auto [place, isNew] = m_Places.emplace(vendor, m_Subsections.size());
    if (isNew) m_Subsections.push_back({.vendor = vendor});
    return m_Subsections[place->second];
  }

  template <class Object>
  void add(std::span<Object* const> objects, std::vector<Run> Subsection::*scope) {
    std::unordered_map<const BuildAttributesBlock*, size_t> places; // among their vendor's runs
    for (uint32_t i = 0; i < objects.size(); ++i) {
      for (uint32_t j = 0; j < objects[i]->getBlockCount(); ++j) {
        const BuildAttributesBlock* block = objects[i]->getBlock(j);
        std::vector<Run>& runs = find(block->getVendor()).*scope;
        const auto [place, isNew] = places.emplace(block, runs.size());
        if (isNew) runs.push_back({block});
        runs[place->second].indices.push_back(i + 1);
      }
    }
  }

  std::vector<Subsection> m_Subsections;
  std::unordered_map<std::string_view, size_t> m_Places; // by vendor
};

// The bytes of a whole attribute section.
class SectionImage {
public:
  explicit SectionImage(const ObjectModule& module) : m_Module(module) {}

  [[nodiscard]] std::string make() {
    m_Bytes = "A";
    for (const Subsection& subsection : SubsectionList(m_Module).take())
      appendSubsection(subsection);
    return std::move(m_Bytes);
  }

private:
  void appendSubsection(const Subsection& subsection) {
    const size_t start = m_Bytes.size();
    appendWord(0);
    m_Bytes += subsection.vendor;
    m_Bytes += '\0';
    if (subsection.ofFile != nullptr) {
      appendUleb(m_Bytes, Tag_File);
      // Counts itself and the byte of the kind.
      appendWord(static_cast<uint32_t>(subsection.ofFile->getData().size() + 5));
      appendData(*subsection.ofFile);
    }
    appendScope(Tag_Section, subsection.ofSections);
    appendScope(Tag_Symbol, subsection.ofSymbols);
    patchSize(start, start);
  }

  // A sub-subsection for each block.
  void appendScope(AttributeScope scope, std::span<const Run> runs) {
    for (const Run& run : runs) {
      const size_t start = m_Bytes.size();
      appendUleb(m_Bytes, scope);
      appendWord(0);
      for (const uint32_t index : run.indices)
        appendUleb(m_Bytes, index);
      m_Bytes += '\0';
      appendData(*run.block);
      // The kind is one byte: scopes are small numbers.
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
  std::string m_Bytes;
};

// The module's first attribute section, which is then its only one.
BuildAttributesSection& onlySection(ObjectModule& module) {
  struct Surplus final : PruneCriterion {
    explicit Surplus(const Section& first) : m_First(first) {}
    using PruneCriterion::goes;
    [[nodiscard]] bool goes(const Section& section) const override {
      return section.getType() == SHT_ZEV_ATTRIBUTES && &section != &m_First;
    }

  private:
    const Section& m_First;
  };
  const auto sections = module.getBuildAttributesSections();
  if (sections.empty()) return *module.createBuildAttributesSection(".ZEV.attributes", 0);
  BuildAttributesSection& first = *sections.front();
  if (sections.size() > 1) module.prune(Surplus(first));
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
  // The section is auxiliary, so its users can't write to it.
  ModuleBuilder::adoptSize(section, bytes.size());
  ModuleBuilder::getBuffer(section).setSize(bytes.size());
  ModuleBuilder::getBuffer(section).write(0, bytes.data(), bytes.size());
  ModuleBuilder::setBuildAttributesSectionUpToDate(module, true);
}

} // namespace elfext
