// SPDX-License-Identifier: Apache-2.0
//
// The sanitizer calls two functions of ours at every allocation and release, which must not
// allocate. The engine has a thread of its own that does now and then.
#include "tests/fuzz/memory_bound.h"

#include <sanitizer/allocator_interface.h>

#include <atomic>
#include <cstdint>
#include <cstdlib>
#include <limits>
#include <unistd.h>

namespace fuzzing {

namespace {

constexpr int64_t MostPerByte = 16;
constexpr int64_t MostBeyond = 0x4000000; // bytes
constexpr int64_t NoLimit = std::numeric_limits<int64_t>::max();

std::atomic<int64_t> limit = NoLimit;
std::atomic<int64_t> taken = 0; // less than nothing where older blocks are freed

void countAllocation(const volatile void*, size_t size) {
  if ((taken += static_cast<int64_t>(size)) <= limit) return;
  limit = NoLimit;
  constexpr char Text[] = "The input takes too much memory\n";
  [[maybe_unused]] const ssize_t done = ::write(STDERR_FILENO, Text, sizeof(Text) - 1);
  std::abort();
}

void countRelease(const volatile void* block) {
  taken -= static_cast<int64_t>(__sanitizer_get_allocated_size(block));
}

} // namespace

MemoryBound::MemoryBound(size_t inputSize) {
  static const int IsInstalled =
      __sanitizer_install_malloc_and_free_hooks(countAllocation, countRelease);
  if (IsInstalled == 0) std::abort();
  taken = 0;
  limit = MostPerByte * static_cast<int64_t>(inputSize) + MostBeyond;
}

MemoryBound::~MemoryBound() {
  limit = NoLimit;
}

} // namespace fuzzing
