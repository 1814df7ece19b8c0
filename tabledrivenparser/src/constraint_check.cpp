// SPDX-License-Identifier: Apache-2.0
//
// The checks of a value against the constraint of its option. Nodes that are not usable under the
// table's mask don't count; of the others one must accept. Where none is usable everything passes:
// a restriction that leaves no rule leaves no rule to break.
//
// Texts are compared with patterns of the client, which are short and hold one "*" at most: nothing
// that a user writes can make a comparison long.

#include "tabledrivenparser/src/constraint_check.h"

namespace tabledrivenparser {

namespace {

// Compares in the type of the option: a range of addresses reaches to the largest unsigned number,
// which is -1 in the table's signed one.
template <class Number>
bool liesInRanges(Number number, const IntegerRange* range) {
  for (; static_cast<Number>(range->low) <= static_cast<Number>(range->high); ++range) {
    if (number < static_cast<Number>(range->low)) continue;
    if (number <= static_cast<Number>(range->high)) return true;
  }
  return false;
}

bool sameText(std::string_view left, std::string_view right, bool isCaseSensitive) {
  return isCaseSensitive ? left == right : support::equalIgnoringCase(left, right);
}

bool matchesAlternative(std::string_view text, std::string_view alternative) {
  const bool isCaseSensitive = alternative.starts_with('C');
  if (isCaseSensitive) alternative.remove_prefix(1);
  const size_t star = alternative.find('*');
  if (star == std::string_view::npos) return sameText(text, alternative, isCaseSensitive);
  return sameText(text.substr(0, star), alternative.substr(0, star), isCaseSensitive);
}

bool matchesPattern(std::string_view text, std::string_view pattern) {
  for (;;) {
    const size_t end = pattern.find('|');
    if (matchesAlternative(text, pattern.substr(0, end))) return true;
    if (end == std::string_view::npos) return false;
    pattern.remove_prefix(end + 1);
  }
}

template <class Node, class Predicate>
bool somePasses(const Node* node, uint32_t tableMask, Predicate accepts) {
  bool isAnyUsable = false;
  for (; node != nullptr; node = node->next) {
    if (!restrictionsMet(node->masks, tableMask)) continue;
    if (accepts(*node)) return true;
    isAnyUsable = true;
  }
  return !isAnyUsable;
}

template <class Predicate>
const MatchString* findUsable(const Enumeration& enumeration, uint32_t tableMask,
                              Predicate isWanted) {
  for (const MatchString& entry : enumeration.entries) {
    if (isWanted(entry) && restrictionsMet(entry.restrictions, tableMask)) return &entry;
  }
  return nullptr;
}

} // namespace

bool meetsConstraint(const ValueDefinition& definition, const Value& value, uint32_t tableMask) {
  const Constraint& constraint = definition.constraint;
  switch (definition.type) {
  case Type_Address:
  case Type_Address64:
    return somePasses(constraint.integers, tableMask, [&](const IntegerConstraintNode& node) {
      return liesInRanges(static_cast<uint64_t>(value.integer), node.ranges);
    });
  case Type_Int:
  case Type_IntVector:
  case Type_Int64Vector:
    return somePasses(constraint.integers, tableMask, [&](const IntegerConstraintNode& node) {
      return liesInRanges(value.integer, node.ranges);
    });
  case Type_String:
  case Type_StringVector:
    return somePasses(constraint.strings, tableMask, [&](const StringConstraintNode& node) {
      return value.text != nullptr && matchesPattern(value.text, node.pattern);
    });
  default:
    return true;
  }
}

const MatchString* findEnumerator(const Enumeration& enumeration, std::string_view name,
                                  uint32_t tableMask) {
  return findUsable(enumeration, tableMask, [name](const MatchString& entry) {
    return support::equalIgnoringCase(entry.name, name);
  });
}

const MatchString* findEnumerator(const Enumeration& enumeration, int64_t number,
                                  uint32_t tableMask) {
  return findUsable(enumeration, tableMask,
                    [number](const MatchString& entry) { return entry.id == number; });
}

} // namespace tabledrivenparser
