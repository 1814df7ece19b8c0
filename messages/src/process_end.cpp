// SPDX-License-Identifier: Apache-2.0
//
// The one door out of the process for this library. The shut-down behind it may itself report and
// come back to the door: the second time there is no ordered way any more, and the process ends
// with only its streams flushed. Else a fault in the shut-down would go round for ever.

#include "messages/interface/process_end.h"

#include "messages/interface/output.h"

#include <cstdlib>

namespace messages {

namespace {

void flushAndExit(int status) {
  flushAll();
  std::exit(status);
}

ExitHandler exitHandler = flushAndExit;
bool isEnding = false;

// A test's handler throws; then the process isn't ending after all.
struct EndingMark {
  EndingMark() { isEnding = true; }
  ~EndingMark() { isEnding = false; }
};

} // namespace

void setExitHandler(ExitHandler handler) {
  exitHandler = handler ? handler : flushAndExit;
}

void endProcess(int status) {
  if (!isEnding) {
    const EndingMark mark;
    exitHandler(status);
  }
  flushAll();
  std::_Exit(status);
}

} // namespace messages
