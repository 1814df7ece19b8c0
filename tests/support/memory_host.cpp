// SPDX-License-Identifier: Apache-2.0
//
// Files are shared by the map and by whoever has them open, so that a file that is replaced or
// removed lives on for its readers, as on a real disk. A name is any text; folders are known by
// what names begin with, and are listed backwards, so that a caller who relies on the host's order
// is found out.

#include "tests/support/memory_host.h"

#include <algorithm>
#include <cerrno>
#include <cstring>

namespace testsupport {

using support::FileHandle;
using support::FileKind;
using support::FileStatus;
using support::HostError;
using support::TemporaryFile;

MemoryHost::File& MemoryHost::enter(std::string_view name, FileKind kind) {
  auto& slot = m_Files[std::string(name)];
  slot = std::make_shared<File>();
  slot->kind = kind;
  slot->inode = m_NextInode++;
  return *slot;
}

MemoryHost::File& MemoryHost::addFile(std::string_view name, std::string_view bytes) {
  File& file = enter(name, FileKind::RegularFile);
  file.bytes = bytes;
  return file;
}

MemoryHost::File& MemoryHost::addDirectory(std::string_view name) {
  File& file = enter(name, FileKind::Directory);
  file.mode = 040755;
  return file;
}

MemoryHost::File& MemoryHost::addSpecial(std::string_view name) {
  File& file = enter(name, FileKind::Special);
  file.mode = 010644;
  return file;
}

MemoryHost::File& MemoryHost::addLink(std::string_view name, std::string_view target) {
  File& file = enter(name, FileKind::RegularFile);
  file.link = target;
  return file;
}

bool MemoryHost::has(std::string_view name) const {
  return m_Files.find(name) != m_Files.end();
}

MemoryHost::File& MemoryHost::at(std::string_view name) const {
  return *m_Files.find(name)->second;
}

std::vector<std::string> MemoryHost::getNames() const {
  std::vector<std::string> all;
  for (const auto& entry : m_Files)
    all.push_back(entry.first);
  return all;
}

size_t MemoryHost::openHandles() const {
  return static_cast<size_t>(std::count_if(m_Open.begin(), m_Open.end(),
                                           [](const auto& file) { return file != nullptr; }));
}

std::shared_ptr<MemoryHost::File> MemoryHost::find(const std::string& name) const {
  const auto found = m_Files.find(name);
  if (found == m_Files.end()) return nullptr;
  return found->second->link.empty() ? found->second : find(found->second->link);
}

void MemoryHost::open(std::shared_ptr<File> target, FileHandle& file) {
  file.number = static_cast<int>(m_Open.size());
  m_Open.push_back(std::move(target));
}

HostError MemoryHost::openForReading(const char* name, FileHandle& file) {
  const std::shared_ptr<File> target = find(name);
  if (!target) return ENOENT;
  if (target->isUnreadable) return EACCES;
  open(target, file);
  return 0;
}

HostError MemoryHost::openForUpdate(const char* name, FileHandle& file) {
  const std::shared_ptr<File> target = find(name);
  if (target && target->isReadOnly) return EACCES;
  return openForReading(name, file);
}

HostError MemoryHost::openSequential(const char* name, FileHandle& file) {
  return openForReading(name, file);
}

HostError MemoryHost::readNext(FileHandle file, std::span<uint8_t> bytes, size_t& done) {
  uint64_t& position = m_Positions[file.number];
  const HostError error = readAt(file, bytes, position, done);
  position += done;
  return error;
}

HostError MemoryHost::lock(FileHandle) {
  return m_LockAnswer ? m_LockAnswer() : 0;
}

HostError MemoryHost::createTemporary(const char* name, uint32_t mode, TemporaryFile& file) {
  constexpr uint32_t UsersMask = 022;
  if (std::strlen(name) > m_LongestName) return ENAMETOOLONG;
  if (has(name)) return EEXIST;
  enter(name, FileKind::RegularFile).mode = 0100000 | (mode & ~UsersMask);
  open(find(name), file.handle);
  file.hasName = !m_HidesTemporaries;
  if (m_HidesTemporaries) m_Files.erase(name);
  return 0;
}

HostError MemoryHost::giveName(TemporaryFile& file, const char* name) {
  if (file.hasName) return 0;
  if (std::strlen(name) > m_LongestName) return ENAMETOOLONG;
  if (has(name)) return EEXIST;
  m_Files[name] = m_Open.at(static_cast<size_t>(file.handle.number));
  file.hasName = true;
  return 0;
}

HostError MemoryHost::createUnnamedTemporary(std::string& name, FileHandle& file) {
  name = "/tmp/quarn." + std::to_string(m_NextTemporary++);
  enter(name, FileKind::RegularFile);
  open(find(name), file);
  return 0;
}

HostError MemoryHost::openForWriting(const char* name, FileHandle& file) {
  const std::string place = followLinks(name);
  if (place.empty()) return ENOENT;
  std::shared_ptr<File> target = find(place);
  if (target && target->kind == FileKind::Directory) return EISDIR;
  if (target && target->isReadOnly) return EACCES;
  if (!target) enter(place, FileKind::RegularFile);
  target = find(place);
  target->bytes.clear();
  open(target, file);
  return 0;
}

HostError MemoryHost::createForWriting(const char* name, FileHandle& file) {
  if (has(name) || followLinks(name) != name) return EEXIST;
  return openForWriting(name, file);
}

HostError MemoryHost::readAt(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                             size_t& done) {
  done = 0;
  const File& source = *m_Open.at(static_cast<size_t>(file.number));
  if (source.kind == FileKind::Directory) return EISDIR;
  ++m_ReadCalls;
  m_BytesRead += bytes.size();
  if (offset >= source.bytes.size()) return 0;
  done = std::min(bytes.size(), source.bytes.size() - static_cast<size_t>(offset));
  if (done != 0) std::memcpy(bytes.data(), source.bytes.data() + offset, done);
  return 0;
}

HostError MemoryHost::write(FileHandle file, std::span<const uint8_t> bytes) {
  File& target = *m_Open.at(static_cast<size_t>(file.number));
  // What fits is written, as a disk does that fills up in the middle of a write.
  const uint64_t fitting = std::min<uint64_t>(bytes.size(), m_Room.value_or(bytes.size()));
  target.isOnDisk = false;
  target.bytes.append(reinterpret_cast<const char*>(bytes.data()), static_cast<size_t>(fitting));
  if (m_Room) *m_Room -= fitting;
  return fitting == bytes.size() ? 0 : ENOSPC;
}

HostError MemoryHost::flush(FileHandle) {
  return 0;
}

HostError MemoryHost::flushToDisk(FileHandle file) {
  m_Open.at(static_cast<size_t>(file.number))->isOnDisk = true;
  return 0;
}

HostError MemoryHost::close(FileHandle file) {
  std::shared_ptr<File>& slot = m_Open.at(static_cast<size_t>(file.number));
  if (!slot) return EBADF;
  slot = nullptr;
  return 0;
}

HostError MemoryHost::rename(const char* from, const char* to) {
  const auto source = m_Files.find(std::string_view(from));
  if (source == m_Files.end()) return ENOENT;
  const auto target = m_Files.find(std::string_view(to));
  if (target != m_Files.end() && target->second->kind == FileKind::Directory) return EISDIR;
  if (m_WhileWaiting && target != m_Files.end() &&
      std::find(m_Open.begin(), m_Open.end(), target->second) != m_Open.end())
    return EBUSY;
  m_Files[to] = source->second;
  m_Files.erase(from);
  return 0;
}

HostError MemoryHost::renameNew(const char* from, const char* to) {
  return has(to) ? EEXIST : rename(from, to);
}

void MemoryHost::pause(uint32_t milliseconds) {
  m_TimePaused += milliseconds;
  if (m_WhileWaiting) m_WhileWaiting();
}

HostError MemoryHost::remove(const char* name) {
  const auto target = m_Files.find(std::string_view(name));
  if (target == m_Files.end()) return ENOENT;
  if (target->second->kind == FileKind::Directory) return EISDIR;
  if (m_BusyRemovals > 0) {
    --m_BusyRemovals;
    return EBUSY;
  }
  m_Files.erase(target);
  return 0;
}

FileStatus MemoryHost::statusFrom(const File& file) {
  FileStatus status;
  status.kind = file.kind;
  status.size = file.toldSize.value_or(static_cast<int64_t>(file.bytes.size()));
  status.modificationTime = file.modificationTime;
  status.modificationNanoseconds = file.modificationNanoseconds;
  status.uid = file.uid;
  status.gid = file.gid;
  status.mode = file.mode;
  status.device = 1;
  status.inode = file.inode;
  return status;
}

HostError MemoryHost::status(const char* name, FileStatus& status) {
  status = FileStatus();
  const std::shared_ptr<File> file = find(name);
  if (!file) return ENOENT;
  status = statusFrom(*file);
  return 0;
}

HostError MemoryHost::statusOf(FileHandle file, FileStatus& status) {
  status = statusFrom(*m_Open.at(static_cast<size_t>(file.number)));
  return 0;
}

bool MemoryHost::isWritable(const char* name) {
  const std::shared_ptr<File> file = find(name);
  return file != nullptr && !file->isReadOnly;
}

void MemoryHost::copyProtection(const char* from, const FileStatus& status, FileHandle file) {
  File& target = *m_Open.at(static_cast<size_t>(file.number));
  Host::copyProtection(from, status, file);
  target.uid = status.uid;
  target.gid = status.gid;
}

void MemoryHost::setPermissions(FileHandle file, uint32_t mode) {
  File& target = *m_Open.at(static_cast<size_t>(file.number));
  target.mode = (target.mode & ~07777u) | (mode & 07777u);
}

void MemoryHost::setTimes(FileHandle file, int64_t seconds) {
  m_Open.at(static_cast<size_t>(file.number))->modificationTime = seconds;
}

HostError MemoryHost::resolveLinks(const char* name, std::string& place) {
  place = name;
  for (auto found = m_Files.find(place); found != m_Files.end() && !found->second->link.empty();
       found = m_Files.find(place)) {
    place = found->second->link;
  }
  return 0;
}

HostError MemoryHost::listDirectory(const char* name, std::vector<std::string>& names) {
  names.clear();
  std::string prefix = name;
  if (prefix == "./") prefix.clear();
  for (const auto& entry : m_Files) {
    if (!entry.first.starts_with(prefix)) continue;
    const std::string leaf = entry.first.substr(prefix.size());
    if (leaf.find('/') == leaf.npos) names.insert(names.begin(), leaf); // not in order
  }
  return 0;
}

} // namespace testsupport
