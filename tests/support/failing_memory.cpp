// SPDX-License-Identifier: Apache-2.0
//
// The linker turns calls of `malloc` in all objects of the program to `__wrap_malloc`. What the C
// library asks for itself comes as always.

#include "tests/support/failing_memory.h"

#include <cstdlib>
#include <new>

// The names are the linker's.
#ifdef __clang__
#pragma clang diagnostic ignored "-Wreserved-identifier"
#endif
extern "C" void* __real_malloc(size_t size);
extern "C" void* __wrap_malloc(size_t size);

namespace testsupport {

namespace {

uint64_t firstFailing = 0;
uint64_t lastFailing = 0;
uint64_t allocationCount = 0;

} // namespace

void failAllocations(uint64_t first, uint64_t last) {
  firstFailing = first;
  lastFailing = last;
  allocationCount = 0;
}

uint64_t getAllocationCount() {
  return allocationCount;
}

} // namespace testsupport

void* __wrap_malloc(size_t size) {
  using namespace testsupport;
  ++allocationCount;
  const bool fails = firstFailing <= allocationCount && allocationCount <= lastFailing;
  return fails ? nullptr : __real_malloc(size);
}

void* operator new(size_t size) {
  for (;;) {
    if (void* memory = __wrap_malloc(size == 0 ? 1 : size)) return memory;
    const std::new_handler handler = std::get_new_handler();
    if (handler == nullptr) throw std::bad_alloc();
    handler();
  }
}

// As the standard library's own: who asks so goes the same way first.
void* operator new(size_t size, const std::nothrow_t&) noexcept {
  try {
    return ::operator new(size);
  } catch (const std::bad_alloc&) {
    return nullptr;
  }
}

void operator delete(void* memory) noexcept {
  std::free(memory);
}

void operator delete(void* memory, size_t) noexcept {
  std::free(memory);
}

void operator delete(void* memory, const std::nothrow_t&) noexcept {
  std::free(memory);
}
