// SPDX-License-Identifier: Apache-2.0
//
// A host whose files are a map in memory. Tests look at every byte of it, give it a disk that fills
// up, and make it tell of files that no real disk should have to hold.
//
// Inodes count up, so a file put in another's place is another file even with the same bytes; times
// and sizes can be told wrongly, as they are when somebody else is at work.

#pragma once

#include "support/interface/host.h"

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace testsupport {

class MemoryHost final : public support::Host {
public:
  struct File {
    support::FileKind kind = support::FileKind::RegularFile;
    std::string bytes;
    std::string link; // where a symbolic link leads; empty for what is no link
    int64_t modificationTime = 1'000'000'000;
    uint32_t modificationNanoseconds = 0;
    int64_t uid = 1;
    int64_t gid = 2;
    uint32_t mode = 0100644;
    bool isReadOnly = false;
    bool isUnreadable = false;
    bool isOnDisk = false;           // a power failure would leave it
    std::optional<int64_t> toldSize; // what `status` says instead of the size
    uint64_t inode = 0;
  };

  // Puts a regular file in place, as it would be if somebody else had written it.
  File& addFile(std::string_view name, std::string_view bytes);
  File& addFile(std::string_view name, std::span<const uint8_t> bytes) {
    return addFile(name,
                   std::string_view(reinterpret_cast<const char*>(bytes.data()), bytes.size()));
  }
  File& addDirectory(std::string_view name);
  File& addSpecial(std::string_view name);
  File& addLink(std::string_view name, std::string_view target);

  [[nodiscard]] bool has(std::string_view name) const;
  // The file must be there.
  [[nodiscard]] File& at(std::string_view name) const;
  [[nodiscard]] std::string read(std::string_view name) const { return at(name).bytes; }
  // All names, sorted.
  [[nodiscard]] std::vector<std::string> getNames() const;

  // From now on the disk takes so many bytes and then fails with ENOSPC. What fits is written.
  void setRoom(uint64_t bytes) { m_Room = bytes; }
  void setEndlessRoom() { m_Room.reset(); }

  // What a call for a lock answers from now on, in place of 0; what somebody else does while one
  // waits for it can be done here, too.
  void setLocks(std::function<support::HostError()> answer) { m_LockAnswer = std::move(answer); }

  // Names are read by the rules of another host from now on.
  void setPathStyle(support::PathStyle style) { m_PathStyle = style; }

  // From now on a file that is open can't be replaced, as on some disks of Windows; what somebody
  // else does while one waits for it can be done here.
  void keepOpenFiles(std::function<void()> whileWaiting = [] {}) {
    m_WhileWaiting = std::move(whileWaiting);
  }
  // The next calls that remove a file find somebody else at it.
  void keepRemovedFiles(uint32_t calls) { m_BusyRemovals = calls; }
  // From now on temporaries have no name until they are given one.
  void hideTemporaries() { m_HidesTemporaries = true; }
  // No name that is longer is taken from now on; there are no folders in it.
  void setLongestName(size_t bytes) { m_LongestName = bytes; }
  // In milliseconds, of all pauses together.
  [[nodiscard]] uint32_t getTimePaused() const { return m_TimePaused; }

  // Handles that were opened and not closed.
  [[nodiscard]] size_t openHandles() const;
  // So many bytes have been asked for by readAt, and so many calls were made to it.
  [[nodiscard]] uint64_t getBytesRead() const { return m_BytesRead; }
  [[nodiscard]] uint64_t readCalls() const { return m_ReadCalls; }

  support::PathStyle getPathStyle() const override { return m_PathStyle; }
  support::HostError openForReading(const char* name, support::FileHandle& file) override;
  support::HostError openForUpdate(const char* name, support::FileHandle& file) override;
  support::HostError openSequential(const char* name, support::FileHandle& file) override;
  support::HostError readNext(support::FileHandle file, std::span<uint8_t> bytes,
                              size_t& done) override;
  support::HostError lock(support::FileHandle file) override;
  support::HostError createTemporary(const char* name, uint32_t mode,
                                     support::TemporaryFile& file) override;
  support::HostError giveName(support::TemporaryFile& file, const char* name) override;
  support::HostError createUnnamedTemporary(std::string& name, support::FileHandle& file) override;
  support::HostError openForWriting(const char* name, support::FileHandle& file) override;
  support::HostError createForWriting(const char* name, support::FileHandle& file) override;
  support::HostError readAt(support::FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                            size_t& done) override;
  support::HostError write(support::FileHandle file, std::span<const uint8_t> bytes) override;
  support::HostError flush(support::FileHandle file) override;
  support::HostError flushToDisk(support::FileHandle file) override;
  support::HostError close(support::FileHandle file) override;
  support::HostError rename(const char* from, const char* to) override;
  support::HostError renameNew(const char* from, const char* to) override;
  bool keepsLocks() const override { return !m_WhileWaiting; }
  void pause(uint32_t milliseconds) override;
  support::HostError remove(const char* name) override;
  support::HostError status(const char* name, support::FileStatus& status) override;
  support::HostError statusOf(support::FileHandle file, support::FileStatus& status) override;
  bool isWritable(const char* name) override;
  void setPermissions(support::FileHandle file, uint32_t mode) override;
  void copyProtection(const char* from, const support::FileStatus& status,
                      support::FileHandle file) override;
  void setTimes(support::FileHandle file, int64_t seconds) override;
  support::HostError resolveLinks(const char* name, std::string& place) override;
  support::HostError listDirectory(const char* name, std::vector<std::string>& names) override;

private:
  std::shared_ptr<File> find(const std::string& name) const;
  File& enter(std::string_view name, support::FileKind kind);
  void open(std::shared_ptr<File> target, support::FileHandle& file);
  static support::FileStatus statusFrom(const File& file);

  // A file that is replaced or removed lives on for those who have it open.
  std::map<std::string, std::shared_ptr<File>, std::less<>> m_Files;
  std::vector<std::shared_ptr<File>> m_Open; // by handle number; null when closed
  std::map<int, uint64_t> m_Positions;       // of readNext, by handle number
  std::optional<uint64_t> m_Room;
  std::function<support::HostError()> m_LockAnswer;
  std::function<void()> m_WhileWaiting; // empty: open files can be replaced
  support::PathStyle m_PathStyle = support::PathStyle_Posix;
  uint32_t m_TimePaused = 0;
  uint32_t m_BusyRemovals = 0;
  bool m_HidesTemporaries = false;
  size_t m_LongestName = SIZE_MAX;
  uint64_t m_NextInode = 1;
  uint64_t m_NextTemporary = 0;
  uint64_t m_BytesRead = 0;
  uint64_t m_ReadCalls = 0;
};

} // namespace testsupport
