// SPDX-License-Identifier: Apache-2.0
//
// The two tables of headers as file regions. What they hold is the model's sections and segments;
// here is only where they lie, and the layout record that each of them becomes.
#include "elfext/interface/elf_header_table.h"

#include "alloclib/interface/region_objects.h"
#include "elfext/interface/data_structure.h"
#include "elfext/interface/program_header_table.h"
#include "elfext/interface/section_header_table.h"

namespace elfext {

void ELFHeaderTable::getAlignment(uint64_t* remainder, uint64_t* alignment) const {
  *remainder = 0;
  *alignment = m_Alignment;
}

DataStructure* SectionHeaderTable::createDataStructure(alloclib::RegionGeneral& region,
                                                       uint64_t currentOffset) {
  return alloclib::create<SectionHeaderTableDataStructure>(region, this, currentOffset);
}

DataStructure* ProgramHeaderTable::createDataStructure(alloclib::RegionGeneral& region,
                                                       uint64_t currentOffset) {
  return alloclib::create<SegmentHeaderTableDataStructure>(region, this, currentOffset);
}

} // namespace elfext
