// SPDX-License-Identifier: Apache-2.0
//
// The place that a diagnostic speaks of. The styles show it as compilers do, so that an editor can
// jump there; with no file known, style 1 shows the tool's name instead.

#pragma once

#include <cstdint>
#include <string_view>

namespace messages {

/// Fields are known from left to right: a line without a file, or a column without a line, is not
/// shown.
struct Location {
  std::string_view file; ///< empty: not known
  uint32_t line = 0;     ///< from 1; 0: not known
  uint32_t column = 0;   ///< from 1; 0: not known
};

} // namespace messages
