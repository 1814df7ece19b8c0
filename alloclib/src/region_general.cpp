// SPDX-License-Identifier: Apache-2.0
//
// The slow side of the general region. One number, 10240 bytes, serves three times: larger requests
// bypass the working block, the fast limit keeps the inline path below that size, and it is the sum
// of small discarded pieces above which they are preferred to fresh memory.
//
// A block of the parent starts with its header; the region object itself stands behind the header
// of the first one. Discarded pieces are lists through the pieces themselves: by size in buckets
// below 128 bytes, in one first-fit list above.
//
// A size may come from a file, through a client. What could wrap when headers and pages are added
// is turned away as memory that is not there, before any sum is made.

#include "alloclib/interface/region_general.h"

#include "alloclib/interface/handlers.h"
#include "alloclib/interface/process.h"
#include "alloclib/interface/region_large_block.h"
#include "alloclib/interface/region_stats.h"
#include "checking/interface/checking.h"

#include <algorithm>
#include <bit>
#include <cstring>
#include <new>

namespace alloclib {
namespace {

// A working block holds this much beyond the request that made it, and is then rounded up to pages:
// a region of few objects stays at a page or two.
constexpr size_t BlockReserve = 3000;

// Far below where adding headers and pages could wrap.
constexpr size_t LargestRequest = PTRDIFF_MAX - (size_t{1} << 16);

// The bytes from the address to the next aligned one: its negative, modulo a power of two.
size_t gapBefore(const char* address, size_t alignment) {
  return -reinterpret_cast<uintptr_t>(address) & (alignment - 1);
}

// Whether [start, end) has room for an aligned object.
bool holds(const char* start, const char* end, size_t bytes, size_t alignment) {
  const auto room = static_cast<size_t>(end - start);
  const size_t gap = gapBefore(start, alignment);
  return gap <= room && bytes <= room - gap;
}

// From the start of a large block to its object.
size_t getLargeHeaderSize(size_t header, size_t alignment) {
  return roundUp(header, std::max<size_t>(alignment, 8));
}

} // namespace

// The documented footprints: a header costs 16 or 24 bytes, the region 96. A field more would cost
// every region, and there are two for each object model.
static_assert(sizeof(RegionGeneral) == 96);

RegionGeneral* RegionGeneral::Create(size_t initialSize, const char* name) {
  switch (getDebugMode()) {
  case Debug_Off:
  case Debug_Plain:
    return createPlain(getProcessLargeBlock(), PageSize, PageSize, name, Flags_Fast);
  case Debug_Tracing:
    return createPlain(getProcessLargeBlock(), PageSize, PageSize, name, Flags_FastTracing);
  case Debug_Transparent:
    return createTransparent(getProcessLargeBlock(), initialSize, name);
  default:
    internalError("Unsupported debug mode in RegionGeneral::Create");
  }
}

RegionGeneral* RegionGeneral::createPlain(Region* parent, size_t firstBlockSize, size_t initialSize,
                                          const char* name, uint32_t flagsState) {
  static_assert(sizeof(Block) == 16 && sizeof(LargeBlock) == 24);
  const bool tracing = (flagsState & Flags_Tracing) != 0;
  RegionStats* stats = RegionStats::start(name, initialSize, tracing);
  void* memory = parent->AllocFull(firstBlockSize, PageSize, nullptr);
  auto* block = ::new (memory) Block{firstBlockSize, nullptr};

  auto* region = ::new (static_cast<void*>(block + 1)) RegionGeneral(stats, parent, flagsState);
  region->m_Blocks = block;
  region->m_Cursor = reinterpret_cast<char*>(region + 1);
  region->m_WorkingEnd = static_cast<char*>(memory) + firstBlockSize;
  poison(region->m_Cursor, static_cast<size_t>(region->m_WorkingEnd - region->m_Cursor));
  region->noteBlock(block, firstBlockSize, sizeof(Block) + sizeof(RegionGeneral));
  region->SetBlockWorkingState();
  return region;
}

// A shell that only forwards. Its parent is a plain region, so that ending it frees what clients
// left behind; the shell lies in that region, too.
RegionGeneral* RegionGeneral::createTransparent(Region* parent, size_t initialSize,
                                                const char* name) {
  if (initialSize > LargestRequest) outOfMemory(initialSize);
  const size_t firstBlockSize = std::max(PageSize, roundUp(initialSize, PageSize));
  RegionGeneral* inner = createPlain(parent, firstBlockSize, initialSize, name, Flags_Fast);
  void* memory = inner->allocate(sizeof(RegionGeneral));
  auto* shell = ::new (memory) RegionGeneral(inner->m_Stats, inner, SLOW_TRANSPARENT);
  shell->m_OwnedParent = true;
  return shell;
}

void* RegionGeneral::AllocFull(size_t size, size_t alignment, const char* fileLine) {
  switch (m_FlagsState) {
  case Flags_Fast:
  case Flags_Buckets:
  case Flags_FastTracing:
  case Flags_BucketsTracing:
    return allocateSlow(size, alignment);
  case SLOW_TRANSPARENT:
    return m_Parent->AllocFull(size, alignment, fileLine);
  default:
    internalError("Unknown flags state in RegionGeneral::AllocFull");
  }
}

void RegionGeneral::DiscardFull(void* pointer, size_t size, size_t alignment) {
  switch (m_FlagsState) {
  case Flags_Fast:
  case Flags_Buckets:
  case Flags_FastTracing:
  case Flags_BucketsTracing:
    return discardSlow(pointer, size, alignment);
  case SLOW_TRANSPARENT:
    return m_Parent->DiscardFull(pointer, size, alignment);
  default:
    internalError("Unknown flags state in RegionGeneral::DiscardFull");
  }
}

void RegionGeneral::Destroy(bool freeMemory) {
  if (m_FlagsState != SLOW_TRANSPARENT) {
    m_Stats->finish();
    if (freeMemory) releaseBlocks();
    return;
  }
  Region* parent = m_Parent;
  const bool ownedParent = m_OwnedParent;
  parent->DiscardFull(this, sizeof(RegionGeneral), alignof(RegionGeneral));
  if (ownedParent) parent->Destroy(freeMemory);
}

// The region object lies in the block that goes last, so its members are read before.
void RegionGeneral::releaseBlocks() {
  Region* parent = m_Parent;
  for (LargeBlock *large = m_LargeBlocks, *next = nullptr; large != nullptr; large = next) {
    next = large->next;
    unpoison(large, large->size);
    parent->DiscardFull(large, large->size, PageSize);
  }
  for (Block *block = m_Blocks, *next = nullptr; block != nullptr; block = next) {
    next = block->next;
    unpoison(block, block->size);
    parent->DiscardFull(block, block->size, PageSize);
  }
}

void* RegionGeneral::allocateSlow(size_t size, size_t alignment) {
  QUARN_ASSERT(1, std::has_single_bit(alignment) && alignment <= PageSize);
  if (size > LargestRequest) outOfMemory(size);
  const size_t bytes = roundUp(size, 8);

  void* block = nullptr;
  // Pieces first, then the large, then fresh memory: the state is Buckets only while there are
  // enough pieces for the look to pay.
  if ((m_FlagsState & Flags_Buckets) != 0) block = allocateFromBucket(bytes, alignment);
  if (block == nullptr && size >= LargeSize) block = allocateLarge(bytes, alignment);
  if (block == nullptr) block = allocateFromWorkingBlock(bytes, alignment);

  if (isTracing()) m_Stats->allocated(block, bytes, bytes - size);
  SetBlockWorkingState();
  unpoison(block, size);
  return block;
}

void* RegionGeneral::allocateLarge(size_t bytes, size_t alignment) {
  // discardLarge finds the header again by the same alignment, so clients must tell it truly.
  const size_t header = getLargeHeaderSize(sizeof(LargeBlock), alignment);
  const size_t total = (bytes + header - 1 + PageSize) / PageSize * PageSize;
  void* memory = m_Parent->AllocFull(total, PageSize, nullptr);
  auto* large = ::new (memory) LargeBlock{total, m_LargeBlocks, nullptr};
  if (m_LargeBlocks != nullptr) m_LargeBlocks->previous = large;
  m_LargeBlocks = large;
  noteBlock(large, total, total - bytes);
  char* object = static_cast<char*>(memory) + header;
  poison(object, total - header);
  return object;
}

void* RegionGeneral::allocateFromBucket(size_t bytes, size_t alignment) {
  // A piece of this size has room for the alignment wherever it starts.
  const size_t pieceBytes = alignment > 8 ? bytes - 8 + alignment : bytes;
  if (pieceBytes >= BucketBound || m_Buckets == nullptr) return nullptr;
  FreePiece*& head = m_Buckets[pieceBytes / 8];
  if (head == nullptr) return nullptr;

  auto* piece = reinterpret_cast<char*>(head);
  head = head->next;
  m_BucketBytes -= pieceBytes;
  if (isTracing()) m_Stats->fragmentationDecreased(pieceBytes);
  poison(piece, pieceBytes);
  const size_t gap = gapBefore(piece, alignment);
  // What lies before and behind the aligned object is a smaller piece each, and not lost.
  putAside(piece, gap);
  putAside(piece + gap + bytes, pieceBytes - gap - bytes);
  return piece + gap;
}

void* RegionGeneral::allocateFromWorkingBlock(size_t bytes, size_t alignment) {
  if (!holds(m_Cursor, m_WorkingEnd, bytes, alignment)) makeWorkingBlock(bytes, alignment);
  const size_t gap = gapBefore(m_Cursor, alignment);
  noteFragmentation(gap);
  char* block = m_Cursor + gap;
  m_Cursor = block + bytes;
  return block;
}

// What is left of the old working block is abandoned: it is rarely worth a place in a list.
void RegionGeneral::makeWorkingBlock(size_t bytes, size_t alignment) {
  noteFragmentation(static_cast<size_t>(m_WorkingEnd - m_Cursor));
  if (reuseFreeChunk(bytes, alignment)) return;

  // Blocks start at a page and their bytes at a multiple of 8, so 8 of the alignment are certain.
  const size_t worstGap = alignment > 8 ? alignment - 8 : 0;
  const size_t total =
      (bytes + worstGap + BlockReserve + sizeof(Block) - 1 + PageSize) / PageSize * PageSize;
  void* memory = m_Parent->AllocFull(total, PageSize, nullptr);
  m_Blocks = ::new (memory) Block{total, m_Blocks};
  m_Cursor = reinterpret_cast<char*>(m_Blocks + 1);
  m_WorkingEnd = static_cast<char*>(memory) + total;
  poison(m_Cursor, total - sizeof(Block));
  noteBlock(m_Blocks, total, sizeof(Block));
}

// The first that fits. A search in vain shows that all chunks are smaller, and is not made again
// before a larger one comes: else thousands of small chunks would be looked at for each new block.
bool RegionGeneral::reuseFreeChunk(size_t bytes, size_t alignment) {
  if (m_FreeChunks == nullptr || bytes > m_LargestChunk) return false;
  for (FreeChunk** link = &m_FreeChunks; *link != nullptr; link = &(*link)->next) {
    auto* start = reinterpret_cast<char*>(*link);
    const size_t size = (*link)->size;
    if (!holds(start, start + size, bytes, alignment)) continue;
    *link = (*link)->next;
    if (isTracing()) m_Stats->fragmentationDecreased(size);
    m_Cursor = start;
    m_WorkingEnd = start + size;
    poison(start, size);
    return true;
  }
  // At a larger alignment a chunk of the size may have been passed over for where it starts.
  if (alignment <= 8) m_LargestChunk = static_cast<uint16_t>(bytes - 1);
  return false;
}

void RegionGeneral::discardSlow(void* pointer, size_t size, size_t alignment) {
  const size_t bytes = roundUp(size, 8);
  if (isTracing()) m_Stats->discarded(pointer, size, bytes - size);
  if (size >= LargeSize) return discardLarge(pointer, size, alignment);
  putAside(static_cast<char*>(pointer), bytes);
  // The buckets may have become worth a look, or have cost a new working block themselves.
  SetBlockWorkingState();
}

void RegionGeneral::discardLarge(void* pointer, size_t size, size_t alignment) {
  char* start = static_cast<char*>(pointer) - getLargeHeaderSize(sizeof(LargeBlock), alignment);
  auto* large = reinterpret_cast<LargeBlock*>(start);
  if (large->next != nullptr) large->next->previous = large->previous;
  if (large->previous != nullptr) large->previous->next = large->next;
  if (large == m_LargeBlocks) m_LargeBlocks = large->next;

  const size_t total = large->size;
  if (isTracing())
    m_Stats->overheadDecreased(total - roundUp(size, 8));
  else
    m_Stats->discarded(large, total, 0);
  unpoison(large, total);
  m_Parent->DiscardFull(large, total, PageSize);
}

// Keeps a piece for reuse. `bytes` is a multiple of 8.
void RegionGeneral::putAside(char* piece, size_t bytes) {
  if (bytes == 0) return;
  noteFragmentation(bytes);
  if (bytes < BucketBound)
    pushBucket(piece, bytes);
  else
    pushFreeChunk(piece, bytes);
}

void RegionGeneral::pushBucket(char* piece, size_t bytes) {
  if (m_Buckets == nullptr) {
    constexpr size_t BucketArrayBytes = BucketCount * sizeof(FreePiece*);
    void* memory = allocateFromWorkingBlock(BucketArrayBytes, 8);
    unpoison(memory, BucketArrayBytes);
    m_Buckets = static_cast<FreePiece**>(std::memset(memory, 0, BucketArrayBytes));
    if (isTracing()) m_Stats->overheadIncreased(BucketArrayBytes);
  }
  poison(piece, bytes);
  unpoison(piece, sizeof(FreePiece));
  FreePiece*& head = m_Buckets[bytes / 8];
  head = ::new (static_cast<void*>(piece)) FreePiece{head};
  m_BucketBytes += bytes;
}

void RegionGeneral::pushFreeChunk(char* piece, size_t bytes) {
  poison(piece, bytes);
  unpoison(piece, sizeof(FreeChunk));
  m_FreeChunks = ::new (static_cast<void*>(piece)) FreeChunk{bytes, m_FreeChunks};
  m_LargestChunk = std::max(m_LargestChunk, static_cast<uint16_t>(bytes));
}

void RegionGeneral::SetBlockWorkingState() {
  const uint32_t tracing = m_FlagsState & Flags_Tracing;
  switch (m_FlagsState & ~uint32_t{Flags_Tracing}) {
  case Flags_Fast:
  case Flags_Buckets:
    m_FlagsState = tracing | (m_BucketBytes > LargeSize ? Flags_Buckets : Flags_Fast);
    break;
  case SLOW_TRANSPARENT:
    internalError("SLOW_TRANSPARENT occurred in SetBlockWorkingState");
  default:
    internalError("Unknown flags in SetBlockWorkingState");
  }
  if (m_Cursor > m_WorkingEnd) internalError("allocation went beyond the end of the working block");
  setFastLimit();
}

void RegionGeneral::setFastLimit() {
  switch (m_FlagsState) {
  case Flags_Fast:
    // Below 10240 also where the block has more room: a large request must come to the slow way,
    // which gives it a block of its own.
    m_FastLimit = m_Cursor + std::min(static_cast<size_t>(m_WorkingEnd - m_Cursor), LargeSize);
    return;
  // No room in sight: every allocation comes to the slow way, to the buckets or to be counted.
  case Flags_Buckets:
  case Flags_FastTracing:
  case Flags_BucketsTracing:
    m_FastLimit = m_Cursor;
    return;
  default:
    internalError("Invalid flags in SetBlockWorkingState");
  }
}

// A region that does not trace counts its blocks; a tracing one its allocations, and of a block
// only what no client gets.
void RegionGeneral::noteBlock(const void* block, size_t bytes, size_t overhead) {
  m_Stats->extended();
  if (!isTracing()) return m_Stats->allocated(block, bytes, 0);
  m_Stats->overheadIncreased(overhead);
}

void RegionGeneral::noteFragmentation(size_t bytes) {
  if (isTracing() && bytes != 0) m_Stats->fragmentationIncreased(bytes);
}

} // namespace alloclib
