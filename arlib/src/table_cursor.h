// SPDX-License-Identifier: Apache-2.0
//
// A way through the bytes of the symbol table from front to back: of bytes in memory, or of those
// of a file, which pass by piece by piece. Tables may be larger than all else that a run keeps.
#pragma once

#include "arlib/interface/archive_format.h"
#include "support/interface/read_window.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace arlib {

// Where the table's bytes are: in memory, or, with a file, `size` bytes at `offset` of that.
struct TableSource {
  std::string_view text = {};
  support::SourceFile* file = nullptr;
  uint64_t offset = 0;
  uint64_t size = 0;
};

class TableCursor {
public:
  // `position` counts from the start of the table, and is not behind its end.
  TableCursor(const TableSource& source, uint64_t position);

  // The next four bytes as a number. Nothing if there are no four, or if they can't be had.
  [[nodiscard]] std::optional<uint32_t> takeWord() {
    if (m_View.size() < WordSize && !viewWord()) return std::nullopt;
    const uint32_t word = getBigEndian32(reinterpret_cast<const uint8_t*>(m_View.data()));
    skip(WordSize);
    return word;
  }
  // The text up to the next NUL, which goes with it. Nothing if there is no NUL, or none that can
  // be had. Good until the next call; for as long as the bytes if these are in memory.
  [[nodiscard]] std::optional<std::string_view> takeName() {
    size_t end = m_View.find('\0');
    if (end == std::string_view::npos && !viewName(end)) return std::nullopt;
    const std::string_view name = m_View.substr(0, end);
    skip(end + 1);
    return name;
  }
  // Goes on to the next byte that is no NUL; false if there is none, or none that can be had.
  [[nodiscard]] bool findData();

  [[nodiscard]] uint64_t getPosition() const { return m_Position; }
  // Whether there were bytes that could not be had, and the host's error number; 0 for a file that
  // is shorter now than the table.
  [[nodiscard]] bool hasFailed() const { return m_HasFailed; }
  [[nodiscard]] support::HostError getError() const { return m_Error; }

private:
  static constexpr size_t WordSize = 4;

  // Widen the view until it has what is wanted. False if it can't have it.
  [[nodiscard]] bool viewMore();
  [[nodiscard]] bool viewWord();
  [[nodiscard]] bool viewName(size_t& end);
  void skip(size_t count) {
    m_View.remove_prefix(count);
    m_Position += count;
  }

  TableSource m_Source;
  support::ReadWindow m_Window;
  std::string_view m_View; // bytes from the position on
  uint64_t m_Position;
  support::HostError m_Error = 0;
  bool m_HasFailed = false;
};

} // namespace arlib
