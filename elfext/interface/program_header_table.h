// SPDX-License-Identifier: Apache-2.0
//
// The program header table as a region of the file.
//
// Its rows are Segments. An object that is still to be linked has none, and the table then no
// place.
#pragma once

#include "elfext/interface/elf_header_table.h"

namespace elfext {

constexpr uint32_t ProgramHeaderSize32 = 32;
constexpr uint32_t ProgramHeaderSize64 = 56;

class ProgramHeaderTable final : public ELFHeaderTable {
public:
  ProgramHeaderTable() : ELFHeaderTable(ProgramHeaderSize32) {}

  DataStructure* createDataStructure(alloclib::RegionGeneral& region,
                                     uint64_t currentOffset) override;
};

} // namespace elfext
