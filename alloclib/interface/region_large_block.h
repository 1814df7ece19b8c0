// SPDX-License-Identifier: Apache-2.0
//
// A page allocator between the general regions and the system. It takes chunks of 1 MiB and keeps
// one bit for each page of 4096 bytes; a set bit is a free page. What a chunk would serve badly,
// blocks of 128 KiB and more, goes straight to the parent.
//
// Its clients are general regions, which ask for few pages at a time and give them back in any
// order; the bitmap finds neighbours free again without keeping lists of them, and costs 1280 bytes
// for 40 MiB.

#pragma once

#include "alloclib/interface/region_base.h"

#include <cstdint>

namespace alloclib {

class RegionStats;

/// Made by RegionFastOld::Create. Its chunks stay with it until Destroy, however many of their
/// pages come back.
class RegionLargeBlock final : public Region {
public:
  /// Sizes are multiples of a page; anything else is an internal error.
  void* AllocFull(size_t size, size_t alignment, const char* fileLine) override;
  void DiscardFull(void* pointer, size_t size, size_t alignment) override;
  /// With true the chunks go back to the parent, whoever still uses them.
  void Destroy(bool freeMemory) override;

  /// Overwrites what is discarded from now on, with a byte that goes up by one each time.
  void setFillDiscarded(bool fill) { m_FillDiscarded = fill; }

private:
  friend struct RegionFastOld;
  friend class RegionLargeBlockPeer;

  static constexpr size_t PageSize = 4096;
  static constexpr size_t ChunkSize = size_t{1} << 20;
  static constexpr size_t ForwardSize = 0x20000;
  static constexpr uint32_t MapWords = 320;
  static constexpr uint32_t WordsPerChunk = ChunkSize / PageSize / 32;
  static constexpr uint32_t ChunkCount = MapWords / WordsPerChunk;
  /// A hint behind the map: this instance is not searched.
  static constexpr uint32_t ExhaustedHint = MapWords + 1;
  static constexpr uint32_t NoRun = MapWords * 32;

  RegionLargeBlock(RegionStats* stats, Region* parent, bool transparent, bool ownedParent);
  static RegionLargeBlock* createOn(Region* parent, const char* name, bool transparent,
                                    bool ownedParent);

  void* allocatePages(uint32_t pages);
  void* allocateFromOverflow(uint32_t pages);
  /// The first bit of a run of free pages from the hint on; NoRun if there is none.
  [[nodiscard]] uint32_t findRun(uint32_t pages) const;
  [[nodiscard]] RegionLargeBlock* findOwner(const void* pointer, uint32_t& bit);
  void SetBits(uint32_t firstBit, uint32_t count, bool free);
  void makeChunk(uint32_t chunk);
  void releaseChunks();

  RegionStats* m_Stats;
  Region* m_Parent;
  uint32_t m_Bitmap[MapWords];
  char* m_Chunks[ChunkCount] = {};
  uint32_t m_Hint = 0;
  RegionLargeBlock* m_Overflow = nullptr;
  bool m_Transparent;
  bool m_OwnedParent;
  bool m_FillDiscarded = false;
  unsigned char m_FillByte = 0;
};

/// Makes a RegionLargeBlock on the default parent; in the transparent debug mode, one that
/// forwards to a system region of its own. The name is kept, not copied.
struct RegionFastOld {
  static RegionLargeBlock* Create(const char* name);
};

} // namespace alloclib
