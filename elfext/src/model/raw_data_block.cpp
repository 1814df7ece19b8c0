// SPDX-License-Identifier: Apache-2.0
//
// Bytes of a segment that no section covers. Its size is that of the gap and never changes; the
// reader leaves the bytes in the image.
#include "elfext/interface/raw_data_block.h"

#include "checking/interface/checking.h"

namespace elfext {

RawDataBlock::RawDataBlock(ObjectModule* objectModule, Segment* segment, uint64_t size)
    : m_Size(size), m_Segment(segment), m_Contents(objectModule) {}

void RawDataBlock::getAlignment(uint64_t* remainder, uint64_t* alignment) const {
  *remainder = 0;
  *alignment = 1;
}

DataStructure* RawDataBlock::createDataStructure(alloclib::RegionGeneral&, uint64_t) {
  // A layout places sections and segments; a block goes where its segment does.
  QUARN_ASSERT(1, !"We shouldn't be here");
  return nullptr;
}

bool RawDataBlock::read(uint64_t offset, void* destination, uint64_t count) const {
  return m_Contents.read(offset, destination, count);
}

bool RawDataBlock::write(uint64_t offset, const void* source, uint64_t count) {
  // A block that nobody has given bytes yet has room for them now.
  if (m_Contents.getSize() != m_Size) m_Contents.setSize(m_Size);
  return m_Contents.write(offset, source, count);
}

} // namespace elfext
