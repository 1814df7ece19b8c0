// SPDX-License-Identifier: Apache-2.0
//
// The program: the host's real files. It writes none, so that no signal leaves anything behind.
#include "quarn-json/json_main.h"
#include "quarn/start_up.h"
#include "support/interface/host.h"

int main(int argc, char** argv) {
  quarn::startUp(argc, argv, support::getPosixHost(), quarn_json::jsonMain);
}
