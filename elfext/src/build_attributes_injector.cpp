// SPDX-License-Identifier: Apache-2.0
#include "elfext/src/build_attributes_injector.h"

#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/object_module.h"

namespace elfext {

namespace {

// What it takes to decode a run on top of other attributes. Their lists can be as long as the
// section: they are copied, and each number of vendor "ZEV" may look all through one of them.
size_t costOfDecoding(size_t runSize, bool isZev, const BuildAttributes* start) {
  constexpr size_t PerEntry = 8;
  if (start == nullptr) return runSize;
  const size_t compatible = start->getCompatibilityTagCount();
  const size_t entries = compatible + start->getAlsoCompatibilityTagCount();
  return runSize + PerEntry * entries + (isZev ? runSize * compatible : 0);
}

} // namespace

// One run of attributes, and what has come of it: the attributes of an object that had `key`.
struct BuildAttributesInjector::Run {
  Run(ObjectModule& module, std::string_view vendor, AttributeBytes bytes)
      : block(module.getBuildAttributesCache().getBlock(vendor, bytes)),
        isQobix(vendor == QobixVendor), isZev(vendor == ZevVendor) {}

  const BuildAttributesBlock* block;
  bool isQobix;
  bool isZev;
  std::unordered_map<const BuildAttributes*, const BuildAttributes*> results = {};
};

bool BuildAttributesInjector::parseFileSubSubsection(std::string_view vendor, AttributeBytes run) {
  if (m_Scope != Tag_File) return true;
  Run fileRun(m_Module, vendor, run);
  return inject(m_Module, fileRun);
}

bool BuildAttributesInjector::parseSectionSubSubsection(std::string_view vendor,
                                                        std::span<const uint32_t> indices,
                                                        AttributeBytes run) {
  if (m_Scope != Tag_Section) return true;
  Run sectionRun(m_Module, vendor, run);
  bool areIndicesWell = true;
  for (const uint32_t index : indices) {
    if (index == 0 || index >= m_Module.getSectionCount())
      areIndicesWell = false;
    else if (!inject(*m_Module.getSection(index), sectionRun))
      return false;
  }
  return areIndicesWell;
}

bool BuildAttributesInjector::parseSymbolSubSubsection(std::string_view vendor,
                                                       std::span<const uint32_t> indices,
                                                       AttributeBytes run) {
  if (m_Scope != Tag_Symbol) return true;
  Run symbolRun(m_Module, vendor, run);
  const std::span<Symbol* const> symbols = m_Module.getSymbols();
  bool areIndicesWell = true;
  for (const uint32_t index : indices) {
    if (index == 0 || index > symbols.size())
      areIndicesWell = false;
    else if (!inject(*symbols[index - 1], symbolRun))
      return false;
  }
  return areIndicesWell;
}

// False when the budget is used up.
bool BuildAttributesInjector::inject(ObjectWithBuildAttributes& object, Run& run) {
  if (!m_Budget.take(object.getBlockCount())) return false;
  object.setBlock(run.block);
  if (!run.isQobix && !run.isZev) return true;
  const BuildAttributes* start = object.getOwnBuildAttributes();
  const auto [result, isNew] = run.results.try_emplace(start, nullptr);
  if (isNew) {
    if (!m_Budget.take(costOfDecoding(run.block->getData().size(), run.isZev, start))) return false;
    result->second = decode(start, run);
  }
  object.setOwnBuildAttributes(result->second);
  if (run.isZev)
    m_Module.raiseHighestTagsVersion(result->second->getNumericTag(ZevTag::Tag_ZV_version));
  return true;
}

// A malformed run gives what it says up to there.
const BuildAttributes* BuildAttributesInjector::decode(const BuildAttributes* start,
                                                       const Run& run) {
  BuildAttributes attributes = start == nullptr ? BuildAttributes() : *start;
  if (run.isQobix) {
    static_cast<void>(QobixBuildAttributesDecodingParser(attributes).parse(run.block->getData()));
    attributes.fixUpAfterDecoding();
  } else {
    static_cast<void>(ZevBuildAttributesDecodingParser(attributes).parse(run.block->getData()));
  }
  return m_Module.getBuildAttributesCache().getBuildAttributes(attributes);
}

} // namespace elfext
