// SPDX-License-Identifier: Apache-2.0
//
// Members of an archive by the names that another archive, which is inserted, has for its own. Only
// long names, of which thousands may share their bytes in either: no look-up by one of them costs
// a look at it.
#pragma once

#include "arlib/interface/archive.h"

#include <cstddef>
#include <cstdint>
#include <map>
#include <string_view>
#include <utility>
#include <vector>

namespace quarn {

class LongNameMatches {
public:
  LongNameMatches(const arlib::Archive& archive, const arlib::Archive& source);

  // Whether a name of the source is to be looked up here.
  [[nodiscard]] static bool isForThese(std::string_view name);

  // The first member of the archive with this name of the source that this run has not made or
  // replaced, or null.
  [[nodiscard]] arlib::ArchiveMember* findUnmodified(std::string_view sourceName);

private:
  struct Named {
    std::vector<arlib::ArchiveMember*> members; // in archive order
    size_t skip = 0;                            // how many in front are modified
  };

  std::map<std::pair<const char*, size_t>, uint64_t> m_Numbers; // of names of the source
  std::map<uint64_t, Named> m_Members;                          // by the numbers of their names
};

} // namespace quarn
