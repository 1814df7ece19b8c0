// SPDX-License-Identifier: Apache-2.0
//
// An archive's error handler that keeps what it was told, and answers as it was told to. Three
// answers cover the contract of the handler: always no, yes where the tool says yes, and yes
// wherever there is any way on.

#pragma once

#include "arlib/interface/error_handler.h"

#include <string>
#include <vector>

namespace testsupport {

enum class Answer {
  GiveUp,          // false, always
  GoOnIfTolerable, // true for severities 1 and 2, as the tool does
  GoOnIfPossible,  // true also for fatal failures that there is a way to go on from
};

class RecordingHandler final : public arlib::ErrorHandler {
public:
  explicit RecordingHandler(Answer answer = Answer::GoOnIfTolerable) : m_Answer(answer) {}

  bool report(const arlib::Archive&, arlib::Severity severity, std::string_view text) override {
    reports.push_back(std::to_string(static_cast<uint32_t>(severity)) + " " + std::string(text));
    return m_Answer != Answer::GiveUp && severity != arlib::Severity::Fatal;
  }

  bool reportBadMemberMagic(const arlib::Archive& archive, uint64_t offset) override {
    ErrorHandler::reportBadMemberMagic(archive, offset);
    return m_Answer == Answer::GoOnIfPossible;
  }

  bool reportRegionOutsideFile(const arlib::Archive& archive, const char* fileName,
                               std::optional<std::string_view> memberName, uint64_t offset,
                               uint64_t size, uint64_t fileSize) override {
    ErrorHandler::reportRegionOutsideFile(archive, fileName, memberName, offset, size, fileSize);
    return m_Answer == Answer::GoOnIfPossible;
  }

  // The reports so far, which are then forgotten.
  std::vector<std::string> take() {
    std::vector<std::string> taken;
    taken.swap(reports);
    return taken;
  }

  // "severity text" of each report, in order.
  std::vector<std::string> reports;

private:
  Answer m_Answer;
};

} // namespace testsupport
