// SPDX-License-Identifier: Apache-2.0
//
// The symbols of a section, and the sorted views of them, which are made anew at the first query
// after a change.
//
// Most sections are never asked, so the views come with the first question, and apart from the
// section. A hostile object has all its symbols in one section, at one offset or of one name:
// sorting is stable and n log n whatever they are.
#include "alloclib/interface/region_objects.h"
#include "checking/interface/checking.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/section.h"
#include "elfext/src/model/sorted_symbols.h"

#include <algorithm>
#include <utility>

namespace elfext {

struct HostedViews {
  explicit HostedViews(alloclib::Region* region)
      : m_HostedSymbolsSortedByOffset(region), m_HostedDynamicSymbolsSortedByOffset(region),
        m_HostedSymbolsSortedByName(region), m_HostedDynamicSymbolsSortedByName(region) {}

  FastArray<Symbol*> m_HostedSymbolsSortedByOffset;
  FastArray<Symbol*> m_HostedDynamicSymbolsSortedByOffset;
  FastArray<Symbol*> m_HostedSymbolsSortedByName;
  FastArray<Symbol*> m_HostedDynamicSymbolsSortedByName;
};

namespace {

void copy(std::span<Symbol* const> from, FastArray<Symbol*>& to) {
  to.setSize(static_cast<uint32_t>(from.size()));
  std::copy(from.begin(), from.end(), to.begin());
}

uint32_t findIndex(std::span<Symbol* const> symbols, const Symbol* symbol) {
  const auto found = std::find(symbols.begin(), symbols.end(), symbol);
  return found == symbols.end() ? NoIndex : static_cast<uint32_t>(found - symbols.begin());
}

uint64_t getOffset(const Symbol& symbol) {
  return symbol.getHostedSymbolOffset();
}

void move(FastArray<Symbol*>& symbols, Symbol* symbol, uint32_t index) {
  symbols.removeValue(symbol);
  symbols.insert(index, symbol);
}

} // namespace

void Section::markHostedChanged() {
  m_AreHostedByOffsetUpToDate = false;
  m_AreHostedByNameUpToDate = false;
}

uint32_t Section::getHostedSymbolIndex(const Symbol* symbol) const {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, !symbol->isDynamic());
  QUARN_ASSERT(1, symbol->getHostedSymbolSection() == this);
  QUARN_ASSERT(2, m_HostedSymbols.contains(const_cast<Symbol*>(symbol)));
  return findIndex(m_HostedSymbols.getSpan(), symbol);
}

uint32_t Section::getHostedDynamicSymbolIndex(const Symbol* symbol) const {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, symbol->isDynamic());
  QUARN_ASSERT(1, symbol->getHostedSymbolSection() == this);
  QUARN_ASSERT(2, m_HostedDynamicSymbols.contains(const_cast<Symbol*>(symbol)));
  return findIndex(m_HostedDynamicSymbols.getSpan(), symbol);
}

void Section::setHostedSymbolIndex(Symbol* symbol, uint32_t index) {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, !symbol->isDynamic());
  QUARN_ASSERT(1, symbol->getHostedSymbolSection() == this);
  QUARN_ASSERT(1, index < m_HostedSymbols.getSize());
  QUARN_ASSERT(1, !m_ObjectModule->m_IndexesFrozen);
  move(m_HostedSymbols.get(m_ObjectModule->getContainerRegion()), symbol, index);
  markHostedChanged();
  markChanged();
}

void Section::setHostedDynamicSymbolIndex(Symbol* symbol, uint32_t index) {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, symbol->isDynamic());
  QUARN_ASSERT(1, symbol->getHostedSymbolSection() == this);
  QUARN_ASSERT(1, index < m_HostedDynamicSymbols.getSize());
  QUARN_ASSERT(1, !m_ObjectModule->m_IndexesFrozen);
  move(m_HostedDynamicSymbols.get(m_ObjectModule->getContainerRegion()), symbol, index);
  markHostedChanged();
  markChanged();
}

