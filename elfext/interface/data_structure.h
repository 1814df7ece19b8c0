// SPDX-License-Identifier: Apache-2.0
//
// The small records that say what is placed where in an output file. They are made in the region
// of who computes a layout, and read their sizes from the file regions that they stand for.
//
// Kinds are numbered in the order of the classes; what has no record of its own (a raw data block)
// goes where its segment does.
#pragma once

#include "elfext/interface/file_region.h"

#include <cstdint>

namespace elfext {

enum DataStructureKind : uint32_t {
  DataStructureKind_ElfHeader = 0,
  DataStructureKind_SectionHeaderTable = 1,
  DataStructureKind_SegmentHeaderTable = 2,
  DataStructureKind_Section = 3,
  DataStructureKind_Segment = 4,
};

class DataStructure {
public:
  [[nodiscard]] virtual DataStructureKind getKind() const = 0;
  /// Bytes in the file.
  [[nodiscard]] virtual uint64_t getSize() const = 0;

  /// The place that the sequencer gave it.
  [[nodiscard]] uint64_t getFileOffset() const { return m_FileOffset; }
  void setFileOffset(uint64_t offset) { m_FileOffset = offset; }

protected:
  explicit DataStructure(uint64_t fileOffset) : m_FileOffset(fileOffset) {}
  ~DataStructure() = default;

private:
  uint64_t m_FileOffset;
};

template <DataStructureKind Kind>
class DataStructureOf final : public DataStructure {
public:
  DataStructureOf(const FileRegion* fileRegion, uint64_t fileOffset)
      : DataStructure(fileOffset), m_FileRegion(fileRegion) {}

  [[nodiscard]] DataStructureKind getKind() const override { return Kind; }
  [[nodiscard]] uint64_t getSize() const override { return m_FileRegion->getFileSize(); }

private:
  const FileRegion* m_FileRegion;
};

using ElfHeaderDataStructure = DataStructureOf<DataStructureKind_ElfHeader>;
using SectionHeaderTableDataStructure = DataStructureOf<DataStructureKind_SectionHeaderTable>;
using SegmentHeaderTableDataStructure = DataStructureOf<DataStructureKind_SegmentHeaderTable>;
using SectionDataStructure = DataStructureOf<DataStructureKind_Section>;
using SegmentDataStructure = DataStructureOf<DataStructureKind_Segment>;

} // namespace elfext
