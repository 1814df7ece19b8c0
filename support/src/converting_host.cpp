// SPDX-License-Identifier: Apache-2.0
//
// The calls that take a name. A pattern is converted as a whole, with the folder that it is looked
// for in, and taken apart again by the rules of the host behind: only that knows where the folder
// ends in its own names.

#include "support/interface/converting_host.h"

#include "support/interface/path.h"

namespace support {

HostError ConvertingHost::openForReading(const char* name, FileHandle& file) {
  return m_Host.openForReading(m_Convert(name).c_str(), file);
}

HostError ConvertingHost::openForUpdate(const char* name, FileHandle& file) {
  return m_Host.openForUpdate(m_Convert(name).c_str(), file);
}

HostError ConvertingHost::openSequential(const char* name, FileHandle& file) {
  return m_Host.openSequential(m_Convert(name).c_str(), file);
}

HostError ConvertingHost::readNext(FileHandle file, std::span<uint8_t> bytes, size_t& done) {
  return m_Host.readNext(file, bytes, done);
}

HostError ConvertingHost::createTemporary(const char* name, uint32_t mode, TemporaryFile& file) {
  return m_Host.createTemporary(m_Convert(name).c_str(), mode, file);
}

HostError ConvertingHost::giveName(TemporaryFile& file, const char* name) {
  return m_Host.giveName(file, m_Convert(name).c_str());
}

HostError ConvertingHost::createUnnamedTemporary(std::string& name, FileHandle& file) {
  return m_Host.createUnnamedTemporary(name, file);
}

HostError ConvertingHost::openForWriting(const char* name, FileHandle& file) {
  return m_Host.openForWriting(m_Convert(name).c_str(), file);
}

HostError ConvertingHost::createForWriting(const char* name, FileHandle& file) {
  return m_Host.createForWriting(m_Convert(name).c_str(), file);
}

HostError ConvertingHost::endWriting(FileHandle file, const char* name, bool isWhole) {
  return m_Host.endWriting(file, m_Convert(name).c_str(), isWhole);
}

HostError ConvertingHost::readAt(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                                 size_t& done) {
  return m_Host.readAt(file, bytes, offset, done);
}

HostError ConvertingHost::write(FileHandle file, std::span<const uint8_t> bytes) {
  return m_Host.write(file, bytes);
}

HostError ConvertingHost::rename(const char* from, const char* to) {
  return m_Host.rename(m_Convert(from).c_str(), m_Convert(to).c_str());
}

HostError ConvertingHost::renameNew(const char* from, const char* to) {
  return m_Host.renameNew(m_Convert(from).c_str(), m_Convert(to).c_str());
}

HostError ConvertingHost::remove(const char* name) {
  return m_Host.remove(m_Convert(name).c_str());
}

HostError ConvertingHost::status(const char* name, FileStatus& status) {
  return m_Host.status(m_Convert(name).c_str(), status);
}

HostError ConvertingHost::statusOf(FileHandle file, FileStatus& status) {
  return m_Host.statusOf(file, status);
}

bool ConvertingHost::isWritable(const char* name) {
  return m_Host.isWritable(m_Convert(name).c_str());
}

void ConvertingHost::setPermissions(FileHandle file, uint32_t mode) {
  m_Host.setPermissions(file, mode);
}

void ConvertingHost::copyProtection(const char* from, const FileStatus& status, FileHandle file) {
  m_Host.copyProtection(m_Convert(from).c_str(), status, file);
}

void ConvertingHost::setTimes(FileHandle file, int64_t seconds) {
  m_Host.setTimes(file, seconds);
}

HostError ConvertingHost::resolveLinks(const char* name, std::string& place) {
  const std::string converted = m_Convert(name);
  const HostError error = m_Host.resolveLinks(converted.c_str(), place);
  if (place == converted) place = name;
  return error;
}

HostError ConvertingHost::listDirectory(const char* name, std::vector<std::string>& names) {
  return m_Host.listDirectory(m_Convert(name).c_str(), names);
}

HostError ConvertingHost::findNames(std::string_view directory, std::string_view leaf,
                                    std::vector<std::string>& names) {
  const path pattern(m_Convert(std::string(directory).append(leaf)), getPathStyle());
  return m_Host.findNames(pattern.getDrive() + pattern.getDirectory(), pattern.getLeaf(), names);
}

} // namespace support
