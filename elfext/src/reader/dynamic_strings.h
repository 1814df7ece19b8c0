// SPDX-License-Identifier: Apache-2.0
//
// The string table of a section with dynamic data.
//
// Offsets come from dynamic tags, version records and preemption maps, which nobody has checked,
// since a bad one is no reason to reject a file. Each is compared with the table's size here; a
// table that is named ends with a zero byte, so the text at a good offset ends in it.
#pragma once

#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

class DynamicStrings {
public:
  // No strings at all.
  DynamicStrings() = default;
  // Those of the table that the section names, if it names one.
  DynamicStrings(ReadContext& context, uint32_t section) {
    const std::optional<uint32_t> table = context.stringTableOf(section);
    if (!table) return;
    m_Text = context.stringsOf(*table);
    m_Size = context.stringSize(*table);
  }

  // Null for an offset that is not in the table.
  [[nodiscard]] const char* find(uint64_t offset) const {
    return offset < m_Size ? m_Text + offset : nullptr;
  }
  // The empty text for one that is not.
  [[nodiscard]] const char* get(uint64_t offset) const {
    return offset < m_Size ? m_Text + offset : "";
  }

private:
  const char* m_Text = nullptr;
  uint64_t m_Size = 0;
};

} // namespace elfext
