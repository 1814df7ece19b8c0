// SPDX-License-Identifier: Apache-2.0
//
// Where memory comes from, for clients that do not care which region it is. Regions stack up: a
// RegionGeneral carves small objects from pages of a RegionLargeBlock, which takes chunks from the
// RegionMallocFree at the root. None of them is thread-safe: the tool is one thread.
//
// What lives as long as an archive or an object model is allocated here, and goes with it in a few
// calls, however many objects there are. So nothing in a region may own what lies outside it.

#pragma once

#include <cstddef>

namespace alloclib {

/// An allocator whose memory goes back as a whole. Clients keep a pointer to one that somebody else
/// has made and will end.
class Region {
public:
  Region(const Region&) = delete;
  Region& operator=(const Region&) = delete;

  /// Returns `size` bytes, never null; running out of memory ends the process. `alignment` is a
  /// power of two up to 4096, and 8 is free. The tag names the place of the call, for a debugger,
  /// and may be null. The memory belongs to the region and dies with it at the latest.
  virtual void* AllocFull(size_t size, size_t alignment, const char* fileLine) = 0;

  /// Gives a block back; size and alignment are those of its allocation, as no header in front of a
  /// small block remembers them.
  virtual void DiscardFull(void* pointer, size_t size, size_t alignment) = 0;

  /// Ends the region and all memory in it, whose destructors do not run. With false nothing is
  /// given back, for a process that is about to exit.
  virtual void Destroy(bool freeMemory) = 0;

  /// Brings the region's statistics up to date where it does not keep them so.
  virtual void updateStats() {}

  /// Bytes; blocks of whole pages are what a region hands to another without waste.
  [[nodiscard]] virtual size_t getPageSize() const { return 4096; }

protected:
  Region() = default;
  /// A region is ended by Destroy, since it lies in memory of its own.
  ~Region() = default;
};

/// To the next multiple, itself a power of two. Wraps near the largest size: callers compare first,
/// or test what comes out.
[[nodiscard]] constexpr size_t roundUp(size_t size, size_t multiple) {
  return (size + multiple - 1) & ~(multiple - 1);
}

} // namespace alloclib
