// SPDX-License-Identifier: Apache-2.0
//
// The program: the host's real files. It writes none, so that no signal leaves anything behind.
#include "quarn-json/json_main.h"
#include "quarn/start_up.h"
#include "support/interface/program.h"

int main(int argc, char** argv) {
  const support::CommandLine line = support::getCommandLine(argc, argv);
  quarn::startUp(line.argc, line.argv, support::getProgramHost(), quarn_json::jsonMain);
}
