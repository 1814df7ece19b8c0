// SPDX-License-Identifier: Apache-2.0
//
// The program: the host's real files, and clean-up on signals from the first moment on.
#include "quarn-ar/ar_main.h"
#include "quarn/start_up.h"
#include "support/interface/host.h"

int main(int argc, char** argv) {
  support::installSignalCleanUp();
  quarn::startUp(argc, argv, support::getPosixHost(), quarn_ar::arMain);
}
