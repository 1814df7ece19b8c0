// SPDX-License-Identifier: Apache-2.0
//
// The words for the levels and the classes of checks, indexed by their numbers: read from the
// command line by set_checking_level, and written by the statistics.

#pragma once

#include <string_view>

namespace checking {

// None is the beginning of another, so the first that a text starts with is the one that is meant.
constexpr std::string_view LevelNames[] = {"none", "low", "medium", "high", "extravagant"};
constexpr std::string_view TemperatureNames[] = {"cold", "hot"};

} // namespace checking
