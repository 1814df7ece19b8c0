// SPDX-License-Identifier: Apache-2.0
//
// Names of good archives are found by looking around, as they are short. Behind a block or two the
// answer is taken from the tables of blocks, which cost one pass each.
#include "arlib/src/long_names.h"

#include "arlib/interface/archive_format.h"
#include "support/interface/path.h"

#include <algorithm>

namespace arlib {

namespace {

constexpr size_t BlockSize = 256;
constexpr size_t None = std::string_view::npos;

// Where the first name ends that ends in [from, limit), or None.
size_t firstEnd(std::string_view table, size_t from, size_t limit) {
  // A terminator may have its second character at the limit.
  const std::string_view text = table.substr(from, limit - from + 1);
  const size_t terminator = text.find(LongNameTerminator);
  const size_t end = std::min(text.substr(0, terminator).find('\0'), terminator);
  return end < limit - from ? from + end : None;
}

// The place behind the last separator in [from, limit), or `from`.
size_t lastLeaf(std::string_view table, size_t from, size_t limit) {
  return limit - support::lastPathComponent(table.substr(from, limit - from)).size();
}

} // namespace

LongNames::LongNames(std::string_view table)
    : m_Table(table), m_LastTerminator(table.rfind(LongNameTerminator)) {}

std::optional<std::string_view> LongNames::nameAt(size_t index) {
  if (index >= m_Table.size()) return std::nullopt;
  if (index > 0 && m_Table[index] == '\n' && m_Table[index - 1] == '/') return std::nullopt;
  if (m_LastTerminator == None || index > m_LastTerminator) return std::nullopt;
  return m_Table.substr(index, endBehind(index) - index);
}

// There is one, as the last terminator is not in front.
size_t LongNames::endBehind(size_t index) {
  const size_t block = index / BlockSize + 2;
  const size_t end = firstEnd(m_Table, index, block * BlockSize);
  if (end != None) return end;
  if (m_Ends.empty()) findEnds();
  return m_Ends[block];
}

void LongNames::findEnds() {
  m_Ends.resize(m_Table.size() / BlockSize + 1);
  size_t next = m_LastTerminator;
  for (size_t block = m_Ends.size(); block-- > 0;) {
    const size_t from = block * BlockSize;
    next = std::min(firstEnd(m_Table, from, from + BlockSize), next);
    m_Ends[block] = static_cast<uint32_t>(next);
  }
}

std::string_view LongNames::leafOf(std::string_view name) {
  if (name.size() < BlockSize) return support::lastPathComponent(name);
  const auto begin = static_cast<size_t>(name.data() - m_Table.data());
  const size_t end = begin + name.size();
  const size_t block = (end - 1) / BlockSize;
  size_t leaf = lastLeaf(m_Table, std::max(begin, block * BlockSize), end);
  if (leaf == block * BlockSize) {
    if (m_Leaves.empty()) findLeaves();
    leaf = std::max<size_t>(begin, m_Leaves[block]);
  }
  return m_Table.substr(leaf, end - leaf);
}

void LongNames::findLeaves() {
  m_Leaves.reserve(m_Table.size() / BlockSize + 1);
  m_Leaves.push_back(0);
  for (size_t from = 0; from + BlockSize <= m_Table.size(); from += BlockSize) {
    const size_t leaf = lastLeaf(m_Table, from, from + BlockSize);
    m_Leaves.push_back(leaf == from ? m_Leaves.back() : static_cast<uint32_t>(leaf));
  }
}

} // namespace arlib
