// SPDX-License-Identifier: Apache-2.0
//
// Members by their names, for who looks many names up, or one among many members.
#pragma once

#include "arlib/interface/archive_member.h"

#include <cstddef>
#include <span>
#include <string_view>
#include <vector>

namespace arlib {

/// A view of the members as they are now: none may get another name while it is in use. Members
/// that share one long name, and names that are no longer than others, cost no look at their bytes.
class NameIndex {
public:
  /// Below, above or equal to 0; names of different length are never equal.
  using Compare = int (*)(std::string_view left, std::string_view right);

  /// Members of one name, as places in the list of the index.
  struct Range {
    size_t first;
    size_t last;
  };

  NameIndex() = default;
  NameIndex(std::vector<ArchiveMember*> members, Compare compare);

  /// The members of a name stand together, in the order in which they were given.
  [[nodiscard]] Range find(std::string_view name) const;
  [[nodiscard]] std::span<ArchiveMember* const> getMembers(Range range) const {
    return std::span(m_Members).subspan(range.first, range.last - range.first);
  }

private:
  void sortByName(Range sameLength) const;

  Compare m_Compare = nullptr;
  /// By length, and then by name where that was asked for: at the first member of a length.
  mutable std::vector<ArchiveMember*> m_Members;
  mutable std::vector<bool> m_IsSorted;
};

/// All but the tables, which have no names.
[[nodiscard]] std::vector<ArchiveMember*>
getNamedMembers(std::span<ArchiveMember* const> archiveMembers);

} // namespace arlib
