// SPDX-License-Identifier: Apache-2.0
//
// What the compiler makes of the rows of a built-in catalogue, and what it checks of them. Rows
// come in, and one array of the pieces of all their formats comes out, with the place where each
// row's pieces end; a row out of order, or a format with a fault, doesn't compile.

#pragma once

#include "messages/src/catalogues.h"
#include "messages/src/format_reader.h"

#include <algorithm>
#include <array>
#include <limits>

namespace messages {

// The look-up is a binary search, and a key that stood twice would hide a text.
consteval bool isSortedAndUnique(std::span<const CatalogueRow> rows) {
  const auto notAscending = [](const CatalogueRow& row, const CatalogueRow& next) {
    return row.key >= next.key;
  };
  return std::adjacent_find(rows.begin(), rows.end(), notAscending) == rows.end();
}

consteval size_t countPieces(std::span<const CatalogueRow> rows) {
  size_t count = 0;
  FormatPiece piece;
  for (const CatalogueRow& row : rows) {
    for (FormatReader reader(row.text); reader.read(piece);)
      ++count;
  }
  return count;
}

template <size_t RowCount, size_t PieceCount>
struct CompiledRows {
  std::array<FormatPiece, PieceCount> pieces;
  std::array<uint16_t, RowCount> ends;

  [[nodiscard]] consteval bool hasFault() const {
    return std::any_of(pieces.begin(), pieces.end(),
                       [](const FormatPiece& piece) { return piece.fault != FormatStatus::Done; });
  }
};

template <const auto& Rows>
consteval auto compileRows() {
  // Counted in a first pass, as an array of constants needs its size before its contents.
  constexpr size_t PieceCount = countPieces(Rows);
  static_assert(PieceCount <= std::numeric_limits<uint16_t>::max());
  CompiledRows<std::size(Rows), PieceCount> compiled{};
  uint16_t count = 0;
  for (size_t row = 0; row < std::size(Rows); ++row) {
    FormatReader reader(Rows[row].text);
    for (FormatPiece piece; reader.read(piece); ++count)
      compiled.pieces[count] = piece;
    compiled.ends[row] = count;
  }
  return compiled;
}

} // namespace messages
