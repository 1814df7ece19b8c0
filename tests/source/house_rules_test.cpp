// SPDX-License-Identifier: Apache-2.0
//
// Rules for each line of code that neither a compiler nor clang-tidy checks. An exception is a row
// here, with its reason.
#include "tree.h"

#include <gtest/gtest.h>

#include <regex>
#include <set>
#include <string>
#include <vector>

namespace {

namespace fs = std::filesystem;

const std::vector<std::string> Libraries = {"alloclib", "arlib",   "checking",         "elfext",
                                            "messages", "support", "tabledrivenparser"};

std::string nameOf(const fs::path& file) {
  return fs::relative(file, treeRoot()).string();
}

std::vector<fs::path> sourcesOfAll(const std::vector<std::string>& folders) {
  std::vector<fs::path> files;
  for (const std::string& folder : folders) {
    const std::vector<fs::path> some = sourcesOf(folder);
    files.insert(files.end(), some.begin(), some.end());
  }
  return files;
}

std::vector<fs::path> sourcesOfTheProduct() {
  std::vector<std::string> folders = Libraries;
  folders.emplace_back("quarn");
  return sourcesOfAll(folders);
}

// All that matches in the text.
std::vector<std::string> findAll(const std::string& text, const std::regex& pattern) {
  std::vector<std::string> found;
  for (std::sregex_iterator match(text.begin(), text.end(), pattern), end; match != end; ++match)
    found.push_back(match->str());
  return found;
}

TEST(HouseRules, FilesAreNamedInSnakeCase) {
  const std::regex snakeCase("[a-z][a-z0-9_]*");
  std::vector<fs::path> files = sourcesOfTheProduct();
  for (const fs::path& file : sourcesOfAll({"tests", "bench"}))
    files.push_back(file);
  for (const fs::path& file : files)
    EXPECT_TRUE(std::regex_match(file.stem().string(), snakeCase)) << file;
}

TEST(HouseRules, NothingIsThrownOrAskedForItsType) {
  const std::regex words("\\b(throw|try|catch|dynamic_cast|typeid)\\b");
  for (const fs::path& file : sourcesOfTheProduct())
    EXPECT_EQ(findAll(codeOf(file), words), std::vector<std::string>()) << file;
}

// Who ends the process, or writes to a stream: where memory has run out or a fault was found
// there is no handler to call; a trace and a table of sizes go to the stream that was asked for.
const std::set<std::string> MayPrintOrExit = {
    "alloclib/src/handlers.cpp",    "alloclib/src/region_stats.cpp",   "checking/src/checking.cpp",
    "messages/src/process_end.cpp", "elfext/src/sizes_statistics.cpp",
};

TEST(HouseRules, LibrariesNeitherPrintNorExit) {
  const std::regex words(
      "\\b(exit|_Exit|quick_exit|abort|terminate|printf|fprintf|puts|fputs|fwrite|perror)\\("
      "|\\bstd::(cout|cerr)\\b");
  for (const fs::path& file : sourcesOfAll(Libraries)) {
    const bool isFree = findAll(codeOf(file), words).empty();
    EXPECT_NE(isFree, MayPrintOrExit.count(nameOf(file)) == 1) << file;
  }
}

// A new action makes the compiler complain wherever it must be decided on.
TEST(HouseRules, SwitchesOverTheActionHaveNoDefault) {
  const std::regex switches("switch \\([^)]*[aA]ction[^)]*\\) \\{[^]*?\n {0,2}\\}");
  size_t count = 0;
  for (const fs::path& file : sourcesOf("quarn")) {
    for (const std::string& text : findAll(codeOf(file), switches)) {
      EXPECT_EQ(text.find("default:"), std::string::npos) << file << ": " << text;
      ++count;
    }
  }
  EXPECT_GT(count, 0u);
}

// Literals of two words that no user reads, and the one that stands for a host's own words.
const std::set<std::string> TextsOutsideOfTheCatalogue = {
    "\"quarn memory\"",
    "\"Unexpected end of file\"",
};

TEST(HouseRules, TheCommandsTextsAreInTheCatalogue) {
  const std::regex twoWords("\"[^\"\n]*[A-Za-z]{2,} [A-Za-z]{2,}[^\"\n]*\"");
  for (const fs::path& file : sourcesOf("quarn")) {
    for (const std::string& text : findAll(codeOf(file, Literals::Kept), twoWords))
      EXPECT_EQ(TextsOutsideOfTheCatalogue.count(text), 1u) << file << ": " << text;
  }
}

} // namespace
