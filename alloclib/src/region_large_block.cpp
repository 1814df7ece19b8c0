// SPDX-License-Identifier: Apache-2.0
//
// The page map and its search. A map covers 40 MiB; when it has no run for a request, a further
// instance takes over, and this one is left alone until pages come back to it.
//
// The search goes word by word from a hint, below which no page is free (but in a map that was
// given up), and takes the first run that is long enough. A request is less than 32 pages, since
// larger ones have gone to the parent, so a search costs at most the 320 words of the map.

#include "alloclib/interface/region_large_block.h"

#include "alloclib/interface/handlers.h"
#include "alloclib/interface/memory_poison.h"
#include "alloclib/interface/process.h"
#include "alloclib/interface/region_malloc_free.h"
#include "alloclib/interface/region_stats.h"

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <iterator>
#include <new>

namespace alloclib {
namespace {

[[noreturn]] void invalidPointer(const void* pointer) {
  char text[80];
  std::snprintf(text, sizeof text, "RegionLargeBlock: discard of invalid pointer: %p\n", pointer);
  internalError(text);
}

} // namespace

RegionLargeBlock* RegionFastOld::Create(const char* name) {
  switch (getDebugMode()) {
  case Debug_Off:
  case Debug_Plain:
  case Debug_Tracing:
    return RegionLargeBlock::createOn(getDefaultParent(), name, false, false);
  case Debug_Transparent:
    return RegionLargeBlock::createOn(RegionMallocFree::Create("all memory"), name, true, true);
  default:
    internalError("Unsupported debug mode in RegionFastOld::Create");
  }
}

RegionLargeBlock* RegionLargeBlock::createOn(Region* parent, const char* name, bool transparent,
                                             bool ownedParent) {
  RegionStats* stats = RegionStats::start(name, transparent ? 0 : ChunkSize, true);
  void* memory = parent->AllocFull(sizeof(RegionLargeBlock), alignof(RegionLargeBlock), nullptr);
  return ::new (memory) RegionLargeBlock(stats, parent, transparent, ownedParent);
}

RegionLargeBlock::RegionLargeBlock(RegionStats* stats, Region* parent, bool transparent,
                                   bool ownedParent)
    : m_Stats(stats), m_Parent(parent), m_Transparent(transparent), m_OwnedParent(ownedParent) {
  // Pages are free before their chunk exists; the chunk is made when the first of them is given
  // out.
  std::fill(std::begin(m_Bitmap), std::end(m_Bitmap), ~uint32_t{0});
  m_Stats->overheadIncreased(sizeof(RegionLargeBlock));
  if (!transparent) makeChunk(0);
}

void* RegionLargeBlock::AllocFull(size_t size, size_t alignment, const char* fileLine) {
  if (size == 0 || size % PageSize != 0) internalError("Invalid allocation using RegionLargeBlock");
  if (m_Transparent) return m_Parent->AllocFull(size, alignment, fileLine);
  void* block = size >= ForwardSize ? m_Parent->AllocFull(size, alignment, fileLine)
                                    : allocatePages(static_cast<uint32_t>(size / PageSize));
  unpoison(block, size);
  m_Stats->allocated(block, size, 0);
  return block;
}

void RegionLargeBlock::DiscardFull(void* pointer, size_t size, size_t alignment) {
  if (size == 0 || size % PageSize != 0) internalError("Invalid discard using RegionLargeBlock");
  if (m_Transparent) return m_Parent->DiscardFull(pointer, size, alignment);
  m_Stats->discarded(pointer, size, 0);
  // The byte goes up, so that two discards of one address can be told apart in a debugger.
  if (m_FillDiscarded) std::memset(pointer, m_FillByte++, size);
  if (size >= ForwardSize) return m_Parent->DiscardFull(pointer, size, alignment);

  uint32_t bit = 0;
  RegionLargeBlock* owner = findOwner(pointer, bit);
  if (owner == nullptr) invalidPointer(pointer);
  owner->SetBits(bit, static_cast<uint32_t>(size / PageSize), true);
  owner->m_Hint = std::min(owner->m_Hint, bit / 32);
  poison(pointer, size);
}

void RegionLargeBlock::Destroy(bool freeMemory) {
  Region* parent = m_Parent;
  const bool ownedParent = m_OwnedParent;
  m_Stats->finish();
  if (freeMemory) {
    releaseChunks();
    parent->DiscardFull(this, sizeof(RegionLargeBlock), alignof(RegionLargeBlock));
  }
  if (ownedParent) parent->Destroy(freeMemory);
}

void RegionLargeBlock::releaseChunks() {
  for (char* chunk : m_Chunks) {
    if (chunk == nullptr) continue;
    unpoison(chunk, ChunkSize);
    m_Parent->DiscardFull(chunk, ChunkSize, PageSize);
  }
  if (m_Overflow == nullptr) return;
  m_Overflow->releaseChunks();
  m_Parent->DiscardFull(m_Overflow, sizeof(RegionLargeBlock), alignof(RegionLargeBlock));
}

void* RegionLargeBlock::allocatePages(uint32_t pages) {
  const uint32_t firstBit = findRun(pages);
  if (firstBit == NoRun) return allocateFromOverflow(pages);
  // Only a search for one page shows that nothing before it is free.
  if (pages == 1) m_Hint = firstBit / 32;
  const uint32_t chunk = firstBit / 32 / WordsPerChunk;
  if (m_Chunks[chunk] == nullptr) makeChunk(chunk);
  SetBits(firstBit, pages, false);
  return m_Chunks[chunk] + size_t{firstBit % (WordsPerChunk * 32)} * PageSize;
}

void* RegionLargeBlock::allocateFromOverflow(uint32_t pages) {
  // The map may still have short runs; looking for them at each request would cost more than the
  // pages are worth.
  m_Hint = ExhaustedHint;
  if (m_Overflow == nullptr) {
    void* memory =
        m_Parent->AllocFull(sizeof(RegionLargeBlock), alignof(RegionLargeBlock), nullptr);
    m_Overflow = ::new (memory) RegionLargeBlock(m_Stats, m_Parent, false, false);
  }
  return m_Overflow->allocatePages(pages);
}

uint32_t RegionLargeBlock::findRun(uint32_t pages) const {
  uint32_t length = 0;
  for (uint32_t word = m_Hint; word < MapWords; ++word) {
    const uint32_t bits = m_Bitmap[word];
    // Pages of two chunks are no neighbours.
    if (bits == 0 || word % WordsPerChunk == 0) length = 0;
    if (bits == 0) continue;
    // Half a word is passed over at once where nothing in it can begin a run.
    const uint32_t start = length == 0 && (bits & 0xFFFF) == 0 ? 16 : 0;
    for (uint32_t bit = start; bit < 32; ++bit) {
      length = (bits >> bit & 1) != 0 ? length + 1 : 0;
      if (length == pages) return word * 32 + bit + 1 - pages;
    }
  }
  return NoRun;
}

RegionLargeBlock* RegionLargeBlock::findOwner(const void* pointer, uint32_t& bit) {
  const auto address = reinterpret_cast<uintptr_t>(pointer);
  // Few chunks in few instances, looked at once for each block of pages: no index is worth its
  // upkeep.
  for (RegionLargeBlock* owner = this; owner != nullptr; owner = owner->m_Overflow) {
    for (uint32_t chunk = 0; chunk < ChunkCount; ++chunk) {
      // Wraps for an address below the chunk, and is then far beyond its size.
      const uintptr_t offset = address - reinterpret_cast<uintptr_t>(owner->m_Chunks[chunk]);
      if (owner->m_Chunks[chunk] == nullptr || offset >= ChunkSize) continue;
      bit = chunk * WordsPerChunk * 32 + static_cast<uint32_t>(offset / PageSize);
      return owner;
    }
  }
  return nullptr;
}

void RegionLargeBlock::SetBits(uint32_t firstBit, uint32_t count, bool free) {
  constexpr uint32_t MapBits = MapWords * 32;
  if (firstBit > MapBits || count > MapBits - firstBit) internalError("SetBits outside of bitmap");
  for (uint32_t bit = firstBit; bit < firstBit + count; ++bit) {
    const uint32_t mask = uint32_t{1} << bit % 32;
    m_Bitmap[bit / 32] = free ? m_Bitmap[bit / 32] | mask : m_Bitmap[bit / 32] & ~mask;
  }
}

void RegionLargeBlock::makeChunk(uint32_t chunk) {
  m_Chunks[chunk] = static_cast<char*>(m_Parent->AllocFull(ChunkSize, PageSize, nullptr));
  poison(m_Chunks[chunk], ChunkSize);
  m_Stats->extended();
}

} // namespace alloclib
