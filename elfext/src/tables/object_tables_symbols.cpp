// SPDX-License-Identifier: Apache-2.0
//
// The rows of the symbol tables. Each is checked in the order name, section, kind.
//
// Elf32_Sym and Elf64_Sym. Behind this step a name's offset lies in its string table, a hosted
// symbol's section is there, and each row that says SHN_XINDEX has its word in an index section;
// homeOf and nameOf rely on it. Symbol rows are the most that the tool looks at, one object after
// the other, so the loop over them asks and a second function reports.
//
// Where sections overlap, a thousand tables may share their rows: each is then judged as a whole,
// by the greatest name offset among its rows, with rows that are wrong in any table counting as the
// greatest number, and by the places where a row wants an index and the index is bad.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/row_marks.h"
#include "elfext/src/bytes/row_maximum.h"
#include "elfext/src/tables/object_tables.h"

#include <limits>
#include <optional>

namespace elfext {

namespace {

bool isSpecialIndex(uint16_t index) {
  return index == SHN_UNDEF || index == SHN_ABS || index == SHN_COMMON || index == SHN_XINDEX;
}

enum class RowFault : uint8_t { None, Name, NoIndexes, NotHosted, Section };

// The first rule that the row breaks. It is looked for in every row of every object, so the report
// stands apart.
RowFault findFault(const ObjectTables& tables, const SymbolTable& table, uint32_t index,
                   const SymbolRow& row) {
  // Offset 0 is no name in any table, even in one without a byte.
  if (row.name != 0 && row.name >= table.stringSize) return RowFault::Name;
  if (row.shndx == SHN_XINDEX && table.indexes == nullptr) return RowFault::NoIndexes;
  const SymbolHome home = tables.homeOf(table, index, row);
  if (home.category != Symbol::Category_Hosted)
    return row.getType() == STT_SECTION ? RowFault::NotHosted : RowFault::None;
  // Also of the reserved indexes that have no meaning of their own here.
  return home.section >= tables.getSectionCount() ? RowFault::Section : RowFault::None;
}

bool reportFault(const ObjectTables& tables, const SymbolTable& table, uint32_t index,
                 const SymbolRow& row, RowFault fault) {
  const SymbolPlace place = {index, table.section, table.isDynamic};
  switch (fault) {
  case RowFault::None:
    break;
  case RowFault::Name:
    return stop(tables.reporter, &ErrorHandler::symbolNameOutOfRange, place, row.name,
                table.stringSection, table.stringSize);
  case RowFault::NoIndexes:
    return stop(tables.reporter, &ErrorHandler::symbolWithoutShndxSection, place);
  case RowFault::NotHosted:
    return stop(tables.reporter, &ErrorHandler::sectionSymbolNotHosted, place);
  case RowFault::Section:
    return stop(tables.reporter, &ErrorHandler::symbolSectionOutOfRange, place,
                tables.homeOf(table, index, row).section, tables.getLastSection());
  }
  return true;
}

bool checkRows(const ObjectTables& tables, const SymbolTable& table) {
  return tables.forEachSymbolRow(table, [&](uint32_t index, const SymbolRow& row) {
    const RowFault fault = findFault(tables, table, index, row);
    return fault == RowFault::None || reportFault(tables, table, index, row, fault);
  });
}

// Answers for a whole table of a file with overlapping sections whether a row needs a closer look.
class OverlappingTables {
public:
  explicit OverlappingTables(const ObjectTables& tables, std::span<const uint8_t> image)
      : m_Tables(tables), m_Rows(image, symbolRowSize(tables.format.isWide),
                                 [this](const uint8_t* bytes) { return suspicion(bytes); }),
        m_RowsWithoutIndexes(image, symbolRowSize(tables.format.isWide),
                             [this](const uint8_t* bytes) {
                               return getRow(bytes).shndx == SHN_XINDEX ? AlwaysSuspicious
                                                                        : suspicion(bytes);
                             }),
        m_UsesIndex(image, symbolRowSize(tables.format.isWide),
                    [this](const uint8_t* bytes) { return getRow(bytes).shndx == SHN_XINDEX; }),
        m_IsBadIndex(image, 4, [this](const uint8_t* bytes) {
          return m_Tables.get<uint32_t>(bytes) >= m_Tables.getSectionCount();
        }) {}
  // The functions above hold its address.
  OverlappingTables(const OverlappingTables&) = delete;
  OverlappingTables& operator=(const OverlappingTables&) = delete;

