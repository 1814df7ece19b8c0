// SPDX-License-Identifier: Apache-2.0
//
// The order of the checks, the ELF header (e_ident, e_type, e_machine, e_version), and what all
// steps ask of the tables. A header is 52 bytes in class 1 and 64 in class 2. Its offsets and
// counts are believed by nobody: the steps that follow compare each with the image.
#include "elfext/src/tables/object_tables.h"

#include "elfext/interface/elf_constants.h"

#include <algorithm>

namespace elfext {

namespace {

constexpr uint64_t IdentSize = 16;
constexpr uint32_t EM_ZEV64_SECOND = 184;

bool readFileHeader(ObjectTables& tables) {
  // First only what says how long the header is.
  const uint8_t* ident = tables.view(0, IdentSize);
  if (ident == nullptr) return false;
  const bool isWide = ident[EI_CLASS] == ELFCLASS64;
  const uint8_t* bytes = tables.view(0, fileHeaderSize(isWide));
  if (bytes == nullptr) return false;
  // Class 2 alone decides; only the other path looks at the magic.
  if (!isWide && !std::equal(ElfMagic.begin(), ElfMagic.end(), bytes))
    return mapLowLevelResult(tables.reporter, LowLevelResult::WrongMagic);
  if (!isWide && bytes[EI_CLASS] != ELFCLASS32)
    return mapLowLevelResult(tables.reporter, LowLevelResult::WrongClass);
  tables.format = {isWide, bytes[EI_DATA] == ELFDATA2LSB};
  getRecord(tables.format, bytes, tables.fileHeader);
  return true;
}

bool checkFileHeader(const ObjectTables& tables) {
  const FileHeader& header = tables.fileHeader;
  const uint8_t encoding = header.ident[EI_DATA];
  // The order of these is that of their reports; each ends the read.
  if (header.type < ET_REL || header.type > ET_CORE)
    return refuse(tables.reporter, &ErrorHandler::unrecognisedFileType, header.type);
  if (encoding != ELFDATA2LSB && encoding != ELFDATA2MSB)
    return refuse(tables.reporter, &ErrorHandler::invalidDataEncoding, encoding);
  if (header.version != EV_CURRENT)
    return refuse(tables.reporter, &ErrorHandler::unsupportedVersion, header.version);
  return true;
}

bool isMachineSupported(uint16_t machine) {
  return machine == EM_ZEV || machine == EM_ZEV64 || machine == EM_ZEV64_SECOND;
}

} // namespace

bool checkHeaderOfAnyMachine(ObjectTables& tables, bool& isForeign) {
  if (!readFileHeader(tables) || !checkFileHeader(tables)) return false;
  isForeign = !isMachineSupported(tables.fileHeader.machine);
  return true;
}

bool checkHeaders(ObjectTables& tables, bool& isForeign) {
  if (!checkHeaderOfAnyMachine(tables, isForeign)) return false;
  // Objects of other processors are members like any other, for a handler that wants them.
  if (isForeign)
    return goOn(tables.reporter, &ErrorHandler::unsupportedMachine, tables.fileHeader.machine);
  return checkSectionHeaders(tables) && checkProgramHeaders(tables);
}

bool checkTables(ObjectTables& tables) {
  // Each step relies on those before it: shapes make row counts whole, contents make every
  // section's bytes known to be there, links say which tables belong together, symbols come before
  // the relocations that name them, and placement before what only concerns laid-out files.
  return checkTableShapes(tables) && checkContents(tables) && checkSectionNames(tables) &&
         checkLinks(tables) && checkSymbols(tables) && checkRelocations(tables) &&
         checkGroups(tables) && checkPlacement(tables) && checkDynamicSections(tables) &&
         checkDebugOverlays(tables) && checkSegmentMaps(tables);
}

void ObjectTables::takeMemory(ObjectTables& former) {
  const auto take = [](auto& array, auto& formerArray) {
    array = std::move(formerArray);
    array.clear();
  };
  // Cleared, not freed: an object like the one before it fits without a new page.
  take(sectionHeaders, former.sectionHeaders);
  take(programHeaders, former.programHeaders);
  take(links, former.links);
  take(symbolTables, former.symbolTables);
  take(relocationTables, former.relocationTables);
  take(groups, former.groups);
  take(groupMembers, former.groupMembers);
}

uint64_t ObjectTables::rowCount(uint32_t section) const {
  const SectionHeader& header = sectionHeaders[section];
  return header.size / expectedEntrySize(header.type, fileHeader.ident[EI_CLASS]);
}

uint64_t ObjectTables::stringSize(uint32_t section) const {
  const auto mended = mendedStrings.find(section);
  return mended == mendedStrings.end() ? sectionHeaders[section].size : mended->second.size();
}

std::optional<uint32_t> ObjectTables::stringTableOf(uint32_t section) const {
  const uint32_t link = sectionHeaders[section].link;
  if (!hasLink(section) || typeOf(link) != SHT_STRTAB) return std::nullopt;
  return link;
}

const char* ObjectTables::nameOf(uint32_t section) const {
  const uint32_t offset = sectionHeaders[section].name;
  return offset == 0 || sectionNames == nullptr ? nullptr : sectionNames + offset;
}

// Linked files and core dumps; in objects still to be linked, st_value is an offset.
bool ObjectTables::hasLaidOutAddresses() const {
  return fileHeader.type == ET_EXEC || fileHeader.type == ET_DYN || fileHeader.type == ET_CORE;
}

const uint8_t* ObjectTables::view(uint64_t offset, uint64_t size) {
  const uint8_t* bytes = image.view(offset, size);
  if (bytes == nullptr) static_cast<void>(failRead());
  return bytes;
}

const uint8_t* ObjectTables::viewSection(uint32_t section) {
  const auto mended = mendedStrings.find(section);
  if (mended != mendedStrings.end()) return mended->second.data();
  const SectionHeader& header = sectionHeaders[section];
  return hasFileBytes(header) ? view(header.offset, header.size) : nullptr;
}

bool ObjectTables::failRead() const {
  switch (image.getFailure()) {
  case ImageFailure::Outside:
    return mapLowLevelResult(reporter, LowLevelResult::OutsideImage);
  case ImageFailure::NoMemory:
    return mapLowLevelResult(reporter, LowLevelResult::NoMemory);
  // A failure that the image did not note is one of the host with number 0.
  case ImageFailure::None:
  case ImageFailure::Unreadable:
    break;
  }
  return refuse(reporter, &ErrorHandler::ioErrorReading, image.getHostError());
}

bool hasFileBytes(const SectionHeader& header) {
  return header.size != 0 && header.type != SHT_NULL && header.type != SHT_NOBITS;
}

bool isSymbolTable(uint32_t type) {
  return type == SHT_SYMTAB || type == SHT_DYNSYM;
}

bool isRelocationTable(uint32_t type) {
  return type == SHT_REL || type == SHT_RELA;
}

} // namespace elfext
