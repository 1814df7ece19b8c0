// SPDX-License-Identifier: Apache-2.0
//
// One relocation: r_offset, type and addend, and its target as a symbol. It belongs to the section
// that it changes, whose views it marks. The type is kept in 16 bits, which class 2 rows may
// exceed: the rest of r_info's low word says nothing here.
#include "elfext/interface/relocation.h"

#include "checking/interface/checking.h"
#include "elfext/interface/object_module.h"

#include <type_traits>

namespace elfext {

static_assert(std::is_trivially_destructible_v<Relocation>, "it dies with its region");

Relocation::Relocation(Section* section, uint64_t offset, uint32_t type, Symbol* target)
    : m_Offset(offset), m_Section(section), m_Target(target),
      m_Type(static_cast<uint16_t>(type & 0xFFFF)) {
  QUARN_ASSERT(1, section != NULL);
  QUARN_ASSERT(1, (target == NULL) || (section->m_ObjectModule == target->m_ObjectModule));
  // A relocation of no symbol is static until its table says otherwise.
  m_IsDynamic = target != nullptr && target->isDynamic();
}

Relocation::Relocation(Section* section, uint64_t offset, uint32_t type, Symbol* target,
                       int64_t addend)
    : Relocation(section, offset, type, target) {
  m_Addend = addend;
  m_HasAddend = true;
}

void Relocation::markChanged() {
  m_Section->m_ObjectModule->markChanged();
}

void Relocation::setOffset(uint64_t offset) {
  m_Offset = offset;
  m_Section->m_AreRelocationsSorted = false;
  markChanged();
}

void Relocation::setType(uint32_t type) {
  m_Type = static_cast<uint16_t>(type & 0xFFFF);
  markChanged();
}

int64_t Relocation::getAddend() const {
  QUARN_ASSERT(1, m_HasAddend);
  return m_Addend;
}

void Relocation::setAddend(int64_t value) {
  m_Addend = value;
  m_HasAddend = true;
  markChanged();
}

void Relocation::clearAddend() {
  m_HasAddend = false;
  markChanged();
}

void Relocation::setDynamic() {
  QUARN_ASSERT(1, m_Target == NULL);
  m_IsDynamic = true;
  markChanged();
}

void Relocation::setTarget(Symbol* target) {
  QUARN_ASSERT(1, (target == NULL) || (m_Section->m_ObjectModule == target->m_ObjectModule));
  m_Target = target;
  if (target != nullptr) m_IsDynamic = target->isDynamic();
  markChanged();
}

} // namespace elfext
