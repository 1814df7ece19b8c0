// SPDX-License-Identifier: Apache-2.0
//
// How the symbol table gets the names of members that are builds of one module, and what is told of
// them on the way.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/interface/minor_variants.h"
#include "arlib/interface/symbol_name_list.h"
#include "elfext/interface/fast_array.h"
#include "elfext/interface/full_attr.h"

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace arlib {

// What ends a name in the table that has no decoration.
constexpr std::string_view PlainEnding("\0", 1);

// Neighbours in the table to come: names that lead to one member.
struct SymbolTableEntries {
  uint32_t place; // of the member
  const SymbolNameList* names;
  std::string_view ending; // of each: their decoration, and a NUL
};

// Publishes the names of one group.
class MinorVariants {
public:
  // Decorations go to the region.
  MinorVariants(Archive& archive, alloclib::RegionGeneral& region, AttributeRecords& records)
      : m_Archive(archive), m_Region(region), m_Records(records) {}

  // Appends the names of all members to the output, in the order of the group. False if a report
  // was answered so.
  bool addSymbols(std::span<const HostingMember> group,
                  elfext::FastArray<SymbolTableEntries>& output);

private:
  [[nodiscard]] bool findCommon();
  [[nodiscard]] bool addLibrary(const ArchiveMember& member, elfext::FullAttr& attributes) const;
  [[nodiscard]] bool reportBases(const std::vector<const ArchiveMember*>& baseVariants) const;

  Archive& m_Archive;
  alloclib::RegionGeneral& m_Region;
  AttributeRecords& m_Records;
  // Of the group at hand.
  std::vector<const ArchiveMember*> m_Members;
  std::vector<elfext::FullAttr> m_Attributes;
  elfext::FullAttr m_Common;
};

} // namespace arlib
