// SPDX-License-Identifier: Apache-2.0
//
// The value of an option of type CALL_BACK: it takes the words itself, in whatever form. A client
// hangs a handler into the option's value; the parser calls it in the place where it would store,
// and asks it again for the report and at the end. No constraint, validator or listener comes
// before it: what it is given is the text as the user wrote it, and any check is its own.

#pragma once

#include <cstdint>

namespace tabledrivenparser {

class Parser;
class TextSink;
struct MatchString;

/// Belongs to the client, who puts it in the option's value before the parse; must outlive the
/// parser.
class CallBackHandler {
public:
  virtual ~CallBackHandler() = default;
  /// argument is null if the row was given none, and else lives as long as the words of the command
  /// line (inside a via file: as long as this call). wordsUsed comes in as the number of words that
  /// the option takes and may be changed. Returns true if the option was accepted. False refuses
  /// the argument; false with wordsUsed set to 0 makes the word an unknown one.
  [[nodiscard]] virtual bool takeArgument(Parser& parser, const MatchString& row,
                                          const char* argument, uint32_t& wordsUsed) = 0;
  /// Writes what it has taken as entries of a command line; the default has nothing to write.
  virtual void printCommandLine(const Parser&, TextSink&) const {}
  /// Forgets what it has taken.
  virtual void releaseValues() {}
};

} // namespace tabledrivenparser
