// SPDX-License-Identifier: Apache-2.0
#include "elfext/interface/content_bytes.h"

#include "alloclib/interface/region_objects.h"
#include "checking/interface/checking.h"

#include <cstring>

namespace elfext {

// What an image can't give is zero bytes: who needs to tell the difference has asked the image
// itself, before.
const uint8_t* ContentBytes::fetch() const {
  m_Foreign = m_Source->view(m_SourceOffset, m_Size);
  m_Source = nullptr;
  if (m_Foreign != nullptr) return m_Foreign;
  void* zeros = m_Region->allocate(m_Size, 1);
  std::memset(zeros, 0, m_Size);
  m_Foreign = static_cast<const uint8_t*>(zeros);
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
}

void ContentBytes::defer(ImageSource& source, uint64_t offset, uint64_t size) {
  m_Source = &source;
  m_SourceOffset = offset;
  m_Foreign = nullptr;
  m_Size = size;
}

FastArray<unsigned char>& ContentBytes::own() {
  const uint8_t* foreign = isOwned() ? nullptr : view();
  if (m_Own == nullptr) m_Own = alloclib::create<FastArray<unsigned char>>(*m_Region, m_Region);
  if (isOwned()) return *m_Own;
  QUARN_ASSERT(1, m_Size <= UINT32_MAX);
  m_Own->setSize(static_cast<uint32_t>(m_Size));
  if (foreign != nullptr) std::memcpy(m_Own->begin(), foreign, m_Size);
  m_Foreign = nullptr;
  m_Source = nullptr;
  return *m_Own;
}

uint8_t* ContentBytes::modify() {
  return m_Size == 0 ? nullptr : own().begin();
}

void ContentBytes::setSize(uint64_t size) {
  // Less of somebody else's bytes is still a view of them.
  if (isOwned() || size > m_Size) own().setSize(static_cast<uint32_t>(size));
  m_Size = size;
}

void ContentBytes::reserve(uint64_t capacity) {
  own().reserve(static_cast<uint32_t>(capacity));
}

} // namespace elfext
