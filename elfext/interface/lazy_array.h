// SPDX-License-Identifier: Apache-2.0
//
// An array that most objects never fill: no more than a null pointer until its first element
// comes. A file may have ten thousands of sections, each with a dozen lists.
#pragma once

#include "alloclib/interface/region_objects.h"
#include "elfext/interface/fast_array.h"

#include <algorithm>
#include <cstdint>
#include <span>

namespace elfext {

template <class T, uint32_t InitialCapacity = 1>
class LazyArray {
public:
  [[nodiscard]] uint32_t getSize() const { return m_Array == nullptr ? 0 : m_Array->getSize(); }
  [[nodiscard]] bool isEmpty() const { return getSize() == 0; }
  [[nodiscard]] std::span<T> getSpan() const {
    return m_Array == nullptr ? std::span<T>() : m_Array->getSpan();
  }
  [[nodiscard]] T* begin() const { return getSpan().data(); }
  [[nodiscard]] T* end() const { return getSpan().data() + getSize(); }

  [[nodiscard]] T& operator[](uint32_t index) const {
    QUARN_ASSERT(1, m_Array != nullptr);
    return (*m_Array)[index];
  }

  [[nodiscard]] bool contains(const T& value) const {
    return m_Array != nullptr && m_Array->contains(value);
  }

  /// The array, made in the region now if it wasn't yet.
  FastArray<T>& get(alloclib::RegionGeneral& region) {
    if (m_Array != nullptr) return *m_Array;
    m_Array = alloclib::create<FastArray<T>>(region, &region);
    m_Array->reserve(InitialCapacity);
    return *m_Array;
  }

  void append(alloclib::RegionGeneral& region, const T& element) { get(region).append(element); }

  /// Those below do nothing to an array that was never filled. The order of the others stays.
  void remove(uint32_t index) {
    QUARN_ASSERT(1, m_Array != nullptr);
    m_Array->remove(index);
  }
  void removeValue(const T& value) {
    if (m_Array != nullptr) m_Array->removeValue(value);
  }
  template <class Predicate>
  void removeIf(Predicate goes) {
    if (m_Array == nullptr) return;
    T* kept = std::remove_if(m_Array->begin(), m_Array->end(), goes);
    m_Array->setSize(static_cast<uint32_t>(kept - m_Array->begin()));
  }
  void clear() {
    if (m_Array != nullptr) m_Array->setSize(0);
  }

private:
  FastArray<T>* m_Array = nullptr;
};

} // namespace elfext
