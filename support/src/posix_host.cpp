// SPDX-License-Identifier: Apache-2.0
//
// The POSIX host. One thing here is more than one call each: what is not finished yet stands in a
// table (posix_unfinished.h), unless it has no name at all. The signals are held back while the
// table and the disk disagree.
//
// Opens, locks, reads and writes that a signal interrupts are made again, and short ones go on
// where they stopped, so that callers see only whole results and true failures. Descriptors are
// closed on exec: nothing that the tool opens is handed to a child.

#include "support/interface/host.h"

#include "support/interface/host_files.h"
#include "support/src/posix_protection.h"
#include "support/src/posix_unfinished.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <dirent.h>
#include <fcntl.h>
#include <memory>
#include <sys/file.h>
#include <sys/stat.h>
#include <thread>
#include <unistd.h>

namespace support {

const HostError FileHasChanged = ESTALE;

std::string hostErrorText(HostError error) {
  return std::strerror(error);
}

namespace {

FileKind kindOf(mode_t mode) {
  if (S_ISREG(mode)) return FileKind::RegularFile;
  if (S_ISDIR(mode)) return FileKind::Directory;
  return FileKind::Special;
}

FileStatus statusFrom(const struct stat& native) {
  FileStatus status;
  status.kind = kindOf(native.st_mode);
  status.size = native.st_size;
  status.modificationTime = native.st_mtim.tv_sec;
  status.modificationNanoseconds = static_cast<uint32_t>(native.st_mtim.tv_nsec);
  status.uid = native.st_uid;
  status.gid = native.st_gid;
  status.mode = native.st_mode;
  status.device = native.st_dev;
  status.inode = native.st_ino;
  return status;
}

constexpr mode_t UsualMode = 0666; // which the user's mask cuts
constexpr mode_t PrivateMode = 0600;
constexpr size_t CopiedPiece = 0x40000;
constexpr size_t LongestLink = 4096;

HostError openNative(const char* name, int flags, FileHandle& file, mode_t mode = UsualMode) {
  do {
    file.number = ::open(name, flags | O_CLOEXEC, mode);
  } while (file.number < 0 && errno == EINTR);
  return file.isOpen() ? 0 : errno;
}

// A device or a FIFO is never one, for which the answer is false.
bool enterIfRegular(const char* name, FileHandle file, int descriptor = NoDescriptor) {
  struct stat native;
  if (fstat(file.number, &native) != 0 || !S_ISREG(native.st_mode)) return false;
  enterUnfinished(name, native, descriptor);
  return true;
}

// The one way to name a file that has none which needs no rights of an administrator. Where it
// isn't there (a process that sees no /proc) the file could never get a name.
std::string ownName(FileHandle file) {
  return "/proc/self/fd/" + std::to_string(file.number);
}

#ifdef O_TMPFILE

// False where the file system, or the process, can't have files without names.
bool openWithoutName(std::string_view name, mode_t mode, FileHandle& file) {
  const std::string_view directory = directoryPart(name);
  if (directory.size() == name.size()) return false;
  const std::string place(directory.empty() ? "." : directory);
  if (openNative(place.c_str(), O_RDWR | O_TMPFILE, file, mode) != 0) return false;
  if (access(ownName(file).c_str(), F_OK) == 0) return true;
  ::close(file.number);
  return false;
}

HostError linkOwn(FileHandle file, const char* name) {
  return linkat(AT_FDCWD, ownName(file).c_str(), AT_FDCWD, name, AT_SYMLINK_FOLLOW) == 0 ? 0
                                                                                         : errno;
}

#else

bool openWithoutName(std::string_view, mode_t, FileHandle&) {
  return false;
}

HostError linkOwn(FileHandle, const char*) {
  return ENOSYS;
}

#endif

// Whether anything stands there, also a link that leads nowhere; an error if the host can't tell.
HostError checkIsFree(const char* name) {
  struct stat native;
  if (lstat(name, &native) == 0) return EEXIST;
  return errno == ENOENT ? 0 : errno;
}

// The lock belongs to the opening, not to the process: closing another handle of the same file
// keeps it.
int lockNative(int descriptor) {
#ifdef F_OFD_SETLKW
  struct flock whole = {};
  whole.l_type = F_WRLCK;
  whole.l_whence = SEEK_SET;
  return fcntl(descriptor, F_OFD_SETLKW, &whole);
#else
  return flock(descriptor, LOCK_EX);
#endif
}

// A second name, and then no first one. Should the first one stay, the file is in its place all the
// same.
HostError linkAndUnlink(const char* from, const char* to) {
  if (link(from, to) != 0) return errno;
  unlink(from);
  return 0;
}

HostError renameNewNative(const char* from, const char* to) {
#ifdef RENAME_NOREPLACE
  if (renameat2(AT_FDCWD, from, AT_FDCWD, to, RENAME_NOREPLACE) == 0) return 0;
  if (errno != EINVAL && errno != ENOSYS) return errno;
#endif
  const HostError error = linkAndUnlink(from, to);
  // A file system without second names (and without the call above) has no such step: look, then
  // rename.
  if (error != EPERM && error != ENOSYS && error != EOPNOTSUPP) return error;
  if (access(to, F_OK) == 0) return EEXIST;
  return std::rename(from, to) == 0 ? 0 : errno;
}

// One step of resolveLinks: the text of a link, or empty if the name is no link.
HostError readLink(const std::string& name, std::string& text) {
  std::array<char, LongestLink> bytes;
  const ssize_t length = readlink(name.c_str(), bytes.data(), bytes.size());
  text.assign(bytes.data(), length > 0 ? static_cast<size_t>(length) : 0);
  return length >= 0 || errno == EINVAL || errno == ENOENT ? 0 : errno;
}

DIR* openDirectory(const char* name) {
  for (;;) {
    DIR* directory = opendir(name);
    if (directory != nullptr || errno != EINTR) return directory;
  }
}

class PosixHost final : public Host {
public:
  HostError openForReading(const char* name, FileHandle& file) override {
    return openNative(name, O_RDONLY | O_NONBLOCK, file);
  }

