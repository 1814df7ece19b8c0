// SPDX-License-Identifier: Apache-2.0
//
// Counts how often each assertion is evaluated, for whoever wonders what the checks cost. The
// assertion macro counts only in a build with QUARN_CHECKING_STATISTICS, so that an ordinary build
// pays nothing, and then only between start and finish. The tool itself never starts it.

#pragma once

#include <cstdint>

namespace checking {

/// How often the place of an assertion is passed: hot ones stand in inner loops.
enum Temperature : uint32_t { Temperature_Cold = 0, Temperature_Hot = 1 };

/// Starts counting from zero and says so through the text sink.
void startStatistics();

/// Stops counting and writes the sites, most counted first, and the totals to the text sink.
void finishStatistics();

/// Counts one evaluation if counting is on. `path` must live until the finish. Always true, so
/// that it fits into a condition.
bool countCheck(const char* path, unsigned line, Temperature temperature, uint32_t level);

} // namespace checking
