// SPDX-License-Identifier: Apache-2.0
//
// Dynamic sections: libraries, search paths, plain values, and the preemption map. Nothing here is
// ever reported: what makes no sense is passed over.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/preemption.h"
#include "elfext/src/dynamic_strings.h"
#include "elfext/src/extents.h"
#include "elfext/src/object_module_reader.h"

#include <set>

namespace elfext {

namespace {

// A tag and its value, of which only the first four bytes count in either class.
struct DynamicTag {
  uint32_t tag;
  uint32_t value;
};

std::vector<DynamicTag> getTags(const ReadContext& context, const uint8_t* bytes, uint64_t size) {
  const uint32_t fieldSize = context.format.isWide ? 8 : 4;
  std::vector<DynamicTag> tags;
  for (uint64_t pos = 0; size - pos >= 2 * fieldSize; pos += 2 * fieldSize) {
    const DynamicTag tag = {context.get<uint32_t>(bytes + pos),
                            context.get<uint32_t>(bytes + pos + fieldSize)};
    if (tag.tag == DT_NULL) break;
    tags.push_back(tag);
  }
  return tags;
}

void takeText(ObjectModule& module, const DynamicTag& tag, const DynamicStrings& strings) {
  if (tag.value == 0) return;
  const char* text = strings.find(tag.value);
  if (text == nullptr) return;
  if (tag.tag == DT_NEEDED)
    module.createNeededLibrary(text);
  else if (tag.tag == DT_SONAME)
    module.setSoname(text);
  else
    module.createLibrarySearchPath(text, tag.tag);
}

void takeTag(ReadContext& context, const DynamicTag& tag, const DynamicStrings& strings) {
  ObjectModule& module = context.module;
  switch (tag.tag) {
  case DT_NEEDED:
  case DT_SONAME:
  case DT_RPATH:
  case DT_RUNPATH:
    return takeText(module, tag, strings);
  case DT_INIT:
    return module.setDynamicValue(DynamicValue_Init, tag.value);
  case DT_FINI:
    return module.setDynamicValue(DynamicValue_Fini, tag.value);
  case DT_INIT_ARRAY:
    return module.setDynamicValue(DynamicValue_InitArray, tag.value);
  case DT_FINI_ARRAY:
    return module.setDynamicValue(DynamicValue_FiniArray, tag.value);
  case DT_INIT_ARRAYSZ:
    return module.setDynamicValue(DynamicValue_InitArraySize, tag.value);
  case DT_FINI_ARRAYSZ:
    return module.setDynamicValue(DynamicValue_FiniArraySize, tag.value);
  case DT_PREINIT_ARRAY:
    return module.setDynamicValue(DynamicValue_PreinitArray, tag.value);
  case DT_PREINIT_ARRAYSZ:
    return module.setDynamicValue(DynamicValue_PreinitArraySize, tag.value);
  case DT_SYMBOLIC:
    return module.addDynamicFlags(DF_SYMBOLIC);
  case DT_TEXTREL:
    return module.addDynamicFlags(DF_TEXTREL);
  case DT_BIND_NOW:
    return module.addDynamicFlags(DF_BIND_NOW);
  case DT_FLAGS:
    return module.addDynamicFlags(tag.value);
  case DT_ZEV_SYMTABSZ:
    context.hasSymbolTableSizeTag = true;
    return;
  default:
    return;
  }
}

// Where a dynamic section says that a preemption map is.
struct MapPlace {
  uint64_t value;
  uint32_t dynamicSection;
};

class PreemptionMapReader {
public:
  explicit PreemptionMapReader(ReadContext& context)
      : m_Context(context), m_AreFileOffsets(context.module.getMachine() == EM_ZEV &&
                                             context.module.getOsAbi() == ELFOSABI_ZEV),
        m_BytesLeft(context.image.getSize()) {}

