// SPDX-License-Identifier: Apache-2.0
//
// A group and its members know each other, and a section is in no more than one group. The reader
// has made sure of that for files; everybody else who adds a section twice is at fault.
#include "elfext/interface/group.h"

#include "checking/interface/checking.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"

#include <cstddef>

namespace elfext {

bool Group::isComdat() const {
  return (m_Flags & GRP_COMDAT) != 0;
}

void Group::addMember(Section* section) {
  QUARN_ASSERT(1, section != NULL);
  QUARN_ASSERT(1, section->getObjectModule() == m_ObjectModule);
  QUARN_ASSERT(1, section->m_Group == NULL);
  m_Members.append(m_ObjectModule->getContainerRegion(), section);
  section->m_Group = this;
  m_ObjectModule->markChanged();
}

void Group::removeMember(Section* section) {
  QUARN_ASSERT(1, section != NULL);
  QUARN_ASSERT(1, section->m_Group == this);
  m_Members.removeValue(section);
  section->m_Group = nullptr;
  m_ObjectModule->markChanged();
}

} // namespace elfext
