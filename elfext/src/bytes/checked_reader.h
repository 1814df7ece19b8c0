// SPDX-License-Identifier: Apache-2.0
//
// Reads the numbers and texts of an attribute section one after the other, for its trace. Reading
// past the end stops the program; the parsers that read attributes of objects are others, and
// answer false instead.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace elfext {

class CheckedReader {
public:
  CheckedReader(std::span<const uint8_t> bytes, bool isLittleEndian)
      : m_Rest(bytes), m_IsLittleEndian(isLittleEndian) {}

  [[nodiscard]] bool isAtEnd() const { return m_Rest.empty(); }
  // The bytes that were not read yet.
  [[nodiscard]] std::span<const uint8_t> getRest() const { return m_Rest; }
  [[nodiscard]] size_t getRemaining() const { return m_Rest.size(); }
  // Whether a text that begins here ends before the bytes do.
  [[nodiscard]] bool isAtText() const;

  // A reader of the next bytes, which this one steps over.
  CheckedReader takePart(size_t size);
  uint8_t readByte() { return takePart(1).m_Rest.front(); }
  // Four bytes, in the reader's byte order.
  uint32_t readWord();
  // Unsigned LEB128. Bits of a number that is too long wrap around.
  uint32_t readUleb();
  // Up to a zero byte, which is stepped over.
  std::string_view readText();

private:
  std::span<const uint8_t> m_Rest;
  bool m_IsLittleEndian;
};

} // namespace elfext
