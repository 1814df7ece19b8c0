// SPDX-License-Identifier: Apache-2.0
//
// The tool's options. A row says how an option is written; a definition says what its id holds.
// Look-up, conversion and the report of the command line all read the same rows.
#pragma once

#include "tabledrivenparser/interface/option_table.h"

#include <array>
#include <cstdint>
#include <span>

namespace quarn {

// The index of an option's value.
enum OptionId : uint32_t {
  Option_Create,
  Option_Help,
  Option_ShowCommandLine,
  Option_Version,
  Option_Sizes,
  Option_Entries,
  Option_SymbolTable,
  Option_Summary,
  Option_QuietCreate,
  Option_KeepExisting,
  Option_Delete,
  Option_Move,
  Option_NoSymbolTable,
  Option_Print,
  Option_Insert,
  Option_RebuildSymbolTable,
  Option_List,
  Option_TruncateNames,
  Option_Update,
  Option_Verbose,
  Option_Extract,
  Option_NewFilesOnly,
  Option_DebugSymbols,
  Option_UniqueSymbols,
  Option_Normalise,
  Option_QobixBuildAttributes,
  Option_After,
  Option_Before,
  Option_CheckingLevel,
  Option_DiagnosticStyle,
  Option_SuppressDiagnostics,
  Option_DiagnosticErrors,
  Option_DiagnosticWarnings,
  Option_DiagnosticRemarks,
  Option_VersionNumber,
  Option_MessageLocale,
  Option_Words,
  Option_LibraryAttributeMap,
  Option_ViaFile,
  Option_Count,
};

[[nodiscard]] const tabledrivenparser::OptionTable& getOptionTable();
[[nodiscard]] std::span<const tabledrivenparser::ValueDefinition> getOptionDefinitions();

using OptionValues = std::array<tabledrivenparser::ValueRecord, Option_Count>;

} // namespace quarn
