// SPDX-License-Identifier: Apache-2.0
//
// The user's say in severities, and the rule by which a message's own word meets it. An element
// names a number ("L6875W", "6875") or a whole severity; the number's own override comes before the
// map of severities, whatever their order on the command line. A letter of another tool is passed
// over, since one via file may serve several tools.

#include "messages/interface/diagnostic_control.h"

#include "messages/src/message_state.h"
#include "support/interface/letters.h"

#include <algorithm>

namespace messages {

namespace {

// Reads up to the first character that is no digit, and stops growing at OverridableNumbers, so
// that no number can wrap round into the table. 0 if there is no digit.
uint32_t readNumber(std::string_view text) {
  uint32_t number = 0;
  for (const char character : text) {
    if (character < '0' || character > '9') break;
    number = std::min(number * 10 + static_cast<uint32_t>(character - '0'), OverridableNumbers);
  }
  return number;
}

bool reportBadElement(std::string_view text) {
  report(severityWord(Severity_Warning), nullptr, UnknownDiagnosticNumber, text);
  return true;
}

// Remarks are no class of messages that the user could tell from others.
bool moveWholeSeverity(Severity moved, uint32_t target, std::string_view text) {
  if (target == Severity_Remark) return reportBadElement(text);
  messageState.severityMap[moved] = target;
  return false;
}

bool overrideNumber(std::string_view digits, uint32_t target, std::string_view text) {
  const uint32_t number = readNumber(digits);
  if (number < 1 || number >= OverridableNumbers) return reportBadElement(text);
  messageState.numberOverride[number] = static_cast<int32_t>(target);
  messageState.hasNumberOverrides = true;
  return false;
}

} // namespace

bool applyDiagnosticOption(uint32_t severityWord, std::string_view text) {
  const uint32_t target = severityOf(severityWord);
  if (text.empty()) return false;
  if (support::equalIgnoringCase(text, "warning"))
    return moveWholeSeverity(Severity_Warning, target, text);
  if (support::equalIgnoringCase(text, "error"))
    return moveWholeSeverity(Severity_Error, target, text);
  if (!support::isLetter(text.front())) return overrideNumber(text, target, text);
  if (support::lowered(text.front()) != support::lowered(CodeLetter)) return false;
  return overrideNumber(text.substr(1), target, text);
}

void applyDiagnosticStyle(uint32_t enumerator) {
  switch (enumerator) {
  case DiagnosticStyle_Zev:
    setStyle(0);
    break;
  case DiagnosticStyle_Gnu:
    setStyle(2);
    break;
  default:
    setStyle(1);
  }
}

uint32_t computeEffectiveSeverity(uint32_t severityWord, Key key) {
  const MessageState& state = messageState;
  const uint32_t asked = severityOf(severityWord);
  // The word is the program's own: a bad one is no matter of input.
  if (asked >= SeverityCount) internalFault("Messages: Bad severity number %d\n", asked);
  const uint32_t number = numberOf(key);
  uint32_t base = asked;
  if (number < OverridableNumbers && state.numberOverride[number] != 0) {
    base = static_cast<uint32_t>(state.numberOverride[number]);
  }
  const uint32_t mapped = state.severityMap[base];
  // Lowering wants one permission, raising the other; equal severities need none.
  const bool isAllowed = (mapped < asked && (severityWord & MayBeLowered) != 0) ||
                         (mapped > asked && (severityWord & MayBeRaised) != 0);
  return isAllowed ? mapped : asked;
}

} // namespace messages
