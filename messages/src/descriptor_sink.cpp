// SPDX-License-Identifier: Apache-2.0
//
// The number of the first failure goes up, and nobody writes on.

#include "messages/src/descriptor_sink.h"

#include "support/interface/descriptor.h"

#include <utility>

namespace messages {

void DescriptorSink::open(int descriptor) {
  if (m_Descriptor < 0) m_Descriptor = support::duplicateDescriptor(descriptor);
}

int DescriptorSink::close() {
  const int descriptor = std::exchange(m_Descriptor, -1);
  return descriptor < 0 ? 0 : support::closeDescriptor(descriptor);
}

int DescriptorSink::write(std::string_view bytes) {
  return m_Descriptor < 0 ? 0 : support::writeToDescriptor(m_Descriptor, bytes);
}

} // namespace messages
