// SPDX-License-Identifier: Apache-2.0
//
// Composing, counting and printing of messages. A line is composed whole and written with one call,
// so that lines of several processes on one terminal don't mix.
//
// The order matters: a message is counted before it is composed, so that the one too many ends the
// run unprinted; and the style is checked before a line is begun, since the report of a bad one
// uses that line itself.

#include "messages/interface/messages.h"

#include "messages/interface/format.h"
#include "messages/interface/process_end.h"
#include "messages/src/catalogues.h"
#include "messages/src/message_state.h"

#include <algorithm>
#include <string>

namespace messages {

constinit MessageState messageState;

namespace {

constexpr size_t LineCapacity = 10240; // bytes; enough for all but the oddest names

struct StyleRow {
  // By what is known of the location: nothing, file, line, column.
  std::array<std::string_view, 4> locationFormats;
  std::array<std::string_view, SeverityCount> prefixes;
  std::string_view codeFormat;
};

// clang-format off
constexpr StyleRow Styles[] = {
    {{"", "\"%s\": ", "\"%s\", line %u: ", "\"%s\", line %u (column %u): "},
     {"", "", "", "Warning: ", "Error: ", "Fatal error: ", "Internal fault: "},
     "%c%.5s: "},
    {{"%s : ", "%s : ", "%s(%u) : ", "%s(%u,%u) : "},
     {"", "", "", "warning ", "error ", "Fatal error ", "Internal fault: "},
     "%c%.4s:  "}, // development environments don't expect a severity letter
    {{"", "%s: ", "%s:%u: ", "%s:%u:%u: "},
     {"", "", "", "Warning: ", "Error: ", "Fatal error: ", "Internal fault: "},
     "%c%.5s: "},
};
// clang-format on

constexpr uint32_t OwnStyle = 0;
constexpr uint32_t EnvironmentStyle = 1;

// The report of a bad style needs a style itself.
const StyleRow& getCurrentStyle() {
  return Styles[messageState.style < std::size(Styles) ? messageState.style : 0];
}

size_t knownFieldCount(const Location& location) {
  if (location.file.empty()) return 0;
  if (location.line == 0) return 1;
  return location.column == 0 ? 2 : 3;
}

void appendCode(std::string& line, Key key) {
  const KeyText keyText(key);
  appendArguments(line, getCurrentStyle().codeFormat,
                  ArgumentArray<char, std::string_view>{CodeLetter, keyText.getTextBehindLetter()});
}

void checkStyle() {
  if (messageState.style >= std::size(Styles)) {
    internalFault("Messages: unexpected diagnostic style %d", messageState.style);
  }
}

[[noreturn]] void endWithTooManyArguments() {
  writeText(Stream::Error, "** NLS Fatal Error: Too many arguments in format string\n");
  endProcess(1);
}

// A fault in the format ends the process.
void appendMessage(std::string& line, const MessageFormat& format,
                   std::span<const Argument> arguments) {
  const FormatStatus status = format.pieces.empty() ? appendFormatted(line, format.text, arguments)
                                                    : appendPieces(line, format.pieces, arguments);
  switch (status) {
  case FormatStatus::Done:
    return;
  case FormatStatus::BadFormat:
    internalFault("Messages: Bad message format %s\n", format.text);
  case FormatStatus::TooManyArguments:
    endWithTooManyArguments();
  }
}

void appendBody(std::string& line, const MessageFormat& format,
                std::span<const Argument> arguments) {
  appendMessage(line, format, arguments);
  if (!format.text.empty()) line += '\n';
}

uint32_t columnAfter(uint32_t column, std::string_view text) {
  const size_t lineEnd = text.rfind('\n');
  if (lineEnd == std::string_view::npos) return column + static_cast<uint32_t>(text.size());
  return static_cast<uint32_t>(text.size() - lineEnd - 1);
}

} // namespace

std::string& startLine() {
  static std::string line;
  line.clear();
  line.reserve(LineCapacity);
  return line;
}

void appendArguments(std::string& line, std::string_view format,
                     std::span<const Argument> arguments) {
  appendMessage(line, {format, {}}, arguments);
}

void appendLead(std::string& line, const Location* location, uint32_t severity) {
  Location place = location ? *location : Location{};
  if (place.file.empty() && messageState.style != OwnStyle) place.file = messageState.subject;
  const size_t known = knownFieldCount(place);
  const std::string_view program = messageState.programName;
  // Where a location begins the line, whoever reads it looks there for a file. The style of
  // development environments has a name in that place anyway.
  const bool hasNameInFront = messageState.style != EnvironmentStyle && known == 0;
  if (hasNameInFront && !program.empty()) line.append(program).append(": ");
  const std::string_view name = program.empty() ? ToolName : program;
  const std::string_view file = known == 0 ? name : place.file;
  appendArguments(
      line, getCurrentStyle().locationFormats[known],
      ArgumentArray<std::string_view, uint32_t, uint32_t>{file, place.line, place.column});
  line += getCurrentStyle().prefixes[severity];
}

bool countMessage(uint32_t severity) {
  MessageState& state = messageState;
  state.column = 0;
  ++state.counts[severity];
  const uint32_t errorSum = state.counts[Severity_Error] + state.counts[Severity_Fatal] +
                            state.counts[Severity_InternalFault];
  // Equal, not above: a handler of a test that comes back is called once.
  if (severity >= Severity_Error && errorSum == state.limit + 1) {
    if (!state.limitHandler) endProcess(1);
    state.limitHandler();
  }
  return severity != Severity_Suppressed;
}

void initialise() {
  MessageState& state = messageState;
  // 40,000 bytes, which nearly no run has touched.
  if (state.hasNumberOverrides) state.numberOverride.fill(0);
  state.hasNumberOverrides = false;
  state.severityMap = {0, 1, 2, 3, 4, 5, 6};
  state.counts.fill(0);
  state.style = 0;
  state.programName = {};
  state.subject = {};
  setLimit(50, nullptr);
  state.column = 0;
  state.diagnosticStream = Stream::Error;
  resetLocale();
  setExternalCatalogue({});
  startLine();
  openStreams();
  installFaultHandlers();
}

bool reportArguments(uint32_t severityWord, const Location* location, Key key,
                     std::span<const Argument> arguments) {
  const uint32_t severity = computeEffectiveSeverity(severityWord, key);
  if (!countMessage(severity)) return false;
  checkStyle();
  std::string& line = startLine();
  appendLead(line, location, severity);
  // A remark is for reading along, and nothing to be looked up or suppressed by its number.
  if (severity != Severity_Remark) appendCode(line, key);
  appendBody(line, getMessageFormat(key), arguments);
  writeText(messageState.diagnosticStream, line);
  return true;
}

bool reportFormatArguments(uint32_t severityWord, const Location* location, std::string_view format,
                           std::span<const Argument> arguments) {
  const uint32_t severity = computeEffectiveSeverity(severityWord, Key{});
  if (!countMessage(severity)) return false;
  checkStyle();
  std::string& line = startLine();
  appendLead(line, location, severity);
  appendBody(line, {format, {}}, arguments);
  writeText(messageState.diagnosticStream, line);
  return true;
}

void plainMessageArguments(Key key, std::span<const Argument> arguments) {
  std::string& line = startLine();
  appendMessage(line, getMessageFormat(key), arguments);
  messageState.column = columnAfter(messageState.column, line);
  writeText(messageState.diagnosticStream, line);
}

void listingMessageArguments(Key key, std::span<const Argument> arguments) {
  std::string& line = startLine();
  appendMessage(line, getMessageFormat(key), arguments);
  if (line.ends_with('\n')) messageState.column = 0;
  writeText(Stream::Output, line);
}

Counters getCounters() {
  const auto& counts = messageState.counts;
  return {counts[Severity_Suppressed], counts[Severity_Remark], counts[Severity_Warning],
          counts[Severity_Error],      counts[Severity_Fatal],  counts[Severity_InternalFault]};
}

uint32_t getErrorCount() {
  return messageState.counts[Severity_Error];
}

void setLimit(uint32_t limit, LimitHandler handler) {
  messageState.limit = limit;
  messageState.limitHandler = handler;
}

void setProgramName(std::string_view name) {
  messageState.programName = name;
}

void setSubject(std::string_view file) {
  messageState.subject = file;
}

uint32_t getStyle() {
  return messageState.style;
}

void setStyle(uint32_t style) {
  messageState.style = style;
}

Stream getDiagnosticStream() {
  return messageState.diagnosticStream;
}

void setDiagnosticStream(Stream stream) {
  messageState.diagnosticStream = stream;
}

uint32_t getColumn() {
  return messageState.column;
}

} // namespace messages
