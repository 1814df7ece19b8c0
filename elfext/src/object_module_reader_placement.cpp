// SPDX-License-Identifier: Apache-2.0
//
// Segments, and where everything lies in the file: regions that share bytes are tied together at
// their distances, sections without bytes are tied to a segment, and the bytes of segments that
// belong to nothing else become blocks of raw data, so that none of them is lost when the file is
// written again.
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "elfext/interface/sort.h"
#include "elfext/src/extents.h"
#include "elfext/src/object_module_reader.h"
#include "elfext/src/segment_finder.h"

#include <algorithm>
#include <set>

namespace elfext {

namespace {

struct Region {
  FileRegion* region;
  Extent extent; // the id is the place in the list of regions
};

void createSegments(ReadContext& context) {
  for (const ProgramHeader& header : context.programHeaders) {
    context.module
        .createSegment(header.type, header.offset, header.vaddr, header.paddr, header.filesz,
                       header.memsz, header.flags, header.align)
        ->setFileOffset(header.offset);
  }
}

void placeHeaderTables(ReadContext& context) {
  ObjectModule& module = context.module;
  module.getElfHeader().setFileOffset(0);
  // An earlier read may have left them elsewhere.
  module.getSectionHeaderTable().clearFileOffset();
  module.getProgramHeaderTable().clearFileOffset();
  if (context.sectionCount() != 0) {
    module.getSectionHeaderTable().setEntryCount(context.sectionCount());
    module.getSectionHeaderTable().setFileOffset(context.fileHeader.shoff);
  }
  if (module.getFileType() != ET_REL) {
    module.getProgramHeaderTable().setEntryCount(context.segmentCount());
    module.getProgramHeaderTable().setFileOffset(context.fileHeader.phoff);
  }
}

// Regions with bytes in the file; first the segments, then the others.
class RegionList {
public:
  explicit RegionList(ReadContext& context) {
    for (uint32_t i = 0; i < context.segmentCount(); ++i) {
      const ProgramHeader& header = context.programHeaders[i];
      add(context.module.getSegment(i), header.offset, header.filesz);
    }
    m_SegmentCount = m_Regions.size();
    for (uint32_t i = 0; i < context.sectionCount(); ++i) {
      const SectionHeader& header = context.sectionHeaders[i];
      if (hasFileBytes(header)) add(context.module.getSection(i), header.offset, header.size);
    }
    addTable(&context.module.getElfHeader());
    addTable(&context.module.getSectionHeaderTable());
    addTable(&context.module.getProgramHeaderTable());
  }

  [[nodiscard]] std::vector<Region>& get() { return m_Regions; }
  [[nodiscard]] std::span<const Region> getOthers() const {
    return std::span(m_Regions).subspan(m_SegmentCount);
  }

private:
  void add(FileRegion* region, uint64_t offset, uint64_t size) {
    if (size == 0) return;
    const auto id = static_cast<uint32_t>(m_Regions.size());
    m_Regions.push_back({region, {offset, endOf(offset, size), id}});
  }
  void addTable(FileRegion* table) {
    uint64_t offset = 0;
    uint64_t size = 0;
    if (table->getFileExtent(&offset, &size)) add(table, offset, size);
  }

  std::vector<Region> m_Regions;
  size_t m_SegmentCount = 0;
};

// Going up by start, a region shares a byte with an earlier one exactly when it starts before the
// farthest end so far; tying it to that one ties it to all that it shares bytes with.
void tieOverlappingRegions(std::vector<Region> regions) {
  const auto comesFirst = [](const Region& left, const Region& right) {
    return left.extent.start != right.extent.start ? left.extent.start < right.extent.start
                                                   : left.extent.id < right.extent.id;
  };
  std::sort(regions.begin(), regions.end(), comesFirst);
  const Region* farthest = nullptr;
  for (const Region& region : regions) {
    if (farthest != nullptr && region.extent.start < farthest->extent.end) {
      [[maybe_unused]] const bool ret = FileRegion::link(
          *farthest->region, *region.region, region.extent.start - farthest->extent.start);
      QUARN_ASSERT(1, ret);
    }
    if (farthest == nullptr || region.extent.end > farthest->extent.end) farthest = &region;
  }
}

void tieSectionsWithoutBytes(ReadContext& context) {
  if (context.programHeaders.empty()) return;
  const std::vector<uint32_t> segments =
      findSegments(context.sectionHeaders, context.programHeaders, context.module.getOsAbi());
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (segments[i] == NoExtent) continue;
    const uint64_t distance =
        context.sectionHeaders[i].offset - context.programHeaders[segments[i]].offset;
    [[maybe_unused]] const bool ret = FileRegion::link(*context.module.getSegment(segments[i]),
                                                       *context.module.getSection(i), distance);
    QUARN_ASSERT(1, ret);
  }
}

// Sweeps over the file and finds the stretches that only segments cover.
class GapFiller {
public:
  GapFiller(ReadContext& context, std::span<const Region> others) : m_Context(context) {
    for (uint32_t i = 0; i < context.segmentCount(); ++i) {
      const ProgramHeader& header = context.programHeaders[i];
      if (header.filesz != 0) addEvents({header.offset, endOf(header.offset, header.filesz), i});
    }
    for (const Region& other : others)
      addEvents({other.extent.start, other.extent.end, NoExtent});
    // All events at one place are taken before the stretch behind it is looked at.
    const auto comesFirst = [](const Event& left, const Event& right) {
      return left.offset < right.offset;
    };
    smoothSort(std::span(m_Events), comesFirst);
  }

