// SPDX-License-Identifier: Apache-2.0
//
// Relocations stay rows, which have been checked, until somebody asks for one.
//
// A large object has far more relocations than anybody asks for, so a section gets its rows, their
// symbols and their count. That is safe because each row's symbol index has been checked against
// the table that m_Symbols is of, and because the model makes objects of all rows before symbols or
// sections change their places.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/relocation.h"
#include "elfext/interface/relocation_rows.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"

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
      // With a symbol, the symbol says whether it is.
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

} // namespace

void giveRelocations(ReadContext& context) {
  for (const RelocationTable& table : context.relocationTables) {
    auto* section = static_cast<RelocationSection*>(context.module.getSection(table.section));
    auto* rows = alloclib::create<LoadedRelocationRows>(
        context.module.getObjectRegion(), context.format, *section, table.rows, table.rowCount,
        context.symbols[table.symbolSection]);
    ModuleBuilder::setRows(*section, rows, table.rowCount);
  }
}

} // namespace elfext
