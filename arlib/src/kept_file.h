// SPDX-License-Identifier: Apache-2.0
//
// The file that was read last, kept open: most members of a run come from one file.
#pragma once

#include "support/interface/host.h"

#include <string>
#include <string_view>

namespace arlib {

class KeptFile {
public:
  explicit KeptFile(support::Host& host) : m_Host(host) {}
  ~KeptFile() { [[maybe_unused]] const support::HostError error = close(); }
  KeptFile(const KeptFile&) = delete;
  KeptFile& operator=(const KeptFile&) = delete;

  [[nodiscard]] bool isOpen(std::string_view fileName) const {
    return m_File.isOpen() && m_FileName == fileName;
  }
  // Of the file that was opened last.
  [[nodiscard]] const char* getFileName() const { return m_FileName.c_str(); }
  [[nodiscard]] support::FileHandle getFile() const { return m_File; }

  // Needs a file that is not open. The host's error number, or 0.
  [[nodiscard]] support::HostError open(const char* fileName) {
    m_FileName = fileName;
    const support::HostError error = m_Host.openForReading(fileName, m_File);
    if (error != 0) m_File = {};
    return error;
  }

  // Has this file open, and no other. The host's error number, or 0.
  [[nodiscard]] support::HostError turnTo(const char* fileName) {
    if (isOpen(fileName)) return 0;
    // Nothing was written to the other file, so nothing is lost if its close fails.
    [[maybe_unused]] const support::HostError error = close();
    return open(fileName);
  }

  // Nothing to do is a success.
  [[nodiscard]] support::HostError close() {
    if (!m_File.isOpen()) return 0;
    const support::HostError error = m_Host.close(m_File);
    m_File = {};
    return error;
  }

private:
  support::Host& m_Host;
  support::FileHandle m_File;
  std::string m_FileName;
};

} // namespace arlib
