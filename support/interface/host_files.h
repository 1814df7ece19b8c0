// SPDX-License-Identifier: Apache-2.0
//
// Questions about files that are put together from the host's plain operations, and the search for
// the files that a word of the command line means. They answer and change nothing; a host that
// can't tell is no failure here, since whoever goes on to open the file hears why.

#pragma once

#include "support/interface/host.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace support {

/// What a name stands for. A name that the host can't tell about counts as nothing, but for a drive
/// alone.
[[nodiscard]] FileKind fileKind(Host& host, const char* name);
/// The same; `error` is what the host said, or 0.
[[nodiscard]] FileKind fileKind(Host& host, const char* name, HostError& error);

/// Modification time in seconds since 1970, or -1 if the host doesn't tell.
[[nodiscard]] int64_t fileTime(Host& host, const char* name);

/// Whether a name or pattern holds "?" or "*".
[[nodiscard]] bool hasWildcard(std::string_view text);

/// The part of a file word that names the directory where "/" alone separates, up to and including
/// the last "/"; may be empty.
[[nodiscard]] std::string_view directoryPart(std::string_view word);

/// The names in a directory that match a leaf with "?" and "*", as Host::findNames tells them. No
/// match, or a directory that can't be listed, gives an empty list.
[[nodiscard]] std::vector<std::string> wildcardSearch(Host& host, std::string_view directory,
                                                      std::string_view leaf);

} // namespace support
