// SPDX-License-Identifier: Apache-2.0
//
// The completions list what the program takes: each option of its table and no other, each name of
// its enumerations, locales and warnings that there are.
#include "checking/src/level_names.h"
#include "messages/interface/catalogue.h"
#include "messages/interface/message_keys.h"
#include "quarn-ar/usage.h"
#include "quarn-json/command_line.h"
#include "quarn/option_table.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <regex>
#include <set>
#include <string>

namespace {

using Names = std::set<std::string>;
using tabledrivenparser::MatchString;

// How each shell's file writes an option, without dashes in the last group that is there.
struct Completion {
  const char* file;
  const char* letter;
  const char* name;
};

const Completion Completions[] = {
    {"quarn.bash", "(?:=|')'?-([A-Za-z])(?= |')| -([A-Za-z])(?= |')", "--([a-z_]+)(?=[ ='\\n])"},
    {"_quarn", "\\n +'(?:\\([^)]*\\))?-([A-Za-z])[+\\[]", "\\n +'\\*?--([a-z_]+)[=\\[]"},
    {"quarn.fish", "\\ncomplete -c quarn -s ([A-Za-z]) ", "\\ncomplete -c quarn -l ([a-z_]+) "},
};

std::string contentsOf(const std::string& name) {
  std::ifstream file(QUARN_SOURCE_DIR "/completions/" + name, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

// The part of a file that has the options of quarn and no other words of their kind.
std::string optionsPartOf(const std::string& name) {
  const std::string text = contentsOf(name);
  if (name == "quarn.bash") return text.substr(0, text.find("__quarn_styles"));
  if (name == "_quarn") return text.substr(0, text.find("_quarn_ar_operations"));
  return text;
}

Names groupsOf(const std::string& text, const char* pattern) {
  const std::regex expression(pattern);
  Names names;
  for (std::sregex_iterator match(text.begin(), text.end(), expression), end; match != end;
       ++match) {
    for (size_t group = 1; group < match->size(); ++group) {
      if ((*match)[group].matched) names.insert((*match)[group]);
    }
  }
  return names;
}

TEST(Completions, ListTheOptionsOfTheProgram) {
  Names letters;
  Names names;
  for (const MatchString& row : quarn::getOptionTable().rows) {
    if (!row.name.empty()) (row.hasLongName() ? names : letters).emplace(row.name);
  }
  for (const Completion& completion : Completions) {
    const std::string text = optionsPartOf(completion.file);
    EXPECT_EQ(groupsOf(text, completion.letter), letters) << completion.file;
    EXPECT_EQ(groupsOf(text, completion.name), names) << completion.file;
  }
}

// Bash and fish say of an option that it wants a value, zsh says so with "=" or "+".
TEST(Completions, KnowWhichOptionsWantAValue) {
  Names wanting;
  for (const MatchString& row : quarn::getOptionTable().rows) {
    if (!row.name.empty() && row.kind == tabledrivenparser::Kind_Required)
      wanting.emplace(row.name);
  }
  EXPECT_EQ(groupsOf(optionsPartOf("_quarn"), "\\n +'(?:\\([^)]*\\)|\\*)?--?([A-Za-z_]+)[=+]\\["),
            wanting);
  EXPECT_EQ(groupsOf(contentsOf("quarn.fish"), "\\ncomplete -c quarn -[sl] ([A-Za-z_]+) -[xr] "),
            wanting);
  Names namesOfBash = groupsOf(optionsPartOf("quarn.bash"), "--([a-z_]+)=");
  namesOfBash.insert({"a", "b", "i"});
  EXPECT_EQ(namesOfBash, wanting);
}

TEST(Completions, KnowTheNamesOfEnumerations) {
  Names words = {"show", "en_US", "ja_JP"};
  words.insert(std::begin(checking::LevelNames), std::end(checking::LevelNames));
  const auto& definition = quarn::getOptionDefinitions()[quarn::Option_DiagnosticStyle];
  for (const MatchString& entry : definition.constraint.enumeration->entries)
    words.emplace(entry.name);
  for (const Completion& completion : Completions) {
    const std::string text = contentsOf(completion.file);
    for (const std::string& word : words)
      EXPECT_TRUE(std::regex_search(text, std::regex("[ '(]" + word + "[ ':\\\\)]")))
          << completion.file << ": " << word;
  }
}

// A number that the user may move belongs to a message that somebody prints as a warning.
TEST(Completions, KnowNumbersOfMessages) {
  Names numbers;
  for (const messages::CatalogueRow& row : messages::getCatalogueRows(messages::EnglishCatalogue))
    numbers.insert("L" +
                   std::string(messages::KeyText(row.key).getTextBehindLetter().substr(0, 4)));
  for (const Completion& completion : Completions) {
    const Names known =
        groupsOf(contentsOf(completion.file), "\\b(L[0-9]{4})\\b|\\b(L[0-9]{4})\\\\t");
    EXPECT_EQ(known.size(), 8u) << completion.file;
    for (const std::string& number : known)
      EXPECT_TRUE(numbers.contains(number)) << completion.file << ": " << number;
  }
}

// The help begins with both, as build systems read it.
TEST(Completions, KnowTheLettersOfQuarnAr) {
  const std::string help = quarn_ar::helpText(quarn_ar::Program::Ar, "quarn-ar");
  std::smatch letters;
  ASSERT_TRUE(std::regex_search(help, letters, std::regex("\\{([a-z]+)\\}\\[([A-Za-z]+)\\]")));
  const std::string operations = "_quarn_ar_operations(=| )'?" + letters[1].str() + "\\b";
  const std::string modifiers = "_quarn_ar_modifiers(=| )'?" + letters[2].str() + "\\b";
  for (const Completion& completion : Completions) {
    const std::string text = contentsOf(completion.file);
    EXPECT_TRUE(std::regex_search(text, std::regex(operations))) << completion.file;
    EXPECT_TRUE(std::regex_search(text, std::regex(modifiers))) << completion.file;
  }
}

TEST(Completions, KnowTheOptionsOfQuarnAr) {
  const std::string help = quarn_ar::helpText(quarn_ar::Program::Ar, "quarn-ar");
  const Names names = groupsOf(help, "--([a-z_-]+)");
  EXPECT_GT(names.size(), 8u);
  for (const Completion& completion : Completions) {
    const std::string text = contentsOf(completion.file);
    const std::string part = text.substr(text.find("_quarn_ar_"));
    for (const std::string& name : names)
      EXPECT_TRUE(std::regex_search(part, std::regex("(--|-l )" + name + "[=\\[ '\\n]")))
          << completion.file << ": " << name;
  }
}

// Bash and zsh have them behind the name of their own, fish in lines of their own.
TEST(Completions, KnowTheOptionsOfQuarnJson) {
  Names names;
  for (const MatchString& row : quarn_json::getOptionRows()) {
    if (!row.name.empty()) names.emplace(row.name);
  }
  const std::string bash = contentsOf("quarn.bash");
  const std::string inBash = bash.substr(bash.find("__quarn_json_names="));
  EXPECT_EQ(groupsOf(inBash.substr(0, inBash.find('\n')), "--([a-z_]+)"), names);
  const std::string zsh = contentsOf("_quarn");
  EXPECT_EQ(groupsOf(zsh.substr(zsh.find("_quarn_json()")), Completions[1].name), names);
  EXPECT_EQ(groupsOf(contentsOf("quarn.fish"), "\ncomplete -c quarn-json -l ([a-z_]+) "), names);
}

} // namespace
