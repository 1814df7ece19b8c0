// SPDX-License-Identifier: Apache-2.0
//
// What the section headers' link and info fields name. Bad links of relocation, group and index
// sections only cost the section; the others end the read.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/src/object_module_reader.h"

namespace elfext {

namespace {

using LinkReport = Report<uint32_t, uint32_t, uint32_t>;

// The reports for a link that names no section, or one of another type than the two wanted.
struct LinkRule {
  LinkReport outOfRange;
  LinkReport ofWrongType;
  uint32_t wantedType;
  uint32_t otherWantedType;
  bool isZeroAllowed;
  // Whether the section is only passed over if the handler wants to go on.
  bool isSkippable;
};

// clang-format off
constexpr LinkRule PreemptionMapRule = {&ErrorHandler::preemptionMapLinkOutOfRange, &ErrorHandler::preemptionMapLinkOfWrongType, SHT_STRTAB, SHT_STRTAB, true,  false};
constexpr LinkRule DynamicRule       = {&ErrorHandler::dynamicLinkOutOfRange,       &ErrorHandler::dynamicLinkOfWrongType,       SHT_STRTAB, SHT_STRTAB, true,  false};
constexpr LinkRule SymbolTableRule   = {&ErrorHandler::symbolTableLinkOutOfRange,   &ErrorHandler::symbolTableLinkOfWrongType,   SHT_STRTAB, SHT_STRTAB, false, false};
constexpr LinkRule RelocationRule    = {&ErrorHandler::relocationLinkOutOfRange,    &ErrorHandler::relocationLinkOfWrongType,    SHT_SYMTAB, SHT_DYNSYM, false, true};
constexpr LinkRule HashRule          = {&ErrorHandler::hashLinkOutOfRange,          &ErrorHandler::hashLinkOfWrongType,          SHT_DYNSYM, SHT_DYNSYM, false, false};
constexpr LinkRule GroupRule         = {&ErrorHandler::groupLinkOutOfRange,         &ErrorHandler::groupLinkOfWrongType,         SHT_SYMTAB, SHT_SYMTAB, false, true};
constexpr LinkRule ShndxRule         = {&ErrorHandler::shndxLinkOutOfRange,         &ErrorHandler::shndxLinkOfWrongType,         SHT_SYMTAB, SHT_DYNSYM, false, true};
// clang-format on

// Makes the link. False ends the read; a section that is passed over is marked as broken.
bool resolveLink(ReadContext& context, uint32_t index, const LinkRule& rule) {
  const uint32_t link = context.sectionHeaders[index].link;
  if (link == 0 && rule.isZeroAllowed) return true;
  const bool isInRange = link < context.sectionCount();
  const uint32_t type = isInRange ? context.typeOf(link) : 0;
  if (isInRange && (type == rule.wantedType || type == rule.otherWantedType)) {
    context.module.getSection(index)->adoptLink(context.module.getSection(link));
    return true;
  }
  const bool goesOn =
      isInRange ? goOn(context.module, rule.ofWrongType, index, link, type)
                : goOn(context.module, rule.outOfRange, index, link, context.lastSection());
  context.isBroken[index] = true;
  return goesOn && rule.isSkippable;
}

bool linkSymbolTable(ReadContext& context, uint32_t index) {
  if (!resolveLink(context, index, SymbolTableRule)) return false;
  const Section* section = context.module.getSection(index);
  auto* strings = static_cast<StringTableSection*>(section->getLink());
  if (section->getType() == SHT_SYMTAB)
    strings->markLinkedBySymtab();
  else
    strings->markLinkedByDynsym();
  return true;
}

bool linkStringUser(ReadContext& context, uint32_t index, const LinkRule& rule) {
  if (!resolveLink(context, index, rule)) return false;
  Section* strings = context.module.getSection(index)->getLink();
  if (strings != nullptr) static_cast<StringTableSection*>(strings)->markLinkedByOther();
  return true;
}

bool linkRelocations(ReadContext& context, uint32_t index) {
  if (!resolveLink(context, index, RelocationRule)) return false;
  if (context.isBroken[index]) return true;
  const uint32_t target = context.sectionHeaders[index].info;
  if (target >= context.sectionCount()) {
    context.isBroken[index] = true;
    return goOn(context.module, &ErrorHandler::relocationTargetOutOfRange, index, target,
                context.lastSection());
  }
  auto* section = static_cast<RelocationSection*>(context.module.getSection(index));
  const bool isDynamic = section->getLink()->getType() == SHT_DYNSYM;
  section->setTarget(context.module.getSection(target), isDynamic);
  return true;
}

bool linkHash(ReadContext& context, uint32_t index) {
  if (!resolveLink(context, index, HashRule)) return false;
  auto* section = static_cast<HashSection*>(context.module.getSection(index));
  static_cast<SymbolTableSection*>(section->getLink())->setHashSection(section);
  return true;
}

bool linkGroup(ReadContext& context, uint32_t index) {
  if (!resolveLink(context, index, GroupRule)) return false;
  if (context.isBroken[index]) return true;
  const SectionHeader& header = context.sectionHeaders[index];
  const uint64_t rowCount = context.rowCount(header.link);
  if (header.info >= rowCount)
    return stop(context.module, &ErrorHandler::groupSignatureOutOfRange, index, header.info,
                header.link, rowCount);
  static_cast<GroupSection*>(context.module.getSection(index))
      ->setSignatureSymbolIndex(header.info);
  return true;
}

bool linkShndx(ReadContext& context, uint32_t index) {
  if (!resolveLink(context, index, ShndxRule)) return false;
  if (context.isBroken[index]) return true;
  const uint32_t table = context.sectionHeaders[index].link;
  auto* section = static_cast<ShndxSection*>(context.module.getSection(index));
  auto* symbols = static_cast<SymbolTableSection*>(section->getLink());
  if (symbols->getShndxSection() != nullptr)
    return stop(context.module, &ErrorHandler::secondShndxSection,
                symbols->getShndxSection()->getIndex(), index, table);
  const uint64_t wordCount = context.rowCount(index);
  const uint64_t rowCount = context.rowCount(table);
  if (wordCount != rowCount)
    return stop(context.module, &ErrorHandler::shndxCountDiffers, index, wordCount, table,
                rowCount);
  symbols->setShndxSection(section);
  return true;
}

bool linkByType(ReadContext& context, uint32_t index) {
  switch (context.typeOf(index)) {
  case SHT_ZEV_PREEMPTMAP:
    return linkStringUser(context, index, PreemptionMapRule);
  case SHT_DYNAMIC:
    return linkStringUser(context, index, DynamicRule);
  case SHT_SYMTAB:
  case SHT_DYNSYM:
    return linkSymbolTable(context, index);
  case SHT_REL:
  case SHT_RELA:
    return linkRelocations(context, index);
  case SHT_HASH:
    return linkHash(context, index);
  case SHT_GROUP:
    return linkGroup(context, index);
  case SHT_SYMTAB_SHNDX:
    return linkShndx(context, index);
  default:
    return true;
  }
}

bool isLinkedByType(uint32_t type) {
  switch (type) {
  case SHT_ZEV_PREEMPTMAP:
  case SHT_DYNAMIC:
  case SHT_SYMTAB:
  case SHT_DYNSYM:
  case SHT_REL:
  case SHT_RELA:
  case SHT_HASH:
  case SHT_GROUP:
  case SHT_SYMTAB_SHNDX:
    return true;
  default:
    return false;
  }
}

bool linkPlainly(ReadContext& context, uint32_t index) {
  const SectionHeader& header = context.sectionHeaders[index];
  if (header.link == 0 || isLinkedByType(header.type)) return true;
  if (header.link >= context.sectionCount())
    return stop(context.module, &ErrorHandler::sectionLinkOutOfRange, index, header.link,
                context.lastSection());
  Section* link = context.module.getSection(header.link);
  context.module.getSection(index)->adoptLink(link);
  if (link->getType() == SHT_STRTAB) static_cast<StringTableSection*>(link)->markLinkedByOther();
  return true;
}

} // namespace

bool readLinks(ReadContext& context) {
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (!linkByType(context, i)) return false;
  }
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (!linkPlainly(context, i)) return false;
  }
  return true;
}

} // namespace elfext
