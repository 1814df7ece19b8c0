// SPDX-License-Identifier: Apache-2.0
//
// The table of the actions.
#include "quarn/actions.h"

#include "checking/interface/checking.h"
#include "quarn/reporting.h"

namespace quarn {

namespace {

// Only an insertion makes a new archive, and a run without an action has nothing to look for in it.
bool wantsArchive(Action action) {
  return action != Action_None && action != Action_Insert;
}

} // namespace

void doAction(Run& run) {
  const Action action = run.settings.action;
  if (run.openStatus.missing && wantsArchive(action)) {
    reportMessage(messages::ErrorWord, messages::ArchiveNotFound, run.getArchiveName(),
                  hostErrorText(run.openStatus.errorNumber));
    return;
  }
  switch (action) {
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

} // namespace quarn
