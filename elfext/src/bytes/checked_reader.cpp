// SPDX-License-Identifier: Apache-2.0
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
  if (!elfext::readUleb(m_Rest, size, value)) stopOutOfBuffer();
  takePart(size);
  return value;
}

std::string_view CheckedReader::readText() {
  const auto end = std::ranges::find(m_Rest, 0);
  const auto size = static_cast<size_t>(end - m_Rest.begin());
  const std::span<const uint8_t> text = takePart(size).getRest();
  readByte();
  return {reinterpret_cast<const char*>(text.data()), text.size()};
}

} // namespace elfext
