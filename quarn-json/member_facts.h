// SPDX-License-Identifier: Apache-2.0
//
// What is known of one member: the numbers of its header, and what its object says of itself. An
// object that can't be read is no error of the library, in which it may stand: it comes with the
// reason.
#pragma once

#include "arlib/interface/archive_member.h"
#include "arlib/interface/minor_variants.h"
#include "quarn-json/json_names.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace quarn_json {

class MemberReader {
public:
  // Names of members that may be builds of one module are kept in the region.
  MemberReader(elfext::ObjectOutline::Machines machines, alloclib::RegionGeneral& region);

  // All of the member, which has that place in the document's list. Nothing, after a report, if the
  // host can't give its bytes.
  [[nodiscard]] std::optional<Json> read(arlib::ArchiveMember& member, uint32_t place);

  // Of the members read so far those with names to publish.
  [[nodiscard]] const std::vector<arlib::HostingMember>& getHostingMembers() const {
    return m_HostingMembers;
  }
  [[nodiscard]] arlib::AttributeRecords& getRecords() { return m_Records; }

private:
  // False after a report.
  [[nodiscard]] bool addObject(arlib::ArchiveMember& member, uint32_t place, Json& row);
  [[nodiscard]] bool addOwnObject(const arlib::ArchiveMember& member,
                                  const std::optional<elfext::FullAttr>& attributes, Json& row);

  alloclib::RegionGeneral& m_Region;
  arlib::AttributeRecords m_Records;
  arlib::ObjectReading m_Reading;
  std::vector<arlib::HostingMember> m_HostingMembers;
};

} // namespace quarn_json
