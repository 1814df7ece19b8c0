// SPDX-License-Identifier: Apache-2.0
//
// Gives each holder the attributes of each run that is for it, and decides when that has become too
// much. The walk over the section's bytes is the base class's; this one is called with runs and
// indexes, in file order.
//
// A section of a few kilobytes can list thousands of holders for each of a thousand runs, each of
// which would be decoded on top of what the holder has already. So what a run comes to is kept by
// the set that it was put on, holders that have the same set share the outcome, and each step is
// taken from a budget. When that is used up the section counts as corrupted.
#include "elfext/src/tables/build_attributes_injector.h"

#include "elfext/interface/build_attributes_cache.h"

namespace elfext {

namespace {

// What it takes to decode a run on top of other attributes. Their lists can be as long as the
// section: they are copied, and each number of vendor "ZEV" may look all through one of them.
size_t costOfDecoding(size_t runSize, bool isZev, const BuildAttributes* start) {
  // An entry costs strings and tree nodes where a byte costs a comparison.
  constexpr size_t PerEntry = 8;
  if (start == nullptr) return runSize;
  const size_t compatible = start->getCompatibilityTagCount();
  const size_t entries = compatible + start->getAlsoCompatibilityTagCount();
  return runSize + PerEntry * entries + (isZev ? runSize * compatible : 0);
}

} // namespace

// One run of attributes, and what has come of it: the attributes of an object that had `key`.
struct BuildAttributesInjector::Run {
  Run(AttributeStore& store, std::string_view vendor, AttributeBytes bytes)
      : block(store.getCache().getBlock(vendor, bytes)), isQobix(vendor == QobixVendor),
        isZev(vendor == ZevVendor) {}

  const BuildAttributesBlock* block;
  bool isQobix;
  bool isZev;
  // The sets are the cache's, one for equal contents, so their addresses tell them apart. Only
  // looked up and never walked through: the order of addresses shows nowhere.
  std::unordered_map<const BuildAttributes*, const BuildAttributes*> results = {};
};

// Nothing is opened for a store that keeps nothing.
void BuildAttributesInjector::open(std::string_view vendor, AttributeBytes bytes,
                                   std::optional<Run>& run) {
  if (m_Store.isKept()) run.emplace(m_Store, vendor, bytes);
}

bool BuildAttributesInjector::parseFileSubSubsection(std::string_view vendor,
                                                     AttributeBytes bytes) {
  if (!looksAt(Tag_File)) return true;
  std::optional<Run> run;
  open(vendor, bytes, run);
  return inject({}, run);
}

bool BuildAttributesInjector::parseSectionSubSubsection(std::string_view vendor,
                                                        std::span<const uint32_t> indices,
                                                        AttributeBytes bytes) {
  if (!looksAt(Tag_Section)) return true;
  std::optional<Run> run;
  open(vendor, bytes, run);
  bool areIndicesWell = true;
  for (const uint32_t index : indices) {
    // The rest of the list is taken before the section is told corrupted: its good indexes count.
    if (index == 0 || index >= m_Store.getSectionCount())
      areIndicesWell = false;
    else if (!inject({AttributeHolder::Kind::Section, index}, run))
      return false;
  }
  return areIndicesWell;
}

bool BuildAttributesInjector::parseSymbolSubSubsection(std::string_view vendor,
                                                       std::span<const uint32_t> indices,
                                                       AttributeBytes bytes) {
  if (!looksAt(Tag_Symbol)) return true;
  std::optional<Run> run;
  open(vendor, bytes, run);
  bool areIndicesWell = true;
  for (const uint32_t index : indices) {
    if (index == 0 || index > m_Store.getSymbolCount())
      areIndicesWell = false;
    else if (!inject({AttributeHolder::Kind::Symbol, index - 1}, run))
      return false;
  }
  return areIndicesWell;
}

// False when the budget is used up.
bool BuildAttributesInjector::inject(AttributeHolder holder, std::optional<Run>& run) {
  if (!run) return true;
  // A block replaces the one of its vendor, for which all of the holder's are looked through: a
  // thousand vendors must not make that a square.
  if (!m_Budget.take(m_Store.getBlockCount(holder))) return false;
  m_Store.setBlock(holder, run->block);
  // Of other vendors only the bytes are kept.
  if (!run->isQobix && !run->isZev) return true;
  const BuildAttributes* start = m_Store.getOwn(holder);
  // Where the budget ends the entry stays empty, and the run is given up with it.
  const auto [result, isNew] = run->results.try_emplace(start, nullptr);
  if (isNew) {
    const size_t cost = costOfDecoding(run->block->getData().size(), run->isZev, start);
    if (!m_Budget.take(cost)) return false;
    result->second = decode(start, *run);
  }
  m_Store.setOwn(holder, result->second);
  if (run->isZev)
    m_Store.raiseHighestTagsVersion(result->second->getNumericTag(ZevTag::Tag_ZV_version));
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
  return m_Store.getCache().getBuildAttributes(attributes);
}

} // namespace elfext
