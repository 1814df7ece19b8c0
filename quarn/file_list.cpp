// SPDX-License-Identifier: Apache-2.0
//
// Only the leaf of a word may be a pattern: its directory is taken as it stands. Order is that of
// the bytes of the names, not that of the host's directory, so that a run gives the same archive on
// every machine.
#include "quarn/file_list.h"

#include "support/interface/host_files.h"

namespace quarn {

void addFileArgument(support::Host& host, std::string_view word, bool expand,
                     std::vector<std::string>& fileList) {
  const std::string_view directory = support::directoryPart(word);
  const std::string_view leaf = word.substr(directory.size());
  if (!expand || !support::hasWildcard(leaf)) {
    fileList.emplace_back(word);
    return;
  }
  const std::vector<std::string> names = support::wildcardSearch(host, directory, leaf);
  if (names.empty()) fileList.emplace_back(word);
  for (const std::string& name : names)
    fileList.push_back(std::string(directory) + name);
}

} // namespace quarn
