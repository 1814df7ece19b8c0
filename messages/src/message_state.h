// SPDX-License-Identifier: Apache-2.0
//
// The process-wide state of the message library, but for the streams and the language, and the
// steps of a report that its sources share. It is set back to that of a fresh process by
// initialise. There is one thread, and so no lock.

#pragma once

#include "messages/interface/messages.h"

#include <array>
#include <cstdint>
#include <string>

namespace messages {

inline constexpr std::string_view ToolName = "quarn";
inline constexpr char CodeLetter = 'L';
inline constexpr uint32_t OverridableNumbers = 10000; // message numbers below this

struct MessageState {
  // What each severity is turned into; index 0 is not used.
  std::array<uint32_t, SeverityCount> severityMap{0, 1, 2, 3, 4, 5, 6};
  // By the number of a message: the severity that the user gave it, or 0.
  std::array<int32_t, OverridableNumbers> numberOverride{};
  bool hasNumberOverrides = false; // spares clearing the table in nearly every run
  std::array<uint32_t, SeverityCount> counts{};
  uint32_t style = 0;
  std::string_view programName; // empty: lines don't begin with one
  std::string_view subject;     // empty: a location that is not known is left out
  uint32_t limit = 50;
  LimitHandler limitHandler = nullptr; // null: end the process
  uint32_t column = 0;
  Stream diagnosticStream = Stream::Error;
};

extern MessageState messageState;

// Takes over the failure reports of the checking and region libraries, and of the heap.
void installFaultHandlers();

// An internal fault with a text of the program that is no format.
[[noreturn]] void plainFault(const char* text);

// Counts a message; false if it is suppressed. Does not return, as a rule, at the one too many.
bool countMessage(uint32_t severity);

// An empty line to compose in. It keeps its memory, so that also "Out of memory" can be composed.
std::string& startLine();

// The location in the current style, then the prefix of the severity.
void appendLead(std::string& line, const Location* location, uint32_t severity);

// A fault in the format ends the process.
void appendArguments(std::string& line, std::string_view format,
                     std::span<const Argument> arguments);

} // namespace messages
