// SPDX-License-Identifier: Apache-2.0
//
// The built-in catalogues. All have the same keys and, for each, the same arguments, which a text
// may name in another order ("%2$s"). The compiler reads their formats, so that a run only fills
// them: a listing of a large archive fills the same format once for each member.

#pragma once

#include "messages/interface/catalogue.h"
#include "messages/src/format_piece.h"

#include <span>

namespace messages {

struct BuiltInCatalogue {
  std::span<const CatalogueRow> rows;
  std::span<const FormatPiece> pieces; // of all rows, one behind the other
  std::span<const uint16_t> ends;      // by row: the number of pieces up to its last one
};

const BuiltInCatalogue& getEnglishCatalogue();
const BuiltInCatalogue& getJapaneseCatalogue();

// A text, and what it says if it is a built-in one; of any other there are no pieces.
struct MessageFormat {
  std::string_view text;
  std::span<const FormatPiece> pieces;
};

// Good for as long as getMessageText's answer.
MessageFormat getMessageFormat(Key key);

} // namespace messages
