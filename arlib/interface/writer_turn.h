// SPDX-License-Identifier: Apache-2.0
//
// Writers of one archive take turns, so that each adds to what the one before it has made. The turn
// is a lock on the file that the archive's name leads to. It is held from before the file is read
// until another has taken its place; readers need no turn, since a file that is replaced stays
// whole for who has it open.
#pragma once

#include <memory>

namespace support {
class SourceFile;
class SourceFiles;
} // namespace support

namespace arlib {

// Waits for a turn at the file that the name leads to, by then, and opens it. The turn ends when
// the file is closed. Null where there is no regular file. Where the host has no locks, or the file
// can't be opened to be locked, it comes without.
[[nodiscard]] std::shared_ptr<support::SourceFile> takeTurn(support::SourceFiles& files,
                                                            const char* fileName);

} // namespace arlib
