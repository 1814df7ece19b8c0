// SPDX-License-Identifier: Apache-2.0
#include "elfext/interface/sizes_statistics.h"

#include "checking/interface/checking.h"
#include "elfext/interface/debug_section_name.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "elfext/interface/sort.h"
#include "elfext/src/compressed_section_extractor.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <vector>

namespace elfext {

namespace {

bool hasFlag(const Section& section, uint32_t flag) {
  return (section.getFlags() & flag) != 0;
}

// The total that the mapping symbols at one place choose; the last of them decides.
uint64_t* destinationOf(const SymbolList& symbols, bool isWritable, SizesStatistics& statistics,
                        uint64_t& writable) {
  const char* name = symbols[symbols.getSize() - 1]->getName();
  if (name[1] != 'd') return &statistics.m_Code;
  if (std::strcmp(name, "$d.realdata") != 0) return &statistics.m_LiteralPools;
  return isWritable ? &writable : &statistics.m_RoData;
}

// An executable section is code, literal pools and data in turn. What comes before the first
// mapping symbol counts as literal pool.
void countExecutable(Section& section, SizesStatistics& statistics) {
  uint64_t writable = 0;
  uint64_t* destination = &statistics.m_LiteralPools;
  const uint64_t size = section.getSize();
  for (uint64_t cursor = 0; cursor < size;) {
    SymbolList here;
    if (section.getSymbolsInRange(cursor, cursor, &here))
      destination = destinationOf(here, hasFlag(section, SHF_WRITE), statistics, writable);
    SymbolList following;
    uint64_t next = size;
    if (section.getFollowingMappingSymbols(cursor + 1, &following))
      next = std::min(size, following[0]->getHostedSymbolOffset());
    *destination += next - cursor;
    cursor = next;
  }
  statistics.m_RwDataUncompressed += writable;
  statistics.m_RwDataCompressed += writable;
}

void countSection(Section& section, const CompressedSectionExtractor& extractor,
                  SizesStatistics& statistics) {
  const uint64_t size = section.getSize();
  if (!hasFlag(section, SHF_ALLOC)) {
    if (isDebugSectionName(section.getName())) statistics.m_DebugInfo += size;
  } else if (section.getType() == SHT_NOBITS) {
    statistics.m_ZiData += size;
  } else if (hasFlag(section, SHF_EXECINSTR)) {
    countExecutable(section, statistics);
  } else if (hasFlag(section, SHF_WRITE)) {
    uint64_t expanded = size;
    if (extractor.isActive() && !extractor.isCompressed(section, &expanded)) expanded = size;
    statistics.m_RwDataCompressed += size;
    statistics.m_RwDataUncompressed += expanded;
  } else {
    statistics.m_RoData += size;
  }
}

// Null for a block whose bytes can't be had, which has been told.
uint64_t* totalFor(const RawDataBlock& block, SizesStatistics& statistics) {
  std::array<uint8_t, 4096> bytes;
  for (uint64_t offset = 0; offset < block.getSize();) {
    const uint64_t count = std::min<uint64_t>(bytes.size(), block.getSize() - offset);
    if (!block.read(offset, bytes.data(), count)) return nullptr;
    if (std::any_of(bytes.begin(), bytes.begin() + static_cast<ptrdiff_t>(count),
                    [](uint8_t byte) { return byte != 0; }))
      return &statistics.m_RoData;
    offset += count;
  }
  return &statistics.m_InternalPadding;
}

void countRawData(const ObjectModule& module, SizesStatistics& statistics) {
  for (const RawDataBlock* block : module.getRawDataBlocks()) {
    if (uint64_t* total = totalFor(*block, statistics)) *total += block->getSize();
  }
}

// File offsets.
struct Range {
  Range(uint64_t offset, uint64_t size)
      : start(offset), end(size > UINT64_MAX - offset ? UINT64_MAX : offset + size) {
    QUARN_ASSERT(1, start <= end);
  }

