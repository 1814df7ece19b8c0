// SPDX-License-Identifier: Apache-2.0
#include "arlib/src/read_symbol_table.h"

#include "arlib/interface/archive_format.h"

#include <algorithm>
#include <functional>
#include <utility>

namespace arlib {

ReadSymbolTable::ReadSymbolTable(std::span<const uint8_t> bytes,
                                 std::span<ArchiveMember* const> members)
    : m_Text(reinterpret_cast<const char*>(bytes.data()), bytes.size()),
      m_Members(members.begin(), members.end()) {
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
  size_t position = namesStart();
  for (uint32_t i = 0; i < m_Count; ++i) {
    const size_t end = m_Text.find('\0', position);
    if (end == m_Text.npos) {
      return archive.end(&ErrorHandler::reportSymbolNameUnterminated, i, m_Count);
    }
    if (!checkEntry(archive, i, m_Text.substr(position, end - position))) return false;
    position = end + 1;
  }
  // A member's type may change later, and the tables have no symbols.
  for (ArchiveMember*& member : m_Members) {
    if (member->isAuxiliary()) member = nullptr;
  }
  return checkRest(archive, position);
}

// Before anything is looked at behind the count, and in 64 bits: a count near 2^30 would wrap to a
// small size.
bool ReadSymbolTable::checkCount(const Archive& archive) {
  const auto size = static_cast<uint32_t>(m_Text.size());
  if (size < 4) return archive.end(&ErrorHandler::reportSymbolTableTooShort, size);
  m_Count = getBigEndian32(reinterpret_cast<const uint8_t*>(m_Text.data()));
  const uint64_t required = 4 + 4 * uint64_t{m_Count};
  if (size >= required) return true;
  return archive.end(&ErrorHandler::reportSymbolTableCountTooLarge, size, m_Count, required);
}

bool ReadSymbolTable::checkEntry(const Archive& archive, uint32_t index, std::string_view name) {
  const ArchiveMember* member = memberOf(index);
  if (member == nullptr) {
    return archive.goOn(&ErrorHandler::reportSymbolAtNoMember, index, name, offsetOf(index));
  }
  if (member != archive.getSymbolTable() && member != archive.getFileNameTable()) return true;
  return archive.goOn(&ErrorHandler::reportSymbolInNonObject, index, name, offsetOf(index));
}

bool ReadSymbolTable::checkRest(const Archive& archive, size_t position) const {
  const size_t trailing = m_Text.find_first_not_of('\0', position);
  if (trailing == m_Text.npos) return true;
  return archive.goOn(&ErrorHandler::reportSymbolTableTrailingData, static_cast<uint32_t>(trailing),
                      static_cast<uint32_t>(position));
}

uint32_t ReadSymbolTable::offsetOf(uint32_t index) const {
  return getBigEndian32(reinterpret_cast<const uint8_t*>(m_Text.data()) + 4 + 4 * size_t{index});
}

// Symbols of one member stand together in most tables, so the last answer is tried first.
ArchiveMember* ReadSymbolTable::memberOf(uint32_t index) {
  const uint32_t offset = offsetOf(index);
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

std::vector<ArchiveMember*> ReadSymbolTable::takeForgotten() {
  std::vector<ArchiveMember*> forgotten = std::move(m_Forgotten);
  std::sort(forgotten.begin(), forgotten.end(), std::less<>());
  return forgotten;
}

bool ReadSymbolTable::isLeft(const ArchiveMember* member,
                             std::span<ArchiveMember* const> forgotten) {
  return member != nullptr &&
         !std::binary_search(forgotten.begin(), forgotten.end(), member, std::less<>());
}

} // namespace arlib
