// SPDX-License-Identifier: Apache-2.0
//
// Runs are processes of their own, so that what the tool does to itself at its end (and it always
// ends by an exit) leaves the test alone. A forked run starts with the test's own memory: fast, and
// good for thousands of runs, but no measure of memory; the real program is started by execv. Every
// run has an alarm, since a hang must fail and not stop the suite.

#include "tests/support/tool_folder.h"

#include "quarn/quarn_main.h"
#include "quarn/start_up.h"
#include "support/interface/host.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

// Memory that is left to the host at the end of a run is no fault of it. The name is the
// sanitizer's, which looks for it.
#ifdef __clang__
#pragma clang diagnostic ignored "-Wreserved-identifier"
#endif
extern "C" const char* __asan_default_options();
extern "C" const char* __asan_default_options() {
  return "detect_leaks=0";
}

namespace testsupport {

namespace {

namespace fs = std::filesystem;

constexpr unsigned LongestRun = 20; // seconds

std::string makeFolder() {
  std::string name = testing::TempDir() + "quarn-tool.XXXXXX";
  return mkdtemp(name.data());
}

std::string readWhole(const std::string& name) {
  std::ifstream stream(name, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

void redirect(int descriptor, const std::string& name) {
  const int file = open(name.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  dup2(file, descriptor);
  close(file);
}

double secondsOf(const timeval& time) {
  return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
}

std::vector<const char*> argumentsOf(const char* program, const std::vector<std::string>& words) {
  std::vector<const char*> arguments = {program};
  for (const std::string& word : words)
    arguments.push_back(word.c_str());
  arguments.push_back(nullptr);
  return arguments;
}

[[noreturn]] void startProgram(const char* program, const std::vector<std::string>& words) {
  setenv("ASAN_OPTIONS", "detect_leaks=0", 1);
  std::vector<const char*> arguments = argumentsOf("quarn", words);
  execv(program, const_cast<char* const*>(arguments.data()));
  _exit(98);
}

} // namespace

ToolFolder::ToolFolder() : m_Folder(makeFolder()), m_Notes(makeFolder()) {}

ToolFolder::~ToolFolder() {
  fs::remove_all(m_Folder);
  fs::remove_all(m_Notes);
}

void ToolFolder::write(const std::string& leaf, const std::string& bytes) const {
  std::ofstream(m_Folder + "/" + leaf, std::ios::binary) << bytes;
}

std::string ToolFolder::read(const std::string& leaf) const {
  return readWhole(m_Folder + "/" + leaf);
}

std::vector<std::string> ToolFolder::leaves() const {
  std::vector<std::string> names;
  for (const auto& entry : fs::directory_iterator(m_Folder))
    names.push_back(entry.path().filename().string());
  std::sort(names.begin(), names.end());
  return names;
}

void ToolFolder::remove(const std::string& leaf) const {
  fs::remove_all(m_Folder + "/" + leaf);
}

void ToolFolder::removeAllBut(const std::vector<std::string>& kept) const {
  for (const std::string& leaf : leaves()) {
    if (std::find(kept.begin(), kept.end(), leaf) == kept.end()) {
      remove(leaf);
    }
  }
}

void ToolFolder::enter(const std::string& notes) const {
  alarm(LongestRun);
  if (chdir(m_Folder.c_str()) != 0) _exit(99);
  setenv("TMPDIR", m_Folder.c_str(), 1);
  redirect(STDOUT_FILENO, m_Notes + "/out" + notes);
  redirect(STDERR_FILENO, m_Notes + "/err" + notes);
}

ToolRun ToolFolder::collect(int process, const std::string& notes) const {
  int state = 0;
  rusage usage = {};
  wait4(process, &state, 0, &usage);
  return {WIFEXITED(state) ? WEXITSTATUS(state) : -1,
          WIFSIGNALED(state) ? WTERMSIG(state) : 0,
          readWhole(m_Notes + "/out" + notes),
          readWhole(m_Notes + "/err" + notes),
          secondsOf(usage.ru_utime) + secondsOf(usage.ru_stime),
          static_cast<uint64_t>(usage.ru_maxrss) * 1024};
}

ToolRun ToolFolder::run(const std::vector<std::string>& words) const {
  return runOn(support::getNativeHost(), words);
}

ToolRun ToolFolder::runOn(support::Host& host, const std::vector<std::string>& words) const {
  std::fflush(nullptr);
  const pid_t process = fork();
  if (process == 0) {
    enter();
    support::installSignalCleanUp();
    const std::vector<const char*> arguments = argumentsOf("quarn", words);
    quarn::startUp(static_cast<int>(arguments.size()) - 1, arguments.data(), host,
                   quarn::quarnMain);
  }
  return collect(process);
}

ToolRun ToolFolder::runProgram(const std::vector<std::string>& words) const {
  return runFile(QUARN_PROGRAM, words);
}

ToolRun ToolFolder::runJson(const std::vector<std::string>& words) const {
  return runFile(QUARN_JSON_PROGRAM, words);
}

ToolRun ToolFolder::runFile(const char* file, const std::vector<std::string>& words) const {
  std::fflush(nullptr);
  const pid_t process = fork();
  if (process == 0) {
    enter();
    startProgram(file, words);
  }
  return collect(process);
}

// They wait for the end of a pipe, which comes when all are there.
std::vector<ToolRun>
ToolFolder::runAtOnce(const std::vector<std::vector<std::string>>& runs) const {
  std::fflush(nullptr);
  int start[2];
  if (pipe(start) != 0) return {};
  std::vector<pid_t> processes;
  for (size_t i = 0; i < runs.size(); ++i) {
    const pid_t process = fork();
    if (process == 0) {
      enter(std::to_string(i));
      close(start[1]);
      char nothing = 0;
      if (::read(start[0], &nothing, 1) != 0) _exit(97);
      close(start[0]);
      startProgram(QUARN_PROGRAM, runs[i]);
    }
    processes.push_back(process);
  }
  close(start[0]);
  close(start[1]);
  std::vector<ToolRun> results;
  for (size_t i = 0; i < runs.size(); ++i)
    results.push_back(collect(processes[i], std::to_string(i)));
  return results;
}

ToolRun ToolFolder::runFaulty(const std::vector<std::string>& words, const Variables& variables,
                              int signal, std::array<uint64_t, 2>& counts) const {
  const std::string countName = m_Notes + "/count";
  fs::remove(countName);
  std::fflush(nullptr);
  const pid_t process = fork();
  if (process == 0) {
    enter();
    for (const auto& [name, value] : variables)
      setenv(name, std::to_string(value).c_str(), 1);
    setenv("QUARN_CALL_COUNT", countName.c_str(), 1);
    // One that was ignored when the tests were started would stay so.
    if (signal != 0) std::signal(signal, SIG_DFL);
    startProgram(QUARN_ON_FAULTY_HOST, words);
  }
  const ToolRun result = collect(process);
  counts = {};
  std::istringstream(readWhole(countName)) >> counts[0] >> counts[1];
  return result;
}

ToolRun ToolFolder::runOnFaultyHost(const std::vector<std::string>& words, const Fault& fault,
                                    uint64_t& callCount) const {
  std::array<uint64_t, 2> counts = {};
  const ToolRun result = runFaulty(words,
                                   {{"QUARN_FAIL_CALL", fault.call},
                                    {"QUARN_FAIL_ERROR", static_cast<uint64_t>(fault.error)},
                                    {"QUARN_FAIL_SIGNAL", static_cast<uint64_t>(fault.signal)}},
                                   fault.signal, counts);
  callCount = counts[0];
  return result;
}

ToolRun ToolFolder::runWithoutMemory(const std::vector<std::string>& words, uint64_t first,
                                     uint64_t last, uint64_t& allocationCount) const {
  std::array<uint64_t, 2> counts = {};
  const ToolRun result = runFaulty(
      words, {{"QUARN_FAIL_ALLOCATION", first}, {"QUARN_FAIL_ALLOCATIONS_TO", last}}, 0, counts);
  allocationCount = counts[1];
  return result;
}

} // namespace testsupport
