// SPDX-License-Identifier: Apache-2.0
//
// The order in which a model is made, and the fields of Elf32_Ehdr and Elf64_Ehdr that it keeps.
// All checks of the tables come first and all making after them: a file that is rejected has cost
// no objects, and what is made needs no way back. Whoever asked for a read that fails clears the
// module.
#include "elfext/src/reader/object_module_reader.h"

#include "elfext/interface/elf_constants.h"
#include "elfext/src/model/module_builder.h"

#include <utility>

namespace elfext {

namespace {

// Clears the module and copies the header's fields in.
void beginModule(ReadContext& context, std::unique_ptr<ImageSource> image) {
  const FileHeader& header = context.fileHeader;
  ObjectModule& module = context.module;
  // Only now, as the checks of the header may leave the module as it was: for a file that is none
  // of ours nothing has changed.
  module.clear();
  // Behind the clearing, which lets go of the former image.
  ModuleBuilder::adoptImageSource(module, std::move(image));
  ModuleBuilder::setReadBuffer(module, context.lentBytes);
  module.setMachine(header.machine);
  module.setFileType(header.type);
  module.setElfClass(header.ident[EI_CLASS]);
  module.setDataEncoding(header.ident[EI_DATA]);
  module.setOsAbi(header.ident[EI_OSABI]);
  module.setAbiVersion(header.ident[EI_ABIVERSION]);
  module.setEntry(header.entry);
  module.setElfFlags(header.flags);
  module.setIdentVersion(header.ident[EI_VERSION]);
  module.setElfVersion(header.version);
  ModuleBuilder::setElfHeaderSize(module, header.ehsize);
  ModuleBuilder::setSectionHeaderOffset(module, header.shoff);
  ModuleBuilder::setProgramHeaderOffset(module, header.phoff);
  ModuleBuilder::setStoredSectionCount(module, header.shnum);
  ModuleBuilder::setStoredProgramHeaderCount(module, header.phnum);
  ModuleBuilder::setSectionHeaderEntrySize(module, header.shentsize);
  ModuleBuilder::setProgramHeaderEntrySize(module, header.phentsize);
  module.reserveSections(context.getSectionCount());
}

void makeObjects(ReadContext& context) {
  // Each step uses what the ones before it have made: names and links want all sections, symbols
  // their sections, relocations their symbols, groups both, notes the segments.
  createSections(context);
  nameSections(context);
  linkSections(context);
  createSymbols(context);
  giveRelocations(context);
  createGroups(context);
  placeRegions(context);
  takeDynamicTables(context);
  takeDebugOverlays(context);
  takeSegmentMaps(context);
}

// Build attributes come last of all, when everything that they may hang on is there.
bool readModule(ReadContext& context) {
  if (!checkTables(context)) return false;
  makeObjects(context);
  return giveBuildAttributes(context);
}

} // namespace

bool readObjectModule(ReadContext& context, std::unique_ptr<ImageSource> image) {
  ObjectModule& module = context.module;
  bool isForeign = false;
  if (!checkHeaders(context, isForeign)) return false;
  if (isForeign) return true;

  beginModule(context, std::move(image));
  // Names are views of the image, which the module now owns.
  ModuleBuilder::setNamesInBuffer(module, true);
  const bool isRead = readModule(context);
  ModuleBuilder::setNamesInBuffer(module, false);
  if (!isRead) return false;
  ModuleBuilder::setReadConditions(module, computeReadConditions(context));
  // The auxiliary sections hold the file's words, and not those that a writer of the model would
  // choose.
  ModuleBuilder::setAuxiliarySectionsUpToDate(module, false);
  return true;
}

} // namespace elfext
