// SPDX-License-Identifier: Apache-2.0
//
// The checks of a symbol table: a count, that many offsets, that many names with a NUL each, all in
// big endian, and nothing behind them. It is walked with two cursors, as offsets and names lie
// apart.
//
// A count that promises more than there is, names without an end, offsets in the middle of a
// member: each ends the read or is told by its index. Each entry costs one look-up at most, so that
// a table of entries which all lead nowhere takes no longer than a good one.
#include "arlib/src/read_symbol_table.h"

#include "arlib/interface/archive_format.h"

namespace arlib {

namespace {

bool failToRead(const Archive& archive, const TableCursor& cursor) {
  return archive.stop(&ErrorHandler::reportReadError, nullptr, cursor.getError());
}

} // namespace

ReadSymbolTable::ReadSymbolTable(const TableSource& source, std::span<ArchiveMember* const> members)
    : m_Source(source), m_Members(members.begin(), members.end()) {
  // Where the members would stand if each had the size that it has, which is where they do stand
  // but for members that were cut.
  uint64_t offset = ArchiveMagic.size();
  m_Offsets.reserve(m_Members.size());
  for (const ArchiveMember* member : m_Members) {
    m_Offsets.push_back(static_cast<uint32_t>(offset));
    offset = nextHeaderOffset(offset, member->getSize());
  }
}

bool ReadSymbolTable::check(const Archive& archive) {
  if (!checkCount(archive)) return false;
  TableCursor names(m_Source, getNamesStart());
  if (!checkEntries(archive, names)) return false;
  // A member's type may change later, and the tables have no symbols.
  for (ArchiveMember*& member : m_Members) {
    if (member->isAuxiliary()) member = nullptr;
  }
  return checkRest(archive, names);
}

// Before anything is looked at behind the count, and in 64 bits: a count near 2^30 would wrap to a
// small size.
bool ReadSymbolTable::checkCount(const Archive& archive) {
  const auto size = static_cast<uint32_t>(m_Source.size);
  if (size < CountSize) return archive.stop(&ErrorHandler::reportSymbolTableTooShort, size);
  TableCursor cursor(m_Source, 0);
  const std::optional<uint32_t> count = cursor.takeWord();
  if (!count) return failToRead(archive, cursor);
  m_Count = *count;
  const uint64_t required = getNamesStart();
  if (size >= required) return true;
  return archive.stop(&ErrorHandler::reportSymbolTableCountTooLarge, size, m_Count, required);
}

bool ReadSymbolTable::checkEntries(const Archive& archive, TableCursor& names) {
  TableCursor offsets(m_Source, CountSize);
  for (uint32_t i = 0; i < m_Count; ++i) {
    const std::optional<std::string_view> name = names.takeName();
    if (!name && names.hasFailed()) return failToRead(archive, names);
    if (!name) return archive.stop(&ErrorHandler::reportSymbolNameUnterminated, i, m_Count);
    const std::optional<uint32_t> offset = offsets.takeWord();
    if (!offset) return failToRead(archive, offsets);
    if (!checkEntry(archive, i, *name, *offset)) return false;
  }
  return true;
}

bool ReadSymbolTable::checkEntry(const Archive& archive, uint32_t index, std::string_view name,
                                 uint32_t offset) {
  const ArchiveMember* member = memberAt(offset);
  if (member == nullptr)
    return archive.goOn(&ErrorHandler::reportSymbolAtNoMember, index, name, offset);
  if (member != archive.getSymbolTable() && member != archive.getFileNameTable()) return true;
  return archive.goOn(&ErrorHandler::reportSymbolInNonObject, index, name, offset);
}

bool ReadSymbolTable::checkRest(const Archive& archive, TableCursor& names) {
  const auto end = static_cast<uint32_t>(names.getPosition());
  if (names.findData())
    return archive.goOn(&ErrorHandler::reportSymbolTableTrailingData,
                        static_cast<uint32_t>(names.getPosition()), end);
  return !names.hasFailed() || failToRead(archive, names);
}

// Symbols of one member stand together in most tables, so the last answer is tried first.
ArchiveMember* ReadSymbolTable::memberAt(uint32_t offset) {
  if (m_LastMember >= m_Offsets.size() || m_Offsets[m_LastMember] != offset) {
    const auto found = std::lower_bound(m_Offsets.begin(), m_Offsets.end(), offset);
    if (found == m_Offsets.end() || *found != offset) return nullptr;
    m_LastMember = static_cast<size_t>(found - m_Offsets.begin());
  }
  return m_Members[m_LastMember];
}

void ReadSymbolTable::forgetSymbolsOf(std::span<ArchiveMember* const> members) {
  m_Forgotten.insert(m_Forgotten.end(), members.begin(), members.end());
}

bool ReadSymbolTable::isLeft(const ArchiveMember* member) const {
  return member != nullptr &&
         !std::binary_search(m_Forgotten.begin(), m_Forgotten.end(), member, std::less<>());
}

} // namespace arlib
