// SPDX-License-Identifier: Apache-2.0
//
// Dynamic sections, the version sections that they count and the preemption maps that they point
// to. Only bytes that can't be had are reported here: what makes no sense is passed over.
//
// Elf32_Dyn and Elf64_Dyn are pairs of d_tag and d_val. Everything in them is a claim of the file
// about other sections: counts of version records, addresses of maps. None is a reason to reject a
// file, so what can't be followed is dropped, and each string table is only asked to be there. A
// thousand dynamic sections that claim the same map, or overlap it, cost one look each: values are
// kept once, and places are searched for together.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/extents.h"
#include "elfext/src/tables/object_tables.h"

#include <set>

namespace elfext {

namespace {

std::vector<DynamicTag> getTags(const ObjectTables& tables, const uint8_t* bytes, uint64_t size) {
  const uint64_t fieldSize = tables.format.isWide ? 8 : 4;
  std::vector<DynamicTag> tags;
  // By subtraction: a section may end in the middle of a pair.
  for (uint64_t pos = 0; size - pos >= 2 * fieldSize; pos += 2 * fieldSize) {
    // In class 2 each is the first word of its 8-byte field, in either byte order.
    const DynamicTag tag = {tables.get<uint32_t>(bytes + pos),
                            tables.get<uint32_t>(bytes + pos + fieldSize)};
    if (tag.tag == DT_NULL) break;
    tags.push_back(tag);
  }
  return tags;
}

// The strings that a section with dynamic data names; none is fine. False after a report.
bool checkStrings(ObjectTables& tables, uint32_t section) {
  const std::optional<uint32_t> table = tables.stringTableOf(section);
  return !table || tables.viewSection(*table) != nullptr;
}

std::optional<uint32_t> findLast(const ObjectTables& tables, uint32_t type) {
  // The last one counts where there are several.
  for (uint32_t i = tables.getSectionCount(); i > 0; --i) {
    if (tables.typeOf(i - 1) == type) return i - 1;
  }
  return std::nullopt;
}

// What a dynamic section says of the version sections; a count that is not there means that there
// should be no such section.
struct VersionCounts {
  std::optional<uint32_t> definitions = {};
  std::optional<uint32_t> requirements = {};
};

// The version sections, unless they and the dynamic section don't agree.
std::optional<VersionTables> findVersions(const ObjectTables& tables, const VersionCounts& counts) {
  VersionTables versions = {.definitions = findLast(tables, SHT_GNU_verdef),
                            .requirements = findLast(tables, SHT_GNU_verneed),
                            .symbolVersions = findLast(tables, SHT_GNU_versym),
                            .dynamicSymbols = findLast(tables, SHT_DYNSYM),
                            .definitionCount = counts.definitions.value_or(0),
                            .requirementCount = counts.requirements.value_or(0)};
  if (counts.definitions.has_value() != versions.definitions.has_value()) return std::nullopt;
  if (counts.requirements.has_value() != versions.requirements.has_value()) return std::nullopt;
  // Two bytes a symbol. With another count there is no telling which word is whose.
  if (versions.symbolVersions && versions.dynamicSymbols &&
      tables.sectionHeaders[*versions.symbolVersions].size / 2 !=
          tables.rowCount(*versions.dynamicSymbols))
    return std::nullopt;
  return versions;
}

// The same for the records of a version section and their strings.
bool checkRecords(ObjectTables& tables, std::optional<uint32_t> section) {
  if (!section || tables.sectionHeaders[*section].size == 0) return true;
  return tables.viewSection(*section) != nullptr && checkStrings(tables, *section);
}

bool checkVersions(ObjectTables& tables, const VersionCounts& counts) {
  tables.versions = findVersions(tables, counts);
  if (!tables.versions) return true;
  const VersionTables& versions = *tables.versions;
  if (!checkRecords(tables, versions.definitions)) return false;
  if (!versions.symbolVersions) return true;
  if (!checkRecords(tables, versions.requirements)) return false;
  return !versions.dynamicSymbols || tables.rowCount(*versions.dynamicSymbols) == 0 ||
         tables.viewSection(*versions.symbolVersions) != nullptr;
}

// Where a dynamic section says that a preemption map is.
struct MapValue {
  uint64_t value;
  uint32_t dynamicSection;
};

class PreemptionMapFinder {
public:
  explicit PreemptionMapFinder(ObjectTables& tables)
      : m_Tables(tables), m_AreFileOffsets(tables.fileHeader.machine == EM_ZEV &&
                                           tables.fileHeader.ident[EI_OSABI] == ELFOSABI_ZEV) {}

