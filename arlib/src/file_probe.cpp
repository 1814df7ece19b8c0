// SPDX-License-Identifier: Apache-2.0
//
// Looks at a file that may become a member: what it is, its numbers, and its first bytes, which
// decide the member's type. The header has room for 32-bit numbers only, and a directory or a
// device has no contents to keep, so both are refused here, before the archive has changed.
#include "arlib/interface/file_probe.h"

#include "arlib/interface/archive_format.h"

#include <algorithm>
#include <cerrno>

namespace arlib {

using support::FileKind;
using support::FileStatus;

bool FileProbe::hasArchiveMagic() const {
  return byteCount >= ArchiveMagic.size() &&
         std::equal(ArchiveMagic.begin(), ArchiveMagic.end(), bytes.begin());
}

support::HostError FileProbe::getRefusal() const {
  return statusError != 0 ? statusError : refusalOf(status);
}

support::HostError refusalOf(const FileStatus& status) {
  if (status.kind == FileKind::Directory) return EISDIR;
  // A host that tells of no mode at all has told nothing of the file.
  if (status.kind != FileKind::RegularFile || status.mode == 0) return EINVAL;
  const auto isOutside = [](int64_t value) { return value < 0 || value > 0x7FFFFFFF; };
  if (isOutside(status.modificationTime) || isOutside(status.size) || isOutside(status.uid) ||
      isOutside(status.gid)) {
    return EOVERFLOW;
  }
  return 0;
}

FileProbe openProbe(support::SourceFiles& files, const char* fileName) {
  FileProbe probe;
  probe.statusError = files.getHost().status(fileName, probe.status);
  if (probe.statusError != 0 || probe.status.kind != FileKind::RegularFile) return probe;
  if (files.openToKeep(fileName, probe.file) == 0) {
    probe.status = probe.file->getStatus();
  } else {
    probe.file = files.remember(fileName, probe.status);
  }
  return probe;
}

FileProbe probeFile(support::SourceFiles& files, const char* fileName) {
  FileProbe probe = openProbe(files, fileName);
  if (probe.getRefusal() != 0) return probe;
  size_t done = 0;
  if (probe.file->readAt(probe.bytes, 0, done) == 0) probe.byteCount = static_cast<uint32_t>(done);
  return probe;
}

} // namespace arlib
