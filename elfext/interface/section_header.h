// SPDX-License-Identifier: Apache-2.0
//
// A row of the section header table in the wide form that both classes are read into; the fields
// are those of the ELF standard, without their sh_.
//
// Elf32_Shdr and Elf64_Shdr. Values are as the file has them until the tables have checked them,
// and mended where the handler let something pass.
#pragma once

#include <cstdint>

namespace elfext {

struct SectionHeader {
  uint32_t name = 0;
  uint32_t type = 0;
  uint64_t flags = 0;
  uint64_t addr = 0;
  uint64_t offset = 0;
  uint64_t size = 0;
  uint32_t link = 0;
  uint32_t info = 0;
  uint64_t addralign = 0;
  uint64_t entsize = 0;
};

} // namespace elfext