  [[nodiscard]] bool isSuspicious(const SymbolTable& table, uint64_t indexOffset) {
    if (table.rowCount < 2) return false;
    const uint32_t rowSize = symbolRowSize(m_Tables.format.isWide);
    // The null symbol is never judged.
    const uint64_t first = m_Tables.sectionHeaders[table.section].offset + rowSize;
    RowMaximum& rows = table.indexes == nullptr ? m_RowsWithoutIndexes : m_Rows;
    const uint32_t greatest = rows.find(first, table.rowCount - 1);
    // A suspicion only: the rows are then looked at one by one, and they decide.
    if (greatest != 0 && greatest >= table.stringSize) return true;
    return table.indexes != nullptr &&
           haveCommon(m_UsesIndex, first, m_IsBadIndex, indexOffset + 4, table.rowCount - 1);
  }

private:
  static constexpr uint32_t AlwaysSuspicious = std::numeric_limits<uint32_t>::max();

  [[nodiscard]] SymbolRow getRow(const uint8_t* bytes) const {
    SymbolRow row;
    getRecord(m_Tables.format, bytes, row);
    return row;
  }

  // The place of the name, which a table's strings must reach beyond.
  [[nodiscard]] uint32_t suspicion(const uint8_t* bytes) const {
    const SymbolRow row = getRow(bytes);
    const bool isHosted = row.shndx == SHN_XINDEX || !isSpecialIndex(row.shndx);
    if (!isSpecialIndex(row.shndx) && row.shndx >= m_Tables.getSectionCount())
      return AlwaysSuspicious;
    return row.getType() == STT_SECTION && !isHosted ? AlwaysSuspicious : row.name;
  }

  const ObjectTables& m_Tables;
  RowMaximum m_Rows;
  RowMaximum m_RowsWithoutIndexes;
  RowMarks m_UsesIndex;
  RowMarks m_IsBadIndex;
};

bool checkOverlappingTable(ObjectTables& tables, const SymbolTable& table,
                           std::optional<OverlappingTables>& overlappingTables) {
  if (!overlappingTables) {
    const uint8_t* image = tables.view(0, tables.image.getSize());
    if (image == nullptr) return false;
    overlappingTables.emplace(tables, std::span(image, tables.image.getSize()));
  }
  const auto indexSection = tables.indexSections.find(table.section);
  const uint64_t indexOffset = indexSection == tables.indexSections.end()
                                   ? 0
                                   : tables.sectionHeaders[indexSection->second].offset;
  return !overlappingTables->isSuspicious(table, indexOffset) || checkRows(tables, table);
}

} // namespace

// The rows, and what they refer to. Of a file with overlapping sections not the strings, as nothing
// is taken from them.
bool openSymbolTable(ObjectTables& tables, uint32_t index, SymbolTable& table) {
  const SectionHeader& header = tables.sectionHeaders[index];
  const uint64_t rowCount = tables.rowCount(index);
  table.section = index;
  table.stringSection = header.link;
  table.stringSize = tables.stringSize(header.link);
  table.isDynamic = header.type == SHT_DYNSYM;
  if (header.size == 0) return true;
  if (rowCount > std::numeric_limits<uint32_t>::max())
    return mapLowLevelResult(tables.reporter, LowLevelResult::NoMemory);
  table.rowCount = static_cast<uint32_t>(rowCount);
  table.rows = tables.view(header.offset, header.size);
  if (table.rows == nullptr) return false;
  const auto indexSection = tables.indexSections.find(index);
  if (indexSection != tables.indexSections.end()) {
    table.indexes = tables.viewSection(indexSection->second);
    if (table.indexes == nullptr) return false;
  }
  if (tables.overlap) return true;
  table.strings = reinterpret_cast<const char*>(tables.viewSection(header.link));
  return table.strings != nullptr;
}

bool checkSymbols(ObjectTables& tables) {
  std::optional<OverlappingTables> overlappingTables;
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (!isSymbolTable(tables.typeOf(i)) || tables.isBroken(i)) continue;
    SymbolTable table;
    if (!openSymbolTable(tables, i, table)) return false;
    if (tables.overlap) {
      if (!checkOverlappingTable(tables, table, overlappingTables)) return false;
      continue;
    }
    if (!checkRows(tables, table)) return false;
    // Row 0 is the null symbol in every table that is kept.
    if (table.rowCount != 0) tables.symbolTables.push_back(table);
  }
  return true;
}

} // namespace elfext
