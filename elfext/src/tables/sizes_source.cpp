// SPDX-License-Identifier: Apache-2.0
//
// Decides what counts as code, literal pool, read-only, read-write or zero-initialised data, debug
// information and padding (the totals of SizesStatistics). Both roads bring their sections, mapping
// symbols and segments in the same form, so the figures are the same. What a file may try is a
// mapping symbol behind its section, a million of them at one place, or segments over one another:
// symbols are sorted once and each is passed over once, and gaps are found by one sweep.
#include "elfext/src/tables/sizes_source.h"

#include "checking/interface/checking.h"
#include "elfext/interface/debug_section_name.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/sort.h"

#include <algorithm>
#include <cstring>
#include <span>

namespace elfext {

namespace {

using SectionSize = SizesSource::SectionSize;
using MappingSymbol = SizesSource::MappingSymbol;
using SegmentSize = SizesSource::SegmentSize;

bool hasFlag(const SectionSize& section, uint32_t flag) {
  return (section.flags & flag) != 0;
}

// The total that a mapping symbol chooses.
uint64_t* destinationOf(const char* name, bool isWritable, SizesStatistics& statistics,
                        uint64_t& writable) {
  // "$a", "$t" and "$x" start code of one kind or another.
  if (name[1] != 'd') return &statistics.m_Code;
  if (std::strcmp(name, "$d.realdata") != 0) return &statistics.m_LiteralPools;
  return isWritable ? &writable : &statistics.m_RoData;
}

// An executable section is code, literal pools and data in turn. What comes before the first
// mapping symbol counts as literal pool; of several symbols at one place the last one decides.
void countExecutable(const SectionSize& section, std::span<const MappingSymbol> symbols,
                     SizesStatistics& statistics) {
  uint64_t writable = 0;
  uint64_t* destination = &statistics.m_LiteralPools;
  auto symbol = symbols.begin();
  // Symbols at or behind the section's end are never reached; offsets that wrapped below its start
  // are large numbers and are not either.
  for (uint64_t cursor = 0; cursor < section.size;) {
    for (; symbol != symbols.end() && symbol->offset == cursor; ++symbol)
      destination = destinationOf(symbol->name, hasFlag(section, SHF_WRITE), statistics, writable);
    const uint64_t next =
        symbol == symbols.end() ? section.size : std::min(section.size, symbol->offset);
    *destination += next - cursor;
    cursor = next;
  }
  // Both totals, as what lies between code is not compressed.
  statistics.m_RwDataUncompressed += writable;
  statistics.m_RwDataCompressed += writable;
}

// By section and offset; those of one place stay in their order. In good objects they are nearly so
// from the start.
void sortByPlace(std::vector<MappingSymbol>& symbols) {
  const auto comesFirst = [](const MappingSymbol& left, const MappingSymbol& right) {
    return left.section != right.section ? left.section < right.section
                                         : left.offset < right.offset;
  };
  if (!std::is_sorted(symbols.begin(), symbols.end(), comesFirst))
    std::stable_sort(symbols.begin(), symbols.end(), comesFirst);
}

void countSection(const SectionSize& section, std::span<const MappingSymbol> symbols,
                  SizesStatistics& statistics) {
  if (!hasFlag(section, SHF_ALLOC)) {
    if (isDebugSectionName(section.name)) statistics.m_DebugInfo += section.size;
  } else if (section.type == SHT_NOBITS) {
    statistics.m_ZiData += section.size;
  } else if (hasFlag(section, SHF_EXECINSTR)) {
    countExecutable(section, symbols, statistics);
  } else if (hasFlag(section, SHF_WRITE)) {
    statistics.m_RwDataCompressed += section.size;
    statistics.m_RwDataUncompressed += section.expandedSize;
  } else {
    statistics.m_RoData += section.size;
  }
}

// File offsets.
struct Range {
  explicit Range(const SizesSource::FileRange& range)
      : start(range.offset),
        end(range.size > UINT64_MAX - range.offset ? UINT64_MAX : range.offset + range.size) {
    // Cut to the largest number above.
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

std::vector<Range> getSegmentRanges(const SizesSource& source) {
  std::vector<Range> ranges;
  for (const SegmentSize& segment : source.segments) {
    if (segment.range.size != 0) ranges.emplace_back(segment.range);
  }
  sortByStart(ranges);
  return ranges;
}

// Bytes of segments that lie before or between occupied ranges. The place in the occupied ranges is
// kept from one segment to the next, so a segment that starts before it counts what is there again.
void countGaps(const SizesSource& source, SizesStatistics& statistics) {
  if (source.segments.empty()) return;
  std::vector<Range> occupied(source.occupied.begin(), source.occupied.end());
  sortByStart(occupied);
  size_t i = 0;
  for (const Range& segment : getSegmentRanges(source)) {
    uint64_t cursor = segment.start;
    for (; i < occupied.size(); ++i) {
      const uint64_t limit = std::min(occupied[i].start, segment.end);
      if (limit > cursor) statistics.m_InternalPadding += limit - cursor;
      if (limit == segment.end) break;
      cursor = std::max(cursor, occupied[i].end);
    }
  }
}

SizesStatistics countSections(SizesSource& source) {
  SizesStatistics statistics;
  sortByPlace(source.mappingSymbols);
  std::span<const MappingSymbol> symbols = source.mappingSymbols;
  for (uint32_t i = 0; i < source.sections.size(); ++i) {
    const auto isElsewhere = [i](const MappingSymbol& symbol) { return symbol.section != i; };
    const auto end = std::find_if(symbols.begin(), symbols.end(), isElsewhere);
    const auto count = static_cast<size_t>(end - symbols.begin());
    countSection(source.sections[i], symbols.first(count), statistics);
    symbols = symbols.subspan(count);
  }
  for (const SizesSource::RawData& data : source.rawData)
    (data.isZero ? statistics.m_InternalPadding : statistics.m_RoData) += data.size;
  countGaps(source, statistics);
  return statistics;
}

void countSegment(const SegmentSize& segment, SizesStatistics& statistics) {
  const uint64_t fileSize = segment.range.size;
  const uint32_t access = segment.flags & (PF_R | PF_W);
  if ((segment.flags & PF_X) != 0) {
    statistics.m_Code += fileSize;
  } else if (access == (PF_R | PF_W)) {
    statistics.m_RwDataUncompressed += fileSize;
    statistics.m_RwDataCompressed += fileSize;
  } else if (access == PF_R) {
    statistics.m_RoData += fileSize;
  } else {
    return;
  }
  // A segment larger in the file than in memory makes this wrap, and the total with it: such a file
  // has no sizes that make sense.
  statistics.m_ZiData += segment.memorySize - fileSize;
}

SizesStatistics countSegments(const SizesSource& source) {
  SizesStatistics statistics;
  for (const SegmentSize& segment : source.segments) {
    if (segment.type == PT_LOAD) countSegment(segment, statistics);
  }
  return statistics;
}

} // namespace

std::optional<bool> isAllZero(uint64_t size,
                              const std::function<const uint8_t*(uint64_t, uint64_t)>& view) {
  // Gaps may be as large as the file; the first byte that is not zero ends the look.
  constexpr uint64_t PieceSize = 4096;
  for (uint64_t offset = 0; offset < size; offset += PieceSize) {
    const uint64_t count = std::min(PieceSize, size - offset);
    const uint8_t* bytes = view(offset, count);
    if (bytes == nullptr) return std::nullopt;
    if (std::any_of(bytes, bytes + count, [](uint8_t byte) { return byte != 0; })) return false;
  }
  return true;
}

SizesStatistics computeSizesStatistics(SizesSource source) {
  // A stripped image has nothing but segments to tell code from data by.
  const bool hasOnlySegments = source.sections.empty() && !source.segments.empty();
  return hasOnlySegments ? countSegments(source) : countSections(source);
}

} // namespace elfext
