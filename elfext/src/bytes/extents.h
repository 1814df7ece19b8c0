// SPDX-License-Identifier: Apache-2.0
//
// Questions about many extents at once, answered by sorting: a file may have ten thousands of
// them, and may have been made so that each touches all others.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <utility>
#include <vector>

namespace elfext {

// The bytes from `start` up to and without `end`.
struct Extent {
  uint64_t start = 0;
  uint64_t end = 0;
  uint32_t id = 0;
};

// No table has so many rows, so this is nobody's id.
constexpr uint32_t NoExtent = 0xFFFFFFFF;

// Of the extents, none of which is empty and whose ids ascend: the lowest id that shares a byte
// with another, and the lowest of these others.
[[nodiscard]] std::optional<std::pair<uint32_t, uint32_t>>
findFirstOverlap(std::span<const Extent> extents);

// For each of the inner extents, at its place: the lowest id of the outer ones that wholly holds
// it, or NoExtent.
[[nodiscard]] std::vector<uint32_t> findFirstHolders(std::span<const Extent> outer,
                                                     std::span<const Extent> inner);

} // namespace elfext
