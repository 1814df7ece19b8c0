// SPDX-License-Identifier: Apache-2.0
//
// The root of all regions: it forwards to the host's heap, and is where the process finds that
// memory has run out. As all else is given back through it, the balance that it checks at the end
// shows memory that some region above has kept.

#pragma once

#include "alloclib/interface/region_base.h"

namespace alloclib {

class RegionStats;

/// One for the process, made by initialise, and one for each transparent page allocator.
class RegionMallocFree final : public Region {
public:
  /// The name is kept, not copied. The caller ends the region with Destroy.
  static RegionMallocFree* Create(const char* name);

  void* AllocFull(size_t size, size_t alignment, const char* fileLine) override;
  void DiscardFull(void* pointer, size_t size, size_t alignment) override;
  /// With true, memory that was not given back is an internal error.
  void Destroy(bool freeMemory) override;

  /// Bytes that the region holds from the host now.
  [[nodiscard]] size_t getCurrentSize() const;

private:
  explicit RegionMallocFree(RegionStats* stats) : m_Stats(stats) {}

  RegionStats* m_Stats;
};

} // namespace alloclib
