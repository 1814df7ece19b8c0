// SPDX-License-Identifier: Apache-2.0
//
// A folder on disk in which the tool is run. `run` runs the driver in a process of its own, made by
// fork alone, so that thousands of runs take seconds; `runProgram` starts the real program, and
// `runOnFaultyHost` the one with the faulty host.
//
// What the runs print goes to a second folder, so that the first one holds nothing but what the
// tool has made: a temporary that is left behind shows.

#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace support {
class Host;
}

namespace testsupport {

struct ToolRun {
  int status = -1; // exit status; -1 if a signal ended the process
  int signal = 0;  // the one that did
  std::string output;
  std::string errors;
  double seconds = 0;      // of the processor, the system's share included
  uint64_t peakMemory = 0; // bytes; not below what this process has when it starts the other one
};

// What happens to a run on the faulty host.
struct Fault {
  uint64_t call = 0; // which of the host calls fails; 0: none
  int error = 0;     // the error number it fails with
  int signal = 0;    // if there is one, it comes with the call, which does not fail
};

class ToolFolder {
public:
  ToolFolder();
  ~ToolFolder();
  ToolFolder(const ToolFolder&) = delete;
  ToolFolder& operator=(const ToolFolder&) = delete;

  [[nodiscard]] const std::string& getName() const { return m_Folder; }

  void write(const std::string& leaf, const std::string& bytes) const;
  [[nodiscard]] std::string read(const std::string& leaf) const;
  // Everything in the folder, sorted.
  [[nodiscard]] std::vector<std::string> leaves() const;
  void remove(const std::string& leaf) const;
  void removeAllBut(const std::vector<std::string>& kept) const;

  // The words behind the tool's name. A run that takes long is ended.
  [[nodiscard]] ToolRun run(const std::vector<std::string>& words) const;
  // The same on another host. What it does to itself stays in the other process.
  [[nodiscard]] ToolRun runOn(support::Host& host, const std::vector<std::string>& words) const;
  // The same by the real program, as users start it.
  [[nodiscard]] ToolRun runProgram(const std::vector<std::string>& words) const;
  // quarn-json, in the same way.
  [[nodiscard]] ToolRun runJson(const std::vector<std::string>& words) const;

  // Several runs of the real program that start at the same moment. What each prints is its own.
  [[nodiscard]] std::vector<ToolRun>
  runAtOnce(const std::vector<std::vector<std::string>>& runs) const;

  // The same with a fault. `callCount` becomes the number of calls that were made; 0 if a signal
  // ended the process.
  [[nodiscard]] ToolRun runOnFaultyHost(const std::vector<std::string>& words, const Fault& fault,
                                        uint64_t& callCount) const;

  // The same where these allocations, counted from 1, fail; none if they are 0.
  [[nodiscard]] ToolRun runWithoutMemory(const std::vector<std::string>& words, uint64_t first,
                                         uint64_t last, uint64_t& allocationCount) const;

private:
  using Variables = std::vector<std::pair<const char*, uint64_t>>;
  // `counts` become the numbers of calls and of allocations.
  [[nodiscard]] ToolRun runFaulty(const std::vector<std::string>& words, const Variables& variables,
                                  int signal, std::array<uint64_t, 2>& counts) const;
  [[nodiscard]] ToolRun runFile(const char* file, const std::vector<std::string>& words) const;
  // `notes` tells apart what runs at the same time print.
  [[nodiscard]] ToolRun collect(int process, const std::string& notes = "") const;
  void enter(const std::string& notes = "") const;

  std::string m_Folder;
  std::string m_Notes; // beside the folder: what the runs print
};

} // namespace testsupport
