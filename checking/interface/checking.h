// SPDX-License-Identifier: Apache-2.0
//
// Assertions and the run-time level that gates them.
//
// An assertion guards against faults of this program, never against bad input: input is checked
// and reported. Each assertion has a level; it is evaluated only while the process-wide level is
// at least that high, and what stands above level 1 is compiled out. Nothing here prints through
// another library: whoever owns the message stream installs a handler for failures and a sink
// for texts.

#pragma once

#ifdef QUARN_CHECKING_STATISTICS
#include "checking/interface/statistics.h"
#endif

#include <cstdint>
#include <string_view>

namespace checking {

/// The numbers are compared with each other, and index the words of --db_check.
enum Level : uint32_t {
  Level_None = 0,
  Level_Low = 1,
  Level_Medium = 2,
  Level_High = 3,
  Level_Extravagant = 4,
};

/// The process-wide level. Written by set_checking_level only.
/// The option --db_check moves it, up to any level; above 1 that enables nothing in this build.
inline uint32_t checkingLevel = Level_Low;

/// Whether an assertion of this level is to be evaluated.
[[nodiscard]] inline bool checking(uint32_t level) {
  return level <= Level_Low && level <= checkingLevel;
}

/// Takes a level's name ("none", "low", "medium", "high", "extravagant"), "show", or "show," and a
/// name. False, with the level as it was, if the text is not one of these; a null text is taken
/// and changes nothing; "show," alone stores level 0.
bool set_checking_level(const char* text);

/// Writes one line to the text sink for each kind of check that the level enables.
void showCheckingLevels();

/// A failed assertion: source path relative to the source tree, line, and the expression's text.
using FailureHandler = void (*)(const char* path, unsigned line, const char* expression);
/// A fault that no expression states.
using FaultHandler = void (*)(const char* text);
/// Takes texts that end with their own newline.
using TextSink = void (*)(std::string_view text);

/// Each installs its argument, or the default again for a null pointer, and returns what was
/// installed before. A handler should end the process; if it returns, the process is aborted. The
/// default handlers write to standard error and exit with status 1; the default sink writes to
/// standard output.
FailureHandler setFailureHandler(FailureHandler handler);
FaultHandler setFaultHandler(FaultHandler handler);
TextSink setTextSink(TextSink sink);

/// Passes a text to the installed sink.
void showText(std::string_view text);

[[noreturn, gnu::cold]] void assertionFailed(const char* path, unsigned line,
                                             const char* expression);
[[noreturn, gnu::cold]] void reportFault(const char* text);

// What the assertion macro does beside its test. Always true.
#ifdef QUARN_CHECKING_STATISTICS
inline bool noteCheck(const char* path, unsigned line, uint32_t level) {
  return countCheck(path, line, Temperature_Cold, level);
}
#else
constexpr bool noteCheck(const char*, unsigned, uint32_t) {
  return true;
}
#endif

} // namespace checking

// Fails unless the expression holds; evaluates it only if checking(level).
#define QUARN_ASSERT(level, expression)                                                            \
  do {                                                                                             \
    if (::checking::checking(level) && ::checking::noteCheck(__FILE__, __LINE__, level) &&         \
        !(expression))                                                                             \
      ::checking::assertionFailed(__FILE__, __LINE__, #expression);                                \
  } while (false)
