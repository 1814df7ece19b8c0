// SPDX-License-Identifier: Apache-2.0
//
// The Windows host. Files are opened so that others may read, write, replace and remove them
// meanwhile: who has one open keeps it as it is, as on POSIX. What differs:
//
// - A file can be replaced while it is open only where the file system can do that (NTFS from
//   Windows 10 on, but not over a network); elsewhere the answer is EBUSY. What a file system says
//   of itself is not asked: a share tells of the abilities of the disk behind it.
// - A lock keeps others from reading the range that it covers. It is taken far behind the end of
//   any file, so that it says "I write" to those who ask for it, and nothing to anybody else.
// - A handler of Ctrl-C and the like runs in a thread of its own. The table of temporaries is
//   therefore changed together with the disk, under a lock that the handler never gives back.

#include "support/interface/host.h"

#include "support/src/windows_host.h"
#include "support/src/windows_links.h"
#include "support/src/windows_names.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <memory>
#include <utility>
#include <windows.h>

namespace support {

// No number of the C library's of this host is as large.
const HostError FileHasChanged = 10070;

namespace {

constexpr DWORD ShareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
constexpr DWORD LargestPiece = 0x40000000; // bytes that one call reads or writes
constexpr uint32_t WritableMode = 0100666;
constexpr uint32_t ReadOnlyMode = 0100444;
constexpr uint32_t DirectoryMode = 040777;
constexpr uint32_t SpecialMode = 020666;
constexpr uint32_t WriteBits = 0222;

// As on POSIX: one archive is written at a time, and its members rarely have temporaries of their
// own; what finds no room here is simply not removed.
constexpr size_t MaximumTemporaries = 16;

struct Temporaries {
  SRWLOCK lock = SRWLOCK_INIT;
  std::array<std::wstring, MaximumTemporaries> names; // empty: not used
};

// Never destroyed: the handler may run while the process ends.
Temporaries& temporaries() {
  static Temporaries& all = *new Temporaries;
  return all;
}

// Keeps the handler away while the table and the disk disagree.
class TableHold {
public:
  TableHold() { AcquireSRWLockExclusive(&temporaries().lock); }
  ~TableHold() { ReleaseSRWLockExclusive(&temporaries().lock); }
  TableHold(const TableHold&) = delete;
  TableHold& operator=(const TableHold&) = delete;

