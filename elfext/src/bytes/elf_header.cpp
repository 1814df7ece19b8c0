// SPDX-License-Identifier: Apache-2.0
//
// The ELF header as a file region: always at offset 0, and aligned to a word. Its size is e_ehsize
// as the file has it.
#include "elfext/interface/elf_header.h"

#include "alloclib/interface/region_objects.h"
#include "checking/interface/checking.h"
#include "elfext/interface/data_structure.h"

namespace elfext {

void ELFHeader::getAlignment(uint64_t* remainder, uint64_t* alignment) const {
  *remainder = 0;
  *alignment = 4;
}

void ELFHeader::setFileOffset(uint64_t offset) {
  QUARN_ASSERT(1, offset == 0);
  FileRegion::setFileOffset(offset);
}

DataStructure* ELFHeader::createDataStructure(alloclib::RegionGeneral& region,
                                              uint64_t currentOffset) {
  QUARN_ASSERT(1, currentOffset == 0);
  return alloclib::create<ElfHeaderDataStructure>(region, this, currentOffset);
}

} // namespace elfext
