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

constexpr Value off{.integer = 0};
constexpr Value on{.integer = 1};
constexpr uint8_t oldRow = Flag_OldSyntax | Flag_Public;
constexpr uint8_t newRow = Flag_Public;

// clang-format off
inline constexpr MatchString rows[] = {
  {"",                  Id_Words,           Kind_Required, {},      nullptr, 0,   newRow},
  {"a",                 Id_After,           Kind_Required, {},      nullptr, ',', oldRow},
  {"b",                 Id_Before,          Kind_Required, {},      nullptr, ',', oldRow},
  {"C",                 Id_KeepOld,         Kind_Implied,  on,  nullptr, ',', newRow},
  {"c",                 Id_NoBanner,        Kind_Implied,  on,  nullptr, ',', newRow},
  {"create",            Id_Create,          Kind_Implied,  on,  nullptr, ',', oldRow},
  {"d",                 Id_Delete,          Kind_Implied,  on,  nullptr, ',', oldRow},
  {"db_check",          Id_CheckLevel,      Kind_Required, {},      nullptr, ',', newRow},
  {"debug_symbols",     Id_DebugSymbols,    Kind_Implied,  on,  nullptr, ',', newRow},
  {"diag_error",        Id_DiagError,       Kind_Required, {},      nullptr, ',', newRow},
  {"diag_style",        Id_DiagStyle,       Kind_Required, {},      nullptr, ',', newRow},
  {"diag_warning",      Id_DiagWarning,     Kind_Required, {},      nullptr, ',', newRow},
  {"h",                 Id_Help,            Kind_Implied,  on,  nullptr, ',', oldRow},
  {"help",              Id_Help,            Kind_Implied,  on,  nullptr, ',', oldRow},
  {"i",                 Id_Before,          Kind_Required, {},      nullptr, ',', oldRow},
  {"libattrmap",        Id_Map,             Kind_Required, {},      nullptr, ',', newRow},
  {"new_files_only",    Id_NewFilesOnly,    Kind_Implied,  on,  nullptr, ',', oldRow},
  {"no_debug_symbols",  Id_DebugSymbols,    Kind_Implied,  off, nullptr, ',', newRow},
  {"no_normalise",      Id_Normalise,       Kind_Required, {},      nullptr, ',', newRow},
  {"no_unique_symbols", Id_UniqueSymbols,   Kind_Implied,  off, nullptr, ',', newRow},
  {"normalise",         Id_Normalise,       Kind_Required, {},      nullptr, ',', newRow},
  {"q",                 Id_Replace,         Kind_Implied,  on,  nullptr, ',', oldRow},
  {"r",                 Id_Replace,         Kind_Implied,  on,  nullptr, ',', oldRow},
  {"show_cmdline",      Id_ShowCommandLine, Kind_Implied,  on,  nullptr, ',', newRow},
  {"sizes",             Id_Sizes,           Kind_Implied,  on,  nullptr, ',', oldRow},
  {"T",                 Id_Truncate,        Kind_Implied,  on,  nullptr, ',', newRow},
  {"t",                 Id_List,            Kind_Implied,  on,  nullptr, ',', newRow},
  {"unique_symbols",    Id_UniqueSymbols,   Kind_Implied,  on,  nullptr, ',', newRow},
  {"V",                 Id_Version,         Kind_Implied,  on,  nullptr, ',', newRow},
  {"v",                 Id_Verbose,         Kind_Implied,  on,  nullptr, ',', newRow},
  {"version",           Id_Version,         Kind_Implied,  on,  nullptr, ',', oldRow},
  {"version_number",    Id_VersionNumber,   Kind_Implied,  on,  nullptr, ',', newRow},
  {"via",               Id_Via,             Kind_Required, {},      nullptr, ',', oldRow},
  {"vsn",               Id_Version,         Kind_Implied,  on,  nullptr, ',', oldRow},
  {"x",                 Id_Extract,         Kind_Implied,  on,  nullptr, ',', oldRow},
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
  return {Type_Boolean, Default_Fixed, off, {}, list};
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
