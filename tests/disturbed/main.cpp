// SPDX-License-Identifier: Apache-2.0
//
// The real programs, on real files, with each of their system calls disturbed in turn: it fails, it
// does half of its work, the program is killed at it or gets a signal, or somebody else changes a
// file there. promises.h says what must hold all the same.
//
//   disturbed                        a sample of all that can happen in each scenario
//   disturbed --all                  all of it
//   disturbed add                    all of one scenario
//   disturbed add 17:error:ENOSPC    one run again, which shows what it did
//
// Each core has a process with a folder of its own; they count together in shared memory.
#include "tests/disturbed/stage.h"

#include <algorithm>
#include <array>
#include <atomic>
#include <cinttypes>
#include <cstdio>
#include <cstring>
#include <new>
#include <random>
#include <sys/mman.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace disturbed {

namespace {

constexpr int Skipped = 77; // as ctest is told
constexpr size_t SampleOfScenario = 120;
constexpr unsigned Seed = 1; // the sample is the same each time
constexpr size_t MostScenarios = 64;
constexpr size_t MostCalls = 4096;
constexpr size_t KindCount = static_cast<size_t>(FaultKind::MakeFolder) + 1;
// The moments between the call that gives a complete archive its first name and the one that gives
// it the archive's.
constexpr ptrdiff_t MostPlacesOfTemporary = 4;

struct Totals {
  std::array<std::atomic<uint64_t>, KindCount> runs;
  std::atomic<uint64_t> failures;
  // For each scenario, behind which calls a kill leaves a temporary.
  std::array<std::array<std::atomic<bool>, MostCalls>, MostScenarios> places;
};

struct Request {
  bool isAll = false;
  std::string scenario; // empty: each
};

// Counts and tells, for one process of several.
class Worker {
public:
  Worker(const Request& request, Totals& totals, size_t number, size_t count)
      : m_Request(request), m_Totals(totals), m_Number(number), m_Count(count), m_Store(m_Tracer) {}

  void playAll();

private:
  void playScenario(size_t index);
  [[nodiscard]] std::vector<Fault> select(std::vector<Fault> faults, size_t index) const;
  void play(Stage& stage, size_t index, const Fault& fault);
  void fail(const Scenario& scenario, const std::string& what);

