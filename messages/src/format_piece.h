// SPDX-License-Identifier: Apache-2.0
//
// What a format says, read once: texts and conversions, one behind the other. A format of the
// catalogue is read by the compiler, any other one as it is filled; what its pieces then come to is
// the same.
//
// Pieces are plain constants of a catalogue: indexes and not pointers, views of the text and no
// copies.

#pragma once

#include "messages/interface/format.h"
#include "messages/src/conversion.h"

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace messages {

struct FormatPiece {
  static constexpr uint8_t NoArgument = 0xFF;

  std::string_view literal; // what stands in front of the conversion
  Conversion conversion;
  bool hasConversion = false;
  uint8_t argument = NoArgument;          // counted from 0
  uint8_t widthArgument = NoArgument;     // of a "*"
  uint8_t precisionArgument = NoArgument; // likewise
  // Where it is not Done, no argument fits, and nothing behind the piece counts. The arguments of
  // its stars were named in front of the fault, and may be at fault first.
  FormatStatus fault = FormatStatus::Done;
};

// As appendFormatted, for a format that was read.
[[nodiscard]] FormatStatus appendPieces(std::string& text, std::span<const FormatPiece> pieces,
                                        std::span<const Argument> arguments);

} // namespace messages
