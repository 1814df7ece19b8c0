// SPDX-License-Identifier: Apache-2.0
//
// Decides when a file goes that several deferred sections read from: with the last of them, or
// earlier where the module is done with it. The reader holds one reference while it runs, and each
// deferred section one.
#include "elfext/interface/reference_counted_file.h"

#include "checking/interface/checking.h"

namespace elfext {

support::HostError ReferenceCountedFile::close() {
  // Closing twice would close what somebody else was given the same number for.
  if (!isOpen()) return 0;
  const support::HostError error = m_Host->close(m_File);
  m_File = {};
  return error;
}

support::HostError ReferenceCountedFile::release() {
  QUARN_ASSERT(1, m_Count > 0);
  --m_Count;
  return m_Count == 0 ? close() : 0;
}

bool ReferenceCountedFile::read(std::span<uint8_t> bytes, uint64_t offset) {
  size_t done = 0;
  // Less than was asked for is a failure too: the file has become shorter since its header was
  // read.
  return isOpen() && m_Host->readAt(m_File, bytes, offset, done) == 0 && done == bytes.size();
}

} // namespace elfext
