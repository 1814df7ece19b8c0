// SPDX-License-Identifier: Apache-2.0
//
// Names that are too long for a host with drive letters, made shorter: its plain calls take 259
// characters of a name, and build systems make longer ones out of "..". An answer to the same
// question as a path converter's, what the host shall be told for a name, that needs no program;
// the tool doesn't use it.

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace support {

/// From so many characters on a name is long, as the host counts: in units of UTF-16.
inline constexpr size_t LongName = 260;

/// A long name without its "." and "..", as the absolute name that it stands for in this folder;
/// any other name, and one that gets no shorter, as it is. Both are Windows names in UTF-8, the
/// folder's an absolute one.
[[nodiscard]] std::string shortenLongName(std::string_view name, std::string_view currentDirectory);

} // namespace support
