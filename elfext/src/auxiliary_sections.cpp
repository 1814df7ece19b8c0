// SPDX-License-Identifier: Apache-2.0
//
// The sections whose contents the model makes itself, of which symbol tables and relocation
// sections do something. This is where a file's relocation rows wait: between setRows and takeRows
// they are counted at their target, and nobody else has them.
#include "elfext/interface/auxiliary_sections.h"

#include "elfext/interface/object_module.h"
#include "elfext/src/bytes/elf_records.h"

#include <utility>

namespace elfext {

bool hasOwnSectionClass(uint32_t type) {
  switch (type) {
  case SHT_NULL:
  case SHT_STRTAB:
  case SHT_SYMTAB:
  case SHT_DYNSYM:
  case SHT_REL:
  case SHT_RELA:
  case SHT_GROUP:
  case SHT_SYMTAB_SHNDX:
  case SHT_HASH:
  case SHT_ZEV_PREEMPTMAP:
  case SHT_GNU_verdef:
  case SHT_GNU_verneed:
  case SHT_GNU_versym:
  case SHT_DYNAMIC:
  case SHT_ZEV_ATTRIBUTES:
  case SHT_ZEV_DEBUGOVERLAY:
    return true;
  default:
    return false;
  }
}

SymbolTableSection::SymbolTableSection(ObjectModule* objectModule, const char* name, uint32_t type,
                                       uint32_t flags)
    : Section(objectModule, name, type, flags,
              {true, false, expectedEntrySize(type, objectModule->getElfClass())}) {}

RelocationSection::RelocationSection(ObjectModule* objectModule, const char* name, uint32_t type,
                                     uint32_t flags)
    : Section(objectModule, name, type, flags,
              {true, false, expectedEntrySize(type, objectModule->getElfClass())}) {}

void RelocationSection::setTarget(Section* target, bool isDynamic) {
  QUARN_ASSERT(1, target != NULL);
  if (m_Target != nullptr) {
    // Rows that wait belong to the old target.
    m_Target->materializeRelocations();
    m_Target->getRelocationSections(m_IsDynamic).removeValue(this);
  }
  m_Target = target;
  m_IsDynamic = isDynamic;
  target->getRelocationSections(isDynamic).append(getObjectModule()->getContainerRegion(), this);
  markChanged();
}

void RelocationSection::setRows(RelocationRows* rows, uint32_t rowCount) {
  QUARN_ASSERT(1, rows != NULL);
  QUARN_ASSERT(1, m_Target != NULL);
  QUARN_ASSERT(1, m_Rows == NULL);
  // Without rows there is nothing to wait, and nothing for anybody to take.
  if (rowCount == 0) return;
  m_Rows = rows;
  m_RowCount = rowCount;
  m_Target->m_PendingRelocationCount += rowCount;
  m_Target->m_AreRelocationsSorted = false;
}

RelocationRows* RelocationSection::takeRows() {
  m_RowCount = 0;
  return std::exchange(m_Rows, nullptr);
}

} // namespace elfext
