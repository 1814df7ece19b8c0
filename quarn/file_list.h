// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "support/interface/host.h"

#include <string>
#include <string_view>
#include <vector>

namespace quarn {

// Adds a file_list word. With `expand`, a word whose leaf holds "?" or "*" stands for the files it
// matches on disk, in byte order of their names; a word that matches nothing stays as it is.
void addFileArgument(support::Host& host, std::string_view word, bool expand,
                     std::vector<std::string>& fileList);

} // namespace quarn
