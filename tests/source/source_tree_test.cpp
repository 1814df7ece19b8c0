// SPDX-License-Identifier: Apache-2.0
//
// Rules of the house that no compiler checks.
#include "quarn/option_table.h"

#include "messages/interface/catalogue.h"
#include "messages/interface/message_keys.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <regex>
#include <set>
#include <string>
#include <vector>

namespace {

namespace fs = std::filesystem;

using Names = std::set<std::string>;

// Which rooms a room may include from, besides itself. Arrows run downwards only.
const std::map<std::string, Names> Arrows = {
    {"alloclib", {"checking"}},
    {"checking", {}},
    {"support", {"alloclib", "checking"}},
    {"tabledrivenparser", {"support", "alloclib", "checking"}},
    {"messages", {"tabledrivenparser", "support", "alloclib", "checking"}},
    {"elfext", {"support", "alloclib", "checking"}},
    {"arlib", {"elfext", "support", "alloclib", "checking"}},
    {"quarn",
     {"arlib", "elfext", "messages", "tabledrivenparser", "support", "alloclib", "checking"}},
};

const fs::path Root = QUARN_SOURCE_DIR;

std::string contentsOf(const fs::path& file) {
  std::ifstream stream(file, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

bool isSource(const fs::path& file) {
  return file.extension() == ".h" || file.extension() == ".cpp";
}

std::vector<fs::path> sourcesOf(const std::string& room) {
  std::vector<fs::path> files;
  for (const auto& entry : fs::recursive_directory_iterator(Root / room)) {
    if (entry.is_regular_file() && isSource(entry.path())) files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  return files;
}

std::vector<std::string> includesOf(const fs::path& file) {
  static const std::regex line("#include \"([^\"]+)\"");
  const std::string text = contentsOf(file);
  std::vector<std::string> names;
  for (std::sregex_iterator match(text.begin(), text.end(), line), end; match != end; ++match) {
    names.push_back((*match)[1]);
  }
  return names;
}

TEST(SourceTree, IncludesFollowTheArrows) {
  for (const auto& [room, allowed] : Arrows) {
    for (const fs::path& file : sourcesOf(room)) {
      for (const std::string& include : includesOf(file)) {
        const std::string from = include.substr(0, include.find('/'));
        EXPECT_TRUE(from == room || allowed.count(from) != 0) << file << " includes " << include;
      }
    }
  }
}

TEST(SourceTree, OnlyInterfacesAreIncludedFromOutside) {
  for (const auto& [room, allowed] : Arrows) {
    for (const fs::path& file : sourcesOf(room)) {
      for (const std::string& include : includesOf(file)) {
        if (include.starts_with(room + "/")) continue;
        EXPECT_NE(include.find("/interface/"), std::string::npos)
            << file << " includes " << include;
      }
    }
  }
}

TEST(SourceTree, EveryFileNamesItsLicence) {
  for (const auto& [room, allowed] : Arrows) {
    for (const fs::path& file : sourcesOf(room)) {
      EXPECT_TRUE(contentsOf(file).starts_with("// SPDX-License-Identifier: Apache-2.0\n")) << file;
    }
  }
}

TEST(SourceTree, EveryHeaderIsIncludedOnce) {
  for (const auto& [room, allowed] : Arrows) {
    for (const fs::path& file : sourcesOf(room)) {
      if (file.extension() != ".h") continue;
      EXPECT_NE(contentsOf(file).find("\n#pragma once\n"), std::string::npos) << file;
    }
  }
}

// A text that nobody prints has no place in the catalogues.
TEST(SourceTree, EveryMessageIsReported) {
  std::string sources;
  for (const char* room : {"quarn", "messages"}) {
    for (const fs::path& file : sourcesOf(room)) {
      const std::string name = file.filename().string();
      if (!name.ends_with("_catalogue.cpp") && name != "message_keys.h")
        sources += contentsOf(file);
    }
  }
  const std::string keys = contentsOf(Root / "messages/interface/message_keys.h");
  const std::regex line("constexpr Key (\\w+)");
  for (std::sregex_iterator match(keys.begin(), keys.end(), line), end; match != end; ++match) {
    const std::string name = (*match)[1];
    EXPECT_TRUE(std::regex_search(sources, std::regex("\\b" + name + "\\b"))) << name;
  }
}

// The options that the help leaves out, deliberately.
const Names UnmentionedOptions = {
    "",
    "new_files_only",
    "i",
    "q",
    "normalise",
    "no_normalise",
    "debug_symbols",
    "no_debug_symbols",
    "unique_symbols",
    "no_unique_symbols",
    "qobix_buildattr",
    "no_qobix_buildattr",
    "libattrmap",
    "db_check",
    "diag_error",
    "diag_remark",
    "diag_style",
    "diag_suppress",
    "diag_warning",
    "message_locale",
    "show_cmdline",
    "version_number",
    "version",
    "V",
    "h",
};

TEST(SourceTree, TheHelpMentionsEachOptionOrLeavesItOutDeliberately) {
  const std::string help = std::string(messages::messageText(messages::HelpEditOptions)) +
                           std::string(messages::messageText(messages::HelpOtherOptions));
  for (const tabledrivenparser::MatchString& row : quarn::optionTable().rows) {
    const std::string name(row.name);
    const std::string shown = "\n" + std::string(row.hasLongName() ? "--" : " -") + name + " ";
    const bool isMentioned = help.find(shown) != std::string::npos;
    EXPECT_EQ(isMentioned, UnmentionedOptions.count(name) == 0) << name;
  }
}

} // namespace
