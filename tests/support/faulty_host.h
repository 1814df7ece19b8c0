// SPDX-License-Identifier: Apache-2.0
//
// A host on which one call goes wrong: the k-th, counted over all operations that can fail. Or a
// signal comes in front of it, or somebody else does something to the files. All others go to the
// host behind it. A read can also get fewer bytes than there are.
//
// By going through k until a run makes fewer calls, a test sees the failure of every call that
// there is, also of those that are added later.

#pragma once

#include "support/interface/host.h"

#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <utility>

namespace testsupport {

class FaultyHost : public support::Host {
public:
  explicit FaultyHost(support::Host& host) : m_Host(host) {}

  // The call with this number, from 1, fails with the error number; 0: none. Counting starts anew.
  void failCall(uint64_t number, support::HostError error) {
    m_FailingCall = number;
    m_FailingError = error;
    m_Calls = 0;
    m_FailingSignal = 0;
    m_Disturbance = nullptr;
    m_IsShort = false;
    m_FailedOperation.clear();
  }
  // The call with this number, if it reads, gets fewer bytes than there are and no error: of a
  // sequence one, since more of them follow, and of a file half, which then ends there. Counting
  // starts anew.
  void shortenCall(uint64_t number) {
    failCall(number, 0);
    m_IsShort = true;
  }
  // A signal comes when the call with this number is made, which then goes on as always if the
  // process still lives. Counting starts anew.
  void raiseAtCall(uint64_t number, int signal) {
    failCall(number, 0);
    m_FailingSignal = signal;
  }

  // Somebody else does something in front of the call with this number, which then goes on as
  // always. Counting starts anew.
  void disturbCall(uint64_t number, std::function<void()> disturbance) {
    failCall(number, 0);
    m_Disturbance = std::move(disturbance);
  }

  [[nodiscard]] uint64_t getCallCount() const { return m_Calls; }
  // Which operation failed, as "rename"; empty if none did.
  [[nodiscard]] const std::string& getFailedOperation() const { return m_FailedOperation; }
  // The file that it was asked for.
  [[nodiscard]] const std::string& getFailedName() const { return m_FailedName; }

  support::PathStyle getPathStyle() const override { return m_Host.getPathStyle(); }
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
  // What goes wrong is the close.
  support::HostError endWriting(support::FileHandle file, const char* name, bool isWhole) override;
  void removeUnfinished() override { m_Host.removeUnfinished(); }
  // Half of the bytes arrive before the failure.
  support::HostError readAt(support::FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                            size_t& done) override;
  // Half of the bytes are written before the failure.
  support::HostError write(support::FileHandle file, std::span<const uint8_t> bytes) override;
  support::HostError flush(support::FileHandle file) override;
  support::HostError flushToDisk(support::FileHandle file) override;
  // The file is closed also when the call fails.
  support::HostError close(support::FileHandle file) override;
  support::HostError rename(const char* from, const char* to) override;
  support::HostError renameNew(const char* from, const char* to) override;
  bool keepsLocks() const override { return m_Host.keepsLocks(); }
  support::HostError replaceAlone(const support::FileStatus& file,
                                  const std::function<support::HostError()>& step) override {
    return m_Host.replaceAlone(file, step);
  }
  void pause(uint32_t milliseconds) override { m_Host.pause(milliseconds); }
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
  support::HostError findNames(std::string_view directory, std::string_view leaf,
                               std::vector<std::string>& names) override;

private:
  // Counts a call; the error that it is to fail with, or 0.
  support::HostError fault(const char* operation, const std::string& name);
  // Of the call that was counted last.
  [[nodiscard]] bool isShort() const { return m_IsShort && m_Calls == m_FailingCall; }
  support::HostError readHalf(support::FileHandle file, std::span<uint8_t> bytes, uint64_t offset,
                              size_t& done);
  support::HostError remember(support::HostError error, const std::string& name,
                              support::FileHandle file);

  support::Host& m_Host;
  uint64_t m_FailingCall = 0;
  support::HostError m_FailingError = 0;
  int m_FailingSignal = 0;
  std::function<void()> m_Disturbance;
  bool m_IsShort = false;
  uint64_t m_Calls = 0;
  std::string m_FailedOperation;
  std::string m_FailedName;
  std::map<int, std::string> m_OpenNames; // by handle number
};

} // namespace testsupport
