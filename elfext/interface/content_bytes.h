// SPDX-License-Identifier: Apache-2.0
//
// Where the bytes of a buffer are: its own, somebody else's, or still in the image. Bytes that are
// not its own are copied before the first change to them, so a view never writes through.
//
// Buffers of a model are made of these: ten thousand sections that nobody looks at cost no byte of
// their contents.
#pragma once

#include "alloclib/interface/region_general.h"
#include "elfext/interface/fast_array.h"
#include "elfext/interface/image_source.h"

#include <cstdint>

namespace elfext {

class ContentBytes {
public:
  /// Empty; its own bytes will come from the region.
  explicit ContentBytes(alloclib::RegionGeneral& region) : m_Region(&region) {}

  [[nodiscard]] uint64_t getSize() const { return m_Size; }
  /// Null when there are none, or when the image can't give them: then `isLost` from now on. Valid
  /// until the next change.
  [[nodiscard]] const uint8_t* view() const;
  [[nodiscard]] bool isLost() const { return m_IsLost; }
  /// Of lost bytes: why, as the host's error number.
  [[nodiscard]] support::HostError getHostError() const { return m_Source->getHostError(); }

  /// Whether the bytes are the buffer's own, and so at most UINT32_MAX of them.
  [[nodiscard]] bool isOwned() const { return m_Foreign == nullptr && m_Source == nullptr; }

  /// Uses the caller's bytes, which must outlive this object or its next change.
  void borrow(const uint8_t* bytes, uint64_t size);
  /// Will ask the source, which must outlive this object, at the first look.
  void defer(ImageSource& source, uint64_t offset, uint64_t size);

  /// The bytes to write to, all its own from now on; null when there are none, or they are lost.
  [[nodiscard]] uint8_t* modify();
  /// New bytes are as they are in memory. Lost bytes stay lost, unless none of them are kept.
  void setSize(uint64_t size);
  void reserve(uint64_t capacity);

private:
  [[nodiscard]] FastArray<unsigned char>* own();
  [[nodiscard]] const uint8_t* fetch() const;

  alloclib::RegionGeneral* m_Region;
  uint64_t m_Size = 0;
  FastArray<unsigned char>* m_Own = nullptr;
  /// Looking at bytes fetches them, which is no change.
  mutable const uint8_t* m_Foreign = nullptr;
  mutable ImageSource* m_Source = nullptr;
  uint64_t m_SourceOffset = 0;
  mutable bool m_IsLost = false;
};

} // namespace elfext
