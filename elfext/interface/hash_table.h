// SPDX-License-Identifier: Apache-2.0
//
// A map on the general heap, for what outlives any region.
//
// What both hash tables can do is in hash_base.h. Its order is that of the hashes and must not
// show.

#pragma once

#include "elfext/interface/hash_base.h"

namespace elfext {

template <class K, class V>
class HashTable : public HashTableBase<K, V, HeapStorage> {
public:
  explicit HashTable(HashFunction<K> hashFunction = &hashKey<K>)
      : HashTableBase<K, V, HeapStorage>(hashFunction) {}
};

} // namespace elfext
