// SPDX-License-Identifier: Apache-2.0
//
// The symbol table from its members' symbols: first the builds of one module, with decorated names,
// then all other members in file order. Reading every object makes it the most expensive thing that
// the library does.
#pragma once

#include "alloclib/interface/region_objects.h"
#include "arlib/interface/symbol_name_list.h"
#include "arlib/src/derived_tables.h"
#include "arlib/src/minor_variants.h"
#include "elfext/interface/fast_array.h"

#include <cstdint>
#include <memory>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace arlib {

// All working storage lies in one region, which goes with the table, or is dropped as a whole.
class SymbolTableMaker {
public:
  explicit SymbolTableMaker(Archive& archive);

  // Finds what is to be published. False after a report.
  bool collect();

  // Whether there is anything to publish, or the archive keeps an empty table as well.
  [[nodiscard]] bool isTableWanted() const;

  // Size of the table, which may be more than an archive can hold.
  [[nodiscard]] uint64_t computeTableSize() const;

  // The table, which is of that size, for members that stand there. It takes all that was found.
  [[nodiscard]] std::unique_ptr<TableText> takeTable(const MemberLayout& layout);

private:
  [[nodiscard]] bool collectKnownNames();
  void collectSymbolHostingMembers();
  bool collectObject(ArchiveMember* member, uint32_t place, ObjectReading& reading);
  void collectKnown(ArchiveMember* member, uint32_t place);
  [[nodiscard]] bool hasObjects() const;
  bool addVariantSymbols();
  [[nodiscard]] std::vector<uint8_t> makeHead(const MemberLayout& layout) const;
  void addPlainSymbols();
  void addUniqueSymbols();
  void addUniqueSymbolsOfSharedBytes();
  [[nodiscard]] bool doNamesShareBytes() const;
  [[nodiscard]] std::vector<const HostingMember*> getPlainMembers() const;
  template <class IsKept>
  void addSome(const HostingMember& hosting, IsKept isKept);

  Archive& m_Archive;
  alloclib::RegionOwner m_Region;
  AttributeRecords m_Records;
  // What the table that was read says of members that nobody here can look into.
  std::unordered_map<const ArchiveMember*, SymbolNameList*> m_KnownNames;
  elfext::FastArray<HostingMember> m_SymbolHostingMembers; // in file order
  // By hosting member: whether it is in a group of minor variants.
  std::vector<bool> m_IsMinorVariant;
  bool m_HasHostFailed = false; // while the members were collected; it has been reported
  elfext::FastArray<SymbolTableEntries> m_Output; // in the order of the table
};

} // namespace arlib
