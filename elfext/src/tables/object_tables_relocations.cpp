// SPDX-License-Identifier: Apache-2.0
//
// Relocation tables. Their rows are checked in one tight loop, for the only thing that can be wrong
// with them: a symbol that the symbol table does not have.
//
// Elf32_Rel(a) and Elf64_Rel(a): r_offset, r_info with symbol and type, and with the `a` form
// r_addend. Relocations are most of an object's rows, so the loop only takes a maximum over one
// word of each row, and only a table that fails is looked through for the row to name. r_offset is
// not looked at here: no read follows it.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/row_maximum.h"
#include "elfext/src/tables/object_tables.h"

#include <algorithm>
#include <limits>
#include <optional>

namespace elfext {

namespace {

// Where r_info has the symbol: in the upper half of its 8 bytes, or above the type in its 4.
uint32_t symbolWordPlace(RecordFormat format) {
  if (!format.isWide) return 4;
  return format.isLittle ? 12 : 8;
}

// The symbol index that the word is, or has above the type.
uint32_t symbolOf(RecordFormat format, uint32_t word) {
  // In class 1 the type is below the symbol, so the greatest word has the greatest symbol.
  return format.isWide ? word : word >> 8;
}

uint32_t symbolOf(RecordFormat format, const uint8_t* row) {
  return symbolOf(format, getWord<uint32_t>(row + symbolWordPlace(format), format.isLittle));
}

template <bool IsLittle>
uint32_t findGreatestWord(const uint8_t* words, uint32_t count, uint32_t distance) {
  uint32_t greatest = 0;
  for (uint32_t i = 0; i < count; ++i, words += distance)
    greatest = std::max(greatest, getWord<uint32_t>(words, IsLittle));
  return greatest;
}

bool hasBadSymbol(RecordFormat format, const RelocationTable& table, uint32_t rowSize) {
  const uint8_t* words = table.rows + symbolWordPlace(format);
  const uint32_t greatest = format.isLittle
                                ? findGreatestWord<true>(words, table.rowCount, rowSize)
                                : findGreatestWord<false>(words, table.rowCount, rowSize);
  return table.rowCount != 0 && symbolOf(format, greatest) >= table.symbolCount;
}

// Which row it is that has a bad symbol is only looked for in a table that has one.
bool checkRows(const ObjectTables& tables, const RelocationTable& table) {
  const uint32_t rowSize = relocationRowSize(tables.format.isWide, table.hasAddend);
  if (!hasBadSymbol(tables.format, table, rowSize)) return true;
  uint32_t row = 0;
  while (symbolOf(tables.format, table.rows + uint64_t{row} * rowSize) < table.symbolCount)
    ++row;
  const uint32_t symbol = symbolOf(tables.format, table.rows + uint64_t{row} * rowSize);
  return stop(tables.reporter, &ErrorHandler::relocationSymbolOutOfRange, row, table.section,
              symbol, table.symbolSection, table.symbolCount);
}

// The greatest symbol index of any run of rows in a file with overlapping sections.
class OverlappingTables {
public:
  OverlappingTables(const ObjectTables& tables, std::span<const uint8_t> image)
      : m_Rel(makeMaximum(tables, image, false)), m_Rela(makeMaximum(tables, image, true)) {}

  [[nodiscard]] bool isSuspicious(const RelocationTable& table, uint64_t offset) {
    return (table.hasAddend ? m_Rela : m_Rel).find(offset, table.rowCount) >= table.symbolCount;
  }

private:
  static RowMaximum makeMaximum(const ObjectTables& tables, std::span<const uint8_t> image,
                                bool hasAddend) {
    const RecordFormat format = tables.format;
    return {image, relocationRowSize(format.isWide, hasAddend),
            [format](const uint8_t* row) { return symbolOf(format, row); }};
  }

  RowMaximum m_Rel;
  RowMaximum m_Rela;
};

bool openTable(ObjectTables& tables, uint32_t index, RelocationTable& table) {
  const SectionHeader& header = tables.sectionHeaders[index];
  const uint64_t rowCount = tables.rowCount(index);
  // Models count rows in 32 bits.
  if (rowCount > std::numeric_limits<uint32_t>::max())
    return mapLowLevelResult(tables.reporter, LowLevelResult::NoMemory);
  table = {.section = index,
           .symbolSection = header.link,
           .symbolCount = tables.rowCount(header.link),
           .rows = tables.view(header.offset, header.size),
           .rowCount = static_cast<uint32_t>(rowCount),
           .hasAddend = header.type == SHT_RELA};
  return table.rows != nullptr;
}

bool checkOverlappingTable(ObjectTables& tables, const RelocationTable& table,
                           std::optional<OverlappingTables>& overlappingTables) {
  if (!overlappingTables) {
    const uint8_t* image = tables.view(0, tables.image.getSize());
    if (image == nullptr) return false;
    overlappingTables.emplace(tables, std::span(image, tables.image.getSize()));
  }
  return !overlappingTables->isSuspicious(table, tables.sectionHeaders[table.section].offset) ||
         checkRows(tables, table);
}

} // namespace

bool checkRelocations(ObjectTables& tables) {
  std::optional<OverlappingTables> overlappingTables;
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (!isRelocationTable(tables.typeOf(i)) || tables.isBroken(i)) continue;
    // Nothing to view, and nothing to check.
    if (tables.sectionHeaders[i].size == 0) continue;
    RelocationTable table;
    if (!openTable(tables, i, table)) return false;
    if (tables.overlap) {
      if (!checkOverlappingTable(tables, table, overlappingTables)) return false;
      continue;
    }
    if (!checkRows(tables, table)) return false;
    tables.relocationTables.push_back(table);
  }
  return true;
}

} // namespace elfext
