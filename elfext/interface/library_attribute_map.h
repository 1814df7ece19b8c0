// SPDX-License-Identifier: Apache-2.0
//
// What the name of a library says of how its code was built. A map is a text of lines, each of a
// pattern for names, the text of the attributes, and perhaps the name of a class of libraries,
// divided by white space; what follows these is ignored. Lines that begin with "#" and lines
// without attributes say nothing.
#pragma once

#include "elfext/interface/full_attr.h"
#include "support/interface/host.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace elfext {

struct LibraryAttributeMap {
  struct Row {
    std::string pattern;
    FullAttr attributes;
    std::string className; ///< may be empty
  };
  std::vector<Row> rows;
};

/// A line longer than this, in bytes, counts as several.
constexpr size_t LibraryAttributeLineLimit = 4096;

/// The rows of the file. `usedDefault` tells that these are the built-in ones: the path is null, or
/// stands for no regular file, or the file can't be read. Of the last `error` is the reason, the
/// host's error number; else it is 0, as it is for what isn't there.
[[nodiscard]] LibraryAttributeMap readLibraryAttributeMap(support::Host& host, const char* path,
                                                          bool& usedDefault,
                                                          support::HostError& error);

/// What the rows that match the name say together, also if that can't be on one target. Of a name
/// with backslashes only the end counts, from the last one on. The target class stays as it was.
void getLibraryAttributes(FullAttr& result, std::string_view name, const LibraryAttributeMap& map);

/// The class of the first matching row that has one, else the name itself: a view of one or the
/// other.
[[nodiscard]] std::string_view getLibraryClass(std::string_view name,
                                               const LibraryAttributeMap& map);

[[nodiscard]] bool isSameLibraryClass(std::string_view a, std::string_view b,
                                      const LibraryAttributeMap& map);

} // namespace elfext
