// SPDX-License-Identifier: Apache-2.0
//
// Undisturbed runs say what is allowed: each file is in one of the states that they have it in.
#include "tests/disturbed/promises.h"

#include <algorithm>
#include <cerrno>
#include <sys/syscall.h>
#include <vector>

namespace disturbed {

namespace {

// One run and the words against it.
class Judgement {
public:
  Judgement(const Scenario& scenario, const Fault& fault, const Expectation& expected,
            const std::optional<ChangedExpectation>& changed, Outcome outcome)
      : m_Scenario(scenario), m_Fault(fault), m_Expected(expected), m_Changed(changed),
        m_Outcome(std::move(outcome)) {}

  [[nodiscard]] Verdict reach();

private:
  [[nodiscard]] bool isKilled() const { return isKill(m_Fault.kind); }
  [[nodiscard]] bool isExtracting() const { return m_Scenario.effect == Effect::Extracted; }
  [[nodiscard]] bool isHarmless() const;
  [[nodiscard]] const SystemCall& metCall() const;
  // Where what could be said can't be.
  [[nodiscard]] bool isSilenced() const { return metCall().isToErrorStream; }
  [[nodiscard]] bool isReportAllowed() const;
  [[nodiscard]] std::string findBadEnd() const;
  [[nodiscard]] std::string findBadReport() const;
  [[nodiscard]] std::string findBadOutput() const;
  [[nodiscard]] std::string findBadFolder() const;
  [[nodiscard]] std::string findBadEntry() const;
  [[nodiscard]] bool isAllowed(const std::string& name) const;
  [[nodiscard]] bool mayBeAbsent(const std::string& name) const;
  [[nodiscard]] bool isHalfBehindKill(const std::string& name) const;
  [[nodiscard]] std::vector<const Entries*> allowedStates() const;
  bool takeTemporary();
  void passOverLostRights();

