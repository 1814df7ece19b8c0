// SPDX-License-Identifier: Apache-2.0
//
// The role of something with bytes: sections and raw data blocks. Whoever lays out or copies a file
// region asks it for its store and then needs to know no more of what it is.
#pragma once

#include <cstdint>

namespace elfext {

class DataStore {
public:
  /// Both answer true, but for bytes that the file could not give: the module's handler has been
  /// told of these, and nothing is read or written. The range must lie within the store.
  virtual bool read(uint64_t offset, void* destination, uint64_t count) const = 0;
  virtual bool write(uint64_t offset, const void* source, uint64_t count) = 0;
  /// Bytes.
  [[nodiscard]] virtual uint64_t getSize() const = 0;
  [[nodiscard]] virtual bool isModifiable() const { return true; }

protected:
  /// Stores belong to their module, never to who reads them.
  ~DataStore() = default;
};

} // namespace elfext
