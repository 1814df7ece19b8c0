// SPDX-License-Identifier: Apache-2.0
//
// How the parser gets at the bytes of via files. The client supplies it, since the parser stands
// below all that knows files; tests put texts, short reads and failures in its place.

#pragma once

#include <cstddef>

namespace tabledrivenparser {

/// Several files may be open at a time, as via files nest.
class ViaFileReader {
public:
  static constexpr ptrdiff_t ReadError = -1;

  virtual ~ViaFileReader() = default;
  /// Returns the open file, or null if it can't be opened.
  [[nodiscard]] virtual void* open(const char* name) = 0;
  /// Reads up to size bytes. Returns their number, 0 only at the end, or ReadError.
  [[nodiscard]] virtual ptrdiff_t read(void* file, char* buffer, size_t size) = 0;
  /// The file is closed whatever the result; false if the host complained.
  virtual bool close(void* file) = 0;
};

} // namespace tabledrivenparser
