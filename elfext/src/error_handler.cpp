// SPDX-License-Identifier: Apache-2.0
//
// The texts of all reports. They reach users letter for letter, and other tools look for them, so
// each stands here whole where it can, with its numbers put between the words. Whatever a file says
// of itself comes in as a number; the object's name is only ever a piece of a text and never a
// format.
#include "elfext/interface/error_handler.h"

#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"

#include <cstring>
#include <string_view>
#include <type_traits>

namespace elfext {

namespace {

constexpr std::string_view AlignmentConflict =
    " have alignment constraints which cannot both be satisfied given their relative offset";

template <class Piece>
void append(std::string& whole, const Piece& piece) {
  if constexpr (std::is_integral_v<Piece>)
    whole += std::to_string(piece);
  else
    whole += piece;
}

template <class... Pieces>
std::string text(const Pieces&... pieces) {
  std::string whole;
  (append(whole, pieces), ...);
  return whole;
}

// "2 (SHT_SYMTAB)", or the number alone for a type without a name.
std::string namedType(uint32_t type) {
  const char* name = sectionTypeName(type);
  return name == nullptr ? text(type) : text(type, " (", name, ")");
}

std::string outOfRange(std::string_view who, uint32_t section, std::string_view what,
                       uint32_t named, uint32_t lastSection) {
  return text(who, " #", section, " refers to ", what, " #", named, " but the last section is #",
              lastSection);
}

std::string ofWrongType(std::string_view who, uint32_t section, std::string_view what,
                        uint32_t link, uint32_t type, std::string_view wanted) {
  return text(who, " #", section, " refers to ", what, " #", link, " but that section has type #",
              namedType(type), " instead of ", wanted);
}

std::string symbolIn(const SymbolPlace& place) {
  return text("Symbol #", place.symbol, " in ", place.isDynamic ? "dynamic " : "",
              "symbol table section #", place.tableSection);
}

std::string ioError(std::string_view what, const ObjectModule& module, int errorNumber) {
  std::string whole = text("I/O error ", what, " file");
  if (module.getObjectName() != nullptr) whole += text(" '", module.getObjectName(), "'");
  if (errorNumber != 0) whole += text(": ", support::hostErrorText(errorNumber));
  return whole;
}

} // namespace

bool ErrorHandler::outOfMemory(const ObjectModule& module) {
  return report(module, 0, text("Out of memory"));
}

bool ErrorHandler::ioErrorReading(const ObjectModule& module, int errorNumber) {
  return report(module, 0, ioError("reading", module, errorNumber));
}

bool ErrorHandler::ioErrorWriting(const ObjectModule& module, int errorNumber) {
  return report(module, 0, ioError("writing", module, errorNumber));
}

bool ErrorHandler::emptySectionHeaderTable(const ObjectModule& module) {
  return report(module, 0, text("Section header table is empty"));
}

bool ErrorHandler::sectionNameTableOutOfRange(const ObjectModule& module, uint32_t index,
                                              uint32_t lastSection) {
  return report(module, index,
                text("ELF header refers to section-name string table section #", index,
                     " but the last section is #", lastSection));
}

bool ErrorHandler::symbolTableLinkOutOfRange(const ObjectModule& module, uint32_t section,
                                             uint32_t link, uint32_t lastSection) {
  return report(
      module, section,
      outOfRange("Symbol table section", section, "string table section", link, lastSection));
}

bool ErrorHandler::relocationLinkOutOfRange(const ObjectModule& module, uint32_t section,
                                            uint32_t link, uint32_t lastSection) {
  return report(
      module, section,
      outOfRange("Relocation section", section, "symbol table section", link, lastSection));
}

bool ErrorHandler::groupLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                       uint32_t lastSection) {
  return report(module, section,
                outOfRange("Group section", section, "symbol table section", link, lastSection));
}

bool ErrorHandler::groupMemberOutOfRange(const ObjectModule& module, uint32_t section,
                                         uint32_t member, uint32_t lastSection) {
  return report(module, section,
                outOfRange("Group section", section, "member section", member, lastSection));
}

bool ErrorHandler::relocationTargetOutOfRange(const ObjectModule& module, uint32_t section,
                                              uint32_t target, uint32_t lastSection) {
  return report(module, section,
                outOfRange("Relocation section", section, "target section", target, lastSection));
}

