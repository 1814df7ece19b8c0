// SPDX-License-Identifier: Apache-2.0
//
// What listings of members say in one way.
#pragma once

#include <cstdint>
#include <string>

namespace quarn {

// "rw-r--r--": the low nine bits alone.
[[nodiscard]] std::string modeText(uint32_t mode);

} // namespace quarn
