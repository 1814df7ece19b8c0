// SPDX-License-Identifier: Apache-2.0
//
// Numbers of any length: seven bits a byte, the least significant ones first, the top bit set on
// all bytes but the last. Attribute sections are made of them. A hostile one is a run of set top
// bits without an end: the bytes that there are bound the loop, and bits that leave 32 never shift
// by more than the language allows.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>

namespace elfext {

// Reads the number at `position` and steps behind it. Bits beyond 32 are not kept apart: the shift
// wraps. False, with the position anywhere, if the bytes end in the middle.
inline bool readUleb(std::span<const uint8_t> bytes, size_t& position, uint32_t& value) {
  value = 0;
  uint32_t shift = 0;
  while (position < bytes.size()) {
    const uint8_t byte = bytes[position++];
    value |= static_cast<uint32_t>(byte & 0x7F) << (shift % 32);
    if ((byte & 0x80) == 0) return true;
    shift += 7;
  }
  return false;
}

// The shortest form, at most five bytes.
inline void appendUleb(std::string& bytes, uint32_t value) {
  while (value >= 0x80) {
    bytes += static_cast<char>(value | 0x80);
    value >>= 7;
  }
  bytes += static_cast<char>(value);
}

} // namespace elfext
