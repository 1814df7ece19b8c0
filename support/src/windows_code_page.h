// SPDX-License-Identifier: Apache-2.0
//
// The way back from a code page, for a console: that takes UTF-16, and texts arrive in the page
// that was asked for.

#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace support {

// Bytes of a page that the host has, or of UTF-8, as UTF-16; what is malformed comes out as the
// host sees fit. At most 2 GiB.
[[nodiscard]] std::wstring wideFromPage(uint32_t number, std::string_view bytes);

} // namespace support
