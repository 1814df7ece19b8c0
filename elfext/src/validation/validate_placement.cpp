// SPDX-License-Identifier: Apache-2.0
//
// The checks of how sections and segments lie in the file and in memory.
//
// They are those that a loader counts on: p_offset, p_vaddr, p_filesz, p_memsz and p_align of
// loadable segments, sh_offset, sh_addr and sh_addralign of sections. All may be any 64-bit number,
// so ends are never computed: distances are compared with sizes. Segments and sections by the ten
// thousand are sorted and gone through once; of those gone through only the one that reaches
// farthest is kept.
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/hash_table.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/segment.h"
#include "elfext/interface/sort.h"
#include "elfext/src/reports/go_on.h"
#include "elfext/src/validation/validate.h"

#include <algorithm>
#include <vector>

namespace elfext {

namespace {

using Segments = std::vector<Segment*>;

Segments getSegments(const ObjectModule& module, uint32_t type) {
  Segments segments;
  for (Segment* segment : module.getSegments()) {
    if (segment->getType() == type) segments.push_back(segment);
  }
  return segments;
}

uint64_t offsetOf(const FileRegion& region) {
  uint64_t offset = 0;
  region.getFileExtent(&offset, nullptr);
  return offset;
}

bool isLoadable(const Section& section) {
  return (section.getFlags() & SHF_ALLOC) != 0;
}

// The holders are, by section, the loadable segments that hold them.
bool validateLoadableSections(const ObjectModule& module, const Segments& holders) {
  for (const Section* section : module.getSections()) {
    const bool counts = isLoadable(*section) && section->getSize() != 0;
    if (counts && holders[section->getIndex()] == nullptr &&
        !goOn(module, &ErrorHandler::loadableSectionOutsideSegments, section->getIndex()))
      return false;
  }
  return true;
}

bool validateOtherSections(const ObjectModule& module, const Segments& holders) {
  for (const Section* section : module.getSections()) {
    // Without a byte in the file it takes nothing from the segment.
    if (isLoadable(*section) || section->getFileSize() == 0) continue;
    const Segment* holder = holders[section->getIndex()];
    if (holder != nullptr && !goOn(module, &ErrorHandler::otherSectionInLoadableSegment,
                                   section->getIndex(), holder->getIndex()))
      return false;
  }
  return true;
}

// The segments are in the order of their places in the file.
bool validateMemoryOrder(const ObjectModule& module, const Segments& loads) {
  for (size_t i = 1; i < loads.size(); ++i) {
    if (loads[i - 1]->getVirtualAddress() > loads[i]->getVirtualAddress() &&
        !goOn(module, &ErrorHandler::loadableSegmentsOutOfOrder, loads[i - 1]->getIndex(),
              loads[i]->getIndex()))
      return false;
  }
  return true;
}

// Whether something that starts so far behind the start of another also ends behind it.
bool endsBehind(uint64_t distance, uint64_t size, uint64_t otherSize) {
  return distance >= otherSize || size > otherSize - distance;
}

// Going up by address, it is enough to look at the segment that reaches farthest.
bool validateMemoryOverlap(const ObjectModule& module, Segments loads) {
  std::erase_if(loads, [](const Segment* load) { return load->getMemorySize() == 0; });
  std::stable_sort(loads.begin(), loads.end(), [](const Segment* left, const Segment* right) {
    return left->getVirtualAddress() < right->getVirtualAddress();
  });
  const Segment* farthest = nullptr;
  for (const Segment* load : loads) {
    if (farthest == nullptr) farthest = load;
    const uint64_t distance = load->getVirtualAddress() - farthest->getVirtualAddress();
    // Reports name the lower index first, whatever the addresses.
    const auto [first, second] = std::minmax({farthest->getIndex(), load->getIndex()});
    if (load != farthest && distance < farthest->getMemorySize() &&
        !goOn(module, &ErrorHandler::loadableSegmentsOverlap, first, second))
      return false;
    if (endsBehind(distance, load->getMemorySize(), farthest->getMemorySize())) farthest = load;
  }
  return true;
}

struct PlacedSection {
  uint64_t offset;
  uint64_t size;
  Section* section;
};

std::vector<PlacedSection> getPlacedSections(const ObjectModule& module) {
  std::vector<PlacedSection> placed;
  for (Section* section : module.getSections()) {
    PlacedSection record = {0, 0, section};
    if (section->getFileExtent(&record.offset, &record.size) && record.size != 0)
      placed.push_back(record);
  }
  smoothSort(std::span(placed), [](const PlacedSection& left, const PlacedSection& right) {
    if (left.offset != right.offset) return left.offset < right.offset;
    // A full key, as this sort is not stable: which of two sections at one place is told must not
    // depend on it.
    if (left.size != right.size) return left.size < right.size;
    return left.section->getIndex() < right.section->getIndex();
  });
  return placed;
}

bool validateApart(const ObjectModule& module, Section& left, Section& right) {
  if (!FileRegion::overlap(left, right, nullptr, nullptr, nullptr)) return true;
  const auto [first, second] = std::minmax({left.getIndex(), right.getIndex()});
  return goOn(module, &ErrorHandler::sectionsOverlap, first, second);
}

// Sections whose distance is fixed must not share bytes. Going up by place, it is enough to look
// at the section of each tree that reaches farthest.
bool validateSectionOverlap(const ObjectModule& module) {
  const std::vector<PlacedSection> placed = getPlacedSections(module);
  // Looked up only, so the order of addresses shows nowhere.
  HashTable<PlacementNode*, const PlacedSection*> farthestOfTree;
  for (const PlacedSection& record : placed) {
    uint64_t offsetInTree = 0;
    PlacementNode* tree = record.section->getPlacement().find(&offsetInTree);
    const PlacedSection** farthest = farthestOfTree.find(tree);
    if (farthest == nullptr) {
      farthestOfTree.put(tree, &record);
      continue;
    }
    if (!validateApart(module, *(*farthest)->section, *record.section)) return false;
    if (endsBehind(record.offset - (*farthest)->offset, record.size, (*farthest)->size))
      *farthest = &record;
  }
  return true;
}

bool validateOnlyOne(const ObjectModule& module, const Segments& segments,
                     Report<uint32_t, uint32_t> report) {
  return segments.size() < 2 ||
         goOn(module, report, segments[0]->getIndex(), segments[1]->getIndex());
}

// Segments that tell how to load a file come before what is loaded.
bool validateBeforeLoads(const ObjectModule& module, const Segments& segments,
                         const Segments& loads, Report<uint32_t, uint32_t> report) {
  if (segments.empty() || loads.empty()) return true;
  const uint32_t segment = segments.front()->getIndex();
  const uint32_t load = loads.front()->getIndex();
  // By index: this is an order of the program headers.
  return load > segment || goOn(module, report, load, segment);
}

bool validateHeaderTableSegment(const ObjectModule& module, const Segments& segments) {
  const uint64_t tableSize =
      uint64_t{module.getProgramHeaderEntrySize()} * module.getSegmentCount();
  for (const Segment* segment : segments) {
    if (segment->getFileSize() < tableSize &&
        !goOn(module, &ErrorHandler::headerTableSegmentTooSmall, segment->getIndex(),
              segment->getFileSize(), tableSize))
      return false;
  }
  return true;
}

bool validateCongruence(const ObjectModule& module, const Segments& loads) {
  for (const Segment* load : loads) {
    const uint64_t address = load->getVirtualAddress();
    const uint64_t offset = offsetOf(*load);
    const uint64_t alignment = load->getSegmentAlignment();
    // The loader maps pages: the same remainder in file and memory lets it.
    if (alignment != 0 && (address - offset) % alignment != 0 &&
        !goOn(module, &ErrorHandler::segmentNotCongruent, load->getIndex(), address, offset,
              alignment))
      return false;
  }
  return true;
}

bool validateSectionAlignment(const ObjectModule& module) {
  for (const Section* section : module.getSections()) {
    const uint64_t alignment = section->getAlignment();
    if (isLoadable(*section) && alignment != 0 && section->getAddress() % alignment != 0 &&
        !goOn(module, &ErrorHandler::sectionMisaligned, section->getIndex(), section->getAddress(),
              alignment))
      return false;
  }
  return true;
}

// Headers that the first loadable segment holds take the bytes in front of its first section.
bool validateRoomForHeaders(ObjectModule& module, Segment& load) {
  const uint64_t start = offsetOf(load);
  const uint32_t conditions = module.getReadConditions();
  uint64_t headersEnd = start;
  if ((conditions & ReadCondition_LoadOverlapsElfHeader) != 0)
    headersEnd = std::max<uint64_t>(headersEnd, module.getElfHeaderSize());
  if ((conditions & ReadCondition_LoadOverlapsProgramHeaderTable) != 0)
    headersEnd = std::max(headersEnd, module.getProgramHeaderOffset() +
                                          uint64_t{module.getProgramHeaderEntrySize()} *
                                              module.getSegmentCount());
  uint64_t unmapped = load.getFileSize();
  // A section within the segment starts no earlier than it.
  for (Section* section : module.getSections()) {
    if (section->getFileSize() != 0 && section->isWithin(load))
      unmapped = std::min(unmapped, offsetOf(*section) - start);
  }
  const uint64_t needed = headersEnd - start;
  return unmapped >= needed ||
         goOn(module, &ErrorHandler::noRoomForHeaders, load.getIndex(), unmapped, needed);
}

bool validateLinkedFile(ObjectModule& module) {
  const Segments loads = getSegments(module, PT_LOAD);
  const Segments interpreters = getSegments(module, PT_INTERP);
  const Segments headerTables = getSegments(module, PT_PHDR);
  // For all sections at once.
  const Segments holders = module.findHolders(loads);
  Segments loadsByOffset = loads;
  std::stable_sort(
      loadsByOffset.begin(), loadsByOffset.end(),
      [](const Segment* left, const Segment* right) { return offsetOf(*left) < offsetOf(*right); });
  return validateLoadableSections(module, holders) && validateOtherSections(module, holders) &&
         validateMemoryOrder(module, loadsByOffset) && validateMemoryOverlap(module, loads) &&
         validateSectionOverlap(module) &&
         validateOnlyOne(module, interpreters, &ErrorHandler::secondInterpreterSegment) &&
         validateOnlyOne(module, headerTables, &ErrorHandler::secondHeaderTableSegment) &&
         validateBeforeLoads(module, interpreters, loads,
                             &ErrorHandler::loadableBeforeInterpreter) &&
         validateBeforeLoads(module, headerTables, loads,
                             &ErrorHandler::loadableBeforeHeaderTable) &&
         validateHeaderTableSegment(module, headerTables) && validateCongruence(module, loads) &&
         validateSectionAlignment(module) &&
         (!loads.empty() || goOn(module, &ErrorHandler::noLoadableSegments)) &&
         (loads.empty() || validateRoomForHeaders(module, *loads.front()));
}

} // namespace

bool validatePlacement(ObjectModule& module) {
  if (module.hasLaidOutAddresses()) return validateLinkedFile(module);
  return module.getSegmentCount() == 0 || goOn(module, &ErrorHandler::unexpectedSegments);
}

} // namespace elfext
