// SPDX-License-Identifier: Apache-2.0
//
// Values into settings, in one fixed order. That order decides what is printed first, which of two
// actions is the second one, and that --new_files_only goes over -u. The order on the command line
// counts only between a switch and its own opposite, which write the same value.
#include "quarn/process_options.h"

#include "checking/interface/checking.h"
#include "messages/interface/catalogue.h"
#include "messages/interface/output.h"
#include "quarn/option_table.h"
#include "quarn/reporting.h"
#include "support/interface/version_banner.h"
#include "tabledrivenparser/interface/option_report.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/text_sink.h"

#include <cstdlib>
#include <string>
#include <string_view>

namespace quarn {

using tabledrivenparser::Parser;
using tabledrivenparser::TextSink;

namespace {

constexpr size_t CommandLineSize = 4096;

// A row of the action table: the option, what it does, and how much of the archive it touches.
struct ActionOption {
  OptionId option;
  Action action;
  AccessMode accessMode;
};

// clang-format off
constexpr ActionOption EarlyActions[] = {
    {Option_Delete,      Action_Delete,      Access_Write},
    {Option_Entries,     Action_Entries,     Access_Members},
    {Option_Extract,     Action_Extract,     Access_Members},
    {Option_Move,        Action_Move,        Access_Write},
    {Option_Print,       Action_Print,       Access_Members},
    {Option_List,        Action_List,        Access_Headers},
};
constexpr ActionOption LateActions[] = {
    {Option_Insert,      Action_Insert,      Access_Write},
    {Option_Sizes,       Action_Sizes,       Access_Members},
    {Option_Summary,     Action_Summary,     Access_Members},
    {Option_SymbolTable, Action_SymbolTable, Access_Members},
};
// clang-format on

// The text may need a larger buffer than the first guess.
std::string commandLineText(const Parser& parser) {
  std::string text(CommandLineSize, '\0');
  for (;;) {
    TextSink sink(text, TextSink::QuoteMode::Blanks, ' ');
    const size_t needed = printCommandLine(parser, sink);
    const bool fits = needed <= text.size();
    text.resize(fits ? needed - 1 : needed);
    if (fits) return text;
  }
}

void showCommandLine(const Parser& parser, const char* toolName) {
  messages::reportFormat(messages::RemarkWord, nullptr,
                         messages::getMessageText(messages::CommandLineEcho), toolName,
                         commandLineText(parser));
}

[[noreturn]] void showVersionNumber() {
  messages::writeRaw(support::versionNumberText(support::getBuildData()) + "\n");
  std::exit(finishOutput() ? 0 : 1);
}

void applyAction(const Parser& parser, const ActionOption& row, Settings& settings) {
  if (!parser.getBoolean(row.option)) return;
  settings.setAction(row.action);
  // A long listing looks at more than the names.
  const bool isLongListing = row.action == Action_List && settings.verbose;
  settings.raiseAccessMode(isLongListing ? Access_Members : row.accessMode);
}

void applyCreate(const Parser& parser, Settings& settings) {
  if (!parser.getBoolean(Option_Create)) return;
  settings.setAction(Action_Insert);
  settings.createArchive = true;
  settings.raiseAccessMode(Access_Write);
  settings.warnOnCreate = false;
}

void applyPosition(const Parser& parser, Settings& settings) {
  if (parser.isSet(Option_Before)) {
    settings.positionKind = Position_Before;
    settings.positionName = parser.getText(Option_Before);
  } else if (parser.isSet(Option_After)) {
    settings.positionKind = Position_After;
    settings.positionName = parser.getText(Option_After);
  }
}

void applySymbolTableOptions(const Parser& parser, Settings& settings) {
  settings.includeDebugSymbols = parser.getBoolean(Option_DebugSymbols);
  settings.uniqueSymbolsOnly = parser.getBoolean(Option_UniqueSymbols);
  settings.useObjectBuildAttributes = parser.getBoolean(Option_QobixBuildAttributes);
}

void applyUpdateMode(const Parser& parser, Settings& settings) {
  if (parser.getBoolean(Option_Update)) settings.updateMode = Update_IfNotNewer;
  if (parser.getBoolean(Option_NewFilesOnly)) settings.updateMode = Update_IfOlder;
}

void applyNormalise(const Parser& parser, Settings& settings) {
  const int32_t time = parser.getInteger(Option_Normalise);
  if (time == 0) return;
  settings.normaliseHeaders = true;
  settings.normaliseTime = time;
}

} // namespace

void processOptions(const Parser& parser, const char* toolName, Settings& settings) {
  if (parser.getBoolean(Option_ShowCommandLine)) showCommandLine(parser, toolName);
  settings.helpRequested = parser.getBoolean(Option_Help);
  settings.versionRequested = parser.getBoolean(Option_Version);
  if (parser.getBoolean(Option_VersionNumber)) showVersionNumber();
  settings.verbose = parser.getBoolean(Option_Verbose);
  if (parser.getBoolean(Option_QuietCreate)) settings.warnOnCreate = false;
  applyCreate(parser, settings);
  for (const ActionOption& row : EarlyActions)
    applyAction(parser, row, settings);
  if (parser.getBoolean(Option_KeepExisting)) settings.overwriteOnExtract = false;
  if (parser.getBoolean(Option_RebuildSymbolTable)) {
    settings.rebuildSymbolTable = true;
    settings.raiseAccessMode(Access_Write);
  }
  for (const ActionOption& row : LateActions)
    applyAction(parser, row, settings);
  applyPosition(parser, settings);
  if (parser.getBoolean(Option_NoSymbolTable)) {
    settings.suppressSymbolTable = true;
    settings.raiseAccessMode(Access_Write);
  }
  settings.truncateNames = parser.getBoolean(Option_TruncateNames);
  applyUpdateMode(parser, settings);
  applySymbolTableOptions(parser, settings);
  settings.libraryAttributeMap = parser.getText(Option_LibraryAttributeMap);
  applyNormalise(parser, settings);
  // A level that isn't one is dropped without a word.
  if (parser.isSet(Option_CheckingLevel)) {
    checking::set_checking_level(parser.getText(Option_CheckingLevel));
  }
}

} // namespace quarn
