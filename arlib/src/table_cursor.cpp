// SPDX-License-Identifier: Apache-2.0
//
// Reads a table's bytes from memory or through a window of the file, so that a table of many
// megabytes need not be held. A name may cross from one piece to the next, and may be as long as
// the table.
#include "arlib/src/table_cursor.h"

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

// A name longer than any piece is read again
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

bool TableCursor::viewWord() {
  return viewMore() && m_View.size() >= WordSize;
}

bool TableCursor::viewName(size_t& end) {
  while (end == std::string_view::npos) {
    const size_t searched = m_View.size();
    if (!viewMore()) return false;
    end = m_View.find('\0', searched);
  }
  return true;
}

bool TableCursor::findData() {
  do {
    const size_t data = m_View.find_first_not_of('\0');
    skip(std::min(data, m_View.size()));
    if (data != std::string_view::npos) return true;
  } while (viewMore());
  return false;
}

} // namespace arlib
