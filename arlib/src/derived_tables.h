// SPDX-License-Identifier: Apache-2.0
//
// What an archive derives from its members: the long-name table, the symbol table, and where each
// header stands. All of it is made as one value before anything of the archive changes, and handed
// to the archive in one call, so that a rebuild which fails leaves everything as it was.
//
// The order is forced: the symbol table holds the offsets of members, and these depend on the size
// of the long-name table.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/src/table_text.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <vector>

namespace arlib {

struct DerivedTable {
  enum class Fate : uint8_t { Kept, Dropped, Made };

  Fate fate = Fate::Kept;
  std::unique_ptr<TableText> text = {}; // of one that was made

  // The size that the table has then, if there is one; `table` is the one that there is now.
  [[nodiscard]] std::optional<uint64_t> getSizeAfter(const ArchiveMember* table) const;
};

// Header offsets. A layout that doesn't fit in 32 bits is refused by the writer, which sums in 64.
struct MemberLayout {
  uint32_t symbolTable = 0;
  uint32_t longNameTable = 0;
  std::vector<uint32_t> members = {}; // in list order; those of tables are not looked at
};

struct DerivedTables {
  DerivedTable longNames = {};
  std::vector<uint32_t> nameOffsets = {}; // in that table, of each long name in list order
  DerivedTable symbols = {};
  MemberLayout layout = {};
};

// As it will be on disk: symbol table, long-name table, then the other members in list order.
[[nodiscard]] MemberLayout layOut(std::span<ArchiveMember* const> members,
                                  std::optional<uint64_t> symbolTableSize,
                                  std::optional<uint64_t> longNameTableSize);

// Makes the long-name table whole, since the offsets in all headers of long-named members point
// into it. False after a report.
bool makeLongNameTable(const Archive& archive, DerivedTables& tables);

// Makes the symbol table of the members' symbols, for the long-name table that there will be, and
// the layout with both. False after a report.
bool makeSymbolTable(Archive& archive, DerivedTables& tables);

} // namespace arlib
