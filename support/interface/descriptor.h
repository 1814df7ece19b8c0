// SPDX-License-Identifier: Apache-2.0
//
// The descriptors that a process is started with, as far as its output needs them. A program may be
// started with stdout or stderr closed, and the first file that it opens would get that number, an
// archive perhaps, and be written into by the next message: so output goes to duplicates. Where the
// process may have no more descriptors an open one serves itself: no file can get its number.

#pragma once

#include "support/interface/host.h"

#include <cstdint>
#include <string_view>

namespace support {

inline constexpr int OutputDescriptor = 1;
inline constexpr int ErrorDescriptor = 2;

/// A duplicate that isn't one of the standard descriptors and that no child gets; the descriptor
/// itself if the host gives no duplicate; or -1 if the descriptor is closed.
[[nodiscard]] int duplicateDescriptor(int descriptor);

/// Writes until all is out, in binary: interrupted calls, short writes and a full pipe that doesn't
/// block are no failures. On a console of Windows the bytes are text.
[[nodiscard]] HostError writeToDescriptor(int descriptor, std::string_view bytes);

/// The code page of the texts that go to a console of Windows from now on; UTF-8 at first. One
/// write must not end inside a character.
void setConsolePage(uint32_t number);

[[nodiscard]] HostError closeDescriptor(int descriptor);

} // namespace support
