// SPDX-License-Identifier: Apache-2.0
//
// A process that runs out of memory: of the allocations by `new` and `malloc` in our own code,
// those from one number to another fail. A program that has it is linked so that its calls of
// `malloc` come here (see CMakeLists.txt).

#pragma once

#include <cstdint>

namespace testsupport {

// The numbers count from this call on, from 1; 0: none fails.
void failAllocations(uint64_t first, uint64_t last);

// Since then.
[[nodiscard]] uint64_t getAllocationCount();

} // namespace testsupport
