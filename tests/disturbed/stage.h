// SPDX-License-Identifier: Apache-2.0
//
// Where one scenario is played, undisturbed first, and then with one fault after the other.

#pragma once

#include "tests/disturbed/promises.h"

#include <map>
#include <string>
#include <utility>
#include <vector>

namespace disturbed {

class Stage {
public:
  Stage(const Tracer& tracer, const Store& store, const Scenario& scenario);

  // That the run does what it is here for, and does the same each time. Empty, or what is wrong.
  [[nodiscard]] std::string findUnsound() const;
  [[nodiscard]] const std::vector<SystemCall>& getCalls() const;
  [[nodiscard]] std::vector<Fault> computeFaults() const;
  [[nodiscard]] Verdict play(const Fault& fault);
  [[nodiscard]] Outcome run(const Fault& fault) const;

private:
  [[nodiscard]] Outcome runOn(const Entries& entries, const Fault& fault) const;
  [[nodiscard]] Outcome runHere(const Fault& fault) const;
  [[nodiscard]] std::string findObstacle() const;
  void change(const Fault& fault) const;
  [[nodiscard]] Entries changed(const Entries& entries, const Fault& fault) const;
  const ChangedExpectation& expectChange(const Fault& fault);

  const Tracer& m_Tracer;
  const Store& m_Store;
  const Scenario& m_Scenario;
  Folder m_Folder;
  Expectation m_Expected;
  std::map<std::pair<FaultKind, std::string>, ChangedExpectation> m_Changes;
};

} // namespace disturbed
