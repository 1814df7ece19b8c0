// SPDX-License-Identifier: Apache-2.0
//
// What the option parser's complaints read like, as far as no option of ours leads to them, and
// what each level of them does to the run.

#include "quarn/option_reporter.h"

#include "tests/support/messages_fixture.h"

#include <array>

namespace quarn {

namespace {

using tabledrivenparser::OptionMessage;
using tabledrivenparser::OptionMessageArgument;
using tabledrivenparser::ReportLevel;

class OptionReporterTest : public messages::MessagesTest {
protected:
  // Of a message about these words.
  template <class... Words>
  std::string textOf(ReportLevel level, OptionMessage message, Words... words) {
    messages::StringSink errors;
    messages::setOutputSinks(&m_Output, &errors);
    const std::array<OptionMessageArgument, sizeof...(words)> arguments{std::string_view(words)...};
    m_Status = statusOf([&] { OptionReporter().reportOptionMessage(level, message, arguments); });
    messages::flushAll();
    messages::setOutputSinks(&m_Output, &m_Error);
    return errors.getText();
  }

  int m_Status = 0;
};

TEST_F(OptionReporterTest, WordsWhatNoOptionOfOursLeadsTo) {
  EXPECT_EQ(textOf(ReportLevel::Warning, OptionMessage::DeprecatedOption, "--old"),
            "Warning: L3912W: Option '--old' is deprecated.\n");
  EXPECT_EQ(textOf(ReportLevel::Warning, OptionMessage::DeprecatedArgument, "x", "--old"),
            "Warning: L3915W: Argument 'x' to option '--old' is deprecated\n");
  EXPECT_EQ(textOf(ReportLevel::Error, OptionMessage::CannotCloseViaFile, "words.via"),
            "Error: L3913W: Could not close via file 'words.via'.\n");
}

TEST_F(OptionReporterTest, EndsTheRunAtAFatalComplaintAlone) {
  for (const ReportLevel level : {ReportLevel::Remark, ReportLevel::Warning, ReportLevel::Error}) {
    textOf(level, OptionMessage::UnrecognizedOption, "-", "x");
    EXPECT_EQ(m_Status, -1);
  }
  EXPECT_EQ(textOf(ReportLevel::Fatal, OptionMessage::UnrecognizedOption, "-", "x"),
            "Fatal error: L3900U: Unrecognized option '-x'.\n");
  EXPECT_EQ(m_Status, 1);
}

} // namespace

} // namespace quarn
