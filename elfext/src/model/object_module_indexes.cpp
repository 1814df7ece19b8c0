// SPDX-License-Identifier: Apache-2.0
//
// Where the objects of a module stand in its lists, and moving them about. Most objects know their
// index; a category list is searched.
//
// An index is a field of the object, so asking costs nothing and moving renumbers what lies
// between. Symbols count from 1, as in their tables, where row 0 is the null symbol; all else from
// 0. Moving a section or a symbol first makes objects of all relocations that are still rows, since
// a row says its symbol as a number, and rows come in the order of their sections.
#include "checking/interface/checking.h"
#include "elfext/interface/group.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/segment.h"

#include <algorithm>

namespace elfext {

// The objects between the two places move up or down by one.
template <class Object>
void ObjectModule::move(FastArray<Object*>& list, Object* object, uint32_t index,
                        uint32_t firstIndex) {
  QUARN_ASSERT(1, !m_IndexesFrozen);
  const uint32_t from = object->m_Index - firstIndex;
  const auto first = list.begin() + std::min(from, index);
  const auto last = list.begin() + std::max(from, index) + 1;
  std::rotate(first, from < index ? first + 1 : last - 1, last);
  for (Object** place = first; place != last; ++place)
    (*place)->m_Index = static_cast<uint32_t>(place - list.begin()) + firstIndex;
  markChanged();
}

// ---- Sections

uint32_t ObjectModule::getSectionIndex(const Section* section) const {
  QUARN_ASSERT(1, section != NULL);
  QUARN_ASSERT(1, section->m_ObjectModule == this);
  QUARN_ASSERT(2, m_Sections.contains(const_cast<Section*>(section)));
  return section->m_Index;
}

// The new order is written beside the old one, in memory that does not stay with the module.
// Relocations that are still rows come in the order that their sections had in the file.
void ObjectModule::setSectionIndex(Section* section, uint32_t index) {
  QUARN_ASSERT(1, section != NULL);
  QUARN_ASSERT(1, section->m_ObjectModule == this);
  QUARN_ASSERT(1, index < m_Sections.getSize());
  QUARN_ASSERT(1, !m_IndexesFrozen);
  materializeAllRelocations();
  const alloclib::RegionOwner region(
      alloclib::RegionGeneral::Create(0, "setSectionIndex() temp region"));
  FastArray<Section*> sections(region.get());
  sections.assign(m_Sections);
  sections.remove(section->m_Index);
  sections.insert(index, section);
  m_Sections.assign(sections);
  for (uint32_t place = 0; place < m_Sections.getSize(); ++place)
    m_Sections[place]->m_Index = place;
  markChanged();
}

// ---- Symbol tables

uint32_t ObjectModule::getSymbolCount() const {
  return m_Symbols.isEmpty() ? 0 : m_Symbols.getSize() + 1;
}

Symbol* ObjectModule::getSymbol(uint32_t index) const {
  QUARN_ASSERT(1, index != 0);
  return m_Symbols[index - 1];
}

uint32_t ObjectModule::getSymbolIndex(const Symbol* symbol) const {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, symbol->m_ObjectModule == this);
  QUARN_ASSERT(1, !symbol->isDynamic());
  QUARN_ASSERT(2, m_Symbols.contains(const_cast<Symbol*>(symbol)));
  return symbol->m_Index;
}

// Relocations that are still rows count on the places that symbols had in the file. And symbols of
// one name or address are in index order in the sorted views.
void ObjectModule::setSymbolIndex(Symbol* symbol, uint32_t index) {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, symbol->m_ObjectModule == this);
  QUARN_ASSERT(1, !symbol->isDynamic());
  QUARN_ASSERT(1, index != 0 && index <= m_Symbols.getSize());
  materializeAllRelocations();
  move(m_Symbols, symbol, index - 1, 1);
  markSymbolsChanged();
}

uint32_t ObjectModule::getDynamicSymbolCount() const {
  return m_DynamicSymbols.isEmpty() ? 0 : m_DynamicSymbols.getSize() + 1;
}

