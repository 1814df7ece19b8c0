// SPDX-License-Identifier: Apache-2.0
//
// The message library: it words, prints and counts every diagnostic of the tool, and prints the
// lines of its listings. A diagnostic has a key; its text lies in the catalogue; what the user said
// about severities and style decides how it looks. Only keys and the tool's own literals are ever
// formats: whatever comes from outside is an argument. The state is process-wide and unlocked.
//
// A report runs through: effective severity, counting (and the end of the run at one error too
// many), location and prefix in the current style, code, text, newline. Bytes that could steer a
// terminal are escaped on the way out. The counters decide the exit status; libraries never call in
// here, but the driver's bridges do it for them.

#pragma once

#include "messages/interface/argument.h"
#include "messages/interface/location.h"
#include "messages/interface/message_keys.h"
#include "messages/interface/output.h"
#include "messages/interface/severity.h"

#include <array>
#include <cstdint>
#include <span>
#include <string_view>

namespace messages {

/// Sets all state back to that of a fresh process (counters, severities, style, language, limit,
/// stream of diagnostics), opens the streams, and takes over the failure reports of the checking
/// and region libraries. The exit handler and the sinks of a test stay.
void initialise();

/// Prints a message of the catalogue: location (null: none), prefix, code, text, newline. Counts it
/// at its effective severity; the error that passes the limit calls the limit handler, unprinted.
/// True if it was printed, false if it was suppressed. A fatal message does not end the process
/// here: its caller does.
bool reportArguments(uint32_t severityWord, const Location* location, Key key,
                     std::span<const Argument> arguments);

/// The same for a literal format; no code is printed.
bool reportFormatArguments(uint32_t severityWord, const Location* location, std::string_view format,
                           std::span<const Argument> arguments);

/// Prints only the text of a key to the stream of diagnostics, and keeps account of the column.
void plainMessageArguments(Key key, std::span<const Argument> arguments);

/// Prints a line of a listing to stdout, whatever the stream of diagnostics is. It is no
/// diagnostic: no prefix, no code, not counted.
void listingMessageArguments(Key key, std::span<const Argument> arguments);

/// Reports a fault of the program itself, with a number that names the place, and ends the process
/// with status 1.
[[noreturn]] void internalFaultArguments(std::string_view format,
                                         std::span<const Argument> arguments);

/// The same for a failed assertion: "Assertion failed: <path> line <n> (<expression>)".
[[noreturn]] void assertionFault(const char* path, unsigned line, const char* expression);

template <class... Arguments>
using ArgumentArray = std::array<Argument, sizeof...(Arguments)>;

template <class... Arguments>
bool report(uint32_t severityWord, const Location* location, Key key,
            const Arguments&... arguments) {
  return reportArguments(severityWord, location, key,
                         ArgumentArray<Arguments...>{Argument(arguments)...});
}

template <class... Arguments>
bool reportFormat(uint32_t severityWord, const Location* location, std::string_view format,
                  const Arguments&... arguments) {
  return reportFormatArguments(severityWord, location, format,
                               ArgumentArray<Arguments...>{Argument(arguments)...});
}

template <class... Arguments>
void plainMessage(Key key, const Arguments&... arguments) {
  plainMessageArguments(key, ArgumentArray<Arguments...>{Argument(arguments)...});
}

template <class... Arguments>
void listingMessage(Key key, const Arguments&... arguments) {
  listingMessageArguments(key, ArgumentArray<Arguments...>{Argument(arguments)...});
}

template <class... Arguments>
[[noreturn]] void internalFault(std::string_view format, const Arguments&... arguments) {
  internalFaultArguments(format, ArgumentArray<Arguments...>{Argument(arguments)...});
}

/// The 24-bit number of a fault, from its text before the arguments are put in. The path of an
/// assertion counts from its last component named "work", whichever separator it is written with,
/// so that the place of the source tree doesn't matter.
[[nodiscard]] uint32_t computeFaultHash(std::string_view text);

/// How many messages came out at each severity.
struct Counters {
  uint32_t suppressed = 0;
  uint32_t remarks = 0;
  uint32_t warnings = 0;
  uint32_t errors = 0;
  uint32_t fatalErrors = 0;
  uint32_t internalFaults = 0;
};
/// Since initialise, by effective severity.
[[nodiscard]] Counters getCounters();
[[nodiscard]] uint32_t getErrorCount();

/// The run ends at the report that makes errors, fatal errors and internal faults together exceed
/// the limit. The default handler ends the process with status 1; after one that returns, the
/// report goes on. Null brings the default back.
using LimitHandler = void (*)();
void setLimit(uint32_t limit, LimitHandler handler);

/// The name that diagnostics without a location begin with, as builds run many programs that write
/// to one log. The tool itself has none. The text must outlive its use.
void setProgramName(std::string_view name);

/// The file that the run is about: in the styles that others read by program it stands in the place
/// of a location that is not known, so that an editor has something to open. The tool itself has
/// none. The text must outlive its use.
void setSubject(std::string_view file);

/// The look of diagnostics: 0 the tool's own, 1 for development environments, 2 for editors.
[[nodiscard]] uint32_t getStyle();
void setStyle(uint32_t style);

/// The stream of diagnostics, stderr unless changed.
[[nodiscard]] Stream getDiagnosticStream();
void setDiagnosticStream(Stream stream);

/// The number of characters behind the last newline of what was printed as plain message.
[[nodiscard]] uint32_t getColumn();

/// The severity that a message comes out with, by the user's overrides and the word's permissions.
[[nodiscard]] uint32_t computeEffectiveSeverity(uint32_t severityWord, Key key);

} // namespace messages
