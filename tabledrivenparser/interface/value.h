// SPDX-License-Identifier: Apache-2.0
//
// One option's value: 64 bits that carry no tag, since the option's definition knows the type.
// Rows, definitions, value records and listeners all pass values in this form, and so a table of
// constants needs no constructors. Asking a parser for a value of another type than the
// definition's is an assertion.

#pragma once

#include "tabledrivenparser/interface/linked_list.h"

#include <cstdint>

namespace tabledrivenparser {

class CallBackHandler;
struct DefaultNode;

/// The numbers are part of the table format; any other number is a bad type, to which nothing can
/// be stored.
enum ValueType : uint32_t {
  Type_Boolean = 0,      ///< 0 or 1
  Type_Enum = 1,         ///< an enumerator's value
  Type_Address = 2,      ///< unsigned 32 bits
  Type_Address64 = 3,    ///< unsigned 64 bits
  Type_Int = 4,          ///< signed 32 bits
  Type_IntVector = 5,    ///< IntegerList
  Type_Int64Vector = 6,  ///< LongIntegerList
  Type_String = 7,       ///< NUL-terminated text, or null
  Type_StringVector = 8, ///< StrList
  Type_CallBack = 9,     ///< a handler that takes the words itself
  Type_ViaFile = 10,     ///< StrList of the names of the files read
};

/// Which member counts follows from the type. An empty vector may be a null pointer. Whoever makes
/// a value owns what it points at; values stored by the parser point into the parser's region.
union Value {
  int64_t integer = 0; ///< Boolean, Enum, Int; Address and Address64 as the same 64 bits
  const char* text;
  IntegerList* integers;
  LongIntegerList* longIntegers;
  StrList* strings;
  CallBackHandler* handler;
  const DefaultNode* defaults; ///< only in a definition whose default is a list of nodes
};

/// Whether a value of the type is a list, to which each use of the option adds.
[[nodiscard]] constexpr bool isVector(ValueType type) {
  return type == Type_IntVector || type == Type_Int64Vector || type == Type_StringVector ||
         type == Type_ViaFile;
}

} // namespace tabledrivenparser