  bool fill() {
    if (hasEndlessSegment())
      return mapLowLevelResult(m_Context.module, LowLevelResult::OutsideImage);
    for (size_t i = 0; i < m_Events.size();) {
      const uint64_t start = m_Events[i].offset;
      for (; i < m_Events.size() && m_Events[i].offset == start; ++i)
        take(m_Events[i]);
      const bool isGap = hasOpenSegment() && m_OpenOthers == 0;
      if (isGap && !fillGap(start, m_Events[i].offset)) return false;
    }
    return true;
  }

private:
  struct Event {
    uint64_t offset;
    uint32_t segment; // NoExtent for what is no segment
    bool isClose;
  };

  // A segment whose end is beyond all numbers has bytes that nothing else covers.
  [[nodiscard]] bool hasEndlessSegment() const {
    return std::any_of(
        m_Context.programHeaders.begin(), m_Context.programHeaders.end(),
        [](const ProgramHeader& header) { return header.filesz > UINT64_MAX - header.offset; });
  }

  void addEvents(const Extent& extent) {
    m_Events.push_back({extent.start, extent.id, false});
    m_Events.push_back({extent.end, extent.id, true});
  }

  // Open segments by how welcome their bytes are; within each set the first one counts.
  [[nodiscard]] std::set<uint32_t>& setOf(uint32_t segment) {
    if (m_Context.isSegmentThere[segment]) return m_OpenThere;
    return m_Context.programHeaders[segment].type == PT_LOAD ? m_OpenLoads : m_OpenOtherSegments;
  }

  [[nodiscard]] bool hasOpenSegment() const {
    return !m_OpenThere.empty() || !m_OpenLoads.empty() || !m_OpenOtherSegments.empty();
  }

  void take(const Event& event) {
    if (event.segment == NoExtent)
      m_OpenOthers += event.isClose ? -1 : 1;
    else if (event.isClose)
      setOf(event.segment).erase(event.segment);
    else
      setOf(event.segment).insert(event.segment);
  }

  [[nodiscard]] uint32_t chooseSegment() const {
    if (!m_OpenThere.empty()) return *m_OpenThere.begin();
    return !m_OpenLoads.empty() ? *m_OpenLoads.begin() : *m_OpenOtherSegments.begin();
  }

  bool requireSegment(uint32_t segment) {
    const ProgramHeader& header = m_Context.programHeaders[segment];
    if (m_Context.isSegmentThere[segment]) return true;
    if (!m_Context.image.contains(header.offset, header.filesz))
      return mapLowLevelResult(m_Context.module, LowLevelResult::OutsideImage);
    setOf(segment).erase(segment);
    m_Context.isSegmentThere[segment] = true;
    setOf(segment).insert(segment);
    return true;
  }

  bool fillGap(uint64_t start, uint64_t end) {
    const uint32_t index = chooseSegment();
    if (!requireSegment(index)) return false;
    const ProgramHeader& header = m_Context.programHeaders[index];
    QUARN_ASSERT(1, end - header.offset <= header.filesz);
    Segment* segment = m_Context.module.getSegment(index);
    RawDataBlock* block = m_Context.module.createRawDataBlock(segment, end - start);
    block->setFileOffset(start);
    block->getBuffer().defer(m_Context.image, start, end - start);
    [[maybe_unused]] const bool ret = FileRegion::link(*segment, *block, start - header.offset);
    QUARN_ASSERT(1, ret);
    return true;
  }

  ReadContext& m_Context;
  std::vector<Event> m_Events;
  std::set<uint32_t> m_OpenThere;
  std::set<uint32_t> m_OpenLoads;
  std::set<uint32_t> m_OpenOtherSegments;
  int64_t m_OpenOthers = 0;
};

} // namespace

bool placeRegions(ReadContext& context) {
  if (context.overlap)
    return stop(context.module, &ErrorHandler::sectionsOverlap, context.overlap->first,
                context.overlap->second);
  createSegments(context);
  placeHeaderTables(context);
  RegionList regions(context);
  tieOverlappingRegions(regions.get());
  tieSectionsWithoutBytes(context);
  return context.programHeaders.empty() || GapFiller(context, regions.getOthers()).fill();
}

} // namespace elfext
