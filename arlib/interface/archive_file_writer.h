// SPDX-License-Identifier: Apache-2.0
//
// Puts an archive on disk. The target is never overwritten in place: the new archive is built in a
// temporary file beside it, since unchanged members are read out of the old one meanwhile, and then
// takes its place in one step.
#pragma once

namespace arlib {

class Archive;

/// True means that the file now holds the archive, and that every member's location points into it.
/// False means that the failure has been reported; the file is then as it was, and no temporary
/// file is left.
///
/// Under the archive's own name the file must be the one that the archive was read from. If
/// somebody else has replaced it or written to it meanwhile, his work is kept, and the write fails
/// with ESTALE.
bool writeFile(const char* fileName, Archive& archive);

enum class WriteEnd {
  Written,
  Failed,    ///< after a report
  Overtaken, ///< somebody else has been faster: his file is left as it is, and nothing is reported
};

/// The same for an archive that must not replace anything; a file that appears at the name
/// overtakes it.
[[nodiscard]] WriteEnd writeNewFile(const char* fileName, Archive& archive);

/// The same for one whose lock is held (see writer_turn.h): it can be overtaken where a disk
/// replaces no open file, since the lock goes with the handle.
[[nodiscard]] WriteEnd writeInTurn(const char* fileName, Archive& archive);

} // namespace arlib
