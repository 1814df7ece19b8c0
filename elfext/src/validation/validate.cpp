// SPDX-License-Identifier: Apache-2.0
//
// The checks that go beyond reading, in the order of their reports; ObjectModule::validate is
// called by who is about to use a module as a whole, after a read or after edits. A problem that
// the handler wants to live with is mended where the report says so, so later checks see it mended.
//
// What is tried by files here is cost: relocations all at one offset, thousands of groups, symbols
// by the ten thousand. Each check walks once or sorts.
#include "elfext/src/validation/validate.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/fast_array.h"
#include "elfext/interface/group.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/relocation.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reports/go_on.h"
#include "elfext/src/validation/relocation_places.h"

#include <algorithm>
#include <tuple>
#include <unordered_map>
#include <vector>

namespace elfext {

namespace {

// What an index table needs: it is loaded, and laid out in the order of the code that sh_link
// names.
constexpr uint32_t IndexTableFlags = SHF_ALLOC | SHF_LINK_ORDER;
constexpr uint32_t CodeFlags = SHF_ALLOC | SHF_EXECINSTR;

// Jump slots are one table in the file, whose rows all have addends or all have none.
bool validateJumpSlots(ObjectModule& module) {
  uint64_t withAddend = 0;
  uint64_t withoutAddend = 0;
  for (Section* section : module.getSections()) {
    withAddend += section->getJumpSlotCountWithAddend();
    withoutAddend += section->getJumpSlotCountWithoutAddend();
  }
  return withAddend == 0 || withoutAddend == 0 || goOn(module, &ErrorHandler::mixedJumpSlotAddends);
}

bool isBlank(const Section& section) {
  return section.getName() == nullptr && section.getFlags() == 0 && section.getAddress() == 0 &&
         section.getSize() == 0 && section.getLink() == nullptr && section.getInfo() == 0;
}

void blank(Section& section) {
  // The null section is auxiliary, and closed to its users.
  ModuleBuilder::setAuxiliary(section, false);
  section.setName(nullptr);
  section.setFlags(0);
  section.setAddress(0);
  ModuleBuilder::adoptSize(section, 0);
  ModuleBuilder::adoptLink(section, nullptr);
  section.setInfo(0);
  ModuleBuilder::setAuxiliary(section, true);
}

bool validateNullSections(ObjectModule& module) {
  for (Section* section : module.getSections()) {
    if (section->getType() != SHT_NULL || isBlank(*section)) continue;
    if (!goOn(module, &ErrorHandler::nullSectionNotNull, section->getIndex())) return false;
    blank(*section);
  }
  return true;
}

bool validateFirstSection(ObjectModule& module) {
  if (module.getSectionCount() == 0) return true;
  const uint32_t type = module.getSection(0)->getType();
  if (type == SHT_NULL) return true;
  if (!goOn(module, &ErrorHandler::firstSectionNotNull, type)) return false;
  // Indexes count from it: sh_link 0 and st_shndx 0 mean none.
  module.setSectionIndex(module.createNullSection(nullptr, 0), 0);
  return true;
}

bool validateSymbolsOfAuxiliarySections(const ObjectModule& module) {
  // What the file itself had is not told as a fault of edits.
  if ((module.getReadConditions() & ReadCondition_HasSymbolInAuxiliarySection) != 0) return true;
  for (const Section* section : module.getSections()) {
    const bool hosts =
        section->getHostedSymbolCount() != 0 || section->getHostedDynamicSymbolCount() != 0;
    if (section->isAuxiliary() && hosts &&
        !goOn(module, &ErrorHandler::auxiliarySectionHostsSymbol, section->getIndex()))
      return false;
  }
  return true;
}

bool validateRelocationsOfAuxiliarySections(const ObjectModule& module) {
  if ((module.getReadConditions() & ReadCondition_HasRelocationInAuxiliarySection) != 0)
    return true;
  for (const Section* section : module.getSections()) {
    if (section->isAuxiliary() && section->getRelocationCount() != 0 &&
        !goOn(module, &ErrorHandler::auxiliarySectionRelocated, section->getIndex()))
      return false;
  }
  return true;
}

struct PlacedRelocation {
  uint64_t offset;
  uint32_t index; // in the list of its section
  bool isDynamic;
};

// For each relocation of the section, whether an earlier one of its kind has its offset. By
// sorting: no choice of offsets makes that slow.
std::vector<bool> findRepeats(Section& section, alloclib::RegionGeneral& region) {
  const uint32_t count = section.getRelocationCount();
  FastArray<PlacedRelocation> placed(&region);
  placed.reserve(count);
  for (uint32_t i = 0; i < count; ++i) {
    const Relocation* relocation = section.getRelocation(i);
    placed.append({relocation->getOffset(), i, relocation->isDynamic()});
  }
  placed.sort([](const PlacedRelocation& left, const PlacedRelocation& right) {
    return std::tie(left.isDynamic, left.offset, left.index) <
           std::tie(right.isDynamic, right.offset, right.index);
  });
  std::vector<bool> repeats(count);
  for (uint32_t i = 1; i < count; ++i)
    repeats[placed[i].index] =
        placed[i].isDynamic == placed[i - 1].isDynamic && placed[i].offset == placed[i - 1].offset;
  return repeats;
}

bool validateRelocationOffsets(Section& section, alloclib::RegionGeneral& region) {
  const std::vector<bool> repeats = findRepeats(section, region);
  for (uint32_t i = 0; i < repeats.size(); ++i) {
    if (!repeats[i]) continue;
    const Relocation* relocation = section.getRelocation(i);
    // In the order of the list, though they were found in that of the offsets.
    const auto report = relocation->isDynamic() ? &ErrorHandler::repeatedDynamicRelocation
                                                : &ErrorHandler::repeatedStaticRelocation;
    if (!goOn(*section.getObjectModule(), report, relocation->getOffset(), section.getIndex()))
      return false;
  }
  return true;
}

bool validateRepeatedRelocations(const ObjectModule& module, alloclib::RegionGeneral& region) {
  if ((module.getReadConditions() & ReadCondition_ChecksRepeatedRelocations) == 0) return true;
  for (Section* section : module.getSections()) {
    if (!validateRelocationOffsets(*section, region)) return false;
  }
  return true;
}

bool validateIndexTable(const ObjectModule& module, const Section& section) {
  const uint32_t missing = IndexTableFlags & ~section.getFlags();
  if (missing != 0 &&
      !goOn(module, &ErrorHandler::indexTableFlagsMissing, section.getIndex(), missing))
    return false;
  const Section* link = section.getLink();
  const bool isSuitable = link != nullptr && link->getType() == SHT_PROGBITS &&
                          (link->getFlags() & CodeFlags) == CodeFlags;
  return isSuitable || goOn(module, &ErrorHandler::indexTableLinkUnsuitable, section.getIndex());
}

bool validateIndexTables(const ObjectModule& module) {
  for (const Section* section : module.getSections()) {
    if (section->getType() == SHT_ZEV_EXIDX && !validateIndexTable(module, *section)) return false;
  }
  return true;
}

bool validateGroupFlag(const ObjectModule& module, Section& section) {
  const bool hasFlag = (section.getFlags() & SHF_GROUP) != 0;
  const Group* group = section.getGroup();
  if (hasFlag == (group != nullptr)) return true;
  if (hasFlag) {
    if (!goOn(module, &ErrorHandler::groupFlagWithoutGroup, section.getIndex())) return false;
    // Membership is the truth, and the flag follows it.
    section.setFlags(section.getFlags() & ~SHF_GROUP);
    return true;
  }
  const GroupSection* groupSection = group->getGroupSection();
  const uint32_t groupIndex = groupSection == nullptr ? 0 : groupSection->getIndex();
  if (!goOn(module, &ErrorHandler::memberWithoutGroupFlag, section.getIndex(), groupIndex))
    return false;
  section.addFlags(SHF_GROUP);
  return true;
}

bool validateGroupFlags(const ObjectModule& module) {
  for (Section* section : module.getSections()) {
    if (!validateGroupFlag(module, *section)) return false;
  }
  return true;
}

// A group may be dropped as a whole, and with it the local symbols that only it can refer to.
bool leavesGroup(const Relocation& relocation) {
  const Symbol* symbol = relocation.getTarget();
  // Global symbols may be found in another object's copy of the group.
  if (symbol == nullptr || symbol->isDynamic() || symbol->getBinding() != STB_LOCAL) return false;
  if (symbol->getCategory() != Symbol::Category_Hosted) return false;
  const Group* group = symbol->getHostedSymbolSection()->getGroup();
  return group != nullptr && group != relocation.getSection()->getGroup();
}

// Relocations in no section are told with section 0.
bool validateGroupsOfRelocations(const ObjectModule& module, Section& target) {
  const std::vector<RelocationPlace> places = findRelocationPlaces(target);
  for (uint32_t i = 0; i < places.size(); ++i) {
    const Relocation& relocation = *target.getRelocation(i);
    if (!leavesGroup(relocation)) continue;
    const RelocationSection* section = places[i].section;
    if (!goOn(module, &ErrorHandler::relocationLeavesGroup, places[i].row,
              section == nullptr ? 0 : section->getIndex(),
              relocation.getTarget()->getHostedSymbolSection()->getIndex(), target.getIndex()))
      return false;
  }
  return true;
}

bool validateGroupsOfRelocations(const ObjectModule& module) {
  for (Section* section : module.getSections()) {
    if (!validateGroupsOfRelocations(module, *section)) return false;
  }
  return true;
}

using RowCounts = std::unordered_map<const RelocationSection*, uint32_t>;

RowCounts countRowsThatAreNotAllowed(const ObjectModule& module) {
  RowCounts counts;
  for (Section* section : module.getSections()) {
    if (section->isRelocatable()) continue;
    for (const RelocationPlace& place : findRelocationPlaces(*section))
      ++counts[place.section];
  }
  return counts;
}

bool validateRelocationTargets(const ObjectModule& module) {
  RowCounts rowCounts = countRowsThatAreNotAllowed(module);
  for (const Section* section : module.getSections()) {
    const RelocationSection* relocations = section->asRelocationSection();
    const Section* target = relocations == nullptr ? nullptr : relocations->getTarget();
    if (target == nullptr || target->isRelocatable()) continue;
    // Row 0 of a section without rows stands for the section.
    const uint32_t rowCount = std::max(rowCounts[relocations], 1U);

    for (uint32_t row = 0; row < rowCount; ++row) {
      if (!goOn(module, &ErrorHandler::relocationNotAllowed, row, section->getIndex(),
                target->getIndex()))
        return false;
    }
  }
  return true;
}

bool validateSectionSymbol(const ObjectModule& module, const Symbol& symbol) {
  const auto tables = symbol.isDynamic() ? module.getDynsymSections() : module.getSymtabSections();
  const uint32_t table = tables.empty() ? 0 : tables.front()->getIndex();
  if (symbol.getCategory() != Symbol::Category_Hosted)
    return goOn(module, &ErrorHandler::sectionSymbolNotHosted,
                {symbol.getIndex(), table, symbol.isDynamic()});
  const Section& section = *symbol.getHostedSymbolSection();
  const uint64_t size = symbol.getSize();
  // Before linking, a section symbol is the section; afterwards the section may have grown round
  // it.
  if (module.getFileType() == ET_REL) {
    return size == 0 || size == section.getSize() ||
           goOn(module, &ErrorHandler::sectionSymbolSizeDiffers, symbol.getIndex(),
                section.getIndex(), size, section.getSize());
  }
  return size <= section.getSize() ||
         goOn(module, &ErrorHandler::sectionSymbolTooLarge, symbol.getIndex(), section.getIndex(),
              size, section.getSize());
}

bool validateSectionSymbols(const ObjectModule& module, std::span<Symbol* const> symbols) {
  for (const Symbol* symbol : symbols) {
    if (symbol->getType() == STT_SECTION && !validateSectionSymbol(module, *symbol)) return false;
  }
  return true;
}

bool validateLocalSymbols(const ObjectModule& module, std::span<Symbol* const> symbols) {
  for (const Symbol* symbol : symbols) {
    const bool isUndefinedLocal =
        symbol->getBinding() == STB_LOCAL && symbol->getCategory() == Symbol::Category_Undefined;
    if (isUndefinedLocal &&
        !goOn(module, &ErrorHandler::localSymbolUndefined, symbol->getIndex(), symbol->isDynamic()))
      return false;
  }
  return true;
}

} // namespace

bool ObjectModule::validate() {
  // The arrays of the checks go with it, and not with the module.
  const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(0x100000, "Validate region"));
  // Each check counts on those before it having mended or refused; the first "no" ends all.
  return validateJumpSlots(*this) && validateNullSections(*this) && validateFirstSection(*this) &&
         validateSymbolsOfAuxiliarySections(*this) &&
         validateRelocationsOfAuxiliarySections(*this) &&
         validateRepeatedRelocations(*this, *region) && validatePlacement(*this) &&
         validateIndexTables(*this) && validateGroupFlags(*this) &&
         validateGroupsOfRelocations(*this) && validateRelocationTargets(*this) &&
         validateSectionSymbols(*this, getSymbols()) &&
         validateSectionSymbols(*this, getDynamicSymbols()) &&
         validateLocalSymbols(*this, getSymbols()) &&
         validateLocalSymbols(*this, getDynamicSymbols());
}

} // namespace elfext
