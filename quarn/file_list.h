// SPDX-License-Identifier: Apache-2.0
//
// Which files the words of a command line mean. Shells expand patterns before the tool sees them;
// this is for words in quotes, in via files, and for hosts whose shells don't.
#pragma once

#include "support/interface/host.h"

#include <string>
#include <string_view>
#include <vector>

namespace quarn {

// Adds a file_list word. With `expand`, a word whose leaf holds "?" or "*" stands for the files it
// matches on disk, in the order of Host::findNames; a word that matches nothing stays as it is. On
// Windows each word is looked for so, and what is found has "\" between its parts.
void addFileArgument(support::Host& host, std::string_view word, bool expand,
                     std::vector<std::string>& fileList);

} // namespace quarn
