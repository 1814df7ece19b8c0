// SPDX-License-Identifier: Apache-2.0
//
// Any bytes as a map from names of libraries to attributes; its lines are the names as well. A map
// is the sum of its lines, and what it says of a library is always the same.
#include "alloclib/interface/region.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/library_attribute_map.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/support/memory_host.h"

#include <algorithm>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

namespace {

using namespace elfext;

constexpr size_t NameLimit = 20; // names looked up in a map

void expect(bool condition) {
  if (!condition) std::abort();
}

LibraryAttributeMap readMap(std::string_view text) {
  testsupport::MemoryHost host;
  host.addFile("map", text);
  bool usedDefault = true;
  support::HostError error = 0;
  LibraryAttributeMap map = readLibraryAttributeMap(host, "map", usedDefault, error);
  expect(!usedDefault && error == 0 && host.openHandles() == 0);
  return map;
}

bool areSame(const LibraryAttributeMap::Row& a, const LibraryAttributeMap::Row& b) {
  return a.pattern == b.pattern && a.attributes == b.attributes && a.className == b.className;
}

// The lines with their ends, cut where they are too long to be one.
std::vector<std::string_view> linesOf(std::string_view text) {
  std::vector<std::string_view> lines;
  while (!text.empty()) {
    size_t length = std::min(text.find('\n'), text.size());
    if (length < text.size() && length < LibraryAttributeLineLimit) ++length;
    length = std::min(length, LibraryAttributeLineLimit);
    lines.push_back(text.substr(0, length));
    text.remove_prefix(length);
  }
  return lines;
}

FullAttr attributesOf(std::string_view name, const LibraryAttributeMap& map) {
  FullAttr attributes = LibraryFullAttr;
  getLibraryAttributes(attributes, name, map);
  return attributes;
}

void checkRow(const LibraryAttributeMap::Row& row) {
  static constexpr std::string_view WhiteSpace = " \t\r\n\v\f";
  expect(!row.pattern.empty());
  expect(row.pattern.find_first_of(WhiteSpace) == std::string::npos);
  expect(row.className.find_first_of(WhiteSpace) == std::string::npos);
}

void lookUp(std::string_view name, const LibraryAttributeMap& map) {
  const FullAttr attributes = attributesOf(name, map);
  expect(attributesOf(name, map) == attributes);
  // A folder in front of the last backslash is not looked at.
  if (name.find('\\') != std::string_view::npos) {
    expect(attributesOf("folder" + std::string(name.substr(name.rfind('\\'))), map) == attributes);
  }
  const std::string_view className = getLibraryClass(name, map);
  const auto names = [className](const LibraryAttributeMap::Row& row) {
    return row.className == className;
  };
  expect(className == name || std::any_of(map.rows.begin(), map.rows.end(), names));
  expect(isSameLibraryClass(name, name, map));
  expect(isSameLibraryClass(name, "other", map) == isSameLibraryClass("other", name, map));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = (static_cast<void>(alloclib::initialise()), true);
  if (!IsInitialised) return 0;
  const fuzzing::MemoryBound bound(size);
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  const LibraryAttributeMap map = readMap(text);
  const std::vector<std::string_view> lines = linesOf(text);

  auto row = map.rows.begin();
  for (const std::string_view line : lines) {
    for (const LibraryAttributeMap::Row& alone : readMap(line).rows) {
      expect(row != map.rows.end() && areSame(*row, alone));
      ++row;
    }
  }
  expect(row == map.rows.end());

  for (const LibraryAttributeMap::Row& each : map.rows)
    checkRow(each);
  for (size_t i = 0; i < std::min(lines.size(), NameLimit); ++i)
    lookUp(lines[i].substr(0, lines[i].find_first_of(" \n")), map);
  return 0;
}
