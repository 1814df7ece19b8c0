// SPDX-License-Identifier: Apache-2.0
#include "arlib/interface/archive_member_type.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_member.h"
#include "checking/interface/checking.h"
#include "elfext/interface/debug_section_name.h"
#include "elfext/interface/deferred_contents_selector.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/error_string_capture.h"
#include "elfext/interface/format_recognizer.h"
#include "elfext/interface/object_module.h"

namespace arlib {

const UnknownArchiveMemberType* UnknownArchiveMemberType::getInstance() {
  static const UnknownArchiveMemberType instance;
  return &instance;
}

const SymbolTableArchiveMemberType* SymbolTableArchiveMemberType::getInstance() {
  static const SymbolTableArchiveMemberType instance;
  return &instance;
}

const FileNameTableArchiveMemberType* FileNameTableArchiveMemberType::getInstance() {
  static const FileNameTableArchiveMemberType instance;
  return &instance;
}

const ElfImageArchiveMemberType* ElfImageArchiveMemberType::getInstance() {
  static const ElfImageArchiveMemberType instance;
  return &instance;
}

const ArchiveMemberType* ArchiveMemberType::decide(const ArchiveMember* archiveMember) {
  QUARN_ASSERT(1, archiveMember != NULL);
  const ElfImageArchiveMemberType* elfImage = ElfImageArchiveMemberType::getInstance();
  if (elfImage->isElfImage(archiveMember)) return elfImage;
  return UnknownArchiveMemberType::getInstance();
}

const ArchiveMemberType* ArchiveMemberType::decide(std::span<const uint8_t> firstBytes) {
  if (elfext::isElfData(firstBytes)) return ElfImageArchiveMemberType::getInstance();
  return UnknownArchiveMemberType::getInstance();
}

bool ElfImageArchiveMemberType::isElfImage(const ArchiveMember* archiveMember) const {
  QUARN_ASSERT(1, archiveMember != NULL);
  if (archiveMember->hasContents()) return elfext::isElfData(archiveMember->getContents());
  const ArchiveMember::ContentsLocation& location = *archiveMember->getContentsLocation();
  return elfext::isElfFile(archiveMember->getArchive()->getHost(), location.fileName,
                           location.offset, archiveMember->getSize());
}

namespace {

// Any definition that is not local; debug symbols only if the archive wants them.
bool isPublished(const elfext::Symbol& symbol, bool includeDebugSymbols) {
  if (symbol.getCategory() == elfext::Symbol::Category_Undefined) return false;
  if (symbol.getBinding() == elfext::STB_LOCAL) return false;
  if (!includeDebugSymbols && symbol.getCategory() == elfext::Symbol::Category_Hosted &&
      elfext::isDebugSectionName(symbol.getHostedSymbolSection()->getName())) {
    return false;
  }
  return symbol.getName() != nullptr && *symbol.getName() != '\0';
}

} // namespace

bool ElfImageArchiveMemberType::getSymbolNames(ArchiveMember* archiveMember, SymbolNameList& names,
                                               std::string& reason) const {
  QUARN_ASSERT(1, archiveMember != NULL);
  elfext::ElfextErrorStringCapture capture;
  elfext::ObjectModule module;
  module.setObjectName(std::string(archiveMember->getName()).c_str());
  module.setErrorHandler(&capture);
  elfext::BySizeDeferredContentsSelector selector;
  reason.clear();
  if (!archiveMember->flushContents()) return false;
  if (!archiveMember->readInto(module, &selector)) {
    reason = capture.getText();
    return false;
  }
  archiveMember->discardContents();
  names.clear();
  const bool includeDebugSymbols = archiveMember->getArchive()->getIncludeDebugSymbols();
  for (const elfext::Symbol* symbol : module.getSymbols()) {
    if (isPublished(*symbol, includeDebugSymbols)) names.add(symbol->getName());
  }
  return true;
}

} // namespace arlib
