// SPDX-License-Identifier: Apache-2.0
//
// All memory of the regions comes through here, and here it shows when the host refuses. The object
// and its record stand outside the balance that Destroy checks: they come from the host's heap
// directly, since there must be one region that needs no other.

#include "alloclib/interface/region_malloc_free.h"

#include "alloclib/interface/handlers.h"
#include "alloclib/interface/region_stats.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <new>

namespace alloclib {
namespace {

// The host's heap aligns for every fundamental type by itself.
bool isPlain(size_t alignment) {
  return alignment <= alignof(std::max_align_t);
}

// Null if the host has no memory.
void* allocateFromHost(size_t size, size_t alignment) {
  // No object of the host is larger; some heaps take such a request for a fault.
  if (size > PTRDIFF_MAX) return nullptr;
  if (isPlain(alignment)) return std::malloc(size);
  return ::operator new(size, std::align_val_t(alignment), std::nothrow);
}

void giveBackToHost(void* block, size_t alignment) {
  if (isPlain(alignment)) return std::free(block);
  ::operator delete(block, std::align_val_t(alignment));
}

} // namespace

RegionMallocFree* RegionMallocFree::Create(const char* name) {
  void* memory = std::malloc(sizeof(RegionMallocFree));
  if (memory == nullptr) outOfMemory(sizeof(RegionMallocFree));
  return ::new (memory) RegionMallocFree(RegionStats::start(name, 0, true));
}

void* RegionMallocFree::AllocFull(size_t size, size_t alignment, const char*) {
  // The heap may answer null to this, which could not be told from having no memory.
  if (size == 0) internalError("Cannot allocate 0 bytes of memory from the system");
  void* block = allocateFromHost(size, alignment);
  if (block == nullptr) outOfMemory(size);
  m_Stats->allocated(block, size, 0);
  return block;
}

void RegionMallocFree::DiscardFull(void* pointer, size_t size, size_t alignment) {
  m_Stats->discarded(pointer, size, 0);
  giveBackToHost(pointer, alignment);
}

void RegionMallocFree::Destroy(bool freeMemory) {
  if (freeMemory && m_Stats->getAllocations() != m_Stats->getFrees())
    internalError("RegionMallocFree cannot free memory on Destroy()");
  m_Stats->finish();
  std::free(this);
}

size_t RegionMallocFree::getCurrentSize() const {
  return m_Stats->getCurrentSize();
}

} // namespace alloclib
