// SPDX-License-Identifier: Apache-2.0
//
// What happens to one run, at one of its system calls. In text it is "17:error:ENOSPC", by which a
// run can be repeated by hand.

#pragma once

#include "tests/disturbed/system_calls.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace disturbed {

enum class FaultKind {
  Error,      // the call fails; `value` is the error
  AllErrors,  // and so does each later one that can fail so
  Short,      // a read or write of `value` bytes only
  KillBefore, // nothing of the call happens
  KillAfter,
  Signal,    // before the call; `value` is the signal
  Truncate,  // somebody else cuts the file `name` in half, and so on
  Grow,      //
  Empty,     //
  Overwrite, // in its place, with another file's bytes
  Patch,     // in its place, where the size stays
  Replace,   // by another file of that name
  Remove,    //
  MakeFolder // in the place of the file
};

struct Fault {
  uint64_t call = 0; // counted from 1; 0: none, nothing happens
  FaultKind kind = FaultKind::Error;
  int value = 0;
  std::string name; // of the file that somebody else changes
};

[[nodiscard]] bool isChange(FaultKind kind);
[[nodiscard]] bool isKill(FaultKind kind);
[[nodiscard]] std::string textOf(const Fault& fault);
[[nodiscard]] std::string nameOf(FaultKind kind);
// None if the text is not that of a fault.
[[nodiscard]] std::optional<Fault> faultOf(const std::string& text);

// All that can happen to a run that makes these calls, where somebody else may change these files.
[[nodiscard]] std::vector<Fault> computeFaults(const std::vector<SystemCall>& calls,
                                               const std::vector<std::string>& files);

// Whether a call fails by a fault that has come.
[[nodiscard]] bool isMetBy(const Fault& fault, const SystemCall& call);

} // namespace disturbed
