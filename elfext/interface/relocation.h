// SPDX-License-Identifier: Apache-2.0
//
// One entry of a relocation table. It points at its symbol, so that reordering symbol tables never
// disturbs it.
//
// r_offset, r_info and r_addend. Relocations that were read are rows until somebody asks for one;
// see Section.
#pragma once

#include <cstdint>

namespace elfext {

class RelocationSection;
class Section;
class Symbol;

class Relocation {
public:
  /// Made by Section::addRelocation. The target may be null, for symbol index 0; otherwise it is of
  /// the section's module. Only the low 16 bits of the type are kept.
  Relocation(Section* section, uint64_t offset, uint32_t type, Symbol* target);
  Relocation(Section* section, uint64_t offset, uint32_t type, Symbol* target, int64_t addend);

  /// r_offset.
  [[nodiscard]] uint64_t getOffset() const { return m_Offset; }
  void setOffset(uint64_t offset);
  [[nodiscard]] uint32_t getType() const { return m_Type; }
  void setType(uint32_t type);

  [[nodiscard]] bool hasAddend() const { return m_HasAddend; }
  /// There must be one.
  [[nodiscard]] int64_t getAddend() const;
  void setAddend(int64_t value);
  void clearAddend();

  /// Whether it belongs into a table that goes with the dynamic symbols.
  [[nodiscard]] bool isDynamic() const { return m_IsDynamic; }
  /// For a relocation without a target, from which nobody can tell.
  void setDynamic();

  /// The section that the relocation applies to.
  [[nodiscard]] Section* getSection() const { return m_Section; }
  /// The relocation section that it was read from; null if it was made since, or when that section
  /// is deleted.
  [[nodiscard]] const RelocationSection* getOrigin() const { return m_Origin; }
  [[nodiscard]] Symbol* getTarget() const { return m_Target; }
  /// Which table the relocation belongs to follows the target, if there is one.
  void setTarget(Symbol* target);

private:
  friend class Pruner;
  friend class Section;

  void markChanged();

  uint64_t m_Offset;
  int64_t m_Addend = 0;
  Section* m_Section;
  Symbol* m_Target = nullptr;
  const RelocationSection* m_Origin = nullptr;
  uint16_t m_Type;
  bool m_IsDynamic = false;
  bool m_HasAddend = false;
};

} // namespace elfext
