// SPDX-License-Identifier: Apache-2.0
//
// How the rooms of the tree hang together, and what agrees from file to file: who may include from
// whom, that the map leads to what there is, licences, names of tests, that each message of the
// catalogue is reported by somebody, and that the help knows each option. The rules are tables
// here; a new room is a row.

#include "quarn/option_table.h"
#include "tree.h"

#include "messages/interface/catalogue.h"
#include "messages/interface/message_keys.h"
#include "support/interface/version_banner.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
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

// A room of elfext's sources: from which others it may include, and of which it may see the public
// headers besides.
struct InnerRoom {
  std::string name;
  Names mayInclude;
  Names maySee;
};

// Lowest first. A report carries a module, and tables speak of symbols' categories and of sizes in
// the words that users know; more than these public words goes up nowhere.
const std::vector<InnerRoom> ElfextRooms = {
    {"containers", {}, {}},
    {"bytes", {"containers"}, {}},
    {"reports", {"bytes"}, {"model"}},
    {"attributes", {"bytes"}, {}},
    {"tables", {"containers", "bytes", "reports", "attributes"}, {"model", "sizes"}},
    {"model", {"containers", "bytes", "reports", "attributes"}, {}},
    {"sizes", {"containers", "bytes", "tables", "model"}, {}},
    {"reader", {"containers", "bytes", "attributes", "tables", "model"}, {}},
    {"validation", {"containers", "bytes", "reports", "model"}, {}},
};

// Files that others look for in elfext/src itself, and the rooms that they are of.
const std::map<std::string, std::string> ElfextsPromisedPlaces = {
    {"auxiliary_sections", "model"}, {"compressed_section_extractor", "sizes"},
    {"error_handler", "reports"},    {"format_recognizer", "bytes"},
    {"sizes_statistics", "sizes"},   {"sort", "containers"},
};

const fs::path Root = treeRoot();

