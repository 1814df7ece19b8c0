// SPDX-License-Identifier: Apache-2.0
//
// Filling of formats. They are the tool's own, so a fault in one is a fault of the program; it is
// found here or by the reader, and told by the caller. Each argument is compared with the
// conversion that asks for it, and each index with the number of arguments: no format reads what
// was not passed.

#include "messages/interface/format.h"

#include "messages/src/format_reader.h"

#include <algorithm>

namespace messages {

namespace {

using Arguments = std::span<const Argument>;

// False if the conversion is none of ours, or not one for this kind of argument.
bool appendArgument(std::string& text, const Conversion& conversion, const Argument& argument) {
  switch (argument.getKind()) {
  case Argument::Kind::String:
    if (conversion.letter != 's') return false;
    appendString(text, conversion, argument.getText());
    return true;
  case Argument::Kind::Character:
    if (conversion.letter != 'c') return false;
    appendCharacter(text, conversion, argument.getCharacter());
    return true;
  case Argument::Kind::Integer:
    break;
  }
  if (conversion.letter == 'd' || conversion.letter == 'i') {
    appendSigned(text, conversion, argument.getSigned());
    return true;
  }
  constexpr std::string_view UnsignedLetters = "uxXo";
  if (UnsignedLetters.find(conversion.letter) == std::string_view::npos) return false;
  appendUnsigned(text, conversion, argument.getUnsigned());
  return true;
}

// The number that an argument holds in the place of a "*".
bool readStar(Arguments arguments, uint8_t index, int32_t& value) {
  if (index >= arguments.size()) return false;
  const Argument& argument = arguments[index];
  if (argument.getKind() != Argument::Kind::Integer) return false;
  value = static_cast<int32_t>(argument.getSigned());
  // A star takes an int, as in C; more would be a length that nobody meant.
  return value == argument.getSigned();
}

bool setWidth(Conversion& conversion, Arguments arguments, uint8_t index) {
  int32_t width = 0;
  if (!readStar(arguments, index, width)) return false;
  if (width < 0) conversion.isLeftAligned = true;
  conversion.width = static_cast<uint32_t>(width < 0 ? -int64_t{width} : width);
  return true;
}

bool setPrecision(Conversion& conversion, Arguments arguments, uint8_t index) {
  int32_t precision = 0;
  if (!readStar(arguments, index, precision)) return false;
  conversion.hasPrecision = precision >= 0;
  conversion.precision = static_cast<uint32_t>(std::max(precision, 0));
  return true;
}

FormatStatus appendConversion(std::string& text, const FormatPiece& piece, Arguments arguments) {
  Conversion conversion = piece.conversion;
  const bool hasStarWidth = piece.widthArgument != FormatPiece::NoArgument;
  if (hasStarWidth && !setWidth(conversion, arguments, piece.widthArgument))
    return FormatStatus::BadFormat;
  const bool hasStarPrecision = piece.precisionArgument != FormatPiece::NoArgument;
  if (hasStarPrecision && !setPrecision(conversion, arguments, piece.precisionArgument))
    return FormatStatus::BadFormat;
  // Behind the stars: a fault in one of these comes first, as when the format is read piece by
  // piece.
  if (piece.fault != FormatStatus::Done) return piece.fault;
  if (piece.argument >= arguments.size()) return FormatStatus::BadFormat;
  return appendArgument(text, conversion, arguments[piece.argument]) ? FormatStatus::Done
                                                                     : FormatStatus::BadFormat;
}

FormatStatus appendPiece(std::string& text, const FormatPiece& piece, Arguments arguments) {
  text.append(piece.literal);
  return piece.hasConversion ? appendConversion(text, piece, arguments) : FormatStatus::Done;
}

} // namespace

FormatStatus appendPieces(std::string& text, std::span<const FormatPiece> pieces,
                          std::span<const Argument> arguments) {
  for (const FormatPiece& piece : pieces) {
    const FormatStatus status = appendPiece(text, piece, arguments);
    if (status != FormatStatus::Done) return status;
  }
  return FormatStatus::Done;
}

// Piece by piece and without an allocation for them: "Out of memory" may come this way.
FormatStatus appendFormatted(std::string& text, std::string_view format,
                             std::span<const Argument> arguments) {
  FormatReader reader(format);
  FormatPiece piece;
  while (reader.read(piece)) {
    const FormatStatus status = appendPiece(text, piece, arguments);
    if (status != FormatStatus::Done) return status;
  }
  return FormatStatus::Done;
}

} // namespace messages
