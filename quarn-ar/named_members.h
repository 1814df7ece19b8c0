// SPDX-License-Identifier: Apache-2.0
//
// Which member a word means: the first of exactly that name, letter case counting, and the next one
// for the same word again. A word is cut to what a member made of that file would be called.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/interface/name_index.h"
#include "quarn-ar/request.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace quarn_ar {

// What a member is called that is made of the file.
[[nodiscard]] std::string_view memberNameOf(std::string_view file, const Request& request);

// A view of the members as they are now; those that come later are not in it.
class NamedMembers {
public:
  NamedMembers(const arlib::Archive& archive, const Request& request);

  // The first of the name, or the one that the request asks for. Null if there is none.
  [[nodiscard]] arlib::ArchiveMember* find(std::string_view word) const;

  // The same, but never one that was taken before.
  [[nodiscard]] arlib::ArchiveMember* take(std::string_view word);

private:
  const Request& m_Request;
  arlib::NameIndex m_Index;
  std::vector<uint32_t> m_Taken; // at a name's first member: how many are
};

} // namespace quarn_ar
