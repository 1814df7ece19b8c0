// SPDX-License-Identifier: Apache-2.0
//
// Via files through the host, like every other file of a run. They are read once, from beginning to
// end, so that a pipe can be one.
#pragma once

#include "support/interface/host.h"
#include "tabledrivenparser/interface/via_file_reader.h"

namespace quarn {

class HostViaFileReader final : public tabledrivenparser::ViaFileReader {
public:
  // The host must outlive this object.
  explicit HostViaFileReader(support::Host& host) : m_Host(host) {}

  void* open(const char* name) override;
  ptrdiff_t read(void* file, char* buffer, size_t size) override;
  bool close(void* file) override;

private:
  support::Host& m_Host;
};

} // namespace quarn
