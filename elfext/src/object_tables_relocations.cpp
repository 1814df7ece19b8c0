// SPDX-License-Identifier: Apache-2.0
//
// Relocation tables. Their rows are checked in one tight loop, for the only thing that can be wrong
// with them: a symbol that the symbol table does not have.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/object_tables.h"
#include "elfext/src/row_maximum.h"

#include <limits>
#include <optional>

namespace elfext {

namespace {

// The symbol index of the row's r_info.
template <bool IsWide>
uint32_t symbolOf(const uint8_t* row, bool isLittle) {
  if constexpr (IsWide) return static_cast<uint32_t>(getWord<uint64_t>(row + 8, isLittle) >> 32);
  return getWord<uint32_t>(row + 4, isLittle) >> 8;
}

template <bool IsWide>
bool checkRows(const ObjectTables& tables, const RelocationTable& table) {
  const uint8_t* row = table.rows;
  const uint32_t rowSize = relocationRowSize(IsWide, table.hasAddend);
  for (uint32_t i = 0; i < table.rowCount; ++i, row += rowSize) {
    const uint32_t symbol = symbolOf<IsWide>(row, tables.format.isLittle);
    if (symbol >= table.symbolCount)
      return stop(tables.reporter, &ErrorHandler::relocationSymbolOutOfRange, i, table.section,
                  symbol, table.symbolSection, table.symbolCount);
  }
  return true;
}

bool checkRows(const ObjectTables& tables, const RelocationTable& table) {
  return tables.format.isWide ? checkRows<true>(tables, table) : checkRows<false>(tables, table);
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
    return {image, relocationRowSize(format.isWide, hasAddend), [format](const uint8_t* row) {
              return format.isWide ? symbolOf<true>(row, format.isLittle)
                                   : symbolOf<false>(row, format.isLittle);
            }};
  }

  RowMaximum m_Rel;
  RowMaximum m_Rela;
};

bool openTable(ObjectTables& tables, uint32_t index, RelocationTable& table) {
  const SectionHeader& header = tables.sectionHeaders[index];
  const uint64_t rowCount = tables.rowCount(index);
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
  for (uint32_t i = 0; i < tables.sectionCount(); ++i) {
    if (!isRelocationTable(tables.typeOf(i)) || tables.isBroken(i)) continue;
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