Symbol* ObjectModule::getDynamicSymbol(uint32_t index) const {
  QUARN_ASSERT(1, index != 0);
  return m_DynamicSymbols[index - 1];
}

uint32_t ObjectModule::getDynamicSymbolIndex(const Symbol* symbol) const {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, symbol->m_ObjectModule == this);
  QUARN_ASSERT(1, symbol->isDynamic());
  QUARN_ASSERT(2, m_DynamicSymbols.contains(const_cast<Symbol*>(symbol)));
  return symbol->m_Index;
}

void ObjectModule::setDynamicSymbolIndex(Symbol* symbol, uint32_t index) {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, symbol->m_ObjectModule == this);
  QUARN_ASSERT(1, symbol->isDynamic());
  QUARN_ASSERT(1, index != 0 && index <= m_DynamicSymbols.getSize());
  materializeAllRelocations();
  move(m_DynamicSymbols, symbol, index - 1, 1);
  markSymbolsChanged();
}

// ---- Category lists

uint32_t ObjectModule::findInCategory(const FastArray<Symbol*>& list, const Symbol* symbol) const {
  QUARN_ASSERT(1, symbol != NULL);
  QUARN_ASSERT(1, symbol->m_ObjectModule == this);
  const auto found = std::find(list.begin(), list.end(), symbol);
  return found == list.end() ? NoIndex : static_cast<uint32_t>(found - list.begin());
}

void ObjectModule::moveInCategory(FastArray<Symbol*>& list, Symbol* symbol, uint32_t index) {
  QUARN_ASSERT(1, index < list.getSize());
  QUARN_ASSERT(1, !m_IndexesFrozen);
  const uint32_t from = findInCategory(list, symbol);
  QUARN_ASSERT(1, from != NoIndex);
  list.remove(from);
  list.insert(index, symbol);
  markChanged();
}

uint32_t ObjectModule::getAbsoluteSymbolIndex(const Symbol* symbol) const {
  return findInCategory(m_AbsoluteSymbols, symbol);
}

void ObjectModule::setAbsoluteSymbolIndex(Symbol* symbol, uint32_t index) {
  moveInCategory(m_AbsoluteSymbols, symbol, index);
}

uint32_t ObjectModule::getCommonSymbolIndex(const Symbol* symbol) const {
  return findInCategory(m_CommonSymbols, symbol);
}

void ObjectModule::setCommonSymbolIndex(Symbol* symbol, uint32_t index) {
  moveInCategory(m_CommonSymbols, symbol, index);
}

uint32_t ObjectModule::getUndefinedSymbolIndex(const Symbol* symbol) const {
  return findInCategory(m_UndefinedSymbols, symbol);
}

void ObjectModule::setUndefinedSymbolIndex(Symbol* symbol, uint32_t index) {
  moveInCategory(m_UndefinedSymbols, symbol, index);
}

uint32_t ObjectModule::getAbsoluteDynamicSymbolIndex(const Symbol* symbol) const {
  return findInCategory(m_AbsoluteDynamicSymbols, symbol);
}

void ObjectModule::setAbsoluteDynamicSymbolIndex(Symbol* symbol, uint32_t index) {
  moveInCategory(m_AbsoluteDynamicSymbols, symbol, index);
}

uint32_t ObjectModule::getCommonDynamicSymbolIndex(const Symbol* symbol) const {
  return findInCategory(m_CommonDynamicSymbols, symbol);
}

void ObjectModule::setCommonDynamicSymbolIndex(Symbol* symbol, uint32_t index) {
  moveInCategory(m_CommonDynamicSymbols, symbol, index);
}

uint32_t ObjectModule::getUndefinedDynamicSymbolIndex(const Symbol* symbol) const {
  return findInCategory(m_UndefinedDynamicSymbols, symbol);
}

