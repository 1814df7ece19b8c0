// SPDX-License-Identifier: Apache-2.0
//
// The name that the tool was called by, for its help and the echo of its command line. What argv[0]
// holds is the caller's choice: it may be missing, empty or long.

#pragma once

#include <cstddef>
#include <span>

namespace support {

inline constexpr size_t ToolNameSize = 32; ///< bytes, the NUL included

/// Writes the name, cut to 31 characters, and a NUL. A null argv0 gives the empty name.
void toolNameFrom(const char* argv0, std::span<char, ToolNameSize> buffer);

} // namespace support