  const Scenario& m_Scenario;
  const Fault& m_Fault;
  const Expectation& m_Expected;
  const std::optional<ChangedExpectation>& m_Changed;
  Outcome m_Outcome;
};

const Entry* findEntry(const Entries& entries, const std::string& name) {
  const auto found = entries.find(name);
  return found == entries.end() ? nullptr : &found->second;
}

// Both there and the same, or neither there. How many names a file has depends on two who are at
// work on them, each in his turn.
bool isSame(const Entries& left, const Entries& right, const std::string& name,
            bool areLinksOfTwo = false) {
  const Entry* one = findEntry(left, name);
  const Entry* other = findEntry(right, name);
  if (one == nullptr || other == nullptr) return one == other;
  if (!areLinksOfTwo) return *one == *other;
  return one->kind == other->kind && one->mode == other->mode && one->bytes == other->bytes;
}

bool isNumbered(const std::string& name, const std::string& stem) {
  if (!name.starts_with(stem + ".")) return false;
  const std::string number = name.substr(stem.size() + 1);
  return !number.empty() && number.find_first_not_of("0123456789") == std::string::npos;
}

// A host that doesn't let a file have the rights of the old one leaves it with fewer: of the new
// file, as it was made.
bool isMoreSecret(const Entry& now, const Entry& wanted) {
  Entry same = now;
  same.mode = wanted.mode;
  return same == wanted && (now.mode & ~wanted.mode) == 0;
}

// What makes no difference to who has asked for all of it.
bool Judgement::isHarmless() const {
  return m_Fault.kind == FaultKind::Short ||
         (m_Fault.kind == FaultKind::Error && m_Fault.value == EINTR);
}

const SystemCall& Judgement::metCall() const {
  // A signal can end the run before the call is made.
  static const SystemCall None;
  const std::vector<SystemCall>& calls = m_Outcome.run.calls;
  return m_Fault.call <= calls.size() ? calls[m_Fault.call - 1] : None;
}

// Of a run with status 0. A close that fails is told of, where that harms nobody.
bool Judgement::isReportAllowed() const {
  const std::string& errors = m_Outcome.run.errors;
  if (m_Changed || isSilenced() || errors == m_Expected.plain.run.errors) return true;
  return metCall().kind() == CallKind::Close && errors.ends_with(m_Expected.plain.run.errors);
}

std::string Judgement::findBadEnd() const {
  const TracedRun& run = m_Outcome.run;
  if (run.hasHung) return "hangs";
  if (isKilled()) return {};
  if (run.signal != 0) {
    const bool isSent = m_Fault.kind == FaultKind::Signal && run.signal == m_Fault.value;
    return isSent ? "" : "ended by signal " + std::to_string(run.signal);
  }
  if (run.status == 0) return findBadOutput();
  if (run.status != 1) return "status " + std::to_string(run.status);
  if (isHarmless()) return "fails: " + run.errors;
  return findBadReport();
}

std::string Judgement::findBadReport() const {
  const std::string& errors = m_Outcome.run.errors;
  if (isSilenced()) return {};
  // Without memory there are no messages in the first moments.
  if (errors.starts_with("Out of memory. ")) return {};
  if (errors.find("rror: ") == std::string::npos) return "status 1 without a report";
  if (errors.find("Success") != std::string::npos) return "a report of no reason: " + errors;
  return {};
}

std::string Judgement::findBadOutput() const {
  const std::string& output = m_Outcome.run.output;
  if (!isReportAllowed()) return "status 0 with another report: " + m_Outcome.run.errors;
  if (output == m_Expected.plain.run.output) return {};
  if (m_Changed && output == m_Changed->plain.run.output) return {};
  // What a writing run tells of each member may be of both states: it starts anew.
  if (m_Changed && m_Scenario.effect != Effect::None) return {};
  return "status 0 with another output; stderr: " + m_Outcome.run.errors;
}

std::vector<const Entries*> Judgement::allowedStates() const {
  if (m_Changed) {
    return {&m_Changed->before, &m_Changed->plain.entries, &m_Changed->later,
            &m_Expected.plain.entries};
  }
  if (m_Outcome.run.status == 0) return {&m_Expected.plain.entries};
  return {&m_Expected.before, &m_Expected.plain.entries};
}

// A file that could not be made whole is removed.
bool Judgement::mayBeAbsent(const std::string& name) const {
  const bool isMade = isExtracting() && !isSame(m_Expected.before, m_Expected.plain.entries, name);
  return isMade && m_Outcome.run.status != 0;
}

// Nobody can remove it then.
bool Judgement::isHalfBehindKill(const std::string& name) const {
  const Entry* now = findEntry(m_Outcome.entries, name);
  const Entry* whole = findEntry(m_Expected.plain.entries, name);
  return isExtracting() && isKilled() && now != nullptr && whole != nullptr &&
         whole->bytes.starts_with(now->bytes);
}

bool Judgement::isAllowed(const std::string& name) const {
  if (isHalfBehindKill(name)) return true;
  if (findEntry(m_Outcome.entries, name) == nullptr && mayBeAbsent(name)) return true;
  const std::vector<const Entries*> states = allowedStates();
  return std::any_of(states.begin(), states.end(), [&](const Entries* state) {
    return isSame(*state, m_Outcome.entries, name, m_Changed.has_value());
  });
}

std::string Judgement::findBadEntry() const {
  Entries all = m_Outcome.entries;
  for (const Entries* state : allowedStates())
    all.insert(state->begin(), state->end());
  for (const auto& [name, entry] : all) {
    if (isAllowed(name)) continue;
    const Entry* now = findEntry(m_Outcome.entries, name);
    if (now == nullptr) return "'" + name + "' is gone";
    return "'" + name + "' is there with " + std::to_string(now->bytes.size()) +
           " bytes, which is neither old nor new";
  }
  return {};
}

// An archive comes in one step: the folder as a whole is in one of the states.
std::string Judgement::findBadFolder() const {
  std::string broken = findBadEntry();
  if (!broken.empty() || m_Changed || isExtracting()) return broken;
  const std::vector<const Entries*> states = allowedStates();
  const bool isOneState = std::any_of(states.begin(), states.end(), [&](const Entries* state) {
    return *state == m_Outcome.entries;
  });
  return isOneState ? "" : "the folder is a mix of old and new";
}

// Whether there is one, which is then forgotten.
bool Judgement::takeTemporary() {
  for (auto entry = m_Outcome.entries.begin(); entry != m_Outcome.entries.end(); ++entry) {
    if (!isNumbered(entry->first, m_Scenario.archive)) continue;
    m_Outcome.entries.erase(entry);
    return true;
  }
  return false;
}

// Who could not be given the rights of the old file has what is asked for all the same.
void Judgement::passOverLostRights() {
  if (metCall().number != SYS_fchmod) return;
  for (auto& [name, entry] : m_Outcome.entries) {
    const Entry* wanted = findEntry(m_Expected.plain.entries, name);
    if (wanted != nullptr && isMoreSecret(entry, *wanted)) entry.mode = wanted->mode;
  }
}

Verdict Judgement::reach() {
  passOverLostRights();
  Verdict verdict;
  if (isKilled()) verdict.leavesTemporary = takeTemporary();
  verdict.broken = findBadEnd();
  // Of all that is wrong, what is left behind is told as well.
  const std::string folder = findBadFolder();
  if (!verdict.broken.empty() && !folder.empty()) verdict.broken += "; ";
  verdict.broken += folder;
  return verdict;
}

} // namespace

Verdict judge(const Scenario& scenario, const Fault& fault, const Expectation& expected,
              const std::optional<ChangedExpectation>& changed, Outcome outcome) {
  return Judgement(scenario, fault, expected, changed, std::move(outcome)).reach();
}

} // namespace disturbed
