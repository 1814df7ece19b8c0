// SPDX-License-Identifier: Apache-2.0
//
// printf's formats over typed arguments, in no locale. Conversions are %s %c %d %i %u %x %X %o and
// %%, with flags, width and precision, "*" for either, and positions as in "%2$s" and "%*1$d", so
// that a translated text may turn its arguments round. Length letters are read past.
//
// There is no %n and no float, and no conversion reads what is no argument: a format can go wrong
// in what it says, but not in what it touches. Formats are catalogue texts and literals; the
// compiler has read those of the catalogue.

#pragma once

#include "messages/interface/argument.h"

#include <span>
#include <string>
#include <string_view>

namespace messages {

/// What became of a format. Faults are the program's own: its caller ends the process with them.
enum class FormatStatus : uint8_t {
  Done,
  BadFormat,        ///< unknown conversion, or one that does not fit its argument
  TooManyArguments, ///< the format reaches beyond MostFormatArguments
};

/// Far more than any text names; a position beyond it is a slip of a translator.
inline constexpr uint32_t MostFormatArguments = 20;

/// Appends the formatted text. On another status than Done the text holds what came out before the
/// fault. Arguments that the format does not use are fine.
[[nodiscard]] FormatStatus appendFormatted(std::string& text, std::string_view format,
                                           std::span<const Argument> arguments);

} // namespace messages
