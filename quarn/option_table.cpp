// SPDX-License-Identifier: Apache-2.0
//
// The rows are sorted by name, as the look-up by prefix wants them, and the compiler checks that
// they are. Several rows may lead to one id ("r" and "q" insert); a row's value is what its option
// stores without an argument, so "no_..." is the same id with another value.
#include "quarn/option_table.h"

#include "messages/interface/diagnostic_control.h"

namespace quarn {

using namespace tabledrivenparser;

namespace {

// What a row stores when its option is given without an argument.
constexpr Value On = {.integer = 1};
constexpr Value Off = {.integer = 0};

constexpr uint8_t Public = Flag_Public;
constexpr uint8_t PublicOld = Flag_Public | Flag_OldSyntax;

// clang-format off
constexpr MatchString Rows[] = {
    {"",                   Option_Words,                Kind_Required, Off, nullptr, 0,   Public},
    {"a",                  Option_After,                Kind_Required, Off, nullptr, ',', PublicOld},
    {"b",                  Option_Before,               Kind_Required, Off, nullptr, ',', PublicOld},
    {"C",                  Option_KeepExisting,         Kind_Implied,  On,  nullptr, ',', Public},
    {"c",                  Option_QuietCreate,          Kind_Implied,  On,  nullptr, ',', Public},
    {"create",             Option_Create,               Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"d",                  Option_Delete,               Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"db_check",           Option_CheckingLevel,        Kind_Required, Off, nullptr, ',', Public},
    {"debug_symbols",      Option_DebugSymbols,         Kind_Implied,  On,  nullptr, ',', Public},
    {"diag_error",         Option_DiagnosticErrors,     Kind_Required, Off, nullptr, ',', Public},
    {"diag_remark",        Option_DiagnosticRemarks,    Kind_Required, Off, nullptr, ',', Public},
    {"diag_style",         Option_DiagnosticStyle,      Kind_Required, Off, nullptr, ',', Public},
    {"diag_suppress",      Option_SuppressDiagnostics,  Kind_Required, Off, nullptr, ',', Public},
    {"diag_warning",       Option_DiagnosticWarnings,   Kind_Required, Off, nullptr, ',', Public},
    {"entries",            Option_Entries,              Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"h",                  Option_Help,                 Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"help",               Option_Help,                 Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"i",                  Option_Before,               Kind_Required, Off, nullptr, ',', PublicOld},
    {"libattrmap",         Option_LibraryAttributeMap,  Kind_Required, Off, nullptr, ',', Public},
    {"m",                  Option_Move,                 Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"message_locale",     Option_MessageLocale,        Kind_Required, Off, nullptr, ',', Public},
    {"n",                  Option_NoSymbolTable,        Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"new_files_only",     Option_NewFilesOnly,         Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"no_debug_symbols",   Option_DebugSymbols,         Kind_Implied,  Off, nullptr, ',', Public},
    {"no_normalise",       Option_Normalise,            Kind_Required, Off, nullptr, ',', Public},
    {"no_qobix_buildattr", Option_QobixBuildAttributes, Kind_Implied,  Off, nullptr, ',', Public},
    {"no_unique_symbols",  Option_UniqueSymbols,        Kind_Implied,  Off, nullptr, ',', Public},
    {"normalise",          Option_Normalise,            Kind_Required, Off, nullptr, ',', Public},
    {"p",                  Option_Print,                Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"q",                  Option_Insert,               Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"qobix_buildattr",    Option_QobixBuildAttributes, Kind_Implied,  On,  nullptr, ',', Public},
    {"r",                  Option_Insert,               Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"s",                  Option_RebuildSymbolTable,   Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"show_cmdline",       Option_ShowCommandLine,      Kind_Implied,  On,  nullptr, ',', Public},
    {"sizes",              Option_Sizes,                Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"T",                  Option_TruncateNames,        Kind_Implied,  On,  nullptr, ',', Public},
    {"t",                  Option_List,                 Kind_Implied,  On,  nullptr, ',', Public},
    {"u",                  Option_Update,               Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"unique_symbols",     Option_UniqueSymbols,        Kind_Implied,  On,  nullptr, ',', Public},
    {"V",                  Option_Version,              Kind_Implied,  On,  nullptr, ',', Public},
    {"v",                  Option_Verbose,              Kind_Implied,  On,  nullptr, ',', Public},
    {"version",            Option_Version,              Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"version_number",     Option_VersionNumber,        Kind_Implied,  On,  nullptr, ',', Public},
    {"via",                Option_ViaFile,              Kind_Required, Off, nullptr, ',', PublicOld},
    {"vsn",                Option_Version,              Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"x",                  Option_Extract,              Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"zs",                 Option_SymbolTable,          Kind_Implied,  On,  nullptr, ',', PublicOld},
    {"zt",                 Option_Summary,              Kind_Implied,  On,  nullptr, ',', PublicOld},
};

constexpr MatchString DiagnosticStyles[] = {
    {"list",      messages::DiagnosticStyle_List},
    {"zev",       messages::DiagnosticStyle_Zev},
    {"ide",       messages::DiagnosticStyle_Ide},
    {"devstudio", messages::DiagnosticStyle_Devstudio},
    {"gnu",       messages::DiagnosticStyle_Gnu},
};
// clang-format on
constexpr Enumeration DiagnosticStyleNames = {DiagnosticStyles};

// A name as a template argument.
template <size_t Size>
struct RowName {
  constexpr RowName(const char (&text)[Size]) {
    for (size_t i = 0; i < Size; ++i)
      characters[i] = text[i];
  }
  [[nodiscard]] constexpr std::string_view getText() const { return {characters, Size - 1}; }
  char characters[Size] = {};
};

// The rows that set one option, the one to be shown first in front.
template <RowName... Names>
constexpr auto RowsNamed = rowsNamed(Rows, Names.getText()...);

template <RowName... Names>
constexpr ValueDefinition flagOption() {
  return {Type_Boolean, Default_Fixed, Off, {}, RowsNamed<Names...>.data()};
}

template <ValueType Type, RowName... Names>
constexpr ValueDefinition option(Value defaultValue = {}, Constraint constraint = {}) {
  return {Type, Default_Fixed, defaultValue, constraint, RowsNamed<Names...>.data()};
}

constexpr Value NoText = {.text = nullptr};
constexpr Value NoTexts = {.strings = nullptr};

// In the order of OptionId.
constexpr ValueDefinition Definitions[] = {
    flagOption<"create">(),
    flagOption<"help", "h">(),
    flagOption<"show_cmdline">(),
    flagOption<"vsn", "version", "V">(),
    flagOption<"sizes">(),
    flagOption<"entries">(),
    flagOption<"zs">(),
    flagOption<"zt">(),
    flagOption<"c">(),
    flagOption<"C">(),
    flagOption<"d">(),
    flagOption<"m">(),
    flagOption<"n">(),
    flagOption<"p">(),
    flagOption<"r", "q">(),
    flagOption<"s">(),
    flagOption<"t">(),
    flagOption<"T">(),
    flagOption<"u">(),
    flagOption<"v">(),
    flagOption<"x">(),
    flagOption<"new_files_only">(),
    flagOption<"debug_symbols", "no_debug_symbols">(),
    flagOption<"unique_symbols", "no_unique_symbols">(),
    option<Type_Int, "normalise", "no_normalise">(),
    flagOption<"qobix_buildattr", "no_qobix_buildattr">(),
    option<Type_String, "a">(NoText),
    option<Type_String, "b", "i">(NoText),
    option<Type_String, "db_check">(NoText),
    option<Type_Enum, "diag_style">({.integer = messages::DiagnosticStyle_Zev},
                                    {.enumeration = &DiagnosticStyleNames}),
    option<Type_StringVector, "diag_suppress">(NoTexts),
    option<Type_StringVector, "diag_error">(NoTexts),
    option<Type_StringVector, "diag_warning">(NoTexts),
    option<Type_StringVector, "diag_remark">(NoTexts),
    flagOption<"version_number">(),
    option<Type_String, "message_locale">(NoText),
    option<Type_StringVector, "">(NoTexts),
    option<Type_String, "libattrmap">(NoText),
    option<Type_ViaFile, "via">(NoTexts),
};

static_assert(areWellFormed(Rows, Option_Count));
static_assert(std::size(Definitions) == Option_Count);
static_assert(listEveryRow(Definitions, Rows));

} // namespace

const OptionTable& getOptionTable() {
  static constexpr OptionTable Table = {
      Rows, indexByFirstLetter(Rows), Policy_Warn, Policy_Accept, 0xFFFFFFFF, nullptr};
  return Table;
}

std::span<const ValueDefinition> getOptionDefinitions() {
  return Definitions;
}

} // namespace quarn
