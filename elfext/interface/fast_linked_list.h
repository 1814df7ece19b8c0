// SPDX-License-Identifier: Apache-2.0
//
// A singly linked list in a region. Its iterator also holds the node before its own, so that it
// can insert and remove where it stands.
//
// For lists that are edited in the middle. Appending, and inserting or removing where an iterator
// stands, cost the same however long the list is.

#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/storage.h"

#include <cstdint>
#include <new>
#include <type_traits>

namespace elfext {

template <class T>
class FastLinkedList : private RegionStorage {
  static_assert(std::is_trivially_destructible_v<T>, "elements are never destroyed");

  struct Node {
    T element;
    Node* next;
  };
  static_assert(alignof(Node) <= 8, "nodes are aligned for 8");

public:
  /// A place in the list, or the end behind its last element. Valid until its node, or the one
  /// before, is removed by another iterator.
  class Iterator {
  public:
    [[nodiscard]] T& operator*() const {
      QUARN_ASSERT(1, m_Current != nullptr);
      return m_Current->element;
    }
    Iterator& operator++() {
      QUARN_ASSERT(1, m_Current != nullptr);
      m_Previous = m_Current;
      m_Current = m_Current->next;
      return *this;
    }
    [[nodiscard]] bool operator==(const Iterator& other) const {
      return m_Current == other.m_Current;
    }

    /// Puts an element in front of the current one and stands on it.
    void insert(const T& element) { m_Current = m_List->insertBehind(m_Previous, element); }
    /// Removes the current element and stands on the next one.
    void remove() {
      QUARN_ASSERT(1, m_Current != nullptr);
      m_Current = m_List->removeBehind(m_Previous);
    }

  private:
    friend class FastLinkedList;
    Iterator(Node* current, Node* previous, FastLinkedList* list)
        : m_Current(current), m_Previous(previous), m_List(list) {}

    Node* m_Current;
    Node* m_Previous;
    FastLinkedList* m_List;
  };

  explicit FastLinkedList(alloclib::Region* region) : RegionStorage(region) {}
  ~FastLinkedList() { clear(); }
  FastLinkedList(const FastLinkedList&) = delete;
  FastLinkedList& operator=(const FastLinkedList&) = delete;

  [[nodiscard]] uint32_t getSize() const { return m_Size; }
  [[nodiscard]] bool isEmpty() const { return m_Size == 0; }

  void append(const T& element) { insertBehind(m_Tail, element); }
  void prepend(const T& element) { insertBehind(nullptr, element); }
  void clear() {
    while (m_Head != nullptr)
      removeBehind(nullptr);
  }

  [[nodiscard]] Iterator begin() { return {m_Head, nullptr, this}; }
  [[nodiscard]] Iterator end() { return {nullptr, m_Tail, this}; }

private:
  /// Behind nothing is at the head.
  Node*& getLinkBehind(Node* previous) { return previous != nullptr ? previous->next : m_Head; }

  Node* insertBehind(Node* previous, const T& element) {
    Node*& link = getLinkBehind(previous);
    link = ::new (allocate(sizeof(Node))) Node{element, link};
    if (m_Tail == previous) m_Tail = link;
    ++m_Size;
    return link;
  }

  /// Returns the node that has moved up.
  Node* removeBehind(Node* previous) {
    Node*& link = getLinkBehind(previous);
    Node* removed = link;
    link = removed->next;
    if (m_Tail == removed) m_Tail = previous;
    release(removed, sizeof(Node));
    --m_Size;
    return link;
  }

  Node* m_Head = nullptr;
  Node* m_Tail = nullptr;
  uint32_t m_Size = 0;
};

} // namespace elfext
