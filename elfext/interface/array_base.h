// SPDX-License-Identifier: Apache-2.0
//
// The growing array behind FastArray and Array. Capacities are 1, 2, 4, 7, 11, 17, 26 and so on;
// counts have 32 bits; misuse is a failed assertion. Elements are copied about and never
// destroyed, so they own nothing.
//
// Counts in files have 32 bits, and so do these. A count that a file claims has been compared with
// the bytes present before anybody reserves for it here: growing only asserts that its numbers
// don't wrap.

#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/sort.h"
#include "elfext/interface/storage.h"

#include <algorithm>
#include <cstdint>
#include <memory>
#include <span>
#include <type_traits>

namespace elfext {

template <class T, class Storage>
class ArrayBase : protected Storage {
  static_assert(std::is_trivially_destructible_v<T>, "elements are never destroyed");
  static_assert(std::is_copy_constructible_v<T>, "elements move when the array grows");
  static_assert(alignof(T) <= 8, "blocks are aligned for 8");

public:
  ArrayBase(const ArrayBase&) = delete;
  ArrayBase& operator=(const ArrayBase&) = delete;

  /// Elements in use.
  [[nodiscard]] uint32_t getSize() const { return m_Used; }
  [[nodiscard]] uint32_t getCapacity() const { return m_Allocated; }
  [[nodiscard]] bool isEmpty() const { return m_Used == 0; }

  [[nodiscard]] T& operator[](uint32_t index) {
    QUARN_ASSERT(1, index < m_Used);
    return m_Elements[index];
  }
  [[nodiscard]] const T& operator[](uint32_t index) const {
    QUARN_ASSERT(1, index < m_Used);
    return m_Elements[index];
  }

  /// Valid until the array grows.
  [[nodiscard]] T* begin() { return m_Elements; }
  [[nodiscard]] T* end() { return m_Elements + m_Used; }
  [[nodiscard]] const T* begin() const { return m_Elements; }
  [[nodiscard]] const T* end() const { return m_Elements + m_Used; }
  [[nodiscard]] std::span<T> getSpan() { return {m_Elements, m_Used}; }
  [[nodiscard]] std::span<const T> getSpan() const { return {m_Elements, m_Used}; }

  /// The element may be one of this array.
  void append(const T& element) {
    if (m_Used == m_Allocated) return appendGrowing(element);
    std::construct_at(m_Elements + m_Used, element);
    ++m_Used;
  }

  /// The elements must not be of this array.
  void append(const T* elements, uint32_t count) {
    QUARN_ASSERT(1, elements != NULL);
    while (count != 0) {
      if (m_Used == m_Allocated) grow(m_Used + 1);
      const uint32_t fitting = std::min(count, m_Allocated - m_Used);
      std::uninitialized_copy_n(elements, fitting, m_Elements + m_Used);
      m_Used += fitting;
      elements += fitting;
      count -= fitting;
    }
  }

  /// Moves what stands at the index and behind it up by one.
  void insert(uint32_t index, const T& element) {
    QUARN_ASSERT(1, index <= m_Used);
    const T copy = element;
    append(copy);
    std::copy_backward(m_Elements + index, end() - 1, end());
    m_Elements[index] = copy;
  }

  /// Keeps the order of the others.
  void remove(uint32_t index) {
    QUARN_ASSERT(1, index < m_Used);
    std::copy(m_Elements + index + 1, end(), m_Elements + index);
    --m_Used;
  }

  /// Removes the first equal element, if there is one.
  void removeValue(const T& value) {
    T* found = std::find(begin(), end(), value);
    if (found != end()) remove(static_cast<uint32_t>(found - begin()));
  }

  /// A linear search: keep a set beside the array where it is asked often.
  [[nodiscard]] bool contains(const T& value) const {
    return std::find(begin(), end(), value) != end();
  }

  /// New elements are left as they are in memory, for the caller to fill; a smaller size releases
  /// and clears nothing.
  void setSize(uint32_t size) {
    reserve(size);
    m_Used = size;
  }

  /// Room for so many elements in all.
  void reserve(uint32_t capacity) {
    if (capacity > m_Allocated) grow(capacity);
  }

  void assign(const ArrayBase& other) {
    if (this == &other) return;
    setSize(other.m_Used);
    std::uninitialized_copy_n(other.m_Elements, other.m_Used, m_Elements);
  }

  /// Not stable; needs no memory, and linear time for sorted input. `isLess(left, right)` is a
  /// strict order.
  template <class IsLess>
  void sort(IsLess isLess) {
    smoothSort(getSpan(), isLess);
  }

protected:
  template <class... Arguments>
  explicit ArrayBase(uint32_t size, Arguments... storageArguments)
      : Storage(storageArguments...), m_Allocated(std::max<uint32_t>(size, 1)), m_Used(size),
        m_Elements(allocateFor(m_Allocated)) {}

  ~ArrayBase() { this->releaseElements(m_Elements, getBytes(m_Allocated)); }

private:
  [[nodiscard]] static size_t getBytes(uint32_t capacity) { return size_t{capacity} * sizeof(T); }

  T* allocateFor(uint32_t capacity) {
    return static_cast<T*>(this->allocateElements(getBytes(capacity)));
  }

  void appendGrowing(const T& element) {
    const T copy = element;
    grow(m_Used + 1);
    std::construct_at(m_Elements + m_Used, copy);
    ++m_Used;
  }

  void grow(uint32_t requiredAllocation) {
    QUARN_ASSERT(1, requiredAllocation > m_Allocated);
    this->mustBeUsable();
    // By half, so that n appends copy no more than a few n elements; a product that wraps is caught
    // below.
    const uint32_t newAllocated = (m_Allocated * 3) / 2 + 1;
    QUARN_ASSERT(1, newAllocated > m_Allocated);
    const uint32_t capacity = std::max(newAllocated, requiredAllocation);
    T* elements = allocateFor(capacity);
    std::uninitialized_copy_n(m_Elements, m_Used, elements);
    this->releaseElements(m_Elements, getBytes(m_Allocated));
    m_Elements = elements;
    m_Allocated = capacity;
  }

  uint32_t m_Allocated;
  uint32_t m_Used;
  T* m_Elements;
};

} // namespace elfext