HostedViews& Section::getHostedViews() {
  alloclib::RegionGeneral& region = m_ObjectModule->getContainerRegion();
  if (m_HostedViews == nullptr) m_HostedViews = alloclib::create<HostedViews>(region, &region);
  return *m_HostedViews;
}

const HostedViews& Section::getHostedViewsByOffset() {
  HostedViews& views = getHostedViews();
  if (std::exchange(m_AreHostedByOffsetUpToDate, true)) return views;
  copy(m_HostedSymbols.getSpan(), views.m_HostedSymbolsSortedByOffset);
  copy(m_HostedDynamicSymbols.getSpan(), views.m_HostedDynamicSymbolsSortedByOffset);
  sortByKey(views.m_HostedSymbolsSortedByOffset.getSpan(), getOffset);
  sortByKey(views.m_HostedDynamicSymbolsSortedByOffset.getSpan(), getOffset);
  return views;
}

// Apart from those by offset: long names that start alike take long to compare.
const HostedViews& Section::getHostedViewsByName() {
  HostedViews& views = getHostedViews();
  if (std::exchange(m_AreHostedByNameUpToDate, true)) return views;
  copy(m_HostedSymbols.getSpan(), views.m_HostedSymbolsSortedByName);
  copy(m_HostedDynamicSymbols.getSpan(), views.m_HostedDynamicSymbolsSortedByName);
  sortByName(views.m_HostedSymbolsSortedByName.getSpan());
  sortByName(views.m_HostedDynamicSymbolsSortedByName.getSpan());
  return views;
}

bool Section::getSymbolsInRange(uint64_t fromOffset, uint64_t toOffset, SymbolList* symbols) {
  QUARN_ASSERT(1, symbols != NULL);
  const SymbolView view = getHostedViewsByOffset().m_HostedSymbolsSortedByOffset.getSpan();
  return collect(view, findRange(view, getOffset, fromOffset, toOffset), Symbol::Class_Mapping,
                 symbols);
}

bool Section::getDynamicSymbolsInRange(uint64_t fromOffset, uint64_t toOffset,
                                       SymbolList* symbols) {
  QUARN_ASSERT(1, symbols != NULL);
  const SymbolView view = getHostedViewsByOffset().m_HostedDynamicSymbolsSortedByOffset.getSpan();
  return collect(view, findRange(view, getOffset, fromOffset, toOffset), Symbol::Class_All,
                 symbols);
}

bool Section::getPrecedingSymbols(uint64_t offset, uint32_t mask, SymbolList* symbols) {
  QUARN_ASSERT(1, symbols != NULL);
  const SymbolView view = getHostedViewsByOffset().m_HostedSymbolsSortedByOffset.getSpan();
  return collect(view, findPreceding(view, getOffset, offset, mask), mask, symbols);
}

bool Section::getFollowingMappingSymbols(uint64_t offset, SymbolList* symbols) {
  QUARN_ASSERT(1, symbols != NULL);
  const SymbolView view = getHostedViewsByOffset().m_HostedSymbolsSortedByOffset.getSpan();
  return collect(view, findFollowing(view, getOffset, offset, Symbol::Class_Mapping),
                 Symbol::Class_Mapping, symbols);
}

bool Section::getSymbolsByName(const char* name, SymbolList* symbols) {
  QUARN_ASSERT(1, name != NULL);
  QUARN_ASSERT(1, symbols != NULL);
  const SymbolView view = getHostedViewsByName().m_HostedSymbolsSortedByName.getSpan();
  return collect(view, findName(view, name), Symbol::Class_All, symbols);
}

bool Section::getDynamicSymbolsByName(const char* name, SymbolList* symbols) {
  QUARN_ASSERT(1, name != NULL);
  QUARN_ASSERT(1, symbols != NULL);
  const SymbolView view = getHostedViewsByName().m_HostedDynamicSymbolsSortedByName.getSpan();
  return collect(view, findName(view, name), Symbol::Class_All, symbols);
}

} // namespace elfext
