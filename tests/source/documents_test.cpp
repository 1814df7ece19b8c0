// SPDX-License-Identifier: Apache-2.0
//
// What documents name is there: the file and the heading behind each link, and each preset, target
// and script that they tell to run. Sessions are run elsewhere (tests/docs, tests/manual).
#include "tree.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <filesystem>
#include <regex>
#include <set>
#include <string>
#include <vector>

namespace {

namespace fs = std::filesystem;

using Names = std::set<std::string>;

const fs::path Root = treeRoot();

std::vector<fs::path> documents() {
  std::vector<fs::path> found;
  for (const char* folder : {".", "docs", "examples", "tests"}) {
    for (const auto& entry : fs::directory_iterator(Root / folder)) {
      if (entry.path().extension() == ".md") found.push_back(entry.path());
    }
  }
  return found;
}

std::vector<std::smatch> matchesIn(const std::string& text, const char* pattern) {
  const std::regex expression(pattern);
  return {std::sregex_iterator(text.begin(), text.end(), expression), {}};
}

Names groupsIn(const std::string& text, const char* pattern) {
  Names names;
  for (const std::smatch& match : matchesIn(text, pattern))
    names.insert(match[1]);
  return names;
}

// A heading as links spell it: small letters, digits and dashes, with a dash for each blank.
std::string anchorOf(const std::string& heading) {
  std::string anchor;
  for (const char character : heading) {
    const auto byte = static_cast<unsigned char>(character);
    if (std::isalnum(byte) != 0 || character == '-' || character == '_')
      anchor += static_cast<char>(std::tolower(byte));
    else if (character == ' ')
      anchor += '-';
  }
  return anchor;
}

bool hasHeading(const fs::path& document, const std::string& anchor) {
  const Names headings = groupsIn(contentsOf(document), "\n#+ ([^\n]+)");
  return std::any_of(headings.begin(), headings.end(),
                     [&](const std::string& heading) { return anchorOf(heading) == anchor; });
}

TEST(Documents, LeadToWhatThereIs) {
  size_t count = 0;
  for (const fs::path& document : documents()) {
    const std::string text = contentsOf(document);
    for (const std::smatch& link : matchesIn(text, "\\]\\(([^)#:]*)(?:#([^)]+))?\\)")) {
      const fs::path target =
          link[1].length() == 0 ? document : document.parent_path() / link[1].str();
      EXPECT_TRUE(fs::exists(target)) << document << ": " << link[0];
      if (link[2].matched) {
        EXPECT_TRUE(hasHeading(target, link[2])) << document << ": " << link[0];
      }
      ++count;
    }
  }
  EXPECT_GT(count, 20U);
}

// What is built lies in a folder of the tree, and has far more files.
Names targets() {
  Names names;
  for (auto entry = fs::recursive_directory_iterator(Root);
       entry != fs::recursive_directory_iterator(); ++entry) {
    const fs::path& path = entry->path();
    if (path == Root / "build" || path == Root / ".git") entry.disable_recursion_pending();
    if (path.filename() == "CMakeLists.txt" || path.extension() == ".cmake")
      names.merge(groupsIn(contentsOf(path), "add_custom_target\\((\\w+)"));
  }
  return names;
}

TEST(Documents, NamePresetsTargetsAndScriptsThatThereAre) {
  const Names presets = groupsIn(contentsOf(Root / "CMakePresets.json"), "\"name\": \"([^\"]+)\"");
  const Names known = targets();
  size_t count = 0;
  for (const fs::path& document : documents()) {
    const std::string text = contentsOf(document);
    for (const std::string& name : groupsIn(text, "--preset[ =]([\\w-]+)")) {
      EXPECT_TRUE(presets.contains(name)) << document << ": " << name;
      ++count;
    }
    for (const std::string& name : groupsIn(text, "--preset [\\w-]+ --target ([\\w-]+)"))
      EXPECT_TRUE(known.contains(name)) << document << ": " << name;
    for (const std::string& name : groupsIn(text, "\\bscripts/([\\w-]+)"))
      EXPECT_TRUE(fs::exists(Root / "scripts" / name)) << document << ": " << name;
  }
  EXPECT_GT(count, 5U);
}

} // namespace
