// SPDX-License-Identifier: Apache-2.0
//
// A folder on disk in which the tool is run. `run` runs the driver in a process of its own, made by
// fork alone, so that thousands of runs take seconds; `runOnFaultyHost` starts the real program.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace testsupport {

struct ToolRun {
  int status = -1; // exit status; -1 if a signal ended the process
  std::string output;
  std::string errors;
};

class ToolFolder {
public:
  ToolFolder();
  ~ToolFolder();
  ToolFolder(const ToolFolder&) = delete;
  ToolFolder& operator=(const ToolFolder&) = delete;

  void write(const std::string& leaf, const std::string& bytes) const;
  [[nodiscard]] std::string read(const std::string& leaf) const;
  // Everything in the folder, sorted.
  [[nodiscard]] std::vector<std::string> leaves() const;
  void removeAllBut(const std::vector<std::string>& kept) const;

  // The words behind the tool's name. A run that takes long is ended.
  [[nodiscard]] ToolRun run(const std::vector<std::string>& words) const;

  // The same with the host call of this number failing; 0: none. `callCount` becomes the number of
  // calls that were made.
  [[nodiscard]] ToolRun runOnFaultyHost(const std::vector<std::string>& words, uint64_t failingCall,
                                        int error, uint64_t& callCount) const;

private:
  [[nodiscard]] ToolRun collect(int process) const;
  void enter() const;

  std::string m_Folder;
  std::string m_Notes; // beside the folder: what the runs print
};

} // namespace testsupport
