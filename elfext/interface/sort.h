// SPDX-License-Identifier: Apache-2.0
//
// The two sorts. The merge sort is stable and makes the sorted views of the object model. The
// smoothsort needs no memory and is quick on sorted input; what it sorts needs a key that tells
// all items apart wherever the order of equal ones could show.
//
// Smoothsort keeps a row of heaps whose sizes are Leonardo numbers (1, 1, 3, 5, 9, 15, ...: each
// the sum of the two before and one). A mask has a bit for each size that occurs, shifted so that
// the smallest heap, the last one, is bit 0; the pair of Leonardo numbers for bit 0 is stepped
// along with the shifts.

#pragma once

#include "checking/interface/checking.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <span>
#include <type_traits>
#include <utility>

namespace elfext {

/// Below 0, 0 or above 0 as the left item comes before, with or after the right one.
using CompareProc = int (*)(const void* left, const void* right, void* context);

/// Sorts an array of 8-byte items, such as pointers; the procedure gets pointers to items and the
/// context word. Stable.
void sort(void* base, size_t count, CompareProc compareProc, void* context);

namespace sorting {

/// For a temporary array on the heap; never null.
[[nodiscard]] void* allocateScratch(size_t count, size_t itemSize);

/// Merges the sorted halves [0, middle) and [middle, count) by way of the scratch array.
template <class T, class Compare>
void merge(T* items, size_t middle, size_t count, T* scratch, Compare& compare) {
  std::copy_n(items, middle, scratch);
  size_t left = 0;
  size_t right = middle;
  T* out = items;
  while (left < middle && right < count)
    *out++ = compare(scratch[left], items[right]) < 1 ? scratch[left++] : items[right++];
  // What is left of the right half is in place.
  std::copy(scratch + left, scratch + middle, out);
}

template <class T, class Compare>
void mergeSortHalves(T* items, size_t count, T* scratch, Compare& compare) {
  if (count < 2) return;
  const size_t middle = count / 2;
  mergeSortHalves(items, middle, scratch, compare);
  mergeSortHalves(items + middle, count - middle, scratch, compare);
  merge(items, middle, count, scratch, compare);
}

/// The row of heaps. `bm0` is the mask, `size` the Leonardo number of bit 0, `below` the one
/// before it.
struct Shape {
  uint64_t bm0 = 1;
  size_t size = 1;
  size_t below = 1;

  void stepUp() {
    bm0 >>= 1;
    const size_t larger = size + below + 1;
    below = size;
    size = larger;
  }
  void stepDown() {
    bm0 <<= 1;
    const size_t smaller = size - below - 1;
    size = below;
    below = smaller;
  }
  /// Up to the next heap in the row.
  void normalise() {
    while ((bm0 & 1) == 0)
      stepUp();
  }
};

template <class T, class IsLess>
class SmoothSorter {
public:
  SmoothSorter(T* items, IsLess& isLess) : m_Items(items), m_IsLess(isLess) {}

  void sort(size_t count) {
    Shape shape = makeHeaps(count);
    for (size_t root = count - 1; root != 0; --root)
      removeLast(root, shape);
  }

private:
  /// Lets the root's item sink in its heap.
  void sift(size_t root, size_t size, size_t below) {
    while (size >= 3) {
      const size_t right = root - 1;
      const size_t left = right - (size - below - 1);
      const bool takesLeft = !m_IsLess(m_Items[left], m_Items[right]);
      const size_t child = takesLeft ? left : right;
      if (!m_IsLess(m_Items[root], m_Items[child])) return;
      std::swap(m_Items[root], m_Items[child]);
      root = child;
      const size_t smaller = size - below - 1;
      size = takesLeft ? below : smaller;
      below = takesLeft ? smaller : below - smaller - 1;
    }
  }

