// SPDX-License-Identifier: Apache-2.0
//
// The rows of the symbol tables. Each is checked in the order name, section, kind; the symbol is
// made at once, unless the read is bound to fail.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/src/object_module_reader.h"
#include "elfext/src/row_marks.h"
#include "elfext/src/row_maximum.h"

#include <limits>
#include <optional>

namespace elfext {

namespace {

struct SymbolTable {
  uint32_t section;
  uint32_t stringSection;
  uint64_t stringSize;
  // Null where nothing is made.
  const char* strings;
  // The words of the index section; null without one.
  const uint8_t* indexes;
  const uint8_t* rows;
  uint64_t rowCount;
  bool isDynamic;
  bool isLaidOut;
};

// Where a row says that its symbol is.
struct SymbolHome {
  Symbol::Category category;
  uint32_t section;
};

uint32_t typeOf(const SymbolRow& row) {
  return row.info & 0xFU;
}

bool isSpecialIndex(uint16_t index) {
  return index == SHN_UNDEF || index == SHN_ABS || index == SHN_COMMON || index == SHN_XINDEX;
}

Symbol::Category specialCategory(uint16_t index) {
  if (index == SHN_ABS) return Symbol::Category_Absolute;
  return index == SHN_COMMON ? Symbol::Category_Common : Symbol::Category_Undefined;
}

// Only the four special indexes have a meaning of their own; the rest of the reserved range names
// sections like any other number.
bool findHome(const ReadContext& context, const SymbolTable& table, SymbolPlace place,
              uint16_t index, SymbolHome& home) {
  if (isSpecialIndex(index) && index != SHN_XINDEX) {
    home = {specialCategory(index), 0};
    return true;
  }
  home = {Symbol::Category_Hosted, index};
  if (index == SHN_XINDEX) {
    if (table.indexes == nullptr)
      return stop(context.module, &ErrorHandler::symbolWithoutShndxSection, place);
    home.section = context.get<uint32_t>(table.indexes + uint64_t{place.symbol} * 4);
  }
  if (home.section < context.sectionCount()) return true;
  return stop(context.module, &ErrorHandler::symbolSectionOutOfRange, place, home.section,
              context.lastSection());
}

bool checkRow(const ReadContext& context, const SymbolTable& table, SymbolPlace place,
              const SymbolRow& row, SymbolHome& home) {
  if (row.name != 0 && row.name >= table.stringSize)
    return stop(context.module, &ErrorHandler::symbolNameOutOfRange, place, row.name,
                table.stringSection, table.stringSize);
  if (!findHome(context, table, place, row.shndx, home)) return false;
  if (typeOf(row) == STT_SECTION && home.category != Symbol::Category_Hosted)
    return stop(context.module, &ErrorHandler::sectionSymbolNotHosted, place);
  return true;
}

Symbol* createSymbol(ReadContext& context, const SymbolTable& table, const SymbolRow& row,
                     const SymbolHome& home) {
  ObjectModule& module = context.module;
  const char* name = row.name == 0 ? nullptr : table.strings + row.name;
  const uint32_t type = typeOf(row);
  const uint32_t binding = row.info >> 4;
  const uint32_t visibility = row.other & 0x3U;
  const bool isDynamic = table.isDynamic;
  switch (home.category) {
  case Symbol::Category_Absolute:
    return isDynamic
               ? module.createAbsoluteDynamicSymbol(name, row.value, type, binding, visibility)
               : module.createAbsoluteSymbol(name, row.value, type, binding, visibility);
  case Symbol::Category_Common:
    return isDynamic ? module.createCommonDynamicSymbol(name, row.value, type, binding, visibility)
                     : module.createCommonSymbol(name, row.value, type, binding, visibility);
  case Symbol::Category_Undefined:
    return isDynamic
               ? module.createUndefinedDynamicSymbol(name, row.value, type, binding, visibility)
               : module.createUndefinedSymbol(name, row.value, type, binding, visibility);
  case Symbol::Category_Hosted:
    break;
  }
  Section* section = module.getSection(home.section);
  const uint64_t offset = table.isLaidOut ? row.value - section->getAddress() : row.value;
  return isDynamic
             ? module.createHostedDynamicSymbol(name, offset, type, binding, visibility, section)
             : module.createHostedSymbol(name, offset, type, binding, visibility, section);
}

bool checkRows(const ReadContext& context, const SymbolTable& table) {
  const uint32_t rowSize = symbolRowSize(context.format.isWide);
  for (uint64_t i = 1; i < table.rowCount; ++i) {
    SymbolRow row;
    SymbolHome home;
    getRecord(context.format, table.rows + i * rowSize, row);
    const SymbolPlace place = {static_cast<uint32_t>(i), table.section, table.isDynamic};
    if (!checkRow(context, table, place, row, home)) return false;
  }
  return true;
}

bool createSymbols(ReadContext& context, const SymbolTable& table) {
  const uint32_t rowSize = symbolRowSize(context.format.isWide);
  const auto rowCount = static_cast<uint32_t>(table.rowCount);
  if (rowCount == 0) return true;
  ObjectModule& module = context.module;
  auto* symbols = static_cast<Symbol**>(
      module.getObjectRegion().allocate(uint64_t{rowCount} * sizeof(Symbol*), alignof(Symbol*)));
  symbols[0] = nullptr;
  context.symbols[table.section] = {symbols, rowCount};
  if (table.isDynamic)
    module.reserveDynamicSymbols(rowCount);
  else
    module.reserveSymbols(rowCount);
  for (uint32_t i = 1; i < rowCount; ++i) {
    SymbolRow row;
    SymbolHome home;
    getRecord(context.format, table.rows + uint64_t{i} * rowSize, row);
    if (!checkRow(context, table, {i, table.section, table.isDynamic}, row, home)) return false;
    symbols[i] = createSymbol(context, table, row, home);
    symbols[i]->setSize(row.size);
  }
  return true;
}

// Answers for a whole table of a file with overlapping sections whether a row needs a closer look.
class OverlappingTables {
public:
  explicit OverlappingTables(ReadContext& context, std::span<const uint8_t> image)
      : m_Context(context), m_Rows(image, symbolRowSize(context.format.isWide),
                                   [this](const uint8_t* bytes) { return suspicion(bytes); }),
        m_RowsWithoutIndexes(image, symbolRowSize(context.format.isWide),
                             [this](const uint8_t* bytes) {
                               return getRow(bytes).shndx == SHN_XINDEX ? AlwaysSuspicious
                                                                        : suspicion(bytes);
                             }),
        m_UsesIndex(image, symbolRowSize(context.format.isWide),
                    [this](const uint8_t* bytes) { return getRow(bytes).shndx == SHN_XINDEX; }),
        m_IsBadIndex(image, 4, [this](const uint8_t* bytes) {
          return m_Context.get<uint32_t>(bytes) >= m_Context.sectionCount();
        }) {}
  OverlappingTables(const OverlappingTables&) = delete;
  OverlappingTables& operator=(const OverlappingTables&) = delete;

