// SPDX-License-Identifier: Apache-2.0
//
// The choice among the builds of a module that a linker makes.
#include "arlib/interface/archive.h"
#include "elfext/interface/attribute_relations.h"

#include <algorithm>
#include <span>
#include <vector>

namespace arlib {

namespace {

using elfext::FullAttr;

// The index of the candidate that fits under the target and uses most of it; their number if none
// fits.
size_t findBest(std::span<const FullAttr> candidates, const FullAttr& target) {
  size_t best = candidates.size();
  for (size_t i = 0; i < candidates.size(); ++i) {
    if (!elfext::fullAttrSatisfies(candidates[i], elfext::FitsUnder, target)) continue;
    if (best == candidates.size()) {
      best = i;
      continue;
    }
    const uint32_t relation =
        elfext::relateFullAttr(candidates[i], elfext::Covers, candidates[best]);
    if (relation == elfext::Relation_Contains) best = i;
  }
  return best;
}

template <class Wanted>
void keepOnly(SymbolList& list, Wanted isWanted) {
  uint32_t kept = 0;
  for (uint32_t i = 0; i < list.getSize(); ++i) {
    if (isWanted(i)) list.set(kept++, list[i]);
  }
  list.setSize(kept);
}

} // namespace

bool Archive::findBestSymbols(std::string_view name, const FullAttr& required, SymbolList& list) {
  if (!findSymbols(name, list)) return false;
  const auto hasAttributes = [&list](uint32_t i) { return list[i]->hasBuildAttributes(); };
  std::vector<FullAttr> candidates;
  bool isAnyDecorated = false;
  for (uint32_t i = 0; i < list.getSize(); ++i) {
    candidates.push_back(list[i]->getBuildAttributes());
    isAnyDecorated = isAnyDecorated || hasAttributes(i);
  }
  if (!isAnyDecorated) return true;
  FullAttr target = candidates.front();
  for (const FullAttr& candidate : candidates)
    target = elfext::intersectFullAttr(target, candidate);
  elfext::mergeFullAttr(target, required, target);
  const size_t best = findBest(candidates, target);
  if (best == candidates.size()) {
    keepOnly(list, [&](uint32_t i) { return !hasAttributes(i); });
    return list.getSize() != 0;
  }
  keepOnly(list, [&](uint32_t i) { return elfext::isSameBuild(candidates[i], candidates[best]); });
  QUARN_ASSERT(1, list.getSize() != 0);
  return true;
}

} // namespace arlib
