// SPDX-License-Identifier: Apache-2.0
//
// Objects as compilers write them come to the same in their tables and as a model. They lie in
// tests/objects; hostile and damaged ones are compared by the tests of those.

#include "tests/systematic/two_roads.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

namespace testsupport {

namespace {

std::vector<std::filesystem::path> findObjects() {
  std::vector<std::filesystem::path> paths;
  for (const auto& entry : std::filesystem::recursive_directory_iterator(QUARN_OBJECTS)) {
    if (entry.path().extension() == ".o") paths.push_back(entry.path());
  }
  std::sort(paths.begin(), paths.end());
  return paths;
}

} // namespace

TEST(TwoRoads, AgreeOnCompiledObjects) {
  const std::vector<std::filesystem::path> paths = findObjects();
  ASSERT_FALSE(paths.empty());
  for (const std::filesystem::path& path : paths) {
    SCOPED_TRACE(path);
    std::ifstream stream(path, std::ios::binary);
    expectSameOnBothRoads(std::string(std::istreambuf_iterator<char>(stream), {}));
  }
}

} // namespace testsupport
