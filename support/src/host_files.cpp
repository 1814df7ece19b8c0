// SPDX-License-Identifier: Apache-2.0
//
// What a word of the command line means as files: the folder that it names, the pattern for its
// leaf, and the names in that folder which fit. The folder may hold anything and change meanwhile,
// so a name found here may be gone, or be no plain file, when somebody opens it: that is reported
// there, with the host's reason.

#include "support/interface/host_files.h"

#include "support/interface/pattern.h"

#include <algorithm>

namespace support {

FileKind fileKind(Host& host, const char* name) {
  HostError error = 0;
  return fileKind(host, name, error);
}

FileKind fileKind(Host& host, const char* name, HostError& error) {
  FileStatus status;
  error = host.status(name, status);
  if (error == 0) return status.kind;
  // A drive without a medium is there all the same.
  const bool isDrive = host.getPathStyle() == PathStyle_Windows && isDriveName(name);
  return isDrive ? FileKind::Directory : FileKind::Nothing;
}

int64_t fileTime(Host& host, const char* name) {
  FileStatus status;
  if (host.status(name, status) != 0) return -1;
  return status.modificationTime;
}

bool hasWildcard(std::string_view text) {
  return text.find_first_of("?*") != std::string_view::npos;
}

std::string_view directoryPart(std::string_view word) {
  const size_t slash = word.rfind('/');
  return slash == std::string_view::npos ? std::string_view() : word.substr(0, slash + 1);
}

std::string Host::followLinks(const char* name) {
  std::string place;
  [[maybe_unused]] const HostError error = resolveLinks(name, place);
  return place;
}

HostError Host::endWriting(FileHandle file, const char* name, bool isWhole) {
  FileStatus written;
  const bool isKnown = statusOf(file, written) == 0 && written.kind == FileKind::RegularFile;
  const HostError error = close(file);
  if (!isKnown || (isWhole && error == 0)) return error;
  const std::string place = followLinks(name);
  FileStatus now;
  // What can't be removed stays: why the file is not whole is known already.
  if (status(place.c_str(), now) == 0 && now.isSameFile(written)) [[maybe_unused]]
    const HostError removeError = remove(place.c_str());
  return error;
}

void Host::copyProtection(const char*, const FileStatus& status, FileHandle file) {
  setPermissions(file, status.mode);
}

HostError Host::findNames(std::string_view directory, std::string_view leaf,
                          std::vector<std::string>& names) {
  const std::string place = directory.empty() ? std::string("./") : std::string(directory);
  if (const HostError error = listDirectory(place.c_str(), names); error != 0) return error;
  std::erase_if(names,
                [leaf](const std::string& name) { return !matchesPattern(leaf, name, true); });
  // A host lists a folder in an order of its own, and the members of an archive would follow it.
  std::sort(names.begin(), names.end());
  return 0;
}

std::vector<std::string> wildcardSearch(Host& host, std::string_view directory,
                                        std::string_view leaf) {
  std::vector<std::string> names;
  if (host.findNames(directory, leaf, names) != 0) return {};
  return names;
}

} // namespace support