  uint64_t start;
  uint64_t end;
};

void sortByStart(std::vector<Range>& ranges) {
  mergeSort(std::span(ranges), [](const Range& left, const Range& right) {
    return left.start == right.start ? 0 : left.start < right.start ? -1 : 1;
  });
}

std::vector<Range> getSegmentRanges(const ObjectModule& module) {
  std::vector<Range> ranges;
  for (const Segment* segment : module.getSegments()) {
    uint64_t offset = 0;
    segment->getFileExtent(&offset, nullptr);
    if (segment->getFileSize() != 0) ranges.emplace_back(offset, segment->getFileSize());
  }
  sortByStart(ranges);
  return ranges;
}

std::vector<Range> getOccupiedRanges(const ObjectModule& module) {
  std::vector<Range> ranges;
  const auto add = [&ranges](const FileRegion& region) {
    uint64_t offset = 0;
    uint64_t size = 0;
    region.getFileExtent(&offset, &size);
    if (size != 0) ranges.emplace_back(offset, size);
  };
  for (const Section* section : module.getSections())
    add(*section);
  for (const RawDataBlock* block : module.getRawDataBlocks())
    add(*block);
  // The headers count also where they are empty.
  ranges.emplace_back(0, module.getElfHeaderSize());
  ranges.emplace_back(module.getProgramHeaderOffset(),
                      uint64_t{module.getProgramHeaderEntrySize()} * module.getSegmentCount());
  ranges.emplace_back(module.getSectionHeaderOffset(),
                      uint64_t{module.getSectionHeaderEntrySize()} * module.getSectionCount());
  sortByStart(ranges);
  return ranges;
}

// Bytes of segments that lie before or between occupied ranges. The place in the occupied ranges is
// kept from one segment to the next, so a segment that starts before it counts what is there again.
void countGaps(const ObjectModule& module, SizesStatistics& statistics) {
  const std::vector<Range> occupied = getOccupiedRanges(module);
  size_t i = 0;
  for (const Range& segment : getSegmentRanges(module)) {
    uint64_t cursor = segment.start;
    for (; i < occupied.size(); ++i) {
      const uint64_t limit = std::min(occupied[i].start, segment.end);
      if (limit > cursor) statistics.m_InternalPadding += limit - cursor;
      if (limit == segment.end) break;
      cursor = std::max(cursor, occupied[i].end);
    }
  }
}

SizesStatistics countSections(ObjectModule& module) {
  SizesStatistics statistics;
  const CompressedSectionExtractor extractor(module);
  for (Section* section : module.getSections())
    countSection(*section, extractor, statistics);
  countRawData(module, statistics);
  countGaps(module, statistics);
  return statistics;
}

void countSegment(const Segment& segment, SizesStatistics& statistics) {
  const uint64_t fileSize = segment.getFileSize();
  const uint32_t access = segment.getFlags() & (PF_R | PF_W);
  if ((segment.getFlags() & PF_X) != 0) {
    statistics.m_Code += fileSize;
  } else if (access == (PF_R | PF_W)) {
    statistics.m_RwDataUncompressed += fileSize;
    statistics.m_RwDataCompressed += fileSize;
  } else if (access == PF_R) {
    statistics.m_RoData += fileSize;
  } else {
    return;
  }
  statistics.m_ZiData += segment.getMemorySize() - fileSize;
}

SizesStatistics countSegments(const ObjectModule& module) {
  SizesStatistics statistics;
  for (const Segment* segment : module.getSegments()) {
    if (segment->getType() == PT_LOAD) countSegment(*segment, statistics);
  }
  return statistics;
}

} // namespace

SizesStatistics computeSizesStatistics(ObjectModule* objectModule) {
  QUARN_ASSERT(1, objectModule != NULL);
  const bool hasOnlySegments =
      objectModule->getSectionCount() == 0 && objectModule->getSegmentCount() != 0;
  return hasOnlySegments ? countSegments(*objectModule) : countSections(*objectModule);
}

void printSizesStatistics(const SizesStatistics& statistics, std::FILE* f) {
  QUARN_ASSERT(1, f != NULL);
  const char* rule = "==========================================\n";
  const auto print = [f](const char* label, uint64_t total) {
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
