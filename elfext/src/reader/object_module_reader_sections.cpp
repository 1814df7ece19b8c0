// SPDX-License-Identifier: Apache-2.0
//
// From checked section headers the sections: their contents, which stay where they are until
// somebody looks, and their names.
//
// A section gets a view of the image at its sh_offset, which nobody reads before it is looked at,
// or, where the caller's selector says so, stays in the file that the module then keeps open.
// Extents were compared with the image by the tables. sh_size is taken as it stands for SHT_NOBITS,
// where no byte of the file answers for it, and a read reserves nothing for it.
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
    // What the read itself looks into, or what later steps make objects of: it is loaded in any
    // case.
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
    // From here on the record closes the file, and two owners would close it twice.
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
  // Auxiliary sections are closed to changes; mending is the one change that a read makes.
  ModuleBuilder::setAuxiliary(section, false);
  while (section.getSize() < mended.size())
    section.appendByte(mended[section.getSize()]);
  section.setByte(0, mended.front());
  section.setByte(section.getSize() - 1, mended.back());
  ModuleBuilder::setAuxiliary(section, true);
}

} // namespace

const char* ReadContext::stringsOf(uint32_t section) {
  // Names are views that live as long as the module, so they must not point into the read's own
  // mended copy.
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
    // In a second loop: a selector is asked about a module that has all its sections.
    if (hasFileBytes(header)) giveContents(context, *module.getSection(i), header);
  }
  for (const auto& [section, bytes] : context.mendedStrings)
    takeMendedStrings(*module.getSection(section), bytes);
}

void nameSections(ReadContext& context) {
  const uint32_t table = context.sectionNameTable;
  // No section has a name then, whatever its sh_name says: the handler has let that pass.
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
