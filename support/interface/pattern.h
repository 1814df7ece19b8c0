// SPDX-License-Identifier: Apache-2.0
//
// The patterns of file_list words: "*" is any run of characters, also none, and "?" any one
// character. There are no sets and no escapes. They are matched against names in a folder, with
// letter case, and against names of members and the parts of a library's name, without.

#pragma once

#include <string_view>

namespace support {

/// Whether the pattern matches the whole text. Without caseSensitive, A-Z and a-z are equal; other
/// bytes are themselves in any case.
[[nodiscard]] bool matchesPattern(std::string_view pattern, std::string_view text,
                                  bool caseSensitive);

} // namespace support
