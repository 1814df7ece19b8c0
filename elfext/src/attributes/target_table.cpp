// SPDX-License-Identifier: Apache-2.0
//
// Look-ups in the target table, by name and by the numbers of Tag_CPU_arch and
// Tag_CPU_arch_profile. Names and numbers may be a file's: one that is not known gets nothing, or
// the row of the empty name. The table is three hundred constants, looked through row by row.
#include "elfext/interface/target_table.h"

#include "checking/interface/checking.h"
#include "elfext/src/attributes/target_rows.h"
#include "support/interface/letters.h"

#include <algorithm>
#include <iterator>
#include <string_view>

namespace elfext {

namespace {

using targets::Rows;

// A row that gets lost in an edit is noticed.
static_assert(std::size(Rows) == 296);

constexpr const TargetEntry* findRow(std::string_view name) {
  for (const TargetEntry& row : Rows) {
    if (support::equalIgnoringCase(row.name, name)) return &row;
  }
  return nullptr;
}

constexpr bool containsItsBase(const TargetEntry& row) {
  if (row.base == nullptr) return true;
  const TargetEntry* base = findRow(row.base);
  return base != nullptr && row.features.contains(base->features);
}

static_assert(std::ranges::all_of(Rows, containsItsBase));
static_assert(std::ranges::is_sorted(Rows, {}, &TargetEntry::kind), "grouped by kind");

// Architectures by number; those with profiles have a row for each.
constexpr uint32_t NumberOf7 = 10;
constexpr uint32_t NumberOf8 = 14;
constexpr std::string_view NamesByNumber[] = {
    "",    "4", "4-K", "5-K",  "5-KD", "5-KDJ",  "6",   "6-NZ",  "6-B",
    "6-N", "7", "6-M", "6-MS", "7-MD", "8-A.32", "8-R", "8-M.1", "8-M.2",
};

constexpr std::string_view nameOf7(uint32_t profile) {
  switch (profile) {
  case 'A':
    return "7-A";
  case 'M':
    return "7-M";
  case 'R':
    return "7-R";
  case 'S':
    return "7-S";
  default:
    return NamesByNumber[NumberOf7];
  }
}

constexpr std::string_view nameOf8(uint32_t profile) {
  switch (profile) {
  case 'R':
    return "8-R";
  case 'S':
    return "8-S";
  default:
    return NamesByNumber[NumberOf8];
  }
}

constexpr std::string_view architectureName(uint32_t number, uint32_t profile) {
  if (number == NumberOf7) return nameOf7(profile);
  if (number == NumberOf8) return nameOf8(profile);
  // The empty name is the first row, which has no features.
  return number < std::size(NamesByNumber) ? NamesByNumber[number] : "";
}

constexpr bool isArchitecture(std::string_view name) {
  const TargetEntry* row = findRow(name);
  return row != nullptr && row->kind == TargetKind_Architecture;
}

static_assert(std::ranges::all_of(NamesByNumber, isArchitecture));
static_assert(isArchitecture(nameOf7('A')) && isArchitecture(nameOf7('M')) &&
              isArchitecture(nameOf7('R')) && isArchitecture(nameOf7('S')));
static_assert(isArchitecture(nameOf8('R')) && isArchitecture(nameOf8('S')));

Target findByName(std::string_view name) {
  const TargetEntry* row = findRow(name);
  if (row == nullptr) return {};
  return {row->features, {row->kind, 0}};
}

} // namespace

std::span<const TargetEntry> procAndArchList() {
  return Rows;
}

Target findTarget(const char* name) {
  return name == nullptr ? Target{} : findByName(name);
}

Target findTargetForArchitecture(uint32_t number, uint32_t profile) {
  return findByName(architectureName(number, profile));
}

bool hasFullFeatures(uint32_t number, uint32_t profile, FeatureSet features) {
  return findTargetForArchitecture(number, profile).features.contains(features);
}

const TargetEntry& firstFloatingPointUnitIn(std::span<const TargetEntry> rows) {
  const auto found = std::ranges::find(rows, TargetKind_FloatingPointUnit, &TargetEntry::kind);
  if (found == rows.end()) checking::reportFault("Did not find any FPU's in procAndArchList");
  return *found;
}

const TargetEntry& getFirstFloatingPointUnit() {
  return firstFloatingPointUnitIn(Rows);
}

} // namespace elfext
