// SPDX-License-Identifier: Apache-2.0
//
// What an object member publishes: its outline is read in place, and its names go to the symbol
// table. Which symbols count is decided here: any definition that is not local, outside debug
// sections unless they are wanted, with a name.
//
// A hostile object lets thousands of symbols share the bytes of one long name. Names are kept as
// views of one copy, so that they cost no more than the object, and of names that share bytes only
// a bounded number is read as decoration.
#include "arlib/interface/archive_member_type.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_member.h"
#include "checking/interface/checking.h"
#include "elfext/interface/attribute_relations.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/debug_section_name.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/format_recognizer.h"
#include "elfext/interface/object_outline.h"
#include "support/interface/shared_texts.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <span>
#include <vector>

namespace arlib {

const UnknownArchiveMemberType* UnknownArchiveMemberType::getInstance() {
  static const UnknownArchiveMemberType Instance;
  return &Instance;
}

const SymbolTableArchiveMemberType* SymbolTableArchiveMemberType::getInstance() {
  static const SymbolTableArchiveMemberType Instance;
  return &Instance;
}

const FileNameTableArchiveMemberType* FileNameTableArchiveMemberType::getInstance() {
  static const FileNameTableArchiveMemberType Instance;
  return &Instance;
}

const ElfImageArchiveMemberType* ElfImageArchiveMemberType::getInstance() {
  static const ElfImageArchiveMemberType Instance;
  return &Instance;
}

namespace {

using FirstBytes = std::array<uint8_t, elfext::RecognizedBytes>;

// As many as there are. Nothing, after a report, if the host can't give them, or no longer: of a
// file that was cut meanwhile nobody knows what its members are.
std::optional<std::span<const uint8_t>> firstBytesOf(const ArchiveMember& archiveMember,
                                                     FirstBytes& bytes) {
  if (archiveMember.hasContents()) return archiveMember.getContents();
  const ArchiveMember::ContentsLocation& location = *archiveMember.getContentsLocation();
  const std::span<uint8_t> wanted =
      std::span(bytes).first(std::min<size_t>(archiveMember.getSize(), bytes.size()));
  size_t done = 0;
  const int error = location.file->readAt(wanted, location.offset, done);
  if (error == 0 && done == wanted.size()) return wanted;
  archiveMember.getArchive()->fail(&ErrorHandler::reportReadError, location.fileName, error);
  return std::nullopt;
}

} // namespace

const ArchiveMemberType* ArchiveMemberType::decide(const ArchiveMember* archiveMember) {
  QUARN_ASSERT(1, archiveMember != NULL);
  FirstBytes buffer;
  const std::optional<std::span<const uint8_t>> bytes = firstBytesOf(*archiveMember, buffer);
  return bytes ? decide(*bytes) : nullptr;
}

const ArchiveMemberType* ArchiveMemberType::decide(std::span<const uint8_t> firstBytes) {
  if (elfext::isElfData(firstBytes)) return ElfImageArchiveMemberType::getInstance();
  return UnknownArchiveMemberType::getInstance();
}

bool ElfImageArchiveMemberType::isElfImage(const ArchiveMember* archiveMember) const {
  QUARN_ASSERT(1, archiveMember != NULL);
  FirstBytes buffer;
  const std::optional<std::span<const uint8_t>> bytes = firstBytesOf(*archiveMember, buffer);
  return bytes && elfext::isElfData(*bytes);
}

namespace {

using OutlinedSymbols = std::span<const elfext::ObjectOutline::OutlinedSymbol>;

// Any definition that is not local; debug symbols only if the archive wants them.
bool isPublished(const elfext::ObjectOutline::OutlinedSymbol& symbol, bool includeDebugSymbols) {
  if (symbol.binding == elfext::STB_LOCAL) return false;
  if (symbol.category == elfext::Symbol::Category_Undefined) return false;
  if (!includeDebugSymbols && elfext::isDebugSectionName(symbol.sectionName)) return false;
  return symbol.name != nullptr && *symbol.name != '\0';
}

// For names that have bytes in common: these are copied once.
void setSharedNames(std::span<const char* const> published, SymbolNameList& names) {
  names.clear();
  const auto copy = [&names](std::string_view whole) { return names.copy(whole); };
  for (const std::string_view shared : support::copyShared(published, copy))
    names.addCopied(shared);
}

// Names that are more bytes than their object has in all must have bytes in common.
void addNames(std::span<const char* const> published, uint64_t objectSize, SymbolNameList& names) {
  names.reserve(static_cast<uint32_t>(published.size()));
  uint64_t bytes = 0;
  for (const char* name : published) {
    const std::string_view text = name;
    bytes += text.size();
    if (bytes > objectSize) return setSharedNames(published, names);
    names.add(text);
  }
}

// All that the object's decoration symbols say, whatever else the symbols are. False if there are
// none. Texts of a good object are no longer than the object; of those that share their bytes
// thousands of times over, only the first ones are read.
bool mergeDecorations(OutlinedSymbols symbols, uint64_t objectSize, AttributeRecords& records,
                      elfext::FullAttr& attributes) {
  constexpr std::string_view Prefix = elfext::DecorationPrefix;
  constexpr uint64_t AlwaysRead = 0x100000;
  uint64_t left = std::max<uint64_t>(2 * objectSize, AlwaysRead);
  bool isFirst = true;
  for (const elfext::ObjectOutline::OutlinedSymbol& symbol : symbols) {
    const char* name = symbol.name;
    // Nearly all names differ in their first character.
    if (name == nullptr || *name != Prefix.front()) continue;
    if (std::strncmp(name, Prefix.data(), Prefix.size()) != 0) continue;
    const std::string_view text(name + Prefix.size(), strnlen(name + Prefix.size(), left + 1));
    if (text.size() > left) break;
    left -= text.size();
    const elfext::FullAttr& stated = records.get(text);
    if (isFirst)
      attributes = stated;
    else
      elfext::mergeFullAttr(attributes, attributes, stated);
    isFirst = false;
  }
  return !isFirst;
}

// What the object says of itself: in its decoration symbols, or as a whole. Then an object that
// says nothing is of the default kind.
bool findAttributes(const elfext::ObjectOutline& outline, OutlinedSymbols symbols,
                    uint64_t objectSize, bool useObjectAttributes, AttributeRecords& records,
                    elfext::FullAttr& attributes) {
  if (!useObjectAttributes) return mergeDecorations(symbols, objectSize, records, attributes);
  const elfext::FullAttr* own = outline.getOwnAttributes();
  attributes = own == nullptr ? elfext::DefaultFullAttr : *own;
  return true;
}

void findNames(OutlinedSymbols symbols, const ArchiveMember& archiveMember, SymbolNameList& names) {
  const bool includeDebugSymbols = archiveMember.getArchive()->getIncludeDebugSymbols();
  std::vector<const char*> published;
  published.reserve(symbols.size());
  for (const elfext::ObjectOutline::OutlinedSymbol& symbol : symbols) {
    if (isPublished(symbol, includeDebugSymbols)) published.push_back(symbol.name);
  }
  names.clear();
  addNames(published, archiveMember.getSize(), names);
}

} // namespace

bool ElfImageArchiveMemberType::readOutline(ArchiveMember& archiveMember,
                                            elfext::ElfextErrorStringCapture& failure,
                                            bool wantsAttributes, elfext::ObjectOutline& outline) {
  failure = {};
  if (!archiveMember.flushContents()) return false;
  const ArchiveMember::ContentsLocation& location = *archiveMember.getContentsLocation();
  if (!outline.read(location.file->shared_from_this(), location.offset, archiveMember.getSize(),
                    &failure, archiveMember.getName(), wantsAttributes)) {
    reportHostFailure(archiveMember, failure);
    return false;
  }
  archiveMember.discardContents();
  return true;
}

bool ElfImageArchiveMemberType::reportHostFailure(const ArchiveMember& archiveMember,
                                                  elfext::ElfextErrorStringCapture& failure) {
  if (!failure.isUnreadable()) return false;
  const int error = failure.getHostError();
  failure = {};
  archiveMember.getArchive()->fail(&ErrorHandler::reportReadError,
                                   archiveMember.getContentsLocation()->fileName, error);
  return true;
}

bool ElfImageArchiveMemberType::getSymbolNames(ArchiveMember* archiveMember, SymbolNameList& names,
                                               std::string& reason) const {
  std::optional<elfext::FullAttr> attributes;
  AttributeRecords records(elfext::parseAttributeString);
  ObjectReading reading{records};
  return getPublished(archiveMember, reading, names, attributes, reason);
}

bool ElfImageArchiveMemberType::getPublished(ArchiveMember* archiveMember, ObjectReading& reading,
                                             SymbolNameList& names,
                                             std::optional<elfext::FullAttr>& attributes,
                                             std::string& reason) const {
  QUARN_ASSERT(1, archiveMember != NULL);
  const bool useObjectAttributes = archiveMember->getArchive()->getUseObjectBuildAttributes();
  elfext::ObjectOutline& outline = reading.outline;
  reason.clear();
  attributes.reset();
  if (!readOutline(*archiveMember, reading.failure, useObjectAttributes, outline)) {
    reason = reading.failure.getText();
    return false;
  }
  const OutlinedSymbols symbols = outline.getSymbols();
  findNames(symbols, *archiveMember, names);
  elfext::FullAttr stated;
  if (findAttributes(outline, symbols, archiveMember->getSize(), useObjectAttributes,
                     reading.records, stated))
    attributes = stated;
  return true;
}

bool ElfImageArchiveMemberType::getBuildAttributes(ArchiveMember* archiveMember,
                                                   elfext::FullAttr& attributes,
                                                   bool useObjectAttributes) const {
  QUARN_ASSERT(1, archiveMember != NULL);
  AttributeRecords records(elfext::parseAttributeString);
  ObjectReading reading{records};
  elfext::ObjectOutline& outline = reading.outline;
  if (!readOutline(*archiveMember, reading.failure, useObjectAttributes, outline)) return false;
  return findAttributes(outline, outline.getSymbols(), archiveMember->getSize(),
                        useObjectAttributes, reading.records, attributes);
}

} // namespace arlib