bool ErrorHandler::shndxLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                       uint32_t lastSection) {
  return report(
      module, section,
      outOfRange("SHT_SYMTAB_SHNDX section", section, "symbol table section", link, lastSection));
}

bool ErrorHandler::hashLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                      uint32_t lastSection) {
  return report(module, section,
                outOfRange("Hash section", section, "symbol table section", link, lastSection));
}

bool ErrorHandler::preemptionMapLinkOutOfRange(const ObjectModule& module, uint32_t section,
                                               uint32_t link, uint32_t lastSection) {
  return report(
      module, section,
      outOfRange("Preemption map section", section, "string table section", link, lastSection));
}

bool ErrorHandler::dynamicLinkOutOfRange(const ObjectModule& module, uint32_t section,
                                         uint32_t link, uint32_t lastSection) {
  return report(module, section,
                outOfRange("Dynamic section", section, "string table section", link, lastSection));
}

bool ErrorHandler::sectionLinkOutOfRange(const ObjectModule& module, uint32_t section,
                                         uint32_t link, uint32_t lastSection) {
  return report(module, section,
                outOfRange("Link field of section", section, "target section", link, lastSection));
}

bool ErrorHandler::sectionNameTableOfWrongType(const ObjectModule& module, uint32_t index,
                                               uint32_t type) {
  return report(module, index,
                text("ELF header refers to section-name string table section #", index,
                     " but that section has type #", namedType(type), " instead of SHT_STRTAB"));
}

bool ErrorHandler::symbolTableLinkOfWrongType(const ObjectModule& module, uint32_t section,
                                              uint32_t link, uint32_t type) {
  return report(module, section,
                ofWrongType("Symbol table section", section, "string table section", link, type,
                            "SHT_STRTAB"));
}

bool ErrorHandler::relocationLinkOfWrongType(const ObjectModule& module, uint32_t section,
                                             uint32_t link, uint32_t type) {
  return report(module, section,
                ofWrongType("Relocation section", section, "symbol table section", link, type,
                            "SHT_SYMTAB or SHT_DYNSYM"));
}

bool ErrorHandler::groupLinkOfWrongType(const ObjectModule& module, uint32_t section, uint32_t link,
                                        uint32_t type) {
  return report(module, section,
                ofWrongType("Group section", section, "symbol table section", link, type,
                            "SHT_SYMTAB or SHT_DYNSYM"));
}

bool ErrorHandler::shndxLinkOfWrongType(const ObjectModule& module, uint32_t section, uint32_t link,
                                        uint32_t type) {
  return report(module, section,
                ofWrongType("SHT_SYMTAB_SHNDX section", section, "symbol table section", link, type,
                            "SHT_SYMTAB or SHT_DYNSYM"));
}

bool ErrorHandler::hashLinkOfWrongType(const ObjectModule& module, uint32_t section, uint32_t link,
                                       uint32_t type) {
  return report(
      module, section,
      ofWrongType("Hash section", section, "symbol table section", link, type, "SHT_DYNSYM"));
}

bool ErrorHandler::preemptionMapLinkOfWrongType(const ObjectModule& module, uint32_t section,
                                                uint32_t link, uint32_t type) {
  return report(module, section,
                ofWrongType("Preemption map section", section, "string table section", link, type,
                            "SHT_STRTAB"));
}

bool ErrorHandler::dynamicLinkOfWrongType(const ObjectModule& module, uint32_t section,
                                          uint32_t link, uint32_t type) {
  return report(
      module, section,
      ofWrongType("Dynamic section", section, "string table section", link, type, "SHT_STRTAB"));
}

bool ErrorHandler::nameWithoutNameTable(const ObjectModule& module, uint32_t section) {
  return report(
      module, section,
      text("Section name field for section #", section,
           " specifies a nonzero string table offset, but there is no section-name string table"));
}

bool ErrorHandler::sectionNameOutOfRange(const ObjectModule& module, uint32_t section,
                                         uint32_t offset, uint64_t tableSize) {
  return report(
      module, section,
      text("Section name field for section #", section, " specifies a string table offset ", offset,
           " which is beyond the end of the section-name string table (length ", tableSize, ")"));
}

