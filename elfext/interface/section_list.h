// SPDX-License-Identifier: Apache-2.0
//
// The sections that a search has found, in a list of its caller's.
//
// Most searches find a few, which need no memory of their own; see ResultList.
#pragma once

#include "elfext/interface/result_list.h"

#include <cstddef>

namespace elfext {

class Section;

class SectionList : public ResultList<Section, 7> {
public:
  /// Fills a place that setSize has made.
  void set(uint32_t index, Section* section) {
    QUARN_ASSERT(1, section != NULL);
    store(index, section);
  }
};

} // namespace elfext
