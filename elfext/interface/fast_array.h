// SPDX-License-Identifier: Apache-2.0
//
// The array of the object model, in a region. Destroying it hands its block back to the region;
// destroying the region without it is as good.
//
// A block that an array has outgrown goes back to the region at once; elements themselves are never
// destroyed, so they own nothing.

#pragma once

#include "elfext/interface/array_base.h"

namespace elfext {

template <class T>
class FastArray : public ArrayBase<T, RegionStorage> {
public:
  /// Empty, with room for one element.
  explicit FastArray(alloclib::Region* region) : FastArray(region, 0) {}

  /// So many elements, for the caller to fill.
  FastArray(alloclib::Region* region, uint32_t size) : ArrayBase<T, RegionStorage>(size, region) {}
};

} // namespace elfext
