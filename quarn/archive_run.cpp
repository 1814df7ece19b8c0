// SPDX-License-Identifier: Apache-2.0
//
// The road of one archive, from the first look at its name to the last byte written.
#include "quarn/archive_run.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "arlib/interface/writer_turn.h"
#include "elfext/interface/library_attribute_map.h"
#include "messages/interface/output.h"
#include "quarn/arlib_error_handler.h"
#include "quarn/member_selection.h"
#include "quarn/reporting.h"
#include "support/interface/host_files.h"

#include <cerrno>
#include <memory>
#include <utility>

namespace quarn {

namespace {

// How a run ended. Who has been overtaken has written nothing.
enum class RunEnd { Done, Overtaken };

// By the many ways in which hosts say that there can be no such file. What else they say of a file
// that they told nothing of is the reason why it was not found.
int reasonOfAbsence(support::HostError error) {
  switch (error) {
  case 0:
  case EILSEQ:
  case EINVAL:
  case ELOOP:
  case ENAMETOOLONG:
  case ENOTDIR:
    return ENOENT;
  }
  return error;
}

// A new archive is made where the file is missing or --create says to look away from what it holds.
// Who is going to write waits for his turn at the file first.
bool openArchive(Run& run, const char* name) {
  run.archive.setClientData(&run.openStatus);
  run.archive.setFileName(name);
  std::shared_ptr<support::SourceFile> file;
  support::FileKind kind = support::FileKind::Nothing;
  support::HostError error = 0;
  if (run.settings.accessMode == Access_Write) {
    file = arlib::takeTurn(run.archive.getSourceFiles(), name, kind, error);
  } else {
    kind = support::fileKind(run.archive.getHost(), name, error);
  }
  const bool exists = kind != support::FileKind::Nothing;
  if (exists && !run.settings.createArchive) {
    return file != nullptr ? arlib::readFile(file, run.archive)
                           : arlib::readFile(name, run.archive);
  }
  run.archive.setOwnFile(std::move(file));
  run.openStatus.missing = true;
  run.openStatus.errorNumber = exists ? 0 : reasonOfAbsence(error);
  return true;
}

// The tables count here: a position is a place in the list. False after a report.
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

void chooseSymbolTableMode(Run& run) {
  if (run.settings.suppressSymbolTable) {
    run.archive.setSymbolTableMode(arlib::SymbolTableMode::Never);
  } else if (run.settings.accessMode == Access_Write) {
    run.archive.setSymbolTableMode(run.settings.symbolTableMode);
  }
}

RunEnd writeArchive(Run& run) {
  const bool isNew = run.openStatus.missing;
  if (run.settings.accessMode != Access_Write && !isNew) return RunEnd::Done;
  if (isNew && run.settings.warnOnCreate) {
    reportMessage(messages::RemarkWord, messages::CreatingArchive, run.getArchiveName());
  }
  run.archive.updateAuxiliaryMembers();
  if (hasErrors()) return RunEnd::Done;
  const bool mayReplace = !isNew || run.openStatus.errorNumber == 0;
  const arlib::WriteEnd end = mayReplace ? arlib::writeInTurn(run.getArchiveName(), run.archive)
                                         : arlib::writeNewFile(run.getArchiveName(), run.archive);
  return end == arlib::WriteEnd::Overtaken ? RunEnd::Overtaken : RunEnd::Done;
}

RunEnd openActAndWrite(Run& run, const char* archiveName, const RunAction& action,
                       messages::HeldOutput& output) {
  const bool isOpen = openArchive(run, archiveName);
  // Nobody can overtake who keeps his turn to the end.
  if (!run.openStatus.missing && run.archive.getHost().keepsLocks()) output.release();
  if (!isOpen || hasErrors()) return RunEnd::Done;
  if (run.settings.accessMode == Access_Write && run.archive.isReadOnly()) {
    reportMessage(messages::ErrorWord, messages::OutputReadOnly, archiveName);
    return RunEnd::Done;
  }
  if (!findPosition(run)) return RunEnd::Done;
  action(run);
  if (run.isCancelled || hasErrors()) return RunEnd::Done;
  // What nobody can be told of is not done either, where it is not held back until it is.
  if (!messages::HeldOutput::isOn() && !messages::flushAll()) return RunEnd::Done;
  chooseSymbolTableMode(run);
  return writeArchive(run);
}

// A map says by a library's name what all of its members may need. One that isn't there gives way
// to the built-in one. False after a report.
bool setLibraryAttributes(arlib::Archive& archive, const char* archiveName, const char* mapName) {
  if (mapName == nullptr) return true;
  bool usedDefault = false;
  support::HostError error = 0;
  const elfext::LibraryAttributeMap map =
      elfext::readLibraryAttributeMap(archive.getHost(), mapName, usedDefault, error);
  if (error != 0) {
    reportMessage(messages::ErrorWord, messages::ReadingFile, mapName, hostErrorText(error));
    return false;
  }
  elfext::FullAttr attributes = elfext::LibraryFullAttr;
  elfext::getLibraryAttributes(attributes, archiveName, map);
  archive.setLibraryAttributes(attributes);
  return true;
}

RunEnd runOnce(support::Host& host, const char* archiveName, const Settings& settings,
               const RunAction& action, messages::HeldOutput& output) {
  arlib::Archive archive(host);
  ArlibErrorHandler handler(settings.verbose);
  archive.setErrorHandler(&handler);
  archive.setIncludeDebugSymbols(settings.includeDebugSymbols);
  archive.setUniqueSymbolsOnly(settings.uniqueSymbolsOnly);
  archive.setUseObjectBuildAttributes(settings.useObjectBuildAttributes);
  archive.setMachines(settings.machines);
  archive.setKeepFolders(settings.keepFolders);
  archive.setTakeAnyNumbers(settings.takeAnyNumbers);
  archive.setSymbolsWanted(false);
  if (!setLibraryAttributes(archive, archiveName, settings.libraryAttributeMap))
    return RunEnd::Done;
  ArchiveOpenStatus openStatus;
  Run run = {archive, settings, openStatus};
  const RunEnd end = openActAndWrite(run, archiveName, action, output);
  archive.closeFiles();
  return end;
}

} // namespace

// Somebody else's new archive is taken over as if it had been there from the start. What this run
// has said so far is held back until it is known to be true: too much of it, and there is no way
// back.
void runOnArchive(support::Host& host, const char* archiveName, const Settings& settings,
                  const RunAction& action) {
  constexpr int MostRuns = 100; // others that make and remove it all the time can't be outrun
  messages::HeldOutput output;
  for (int run = 0; run < MostRuns; ++run) {
    if (settings.accessMode == Access_Write) output.hold();
    if (runOnce(host, archiveName, settings, action, output) == RunEnd::Done) return;
    if (!output.drop()) break;
  }
  reportMessage(messages::ErrorWord, messages::WritingArchive, archiveName, hostErrorText(EEXIST));
}

} // namespace quarn
