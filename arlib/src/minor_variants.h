// SPDX-License-Identifier: Apache-2.0
//
// Members that are builds of one module: they define the same symbols, so a plain symbol table
// could not tell them apart. What all of them need of their target is the base; the names of a
// member that needs more are published with a decoration that spells the difference out.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/interface/symbol_name_list.h"
#include "elfext/interface/fast_array.h"
#include "elfext/interface/full_attr.h"

#include <compare>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace arlib {

// What members with the same names agree in: many others don't, and need not be compared.
struct NamesKey {
  // Best taken while the names are still at hand.
  explicit NamesKey(const SymbolNameList& names);
  auto operator<=>(const NamesKey&) const = default;

  uint64_t hash = 0; // whatever their order
  uint32_t count;
  uint64_t textSize;
};

// A member with names to publish.
struct HostingMember {
  ArchiveMember* member;
  uint32_t place; // in the archive's list of members
  const SymbolNameList* names;
  NamesKey key;
  elfext::FullAttr attributes = {};
  bool isForeign = false; // says nothing of builds
};

// Neighbours in the table to come: names that lead to one member.
struct SymbolTableEntries {
  uint32_t place; // of the member
  const SymbolNameList* names;
};

// Indices of hosting members, at least two, in file order.
using VariantGroup = std::vector<uint32_t>;

// Groups those that have the same names with the same multiplicities, in any order. The groups are
// in the order of their first members; members that are like no other are in none.
[[nodiscard]] std::vector<VariantGroup>
findMinorVariants(std::span<const HostingMember> hostingMembers);

// Publishes the names of one group.
class MinorVariants {
public:
  // Decorated names go to the region.
  MinorVariants(Archive& archive, alloclib::RegionGeneral& region, AttributeRecords& records)
      : m_Archive(archive), m_Region(region), m_Records(records) {}

  // Appends the names of all members to the output, in the order of the group. False if a report
  // was answered so.
  bool addSymbols(std::span<const HostingMember> group,
                  elfext::FastArray<SymbolTableEntries>& output);

private:
  [[nodiscard]] bool findCommon();
  [[nodiscard]] bool addLibraryAttributes(const ArchiveMember& member,
                                          elfext::FullAttr& attributes) const;
  [[nodiscard]] bool decorate(const ArchiveMember& member, const elfext::FullAttr& attributes,
                              std::string& decoration) const;
  [[nodiscard]] const SymbolNameList* decorateNames(const SymbolNameList& names,
                                                    std::string_view decoration) const;
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
