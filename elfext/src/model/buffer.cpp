// SPDX-License-Identifier: Apache-2.0
//
// Access to contents in words of the object's byte order, and the check of each access. Misuse is a
// fault of the program and an assertion: whoever goes where a file points compares first. Each
// check comes in an order in which no sum can wrap before it is looked at.
//
// Bytes of a file may still be missing when they are wanted: the file was there when the extents
// were checked, and has been cut since. That is told once for each buffer, and what is wanted then
// is null, or 0 as a word.
#include "elfext/interface/buffer.h"

#include "checking/interface/checking.h"
#include "elfext/interface/object_module.h"

#include <array>
#include <cstddef>
#include <cstring>

namespace elfext {
namespace {

template <class Word>
Word assemble(const uint8_t* bytes, bool isLittleEndian) {
  uint64_t value = 0;
  // Byte by byte: the place may be odd, and the host of either order.
  for (size_t index = 0; index < sizeof(Word); ++index)
    value = value << 8 | bytes[isLittleEndian ? sizeof(Word) - 1 - index : index];
  return static_cast<Word>(value);
}

template <class Word>
void disassemble(uint8_t* bytes, uint64_t value, bool isLittleEndian) {
  for (size_t index = 0; index < sizeof(Word); ++index) {
    bytes[isLittleEndian ? index : sizeof(Word) - 1 - index] = static_cast<uint8_t>(value);
    value >>= 8;
  }
}

} // namespace

Buffer::Buffer(ObjectModule* objectModule)
    : m_Contents(objectModule->getContainerRegion()), m_ObjectModule(objectModule) {}

void Buffer::setExternalData(ExternalDataFunction function, void* handle, uint64_t size) {
  m_ExternalDataFunction = function;
  m_ExternalDataHandle = handle;
  m_ExternalDataSize = size;
}

void Buffer::tellLoss() const {
  if (!m_Contents.isLost() || m_IsLossTold) return;
  // Before the telling, as the handler may look into the section again.
  m_IsLossTold = true;
  m_ObjectModule->reportLostContents(m_Contents.getHostError());
}

const uint8_t* Buffer::viewAt(uint64_t offset) const {
  const uint8_t* bytes = m_Contents.view();
  tellLoss();
  return bytes == nullptr ? nullptr : bytes + offset;
}

uint8_t* Buffer::modifyAt(uint64_t offset) {
  uint8_t* bytes = m_Contents.modify();
  tellLoss();
  return bytes == nullptr ? nullptr : bytes + offset;
}

const uint8_t* Buffer::getContents() const {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  return viewAt(0);
}

uint8_t* Buffer::getModifiableContents() {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  return modifyAt(0);
}

uint64_t Buffer::getSize() const {
  return isExternal() ? m_ExternalDataSize : m_Contents.getSize();
}

void Buffer::setSize(uint64_t size) {
  if (isExternal()) {
    m_ExternalDataSize = size;
    return;
  }
  QUARN_ASSERT(1, size <= UINT32_MAX);
  m_Contents.setSize(size);
  tellLoss();
}

void Buffer::reserve(uint64_t size) {
  if (isExternal()) return;
  QUARN_ASSERT(1, size <= UINT32_MAX);
  m_Contents.reserve(size);
  tellLoss();
}

template <class Word>
Word Buffer::loadWord(uint64_t offset) const {
  std::array<uint8_t, sizeof(Word)> bytes;
  // External data is never viewed: its owner delivers copies.
  if (isExternal()) readExternal(offset, bytes.data(), bytes.size());
  const uint8_t* word = isExternal() ? bytes.data() : viewAt(offset);
  return word == nullptr ? Word{0} : assemble<Word>(word, m_ObjectModule->isLittleEndian());
}

template <class Word>
void Buffer::storeWord(uint64_t offset, Word value) {
  uint8_t* word = modifyAt(offset);
  if (word != nullptr) disassemble<Word>(word, value, m_ObjectModule->isLittleEndian());
}

template <class Word>
uint64_t Buffer::appendWord(Word value) {
  const uint64_t oldSize = m_Contents.getSize();
  // Growing by steps costs no square: the array behind it grows by half each time.
  setSize(oldSize + sizeof(Word));
  storeWord(oldSize, value);
  return oldSize;
}

uint8_t Buffer::getByte(uint64_t offset) const {
  if (isExternal()) return loadWord<uint8_t>(offset);
  QUARN_ASSERT(1, offset < m_Contents.getSize());
  return loadWord<uint8_t>(offset);
}

uint16_t Buffer::get16(uint64_t offset) const {
  QUARN_ASSERT(1, offset % 2 == 0);
  return getUnaligned16(offset);
}

uint32_t Buffer::get32(uint64_t offset) const {
  QUARN_ASSERT(1, offset % 4 == 0);
  return getUnaligned32(offset);
}

uint64_t Buffer::get64(uint64_t offset) const {
  QUARN_ASSERT(1, offset % 8 == 0);
  return getUnaligned64(offset);
}

// The first of the two assertions keeps the sum in the second from wrapping.
uint16_t Buffer::getUnaligned16(uint64_t offset) const {
  if (isExternal()) return loadWord<uint16_t>(offset);
  QUARN_ASSERT(1, offset <= m_Contents.getSize());
  QUARN_ASSERT(1, offset + 2 <= m_Contents.getSize());
  return loadWord<uint16_t>(offset);
}

uint32_t Buffer::getUnaligned32(uint64_t offset) const {
  if (isExternal()) return loadWord<uint32_t>(offset);
  QUARN_ASSERT(1, offset <= m_Contents.getSize());
  QUARN_ASSERT(1, offset + 4 <= m_Contents.getSize());
  return loadWord<uint32_t>(offset);
}

uint64_t Buffer::getUnaligned64(uint64_t offset) const {
  if (isExternal()) return loadWord<uint64_t>(offset);
  QUARN_ASSERT(1, offset <= m_Contents.getSize());
  QUARN_ASSERT(1, offset + 8 <= m_Contents.getSize());
  return loadWord<uint64_t>(offset);
}

void Buffer::setByte(uint64_t offset, uint8_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, offset <= UINT32_MAX);
  QUARN_ASSERT(1, offset < m_Contents.getSize());
  storeWord(offset, value);
}

