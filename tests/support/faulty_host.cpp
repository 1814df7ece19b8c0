// SPDX-License-Identifier: Apache-2.0
//
// Every operation counts itself, and asks whether it is the one. What fails has done a part of its
// work where a real one may have: half of the bytes of a read or a write, and a close that has
// closed all the same. So a caller that believes the first half, or closes twice, is found out.

#include "tests/support/faulty_host.h"

#include <algorithm>
#include <csignal>
#include <cstddef>

namespace testsupport {

using support::FileHandle;
using support::FileStatus;
using support::HostError;
using support::TemporaryFile;

HostError FaultyHost::fault(const char* operation, const std::string& name) {
  if (++m_Calls != m_FailingCall) return 0;
  m_FailedOperation = operation;
  m_FailedName = name;
  if (m_FailingSignal != 0) std::raise(m_FailingSignal);
  if (m_Disturbance) m_Disturbance();
  return m_FailingError;
}

HostError FaultyHost::remember(HostError error, const std::string& name, FileHandle file) {
  if (error == 0) m_OpenNames[file.number] = name;
  return error;
}

HostError FaultyHost::openForReading(const char* name, FileHandle& file) {
  if (const HostError error = fault("openForReading", name)) return error;
  const HostError error = m_Host.openForReading(name, file);
  return remember(error, name, file);
}

HostError FaultyHost::openForUpdate(const char* name, FileHandle& file) {
  if (const HostError error = fault("openForUpdate", name)) return error;
  const HostError error = m_Host.openForUpdate(name, file);
  return remember(error, name, file);
}

HostError FaultyHost::openSequential(const char* name, FileHandle& file) {
  if (const HostError error = fault("openSequential", name)) return error;
  const HostError error = m_Host.openSequential(name, file);
  return remember(error, name, file);
}

HostError FaultyHost::readNext(FileHandle file, std::span<uint8_t> bytes, size_t& done) {
  done = 0;
  const HostError error = fault("readNext", m_OpenNames[file.number]);
  if (error != 0) return error;
  return m_Host.readNext(file, isShort() ? bytes.first(1) : bytes, done);
}

HostError FaultyHost::lock(FileHandle file) {
  const HostError error = fault("lock", m_OpenNames[file.number]);
  return error != 0 ? error : m_Host.lock(file);
}

HostError FaultyHost::createTemporary(const char* name, uint32_t mode, TemporaryFile& file) {
  if (const HostError error = fault("createTemporary", name)) return error;
  const HostError error = m_Host.createTemporary(name, mode, file);
  return remember(error, name, file.handle);
}

HostError FaultyHost::giveName(TemporaryFile& file, const char* name) {
  const HostError error = fault("giveName", name);
  return error != 0 ? error : m_Host.giveName(file, name);
}

HostError FaultyHost::createUnnamedTemporary(std::string& name, FileHandle& file) {
  if (const HostError error = fault("createUnnamedTemporary", "")) return error;
  const HostError error = m_Host.createUnnamedTemporary(name, file);
  return remember(error, name, file);
}

HostError FaultyHost::openForWriting(const char* name, FileHandle& file) {
  if (const HostError error = fault("openForWriting", name)) return error;
  const HostError error = m_Host.openForWriting(name, file);
  return remember(error, name, file);
}

HostError FaultyHost::createForWriting(const char* name, FileHandle& file) {
  if (const HostError error = fault("createForWriting", name)) return error;
  const HostError error = m_Host.createForWriting(name, file);
  return remember(error, name, file);
}

HostError FaultyHost::endWriting(FileHandle file, const char* name, bool isWhole) {
  const HostError error = fault("close", name);
  m_OpenNames.erase(file.number);
  const HostError closeError = m_Host.endWriting(file, name, isWhole && error == 0);
  return error != 0 ? error : closeError;
}

HostError FaultyHost::readAt(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                             size_t& done) {
  const HostError error = fault("readAt", m_OpenNames[file.number]);
  if (isShort()) return readHalf(file, bytes, offset, done);
  if (error == 0) return m_Host.readAt(file, bytes, offset, done);
  [[maybe_unused]] const HostError ignored =
      m_Host.readAt(file, bytes.first(bytes.size() / 2), offset, done);
  return error;
}

// Who believes that all has come finds other bytes behind the half.
HostError FaultyHost::readHalf(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                               size_t& done) {
  const HostError error = m_Host.readAt(file, bytes, offset, done);
  done /= 2;
  std::fill(bytes.begin() + static_cast<std::ptrdiff_t>(done), bytes.end(), uint8_t{0xEE});
  return error;
}

HostError FaultyHost::write(FileHandle file, std::span<const uint8_t> bytes) {
  const HostError error = fault("write", m_OpenNames[file.number]);
  if (error == 0) return m_Host.write(file, bytes);
  [[maybe_unused]] const HostError ignored = m_Host.write(file, bytes.first(bytes.size() / 2));
  return error;
}

HostError FaultyHost::flush(FileHandle file) {
  const HostError error = fault("flush", m_OpenNames[file.number]);
  return error != 0 ? error : m_Host.flush(file);
}

HostError FaultyHost::flushToDisk(FileHandle file) {
  const HostError error = fault("flushToDisk", m_OpenNames[file.number]);
  return error != 0 ? error : m_Host.flushToDisk(file);
}

HostError FaultyHost::close(FileHandle file) {
  const HostError error = fault("close", m_OpenNames[file.number]);
  m_OpenNames.erase(file.number);
  const HostError closeError = m_Host.close(file);
  return error != 0 ? error : closeError;
}

HostError FaultyHost::rename(const char* from, const char* to) {
  const HostError error = fault("rename", from);
  return error != 0 ? error : m_Host.rename(from, to);
}

HostError FaultyHost::renameNew(const char* from, const char* to) {
  const HostError error = fault("renameNew", from);
  return error != 0 ? error : m_Host.renameNew(from, to);
}

HostError FaultyHost::remove(const char* name) {
  const HostError error = fault("remove", name);
  return error != 0 ? error : m_Host.remove(name);
}

HostError FaultyHost::status(const char* name, FileStatus& status) {
  status = FileStatus();
  const HostError error = fault("status", name);
  return error != 0 ? error : m_Host.status(name, status);
}

HostError FaultyHost::statusOf(FileHandle file, FileStatus& status) {
  status = FileStatus();
  const HostError error = fault("statusOf", m_OpenNames[file.number]);
  return error != 0 ? error : m_Host.statusOf(file, status);
}

bool FaultyHost::isWritable(const char* name) {
  return fault("isWritable", name) == 0 && m_Host.isWritable(name);
}

void FaultyHost::setPermissions(FileHandle file, uint32_t mode) {
  if (fault("setPermissions", m_OpenNames[file.number]) == 0) m_Host.setPermissions(file, mode);
}

void FaultyHost::copyProtection(const char* from, const FileStatus& status, FileHandle file) {
  if (fault("copyProtection", m_OpenNames[file.number]) == 0)
    m_Host.copyProtection(from, status, file);
}

void FaultyHost::setTimes(FileHandle file, int64_t seconds) {
  if (fault("setTimes", m_OpenNames[file.number]) == 0) m_Host.setTimes(file, seconds);
}

HostError FaultyHost::resolveLinks(const char* name, std::string& place) {
  place = name;
  const HostError error = fault("resolveLinks", name);
  return error != 0 ? error : m_Host.resolveLinks(name, place);
}

HostError FaultyHost::listDirectory(const char* name, std::vector<std::string>& names) {
  names.clear();
  const HostError error = fault("listDirectory", name);
  return error != 0 ? error : m_Host.listDirectory(name, names);
}

HostError FaultyHost::findNames(std::string_view directory, std::string_view leaf,
                                std::vector<std::string>& names) {
  names.clear();
  const HostError error = fault("findNames", std::string(directory));
  return error != 0 ? error : m_Host.findNames(directory, leaf, names);
}

} // namespace testsupport
