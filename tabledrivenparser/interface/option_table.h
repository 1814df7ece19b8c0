// SPDX-License-Identifier: Apache-2.0
//
// The tables from which a command line is parsed. They are constants of the client: rows say how
// options are written, definitions say what each option id holds, and one writable record for each
// id holds its value. The constexpr functions below check tables at compile time and work out what
// would otherwise be kept by hand.
//
// The order of the rows is part of the format: sorted without regard to case, the positional row
// first, words that start with no letter before the others. The look-up starts at a letter's first
// row and stops behind its last one; a row in another place would never be found, which is why
// areWellFormed belongs in a static_assert beside every table.

#pragma once

#include "support/interface/letters.h"
#include "tabledrivenparser/interface/constraint.h"
#include "tabledrivenparser/interface/value.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace tabledrivenparser {

class FallbackHandler;
class Parser;

/// What an option does with an argument. The numbers are part of the table format.
enum RowKind : uint32_t {
  Kind_Required = 0, ///< a parameter is required
  Kind_Optional = 1, ///< implied parameter, an argument may replace it
  Kind_Implied = 2,  ///< implied parameter, no argument
};

/// Bits of MatchString::flags.
enum RowFlag : uint8_t {
  Flag_OldSyntax = 1,  ///< a long name also works with one dash, a letter in either case
  Flag_Deprecated = 2, ///< see OptionTable::deprecatedPolicy
  Flag_Public = 4,     ///< may be abbreviated with a "."
};

/// One way to write an option, or one entry of an enumeration.
struct MatchString {
  /// Without dashes, NUL-terminated; "" for the positional words.
  std::string_view name;
  /// The value id; in an enumeration the enumerator's value.
  uint32_t id = 0;
  RowKind kind = Kind_Required;
  /// The implied value of the last two kinds; one element where the option is a vector.
  Value value{};
  /// Zero-terminated masks; the row is usable only if the table's mask has a bit in common with
  /// each.
  const uint32_t* restrictions = nullptr;
  /// Between the elements of a list, 0 for none; in an enumeration not 0 for a deprecated entry.
  char separator = 0;
  /// Bits of RowFlag.
  uint8_t flags = 0;

  [[nodiscard]] constexpr bool has(RowFlag flag) const { return (flags & flag) != 0; }
  [[nodiscard]] constexpr bool hasLongName() const { return name.size() > 1; }
};

/// Any other number accepts silently.
enum SyntaxPolicy : uint32_t { Policy_Accept = 0, Policy_Warn = 1, Policy_Reject = 2 };

/// In a FirstLetterIndex: no row starts with the letter.
constexpr uint32_t NoRow = 0xFFFFFFFF;
/// For each letter the first row that starts with it in either case, or NoRow.
using FirstLetterIndex = std::array<uint32_t, 26>;

/// The rows with what is said of all of them. A constant of the client, which outlives the parser.
struct OptionTable {
  std::span<const MatchString> rows; ///< sorted: see areSorted
  FirstLetterIndex firstRows;        ///< indexByFirstLetter(rows)
  SyntaxPolicy oldSyntaxPolicy = Policy_Warn;
  SyntaxPolicy deprecatedPolicy = Policy_Accept; ///< only Policy_Warn says anything
  uint32_t restrictionMask = 0xFFFFFFFF;
  FallbackHandler* fallback = nullptr; ///< the client's, null if there is none
};

/// Where an option's value comes from while nobody has set it.
enum DefaultKind : uint32_t {
  Default_None = 0,
  Default_Fixed = 1,
  Default_List = 2,     ///< the first node whose masks all meet the table's mask
  Default_Computed = 3, ///< by the record's default call back
};

/// One of several defaults, for tables that serve more than one tool by their masks.
struct DefaultNode {
  const uint32_t* masks = nullptr; ///< as MatchString::restrictions
  Value value{};
  const DefaultNode* next = nullptr;
};

/// What an option id holds, whichever of its rows it is written with.
struct ValueDefinition {
  ValueType type = Type_Boolean;
  DefaultKind defaultKind = Default_Fixed;
  Value defaultValue{};
  Constraint constraint{};
  const MatchString* const* rows = nullptr; ///< null-terminated, in the order reports prefer
};

