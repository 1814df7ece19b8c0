// SPDX-License-Identifier: Apache-2.0
//
// The parser knows an open file as a pointer, so each handle lives on the heap until it is closed.
#include "quarn/host_via_file_reader.h"

#include <memory>

namespace quarn {

using support::FileHandle;

void* HostViaFileReader::open(const char* name) {
  auto file = std::make_unique<FileHandle>();
  return m_Host.openSequential(name, *file) == 0 ? file.release() : nullptr;
}

// A directory opens, and fails here.
ptrdiff_t HostViaFileReader::read(void* file, char* buffer, size_t size) {
  size_t done = 0;
  auto* bytes = reinterpret_cast<uint8_t*>(buffer);
  const support::HostError error =
      m_Host.readNext(*static_cast<FileHandle*>(file), {bytes, size}, done);
  return error == 0 ? static_cast<ptrdiff_t>(done) : ReadError;
}

bool HostViaFileReader::close(void* file) {
  const std::unique_ptr<FileHandle> handle(static_cast<FileHandle*>(file));
  return m_Host.close(*handle) == 0;
}

} // namespace quarn
