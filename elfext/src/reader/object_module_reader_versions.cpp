// SPDX-License-Identifier: Apache-2.0
//
// Symbol versions. The version definition and requirement sections are chains of records that tell
// the distance to the next one; the version symbol section has a word for each dynamic symbol. The
// chains end at the section's end, at a distance of 0, or when the told count is used up; what is
// wrong in them is never reported.
//
// The records are Elf_Verdef and Elf_Verdaux, Elf_Verneed and Elf_Vernaux, of equal layout in both
// classes. Counts, distances and names are claims: each record is held against the section before
// it is looked at, and the number of records that all walks take together is bounded by the
// section's size, as chains may run into one another.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/file_version_definition.h"
#include "elfext/src/reader/dynamic_strings.h"
#include "elfext/src/reader/object_module_reader.h"

#include <algorithm>
#include <map>

namespace elfext {

namespace {

constexpr uint32_t VerdefSize = 20;
constexpr uint32_t VerdauxSize = 8;
constexpr uint32_t VerneedSize = 16;
constexpr uint32_t VernauxSize = 16;
// Versions of this number and below mean no version.
constexpr uint32_t VER_NDX_GLOBAL = 1;

struct Requirement {
  const char* versionName;
  const char* fileName;
};

// A section of records, with the table that their names are in.
struct RecordSection {
  const uint8_t* bytes = nullptr;
  uint64_t size = 0;
  DynamicStrings strings = {};

  [[nodiscard]] bool contains(uint64_t offset, uint64_t count) const {
    return offset <= size && count <= size - offset;
  }
};

RecordSection openSection(ReadContext& context, uint32_t section) {
  const uint64_t size = context.sectionHeaders[section].size;
  if (size == 0) return {};
  return {context.viewSection(section), size, DynamicStrings(context, section)};
}

class VersionReader {
public:
  explicit VersionReader(ReadContext& context) : m_Context(context) {}

  void readDefinitions(uint32_t section, uint32_t count) {
    const RecordSection records = openSection(m_Context, section);
    const uint64_t most = std::min<uint64_t>(count, records.size / VerdefSize);
    uint64_t pos = 0;
    for (uint64_t i = 0; i < most && records.contains(pos, VerdefSize); ++i) {
      readDefinition(records, pos);
      // vd_next counts from this record, so a chain only goes forward.
      const uint32_t next = word(records, pos + 16);
      if (next == 0) break;
      pos += next;
    }
  }

  void readRequirements(uint32_t section, uint32_t count) {
    const RecordSection records = openSection(m_Context, section);
    // Chains that share records, which no good file has, would be walked again and again.
    m_RecordsLeft = records.size / VernauxSize;
    const uint64_t most = std::min<uint64_t>(count, records.size / VerneedSize);
    uint64_t pos = 0;
    for (uint64_t i = 0; i < most && records.contains(pos, VerneedSize); ++i) {
      readFile(records, pos);
      const uint32_t next = word(records, pos + 12);
      if (next == 0) break;
      pos += next;
    }
  }

  // Gives each dynamic symbol the version that its word means.
  void apply(uint32_t symbolVersions, std::span<Symbol* const> symbols) {
    const uint8_t* words = symbols.empty() ? nullptr : m_Context.viewSection(symbolVersions);
    // The checks have compared the words' count with that of the symbols.
    for (size_t i = 1; i < symbols.size(); ++i)
      applyTo(*symbols[i], m_Context.get<uint16_t>(words + 2 * i));
  }

private:
  [[nodiscard]] uint16_t half(const RecordSection& records, uint64_t pos) const {
    return m_Context.get<uint16_t>(records.bytes + pos);
  }
  [[nodiscard]] uint32_t word(const RecordSection& records, uint64_t pos) const {
    return m_Context.get<uint32_t>(records.bytes + pos);
  }

  // The first name is the version's own; the others are those of its predecessors.
  void readDefinition(const RecordSection& records, uint64_t pos) {
    // vd_aux, by which the name may be anywhere behind.
    const uint64_t names = pos + word(records, pos + 12);
    const bool hasName = half(records, pos + 6) != 0 && records.contains(names, VerdauxSize);
    const char* name = hasName ? records.strings.get(word(records, names)) : "";
    const uint32_t flags = half(records, pos + 2);
    const uint32_t index = half(records, pos + 4);
    const FileVersionDefinition* definition =
        m_Context.module.createFileVersionDefinition(name, index, flags);
    if ((flags & VER_FLG_BASE) != 0)
      m_Context.module.setFileVersionDefinition(definition);
    else
      // Of several definitions of one index the first one counts; a map, as indexes are any numbers
      // of the file's.
      m_Definitions.emplace(index, definition);
  }

  void readFile(const RecordSection& records, uint64_t pos) {
    const uint32_t count = half(records, pos + 2);
    const char* fileName = records.strings.get(word(records, pos + 4));
    uint64_t entry = pos + word(records, pos + 8);
    for (uint32_t i = 0; i < count && records.contains(entry, VernauxSize); ++i) {
      // As many records as the section has room for: enough for every chain that shares none.
      if (m_RecordsLeft == 0) return;
      --m_RecordsLeft;
      const uint32_t version = half(records, entry + 6) & ~VERSYM_HIDDEN;
      m_Requirements.emplace(version,
                             Requirement{records.strings.get(word(records, entry + 8)), fileName});
      const uint32_t next = word(records, entry + 12);
      if (next == 0) return;
      entry += next;
    }
  }

  void applyTo(Symbol& symbol, uint32_t versionWord) {
    const bool isHidden = (versionWord & VERSYM_HIDDEN) != 0;
    const uint32_t version = versionWord & ~VERSYM_HIDDEN;
    // 0 is local and 1 is global without a version.
    if (version <= VER_NDX_GLOBAL) return;
    const auto definition = m_Definitions.find(version);
    const auto requirement = m_Requirements.find(version);
    // A definition is only for a symbol that is defined here.
    if (definition != m_Definitions.end() && symbol.getCategory() != Symbol::Category_Undefined)
      symbol.setVersionDefinition(definition->second, isHidden);
    else if (requirement != m_Requirements.end())
      symbol.setVersionRequirement(version, requirement->second.versionName,
                                   requirement->second.fileName, isHidden);
  }

  ReadContext& m_Context;
  std::map<uint32_t, const FileVersionDefinition*> m_Definitions;
  std::map<uint32_t, Requirement> m_Requirements;
  uint64_t m_RecordsLeft = 0;
};

} // namespace

void takeVersions(ReadContext& context, const VersionTables& versions) {
  VersionReader reader(context);
  if (versions.definitions) reader.readDefinitions(*versions.definitions, versions.definitionCount);
  if (!versions.symbolVersions) return;
  if (versions.requirements)
    reader.readRequirements(*versions.requirements, versions.requirementCount);
  if (versions.dynamicSymbols)
    reader.apply(*versions.symbolVersions, context.symbols[*versions.dynamicSymbols]);
}

} // namespace elfext
