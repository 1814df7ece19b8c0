// SPDX-License-Identifier: Apache-2.0
//
// The order of the steps, and the ELF header.
#include "elfext/src/object_module_reader.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"

#include <algorithm>
#include <utility>

namespace elfext {

namespace {

constexpr uint64_t IdentSize = 16;
constexpr size_t ClassPosition = 4;
constexpr size_t EncodingPosition = 5;
constexpr size_t VersionPosition = 6;
constexpr size_t OsAbiPosition = 7;
constexpr size_t AbiVersionPosition = 8;
constexpr std::array<uint8_t, 4> Magic = {0x7F, 'E', 'L', 'F'};
constexpr uint32_t EM_ZEV64_SECOND = 184;

bool checkFileHeader(const ReadContext& context) {
  const FileHeader& header = context.fileHeader;
  const uint8_t encoding = header.ident[EncodingPosition];
  if (header.type < ET_REL || header.type > ET_CORE)
    return refuse(context.module, &ErrorHandler::unrecognisedFileType, header.type);
  if (encoding != ELFDATA2LSB && encoding != ELFDATA2MSB)
    return refuse(context.module, &ErrorHandler::invalidDataEncoding, encoding);
  if (header.version != EV_CURRENT)
    return refuse(context.module, &ErrorHandler::unsupportedVersion, header.version);
  return true;
}

bool isMachineSupported(uint16_t machine) {
  return machine == EM_ZEV || machine == EM_ZEV64 || machine == EM_ZEV64_SECOND;
}

// Clears the module and copies the header's fields in.
void beginModule(ReadContext& context, std::unique_ptr<ImageSource> image) {
  const FileHeader& header = context.fileHeader;
  ObjectModule& module = context.module;
  module.clear();
  module.adoptImageSource(std::move(image));
  module.setReadBuffer(context.lentBytes);
  module.setMachine(header.machine);
  module.setFileType(header.type);
  module.setElfClass(header.ident[ClassPosition]);
  module.setDataEncoding(header.ident[EncodingPosition]);
  module.setOsAbi(header.ident[OsAbiPosition]);
  module.setAbiVersion(header.ident[AbiVersionPosition]);
  module.setEntry(header.entry);
  module.setElfFlags(header.flags);
  module.setIdentVersion(header.ident[VersionPosition]);
  module.setElfVersion(header.version);
  module.setElfHeaderSize(header.ehsize);
  module.setSectionHeaderOffset(header.shoff);
  module.setProgramHeaderOffset(header.phoff);
  module.setStoredSectionCount(header.shnum);
  module.setStoredProgramHeaderCount(header.phnum);
  module.setSectionHeaderEntrySize(header.shentsize);
  module.setProgramHeaderEntrySize(header.phentsize);
  module.reserveSections(context.sectionCount());
}

// What the header tables and all sections say. Build attributes come last of all, when everything
// that they may hang on is there.
bool readModule(ReadContext& context) {
  return createSections(context) && readContents(context) && readSectionNames(context) &&
         readLinks(context) && readSymbols(context) && readRelocations(context) &&
         readGroups(context) && placeRegions(context) && readDynamicSections(context) &&
         readDebugOverlays(context) && readSegmentMaps(context) && readBuildAttributes(context);
}

} // namespace

bool readObjectModule(ReadContext& context, std::unique_ptr<ImageSource> image) {
  ObjectModule& module = context.module;
  if (!readFileHeader(context) || !checkFileHeader(context)) return false;
  const uint16_t machine = context.fileHeader.machine;
  if (!isMachineSupported(machine)) return goOn(module, &ErrorHandler::unsupportedMachine, machine);
  if (!readSectionHeaders(context) || !readProgramHeaders(context)) return false;

  beginModule(context, std::move(image));
  // Names are views of the image, which the module now owns.
  const bool wereNamesInBuffer = module.areNamesInBuffer();
  module.setNamesInBuffer(true);
  const bool isRead = readModule(context);
  module.setNamesInBuffer(wereNamesInBuffer);
  if (!isRead) return false;
  module.setReadConditions(computeReadConditions(context));
  module.setAuxiliarySectionsUpToDate(false);
  return true;
}

bool readFileHeader(ReadContext& context) {
  const uint8_t* ident = context.view(0, IdentSize);
  if (ident == nullptr) return false;
  const bool isWide = ident[ClassPosition] == ELFCLASS64;
  const uint8_t* bytes = context.view(0, fileHeaderSize(isWide));
  if (bytes == nullptr) return false;
  // Class 2 alone decides; only the other path looks at the magic.
  if (!isWide && !std::equal(Magic.begin(), Magic.end(), bytes))
    return mapLowLevelResult(context.module, LowLevelResult::WrongMagic);
  if (!isWide && bytes[ClassPosition] != ELFCLASS32)
    return mapLowLevelResult(context.module, LowLevelResult::WrongClass);
  context.format = {isWide, bytes[EncodingPosition] == ELFDATA2LSB};
  getRecord(context.format, bytes, context.fileHeader);
  return true;
}

uint64_t ReadContext::rowCount(uint32_t section) const {
  const SectionHeader& header = sectionHeaders[section];
  return header.size / expectedEntrySize(header.type, module.getElfClass());
}

const uint8_t* ReadContext::view(uint64_t offset, uint64_t size) {
  const uint8_t* bytes = image.view(offset, size);
  if (bytes == nullptr) static_cast<void>(failRead());
  return bytes;
}

const uint8_t* ReadContext::viewSection(uint32_t section) {
  const SectionHeader& header = sectionHeaders[section];
  const Section* holder = module.getSection(section);
  // The model gives zeros for bytes that it can't get; the read has to know.
  if (hasFileBytes(header)) {
    const uint8_t* bytes = view(header.offset, header.size);
    if (bytes == nullptr || holder->isContentsDeferred()) return bytes;
  }
  return holder->getBuffer().getContents();
}

bool ReadContext::failRead() const {
  switch (image.getFailure()) {
  case ImageFailure::Outside:
    return mapLowLevelResult(module, LowLevelResult::OutsideImage);
  case ImageFailure::NoMemory:
    return mapLowLevelResult(module, LowLevelResult::NoMemory);
  case ImageFailure::None:
  case ImageFailure::Unreadable:
    break;
  }
  return refuse(module, &ErrorHandler::ioErrorReading, image.getHostError());
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
