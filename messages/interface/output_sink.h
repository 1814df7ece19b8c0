// SPDX-License-Identifier: Apache-2.0
//
// Where the bytes of one stream go: a descriptor in the tool, a string in a test, a sink that fails
// in a test of what happens then. What arrives here is final: escaped, in order, and not to be
// changed.

#pragma once

#include <string_view>

namespace messages {

/// The end of a stream. Belongs to who made it, and must outlive its use by the streams.
class OutputSink {
public:
  virtual ~OutputSink() = default;
  /// Takes all the bytes. 0, or the host's error number, after which an unknown part is written.
  [[nodiscard]] virtual int write(std::string_view bytes) = 0;
};

} // namespace messages
