// SPDX-License-Identifier: Apache-2.0
//
// Decides where a buffer's bytes are at any moment, and when they move. There are four states: own
// bytes in the module's region; bytes that somebody lent; bytes of the image that were looked at;
// bytes of the image that nobody has asked for yet. Buffer is the only caller. A file can't make
// this room reserve more than it holds: the tables have compared each extent with the image before
// a buffer hears of it, and a view copies nothing.
#include "elfext/interface/content_bytes.h"

#include "alloclib/interface/region_objects.h"
#include "checking/interface/checking.h"

#include <cstring>

namespace elfext {

// An image that has failed once is not asked again: the same bytes must not be there for one look
// and gone for the next.
const uint8_t* ContentBytes::fetch() const {
  if (m_IsLost) return nullptr;
  m_Foreign = m_Source->view(m_SourceOffset, m_Size);
  m_IsLost = m_Foreign == nullptr;
  // The source stays where it failed: it is the one that knows the host's error number.
  if (!m_IsLost) m_Source = nullptr;
  return m_Foreign;
}

const uint8_t* ContentBytes::view() const {
  if (m_Size == 0) return nullptr;
  if (m_Source != nullptr) return fetch();
  return m_Foreign != nullptr ? m_Foreign : m_Own->begin();
}

void ContentBytes::borrow(const uint8_t* bytes, uint64_t size) {
  m_Source = nullptr;
  m_Foreign = bytes;
  m_Size = size;
  m_IsLost = false;
}

void ContentBytes::defer(ImageSource& source, uint64_t offset, uint64_t size) {
  m_Source = &source;
  m_SourceOffset = offset;
  m_Foreign = nullptr;
  m_Size = size;
  m_IsLost = false;
}

FastArray<unsigned char>* ContentBytes::own() {
  // Fetched before anything is reserved, so that lost bytes cost no memory.
  const uint8_t* foreign = isOwned() ? nullptr : view();
  if (m_IsLost) return nullptr;
  if (m_Own == nullptr) m_Own = alloclib::create<FastArray<unsigned char>>(*m_Region, m_Region);
  if (isOwned()) return m_Own;
  QUARN_ASSERT(1, m_Size <= UINT32_MAX);
  m_Own->setSize(static_cast<uint32_t>(m_Size));
  if (foreign != nullptr) std::memcpy(m_Own->begin(), foreign, m_Size);
  m_Foreign = nullptr;
  m_Source = nullptr;
  return m_Own;
}

uint8_t* ContentBytes::modify() {
  FastArray<unsigned char>* bytes = m_Size == 0 ? nullptr : own();
  return bytes == nullptr ? nullptr : bytes->begin();
}

void ContentBytes::setSize(uint64_t size) {
  // Nothing is kept of bytes that are cut to none, so those that were lost are forgiven.
  if (size == 0 && !isOwned()) borrow(nullptr, 0);
  // Less of somebody else's bytes is still a view of them.
  const bool mustOwn = isOwned() || size > m_Size;
  FastArray<unsigned char>* bytes = mustOwn ? own() : nullptr;
  if (bytes != nullptr) bytes->setSize(static_cast<uint32_t>(size));
  m_Size = size;
}

void ContentBytes::reserve(uint64_t capacity) {
  if (FastArray<unsigned char>* bytes = own(); bytes != nullptr)
    bytes->reserve(static_cast<uint32_t>(capacity));
}

} // namespace elfext
