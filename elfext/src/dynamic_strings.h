// SPDX-License-Identifier: Apache-2.0
//
// The string table of a section with dynamic data.
#pragma once

#include "elfext/interface/elf_constants.h"
#include "elfext/src/object_module_reader.h"

namespace elfext {

class DynamicStrings {
public:
  // Takes the linked section if it is a string table, which alone is sure to end with a zero byte;
  // null is none. False, after a report, if its bytes can't be had.
  [[nodiscard]] bool open(ReadContext& context, const Section* linked) {
    if (linked == nullptr || linked->getType() != SHT_STRTAB) return true;
    m_Text = reinterpret_cast<const char*>(context.viewSection(linked->getIndex()));
    m_Size = linked->getSize();
    return m_Text != nullptr;
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
