// SPDX-License-Identifier: Apache-2.0
//
// Where everything lies in the file: sections must not overlap, and the bytes of segments that
// belong to nothing else must be there.
//
// Overlaps have been found from the headers already; here is their place in the order of reports.
// Gaps become blocks of raw data in a model, and padding or data in the sizes. A hostile file has
// ten thousand segments over the same bytes, or ones that end beyond all numbers: the sweep sorts
// the ends once and asks at each which segments are open, and what it answers with has been
// compared with the image.
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/sort.h"
#include "elfext/src/bytes/extents.h"
#include "elfext/src/tables/object_tables.h"

#include <algorithm>
#include <set>

namespace elfext {

namespace {

// All that has bytes in the file and is no segment.
std::vector<Extent> getOccupiedExtents(const ObjectTables& tables) {
  std::vector<Extent> extents;
  const auto add = [&extents](uint64_t offset, uint64_t size) {
    if (size != 0) extents.push_back({offset, endOf(offset, size), NoExtent});
  };
  for (const SectionHeader& header : tables.sectionHeaders) {
    if (hasFileBytes(header)) add(header.offset, header.size);
  }
  const FileHeader& header = tables.fileHeader;
  add(0, header.ehsize);
  add(header.shoff, uint64_t{header.shentsize} * tables.getSectionCount());
  // In an object still to be linked this table has no place.
  if (header.type != ET_REL)
    add(header.phoff, uint64_t{header.phentsize} * tables.getSegmentCount());
  return extents;
}

// Sweeps over the file and finds the stretches that only segments cover.
class GapFinder {
public:
  GapFinder(ObjectTables& tables, std::span<const Extent> others) : m_Tables(tables) {
    for (uint32_t i = 0; i < tables.getSegmentCount(); ++i) {
      const ProgramHeader& header = tables.programHeaders[i];
      if (header.filesz != 0) addEvents({header.offset, endOf(header.offset, header.filesz), i});
    }
    for (const Extent& other : others)
      addEvents(other);
    // All events at one place are taken before the stretch behind it is looked at.
    const auto comesFirst = [](const Event& left, const Event& right) {
      return left.offset < right.offset;
    };
    smoothSort(std::span(m_Events), comesFirst);
  }

  bool find() {
    // First, as its end would be cut to the largest number, and look as if it were there.
    if (hasEndlessSegment())
      return mapLowLevelResult(m_Tables.reporter, LowLevelResult::OutsideImage);
    for (size_t i = 0; i < m_Events.size();) {
      const uint64_t start = m_Events[i].offset;
      for (; i < m_Events.size() && m_Events[i].offset == start; ++i)
        take(m_Events[i]);
      // Behind the last event everything is closed, so there is a next one.
      const bool isGap = hasOpenSegment() && m_OpenOthers == 0;
      if (isGap && !addGap(start, m_Events[i].offset)) return false;
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
        m_Tables.programHeaders.begin(), m_Tables.programHeaders.end(),
        [](const ProgramHeader& header) { return header.filesz > UINT64_MAX - header.offset; });
  }

  void addEvents(const Extent& extent) {
    m_Events.push_back({extent.start, extent.id, false});
    m_Events.push_back({extent.end, extent.id, true});
  }

  // Open segments by how welcome their bytes are; within each set the first one counts. Sets, as
  // ten thousand segments may be open at once and close in any order.
  [[nodiscard]] std::set<uint32_t>& setOf(uint32_t segment) {
    if (m_Tables.isSegmentThere[segment]) return m_OpenThere;
    return m_Tables.programHeaders[segment].type == PT_LOAD ? m_OpenLoads : m_OpenOtherSegments;
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
    const ProgramHeader& header = m_Tables.programHeaders[segment];
    if (m_Tables.isSegmentThere[segment]) return true;
    if (!m_Tables.image.contains(header.offset, header.filesz))
      return mapLowLevelResult(m_Tables.reporter, LowLevelResult::OutsideImage);
    // It changes sets when it becomes one of those that are there.
    setOf(segment).erase(segment);
    m_Tables.isSegmentThere[segment] = true;
    setOf(segment).insert(segment);
    return true;
  }

  bool addGap(uint64_t start, uint64_t end) {
    const uint32_t index = chooseSegment();
    if (!requireSegment(index)) return false;
    const ProgramHeader& header = m_Tables.programHeaders[index];
    // Its own close event is at its end, and no gap goes beyond the next event.
    QUARN_ASSERT(1, end - header.offset <= header.filesz);
    m_Tables.gaps.push_back({index, start, end});
    return true;
  }

  ObjectTables& m_Tables;
  std::vector<Event> m_Events;
  std::set<uint32_t> m_OpenThere;
  std::set<uint32_t> m_OpenLoads;
  std::set<uint32_t> m_OpenOtherSegments;
  int64_t m_OpenOthers = 0;
};

} // namespace

bool checkPlacement(ObjectTables& tables) {
  if (tables.overlap)
    return stop(tables.reporter, &ErrorHandler::sectionsOverlap, tables.overlap->first,
                tables.overlap->second);
  return tables.programHeaders.empty() || GapFinder(tables, getOccupiedExtents(tables)).find();
}

} // namespace elfext
