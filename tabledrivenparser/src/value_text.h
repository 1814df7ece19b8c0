// SPDX-License-Identifier: Apache-2.0
//
// Values as such: the empty one, equality, and how one is written. The parser asks for defaults,
// the two reports for the rest.

#pragma once

#include "tabledrivenparser/interface/option_table.h"

#include <string>

namespace tabledrivenparser {

// Zero or null, in the member that counts for the type.
Value emptyValue(ValueType type);

// Whether two values of the type say the same; an empty list is equal to a null one.
bool areEqual(ValueType type, const Value& left, const Value& right);

// A value that is no vector, or one element of one, as an argument that would give it again; a null
// text as an empty one. An enumerator goes by a name that is usable under the table's mask and, if
// it has one, not deprecated.
std::string argumentText(const ValueDefinition& definition, const Value& value, uint32_t tableMask);

// Calls visit with each element of a vector value, each as a Value.
template <class Visit>
void forEachElement(ValueType type, const Value& vector, Visit visit) {
  if (type == Type_IntVector) {
    if (vector.integers == nullptr) return;
    for (int element : *vector.integers)
      visit(Value{.integer = element});
  } else if (type == Type_Int64Vector) {
    if (vector.longIntegers == nullptr) return;
    for (long long element : *vector.longIntegers)
      visit(Value{.integer = element});
  } else {
    if (vector.strings == nullptr) return;
    for (const char* element : *vector.strings)
      visit(Value{.text = element});
  }
}

} // namespace tabledrivenparser