  // Locks of an open file description want the right to write. They don't meet those that scripts
  // take with flock around a whole build: such a script must not wait for itself.
  HostError openForUpdate(const char* name, FileHandle& file) override {
    return openNative(name, O_RDWR | O_NONBLOCK, file);
  }

  HostError openSequential(const char* name, FileHandle& file) override {
    return openNative(name, O_RDONLY, file);
  }

  HostError readNext(FileHandle file, std::span<uint8_t> bytes, size_t& done) override {
    ssize_t count = 0;
    do {
      count = read(file.number, bytes.data(), bytes.size());
    } while (count < 0 && errno == EINTR);
    done = count < 0 ? 0 : static_cast<size_t>(count);
    return count < 0 ? errno : 0;
  }

  HostError lock(FileHandle file) override {
    // There is no bound to the wait: who holds the lock is another run that writes, and it ends.
    while (lockNative(file.number) != 0) {
      if (errno != EINTR) return errno;
    }
    return 0;
  }

  HostError createTemporary(const char* name, uint32_t mode, TemporaryFile& file) override {
    if (const HostError error = checkIsFree(name); error != 0) return error;
    file.hasName = !openWithoutName(name, mode, file.handle);
    if (!file.hasName) return 0;
    const SignalHold hold;
    const HostError error = openNative(name, O_WRONLY | O_CREAT | O_EXCL, file.handle, mode);
    if (error == 0) enterIfRegular(name, file.handle);
    return error;
  }

  HostError giveName(TemporaryFile& file, const char* name) override {
    if (file.hasName) return 0;
    if (const HostError error = closeCopy(file.handle); error != 0) return error;
    const SignalHold hold;
    // Entered beforehand, so that nothing keeps it from being renamed at once.
    enterIfRegular(name, file.handle);
    HostError error = linkOwn(file.handle, name);
    if (error != 0) forgetUnfinished(name);
    if (error != 0 && error != EEXIST) error = moveToNamed(file.handle, name);
    file.hasName = error == 0;
    return error;
  }