bool ErrorHandler::groupSignatureOutOfRange(const ObjectModule& module, uint32_t section,
                                            uint32_t symbol, uint32_t tableSection,
                                            uint64_t rowCount) {
  return report(module, section,
                text("Group section #", section, " refers to symbol #", symbol,
                     " but its associated symbol table section #", tableSection, " only contains ",
                     rowCount, " symbols"));
}

bool ErrorHandler::secondShndxSection(const ObjectModule& module, uint32_t firstSection,
                                      uint32_t section, uint32_t tableSection) {
  return report(module, section,
                text("SHT_SYMTAB_SHNDX sections #", firstSection, " and #", section,
                     " are both associated with the same symbol table section #", tableSection));
}

bool ErrorHandler::shndxCountDiffers(const ObjectModule& module, uint32_t section,
                                     uint64_t wordCount, uint32_t tableSection, uint64_t rowCount) {
  return report(module, section,
                text("SHT_SYMTAB_SHNDX section #", section, " contains ", wordCount,
                     " entries, but its associated symbol table section #", tableSection,
                     " contains ", rowCount));
}

bool ErrorHandler::symbolNameOutOfRange(const ObjectModule& module, SymbolPlace place,
                                        uint32_t offset, uint32_t stringSection,
                                        uint64_t stringSize) {
  return report(module, place.tableSection,
                text(symbolIn(place), " refers to offset ", offset, " in string table section #",
                     stringSection, ", which is only ", stringSize, " bytes long"));
}

bool ErrorHandler::symbolWithoutShndxSection(const ObjectModule& module, SymbolPlace place) {
  return report(module, place.tableSection,
                text(symbolIn(place), " has SHN_XINDEX section field, but there is no "
                                      "SHT_SYMTAB_SHNDX section associated with the symbol table"));
}

bool ErrorHandler::symbolSectionOutOfRange(const ObjectModule& module, SymbolPlace place,
                                           uint32_t section, uint32_t lastSection) {
  return report(module, place.tableSection,
                text(symbolIn(place), " is defined in section #", section,
                     " but the last section is #", lastSection));
}

bool ErrorHandler::sectionSymbolNotHosted(const ObjectModule& module, SymbolPlace place) {
  const std::string symbol =
      place.tableSection == 0 ? text("Symbol #", place.symbol) : symbolIn(place);
  return report(module, place.tableSection,
                text(symbol, " has type STT_SECTION but is not defined relative to a section"));
}

bool ErrorHandler::sectionSymbolSizeDiffers(const ObjectModule& module, uint32_t symbol,
                                            uint32_t section, uint64_t size, uint64_t sectionSize) {
  return report(module, section,
                text("Symbol #", symbol, ", the STT_SECTION symbol for section #", section,
                     ", has size ", size, " which should be either zero or the section's size ",
                     sectionSize));
}

bool ErrorHandler::sectionSymbolTooLarge(const ObjectModule& module, uint32_t symbol,
                                         uint32_t section, uint64_t size, uint64_t sectionSize) {
  return report(module, section,
                text("Symbol #", symbol, ", a STT_SECTION symbol in section #", section,
                     ", has size ", size, " which should be at most the section's size ",
                     sectionSize));
}

bool ErrorHandler::relocationSymbolOutOfRange(const ObjectModule& module, uint64_t relocation,
                                              uint32_t section, uint32_t symbol,
                                              uint32_t tableSection, uint64_t rowCount) {
  return report(module, section,
                text("Relocation #", relocation, " in relocation section #", section,
                     " refers to symbol #", symbol, " but its associated symbol table section #",
                     tableSection, " only contains ", rowCount, " symbols"));
}

bool ErrorHandler::sectionInTwoGroups(const ObjectModule& module, uint32_t section,
                                      uint32_t groupSection, uint32_t otherGroupSection) {
  return report(module, section,
                text("Section #", section, " belongs to group section #", groupSection,
                     " and also to group section #", otherGroupSection));
}

bool ErrorHandler::corruptBuildAttributes(const ObjectModule& module, uint32_t section) {
  return report(module, section, text("Build attributes in section #", section, " are corrupted"));
}

