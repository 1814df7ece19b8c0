// SPDX-License-Identifier: Apache-2.0
//
// A hosted symbol is in a list of its section, any other in a list of its module: wherever the
// category changes, the symbol leaves one list and joins the other.
//
// The fields are st_name, st_info (type and binding), st_other (visibility) and st_size; st_shndx
// and st_value have become a category with a section and one word. Ten thousands of symbols are
// made for an object, so a symbol is small and has nothing to destroy.
#include "elfext/interface/symbol.h"

#include "alloclib/interface/region_objects.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/symbol_version_definition.h"
#include "elfext/interface/symbol_version_requirement.h"
#include "elfext/src/bytes/symbol_names.h"

#include <cstring>
#include <type_traits>

namespace elfext {

static_assert(std::is_trivially_destructible_v<Symbol>, "it dies with its region");

Symbol::Class Symbol::getClass() const {
  if (isMappingSymbolName(m_Name)) return Class_Mapping;
  return isTagSymbolName(m_Name) ? Class_Tag : Class_Ordinary;
}

uint64_t Symbol::getAddress() const {
  if (m_Category == Category_Hosted) return m_Section->getAddress() + m_Word;
  return m_Category == Category_Absolute ? m_Word : 0;
}

uint64_t Symbol::getAbiValue() const {
  if (m_Category == Category_Undefined) return 0;
  // The lowest bit of a function's address says which instruction set it is in, and is no part of
  // the place.
  const uint64_t word = m_Type == STT_FUNC ? m_Word & ~uint64_t{1} : m_Word;
  if (m_Category != Category_Hosted || !m_ObjectModule->hasLaidOutAddresses()) return word;
  return m_Section->getAddress() + word;
}

bool Symbol::isBuildAttributesSymbol() const {
  if (startsAsBuildAttributes()) return true;
  return m_Category == Category_Absolute && m_Name != nullptr &&
         std::strstr(m_Name, DecorationMarker.data()) != nullptr;
}

bool Symbol::startsAsBuildAttributes() const {
  if (m_Category != Category_Hosted && m_Category != Category_Absolute) return false;
  return m_Name != nullptr &&
         std::strncmp(m_Name, DecorationPrefix.data(), DecorationPrefix.size()) == 0;
}

void Symbol::markChanged() {
  m_ObjectModule->markSymbolsChanged();
  if (m_Category == Category_Hosted) m_Section->markHostedChanged();
}

void Symbol::setName(const char* name) {
  if (name == m_Name) return;
  if (name != nullptr && m_Name != nullptr && std::strcmp(name, m_Name) == 0) return;
  m_Name = m_ObjectModule->copyText(name);
  markChanged();
}

void Symbol::setSize(uint64_t size) {
  m_Size = size;
  m_ObjectModule->markChanged();
}

void Symbol::setType(uint32_t type) {
  m_Type = static_cast<uint8_t>(type & 0xF);
  m_ObjectModule->markChanged();
}

void Symbol::setBinding(uint32_t binding) {
  m_Binding = static_cast<uint8_t>(binding & 0xF);
  m_ObjectModule->markChanged();
}

void Symbol::setVisibility(uint32_t visibility) {
  m_Visibility = static_cast<uint8_t>(visibility & 0x3);
  m_ObjectModule->markChanged();
}

void Symbol::leaveList() {
  if (m_Category != Category_Hosted)
    return m_ObjectModule->getCategoryList(m_Category, m_IsDynamic).removeValue(this);
  m_Section->getHostedList(m_IsDynamic).removeValue(this);
  m_Section->markHostedChanged();
}

void Symbol::joinList() {
  if (m_Category != Category_Hosted)
    return m_ObjectModule->getCategoryList(m_Category, m_IsDynamic).append(this);
  m_Section->getHostedList(m_IsDynamic).append(m_ObjectModule->getContainerRegion(), this);
}

void Symbol::place(Category category, Section* section, uint64_t word) {
  QUARN_ASSERT(1, !m_ObjectModule->indexesAreFrozen());
  // Leaving searches a list: only where it must.
  if (category != m_Category || section != m_Section) {
    leaveList();
    m_Category = category;
    m_Section = section;
    // A definition's version is nothing that a reference has, and the other way round.
    if (m_IsDynamic && category == Category_Undefined) m_VersionDefinition = nullptr;
    if (m_IsDynamic && category != Category_Undefined) m_VersionRequirement = nullptr;
    joinList();
  }
  m_Word = word;
  markChanged();
}

// What remains of an undefined symbol's value is no definition.
void Symbol::makeUndefined() {
  place(Category_Undefined, nullptr, 0);
}

void Symbol::makeAbsolute(uint64_t value) {
  place(Category_Absolute, nullptr, value);
}

void Symbol::makeCommon(uint64_t alignment) {
  place(Category_Common, nullptr, alignment);
}

void Symbol::makeHosted(Section* section, uint64_t offset) {
  QUARN_ASSERT(1, section != NULL);
  QUARN_ASSERT(1, section->m_ObjectModule == m_ObjectModule);
  place(Category_Hosted, section, offset);
}

void Symbol::setVersionDefinition(const FileVersionDefinition* version, bool hidden) {
  QUARN_ASSERT(1, m_IsDynamic);
  QUARN_ASSERT(1, getCategory() != Category_Undefined);
  m_VersionDefinition = alloclib::create<SymbolVersionDefinition>(
      m_ObjectModule->getObjectRegion(), SymbolVersionDefinition{version, hidden});
  m_ObjectModule->markChanged();
}

void Symbol::setVersionRequirement(uint32_t version, const char* versionName, const char* fileName,
                                   bool hidden) {
  QUARN_ASSERT(1, m_IsDynamic);
  const SymbolVersionRequirement requirement = {version, m_ObjectModule->keepText(versionName),
                                                m_ObjectModule->keepText(fileName), hidden};
  m_VersionRequirement =
      alloclib::create<SymbolVersionRequirement>(m_ObjectModule->getObjectRegion(), requirement);
  m_ObjectModule->markChanged();
}

void Symbol::clearVersionDefinition() {
  QUARN_ASSERT(1, m_IsDynamic);
  m_VersionDefinition = nullptr;
  m_ObjectModule->markChanged();
}

void Symbol::clearVersionRequirement() {
  QUARN_ASSERT(1, m_IsDynamic);
  m_VersionRequirement = nullptr;
  m_ObjectModule->markChanged();
}

void Symbol::setAssociatedSymbol(Symbol* symbol) {
  QUARN_ASSERT(1, symbol == NULL || symbol->getObjectModule() == m_ObjectModule);
  m_AssociatedSymbol = symbol;
}

void Symbol::getInheritedBuildAttributes(BuildAttributes& result) const {
  if (m_Category == Category_Hosted)
    m_Section->getEffectiveBuildAttributes(result);
  else
    m_ObjectModule->getEffectiveBuildAttributes(result);
}

} // namespace elfext
