// SPDX-License-Identifier: Apache-2.0
//
// One rebuild of the two tables of an archive. The order of the steps is forced: the symbol table
// holds the offsets of members, and these depend on the size of the long-name table.
#pragma once

#include "alloclib/interface/region_objects.h"
#include "arlib/interface/archive.h"
#include "arlib/interface/symbol_name_list.h"
#include "arlib/src/minor_variants.h"
#include "elfext/interface/fast_array.h"

#include <cstdint>
#include <string_view>
#include <unordered_set>
#include <vector>

namespace arlib {

// All working storage lies in one scratch region that is dropped as a whole.
class AuxiliaryMembers {
public:
  explicit AuxiliaryMembers(Archive& archive);

  // False if one of the tables could not be rebuilt; it then stands as it was.
  bool update();

private:
  bool updateFileNameTable();
  bool updateSymbolTable();
  void removeSymbolTable();
  void collectSymbolHostingMembers();
  bool addVariantSymbols();
  void addPlainSymbols();
  [[nodiscard]] const SymbolNameList* dropSeenNames(const SymbolNameList& names,
                                                    std::unordered_set<std::string_view>& seen);
  [[nodiscard]] uint64_t computeTableSize() const;
  bool makeSymbolTable(uint64_t tableSize);
  void computeMemberOffsets(uint64_t tableSize);
  void fillSymbolTable(std::span<uint8_t> bytes) const;
  ArchiveMember* appendTable(const ArchiveMemberType* type);
  bool resizeTable(ArchiveMember* table, uint32_t size);
  void forgetTable(ArchiveMember*& table);
  [[nodiscard]] bool hasLayoutChanged() const;
  void putTablesInPlace();
  void computeOffsets();

  Archive& m_Archive;
  alloclib::RegionOwner m_Region;
  AttributeRecords m_Records;
  elfext::FastArray<HostingMember> m_SymbolHostingMembers; // in file order
  // By hosting member: whether it is in a group of minor variants.
  std::vector<bool> m_IsMinorVariant;
  elfext::FastArray<SymbolTableEntries> m_Output; // in the order of the table
};

} // namespace arlib
