// SPDX-License-Identifier: Apache-2.0
//
// What the parser tells its client about a command line. The parser knows neither wording nor
// catalogue: it names a message by its number and hands over what the text inserts, in the order of
// the text's conversions. So the parser stands below messages, whose locale listener is in turn a
// listener of the parser; the tool's side of this is quarn/option_reporter.

#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <variant>

namespace tabledrivenparser {

/// How bad it is; the client turns it into a severity of its own.
enum class ReportLevel : uint32_t {
  Remark = 0,
  Warning = 1, ///< the only level that the user may raise or lower
  Error = 2,
  Fatal = 3, ///< the run is over; nothing is parsed after it
};

/// The values are the numbers of the catalogue's messages.
enum class OptionMessage : uint16_t {
  UnrecognizedOption = 3900,        ///< dashes, word
  MissingArgument = 3901,           ///< word
  RecursiveViaFile = 3902,          ///< depth (int), file
  ArgumentNotPermitted = 3903,      ///< argument, row name
  CannotOpenViaFile = 3904,         ///< file
  ViaFileReadError = 3905,          ///< file
  MalformedViaFile = 3906,          ///< file
  ViaFileCommandTooLong = 3907,     ///< file
  IntegerOverflow = 3908,           ///< argument
  OldSyntax = 3910,                 ///< dashes, row name, "=" or "", argument or ""
  DeprecatedOption = 3912,          ///< row name
  CannotCloseViaFile = 3913,        ///< file
  SelectableArguments = 3914,       ///< row name, names joined by blanks
  DeprecatedArgument = 3915,        ///< argument, row name
  UnexpectedArgument = 3916,        ///< dashes, row name
  ConcatenatedArgument = 3917,      ///< row name, rest of the word
  NulInViaFile = 3918,              ///< file
  PossibleMatches = 3919,           ///< word, two row names
  RepeatedConcatenatedOption = 3920 ///< row name, letters before it, row name, rest of the word
};

using OptionMessageArgument = std::variant<std::string_view, int>;

/// Arguments live only as long as the call; their text may come from outside and is never a format.
class Reporter {
public:
  virtual ~Reporter() = default;
  /// May end the process when level is Fatal. If it returns from a fatal report, the parser has
  /// failed and ignores every later word.
  virtual void reportOptionMessage(ReportLevel level, OptionMessage message,
                                   std::span<const OptionMessageArgument> arguments) = 0;
};

} // namespace tabledrivenparser
