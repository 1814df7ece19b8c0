// SPDX-License-Identifier: Apache-2.0
//
// The members' names as they are now, for runs that look many of them up.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/interface/name_index.h"

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace quarn {

class MemberNames {
public:
  // Auxiliary members have no names and are left out.
  explicit MemberNames(const arlib::Archive& archive);

  // The members of a name, ignoring ASCII case, in the order that they had in the archive.
  [[nodiscard]] std::span<arlib::ArchiveMember* const> find(std::string_view name) const;

  // The first of these that this run has not made or replaced, or null. Costs no more when many
  // members of the name have been replaced already.
  [[nodiscard]] arlib::ArchiveMember* findUnmodified(std::string_view name);

private:
  arlib::NameIndex m_Index;
  std::vector<uint32_t> m_Skip; // at a name's first member: how many of the name are modified
};

} // namespace quarn
