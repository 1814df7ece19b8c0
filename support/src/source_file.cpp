// SPDX-License-Identifier: Apache-2.0
//
// The files that are open stand in a queue. Who comes in when it is full sends out the one that has
// been in it longest: runs go through their files in order, so that is the one that is not wanted
// for the longest time.
//
// A file that was sent out is opened by its name again when somebody reads on, and compared with
// the status of the first opening: device, inode, size and time to the nanosecond. That is what
// stops a library that is replaced, or an object that is compiled anew, from being half the old and
// half the new one in the archive that is written.

#include "support/interface/source_file.h"

#include <algorithm>
#include <cerrno>
#include <utility>

namespace support {

struct SourceFiles::Shared {
  Host& host;
  size_t bound;
  std::deque<SourceFile*> open = {};
  uint64_t mostKept = DefaultMostKept;
  uint64_t kept = 0; // bytes, of all files
  HostError closeError = 0;
  std::string closeErrorName = {};

  // Closes the oldest file that may be closed. False if there is none.
  bool closeOldest() {
    if (open.empty()) return false;
    open.front()->close();
    return true;
  }

  // The process or the machine may allow fewer files than the bound does.
  template <class Open>
  HostError openInRoom(const Open& openOne) {
    HostError error = openOne();
    while ((error == EMFILE || error == ENFILE) && closeOldest())
      error = openOne();
    return error;
  }

  HostError openWithinBound(const char* name, bool isForUpdate, FileHandle& handle) {
    while (open.size() >= bound && closeOldest()) {
    }
    return openInRoom([&] {
      return isForUpdate ? host.openForUpdate(name, handle) : host.openForReading(name, handle);
    });
  }

  void leave(SourceFile* file) {
    // Mostly the first: who makes room is the oldest.
    const auto place = std::find(open.begin(), open.end(), file);
    // One that is kept open for its lock isn't in the queue.
    if (place != open.end()) open.erase(place);
  }

  void noteClose(HostError error, const std::string& name) {
    if (error == 0 || closeError != 0) return;
    closeError = error;
    closeErrorName = name;
  }
};

bool isUnchanged(const FileStatus& before, const FileStatus& now) {
  return now.isSameFile(before) && now.size == before.size &&
         now.modificationTime == before.modificationTime &&
         now.modificationNanoseconds == before.modificationNanoseconds;
}

SourceFiles::SourceFiles(Host& host, size_t bound)
    : m_Shared(std::make_shared<Shared>(Shared{.host = host, .bound = bound})) {}

Host& SourceFiles::getHost() const {
  return m_Shared->host;
}

HostError SourceFiles::open(const char* name, std::shared_ptr<SourceFile>& file) {
  file.reset(new SourceFile(m_Shared, name));
  return file->openFirst(false);
}

void SourceFiles::setMostKept(uint64_t bytes) {
  m_Shared->mostKept = bytes;
}

HostError SourceFiles::openToKeep(const char* name, std::shared_ptr<SourceFile>& file) {
  const HostError error = open(name, file);
  if (error == 0) file->keepIfSmall();
  return error;
}

HostError SourceFiles::openForUpdate(const char* name, std::shared_ptr<SourceFile>& file) {
  file.reset(new SourceFile(m_Shared, name));
  return file->openFirst(true);
}

std::shared_ptr<SourceFile> SourceFiles::remember(const char* name, const FileStatus& status) {
  std::shared_ptr<SourceFile> file(new SourceFile(m_Shared, name));
  file->m_Status = status;
  return file;
}

HostError SourceFiles::openOther(const std::function<HostError()>& open) {
  return m_Shared->openInRoom(open);
}

void SourceFiles::closeAll() {
  while (m_Shared->closeOldest()) {
  }
}

HostError SourceFiles::takeCloseError(std::string& name) {
  name = m_Shared->closeErrorName;
  return std::exchange(m_Shared->closeError, 0);
}

SourceFile::~SourceFile() {
  close();
  m_Shared->kept -= m_KeptSize;
}

Host& SourceFile::getHost() const {
  return m_Shared->host;
}

HostError SourceFile::openFirst(bool isForUpdate) {
  m_IsKeptOpen = isForUpdate;
  HostError error = m_Shared->openWithinBound(m_Name.c_str(), isForUpdate, m_Handle);
  if (error != 0) {
    m_Handle = {};
    return error;
  }
  if (!m_IsKeptOpen) m_Shared->open.push_back(this);
  error = m_Shared->host.statusOf(m_Handle, m_Status);
  if (error != 0) close();
  return error;
}

HostError SourceFile::openAgain() {
  if (m_Handle.isOpen()) return 0;
  const FileStatus before = m_Status;
  HostError error = openFirst(false);
  if (error == 0 && !isUnchanged(before, m_Status)) error = FileHasChanged;
  m_Status = before;
  if (error != 0) close();
  return error;
}

// Whatever goes wrong here is left to who wants the bytes: it will go wrong again, or not.
void SourceFile::keepIfSmall() {
  const auto size = static_cast<uint64_t>(m_Status.size);
  if (m_Status.kind != FileKind::RegularFile || size > SourceFiles::LargestKept) return;
  if (m_Shared->kept + size > m_Shared->mostKept) return;
  // One byte more than there should be: some files hold more than they say.
  const auto wanted = static_cast<size_t>(size) + 1;
  auto bytes = std::make_unique_for_overwrite<uint8_t[]>(wanted);
  size_t done = 0;
  if (readAt({bytes.get(), wanted}, 0, done) != 0 || done != size) return;
  // Between the opening and here somebody may have written: bytes of two versions are not kept.
  if (checkUnchanged() != 0) return;
  m_Kept = std::move(bytes);
  m_KeptSize = done;
  m_Shared->kept += done;
  close();
}

HostError SourceFile::readAt(std::span<uint8_t> bytes, uint64_t offset, size_t& done) {
  done = 0;
  if (isKept()) {
    const std::span<const uint8_t> rest = getKept().subspan(std::min<uint64_t>(offset, m_KeptSize));
    done = std::min(bytes.size(), rest.size());
    std::copy_n(rest.begin(), done, bytes.begin());
    return 0;
  }
  if (const HostError error = openAgain(); error != 0) return error;
  return m_Shared->host.readAt(m_Handle, bytes, offset, done);
}

HostError SourceFile::checkUnchanged() {
  if (isKept()) return 0;
  if (const HostError error = openAgain(); error != 0) return error;
  FileStatus now;
  if (const HostError error = m_Shared->host.statusOf(m_Handle, now); error != 0) return error;
  return isUnchanged(m_Status, now) ? 0 : FileHasChanged;
}

HostError SourceFile::lock() {
  if (const HostError error = m_Shared->host.lock(m_Handle); error != 0) return error;
  // Whoever had the lock before may have written: the file is taken as it is from here on.
  FileStatus now;
  if (m_Shared->host.statusOf(m_Handle, now) == 0) m_Status = now;
  return 0;
}

FileHandle SourceFile::giveHandle() {
  m_Shared->leave(this);
  return std::exchange(m_Handle, {});
}

void SourceFile::close() {
  if (!m_Handle.isOpen()) return;
  m_Shared->noteClose(m_Shared->host.close(giveHandle()), m_Name);
}

} // namespace support