  HostError createUnnamedTemporary(std::string& name, FileHandle& file) override {
    const char* place = std::getenv("TMPDIR");
    name = place != nullptr && *place != '\0' ? place : "/tmp";
    name += "/quarn.XXXXXX";
    const SignalHold hold;
    file.number = mkostemp(name.data(), O_CLOEXEC);
    if (!file.isOpen()) return errno;
    enterIfRegular(name.c_str(), file);
    return 0;
  }

  HostError openForWriting(const char* name, FileHandle& file) override {
    constexpr int Flags = O_WRONLY | O_CREAT | O_TRUNC | O_NONBLOCK;
    // Before the file is there: memory may run out here.
    std::string place = name;
    const SignalHold hold;
    HostError error = openNative(name, Flags | O_NOFOLLOW, file);
    if (error == ELOOP || error == EMLINK) {
      error = resolveLinks(name, place);
      if (error == 0) error = openNative(place.c_str(), Flags, file);
    }
    // Only the opening must not wait: whoever reads from a FIFO takes his time.
    if (error == 0 && !enterIfRegular(place.c_str(), file, file.number))
      fcntl(file.number, F_SETFL, O_WRONLY);
    return error;
  }

  HostError createForWriting(const char* name, FileHandle& file) override {
    const SignalHold hold;
    const HostError error = openNative(name, O_WRONLY | O_CREAT | O_EXCL, file);
    if (error == 0) enterIfRegular(name, file, file.number);
    return error;
  }

  HostError endWriting(FileHandle file, const char*, bool isWhole) override {
    const SignalHold hold;
    const HostError error = close(file);
    endUnfinished(file.number, isWhole && error == 0);
    return error;
  }

  void removeUnfinished() override { removeUnfinishedFiles(); }

  HostError readAt(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                   size_t& done) override {
    done = 0;
    while (done < bytes.size()) {
      const ssize_t count = pread(file.number, bytes.data() + done, bytes.size() - done,
                                  static_cast<off_t>(offset + done));
      if (count == 0) break;
      if (count > 0) {
        done += static_cast<size_t>(count);
      } else if (errno != EINTR) {
        return errno;
      }
    }
    return 0;
  }

  HostError write(FileHandle file, std::span<const uint8_t> bytes) override {
    while (!bytes.empty()) {
      const ssize_t count = ::write(file.number, bytes.data(), bytes.size());
      // No progress and no reason: going on would never end.
      if (count == 0) return EIO;
      if (count > 0) {
        bytes = bytes.subspan(static_cast<size_t>(count));
      } else if (errno != EINTR) {
        return errno;
      }
    }
    return 0;
  }

  // Every write has reached the kernel when it returns: nothing is held back in the process.
  HostError flush(FileHandle) override { return 0; }

  HostError flushToDisk(FileHandle file) override {
    while (fsync(file.number) != 0) {
      // Not every file system has disks behind it.
      if (errno == EINVAL || errno == ENOSYS || errno == EROFS || errno == ENOTSUP) return 0;
      if (errno != EINTR) return errno;
    }
    return 0;
  }

  HostError close(FileHandle file) override {
    // The descriptor is gone also when the call was interrupted, so there is no second try.
    return ::close(file.number) == 0 || errno == EINTR ? 0 : errno;
  }

  HostError rename(const char* from, const char* to) override {
    const SignalHold hold;
    if (std::rename(from, to) != 0) return errno;
    forgetUnfinished(from);
    return 0;
  }

  HostError renameNew(const char* from, const char* to) override {
    const SignalHold hold;
    if (const HostError error = renameNewNative(from, to); error != 0) return error;
    forgetUnfinished(from);
    return 0;
  }

  void pause(uint32_t milliseconds) override {
    std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
  }

  HostError remove(const char* name) override {
    const SignalHold hold;
    if (unlink(name) != 0) return errno;
    forgetUnfinished(name);
    return 0;
  }