  // Takes the name as it is: behind a lock and a file that is made, memory must not run out.
  void enter(std::wstring name) { replace({}, std::move(name)); }
  void forget(const std::wstring& name) { replace(name, {}); }
  static void removeAll() {
    for (std::wstring& name : temporaries().names) {
      if (!name.empty()) DeleteFileW(name.c_str());
      name.clear();
    }
  }

private:
  static void replace(const std::wstring& before, std::wstring after) {
    auto& names = temporaries().names;
    const auto slot = std::find(names.begin(), names.end(), before);
    if (slot != names.end()) *slot = std::move(after);
  }
};

// The default handler, which comes next, ends the process.
BOOL WINAPI removeTemporaries(DWORD) {
  AcquireSRWLockExclusive(&temporaries().lock);
  TableHold::removeAll();
  return FALSE;
}

bool isCleanUpInstalled = false;

// 64-bit Windows gives handles of which 32 bits count, so that programs of 32 bits can share them.
HANDLE handleOf(FileHandle file) {
  return reinterpret_cast<HANDLE>(static_cast<intptr_t>(file.number));
}

HostError numberOf(HANDLE handle, FileHandle& file) {
  file.number =
      handle == INVALID_HANDLE_VALUE ? -1 : static_cast<int>(reinterpret_cast<intptr_t>(handle));
  return file.isOpen() ? 0 : lastHostError();
}

bool isDirectory(HANDLE handle) {
  BY_HANDLE_FILE_INFORMATION info;
  return GetFileInformationByHandle(handle, &info) != 0 &&
         (info.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0;
}

bool hasAttribute(const std::wstring& name, DWORD attribute) {
  const DWORD attributes = GetFileAttributesW(name.c_str());
  return attributes != INVALID_FILE_ATTRIBUTES && (attributes & attribute) != 0;
}

// Whether a part in front of the leaf is there, and no directory.
bool isBelowFile(std::wstring name) {
  for (;;) {
    const size_t separator = name.find_last_of(L"\\/");
    if (separator == std::wstring::npos || separator == 0) return false;
    name.resize(separator);
    const DWORD attributes = GetFileAttributesW(name.c_str());
    if (attributes != INVALID_FILE_ATTRIBUTES) return (attributes & FILE_ATTRIBUTE_DIRECTORY) == 0;
  }
}

// A call that no directory takes says "access denied" of one, as of much else; and "not found" is
// said also of a name that goes on behind a file's.
HostError errorOf(HostError error, const std::wstring& name) {
  if (error == EACCES && hasAttribute(name, FILE_ATTRIBUTE_DIRECTORY)) return EISDIR;
  return error == ENOENT && isBelowFile(name) ? ENOTDIR : error;
}

HostError openNative(const std::wstring& name, DWORD access, DWORD disposition, FileHandle& file,
                     DWORD flags = 0) {
  const HANDLE handle = CreateFileW(name.c_str(), access, ShareAll, nullptr, disposition,
                                    FILE_ATTRIBUTE_NORMAL | flags, nullptr);
  const HostError error = numberOf(handle, file);
  return error == 0 ? 0 : errorOf(error, name);
}

// Directories open, too, and fail when they are read.
HostError openExisting(const char* name, DWORD access, FileHandle& file) {
  std::wstring native;
  file = {};
  if (const HostError error = nativeName(name, native); error != 0) return error;
  return openNative(native, access, OPEN_EXISTING, file, FILE_FLAG_BACKUP_SEMANTICS);
}

constexpr int64_t TicksOfSecond = 10'000'000;
constexpr int64_t SecondsBefore1970 = 11'644'473'600; // since 1601

int64_t joined(DWORD high, DWORD low) {
  return static_cast<int64_t>(uint64_t{high} << 32 | low);
}

// 0 is how a file system says that it knows no time.
void setTime(FileStatus& status, const FILETIME& time) {
  const int64_t ticks = joined(time.dwHighDateTime, time.dwLowDateTime);
  if (ticks == 0) return;
  status.modificationTime = ticks / TicksOfSecond - SecondsBefore1970;
  status.modificationNanoseconds = static_cast<uint32_t>(ticks % TicksOfSecond * 100);
}

FileStatus statusFrom(const BY_HANDLE_FILE_INFORMATION& info) {
  const bool isDirectory = (info.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0;
  const bool isReadOnly = (info.dwFileAttributes & FILE_ATTRIBUTE_READONLY) != 0;
  FileStatus status;
  status.kind = isDirectory ? FileKind::Directory : FileKind::RegularFile;
  status.size = joined(info.nFileSizeHigh, info.nFileSizeLow);
  status.mode = isDirectory ? DirectoryMode : isReadOnly ? ReadOnlyMode : WritableMode;
  status.device = info.dwVolumeSerialNumber;
  status.inode = static_cast<uint64_t>(joined(info.nFileIndexHigh, info.nFileIndexLow));
  setTime(status, info.ftLastWriteTime);
  return status;
}

// Some shares number no file, and say 0 or the largest number of each: there the whole path, with
// links followed and in the letters of the disk, has to stand for the file.
void setIdentityFromPath(FileStatus& status, HANDLE handle) {
  if (status.inode != 0 && status.inode != UINT64_MAX) return;
  std::wstring path(GetFinalPathNameByHandleW(handle, nullptr, 0, 0), L'\0'); // with the NUL
  if (GetFinalPathNameByHandleW(handle, path.data(), static_cast<DWORD>(path.size()), 0) == 0)
    return;
  status.inode = std::hash<std::wstring>()(path);
}

// ReFS numbers its files with 128 bits, and has no 64 bits that tell them all apart; elsewhere the
// upper half is 0.
void setIdentity(FileStatus& status, HANDLE handle) {
  FILE_ID_INFO info;
  if (GetFileInformationByHandleEx(handle, FileIdInfo, &info, sizeof info) == 0)
    return setIdentityFromPath(status, handle);
  std::array<uint64_t, 2> halves;
  static_assert(sizeof halves == sizeof info.FileId);
  std::memcpy(halves.data(), &info.FileId, sizeof halves);
  constexpr uint64_t Spread = 0x9E3779B97F4A7C15; // odd: no two upper halves become one
  status.device = info.VolumeSerialNumber;
  status.inode = halves[0] ^ halves[1] * Spread;
  setIdentityFromPath(status, handle);
}

HostError statusOfHandle(HANDLE handle, FileStatus& status) {
  status = FileStatus();
  SetLastError(NO_ERROR);
  const DWORD type = GetFileType(handle);
  if (type == FILE_TYPE_UNKNOWN && GetLastError() != NO_ERROR) return lastHostError();
  if (type != FILE_TYPE_DISK) {
    status.kind = FileKind::Special;
    status.mode = SpecialMode;
    return 0;
  }
  BY_HANDLE_FILE_INFORMATION info;
  if (GetFileInformationByHandle(handle, &info) == 0) return lastHostError();
  status = statusFrom(info);
  setIdentity(status, handle);
  return 0;
}

// FILE_RENAME_INFO as it is since Windows 10, with flags in the place of a truth value.
struct RenameHead {
  DWORD flags;
  HANDLE root;
  DWORD length; // bytes
};
constexpr DWORD RenameReplaces = 1;
constexpr DWORD RenameAsPosix = 2;
constexpr auto RenameInfoEx = static_cast<FILE_INFO_BY_HANDLE_CLASS>(22);

class OwnedHandle {
public:
  explicit OwnedHandle(HANDLE handle) : m_Handle(handle) {}
  ~OwnedHandle() {
    if (isOpen()) CloseHandle(m_Handle);
  }
  OwnedHandle(const OwnedHandle&) = delete;
  OwnedHandle& operator=(const OwnedHandle&) = delete;

  [[nodiscard]] bool isOpen() const { return m_Handle != INVALID_HANDLE_VALUE; }
  [[nodiscard]] HANDLE get() const { return m_Handle; }

private:
  HANDLE m_Handle;
};

// Some calls say "no handle" with another number.
HANDLE orInvalid(HANDLE handle) {
  return handle == nullptr ? INVALID_HANDLE_VALUE : handle;
}

// One step also where somebody has the old file open.
bool renameAsPosix(const std::wstring& from, const std::wstring& to) {
  const OwnedHandle file(CreateFileW(from.c_str(), DELETE | SYNCHRONIZE, ShareAll, nullptr,
                                     OPEN_EXISTING, FILE_FLAG_OPEN_REPARSE_POINT, nullptr));
  if (!file.isOpen()) return false;
  const std::wstring path = wholePath(to);
  constexpr size_t NamePlace = offsetof(RenameHead, length) + sizeof(DWORD);
  const size_t nameSize = path.size() * sizeof(wchar_t);
  // Of the size that the call wants at least, with a NUL behind the name.
  std::vector<std::byte> bytes(std::max(NamePlace + nameSize, sizeof(RenameHead)) +
                               sizeof(wchar_t));
  const RenameHead head = {RenameReplaces | RenameAsPosix, nullptr, static_cast<DWORD>(nameSize)};
  std::memcpy(bytes.data(), &head, NamePlace);
  std::memcpy(bytes.data() + NamePlace, path.data(), nameSize);
  return SetFileInformationByHandle(file.get(), RenameInfoEx, bytes.data(),
                                    static_cast<DWORD>(bytes.size())) != 0;
}

// Whether the right to do so is there; who has the file open may keep it from happening.
bool mayDelete(const std::wstring& name) {
  if (hasAttribute(name, FILE_ATTRIBUTE_READONLY)) return false;
  const OwnedHandle file(CreateFileW(name.c_str(), DELETE, ShareAll, nullptr, OPEN_EXISTING,
                                     FILE_FLAG_OPEN_REPARSE_POINT, nullptr));
  return file.isOpen() || GetLastError() == ERROR_SHARING_VIOLATION;
}

// "Access denied" is also the answer where a file that is open would have to go.
HostError replaceError(const std::wstring& to) {
  const HostError error = errorOf(lastHostError(), to);
  return error == EACCES && mayDelete(to) ? EBUSY : error;
}

HostError replaceNative(const std::wstring& from, const std::wstring& to) {
  if (renameAsPosix(from, to)) return 0;
  if (MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_REPLACE_EXISTING) != 0) return 0;
  return replaceError(to);
}

HostError removeNative(const std::wstring& name) {
  if (DeleteFileW(name.c_str()) != 0) return 0;
  const HostError error = errorOf(lastHostError(), name);
  // A file that may not be written may still be removed, as on POSIX.
  if (error != EACCES || !hasAttribute(name, FILE_ATTRIBUTE_READONLY)) return error;
  SetFileAttributesW(name.c_str(), FILE_ATTRIBUTE_NORMAL);
  return DeleteFileW(name.c_str()) != 0 ? 0 : lastHostError();
}

// Where a link leads: a text without a drive starts from that of the link, and mostly also from its
// folder.
std::string placeOfLink(const std::string& link, const std::string& text) {
  const path from(link, PathStyle_Windows);
  const path to(text, PathStyle_Windows);
  if (!to.getDrive().empty()) return text;
  const bool isFromTheTop = to.getDirectory().starts_with('\\');
  return from.getDrive() + (isFromTheTop ? "" : from.getDirectory()) + text;
}

// What FindFirstFileW finds, but for the folder itself and the one above. A folder in which nothing
// fits is no failure: only the search of the top of a drive ends so with "*", too.
HostError findNative(const std::wstring& pattern, std::vector<std::string>& names) {
  WIN32_FIND_DATAW found;
  const HANDLE search = FindFirstFileW(pattern.c_str(), &found);
  if (search == INVALID_HANDLE_VALUE) {
    const bool isEmpty = GetLastError() == ERROR_FILE_NOT_FOUND;
    const HostError error = errorOf(lastHostError(), pattern);
    return isEmpty && error == ENOENT ? 0 : error;
  }
  const std::unique_ptr<void, decltype(&FindClose)> closer(search, FindClose);
  do {
    std::string leaf = narrow(found.cFileName);
    if (leaf != "." && leaf != "..") names.push_back(std::move(leaf));
  } while (FindNextFileW(search, &found) != 0);
  return GetLastError() == ERROR_NO_MORE_FILES ? 0 : lastHostError();
}

class WindowsHost final : public Host {
public:
  PathStyle getPathStyle() const override { return PathStyle_Windows; }

  HostError openForReading(const char* name, FileHandle& file) override {
    return openExisting(name, GENERIC_READ, file);
  }

  HostError openForUpdate(const char* name, FileHandle& file) override {
    const HostError error = openExisting(name, GENERIC_READ | GENERIC_WRITE, file);
    if (error != 0 || !isDirectory(handleOf(file))) return error;
    CloseHandle(handleOf(file));
    file = {};
    return EISDIR;
  }

  HostError openSequential(const char* name, FileHandle& file) override {
    return openForReading(name, file);
  }

  HostError readNext(FileHandle file, std::span<uint8_t> bytes, size_t& done) override {
    DWORD count = 0;
    const auto size = static_cast<DWORD>(std::min<size_t>(bytes.size(), LargestPiece));
    const bool isRead = ReadFile(handleOf(file), bytes.data(), size, &count, nullptr) != 0;
    done = count;
    // The end of a pipe.
    return isRead || GetLastError() == ERROR_BROKEN_PIPE ? 0 : readError(file);
  }

  HostError lock(FileHandle file) override {
    OVERLAPPED place = {};
    place.Offset = 0;
    place.OffsetHigh = 0x7FFFFFFE;
    return LockFileEx(handleOf(file), LOCKFILE_EXCLUSIVE_LOCK, 0, 1, 0, &place) != 0
               ? 0
               : lastHostError();
  }

  // Who may read a file is a matter of its folder here, not of a mode.
  HostError createTemporary(const char* name, uint32_t, TemporaryFile& file) override {
    file.hasName = true;
    return createNew(name, file.handle);
  }

  HostError createUnnamedTemporary(std::string& name, FileHandle& file) override {
    std::wstring place(GetTempPathW(0, nullptr), L'\0'); // with the NUL
    place.resize(GetTempPathW(static_cast<DWORD>(place.size()), place.data()));
    const std::string beginning =
        narrow(place) + "quarn." + std::to_string(GetCurrentProcessId()) + ".";
    HostError error = EEXIST;
    while (error == EEXIST) {
      name = beginning + std::to_string(m_UnnamedTemporaries++);
      error = createNew(name.c_str(), file);
    }
    return error;
  }

  // Emptied by a second step, as creating anew wants the attributes that the file has.
  HostError openForWriting(const char* name, FileHandle& file) override {
    std::wstring native;
    file = {};
    if (const HostError error = nativeName(name, native); error != 0) return error;
    std::wstring place = nativePlace(name);
    TableHold table;
    if (const HostError error = openNative(native, GENERIC_WRITE, OPEN_ALWAYS, file); error != 0)
      return error;
    if (GetFileType(handleOf(file)) != FILE_TYPE_DISK) return 0;
    if (SetEndOfFile(handleOf(file)) != 0) {
      table.enter(std::move(place));
      return 0;
    }
    const HostError error = lastHostError();
    CloseHandle(handleOf(file));
    file = {};
    return error;
  }

  HostError createForWriting(const char* name, FileHandle& file) override {
    return createNew(name, file);
  }

  HostError endWriting(FileHandle file, const char* name, bool isWhole) override {
    const std::wstring native = nativePlace(name);
    const HostError error = Host::endWriting(file, name, isWhole);
    TableHold().forget(native);
    return error;
  }

  void removeUnfinished() override {
    const TableHold table;
    TableHold::removeAll();
  }

  HostError readAt(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                   size_t& done) override {
    done = 0;
    while (done < bytes.size()) {
      OVERLAPPED place = {};
      place.Offset = static_cast<DWORD>(offset + done);
      place.OffsetHigh = static_cast<DWORD>((offset + done) >> 32);
      DWORD count = 0;
      const auto size = static_cast<DWORD>(std::min<size_t>(bytes.size() - done, LargestPiece));
      if (ReadFile(handleOf(file), bytes.data() + done, size, &count, &place) == 0)
        return GetLastError() == ERROR_HANDLE_EOF ? 0 : readError(file);
      if (count == 0) break;
      done += count;
    }
    return 0;
  }

  HostError write(FileHandle file, std::span<const uint8_t> bytes) override {
    while (!bytes.empty()) {
      DWORD count = 0;
      const auto size = static_cast<DWORD>(std::min<size_t>(bytes.size(), LargestPiece));
      if (WriteFile(handleOf(file), bytes.data(), size, &count, nullptr) == 0)
        return lastHostError();
      // No progress and no reason: going on would never end.
      if (count == 0) return EIO;
      bytes = bytes.subspan(count);
    }
    return 0;
  }

  // Every write has reached the system when it returns: nothing is held back in the process but the
  // time of the last one, which NTFS enters at the close, unless it was told one.
  HostError flush(FileHandle file) override {
    FILETIME now;
    GetSystemTimeAsFileTime(&now);
    SetFileTime(handleOf(file), nullptr, nullptr, &now);
    return 0;
  }

  // A share that knows no such step says that the call is none.
  HostError flushToDisk(FileHandle file) override {
    if (FlushFileBuffers(handleOf(file)) != 0 || GetLastError() == ERROR_INVALID_FUNCTION) return 0;
    return lastHostError();
  }

  HostError close(FileHandle file) override {
    return CloseHandle(handleOf(file)) != 0 ? 0 : lastHostError();
  }

  HostError rename(const char* from, const char* to) override {
    return renameBy(from, to, replaceNative);
  }

  HostError renameNew(const char* from, const char* to) override {
    return renameBy(from, to, [](const std::wstring& source, const std::wstring& target) {
      return MoveFileExW(source.c_str(), target.c_str(), 0) != 0 ? 0 : lastHostError();
    });
  }

  // It depends on the disk, and not every disk tells.
  bool keepsLocks() const override { return false; }

  // A mutex with the name of the file that goes: who has read another one has another.
  HostError replaceAlone(const FileStatus& file, const std::function<HostError()>& step) override {
    const std::wstring name =
        L"Global\\quarn-" + std::to_wstring(file.device) + L"-" + std::to_wstring(file.inode);
    const OwnedHandle mutex(orInvalid(CreateMutexW(nullptr, FALSE, name.c_str())));
    // One that ended without giving it back leaves nothing half done.
    const bool isHeld = mutex.isOpen() && WaitForSingleObject(mutex.get(), INFINITE) != WAIT_FAILED;
    const HostError error = step();
    if (isHeld) ReleaseMutex(mutex.get());
    return error;
  }

  void pause(uint32_t milliseconds) override { Sleep(milliseconds); }

  HostError remove(const char* name) override {
    std::wstring native;
    if (const HostError error = nativeName(name, native); error != 0) return error;
    TableHold table;
    const HostError error = removeNative(native);
    if (error == 0) table.forget(native);
    return error;
  }

  HostError status(const char* name, FileStatus& status) override {
    status = FileStatus();
    std::wstring native;
    if (const HostError error = nativeName(name, native); error != 0) return error;
    const OwnedHandle file(CreateFileW(native.c_str(), FILE_READ_ATTRIBUTES, ShareAll, nullptr,
                                       OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS, nullptr));
    return file.isOpen() ? statusOfHandle(file.get(), status) : errorOf(lastHostError(), native);
  }

  HostError statusOf(FileHandle file, FileStatus& status) override {
    return statusOfHandle(handleOf(file), status);
  }

  // The attribute is asked for by itself, as not all that runs programs for Windows heeds it. Who
  // has the file open in a way that keeps others out says nothing of rights.
  bool isWritable(const char* name) override {
    FileStatus own;
    std::wstring native;
    if (status(name, own) != 0 || (own.mode & WriteBits) == 0 || nativeName(name, native) != 0)
      return false;
    const OwnedHandle file(CreateFileW(native.c_str(), FILE_WRITE_DATA, ShareAll, nullptr,
                                       OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS, nullptr));
    return file.isOpen() || GetLastError() == ERROR_SHARING_VIOLATION;
  }

  void setPermissions(FileHandle file, uint32_t mode) override {
    FILE_BASIC_INFO info = {}; // times of 0 stay as they are
    info.FileAttributes = (mode & WriteBits) == 0 ? FILE_ATTRIBUTE_READONLY : FILE_ATTRIBUTE_NORMAL;
    SetFileInformationByHandle(handleOf(file), FileBasicInfo, &info, sizeof info);
  }

  void setTimes(FileHandle file, int64_t seconds) override {
    if (seconds < -SecondsBefore1970 || seconds > INT64_MAX / TicksOfSecond - SecondsBefore1970)
      return;
    const auto ticks = static_cast<uint64_t>((seconds + SecondsBefore1970) * TicksOfSecond);
    const FILETIME time = {static_cast<DWORD>(ticks), static_cast<DWORD>(ticks >> 32)};
    SetFileTime(handleOf(file), nullptr, &time, &time);
  }

  HostError resolveLinks(const char* name, std::string& place) override {
    constexpr int MaximumLinks = 63; // as the system: a longer chain is a circle
    std::string end = name;
    place = name;
    for (int i = 0; i < MaximumLinks; ++i) {
      std::wstring native;
      std::wstring text;
      if (nativeName(end, native) == 0 && hasAttribute(native, FILE_ATTRIBUTE_REPARSE_POINT))
        text = readLink(native);
      if (text.empty()) {
        place = end;
        return 0;
      }
      end = placeOfLink(end, narrow(text));
    }
    return 0;
  }

  HostError listDirectory(const char* name, std::vector<std::string>& names) override {
    return findNames(name, "*", names);
  }

  HostError findNames(std::string_view directory, std::string_view leaf,
                      std::vector<std::string>& names) override {
    names.clear();
    std::wstring native;
    std::wstring pattern;
    if (!widen(leaf, pattern)) return EILSEQ;
    const std::string_view place = directory.empty() ? "." : directory;
    if (const HostError error = nativeName(place, native, pattern.size() + 1); error != 0)
      return error;
    // A drive alone is the folder that one is in on that drive.
    if (isDriveName(directory)) native = wholePath(native);
    if (native.back() != L'\\' && native.back() != L'/') native += L'\\';
    return findNative(native + pattern, names);
  }

private:
  // Where links lead; empty for a name that no file has.
  std::wstring nativePlace(const char* name) {
    std::wstring native;
    if (nativeName(followLinks(name), native) != 0) native.clear();
    return native;
  }

  static HostError createNew(const char* name, FileHandle& file) {
    std::wstring native;
    file = {};
    if (const HostError error = nativeName(name, native); error != 0) return error;
    TableHold table;
    // A link that leads nowhere would be followed, and the file made where it leads.
    const HostError error = openNative(native, GENERIC_READ | GENERIC_WRITE, CREATE_NEW, file,
                                       FILE_FLAG_OPEN_REPARSE_POINT);
    if (error == 0) table.enter(std::move(native));
    // A folder in the place is said to deny access.
    return error == EISDIR ? EEXIST : error;
  }

  // A directory says "invalid function".
  static HostError readError(FileHandle file) {
    const HostError error = lastHostError();
    return isDirectory(handleOf(file)) ? EISDIR : error;
  }

  template <class Rename>
  static HostError renameBy(const char* from, const char* to, const Rename& rename) {
    std::wstring source;
    std::wstring target;
    if (const HostError error = nativeName(from, source); error != 0) return error;
    if (const HostError error = nativeName(to, target); error != 0) return error;
    TableHold table;
    const HostError error = rename(source, target);
    if (error == 0) table.forget(source);
    return error;
  }

  uint64_t m_UnnamedTemporaries = 0; // of this process, so far
};

struct ErrorText {
  HostError error;
  const char* text;
};

// Where the C library of this host has other words than those of POSIX systems.
constexpr ErrorText ErrorTexts[] = {
    {ENOMEM, "Cannot allocate memory"},
    {EBUSY, "Device or resource busy"},
    {EXDEV, "Invalid cross-device link"},
    {EINVAL, "Invalid argument"},
    {EFBIG, "File too large"},
    {EROFS, "Read-only file system"},
    {ENAMETOOLONG, "File name too long"},
    {ENOSYS, "Function not implemented"},
    {EOVERFLOW, "Value too large for defined data type"},
    {ELOOP, "Too many levels of symbolic links"},
    {EILSEQ, "Invalid or incomplete multibyte or wide character"},
    {FileHasChanged, "Stale file handle"},
};

} // namespace

std::string hostErrorText(HostError error) {
  const auto* row = std::find_if(std::begin(ErrorTexts), std::end(ErrorTexts),
                                 [error](const ErrorText& r) { return r.error == error; });
  if (row != std::end(ErrorTexts)) return row->text;
  const std::string text = std::strerror(error);
  return text == "Unknown error" ? text + " " + std::to_string(error) : text;
}

void endWithoutReader() {
  if (!isCleanUpInstalled) return;
  removeTemporaries(CTRL_CLOSE_EVENT);
  TerminateProcess(GetCurrentProcess(), EXIT_FAILURE);
}

Host& getNativeHost() {
  static WindowsHost host;
  return host;
}

void installSignalCleanUp() {
  // No box that nobody can answer where a disk is not in its drive.
  SetErrorMode(SEM_FAILCRITICALERRORS | SEM_NOGPFAULTERRORBOX | SEM_NOOPENFILEERRORBOX);
  isCleanUpInstalled = SetConsoleCtrlHandler(removeTemporaries, TRUE) != 0;
}

} // namespace support
