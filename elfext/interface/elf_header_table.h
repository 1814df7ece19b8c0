// SPDX-License-Identifier: Apache-2.0
//
// A table of headers as a region of the file: what the section and program header tables share.
//
// Entry sizes are what e_shentsize and e_phentsize say; the rows themselves always have the size of
// the class.
#pragma once

#include "elfext/interface/file_region.h"

namespace elfext {

class ELFHeaderTable : public FileRegion {
public:
  [[nodiscard]] uint64_t getFileSize() const override {
    return uint64_t{m_EntrySize} * m_EntryCount;
  }
  /// Bytes.
  [[nodiscard]] uint32_t getEntrySize() const { return m_EntrySize; }
  void setEntrySize(uint32_t size) { m_EntrySize = size; }
  void setEntryCount(uint64_t count) { m_EntryCount = count; }

  void getAlignment(uint64_t* remainder, uint64_t* alignment) const override;
  void setAlignment(uint64_t alignment) override { m_Alignment = alignment; }

protected:
  explicit ELFHeaderTable(uint32_t entrySize) : m_EntrySize(entrySize) {}
  ~ELFHeaderTable() = default;

private:
  uint32_t m_EntrySize;
  uint64_t m_EntryCount = 0;
  uint64_t m_Alignment = 4;
};

} // namespace elfext
