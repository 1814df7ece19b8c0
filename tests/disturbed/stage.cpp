// SPDX-License-Identifier: Apache-2.0
//
// A fault is played on the same files each time, and up to the fault the run must be the one that
// was seen undisturbed: else it is no repetition, and its number means nothing.
#include "tests/disturbed/stage.h"

#include "tests/disturbed/others.h"

#include <algorithm>

namespace disturbed {

namespace {

// Whether the first `count` calls are there, and of the same kinds.
bool hasSameCalls(const std::vector<SystemCall>& left, const std::vector<SystemCall>& right,
                  uint64_t count) {
  if (count > left.size() || count > right.size()) return false;
  return std::equal(
      left.begin(), left.begin() + static_cast<ptrdiff_t>(count), right.begin(),
      [](const SystemCall& one, const SystemCall& other) { return one.number == other.number; });
}

} // namespace

Stage::Stage(const Tracer& tracer, const Store& store, const Scenario& scenario)
    : m_Tracer(tracer), m_Store(store), m_Scenario(scenario) {
  m_Expected.before = store.entriesOf(scenario);
  m_Folder.put(m_Expected.before);
  m_Expected.before = m_Folder.take();
  m_Expected.plain = run({});
}

const std::vector<SystemCall>& Stage::getCalls() const {
  return m_Expected.plain.run.calls;
}

std::string Stage::findUnsound() const {
  const TracedRun& plain = m_Expected.plain.run;
  if (plain.status != 0) {
    return "has status " + std::to_string(plain.status) + " undisturbed: " + plain.errors;
  }
  const bool isChanging = m_Expected.before != m_Expected.plain.entries;
  if (isChanging == (m_Scenario.effect == Effect::None)) return "has not the effect of its row";
  const Outcome again = run({});
  if (again.entries != m_Expected.plain.entries) return "makes other files each time";
  const bool isSame = again.run.calls.size() == plain.calls.size() &&
                      hasSameCalls(again.run.calls, plain.calls, plain.calls.size());
  return isSame ? "" : "makes other calls each time";
}

std::vector<Fault> Stage::computeFaults() const {
  std::vector<std::string> files;
  for (const std::string name : {m_Scenario.archive, m_Scenario.input}) {
    if (name != "-") files.push_back(name);
  }
  return disturbed::computeFaults(getCalls(), files);
}

void Stage::change(const Fault& fault) const {
  changeFile(m_Folder.getName(), fault, m_Store.replacementOf(fault.name));
}

Outcome Stage::runOn(const Entries& entries, const Fault& fault) const {
  m_Folder.put(entries);
  return runHere(fault);
}

Outcome Stage::runHere(const Fault& fault) const {
  Outcome outcome;
  const Command command = commandOf(m_Scenario, m_Folder.getName());
  outcome.run = m_Tracer.run(command, fault, [&] { change(fault); });
  outcome.entries = m_Folder.take();
  return outcome;
}

Outcome Stage::run(const Fault& fault) const {
  return runOn(m_Expected.before, fault);
}

Entries Stage::changed(const Entries& entries, const Fault& fault) const {
  m_Folder.put(entries);
  change(fault);
  return m_Folder.take();
}

const ChangedExpectation& Stage::expectChange(const Fault& fault) {
  const auto [place, isNew] = m_Changes.try_emplace({fault.kind, fault.name});
  ChangedExpectation& expected = place->second;
  if (!isNew) return expected;
  expected.before = changed(m_Expected.before, fault);
  // The change comes first: at the first call of all.
  Fault first = fault;
  first.call = 1;
  expected.plain = run(first);
  expected.later = changed(m_Expected.plain.entries, fault);
  return expected;
}

// What a kill leaves is in nobody's way: the same run made once more does all of its work.
std::string Stage::findObstacle() const {
  const Outcome again = runHere({});
  if (again.run.status != 0) return "the next run fails: " + again.run.errors;
  for (const auto& [name, entry] : m_Expected.plain.entries) {
    const auto found = again.entries.find(name);
    if (found == again.entries.end() || found->second != entry) {
      return "the next run does not make '" + name + "'";
    }
  }
  return {};
}

Verdict Stage::play(const Fault& fault) {
  std::optional<ChangedExpectation> changed;
  if (isChange(fault.kind)) changed = expectChange(fault);
  Outcome outcome = run(fault);
  // Up to the fault it is the run that is expected. A signal comes behind the call before.
  const uint64_t same = fault.call - (fault.kind == FaultKind::Signal ? 1 : 0);
  if (!hasSameCalls(outcome.run.calls, getCalls(), same)) {
    return {"makes other calls than undisturbed", false};
  }
  Verdict verdict = judge(m_Scenario, fault, m_Expected, changed, std::move(outcome));
  if (verdict.leavesTemporary && verdict.broken.empty()) verdict.broken = findObstacle();
  return verdict;
}

} // namespace disturbed
