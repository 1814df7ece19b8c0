// SPDX-License-Identifier: Apache-2.0
//
// Of many holders, the first one for each of many guests. A file may have ten thousands of each, so
// they are not held against one another but sorted; the answer is that of going through the holders
// in the order of their ids.
#pragma once

#include "elfext/src/bytes/extents.h"

#include <cstdint>
#include <span>
#include <vector>

namespace elfext {

// Takes guests whose place is one of `firstPlace` to `lastPlace`, both included, and whose numbers
// all are among its own.
struct Holder {
  uint64_t firstPlace = 0;
  uint64_t lastPlace = 0;
  uint64_t start = 0;
  uint64_t size = 0;
  uint32_t id = 0;
};

// Has `size` numbers from `start` on; without any, it needs that place itself.
struct Guest {
  uint64_t place = 0;
  uint64_t start = 0;
  uint64_t size = 0;
};

// For each guest, the lowest id of a holder that takes it, or NoExtent.
[[nodiscard]] std::vector<uint32_t> findFirstHolders(std::span<const Holder> holders,
                                                     std::span<const Guest> guests);

} // namespace elfext
