// SPDX-License-Identifier: Apache-2.0
//
// The tree of assertion sites. It is the one place of the ground that uses the general heap for a
// container: it must not count, or disturb, what it measures in the regions.
//
// A site is known by path, line, temperature and level. The tree keeps them in that order, which is
// the order of sites with the same count in the report: nothing depends on where they lie in
// memory.

#include "checking/interface/statistics.h"

#include "checking/interface/checking.h"
#include "checking/src/level_names.h"

#include <algorithm>
#include <array>
#include <compare>
#include <cstddef>
#include <iterator>
#include <map>
#include <sstream>
#include <string_view>
#include <utility>
#include <vector>

namespace checking {
namespace {

struct Site {
  std::string_view path;
  unsigned line;
  Temperature temperature;
  uint32_t level;

  auto operator<=>(const Site&) const = default;
};

using SiteCount = std::pair<Site, uint64_t>;

std::map<Site, uint64_t> siteCounts;
bool counting = false;

void showSite(const SiteCount& siteCount) {
  const auto& [site, count] = siteCount;
  std::ostringstream text;
  text << site.path << ' ' << site.line << " (" << TemperatureNames[site.temperature] << ' '
       << LevelNames[site.level] << "): " << count << '\n';
  showText(text.str());
}

void showTotals() {
  std::array<std::array<uint64_t, std::size(LevelNames)>, std::size(TemperatureNames)> totals = {};
  for (const auto& [site, count] : siteCounts)
    totals[site.temperature][site.level] += count;

  std::ostringstream text;
  text << "\nTotals:\n";
  for (size_t temperature = 0; temperature < totals.size(); ++temperature)
    for (size_t level = 0; level < totals[temperature].size(); ++level)
      text << TemperatureNames[temperature] << ' ' << LevelNames[level] << ": "
           << totals[temperature][level] << '\n';
  showText(text.str());
}

} // namespace

void startStatistics() {
  siteCounts.clear();
  counting = true;
  showText("Collecting checking statistics\n");
}

void finishStatistics() {
  counting = false;
  showText("Finished checking statistics\n");
  std::vector<SiteCount> sites(siteCounts.begin(), siteCounts.end());
  // Sites with equal counts stay in the tree's order.
  std::stable_sort(sites.begin(), sites.end(), [](const SiteCount& left, const SiteCount& right) {
    return left.second > right.second;
  });
  std::for_each(sites.begin(), sites.end(), showSite);
  showTotals();
}

bool countCheck(const char* path, unsigned line, Temperature temperature, uint32_t level) {
  if (counting) ++siteCounts[Site{path, line, temperature, level}];
  return true;
}

} // namespace checking