bool ErrorHandler::emptyStringTable(const ObjectModule& module, uint32_t section) {
  return report(module, section, text("String table section #", section, " is completely empty"));
}

bool ErrorHandler::stringTableNotZeroEnded(const ObjectModule& module, uint32_t section,
                                           bool badStart, bool badEnd) {
  return report(module, section,
                text("String table section #", section, badStart ? " starts" : "",
                     badStart && badEnd ? " and" : "", badEnd ? " ends" : "",
                     " with a non-zero byte value"));
}

bool ErrorHandler::unrecognisedFileType(const ObjectModule& module, uint32_t type) {
  return report(module, 0,
                text("ELF file has unrecognised type code ", type, " (we handle types 1-4)"));
}

bool ErrorHandler::invalidDataEncoding(const ObjectModule& module, uint32_t encoding) {
  return report(module, 0,
                text("ELF file has invalid endianness code ", encoding, " (should be 1 or 2)"));
}

bool ErrorHandler::unsupportedVersion(const ObjectModule& module, uint32_t version) {
  return report(
      module, 0,
      text("ELF file has unsupported version code ", version, " (we only handle version 1)"));
}

bool ErrorHandler::unsupportedMachine(const ObjectModule& module, uint32_t machine) {
  return report(
      module, 0,
      text("ELF file has unsupported machine code ", machine, " (we only handle EM_ZEV = 40)"));
}

bool ErrorHandler::wrongEntrySize(const ObjectModule& module, uint32_t section, uint64_t entrySize,
                                  uint64_t expected) {
  return report(module, section,
                text("Section #", section, " specifies its entry size as ", entrySize,
                     " (should be ", expected, ")"));
}

bool ErrorHandler::sizeNotMultiple(const ObjectModule& module, uint32_t section, uint64_t size,
                                   uint64_t entrySize) {
  return report(
      module, section,
      text("Section #", section, " has length ", size, ", which is not a multiple of ", entrySize));
}

bool ErrorHandler::mixedJumpSlotAddends(const ObjectModule& module) {
  return report(module, 0,
                text("Relocations in PLT and GOT include some with addends and some without"));
}

bool ErrorHandler::nullSectionNotNull(const ObjectModule& module, uint32_t section) {
  return report(module, section,
                text("SHT_NULL section #", section, " does not have completely null details"));
}

bool ErrorHandler::firstSectionNotNull(const ObjectModule& module, uint32_t type) {
  return report(module, 0, text("Section #0 has type ", namedType(type), " instead of SHT_NULL"));
}

bool ErrorHandler::auxiliarySectionHostsSymbol(const ObjectModule& module, uint32_t section) {
  return report(module, section,
                text("Auxiliary section #", section, " has at least one symbol defined in it"));
}

bool ErrorHandler::auxiliarySectionRelocated(const ObjectModule& module, uint32_t section) {
  return report(module, section,
                text("Auxiliary section #", section, " has at least one relocation in it"));
}

bool ErrorHandler::repeatedDynamicRelocation(const ObjectModule& module, uint64_t offset,
                                             uint32_t section) {
  return report(module, section,
                text("Multiple dynamic relocations at offset ", offset, " in section #", section));
}

bool ErrorHandler::repeatedStaticRelocation(const ObjectModule& module, uint64_t offset,
                                            uint32_t section) {
  return report(module, section,
                text("Multiple static relocations at offset ", offset, " in section #", section));
}

bool ErrorHandler::unexpectedSegments(const ObjectModule& module) {
  return report(module, 0,
                text("Program header table is non-empty although file is not executable"));
}

bool ErrorHandler::loadableSectionOutsideSegments(const ObjectModule& module, uint32_t section) {
  return report(module, section,
                text("Loadable section #", section, " is not contained in a loadable segment"));
}

bool ErrorHandler::otherSectionInLoadableSegment(const ObjectModule& module, uint32_t section,
                                                 uint32_t segment) {
  return report(
      module, section,
      text("Non-loadable section #", section, " is contained in loadable segment #", segment));
}

bool ErrorHandler::loadableSegmentsOutOfOrder(const ObjectModule& module, uint32_t segment,
                                              uint32_t laterSegment) {
  return report(module, 0,
                text("Loadable segments #", segment, " appears before #", laterSegment,
                     " in the file but after it in memory"));
}

