// SPDX-License-Identifier: Apache-2.0
//
// Which totals a column sums up, and how an object marks the section of its entry point: by a flag
// of our machines' own.
#include "quarn/object_facts.h"

#include "elfext/interface/elf_constants.h"

namespace quarn {

namespace {

constexpr uint32_t EntryFlag = 0x10000000;

} // namespace

ObjectSizes columnsOf(const elfext::SizesStatistics& totals) {
  return {.code = totals.m_Code + totals.m_LiteralPools,
          .readOnlyData = totals.m_RoData + totals.m_InternalPadding,
          .readWriteData = totals.m_RwDataUncompressed,
          .zeroInitialised = totals.m_ZiData,
          .debug = totals.m_DebugInfo};
}

std::vector<const char*> entrySectionsOf(const elfext::ObjectOutline& outline) {
  constexpr uint32_t EntryFlags = elfext::SHF_ALLOC | EntryFlag;
  std::vector<const char*> names;
  for (const elfext::ObjectOutline::OutlinedSection& section : outline.getSections()) {
    if (section.type != elfext::SHT_PROGBITS) continue;
    if ((section.flags & EntryFlags) != EntryFlags) continue;
    names.push_back(section.name == nullptr ? "" : section.name);
  }
  return names;
}

} // namespace quarn
