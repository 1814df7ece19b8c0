// SPDX-License-Identifier: Apache-2.0
//
// A member header's fields, put and got side by side: 60 bytes of text, numbers in decimal (the
// mode in octal), each filled up with blanks. What is put can always be got again; what is got may
// have been written by anybody, so a number ends at what is no digit, must fill its field, and must
// fit in 32 bits.
#include "arlib/interface/archive_format.h"

#include <algorithm>
#include <charconv>

namespace arlib {

namespace {

constexpr bool isDigit(char character) {
  return character >= '0' && character <= '9';
}

void putText(std::span<uint8_t, MemberHeaderSize> bytes, HeaderField field, std::string_view text) {
  const std::span<uint8_t> room = bytes.subspan(field.position, field.width);
  const auto end = std::copy_n(text.begin(), std::min(text.size(), room.size()), room.begin());
  std::fill(end, room.end(), uint8_t{' '});
}

void putNumber(std::span<uint8_t, MemberHeaderSize> bytes, HeaderField field, uint32_t value,
               int base) {
  std::array<char, 16> digits;
  const auto end = std::to_chars(digits.begin(), digits.end(), value, base).ptr;
  putText(bytes, field, std::string_view(digits.begin(), end));
}

} // namespace

void putMemberHeader(std::span<uint8_t, MemberHeaderSize> bytes, std::string_view name,
                     const MemberHeaderNumbers& numbers) {
  putText(bytes, NameField, name);
  putNumber(bytes, DateField, numbers.date, 10);
  putNumber(bytes, UidField, numbers.uid, 10);
  putNumber(bytes, GidField, numbers.gid, 10);
  putNumber(bytes, ModeField, numbers.mode, 8);
  putNumber(bytes, SizeField, numbers.size, 10);
  putText(bytes, MagicField, MemberMagic);
}

bool parseHeaderNumber(std::string_view text, uint32_t base, uint32_t width, uint32_t& result) {
  result = 0;
  const size_t start = std::min(text.find_first_not_of(' '), text.size());
  if (start == text.size() || !isDigit(text[start])) return false;
  size_t position = start;
  while (position < text.size() && isDigit(text[position])) {
    const auto value = static_cast<uint32_t>(text[position++] - '0');
    if (value >= base) break;
    const uint64_t next = uint64_t{result} * base + value;
    if (next > UINT32_MAX) return false;
    result = static_cast<uint32_t>(next);
  }
  position = std::min(text.find_first_not_of(' ', position), text.size());
  return position == text.size() && position == width;
}

} // namespace arlib
