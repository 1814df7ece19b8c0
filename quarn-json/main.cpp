// SPDX-License-Identifier: Apache-2.0
//
// The program: the host's real files, and clean-up on signals from the first moment on. The
// document waits in a temporary file until it is whole.
#include "quarn-json/json_main.h"
#include "quarn/start_up.h"
#include "support/interface/host.h"
#include "support/interface/program.h"

int main(int argc, char** argv) {
  support::installSignalCleanUp();
  const support::CommandLine line = support::getCommandLine(argc, argv);
  quarn::startUp(line.argc, line.argv, support::getProgramHost(), quarn_json::jsonMain);
}
