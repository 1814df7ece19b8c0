// SPDX-License-Identifier: Apache-2.0
//
// From checked section headers the sections: their contents, which stay where they are until
// somebody looks, and their names.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/deferred_contents.h"
#include "elfext/interface/deferred_contents_selector.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/reference_counted_file.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

namespace {

bool mayBeDeferred(uint32_t type) {
  switch (type) {
  case SHT_SYMTAB:
  case SHT_STRTAB:
  case SHT_RELA:
  case SHT_HASH:
  case SHT_DYNAMIC:
  case SHT_NOTE:
  case SHT_REL:
  case SHT_DYNSYM:
  case SHT_GROUP:
  case SHT_SYMTAB_SHNDX:
  case SHT_GNU_verdef:
  case SHT_GNU_verneed:
  case SHT_GNU_versym:
  case SHT_ZEV_PREEMPTMAP:
  case SHT_ZEV_ATTRIBUTES:
  case SHT_ZEV_DEBUGOVERLAY:
    return false;
  default:
    return true;
  }
}

void deferSection(ReadContext& context, Section& section, const SectionHeader& header) {
  DeferralFile& deferral = *context.deferral;
  alloclib::RegionGeneral& region = section.getObjectModule()->getObjectRegion();
  if (deferral.shared == nullptr) {
    deferral.shared = alloclib::create<ReferenceCountedFile>(region, deferral.host, deferral.file);
    deferral.shared->addReference();
    context.image.leaveFileOpen();
  }
  ModuleBuilder::deferContents(
      section, alloclib::create<DeferredContents>(region, deferral.shared, true, header));
}

void giveContents(ReadContext& context, Section& section, const SectionHeader& header) {
  ModuleBuilder::adoptSize(section, header.size);
  if (context.deferral != nullptr && mayBeDeferred(header.type) &&
      context.deferral->selector.isDeferred(section, header.size))
    deferSection(context, section, header);
  else
    ModuleBuilder::getBuffer(section).defer(context.image, header.offset, header.size);
}

// The section of a string table gets what differs in the table of the read: its ends.
void takeMendedStrings(Section& section, std::span<const uint8_t> mended) {
  ModuleBuilder::setAuxiliary(section, false);
  while (section.getSize() < mended.size())
    section.appendByte(mended[section.getSize()]);
  section.setByte(0, mended.front());
  section.setByte(section.getSize() - 1, mended.back());
  ModuleBuilder::setAuxiliary(section, true);
}

} // namespace

const char* ReadContext::stringsOf(uint32_t section) {
  const uint8_t* bytes = mendedStrings.contains(section)
                             ? ModuleBuilder::getBuffer(*module.getSection(section)).getContents()
                             : viewSection(section);
  return reinterpret_cast<const char*>(bytes);
}

void createSections(ReadContext& context) {
  ObjectModule& module = context.module;
  for (const SectionHeader& header : context.sectionHeaders) {
    Section& section =
        *module.createSectionOfType(nullptr, header.type, static_cast<uint32_t>(header.flags));
    ModuleBuilder::adoptHeader(section, header);
  }
  QUARN_ASSERT(1, module.getSectionCount() == context.sectionHeaders.size());
  for (uint32_t i = 0; i < context.getSectionCount(); ++i) {
    const SectionHeader& header = context.sectionHeaders[i];
    if (header.type == SHT_NOBITS) ModuleBuilder::adoptSize(*module.getSection(i), header.size);
    if (hasFileBytes(header)) giveContents(context, *module.getSection(i), header);
  }
  for (const auto& [section, bytes] : context.mendedStrings)
    takeMendedStrings(*module.getSection(section), bytes);
}

void nameSections(ReadContext& context) {
  const uint32_t table = context.sectionNameTable;
  if (table == 0) return;
  QUARN_ASSERT(1, context.module.getSection(table)->getType() == SHT_STRTAB);
  ModuleBuilder::markSectionNameTable(
      *static_cast<StringTableSection*>(context.module.getSection(table)));
  const char* names = context.stringsOf(table);
  for (uint32_t i = 0; i < context.getSectionCount(); ++i) {
    const uint32_t offset = context.sectionHeaders[i].name;
    if (offset != 0) ModuleBuilder::adoptName(*context.module.getSection(i), names + offset);
  }
}

} // namespace elfext
