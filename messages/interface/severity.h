// SPDX-License-Identifier: Apache-2.0
//
// How bad a message is. A reporter passes a severity word: the severity in bits 16 and up, with two
// bits that say whether the user may lower or raise it on the command line. WarningWord may move
// both ways and none of the others at all: an error that could be lowered would let a run replace
// an archive that it had found wrong.

#pragma once

#include <cstdint>

namespace messages {

/// Ascending: "lower" and "higher" compare the numbers.
enum Severity : uint32_t {
  Severity_Suppressed = 1,
  Severity_Remark = 2,
  Severity_Warning = 3,
  Severity_Error = 4,
  Severity_Fatal = 5,
  Severity_InternalFault = 6,
};

inline constexpr uint32_t SeverityCount = 7; ///< 0 is not used

inline constexpr uint32_t MayBeLowered = 1;
inline constexpr uint32_t MayBeRaised = 2;

/// `permissions` are MayBeLowered, MayBeRaised, both or none.
[[nodiscard]] constexpr uint32_t severityWord(Severity severity, uint32_t permissions = 0) {
  return severity << 16 | permissions;
}
/// A Severity, or another number if the word is none.
[[nodiscard]] constexpr uint32_t severityOf(uint32_t word) {
  return word >> 16;
}

inline constexpr uint32_t RemarkWord = severityWord(Severity_Remark);
inline constexpr uint32_t WarningWord = severityWord(Severity_Warning, MayBeLowered | MayBeRaised);
inline constexpr uint32_t ErrorWord = severityWord(Severity_Error);
inline constexpr uint32_t FatalWord = severityWord(Severity_Fatal);

} // namespace messages
