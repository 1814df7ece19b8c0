// SPDX-License-Identifier: Apache-2.0
//
// The array on the general heap, for what outlives any region. It frees its block when it goes.
//
// The string cache uses it; the model's are FastArrays, which differ in nothing but where the
// memory comes from.

#pragma once

#include "elfext/interface/array_base.h"

namespace elfext {

template <class T>
class Array : public ArrayBase<T, HeapStorage> {
public:
  /// Empty, with room for one element.
  Array() : ArrayBase<T, HeapStorage>(0) {}
};

} // namespace elfext
