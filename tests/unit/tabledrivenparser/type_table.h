// SPDX-License-Identifier: Apache-2.0
//
// A table with an option of every type: each with a flag form, where its type has one, and a form
// that takes an argument. It is for what a table may hold and the tool's has not.

#pragma once

#include "parser_session.h"

#include <limits>

namespace tabledrivenparser::types {

enum Id : uint32_t {
  Id_Words,
  Id_Boolean,
  Id_Enum,
  Id_Address,
  Id_Address64,
  Id_Int,
  Id_IntVector,
  Id_Int64Vector,
  Id_String,
  Id_StringVector,
  Id_CallBack,
  Id_Via,
  Id_Bad,
  Id_Count,
};

inline constexpr uint32_t ExpertMask[] = {2, 0};

// clang-format off
inline constexpr MatchString Rows[] = {
  {"",         Id_Words,        Kind_Required, {},                     nullptr, 0,   0},
  {"add64",    Id_Address64,    Kind_Required, {},                     nullptr, 0,   0},
  {"addr",     Id_Address,      Kind_Required, {},                     nullptr, 0,   0},
  {"address",  Id_Address,      Kind_Optional, {.integer = 0xABCDEF},  nullptr, 0,   Flag_Public},
  {"bad",      Id_Bad,          Kind_Required, {},                     nullptr, 0,   0},
  {"bool",     Id_Boolean,      Kind_Required, {.integer = 7},         nullptr, 0,   0},
  {"call",     Id_CallBack,     Kind_Required, {},                     nullptr, 0,   0},
  {"enum",     Id_Enum,         Kind_Required, {},                     nullptr, 0,   0},
  {"int",      Id_Int,          Kind_Required, {},                     nullptr, 0,   0},
  {"int1",     Id_Int,          Kind_Implied,  {.integer = 1},         nullptr, 0,   Flag_OldSyntax | Flag_Public},
  {"k",        Id_CallBack,     Kind_Implied,  {},                     nullptr, 0,   0},
  {"long",     Id_Int64Vector,  Kind_Required, {},                     nullptr, ':', 0},
  {"long_max", Id_Int64Vector,  Kind_Implied,  {.integer = std::numeric_limits<int64_t>::max()}, nullptr, 0, 0},
  {"many",     Id_IntVector,    Kind_Required, {},                     nullptr, ',', 0},
  {"many5",    Id_IntVector,    Kind_Required, {.integer = 5},         nullptr, 0,   0},
  {"many6",    Id_IntVector,    Kind_Implied,  {.integer = 6},         nullptr, ',', 0},
  {"red",      Id_Enum,         Kind_Implied,  {.integer = 2},         nullptr, 0,   0},
  {"redder",   Id_Enum,         Kind_Implied,  {.integer = 77},        nullptr, 0,   0},
  {"text",     Id_String,       Kind_Required, {},                     nullptr, 0,   0},
  {"text_x",   Id_String,       Kind_Implied,  {.text = "x"},          nullptr, 0,   Flag_Deprecated},
  {"texts",    Id_StringVector, Kind_Required, {},                     nullptr, ',', 0},
  {"texts_y",  Id_StringVector, Kind_Implied,  {.text = "y"},          ExpertMask, ',', 0},
  {"u",        Id_StringVector, Kind_Required, {},                     nullptr, 0,   0},
  {"via",      Id_Via,          Kind_Required, {},                     nullptr, ',', 0},
  {"via0",     Id_Via,          Kind_Implied,  {},                     nullptr, ',', 0},
  {"x",        Id_Boolean,      Kind_Implied,  {.integer = 1},         nullptr, 0,   0},
};

inline constexpr MatchString Colours[] = {
  {"Choose",  0},
  {"green",   1},
  {"Red",     2},
  {"crimson", 2, Kind_Required, {}, nullptr,    1},
  {"violet",  3, Kind_Required, {}, ExpertMask, 0},
};
// clang-format on
inline constexpr Enumeration ColourEnumeration{Colours};

inline constexpr auto WordsRows = rowsNamed(Rows, "");
inline constexpr auto BooleanRows = rowsNamed(Rows, "bool", "x");
inline constexpr auto EnumRows = rowsNamed(Rows, "enum", "red", "redder");
inline constexpr auto AddressRows = rowsNamed(Rows, "addr", "address");
inline constexpr auto Address64Rows = rowsNamed(Rows, "add64");
inline constexpr auto IntRows = rowsNamed(Rows, "int", "int1");
inline constexpr auto ManyRows = rowsNamed(Rows, "many", "many5", "many6");
inline constexpr auto LongRows = rowsNamed(Rows, "long", "long_max");
inline constexpr auto TextRows = rowsNamed(Rows, "text_x", "text");
inline constexpr auto TextsRows = rowsNamed(Rows, "texts", "texts_y", "u");
inline constexpr auto CallRows = rowsNamed(Rows, "call", "k");
inline constexpr auto ViaRows = rowsNamed(Rows, "via", "via0");
inline constexpr auto BadRows = rowsNamed(Rows, "bad");

// clang-format off
inline constexpr std::array<ValueDefinition, Id_Count> Definitions = {{
  {Type_StringVector, Default_Fixed, {.strings = nullptr},      {}, WordsRows.data()},
  {Type_Boolean,      Default_Fixed, {.integer = 0},            {}, BooleanRows.data()},
  {Type_Enum,         Default_Fixed, {.integer = 1},            {.enumeration = &ColourEnumeration}, EnumRows.data()},
  {Type_Address,      Default_Fixed, {.integer = 0x10},         {}, AddressRows.data()},
  {Type_Address64,    Default_None,  {},                        {}, Address64Rows.data()},
  {Type_Int,          Default_Fixed, {.integer = -1},           {}, IntRows.data()},
  {Type_IntVector,    Default_Fixed, {.integers = nullptr},     {}, ManyRows.data()},
  {Type_Int64Vector,  Default_Fixed, {.longIntegers = nullptr}, {}, LongRows.data()},
  {Type_String,       Default_Fixed, {.text = nullptr},         {}, TextRows.data()},
  {Type_StringVector, Default_Fixed, {.strings = nullptr},      {}, TextsRows.data()},
  {Type_CallBack,     Default_Fixed, {.handler = nullptr},      {}, CallRows.data()},
  {Type_ViaFile,      Default_Fixed, {.strings = nullptr},      {}, ViaRows.data()},
  {static_cast<ValueType>(11), Default_Fixed, {},               {}, BadRows.data()},
}};
// clang-format on

static_assert(areWellFormed(Rows, Id_Count));

inline constexpr OptionTable Table{Rows, indexByFirstLetter(Rows)};

// Copies of the tables, which a test may change before it parses.
struct ChangeableTables {
  OptionTable m_Table = Table;
  std::array<ValueDefinition, Id_Count> m_Definitions = Definitions;
};

class Session : public ChangeableTables, public ParserSession {
public:
  Session() : ParserSession(m_Table, m_Definitions) {}
};

} // namespace tabledrivenparser::types
