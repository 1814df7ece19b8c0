// SPDX-License-Identifier: Apache-2.0
//
// Writing to a descriptor until all is out: interrupted calls, short writes and a full pipe that
// doesn't block are no failures. A reader who is slow only costs time; one who has gone is a
// failure, as is a full disk. The number of the first failure goes up, and nobody writes on.

#include "messages/src/descriptor_sink.h"

#include <cerrno>
#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

namespace messages {

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

void DescriptorSink::open(int descriptor) {
  if (m_Descriptor < 0) m_Descriptor = fcntl(descriptor, F_DUPFD_CLOEXEC, LowestDuplicate);
}

int DescriptorSink::close() {
  if (m_Descriptor < 0) return 0;
  const int result = ::close(m_Descriptor);
  m_Descriptor = -1;
  return result == 0 || errno == EINTR ? 0 : errno;
}

int DescriptorSink::write(std::string_view bytes) {
  if (m_Descriptor < 0) return 0;
  while (!bytes.empty()) {
    const ssize_t count = ::write(m_Descriptor, bytes.data(), bytes.size());
    if (count >= 0) {
      bytes.remove_prefix(static_cast<size_t>(count));
    } else if (const int errorNumber = errno; !mayTryAgain(m_Descriptor, errorNumber)) {
      return errorNumber;
    }
  }
  return 0;
}

} // namespace messages
