// SPDX-License-Identifier: Apache-2.0
//
// What goes with what: a group takes its section along, a section its symbols and the relocation
// sections for it, a symbol the relocations that name it, a segment its blocks of raw data. All
// marks are set first, so each list is swept once and every mark is there when another list asks
// for it. Memory is given back with the regions; only deferred contents and the blocks' buffers end
// here.
#include "elfext/src/model/pruner.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/group.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/relocation.h"
#include "elfext/interface/segment.h"

#include <algorithm>
#include <memory>
#include <utility>
#include <vector>

namespace elfext {

void Pruner::run() {
  markAll();
  // Some sweeps look at marks of objects that later ones take out of their lists. Relocations come
  // first: rows that become objects count on all symbols and sections being there.
  if (m_SymbolsGo || m_SectionsGo) sweepRelocations();
  if (m_SectionsGo || m_SegmentsGo) sweepPlacement();
  if (m_SymbolsGo) sweepSymbols();
  if (m_GroupsGo || m_SectionsGo) sweepGroups();
  if (m_SectionsGo || m_SegmentsGo || m_GroupsGo) sweepSections();
  if (m_SegmentsGo) sweepSegments();
  sweepAndNumber(m_ObjectModule.m_NeededLibraries, 0);
  sweepAndNumber(m_ObjectModule.m_LibrarySearchPaths, 0);
  sweepAndNumber(m_ObjectModule.m_Preemptions, 0);
  m_ObjectModule.markSymbolsChanged();
}

// ---- Marking

// Whether any goes.
template <class Object>
bool Pruner::mark(FastArray<Object*>& list) {
  bool anyGoes = false;
  for (Object* object : list) {
    object->m_Goes = m_Criterion.goes(*object);
    anyGoes |= object->m_Goes;
  }
  return anyGoes;
}

void Pruner::markAll() {
  m_GroupsGo = mark(m_ObjectModule.m_Groups);
  m_SegmentsGo = mark(m_ObjectModule.m_Segments);
  m_SectionsGo = mark(m_ObjectModule.m_Sections);
  mark(m_ObjectModule.m_NeededLibraries);
  mark(m_ObjectModule.m_LibrarySearchPaths);
  mark(m_ObjectModule.m_Preemptions);
  markDependentSections();
  m_SymbolsGo = markSymbols(m_ObjectModule.m_Symbols);
  m_SymbolsGo |= markSymbols(m_ObjectModule.m_DynamicSymbols);
}

// A group takes its section along, and a section the relocation sections for it: these may
// themselves have some.
void Pruner::markDependentSections() {
  std::vector<Section*> going;
  for (Section* section : m_ObjectModule.m_Sections)
    if (section->m_Goes) going.push_back(section);
  const auto take = [&going](Section* section) {
    // A relocation section may be for itself, or two of them for one another: each is taken once.
    if (std::exchange(section->m_Goes, true)) return;
    going.push_back(section);
  };
  for (Group* group : m_ObjectModule.m_Groups)
    if (group->m_Goes && group->m_GroupSection != nullptr) take(group->m_GroupSection);
  // NOLINTNEXTLINE(modernize-loop-convert): it grows meanwhile
  for (size_t next = 0; next < going.size(); ++next)
    for (bool isDynamic : {false, true})
      for (RelocationSection* section : going[next]->getRelocationSections(isDynamic).getSpan())
        take(section);
  m_SectionsGo = !going.empty();
}

bool Pruner::markSymbols(FastArray<Symbol*>& table) {
  bool anyGoes = false;
  for (Symbol* symbol : table) {
    const bool isHosted = symbol->m_Category == Symbol::Category_Hosted;
    // What a section hosts goes whatever the criterion says of it.
    symbol->m_Goes = (isHosted && symbol->m_Section->m_Goes) || m_Criterion.goes(*symbol);
    anyGoes |= symbol->m_Goes;
  }
  return anyGoes;
}

// ---- Sweeping

template <class Object>
void Pruner::sweep(FastArray<Object*>& list) {
  const auto goes = [](const Object* object) { return object->m_Goes; };
  Object** kept = std::remove_if(list.begin(), list.end(), goes);
  list.setSize(static_cast<uint32_t>(kept - list.begin()));
}

template <class Object>
void Pruner::sweepAndNumber(FastArray<Object*>& list, uint32_t firstIndex) {
  sweep(list);
  for (uint32_t index = 0; index < list.getSize(); ++index)
    list[index]->m_Index = index + firstIndex;
}

// Rows count on the symbols' places, and on their own section: what stays of them must become
// objects before either changes.
void Pruner::sweepRelocations() {
  for (Section* section : m_ObjectModule.m_Sections) {
    if (section->m_Goes) continue;
    section->materializeRelocations();
    // One whose relocation section goes stays, but stands in no row any more.
    for (Relocation* relocation : section->m_Relocations.getSpan())
      if (relocation->m_Origin != nullptr && relocation->m_Origin->m_Goes)
        relocation->m_Origin = nullptr;
    if (!m_SymbolsGo || section->m_Relocations.isEmpty()) continue;
    section->m_Relocations.removeIf([](const Relocation* relocation) {
      return relocation->getTarget() != nullptr && relocation->getTarget()->m_Goes;
    });
    section->m_AreRelocationsSorted = false;
  }
}

// The trees lose what goes all at once.
void Pruner::sweepPlacement() {
  std::vector<PlacementNode*> staying = {&m_ObjectModule.m_ElfHeader.getPlacement(),
                                         &m_ObjectModule.m_SectionHeaderTable.getPlacement(),
                                         &m_ObjectModule.m_ProgramHeaderTable.getPlacement()};
  std::vector<PlacementNode*> going;
  for (Segment* segment : m_ObjectModule.m_Segments)
    (segment->m_Goes ? going : staying).push_back(&segment->getPlacement());
  for (Section* section : m_ObjectModule.m_Sections)
    (section->m_Goes ? going : staying).push_back(&section->getPlacement());
  for (RawDataBlock* block : m_ObjectModule.m_RawDataBlocks)
    (block->getSegment()->m_Goes ? going : staying).push_back(&block->getPlacement());
  PlacementNode::keepOnly(staying);
  for (PlacementNode* node : going)
    node->forget();
}

void Pruner::sweepSymbols() {
  for (bool isDynamic : {false, true})
    for (Symbol::Category category :
         {Symbol::Category_Absolute, Symbol::Category_Common, Symbol::Category_Undefined})
      sweep(m_ObjectModule.getCategoryList(category, isDynamic));
  for (Section* section : m_ObjectModule.m_Sections) {
    if (section->m_Goes) continue;
    for (bool isDynamic : {false, true})
      section->getHostedList(isDynamic).removeIf([](const Symbol* s) { return s->m_Goes; });
    // The sorted views still hold what went.
    section->markHostedChanged();
  }
  for (FastArray<Symbol*>* table : {&m_ObjectModule.m_Symbols, &m_ObjectModule.m_DynamicSymbols})
    for (Symbol* symbol : *table)
      if (symbol->m_AssociatedSymbol != nullptr && symbol->m_AssociatedSymbol->m_Goes)
        symbol->m_AssociatedSymbol = nullptr;
  sweepAndNumber(m_ObjectModule.m_Symbols, 1);
  sweepAndNumber(m_ObjectModule.m_DynamicSymbols, 1);
}

void Pruner::sweepGroups() {
  auto& noted = m_ObjectModule.m_MapSignaturesToComdatGroups;
  const bool areAnyNoted = noted.getSize() != 0;
  for (Group* group : m_ObjectModule.m_Groups) {
    if (group->m_GroupSection != nullptr && group->m_GroupSection->m_Goes)
      group->m_GroupSection = nullptr;
    group->m_Members.removeIf([](const Section* section) { return section->m_Goes; });
    if (!group->m_Goes) continue;
    for (Section* section : group->m_Members.getSpan())
      section->m_Group = nullptr;
    // Nothing is noted in modules in which nobody has looked for a group.
    if (areAnyNoted) noted.remove(Stringlett(group->m_Signature));
  }
  sweepAndNumber(m_ObjectModule.m_Groups, 0);
  sweep(m_ObjectModule.m_UnnotedGroups);
  if (!areAnyNoted) return;
  // Another group of the same signature may be the first one now.
  for (Group* group : m_ObjectModule.m_Groups)
    m_ObjectModule.noteComdatGroup(group);
}

void Pruner::sweepSection(Section& section) {
  const auto goes = [](const Section* other) { return other->m_Goes; };
  if (section.m_Link != nullptr && section.m_Link->m_Goes) section.m_Link = nullptr;
  if (section.m_Segment != nullptr && section.m_Segment->m_Goes) section.m_Segment = nullptr;
  section.m_LinkingSections.removeIf(goes);
  section.m_StaticRelocationSections.removeIf(goes);
  section.m_DynamicRelocationSections.removeIf(goes);
}

void Pruner::sweepSections() {
  for (FastArray<SymbolTableSection*>* tables :
       {&m_ObjectModule.m_SymtabSections, &m_ObjectModule.m_DynsymSections})
    for (SymbolTableSection* table : *tables) {
      if (table->m_ShndxSection != nullptr && table->m_ShndxSection->m_Goes)
        table->m_ShndxSection = nullptr;
      if (table->m_HashSection != nullptr && table->m_HashSection->m_Goes)
        table->m_HashSection = nullptr;
    }
  for (Section* section : m_ObjectModule.m_Sections) {
    // What goes lets go of the file that its contents are in, which may close it.
    if (section->m_Goes)
      section->dropDeferredContents();
    else
      sweepSection(*section);
  }
  sweep(m_ObjectModule.m_StringTableSections);
  sweep(m_ObjectModule.m_SymtabSections);
  sweep(m_ObjectModule.m_DynsymSections);
  sweep(m_ObjectModule.m_GroupSections);
  sweep(m_ObjectModule.m_HashSections);
  sweep(m_ObjectModule.m_ShndxSections);
  sweep(m_ObjectModule.m_PreemptionMapSections);
  sweep(m_ObjectModule.m_VerdefSections);
  sweep(m_ObjectModule.m_VerneedSections);
  sweep(m_ObjectModule.m_VersymSections);
  sweep(m_ObjectModule.m_DynamicSections);
  sweep(m_ObjectModule.m_DebugOverlaySections);
  sweep(m_ObjectModule.m_BuildAttributesSections);
  sweepOverlayRecords();
  sweepAndNumber(m_ObjectModule.m_Sections, 0);
}

void Pruner::sweepOverlayRecords() {
  FastArray<DebugOverlayRecord>& records = m_ObjectModule.m_DebugOverlayRecords;
  DebugOverlayRecord* kept =
      std::remove_if(records.begin(), records.end(), [](const DebugOverlayRecord& record) {
        return record.debugSection->m_Goes || record.section->m_Goes;
      });
  records.setSize(static_cast<uint32_t>(kept - records.begin()));
}

void Pruner::sweepSegments() {
  FastArray<RawDataBlock*>& blocks = m_ObjectModule.m_RawDataBlocks;
  RawDataBlock** kept =
      std::stable_partition(blocks.begin(), blocks.end(),
                            [](const RawDataBlock* block) { return !block->getSegment()->m_Goes; });
  // Behind the placement's sweep, which needed the blocks' nodes.
  std::for_each(kept, blocks.end(), [](RawDataBlock* block) { std::destroy_at(block); });
  blocks.setSize(static_cast<uint32_t>(kept - blocks.begin()));
  sweepAndNumber(m_ObjectModule.m_Segments, 0);
}

} // namespace elfext
