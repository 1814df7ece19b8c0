// SPDX-License-Identifier: Apache-2.0
//
// Two tables of this system's own: the records of debug overlay sections, and the note that maps
// sections to segments.
//
// A note is namesz, descsz and type as words, then the owner's name and the descriptor, both padded
// to words (Elf_Nhdr). Sizes are 32 bits and the sums 64, so a note that claims 4 GiB ends the walk
// and wraps nothing. Rows of an overlay section have the size that sh_entsize says: rows too small
// for their record, with which they would reach beyond the section, are passed over as a whole.
#include "elfext/interface/debug_section_name.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/src/tables/object_tables.h"

#include <algorithm>
#include <cstring>
#include <optional>
#include <span>
#include <vector>

namespace elfext {

namespace {

// A record is a word of the class's width, then two section indexes: as words if there is room for
// them in the row, else as half words.
DebugOverlayRow getOverlayRecord(const ObjectTables& tables, const uint8_t* row, uint64_t rowSize) {
  const uint32_t wordSize = tables.format.isWide ? 8 : 4;
  const uint8_t* indexes = row + wordSize;
  const uint64_t word =
      tables.format.isWide ? tables.get<uint64_t>(row) : tables.get<uint32_t>(row);
  if (rowSize - wordSize >= 8)
    return {word, tables.get<uint32_t>(indexes), tables.get<uint32_t>(indexes + 4)};
  return {word, tables.get<uint16_t>(indexes), tables.get<uint16_t>(indexes + 2)};
}

bool checkOverlayRecord(ObjectTables& tables, uint32_t index, uint64_t number,
                        const DebugOverlayRow& record) {
  if (record.debugSection >= tables.getSectionCount())
    return goOn(tables.reporter, &ErrorHandler::overlayOfNoSection, number, index,
                record.debugSection);
  // Names have been checked, so a section's name ends in its table.
  if (!isDebugSectionName(tables.nameOf(record.debugSection)))
    return goOn(tables.reporter, &ErrorHandler::overlayOfOtherSection, number, index,
                record.debugSection);
  if (record.section >= tables.getSectionCount())
    return goOn(tables.reporter, &ErrorHandler::overlayOfNoSection, number, index, record.section);
  tables.debugOverlayRows.push_back(record);
  return true;
}

bool checkDebugOverlay(ObjectTables& tables, uint32_t index) {
  const SectionHeader& header = tables.sectionHeaders[index];
  // The word and two half words. Also keeps the division below from one by 0.
  const uint64_t smallestRow = tables.format.isWide ? 12 : 8;
  if (header.entsize < smallestRow || header.size < header.entsize) return true;
  const uint8_t* bytes = tables.viewSection(index);
  if (bytes == nullptr) return false;
  const uint64_t count = header.size / header.entsize;
  for (uint64_t i = 0; i < count; ++i) {
    const uint8_t* row = bytes + i * header.entsize;
    const DebugOverlayRow record = getOverlayRecord(tables, row, header.entsize);
    if (!checkOverlayRecord(tables, index, i, record)) return false;
  }
  return true;
}

// A header and one word of name or descriptor: what is smaller at a section's end is padding.
constexpr uint64_t SmallestNote = 16;
constexpr uint64_t NoteHeaderSize = 12;
constexpr uint32_t SegmentMapNote = 0x40000000;
constexpr char SegmentMapOwner[] = "ZEV";

uint64_t roundUpToWord(uint64_t size) {
  return (size + 3) & ~uint64_t{3};
}

// The indexes of the SHF_ALLOC sections. They are looked for once: there may be maps by the
// thousand.
std::vector<uint32_t> findAllocatedSections(const ObjectTables& tables) {
  std::vector<uint32_t> sections;
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if ((tables.sectionHeaders[i].flags & SHF_ALLOC) != 0) sections.push_back(i);
  }
  return sections;
}

// One word for each SHF_ALLOC section, in index order: the number of its segment. A word that is
// missing counts as 0.
bool checkSegmentMap(ObjectTables& tables, uint32_t noteSection,
                     std::span<const uint32_t> allocated, const uint8_t* words, uint64_t count) {
  const auto sectionCount = static_cast<uint32_t>(allocated.size());
  // Of several notes the last one counts, section by section.
  tables.notedSegments.resize(tables.getSectionCount(), NoSegment);
  for (uint32_t i = 0; i < sectionCount; ++i) {
    const uint32_t segment = i < count ? tables.get<uint32_t>(words + uint64_t{i} * 4) : 0;
    if (segment < tables.getSegmentCount())
      tables.notedSegments[allocated[i]] = segment;
    else if (!goOn(tables.reporter, &ErrorHandler::segmentMapOutOfRange, noteSection, allocated[i],
                   segment))
      return false;
  }
  return count == sectionCount || goOn(tables.reporter, &ErrorHandler::segmentMapCountDiffers,
                                       noteSection, count, sectionCount);
}

bool checkNotes(ObjectTables& tables, uint32_t index, std::span<const uint32_t> allocated) {
  const uint64_t size = tables.sectionHeaders[index].size;
  const uint8_t* bytes = tables.viewSection(index);
  if (bytes == nullptr) return false;
  uint64_t pos = 0;
  while (size - pos >= SmallestNote) {
    const auto nameSize = tables.get<uint32_t>(bytes + pos);
    const auto descriptorSize = tables.get<uint32_t>(bytes + pos + 4);
    const auto type = tables.get<uint32_t>(bytes + pos + 8);
    const uint8_t* name = bytes + pos + NoteHeaderSize;
    const uint64_t descriptor = pos + NoteHeaderSize + roundUpToWord(nameSize);
    // What follows a note that leaves its section can't be found, and is not missed.
    if (descriptor > size) return true;
    const uint64_t length = std::min<uint64_t>(descriptorSize, size - descriptor);
    const bool isSegmentMap = nameSize == sizeof SegmentMapOwner && type == SegmentMapNote &&
                              std::memcmp(name, SegmentMapOwner, nameSize) == 0;
    if (isSegmentMap && !checkSegmentMap(tables, index, allocated, bytes + descriptor, length / 4))
      return false;
    const uint64_t padded = roundUpToWord(descriptorSize);
    if (padded > size - descriptor) return true;
    pos = descriptor + padded;
  }
  return true;
}

} // namespace

bool checkDebugOverlays(ObjectTables& tables) {
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (tables.typeOf(i) == SHT_ZEV_DEBUGOVERLAY && !checkDebugOverlay(tables, i)) return false;
  }
  return true;
}

bool checkSegmentMaps(ObjectTables& tables) {
  // Made for the first section that may have notes: most objects have none.
  std::optional<std::vector<uint32_t>> allocated;
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (tables.typeOf(i) != SHT_NOTE || tables.sectionHeaders[i].size < SmallestNote) continue;
    if (!allocated) allocated = findAllocatedSections(tables);
    if (!checkNotes(tables, i, *allocated)) return false;
  }
  return true;
}

} // namespace elfext
