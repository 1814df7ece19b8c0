// SPDX-License-Identifier: Apache-2.0
//
// Lists that a search fills for its caller: some slots inline, since most searches find few, and
// one heap array for what goes beyond.
//
// The caller keeps one list for many searches; it never owns what it points to.
#pragma once

#include "checking/interface/checking.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <memory>

namespace elfext {

template <class T, uint32_t InlineSlots>
class ResultList {
public:
  ResultList() = default;
  ResultList(const ResultList&) = delete;
  ResultList& operator=(const ResultList&) = delete;

  [[nodiscard]] uint32_t getSize() const { return m_Size; }

  /// The new elements are unset until `set`. What overflow array there is serves again if it is
  /// large enough.
  void setSize(uint32_t size) {
    const uint32_t overflow = size > InlineSlots ? size - InlineSlots : 0;
    if (overflow > m_OverflowCapacity) {
      m_Overflow = std::make_unique<T*[]>(overflow);
      m_OverflowCapacity = overflow;
    }
    m_InlineUsed = std::min(size, InlineSlots);
    m_Size = size;
  }

  [[nodiscard]] T* operator[](uint32_t index) const {
    QUARN_ASSERT(1, index < m_Size);
    return index < m_InlineUsed ? m_Inline[index] : m_Overflow[index - m_InlineUsed];
  }

protected:
  /// The caller has asserted that `element` is not null, under the name that its users know.
  void store(uint32_t index, T* element) {
    QUARN_ASSERT(1, index < m_Size);
    (index < m_InlineUsed ? m_Inline[index] : m_Overflow[index - m_InlineUsed]) = element;
  }

private:
  std::array<T*, InlineSlots> m_Inline = {};
  uint32_t m_InlineUsed = 0;
  std::unique_ptr<T*[]> m_Overflow;
  uint32_t m_OverflowCapacity = 0;
  uint32_t m_Size = 0;
};

} // namespace elfext