bool ErrorHandler::loadableSegmentsOverlap(const ObjectModule& module, uint32_t segment,
                                           uint32_t otherSegment) {
  return report(module, 0,
                text("Loadable segments #", segment, " and #", otherSegment, " overlap"));
}

bool ErrorHandler::sectionsOverlap(const ObjectModule& module, uint32_t section,
                                   uint32_t otherSection) {
  return report(module, section,
                text("Sections #", section, " and #", otherSection, " overlap in the file"));
}

bool ErrorHandler::secondInterpreterSegment(const ObjectModule& module, uint32_t segment,
                                            uint32_t otherSegment) {
  return report(module, 0,
                text("Segments #", segment, " and #", otherSegment, " both have type PT_INTERP"));
}

bool ErrorHandler::secondHeaderTableSegment(const ObjectModule& module, uint32_t segment,
                                            uint32_t otherSegment) {
  return report(module, 0,
                text("Segments #", segment, " and #", otherSegment, " both have type PT_PHDR"));
}

bool ErrorHandler::loadableBeforeInterpreter(const ObjectModule& module, uint32_t loadable,
                                             uint32_t segment) {
  return report(module, 0,
                text("PT_LOAD segment #", loadable, " comes before PT_INTERP segment #", segment));
}

bool ErrorHandler::loadableBeforeHeaderTable(const ObjectModule& module, uint32_t loadable,
                                             uint32_t segment) {
  return report(module, 0,
                text("PT_LOAD segment #", loadable, " comes before PT_PHDR segment #", segment));
}

bool ErrorHandler::headerTableSegmentTooSmall(const ObjectModule& module, uint32_t segment,
                                              uint64_t size, uint64_t tableSize) {
  return report(module, 0,
                text("PT_PHDR segment #", segment, " has size ", size,
                     " bytes, smaller than the actual size of the program header table (",
                     tableSize, ")"));
}

bool ErrorHandler::segmentNotCongruent(const ObjectModule& module, uint32_t segment,
                                       uint64_t address, uint64_t offset, uint64_t alignment) {
  return report(module, 0,
                text("Loadable segment #", segment, "'s virtual address ", address,
                     " and its file offset ", offset, " are not congruent modulo its alignment ",
                     alignment));
}

bool ErrorHandler::sectionMisaligned(const ObjectModule& module, uint32_t section, uint64_t address,
                                     uint64_t alignment) {
  return report(module, section,
                text("Loadable section #", section, "'s virtual address ", address,
                     " is not a multiple of its alignment ", alignment));
}

bool ErrorHandler::noLoadableSegments(const ObjectModule& module) {
  return report(module, 0, text("No loadable segments exist"));
}

bool ErrorHandler::noRoomForHeaders(const ObjectModule& module, uint32_t segment, uint64_t unmapped,
                                    uint64_t needed) {
  return report(module, 0,
                text("First loadable segment #", segment, " has ", unmapped,
                     " bytes unmapped at the start, but ", needed, " are needed"));
}

bool ErrorHandler::indexTableFlagsMissing(const ObjectModule& module, uint32_t section,
                                          uint32_t missingFlags) {
  const bool lacksAlloc = (missingFlags & SHF_ALLOC) != 0;
  const bool lacksLinkOrder = (missingFlags & SHF_LINK_ORDER) != 0;
  const bool lacksBoth = lacksAlloc && lacksLinkOrder;
  return report(module, section,
                text("SHT_ZEV_EXIDX section #", section, " should have",
                     lacksAlloc ? " SHF_ALLOC (2)" : "", lacksBoth ? " and" : "",
                     lacksLinkOrder ? " SHF_LINK_ORDER (128)" : "", " flag", lacksBoth ? "s" : "",
                     " set"));
}

bool ErrorHandler::indexTableLinkUnsuitable(const ObjectModule& module, uint32_t section) {
  return report(
      module, section,
      text("sh_link field of SHT_ZEV_EXIDX section #", section,
           " should point to a SHT_PROGBITS section with SHF_ALLOC and SHF_EXECINSTR flags set"));
}

