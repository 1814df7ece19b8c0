// SPDX-License-Identifier: Apache-2.0
//
// The tables of an object whose machine is none of ours: only what the ELF standard itself gives a
// meaning is looked at, since section types, reserved section indexes and row sizes of all else are
// each machine's own. An object has one symbol table; of a file with more the first one counts, so
// that a thousand tables of the same bytes cost no more than one.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/tables/object_tables.h"

#include <optional>

namespace elfext {

namespace {

std::optional<uint32_t> findSymbolTable(const ObjectTables& tables) {
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (tables.typeOf(i) == SHT_SYMTAB) return i;
  }
  return std::nullopt;
}

bool areBytesThere(const ObjectTables& tables, uint32_t section) {
  const SectionHeader& header = tables.sectionHeaders[section];
  return tables.image.contains(header.offset, header.size) ||
         mapLowLevelResult(tables.reporter, LowLevelResult::OutsideImage);
}

bool checkNames(const ObjectTables& tables, const SymbolTable& table) {
  return tables.forEachSymbolRow(table, [&](uint32_t index, const SymbolRow& row) {
    if (row.name == 0 || row.name < table.stringSize) return true;
    const SymbolPlace place = {index, table.section, table.isDynamic};
    return stop(tables.reporter, &ErrorHandler::symbolNameOutOfRange, place, row.name,
                table.stringSection, table.stringSize);
  });
}

} // namespace

bool checkForeignTables(ObjectTables& tables) {
  if (!checkSectionHeaders(tables)) return false;
  const std::optional<uint32_t> section = findSymbolTable(tables);
  if (!section) return true;
  if (!checkTableShape(tables, *section) || !areBytesThere(tables, *section)) return false;
  if (!checkSymbolTableLink(tables, *section)) return false;
  const uint32_t strings = tables.sectionHeaders[*section].link;
  if (!areBytesThere(tables, strings) || !checkStringTable(tables, strings)) return false;
  SymbolTable table;
  if (!openSymbolTable(tables, *section, table)) return false;
  if (table.rowCount == 0) return true;
  tables.symbolTables.push_back(table);
  return checkNames(tables, table);
}

} // namespace elfext
