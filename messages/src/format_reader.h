// SPDX-License-Identifier: Apache-2.0
//
// The reader of formats, which also runs in the compiler. It finds what is wrong with a format
// whatever its arguments are: an unfinished conversion, a width beyond an int, a position of 0 or
// beyond the bound, positions mixed with plain order. A letter that is no conversion shows when it
// is filled, with the kind of the argument.
//
// The form: "%" [position "$"] flags [width] ["." precision] length-letters letter.

#pragma once

#include "messages/src/format_piece.h"

#include <algorithm>
#include <limits>
#include <optional>

namespace messages {

class FormatReader {
public:
  constexpr explicit FormatReader(std::string_view format) : m_Rest(format) {}

  // The next piece, which views the format; false at the end, and behind a fault.
  constexpr bool read(FormatPiece& piece) {
    piece = {};
    if (m_Rest.empty()) return false;
    const size_t length = std::min(m_Rest.find('%'), m_Rest.size());
    const bool isPercent = m_Rest.substr(length).starts_with("%%");
    piece.literal = m_Rest.substr(0, length + (isPercent ? 1 : 0));
    m_Rest.remove_prefix(piece.literal.size());
    if (!skip('%') || isPercent) return true;
    piece.hasConversion = true;
    piece.fault = readConversion(piece);
    if (piece.fault != FormatStatus::Done) m_Rest = {};
    return true;
  }

private:
  // How the format names its arguments; the two ways don't mix.
  enum class Order : uint8_t { Unknown, Sequential, Positional };

  static constexpr uint32_t LargestNumber = std::numeric_limits<int32_t>::max();

  static constexpr bool isDigit(char character) { return character >= '0' && character <= '9'; }

  constexpr bool skip(char character) {
    if (!m_Rest.starts_with(character)) return false;
    m_Rest.remove_prefix(1);
    return true;
  }

  // Stops growing beyond the largest number.
  constexpr uint32_t readNumber() {
    uint64_t number = 0;
    for (; !m_Rest.empty() && isDigit(m_Rest.front()); m_Rest.remove_prefix(1)) {
      number = std::min<uint64_t>(number * 10 + static_cast<uint64_t>(m_Rest.front() - '0'),
                                  uint64_t{LargestNumber} + 1);
    }
    return static_cast<uint32_t>(number);
  }

  // Reads "2$", if a position stands here.
  constexpr std::optional<uint32_t> readPosition() {
    const std::string_view start = m_Rest;
    // A number without "$" is the width, or its "0" a flag, and is read again as that.
    const uint32_t position = readNumber();
    if (m_Rest.size() < start.size() && skip('$')) return position;
    m_Rest = start;
    return std::nullopt;
  }

  constexpr void readFlags(Conversion& conversion) {
    for (;; m_Rest.remove_prefix(1)) {
      switch (m_Rest.empty() ? '\0' : m_Rest.front()) {
      case '-':
        conversion.isLeftAligned = true;
        break;
      case '+':
        conversion.showsPlus = true;
        break;
      case ' ':
        conversion.showsBlank = true;
        break;
      case '#':
        conversion.isAlternate = true;
        break;
      case '0':
        conversion.isZeroPadded = true;
        break;
      default:
        return;
      }
    }
  }

  // Positions count from 1; without one it is the next argument in turn.
  constexpr FormatStatus nameArgument(std::optional<uint32_t> position, uint8_t& argument) {
    const Order order = position ? Order::Positional : Order::Sequential;
    // In C a mixture is undefined: nobody could say which argument is the next in turn.
    if (m_Order != Order::Unknown && m_Order != order) return FormatStatus::BadFormat;
    m_Order = order;
    if (position == 0u) return FormatStatus::BadFormat;
    const uint32_t index = position ? *position - 1 : m_NamedCount++;
    if (index >= MostFormatArguments) return FormatStatus::TooManyArguments;
    argument = static_cast<uint8_t>(index);
    return FormatStatus::Done;
  }

  // A width or a precision: a number, or a "*" and the argument that holds it.
  constexpr FormatStatus readExtent(uint32_t& extent, uint8_t& argument) {
    if (skip('*')) return nameArgument(readPosition(), argument);
    extent = readNumber();
    return extent <= LargestNumber ? FormatStatus::Done : FormatStatus::BadFormat;
  }

  // From behind its "%".
  constexpr FormatStatus readConversion(FormatPiece& piece) {
    Conversion& conversion = piece.conversion;
    const std::optional<uint32_t> position = readPosition();
    readFlags(conversion);
    FormatStatus status = readExtent(conversion.width, piece.widthArgument);
    if (status != FormatStatus::Done) return status;
    conversion.hasPrecision = skip('.');
    if (conversion.hasPrecision) {
      status = readExtent(conversion.precision, piece.precisionArgument);
      if (status != FormatStatus::Done) return status;
    }
    m_Rest.remove_prefix(std::min(m_Rest.find_first_not_of("hljztL"), m_Rest.size()));
    if (m_Rest.empty()) return FormatStatus::BadFormat;
    conversion.letter = m_Rest.front();
    m_Rest.remove_prefix(1);
    return nameArgument(position, piece.argument);
  }

  std::string_view m_Rest;
  uint32_t m_NamedCount = 0; // in sequential order
  Order m_Order = Order::Unknown;
};

} // namespace messages
