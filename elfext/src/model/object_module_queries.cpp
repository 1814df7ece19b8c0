// SPDX-License-Identifier: Apache-2.0
//
// Look-ups in a module: those of symbols over views that are made anew at the first look-up after
// a change.
//
// A look-up costs a logarithm after the first, which sorts. The sorts are stable, so among equal
// names and addresses the order of the tables shows. Nothing is sorted before somebody asks.
#include "checking/interface/checking.h"
#include "elfext/interface/group.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/segment.h"
#include "elfext/src/bytes/first_holders.h"
#include "elfext/src/model/sorted_symbols.h"

#include <algorithm>
#include <cstring>

namespace elfext {
namespace {

uint64_t getAddress(const Symbol& symbol) {
  return symbol.getAddress();
}

// Where a region lies: the place is its tree, told by the root, and the start counts from there.
Guest placeOf(FileRegion& region) {
  uint64_t start = 0;
  // An address as a number only tells trees apart; no answer depends on its order.
  const PlacementNode* tree = region.getPlacement().find(&start);
  return {.place = reinterpret_cast<uintptr_t>(tree), .start = start, .size = region.getFileSize()};
}

Holder asHolder(Segment& segment, uint32_t id) {
  const Guest place = placeOf(segment);
  return {.firstPlace = place.place,
          .lastPlace = place.place,
          .start = place.start,
          .size = place.size,
          .id = id};
}

} // namespace

void ObjectModule::updateSortedViews() {
  if (m_AreSortedViewsUpToDate) return;
  m_SymbolsSortedByAddress.assign(m_Symbols);
  m_DynamicSymbolsSortedByAddress.assign(m_DynamicSymbols);
  m_SymbolsSortedByName.assign(m_Symbols);
  m_DynamicSymbolsSortedByName.assign(m_DynamicSymbols);
  sortByKey(m_SymbolsSortedByAddress.getSpan(), getAddress);
  sortByKey(m_DynamicSymbolsSortedByAddress.getSpan(), getAddress);
  sortByName(m_SymbolsSortedByName.getSpan());
  sortByName(m_DynamicSymbolsSortedByName.getSpan());
  m_AreSortedViewsUpToDate = true;
}

bool ObjectModule::getSectionsByName(const char* name, SectionList* sections) const {
  QUARN_ASSERT(1, name != NULL);
  QUARN_ASSERT(1, sections != NULL);
  const auto isWanted = [name](const Section* section) {
    return section->getName() != nullptr && std::strcmp(section->getName(), name) == 0;
  };
  // Counted first, so the list is sized once.
  sections->setSize(
      static_cast<uint32_t>(std::count_if(m_Sections.begin(), m_Sections.end(), isWanted)));
  uint32_t listIndex = 0;
  for (Section* section : m_Sections)
    if (isWanted(section)) sections->set(listIndex++, section);
  return listIndex != 0;
}

bool ObjectModule::getSymbolsByName(const char* name, SymbolList* symbols) {
  QUARN_ASSERT(1, name != NULL);
  QUARN_ASSERT(1, symbols != NULL);
  updateSortedViews();
  const SymbolView view = m_SymbolsSortedByName.getSpan();
  return collect(view, findName(view, name), Symbol::Class_All, symbols);
}

bool ObjectModule::getDynamicSymbolsByName(const char* name, SymbolList* symbols) {
  QUARN_ASSERT(1, name != NULL);
  QUARN_ASSERT(1, symbols != NULL);
  updateSortedViews();
  const SymbolView view = m_DynamicSymbolsSortedByName.getSpan();
  return collect(view, findName(view, name), Symbol::Class_All, symbols);
}

bool ObjectModule::collectByAddress(uint32_t fromIndex, uint32_t toIndex, uint32_t mask,
                                    SymbolList* symbols) const {
  QUARN_ASSERT(1, fromIndex <= toIndex && toIndex < m_SymbolsSortedByAddress.getSize());
  return collect(m_SymbolsSortedByAddress.getSpan(), {true, fromIndex, toIndex}, mask, symbols);
}

bool ObjectModule::getSymbolsInRange(uint64_t fromAddress, uint64_t toAddress, uint32_t mask,
                                     SymbolList* symbols) {
  QUARN_ASSERT(1, symbols != NULL);
  updateSortedViews();
  symbols->setSize(0);
  const SymbolRun run =
      findRange(m_SymbolsSortedByAddress.getSpan(), getAddress, fromAddress, toAddress);
  return run.isFound && collectByAddress(run.fromIndex, run.toIndex, mask, symbols);
}

bool ObjectModule::getSymbolsAtAddress(uint64_t address, uint32_t mask, SymbolList* symbols) {
  return getSymbolsInRange(address, address, mask, symbols);
}

bool ObjectModule::getPrecedingSymbols(uint64_t address, uint32_t mask, SymbolList* symbols) {
  QUARN_ASSERT(1, symbols != NULL);
  updateSortedViews();
  symbols->setSize(0);
  const SymbolRun run =
      findPreceding(m_SymbolsSortedByAddress.getSpan(), getAddress, address, mask);
  return run.isFound && collectByAddress(run.fromIndex, run.toIndex, mask, symbols);
}

bool ObjectModule::getFollowingSymbols(uint64_t address, uint32_t mask, SymbolList* symbols) {
  QUARN_ASSERT(1, symbols != NULL);
  updateSortedViews();
  symbols->setSize(0);
  const SymbolRun run =
      findFollowing(m_SymbolsSortedByAddress.getSpan(), getAddress, address, mask);
  return run.isFound && collectByAddress(run.fromIndex, run.toIndex, mask, symbols);
}

std::vector<Segment*> ObjectModule::findHolders(std::span<Segment* const> segments) const {
  std::vector<Holder> holders;
  holders.reserve(segments.size());
  for (Segment* segment : segments)
    holders.push_back(asHolder(*segment, static_cast<uint32_t>(holders.size())));
  std::vector<Guest> guests;
  guests.reserve(m_Sections.getSize());
  for (Section* section : m_Sections)
    guests.push_back(placeOf(*section));
  std::vector<Segment*> found;
  found.reserve(guests.size());
  for (const uint32_t id : findFirstHolders(holders, guests))
    found.push_back(id == NoExtent ? nullptr : segments[id]);
  return found;
}

// Signatures may be long and all the same text: nobody should pay for them who does not ask.
void ObjectModule::noteComdatGroups() {
  for (Group* group : m_UnnotedGroups)
    noteComdatGroup(group);
  m_UnnotedGroups.setSize(0);
}

Group* ObjectModule::findComdatGroup(const char* signature) {
  QUARN_ASSERT(1, signature != NULL);
  noteComdatGroups();
  Group* const* group = m_MapSignaturesToComdatGroups.find(Stringlett(signature));
  return group == nullptr ? nullptr : *group;
}

} // namespace elfext
