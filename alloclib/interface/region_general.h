// SPDX-License-Identifier: Apache-2.0
//
// The region of the many small objects: archives, object models, the parser's copies and scratch
// tables all live in one. Allocation moves a cursor through a working block: a compare and an add,
// inlined at the call. Whatever does not fit goes the slow way, which also holds all decisions:
// large objects get a block of their own, discarded pieces come to use again, tracing regions
// count.
//
// The inline path stays right in every state because the slow one sets the fast limit: at the
// cursor itself where each allocation has to be looked at.
//
// A size may come from a file. The two comparisons of the inline path stand so that no size,
// however large, wraps into one that seems to fit.

#pragma once

#include "alloclib/interface/memory_poison.h"
#include "alloclib/interface/region_base.h"

#include <cstdint>

namespace alloclib {

class RegionStats;

/// Made by Create and ended by Destroy, mostly through a RegionOwner. The object lies in its own
/// first block.
class RegionGeneral final : public Region {
public:
  /// A region of one page, which grows on the process's RegionLargeBlock. The initial size, in
  /// bytes, counts only in the transparent debug mode. The name is kept, not copied. The caller
  /// ends the region with Destroy. Needs an alloclib::Session.
  static RegionGeneral* Create(size_t initialSize, const char* name);

  /// `size` bytes, never null. `alignment` is a power of two up to 4096. The memory belongs to
  /// the region. A size of 0 yields an address that nobody may read or write.
  void* allocate(size_t size, size_t alignment = 8) {
    const auto room = static_cast<size_t>(m_FastLimit - m_Cursor);
    const size_t rounded = roundUp(size, 8);
    // The first comparison catches a size that overflows when it is rounded.
    if (alignment > 8 || size >= room || rounded >= room)
      return AllocFull(size, alignment, nullptr);
    char* block = m_Cursor;
    m_Cursor += rounded;
    unpoison(block, size);
    return block;
  }

  /// Gives a block back early, for use by later allocations. Size and alignment are those of the
  /// allocation.
  void discard(void* pointer, size_t size, size_t alignment = 8) {
    DiscardFull(pointer, size, alignment);
  }

  void* AllocFull(size_t size, size_t alignment, const char* fileLine) override;
  void DiscardFull(void* pointer, size_t size, size_t alignment) override;
  void Destroy(bool freeMemory) override;

private:
  /// For tests, which look at the states and lists.
  friend class RegionGeneralPeer;

  enum FlagsState : uint32_t {
    Flags_Fast = 1,
    Flags_Buckets = 2,
    SLOW_TRANSPARENT = 3,
    Flags_Tracing = 4,
    Flags_FastTracing = Flags_Fast | Flags_Tracing,
    Flags_BucketsTracing = Flags_Buckets | Flags_Tracing,
  };

  /// In front of a block's bytes. The sizes are of the whole block, as the parent wants them back.
  struct Block {
    size_t size;
    Block* next;
  };
  /// Linked both ways, since a single one may be given back at any time.
  struct LargeBlock {
    size_t size;
    LargeBlock* next;
    LargeBlock* previous;
  };
  /// At the start of a returned piece of BucketBound bytes or more.
  struct FreeChunk {
    size_t size;
    FreeChunk* next;
  };
  /// At the start of a smaller one; its size is that of its bucket.
  struct FreePiece {
    FreePiece* next;
  };

  static constexpr size_t PageSize = 4096;
  // What these numbers decide is said at the head of the source.
  static constexpr size_t LargeSize = 10240;
  static constexpr size_t BucketBound = 128;
  static constexpr size_t BucketCount = BucketBound / 8;

  RegionGeneral(RegionStats* stats, Region* parent, uint32_t flagsState)
      : m_Stats(stats), m_Parent(parent), m_FlagsState(flagsState) {}

  static RegionGeneral* createPlain(Region* parent, size_t firstBlockSize, size_t initialSize,
                                    const char* name, uint32_t flagsState);
  static RegionGeneral* createTransparent(Region* parent, size_t initialSize, const char* name);

  void* allocateSlow(size_t size, size_t alignment);
  void* allocateLarge(size_t bytes, size_t alignment);
  void* allocateFromBucket(size_t bytes, size_t alignment);
  void* allocateFromWorkingBlock(size_t bytes, size_t alignment);
  void makeWorkingBlock(size_t bytes, size_t alignment);
  bool reuseFreeChunk(size_t bytes, size_t alignment);
  void discardSlow(void* pointer, size_t size, size_t alignment);
  void discardLarge(void* pointer, size_t size, size_t alignment);
  void putAside(char* piece, size_t bytes);
  void pushBucket(char* piece, size_t bytes);
  void pushFreeChunk(char* piece, size_t bytes);
  void releaseBlocks();
  void SetBlockWorkingState();
  void setFastLimit();
  void noteBlock(const void* block, size_t bytes, size_t overhead);
  void noteFragmentation(size_t bytes);
  [[nodiscard]] bool isTracing() const { return (m_FlagsState & Flags_Tracing) != 0; }

  RegionStats* m_Stats;
  Region* m_Parent;
  char* m_Cursor = nullptr;
  char* m_FastLimit = nullptr;
  char* m_WorkingEnd = nullptr;
  uint32_t m_FlagsState;
  /// No free chunk has more bytes than this.
  uint16_t m_LargestChunk = 0;
  bool m_OwnedParent = false;
  Block* m_Blocks = nullptr;
  LargeBlock* m_LargeBlocks = nullptr;
  FreeChunk* m_FreeChunks = nullptr;
  size_t m_BucketBytes = 0;
  /// Made in the region itself at the first small discard.
  FreePiece** m_Buckets = nullptr;
};

} // namespace alloclib
