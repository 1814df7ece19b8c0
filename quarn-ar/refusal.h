// SPDX-License-Identifier: Apache-2.0
//
// What can't be honoured is refused in one sentence, and never guessed at.
#pragma once

#include "messages/interface/messages.h"

#include <string_view>

namespace quarn_ar {

// Always false. The sentence is a literal format.
template <class... Arguments>
bool refuse(std::string_view sentence, const Arguments&... arguments) {
  messages::reportFormat(messages::ErrorWord, nullptr, sentence, arguments...);
  return false;
}

} // namespace quarn_ar
