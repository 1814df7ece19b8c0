// SPDX-License-Identifier: Apache-2.0
//
// One archive, one action: open, act, and write back if nothing went wrong. In front of the write
// stands the one checkpoint of a run: was any error counted? The derived tables are rebuilt before
// it, so that a warning of the rebuild that was raised to an error keeps the old file as well.
//
// Others may be at work on the same file. Who is going to write waits for his turn; who has made a
// new archive where somebody else was faster starts over with the one that is there now.
#pragma once

#include "quarn/run.h"
#include "support/interface/host.h"

#include <functional>

namespace quarn {

using RunAction = std::function<void(Run&)>;

// Does the action on the archive. It may be done again from the start, on an archive that somebody
// else has made meanwhile. What went wrong has been reported.
void runOnArchive(support::Host& host, const char* archiveName, const Settings& settings,
                  const RunAction& action);

} // namespace quarn