  [[nodiscard]] bool isSuspicious(const SymbolTable& table, uint64_t indexOffset) {
    if (table.rowCount < 2) return false;
    const uint32_t rowSize = symbolRowSize(m_Context.format.isWide);
    const uint64_t first = m_Context.sectionHeaders[table.section].offset + rowSize;
    RowMaximum& rows = table.indexes == nullptr ? m_RowsWithoutIndexes : m_Rows;
    const uint32_t greatest = rows.find(first, table.rowCount - 1);
    if (greatest != 0 && greatest >= table.stringSize) return true;
    return table.indexes != nullptr &&
           haveCommon(m_UsesIndex, first, m_IsBadIndex, indexOffset + 4, table.rowCount - 1);
  }

private:
  static constexpr uint32_t AlwaysSuspicious = std::numeric_limits<uint32_t>::max();

  [[nodiscard]] SymbolRow getRow(const uint8_t* bytes) const {
    SymbolRow row;
    getRecord(m_Context.format, bytes, row);
    return row;
  }

  // The place of the name, which a table's strings must reach beyond.
  [[nodiscard]] uint32_t suspicion(const uint8_t* bytes) const {
    const SymbolRow row = getRow(bytes);
    const bool isHosted = row.shndx == SHN_XINDEX || !isSpecialIndex(row.shndx);
    if (!isSpecialIndex(row.shndx) && row.shndx >= m_Context.sectionCount())
      return AlwaysSuspicious;
    return typeOf(row) == STT_SECTION && !isHosted ? AlwaysSuspicious : row.name;
  }

  ReadContext& m_Context;
  RowMaximum m_Rows;
  RowMaximum m_RowsWithoutIndexes;
  RowMarks m_UsesIndex;
  RowMarks m_IsBadIndex;
};

bool openTable(ReadContext& context, uint32_t index, SymbolTable& table) {
  const SectionHeader& header = context.sectionHeaders[index];
  const Section* strings = context.module.getSection(header.link);
  table = {.section = index,
           .stringSection = header.link,
           .stringSize = strings->getSize(),
           .strings = nullptr,
           .indexes = nullptr,
           .rows = nullptr,
           .rowCount = context.rowCount(index),
           .isDynamic = header.type == SHT_DYNSYM,
           .isLaidOut = context.module.hasLaidOutAddresses()};
  if (header.size == 0) return true;
  if (table.rowCount > std::numeric_limits<uint32_t>::max())
    return mapLowLevelResult(context.module, LowLevelResult::NoMemory);
  table.rows = context.view(header.offset, header.size);
  if (table.rows == nullptr) return false;
  const auto* section = static_cast<const SymbolTableSection*>(context.module.getSection(index));
  const ShndxSection* indexSection = section->getShndxSection();
  if (indexSection != nullptr) {
    table.indexes = context.viewSection(indexSection->getIndex());
    if (table.indexes == nullptr) return false;
  }
  if (context.overlap) return true;
  table.strings = reinterpret_cast<const char*>(context.viewSection(header.link));
  return table.strings != nullptr;
}

bool checkOverlappingTable(ReadContext& context, const SymbolTable& table,
                           std::optional<OverlappingTables>& tables) {
  if (!tables) {
    const uint8_t* image = context.view(0, context.image.getSize());
    if (image == nullptr) return false;
    tables.emplace(context, std::span(image, context.image.getSize()));
  }
  const auto* section =
      static_cast<const SymbolTableSection*>(context.module.getSection(table.section));
  const ShndxSection* indexSection = section->getShndxSection();
  const uint64_t indexOffset =
      indexSection == nullptr ? 0 : context.sectionHeaders[indexSection->getIndex()].offset;
  return !tables->isSuspicious(table, indexOffset) || checkRows(context, table);
}

} // namespace

bool readSymbols(ReadContext& context) {
  std::optional<OverlappingTables> overlappingTables;
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (!isSymbolTable(context.typeOf(i)) || context.isBroken[i]) continue;
    SymbolTable table;
    if (!openTable(context, i, table)) return false;
    const bool goesOn = context.overlap ? checkOverlappingTable(context, table, overlappingTables)
                                        : createSymbols(context, table);
    if (!goesOn) return false;
  }
  return true;
}

} // namespace elfext
