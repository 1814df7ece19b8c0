// SPDX-License-Identifier: Apache-2.0
//
// A tree is an array in which element i is the greater of 2i and 2i + 1; the rows are its second
// half. Making one takes a look at each row and two words of memory for it; then each of a thousand
// tables over the same rows is answered in some twenty rounds, where walking through each would
// take the product. Groups, relocations and symbols of files with overlapping sections are checked
// this way.
#include "elfext/src/bytes/row_maximum.h"

#include <algorithm>
#include <utility>

namespace elfext {

RowMaximum::RowMaximum(std::span<const uint8_t> image, uint32_t rowSize, ValueOf valueOf)
    : m_Image(image), m_RowSize(rowSize), m_ValueOf(std::move(valueOf)) {}

RowMaximum::Tree RowMaximum::makeTree(uint64_t firstOffset) const {
  const size_t rows = (m_Image.size() - firstOffset) / m_RowSize;
  Tree tree(2 * rows);
  for (size_t i = 0; i < rows; ++i)
    tree[rows + i] = m_ValueOf(m_Image.data() + firstOffset + i * m_RowSize);
  for (size_t i = rows; i-- > 1;)
    tree[i] = std::max(tree[2 * i], tree[2 * i + 1]);
  return tree;
}

uint32_t RowMaximum::find(uint64_t offset, uint64_t count) {
  if (count == 0) return 0;
  const uint64_t remainder = offset % m_RowSize;
  // At most as many trees as a row has bytes.
  auto found = m_Trees.find(remainder);
  if (found == m_Trees.end()) found = m_Trees.emplace(remainder, makeTree(remainder)).first;
  const Tree& tree = found->second;
  const size_t rows = tree.size() / 2;
  size_t first = rows + (offset - remainder) / m_RowSize;
  size_t end = first + count;
  uint32_t greatest = 0;
  // From both ends upwards: a right child at the start, or a left one at the end, is taken by
  // itself, as its parent also covers a row outside.
  for (; first < end; first /= 2, end /= 2) {
    if (first % 2 == 1) greatest = std::max(greatest, tree[first++]);
    if (end % 2 == 1) greatest = std::max(greatest, tree[--end]);
  }
  return greatest;
}

} // namespace elfext
