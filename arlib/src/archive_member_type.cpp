// SPDX-License-Identifier: Apache-2.0
#include "arlib/interface/archive_member_type.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_member.h"
#include "checking/interface/checking.h"
#include "elfext/interface/format_recognizer.h"

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

// Objects are told from other files, but not read: none publishes a symbol.
bool ElfImageArchiveMemberType::getSymbolNames(ArchiveMember*, SymbolNameList& names,
                                               std::string&) const {
  names.clear();
  return true;
}

} // namespace arlib
