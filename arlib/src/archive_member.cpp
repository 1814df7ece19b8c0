// SPDX-License-Identifier: Apache-2.0
//
// Where a member's bytes are: in memory, in a file, or in both, and then they are the same. They
// stay where they are until somebody wants them, and are read through the file that was opened
// first, so that a name which leads to another file meanwhile does no harm. Tables that were read
// are never freed before the archive is: names and symbols are views of their bytes.
#include "arlib/interface/archive_member.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_format.h"
#include "arlib/src/table_text.h"
#include "elfext/interface/error_handler.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/read_elf_file.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <string>
#include <type_traits>

namespace arlib {

static_assert(std::is_trivially_destructible_v<ArchiveMember>,
              "members die with their region, without a destructor run");

ArchiveMember::ArchiveMember(Archive* archive)
    : m_Type(UnknownArchiveMemberType::getInstance()), m_Archive(archive) {}

uint32_t ArchiveMember::getOffset() const {
  QUARN_ASSERT(1, m_Archive->m_ArchiveMemberOffsetsUpToDate);
  return m_Offset;
}

bool ArchiveMember::isAuxiliary() const {
  QUARN_ASSERT(1, m_Type != NULL);
  return m_Type == SymbolTableArchiveMemberType::getInstance() ||
         m_Type == FileNameTableArchiveMemberType::getInstance();
}

void ArchiveMember::setDate(int64_t date) {
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  m_Date = date;
}

void ArchiveMember::setUid(uint32_t uid) {
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  m_Uid = uid;
}

void ArchiveMember::setGid(uint32_t gid) {
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  m_Gid = gid;
}

void ArchiveMember::setMode(uint32_t mode) {
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  m_Mode = mode;
}

void ArchiveMember::setName(std::string_view name) {
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  QUARN_ASSERT(1, !isAuxiliary());
  if (name == m_Name) return;
  m_Name = std::string_view(m_Archive->copyToRegion(name), name.size());
  m_NameIsLeaf = false;
  m_Archive->noteEdit(Edit::NewName);
}

std::span<const uint8_t> ArchiveMember::getContents() const {
  QUARN_ASSERT(1, m_Contents.has_value());
  return {m_Contents->bytes, m_Contents->size};
}

const std::optional<ArchiveMember::ContentsLocation>& ArchiveMember::getContentsLocation() const {
  QUARN_ASSERT(1, m_Type != NULL);
  return m_ContentsLocation;
}

std::span<uint8_t> ArchiveMember::getModifiableContents() {
  QUARN_ASSERT(1, m_Type == NULL);
  QUARN_ASSERT(1, m_Contents.has_value());
  return {m_Contents->bytes, m_Contents->size};
}

uint32_t ArchiveMember::getSymbolIndex(const Symbol* symbol) const {
  return m_Archive->getSymbolIndex(symbol);
}

std::span<uint8_t> ArchiveMember::replaceContents(uint32_t size) {
  if (m_Contents && m_Contents->capacity >= size && !m_ContentsAreViewed) {
    m_Contents->size = size;
    return {m_Contents->bytes, size};
  }
  freeContents();
  const uint32_t capacity = std::max(size, 1u);
  m_Contents = Contents{static_cast<uint8_t*>(m_Archive->m_ContainerRegion->allocate(capacity)),
                        size, capacity};
  return {m_Contents->bytes, size};
}

void ArchiveMember::takeMade(const TableText* made) {
  freeContents();
  m_Size = static_cast<uint32_t>(made->getSize());
  m_Made = made;
  releaseContentsLocation();
}

void ArchiveMember::freeContents() {
  if (m_Contents && m_ContentsAreViewed) {
    m_Archive->m_ViewedBytes.emplace_back(m_Contents->bytes, m_Contents->capacity);
  } else if (m_Contents) {
    m_Archive->m_ContainerRegion->discard(m_Contents->bytes, m_Contents->capacity);
  }
  m_Contents.reset();
  m_ContentsAreViewed = false;
}

void ArchiveMember::setLocation(const std::shared_ptr<support::SourceFile>& file, uint32_t offset,
                                bool isTemporary) {
  support::SourceFile* held = m_Archive->hold(file);
  m_ContentsLocation = ContentsLocation{held, held->getName(), offset, isTemporary};
}

bool ArchiveMember::readContents(std::span<uint8_t> bytes) {
  support::SourceFile& file = *m_ContentsLocation->file;
  size_t done = 0;
  int error = file.readAt(bytes, m_ContentsLocation->offset, done);
  const bool isCutShort = error == 0 && done < bytes.size();
  if (error == 0 && !isCutShort) error = file.checkUnchanged();
  if (error == 0 && !isCutShort) return true;
  return m_Archive->fail(&ErrorHandler::reportReadError, file.getName(), error);
}

bool ArchiveMember::loadContents() {
  if (m_Contents) return true;
  if (m_Made != nullptr) {
    TableText::Place front;
    m_Made->take(replaceContents(m_Size), front);
    return true;
  }
  QUARN_ASSERT(1, m_ContentsLocation.has_value());
  if (readContents(replaceContents(m_Size))) return true;
  freeContents();
  return false;
}

bool ArchiveMember::flushContents() {
  if (m_ContentsLocation) return true;
  loadContents();
  support::Host& host = m_Archive->getHost();
  std::string name;
  support::FileHandle file;
  const int error =
      m_Archive->m_SourceFiles.openOther([&] { return host.createUnnamedTemporary(name, file); });
  if (error != 0) {
    return m_Archive->fail(&ErrorHandler::reportWriteError, name.c_str(), error);
  }
  const std::span<const uint8_t> bytes = getContents();
  int writeError = host.write(file, bytes.first(std::min<size_t>(m_Size, bytes.size())));
  support::FileStatus status;
  if (writeError == 0) writeError = host.flush(file);
  if (writeError == 0) writeError = host.statusOf(file, status);
  const int closeError = host.close(file);
  if (writeError == 0 && closeError == 0) {
    setLocation(m_Archive->m_SourceFiles.remember(name.c_str(), status), 0, true);
    return true;
  }
  // Of the two failures the first one is told; a temporary that can't be removed is only litter.
  [[maybe_unused]] const int removeError = host.remove(name.c_str());
  if (writeError != 0) {
    return m_Archive->fail(&ErrorHandler::reportWriteError, name.c_str(), writeError);
  }
  return m_Archive->fail(&ErrorHandler::reportCloseError, name.c_str(), closeError);
}

bool ArchiveMember::discardContents() {
  flushContents();
  freeContents();
  return true;
}

bool ArchiveMember::determineType() {
  QUARN_ASSERT(1, m_Type == NULL);
  // The test looks at the contents or their location, which want a member of some type.
  m_Type = UnknownArchiveMemberType::getInstance();
  m_Type = ArchiveMemberType::decide(this);
  return m_Type != nullptr;
}

void ArchiveMember::setContents(const void* data, uint32_t size) {
  QUARN_ASSERT(1, data != NULL);
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  QUARN_ASSERT(1, m_Type != NULL);
  // The data may be a part of the old contents.
  std::memmove(replaceContents(size).data(), data, size);
  m_Size = size;
  m_Made = nullptr;
  m_Type = ArchiveMemberType::decide(getContents());
  m_Archive->noteEdit(Edit::NewBytes);
  m_Modified = true;
  releaseContentsLocation();
}

void ArchiveMember::takeFile(const std::shared_ptr<support::SourceFile>& file, uint32_t offset,
                             uint32_t size) {
  freeContents();
  m_Made = nullptr;
  // A temporary file of the old contents is left alone: only releaseContentsLocation deletes.
  setLocation(file, offset, false);
  const support::FileStatus& status = file->getStatus();
  m_Size = size;
  m_Date = status.modificationTime;
  m_Uid = static_cast<uint32_t>(status.uid);
  m_Gid = static_cast<uint32_t>(status.gid);
  m_Mode = status.mode;
  m_Modified = true;
}

bool ArchiveMember::setContentsFromFile(const char* fileName) {
  QUARN_ASSERT(1, fileName != NULL);
  return setContentsFromFile(fileName, probeFile(m_Archive->m_SourceFiles, fileName));
}

bool ArchiveMember::setContentsFromFile(const char* fileName, const FileProbe& probe) {
  QUARN_ASSERT(1, m_Type != NULL);
  if (const int error = probe.getRefusal(); error != 0) {
    return m_Archive->fail(&ErrorHandler::reportReadError, fileName, error);
  }
  takeFile(probe.file, 0, static_cast<uint32_t>(probe.status.size));
  m_Archive->noteEdit(Edit::NewFile);
  m_Type = ArchiveMemberType::decide(probe.getFirstBytes());
  return true;
}

bool ArchiveMember::setContentsFromFileRegion(const char* fileName, uint32_t offset,
                                              uint32_t size) {
  QUARN_ASSERT(1, fileName != NULL);
  QUARN_ASSERT(1, m_Type != NULL);
  FileProbe probe;
  if (!m_Archive->openRegion(fileName, std::nullopt, offset, size, probe)) return false;
  takeFile(probe.file, offset, size);
  m_Archive->noteEdit(Edit::NewFile);
  m_Type = ArchiveMemberType::decide(probe.getFirstBytes());
  return true;
}

void ArchiveMember::setContentsFromMember(const ArchiveMember& source) {
  QUARN_ASSERT(1, m_Type != NULL);
  const ContentsLocation& location = *source.getContentsLocation();
  takeFile(location.file->shared_from_this(), location.offset, source.m_Size);
  m_Archive->noteEdit(Edit::NewFile);
  takeHeaderNumbers(source);
  m_Type = source.m_Type;
}

void ArchiveMember::takeHeaderNumbers(const ArchiveMember& source) {
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  m_Date = source.m_Date;
  m_Uid = source.m_Uid;
  m_Gid = source.m_Gid;
  m_Mode = source.m_Mode;
}

bool ArchiveMember::readInto(elfext::ObjectModule& module,
                             elfext::DeferredContentsSelector* selector) const {
  const ContentsLocation& location = *m_ContentsLocation;
  return elfext::readElfFile(location.file->shared_from_this(), location.offset, m_Size, module,
                             selector);
}

bool ArchiveMember::readObjectModule(elfext::ObjectModule& module,
                                     elfext::DeferredContentsSelector* selector) {
  QUARN_ASSERT(1, m_Type != NULL);
  if (!flushContents()) return false;
  return readInto(module, selector);
}

std::unique_ptr<elfext::ObjectModule>
ArchiveMember::createObjectModule(elfext::DeferredContentsSelector* selector) {
  auto module = std::make_unique<elfext::ObjectModule>();
  if (!readObjectModule(*module, selector)) return nullptr;
  return module;
}

bool ArchiveMember::clearType() {
  QUARN_ASSERT(1, !isAuxiliary());
  QUARN_ASSERT(1, !m_Archive->isReadOnly());
  QUARN_ASSERT(1, m_Type != NULL);
  const bool isLoaded = loadContents();
  // Without its bytes in memory the member must keep its location, or it would have neither.
  if (isLoaded) releaseContentsLocation();
  m_Type = nullptr;
  m_Archive->noteEdit(Edit::NewBytes);
  m_Modified = true;
  return isLoaded;
}

bool ArchiveMember::releaseContentsLocation() {
  if (!m_ContentsLocation) return true;
  const ContentsLocation location = *m_ContentsLocation;
  m_ContentsLocation.reset();
  if (!location.isTemporary) return true;
  const int error = m_Archive->getHost().remove(location.fileName);
  if (error == 0) return true;
  return m_Archive->fail(&ErrorHandler::reportDeleteError, location.fileName, error);
}

} // namespace arlib
