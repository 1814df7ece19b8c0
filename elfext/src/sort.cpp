// SPDX-License-Identifier: Apache-2.0
//
// The merge sort for items whose type is not known here: eight bytes each, which it moves as
// numbers and shows to the compare procedure in place. Who knows the type of his items calls the
// templates of the header.

#include "elfext/interface/sort.h"

#include "alloclib/interface/handlers.h"

namespace elfext {

void* sorting::allocateScratch(size_t count, size_t itemSize) {
  // The items are in memory already, so the product cannot wrap.
  void* scratch = std::malloc(count * itemSize);
  if (scratch == nullptr) alloclib::outOfMemory(count * itemSize);
  return scratch;
}

void sort(void* base, size_t count, CompareProc compareProc, void* context) {
  QUARN_ASSERT(1, base != NULL);
  QUARN_ASSERT(1, compareProc != NULL);
  mergeSort(std::span(static_cast<uint64_t*>(base), count),
            [=](const uint64_t& left, const uint64_t& right) {
              return compareProc(&left, &right, context);
            });
}

} // namespace elfext
