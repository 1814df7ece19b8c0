// SPDX-License-Identifier: Apache-2.0
//
// Symbol versions. The version definition and requirement sections are chains of records that tell
// the distance to the next one; the version symbol section has a word for each dynamic symbol. The
// chains end at the section's end, at a distance of 0, or when the told count is used up; what is
// wrong in them is never reported.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/file_version_definition.h"
#include "elfext/src/dynamic_strings.h"
#include "elfext/src/object_module_reader.h"

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

bool openSection(ReadContext& context, const Section* section, RecordSection& records) {
  records.size = section->getSize();
  if (records.size == 0) return true;
  records.bytes = context.viewSection(section->getIndex());
  return records.bytes != nullptr && records.strings.open(context, section->getLink());
}

class VersionReader {
public:
  explicit VersionReader(ReadContext& context) : m_Context(context) {}

  bool readDefinitions(const Section* section, uint32_t count) {
    RecordSection records;
    if (!openSection(m_Context, section, records)) return false;
    const uint64_t most = std::min<uint64_t>(count, records.size / VerdefSize);
    uint64_t pos = 0;
    for (uint64_t i = 0; i < most && records.contains(pos, VerdefSize); ++i) {
      readDefinition(records, pos);
      const uint32_t next = word(records, pos + 16);
      if (next == 0) break;
      pos += next;
    }
    return true;
  }

  bool readRequirements(const Section* section, uint32_t count) {
    RecordSection records;
    if (!openSection(m_Context, section, records)) return false;
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
    return true;
  }

  // Gives each dynamic symbol the version that its word means.
  bool apply(const Section* versym, std::span<Symbol* const> symbols) {
    if (symbols.empty()) return true;
    const uint8_t* words = m_Context.viewSection(versym->getIndex());
    if (words == nullptr) return false;
    for (size_t i = 1; i < symbols.size(); ++i)
      applyTo(*symbols[i], m_Context.get<uint16_t>(words + 2 * i));
    return true;
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
      m_Definitions.emplace(index, definition);
  }

  void readFile(const RecordSection& records, uint64_t pos) {
    const uint32_t count = half(records, pos + 2);
    const char* fileName = records.strings.get(word(records, pos + 4));
    uint64_t entry = pos + word(records, pos + 8);
    for (uint32_t i = 0; i < count && records.contains(entry, VernauxSize); ++i) {
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
    if (version <= VER_NDX_GLOBAL) return;
    const auto definition = m_Definitions.find(version);
    const auto requirement = m_Requirements.find(version);
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

template <class SectionClass>
const SectionClass* lastOf(std::span<SectionClass* const> sections) {
  return sections.empty() ? nullptr : sections.back();
}

} // namespace

bool readVersions(ReadContext& context, const VersionCounts& counts, bool& areVersionsRead) {
  const ObjectModule& module = context.module;
  const auto* verdef = lastOf(module.getVerdefSections());
  const auto* verneed = lastOf(module.getVerneedSections());
  const auto* versym = lastOf(module.getVersymSections());
  const auto* dynsym = lastOf(module.getDynsymSections());
  if (counts.definitions.has_value() != (verdef != nullptr)) return true;
  if (counts.requirements.has_value() != (verneed != nullptr)) return true;
  if (versym != nullptr && dynsym != nullptr &&
      versym->getSize() / 2 != context.rowCount(dynsym->getIndex()))
    return true;
  areVersionsRead = true;
  VersionReader reader(context);
  if (verdef != nullptr && !reader.readDefinitions(verdef, *counts.definitions)) return false;
  if (versym == nullptr) return true;
  if (verneed != nullptr && !reader.readRequirements(verneed, *counts.requirements)) return false;
  return dynsym == nullptr || reader.apply(versym, context.symbols[dynsym->getIndex()]);
}

} // namespace elfext
