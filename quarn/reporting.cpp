// SPDX-License-Identifier: Apache-2.0
//
// Host errors in words, and the two questions that decide a run's status: was an error counted, and
// could stdout take what it was given?
#include "quarn/reporting.h"

#include "support/interface/host.h"

namespace quarn {

bool hasErrors() {
  return messages::getErrorCount() != 0;
}

// Where the host has given no number it was not the host that failed.
std::string hostErrorText(int errorNumber) {
  return errorNumber == 0 ? "Unexpected end of file" : support::hostErrorText(errorNumber);
}

bool finishOutput() {
  if (messages::finishOutput()) return true;
  reportMessage(messages::ErrorWord, messages::WritingExtractedFile, "stdout",
                hostErrorText(messages::getStdoutError()));
  return false;
}

} // namespace quarn