/// The client's own check of a value, behind the constraint. False refuses the argument.
using Validator = bool (*)(const Parser& parser, uint32_t id, const Value& value);
/// Is asked more than once: for a vector it gives the same list each time.
using DefaultCallBack = Value (*)(const Parser& parser, uint32_t id);

/// The parser sets value and both counters at its start, the client the call backs before it.
struct ValueRecord {
  Value value{};
  uint32_t firstSet = 0; ///< the set counter at the first and the last time that the value was set,
  uint32_t lastSet = 0;  ///< 0 for never
  Validator validator = nullptr;
  DefaultCallBack defaultCallBack = nullptr;
};

/// Goes through the rows from the last to the first, so that the first one of a letter is what
/// stays.
[[nodiscard]] constexpr FirstLetterIndex indexByFirstLetter(std::span<const MatchString> rows) {
  FirstLetterIndex index{};
  index.fill(NoRow);
  for (size_t row = rows.size(); row-- > 0;) {
    if (rows[row].name.empty() || !support::isLetter(rows[row].name.front())) continue;
    index[static_cast<size_t>(support::lowered(rows[row].name.front()) - 'a')] =
        static_cast<uint32_t>(row);
  }
  return index;
}

/// Without regard to case, and an upper-case letter before its lower-case twin.
[[nodiscard]] constexpr bool comesBefore(std::string_view left, std::string_view right) {
  for (size_t at = 0; at < left.size() && at < right.size(); ++at) {
    const auto a = static_cast<unsigned char>(support::lowered(left[at]));
    const auto b = static_cast<unsigned char>(support::lowered(right[at]));
    if (a != b) return a < b;
  }
  if (left.size() != right.size()) return left.size() < right.size();
  return left < right;
}

/// Whether each row comes before the next; two of one name are not sorted.
[[nodiscard]] constexpr bool areSorted(std::span<const MatchString> rows) {
  for (size_t row = 1; row < rows.size(); ++row) {
    if (!comesBefore(rows[row - 1].name, rows[row].name)) return false;
  }
  return true;
}

/// Whether the look-up can find the row: it folds the word, but only the first character of a name.
/// Names that start with no letter must sort before those that do.
[[nodiscard]] constexpr bool isFindable(std::string_view name) {
  if (name.empty()) return true;
  if (static_cast<unsigned char>(support::lowered(name.front())) > 'z') return false;
  for (char character : name.substr(1)) {
    if (character == '-' || character != support::lowered(character)) return false;
  }
  return true;
}

/// Whether the rows are sorted, can all be found, and their ids lie below idCount.
[[nodiscard]] constexpr bool areWellFormed(std::span<const MatchString> rows, size_t idCount) {
  for (const MatchString& row : rows) {
    if (row.id >= idCount || !isFindable(row.name)) return false;
  }
  return areSorted(rows);
}

/// The row of that name, null if there is none.
[[nodiscard]] constexpr const MatchString* rowNamed(std::span<const MatchString> rows,
                                                    std::string_view name) {
  for (const MatchString& row : rows) {
    if (row.name == name) return &row;
  }
  return nullptr;
}

/// The list of rows that a definition wants, from their names:
///   constexpr auto VersionRows = rowsNamed(Rows, "vsn", "version", "V");
template <class... Names>
[[nodiscard]] constexpr std::array<const MatchString*, sizeof...(Names) + 1>
rowsNamed(std::span<const MatchString> rows, Names... names) {
  return {rowNamed(rows, names)..., nullptr};
}

/// Whether each definition lists rows of its own id only, and all lists together hold every row. No
/// definition may be without a list.
[[nodiscard]] constexpr bool listEveryRow(std::span<const ValueDefinition> definitions,
                                          std::span<const MatchString> rows) {
  size_t listed = 0;
  for (size_t id = 0; id < definitions.size(); ++id) {
    const MatchString* const* row = definitions[id].rows;
    for (; *row != nullptr; ++row, ++listed) {
      if ((*row)->id != id) return false;
    }
  }
  return listed == rows.size();
}

} // namespace tabledrivenparser
