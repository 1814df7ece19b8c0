// SPDX-License-Identifier: Apache-2.0
//
// Section groups: a word of flags, then the indexes of the members.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/group.h"
#include "elfext/src/object_module_reader.h"
#include "elfext/src/row_maximum.h"

#include <span>
#include <vector>

namespace elfext {

namespace {

constexpr uint32_t NoGroup = 0xFFFFFFFF;

const char* signatureOf(const ReadContext& context, uint32_t index) {
  const SectionHeader& header = context.sectionHeaders[index];
  const Symbol* symbol = context.symbols[header.link][header.info];
  return symbol == nullptr || symbol->getName() == nullptr ? "" : symbol->getName();
}

Group* createGroup(ReadContext& context, uint32_t index, uint32_t flags) {
  auto* section = static_cast<GroupSection*>(context.module.getSection(index));
  Group* group = context.module.createGroup(signatureOf(context, index), section->getName(), flags);
  group->setGroupSection(section);
  return group;
}

// Null groups are those of a read that is bound to fail. The owners are, by section, the sections
// of the groups that they are in.
bool readMember(ReadContext& context, uint32_t index, uint32_t member, Group* group,
                std::vector<uint32_t>& owners) {
  if (member >= context.sectionCount())
    return goOn(context.module, &ErrorHandler::groupMemberOutOfRange, index, member,
                context.lastSection());
  if (member == 0 && context.typeOf(0) == SHT_NULL) return true;
  if (owners[member] != NoGroup)
    return goOn(context.module, &ErrorHandler::sectionInTwoGroups, member, owners[member], index);
  owners[member] = index;
  if (group != nullptr) group->addMember(context.module.getSection(member));
  return true;
}

bool readGroup(ReadContext& context, uint32_t index, std::vector<uint32_t>& owners) {
  const SectionHeader& header = context.sectionHeaders[index];
  const uint8_t* words = header.size == 0 ? nullptr : context.view(header.offset, header.size);
  if (header.size != 0 && words == nullptr) return false;
  const uint32_t flags = words == nullptr ? 0 : context.get<uint32_t>(words);
  Group* group = context.overlap ? nullptr : createGroup(context, index, flags);
  const uint64_t count = context.rowCount(index);
  for (uint64_t i = 1; i < count; ++i) {
    const auto member = context.get<uint32_t>(words + i * 4);
    if (!readMember(context, index, member, group, owners)) return false;
  }
  return true;
}

// Where groups lie over one another, zeros are all that they may share without a report, since a
// member can be listed only once. So a group of zeros needs no second look.
bool checkOverlappingGroups(ReadContext& context, std::span<const uint32_t> groups,
                            std::vector<uint32_t>& owners) {
  const uint8_t* image = context.view(0, context.image.getSize());
  if (image == nullptr) return false;
  RowMaximum words(std::span(image, context.image.getSize()), 4,
                   [&context](const uint8_t* bytes) { return context.get<uint32_t>(bytes); });
  const bool areZerosIgnored = context.typeOf(0) == SHT_NULL;
  for (const uint32_t index : groups) {
    const uint64_t count = context.rowCount(index);
    const bool isEmpty =
        count < 2 || words.find(context.sectionHeaders[index].offset + 4, count - 1) == 0;
    if (isEmpty && (areZerosIgnored || count < 2)) continue;
    if (!readGroup(context, index, owners)) return false;
  }
  return true;
}

} // namespace

bool readGroups(ReadContext& context) {
  std::vector<uint32_t> groups;
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (context.typeOf(i) == SHT_GROUP && !context.isBroken[i]) groups.push_back(i);
  }
  if (groups.empty()) return true;
  std::vector<uint32_t> owners(context.sectionCount(), NoGroup);
  if (context.overlap) return checkOverlappingGroups(context, groups, owners);
  for (const uint32_t index : groups) {
    if (!readGroup(context, index, owners)) return false;
  }
  return true;
}

} // namespace elfext
