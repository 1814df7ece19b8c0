// SPDX-License-Identifier: Apache-2.0
//
// Where the containers take their memory from: the one thing in which the fast family and the
// plain family differ. Neither ever yields null.

#pragma once

#include "alloclib/interface/handlers.h"
#include "alloclib/interface/region_base.h"
#include "checking/interface/checking.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>

namespace elfext {

// Products of a 32-bit count and an element size must not wrap.
static_assert(sizeof(size_t) == 8);

/// Memory of a region, which may be destroyed before the container.
class RegionStorage {
protected:
  explicit RegionStorage(alloclib::Region* region) : m_Region(region) {
    QUARN_ASSERT(1, region != NULL);
  }

  void mustBeUsable() const { QUARN_ASSERT(1, m_Region != NULL); }

  [[nodiscard]] void* allocate(size_t bytes) { return m_Region->AllocFull(bytes, 8, nullptr); }
  void release(void* start, size_t bytes) { m_Region->DiscardFull(start, bytes, 8); }

  /// A block of elements is padded to a multiple of 8 and ends with one more word, which holds the
  /// block's own start: both ends of what goes back to the region follow from the elements alone.
  [[nodiscard]] void* allocateElements(size_t bytes) {
    const size_t padded = alloclib::roundUp(bytes, 8);
    void* start = allocate(padded + sizeof start);
    std::memcpy(static_cast<char*>(start) + padded, &start, sizeof start);
    return start;
  }

  void releaseElements(void* elements, size_t bytes) {
    char* word = static_cast<char*>(elements) + alloclib::roundUp(bytes, 8);
    char* start = nullptr;
    std::memcpy(&start, word, sizeof start);
    release(start, static_cast<size_t>(word - start) + sizeof start);
  }

  alloclib::Region* m_Region;
};

/// Memory of the general heap, for containers that outlive any region.
class HeapStorage {
protected:
  void mustBeUsable() const {}

  [[nodiscard]] void* allocate(size_t bytes) {
    void* block = std::malloc(bytes);
    if (block == nullptr) alloclib::outOfMemory(bytes);
    return block;
  }
  void release(void* start, size_t) { std::free(start); }

  [[nodiscard]] void* allocateElements(size_t bytes) { return allocate(bytes); }
  void releaseElements(void* elements, size_t) { std::free(elements); }
};

} // namespace elfext
