// SPDX-License-Identifier: Apache-2.0
//
// Searches in the sorted views of symbols, which the module keeps by address and its sections by
// offset, and both by name.
//
// Whoever keeps a view knows whether it is up to date; nothing of that is checked here.
#pragma once

#include "elfext/interface/fast_array.h"
#include "elfext/interface/symbol.h"
#include "elfext/interface/symbol_list.h"

#include <cstdint>
#include <span>

namespace elfext {

using SymbolView = std::span<Symbol* const>;
// What a view is sorted by.
using SymbolKey = uint64_t (*)(const Symbol& symbol);

// What the bounds answer when there is no such symbol.
constexpr uint32_t NotFound = 0xFFFFFFFF;

// Bytewise as unsigned; a symbol without a name comes before all others.
[[nodiscard]] int compareNames(const char* left, const char* right);

// Equal symbols stay in their order.
void sortByKey(std::span<Symbol*> symbols, SymbolKey key);
void sortByName(std::span<Symbol*> symbols);

// The first symbol whose key is not below the value; the last whose key is not above it.
[[nodiscard]] uint32_t lowerBound(SymbolView symbols, SymbolKey key, uint64_t value);
[[nodiscard]] uint32_t upperBound(SymbolView symbols, SymbolKey key, uint64_t value);

// A stretch of a view, both ends included.
struct SymbolRun {
  bool isFound = false;
  uint32_t fromIndex = 0;
  uint32_t toIndex = 0;
};

// The symbols with keys from the first to the last value, both included.
[[nodiscard]] SymbolRun findRange(SymbolView symbols, SymbolKey key, uint64_t from, uint64_t to);
// The symbols with the highest key not above the value (the lowest not below it) at which there is
// one of a class in the mask; that one is at an end of the run.
[[nodiscard]] SymbolRun findPreceding(SymbolView symbols, SymbolKey key, uint64_t value,
                                      uint32_t mask);
[[nodiscard]] SymbolRun findFollowing(SymbolView symbols, SymbolKey key, uint64_t value,
                                      uint32_t mask);
[[nodiscard]] SymbolRun findName(SymbolView symbols, const char* name);

// Fills the list with the run's symbols of the classes in the mask; whether there are any.
bool collect(SymbolView symbols, const SymbolRun& run, uint32_t mask, SymbolList* list);

} // namespace elfext
