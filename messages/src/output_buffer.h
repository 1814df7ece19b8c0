// SPDX-License-Identifier: Apache-2.0
//
// The buffer of stdout. It remembers the first failure of its sink and drops what comes after,
// since output with a hole in it is worse than output that ends. It is static data of the process
// and needs no memory of the heap, so that it can be flushed when that has run out.

#pragma once

#include "messages/interface/output_sink.h"

#include <array>
#include <cstddef>

namespace messages {

class OutputBuffer {
public:
  constexpr explicit OutputBuffer(OutputSink* sink) : m_Sink(sink) {}

  void append(std::string_view bytes);
  void flush();
  // Flushes to the old sink, then forgets its failure.
  void setSink(OutputSink* sink);

  // The host's error number of the first failure, or 0.
  [[nodiscard]] int getError() const { return m_Error; }
  void noteError(int errorNumber) {
    if (m_Error == 0) m_Error = errorNumber;
  }

private:
  static constexpr size_t Capacity = 0x10000; // bytes

  OutputSink* m_Sink;
  size_t m_Used = 0;
  int m_Error = 0;
  std::array<char, Capacity> m_Bytes{};
};

} // namespace messages
