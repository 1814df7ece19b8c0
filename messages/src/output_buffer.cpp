// SPDX-License-Identifier: Apache-2.0
//
// Small pieces are gathered; a piece as large as the buffer goes out uncopied. A listing of 10,000
// members is a few writes in this way, and the contents of a member that is printed cost no copy
// more than they must. Order is kept: what is gathered goes out before a large piece.

#include "messages/src/output_buffer.h"

#include <algorithm>

namespace messages {

void OutputBuffer::append(std::string_view bytes) {
  if (bytes.size() > Capacity - m_Used) flush();
  // After the flush, which may have been what failed.
  if (m_Error != 0) return;
  if (bytes.size() >= Capacity) {
    noteError(m_Sink->write(bytes));
    return;
  }
  std::copy(bytes.begin(), bytes.end(), m_Bytes.data() + m_Used);
  m_Used += bytes.size();
}

void OutputBuffer::flush() {
  if (m_Error == 0 && m_Used > 0) noteError(m_Sink->write({m_Bytes.data(), m_Used}));
  m_Used = 0;
}

void OutputBuffer::setSink(OutputSink* sink) {
  flush();
  m_Sink = sink;
  m_Error = 0;
}

} // namespace messages
