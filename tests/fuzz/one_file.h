// SPDX-License-Identifier: Apache-2.0
//
// A reader of via files for which every name is the same file, which comes in pieces.
//
// Pieces may have any size, so that the scanner meets each border between two reads; and a file
// that names itself is met by any name.

#pragma once

#include "tabledrivenparser/interface/via_file_reader.h"

#include <algorithm>
#include <cstring>
#include <string_view>

class OneFile final : public tabledrivenparser::ViaFileReader {
public:
  // The text must outlive this object.
  OneFile(std::string_view text, size_t pieceSize) : m_Text(text), m_PieceSize(pieceSize) {}

  void* open(const char*) override { return new size_t(0); }
  ptrdiff_t read(void* file, char* buffer, size_t size) override {
    size_t& position = *static_cast<size_t*>(file);
    const size_t count = std::min({size, m_PieceSize, m_Text.size() - position});
    if (count > 0) std::memcpy(buffer, m_Text.data() + position, count);
    position += count;
    return static_cast<ptrdiff_t>(count);
  }
  bool close(void* file) override {
    delete static_cast<size_t*>(file);
    return true;
  }

private:
  std::string_view m_Text;
  size_t m_PieceSize;
};
