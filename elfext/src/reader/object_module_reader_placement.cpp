// SPDX-License-Identifier: Apache-2.0
//
// Segments, and where everything lies in the file: regions that share bytes are tied together at
// their distances, sections without bytes are tied to a segment, and the bytes of segments that
// belong to nothing else become blocks of raw data, so that none of them is lost when the file is
// written again.
//
// The placement forest says which regions must keep their distances when a file is laid out again.
// A hostile file has ten thousands of regions that all touch: each is tied once, to one other, and
// not to all that it touches.
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "elfext/src/bytes/extents.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"
#include "elfext/src/reader/segment_finder.h"

#include <algorithm>

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
  if (context.getSectionCount() != 0) {
    module.getSectionHeaderTable().setEntryCount(context.getSectionCount());
    module.getSectionHeaderTable().setFileOffset(context.fileHeader.shoff);
  }
  if (module.getFileType() != ET_REL) {
    module.getProgramHeaderTable().setEntryCount(context.getSegmentCount());
    module.getProgramHeaderTable().setFileOffset(context.fileHeader.phoff);
  }
}

// Regions with bytes in the file.
class RegionList {
public:
  explicit RegionList(ReadContext& context) {
    for (uint32_t i = 0; i < context.getSegmentCount(); ++i) {
      const ProgramHeader& header = context.programHeaders[i];
      add(context.module.getSegment(i), header.offset, header.filesz);
    }
    for (uint32_t i = 0; i < context.getSectionCount(); ++i) {
      const SectionHeader& header = context.sectionHeaders[i];
      if (hasFileBytes(header)) add(context.module.getSection(i), header.offset, header.size);
    }
    addTable(&context.module.getElfHeader());
    addTable(&context.module.getSectionHeaderTable());
    addTable(&context.module.getProgramHeaderTable());
  }

  [[nodiscard]] std::vector<Region>& get() { return m_Regions; }

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
};

// Neither refused nor too far: a region joins once, at a distance that is the difference of two
// offsets of one file.
void tie(FileRegion& first, FileRegion& second, uint64_t distance) {
  [[maybe_unused]] const bool ret = FileRegion::link(first, second, distance);
  QUARN_ASSERT(1, ret);
}

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
    if (farthest != nullptr && region.extent.start < farthest->extent.end)
      tie(*farthest->region, *region.region, region.extent.start - farthest->extent.start);
    if (farthest == nullptr || region.extent.end > farthest->extent.end) farthest = &region;
  }
}

void tieSectionsWithoutBytes(ReadContext& context) {
  // Objects that are still to be linked, which are nearly all.
  if (context.programHeaders.empty()) return;
  const std::vector<uint32_t> segments =
      findSegments(context.sectionHeaders, context.programHeaders, context.module.getOsAbi());
  for (uint32_t i = 0; i < context.getSectionCount(); ++i) {
    if (segments[i] == NoExtent) continue;
    const uint64_t distance =
        context.sectionHeaders[i].offset - context.programHeaders[segments[i]].offset;
    tie(*context.module.getSegment(segments[i]), *context.module.getSection(i), distance);
  }
}

void createRawDataBlocks(ReadContext& context) {
  for (const SegmentGap& gap : context.gaps) {
    Segment* segment = context.module.getSegment(gap.segment);
    RawDataBlock* block = context.module.createRawDataBlock(segment, gap.end - gap.start);
    block->setFileOffset(gap.start);
    // The bytes stay in the image: a gap may be as large as the file.
    ModuleBuilder::getBuffer(*block).defer(context.image, gap.start, gap.end - gap.start);
    const uint64_t distance = gap.start - context.programHeaders[gap.segment].offset;
    tie(*segment, *block, distance);
  }
}

} // namespace

void placeRegions(ReadContext& context) {
  createSegments(context);
  placeHeaderTables(context);
  RegionList regions(context);
  tieOverlappingRegions(regions.get());
  tieSectionsWithoutBytes(context);
  createRawDataBlocks(context);
}

} // namespace elfext
