// SPDX-License-Identifier: Apache-2.0
//
// Relocation tables. Their rows are checked in one tight loop, for the only thing that can be wrong
// with them: a symbol that the symbol table does not have. They become relocations when somebody
// asks for one.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/relocation.h"
#include "elfext/interface/relocation_rows.h"
#include "elfext/src/object_module_reader.h"
#include "elfext/src/row_maximum.h"

#include <limits>
#include <optional>

namespace elfext {

namespace {

class LoadedRelocationRows final : public RelocationRows {
public:
  LoadedRelocationRows(RecordFormat format, const RelocationSection& section, const uint8_t* rows,
                       uint32_t rowCount, std::span<Symbol* const> symbols)
      : m_Format(format), m_Rows(rows), m_RowCount(rowCount), m_Symbols(symbols),
        m_HasAddend(section.hasAddends()), m_IsDynamic(section.isDynamic()) {}

  void appendTo(Section& target) override {
    const uint32_t rowSize = relocationRowSize(m_Format.isWide, m_HasAddend);
    for (uint32_t i = 0; i < m_RowCount; ++i) {
      RelocationRow row;
      getRecord(m_Format, m_HasAddend, m_Rows + uint64_t{i} * rowSize, row);
      Symbol* symbol = m_Symbols[row.symbol];
      Relocation* relocation = m_HasAddend
                                   ? target.addRelocation(row.offset, row.type, symbol, row.addend)
                                   : target.addRelocation(row.offset, row.type, symbol);
      if (symbol == nullptr && m_IsDynamic) relocation->setDynamic();
    }
  }

private:
  RecordFormat m_Format;
  const uint8_t* m_Rows;
  uint32_t m_RowCount;
  std::span<Symbol* const> m_Symbols;
  bool m_HasAddend;
  bool m_IsDynamic;
};

// The symbol index of the row's r_info.
template <bool IsWide>
uint32_t symbolOf(const uint8_t* row, bool isLittle) {
  if constexpr (IsWide) return static_cast<uint32_t>(getWord<uint64_t>(row + 8, isLittle) >> 32);
  return getWord<uint32_t>(row + 4, isLittle) >> 8;
}

struct RelocationTable {
  uint32_t section;
  uint32_t symbolSection;
  uint64_t symbolCount;
  const uint8_t* rows;
  uint32_t rowCount;
  uint32_t rowSize;
};

template <bool IsWide>
bool checkRows(const ReadContext& context, const RelocationTable& table) {
  const uint8_t* row = table.rows;
  for (uint32_t i = 0; i < table.rowCount; ++i, row += table.rowSize) {
    const uint32_t symbol = symbolOf<IsWide>(row, context.format.isLittle);
    if (symbol >= table.symbolCount)
      return stop(context.module, &ErrorHandler::relocationSymbolOutOfRange, i, table.section,
                  symbol, table.symbolSection, table.symbolCount);
  }
  return true;
}

bool checkRows(const ReadContext& context, const RelocationTable& table) {
  return context.format.isWide ? checkRows<true>(context, table) : checkRows<false>(context, table);
}

// The greatest symbol index of any run of rows in a file with overlapping sections.
class OverlappingTables {
public:
  OverlappingTables(const ReadContext& context, std::span<const uint8_t> image)
      : m_Rel(makeMaximum(context, image, false)), m_Rela(makeMaximum(context, image, true)) {}

  [[nodiscard]] bool isSuspicious(const RelocationTable& table, uint64_t offset, bool hasAddend) {
    return (hasAddend ? m_Rela : m_Rel).find(offset, table.rowCount) >= table.symbolCount;
  }

private:
  static RowMaximum makeMaximum(const ReadContext& context, std::span<const uint8_t> image,
                                bool hasAddend) {
    const RecordFormat format = context.format;
    return {image, relocationRowSize(format.isWide, hasAddend), [format](const uint8_t* row) {
              return format.isWide ? symbolOf<true>(row, format.isLittle)
                                   : symbolOf<false>(row, format.isLittle);
            }};
  }

  RowMaximum m_Rel;
  RowMaximum m_Rela;
};

bool openTable(ReadContext& context, uint32_t index, RelocationTable& table) {
  const SectionHeader& header = context.sectionHeaders[index];
  const uint64_t rowCount = context.rowCount(index);
  if (rowCount > std::numeric_limits<uint32_t>::max())
    return mapLowLevelResult(context.module, LowLevelResult::NoMemory);
  table = {.section = index,
           .symbolSection = header.link,
           .symbolCount = context.rowCount(header.link),
           .rows = context.view(header.offset, header.size),
           .rowCount = static_cast<uint32_t>(rowCount),
           .rowSize = relocationRowSize(context.format.isWide, header.type == SHT_RELA)};
  return table.rows != nullptr;
}

bool checkOverlappingTable(ReadContext& context, const RelocationTable& table,
                           std::optional<OverlappingTables>& tables) {
  if (!tables) {
    const uint8_t* image = context.view(0, context.image.getSize());
    if (image == nullptr) return false;
    tables.emplace(context, std::span(image, context.image.getSize()));
  }
  const SectionHeader& header = context.sectionHeaders[table.section];
  return !tables->isSuspicious(table, header.offset, header.type == SHT_RELA) ||
         checkRows(context, table);
}

bool readTable(ReadContext& context, const RelocationTable& table) {
  if (!checkRows(context, table)) return false;
  auto* section = static_cast<RelocationSection*>(context.module.getSection(table.section));
  auto* rows = alloclib::create<LoadedRelocationRows>(
      context.module.getObjectRegion(), context.format, *section, table.rows, table.rowCount,
      context.symbols[table.symbolSection]);
  section->setRows(rows, table.rowCount);
  return true;
}

} // namespace

bool readRelocations(ReadContext& context) {
  std::optional<OverlappingTables> overlappingTables;
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (!isRelocationTable(context.typeOf(i)) || context.isBroken[i]) continue;
    if (context.sectionHeaders[i].size == 0) continue;
    RelocationTable table;
    if (!openTable(context, i, table)) return false;
    const bool goesOn = context.overlap ? checkOverlappingTable(context, table, overlappingTables)
                                        : readTable(context, table);
    if (!goesOn) return false;
  }
  return true;
}

} // namespace elfext
