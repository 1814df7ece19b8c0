// SPDX-License-Identifier: Apache-2.0
//
// Section groups: a word of flags, then the indexes of the members.
//
// A section is in one group at most; the owners, by section, find a second one at once. Group
// sections have been checked to consist of whole words and to lie in the image. A hostile file
// repeats members, or lays a thousand group sections over the same zeros, each of which would be
// walked through.
#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/row_maximum.h"
#include "elfext/src/tables/object_tables.h"

#include <span>

namespace elfext {

namespace {

constexpr uint32_t NoGroup = 0xFFFFFFFF;

// The owners are, by section, the sections of the groups that they are in.
bool checkMember(ObjectTables& tables, uint32_t group, uint32_t member,
                 std::vector<uint32_t>& owners) {
  if (member >= tables.getSectionCount())
    return goOn(tables.reporter, &ErrorHandler::groupMemberOutOfRange, group, member,
                tables.getLastSection());
  // Zeros name the null section, which is nobody's member.
  if (member == 0 && tables.typeOf(0) == SHT_NULL) return true;
  if (owners[member] != NoGroup)
    return goOn(tables.reporter, &ErrorHandler::sectionInTwoGroups, member, owners[member], group);
  owners[member] = group;
  tables.groupMembers.push_back(member);
  return true;
}

bool checkGroup(ObjectTables& tables, uint32_t index, std::vector<uint32_t>& owners) {
  const SectionHeader& header = tables.sectionHeaders[index];
  const uint8_t* words = header.size == 0 ? nullptr : tables.view(header.offset, header.size);
  if (header.size != 0 && words == nullptr) return false;
  // All groups' members are in one array: a list for each group would cost more than its one or two
  // members.
  const size_t firstMember = tables.groupMembers.size();
  const uint64_t count = tables.rowCount(index);
  for (uint64_t i = 1; i < count; ++i) {
    if (!checkMember(tables, index, tables.get<uint32_t>(words + i * 4), owners)) return false;
  }
  tables.groups.push_back({.section = index,
                           .flags = words == nullptr ? 0 : tables.get<uint32_t>(words),
                           .firstMember = firstMember,
                           .memberCount = tables.groupMembers.size() - firstMember});
  return true;
}

// Where groups lie over one another, zeros are all that they may share without a report, since a
// member can be listed only once. So a group of zeros needs no second look.
bool checkOverlappingGroups(ObjectTables& tables, std::span<const uint32_t> groups,
                            std::vector<uint32_t>& owners) {
  const uint8_t* image = tables.view(0, tables.image.getSize());
  if (image == nullptr) return false;
  RowMaximum words(std::span(image, tables.image.getSize()), 4,
                   [&tables](const uint8_t* bytes) { return tables.get<uint32_t>(bytes); });
  const bool areZerosIgnored = tables.typeOf(0) == SHT_NULL;
  for (const uint32_t index : groups) {
    const uint64_t count = tables.rowCount(index);
    const bool isEmpty =
        count < 2 || words.find(tables.sectionHeaders[index].offset + 4, count - 1) == 0;
    if (isEmpty && (areZerosIgnored || count < 2)) continue;
    if (!checkGroup(tables, index, owners)) return false;
  }
  return true;
}

} // namespace

bool checkGroups(ObjectTables& tables) {
  std::vector<uint32_t> groups;
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (tables.typeOf(i) == SHT_GROUP && !tables.isBroken(i)) groups.push_back(i);
  }
  if (groups.empty()) return true;
  std::vector<uint32_t> owners(tables.getSectionCount(), NoGroup);
  // The read will end at the check of placement; what is reported before that must still be.
  if (tables.overlap) return checkOverlappingGroups(tables, groups, owners);
  tables.groups.reserve(groups.size());
  for (const uint32_t index : groups) {
    if (!checkGroup(tables, index, owners)) return false;
  }
  return true;
}

} // namespace elfext
