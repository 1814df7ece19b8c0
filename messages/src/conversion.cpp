// SPDX-License-Identifier: Apache-2.0
//
// Rendering of values as printf does it in the C locale: sign or base, zeros, digits, and blanks on
// one side. It is done here and not by the host's printf, since that goes by the locale, and takes
// a format with its arguments unread.
//
// Width and precision may be as large as 2147483647, by the tool's own formats and star arguments
// only; a text then grows to that.

#include "messages/src/conversion.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace messages {

namespace {

// A number on its way out: sign or base in front, then zeros, then digits.
struct NumberParts {
  std::string_view front;
  size_t zeroCount;
  std::string_view digits;
};

using DigitBuffer = std::array<char, 24>; // 22 octal digits of 64 bits

std::string_view writeDigits(DigitBuffer& buffer, uint64_t value, char letter) {
  const int base = letter == 'o' ? 8 : (letter == 'x' || letter == 'X') ? 16 : 10;
  const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, base);
  if (letter == 'X') {
    std::transform(buffer.data(), result.ptr, buffer.data(), [](char digit) {
      return digit >= 'a' ? static_cast<char>(digit - 'a' + 'A') : digit;
    });
  }
  return {buffer.data(), static_cast<size_t>(result.ptr - buffer.data())};
}

size_t computePadding(const Conversion& conversion, size_t length) {
  return length < conversion.width ? conversion.width - length : 0;
}

void appendPadded(std::string& text, const Conversion& conversion, std::string_view value) {
  const size_t padding = computePadding(conversion, value.size());
  if (!conversion.isLeftAligned) text.append(padding, ' ');
  text.append(value);
  if (conversion.isLeftAligned) text.append(padding, ' ');
}

void appendNumber(std::string& text, const Conversion& conversion, NumberParts parts) {
  size_t length = parts.front.size() + parts.zeroCount + parts.digits.size();
  const bool fillsWithZeros =
      conversion.isZeroPadded && !conversion.isLeftAligned && !conversion.hasPrecision;
  if (fillsWithZeros && length < conversion.width) {
    parts.zeroCount += conversion.width - length;
    length = conversion.width;
  }
  const size_t padding = computePadding(conversion, length);
  if (!conversion.isLeftAligned) text.append(padding, ' ');
  text.append(parts.front).append(parts.zeroCount, '0').append(parts.digits);
  if (conversion.isLeftAligned) text.append(padding, ' ');
}

// A precision of 0 shows the value 0 as no digit at all.
NumberParts makeParts(DigitBuffer& buffer, const Conversion& conversion, uint64_t value) {
  std::string_view digits = writeDigits(buffer, value, conversion.letter);
  if (value == 0 && conversion.hasPrecision) digits = {};
  const size_t wanted = std::max<size_t>(conversion.precision, digits.size());
  return {"", wanted - digits.size(), digits};
}

} // namespace

void appendString(std::string& text, const Conversion& conversion, std::string_view value) {
  if (conversion.hasPrecision) value = value.substr(0, conversion.precision);
  appendPadded(text, conversion, value);
}

void appendCharacter(std::string& text, const Conversion& conversion, char value) {
  appendPadded(text, conversion, {&value, 1});
}

void appendSigned(std::string& text, const Conversion& conversion, int64_t value) {
  // Negated in unsigned arithmetic, where the smallest value has its counterpart.
  const auto bits = static_cast<uint64_t>(value);
  DigitBuffer buffer;
  NumberParts parts = makeParts(buffer, conversion, value < 0 ? 0 - bits : bits);
  if (value < 0) {
    parts.front = "-";
  } else if (conversion.showsPlus) {
    parts.front = "+";
  } else if (conversion.showsBlank) {
    parts.front = " ";
  }
  appendNumber(text, conversion, parts);
}

void appendUnsigned(std::string& text, const Conversion& conversion, uint64_t value) {
  DigitBuffer buffer;
  NumberParts parts = makeParts(buffer, conversion, value);
  // "#" asks octal for a leading zero, unless the precision has given one.
  if (conversion.isAlternate && conversion.letter == 'o' && parts.zeroCount == 0 &&
      !parts.digits.starts_with('0')) {
    parts.zeroCount = 1;
  }
  if (conversion.isAlternate && value != 0 && conversion.letter == 'x') parts.front = "0x";
  if (conversion.isAlternate && value != 0 && conversion.letter == 'X') parts.front = "0X";
  appendNumber(text, conversion, parts);
}

} // namespace messages
