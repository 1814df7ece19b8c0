// SPDX-License-Identifier: Apache-2.0
//
// Letter case counts. A library may hold one name thousands of times, and each word takes the next
// of them.
#include "quarn-ar/named_members.h"

namespace quarn_ar {

using arlib::ArchiveMember;

namespace {

// What a header has room for.
constexpr size_t ShortName = 15;

int compareNames(std::string_view left, std::string_view right) {
  return left.compare(right);
}

} // namespace

std::string_view memberNameOf(std::string_view file, const Request& request) {
  const std::string_view name = request.fullNames ? file : support::leafOf(file, request.pathStyle);
  return request.shortNames ? name.substr(0, ShortName) : name;
}

NamedMembers::NamedMembers(const arlib::Archive& archive, const Request& request)
    : m_Request(request), m_Index(arlib::getNamedMembers(archive.getMembers()), compareNames),
      m_Taken(archive.getMembers().size()) {}

ArchiveMember* NamedMembers::find(std::string_view word) const {
  const std::span<ArchiveMember* const> named =
      m_Index.getMembers(m_Index.find(memberNameOf(word, m_Request)));
  const uint32_t before = m_Request.instance == 0 ? 0 : m_Request.instance - 1;
  return before < named.size() ? named[before] : nullptr;
}

ArchiveMember* NamedMembers::take(std::string_view word) {
  if (m_Request.instance != 0) return find(word);
  const arlib::NameIndex::Range range = m_Index.find(memberNameOf(word, m_Request));
  const std::span<ArchiveMember* const> named = m_Index.getMembers(range);
  if (named.empty()) return nullptr;
  uint32_t& taken = m_Taken[range.first];
  return taken < named.size() ? named[taken++] : nullptr;
}

} // namespace quarn_ar
