// SPDX-License-Identifier: Apache-2.0
//
// Objects and texts in regions. Nothing in a region is destructed when the region goes: an object
// that owns an outside resource must be destructed by its owner first. Classes that live here by
// the thousand assert at their own place that they are trivially destructible.

#pragma once

#include "alloclib/interface/region_general.h"

#include <cstring>
#include <memory>
#include <new>
#include <string_view>
#include <utility>

namespace alloclib {

/// A new object in the region. Its destructor does not run when the region goes.
template <class T, class... Arguments>
[[nodiscard]] T* create(RegionGeneral& region, Arguments&&... arguments) {
  return ::new (region.allocate(sizeof(T), alignof(T))) T(std::forward<Arguments>(arguments)...);
}

/// A copy of the text in the region, with a NUL behind it.
[[nodiscard]] inline const char* copyString(RegionGeneral& region, std::string_view text) {
  auto* copy = static_cast<char*>(region.allocate(text.size() + 1, 1));
  if (!text.empty()) std::memcpy(copy, text.data(), text.size());
  copy[text.size()] = '\0';
  return copy;
}

/// For RegionOwner; the region must be one that may be destroyed with its memory given back.
struct RegionDeleter {
  void operator()(RegionGeneral* region) const { region->Destroy(true); }
};

/// Ends the region, with all that is in it, when its owner goes.
using RegionOwner = std::unique_ptr<RegionGeneral, RegionDeleter>;

} // namespace alloclib
