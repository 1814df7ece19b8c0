// SPDX-License-Identifier: Apache-2.0
//
// Sorted once, so that a run with 10,000 words on a library of 10,000 members looks each up in a
// few steps. A library may hold one name thousands of times, and each word takes the next of them.
#include "quarn-ar/named_members.h"

#include <algorithm>

namespace quarn_ar {

using arlib::ArchiveMember;

namespace {

// What a header has room for.
constexpr size_t ShortName = 15;

} // namespace

std::string_view memberNameOf(std::string_view file, const Request& request) {
  const std::string_view name = request.fullNames ? file : support::leafOf(file, request.pathStyle);
  return request.shortNames ? name.substr(0, ShortName) : name;
}

NamedMembers::NamedMembers(const arlib::Archive& archive, const Request& request)
    : m_Request(request) {
  for (ArchiveMember* member : archive.getMembers()) {
    if (!member->isAuxiliary()) m_Members.push_back(member);
  }
  std::stable_sort(m_Members.begin(), m_Members.end(),
                   [](const ArchiveMember* left, const ArchiveMember* right) {
                     return left->getName() < right->getName();
                   });
  m_Taken.resize(m_Members.size());
}

size_t NamedMembers::placeOf(std::string_view name) const {
  const auto first =
      std::partition_point(m_Members.begin(), m_Members.end(), [name](const ArchiveMember* member) {
        return member->getName() < name;
      });
  return static_cast<size_t>(first - m_Members.begin());
}

ArchiveMember* NamedMembers::memberAt(size_t place, std::string_view name) const {
  if (place >= m_Members.size() || m_Members[place]->getName() != name) return nullptr;
  return m_Members[place];
}

ArchiveMember* NamedMembers::find(std::string_view word) const {
  const std::string_view name = memberNameOf(word, m_Request);
  const uint32_t before = m_Request.instance == 0 ? 0 : m_Request.instance - 1;
  return memberAt(placeOf(name) + before, name);
}

ArchiveMember* NamedMembers::take(std::string_view word) {
  if (m_Request.instance != 0) return find(word);
  const std::string_view name = memberNameOf(word, m_Request);
  const size_t first = placeOf(name);
  if (first >= m_Members.size()) return nullptr;
  ArchiveMember* member = memberAt(first + m_Taken[first], name);
  if (member != nullptr) ++m_Taken[first];
  return member;
}

} // namespace quarn_ar
