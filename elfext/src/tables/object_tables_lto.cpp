// SPDX-License-Identifier: Apache-2.0
//
// The symbols of objects that a GCC compiler made for the optimiser of a link. Such an object may
// be "slim": it has no machine code, one ELF symbol says so, and what it defines stands in sections
// named ".gnu.lto_.symtab." and a number, of which a merged object has several. They hold records
// without padding, whatever the class and byte order of the file:
//
//   name       text, ends with a NUL
//   group      text, ends with a NUL: the COMDAT group
//   kind       1 byte: 0 definition, 1 weak definition, 2 reference, 3 weak reference, 4 common
//   visibility 1 byte
//   size       8 bytes
//   slot       4 bytes
//
// In a hostile file a record reaches beyond its section, or a thousand sections are the same bytes:
// a file whose tables are more bytes than it has itself is refused before they are looked at.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/tables/object_tables.h"

#include <string_view>

namespace elfext {

namespace {

constexpr std::string_view SlimMarker = "__gnu_lto_slim";
constexpr std::string_view TablePrefix = ".gnu.lto_.symtab.";
// Kind, visibility, size and slot.
constexpr size_t FixedPart = 1 + 1 + 8 + 4;

enum RecordKind : uint8_t { Kind_Definition = 0, Kind_WeakDefinition = 1, Kind_Common = 4 };

bool isDefinition(char kind) {
  const auto value = static_cast<uint8_t>(kind);
  return value == Kind_Definition || value == Kind_WeakDefinition || value == Kind_Common;
}

bool hasMarker(const ObjectTables& tables) {
  for (const SymbolTable& table : tables.symbolTables) {
    const bool isWithout = tables.forEachSymbolRow(
        table, [&](uint32_t, const SymbolRow& row) { return !isSlimMarker(table.nameOf(row)); });
    if (!isWithout) return true;
  }
  return false;
}

bool isRecordTable(const ObjectTables& tables, uint32_t section) {
  const char* name = tables.nameOf(section);
  return name != nullptr && hasFileBytes(tables.sectionHeaders[section]) &&
         std::string_view(name).starts_with(TablePrefix);
}

// Takes a text and its NUL off the front of the records. False if it has no end.
bool takeText(std::string_view& records, std::string_view& text) {
  const size_t size = records.find('\0');
  if (size == std::string_view::npos) return false;
  text = records.substr(0, size);
  records.remove_prefix(size + 1);
  return true;
}

bool readRecords(ObjectTables& tables, std::string_view records) {
  while (!records.empty()) {
    std::string_view name;
    std::string_view group;
    if (!takeText(records, name) || !takeText(records, group) || records.size() < FixedPart)
      return mapLowLevelResult(tables.reporter, LowLevelResult::OutsideImage);
    if (isDefinition(records.front())) tables.ltoDefinitions.push_back(name.data());
    records.remove_prefix(FixedPart);
  }
  return true;
}

} // namespace

bool isSlimMarker(const char* name) {
  // Nearly all names differ in their first character.
  return name != nullptr && *name == SlimMarker.front() && name == SlimMarker;
}

bool checkLtoTables(ObjectTables& tables) {
  if (!hasMarker(tables)) return true;
  if (tables.sectionNames == nullptr && !openSectionNames(tables)) return false;
  tables.isSlim = true;
  uint64_t left = tables.image.getSize();
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (!isRecordTable(tables, i)) continue;
    const SectionHeader& header = tables.sectionHeaders[i];
    if (header.size > left) return mapLowLevelResult(tables.reporter, LowLevelResult::OutsideImage);
    left -= header.size;
    const uint8_t* bytes = tables.view(header.offset, header.size);
    if (bytes == nullptr) return false;
    if (!readRecords(tables, {reinterpret_cast<const char*>(bytes), header.size})) return false;
  }
  return true;
}

} // namespace elfext