  // False if the file can't be read.
  bool read(std::span<const MapPlace> places) {
    if (places.empty()) return true;
    std::vector<Extent> values;
    for (const MapPlace& place : places)
      values.push_back({place.value, place.value + 1, 0});
    const std::vector<uint32_t> sections = findFirstHolders(getExtents(), values);
    for (size_t i = 0; i < places.size(); ++i) {
      if (sections[i] != NoExtent && !readAt(sections[i], places[i])) return false;
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
    for (uint32_t i = 0; i < m_Context.sectionCount(); ++i) {
      const SectionHeader& header = m_Context.sectionHeaders[i];
      if (header.type == SHT_NULL || (m_AreFileOffsets && header.type == SHT_NOBITS)) continue;
      extents.push_back({startOf(header), endOf(startOf(header), header.size), i});
    }
    return extents;
  }

  bool readAt(uint32_t index, const MapPlace& place) {
    const SectionHeader& header = m_Context.sectionHeaders[index];
    if (!hasFileBytes(header)) return true;
    const uint8_t* bytes = m_Context.viewSection(index);
    const Section* dynamic = m_Context.module.getSection(place.dynamicSection);
    m_Strings = {};
    if (bytes == nullptr || !m_Strings.open(m_Context, dynamic->getLink())) return false;
    const uint64_t start = place.value - startOf(header);
    readMap(bytes + start, header.size - start);
    return true;
  }

  // Records, each a word with the number of preempted libraries and as many names behind two
  // more, up to one with the number 0. All maps together can't be larger than the file, unless
  // somebody made them run into one another.
  void readMap(const uint8_t* bytes, uint64_t size) {
    uint64_t pos = 0;
    while (size - pos >= 4) {
      const auto count = m_Context.get<uint32_t>(bytes + pos);
      const uint64_t recordSize = 12 + uint64_t{count} * 4;
      if (count == 0 || size - pos < recordSize || m_BytesLeft < recordSize) return;
      if (!readRecord(bytes + pos + 4, count)) return;
      m_BytesLeft -= recordSize;
      pos += recordSize;
    }
  }

  bool readRecord(const uint8_t* words, uint32_t count) {
    const char* symbolName = textAt(words);
    const char* preemptingName = textAt(words + 4);
    if (symbolName == nullptr || preemptingName == nullptr) return false;
    Preemption* preemption = m_Context.module.createPreemption(symbolName, preemptingName);
    for (uint32_t i = 0; i < count; ++i) {
      const char* name = textAt(words + 8 + uint64_t{i} * 4);
      if (name == nullptr) return false;
      preemption->addPreemptedDll(name);
    }
    return true;
  }

  [[nodiscard]] const char* textAt(const uint8_t* word) const {
    const auto offset = m_Context.get<uint32_t>(word);
    return offset == 0 ? "" : m_Strings.find(offset);
  }

  ReadContext& m_Context;
  bool m_AreFileOffsets;
  DynamicStrings m_Strings;
  uint64_t m_BytesLeft;
};

// What is found on the way over all dynamic sections.
struct DynamicState {
  // Each value once: maps can be many and large, and reading one twice tells nothing new.
  std::set<uint64_t> mapValues = {};
  std::vector<MapPlace> maps = {};
  // There is one set of version sections, and what it says is said once.
  bool areVersionsRead = false;
};

bool readDynamicSection(ReadContext& context, uint32_t index, DynamicState& state) {
  const SectionHeader& header = context.sectionHeaders[index];
  if (header.size == 0) return true;
  const uint8_t* bytes = context.viewSection(index);
  if (bytes == nullptr) return false;
  DynamicStrings strings;
  if (!strings.open(context, context.module.getSection(index)->getLink())) return false;
  const std::vector<DynamicTag> tags = getTags(context, bytes, header.size);
  VersionCounts counts;
  for (const DynamicTag& tag : tags) {
    takeTag(context, tag, strings);
    if (tag.tag == DT_VERDEFNUM && !counts.definitions) counts.definitions = tag.value;
    if (tag.tag == DT_VERNEEDNUM && !counts.requirements) counts.requirements = tag.value;
    if (tag.tag == DT_ZEV_PREEMPTMAP && state.mapValues.insert(tag.value).second)
      state.maps.push_back({tag.value, index});
  }
  return state.areVersionsRead || readVersions(context, counts, state.areVersionsRead);
}

} // namespace

bool readDynamicSections(ReadContext& context) {
  DynamicState state;
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (context.typeOf(i) != SHT_DYNAMIC || context.isBroken[i]) continue;
    if (!readDynamicSection(context, i, state)) return false;
  }
  return PreemptionMapReader(context).read(state.maps);
}

} // namespace elfext
