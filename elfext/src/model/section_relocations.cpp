// SPDX-License-Identifier: Apache-2.0
//
// The relocations of a section. What a file says of them stays in its relocation sections as rows
// until somebody wants a relocation: then all rows for this section become objects, in the order of
// their sections, and nobody can tell when.
//
// Rows were checked by the reader, so making objects of them can't fail; an object with a million
// relocations costs nothing for them until somebody looks. The list's order is the file's; a sorted
// view by offset is made at the first query after a change.
#include "alloclib/interface/region_objects.h"
#include "checking/interface/checking.h"
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/relocation.h"
#include "elfext/interface/relocation_rows.h"
#include "elfext/interface/section.h"
#include "elfext/interface/sort.h"

#include <algorithm>
#include <vector>

namespace elfext {

void Section::mustTakeRelocation(const Symbol* target) const {
  QUARN_ASSERT(1, (target == NULL) || (target->m_ObjectModule == m_ObjectModule));
  QUARN_ASSERT(1, m_IsRelocatable);
  QUARN_ASSERT(1, !m_ObjectModule->m_IndexesFrozen);
}

Relocation* Section::addRelocation(uint64_t offset, uint32_t type, Symbol* target) {
  mustTakeRelocation(target);
  return appendRelocation({this, offset, type, target});
}

Relocation* Section::addRelocation(uint64_t offset, uint32_t type, Symbol* target, int64_t addend) {
  mustTakeRelocation(target);
  return appendRelocation({this, offset, type, target, addend});
}

Relocation* Section::appendRelocation(const Relocation& relocation) {
  materializeRelocations();
  auto* appended = alloclib::create<Relocation>(m_ObjectModule->getObjectRegion(), relocation);
  m_Relocations.append(m_ObjectModule->getContainerRegion(), appended);
  m_AreRelocationsSorted = false;
  markChanged();
  return appended;
}

void Section::materializeRelocations() {
  if (m_PendingRelocationCount == 0) return;
  m_Relocations.get(m_ObjectModule->getContainerRegion())
      .reserve(m_Relocations.getSize() + m_PendingRelocationCount);
  m_PendingRelocationCount = 0;
  std::vector<RelocationSection*> sections;
  for (bool isDynamic : {false, true})
    for (RelocationSection* section : getRelocationSections(isDynamic).getSpan())
      if (section->getPendingRowCount() != 0) sections.push_back(section);
  // Static and dynamic ones are in two lists; their indexes make one order of them.
  std::sort(sections.begin(), sections.end(), [](const Section* left, const Section* right) {
    return left->getIndex() < right->getIndex();
  });
  // Saying what the file says is no change, and allowed where changes are not.
  const bool isRelocatable = std::exchange(m_IsRelocatable, true);
  const bool areFrozen = std::exchange(m_ObjectModule->m_IndexesFrozen, false);
  const bool areUpToDate = m_ObjectModule->areAuxiliarySectionsUpToDate();
  for (RelocationSection* section : sections) {
    const uint32_t first = m_Relocations.getSize();
    section->takeRows()->appendTo(*this);
    for (Relocation* relocation : m_Relocations.getSpan().subspan(first))
      relocation->m_Origin = section;
  }
  m_IsRelocatable = isRelocatable;
  m_ObjectModule->m_IndexesFrozen = areFrozen;
  m_ObjectModule->m_AreAuxiliarySectionsUpToDate = areUpToDate;
}

uint32_t Section::getRelocationCount() const {
  return m_Relocations.getSize() + m_PendingRelocationCount;
}

Relocation* Section::getRelocation(uint32_t index) {
  materializeRelocations();
  return m_Relocations[index];
}

uint32_t Section::getRelocationIndex(const Relocation* relocation) {
  QUARN_ASSERT(1, relocation != NULL);
  QUARN_ASSERT(1, relocation->m_Section == this);
  QUARN_ASSERT(2, m_Relocations.contains(const_cast<Relocation*>(relocation)));
  const std::span<Relocation*> all = m_Relocations.getSpan();
  const auto found = std::find(all.begin(), all.end(), relocation);
  return found == all.end() ? NoIndex : static_cast<uint32_t>(found - all.begin());
}

void Section::setRelocationIndex(Relocation* relocation, uint32_t index) {
  materializeRelocations();
  QUARN_ASSERT(1, relocation != NULL);
  QUARN_ASSERT(1, relocation->m_Section == this);
  QUARN_ASSERT(1, index < m_Relocations.getSize());
  QUARN_ASSERT(1, !m_ObjectModule->m_IndexesFrozen);
  if (m_Relocations[index] == relocation) return;
  FastArray<Relocation*>& relocations = m_Relocations.get(m_ObjectModule->getContainerRegion());
  relocations.removeValue(relocation);
  relocations.insert(index, relocation);
  m_AreRelocationsSorted = false;
  markChanged();
}

void Section::removeRelocation(Relocation* relocation) {
  QUARN_ASSERT(1, relocation != NULL);
  QUARN_ASSERT(1, relocation->m_Section == this);
  QUARN_ASSERT(1, !m_ObjectModule->m_IndexesFrozen);
  m_Relocations.removeValue(relocation);
  m_AreRelocationsSorted = false;
  markChanged();
}

void Section::removeAllRelocations() {
  QUARN_ASSERT(1, !m_ObjectModule->m_IndexesFrozen);
  for (bool isDynamic : {false, true})
    for (RelocationSection* section : getRelocationSections(isDynamic).getSpan())
      section->takeRows();
  m_PendingRelocationCount = 0;
  m_Relocations.clear();
  m_AreRelocationsSorted = false;
  markChanged();
}

// All rows of one relocation section are of one kind.
bool Section::hasRelocations(bool isDynamic, bool hasAddend) const {
  const auto& sections = isDynamic ? m_DynamicRelocationSections : m_StaticRelocationSections;
  const auto isPending = [=](const RelocationSection* section) {
    return section->getPendingRowCount() != 0 && section->hasAddends() == hasAddend;
  };
  const auto isWanted = [=](const Relocation* relocation) {
    return relocation->isDynamic() == isDynamic && relocation->hasAddend() == hasAddend;
  };
  return std::any_of(sections.begin(), sections.end(), isPending) ||
         std::any_of(m_Relocations.begin(), m_Relocations.end(), isWanted);
}

bool Section::hasStaticRelocationsWithAddend() const {
  return hasRelocations(false, true);
}

bool Section::hasStaticRelocationsWithoutAddend() const {
  return hasRelocations(false, false);
}

bool Section::hasDynamicRelocationsWithAddend() const {
  return hasRelocations(true, true);
}

bool Section::hasDynamicRelocationsWithoutAddend() const {
  return hasRelocations(true, false);
}

uint32_t Section::countDynamicRelocations(bool isJumpSlot, bool hasAddend) {
  materializeRelocations();
  // Relocation types are numbered by the machine.
  const uint32_t jumpSlot =
      m_ObjectModule->getMachine() == EM_ZEV ? R_ZEV_JUMP_SLOT : R_ZEV64_JUMP_SLOT;
  const auto isWanted = [=](const Relocation* relocation) {
    return relocation->isDynamic() && relocation->hasAddend() == hasAddend &&
           (relocation->getType() == jumpSlot) == isJumpSlot;
  };
  return static_cast<uint32_t>(std::count_if(m_Relocations.begin(), m_Relocations.end(), isWanted));
}

uint32_t Section::getJumpSlotCountWithoutAddend() {
  return countDynamicRelocations(true, false);
}

uint32_t Section::getJumpSlotCountWithAddend() {
  return countDynamicRelocations(true, true);
}

uint32_t Section::getOtherDynamicCountWithoutAddend() {
  return countDynamicRelocations(false, false);
}

uint32_t Section::getOtherDynamicCountWithAddend() {
  return countDynamicRelocations(false, true);
}

void Section::sortRelocations() {
  materializeRelocations();
  if (m_AreRelocationsSorted) return;
  m_RelocationsSortedByOffset.clear();
  for (Relocation* relocation : m_Relocations.getSpan())
    m_RelocationsSortedByOffset.append(m_ObjectModule->getContainerRegion(), relocation);
  // Stable: relocations of one place stay in the list's order.
  mergeSort(m_RelocationsSortedByOffset.getSpan(),
            [](const Relocation* left, const Relocation* right) {
              return static_cast<int>(left->getOffset() > right->getOffset()) -
                     static_cast<int>(left->getOffset() < right->getOffset());
            });
  m_AreRelocationsSorted = true;
}

void Section::getRelocationsInRange(uint64_t fromOffset, uint64_t toOffset,
                                    RelocationList* relocations) {
  QUARN_ASSERT(1, relocations != NULL);
  sortRelocations();
  const std::span<Relocation*> all = m_RelocationsSortedByOffset.getSpan();
  const auto from = std::partition_point(
      all.begin(), all.end(), [=](const Relocation* r) { return r->getOffset() < fromOffset; });
  const auto to = std::partition_point(
      from, all.end(), [=](const Relocation* r) { return r->getOffset() <= toOffset; });
  relocations->setSize(static_cast<uint32_t>(to - from));
  for (uint32_t index = 0; index < relocations->getSize(); ++index)
    relocations->set(index, from[index]);
}

} // namespace elfext
