// SPDX-License-Identifier: Apache-2.0
//
// The relocations that a search has found, in a list of its caller's.
//
// Most searches find a few, which need no memory of their own; see ResultList.
#pragma once

#include "elfext/interface/result_list.h"

#include <cstddef>

namespace elfext {

class Relocation;

class RelocationList : public ResultList<Relocation, 7> {
public:
  /// Fills a place that setSize has made.
  void set(uint32_t index, Relocation* relocation) {
    QUARN_ASSERT(1, relocation != NULL);
    store(index, relocation);
  }
};

} // namespace elfext
