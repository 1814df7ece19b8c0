// SPDX-License-Identifier: Apache-2.0
//
// The greatest value of any run of rows, where a file's tables lie over one another: rows that a
// thousand tables share are looked at once. Tables share rows when the distance of their offsets
// is a multiple of the row size, so there is one tree of maxima for each remainder.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <span>
#include <vector>

namespace elfext {

class RowMaximum {
public:
  using ValueOf = std::function<uint32_t(const uint8_t* row)>;

  RowMaximum(std::span<const uint8_t> image, uint32_t rowSize, ValueOf valueOf);

  // Of `count` rows from `offset` on, all of them in the image; 0 for no rows.
  [[nodiscard]] uint32_t find(uint64_t offset, uint64_t count);

private:
  using Tree = std::vector<uint32_t>;

  [[nodiscard]] Tree makeTree(uint64_t firstOffset) const;

  std::span<const uint8_t> m_Image;
  uint32_t m_RowSize;
  ValueOf m_ValueOf;
  std::map<uint64_t, Tree> m_Trees;
};

} // namespace elfext
