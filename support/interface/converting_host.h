// SPDX-License-Identifier: Apache-2.0
//
// A host whose names are other ones: each call that takes a name has it converted, and goes to the
// host behind this one. A file has so many names as the tool has calls for it, and all of them must
// be of one kind, or a file that is made under one could not be put in the place of another.

#pragma once

#include "support/interface/host.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace support {

class ConvertingHost final : public Host {
public:
  /// From a name to what the host behind calls it. The same name must always give the same one.
  using NameConversion = std::function<std::string(std::string_view name)>;

  /// The host outlives this object.
  ConvertingHost(Host& host, NameConversion convert)
      : m_Host(host), m_Convert(std::move(convert)) {}

  [[nodiscard]] PathStyle getPathStyle() const override { return m_Host.getPathStyle(); }
  HostError openForReading(const char* name, FileHandle& file) override;
  HostError openForUpdate(const char* name, FileHandle& file) override;
  HostError openSequential(const char* name, FileHandle& file) override;
  HostError readNext(FileHandle file, std::span<uint8_t> bytes, size_t& done) override;
  HostError lock(FileHandle file) override { return m_Host.lock(file); }
  HostError createTemporary(const char* name, uint32_t mode, TemporaryFile& file) override;
  HostError giveName(TemporaryFile& file, const char* name) override;
  /// The name is one of the host's behind, and must be its own conversion.
  HostError createUnnamedTemporary(std::string& name, FileHandle& file) override;
  HostError openForWriting(const char* name, FileHandle& file) override;
  HostError createForWriting(const char* name, FileHandle& file) override;
  HostError endWriting(FileHandle file, const char* name, bool isWhole) override;
  void removeUnfinished() override { m_Host.removeUnfinished(); }
  HostError readAt(FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                   size_t& done) override;
  HostError write(FileHandle file, std::span<const uint8_t> bytes) override;
  HostError flush(FileHandle file) override { return m_Host.flush(file); }
  HostError flushToDisk(FileHandle file) override { return m_Host.flushToDisk(file); }
  HostError close(FileHandle file) override { return m_Host.close(file); }
  HostError rename(const char* from, const char* to) override;
  HostError renameNew(const char* from, const char* to) override;
  [[nodiscard]] bool keepsLocks() const override { return m_Host.keepsLocks(); }
  HostError replaceAlone(const FileStatus& file, const std::function<HostError()>& step) override {
    return m_Host.replaceAlone(file, step);
  }
  void pause(uint32_t milliseconds) override { m_Host.pause(milliseconds); }
  HostError remove(const char* name) override;
  HostError status(const char* name, FileStatus& status) override;
  HostError statusOf(FileHandle file, FileStatus& status) override;
  bool isWritable(const char* name) override;
  void setPermissions(FileHandle file, uint32_t mode) override;
  void copyProtection(const char* from, const FileStatus& status, FileHandle file) override;
  void setTimes(FileHandle file, int64_t seconds) override;
  /// The name as it was given where it is no link, else one of the host's behind.
  HostError resolveLinks(const char* name, std::string& place) override;
  HostError listDirectory(const char* name, std::vector<std::string>& names) override;
  HostError findNames(std::string_view directory, std::string_view leaf,
                      std::vector<std::string>& names) override;

private:
  Host& m_Host;
  NameConversion m_Convert;
};

} // namespace support
