// SPDX-License-Identifier: Apache-2.0
//
// Takes turns at an archive by a lock on its file. The name is looked at again when the lock has
// come: who had the turn before has put a new file in its place, and the lock on the old one is
// worth nothing.
#include "arlib/interface/writer_turn.h"

#include "support/interface/host_files.h"

#include <cerrno>

namespace arlib {

namespace {

using support::SourceFile;

// Not the work of other writers, who rename: a host that tells of a file which it can't open.
constexpr int MostTimesGone = 1000;

// Whether the name still leads to the file: who had the turn before may have put a new one in its
// place while one waited for it.
bool isStillThere(const SourceFile& file, const char* fileName) {
  support::FileStatus now;
  return file.getHost().status(fileName, now) == 0 && now.isSameFile(file.getStatus());
}

} // namespace

std::shared_ptr<SourceFile> takeTurn(support::SourceFiles& files, const char* fileName,
                                     support::FileKind& kind, support::HostError& error) {
  for (int timesGone = 0;;) {
    support::FileStatus status;
    error = files.getHost().status(fileName, status);
    if (error != 0) status = {};
    kind = status.kind;
    if (kind != support::FileKind::RegularFile) return nullptr;
    std::shared_ptr<SourceFile> file;
    const support::HostError openError = files.openForUpdate(fileName, file);
    if (openError == ENOENT && ++timesGone < MostTimesGone) continue;
    if (openError != 0) return files.remember(fileName, status);
    // Without locks one goes on as best one can: the writer looks again before it replaces the
    // file.
    if (file->lock() != 0 || isStillThere(*file, fileName)) return file;
  }
}

} // namespace arlib
