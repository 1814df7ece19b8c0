// SPDX-License-Identifier: Apache-2.0
//
// The names of section types, as the ELF standard and the processor's supplement spell them, for
// reports. Types that these don't name are shown by number alone.
#include "elfext/interface/elf_constants.h"

namespace elfext {

const char* sectionTypeName(uint32_t type) {
  // clang-format off
  switch (type) {
  case SHT_NULL:             return "SHT_NULL";
  case SHT_PROGBITS:         return "SHT_PROGBITS";
  case SHT_SYMTAB:           return "SHT_SYMTAB";
  case SHT_STRTAB:           return "SHT_STRTAB";
  case SHT_RELA:             return "SHT_RELA";
  case SHT_HASH:             return "SHT_HASH";
  case SHT_DYNAMIC:          return "SHT_DYNAMIC";
  case SHT_NOTE:             return "SHT_NOTE";
  case SHT_NOBITS:           return "SHT_NOBITS";
  case SHT_REL:              return "SHT_REL";
  case SHT_SHLIB:            return "SHT_SHLIB";
  case SHT_DYNSYM:           return "SHT_DYNSYM";
  case SHT_INIT_ARRAY:       return "SHT_INIT_ARRAY";
  case SHT_FINI_ARRAY:       return "SHT_FINI_ARRAY";
  case SHT_PREINIT_ARRAY:    return "SHT_PREINIT_ARRAY";
  case SHT_GROUP:            return "SHT_GROUP";
  case SHT_SYMTAB_SHNDX:     return "SHT_SYMTAB_SHNDX";
  case SHT_GNU_verdef:       return "SHT_GNU_verdef";
  case SHT_GNU_verneed:      return "SHT_GNU_verneed";
  case SHT_GNU_versym:       return "SHT_GNU_versym";
  case SHT_ZEV_EXIDX:        return "SHT_ZEV_EXIDX";
  case SHT_ZEV_PREEMPTMAP:   return "SHT_ZEV_PREEMPTMAP";
  case SHT_ZEV_ATTRIBUTES:   return "SHT_ZEV_ATTRIBUTES";
  case SHT_ZEV_DEBUGOVERLAY: return "SHT_ZEV_DEBUGOVERLAY";
  default:                   return nullptr;
  }
  // clang-format on
}

} // namespace elfext
