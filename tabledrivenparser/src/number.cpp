// SPDX-License-Identifier: Apache-2.0
//
// Numbers as a user writes them: white space, a sign, then decimal digits, or hexadecimal ones
// behind "0x". The prefix stands in front of white space and sign. What is given to the C library's
// conversion begins with a digit, as that would by itself take a second sign.
//
// What doesn't fit the type is told as an overflow and never cut: an address or a count that has
// lost its upper digits would be a good number for the wrong thing.

#include "tabledrivenparser/src/number.h"

#include "support/interface/letters.h"

#include <cerrno>
#include <cstdlib>
#include <limits>

namespace tabledrivenparser {

namespace {

bool isDigit(char character, int base) {
  if (character >= '0' && character <= '9') return true;
  return base == 16 && support::lowered(character) >= 'a' && support::lowered(character) <= 'f';
}

// A negative unsigned number stands for the one that wraps to it.
uint64_t largestMagnitude(ValueType type, bool isNegative) {
  switch (type) {
  case Type_Address:
    return std::numeric_limits<uint32_t>::max();
  case Type_Address64:
    return std::numeric_limits<uint64_t>::max();
  case Type_Int64Vector:
    return uint64_t{std::numeric_limits<int64_t>::max()} + (isNegative ? 1 : 0);
  default:
    return uint64_t{std::numeric_limits<int32_t>::max()} + (isNegative ? 1 : 0);
  }
}

} // namespace

NumberText readNumber(const char* text, ValueType type) {
  NumberText number;
  const bool isHexadecimal = text[0] == '0' && support::lowered(text[1]) == 'x';
  const int base = isHexadecimal ? 16 : 10;
  if (isHexadecimal) text += 2;
  while (support::isWhiteSpace(*text))
    ++text;
  const bool isNegative = *text == '-';
  if (isNegative || *text == '+') ++text;
  // strtoull would skip more white space here, and take a second sign.
  if (!isDigit(*text, base)) return number;

  char* end = nullptr;
  errno = 0;
  const unsigned long long magnitude = std::strtoull(text, &end, base);
  const bool isTooLarge = errno == ERANGE || magnitude > largestMagnitude(type, isNegative);
  number.end = end;
  number.result = isTooLarge ? NumberResult::Overflow : NumberResult::Good;
  // Negated in unsigned arithmetic, where the smallest number has its counterpart.
  number.value = static_cast<int64_t>(isNegative ? 0 - magnitude : magnitude);
  if (type == Type_Address) number.value = static_cast<uint32_t>(number.value);
  return number;
}

} // namespace tabledrivenparser
