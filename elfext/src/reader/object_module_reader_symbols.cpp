// SPDX-License-Identifier: Apache-2.0
//
// From checked rows of symbol tables the symbols.
//
// Elf32_Sym and Elf64_Sym. The rows' names, sections and kinds have been checked, so st_name and
// st_shndx are followed without a question. The values st_value and st_size are taken as they
// stand.
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

namespace {

Symbol* createSymbol(ReadContext& context, const SymbolTable& table, const char* strings,
                     const SymbolRow& row, const SymbolHome& home) {
  const bool isHosted = home.category == Symbol::Category_Hosted;
  return context.module.createSymbol(
      {.category = home.category,
       .isDynamic = table.isDynamic,
       .name = row.name == 0 ? nullptr : strings + row.name,
       .value = isHosted ? context.placeInHome(row, home) : row.value,
       .type = row.getType(),
       .binding = row.getBinding(),
       .visibility = row.other & 0x3U,
       .section = isHosted ? context.module.getSection(home.section) : nullptr});
}

void createSymbolsOf(ReadContext& context, const SymbolTable& table) {
  ObjectModule& module = context.module;
  auto* symbols = static_cast<Symbol**>(module.getObjectRegion().allocate(
      uint64_t{table.rowCount} * sizeof(Symbol*), alignof(Symbol*)));
  // Row 0, the null symbol: relocations and signatures that name it find nobody.
  symbols[0] = nullptr;
  context.symbols[table.section] = {symbols, table.rowCount};
  if (table.isDynamic)
    module.reserveDynamicSymbols(table.rowCount);
  else
    // The rows are there in the image, so this is no claim of the file.
    module.reserveSymbols(table.rowCount);
  const char* strings = context.stringsOf(table.stringSection);
  for (uint32_t i = 1; i < table.rowCount; ++i) {
    const SymbolRow row = context.getSymbolRow(table, i);
    symbols[i] = createSymbol(context, table, strings, row, context.homeOf(table, i, row));
    symbols[i]->setSize(row.size);
  }
}

} // namespace

void createSymbols(ReadContext& context) {
  // Empty for what is no symbol table.
  context.symbols.resize(context.getSectionCount());
  for (const SymbolTable& table : context.symbolTables)
    createSymbolsOf(context, table);
}

} // namespace elfext
