// SPDX-License-Identifier: Apache-2.0
// What the compiler checks of every built-in catalogue.
#pragma once

#include "messages/interface/catalogue.h"

#include <algorithm>

namespace messages {

// The look-up is a binary search, and a key that stood twice would hide a text.
constexpr bool isSortedAndUnique(std::span<const CatalogueRow> rows) {
  const auto notAscending = [](const CatalogueRow& row, const CatalogueRow& next) {
    return row.key >= next.key;
  };
  return std::adjacent_find(rows.begin(), rows.end(), notAscending) == rows.end();
}

} // namespace messages
