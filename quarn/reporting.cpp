// SPDX-License-Identifier: Apache-2.0
//
// Host errors in words, and the two questions that decide a run's status: was an error counted, and
// could stdout take what it was given?
#include "quarn/reporting.h"

#include <cstring>

namespace quarn {

bool hasErrors() {
  return messages::getErrorCount() != 0;
}

// The process never leaves the C locale, so the text is the same for every user. Where the host has
// given no number it was not the host that failed.
std::string hostErrorText(int errorNumber) {
  return errorNumber == 0 ? "Unexpected end of file" : std::strerror(errorNumber);
}

bool flushOutput() {
  if (messages::flushAll()) return true;
  reportMessage(messages::ErrorWord, messages::WritingExtractedFile, "stdout",
                hostErrorText(messages::getStdoutError()));
  return false;
}

} // namespace quarn
