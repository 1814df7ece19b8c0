// SPDX-License-Identifier: Apache-2.0
//
// Reports name a relocation by the section and row that it stands in, which the model no longer
// says: objects only know the section that they came from, and may have changed their kind since.
// So rows are counted anew, in one walk over the target's list, as a writer of the module would
// deal them out.
#include "elfext/src/validation/relocation_places.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/relocation.h"

#include <array>
#include <unordered_map>

namespace elfext {

namespace {

class PlaceFinder {
public:
  explicit PlaceFinder(const Section& target) {
    noteFirst(target.getStaticRelocationSections());
    noteFirst(target.getDynamicRelocationSections());
  }

  RelocationPlace take(const Relocation& relocation, uint32_t index) {
    const RelocationSection* section = findSection(relocation);
    // A row count for each section that comes up; never walked through, so the order of addresses
    // shows nowhere.
    return {section, section == nullptr ? index : m_RowCounts[section]++};
  }

private:
  static size_t kindOf(bool isDynamic, bool hasAddends) {
    return (isDynamic ? 2 : 0) + (hasAddends ? 1 : 0);
  }
  static size_t kindOf(const RelocationSection& section) {
    return kindOf(section.isDynamic(), section.hasAddends());
  }

  void noteFirst(std::span<RelocationSection* const> sections) {
    for (const RelocationSection* section : sections) {
      // A section holds rows of one kind: static or dynamic, with addends or without.
      const RelocationSection*& first = m_FirstOfKind[kindOf(*section)];
      if (first == nullptr) first = section;
    }
  }

  [[nodiscard]] const RelocationSection* findSection(const Relocation& relocation) const {
    const size_t kind = kindOf(relocation.isDynamic(), relocation.hasAddend());
    const RelocationSection* origin = relocation.getOrigin();
    const bool isAtOrigin = origin != nullptr && origin->getTarget() == relocation.getSection() &&
                            kindOf(*origin) == kind;
    return isAtOrigin ? origin : m_FirstOfKind[kind];
  }

  std::array<const RelocationSection*, 4> m_FirstOfKind = {};
  std::unordered_map<const RelocationSection*, uint32_t> m_RowCounts;
};

} // namespace

std::vector<RelocationPlace> findRelocationPlaces(Section& target) {
  std::vector<RelocationPlace> places;
  const uint32_t count = target.getRelocationCount();
  if (count == 0) return places;
  places.reserve(count);
  PlaceFinder finder(target);
  for (uint32_t i = 0; i < count; ++i)
    places.push_back(finder.take(*target.getRelocation(i), i));
  return places;
}

} // namespace elfext
