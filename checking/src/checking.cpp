// SPDX-License-Identifier: Apache-2.0
//
// The level's text form, and the ways out for failures and texts. The defaults serve a program that
// has not installed its message stream yet, and tests.
//
// The text comes from the command line. A name with anything behind it is refused and leaves the
// level alone; "show" and "show," are words of their own in front of the names.

#include "checking/interface/checking.h"

#include "checking/src/level_names.h"

#include <cstdio>
#include <cstdlib>
#include <iterator>

namespace checking {
namespace {

void printFailure(const char* path, unsigned line, const char* expression) {
  std::fprintf(stderr, "Assertion failed: %s line %u (%s)\n", path, line, expression);
  std::exit(1);
}

void printFault(const char* text) {
  std::fprintf(stderr, "%s\n", text);
  std::exit(1);
}

void printText(std::string_view text) {
  std::fwrite(text.data(), 1, text.size(), stdout);
}

FailureHandler failureHandler = printFailure;
FaultHandler faultHandler = printFault;
TextSink textSink = printText;

template <class Handler>
Handler exchange(Handler& installed, Handler wanted, Handler standard) {
  Handler previous = installed;
  installed = wanted != nullptr ? wanted : standard;
  return previous;
}

bool takePrefix(std::string_view& text, std::string_view prefix) {
  if (!text.starts_with(prefix)) return false;
  text.remove_prefix(prefix.size());
  return true;
}

// The number of the level whose name the text starts with, the name being taken off; the number
// of levels if there is none.
uint32_t takeLevelName(std::string_view& text) {
  uint32_t level = 0;
  for (std::string_view name : LevelNames) {
    if (takePrefix(text, name)) return level;
    ++level;
  }
  return level;
}

void storeLevel(uint32_t level) {
  switch (level) {
  case Level_None:
  case Level_Low:
  case Level_Medium:
  case Level_High:
  case Level_Extravagant:
    checkingLevel = level;
    return;
  }
  reportFault("Unreachable code: set_checking_level");
}

} // namespace

FailureHandler setFailureHandler(FailureHandler handler) {
  return exchange(failureHandler, handler, &printFailure);
}

FaultHandler setFaultHandler(FaultHandler handler) {
  return exchange(faultHandler, handler, &printFault);
}

TextSink setTextSink(TextSink sink) {
  return exchange(textSink, sink, &printText);
}

void showText(std::string_view text) {
  textSink(text);
}

void assertionFailed(const char* path, unsigned line, const char* expression) {
  failureHandler(path, line, expression);
  // The caller's invariant is broken: nothing behind a failed assertion may run, whatever the
  // handler does.
  std::abort();
}

void reportFault(const char* text) {
  faultHandler(text);
  std::abort();
}

bool set_checking_level(const char* text) {
  if (text == nullptr) return true;
  std::string_view rest = text;
  if (rest == "show") {
    showCheckingLevels();
    return true;
  }
  const bool show = takePrefix(rest, "show,");
  uint32_t level = takeLevelName(rest);
  if (level == std::size(LevelNames)) {
    if (!show) return false;
    level = Level_None;
  }
  if (!rest.empty()) return false;
  storeLevel(level);
  if (show) showCheckingLevels();
  return true;
}

void showCheckingLevels() {
  if (checkingLevel >= Level_Low) showText("COLD LOW checks enabled\n");
  if (checkingLevel >= Level_Medium) showText("COLD MEDIUM checks enabled\n");
  if (checkingLevel >= Level_High) showText("COLD HIGH checks enabled\n");
  if (checkingLevel >= Level_Extravagant) showText("COLD EXTRAVAGANT checks enabled\n");
  if (checkingLevel >= Level_Low) showText("HOT LOW checks enabled\n");
}

} // namespace checking
