// SPDX-License-Identifier: Apache-2.0
//
// The symbol table as it stood in the file. It is checked when the archive is read, since a broken
// one ends the read. The symbols are made of it when somebody asks; who says beforehand that he
// won't, and only visits them, spares the memory for the table's bytes, too.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/src/table_cursor.h"

#include <algorithm>
#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

namespace arlib {

class ReadSymbolTable {
public:
  // The members are those of the file, in file order.
  ReadSymbolTable(const TableSource& source, std::span<ArchiveMember* const> members);

  // Goes through the whole table. Entries that lead to no object's member are left out if the
  // archive's handler says so. False ends the read, after a report.
  [[nodiscard]] bool check(const Archive& archive);

  // Their symbols are left out from now on.
  void forgetSymbolsOf(std::span<ArchiveMember* const> members);

  // Hands each entry that is left, in table order, to `add`(name, member). Names are good until the
  // next one comes, or for as long as the table's bytes if these are in memory. Only of a table
  // that was found to be sound. False, with the host's error, if bytes can't be had any more.
  template <class Add>
  [[nodiscard]] bool forEachSymbol(Add add, support::HostError& error) {
    std::sort(m_Forgotten.begin(), m_Forgotten.end(), std::less<>());
    TableCursor offsets(m_Source, CountSize);
    TableCursor names(m_Source, getNamesStart());
    for (uint32_t i = 0; i < m_Count; ++i) {
      const std::optional<std::string_view> name = names.takeName();
      const std::optional<uint32_t> offset = offsets.takeWord();
      if (!name || !offset) {
        error = names.hasFailed() ? names.getError() : offsets.getError();
        return false;
      }
      ArchiveMember* member = memberAt(*offset);
      if (isLeft(member)) add(*name, member);
    }
    return true;
  }

private:
  [[nodiscard]] bool checkCount(const Archive& archive);
  [[nodiscard]] bool checkEntries(const Archive& archive, TableCursor& names);
  [[nodiscard]] bool checkEntry(const Archive& archive, uint32_t index, std::string_view name,
                                uint32_t offset);
  [[nodiscard]] static bool checkRest(const Archive& archive, TableCursor& names);

  static constexpr uint64_t CountSize = 4;
  [[nodiscard]] uint64_t getNamesStart() const { return CountSize + 4 * uint64_t{m_Count}; }
  // The member whose header stands there, or null.
  [[nodiscard]] ArchiveMember* memberAt(uint32_t offset);
  [[nodiscard]] bool isLeft(const ArchiveMember* member) const;

  TableSource m_Source;
  uint32_t m_Count = 0;
  // Members and their header offsets, ascending.
  std::vector<ArchiveMember*> m_Members;
  std::vector<uint32_t> m_Offsets;
  size_t m_LastMember = 0;
  std::vector<ArchiveMember*> m_Forgotten;
};

} // namespace arlib
