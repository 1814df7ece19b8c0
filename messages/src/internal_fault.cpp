// SPDX-License-Identifier: Apache-2.0
//
// Faults of the program itself. Each is printed with a number made from its text, by which one
// report can be compared with another whatever the arguments and wherever the tool was built. The
// number: hash times 31 plus the character, modulo 2 to the 24th, over the text before its
// arguments are put in, up to the first newline.
//
// A fault is counted, told on the stream of diagnostics, and ends the process through the driver's
// shut-down: no archive is put in place any more.

#include "messages/interface/format.h"
#include "messages/interface/messages.h"
#include "messages/interface/process_end.h"
#include "messages/src/message_state.h"
#include "support/interface/version_banner.h"

#include <algorithm>
#include <string>

namespace messages {

namespace {

constexpr std::string_view AssertionLead = "Assertion failed: ";

bool isSeparator(char character) {
  return character == '/' || character == '\\';
}

// Where the path shall begin: at its last component named "work", or at `start` if there is none.
size_t findWorkComponent(std::string_view text, size_t start) {
  constexpr std::string_view Component = "work";
  for (size_t at = text.rfind(Component); at != std::string_view::npos && at >= start;
       at = text.rfind(Component, at - 1)) {
    const size_t end = at + Component.size();
    const bool beginsComponent = at == start || isSeparator(text[at - 1]);
    if (beginsComponent && end < text.size() && isSeparator(text[end])) return at;
  }
  return start;
}

uint32_t extendHash(uint32_t hash, std::string_view text) {
  constexpr uint32_t HashMask = 0xFFFFFF;
  for (const char character : text) {
    // A host with the other separator gives the same number.
    const char counted = character == '\\' ? '/' : character;
    hash = (hash * 31 + static_cast<unsigned char>(counted)) & HashMask;
  }
  return hash;
}

[[noreturn]] void endWithFault(uint32_t hash, std::string_view message) {
  countMessage(Severity_InternalFault);
  std::string& line = startLine();
  appendLead(line, nullptr, Severity_InternalFault);
  appendArguments(line, "[0x%06x:%s] ",
                  ArgumentArray<uint32_t, std::string>{
                      hash, support::versionNumberText(support::getBuildData())});
  line.append(message).append("\n");
  writeText(messageState.diagnosticStream, line);
  endProcess(1);
}

} // namespace

uint32_t computeFaultHash(std::string_view text) {
  text = text.substr(0, text.find('\n'));
  if (!text.starts_with(AssertionLead)) return extendHash(0, text);
  const size_t pathStart = findWorkComponent(text, AssertionLead.size());
  return extendHash(extendHash(0, AssertionLead), text.substr(pathStart));
}

void internalFaultArguments(std::string_view format, std::span<const Argument> arguments) {
  std::string message;
  // The report of a bad format must not itself fail on one: then the format is shown as it is.
  if (appendFormatted(message, format, arguments) != FormatStatus::Done) message = format;
  endWithFault(computeFaultHash(format), message);
}

void plainFault(const char* text) {
  endWithFault(computeFaultHash(text), text);
}

void assertionFault(const char* path, unsigned line, const char* expression) {
  std::string message(AssertionLead);
  message.append(path).append(" line ").append(std::to_string(line)).append(" (");
  // The expression is an argument: in its place the number sees "%s".
  const uint32_t hash = computeFaultHash(message + "%s)");
  endWithFault(hash, message.append(expression).append(")"));
}

} // namespace messages
