// SPDX-License-Identifier: Apache-2.0
//
// The host of the tests where it is Windows. Its C library ends an aborted process with status 3.

#include "tests/support/test_host.h"

#include <cstdlib>
#include <ctime>
#include <string>
#include <windows.h>

namespace testsupport {

void setTimeZone(const char* name) {
  _putenv((std::string("TZ=") + (name == nullptr ? "" : name)).c_str());
  _tzset();
}

bool hasAborted(int status) {
  return status == 3;
}

void* takeAddresses(size_t size) {
  return VirtualAlloc(nullptr, size, MEM_RESERVE | MEM_COMMIT, PAGE_READWRITE);
}

void giveAddressesBack(void* addresses, size_t) {
  VirtualFree(addresses, 0, MEM_RELEASE);
}

} // namespace testsupport
