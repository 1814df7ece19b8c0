// SPDX-License-Identifier: Apache-2.0
//
// A run in six sentences: the words are read into values, and the values into settings; what keeps
// it from working is told, or the files are found that the words mean; the archive is worked on.
// The order of the complaints is that of the checks here, since only the first one is told.
#include "quarn/quarn_main.h"

#include "messages/interface/messages.h"
#include "quarn/actions.h"
#include "quarn/archive_run.h"
#include "quarn/banner.h"
#include "quarn/file_list.h"
#include "quarn/host_via_file_reader.h"
#include "quarn/option_listeners.h"
#include "quarn/option_reporter.h"
#include "quarn/option_table.h"
#include "quarn/process_options.h"
#include "quarn/reporting.h"
#include "tabledrivenparser/interface/parser.h"

#include <string>
#include <vector>

namespace quarn {

using tabledrivenparser::Parser;
using tabledrivenparser::StrList;

namespace {

// The letters that the message names are these, though there are more actions.
constexpr const char* ActionLetters = "dmpqrtx";

void readWords(Parser& parser, int argc, const char* const* argv) {
  for (int i = 1; i < argc;) {
    i += static_cast<int>(parser.parseWord(argv[i], i + 1 < argc ? argv[i + 1] : nullptr));
  }
}

// The first word that is no option; an empty one counts as none.
const char* archiveNameOf(const StrList* words) {
  if (words == nullptr || words->isEmpty()) return nullptr;
  const char* first = *words->begin();
  return *first == '\0' ? nullptr : first;
}

// What keeps a run from working on an archive.
enum class Obstacle { None, Errors, Help, NoArchive, NoAction };

Obstacle findObstacle(int argc, const char* archiveName, const Settings& settings) {
  if (hasErrors()) return Obstacle::Errors;
  if (settings.helpRequested || (argc <= 1 && !settings.createArchive)) return Obstacle::Help;
  if (archiveName == nullptr) return Obstacle::NoArchive;
  const bool isIdle = settings.action == Action_None && !settings.rebuildSymbolTable;
  return isIdle ? Obstacle::NoAction : Obstacle::None;
}

// Errors have been told when they were counted.
void tell(Obstacle obstacle, const Settings& settings, const char* toolName) {
  if (obstacle == Obstacle::Errors) return;
  if (obstacle == Obstacle::Help) return showBanner(BannerMode::WithHelp, toolName);
  if (obstacle == Obstacle::NoAction) {
    reportMessage(messages::ErrorWord, messages::NoActionSpecified, ActionLetters);
  } else if (!settings.versionRequested) {
    reportMessage(messages::ErrorWord, messages::NoArchiveSpecified);
  }
  showBanner(settings.versionRequested ? BannerMode::Alone : BannerMode::WithHelp, toolName);
}

// The words behind the archive's name. Patterns stand for files on disk only where files go in, or
// where a position is given.
std::vector<std::string> findFiles(const Parser& parser, support::Host& host,
                                   const Settings& settings) {
  const bool expand = settings.createArchive || parser.getBoolean(Option_Insert) ||
                      parser.isSet(Option_Before) || parser.isSet(Option_After);
  std::vector<std::string> files;
  bool isArchiveName = true;
  for (const char* word : *parser.getTexts(Option_Words)) {
    if (!isArchiveName) addFileArgument(host, word, expand, files);
    isArchiveName = false;
  }
  return files;
}

} // namespace

void quarnMain(int argc, const char* const* argv, const char* toolName, support::Host& host,
               alloclib::RegionGeneral& memory) {
  QuarnListener listener;
  OptionReporter reporter;
  HostViaFileReader viaFiles(host);
  OptionValues values;
  Parser parser({getOptionTable(), getOptionDefinitions(), values}, &listener, reporter, viaFiles,
                memory);
  Settings settings;
  readWords(parser, argc, argv);
  processOptions(parser, toolName, settings);
  const char* archiveName = archiveNameOf(parser.getTexts(Option_Words));
  const Obstacle obstacle = findObstacle(argc, archiveName, settings);
  if (obstacle != Obstacle::None) {
    tell(obstacle, settings, toolName);
  } else {
    settings.fileList = findFiles(parser, host, settings);
    runOnArchive(host, archiveName, settings, doAction);
  }
  parser.releaseValues();
}

} // namespace quarn
