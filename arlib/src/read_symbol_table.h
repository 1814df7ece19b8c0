// SPDX-License-Identifier: Apache-2.0
//
// The symbol table as it stood in the file. It is checked when the archive is read, since a broken
// one ends the read; the symbols are made of it when somebody asks, which most runs never do.
#pragma once

#include "arlib/interface/archive.h"

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace arlib {

class ReadSymbolTable {
public:
  // The bytes, and the members as they stand in the file, in file order.
  ReadSymbolTable(std::span<const uint8_t> bytes, std::span<ArchiveMember* const> members);

  // Goes through the whole table. Entries that lead to no object's member are left out if the
  // archive's handler says so. False ends the read, after a report.
  [[nodiscard]] bool check(const Archive& archive);

  // Their symbols are left out from now on.
  void forgetSymbolsOf(std::span<ArchiveMember* const> members);

  // Hands each entry that is left, in table order, to `add`(name, member). Only of a table that was
  // found to be sound.
  template <class Add>
  void forEachSymbol(Add add) {
    const std::vector<ArchiveMember*> forgotten = takeForgotten();
    size_t position = namesStart();
    for (uint32_t i = 0; i < m_Count; ++i) {
      const std::string_view name = nameAt(position);
      position += name.size() + 1;
      ArchiveMember* member = memberOf(i);
      if (isLeft(member, forgotten)) add(name, member);
    }
  }

private:
  [[nodiscard]] bool checkCount(const Archive& archive);
  [[nodiscard]] bool checkEntry(const Archive& archive, uint32_t index, std::string_view name);
  [[nodiscard]] bool checkRest(const Archive& archive, size_t position) const;

  [[nodiscard]] size_t namesStart() const { return 4 + 4 * size_t{m_Count}; }
  [[nodiscard]] std::string_view nameAt(size_t position) const {
    return m_Text.substr(position, m_Text.find('\0', position) - position);
  }
  // The header offset that the entry holds.
  [[nodiscard]] uint32_t offsetOf(uint32_t index) const;
  // The member whose header stands there, or null.
  [[nodiscard]] ArchiveMember* memberOf(uint32_t index);
  [[nodiscard]] std::vector<ArchiveMember*> takeForgotten();
  [[nodiscard]] static bool isLeft(const ArchiveMember* member,
                                   std::span<ArchiveMember* const> forgotten);

  std::string_view m_Text; // the bytes
  uint32_t m_Count = 0;
  // Members and their header offsets, ascending.
  std::vector<ArchiveMember*> m_Members;
  std::vector<uint32_t> m_Offsets;
  size_t m_LastMember = 0;
  std::vector<ArchiveMember*> m_Forgotten;
};

} // namespace arlib
