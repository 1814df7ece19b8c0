// SPDX-License-Identifier: Apache-2.0
//
// The ELF header as a region of the file: always at its start.
//
// It is placed like all others when a file is laid out, and segments may hold it. What the header
// says is in ObjectModule.
#pragma once

#include "elfext/interface/file_region.h"

namespace elfext {

/// A new file of class 1 has eight bytes more than the standard's 52.
constexpr uint32_t NewElfHeaderSize32 = 60;
constexpr uint32_t ElfHeaderSize64 = 64;

class ELFHeader final : public FileRegion {
public:
  [[nodiscard]] uint64_t getFileSize() const override { return m_Size; }
  /// Bytes, as e_ehsize has it.
  void setSize(uint32_t size) { m_Size = size; }

  void getAlignment(uint64_t* remainder, uint64_t* alignment) const override;
  /// Only 0 is possible.
  void setFileOffset(uint64_t offset) override;
  DataStructure* createDataStructure(alloclib::RegionGeneral& region,
                                     uint64_t currentOffset) override;

private:
  uint32_t m_Size = NewElfHeaderSize32;
};

} // namespace elfext
