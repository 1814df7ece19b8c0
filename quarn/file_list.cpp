// SPDX-License-Identifier: Apache-2.0
//
// Only the leaf of a word may be a pattern: its directory is taken as it stands. Names come in the
// order that the host gives them: on POSIX that of their bytes, so that a run gives the same
// archive on every machine.
#include "quarn/file_list.h"

#include "support/interface/host_files.h"
#include "support/interface/path.h"

namespace quarn {

namespace {

// Here a word without a pattern is looked for, too, and gets the letters that the disk has.
void addWindowsFileArgument(support::Host& host, std::string_view word,
                            std::vector<std::string>& fileList) {
  support::path path(word, support::PathStyle_Windows);
  const std::string leaf = path.getLeaf();
  // What is the name of no entry of the folder. A search for it would find the folder itself.
  const bool isFolder = leaf.empty() || leaf == "." || leaf == "..";
  std::vector<std::string> names;
  if (!isFolder) names = support::wildcardSearch(host, path.getDrive() + path.getDirectory(), leaf);
  if (names.empty()) fileList.emplace_back(word);
  for (const std::string& name : names) {
    path.replaceLeaf(name);
    fileList.push_back(path.toString());
  }
}

} // namespace

void addFileArgument(support::Host& host, std::string_view word, bool expand,
                     std::vector<std::string>& fileList) {
  if (expand && host.getPathStyle() == support::PathStyle_Windows)
    return addWindowsFileArgument(host, word, fileList);
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
