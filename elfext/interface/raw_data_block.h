// SPDX-License-Identifier: Apache-2.0
//
// A piece of a segment that no section and no header covers, so that no byte of a segment is lost.
//
// The reader makes one for each gap that it finds; the bytes are a view of the image until somebody
// writes. Sizes count them as padding where they are zero, and as data where not.
#pragma once

#include "elfext/interface/buffer.h"
#include "elfext/interface/data_store.h"
#include "elfext/interface/file_region.h"

namespace elfext {

class Segment;

class RawDataBlock final : public FileRegion, public DataStore {
public:
  /// Made by ObjectModule::createRawDataBlock. The size, in bytes, is fixed; the bytes are the
  /// caller's to give.
  RawDataBlock(ObjectModule* objectModule, Segment* segment, uint64_t size);

  /// The segment that the bytes belong to; the block goes with it.
  [[nodiscard]] Segment* getSegment() const { return m_Segment; }

  [[nodiscard]] uint64_t getFileSize() const override { return m_Size; }
  void getAlignment(uint64_t* remainder, uint64_t* alignment) const override;
  DataStore* getDataStore() override { return this; }
  /// Never called: a block has no record of its own in a layout.
  DataStructure* createDataStructure(alloclib::RegionGeneral& region,
                                     uint64_t currentOffset) override;

  bool read(uint64_t offset, void* destination, uint64_t count) const override;
  bool write(uint64_t offset, const void* source, uint64_t count) override;
  [[nodiscard]] uint64_t getSize() const override { return m_Size; }

private:
  friend class ModuleBuilder;

  uint64_t m_Size;
  Segment* m_Segment;
  Buffer m_Contents;
};

} // namespace elfext
