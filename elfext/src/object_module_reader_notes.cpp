// SPDX-License-Identifier: Apache-2.0
//
// Two tables of this system's own: the records of debug overlay sections, and the note that maps
// sections to segments.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/debug_section_name.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/src/object_module_reader.h"

#include <algorithm>
#include <cstring>
#include <span>
#include <vector>

namespace elfext {

namespace {

// A record is a word of the class's width, then two section indexes: as words if there is room for
// them in the row, else as half words.
struct OverlayRecord {
  uint64_t word;
  uint32_t debugSection;
  uint32_t section;
};

OverlayRecord getOverlayRecord(const ReadContext& context, const uint8_t* row, uint64_t rowSize) {
  const uint32_t wordSize = context.format.isWide ? 8 : 4;
  const uint8_t* indexes = row + wordSize;
  const uint64_t word =
      context.format.isWide ? context.get<uint64_t>(row) : context.get<uint32_t>(row);
  if (rowSize - wordSize >= 8)
    return {word, context.get<uint32_t>(indexes), context.get<uint32_t>(indexes + 4)};
  return {word, context.get<uint16_t>(indexes), context.get<uint16_t>(indexes + 2)};
}

bool readOverlayRecord(ReadContext& context, uint32_t index, uint64_t number,
                       const OverlayRecord& record) {
  ObjectModule& module = context.module;
  if (record.debugSection >= context.sectionCount())
    return goOn(module, &ErrorHandler::overlayOfNoSection, number, index, record.debugSection);
  Section* debugSection = module.getSection(record.debugSection);
  if (!isDebugSectionName(debugSection->getName()))
    return goOn(module, &ErrorHandler::overlayOfOtherSection, number, index, record.debugSection);
  if (record.section >= context.sectionCount())
    return goOn(module, &ErrorHandler::overlayOfNoSection, number, index, record.section);
  module.addDebugOverlayRecord({record.word, debugSection, module.getSection(record.section)});
  return true;
}

bool readDebugOverlay(ReadContext& context, uint32_t index) {
  const SectionHeader& header = context.sectionHeaders[index];
  const uint64_t smallestRow = context.format.isWide ? 12 : 8;
  if (header.entsize < smallestRow || header.size < header.entsize) return true;
  const uint8_t* bytes = context.viewSection(index);
  if (bytes == nullptr) return false;
  const uint64_t count = header.size / header.entsize;
  for (uint64_t i = 0; i < count; ++i) {
    const uint8_t* row = bytes + i * header.entsize;
    const OverlayRecord record = getOverlayRecord(context, row, header.entsize);
    if (!readOverlayRecord(context, index, i, record)) return false;
  }
  return true;
}

constexpr uint64_t SmallestNote = 16;
constexpr uint64_t NoteHeaderSize = 12;
constexpr uint32_t SegmentMapNote = 0x40000000;
constexpr char SegmentMapOwner[] = "ZEV";

uint64_t roundUpToWord(uint64_t size) {
  return (size + 3) & ~uint64_t{3};
}

// The indexes of the SHF_ALLOC sections. They are looked for once: there may be maps by the
// thousand.
std::vector<uint32_t> findAllocatedSections(const ReadContext& context) {
  std::vector<uint32_t> sections;
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if ((context.sectionHeaders[i].flags & SHF_ALLOC) != 0) sections.push_back(i);
  }
  return sections;
}

// One word for each SHF_ALLOC section, in index order: the number of its segment. A word that is
// missing counts as 0.
bool readSegmentMap(ReadContext& context, uint32_t noteSection, std::span<const uint32_t> allocated,
                    const uint8_t* words, uint64_t count) {
  const auto sectionCount = static_cast<uint32_t>(allocated.size());
  for (uint32_t i = 0; i < sectionCount; ++i) {
    const uint32_t segment = i < count ? context.get<uint32_t>(words + uint64_t{i} * 4) : 0;
    if (segment < context.segmentCount())
      context.module.getSection(allocated[i])->setSegment(context.module.getSegment(segment));
    else if (!goOn(context.module, &ErrorHandler::segmentMapOutOfRange, noteSection, allocated[i],
                   segment))
      return false;
  }
  return count == sectionCount || goOn(context.module, &ErrorHandler::segmentMapCountDiffers,
                                       noteSection, count, sectionCount);
}

bool readNotes(ReadContext& context, uint32_t index, std::span<const uint32_t> allocated) {
  const uint64_t size = context.sectionHeaders[index].size;
  const uint8_t* bytes = context.viewSection(index);
  if (bytes == nullptr) return false;
  uint64_t pos = 0;
  while (size - pos >= SmallestNote) {
    const auto nameSize = context.get<uint32_t>(bytes + pos);
    const auto descriptorSize = context.get<uint32_t>(bytes + pos + 4);
    const auto type = context.get<uint32_t>(bytes + pos + 8);
    const uint8_t* name = bytes + pos + NoteHeaderSize;
    const uint64_t descriptor = pos + NoteHeaderSize + roundUpToWord(nameSize);
    if (descriptor > size) return true;
    const uint64_t length = std::min<uint64_t>(descriptorSize, size - descriptor);
    const bool isSegmentMap = nameSize == sizeof SegmentMapOwner && type == SegmentMapNote &&
                              std::memcmp(name, SegmentMapOwner, nameSize) == 0;
    if (isSegmentMap && !readSegmentMap(context, index, allocated, bytes + descriptor, length / 4))
      return false;
    const uint64_t padded = roundUpToWord(descriptorSize);
    if (padded > size - descriptor) return true;
    pos = descriptor + padded;
  }
  return true;
}

} // namespace

bool readDebugOverlays(ReadContext& context) {
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (context.typeOf(i) == SHT_ZEV_DEBUGOVERLAY && !readDebugOverlay(context, i)) return false;
  }
  return true;
}

bool readSegmentMaps(ReadContext& context) {
  const std::vector<uint32_t> allocated = findAllocatedSections(context);
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    const bool hasNotes =
        context.typeOf(i) == SHT_NOTE && context.sectionHeaders[i].size >= SmallestNote;
    if (hasNotes && !readNotes(context, i, allocated)) return false;
  }
  return true;
}

} // namespace elfext
