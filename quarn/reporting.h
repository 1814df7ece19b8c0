// SPDX-License-Identifier: Apache-2.0
//
// How the driver reports. Texts are chosen by key; whatever comes from outside is an argument.
#pragma once

#include "messages/interface/messages.h"
#include "messages/interface/process_end.h"

#include <string>

namespace quarn {

// Whether an error has been counted in this run.
[[nodiscard]] bool hasErrors();

// Prints a catalogue message. A severity word of fatal or above ends the process. Returns whether
// something was printed.
template <class... Arguments>
bool reportMessage(uint32_t severityWord, messages::Key key, const Arguments&... arguments) {
  const bool isPrinted = messages::report(severityWord, nullptr, key, arguments...);
  if (severityWord >= messages::FatalWord) messages::endProcess(1);
  return isPrinted;
}

// The host's text for an error number. 0 stands for a file that ended too early.
[[nodiscard]] std::string hostErrorText(int errorNumber);

// Hands over what stdout has held back. False after a report: what it could not take must not look
// like success to whoever reads the status only.
bool finishOutput();

} // namespace quarn
