// SPDX-License-Identifier: Apache-2.0
//
// The words for the levels and the classes of checks, indexed by their numbers.

#pragma once

#include <string_view>

namespace checking {

constexpr std::string_view LevelNames[] = {"none", "low", "medium", "high", "extravagant"};
constexpr std::string_view TemperatureNames[] = {"cold", "hot"};

} // namespace checking
