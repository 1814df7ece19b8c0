// SPDX-License-Identifier: Apache-2.0
//
// What the container tests share: a region that knows each of its blocks, and the way to expect a
// failed assertion. Fresh memory is full of rubbish, so that a container that relies on zeros
// fails; a block that comes back with another size than it was asked for fails, too.

#pragma once

#include "alloclib/interface/region.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <map>
#include <type_traits>

// The default failure handler prints the expression in parentheses and exits with status 1.
#define EXPECT_FAILED_ASSERTION(statement, expression)                                             \
  EXPECT_EXIT(statement, testing::ExitedWithCode(1), "\\(" expression "\\)")

namespace elfext {

// Volatile, or the compiler sees the null pointer and warns of what follows the assertion.
inline alloclib::Region* volatile noRegion = nullptr;

// Fresh memory is full of rubbish. Every block must come back as it was asked for, or die with
// the region.
class CountingRegion final : public alloclib::Region {
public:
  struct Block {
    size_t size;
    size_t alignment;
  };

  CountingRegion() = default;
  ~CountingRegion() {
    for (const auto& [start, block] : m_Blocks)
      std::free(start);
  }

  void* AllocFull(size_t size, size_t alignment, const char*) override {
    ++m_Allocations;
    void* start = std::malloc(size);
    std::memset(start, 0xA5, size);
    m_Blocks[start] = {size, alignment};
    return start;
  }

  void DiscardFull(void* pointer, size_t size, size_t alignment) override {
    const auto found = m_Blocks.find(pointer);
    ASSERT_NE(found, m_Blocks.end()) << "no block starts there";
    EXPECT_EQ(found->second.size, size);
    EXPECT_EQ(found->second.alignment, alignment);
    m_Blocks.erase(found);
    std::free(pointer);
  }

  void Destroy(bool) override {}

  // The blocks that are out now, by their addresses.
  [[nodiscard]] const std::map<void*, Block>& getBlocks() const { return m_Blocks; }
  // Blocks handed out so far.
  [[nodiscard]] size_t getAllocations() const { return m_Allocations; }

private:
  std::map<void*, Block> m_Blocks;
  size_t m_Allocations = 0;
};

// A container of either family; only one of them wants the region.
template <class Container>
Container makeContainer(CountingRegion& region) {
  if constexpr (std::is_constructible_v<Container, alloclib::Region*>)
    return Container(&region);
  else
    return Container();
}

} // namespace elfext
