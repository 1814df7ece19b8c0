// SPDX-License-Identifier: Apache-2.0
//
// Files that bytes are read from, each opened once.
//
// A name leads to another file from one moment to the next: whoever reads some bytes of a file now
// and others later must not go by its name a second time. So a run reads each file through the one
// opening that it began with. Only so many files are open at a time; a file that had to be closed
// in between is opened by its name again, and then it must be the same file, of the same size and
// time, or its bytes are no longer to be had: the read fails with ESTALE. Small files may be read
// at once and kept, so that none of that is needed for them.
#pragma once

#include "support/interface/host.h"

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <memory>
#include <span>
#include <string>

namespace support {

class SourceFile;

/// What a file that is closed and opened again must still be: the same file, as long as before, and
/// not written to since.
[[nodiscard]] bool isUnchanged(const FileStatus& before, const FileStatus& now);

/// The files that one run has open. They share the bound, also with those that outlive this object.
class SourceFiles {
public:
  /// Enough for the files that a run turns between, and few enough to leave the process room.
  static constexpr size_t DefaultBound = 64;

  /// The host must outlive this object and all files that it has opened.
  explicit SourceFiles(Host& host, size_t bound = DefaultBound);

  /// The host that all its files are opened on.
  [[nodiscard]] Host& getHost() const;

  /// Opens a file for reading. The host's error number, or 0.
  [[nodiscard]] HostError open(const char* name, std::shared_ptr<SourceFile>& file);

  /// The same for a file that is going to be read several times, as a whole: a small one is read
  /// now and closed, as long as there is room for its bytes.
  [[nodiscard]] HostError openToKeep(const char* name, std::shared_ptr<SourceFile>& file);

  /// In bytes: what is small, and how much is kept of all files together unless it is set.
  static constexpr uint64_t LargestKept = 0x10000;
  static constexpr uint64_t DefaultMostKept = 0x1000000;
  void setMostKept(uint64_t bytes);

  /// Opens a file so that it can be locked, and keeps it open whatever the bound.
  [[nodiscard]] HostError openForUpdate(const char* name, std::shared_ptr<SourceFile>& file);

  /// A file that is not opened before somebody wants its bytes; `status` is what it must be then.
  [[nodiscard]] std::shared_ptr<SourceFile> remember(const char* name, const FileStatus& status);

  /// Calls `open`, which opens a file that is none of these; where the process or the machine
  /// allows no more of them, some of these are closed to make room. The host's error number, or 0.
  [[nodiscard]] HostError openOther(const std::function<HostError()>& open);

  /// Closes all of them but those that are kept open. Who reads on opens his again.
  void closeAll();

  /// The first failure of a close that nobody has heard of yet: its error number, or 0, and the
  /// name of the file. Reading went well all the same.
  [[nodiscard]] HostError takeCloseError(std::string& name);

private:
  friend class SourceFile;
  struct Shared;

  std::shared_ptr<Shared> m_Shared;
};

/// One of them. It is closed when nobody holds it any more.
class SourceFile : public std::enable_shared_from_this<SourceFile> {
public:
  /// Closes the file; a close that fails is told by SourceFiles::takeCloseError.
  ~SourceFile();
  SourceFile(const SourceFile&) = delete;
  SourceFile& operator=(const SourceFile&) = delete;

  [[nodiscard]] const char* getName() const { return m_Name.c_str(); }
  /// What the host told of the file when it was opened.
  [[nodiscard]] const FileStatus& getStatus() const { return m_Status; }
  [[nodiscard]] Host& getHost() const;

  /// As Host::readAt. ESTALE if the file had to be opened again and is another one now.
  [[nodiscard]] HostError readAt(std::span<uint8_t> bytes, uint64_t offset, size_t& done);

  /// All bytes, if they are kept: as long as this object lives, whatever becomes of the file. Null
  /// data if they are not.
  [[nodiscard]] std::span<const uint8_t> getKept() const { return {m_Kept.get(), m_KeptSize}; }
  [[nodiscard]] bool isKept() const { return m_Kept != nullptr; }

  /// 0 if the file still is as long and as old as when it was opened. ESTALE if it was written to
  /// meanwhile: what was read of it may be old in one place and new in another.
  [[nodiscard]] HostError checkUnchanged();

  /// Waits until nobody else has locked the file; only for one that was opened for update and not
  /// read yet: what others have written to it while one waited is no change. The host's error
  /// number where there are no locks.
  [[nodiscard]] HostError lock();

  /// Lets go of the file, and so of its lock. Who reads on opens it again.
  void close();

  /// The open file, which is the caller's to close from now on; only directly behind the opening.
  [[nodiscard]] FileHandle giveHandle();

private:
  friend class SourceFiles;

  SourceFile(std::shared_ptr<SourceFiles::Shared> shared, const char* name)
      : m_Shared(std::move(shared)), m_Name(name) {}

  [[nodiscard]] HostError openFirst(bool isForUpdate);
  [[nodiscard]] HostError openAgain();
  void keepIfSmall();

  std::shared_ptr<SourceFiles::Shared> m_Shared;
  std::string m_Name;
  FileStatus m_Status;
  FileHandle m_Handle;
  bool m_IsKeptOpen = false;
  std::unique_ptr<uint8_t[]> m_Kept;
  size_t m_KeptSize = 0;
};

} // namespace support
