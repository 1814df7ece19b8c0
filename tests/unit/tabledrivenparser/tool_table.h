// SPDX-License-Identifier: Apache-2.0
// A table like that of an archive tool: letters and long names, twins in both cases, old syntax.
#pragma once

#include "parser_session.h"

namespace tabledrivenparser::tool {

enum Id : uint32_t {
  Id_Create,
  Id_Help,
  Id_ShowCommandLine,
  Id_Version,
  Id_Sizes,
  Id_NoBanner,
  Id_KeepOld,
  Id_Delete,
  Id_Replace,
  Id_List,
  Id_Truncate,
  Id_Verbose,
  Id_Extract,
  Id_NewFilesOnly,
  Id_DebugSymbols,
  Id_UniqueSymbols,
  Id_Normalise,
  Id_After,
  Id_Before,
  Id_CheckLevel,
  Id_DiagStyle,
  Id_DiagError,
  Id_DiagWarning,
  Id_VersionNumber,
  Id_Words,
  Id_Map,
  Id_Via,
  Id_Count,
};

constexpr Value k_False{.integer = 0};
constexpr Value k_True{.integer = 1};
constexpr uint8_t k_Old = Flag_OldSyntax | Flag_Public;
constexpr uint8_t k_New = Flag_Public;

// clang-format off
inline constexpr MatchString rows[] = {
  {"",                  Id_Words,           Kind_Required, {},      nullptr, 0,   k_New},
  {"a",                 Id_After,           Kind_Required, {},      nullptr, ',', k_Old},
  {"b",                 Id_Before,          Kind_Required, {},      nullptr, ',', k_Old},
  {"C",                 Id_KeepOld,         Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"c",                 Id_NoBanner,        Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"create",            Id_Create,          Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"d",                 Id_Delete,          Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"db_check",          Id_CheckLevel,      Kind_Required, {},      nullptr, ',', k_New},
  {"debug_symbols",     Id_DebugSymbols,    Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"diag_error",        Id_DiagError,       Kind_Required, {},      nullptr, ',', k_New},
  {"diag_style",        Id_DiagStyle,       Kind_Required, {},      nullptr, ',', k_New},
  {"diag_warning",      Id_DiagWarning,     Kind_Required, {},      nullptr, ',', k_New},
  {"h",                 Id_Help,            Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"help",              Id_Help,            Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"i",                 Id_Before,          Kind_Required, {},      nullptr, ',', k_Old},
  {"libattrmap",        Id_Map,             Kind_Required, {},      nullptr, ',', k_New},
  {"new_files_only",    Id_NewFilesOnly,    Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"no_debug_symbols",  Id_DebugSymbols,    Kind_Implied,  k_False, nullptr, ',', k_New},
  {"no_normalise",      Id_Normalise,       Kind_Required, {},      nullptr, ',', k_New},
  {"no_unique_symbols", Id_UniqueSymbols,   Kind_Implied,  k_False, nullptr, ',', k_New},
  {"normalise",         Id_Normalise,       Kind_Required, {},      nullptr, ',', k_New},
  {"q",                 Id_Replace,         Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"r",                 Id_Replace,         Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"show_cmdline",      Id_ShowCommandLine, Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"sizes",             Id_Sizes,           Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"T",                 Id_Truncate,        Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"t",                 Id_List,            Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"unique_symbols",    Id_UniqueSymbols,   Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"V",                 Id_Version,         Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"v",                 Id_Verbose,         Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"version",           Id_Version,         Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"version_number",    Id_VersionNumber,   Kind_Implied,  k_True,  nullptr, ',', k_New},
  {"via",               Id_Via,             Kind_Required, {},      nullptr, ',', k_Old},
  {"vsn",               Id_Version,         Kind_Implied,  k_True,  nullptr, ',', k_Old},
  {"x",                 Id_Extract,         Kind_Implied,  k_True,  nullptr, ',', k_Old},
};

inline constexpr MatchString styles[] = {
  {"list", 0}, {"zev", 1}, {"ide", 2}, {"devstudio", 3}, {"gnu", 4},
};
// clang-format on

inline constexpr Enumeration styleEnumeration{styles};

inline constexpr auto createRows = rowsNamed(rows, "create");
inline constexpr auto helpRows = rowsNamed(rows, "help", "h");
inline constexpr auto showRows = rowsNamed(rows, "show_cmdline");
inline constexpr auto versionRows = rowsNamed(rows, "vsn", "version", "V");
inline constexpr auto sizesRows = rowsNamed(rows, "sizes");
inline constexpr auto noBannerRows = rowsNamed(rows, "c");
inline constexpr auto keepOldRows = rowsNamed(rows, "C");
inline constexpr auto deleteRows = rowsNamed(rows, "d");
inline constexpr auto replaceRows = rowsNamed(rows, "r", "q");
inline constexpr auto listRows = rowsNamed(rows, "t");
inline constexpr auto truncateRows = rowsNamed(rows, "T");
inline constexpr auto verboseRows = rowsNamed(rows, "v");
inline constexpr auto extractRows = rowsNamed(rows, "x");
inline constexpr auto newFilesRows = rowsNamed(rows, "new_files_only");
inline constexpr auto debugRows = rowsNamed(rows, "debug_symbols", "no_debug_symbols");
inline constexpr auto uniqueRows = rowsNamed(rows, "unique_symbols", "no_unique_symbols");
inline constexpr auto normaliseRows = rowsNamed(rows, "normalise", "no_normalise");
inline constexpr auto afterRows = rowsNamed(rows, "a");
inline constexpr auto beforeRows = rowsNamed(rows, "b", "i");
inline constexpr auto checkRows = rowsNamed(rows, "db_check");
inline constexpr auto styleRows = rowsNamed(rows, "diag_style");
inline constexpr auto errorRows = rowsNamed(rows, "diag_error");
inline constexpr auto warningRows = rowsNamed(rows, "diag_warning");
inline constexpr auto numberRows = rowsNamed(rows, "version_number");
inline constexpr auto wordsRows = rowsNamed(rows, "");
inline constexpr auto mapRows = rowsNamed(rows, "libattrmap");
inline constexpr auto viaRows = rowsNamed(rows, "via");

constexpr ValueDefinition flagOf(const MatchString* const* list) {
  return {Type_Boolean, Default_Fixed, k_False, {}, list};
}
constexpr ValueDefinition textOf(const MatchString* const* list) {
  return {Type_String, Default_Fixed, {.text = nullptr}, {}, list};
}
constexpr ValueDefinition textsOf(const MatchString* const* list) {
  return {Type_StringVector, Default_Fixed, {.strings = nullptr}, {}, list};
}

// clang-format off
inline constexpr ValueDefinition definitions[] = {
  flagOf(createRows.data()),   flagOf(helpRows.data()),     flagOf(showRows.data()),
  flagOf(versionRows.data()),  flagOf(sizesRows.data()),    flagOf(noBannerRows.data()),
  flagOf(keepOldRows.data()),  flagOf(deleteRows.data()),   flagOf(replaceRows.data()),
  flagOf(listRows.data()),     flagOf(truncateRows.data()), flagOf(verboseRows.data()),
  flagOf(extractRows.data()),  flagOf(newFilesRows.data()), flagOf(debugRows.data()),
  flagOf(uniqueRows.data()),
  {Type_Int, Default_Fixed, {.integer = 0}, {}, normaliseRows.data()},
  textOf(afterRows.data()),    textOf(beforeRows.data()),   textOf(checkRows.data()),
  {Type_Enum, Default_Fixed, {.integer = 1}, {.enumeration = &styleEnumeration}, styleRows.data()},
  textsOf(errorRows.data()),   textsOf(warningRows.data()), flagOf(numberRows.data()),
  textsOf(wordsRows.data()),   textOf(mapRows.data()),
  {Type_ViaFile, Default_Fixed, {.strings = nullptr}, {}, viaRows.data()},
};
// clang-format on

static_assert(std::size(definitions) == Id_Count);
static_assert(areWellFormed(rows, Id_Count));
static_assert(listEveryRow(definitions, rows));

inline constexpr OptionTable table{rows, indexByFirstLetter(rows), Policy_Warn, Policy_Accept};

class Session : public ParserSession {
public:
  Session() : ParserSession(table, definitions) {}
};

// The reports of one command line.
inline Lines reportsOf(std::initializer_list<const char*> words) {
  Session session;
  session.parse(words);
  return session.reports();
}

} // namespace tabledrivenparser::tool
