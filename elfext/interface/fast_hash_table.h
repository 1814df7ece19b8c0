// SPDX-License-Identifier: Apache-2.0
//
// A map in a region. Keys compare with ==: pointers by address, texts by their bytes.
//
// What both hash tables can do is in hash_base.h. Its order is that of the hashes and must not
// show.

#pragma once

#include "elfext/interface/hash_base.h"

namespace elfext {

template <class K, class V>
class FastHashTable : public HashTableBase<K, V, RegionStorage> {
public:
  explicit FastHashTable(alloclib::Region* region, HashFunction<K> hashFunction = &hashKey<K>)
      : HashTableBase<K, V, RegionStorage>(hashFunction, region) {}
};

} // namespace elfext
