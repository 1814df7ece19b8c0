// SPDX-License-Identifier: Apache-2.0
//
// The tree of assertion sites. It is the one place of the ground that uses the general heap for
// a container: it must not count, or disturb, what it measures in the regions.

#include "checking/interface/statistics.h"

#include "checking/interface/checking.h"
#include "checking/src/level_names.h"

#include <algorithm>
#include <array>
#include <compare>
#include <map>
#include <string>
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

std::string classAndLevel(uint32_t temperature, uint32_t level) {
  std::string text(temperatureNames[temperature]);
  text += " ";
  text += levelNames[level];
  return text;
}

void showSite(const SiteCount& siteCount) {
  const Site& site = siteCount.first;
  std::string text(site.path);
  text += " " + std::to_string(site.line);
  text += " (" + classAndLevel(site.temperature, site.level) + ")";
  text += ": " + std::to_string(siteCount.second) + "\n";
  showText(text);
}

void showTotals() {
  std::array<std::array<uint64_t, std::size(levelNames)>, std::size(temperatureNames)> totals = {};
  for (const auto& [site, count] : siteCounts)
    totals[site.temperature][site.level] += count;

  showText("\nTotals:\n");
  for (uint32_t temperature = 0; temperature < totals.size(); ++temperature)
    for (uint32_t level = 0; level < totals[temperature].size(); ++level)
      showText(classAndLevel(temperature, level) + ": " +
               std::to_string(totals[temperature][level]) + "\n");
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
