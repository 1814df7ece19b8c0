// SPDX-License-Identifier: Apache-2.0
//
// What one run is to do: the command line as one record. Nothing else holds an option's value.
#pragma once

#include "arlib/interface/archive.h"
#include "elfext/interface/object_outline.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quarn {

// One run does one action.
enum Action : uint32_t {
  Action_None = 0,
  Action_Insert = 1,
  Action_Delete = 2,
  Action_Entries = 3,
  Action_Extract = 4,
  Action_Move = 5,
  Action_Print = 6,
  Action_List = 7,
  Action_Sizes = 8,
  Action_Summary = 9,
  Action_SymbolTable = 10,
};

// How much of the archive a run touches. Only a writing run makes a difference.
enum AccessMode : int32_t {
  Access_None = 0,
  Access_Headers = 1,
  Access_Members = 2,
  Access_Write = 3,
};

enum PositionKind : uint32_t {
  Position_None = 0,
  Position_Before = 1,
  Position_After = 2,
};

// Which existing members an insertion replaces.
enum UpdateMode : uint32_t {
  Update_Always = 0,
  Update_IfNotNewer = 1, // the member's time is at most the file's
  Update_IfOlder = 2,    // the member's time is before the file's
};

struct Settings {
  Action action = Action_None;
  PositionKind positionKind = Position_None;
  const char* positionName = nullptr;
  bool suppressSymbolTable = false;
  bool rebuildSymbolTable = false;
  bool versionRequested = false;
  bool createArchive = false;
  const char* libraryAttributeMap = nullptr; // the map's file name
  bool warnOnCreate = true;
  bool overwriteOnExtract = true;
  bool truncateNames = false;
  UpdateMode updateMode = Update_Always;
  bool verbose = false;
  bool helpRequested = false;
  AccessMode accessMode = Access_None;
  bool normaliseHeaders = false;
  int32_t normaliseTime = 0; // seconds since 1970
  bool includeDebugSymbols = false;
  bool uniqueSymbolsOnly = false;
  bool useObjectBuildAttributes = false;
  // The next six are what other tools of the kind do, and no option of this one asks for.
  elfext::ObjectOutline::Machines machines = elfext::ObjectOutline::Machines::Own;
  arlib::SymbolTableMode symbolTableMode = arlib::SymbolTableMode::Always; // of a run that writes
  bool keepFolders = false;    // in the names of members
  bool takeAnyNumbers = false; // for date and owner of the archive's own file
  bool restoreModes = false;   // of files that are extracted
  bool restoreDates = false;
  std::vector<std::string> fileList; // the file_list words in order, after expansion on disk

  // Chooses the action. A second, different one is reported and leaves the first in place.
  void setAction(Action newAction);

  // The mode is only ever raised.
  void raiseAccessMode(AccessMode mode);
};

} // namespace quarn
