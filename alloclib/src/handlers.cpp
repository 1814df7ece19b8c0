// SPDX-License-Identifier: Apache-2.0
//
// The installed handlers. They work before the region system is initialised, and after it has been
// shut down, since that is when faults of the start-up show. So they are plain pointers with a
// constant start value, and the defaults need nothing but the C library.

#include "alloclib/interface/handlers.h"

#include "alloclib/interface/process.h"

#include <cstdio>
#include <cstdlib>

namespace alloclib {
namespace {

void printInternalError(const char* text) {
  std::fprintf(stderr, "Internal alloclib error: %s\n", text);
  std::exit(1);
}

void printOutOfMemory(size_t size, size_t systemSize) {
  std::fprintf(stderr, "Out of memory. Allocation of %zu bytes failed, system size is %zu bytes\n",
               size, systemSize);
  std::exit(1);
}

InternalErrorHandler internalErrorHandler = printInternalError;
OutOfMemoryHandler outOfMemoryHandler = printOutOfMemory;

} // namespace

InternalErrorHandler setInternalErrorHandler(InternalErrorHandler handler) {
  InternalErrorHandler previous = internalErrorHandler;
  internalErrorHandler = handler != nullptr ? handler : printInternalError;
  return previous;
}

OutOfMemoryHandler setOutOfMemoryHandler(OutOfMemoryHandler handler) {
  OutOfMemoryHandler previous = outOfMemoryHandler;
  outOfMemoryHandler = handler != nullptr ? handler : printOutOfMemory;
  return previous;
}

void internalError(const char* text) {
  internalErrorHandler(text);
  // A handler that comes back would let the caller go on with memory that is not there.
  std::abort();
}

void outOfMemory(size_t size) {
  outOfMemoryHandler(size, getSystemSize());
  std::abort();
}

} // namespace alloclib
