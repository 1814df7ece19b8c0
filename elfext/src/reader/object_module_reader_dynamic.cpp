// SPDX-License-Identifier: Apache-2.0
//
// From dynamic sections needed libraries, search paths, plain values, and the preemption maps.
//
// The tags have been taken apart with the tables, where the maps' places were found too; what a tag
// says is believed only where it leads to a text that there is. A preemption map is records of
// words: the number of preempted libraries, the offset of a symbol's name, that of the preempting
// library, and those of the preempted ones; a number of 0 ends it. Hostile maps claim more names
// than the section has bytes, or lie a thousandfold over one another.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/preemption.h"
#include "elfext/src/reader/dynamic_strings.h"
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

namespace {

void takeText(ObjectModule& module, const DynamicTag& tag, const DynamicStrings& strings) {
  // Offset 0 is the empty text, which names no library.
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
    // The last tag of a kind counts; flags add up.
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

class PreemptionMapReader {
public:
  explicit PreemptionMapReader(ReadContext& context)
      : m_Context(context), m_BytesLeft(context.image.getSize()) {}

  void read(const PreemptionMapPlace& place) {
    // The strings are those of the dynamic section that points to the map, and not of the section
    // that the map is in.
    m_Strings = DynamicStrings(m_Context, place.dynamicSection);
    readMap(m_Context.viewSection(place.section) + place.start,
            m_Context.sectionHeaders[place.section].size - place.start);
  }

private:
  // Records, each a word with the number of preempted libraries and as many names behind two
  // more, up to one with the number 0. All maps together can't be larger than the file, unless
  // somebody made them run into one another.
  void readMap(const uint8_t* bytes, uint64_t size) {
    uint64_t pos = 0;
    while (size - pos >= 4) {
      const auto count = m_Context.get<uint32_t>(bytes + pos);
      // In 64 bits, so a count of 2^32 - 1 is too large and not small.
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
    // Made before the names behind it are looked at: what a map says up to its first bad name
    // stays.
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
  DynamicStrings m_Strings;
  uint64_t m_BytesLeft;
};

} // namespace

void takeDynamicTables(ReadContext& context) {
  for (const DynamicTable& table : context.dynamicTables) {
    const DynamicStrings strings(context, table.section);
    for (const DynamicTag& tag : table.tags)
      takeTag(context, tag, strings);
  }
  // After all tags, once for the file.
  if (context.versions) takeVersions(context, *context.versions);
  PreemptionMapReader maps(context);
  for (const PreemptionMapPlace& place : context.preemptionMaps)
    maps.read(place);
}

} // namespace elfext
