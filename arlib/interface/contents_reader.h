// SPDX-License-Identifier: Apache-2.0
//
// Reads members' contents in pieces, wherever they are, so that no member has to be in memory as a
// whole. Most members of a run come from one file, and what is read ahead of one member serves the
// next.
#pragma once

#include "arlib/interface/archive.h"

#include <cstdint>
#include <memory>
#include <span>

namespace support {
class ReadWindow;
class SourceFile;
} // namespace support

namespace arlib {

class ContentsReader {
public:
  /// Failures are reported through the archive's handler.
  explicit ContentsReader(Archive& archive);
  ~ContentsReader();
  ContentsReader(const ContentsReader&) = delete;
  ContentsReader& operator=(const ContentsReader&) = delete;

  /// Turns to a member. False after a report.
  [[nodiscard]] bool start(const ArchiveMember& member);

  /// The next piece; empty at the end of the member. It holds until the next call. False after a
  /// report.
  [[nodiscard]] bool read(std::span<const uint8_t>& piece);

  /// Makes sure that the file of the members read so far was not written to meanwhile: what came of
  /// them could be old in one place and new in another. `start` does so where it turns to another
  /// file. False after a report.
  bool finish();

  /// The host's error number of the last failure; 0 if a file ended too early, ESTALE if it
  /// changed.
  [[nodiscard]] int getError() const { return m_Error; }

private:
  struct MadePieces;

  /// Large enough that the number of host calls doesn't matter, small enough for a processor's
  /// cache. Copying inside the kernel was measured, and is no faster than this.
  static constexpr uint64_t PieceSize = 0x40000;

  bool turnTo(support::SourceFile* file);
  bool failToRead(int error);

  Archive& m_Archive;
  support::SourceFile* m_File = nullptr; ///< that was read last, and is still to be looked at
  std::unique_ptr<support::ReadWindow> m_Window;
  const uint8_t* m_Memory = nullptr;  ///< the rest of a member that is in memory
  std::unique_ptr<MadePieces> m_Made; ///< the rest of a table that is made piece by piece
  uint64_t m_Offset = 0;              ///< of the rest of a member that is on disk
  uint64_t m_Remaining = 0;
  int m_Error = 0;
};

} // namespace arlib
