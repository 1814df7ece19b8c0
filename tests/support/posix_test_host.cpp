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

void setEnvironment(const char* name, const char* value) {
  if (value == nullptr)
    unsetenv(name);
  else
    setenv(name, value, 1);
}

void setTemporaryPlace(const char* folder) {
  setEnvironment("TMPDIR", folder);
}

void setTimeZone(const char* name) {
  setEnvironment("TZ", name);
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
