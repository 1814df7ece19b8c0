// SPDX-License-Identifier: Apache-2.0
//
// Looks at a file that may become a member: what it is, its numbers, and its first bytes, which
// decide the member's type. The header has room for 32-bit numbers only, and a directory or a
// device has no contents to keep, so both are refused here, before the archive has changed. So is
// what the host can't give: of a file without its bytes nobody knows whether it is an object.
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
  if (hostError != 0) return hostError;
  // Files that the host makes up as they are read say that they are empty.
  return status.size == 0 && byteCount != 0 ? EINVAL : refusalOf(status);
}

void FileProbe::look(uint64_t offset, uint64_t size) {
  size_t done = 0;
  const std::span<uint8_t> wanted = std::span(bytes).first(std::min<uint64_t>(size, bytes.size()));
  hostError = file->readAt(wanted, offset, done);
  // What has lost bytes since its size was taken is neither an object nor none.
  const bool isCut =
      refusalOf(status) == 0 && done < wanted.size() && status.holds(offset + done, 1);
  if (hostError == 0 && isCut) hostError = support::FileHasChanged;
  if (hostError == 0) byteCount = static_cast<uint32_t>(done);
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
  probe.hostError = files.getHost().status(fileName, probe.status);
  if (probe.hostError != 0 || probe.status.kind != FileKind::RegularFile) return probe;
  probe.hostError = files.openToKeep(fileName, probe.file);
  if (probe.hostError == 0) probe.status = probe.file->getStatus();
  return probe;
}

FileProbe probeFile(support::SourceFiles& files, const char* fileName) {
  FileProbe probe = openProbe(files, fileName);
  const bool isOpen = probe.hostError == 0 && probe.status.kind == FileKind::RegularFile;
  if (isOpen) probe.look(0, probe.bytes.size());
  return probe;
}

} // namespace arlib
