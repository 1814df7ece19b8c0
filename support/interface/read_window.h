// SPDX-License-Identifier: Apache-2.0
//
// A view of a file through a buffer: whoever walks a file in small steps gets its bytes without a
// host call for each step, and whoever leaps over large bodies doesn't read them. Archives are
// walked through it from header to header, and objects in them from table to table.
//
// An offset may be any number that a file names: behind the end there are simply no bytes. The
// buffer grows to what is asked for, so who takes a size from a file compares it with what is there
// first.

#pragma once

#include "support/interface/source_file.h"

#include <cstdint>
#include <span>
#include <vector>

namespace support {

/// One buffer for one file after the other. It grows as needed and keeps its memory for the next.
class ReadWindow {
public:
  /// What has been read of another file is forgotten. The file stays the caller's.
  void setFile(SourceFile* file) {
    m_File = file;
    m_Start = 0;
    m_Used = 0;
    m_LastEnd = 0;
    m_EndsFile = false;
  }

  /// Makes up to `size` bytes at `offset` available; fewer only where the file ends, or on an
  /// error. The view holds until the next call.
  [[nodiscard]] std::span<const uint8_t> fetch(uint64_t offset, size_t size, HostError& error);

private:
  [[nodiscard]] HostError read(uint64_t offset, size_t size);

  /// A step over at most so many bytes is part of a walk, and worth reading ahead for. A longer one
  /// is a leap: reading what it leaps over would cost more than the host call that it saves.
  static constexpr size_t WalkStep = 0x1000;
  static constexpr size_t AheadSize = 0x8000;
  /// What a leap reads at least: room for a header, its neighbours and a body's first bytes.
  static constexpr size_t LeapSize = 0x200;

  SourceFile* m_File = nullptr;
  std::vector<uint8_t> m_Bytes;
  uint64_t m_Start = 0; ///< file offset of the first byte
  size_t m_Used = 0;
  uint64_t m_LastEnd = 0;  ///< end of the last request
  bool m_EndsFile = false; ///< the file has nothing behind the bytes held
};

} // namespace support
