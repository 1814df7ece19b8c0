// SPDX-License-Identifier: Apache-2.0
//
// What the program says of itself.
#pragma once

#include <string>
#include <string_view>

namespace quarn_json {

[[nodiscard]] std::string helpText(std::string_view toolName);
[[nodiscard]] std::string versionText();

} // namespace quarn_json
