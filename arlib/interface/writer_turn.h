// SPDX-License-Identifier: Apache-2.0
//
// Writers of one archive take turns, so that each adds to what the one before it has made. The turn
// is a lock on the file that the archive's name leads to. It is held from before the file is read
// until another has taken its place; readers need no turn, since a file that is replaced stays
// whole for who has it open.
#pragma once

#include "support/interface/source_file.h"

#include <memory>

namespace arlib {

/// Waits for a turn at the file that the name leads to, by then, and opens it. The turn ends when
/// the file is closed. Where the host has no locks, or the file can't be opened to be locked, it
/// comes without. Null where there is no regular file; `kind` is what was there, and `error` what
/// the host said if it told of nothing; who asks again later may be told of a file that he has no
/// turn at.
[[nodiscard]] std::shared_ptr<support::SourceFile> takeTurn(support::SourceFiles& files,
                                                            const char* fileName,
                                                            support::FileKind& kind,
                                                            support::HostError& error);

} // namespace arlib
