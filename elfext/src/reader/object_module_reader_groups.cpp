// SPDX-License-Identifier: Apache-2.0
//
// From checked group sections the groups.
//
// Flags, members and the signature symbol's index were checked with the tables: each member is in
// one group only. So what addMember asserts holds for every file.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/group.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

namespace {

const char* signatureOf(const ReadContext& context, uint32_t index) {
  const SectionHeader& header = context.sectionHeaders[index];
  // Null for symbol 0, which a group may name.
  const Symbol* symbol = context.symbols[header.link][header.info];
  return symbol == nullptr || symbol->getName() == nullptr ? "" : symbol->getName();
}

} // namespace

void createGroups(ReadContext& context) {
  ObjectModule& module = context.module;
  for (const GroupTable& table : context.groups) {
    auto* section = static_cast<GroupSection*>(module.getSection(table.section));
    Group* group =
        module.createGroup(signatureOf(context, table.section), section->getName(), table.flags);
    ModuleBuilder::setGroupSection(*group, section);
    for (const uint32_t member :
         std::span(context.groupMembers).subspan(table.firstMember, table.memberCount))
      group->addMember(module.getSection(member));
  }
}

} // namespace elfext
