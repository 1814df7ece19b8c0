// SPDX-License-Identifier: Apache-2.0
//
// An open file that several deferred sections share. It is closed when the last of them lets go.
//
// It belongs to a module's region, but what it holds is the host's: only counting down to 0, or
// closing, gives that back.
#pragma once

#include "support/interface/host.h"

#include <cstdint>
#include <span>

namespace elfext {

class ReferenceCountedFile {
public:
  /// Takes over the open file, with a count of 0. The host must outlive this object.
  ReferenceCountedFile(support::Host& host, support::FileHandle file)
      : m_Host(&host), m_File(file) {}

  void addReference() { ++m_Count; }
  /// Closes the file at 0. The host's error number of the close, or 0.
  support::HostError release();
  /// Closes the file now, whatever the count; nothing can be read any more.
  support::HostError close();
  /// Gives the file back to who opened it; nothing can be read any more.
  void leaveFileOpen() { m_File = {}; }

  [[nodiscard]] uint32_t getCount() const { return m_Count; }
  [[nodiscard]] bool isOpen() const { return m_File.isOpen(); }
  /// Fills the span with the bytes at `offset`; false if the file can't give them all.
  [[nodiscard]] bool read(std::span<uint8_t> bytes, uint64_t offset);

private:
  support::Host* m_Host;
  support::FileHandle m_File;
  uint32_t m_Count = 0;
};

} // namespace elfext
