// SPDX-License-Identifier: Apache-2.0
//
// When to read, and how much. A step of at most 4 KiB behind the last request is part of a walk,
// and 32 KiB are read ahead; anything else is a leap, which reads 512 bytes or what was asked for.
// The members of a library of small objects are walked, those of large ones are leapt over, and
// neither reads much that nobody looks at.
//
// A file may be cut while it is read. What counts is then what the host gave: the view is shorter
// than asked for, and its user reports an end that came too early.

#include "support/interface/read_window.h"

#include <algorithm>

namespace support {

std::span<const uint8_t> ReadWindow::fetch(uint64_t offset, size_t size, HostError& error) {
  error = 0;
  const uint64_t end = m_Start + m_Used;
  // By subtraction, since offset and size may add up to more than 64 bits hold.
  const bool isHeld = offset >= m_Start && offset <= end && (size <= end - offset || m_EndsFile);
  if (!isHeld) error = read(offset, size);
  // Should this sum wrap, the next read is only of another length.
  m_LastEnd = offset + size;
  const auto skipped = static_cast<size_t>(offset - m_Start);
  return std::span<const uint8_t>(m_Bytes).subspan(skipped, std::min(size, m_Used - skipped));
}

HostError ReadWindow::read(uint64_t offset, size_t size) {
  const bool isWalk = offset >= m_LastEnd && offset - m_LastEnd <= WalkStep;
  // Nothing is read ahead from behind the end that the file had when it was opened.
  const auto fileSize = static_cast<uint64_t>(m_File->getStatus().size);
  const uint64_t ahead =
      std::min<uint64_t>(isWalk ? AheadSize : LeapSize, fileSize - std::min(offset, fileSize));
  const size_t wanted = std::max(size, static_cast<size_t>(ahead));
  if (m_Bytes.size() < wanted) m_Bytes.resize(wanted);
  m_Start = offset;
  const HostError error = m_File->readAt(std::span(m_Bytes).first(wanted), offset, m_Used);
  if (error != 0) m_Used = 0;
  m_EndsFile = error == 0 && (m_Used < wanted || offset + m_Used >= fileSize);
  return error;
}

} // namespace support
