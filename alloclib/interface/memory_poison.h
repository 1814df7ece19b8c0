// SPDX-License-Identifier: Apache-2.0
//
// Tells the address sanitizer which bytes of a region nobody owns, so that it finds a use after a
// discard as it does with the host's heap. Without this a region would hide exactly the faults that
// broken objects are to bring to light in the sanitized runs: to the sanitizer a block of the
// parent is one allocation, all of it good.
//
// Every path that hands out bytes unpoisons as many as were asked for, and not the rounding behind
// them; every path that takes some back poisons them. Without the sanitizer these are nothing.

#pragma once

#include <cstddef>

#if defined(__SANITIZE_ADDRESS__)
#include <sanitizer/asan_interface.h>
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#include <sanitizer/asan_interface.h>
#endif
#endif

namespace alloclib {

#ifdef ASAN_POISON_MEMORY_REGION
/// From now on nobody may read or write these bytes.
inline void poison(const void* start, size_t bytes) {
  ASAN_POISON_MEMORY_REGION(start, bytes);
}
/// Somebody owns them again.
inline void unpoison(const void* start, size_t bytes) {
  ASAN_UNPOISON_MEMORY_REGION(start, bytes);
}
#else
inline void poison(const void*, size_t) {}
inline void unpoison(const void*, size_t) {}
#endif

} // namespace alloclib
