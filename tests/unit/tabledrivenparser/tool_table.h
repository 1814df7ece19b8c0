// SPDX-License-Identifier: Apache-2.0
//
// A table like that of an archive tool: letters and long names, twins in both cases, old syntax. It
// is the tests' own, so that a new option of the tool changes nothing here.

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

constexpr Value Off{.integer = 0};
constexpr Value On{.integer = 1};
constexpr uint8_t OldRow = Flag_OldSyntax | Flag_Public;
constexpr uint8_t NewRow = Flag_Public;

// clang-format off
inline constexpr MatchString Rows[] = {
  {"",                  Id_Words,           Kind_Required, {},      nullptr, 0,   NewRow},
  {"a",                 Id_After,           Kind_Required, {},      nullptr, ',', OldRow},
  {"b",                 Id_Before,          Kind_Required, {},      nullptr, ',', OldRow},
  {"C",                 Id_KeepOld,         Kind_Implied,  On,  nullptr, ',', NewRow},
  {"c",                 Id_NoBanner,        Kind_Implied,  On,  nullptr, ',', NewRow},
  {"create",            Id_Create,          Kind_Implied,  On,  nullptr, ',', OldRow},
  {"d",                 Id_Delete,          Kind_Implied,  On,  nullptr, ',', OldRow},
  {"db_check",          Id_CheckLevel,      Kind_Required, {},      nullptr, ',', NewRow},
  {"debug_symbols",     Id_DebugSymbols,    Kind_Implied,  On,  nullptr, ',', NewRow},
  {"diag_error",        Id_DiagError,       Kind_Required, {},      nullptr, ',', NewRow},
  {"diag_style",        Id_DiagStyle,       Kind_Required, {},      nullptr, ',', NewRow},
  {"diag_warning",      Id_DiagWarning,     Kind_Required, {},      nullptr, ',', NewRow},
  {"h",                 Id_Help,            Kind_Implied,  On,  nullptr, ',', OldRow},
  {"help",              Id_Help,            Kind_Implied,  On,  nullptr, ',', OldRow},
  {"i",                 Id_Before,          Kind_Required, {},      nullptr, ',', OldRow},
  {"libattrmap",        Id_Map,             Kind_Required, {},      nullptr, ',', NewRow},
  {"new_files_only",    Id_NewFilesOnly,    Kind_Implied,  On,  nullptr, ',', OldRow},
  {"no_debug_symbols",  Id_DebugSymbols,    Kind_Implied,  Off, nullptr, ',', NewRow},
  {"no_normalise",      Id_Normalise,       Kind_Required, {},      nullptr, ',', NewRow},
  {"no_unique_symbols", Id_UniqueSymbols,   Kind_Implied,  Off, nullptr, ',', NewRow},
  {"normalise",         Id_Normalise,       Kind_Required, {},      nullptr, ',', NewRow},
  {"q",                 Id_Replace,         Kind_Implied,  On,  nullptr, ',', OldRow},
  {"r",                 Id_Replace,         Kind_Implied,  On,  nullptr, ',', OldRow},
  {"show_cmdline",      Id_ShowCommandLine, Kind_Implied,  On,  nullptr, ',', NewRow},
  {"sizes",             Id_Sizes,           Kind_Implied,  On,  nullptr, ',', OldRow},
  {"T",                 Id_Truncate,        Kind_Implied,  On,  nullptr, ',', NewRow},
  {"t",                 Id_List,            Kind_Implied,  On,  nullptr, ',', NewRow},
  {"unique_symbols",    Id_UniqueSymbols,   Kind_Implied,  On,  nullptr, ',', NewRow},
  {"V",                 Id_Version,         Kind_Implied,  On,  nullptr, ',', NewRow},
  {"v",                 Id_Verbose,         Kind_Implied,  On,  nullptr, ',', NewRow},
  {"version",           Id_Version,         Kind_Implied,  On,  nullptr, ',', OldRow},
  {"version_number",    Id_VersionNumber,   Kind_Implied,  On,  nullptr, ',', NewRow},
  {"via",               Id_Via,             Kind_Required, {},      nullptr, ',', OldRow},
  {"vsn",               Id_Version,         Kind_Implied,  On,  nullptr, ',', OldRow},
  {"x",                 Id_Extract,         Kind_Implied,  On,  nullptr, ',', OldRow},
};

inline constexpr MatchString Styles[] = {
  {"list", 0}, {"zev", 1}, {"ide", 2}, {"devstudio", 3}, {"gnu", 4},
};
// clang-format on

inline constexpr Enumeration StyleEnumeration{Styles};

