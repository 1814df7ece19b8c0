// SPDX-License-Identifier: Apache-2.0
//
// The section header table as a region of the file.
//
// Its rows are Sections. Row sizes are those of the classes, in bytes.
#pragma once

#include "elfext/interface/elf_header_table.h"

namespace elfext {

constexpr uint32_t SectionHeaderSize32 = 40;
constexpr uint32_t SectionHeaderSize64 = 64;

class SectionHeaderTable final : public ELFHeaderTable {
public:
  SectionHeaderTable() : ELFHeaderTable(SectionHeaderSize32) {}

  DataStructure* createDataStructure(alloclib::RegionGeneral& region,
                                     uint64_t currentOffset) override;
};

} // namespace elfext
