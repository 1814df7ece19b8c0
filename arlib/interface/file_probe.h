// SPDX-License-Identifier: Apache-2.0
//
// All that the archive wants to know of a file before it takes it in: what the host tells of it,
// and its first bytes. The file is open then, and whatever is read of it later is read of that
// same file.
#pragma once

#include "elfext/interface/format_recognizer.h"
#include "support/interface/source_file.h"

#include <array>
#include <cstdint>
#include <memory>
#include <span>

namespace arlib {

struct FileProbe {
  /// Why the host told nothing of the file, or nothing of its bytes: the error number, or 0.
  support::HostError hostError = 0;
  support::FileStatus status;
  std::array<uint8_t, elfext::RecognizedBytes> bytes = {};
  uint32_t byteCount = 0;
  /// Of a regular file that the host could open.
  std::shared_ptr<support::SourceFile> file;

  [[nodiscard]] std::span<const uint8_t> getFirstBytes() const {
    return std::span(bytes).first(byteCount);
  }
  /// Takes the first bytes of a piece of the file, which is open, or tells in `hostError` why not.
  void look(uint64_t offset, uint64_t size);

  [[nodiscard]] bool exists() const { return status.kind != support::FileKind::Nothing; }

  /// Whether the file begins as an archive does.
  [[nodiscard]] bool hasArchiveMagic() const;

  /// Why the file can't become a member: 0, or the error number to report. It must be a regular
  /// file that has no more bytes than it says, if it says none, and the numbers that go in the
  /// header must not be negative as signed 32-bit values.
  [[nodiscard]] support::HostError getRefusal() const;
};

/// Opens regular files only: looking at a device or a FIFO could have effects, or wait.
[[nodiscard]] FileProbe probeFile(support::SourceFiles& files, const char* fileName);

/// The same without the first bytes.
[[nodiscard]] FileProbe openProbe(support::SourceFiles& files, const char* fileName);

/// What may be said of a file's status alone, as FileProbe::getRefusal does.
[[nodiscard]] support::HostError refusalOf(const support::FileStatus& status);

} // namespace arlib
