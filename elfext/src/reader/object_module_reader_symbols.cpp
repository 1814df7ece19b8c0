// SPDX-License-Identifier: Apache-2.0
//
// From checked rows of symbol tables the symbols.
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

namespace {

Symbol* createSymbol(ReadContext& context, const SymbolTable& table, const char* strings,
                     const SymbolRow& row, const SymbolHome& home) {
  ObjectModule& module = context.module;
  const char* name = row.name == 0 ? nullptr : strings + row.name;
  const uint32_t type = row.getType();
  const uint32_t binding = row.getBinding();
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
  const uint64_t offset = context.placeInHome(row, home);
  return isDynamic
             ? module.createHostedDynamicSymbol(name, offset, type, binding, visibility, section)
             : module.createHostedSymbol(name, offset, type, binding, visibility, section);
}

void createSymbolsOf(ReadContext& context, const SymbolTable& table) {
  ObjectModule& module = context.module;
  auto* symbols = static_cast<Symbol**>(module.getObjectRegion().allocate(
      uint64_t{table.rowCount} * sizeof(Symbol*), alignof(Symbol*)));
  symbols[0] = nullptr;
  context.symbols[table.section] = {symbols, table.rowCount};
  if (table.isDynamic)
    module.reserveDynamicSymbols(table.rowCount);
  else
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
  context.symbols.resize(context.getSectionCount());
  for (const SymbolTable& table : context.symbolTables)
    createSymbolsOf(context, table);
}

} // namespace elfext
