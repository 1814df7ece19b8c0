// SPDX-License-Identifier: Apache-2.0
//
// Via files through fopen, fread and fclose, in binary: the scanner knows both line ends itself,
// and must see a NUL byte. A stream remembers an error and would give its good bytes first, so the
// error mark is looked at before each read.

#include "tabledrivenparser/interface/stdio_via_file_reader.h"

#include <cstdio>

namespace tabledrivenparser {

void* StdioViaFileReader::open(const char* name) {
  return std::fopen(name, "rb");
}

// A directory opens, and fails here. An error that came behind good bytes is told by the next call.
ptrdiff_t StdioViaFileReader::read(void* file, char* buffer, size_t size) {
  auto* stream = static_cast<std::FILE*>(file);
  const size_t count = std::ferror(stream) != 0 ? 0 : std::fread(buffer, 1, size, stream);
  if (count == 0 && std::ferror(stream) != 0) return ReadError;
  return static_cast<ptrdiff_t>(count);
}

bool StdioViaFileReader::close(void* file) {
  return std::fclose(static_cast<std::FILE*>(file)) == 0;
}

} // namespace tabledrivenparser
