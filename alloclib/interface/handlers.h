// SPDX-License-Identifier: Apache-2.0
//
// The two ways in which the region library gives up: a fault of the program, and memory that is not
// to be had. Neither comes back to the caller, so no allocation ever yields null, and no client has
// an untested branch for that.
//
// The ground may not print through a room above it. So it calls handlers: messages installs its own
// when it starts, and until then the defaults here serve. A count from a file should not lead here:
// readers compare it with the bytes present before they reserve anything.

#pragma once

#include <cstddef>

namespace alloclib {

/// The text of a fault inside the library or in the way it is used, valid during the call.
using InternalErrorHandler = void (*)(const char* text);
/// `size` is the request in bytes; `systemSize` is what the process holds from the system, in
/// bytes.
using OutOfMemoryHandler = void (*)(size_t size, size_t systemSize);

/// Each installs its argument, or the default again for a null pointer, and returns what was
/// installed before. A handler should end the process; if it returns, the process is aborted. The
/// defaults write to standard error and exit with status 1, and need no set-up.
InternalErrorHandler setInternalErrorHandler(InternalErrorHandler handler);
OutOfMemoryHandler setOutOfMemoryHandler(OutOfMemoryHandler handler);

/// Calls the handler. Cold, as both stand behind comparisons in the allocation paths.
[[noreturn, gnu::cold]] void internalError(const char* text);
/// Also for callers that take memory from the host's heap themselves. `size` in bytes.
[[noreturn, gnu::cold]] void outOfMemory(size_t size);

} // namespace alloclib