void Buffer::set16(uint64_t offset, uint16_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, offset <= UINT32_MAX);
  QUARN_ASSERT(1, offset + 2 <= m_Contents.getSize());
  QUARN_ASSERT(1, offset % 2 == 0);
  storeWord(offset, value);
}

void Buffer::set32(uint64_t offset, uint32_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, offset <= UINT32_MAX);
  QUARN_ASSERT(1, offset + 4 <= m_Contents.getSize());
  QUARN_ASSERT(1, offset % 4 == 0);
  storeWord(offset, value);
}

void Buffer::set64(uint64_t offset, uint64_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, offset <= UINT32_MAX);
  QUARN_ASSERT(1, offset + 8 <= m_Contents.getSize());
  QUARN_ASSERT(1, offset % 8 == 0);
  storeWord(offset, value);
}

void Buffer::readExternal(uint64_t offset, void* buffer, uint64_t count) const {
  QUARN_ASSERT(1, count <= m_ExternalDataSize);
  QUARN_ASSERT(1, offset + count <= m_ExternalDataSize);
  auto* destination = static_cast<uint8_t*>(buffer);
  while (count != 0) {
    const uint64_t ret = m_ExternalDataFunction(m_ExternalDataHandle, offset, destination, count);
    // A source that delivers nothing would be asked for ever.
    QUARN_ASSERT(1, ret > 0);
    QUARN_ASSERT(1, ret <= count);
    offset += ret;
    destination += ret;
    count -= ret;
  }
}

bool Buffer::read(uint64_t offset, void* buffer, uint64_t count) const {
  QUARN_ASSERT(1, offset + count >= offset);
  QUARN_ASSERT(1, offset + count >= count);
  QUARN_ASSERT(1, buffer != NULL);
  if (isExternal()) {
    readExternal(offset, buffer, count);
    return true;
  }
  QUARN_ASSERT(1, offset <= m_Contents.getSize());
  QUARN_ASSERT(1, count <= m_Contents.getSize());
  QUARN_ASSERT(1, offset + count <= m_Contents.getSize());
  if (count == 0) return true;
  const uint8_t* bytes = viewAt(offset);
  if (bytes != nullptr) std::memcpy(buffer, bytes, count);
  return bytes != nullptr;
}

bool Buffer::write(uint64_t offset, const void* buffer, uint64_t count) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, buffer != NULL);
  QUARN_ASSERT(1, offset <= UINT32_MAX);
  QUARN_ASSERT(1, count <= UINT32_MAX);
  QUARN_ASSERT(1, offset <= m_Contents.getSize());
  QUARN_ASSERT(1, count <= m_Contents.getSize());
  QUARN_ASSERT(1, offset + count <= m_Contents.getSize());
  if (count == 0) return true;
  uint8_t* bytes = modifyAt(offset);
  if (bytes != nullptr) std::memcpy(bytes, buffer, count);
  return bytes != nullptr;
}

uint64_t Buffer::appendByte(uint8_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  return appendWord(value);
}

uint64_t Buffer::append16(uint16_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, m_Contents.getSize() % 2 == 0);
  return appendWord(value);
}

uint64_t Buffer::append32(uint32_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, m_Contents.getSize() % 4 == 0);
  return appendWord(value);
}

uint64_t Buffer::append64(uint64_t value) {
  QUARN_ASSERT(1, !m_ExternalDataFunction);
  QUARN_ASSERT(1, m_Contents.getSize() % 8 == 0);
  return appendWord(value);
}

} // namespace elfext
