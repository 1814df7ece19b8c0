// SPDX-License-Identifier: Apache-2.0
//
// A set on the general heap, for what outlives any region.
//
// What both hash sets can do is in hash_base.h. Its order is that of the hashes and must not show.

#pragma once

#include "elfext/interface/hash_base.h"

namespace elfext {

template <class K>
class HashSet : public HashSetBase<K, HeapStorage> {
public:
  explicit HashSet(HashFunction<K> hashFunction = &hashKey<K>)
      : HashSetBase<K, HeapStorage>(hashFunction) {}
};

} // namespace elfext
