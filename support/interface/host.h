// SPDX-License-Identifier: Apache-2.0
//
// The host: every file operation of the product goes through this one interface, so that tests can
// put another host in its place (a map in memory, a disk that is full, a k-th call that fails).
//
// Errors come back as the host's own error number (errno), at once; 0 is success. Nothing is kept
// in a process-wide error variable between two calls. Names are NUL-terminated byte strings, on
// Windows in UTF-8; what separates their parts is told by the host's style.
//
// Others change the same files meanwhile, and a name may lead to a FIFO, a device, a link or a file
// that grows: an opening never waits, a status tells what a thing is before it is used, and a
// temporary is created only where nothing stands. Names are resolved anew by each call that takes
// one; whoever wants to stay with one file keeps its handle (see source_file.h).

#pragma once

#include "support/interface/path.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace support {

/// The host's error number; 0 means success.
using HostError = int;

/// A file is not the one that it was (ESTALE, which not every C library has).
extern const HostError FileHasChanged;

/// The text of an error number: the same words on every host. The process never leaves the C
/// locale, so they are also the same for every user.
[[nodiscard]] std::string hostErrorText(HostError error);

/// What a name or an open file stands for, links followed.
enum class FileKind : uint8_t {
  Nothing,     ///< no such name, or the host refuses to say
  RegularFile, ///< an ordinary file
  Directory,
  Special, ///< a device, FIFO or socket: never opened, never removed
};

/// What the host knows of a file, all in 64 bits: the caller narrows, with checks.
struct FileStatus {
  FileKind kind = FileKind::Nothing;
  int64_t size = 0;                     ///< bytes
  int64_t modificationTime = 0;         ///< seconds since 1970
  uint32_t modificationNanoseconds = 0; ///< behind the second, as far as the host tells
  int64_t uid = 0;
  int64_t gid = 0;
  uint32_t mode = 0; ///< type and permission bits, as in st_mode
  uint64_t device = 0;
  uint64_t inode = 0;

  /// The same file under whatever name. Two that are nothing are never the same.
  [[nodiscard]] bool isSameFile(const FileStatus& other) const {
    return kind != FileKind::Nothing && kind == other.kind && device == other.device &&
           inode == other.inode;
  }
  /// Whether the file has that range of bytes, whatever the two numbers are.
  [[nodiscard]] bool holds(uint64_t offset, uint64_t count) const {
    const auto available = static_cast<uint64_t>(size);
    return offset <= available && count <= available - offset;
  }
};

/// An open file. A plain number, so that it can be copied; whoever opened it closes it.
struct FileHandle {
  int number = -1;

  [[nodiscard]] bool isOpen() const { return number >= 0; }
};

/// A file that is going to be put in another's place when it is whole. Where the host can have such
/// files it has no name until it is given one, and goes with its handle whatever ends the process.
struct TemporaryFile {
  FileHandle handle;
  bool hasName = false;
};

/// All file operations of a process. Objects that are given one keep a reference: it outlives them.
/// Texts are views for the call.
class Host {
public:
  virtual ~Host() = default;

  /// By which rules names are read: PathStyle_Posix or PathStyle_Windows.
  [[nodiscard]] virtual PathStyle getPathStyle() const { return PathStyle_Posix; }

  /// Opens an existing file. Never waits, also not on a FIFO.
  [[nodiscard]] virtual HostError openForReading(const char* name, FileHandle& file) = 0;

  /// The same for a file that is going to be locked: a host may want the right to write for that.
  [[nodiscard]] virtual HostError openForUpdate(const char* name, FileHandle& file) = 0;

  /// Opens a file that is read from its beginning to its end, with `readNext`: may be a pipe, too,
  /// and then waits for who writes into it.
  [[nodiscard]] virtual HostError openSequential(const char* name, FileHandle& file) = 0;

  /// Reads up to bytes.size() bytes behind those that were read before; 0 of them only at the end.
  [[nodiscard]] virtual HostError readNext(FileHandle file, std::span<uint8_t> bytes,
                                           size_t& done) = 0;

  /// Waits until nobody else holds the lock of the file, and takes it. It is the process's own word
  /// to others who lock: who doesn't ask isn't kept from anything. Closing the handle gives it
  /// back. An error means that the host or the file system has no locks.
  [[nodiscard]] virtual HostError lock(FileHandle file) = 0;

  /// Creates a file for a name at which nothing must stand yet (else EEXIST), with permission bits
  /// that the user's mask still cuts. It is unfinished until it is renamed or removed.
  [[nodiscard]] virtual HostError createTemporary(const char* name, uint32_t mode,
                                                  TemporaryFile& file) = 0;

  /// Lets a temporary that has no name so far stand at that one, if nothing has come to stand there
  /// meanwhile (else EEXIST). Before it is closed; all failures that a close could tell of are told
  /// here.
  [[nodiscard]] virtual HostError giveName(TemporaryFile&, const char*) { return 0; }

  /// Creates a temporary with a name of the host's choice in a writable place, and stores the name.
  [[nodiscard]] virtual HostError createUnnamedTemporary(std::string& name, FileHandle& file) = 0;

  /// Creates a file, or empties the one that is there. It is unfinished until `endWriting`.
  [[nodiscard]] virtual HostError openForWriting(const char* name, FileHandle& file) = 0;

