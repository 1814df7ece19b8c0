// SPDX-License-Identifier: Apache-2.0
#include "quarn/quarn_main.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "arlib/interface/writer_turn.h"
#include "checking/interface/checking.h"
#include "elfext/interface/library_attribute_map.h"
#include "messages/interface/output.h"
#include "quarn/actions.h"
#include "quarn/arlib_error_handler.h"
#include "quarn/banner.h"
#include "quarn/file_list.h"
#include "quarn/member_selection.h"
#include "quarn/option_listeners.h"
#include "quarn/option_reporter.h"
#include "quarn/option_table.h"
#include "quarn/process_options.h"
#include "quarn/reporting.h"
#include "support/interface/host_files.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/stdio_via_file_reader.h"

#include <cerrno>
#include <memory>
#include <utility>

namespace quarn {

using tabledrivenparser::Parser;
using tabledrivenparser::StrList;

namespace {

// The letters that the message names are these, though there are more actions.
constexpr const char* ActionLetters = "dmpqrtx";

void scanOptions(Parser& parser, int argc, const char* const* argv) {
  for (int i = 1; i < argc;) {
    i += static_cast<int>(parser.parseWord(argv[i], i + 1 < argc ? argv[i + 1] : nullptr));
  }
}

bool hasErrors() {
  return messages::errorCount() != 0;
}

BannerMode bannerModeOf(const Settings& settings) {
  return settings.versionRequested ? BannerMode::Alone : BannerMode::WithHelp;
}

// The first word that is no option; an empty one counts as none.
const char* archiveNameOf(const StrList* words) {
  if (words == nullptr || words->isEmpty()) return nullptr;
  const char* first = *words->begin();
  return *first == '\0' ? nullptr : first;
}

void fillFileList(const Parser& parser, support::Host& host, Settings& settings) {
  const bool expand = settings.createArchive || parser.booleanValue(Option_Insert) ||
                      parser.isSet(Option_Before) || parser.isSet(Option_After);
  bool isArchiveName = true;
  for (const char* word : *parser.textsValue(Option_Words)) {
    if (!isArchiveName) addFileArgument(host, word, expand, settings.fileList);
    isArchiveName = false;
  }
}

// Whether there is something to work on and something to do; if not, the user has been told.
bool isWorkGiven(int argc, const Parser& parser, const char* archiveName, support::Host& host,
                 const char* toolName, Settings& settings) {
  if (hasErrors()) return false;
  if (settings.helpRequested || (argc <= 1 && !settings.createArchive)) {
    showBanner(BannerMode::WithHelp, toolName);
    return false;
  }
  if (archiveName == nullptr) {
    if (!settings.versionRequested) {
      reportMessage(messages::ErrorWord, messages::NoArchiveSpecified);
    }
    showBanner(bannerModeOf(settings), toolName);
    return false;
  }
  fillFileList(parser, host, settings);
  if (hasErrors()) return false;
  if (settings.action == Action_None && !settings.rebuildSymbolTable) {
    reportMessage(messages::ErrorWord, messages::NoActionSpecified, ActionLetters);
    showBanner(bannerModeOf(settings), toolName);
    return false;
  }
  return true;
}

// A new archive is made where the file is missing or --create says to look away from what it holds.
// Who is going to write waits for his turn at the file first.
bool openArchive(Run& run, const char* name) {
  run.archive.setClientData(&run.openStatus);
  run.archive.setFileName(name);
  std::shared_ptr<support::SourceFile> file;
  support::FileKind kind = support::FileKind::Nothing;
  if (run.settings.accessMode == Access_Write) {
    file = arlib::takeTurn(run.archive.getSourceFiles(), name, kind);
  } else {
    kind = support::fileKind(run.archive.getHost(), name);
  }
  const bool exists = kind != support::FileKind::Nothing;
  if (exists && !run.settings.createArchive) {
    return file != nullptr ? arlib::readFile(file, run.archive)
                           : arlib::readFile(name, run.archive);
  }
  run.archive.setOwnFile(std::move(file));
  run.openStatus.missing = true;
  run.openStatus.errorNumber = exists ? 0 : ENOENT;
  return true;
}

// The tables count here: a position is a place in the list.
bool findPosition(Run& run) {
  if (run.settings.positionKind == Position_None) return true;
  int32_t index = 0;
  for (const arlib::ArchiveMember* member : run.archive.getMembers()) {
    if (memberMatches(*member, run.settings.positionName)) {
      run.position = run.settings.positionKind == Position_After ? index + 1 : index;
      return true;
    }
    ++index;
  }
  reportMessage(messages::ErrorWord, messages::PositionNotFound, run.settings.positionName);
  return false;
}

void dispatch(Run& run) {
  switch (run.settings.action) {
  case Action_None:
    return;
  case Action_Insert:
    return insertFiles(run);
  case Action_Delete:
    return deleteMembers(run);
  case Action_Entries:
    return reportObjects(run, Report_Entries);
  case Action_Extract:
    return extractMembers(run);
  case Action_Move:
    return moveMembers(run);
  case Action_Print:
    return printMembers(run);
  case Action_List:
    return listMembers(run);
  case Action_Sizes:
    return reportObjects(run, Report_Sizes);
  case Action_Summary:
    return reportObjects(run, Report_Entries | Report_Sizes);
  case Action_SymbolTable:
    return listSymbolTable(run);
  }
  QUARN_ASSERT(1, false);
}

void chooseSymbolTableMode(Run& run) {
  if (run.settings.suppressSymbolTable) {
    run.archive.setSymbolTableMode(arlib::SymbolTableMode::Never);
  } else if (run.settings.accessMode == Access_Write) {
    run.archive.setSymbolTableMode(arlib::SymbolTableMode::Always);
  }
}

// How a run ended. Who has been overtaken has made a new archive where somebody else was faster:
// nothing is written, and the run may start over with the archive that is there now.
enum class RunEnd { Done, Overtaken };

// The tables are rebuilt before the last look at the error count, so that a warning of the rebuild
// that was raised to an error keeps the old file as well.
RunEnd writeArchive(Run& run) {
  const bool isNew = run.openStatus.missing;
  if (run.settings.accessMode != Access_Write && !isNew) return RunEnd::Done;
  if (isNew && run.settings.warnOnCreate) {
    reportMessage(messages::RemarkWord, messages::CreatingArchive, run.archiveName());
  }
  run.archive.updateAuxiliaryMembers();
  if (hasErrors()) return RunEnd::Done;
  if (!isNew || run.openStatus.errorNumber == 0) {
    arlib::writeFile(run.archiveName(), run.archive);
    return RunEnd::Done;
  }
  const arlib::NewFile newFile = arlib::writeNewFile(run.archiveName(), run.archive);
  return newFile == arlib::NewFile::Exists ? RunEnd::Overtaken : RunEnd::Done;
}

RunEnd runAction(Run& run, const char* archiveName, messages::HeldOutput& output) {
  const bool isOpen = openArchive(run, archiveName);
  // Nobody can overtake who has his turn.
  if (!run.openStatus.missing) output.release();
  if (!isOpen || hasErrors()) return RunEnd::Done;
  if (run.settings.accessMode == Access_Write && run.archive.isReadOnly()) {
    reportMessage(messages::ErrorWord, messages::OutputReadOnly, archiveName);
    return RunEnd::Done;
  }
  if (!findPosition(run)) return RunEnd::Done;
  dispatch(run);
  if (hasErrors()) return RunEnd::Done;
  chooseSymbolTableMode(run);
  return writeArchive(run);
}

// A map says by a library's name what all of its members may need. One that can't be read gives way
// to the built-in one.
void setLibraryAttributes(arlib::Archive& archive, const char* archiveName, const char* mapName) {
  if (mapName == nullptr) return;
  bool usedDefault = false;
  const elfext::LibraryAttributeMap map =
      elfext::readLibraryAttributeMap(archive.getHost(), mapName, usedDefault);
  elfext::FullAttr attributes = elfext::LibraryFullAttr;
  elfext::getLibraryAttributes(attributes, archiveName, map);
  archive.setLibraryAttributes(attributes);
}

RunEnd runOnce(support::Host& host, const char* archiveName, Settings& settings,
               messages::HeldOutput& output) {
  arlib::Archive archive(host);
  ArlibErrorHandler handler(settings.verbose);
  archive.setErrorHandler(&handler);
  archive.setIncludeDebugSymbols(settings.includeDebugSymbols);
  archive.setUniqueSymbolsOnly(settings.uniqueSymbolsOnly);
  archive.setUseObjectBuildAttributes(settings.useObjectBuildAttributes);
  archive.setSymbolsWanted(false);
  setLibraryAttributes(archive, archiveName, settings.libraryAttributeMap);
  ArchiveOpenStatus openStatus;
  Run run = {archive, settings, openStatus};
  const RunEnd end = runAction(run, archiveName, output);
  archive.closeFiles();
  return end;
}

// Somebody else's new archive is taken over as if it had been there from the start. What this run
// has said so far is held back until it is known to be true: too much of it, and there is no way
// back.
void runUntilDone(support::Host& host, const char* archiveName, Settings& settings) {
  constexpr int MostRuns = 100; // others that make and remove it all the time can't be outrun
  messages::HeldOutput output;
  for (int run = 0; run < MostRuns; ++run) {
    if (settings.accessMode == Access_Write) output.hold();
    if (runOnce(host, archiveName, settings, output) == RunEnd::Done) return;
    if (!output.drop()) break;
  }
  reportMessage(messages::ErrorWord, messages::WritingArchive, archiveName, hostErrorText(EEXIST));
}

} // namespace

bool isMissing(const Run& run) {
  if (!run.openStatus.missing) return false;
  reportMessage(messages::ErrorWord, messages::ArchiveNotFound, run.archiveName(),
                hostErrorText(run.openStatus.errorNumber));
  return true;
}

void quarnMain(int argc, const char* const* argv, const char* toolName, support::Host& host,
               alloclib::RegionGeneral& memory) {
  Settings settings;
  QuarnListener listener;
  OptionReporter reporter;
  tabledrivenparser::StdioViaFileReader files;
  OptionValues values;
  Parser parser({optionTable(), optionDefinitions(), values}, &listener, reporter, files, memory);
  scanOptions(parser, argc, argv);
  processOptions(parser, toolName, settings);
  const char* archiveName = archiveNameOf(parser.textsValue(Option_Words));
  if (isWorkGiven(argc, parser, archiveName, host, toolName, settings)) {
    runUntilDone(host, archiveName, settings);
  }
  parser.releaseValues();
}

} // namespace quarn
