// SPDX-License-Identifier: Apache-2.0
//
// The sizes of a model: what it takes from sections, blocks and segments, which
// tables/sizes_source.cpp then counts by the same rules as for objects without a model; and the
// table in which they are printed. Offsets and sizes go over as the file had them.
#include "elfext/interface/sizes_statistics.h"

#include "checking/interface/checking.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "elfext/src/compressed_section_extractor.h"
#include "elfext/src/tables/sizes_source.h"

#include <array>

namespace elfext {

namespace {

void addMappingSymbols(const Section& section, SizesSource& source) {
  for (uint32_t i = 0; i < section.getHostedSymbolCount(); ++i) {
    const Symbol& symbol = *section.getHostedSymbol(i);
    if (symbol.getClass() == Symbol::Class_Mapping)
      source.mappingSymbols.push_back(
          {section.getIndex(), symbol.getHostedSymbolOffset(), symbol.getName()});
  }
}

SizesSource::FileRange rangeOf(const FileRegion& region) {
  SizesSource::FileRange range;
  region.getFileExtent(&range.offset, &range.size);
  return range;
}

void addOccupied(const SizesSource::FileRange& range, SizesSource& source) {
  if (range.size != 0) source.occupied.push_back(range);
}

void addSections(ObjectModule& module, SizesSource& source) {
  constexpr uint32_t CodeFlags = SHF_ALLOC | SHF_EXECINSTR;
  const CompressedSectionExtractor extractor(module);
  for (const Section* section : module.getSections()) {
    const uint64_t size = section->getSize();
    uint64_t expanded = size;
    // What the extractor has put there counts only if it says so.
    if (extractor.isActive() && !extractor.isCompressed(*section, &expanded)) expanded = size;
    source.sections.push_back(
        {section->getName(), section->getType(), section->getFlags(), size, expanded});
    addOccupied(rangeOf(*section), source);
    if ((section->getFlags() & CodeFlags) == CodeFlags) addMappingSymbols(*section, source);
  }
}

// Blocks whose bytes can't be had, which has been told, are left out.
void addRawData(const ObjectModule& module, SizesSource& source) {
  std::array<uint8_t, 4096> bytes;
  for (const RawDataBlock* block : module.getRawDataBlocks()) {
    addOccupied(rangeOf(*block), source);
    const std::optional<bool> isZero =
        isAllZero(block->getSize(), [&](uint64_t offset, uint64_t count) {
          return block->read(offset, bytes.data(), count) ? bytes.data() : nullptr;
        });
    if (isZero) source.rawData.push_back({block->getSize(), *isZero});
  }
}

SizesSource getSizesSource(ObjectModule& module) {
  SizesSource source;
  addSections(module, source);
  addRawData(module, source);
  for (const Segment* segment : module.getSegments()) {
    source.segments.push_back(
        {segment->getType(), segment->getFlags(), rangeOf(*segment), segment->getMemorySize()});
  }
  source.occupied.push_back({0, module.getElfHeaderSize()});
  source.occupied.push_back(
      {module.getProgramHeaderOffset(),
       uint64_t{module.getProgramHeaderEntrySize()} * module.getSegmentCount()});
  source.occupied.push_back(
      {module.getSectionHeaderOffset(),
       uint64_t{module.getSectionHeaderEntrySize()} * module.getSectionCount()});
  return source;
}

} // namespace

SizesStatistics computeSizesStatistics(ObjectModule* objectModule) {
  QUARN_ASSERT(1, objectModule != NULL);
  return computeSizesStatistics(getSizesSource(*objectModule));
}

void printSizesStatistics(const SizesStatistics& statistics, std::FILE* f) {
  QUARN_ASSERT(1, f != NULL);
  const char* rule = "==========================================\n";
  const auto print = [f](const char* label, uint64_t total) {
    // Only the low 32 bits have a place in the table.
    std::fprintf(f, "%-24s: %10u bytes\n", label, static_cast<uint32_t>(total));
  };
  std::fputs(rule, f);
  print("Code", statistics.m_Code);
  print("Literal pools", statistics.m_LiteralPools);
  print("RW data (uncompressed)", statistics.m_RwDataUncompressed);
  print("RW data (compressed)", statistics.m_RwDataCompressed);
  print("RO data", statistics.m_RoData);
  print("ZI data", statistics.m_ZiData);
  print("Debug info", statistics.m_DebugInfo);
  print("Internal padding", statistics.m_InternalPadding);
  std::fputs(rule, f);
}

} // namespace elfext