  /// The same where nothing stands, not even a link that leads nowhere; else EEXIST.
  [[nodiscard]] virtual HostError createForWriting(const char* name, FileHandle& file) = 0;

  /// Closes what one of these two has opened under that name. Unless all has arrived in it, and the
  /// close goes well, too, the file is removed: a regular one alone, and only where it still
  /// stands; never a device or a FIFO, and of a link the file that it leads to.
  [[nodiscard]] virtual HostError endWriting(FileHandle file, const char* name, bool isWhole);

  /// Removes all files of this process that are unfinished, before it ends.
  virtual void removeUnfinished() {}

  /// Reads up to bytes.size() bytes at `offset`; `done` is how many there were. Fewer than asked
  /// for with a result of 0 means that the file ends there. On some hosts it moves the place where
  /// `readNext` and `write` go on: a file that was written is read when it is whole.
  [[nodiscard]] virtual HostError readAt(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                                         size_t& done) = 0;

  /// Writes all bytes at the file's position, or fails.
  [[nodiscard]] virtual HostError write(FileHandle file, std::span<const uint8_t> bytes) = 0;

  /// Hands over what the host has held back of earlier writes, so that a full disk shows here and
  /// not at the close, and the time of the last change is what it will be when the file is closed.
  [[nodiscard]] virtual HostError flush(FileHandle file) = 0;

  /// Waits until the bytes are on the disk, so that a power failure later on finds them there. Some
  /// failures of a disk show nowhere else. 0 where the host has no such step for the file.
  [[nodiscard]] virtual HostError flushToDisk(FileHandle file) = 0;

  /// The handle is closed in any case.
  [[nodiscard]] virtual HostError close(FileHandle file) = 0;

  /// Puts `from` in the place of `to` in one step: at no moment is there no `to`. EBUSY where
  /// somebody has one of them open in a way that keeps it from being renamed or replaced, which may
  /// pass. Where the file system replaces no open file, one's own handle of `to` is in the way,
  /// too.
  [[nodiscard]] virtual HostError rename(const char* from, const char* to) = 0;

  /// The same where there must be no `to` yet (else EEXIST), in one step as far as the host can.
  [[nodiscard]] virtual HostError renameNew(const char* from, const char* to) = 0;

  /// Whether who has the lock of a file keeps it until he has put another in its place: not where
  /// the handle that it comes with may have to be closed first.
  [[nodiscard]] virtual bool keepsLocks() const { return true; }

  /// Takes a step that looks at a file and then replaces it. Where the lock may be gone by then,
  /// nobody on this machine who replaces the same file in this way comes in between.
  [[nodiscard]] virtual HostError replaceAlone(const FileStatus&,
                                               const std::function<HostError()>& step) {
    return step();
  }

  /// Does nothing for a while.
  virtual void pause(uint32_t milliseconds) = 0;

  /// Removes a name, and with the last one the file; those who have it open keep it.
  [[nodiscard]] virtual HostError remove(const char* name) = 0;

  /// Links are followed. A name that isn't there gives an error and the kind Nothing.
  [[nodiscard]] virtual HostError status(const char* name, FileStatus& status) = 0;
  [[nodiscard]] virtual HostError statusOf(FileHandle file, FileStatus& status) = 0;

  /// Whether the file may be written, by the host's access test.
  [[nodiscard]] virtual bool isWritable(const char* name) = 0;

  /// Best effort: the permission bits of `mode`.
  virtual void setPermissions(FileHandle file, uint32_t mode) = 0;

  /// Best effort: makes a file as protected as the one of that name with that status: permission
  /// bits, and where the host has them owner, group, access lists, and attributes that users set.
  /// A file that comes to belong to somebody else never runs with the rights of its owner.
  virtual void copyProtection(const char* from, const FileStatus& status, FileHandle file);

  /// Best effort: when the file was last changed and used, in seconds since 1970. What is written
  /// later may change it again.
  virtual void setTimes(FileHandle file, int64_t seconds) = 0;

  /// Stores the name that a chain of symbolic links leads to, also when nothing is there. That of a
  /// name that is no link, or of a circle, or where the host can't tell, is the name itself.
  [[nodiscard]] virtual HostError resolveLinks(const char* name, std::string& place) = 0;

  /// The same where it does no harm if the host can't tell.
  [[nodiscard]] std::string followLinks(const char* name);

  /// All names of a directory but "." and "..", in the host's order.
  [[nodiscard]] virtual HostError listDirectory(const char* name,
                                                std::vector<std::string>& names) = 0;

  /// The names in a directory that match a leaf with "?" and "*", by the host's rules and in the
  /// order that it gives them. As it stands here: letter case counts, and the order is that of the
  /// bytes, so that the same files give the same list whatever order the directory has. `directory`
  /// ends with a separator; empty is the current one.
  [[nodiscard]] virtual HostError findNames(std::string_view directory, std::string_view leaf,
                                            std::vector<std::string>& names);
};

/// The host that the process runs on.
[[nodiscard]] Host& getNativeHost();

/// From now on what ends the process against its will (on POSIX all signals that do and can be
/// caught, its own faults among them; on Windows Ctrl-C, Ctrl-Break, the closing of the console and
/// the end of the session) removes the unfinished files of getNativeHost() first, and a file size
/// limit shows as a failed write instead of a signal.
void installSignalCleanUp();

} // namespace support
