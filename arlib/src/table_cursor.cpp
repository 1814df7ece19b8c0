// SPDX-License-Identifier: Apache-2.0
#include "arlib/src/table_cursor.h"

#include "arlib/interface/archive_format.h"
#include "checking/interface/checking.h"

#include <algorithm>

namespace arlib {

TableCursor::TableCursor(const TableSource& source, uint64_t position)
    : m_Source(source), m_Position(position) {
  QUARN_ASSERT(1, position <= source.size);
  if (source.file == nullptr)
    m_View = source.text.substr(position);
  else
    m_Window.setFile(source.file);
}

// Widens the view, which holds too little for who asks. A name longer than any piece is read again
// in pieces that double, so that none is read more than twice.
bool TableCursor::viewMore() {
  constexpr uint64_t PieceSize = 0x10000;
  const uint64_t rest = m_Source.size - m_Position;
  if (m_View.size() == rest) return false;
  const uint64_t wanted = std::min(rest, std::max<uint64_t>(PieceSize, 2 * m_View.size()));
  const std::span<const uint8_t> bytes =
      m_Window.fetch(m_Source.offset + m_Position, static_cast<size_t>(wanted), m_Error);
  m_HasFailed = bytes.size() < wanted;
  m_View = {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
  return !m_HasFailed;
}

void TableCursor::skip(size_t count) {
  m_View.remove_prefix(count);
  m_Position += count;
}

std::optional<uint32_t> TableCursor::takeWord() {
  constexpr size_t WordSize = 4;
  if (m_View.size() < WordSize && !viewMore()) return std::nullopt;
  if (m_View.size() < WordSize) return std::nullopt;
  const uint32_t word = getBigEndian32(reinterpret_cast<const uint8_t*>(m_View.data()));
  skip(WordSize);
  return word;
}

std::optional<std::string_view> TableCursor::takeName() {
  size_t end = m_View.find('\0');
  while (end == m_View.npos) {
    const size_t searched = m_View.size();
    if (!viewMore()) return std::nullopt;
    end = m_View.find('\0', searched);
  }
  const std::string_view name = m_View.substr(0, end);
  skip(end + 1);
  return name;
}

bool TableCursor::findData() {
  do {
    const size_t data = m_View.find_first_not_of('\0');
    skip(std::min(data, m_View.size()));
    if (data != m_View.npos) return true;
  } while (viewMore());
  return false;
}

} // namespace arlib
