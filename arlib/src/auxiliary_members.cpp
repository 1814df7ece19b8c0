// SPDX-License-Identifier: Apache-2.0
#include "arlib/src/auxiliary_members.h"

#include "arlib/interface/archive_format.h"
#include "elfext/interface/attribute_string.h"

#include <cerrno>
#include <cstring>
#include <string>

namespace arlib {

namespace {

constexpr size_t ScratchRegionSize = 0x100000;

bool hasLongName(const ArchiveMember* member) {
  return !member->isAuxiliary() && member->getName().size() > MaximumShortName;
}

} // namespace

bool Archive::updateAuxiliaryMembers() {
  return AuxiliaryMembers(*this).update();
}

AuxiliaryMembers::AuxiliaryMembers(Archive& archive)
    : m_Archive(archive),
      m_Region(alloclib::RegionGeneral::Create(ScratchRegionSize,
                                               "arlib::Archive::updateAuxiliaryMembers() region")),
      m_Records(elfext::parseAttributeString), m_SymbolHostingMembers(m_Region.get()),
      m_Output(m_Region.get()) {}

bool AuxiliaryMembers::update() {
  for (ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    if (member->m_Type == nullptr) member->determineType();
  }
  if (!m_Archive.m_FileNameTableUpToDate) {
    m_Archive.m_ArchiveMemberOffsetsUpToDate = false;
    if (!updateFileNameTable()) return false;
    if (hasLayoutChanged()) m_Archive.m_SymbolTableUpToDate = false;
  }
  if (!m_Archive.m_SymbolTableUpToDate) {
    m_Archive.m_ArchiveMemberOffsetsUpToDate = false;
    if (!updateSymbolTable()) return false;
  }
  putTablesInPlace();
  computeOffsets();
  return true;
}

// Moving a table to the front makes no table stale that was not stale before. It does shift the
// members: a long-name table that came second in the file changes places with the first.
void AuxiliaryMembers::putTablesInPlace() {
  uint32_t place = 0;
  for (ArchiveMember* table : {m_Archive.m_SymbolTable, m_Archive.m_FileNameTable}) {
    if (table == nullptr) continue;
    if (m_Archive.m_ArchiveMembers[place] != table) {
      m_Archive.moveMember(table, place);
      m_Archive.m_ArchiveMemberOffsetsUpToDate = false;
    }
    ++place;
  }
  m_Archive.m_FileNameTableUpToDate = true;
  m_Archive.m_SymbolTableUpToDate = true;
}

// A long-name table that comes, goes or changes its size shifts all members behind it, and with
// them what the symbol table's offsets lead to. As long as the table counts as up to date, each
// member's offset is the one that the table knows.
bool AuxiliaryMembers::hasLayoutChanged() const {
  const ArchiveMember* symbols = m_Archive.m_SymbolTable;
  if (symbols == nullptr) return false;
  uint64_t cursor = nextHeaderOffset(ArchiveMagic.size(), symbols->m_Size);
  if (const ArchiveMember* names = m_Archive.m_FileNameTable; names != nullptr) {
    cursor = nextHeaderOffset(cursor, names->m_Size);
  }
  for (const ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    if (member->isAuxiliary()) continue;
    if (member->m_Offset != cursor) return true;
    cursor = nextHeaderOffset(cursor, member->m_Size);
  }
  return false;
}

void AuxiliaryMembers::computeOffsets() {
  if (m_Archive.m_ArchiveMemberOffsetsUpToDate) return;
  uint64_t offset = ArchiveMagic.size();
  for (ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    // A layout that doesn't fit in 32 bits is refused by the writer, which sums in 64.
    member->m_Offset = static_cast<uint32_t>(offset);
    offset = nextHeaderOffset(offset, member->m_Size);
  }
  m_Archive.m_ArchiveMemberOffsetsUpToDate = true;
}

ArchiveMember* AuxiliaryMembers::appendTable(const ArchiveMemberType* type) {
  ArchiveMember* table = m_Archive.appendMember("");
  table->m_Type = type;
  table->replaceContents(0);
  return table;
}

// Bytes that nobody wanted at the read are not read to be replaced.
bool AuxiliaryMembers::resizeTable(ArchiveMember* table, uint32_t size) {
  const bool isTaken = table != m_Archive.m_SymbolTable || m_Archive.m_AreSymbolsWanted;
  if (isTaken && !table->loadContents()) return false;
  table->replaceContents(size);
  table->releaseContentsLocation();
  table->m_Size = size;
  return true;
}

// The object is only forgotten until the archive is cleared: names and symbols may be views of its
// bytes.
void AuxiliaryMembers::forgetTable(ArchiveMember*& table) {
  if (table == nullptr) return;
  m_Archive.m_ArchiveMembers.remove(m_Archive.getMemberIndex(table));
  m_Archive.m_SortedArchiveMembersUpToDate = false;
  m_Archive.m_ForgottenTables.push_back(table);
  table = nullptr;
}

// Rewritten whole, since the offsets in all headers of long-named members point into it.
bool AuxiliaryMembers::updateFileNameTable() {
  uint64_t required = 0;
  for (const ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    if (hasLongName(member)) required += member->m_Name.size() + LongNameTerminator.size();
  }
  if (required == 0) {
    forgetTable(m_Archive.m_FileNameTable);
    m_Archive.m_FileNameTableUpToDate = true;
    return true;
  }
  if (required > MaximumFileSize) {
    return m_Archive.fail(&ErrorHandler::reportWriteError, m_Archive.getFileName(), EFBIG);
  }
  ArchiveMember*& table = m_Archive.m_FileNameTable;
  if (table == nullptr) table = appendTable(FileNameTableArchiveMemberType::getInstance());
  const auto requiredFileNameTableSize = static_cast<uint32_t>(required);
  if (!resizeTable(table, requiredFileNameTableSize)) return false;
  uint8_t* bytes = table->m_Contents->bytes;
  uint32_t fileNameTableOffset = 0;
  for (ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    if (!hasLongName(member)) continue;
    member->m_FileNameTableOffset = fileNameTableOffset;
    for (const std::string_view part : {member->m_Name, LongNameTerminator}) {
      std::memcpy(bytes + fileNameTableOffset, part.data(), part.size());
      fileNameTableOffset += static_cast<uint32_t>(part.size());
    }
  }
  QUARN_ASSERT(1, fileNameTableOffset == requiredFileNameTableSize);
  m_Archive.m_FileNameTableUpToDate = true;
  return true;
}

void AuxiliaryMembers::removeSymbolTable() {
  forgetTable(m_Archive.m_SymbolTable);
  m_Archive.m_SymbolTableUpToDate = true;
}

bool AuxiliaryMembers::updateSymbolTable() {
  QUARN_ASSERT(1, m_Archive.m_FileNameTableUpToDate);
  if (m_Archive.m_SymbolTableMode == SymbolTableMode::Never) {
    removeSymbolTable();
    return true;
  }
  collectSymbolHostingMembers();
  if (m_SymbolHostingMembers.getSize() == 0 &&
      m_Archive.m_SymbolTableMode == SymbolTableMode::IfSymbols) {
    removeSymbolTable();
    return true;
  }
  if (!addVariantSymbols()) return false;
  addPlainSymbols();
  return makeSymbolTable(computeTableSize());
}

// A member that can't be read is told of and has no entries. A handler that says to stop there
// leaves the table with the members collected so far.
void AuxiliaryMembers::collectSymbolHostingMembers() {
  const elfext::FullAttr nothingStated = m_Records.get("");
  ObjectReading reading{m_Records};
  QUARN_ASSERT(1, m_SymbolHostingMembers.getSize() == 0);
  for (ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    if (!member->m_Type->isObjectModule()) continue;
    const auto* type = static_cast<const ObjectModuleArchiveMemberType*>(member->m_Type);
    auto* names = alloclib::create<SymbolNameList>(*m_Region, m_Region.get());
    std::optional<elfext::FullAttr> attributes;
    std::string reason;
    if (!type->getPublished(member, reading, *names, attributes, reason) &&
        !m_Archive.goOn(&ErrorHandler::reportUnreadableMemberSymbols, *member, reason)) {
      return;
    }
    if (names->getSize() == 0) continue;
    m_SymbolHostingMembers.append(
        {member, names, NamesKey(*names), attributes.value_or(nothingStated)});
  }
}

// They come before all others. A name of theirs may stand in the table more than once, also where
// other names may not.
bool AuxiliaryMembers::addVariantSymbols() {
  m_IsMinorVariant.resize(m_SymbolHostingMembers.getSize());
  MinorVariants variants(m_Archive, *m_Region, m_Records);
  std::vector<HostingMember> members;
  for (const VariantGroup& group : findMinorVariants(m_SymbolHostingMembers.span())) {
    members.clear();
    for (const uint32_t index : group) {
      m_IsMinorVariant[index] = true;
      members.push_back(m_SymbolHostingMembers[index]);
    }
    if (!variants.addSymbols(members, m_Output)) return false;
  }
  return true;
}

void AuxiliaryMembers::addPlainSymbols() {
  std::unordered_set<std::string_view> seenNames;
  for (uint32_t index = 0; index < m_SymbolHostingMembers.getSize(); ++index) {
    if (m_IsMinorVariant[index]) continue;
    const HostingMember& hosting = m_SymbolHostingMembers[index];
    const SymbolNameList* names = hosting.names;
    if (m_Archive.m_UniqueSymbolsOnly) names = dropSeenNames(*names, seenNames);
    m_Output.append({hosting.member, names});
  }
}

const SymbolNameList* AuxiliaryMembers::dropSeenNames(const SymbolNameList& names,
                                                      std::unordered_set<std::string_view>& seen) {
  auto* fresh = alloclib::create<SymbolNameList>(*m_Region, m_Region.get());
  for (uint32_t i = 0; i < names.getSize(); ++i) {
    if (seen.insert(names[i]).second) fresh->addCopied(names[i]);
  }
  return fresh;
}

uint64_t AuxiliaryMembers::computeTableSize() const {
  uint64_t size = 4;
  for (const SymbolTableEntries& entries : m_Output)
    size += (4 + 1) * uint64_t{entries.names->getSize()} + entries.names->getTextSize();
  return size;
}

bool AuxiliaryMembers::makeSymbolTable(uint64_t tableSize) {
  if (tableSize > MaximumFileSize) {
    return m_Archive.fail(&ErrorHandler::reportWriteError, m_Archive.getFileName(), EFBIG);
  }
  ArchiveMember*& table = m_Archive.m_SymbolTable;
  if (table == nullptr) table = appendTable(SymbolTableArchiveMemberType::getInstance());
  if (!resizeTable(table, static_cast<uint32_t>(tableSize))) return false;
  computeMemberOffsets(tableSize);
  fillSymbolTable({table->m_Contents->bytes, table->m_Contents->size});
  m_Archive.m_SymbolTableUpToDate = true;
  return true;
}

// As they will be on disk: symbol table, long-name table, then the other members in list order.
void AuxiliaryMembers::computeMemberOffsets(uint64_t tableSize) {
  uint64_t cursor = nextHeaderOffset(ArchiveMagic.size(), tableSize);
  m_Archive.m_SymbolTable->m_Offset = static_cast<uint32_t>(ArchiveMagic.size());
  if (ArchiveMember* names = m_Archive.m_FileNameTable; names != nullptr) {
    names->m_Offset = static_cast<uint32_t>(cursor);
    cursor = nextHeaderOffset(cursor, names->m_Size);
  }
  for (ArchiveMember* member : m_Archive.m_ArchiveMembers) {
    if (member->isAuxiliary()) continue;
    member->m_Offset = static_cast<uint32_t>(cursor);
    cursor = nextHeaderOffset(cursor, member->m_Size);
  }
  m_Archive.m_ArchiveMemberOffsetsUpToDate = true;
}

// The count, the offset of each name's member, and the names.
void AuxiliaryMembers::fillSymbolTable(std::span<uint8_t> bytes) const {
  size_t position = 4;
  for (const auto& [member, names] : m_Output) {
    for (uint32_t i = 0; i < names->getSize(); ++i, position += 4)
      putBigEndian32(bytes.data() + position, member->m_Offset);
  }
  putBigEndian32(bytes.data(), static_cast<uint32_t>(position / 4 - 1));
  for (const auto& [member, names] : m_Output) {
    for (uint32_t i = 0; i < names->getSize(); ++i) {
      const std::string_view name = (*names)[i];
      std::memcpy(bytes.data() + position, name.data(), name.size());
      position += name.size();
      bytes[position++] = 0;
    }
  }
  QUARN_ASSERT(1, position == bytes.size());
}

} // namespace arlib
