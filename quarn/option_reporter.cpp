// SPDX-License-Identifier: Apache-2.0
//
// One message of the catalogue for each complaint of the parser; a total switch, so that a new one
// can't be forgotten. What the user wrote is only ever an argument of a message.
#include "quarn/option_reporter.h"

#include "quarn/reporting.h"

#include <vector>

namespace quarn {

using tabledrivenparser::OptionMessage;
using tabledrivenparser::OptionMessageArgument;
using tabledrivenparser::ReportLevel;

namespace {

messages::Key keyOf(OptionMessage message) {
  switch (message) {
  case OptionMessage::UnrecognizedOption:
    return messages::UnrecognizedOption;
  case OptionMessage::MissingArgument:
    return messages::MissingArgument;
  case OptionMessage::RecursiveViaFile:
    return messages::RecursiveViaFile;
  case OptionMessage::ArgumentNotPermitted:
    return messages::ArgumentNotPermitted;
  case OptionMessage::CannotOpenViaFile:
    return messages::ViaFileNotOpened;
  case OptionMessage::ViaFileReadError:
    return messages::ViaFileReadError;
  case OptionMessage::MalformedViaFile:
    return messages::MalformedViaFile;
  case OptionMessage::ViaFileCommandTooLong:
    return messages::ViaFileCommandTooLong;
  case OptionMessage::IntegerOverflow:
    return messages::IntegerOverflow;
  case OptionMessage::OldSyntax:
    return messages::OldSyntax;
  case OptionMessage::DeprecatedOption:
    return messages::DeprecatedOption;
  case OptionMessage::CannotCloseViaFile:
    return messages::ViaFileNotClosed;
  case OptionMessage::SelectableArguments:
    return messages::SelectableArguments;
  case OptionMessage::DeprecatedArgument:
    return messages::DeprecatedArgument;
  case OptionMessage::UnexpectedArgument:
    return messages::UnexpectedArgument;
  case OptionMessage::ConcatenatedArgument:
    return messages::ConcatenatedOptionArgument;
  case OptionMessage::NulInViaFile:
    return messages::NulInViaFile;
  case OptionMessage::PossibleMatches:
    return messages::PossibleMatches;
  case OptionMessage::RepeatedConcatenatedOption:
    return messages::RepeatedOption;
  }
  return {};
}

uint32_t severityWordOf(ReportLevel level) {
  switch (level) {
  case ReportLevel::Remark:
    return messages::RemarkWord;
  case ReportLevel::Warning:
    return messages::WarningWord;
  case ReportLevel::Error:
    return messages::ErrorWord;
  case ReportLevel::Fatal:
    return messages::FatalWord;
  }
  return messages::FatalWord;
}

} // namespace

void OptionReporter::reportOptionMessage(ReportLevel level, OptionMessage message,
                                         std::span<const OptionMessageArgument> arguments) {
  std::vector<messages::Argument> pieces;
  for (const OptionMessageArgument& argument : arguments) {
    std::visit([&pieces](auto piece) { pieces.emplace_back(piece); }, argument);
  }
  messages::reportArguments(severityWordOf(level), nullptr, keyOf(message), pieces);
  if (level == ReportLevel::Fatal) messages::endProcess(1);
}

} // namespace quarn