std::vector<std::string> includesOf(const fs::path& file) {
  static const std::regex Line("#include \"([^\"]+)\"");
  const std::string text = contentsOf(file);
  std::vector<std::string> names;
  for (std::sregex_iterator match(text.begin(), text.end(), Line), end; match != end; ++match) {
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

// The room of a file of elfext/src, by its path from there; empty for a file in a wrong place.
std::string roomOfSource(const fs::path& file) {
  if (file.has_parent_path()) return file.parent_path().string();
  const auto promised = ElfextsPromisedPlaces.find(file.stem().string());
  return promised == ElfextsPromisedPlaces.end() ? "" : promised->second;
}

// A public header is of the room that has its other half. One that has none is of no room.
std::map<std::string, std::string> roomsOfInterfaces() {
  std::map<std::string, std::string> rooms;
  for (const fs::path& file : sourcesOf("elfext/src")) {
    if (file.extension() == ".cpp")
      rooms[file.stem().string()] = roomOfSource(fs::relative(file, Root / "elfext/src"));
  }
  return rooms;
}

// The room that a path from the root leads into: none outside of elfext.
std::string elfextRoomOf(const fs::path& file) {
  static const std::map<std::string, std::string> Interfaces = roomsOfInterfaces();
  const std::string name = file.string();
  if (name.starts_with("elfext/src/")) return roomOfSource(fs::relative(file, "elfext/src"));
  if (!name.starts_with("elfext/interface/")) return "";
  const auto found = Interfaces.find(file.stem().string());
  return found == Interfaces.end() ? "" : found->second;
}

// Who includes a public header of no room includes what that one does.
bool mayInclude(const InnerRoom& room, const std::string& include) {
  const std::string from = elfextRoomOf(include);
  if (from == room.name || room.mayInclude.count(from) != 0) return true;
  if (!include.starts_with("elfext/")) return true;
  if (include.starts_with("elfext/src/")) return false;
  if (!from.empty()) return room.maySee.count(from) != 0;
  const std::vector<std::string> behind = includesOf(Root / include);
  return std::all_of(behind.begin(), behind.end(),
                     [&room](const std::string& name) { return mayInclude(room, name); });
}

TEST(SourceTree, EveryFileOfElfextHasARoom) {
  Names names;
  for (const InnerRoom& room : ElfextRooms)
    names.insert(room.name);
  for (const fs::path& file : sourcesOf("elfext/src"))
    EXPECT_EQ(names.count(elfextRoomOf(fs::relative(file, Root))), 1u) << file;
}

TEST(SourceTree, IncludesFollowTheArrowsOfElfextsRooms) {
  for (const fs::path& file : sourcesOf("elfext")) {
    const std::string name = elfextRoomOf(fs::relative(file, Root));
    const auto isOfName = [&name](const InnerRoom& room) { return room.name == name; };
    const auto room = std::find_if(ElfextRooms.begin(), ElfextRooms.end(), isOfName);
    if (room == ElfextRooms.end()) continue;
    for (const std::string& include : includesOf(file))
      EXPECT_TRUE(mayInclude(*room, include)) << file << " of " << name << " includes " << include;
  }
}

TEST(SourceTree, ElfextsRoomsIncludeOnlyFromLowerOnes) {
  Names lower;
  for (const InnerRoom& room : ElfextRooms) {
    EXPECT_TRUE(
        std::includes(lower.begin(), lower.end(), room.mayInclude.begin(), room.mayInclude.end()))
        << room.name;
    lower.insert(room.name);
  }
}

// Whether there is such a file or folder: by its whole name, or without the part that a library's
// pair of folders adds, or without its ending.
bool exists(const fs::path& folder, const fs::path& name) {
  const fs::path first = *name.begin();
  const fs::path rest = name.lexically_relative(first);
  for (const fs::path& path : {name, first / "interface" / rest, first / "src" / rest}) {
    for (const char* ending : {"", ".h", ".cpp"}) {
      if (fs::exists(folder / (path.string() + ending))) return true;
    }
  }
  return false;
}

// Names on the map count from the root, or from where the map says that they do.
TEST(SourceTree, TheMapLeadsToWhatThereIs) {
  const std::string map = contentsOf(Root / "docs/architecture.md");
  const std::regex name("`([a-z][a-z_]*/[a-z_/.]*)`");
  size_t count = 0;
  for (std::sregex_iterator match(map.begin(), map.end(), name), end; match != end; ++match) {
    const std::string path = (*match)[1];
    EXPECT_TRUE(exists(Root, path) || exists(Root / "elfext", path) ||
                exists(Root / "elfext/src", path))
        << path;
    ++count;
  }
  EXPECT_GT(count, 50u);
}

TEST(SourceTree, EveryFileNamesItsLicence) {
  for (const auto& [room, allowed] : Arrows) {
    for (const fs::path& file : sourcesOf(room)) {
      EXPECT_TRUE(contentsOf(file).starts_with("// SPDX-License-Identifier: Apache-2.0\n")) << file;
    }
  }
}

TEST(SourceTree, BuildFilesNameTheirLicence) {
  for (const char* folder : {"cmake", "examples", "packaging", "quarn-ar", "quarn-json", "tests"}) {
    for (const auto& entry : fs::recursive_directory_iterator(Root / folder)) {
      const fs::path& file = entry.path();
      if (file.filename() != "CMakeLists.txt" && file.extension() != ".cmake") continue;
      EXPECT_TRUE(contentsOf(file).starts_with("# SPDX-License-Identifier: Apache-2.0\n")) << file;
    }
  }
}

// Such files have marks of their own for comments. A shell may want the first line for itself.
TEST(SourceTree, PagesAndCompletionsNameTheirLicence) {
  const std::regex licence("(#[^\n]*\n)?[.\\\\\"#]+ SPDX-License-Identifier: Apache-2.0\n[^]*");
  for (const char* folder : {"manual", "completions"}) {
    for (const auto& entry : fs::directory_iterator(Root / folder))
      EXPECT_TRUE(std::regex_match(contentsOf(entry.path()).substr(0, 200), licence))
          << entry.path();
  }
}

// What a file is for stands before anything else.
TEST(SourceTree, EveryFileBeginsWithWhatItDecides) {
  std::vector<std::string> rooms = {"bench", "tests"};
  for (const auto& [room, allowed] : Arrows)
    rooms.push_back(room);
  for (const std::string& room : rooms) {
    for (const fs::path& file : sourcesOf(room)) {
      std::ifstream stream(file);
      std::string line;
      std::getline(stream, line);
      while (std::getline(stream, line) && line == "//") {
      }
      EXPECT_TRUE(line.starts_with("// ")) << file << " begins with " << line;
    }
  }
}

// The files of the driver by the names that a source and its header share: who is called, and who
// calls him back through somebody else, would be one room under two names.
TEST(SourceTree, NobodyInTheDriverIsCalledBack) {
  std::map<std::string, Names> uses;
  for (const fs::path& file : sourcesOf("quarn")) {
    for (const std::string& include : includesOf(file)) {
      if (include.starts_with("quarn/")) uses[file.stem()].insert(fs::path(include).stem());
    }
  }
  for (auto& [name, used] : uses)
    used.erase(name);
  // Who uses nobody that is left is taken away, until nobody is left, or a circle.
  for (bool isSmaller = true; isSmaller;) {
    isSmaller =
        std::erase_if(uses, [&uses](const auto& entry) {
          return std::none_of(entry.second.begin(), entry.second.end(),
                              [&uses](const std::string& used) { return uses.contains(used); });
        }) != 0;
  }
  for (const auto& [name, used] : uses)
    ADD_FAILURE() << name << " is part of a circle, or uses one";
}

TEST(SourceTree, EveryHeaderIsIncludedOnce) {
  for (const auto& [room, allowed] : Arrows) {
    for (const fs::path& file : sourcesOf(room)) {
      if (file.extension() != ".h") continue;
      EXPECT_NE(contentsOf(file).find("\n#pragma once\n"), std::string::npos) << file;
    }
  }
}

// What follows the suite is a sentence about it.
TEST(SourceTree, TestsAreNamedInCamelCase) {
  const std::regex test("\\n(?:TYPED_)?TEST(?:_F|_P)?\\((\\w+),\\s*(\\w+)\\)");
  const std::regex camelCase("(?:[A-Z][a-z0-9]*)+");
  for (const fs::path& file : sourcesOf("tests")) {
    const std::string text = contentsOf(file);
    for (std::sregex_iterator match(text.begin(), text.end(), test), end; match != end; ++match) {
      EXPECT_TRUE(std::regex_match((*match)[1].str(), camelCase)) << file << ": " << (*match)[1];
      EXPECT_TRUE(std::regex_match((*match)[2].str(), camelCase)) << file << ": " << (*match)[2];
    }
  }
}

// The names of tests and transcripts, as documents give them.
Names namesOfTests() {
  const std::regex test("\\nT(?:YPED_T)?EST(?:_F|_P)?\\((\\w+),\\s*(\\w+)\\)");
  Names known;
  for (const fs::path& file : sourcesOf("tests")) {
    const std::string text = contentsOf(file);
    for (std::sregex_iterator match(text.begin(), text.end(), test), end; match != end; ++match)
      known.insert((*match)[1].str() + "." + (*match)[2].str());
  }
  for (const auto& entry : fs::directory_iterator(treeRoot() / "tests/cli"))
    known.insert(entry.path().filename());
  return known;
}

// How many tests a text names; each must be there.
size_t countNamedTests(const std::string& text, const Names& known) {
  const std::regex quoted("`(\\w+)\\.(\\w+)`");
  size_t count = 0;
  for (std::sregex_iterator match(text.begin(), text.end(), quoted), end; match != end; ++match) {
    EXPECT_TRUE(known.contains((*match)[1].str() + "." + (*match)[2].str())) << (*match)[0];
    ++count;
  }
  return count;
}

// Who looks for the test of a promise finds it under the name that the list of promises has.
TEST(SourceTree, TheListOfPromisesLeadsToTests) {
  EXPECT_GT(countNamedTests(contentsOf(treeRoot() / "tests/README.md"), namesOfTests()), 20U);
}

// The last heading is of what is not promised.
TEST(SourceTree, EveryPromiseNamesTheTestsThatHoldIt) {
  const std::string text = contentsOf(treeRoot() / "docs/reliability.md");
  const Names known = namesOfTests();
  const std::string heading = "\n## ";
  size_t promises = 0;
  for (size_t place = text.find(heading), next = 0; place != std::string::npos; place = next) {
    next = text.find(heading, place + 1);
    if (next == std::string::npos) break;
    const size_t held = text.find("\n*Held by* ", place);
    ASSERT_LT(held, next) << text.substr(place, 60);
    EXPECT_GT(countNamedTests(text.substr(held, text.find('\n', held + 1) - held), known), 2U);
    ++promises;
  }
  EXPECT_EQ(promises, 6U);
}

TEST(SourceTree, EveryPageAndCompletionIsInstalled) {
  const std::string rules =
      contentsOf(Root / "cmake/Install.cmake") + contentsOf(Root / "cmake/InstallPages.cmake");
  for (const char* folder : {"manual", "completions"}) {
    for (const auto& entry : fs::directory_iterator(Root / folder)) {
      const std::string name = entry.path().filename();
      EXPECT_NE(rules.find(name), std::string::npos) << folder << "/" << name;
    }
  }
}

TEST(SourceTree, TheNewestChangesAreOfThisVersion) {
  const std::string changes = contentsOf(Root / "CHANGELOG.md");
  const std::string heading = "# Changes\n\n## " + std::string(support::getBuildData().version);
  EXPECT_TRUE(changes.starts_with(heading + " ") || changes.starts_with(heading + "\n")) << heading;
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
  const std::string help = std::string(messages::getMessageText(messages::HelpEditOptions)) +
                           std::string(messages::getMessageText(messages::HelpOtherOptions));
  for (const tabledrivenparser::MatchString& row : quarn::getOptionTable().rows) {
    const std::string name(row.name);
    const std::string shown = "\n" + std::string(row.hasLongName() ? "--" : " -") + name + " ";
    const bool isMentioned = help.find(shown) != std::string::npos;
    EXPECT_EQ(isMentioned, UnmentionedOptions.count(name) == 0) << name;
  }
}

} // namespace
