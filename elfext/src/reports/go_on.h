// SPDX-License-Identifier: Apache-2.0
//
// Report and decide in one expression: `if (!goOn(module, &ErrorHandler::x, ...)) return false;`.
// The teller is the module that is wrong, or the reporter of a read.
//
// The tables, validation and a module that has lost contents report through these three, so the
// test for a handler that is not there stands here. Which of the three is taken says what a report
// means: a question, an end that the handler only hears of, or an end that it must not deny.
#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/error_handler.h"
#include "elfext/src/reports/read_reporter.h"

#include <type_traits>

namespace elfext {

template <class... Parameters>
using Report = bool (ErrorHandler::*)(const ObjectModule&, Parameters...);

[[nodiscard]] inline const ObjectModule& moduleOf(const ObjectModule& module) {
  return module;
}
[[nodiscard]] inline const ObjectModule& moduleOf(const ReadReporter& reporter) {
  return reporter.getModule();
}

// The handler's answer; without one the answer is no.
template <class Teller, class... Parameters>
[[nodiscard]] bool goOn(const Teller& teller, Report<Parameters...> report,
                        std::type_identity_t<Parameters>... arguments) {
  ErrorHandler* handler = teller.getErrorHandler();
  return handler != nullptr && (handler->*report)(moduleOf(teller), arguments...);
}

// For reports after which nothing goes on, whatever the answer. Always false.
template <class Teller, class... Parameters>
[[nodiscard]] bool stop(const Teller& teller, Report<Parameters...> report,
                        std::type_identity_t<Parameters>... arguments) {
  static_cast<void>(goOn(teller, report, arguments...));
  return false;
}

// For reports to which there is but one answer. Always false.
template <class Teller, class... Parameters>
[[nodiscard]] bool refuse(const Teller& teller, Report<Parameters...> report,
                          std::type_identity_t<Parameters>... arguments) {
  [[maybe_unused]] const bool err_response = goOn(teller, report, arguments...);
  QUARN_ASSERT(1, !err_response);
  return false;
}

} // namespace elfext
