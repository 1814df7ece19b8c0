// SPDX-License-Identifier: Apache-2.0
//
// The POSIX host. One thing here is more than one call each: a file made by createTemporary stands
// in a small table until it is renamed or removed. The signal handler walks that table with
// `unlink` alone, which is allowed in a handler; the signals are held back while the table and the
// disk disagree.
//
// Opens, locks, reads and writes that a signal interrupts are made again, and short ones go on
// where they stopped, so that callers see only whole results and true failures. Descriptors are
// closed on exec: nothing that the tool opens is handed to a child.

#include "support/interface/host.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <csignal>
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

constexpr std::array<int, 4> EndingSignals = {SIGINT, SIGTERM, SIGHUP, SIGPIPE};

// One archive is written at a time, and its members rarely have temporaries of their own; what
// finds no room here is simply not removed by a signal.
constexpr size_t MaximumTemporaries = 16;
constexpr size_t MaximumTemporaryName = 4096;

struct TemporarySlot {
  volatile sig_atomic_t isUsed = 0;
  char name[MaximumTemporaryName] = {};
};

std::array<TemporarySlot, MaximumTemporaries> temporarySlots;

// Holds the ending signals back while it lives.
class SignalHold {
public:
  SignalHold() {
    sigset_t ending;
    sigemptyset(&ending);
    for (const int signal : EndingSignals)
      sigaddset(&ending, signal);
    sigprocmask(SIG_BLOCK, &ending, &m_Before);
  }
  ~SignalHold() { sigprocmask(SIG_SETMASK, &m_Before, nullptr); }
  SignalHold(const SignalHold&) = delete;
  SignalHold& operator=(const SignalHold&) = delete;

private:
  sigset_t m_Before;
};

void enterTemporary(const char* name) {
  const size_t length = std::strlen(name);
  if (length >= MaximumTemporaryName) return;
  for (TemporarySlot& slot : temporarySlots) {
    if (slot.isUsed != 0) continue;
    std::memcpy(slot.name, name, length + 1);
    slot.isUsed = 1;
    return;
  }
}

void forgetTemporary(const char* name) {
  for (TemporarySlot& slot : temporarySlots) {
    if (slot.isUsed != 0 && std::strcmp(slot.name, name) == 0) slot.isUsed = 0;
  }
}

extern "C" void removeTemporariesAndEnd(int signal) {
  for (TemporarySlot& slot : temporarySlots) {
    if (slot.isUsed != 0) unlink(slot.name);
  }
  // The process ends by the signal itself, so that the caller's shell sees what has ended it.
  std::signal(signal, SIG_DFL);
  std::raise(signal);
}

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

HostError openNative(const char* name, int flags, FileHandle& file) {
  do {
    // 0666 is cut by the user's mask; what an archive shall have at the end is set from the old
    // one.
    file.number = ::open(name, flags | O_CLOEXEC, 0666);
  } while (file.number < 0 && errno == EINTR);
  return file.isOpen() ? 0 : errno;
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

// One step of followLinks: the text of a link, or empty if the name is no link.
std::string linkText(const std::string& name) {
  std::array<char, MaximumTemporaryName> text;
  const ssize_t length = readlink(name.c_str(), text.data(), text.size());
  if (length <= 0 || static_cast<size_t>(length) == text.size()) return {};
  return std::string(text.data(), static_cast<size_t>(length));
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

  HostError createTemporary(const char* name, FileHandle& file) override {
    const SignalHold hold;
    const HostError error = openNative(name, O_WRONLY | O_CREAT | O_EXCL, file);
    if (error == 0) enterTemporary(name);
    return error;
  }

  HostError createUnnamedTemporary(std::string& name, FileHandle& file) override {
    const char* place = std::getenv("TMPDIR");
    name = place != nullptr && *place != '\0' ? place : "/tmp";
    name += "/quarn.XXXXXX";
    const SignalHold hold;
    file.number = mkostemp(name.data(), O_CLOEXEC);
    if (!file.isOpen()) return errno;
    enterTemporary(name.c_str());
    return 0;
  }

  HostError openForWriting(const char* name, FileHandle& file) override {
    return openNative(name, O_WRONLY | O_CREAT | O_TRUNC | O_NONBLOCK, file);
  }

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

  HostError close(FileHandle file) override {
    // The descriptor is gone also when the call was interrupted, so there is no second try.
    return ::close(file.number) == 0 || errno == EINTR ? 0 : errno;
  }

  HostError rename(const char* from, const char* to) override {
    const SignalHold hold;
    if (std::rename(from, to) != 0) return errno;
    forgetTemporary(from);
    return 0;
  }

  HostError renameNew(const char* from, const char* to) override {
    const SignalHold hold;
    if (const HostError error = renameNewNative(from, to); error != 0) return error;
    forgetTemporary(from);
    return 0;
  }

  void pause(uint32_t milliseconds) override {
    std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
  }

  HostError remove(const char* name) override {
    const SignalHold hold;
    if (unlink(name) != 0) return errno;
    forgetTemporary(name);
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

  void setTimes(FileHandle file, int64_t seconds) override {
    const timespec time = {.tv_sec = static_cast<time_t>(seconds), .tv_nsec = 0};
    const timespec times[] = {time, time};
    [[maybe_unused]] const int result = futimens(file.number, times);
  }

  std::string followLinks(const char* name) override {
    constexpr int MaximumLinks = 40; // as the kernel: a longer chain is a circle
    std::string place = name;
    for (int i = 0; i < MaximumLinks; ++i) {
      const std::string text = linkText(place);
      if (text.empty()) return place;
      // A relative link starts from the folder that it lies in.
      place.resize(text.front() == '/' ? 0 : place.rfind('/') + 1);
      place += text;
    }
    return name;
  }

  HostError listDirectory(const char* name, std::vector<std::string>& names) override {
    names.clear();
    const std::unique_ptr<DIR, int (*)(DIR*)> directory(opendir(name), closedir);
    if (!directory) return errno;
    for (;;) {
      errno = 0;
      const dirent* entry = readdir(directory.get());
      if (entry == nullptr) return errno;
      const std::string leaf = entry->d_name;
      if (leaf != "." && leaf != "..") names.push_back(leaf);
    }
  }
};

} // namespace

Host& getNativeHost() {
  static PosixHost host;
  return host;
}

void installSignalCleanUp() {
  for (const int signal : EndingSignals) {
    struct sigaction before;
    // A signal that the parent process ignores (a job in the background) stays ignored.
    if (sigaction(signal, nullptr, &before) == 0 && before.sa_handler == SIG_IGN) continue;
    std::signal(signal, removeTemporariesAndEnd);
  }
  // The write then fails with EFBIG, and the clean-up of a failed write runs as for a full disk.
  std::signal(SIGXFSZ, SIG_IGN);
}

} // namespace support