void ObjectModule::setUndefinedDynamicSymbolIndex(Symbol* symbol, uint32_t index) {
  moveInCategory(m_UndefinedDynamicSymbols, symbol, index);
}

// ---- The other lists

uint32_t ObjectModule::getGroupIndex(const Group* group) const {
  QUARN_ASSERT(1, group != NULL);
  QUARN_ASSERT(1, group->m_ObjectModule == this);
  QUARN_ASSERT(2, m_Groups.contains(const_cast<Group*>(group)));
  return group->m_Index;
}

void ObjectModule::setGroupIndex(Group* group, uint32_t index) {
  QUARN_ASSERT(1, group != NULL);
  QUARN_ASSERT(1, group->m_ObjectModule == this);
  QUARN_ASSERT(1, index < m_Groups.getSize());
  move(m_Groups, group, index, 0);
}

uint32_t ObjectModule::getSegmentIndex(const Segment* segment) const {
  QUARN_ASSERT(1, segment != NULL);
  QUARN_ASSERT(1, segment->m_ObjectModule == this);
  QUARN_ASSERT(2, m_Segments.contains(const_cast<Segment*>(segment)));
  return segment->m_Index;
}

void ObjectModule::setSegmentIndex(Segment* segment, uint32_t index) {
  QUARN_ASSERT(1, segment != NULL);
  QUARN_ASSERT(1, segment->m_ObjectModule == this);
  QUARN_ASSERT(1, index < m_Segments.getSize());
  move(m_Segments, segment, index, 0);
}

uint32_t ObjectModule::getNeededLibraryIndex(const NeededLibrary* neededLibrary) const {
  QUARN_ASSERT(1, neededLibrary != NULL);
  QUARN_ASSERT(1, neededLibrary->m_ObjectModule == this);
  QUARN_ASSERT(2, m_NeededLibraries.contains(const_cast<NeededLibrary*>(neededLibrary)));
  return neededLibrary->m_Index;
}

void ObjectModule::setNeededLibraryIndex(NeededLibrary* neededLibrary, uint32_t index) {
  QUARN_ASSERT(1, neededLibrary != NULL);
  QUARN_ASSERT(1, neededLibrary->m_ObjectModule == this);
  QUARN_ASSERT(1, index < m_NeededLibraries.getSize());
  move(m_NeededLibraries, neededLibrary, index, 0);
}

uint32_t ObjectModule::getLibrarySearchPathIndex(const LibrarySearchPath* librarySearchPath) const {
  QUARN_ASSERT(1, librarySearchPath != NULL);
  QUARN_ASSERT(1, librarySearchPath->m_ObjectModule == this);
  QUARN_ASSERT(2, m_LibrarySearchPaths.contains(const_cast<LibrarySearchPath*>(librarySearchPath)));
  return librarySearchPath->m_Index;
}

void ObjectModule::setLibrarySearchPathIndex(LibrarySearchPath* librarySearchPath, uint32_t index) {
  QUARN_ASSERT(1, librarySearchPath != NULL);
  QUARN_ASSERT(1, librarySearchPath->m_ObjectModule == this);
  QUARN_ASSERT(1, index < m_LibrarySearchPaths.getSize());
  move(m_LibrarySearchPaths, librarySearchPath, index, 0);
}

uint32_t ObjectModule::getPreemptionIndex(const Preemption* preemption) const {
  QUARN_ASSERT(1, preemption != NULL);
  QUARN_ASSERT(1, preemption->m_ObjectModule == this);
  QUARN_ASSERT(2, m_Preemptions.contains(const_cast<Preemption*>(preemption)));
  return preemption->m_Index;
}

void ObjectModule::setPreemptionIndex(Preemption* preemption, uint32_t index) {
  QUARN_ASSERT(1, preemption != NULL);
  QUARN_ASSERT(1, preemption->m_ObjectModule == this);
  QUARN_ASSERT(1, index < m_Preemptions.getSize());
  move(m_Preemptions, preemption, index, 0);
}

} // namespace elfext
