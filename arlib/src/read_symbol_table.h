// SPDX-License-Identifier: Apache-2.0
//
// The symbol table as it stood in the file. It is checked when the archive is read, since a broken
// one ends the read. The symbols are made of it when somebody asks, which most runs never do: they
// say so beforehand, and the table's bytes are not kept.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/src/table_cursor.h"

#include <cstdint>
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

  // Hands each entry that is left, in table order, to `add`(name, member). Only of a table that was
  // found to be sound, and whose bytes are in memory.
  template <class Add>
  void forEachSymbol(Add add) {
    const std::vector<ArchiveMember*> forgotten = takeForgotten();
    TableCursor offsets(m_Source, CountSize);
    TableCursor names(m_Source, namesStart());
    for (uint32_t i = 0; i < m_Count; ++i) {
      const std::string_view name = names.takeName().value();
      ArchiveMember* member = memberAt(offsets.takeWord().value());
      if (isLeft(member, forgotten)) add(name, member);
    }
  }

private:
  [[nodiscard]] bool checkCount(const Archive& archive);
  [[nodiscard]] bool checkEntries(const Archive& archive, TableCursor& names);
  [[nodiscard]] bool checkEntry(const Archive& archive, uint32_t index, std::string_view name,
                                uint32_t offset);
  [[nodiscard]] static bool checkRest(const Archive& archive, TableCursor& names);

  static constexpr uint64_t CountSize = 4;
  [[nodiscard]] uint64_t namesStart() const { return CountSize + 4 * uint64_t{m_Count}; }
  // The member whose header stands there, or null.
  [[nodiscard]] ArchiveMember* memberAt(uint32_t offset);
  [[nodiscard]] std::vector<ArchiveMember*> takeForgotten();
  [[nodiscard]] static bool isLeft(const ArchiveMember* member,
                                   std::span<ArchiveMember* const> forgotten);

  TableSource m_Source;
  uint32_t m_Count = 0;
  // Members and their header offsets, ascending.
  std::vector<ArchiveMember*> m_Members;
  std::vector<uint32_t> m_Offsets;
  size_t m_LastMember = 0;
  std::vector<ArchiveMember*> m_Forgotten;
};

} // namespace arlib
