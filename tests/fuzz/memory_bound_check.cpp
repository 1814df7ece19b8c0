// SPDX-License-Identifier: Apache-2.0
//
// The bound on memory holds: this program takes as much as an input of a thousand bytes may, gives
// it back, and takes one byte more. What it prints is its answer: the end is the same for all.
#include "tests/fuzz/memory_bound.h"

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <vector>

namespace {

constexpr size_t InputSize = 1000;
constexpr size_t Most = 16 * InputSize + 0x4000000;

// Nobody may leave the block out because it isn't used.
size_t takeAndGiveBack(size_t size) {
  std::vector<char> block(size, 'x');
  return static_cast<size_t>(block.back());
}

} // namespace

int main() {
  std::signal(SIGABRT, [](int) { std::_Exit(0); });
  const fuzzing::MemoryBound bound(InputSize);
  size_t sum = takeAndGiveBack(Most) + takeAndGiveBack(Most);
  std::setvbuf(stdout, nullptr, _IONBF, 0);
  std::puts("As much as it may");
  sum += takeAndGiveBack(Most + 1);
  return sum == 0 ? 0 : 1;
}
