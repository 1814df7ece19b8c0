// SPDX-License-Identifier: Apache-2.0
//
// The numbers of the ELF standard, under the standard's own names, as far as this library knows
// them, and those of the ZEV processor supplement.
//
// Each group begins with the field that its values stand in. They are 32 bits wide whatever the
// field is; what a file says may be any number and is compared with these,
// never taken for one of them.
#pragma once

#include <array>
#include <cstdint>

namespace elfext {

/// e_ident; the first four bytes of every ELF file.
constexpr std::array<uint8_t, 4> ElfMagic = {0x7F, 'E', 'L', 'F'};
constexpr uint32_t ELFCLASS32 = 1;
constexpr uint32_t ELFCLASS64 = 2;
constexpr uint32_t ELFDATA2LSB = 1;
constexpr uint32_t ELFDATA2MSB = 2;
constexpr uint32_t ELFOSABI_ZEV = 64;

/// e_type
constexpr uint32_t ET_NONE = 0;
constexpr uint32_t ET_REL = 1;
constexpr uint32_t ET_EXEC = 2;
constexpr uint32_t ET_DYN = 3;
constexpr uint32_t ET_CORE = 4;

/// e_machine
constexpr uint32_t EM_ZEV = 40;
constexpr uint32_t EM_ZEV64 = 183;

/// e_version
constexpr uint32_t EV_CURRENT = 1;

/// st_shndx, e_shstrndx, e_phnum
constexpr uint32_t SHN_UNDEF = 0;
constexpr uint32_t SHN_LORESERVE = 0xFF00;
constexpr uint32_t SHN_ABS = 0xFFF1;
constexpr uint32_t SHN_COMMON = 0xFFF2;
constexpr uint32_t SHN_XINDEX = 0xFFFF;
constexpr uint32_t PN_XNUM = 0xFFFF;

/// sh_type
constexpr uint32_t SHT_NULL = 0;
constexpr uint32_t SHT_PROGBITS = 1;
constexpr uint32_t SHT_SYMTAB = 2;
constexpr uint32_t SHT_STRTAB = 3;
constexpr uint32_t SHT_RELA = 4;
constexpr uint32_t SHT_HASH = 5;
constexpr uint32_t SHT_DYNAMIC = 6;
constexpr uint32_t SHT_NOTE = 7;
constexpr uint32_t SHT_NOBITS = 8;
constexpr uint32_t SHT_REL = 9;
constexpr uint32_t SHT_SHLIB = 10;
constexpr uint32_t SHT_DYNSYM = 11;
constexpr uint32_t SHT_INIT_ARRAY = 14;
constexpr uint32_t SHT_FINI_ARRAY = 15;
constexpr uint32_t SHT_PREINIT_ARRAY = 16;
constexpr uint32_t SHT_GROUP = 17;
constexpr uint32_t SHT_SYMTAB_SHNDX = 18;
constexpr uint32_t SHT_GNU_verdef = 0x6FFFFFFD;
constexpr uint32_t SHT_GNU_verneed = 0x6FFFFFFE;
constexpr uint32_t SHT_GNU_versym = 0x6FFFFFFF;
constexpr uint32_t SHT_ZEV_EXIDX = 0x70000001;
constexpr uint32_t SHT_ZEV_PREEMPTMAP = 0x70000002;
constexpr uint32_t SHT_ZEV_ATTRIBUTES = 0x70000003;
constexpr uint32_t SHT_ZEV_DEBUGOVERLAY = 0x70000004;

/// sh_flags
constexpr uint32_t SHF_WRITE = 0x1;
constexpr uint32_t SHF_ALLOC = 0x2;
constexpr uint32_t SHF_EXECINSTR = 0x4;
constexpr uint32_t SHF_MERGE = 0x10;
constexpr uint32_t SHF_STRINGS = 0x20;
constexpr uint32_t SHF_INFO_LINK = 0x40;
constexpr uint32_t SHF_LINK_ORDER = 0x80;
constexpr uint32_t SHF_GROUP = 0x200;
constexpr uint32_t SHF_TLS = 0x400;

/// The flags word of a group
constexpr uint32_t GRP_COMDAT = 0x1;

/// st_info: binding and type
constexpr uint32_t STB_LOCAL = 0;
constexpr uint32_t STB_GLOBAL = 1;
constexpr uint32_t STB_WEAK = 2;
constexpr uint32_t STT_NOTYPE = 0;
constexpr uint32_t STT_OBJECT = 1;
constexpr uint32_t STT_FUNC = 2;
constexpr uint32_t STT_SECTION = 3;
constexpr uint32_t STT_FILE = 4;
constexpr uint32_t STT_COMMON = 5;
constexpr uint32_t STT_TLS = 6;

/// st_other
constexpr uint32_t STV_DEFAULT = 0;
constexpr uint32_t STV_INTERNAL = 1;
constexpr uint32_t STV_HIDDEN = 2;
constexpr uint32_t STV_PROTECTED = 3;

/// p_type
constexpr uint32_t PT_NULL = 0;
constexpr uint32_t PT_LOAD = 1;
constexpr uint32_t PT_DYNAMIC = 2;
constexpr uint32_t PT_INTERP = 3;
constexpr uint32_t PT_NOTE = 4;
constexpr uint32_t PT_SHLIB = 5;
constexpr uint32_t PT_PHDR = 6;
constexpr uint32_t PT_TLS = 7;
constexpr uint32_t PT_ZEV_EXIDX = 0x70000001;

/// p_flags
constexpr uint32_t PF_X = 1;
constexpr uint32_t PF_W = 2;
constexpr uint32_t PF_R = 4;

/// d_tag
constexpr uint32_t DT_NULL = 0;
constexpr uint32_t DT_NEEDED = 1;
constexpr uint32_t DT_INIT = 12;
constexpr uint32_t DT_FINI = 13;
constexpr uint32_t DT_SONAME = 14;
constexpr uint32_t DT_RPATH = 15;
constexpr uint32_t DT_SYMBOLIC = 16;
constexpr uint32_t DT_TEXTREL = 22;
constexpr uint32_t DT_BIND_NOW = 24;
constexpr uint32_t DT_INIT_ARRAY = 25;
constexpr uint32_t DT_FINI_ARRAY = 26;
constexpr uint32_t DT_INIT_ARRAYSZ = 27;
constexpr uint32_t DT_FINI_ARRAYSZ = 28;
constexpr uint32_t DT_RUNPATH = 29;
constexpr uint32_t DT_FLAGS = 30;
constexpr uint32_t DT_PREINIT_ARRAY = 32;
constexpr uint32_t DT_PREINIT_ARRAYSZ = 33;
constexpr uint32_t DT_VERDEFNUM = 0x6FFFFFFD;
constexpr uint32_t DT_VERNEEDNUM = 0x6FFFFFFF;
constexpr uint32_t DT_ZEV_SYMTABSZ = 0x70000001;
constexpr uint32_t DT_ZEV_PREEMPTMAP = 0x70000002;

/// DT_FLAGS, and the single tags that say the same
constexpr uint32_t DF_SYMBOLIC = 0x2;
constexpr uint32_t DF_TEXTREL = 0x4;
constexpr uint32_t DF_BIND_NOW = 0x8;

/// Versions: vd_flags, and a symbol's word in the versym section
constexpr uint32_t VER_FLG_BASE = 0x1;
constexpr uint32_t VERSYM_HIDDEN = 0x8000;

/// Jump-slot relocations
constexpr uint32_t R_ZEV_JUMP_SLOT = 22;
constexpr uint32_t R_ZEV64_JUMP_SLOT = 1026;

/// The section type's name as the constant above is spelt; null for a type without one.
[[nodiscard]] const char* sectionTypeName(uint32_t type);

} // namespace elfext
