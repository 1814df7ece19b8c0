// SPDX-License-Identifier: Apache-2.0
//
// What our programs are known not to keep yet. A row is deleted where its fault is mended; a run of
// everything tells of rows that nothing needs any more.

#pragma once

#include "tests/disturbed/scenarios.h"

#include <array>
#include <cerrno>
#include <sys/syscall.h>

namespace disturbed {

struct KnownFailure {
  const char* what;
  // `broken` is the verdict's words.
  bool (*isMet)(const Scenario& scenario, const Fault& fault, const SystemCall& call,
                const std::string& broken);
};

inline constexpr std::array<KnownFailure, 6> KnownFailures = {{
    {"out of memory in the first moments is not told of",
     [](const Scenario&, const Fault& fault, const SystemCall& call, const std::string& broken) {
       return fault.value == ENOMEM && call.kind() == CallKind::Memory &&
              broken == "status 1 without a report";
     }},
    {"an object or a table that can't be read is taken for none, with status 0",
     [](const Scenario&, const Fault& fault, const SystemCall& call, const std::string&) {
       const bool isError = fault.kind == FaultKind::Error || fault.kind == FaultKind::AllErrors;
       return isError && (call.number == SYS_pread64 || call.number == SYS_newfstatat);
     }},
    {"permissions that can't be kept are lost without a word",
     [](const Scenario&, const Fault& fault, const SystemCall& call, const std::string&) {
       return fault.kind == FaultKind::Error && call.number == SYS_fchmod;
     }},
    {"a stdout that can't be duplicated swallows what is printed, with status 0",
     [](const Scenario&, const Fault& fault, const SystemCall& call, const std::string&) {
       return fault.value == EMFILE && call.number == SYS_fcntl;
     }},
    {"a symbolic link that can't be read is replaced by a file",
     [](const Scenario&, const Fault&, const SystemCall& call, const std::string&) {
       return call.number == SYS_readlink;
     }},
    {"an interrupted opening of a folder is told of as a missing file",
     [](const Scenario& scenario, const Fault& fault, const SystemCall& call, const std::string&) {
       return scenario.input == std::string_view("c.o") && fault.value == EINTR &&
              call.number == SYS_openat;
     }},
}};

// Whether a kill may still leave a temporary wherever the archive is being written.
inline constexpr bool AreManyPlacesKnown = true;

} // namespace disturbed
