// SPDX-License-Identifier: Apache-2.0
//
// Which faults a call can have follows from what it is, and from what it did undisturbed.
#include "tests/disturbed/fault.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <charconv>
#include <csignal>

namespace disturbed {

namespace {

struct KindRow {
  FaultKind kind;
  const char* name;
};

// clang-format off
constexpr KindRow KindRows[] = {
    {FaultKind::Error,       "error"},
    {FaultKind::AllErrors,   "all_errors"},
    {FaultKind::Short,       "short"},
    {FaultKind::KillBefore,  "kill_before"},
    {FaultKind::KillAfter,   "kill_after"},
    {FaultKind::Signal,      "signal"},
    {FaultKind::Truncate,    "truncate"},
    {FaultKind::Grow,        "grow"},
    {FaultKind::Empty,       "empty"},
    {FaultKind::Overwrite,   "overwrite"},
    {FaultKind::Patch,       "patch"},
    {FaultKind::Replace,     "replace"},
    {FaultKind::Remove,      "remove"},
    {FaultKind::MakeFolder,  "make_folder"},
};
// clang-format on

constexpr int SentSignals[] = {SIGINT,  SIGTERM, SIGHUP,  SIGQUIT, SIGPIPE,
                               SIGXCPU, SIGALRM, SIGUSR1, SIGUSR2};

bool contains(const std::vector<int>& all, int one) {
  return std::find(all.begin(), all.end(), one) != all.end();
}

// The bytes that a read or a write has passed, where fewer would do as well.
std::vector<int> shortCounts(const SystemCall& call) {
  if (!call.isCounted() || call.result < 2) return {};
  const int half = static_cast<int>(call.result / 2);
  if (half == 1) return {1};
  return {1, half};
}

// Memory, descriptors or disk are all used up, or the disk can't be read any more, and that stays
// so.
std::vector<int> lastingErrors(const SystemCall& call) {
  const CallKind kind = call.kind();
  if (kind == CallKind::Memory) return {ENOMEM};
  if (kind == CallKind::Open) return {EMFILE};
  if (kind == CallKind::Read) return {EIO};
  if (kind == CallKind::Write && !call.isToErrorStream) return {ENOSPC};
  return {};
}

void addFaults(std::vector<Fault>& faults, uint64_t number, const SystemCall& call) {
  for (const int error : call.errors())
    faults.push_back({number, FaultKind::Error, error, {}});
  for (const int error : lastingErrors(call))
    faults.push_back({number, FaultKind::AllErrors, error, {}});
  for (const int count : shortCounts(call))
    faults.push_back({number, FaultKind::Short, count, {}});
  faults.push_back({number, FaultKind::KillBefore, 0, {}});
  faults.push_back({number, FaultKind::KillAfter, 0, {}});
  for (const int signal : SentSignals)
    faults.push_back({number, FaultKind::Signal, signal, {}});
}

std::string valueText(const Fault& fault) {
  if (fault.kind == FaultKind::Error || fault.kind == FaultKind::AllErrors) {
    return errorName(fault.value);
  }
  if (fault.kind == FaultKind::Signal) return signalName(fault.value);
  if (fault.kind == FaultKind::Short) return std::to_string(fault.value);
  return fault.name;
}

std::optional<int> valueOf(FaultKind kind, const std::string& text) {
  int value = 0;
  if (kind == FaultKind::Short) {
    std::from_chars(text.data(), text.data() + text.size(), value);
  } else if (kind == FaultKind::Signal) {
    value = signalOfName(text);
  } else {
    value = errorOfName(text);
  }
  return value == 0 ? std::nullopt : std::optional(value);
}

} // namespace

bool isChange(FaultKind kind) {
  return kind >= FaultKind::Truncate;
}

bool isKill(FaultKind kind) {
  return kind == FaultKind::KillBefore || kind == FaultKind::KillAfter;
}

std::string nameOf(FaultKind kind) {
  for (const KindRow& row : KindRows) {
    if (row.kind == kind) return row.name;
  }
  return {};
}

std::string textOf(const Fault& fault) {
  return std::to_string(fault.call) + ":" + nameOf(fault.kind) + ":" + valueText(fault);
}

std::optional<Fault> faultOf(const std::string& text) {
  const size_t first = text.find(':');
  const size_t second = text.find(':', first + 1);
  Fault fault;
  std::from_chars(text.data(), text.data() + text.size(), fault.call);
  if (fault.call == 0 || second == std::string::npos) return std::nullopt;
  const std::string kind = text.substr(first + 1, second - first - 1);
  const std::string value = text.substr(second + 1);
  for (const KindRow& row : KindRows) {
    if (kind != row.name) continue;
    fault.kind = row.kind;
    fault.name = isChange(row.kind) ? value : "";
    if (isChange(row.kind) || isKill(row.kind)) return fault;
    const std::optional<int> number = valueOf(row.kind, value);
    fault.value = number.value_or(0);
    return number ? std::optional(fault) : std::nullopt;
  }
  return std::nullopt;
}

std::vector<Fault> computeFaults(const std::vector<SystemCall>& calls,
                                 const std::vector<std::string>& files) {
  std::vector<Fault> faults;
  for (uint64_t i = 0; i < calls.size(); ++i) {
    addFaults(faults, i + 1, calls[i]);
    for (const KindRow& row : KindRows) {
      if (!isChange(row.kind)) continue;
      for (const std::string& name : files)
        faults.push_back({i + 1, row.kind, 0, name});
    }
  }
  return faults;
}

bool isMetBy(const Fault& fault, const SystemCall& call) {
  if (fault.kind == FaultKind::AllErrors) return contains(lastingErrors(call), fault.value);
  return fault.kind == FaultKind::Error;
}

} // namespace disturbed