  bool find(std::span<const MapValue> values) {
    if (values.empty()) return true;
    std::vector<Extent> places;
    for (const MapValue& value : values)
      places.push_back({value.value, value.value + 1, 0});
    const std::vector<uint32_t> sections = findFirstHolders(getExtents(), places);
    for (size_t i = 0; i < values.size(); ++i) {
      // No section at that place means no map.
      if (sections[i] != NoExtent && !addMap(sections[i], values[i])) return false;
    }
    return true;
  }

private:
  // Values are places in the file for the system that has them so, else addresses.
  [[nodiscard]] uint64_t startOf(const SectionHeader& header) const {
    return m_AreFileOffsets ? header.offset : header.addr;
  }

  [[nodiscard]] std::vector<Extent> getExtents() const {
    std::vector<Extent> extents;
    for (uint32_t i = 0; i < m_Tables.getSectionCount(); ++i) {
      const SectionHeader& header = m_Tables.sectionHeaders[i];
      if (header.type == SHT_NULL || (m_AreFileOffsets && header.type == SHT_NOBITS)) continue;
      extents.push_back({startOf(header), endOf(startOf(header), header.size), i});
    }
    return extents;
  }

  bool addMap(uint32_t section, const MapValue& value) {
    const SectionHeader& header = m_Tables.sectionHeaders[section];
    if (!hasFileBytes(header)) return true;
    if (m_Tables.viewSection(section) == nullptr) return false;
    if (!checkStrings(m_Tables, value.dynamicSection)) return false;
    m_Tables.preemptionMaps.push_back(
        // The section holds the value, so this lies within it.
        {section, value.value - startOf(header), value.dynamicSection});
    return true;
  }

  ObjectTables& m_Tables;
  bool m_AreFileOffsets;
};

class DynamicWalk {
public:
  explicit DynamicWalk(ObjectTables& tables) : m_Tables(tables) {}

  bool takeSection(uint32_t index) {
    const SectionHeader& header = m_Tables.sectionHeaders[index];
    if (header.size == 0) return true;
    const uint8_t* bytes = m_Tables.viewSection(index);
    if (bytes == nullptr || !checkStrings(m_Tables, index)) return false;
    DynamicTable table = {index, getTags(m_Tables, bytes, header.size)};
    VersionCounts counts;
    for (const DynamicTag& tag : table.tags)
      takeTag(index, tag, counts);
    m_Tables.dynamicTables.push_back(std::move(table));
    // There is one set of version sections, and what it says is said once.
    return m_Tables.versions || checkVersions(m_Tables, counts);
  }

  bool takeMaps() { return PreemptionMapFinder(m_Tables).find(m_Maps); }

private:
  void takeTag(uint32_t index, const DynamicTag& tag, VersionCounts& counts) {
    if (tag.tag == DT_VERDEFNUM && !counts.definitions) counts.definitions = tag.value;
    if (tag.tag == DT_VERNEEDNUM && !counts.requirements) counts.requirements = tag.value;
    if (tag.tag == DT_ZEV_PREEMPTMAP && m_MapValues.insert(tag.value).second)
      m_Maps.push_back({tag.value, index});
  }

  ObjectTables& m_Tables;
  // Each value once: maps can be many and large, and reading one twice tells nothing new.
  std::set<uint64_t> m_MapValues;
  std::vector<MapValue> m_Maps;
};

} // namespace

bool checkDynamicSections(ObjectTables& tables) {
  DynamicWalk walk(tables);
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (tables.typeOf(i) != SHT_DYNAMIC || tables.isBroken(i)) continue;
    if (!walk.takeSection(i)) return false;
  }
  return walk.takeMaps();
}

} // namespace elfext
