// SPDX-License-Identifier: Apache-2.0
//
// Decides what is known of two regions' places when one has to be told from the other: the file
// offset that a region was given, or only its distance from others in the placement forest. The
// reader gives offsets and links regions that share bytes; pruning and validation ask.
//
// Sizes come from the file and may be anything up to 2^64 - 1, so that no end is ever computed:
// each question is asked of how far one start lies into the other region, and of what is left
// there.
#include "elfext/interface/file_region.h"

#include <algorithm>

namespace elfext {

bool FileRegion::getFileExtent(uint64_t* offset, uint64_t* size) const {
  if (offset != nullptr) *offset = m_FileOffset;
  if (size != nullptr) *size = getFileSize();
  return m_HasFileOffset;
}

void FileRegion::setFileOffset(uint64_t offset) {
  m_FileOffset = offset;
  m_HasFileOffset = true;
}

void FileRegion::clearFileOffset() {
  m_FileOffset = 0;
  m_HasFileOffset = false;
}

bool FileRegion::overlap(FileRegion& first, FileRegion& second, uint64_t* offsetInFirst,
                         uint64_t* offsetInSecond, uint64_t* length) {
  uint64_t firstStart = 0;
  uint64_t secondStart = 0;
  // Of regions in two trees nobody knows how they lie to each other.
  if (first.m_Placement.find(&firstStart) != second.m_Placement.find(&secondStart)) return false;
  const uint64_t start = std::max(firstStart, secondStart);
  const uint64_t intoFirst = start - firstStart;
  const uint64_t intoSecond = start - secondStart;
  // Also true of an empty region, which shares no byte with anything.
  if (intoFirst >= first.getFileSize() || intoSecond >= second.getFileSize()) return false;
  if (offsetInFirst != nullptr) *offsetInFirst = intoFirst;
  if (offsetInSecond != nullptr) *offsetInSecond = intoSecond;
  if (length != nullptr)
    *length = std::min(first.getFileSize() - intoFirst, second.getFileSize() - intoSecond);
  return true;
}

bool FileRegion::isWithin(FileRegion& outer) {
  uint64_t start = 0;
  uint64_t outerStart = 0;
  if (m_Placement.find(&start) != outer.m_Placement.find(&outerStart)) return false;
  if (start < outerStart) return false;
  const uint64_t into = start - outerStart;
  return into <= outer.getFileSize() && getFileSize() <= outer.getFileSize() - into;
}

} // namespace elfext
