// SPDX-License-Identifier: Apache-2.0
//
// Writing to a descriptor until all is out. A reader who is slow only costs time; one who has gone
// is a failure, as is a full disk.

#include "support/interface/descriptor.h"

#include <cerrno>
#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

namespace support {

namespace {

// A duplicate may not take the number of a standard stream that is closed: what is meant for
// nobody would then come out of the other stream.
constexpr int LowestDuplicate = STDERR_FILENO + 1;

// Whether the failed write is worth another try, when needed after waiting for room.
bool mayTryAgain(int descriptor, int errorNumber) {
  if (errorNumber == EINTR) return true;
  if (errorNumber != EAGAIN && errorNumber != EWOULDBLOCK) return false;
  pollfd request{descriptor, POLLOUT, 0};
  return poll(&request, 1, -1) >= 0 || errno == EINTR;
}

} // namespace

int duplicateDescriptor(int descriptor) {
  const int duplicate = fcntl(descriptor, F_DUPFD_CLOEXEC, LowestDuplicate);
  return duplicate >= 0 || errno == EBADF ? duplicate : descriptor;
}

HostError writeToDescriptor(int descriptor, std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t count = ::write(descriptor, bytes.data(), bytes.size());
    if (count >= 0) {
      bytes.remove_prefix(static_cast<size_t>(count));
    } else if (const int errorNumber = errno; !mayTryAgain(descriptor, errorNumber)) {
      return errorNumber;
    }
  }
  return 0;
}

// A terminal takes bytes as anything else does.
void setConsolePage(uint32_t) {}

HostError closeDescriptor(int descriptor) {
  return ::close(descriptor) == 0 || errno == EINTR ? 0 : errno;
}

} // namespace support