  const Request& m_Request;
  Totals& m_Totals;
  size_t m_Number;
  size_t m_Count;
  Tracer m_Tracer;
  Store m_Store;
};

void Worker::fail(const Scenario& scenario, const std::string& what) {
  ++m_Totals.failures;
  std::printf("disturbed %s %s\n", scenario.name, what.c_str());
  std::fflush(stdout);
}

void Worker::play(Stage& stage, size_t index, const Fault& fault) {
  const Scenario& scenario = getScenarios()[index];
  const Verdict verdict = stage.play(fault);
  ++m_Totals.runs[static_cast<size_t>(fault.kind)];
  if (verdict.leavesTemporary) {
    const bool isBefore = fault.kind == FaultKind::KillBefore;
    m_Totals.places[index][fault.call - (isBefore ? 1 : 0)] = true;
  }
  if (verdict.broken.empty()) return;
  const SystemCall& call = stage.getCalls()[fault.call - 1];
  fail(scenario, textOf(fault) + "  # " + call.name() + ": " + verdict.broken);
}

// A part of them, if not all are wanted, and of this part each one for one process.
std::vector<Fault> Worker::select(std::vector<Fault> faults, size_t index) const {
  std::mt19937 random(Seed + static_cast<unsigned>(index));
  std::shuffle(faults.begin(), faults.end(), random);
  const bool isSample = !m_Request.isAll && m_Request.scenario.empty();
  if (isSample && faults.size() > SampleOfScenario) faults.resize(SampleOfScenario);
  std::vector<Fault> selected;
  for (size_t i = m_Number; i < faults.size(); i += m_Count)
    selected.push_back(faults[i]);
  return selected;
}

void Worker::playScenario(size_t index) {
  const Scenario& scenario = getScenarios()[index];
  Stage stage(m_Tracer, m_Store, scenario);
  const std::string unsound = stage.findUnsound();
  if (!unsound.empty() || stage.getCalls().size() >= MostCalls) {
    fail(scenario, unsound.empty() ? "makes too many calls" : unsound);
    return;
  }
  for (const Fault& fault : select(stage.computeFaults(), index))
    play(stage, index, fault);
}

void Worker::playAll() {
  for (size_t i = 0; i < getScenarios().size(); ++i) {
    if (m_Request.scenario.empty() || m_Request.scenario == getScenarios()[i].name) playScenario(i);
  }
}

Totals& makeSharedTotals() {
  void* const place =
      mmap(nullptr, sizeof(Totals), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
  if (place == MAP_FAILED) std::abort();
  return *new (place) Totals();
}

void playOnAllCores(const Request& request, Totals& totals) {
  const size_t count = std::max(1U, std::thread::hardware_concurrency());
  std::vector<pid_t> processes;
  for (size_t i = 0; i < count; ++i) {
    const pid_t process = fork();
    if (process == 0) {
      Worker(request, totals, i, count).playAll();
      _exit(0);
    }
    processes.push_back(process);
  }
  for (const pid_t process : processes) {
    int state = 0;
    waitpid(process, &state, 0);
    if (!WIFEXITED(state) || WEXITSTATUS(state) != 0) ++totals.failures;
  }
}

void reportPlaces(Totals& totals) {
  for (size_t i = 0; i < getScenarios().size(); ++i) {
    const auto& places = totals.places[i];
    const ptrdiff_t count = std::count(places.begin(), places.end(), true);
    if (count == 0) continue;
    const bool isTooMany = count > MostPlacesOfTemporary;
    std::printf("%s: a kill at %td places leaves a temporary%s\n", getScenarios()[i].name, count,
                isTooMany ? ", which is too many" : "");
    if (isTooMany) ++totals.failures;
  }
}

int report(Totals& totals) {
  reportPlaces(totals);
  uint64_t all = 0;
  for (size_t kind = 0; kind < KindCount; ++kind) {
    const uint64_t count = totals.runs[kind];
    all += count;
    std::printf("%8" PRIu64 " %s\n", count, nameOf(static_cast<FaultKind>(kind)).c_str());
  }
  const uint64_t failures = totals.failures;
  std::printf("%8" PRIu64 " runs, %" PRIu64 " failures\n", all, failures);
  return failures == 0 && all != 0 ? 0 : 1;
}

void show(const Outcome& outcome, const Fault& fault) {
  uint64_t number = 0;
  for (const SystemCall& call : outcome.run.calls) {
    ++number;
    std::printf("%c%4" PRIu64 " %s(%#lx, %#lx, %#lx) = %ld\n", number == fault.call ? '>' : ' ',
                number, call.name().c_str(), static_cast<unsigned long>(call.arguments[0]),
                static_cast<unsigned long>(call.arguments[1]),
                static_cast<unsigned long>(call.arguments[2]), call.result);
  }
  std::printf("status %d, signal %d\nstderr: %s\n", outcome.run.status, outcome.run.signal,
              outcome.run.errors.c_str());
  for (const auto& [name, entry] : outcome.entries)
    std::printf("%s: %zu bytes, mode %o\n", name.c_str(), entry.bytes.size(), entry.mode);
}

int playOne(const Scenario& scenario, const Fault& fault) {
  const Tracer tracer;
  const Store store(tracer);
  Stage stage(tracer, store, scenario);
  const Verdict verdict = stage.play(fault);
  show(stage.run(fault), fault);
  std::printf("%s\n", verdict.broken.empty() ? "All is kept." : verdict.broken.c_str());
  return verdict.broken.empty() ? 0 : 1;
}

int playOne(const std::string& name, const std::string& text) {
  const std::optional<Fault> fault = faultOf(text);
  for (const Scenario& scenario : getScenarios()) {
    if (name == scenario.name && fault) return playOne(scenario, *fault);
  }
  std::fprintf(stderr, "No such scenario or fault\n");
  return 2;
}

} // namespace

} // namespace disturbed

int main(int argc, char** argv) {
  using namespace disturbed;
  if (!canTrace()) {
    std::puts("Skipped: this machine lets nobody trace a process");
    return Skipped;
  }
  if (argc > 2) return playOne(argv[1], argv[2]);
  Request request;
  request.isAll = argc > 1 && std::strcmp(argv[1], "--all") == 0;
  if (argc > 1 && !request.isAll) request.scenario = argv[1];
  Totals& totals = makeSharedTotals();
  playOnAllCores(request, totals);
  return report(totals);
}
