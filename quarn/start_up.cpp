// SPDX-License-Identifier: Apache-2.0
//
// Order matters here: regions before what lives in them, messages before the first word can be
// wrong, and the way out before anything that may end the run. The session and the driver's region
// are never destroyed as objects, since a message may end the process from anywhere, with regions
// in use.
#include "quarn/start_up.h"

#include "alloclib/interface/handlers.h"
#include "alloclib/interface/region.h"
#include "alloclib/interface/session.h"
#include "messages/interface/messages.h"
#include "messages/interface/output.h"
#include "messages/interface/process_end.h"
#include "quarn/reporting.h"
#include "support/interface/host.h"
#include "support/interface/tool_name.h"

#include <array>
#include <cstdlib>
#include <new>

namespace quarn {

namespace {

constexpr size_t DriverRegionSize = 1024;

// Never destroyed: the process may end anywhere, with regions alive.
alloclib::Session* session = nullptr;
alloclib::RegionGeneral* driverRegion = nullptr;
support::Host* usedHost = nullptr;

// Until there are messages to tell it.
void endWithoutMemory() {
  alloclib::outOfMemory(sizeof(alloclib::Session));
}

} // namespace

void startUp(int argc, const char* const* argv, support::Host& host, Work work) {
  usedHost = &host;
  std::set_new_handler(endWithoutMemory);
  session = new alloclib::Session;
  driverRegion = alloclib::RegionGeneral::Create(DriverRegionSize, "quarn memory");
  messages::initialise();
  messages::setExitHandler(shutDown);
  std::array<char, support::ToolNameSize> toolName;
  support::toolNameFrom(argc > 0 ? argv[0] : nullptr, toolName);
  work(argc, argv, toolName.data(), host, *driverRegion);
  finishOutput();
  shutDown(hasErrors() ? 1 : 0);
}

// Objects of the work may still be alive where a message ends the run, so what the regions hold is
// left to the host. Half a file is not: it looks like a whole one to whoever finds it. What could
// not be written is told by the status at least.
void shutDown(int code) {
  if (usedHost != nullptr) usedHost->removeUnfinished();
  messages::closeStreams();
  if (driverRegion != nullptr) {
    driverRegion->Destroy(false);
    session->leave();
  }
  const bool isOutputLost = messages::hasStdoutFailed() || messages::hasStderrFailed();
  std::exit(code == 0 && isOutputLost ? 1 : code);
}

} // namespace quarn
