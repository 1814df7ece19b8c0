// SPDX-License-Identifier: Apache-2.0
//
// What an option accepts beyond its type: the names of an enumeration, ranges of numbers, or
// patterns of texts. All are constants of the client, without a count: lists end by a mark of their
// own, so that a row holds one pointer. The check is made by constraint_check, before validator and
// listener see the value.

#pragma once

#include <cstdint>
#include <span>

namespace tabledrivenparser {

struct MatchString;

/// The entries need no order. In an entry, id is the enumerator and separator, if not zero, marks
/// it as deprecated.
struct Enumeration {
  std::span<const MatchString> entries;
};

/// Both ends included. For the unsigned types the ends are taken as unsigned.
struct IntegerRange {
  int64_t low;
  int64_t high;
};

/// A rule for numbers; a value passes if one usable node of the chain accepts it.
struct IntegerConstraintNode {
  const uint32_t* masks = nullptr;      ///< as MatchString::restrictions
  const IntegerRange* ranges = nullptr; ///< ended by a range whose low lies above its high
  const IntegerConstraintNode* next = nullptr;
};

/// The same for texts.
struct StringConstraintNode {
  const uint32_t* masks = nullptr; ///< as MatchString::restrictions
  /// Alternatives separated by "|". An alternative that begins with "C" compares the case of
  /// letters; a "*" matches whatever is left.
  const char* pattern = nullptr;
  const StringConstraintNode* next = nullptr;
};

/// Which member counts follows from the option's type: enumeration for ENUM (there never null),
/// strings for STRING and STRING_VECTOR, integers for the types of numbers.
union Constraint {
  const void* none = nullptr;
  const Enumeration* enumeration;
  const IntegerConstraintNode* integers;
  const StringConstraintNode* strings;
};

/// Whether every mask of a zero-terminated list has a bit in common with the table's mask. A null
/// list restricts nothing.
[[nodiscard]] constexpr bool restrictionsMet(const uint32_t* masks, uint32_t tableMask) {
  if (masks == nullptr) return true;
  for (; *masks != 0; ++masks) {
    if ((*masks & tableMask) == 0) return false;
  }
  return true;
}

} // namespace tabledrivenparser