  HostError status(const char* name, FileStatus& status) override {
    struct stat native;
    status = FileStatus();
    if (stat(name, &native) != 0) return errno;
    status = statusFrom(native);
    return 0;
  }

  HostError statusOf(FileHandle file, FileStatus& status) override {
    struct stat native;
    status = FileStatus();
    if (fstat(file.number, &native) != 0) return errno;
    status = statusFrom(native);
    return 0;
  }

  bool isWritable(const char* name) override { return access(name, W_OK) == 0; }

  void setPermissions(FileHandle file, uint32_t mode) override {
    [[maybe_unused]] const int result = fchmod(file.number, mode & 07777);
  }

  void copyProtection(const char* from, const FileStatus& status, FileHandle file) override {
    copyProtectionTo(file.number, from, status);
  }

  void setTimes(FileHandle file, int64_t seconds) override {
    const timespec time = {.tv_sec = static_cast<time_t>(seconds), .tv_nsec = 0};
    const timespec times[] = {time, time};
    [[maybe_unused]] const int result = futimens(file.number, times);
  }

  HostError resolveLinks(const char* name, std::string& place) override {
    constexpr int MaximumLinks = 40; // as the kernel: a longer chain is a circle
    std::string end = name;
    std::string text;
    place = name;
    for (int i = 0; i <= MaximumLinks; ++i) {
      if (const HostError error = readLink(end, text); error != 0) return error;
      if (text.empty()) {
        place = end;
        return 0;
      }
      // A relative link starts from the folder that it lies in.
      end.resize(text.front() == '/' ? 0 : end.rfind('/') + 1);
      end += text;
    }
    return 0;
  }

  HostError listDirectory(const char* name, std::vector<std::string>& names) override {
    names.clear();
    const std::unique_ptr<DIR, int (*)(DIR*)> directory(openDirectory(name), closedir);
    if (!directory) return errno;
    for (;;) {
      errno = 0;
      const dirent* entry = readdir(directory.get());
      if (entry == nullptr) return errno;
      const std::string leaf = entry->d_name;
      if (leaf != "." && leaf != "..") names.push_back(leaf);
    }
  }

private:
  // What a file system has to say at a close it says at this one, before the file replaces another.
  // Where there is no room for one more, it says it too late.
  HostError closeCopy(FileHandle file) {
    const FileHandle copy = {fcntl(file.number, F_DUPFD_CLOEXEC, 0)};
    return copy.isOpen() ? close(copy) : 0;
  }

  // Who keeps a process from naming its files in that way (a profile of the machine, an emulated
  // root) lets it create others: the handle is one of a copy from now on, which is as protected,
  // and on the disk if the file was.
  HostError moveToNamed(FileHandle file, const char* name) {
    struct stat native;
    if (fstat(file.number, &native) != 0) return errno;
    FileHandle named;
    HostError error = openNative(name, O_RDWR | O_CREAT | O_EXCL, named, PrivateMode);
    if (error != 0) return error;
    enterIfRegular(name, named);
    error = copyAll(file, named);
    if (error == 0) copyProtectionTo(named.number, ownName(file).c_str(), statusFrom(native));
    if (error == 0) error = flushToDisk(named);
    if (error == 0 && dup2(named.number, file.number) < 0) error = errno;
    if (error == 0) fcntl(file.number, F_SETFD, FD_CLOEXEC);
    if (error != 0 && unlink(name) == 0) forgetUnfinished(name);
    ::close(named.number);
    return error;
  }

  HostError copyAll(FileHandle from, FileHandle to) {
    std::vector<uint8_t> piece(CopiedPiece);
    for (uint64_t offset = 0;;) {
      size_t done = 0;
      if (const HostError error = readAt(from, piece, offset, done); error != 0) return error;
      if (done == 0) return 0;
      if (const HostError error = write(to, std::span(piece).first(done)); error != 0) return error;
      offset += done;
    }
  }
};

} // namespace

Host& getNativeHost() {
  static PosixHost host;
  return host;
}

} // namespace support
