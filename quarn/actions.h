// SPDX-License-Identifier: Apache-2.0
//
// The actions: one function for each row of the action table. Each goes on with the next word after
// a complaint; an error that was counted keeps the archive from being written. All but an insertion
// find an archive that is there.
#pragma once

#include "quarn/run.h"

namespace quarn {

// Does the action of the run. An archive that isn't there is an error, unless files go into it.
void doAction(Run& run);

// -r, -q, --create. On a new archive without files it cancels the writing.
void insertFiles(Run& run);

// -d. Without words nothing is deleted, and the archive is written back.
void deleteMembers(Run& run);

// -m
void moveMembers(Run& run);

// -x. Each member goes to a file of its name in the current directory.
void extractMembers(Run& run);

// -p. The members' contents go to stdout unchanged.
void printMembers(Run& run);

// -t, with -v the long form.
void listMembers(Run& run);

// --zs
void listSymbolTable(Run& run);

// --entries, --sizes, and --zt for both.
enum ReportFlag : uint32_t { Report_Entries = 1, Report_Sizes = 2 };
void reportObjects(Run& run, uint32_t flags);

} // namespace quarn