  /// Whether the item of another heap's root belongs above the root and both its children.
  [[nodiscard]] bool isAboveHeap(size_t candidate, size_t root, size_t size, size_t below) const {
    if (!m_IsLess(m_Items[root], m_Items[candidate])) return false;
    if (size < 3) return true;
    const size_t right = root - 1;
    const size_t left = right - (size - below - 1);
    return m_IsLess(m_Items[right], m_Items[candidate]) &&
           m_IsLess(m_Items[left], m_Items[candidate]);
  }

  /// Moves the root's item along the row, to the left, as long as the root there is greater; then
  /// lets it sink. The roots of the row ascend afterwards.
  void trinkle(size_t root, const Shape* sptr) {
    Shape shape = *sptr;
    QUARN_ASSERT(1, (sptr->bm0 & 1));
    while (shape.bm0 != 1) {
      const size_t previous = root - shape.size;
      if (!isAboveHeap(previous, root, shape.size, shape.below)) break;
      std::swap(m_Items[root], m_Items[previous]);
      root = previous;
      shape.bm0 &= ~uint64_t{1};
      shape.normalise();
    }
    sift(root, shape.size, shape.below);
  }

  /// Grows the row by one item at a time. A heap that will be part of a larger one before the end
  /// need not be in order with its neighbours yet.
  Shape makeHeaps(size_t count) {
    Shape shape;
    for (size_t root = 0; root + 1 < count; ++root) {
      if ((shape.bm0 & 3) == 3) {
        sift(root, shape.size, shape.below);
        shape.stepUp();
        shape.stepUp();
        shape.bm0 |= 1;
        continue;
      }
      QUARN_ASSERT(1, !(shape.bm0 & 2));
      if (root + shape.below + 1 < count)
        sift(root, shape.size, shape.below);
      else
        trinkle(root, &shape);
      startSingle(shape);
    }
    trinkle(count - 1, &shape);
    return shape;
  }

  /// Adds a heap of one item at the end of the row.
  static void startSingle(Shape& shape) {
    do
      shape.stepDown();
    while (shape.size != 1);
    shape.bm0 |= 1;
  }

  /// Takes the greatest item, the last root, off the row; what was below it makes two heaps.
  void removeLast(size_t root, Shape& shape) {
    shape.bm0 &= ~uint64_t{1};
    if (shape.size == 1) {
      shape.normalise();
      return;
    }
    const size_t rightSize = shape.size - shape.below - 1;
    shape.stepDown();
    shape.bm0 |= 1;
    trinkle(root - 1 - rightSize, &shape);
    shape.stepDown();
    shape.bm0 |= 1;
    trinkle(root - 1, &shape);
  }

  T* m_Items;
  IsLess& m_IsLess;
};

} // namespace sorting

/// Puts the items into another order before a sort whose result must not depend on it, in the
/// builds that look for such dependence; nothing in all others.
template <class T>
void shakeOrder([[maybe_unused]] std::span<T> items) {
#ifdef QUARN_SHAKE_ORDER
  uint32_t state = 12345;
  for (size_t count = items.size(); count > 1; --count) {
    state = state * 1664525 + 1013904223;
    std::swap(items[count - 1], items[state % count]);
  }
#endif
}

/// Stable. `compare(left, right)` answers as a CompareProc does.
template <class T, class Compare>
void mergeSort(std::span<T> items, Compare compare) {
  static_assert(std::is_trivially_copyable_v<T>);
  static_assert(!std::is_same_v<std::invoke_result_t<Compare&, const T&, const T&>, bool>,
                "the comparison has three results");
  if (items.size() < 2) return;
  auto* scratch = static_cast<T*>(sorting::allocateScratch(items.size() / 2, sizeof(T)));
  sorting::mergeSortHalves(items.data(), items.size(), scratch, compare);
  std::free(scratch);
}

/// Not stable, without memory of its own. `isLess(left, right)` is a strict order.
template <class T, class IsLess>
void smoothSort(std::span<T> items, IsLess isLess) {
  if (items.size() < 2) return;
  shakeOrder(items);
  sorting::SmoothSorter<T, IsLess>(items.data(), isLess).sort(items.size());
}

} // namespace elfext
