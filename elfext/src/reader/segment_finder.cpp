// SPDX-License-Identifier: Apache-2.0
//
// Both sections and segments may be many, so they are not held against one another. What the plain
// order comes to is three questions, each for the sections that still have no segment: for the
// first one that ends there, the first one that has offset and addresses, and the first one that
// has the offset.
//
// Offsets, addresses and sizes are the file's and may wrap; ends are cut, or compared as start and
// size.
#include "elfext/src/reader/segment_finder.h"

#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/first_holders.h"
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

namespace {

// Whether a segment is judged by where it lies, or else by where it ends.
bool takesRangeTest(uint32_t segmentType, uint32_t osAbi) {
  switch (segmentType) {
  case PT_LOAD:
  case PT_NOTE:
  case PT_PHDR:
  case PT_TLS:
  case PT_ZEV_EXIDX:
    return true;
  case PT_DYNAMIC:
  case PT_INTERP:
    return osAbi != ELFOSABI_ZEV;
  default:
    return false;
  }
}

bool needsSegment(const SectionHeader& section) {
  return section.type != SHT_NULL && !hasFileBytes(section);
}

enum class Test : uint8_t { EndsThere, HasAddresses, HasOffset };

class SegmentFinder {
public:
  SegmentFinder(std::span<const SectionHeader> sections, std::span<const ProgramHeader> segments,
                uint32_t osAbi)
      : m_Sections(sections), m_Segments(segments), m_OsAbi(osAbi),
        m_Found(sections.size(), NoExtent) {
    for (uint32_t i = 0; i < sections.size(); ++i) {
      if (needsSegment(sections[i])) m_Open.push_back(i);
    }
  }

  // For the sections that have no segment so far.
  void ask(Test test) {
    const std::vector<uint32_t> found = findFirstHolders(makeHolders(test), makeGuests(test));
    for (size_t i = 0; i < found.size(); ++i)
      m_Found[m_Open[i]] = found[i];
    std::erase_if(m_Open, [this](uint32_t section) { return m_Found[section] != NoExtent; });
  }

  [[nodiscard]] std::vector<uint32_t>& getFound() { return m_Found; }

private:
  [[nodiscard]] std::vector<Holder> makeHolders(Test test) const {
    std::vector<Holder> holders;
    for (uint32_t i = 0; i < m_Segments.size(); ++i) {
      const ProgramHeader& segment = m_Segments[i];
      if (takesRangeTest(segment.type, m_OsAbi) == (test == Test::EndsThere)) continue;
      const uint64_t end = endOf(segment.offset, segment.filesz);
      if (test != Test::EndsThere)
        holders.push_back({.firstPlace = segment.offset,
                           .lastPlace = end,
                           .start = test == Test::HasAddresses ? segment.vaddr : 0,
                           .size = segment.memsz,
                           .id = i});
      // Not cut, so that it does end there; and not larger in the file than in memory, which would
      // leave no room but a wrapped one.
      else if (end - segment.offset == segment.filesz && segment.memsz >= segment.filesz)
        holders.push_back({.firstPlace = end,
                           .lastPlace = end,
                           .start = 0,
                           .size = segment.memsz - segment.filesz,
                           .id = i});
    }
    return holders;
  }

  [[nodiscard]] std::vector<Guest> makeGuests(Test test) const {
    std::vector<Guest> guests;
    guests.reserve(m_Open.size());
    for (const uint32_t i : m_Open) {
      const SectionHeader& section = m_Sections[i];
      const uint64_t start = test == Test::HasAddresses ? section.addr : 0;
      // Without addresses all numbers start at 0, and the question is only whether there is room
      // for the size.
      guests.push_back({.place = section.offset, .start = start, .size = section.size});
    }
    return guests;
  }

  std::span<const SectionHeader> m_Sections;
  std::span<const ProgramHeader> m_Segments;
  uint32_t m_OsAbi;
  std::vector<uint32_t> m_Found;
  std::vector<uint32_t> m_Open; // sections that still need a segment
};

} // namespace

std::vector<uint32_t> findSegments(std::span<const SectionHeader> sections,
                                   std::span<const ProgramHeader> segments, uint32_t osAbi) {
  SegmentFinder finder(sections, segments, osAbi);
  // In the order in which the answers win: an end is taken at once, addresses beat a mere offset.
  finder.ask(Test::EndsThere);
  finder.ask(Test::HasAddresses);
  finder.ask(Test::HasOffset);
  return std::move(finder.getFound());
}

} // namespace elfext
