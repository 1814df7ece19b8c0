// SPDX-License-Identifier: Apache-2.0
//
// The host of the tests where it is a POSIX system.

#include "tests/support/test_host.h"

#include <csignal>
#include <cstdlib>
#include <ctime>
#include <sys/mman.h>
#include <sys/wait.h>

namespace testsupport {

void setTimeZone(const char* name) {
  if (name == nullptr)
    unsetenv("TZ");
  else
    setenv("TZ", name, 1);
  tzset();
}

bool hasAborted(int status) {
  return WIFSIGNALED(status) && WTERMSIG(status) == SIGABRT;
}

void* takeAddresses(size_t size) {
  void* addresses = mmap(nullptr, size, PROT_READ | PROT_WRITE,
                         MAP_PRIVATE | MAP_ANONYMOUS | MAP_NORESERVE, -1, 0);
  return addresses == MAP_FAILED ? nullptr : addresses;
}

void giveAddressesBack(void* addresses, size_t size) {
  munmap(addresses, size);
}

} // namespace testsupport
