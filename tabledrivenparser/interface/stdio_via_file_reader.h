// SPDX-License-Identifier: Apache-2.0
//
// Via files from the C library's streams. The name is the one that the user wrote, relative to the
// working folder also inside another via file.

#pragma once

#include "tabledrivenparser/interface/via_file_reader.h"

namespace tabledrivenparser {

/// Has no state of its own: each open file is a stream, and the pointer that stands for it.
class StdioViaFileReader final : public ViaFileReader {
public:
  void* open(const char* name) override;
  ptrdiff_t read(void* file, char* buffer, size_t size) override;
  bool close(void* file) override;
};

} // namespace tabledrivenparser
