// SPDX-License-Identifier: Apache-2.0
//
// What a section is; its contents, relocations and symbols have files of their own.
//
// Fields that a file fills are the ELF standard's: sh_name, sh_type, sh_flags (of which 32 bits are
// kept), sh_addr, sh_size, sh_link, sh_info, sh_addralign, sh_entsize. Auxiliary sections are those
// that the model makes the contents of (tables, strings): their users change the objects instead,
// and changing the section is a fault.
#include "elfext/interface/section.h"

#include "alloclib/interface/region_objects.h"
#include "elfext/interface/data_structure.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/segment.h"

#include <algorithm>
#include <cstring>

namespace elfext {

Section::Section(ObjectModule* objectModule, const char* name, uint32_t type, uint32_t flags,
                 const Traits& traits)
    : ObjectWithBuildAttributes(objectModule), m_Name(name), m_EntrySize(traits.entrySize),
      m_Type(type), m_Flags(flags), m_IsAuxiliary(traits.isAuxiliary),
      m_IsRelocatable(traits.isRelocatable), m_Contents(objectModule) {}

Section::~Section() {
  dropDeferredContents();
}

uint64_t Section::getFileSize() const {
  return m_Type == SHT_NOBITS ? 0 : getSize();
}

void Section::markChanged() {
  m_ObjectModule->markChanged();
}

void Section::setName(const char* name) {
  if (name == m_Name) return;
  if (name != nullptr && m_Name != nullptr && std::strcmp(name, m_Name) == 0) return;
  m_Name = m_ObjectModule->copyText(name);
  markChanged();
}

void Section::setFlags(uint32_t flags) {
  m_Flags = flags;
  markChanged();
}

void Section::addFlags(uint32_t flags) {
  setFlags(m_Flags | flags);
}

// The addresses of the section's symbols move with it.
void Section::setAddress(uint64_t address) {
  m_Address = address;
  m_ObjectModule->markSymbolsChanged();
}

void Section::setEntrySize(uint64_t size) {
  m_EntrySize = size;
  markChanged();
}

void Section::setLink(Section* link) {
  QUARN_ASSERT(1, link != NULL);
  QUARN_ASSERT(1, link->m_ObjectModule == m_ObjectModule);
  QUARN_ASSERT(2, m_ObjectModule->m_Sections.contains(link));
  QUARN_ASSERT(1, !m_IsAuxiliary);
  adoptLink(link);
}

void Section::adoptLink(Section* link) {
  if (m_Link != nullptr) m_Link->m_LinkingSections.removeValue(this);
  m_Link = link;
  if (link != nullptr) link->m_LinkingSections.append(m_ObjectModule->getContainerRegion(), this);
  markChanged();
}

void Section::setInfo(uint32_t value) {
  QUARN_ASSERT(1, !m_IsAuxiliary);
  m_Info = value;
  markChanged();
}

void Section::adoptHeader(const SectionHeader& header) {
  m_EntrySize = header.entsize;
  m_Info = header.info;
  m_Alignment = header.addralign;
  setFileOffset(header.offset);
  setAddress(header.addr);
}

void Section::setSize(uint64_t size) {
  QUARN_ASSERT(1, !m_IsAuxiliary);
  m_Size = size;
  // A section without bytes may have any size, for which nothing is reserved.
  if (m_Type != SHT_NOBITS) m_Contents.setSize(size);
  markChanged();
}

uint64_t Section::addSize(uint64_t delta) {
  const uint64_t oldSize = m_Size;
  m_Size += delta;
  markChanged();
  return oldSize;
}

void Section::setAlignment(uint64_t alignment) {
  QUARN_ASSERT(1, (alignment & ~(alignment & (0 - alignment))) == 0);
  m_Alignment = alignment;
  markChanged();
}

void Section::increaseAlignment(uint64_t alignment) {
  QUARN_ASSERT(1, (alignment & ~(alignment & (0 - alignment))) == 0);
  if (alignment > m_Alignment) setAlignment(alignment);
}

void Section::makeProgBits() {
  QUARN_ASSERT(1, !m_IsAuxiliary);
  m_Type = SHT_PROGBITS;
  m_Contents.setSize(m_Size);
  markChanged();
}

bool Section::isInSegment(uint32_t* segmentIndex) {
  for (Segment* segment : m_ObjectModule->getSegments()) {
    // The first one in the order of the program headers.
    if (!isWithin(*segment)) continue;
    if (segmentIndex != nullptr) *segmentIndex = segment->getIndex();
    return true;
  }
  return false;
}

void Section::getInheritedBuildAttributes(BuildAttributes& result) const {
  m_ObjectModule->getEffectiveBuildAttributes(result);
}

void Section::getAlignment(uint64_t* remainder, uint64_t* alignment) const {
  *remainder = 0;
  switch (m_Type) {
  case SHT_NULL:
  case SHT_NOBITS:
    *alignment = 1;
    return;
  case SHT_SYMTAB:
  case SHT_RELA:
  case SHT_HASH:
  case SHT_REL:
  case SHT_DYNSYM:
  case SHT_GROUP:
  case SHT_SYMTAB_SHNDX:
    *alignment = 4;
    return;
  default:
    // In the file a word's alignment is enough; 0 means none. What memory wants is sh_addralign.
    *alignment = std::clamp<uint64_t>(m_Alignment, 1, 4);
  }
}

DataStructure* Section::createDataStructure(alloclib::RegionGeneral& region,
                                            uint64_t currentOffset) {
  return alloclib::create<SectionDataStructure>(region, this, currentOffset);
}

} // namespace elfext
