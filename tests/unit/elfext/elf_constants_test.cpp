// SPDX-License-Identifier: Apache-2.0
//
// The names of section types, as reports show them: each type has that of its constant, and a
// number that is none has no name.

#include "elfext/interface/elf_constants.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>

namespace elfext {
namespace {

TEST(SectionTypeNameTest, SpellsEachTypeAsItsConstant) {
  const std::pair<uint32_t, const char*> names[] = {
      {0, "SHT_NULL"},
      {1, "SHT_PROGBITS"},
      {2, "SHT_SYMTAB"},
      {3, "SHT_STRTAB"},
      {4, "SHT_RELA"},
      {5, "SHT_HASH"},
      {6, "SHT_DYNAMIC"},
      {7, "SHT_NOTE"},
      {8, "SHT_NOBITS"},
      {9, "SHT_REL"},
      {10, "SHT_SHLIB"},
      {11, "SHT_DYNSYM"},
      {14, "SHT_INIT_ARRAY"},
      {15, "SHT_FINI_ARRAY"},
      {16, "SHT_PREINIT_ARRAY"},
      {17, "SHT_GROUP"},
      {18, "SHT_SYMTAB_SHNDX"},
      {0x6ffffffd, "SHT_GNU_verdef"},
      {0x6ffffffe, "SHT_GNU_verneed"},
      {0x6fffffff, "SHT_GNU_versym"},
      {0x70000001, "SHT_ZEV_EXIDX"},
      {0x70000002, "SHT_ZEV_PREEMPTMAP"},
      {0x70000003, "SHT_ZEV_ATTRIBUTES"},
      {0x70000004, "SHT_ZEV_DEBUGOVERLAY"},
  };
  for (const auto& [type, name] : names)
    EXPECT_STREQ(sectionTypeName(type), name);
}

TEST(SectionTypeNameTest, KnowsNoOtherType) {
  for (uint32_t type : {12u, 13u, 19u, 0x6ffffffcu, 0x70000000u, 0x70000005u, 0xffffffffu})
    EXPECT_EQ(sectionTypeName(type), nullptr) << type;
}

} // namespace
} // namespace elfext
