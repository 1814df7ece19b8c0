// SPDX-License-Identifier: Apache-2.0
//
// Which rows have a property, as bits, where a file's tables lie over one another. Two tables that
// are read row beside row are compared 64 rows at a time, as there may be a thousand such pairs,
// each at distances of its own. As with maxima, there is one set of bits for each remainder of the
// offset.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <span>
#include <vector>

namespace elfext {

class RowMarks {
public:
  using IsMarked = std::function<bool(const uint8_t* row)>;

  RowMarks(std::span<const uint8_t> image, uint32_t rowSize, IsMarked isMarked);

  // Whether among `count` rows of each, from the two offsets on and all of them in the image, there
  // is a pair in the same place of which both are marked.
  friend bool haveCommon(RowMarks& left, uint64_t leftOffset, RowMarks& right, uint64_t rightOffset,
                         uint64_t count);

private:
  // With one word more than the bits need.
  using Bits = std::vector<uint64_t>;

  // Where the bit of the row at an offset is.
  struct Place {
    const Bits& bits;
    uint64_t first;
    // 64 bits from the `index`-th on.
    [[nodiscard]] uint64_t get(uint64_t index) const;
  };

  [[nodiscard]] Place find(uint64_t offset);
  [[nodiscard]] Bits makeBits(uint64_t firstOffset) const;

  std::span<const uint8_t> m_Image;
  uint32_t m_RowSize;
  IsMarked m_IsMarked;
  std::map<uint64_t, Bits> m_Bits;
};

} // namespace elfext
