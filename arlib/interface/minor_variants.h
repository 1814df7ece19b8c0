// SPDX-License-Identifier: Apache-2.0
//
// Members that are builds of one module: they define the same symbols, so a plain symbol table
// could not tell them apart. What all of them need of their target is the base; the names of a
// member that needs more are published with a decoration that spells the difference out.
//
// The symbol table is made by these rules. Who wants to know what it will say of builds, and why,
// reads the objects (ArchiveMemberType::getPublished), and asks here.
#pragma once

#include "arlib/interface/archive_member_type.h"
#include "arlib/interface/symbol_name_list.h"
#include "elfext/interface/full_attr.h"

#include <compare>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace arlib {

class ArchiveMember;

/// What members with the same names agree in: many others don't, and need not be compared.
struct NamesKey {
  /// Best taken while the names are still at hand.
  explicit NamesKey(const SymbolNameList& names);
  auto operator<=>(const NamesKey&) const = default;

  uint64_t hash = 0; ///< whatever their order
  uint32_t count;
  uint64_t textSize;
};

/// A member with names to publish.
struct HostingMember {
  ArchiveMember* member;
  uint32_t place; ///< in the archive's list of members
  const SymbolNameList* names;
  NamesKey key;
  elfext::FullAttr attributes = {};
  bool isForeign = false; ///< says nothing of builds
};

/// Indices of hosting members, at least two, in file order.
using VariantGroup = std::vector<uint32_t>;

/// Groups those that have the same names with the same multiplicities, in any order. The groups are
/// in the order of their first members; members that are like no other are in none.
[[nodiscard]] std::vector<VariantGroup>
findMinorVariants(std::span<const HostingMember> hostingMembers);

/// What all of a group need, which is not empty.
[[nodiscard]] elfext::FullAttr
computeCommonAttributes(std::span<const elfext::FullAttr> attributes);

/// Adds what the library as a whole needs, or nothing for null. False if both can't be on one
/// target; they are added all the same.
[[nodiscard]] bool addLibraryAttributes(elfext::FullAttr& attributes,
                                        const elfext::FullAttr* library);

/// What tells the names of one build from those of the base.
struct Decoration {
  std::string text; ///< of attributes, that stands behind the marker
  bool isComplete;  ///< whether text and base together say all that the build needs
};

/// Nothing for a build that needs what all of them do: the base.
[[nodiscard]] std::optional<Decoration> computeDecoration(const elfext::FullAttr& attributes,
                                                          const elfext::FullAttr& common,
                                                          AttributeRecords& records);

} // namespace arlib
