// SPDX-License-Identifier: Apache-2.0
//
// What the programs are doing while they are disturbed: one row for each kind of run.

#pragma once

#include "tests/disturbed/folder.h"
#include "tests/disturbed/tracer.h"

#include <span>
#include <string>
#include <vector>

namespace disturbed {

enum class Effect {
  None,     // it only tells
  Archive,  // the archive becomes another one, in one step
  Extracted // files come one after the other
};

struct Scenario {
  const char* name;
  Effect effect;
  const char* archive; // the one that somebody else may change meanwhile
  const char* input;   // and so this one
  const char* files;   // that stand in the folder; blanks between them
  const char* line;    // what the user types
};

[[nodiscard]] std::span<const Scenario> getScenarios();

// The files that the rows name, made by the programs themselves.
class Store {
public:
  explicit Store(const Tracer& tracer);
  // What stands in the folder before the run.
  [[nodiscard]] Entries entriesOf(const Scenario& scenario) const;
  // Another good file for the place of this one.
  [[nodiscard]] const std::string& replacementOf(const std::string& name) const;

private:
  void addObjects();
  void addLibraries(const Tracer& tracer);
  void addLibrary(const Tracer& tracer, const Entries& files, const std::string& name,
                  const std::string& line);
  Entries m_Files;
};

[[nodiscard]] Command commandOf(const Scenario& scenario, const std::string& folder);

} // namespace disturbed
