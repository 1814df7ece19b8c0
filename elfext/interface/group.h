// SPDX-License-Identifier: Apache-2.0
//
// A section group: sections that are kept or dropped together, under the name of a signature.
//
// In a file it is a section of type SHT_GROUP: a word of flags and the members' indexes, with the
// signature in a symbol that sh_link and sh_info name. The reader has made sure that no section is
// in two.
#pragma once

#include "elfext/interface/lazy_array.h"

#include <cstdint>

namespace elfext {

class GroupSection;
class ObjectModule;
class Section;

class Group {
public:
  /// Made by ObjectModule::createGroup.
  Group(ObjectModule* objectModule, const char* signature, const char* name, uint32_t flags)
      : m_ObjectModule(objectModule), m_Signature(signature), m_Name(name), m_Flags(flags) {}

  /// Never null.
  [[nodiscard]] const char* getSignature() const { return m_Signature; }
  /// The name of the group's section, which may be null.
  [[nodiscard]] const char* getName() const { return m_Name; }
  /// The first word of the group's section.
  [[nodiscard]] uint32_t getFlags() const { return m_Flags; }
  /// Whether linkers keep one group of each signature only.
  [[nodiscard]] bool isComdat() const;
  [[nodiscard]] uint32_t getIndex() const { return m_Index; }
  [[nodiscard]] ObjectModule* getObjectModule() const { return m_ObjectModule; }

  /// The section that the group was read from; null for a new group.
  [[nodiscard]] GroupSection* getGroupSection() const { return m_GroupSection; }

  [[nodiscard]] uint32_t getMemberCount() const { return m_Members.getSize(); }
  [[nodiscard]] Section* getMember(uint32_t index) const { return m_Members[index]; }
  /// A section of this module that is in no group yet.
  void addMember(Section* section);
  /// A member of this group.
  void removeMember(Section* section);

private:
  friend class ModuleBuilder;
  friend class ObjectModule;
  friend class Pruner;

  ObjectModule* m_ObjectModule;
  const char* m_Signature;
  const char* m_Name;
  GroupSection* m_GroupSection = nullptr;
  LazyArray<Section*> m_Members;
  uint32_t m_Flags;
  uint32_t m_Index = 0;
  bool m_Goes = false;
};

} // namespace elfext
