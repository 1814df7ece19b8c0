// SPDX-License-Identifier: Apache-2.0
//
// Texts as bytes and bytes as texts, for tests that write their inputs as strings, and the numbers
// in these. Byte orders are spelled out, so that no test asks the code it tests for them.

#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace testsupport {

inline std::span<const uint8_t> bytesOf(std::string_view text) {
  return {reinterpret_cast<const uint8_t*>(text.data()), text.size()};
}

inline std::string textOf(std::span<const uint8_t> bytes) {
  return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

// 32 bits in the given byte order.
inline std::string word(uint64_t value, bool isLittle) {
  std::string bytes;
  for (uint32_t i = 0; i < 4; ++i)
    bytes += static_cast<char>(value >> 8 * (isLittle ? i : 3 - i) & 0xFF);
  return bytes;
}

inline std::string littleEndian(uint32_t value) {
  return word(value, true);
}

inline std::string bigEndian(uint32_t value) {
  return word(value, false);
}

} // namespace testsupport
