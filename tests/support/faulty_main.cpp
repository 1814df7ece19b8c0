// SPDX-License-Identifier: Apache-2.0
//
// The tool on a host of which one call fails, told by the environment: QUARN_FAIL_CALL is the
// number of the call from 1 (0 or unset: none), QUARN_FAIL_ERROR the error number it fails with, or
// QUARN_FAIL_SIGNAL the signal that comes with it instead. QUARN_FAIL_ALLOCATION is the number of
// the allocation that fails, and QUARN_FAIL_ALLOCATIONS_TO the one that is the last to do so.
// At exit the numbers of calls and of allocations that were made are written to the file
// QUARN_CALL_COUNT.
//
// A first word that is the name of another of our programs is taken for it.
//
// It is a program of its own, so that signals end a real process and the temporaries of the real
// host are looked for on a real disk.

#include "quarn-ar/ar_main.h"
#include "quarn-json/json_main.h"
#include "quarn/quarn_main.h"
#include "quarn/start_up.h"
#include "support/interface/host.h"
#include "tests/support/failing_memory.h"
#include "tests/support/faulty_host.h"

#include <cstdio>
#include <cstdlib>
#include <string_view>

namespace {

testsupport::FaultyHost& getFaultyHost() {
  static testsupport::FaultyHost host(support::getNativeHost());
  return host;
}

unsigned long numberFrom(const char* variable) {
  const char* text = std::getenv(variable);
  return text == nullptr ? 0 : std::strtoul(text, nullptr, 10);
}

void writeCallCount() {
  const char* name = std::getenv("QUARN_CALL_COUNT");
  if (name == nullptr) return;
  std::FILE* file = std::fopen(name, "w");
  if (file == nullptr) return;
  std::fprintf(file, "%llu %llu\n", static_cast<unsigned long long>(getFaultyHost().getCallCount()),
               static_cast<unsigned long long>(testsupport::getAllocationCount()));
  std::fclose(file);
}

quarn::Work workNamed(std::string_view word) {
  if (word == "quarn-ar") return quarn_ar::arMain;
  if (word == "quarn-json") return quarn_json::jsonMain;
  return quarn::quarnMain;
}

} // namespace

int main(int argc, char** argv) {
  support::installSignalCleanUp();
  const unsigned long call = numberFrom("QUARN_FAIL_CALL");
  const auto signal = static_cast<int>(numberFrom("QUARN_FAIL_SIGNAL"));
  if (signal != 0)
    getFaultyHost().raiseAtCall(call, signal);
  else
    getFaultyHost().failCall(call, static_cast<support::HostError>(numberFrom("QUARN_FAIL_ERROR")));
  std::atexit(writeCallCount);
  testsupport::failAllocations(numberFrom("QUARN_FAIL_ALLOCATION"),
                               numberFrom("QUARN_FAIL_ALLOCATIONS_TO"));
  const quarn::Work work = workNamed(argc > 1 ? argv[1] : "");
  const int skipped = work == quarn::quarnMain ? 0 : 1;
  quarn::startUp(argc - skipped, argv + skipped, getFaultyHost(), work);
}
