// SPDX-License-Identifier: Apache-2.0
//
// The region system of the process: its start and end, and what new regions are made of. Below all
// others stands the root region, which is made here and asks the host; on it the one page allocator
// that all general regions share; and these belong to whoever made them. Programs go through
// alloclib::Session; the functions are open for tests, which put other parents in.

#pragma once

#include <cstddef>
#include <cstdint>

namespace alloclib {

class Region;
class RegionLargeBlock;

/// What regions made from now on do; those there already stay as they are.
/// The tool leaves it off: the other modes are for whoever looks for a leak or a misuse.
enum DebugMode : int {
  Debug_Off = 0,
  Debug_Plain = 1,
  /// Every allocation is counted and can be traced.
  Debug_Tracing = 2,
  /// Every region allocates from a parent of its own.
  Debug_Transparent = 3,
};

/// Makes the root region and the first default parent of it. A second call is an internal error.
void initialise();

/// Undoes initialise; every region must have been destroyed. With false nothing is checked and
/// nothing given back, for a process that is about to exit with regions still alive. An internal
/// error before initialise.
void shutDown(bool freeMemory = true);

/// The region on which RegionFastOld::Create builds. The pushed region must stay until it is
/// popped and its users are gone.
void pushDefaultParent(Region* parent);
/// Returns the region that was popped.
Region* popDefaultParent();
/// The region that was pushed last, or the root region. An internal error before initialise.
[[nodiscard]] Region* getDefaultParent();

/// The page allocator under all general regions, made on the default parent at its first use.
/// One for all, as it takes 1 MiB of the host before the first page is asked for.
[[nodiscard]] RegionLargeBlock* getProcessLargeBlock();

/// Bytes that the root region holds from the host; 0 before initialise.
[[nodiscard]] size_t getSystemSize();

/// A DebugMode. An int, so that one that there is not shows as an internal error where a region is
/// made with it.
[[nodiscard]] int getDebugMode();
void setDebugMode(int mode);

/// How much regions made from now on tell about themselves on standard error: 1 their life, 2
/// allocations too, 3 overhead and fragmentation too.
[[nodiscard]] uint32_t getTraceLevel();
void setTraceLevel(uint32_t level);

} // namespace alloclib
