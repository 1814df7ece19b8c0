// SPDX-License-Identifier: Apache-2.0
//
// A set in a region. Keys compare with ==: pointers by address, texts by their bytes.
//
// What both hash sets can do is in hash_base.h. Its order is that of the hashes and must not show.

#pragma once

#include "elfext/interface/hash_base.h"

namespace elfext {

template <class K>
class FastHashSet : public HashSetBase<K, RegionStorage> {
public:
  explicit FastHashSet(alloclib::Region* region, HashFunction<K> hashFunction = &hashKey<K>)
      : HashSetBase<K, RegionStorage>(hashFunction, region) {}
};

} // namespace elfext
