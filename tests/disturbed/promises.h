// SPDX-License-Identifier: Apache-2.0
//
// What holds at the end of each run, whatever has happened to it:
//
// - It ends, by itself or by the signal that was sent. Its status is 0, and then the result is
//   whole and nothing else is said; or 1, and then it has said why.
// - The archive is the old one, to the byte and with its mode and its names, or the complete new
//   one; so is every file that is extracted, or it is not there. All else is as it was.
// - Nothing is left behind. SIGKILL alone may leave one temporary beside the archive, which is
//   in no other run's way.
// - A call that was interrupted, or moved fewer bytes than it was told to, makes no difference.
// - Where somebody else has changed a file meanwhile, it is as he has left it, or a complete new
//   one; what the run tells is of the file before the change, or behind it.

#pragma once

#include "tests/disturbed/fault.h"
#include "tests/disturbed/folder.h"
#include "tests/disturbed/scenarios.h"
#include "tests/disturbed/tracer.h"

#include <optional>
#include <string>

namespace disturbed {

struct Outcome {
  TracedRun run;
  Entries entries; // of the folder, behind the run
};

// Of runs that nobody disturbs.
struct Expectation {
  Entries before;
  Outcome plain;
};

// With a change by somebody else: before the run and behind it.
struct ChangedExpectation {
  Entries before;
  Outcome plain;
  Entries later;
};

struct Verdict {
  std::string broken; // what was not kept; empty if everything was
  bool leavesTemporary = false;
};

[[nodiscard]] Verdict judge(const Scenario& scenario, const Fault& fault,
                            const Expectation& expected,
                            const std::optional<ChangedExpectation>& changed, Outcome outcome);

} // namespace disturbed
