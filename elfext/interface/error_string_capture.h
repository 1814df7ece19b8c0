// SPDX-License-Identifier: Apache-2.0
//
// Keeps the text of a report for a client that words its own message round it, and ends the read.
//
// The archive uses one for each object that it reads: the first thing wrong is what the user is
// told, and nothing is read behind it.
#pragma once

#include "elfext/interface/error_handler.h"

#include <string>

namespace elfext {

class ElfextErrorStringCapture final : public ErrorHandler {
public:
  bool report(const ObjectModule&, uint32_t, const std::string& text) override {
    m_Text = text;
    return false;
  }
  bool ioErrorReading(const ObjectModule& module, int errorNumber) override {
    m_IsUnreadable = true;
    m_HostError = errorNumber;
    return ErrorHandler::ioErrorReading(module, errorNumber);
  }

  /// The last report's text; empty before the first.
  [[nodiscard]] const std::string& getText() const { return m_Text; }
  /// Whether the bytes were not to be had, of which nothing is known then. Otherwise they were at
  /// fault themselves.
  [[nodiscard]] bool isUnreadable() const { return m_IsUnreadable; }
  /// The host's error number then; 0 where its file has become shorter.
  [[nodiscard]] int getHostError() const { return m_HostError; }

private:
  std::string m_Text;
  bool m_IsUnreadable = false;
  int m_HostError = 0;
};

} // namespace elfext
