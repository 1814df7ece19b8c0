// SPDX-License-Identifier: Apache-2.0
//
// Runs a program and stops it at each of its system calls, as a debugger does; at one of them
// something goes wrong.
//
// Calls are counted from the first one by which the program says what shall become of a signal:
// that is how our programs begin. What the C library does before is not ours.

#pragma once

#include "tests/disturbed/fault.h"

#include <functional>
#include <string>
#include <vector>

namespace disturbed {

struct Command {
  std::string file;               // the program
  std::vector<std::string> words; // the first is the name that it is called by
  std::string folder;             // the one that it works in
};

struct TracedRun {
  int status = -1; // -1 if a signal ended it
  int signal = 0;
  bool hasHung = false; // and was ended for it
  std::string output;
  std::string errors;
  std::vector<SystemCall> calls;
};

// The file that a program's stream leads to: in memory, used again for each run.
class Stream {
public:
  Stream();
  ~Stream();
  Stream(const Stream&) = delete;
  Stream& operator=(const Stream&) = delete;
  [[nodiscard]] int getDescriptor() const { return m_Descriptor; }
  [[nodiscard]] std::string takeAll() const; // and leaves nothing

private:
  int m_Descriptor;
};

// Not every machine lets a process do it to its own child.
[[nodiscard]] bool canTrace();

class Tracer {
public:
  // `change` is what somebody else does, where the fault is of that kind.
  [[nodiscard]] TracedRun run(const Command& command, const Fault& fault,
                              const std::function<void()>& change) const;

private:
  [[noreturn]] void start(const Command& command) const;
  Stream m_Output;
  Stream m_Errors;
};

} // namespace disturbed
