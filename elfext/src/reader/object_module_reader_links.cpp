// SPDX-License-Identifier: Apache-2.0
//
// From checked link and info fields to sections that know one another.
//
// hasLink has the answer of the checks: where it says yes, sh_link names a section of a type that
// its user may name, so that the casts below are right. Sections with a rule of their own come
// first, as in the checks.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

namespace {

void markLinked(StringTableSection& strings, uint32_t userType) {
  if (userType == SHT_SYMTAB)
    ModuleBuilder::markLinkedBySymtab(strings);
  else if (userType == SHT_DYNSYM)
    ModuleBuilder::markLinkedByDynsym(strings);
  else
    ModuleBuilder::markLinkedByOther(strings);
}

void linkRelocations(ReadContext& context, RelocationSection& section, const Section& symbols) {
  const uint32_t index = section.getIndex();
  // The handler let a bad sh_info pass: the section keeps its link and relocates nothing.
  if (context.links[index] == LinkState::WithoutTarget) return;
  ModuleBuilder::setTarget(section, context.module.getSection(context.sectionHeaders[index].info),
                           symbols.getType() == SHT_DYNSYM);
}

// What a section that is linked by its type's own rule is to the section that it names.
void linkByType(ReadContext& context, Section& section, Section& link) {
  switch (section.getType()) {
  case SHT_REL:
  case SHT_RELA:
    return linkRelocations(context, static_cast<RelocationSection&>(section), link);
  case SHT_HASH:
    return ModuleBuilder::setHashSection(static_cast<SymbolTableSection&>(link),
                                         static_cast<HashSection*>(&section));
  case SHT_GROUP:
    return ModuleBuilder::setSignatureSymbolIndex(static_cast<GroupSection&>(section),
                                                  context.sectionHeaders[section.getIndex()].info);
  case SHT_SYMTAB_SHNDX:
    return ModuleBuilder::setShndxSection(static_cast<SymbolTableSection&>(link),
                                          static_cast<ShndxSection*>(&section));
  default:
    return markLinked(static_cast<StringTableSection&>(link), section.getType());
  }
}

} // namespace

void linkSections(ReadContext& context) {
  for (const bool isByType : {true, false}) {
    for (uint32_t i = 0; i < context.getSectionCount(); ++i) {
      if (!context.hasLink(i) || isLinkedByType(context.typeOf(i)) != isByType) continue;
      Section& section = *context.module.getSection(i);
      Section& link = *context.module.getSection(context.sectionHeaders[i].link);
      ModuleBuilder::adoptLink(section, &link);
      if (isByType)
        linkByType(context, section, link);
      else if (link.getType() == SHT_STRTAB)
        markLinked(static_cast<StringTableSection&>(link), section.getType());
    }
  }
}

} // namespace elfext
