// SPDX-License-Identifier: Apache-2.0
//
// Searches for the ends of runs of equal keys. Among symbols of one key the answer must be the
// first or the last, which the usual bounds, written out for 32-bit indexes, give in a logarithm;
// only who asks for a class of symbols may have to pass over others.
#include "elfext/src/model/sorted_symbols.h"

#include "elfext/interface/sort.h"

#include <cstring>

namespace elfext {
namespace {

bool passes(const Symbol& symbol, uint32_t mask) {
  return mask == Symbol::Class_All || (symbol.getClass() & mask) != 0;
}

} // namespace

int compareNames(const char* left, const char* right) {
  // Also where both are null.
  if (left == right) return 0;
  if (left == nullptr) return -1;
  if (right == nullptr) return 1;
  return std::strcmp(left, right);
}

void sortByKey(std::span<Symbol*> symbols, SymbolKey key) {
  mergeSort(symbols, [key](const Symbol* left, const Symbol* right) {
    const uint64_t leftKey = key(*left);
    const uint64_t rightKey = key(*right);
    return static_cast<int>(leftKey > rightKey) - static_cast<int>(leftKey < rightKey);
  });
}

void sortByName(std::span<Symbol*> symbols) {
  mergeSort(symbols, [](const Symbol* left, const Symbol* right) {
    return compareNames(left->getName(), right->getName());
  });
}

uint32_t lowerBound(SymbolView symbols, SymbolKey key, uint64_t value) {
  int32_t low = 0;
  int32_t high = static_cast<int32_t>(symbols.size()) - 1;
  while (low <= high) {
    const int32_t mid = low + (high - low) / 2;
    const auto index = static_cast<uint32_t>(mid);
    if (key(*symbols[index]) < value)
      low = mid + 1;
    else if (mid == 0 || key(*symbols[index - 1]) < value)
      return index;
    else
      high = mid - 1;
  }
  return NotFound;
}

uint32_t upperBound(SymbolView symbols, SymbolKey key, uint64_t value) {
  int32_t low = 0;
  const int32_t last = static_cast<int32_t>(symbols.size()) - 1;
  int32_t high = last;
  while (low <= high) {
    const int32_t mid = low + (high - low) / 2;
    const auto index = static_cast<uint32_t>(mid);
    if (key(*symbols[index]) > value)
      high = mid - 1;
    else if (mid == last || key(*symbols[index + 1]) > value)
      return index;
    else
      low = mid + 1;
  }
  return NotFound;
}

SymbolRun findRange(SymbolView symbols, SymbolKey key, uint64_t from, uint64_t to) {
  const uint32_t fromIndex = lowerBound(symbols, key, from);
  const uint32_t toIndex = upperBound(symbols, key, to);
  // Where no key lies between the values, the bounds pass each other.
  if (fromIndex == NotFound || toIndex == NotFound || fromIndex > toIndex) return {};
  return {true, fromIndex, toIndex};
}

SymbolRun findPreceding(SymbolView symbols, SymbolKey key, uint64_t value, uint32_t mask) {
  uint32_t toIndex = upperBound(symbols, key, value);
  while (toIndex != NotFound && !passes(*symbols[toIndex], mask))
    --toIndex; // below 0 is NotFound
  if (toIndex == NotFound) return {};
  const uint64_t place = key(*symbols[toIndex]);
  uint32_t fromIndex = toIndex;
  while (fromIndex > 0 && key(*symbols[fromIndex - 1]) == place)
    --fromIndex;
  return {true, fromIndex, toIndex};
}

SymbolRun findFollowing(SymbolView symbols, SymbolKey key, uint64_t value, uint32_t mask) {
  uint32_t fromIndex = lowerBound(symbols, key, value);
  while (fromIndex < symbols.size() && !passes(*symbols[fromIndex], mask))
    ++fromIndex;
  if (fromIndex >= symbols.size()) return {};
  const uint64_t place = key(*symbols[fromIndex]);
  uint32_t toIndex = fromIndex;
  while (toIndex + 1 < symbols.size() && key(*symbols[toIndex + 1]) == place)
    ++toIndex;
  return {true, fromIndex, toIndex};
}

SymbolRun findName(SymbolView symbols, const char* name) {
  size_t low = 0;
  size_t high = symbols.size();
  while (low < high) {
    const size_t mid = low + (high - low) / 2;
    const int order = compareNames(symbols[mid]->getName(), name);
    if (order == 0) {
      // Outwards from any one that is equal: the run is what is answered, so its length is no loss.
      auto from = static_cast<uint32_t>(mid);
      uint32_t to = from;
      while (from > 0 && compareNames(symbols[from - 1]->getName(), name) == 0)
        --from;
      while (to + 1 < symbols.size() && compareNames(symbols[to + 1]->getName(), name) == 0)
        ++to;
      return {true, from, to};
    }
    if (order < 0)
      low = mid + 1;
    else
      high = mid;
  }
  return {};
}

bool collect(SymbolView symbols, const SymbolRun& run, uint32_t mask, SymbolList* list) {
  list->setSize(0);
  if (!run.isFound) return false;
  // Counted first, so that the list is sized once.
  uint32_t goodSymbolCount = 0;
  for (uint32_t index = run.fromIndex; index <= run.toIndex; ++index)
    goodSymbolCount += passes(*symbols[index], mask) ? 1 : 0;
  list->setSize(goodSymbolCount);
  uint32_t listIndex = 0;
  for (uint32_t index = run.fromIndex; index <= run.toIndex; ++index)
    if (passes(*symbols[index], mask)) list->set(listIndex++, symbols[index]);
  QUARN_ASSERT(1, listIndex == goodSymbolCount);
  return goodSymbolCount != 0;
}

} // namespace elfext
