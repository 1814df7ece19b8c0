// SPDX-License-Identifier: Apache-2.0
#include "arlib/interface/writer_turn.h"

#include "support/interface/source_file.h"

#include <cerrno>

namespace arlib {

std::shared_ptr<support::SourceFile> takeTurn(support::SourceFiles& files, const char* fileName) {
  support::Host& host = files.getHost();
  support::FileStatus status;
  while (host.status(fileName, status) == 0 && status.kind == support::FileKind::RegularFile) {
    std::shared_ptr<support::SourceFile> file;
    const support::HostError error = files.openForUpdate(fileName, file);
    if (error == ENOENT) continue;
    if (error != 0) return files.remember(fileName, status);
    // Without locks one goes on as best one can: the writer looks again before it replaces the
    // file.
    if (file->lock() != 0) return file;
    // Who had the turn before may have put a new file in the place of the one that was waited for.
    if (host.status(fileName, status) == 0 && status.isSameFile(file->getStatus())) return file;
  }
  return nullptr;
}

} // namespace arlib
