// SPDX-License-Identifier: Apache-2.0
//
// Dates by the clock on the wall of whoever runs the program, as listings show them.

#pragma once

#include <cstdint>
#include <ctime>

namespace support {

/// Breaks seconds since 1970 down by the host's time zone. False where the host can't.
[[nodiscard]] bool breakDownLocally(int64_t seconds, std::tm& date);

} // namespace support
