// SPDX-License-Identifier: Apache-2.0
//
// A row of the program header table: p_type, p_offset, p_vaddr, p_paddr, p_filesz, p_memsz,
// p_flags, p_align, kept as the file has them. Whether the bytes are there was checked only where
// they are needed.
#include "elfext/interface/segment.h"

#include "alloclib/interface/region_objects.h"
#include "elfext/interface/data_structure.h"

namespace elfext {

// NOLINTNEXTLINE(readability-function-size): the fields of a program header
Segment::Segment(ObjectModule* objectModule, uint32_t type, uint64_t offset, uint64_t vaddr,
                 uint64_t paddr, uint64_t filesz, uint64_t memsz, uint32_t flags, uint64_t align)
    : m_ObjectModule(objectModule), m_VirtualAddress(vaddr), m_PhysicalAddress(paddr),
      m_FileSize(filesz), m_MemorySize(memsz), m_Alignment(align), m_Type(type), m_Flags(flags) {
  setFileOffset(offset);
}

// A file may say 0 for no alignment, by which nobody should divide.
void Segment::getAlignment(uint64_t* remainder, uint64_t* alignment) const {
  *alignment = m_Alignment == 0 ? 1 : m_Alignment;
  *remainder = m_VirtualAddress % *alignment;
}

DataStructure* Segment::createDataStructure(alloclib::RegionGeneral& region,
                                            uint64_t currentOffset) {
  return alloclib::create<SegmentDataStructure>(region, this, currentOffset);
}

} // namespace elfext