inline constexpr auto CreateRows = rowsNamed(Rows, "create");
inline constexpr auto HelpRows = rowsNamed(Rows, "help", "h");
inline constexpr auto ShowRows = rowsNamed(Rows, "show_cmdline");
inline constexpr auto VersionRows = rowsNamed(Rows, "vsn", "version", "V");
inline constexpr auto SizesRows = rowsNamed(Rows, "sizes");
inline constexpr auto NoBannerRows = rowsNamed(Rows, "c");
inline constexpr auto KeepOldRows = rowsNamed(Rows, "C");
inline constexpr auto DeleteRows = rowsNamed(Rows, "d");
inline constexpr auto ReplaceRows = rowsNamed(Rows, "r", "q");
inline constexpr auto ListRows = rowsNamed(Rows, "t");
inline constexpr auto TruncateRows = rowsNamed(Rows, "T");
inline constexpr auto VerboseRows = rowsNamed(Rows, "v");
inline constexpr auto ExtractRows = rowsNamed(Rows, "x");
inline constexpr auto NewFilesRows = rowsNamed(Rows, "new_files_only");
inline constexpr auto DebugRows = rowsNamed(Rows, "debug_symbols", "no_debug_symbols");
inline constexpr auto UniqueRows = rowsNamed(Rows, "unique_symbols", "no_unique_symbols");
inline constexpr auto NormaliseRows = rowsNamed(Rows, "normalise", "no_normalise");
inline constexpr auto AfterRows = rowsNamed(Rows, "a");
inline constexpr auto BeforeRows = rowsNamed(Rows, "b", "i");
inline constexpr auto CheckRows = rowsNamed(Rows, "db_check");
inline constexpr auto StyleRows = rowsNamed(Rows, "diag_style");
inline constexpr auto ErrorRows = rowsNamed(Rows, "diag_error");
inline constexpr auto WarningRows = rowsNamed(Rows, "diag_warning");
inline constexpr auto NumberRows = rowsNamed(Rows, "version_number");
inline constexpr auto WordsRows = rowsNamed(Rows, "");
inline constexpr auto MapRows = rowsNamed(Rows, "libattrmap");
inline constexpr auto ViaRows = rowsNamed(Rows, "via");

constexpr ValueDefinition flagOf(const MatchString* const* list) {
  return {Type_Boolean, Default_Fixed, Off, {}, list};
}
constexpr ValueDefinition textOf(const MatchString* const* list) {
  return {Type_String, Default_Fixed, {.text = nullptr}, {}, list};
}
constexpr ValueDefinition textsOf(const MatchString* const* list) {
  return {Type_StringVector, Default_Fixed, {.strings = nullptr}, {}, list};
}

// clang-format off
inline constexpr ValueDefinition Definitions[] = {
  flagOf(CreateRows.data()),   flagOf(HelpRows.data()),     flagOf(ShowRows.data()),
  flagOf(VersionRows.data()),  flagOf(SizesRows.data()),    flagOf(NoBannerRows.data()),
  flagOf(KeepOldRows.data()),  flagOf(DeleteRows.data()),   flagOf(ReplaceRows.data()),
  flagOf(ListRows.data()),     flagOf(TruncateRows.data()), flagOf(VerboseRows.data()),
  flagOf(ExtractRows.data()),  flagOf(NewFilesRows.data()), flagOf(DebugRows.data()),
  flagOf(UniqueRows.data()),
  {Type_Int, Default_Fixed, {.integer = 0}, {}, NormaliseRows.data()},
  textOf(AfterRows.data()),    textOf(BeforeRows.data()),   textOf(CheckRows.data()),
  {Type_Enum, Default_Fixed, {.integer = 1}, {.enumeration = &StyleEnumeration}, StyleRows.data()},
  textsOf(ErrorRows.data()),   textsOf(WarningRows.data()), flagOf(NumberRows.data()),
  textsOf(WordsRows.data()),   textOf(MapRows.data()),
  {Type_ViaFile, Default_Fixed, {.strings = nullptr}, {}, ViaRows.data()},
};
// clang-format on

static_assert(std::size(Definitions) == Id_Count);
static_assert(areWellFormed(Rows, Id_Count));

inline constexpr OptionTable Table{Rows, indexByFirstLetter(Rows), Policy_Warn, Policy_Accept};

class Session : public ParserSession {
public:
  Session() : ParserSession(Table, Definitions) {}
};

// The reports of one command line.
inline Lines reportsOf(std::initializer_list<const char*> words) {
  Session session;
  session.parse(words);
  return session.getReports();
}

} // namespace tabledrivenparser::tool
