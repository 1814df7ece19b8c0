// SPDX-License-Identifier: Apache-2.0
//
// The chained hash behind the four tables and sets. It starts with 17 buckets and grows above a
// load of three quarters, to 26, 40, 61, 92 and so on. A new node goes to the head of its chain.
// There is no iterator, only the derived classes' export, whose order is that of the buckets.

#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/hash_functions.h"
#include "elfext/interface/storage.h"

#include <cstdint>
#include <memory>
#include <new>
#include <type_traits>

namespace elfext {

/// `Node` has the members `key` and `next`; it owns nothing, as nodes are never destroyed.
template <class Node, class Storage>
class HashBase : protected Storage {
  static_assert(std::is_trivially_destructible_v<Node>, "nodes are never destroyed");
  static_assert(alignof(Node) <= 8, "nodes are aligned for 8");

public:
  using Key = decltype(Node::key);

  HashBase(const HashBase&) = delete;
  HashBase& operator=(const HashBase&) = delete;

  /// Entries.
  [[nodiscard]] uint32_t getSize() const { return m_Entries; }
  [[nodiscard]] uint32_t getBucketCount() const { return m_HashTableSize; }

  /// Removes the key; false if it was not there.
  bool remove(const Key& key) {
    for (Node** link = &getBucket(key); *link != nullptr; link = &(*link)->next) {
      if (!((*link)->key == key)) continue;
      Node* node = *link;
      *link = node->next;
      this->release(node, sizeof(Node));
      --m_Entries;
      return true;
    }
    return false;
  }

protected:
  template <class... Arguments>
  explicit HashBase(HashFunction<Key> hashFunction, Arguments... storageArguments)
      : Storage(storageArguments...), m_HashFunction(hashFunction),
        m_Buckets(allocateBuckets(m_HashTableSize)) {}

  ~HashBase() {
    forEachNode([this](Node* node) { this->release(node, sizeof(Node)); });
    releaseBuckets();
  }

  [[nodiscard]] Node* findNode(const Key& key) const {
    Node* node = getBucket(key);
    while (node != nullptr && !(node->key == key))
      node = node->next;
    return node;
  }

  /// Takes the key, which is not there yet, and what else the node has.
  template <class... Values>
  Node* addNode(const Key& key, const Values&... values) {
    Node*& head = getBucket(key);
    head = ::new (this->allocate(sizeof(Node))) Node{key, values..., head};
    ++m_Entries;
    return head;
  }

  /// Comes before each insertion, even of a key that is there.
  void growIfLoaded() {
    if (m_Entries * 4 <= m_HashTableSize * 3) return;
    const uint32_t newHashTableSize = (m_HashTableSize * 3) / 2 + 1;
    QUARN_ASSERT(1, newHashTableSize > m_HashTableSize);
    rehash(newHashTableSize);
  }

  /// The visitor may release the node.
  template <class Visitor>
  void forEachNode(Visitor visit) const {
    for (uint32_t bucket = 0; bucket < m_HashTableSize; ++bucket) {
      for (Node *node = m_Buckets[bucket], *next = nullptr; node != nullptr; node = next) {
        next = node->next;
        visit(node);
      }
    }
  }

private:
  [[nodiscard]] Node*& getBucket(const Key& key) const {
    uint32_t hash = m_HashFunction(&key);
// Another seed, for the builds that look for output that depends on the order.
#ifdef QUARN_SHAKE_ORDER
    hash ^= 0x9E3779B9;
#endif
    return m_Buckets[hash % m_HashTableSize];
  }

  Node** allocateBuckets(uint32_t count) {
    auto** buckets = static_cast<Node**>(this->allocate(size_t{count} * sizeof(Node*)));
    std::uninitialized_fill_n(buckets, count, nullptr);
    return buckets;
  }

  void releaseBuckets() {
    this->release(m_Buckets, size_t{m_HashTableSize} * sizeof(Node*));
  }

  /// Moves the nodes, from bucket 0 and each chain's head on, to the heads of their new chains.
  void rehash(uint32_t newHashTableSize) {
    Node** oldBuckets = m_Buckets;
    const uint32_t oldHashTableSize = m_HashTableSize;
    m_Buckets = allocateBuckets(newHashTableSize);
    m_HashTableSize = newHashTableSize;
    for (uint32_t bucket = 0; bucket < oldHashTableSize; ++bucket) {
      while (Node* node = oldBuckets[bucket]) {
        oldBuckets[bucket] = node->next;
        Node*& head = getBucket(node->key);
        node->next = head;
        head = node;
      }
    }
    this->release(oldBuckets, size_t{oldHashTableSize} * sizeof(Node*));
  }

  HashFunction<Key> m_HashFunction;
  uint32_t m_HashTableSize = 17;
  Node** m_Buckets;
  uint32_t m_Entries = 0;
};

/// The two kinds of nodes, and what a table exports.
template <class K, class V>
struct HashTableNode {
  K key;
  V value;
  HashTableNode* next;
};

template <class K>
struct HashSetNode {
  K key;
  HashSetNode* next;
};

template <class K, class V>
struct HashEntry {
  K key;
  V value;
};

/// What both families' tables can do.
template <class K, class V, class Storage>
class HashTableBase : public HashBase<HashTableNode<K, V>, Storage> {
public:
  /// Replaces the value of a key that is there.
  void put(const K& key, const V& value) {
    this->growIfLoaded();
    if (HashTableNode<K, V>* node = this->findNode(key))
      node->value = value;
    else
      this->addNode(key, value);
  }

  /// The key must be there.
  [[nodiscard]] V get(const K& key) const {
    if (const V* value = find(key)) return *value;
    QUARN_ASSERT(1, false);
    return V{};
  }

  /// The key's value, in place; null if the key is not there. Valid until the key is removed.
  [[nodiscard]] V* find(const K& key) const {
    HashTableNode<K, V>* node = this->findNode(key);
    return node == nullptr ? nullptr : &node->value;
  }

  [[nodiscard]] bool containsKey(const K& key) const { return this->findNode(key) != nullptr; }

  /// Replaces the array's elements by all HashEntry<K, V>. Sort them before their order can show.
  template <class EntryArray>
  void exportEntries(EntryArray& entries) const {
    entries.setSize(this->getSize());
    uint32_t index = 0;
    this->forEachNode([&](const HashTableNode<K, V>* node) {
      entries[index++] = HashEntry<K, V>{node->key, node->value};
    });
  }

protected:
  using HashBase<HashTableNode<K, V>, Storage>::HashBase;
};

/// What both families' sets can do.
template <class K, class Storage>
class HashSetBase : public HashBase<HashSetNode<K>, Storage> {
public:
  /// False if the key was there already.
  bool add(const K& key) {
    this->growIfLoaded();
    if (contains(key)) return false;
    this->addNode(key);
    return true;
  }

  [[nodiscard]] bool contains(const K& key) const { return this->findNode(key) != nullptr; }

  /// Replaces the array's elements by all keys. Sort them before their order can show.
  template <class KeyArray>
  void exportKeys(KeyArray& keys) const {
    keys.setSize(this->getSize());
    uint32_t index = 0;
    this->forEachNode([&](const HashSetNode<K>* node) { keys[index++] = node->key; });
  }

protected:
  using HashBase<HashSetNode<K>, Storage>::HashBase;
};

} // namespace elfext
