// SPDX-License-Identifier: Apache-2.0
//
// The symbols that a search has found, in a list of its caller's.
//
// Most searches find a few, which need no memory of their own; see ResultList.
#pragma once

#include "elfext/interface/result_list.h"

#include <cstddef>

namespace elfext {

class Symbol;

class SymbolList : public ResultList<Symbol, 7> {
public:
  /// Fills a place that setSize has made.
  void set(uint32_t index, Symbol* symbol) {
    QUARN_ASSERT(1, symbol != NULL);
    store(index, symbol);
  }
};

} // namespace elfext
