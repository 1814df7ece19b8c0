// SPDX-License-Identifier: Apache-2.0
//
// A private duplicate of a descriptor as the end of a stream, or where there can be none the
// descriptor itself.

#pragma once

#include "messages/interface/output_sink.h"

namespace messages {

class DescriptorSink final : public OutputSink {
public:
  constexpr DescriptorSink() = default;

  // Takes the descriptor, unless that was done before. A closed one leaves the sink closed.
  void open(int descriptor);
  // 0, or the host's error number.
  int close();

  // A closed sink drops everything and answers 0.
  int write(std::string_view bytes) override;

private:
  int m_Descriptor = -1;
};

} // namespace messages
