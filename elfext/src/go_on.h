// SPDX-License-Identifier: Apache-2.0
//
// Report and decide in one expression: `if (!goOn(module, &ErrorHandler::x, ...)) return false;`.
#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/error_handler.h"
#include "elfext/interface/object_module.h"

#include <type_traits>

namespace elfext {

template <class... Parameters>
using Report = bool (ErrorHandler::*)(const ObjectModule&, Parameters...);

// The handler's answer; a module without one refuses.
template <class... Parameters>
[[nodiscard]] bool goOn(const ObjectModule& module, Report<Parameters...> report,
                        std::type_identity_t<Parameters>... arguments) {
  ErrorHandler* handler = module.getErrorHandler();
  return handler != nullptr && (handler->*report)(module, arguments...);
}

// For reports after which nothing goes on, whatever the answer. Always false.
template <class... Parameters>
[[nodiscard]] bool stop(const ObjectModule& module, Report<Parameters...> report,
                        std::type_identity_t<Parameters>... arguments) {
  static_cast<void>(goOn(module, report, arguments...));
  return false;
}

// For reports to which there is but one answer. Always false.
template <class... Parameters>
[[nodiscard]] bool refuse(const ObjectModule& module, Report<Parameters...> report,
                          std::type_identity_t<Parameters>... arguments) {
  [[maybe_unused]] const bool err_response = goOn(module, report, arguments...);
  QUARN_ASSERT(1, !err_response);
  return false;
}

} // namespace elfext
