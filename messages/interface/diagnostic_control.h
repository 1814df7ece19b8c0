// SPDX-License-Identifier: Apache-2.0
//
// What the user may say about diagnostics: --diag_error, --diag_warning, --diag_remark,
// --diag_suppress and --diag_style. All of it acts at once, on the messages still to come; the
// driver's listener calls in here while the command line is parsed. Nothing here can turn an error
// into less: whether a message moves at all is in the word of its reporter.

#pragma once

#include "messages/interface/severity.h"

#include <cstdint>
#include <string_view>

namespace messages {

inline constexpr uint32_t DiagnosticSuppress = severityWord(Severity_Suppressed);
inline constexpr uint32_t DiagnosticRemark = severityWord(Severity_Remark);
inline constexpr uint32_t DiagnosticWarning = severityWord(Severity_Warning);
inline constexpr uint32_t DiagnosticError = severityWord(Severity_Error);

/// Applies one element of a --diag_* list: a message number, with or without its letter, or
/// "warning" or "error" for all of that severity. True if the element was bad, which has then been
/// reported; another tool's letter is passed over without a word.
bool applyDiagnosticOption(uint32_t severityWord, std::string_view text);

/// The numbers of the names of --diag_style in the option table.
enum DiagnosticStyle : uint32_t {
  DiagnosticStyle_List = 0,
  DiagnosticStyle_Zev = 1,
  DiagnosticStyle_Ide = 2,
  DiagnosticStyle_Devstudio = 3,
  DiagnosticStyle_Gnu = 4,
};

/// The values of --diag_style, by the number in its enumeration.
void applyDiagnosticStyle(uint32_t enumerator);

} // namespace messages
