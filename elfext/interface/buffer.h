// SPDX-License-Identifier: Apache-2.0
//
// The byte store of a section or a raw data block. It knows the byte order of its module, so all
// words go through it. The bytes are in memory, or they stay outside of the model and come in
// through a function.
#pragma once

#include "elfext/interface/content_bytes.h"

#include <cstdint>

namespace elfext {

class ObjectModule;

/// Delivers up to `count` bytes at `offset` and returns how many: at least one.
using ExternalDataFunction = uint64_t (*)(void* handle, uint64_t offset, void* destination,
                                          uint64_t count);

/// Bytes of a file that are not read before somebody looks may turn out not to be there. The
/// module's handler then is told of a read error, once; there are no contents, `read` and `write`
/// answer false, a word reads as 0, and writing to it does nothing.
///
/// Offsets and sizes are in bytes. What reads a word in memory asserts that it lies within the
/// buffer; the aligned forms also assert that the offset is a multiple of the word.
class Buffer {
public:
  explicit Buffer(ObjectModule* objectModule);

  /// The contents now come through the function.
  void setExternalData(ExternalDataFunction function, void* handle, uint64_t size);
  [[nodiscard]] bool isExternal() const { return m_ExternalDataFunction != nullptr; }

  /// Uses the caller's memory, which must outlive the module's use of it. The first change copies.
  void borrow(const uint8_t* bytes, uint64_t size) {
    m_Contents.borrow(bytes, size);
    m_IsLossTold = false;
  }
  /// The same for bytes that the source is to give when somebody looks at them.
  void defer(ImageSource& source, uint64_t offset, uint64_t size) {
    m_Contents.defer(source, offset, size);
    m_IsLossTold = false;
  }

  /// The bytes in memory, or null when there are none or they can't be had. Valid until the next
  /// change.
  [[nodiscard]] const uint8_t* getContents() const;
  /// The same to write to; copies what was not the buffer's own.
  [[nodiscard]] uint8_t* getModifiableContents();
  [[nodiscard]] uint64_t getSize() const;
  /// New bytes are as they are in memory: the caller fills them.
  void setSize(uint64_t size);
  /// Room for so many bytes in all; nothing for external data.
  void reserve(uint64_t size);

  /// Aligned words: the offset is a multiple of the word's size.
  [[nodiscard]] uint8_t getByte(uint64_t offset) const;
  void setByte(uint64_t offset, uint8_t value);

  [[nodiscard]] uint16_t get16(uint64_t offset) const;
  [[nodiscard]] uint32_t get32(uint64_t offset) const;
  [[nodiscard]] uint64_t get64(uint64_t offset) const;
  void set16(uint64_t offset, uint16_t value);
  void set32(uint64_t offset, uint32_t value);
  void set64(uint64_t offset, uint64_t value);

  /// Words at any offset.
  [[nodiscard]] uint16_t getUnaligned16(uint64_t offset) const;
  [[nodiscard]] uint32_t getUnaligned32(uint64_t offset) const;
  [[nodiscard]] uint64_t getUnaligned64(uint64_t offset) const;

  /// Both assert that the range lies within the buffer.
  bool read(uint64_t offset, void* buffer, uint64_t count) const;
  bool write(uint64_t offset, const void* buffer, uint64_t count);

  /// Each returns the old size. Words go to a multiple of their own size.
  uint64_t appendByte(uint8_t value);
  uint64_t append16(uint16_t value);
  uint64_t append32(uint32_t value);
  uint64_t append64(uint64_t value);

private:
  /// The bytes from an offset on, to look at or to write to; null, after a report, if they can't be
  /// had.
  [[nodiscard]] const uint8_t* viewAt(uint64_t offset) const;
  [[nodiscard]] uint8_t* modifyAt(uint64_t offset);
  void tellLoss() const;
  template <class Word>
  [[nodiscard]] Word loadWord(uint64_t offset) const;
  template <class Word>
  void storeWord(uint64_t offset, Word value);
  template <class Word>
  uint64_t appendWord(Word value);
  void readExternal(uint64_t offset, void* buffer, uint64_t count) const;

  ContentBytes m_Contents;
  ObjectModule* m_ObjectModule;
  ExternalDataFunction m_ExternalDataFunction = nullptr;
  void* m_ExternalDataHandle = nullptr;
  uint64_t m_ExternalDataSize = 0;
  mutable bool m_IsLossTold = false;
};

} // namespace elfext
