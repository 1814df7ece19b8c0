// SPDX-License-Identifier: Apache-2.0
#include "quarn/start_up.h"
#include "support/interface/host.h"

int main(int argc, char** argv) {
  support::installSignalCleanUp();
  quarn::startUp(argc, argv, support::getPosixHost());
}
