// SPDX-License-Identifier: Apache-2.0
//
// The sections whose bytes are bookkeeping: one class for each type, all made by the creators of
// ObjectModule. What they know beside a plain section is how they hang together.
//
// The numbers in their constructors are whether the section is auxiliary, whether relocations may
// apply to it, and the size of its rows in bytes, 0 for none of fixed size.
#pragma once

#include "elfext/interface/elf_constants.h"
#include "elfext/interface/section.h"

#include <cstdint>

namespace elfext {

class HashSection;
class RelocationRows;
class ShndxSection;

/// Whether sections of the type have a class of their own, one of those below.
[[nodiscard]] bool hasOwnSectionClass(uint32_t type);

class NullSection final : public Section {
public:
  NullSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_NULL, flags, {true, true, 0}) {}
};

class StringTableSection final : public Section {
public:
  StringTableSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_STRTAB, flags, {true, false, 0}) {}

  /// Who uses it.
  [[nodiscard]] bool isSectionNameTable() const { return m_IsSectionNameTable; }
  [[nodiscard]] bool isLinkedBySymtab() const { return m_IsLinkedBySymtab; }
  [[nodiscard]] bool isLinkedByDynsym() const { return m_IsLinkedByDynsym; }
  [[nodiscard]] bool isLinkedByOther() const { return m_IsLinkedByOther; }

private:
  friend class ModuleBuilder;

  bool m_IsSectionNameTable = false;
  bool m_IsLinkedBySymtab = false;
  bool m_IsLinkedByDynsym = false;
  bool m_IsLinkedByOther = false;
};

class SymbolTableSection final : public Section {
public:
  /// The type is SHT_SYMTAB or SHT_DYNSYM.
  SymbolTableSection(ObjectModule* objectModule, const char* name, uint32_t type, uint32_t flags);

  /// Null for a table without.
  [[nodiscard]] ShndxSection* getShndxSection() const { return m_ShndxSection; }
  [[nodiscard]] HashSection* getHashSection() const { return m_HashSection; }

private:
  friend class ModuleBuilder;
  friend class Pruner;

  ShndxSection* m_ShndxSection = nullptr;
  HashSection* m_HashSection = nullptr;
};

class RelocationSection final : public Section {
public:
  /// The type is SHT_REL or SHT_RELA.
  RelocationSection(ObjectModule* objectModule, const char* name, uint32_t type, uint32_t flags);

  /// The section that the relocations apply to; null until it is known.
  [[nodiscard]] Section* getTarget() const { return m_Target; }
  /// Whether its symbols are the dynamic ones.
  [[nodiscard]] bool isDynamic() const { return m_IsDynamic; }
  [[nodiscard]] bool hasAddends() const { return getType() == SHT_RELA; }
  /// Rows that are not relocations yet.
  [[nodiscard]] uint32_t getPendingRowCount() const { return m_RowCount; }

  [[nodiscard]] RelocationSection* asRelocationSection() override { return this; }
  [[nodiscard]] const RelocationSection* asRelocationSection() const override { return this; }

private:
  friend class ModuleBuilder;
  friend class Pruner;
  friend class Section;

  void setTarget(Section* target, bool isDynamic);
  void setRows(RelocationRows* rows, uint32_t rowCount);
  RelocationRows* takeRows();

  Section* m_Target = nullptr;
  RelocationRows* m_Rows = nullptr;
  uint32_t m_RowCount = 0;
  bool m_IsDynamic = false;
};

class GroupSection final : public Section {
public:
  GroupSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_GROUP, flags, {true, false, 4}) {}

  /// In the symbol table that the section links to.
  [[nodiscard]] uint32_t getSignatureSymbolIndex() const { return m_SignatureSymbolIndex; }

private:
  friend class ModuleBuilder;

  uint32_t m_SignatureSymbolIndex = 0;
};

class ShndxSection final : public Section {
public:
  ShndxSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_SYMTAB_SHNDX, flags, {true, false, 4}) {}
};

class HashSection final : public Section {
public:
  HashSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_HASH, flags, {true, false, 0}) {}
};

class PreemptionMapSection final : public Section {
public:
  PreemptionMapSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_ZEV_PREEMPTMAP, flags, {true, false, 0}) {}
};

class VerdefSection final : public Section {
public:
  VerdefSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_GNU_verdef, flags, {true, false, 0}) {}
};

class VerneedSection final : public Section {
public:
  VerneedSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_GNU_verneed, flags, {true, false, 0}) {}
};

class VersymSection final : public Section {
public:
  VersymSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_GNU_versym, flags, {true, false, 0}) {}
};

class DynamicSection final : public Section {
public:
  DynamicSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_DYNAMIC, flags, {true, true, 0}) {}
};

class BuildAttributesSection final : public Section {
public:
  BuildAttributesSection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_ZEV_ATTRIBUTES, flags, {true, true, 0}) {}
};

class DebugOverlaySection final : public Section {
public:
  DebugOverlaySection(ObjectModule* objectModule, const char* name, uint32_t flags)
      : Section(objectModule, name, SHT_ZEV_DEBUGOVERLAY, flags, {true, true, 0}) {}
};

} // namespace elfext
