// SPDX-License-Identifier: Apache-2.0
//
// Bits of rows, made when a table at a new remainder is first asked for. Only the check of symbols
// in files with overlapping sections calls this: there a thousand symbol tables may each be paired
// with an index section of a thousand others, all over the same few kilobytes. A pair costs one
// word for 64 rows then, and the rows themselves are looked at once for each remainder.
#include "elfext/src/bytes/row_marks.h"

#include <utility>

namespace elfext {

RowMarks::RowMarks(std::span<const uint8_t> image, uint32_t rowSize, IsMarked isMarked)
    : m_Image(image), m_RowSize(rowSize), m_IsMarked(std::move(isMarked)) {}

RowMarks::Bits RowMarks::makeBits(uint64_t firstOffset) const {
  const uint64_t rows = (m_Image.size() - firstOffset) / m_RowSize;
  // One word for the rows behind the last full 64, and one that get() may look into beyond them.
  Bits bits(rows / 64 + 2);
  for (uint64_t i = 0; i < rows; ++i) {
    const bool isMarked = m_IsMarked(m_Image.data() + firstOffset + i * m_RowSize);
    // Row i is bit i % 64, so that neighbouring rows shift into one word whatever row a table
    // starts at.
    bits[i / 64] |= uint64_t{isMarked} << (i % 64);
  }
  return bits;
}

RowMarks::Place RowMarks::find(uint64_t offset) {
  const uint64_t remainder = offset % m_RowSize;
  auto found = m_Bits.find(remainder);
  if (found == m_Bits.end()) found = m_Bits.emplace(remainder, makeBits(remainder)).first;
  return {found->second, (offset - remainder) / m_RowSize};
}

uint64_t RowMarks::Place::get(uint64_t index) const {
  const uint64_t bit = first + index;
  const uint64_t shift = bit % 64;
  const uint64_t low = bits[bit / 64] >> shift;
  // A shift by 64 is not defined.
  return shift == 0 ? low : low | bits[bit / 64 + 1] << (64 - shift);
}

bool haveCommon(RowMarks& left, uint64_t leftOffset, RowMarks& right, uint64_t rightOffset,
                uint64_t count) {
  const RowMarks::Place leftPlace = left.find(leftOffset);
  const RowMarks::Place rightPlace = right.find(rightOffset);
  for (uint64_t i = 0; i < count; i += 64) {
    uint64_t common = leftPlace.get(i) & rightPlace.get(i);
    // Rows behind the two tables are in the bits too, and must not decide.
    if (count - i < 64) common &= (uint64_t{1} << (count - i)) - 1;
    if (common != 0) return true;
  }
  return false;
}

} // namespace elfext
