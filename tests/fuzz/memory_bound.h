// SPDX-License-Identifier: Apache-2.0
//
// What one input may cost in memory: sixteen times its own size, and 64 MiB. The engine's limit is
// for the process, whose cost has grown with all inputs before; here is counted what is allocated
// and not yet freed since the input began.
#pragma once

#include <cstddef>

namespace fuzzing {

// Ends the process with a report, at the allocation that goes beyond the bound. One at a time.
class MemoryBound {
public:
  explicit MemoryBound(size_t inputSize);
  ~MemoryBound();
  MemoryBound(const MemoryBound&) = delete;
  MemoryBound& operator=(const MemoryBound&) = delete;
};

} // namespace fuzzing
