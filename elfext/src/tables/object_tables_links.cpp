// SPDX-License-Identifier: Apache-2.0
//
// What the section headers' link and info fields name. Bad links of relocation, group and index
// sections only cost the section; the others end the read.
//
// sh_link and sh_info are indexes that the file chose. Behind this step, hasLink says that an index
// may be followed and leads to a section of a type that its user may name: rows, strings and
// symbols are looked for there without another question. Sections are told in their order, those
// with a rule of their own type before all others.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/tables/object_tables.h"

namespace elfext {

namespace {

using LinkReport = Report<uint32_t, uint32_t, uint32_t>;

// The reports for a link that names no section, or one of another type than the two wanted.
struct LinkRule {
  // The handler's operations themselves: the row of a type says what is told, and one function
  // tells it.
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

// False ends the read; a section that is passed over is marked as broken.
bool checkLink(ObjectTables& tables, uint32_t index, const LinkRule& rule) {
  const uint32_t link = tables.sectionHeaders[index].link;
  if (link == 0 && rule.isZeroAllowed) return true;
  const bool isInRange = link < tables.getSectionCount();
  const uint32_t type = isInRange ? tables.typeOf(link) : 0;
  if (isInRange && (type == rule.wantedType || type == rule.otherWantedType)) {
    tables.links[index] = LinkState::Whole;
    return true;
  }
  const bool goesOn =
      isInRange ? goOn(tables.reporter, rule.ofWrongType, index, link, type)
                : goOn(tables.reporter, rule.outOfRange, index, link, tables.getLastSection());
  // Also where the handler lets it pass: hasLink then keeps everybody from following it.
  tables.links[index] = LinkState::Broken;
  return goesOn && rule.isSkippable;
}

bool checkRelocationLinks(ObjectTables& tables, uint32_t index) {
  if (!checkLink(tables, index, RelocationRule)) return false;
  const uint32_t target = tables.sectionHeaders[index].info;
  if (tables.isBroken(index) || target < tables.getSectionCount()) return true;
  tables.links[index] = LinkState::WithoutTarget;
  return goOn(tables.reporter, &ErrorHandler::relocationTargetOutOfRange, index, target,
              tables.getLastSection());
}

bool checkGroupLinks(ObjectTables& tables, uint32_t index) {
  if (!checkLink(tables, index, GroupRule)) return false;
  if (tables.isBroken(index)) return true;
  const SectionHeader& header = tables.sectionHeaders[index];
  const uint64_t rowCount = tables.rowCount(header.link);
  // A signature that there is not leaves the group without a name to be compared by, so nothing
  // goes on.
  return header.info < rowCount || stop(tables.reporter, &ErrorHandler::groupSignatureOutOfRange,
                                        index, header.info, header.link, rowCount);
}

bool checkIndexSectionLink(ObjectTables& tables, uint32_t index) {
  if (!checkLink(tables, index, ShndxRule)) return false;
  if (tables.isBroken(index)) return true;
  const uint32_t table = tables.sectionHeaders[index].link;
  // Two index sections for one table would say two things of each symbol.
  const auto [first, isFirst] = tables.indexSections.emplace(table, index);
  if (!isFirst)
    return stop(tables.reporter, &ErrorHandler::secondShndxSection, first->second, index, table);
  const uint64_t wordCount = tables.rowCount(index);
  const uint64_t rowCount = tables.rowCount(table);
  // One word for each row: from here on a row's word is known to be there.
  return wordCount == rowCount ||
         stop(tables.reporter, &ErrorHandler::shndxCountDiffers, index, wordCount, table, rowCount);
}

bool checkLinkByType(ObjectTables& tables, uint32_t index) {
  switch (tables.typeOf(index)) {
  case SHT_ZEV_PREEMPTMAP:
    return checkLink(tables, index, PreemptionMapRule);
  case SHT_DYNAMIC:
    return checkLink(tables, index, DynamicRule);
  case SHT_SYMTAB:
  case SHT_DYNSYM:
    return checkSymbolTableLink(tables, index);
  case SHT_REL:
  case SHT_RELA:
    return checkRelocationLinks(tables, index);
  case SHT_HASH:
    return checkLink(tables, index, HashRule);
  case SHT_GROUP:
    return checkGroupLinks(tables, index);
  case SHT_SYMTAB_SHNDX:
    return checkIndexSectionLink(tables, index);
  default:
    return true;
  }
}

bool checkPlainLink(ObjectTables& tables, uint32_t index) {
  const SectionHeader& header = tables.sectionHeaders[index];
  if (header.link == 0 || isLinkedByType(header.type)) return true;
  if (header.link < tables.getSectionCount()) {
    tables.links[index] = LinkState::Whole;
    return true;
  }
  return stop(tables.reporter, &ErrorHandler::sectionLinkOutOfRange, index, header.link,
              tables.getLastSection());
}

} // namespace

bool checkLinks(ObjectTables& tables) {
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (!checkLinkByType(tables, i)) return false;
  }
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (!checkPlainLink(tables, i)) return false;
  }
  return true;
}

bool checkSymbolTableLink(ObjectTables& tables, uint32_t index) {
  return checkLink(tables, index, SymbolTableRule);
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

} // namespace elfext