bool ErrorHandler::groupFlagWithoutGroup(const ObjectModule& module, uint32_t section) {
  return report(module, section,
                text("Section #", section,
                     " has the SHF_GROUP flag set but is not referenced by any SHT_GROUP section"));
}

bool ErrorHandler::memberWithoutGroupFlag(const ObjectModule& module, uint32_t section,
                                          uint32_t groupSection) {
  return report(module, section,
                text("Section #", section, " is referenced by SHT_GROUP section #", groupSection,
                     " but does not have the SHF_GROUP flag set"));
}

bool ErrorHandler::relocationLeavesGroup(const ObjectModule& module, uint64_t relocation,
                                         uint32_t section, uint32_t symbolSection,
                                         uint32_t targetSection) {
  return report(module, section,
                text("Relocation #", relocation, " in section #", section,
                     " references a local symbol in section #", symbolSection,
                     " which is not in the same group as its target section #", targetSection));
}

bool ErrorHandler::relocationNotAllowed(const ObjectModule& module, uint64_t relocation,
                                        uint32_t section, uint32_t targetSection) {
  return report(module, section,
                text("Relocation #", relocation, " in section #", section, " has target section #",
                     targetSection, " which should not be relocated at all"));
}

bool ErrorHandler::localSymbolUndefined(const ObjectModule& module, uint32_t symbol,
                                        bool isDynamic) {
  return report(module, 0,
                text(isDynamic ? "Dynamic symbol #" : "Symbol #", symbol,
                     " has binding STB_LOCAL but is undefined"));
}

bool ErrorHandler::wrongMagic(const ObjectModule& module) {
  return report(module, 0, text("File is not an ELF file (wrong magic number)"));
}

bool ErrorHandler::wrongClass(const ObjectModule& module) {
  return report(module, 0, text("File is not 32-bit ELF"));
}

bool ErrorHandler::segmentAlignmentConflict(const ObjectModule& module, uint32_t segment,
                                            uint32_t otherSegment) {
  return report(module, 0,
                text("Segment #", segment, " and segment #", otherSegment, AlignmentConflict));
}

bool ErrorHandler::sectionAlignmentConflict(const ObjectModule& module, uint32_t segment,
                                            uint32_t section) {
  return report(module, section,
                text("Segment #", segment, " and section #", section, AlignmentConflict));
}

bool ErrorHandler::programHeaderTableAlignmentConflict(const ObjectModule& module,
                                                       uint32_t segment) {
  return report(module, 0,
                text("Segment #", segment, " and program header table", AlignmentConflict));
}

bool ErrorHandler::sectionHeaderTableAlignmentConflict(const ObjectModule& module,
                                                       uint32_t segment) {
  return report(module, 0,
                text("Segment #", segment, " and section header table", AlignmentConflict));
}

bool ErrorHandler::elfHeaderAlignmentConflict(const ObjectModule& module, uint32_t segment) {
  return report(module, 0, text("Segment #", segment, " and ELF header", AlignmentConflict));
}

bool ErrorHandler::overlayOfOtherSection(const ObjectModule& module, uint64_t record,
                                         uint32_t section, uint32_t named) {
  return report(module, section,
                text("Record #", record, " in debug overlay section #", section,
                     " refers to section #", named, " which is not a debug section"));
}

bool ErrorHandler::overlayOfNoSection(const ObjectModule& module, uint64_t record, uint32_t section,
                                      uint32_t named) {
  return report(module, section,
                text("Record #", record, " in debug overlay section #", section,
                     " refers to section #", named, " which is not a section"));
}

bool ErrorHandler::segmentMapCountDiffers(const ObjectModule& module, uint32_t section,
                                          uint64_t entryCount, uint32_t allocatedSections) {
  return report(module, section,
                text("Section/segment mapping in SHT_NOTE section #", section, " contains ",
                     entryCount, " entries, but there are ", allocatedSections,
                     " SHF_ALLOC sections"));
}

bool ErrorHandler::segmentMapOutOfRange(const ObjectModule& module, uint32_t noteSection,
                                        uint32_t section, uint32_t segment) {
  return report(module, noteSection,
                text("Section/segment mapping in SHT_NOTE section #", noteSection,
                     " maps section #", section, " to segment #", segment,
                     " which does not exist"));
}

} // namespace elfext
