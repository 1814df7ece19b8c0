// SPDX-License-Identifier: Apache-2.0
//
// How the numbers and texts of an attribute section are taken from its bytes. The one caller is the
// trace of such a section, a view for people that no read of the tool makes; it answers with a text
// and has no handler to ask. So a section that ends in the middle of a number or text stops the
// program, rather than letting the trace go on with bytes that are not there: every step ends in
// takePart, which compares before it cuts.
#include "elfext/src/bytes/checked_reader.h"

#include "checking/interface/checking.h"
#include "elfext/src/bytes/leb128.h"

#include <algorithm>

namespace elfext {

namespace {

[[noreturn]] void stopOutOfBuffer() {
  checking::reportFault("DW_UTIL: Out of buffer");
}

} // namespace

bool CheckedReader::isAtText() const {
  return std::ranges::find(m_Rest, 0) != m_Rest.end();
}

CheckedReader CheckedReader::takePart(size_t size) {
  if (size > m_Rest.size()) stopOutOfBuffer();
  const CheckedReader part(m_Rest.first(size), m_IsLittleEndian);
  m_Rest = m_Rest.subspan(size);
  return part;
}

uint32_t CheckedReader::readWord() {
  CheckedReader bytes = takePart(sizeof(uint32_t));
  uint32_t word = 0;
  for (uint32_t i = 0; i < sizeof word; ++i) {
    const uint32_t byte = bytes.readByte();
    word = m_IsLittleEndian ? word | byte << 8 * i : word << 8 | byte;
  }
  return word;
}

uint32_t CheckedReader::readUleb() {
  size_t size = 0;
  uint32_t value = 0;
  // The scoped name is the function on bytes, not this one.
  if (!elfext::readUleb(m_Rest, size, value)) stopOutOfBuffer();
  takePart(size);
  return value;
}

std::string_view CheckedReader::readText() {
  const auto end = std::ranges::find(m_Rest, 0);
  const auto size = static_cast<size_t>(end - m_Rest.begin());
  // Without a zero byte the text is all that is left, and stepping over its end stops.
  const std::span<const uint8_t> text = takePart(size).getRest();
  readByte();
  return {reinterpret_cast<const char*>(text.data()), text.size()};
}

} // namespace elfext
