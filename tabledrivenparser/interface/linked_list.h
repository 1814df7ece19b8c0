// SPDX-License-Identifier: Apache-2.0
//
// The list behind every vector value. Most lists hold one element, so that one lies inside the list
// object; the others are nodes from a region and die with it. A list and not an array: elements
// come one at a time for as long as the user goes on, and nothing ever asks for the n-th.
//
// Words of a command line are up to the user, also their number: appending is at the tail and costs
// the same for the first and the hundred thousandth.

#pragma once

#include "alloclib/interface/region.h"
#include "alloclib/interface/region_objects.h"

#include <cstdint>
#include <string_view>

namespace tabledrivenparser {

struct MatchString;

template <class T>
struct LinkedListNode {
  T value{};
  LinkedListNode* next = nullptr;
};

namespace detail {
/// Texts are equal by their characters, everything else as itself.
template <class T>
[[nodiscard]] bool sameElement(T left, T right) {
  return left == right;
}
[[nodiscard]] inline bool sameElement(const char* left, const char* right) {
  return std::string_view(left) == std::string_view(right);
}
} // namespace detail

/// The elements are plain values: the list owns its nodes, never what an element points at. The
/// region must live as long as the list. The list stays where it was made, since it may point at
/// its own inside.
template <class T>
class LinkedList {
public:
  static constexpr uint32_t Absent = 0xFFFFFFFF;

  class Iterator {
  public:
    explicit Iterator(const LinkedListNode<T>* node) : m_Node(node) {}
    T operator*() const { return m_Node->value; }
    Iterator& operator++() {
      m_Node = m_Node->next;
      return *this;
    }
    bool operator==(const Iterator&) const = default;

  private:
    const LinkedListNode<T>* m_Node;
  };

  /// Empty, and without a node of the region: the first element needs none.
  explicit LinkedList(alloclib::RegionGeneral& region) : m_Region(&region) {}
  LinkedList(const LinkedList&) = delete;
  LinkedList& operator=(const LinkedList&) = delete;

  [[nodiscard]] bool isEmpty() const { return m_Tail == nullptr; }
  /// Counts the elements by walking them.
  [[nodiscard]] uint32_t size() const {
    uint32_t count = 0;
    for (auto element = begin(); element != end(); ++element)
      ++count;
    return count;
  }
  [[nodiscard]] Iterator begin() const { return Iterator(isEmpty() ? nullptr : &m_First); }
  [[nodiscard]] Iterator end() const { return Iterator(nullptr); }

  /// At the end, in the same time whatever the length.
  void append(T value) {
    LinkedListNode<T>* node = &m_First;
    if (!isEmpty()) {
      node = alloclib::create<LinkedListNode<T>>(*m_Region);
      m_Tail->next = node;
    }
    node->value = value;
    node->next = nullptr;
    m_Tail = node;
  }

  /// The position of the first element equal to value, Absent if there is none.
  [[nodiscard]] uint32_t indexOf(T value) const {
    uint32_t index = 0;
    for (T element : *this) {
      if (detail::sameElement(element, value)) return index;
      ++index;
    }
    return Absent;
  }

  /// Removes every element equal to value; the others keep their order.
  void removeAll(T value) {
    removeWhere([value](T element) { return detail::sameElement(element, value); });
  }

  /// For lists of texts: removes every element that begins with prefix.
  void removeAllWithPrefix(std::string_view prefix) requires requires(T element) {
    std::string_view(element);
  }
  {
    removeWhere([prefix](T element) { return std::string_view(element).starts_with(prefix); });
  }

  /// Forgets all elements; the nodes stay with the region.
  void clear() {
    m_First.next = nullptr;
    m_Tail = nullptr;
  }

private:
  /// What stays moves to the front, so that the first element lies in the list object again.
  template <class Predicate>
  void removeWhere(Predicate isUnwanted) {
    if (isEmpty()) return;
    LinkedListNode<T>* lastKept = nullptr;
    LinkedListNode<T>* free = &m_First;
    for (const LinkedListNode<T>* node = &m_First; node != nullptr; node = node->next) {
      if (isUnwanted(node->value)) continue;
      free->value = node->value;
      lastKept = free;
      free = free->next;
    }
    m_Tail = lastKept;
    if (lastKept != nullptr) lastKept->next = nullptr;
  }

  LinkedListNode<T> m_First;
  LinkedListNode<T>* m_Tail = nullptr; ///< null while the list is empty
  alloclib::RegionGeneral* m_Region;
};

using StrList = LinkedList<const char*>;
using IntegerList = LinkedList<int>;
using LongIntegerList = LinkedList<long long>;
using RowList = LinkedList<const MatchString*>;
using OwnedMemory = LinkedList<void*>;

} // namespace tabledrivenparser
