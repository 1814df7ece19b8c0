// SPDX-License-Identifier: Apache-2.0
//
// The page of quarn-ar and quarn-ranlib has their letters, each with the operations that it goes
// with, their long options and their refusals, each of them, and no others. Letters are tried on
// the programs; options and refusals are read from the source, which has each in one form.
#include "manual_page.h"
#include "quarn-ar/command_line.h"
#include "tests/support/messages_fixture.h"

#include <algorithm>
#include <map>
#include <regex>

namespace manuals {
namespace {

using quarn_ar::Answer;
using quarn_ar::Program;
using Words = std::vector<std::string>;

const char* const Page = "quarn-ar.1";
constexpr std::string_view Operations = "dmpqrstx";
constexpr std::string_view Letters = "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ";

class ArPage : public messages::MessagesTest {
protected:
  // With a word for a place or a count, or without.
  bool isTaken(Program program, const std::string& letters) {
    return isTakenAs(program, {letters, "lib.a"}) || isTakenAs(program, {letters, "1", "lib.a"});
  }

private:
  // On messages of its own: a program ends itself after so many errors.
  bool isTakenAs(Program program, const Words& words) {
    SetUp();
    quarn_ar::Request request;
    return readCommandLine(program, words, request) != Answer::Refused;
  }
};

Lines itemsUnder(const char* heading) {
  return itemsIn(linesUnder(sourceOf(Page), heading));
}

// All matches of a pattern's first group in the sources of the programs, where a literal of several
// lines counts as one.
Names inTheSource(const char* pattern) {
  const std::regex expression(pattern);
  Names found;
  for (const char* file : {"ar_main", "command_line", "insertion", "operations", "response_file"}) {
    const std::string text = std::regex_replace(
        contentsOf("quarn-ar/" + std::string(file) + ".cpp"), std::regex("\"\\s*\n\\s*\""), "");
    for (std::sregex_iterator match(text.begin(), text.end(), expression), end; match != end;
         ++match)
      found.insert((*match)[1]);
  }
  return found;
}

TEST_F(ArPage, HasAnItemForEachOperation) {
  Names described;
  for (const std::string& item : itemsUnder("Operations"))
    add(described, wordsMarked(item, "Cm"));
  Names taken;
  for (const char letter : Letters) {
    const std::string word(1, letter);
    if (isTaken(Program::Ar, word)) taken.insert(word);
  }
  // Those that answer at once are modifiers of any operation.
  taken.erase("h");
  taken.erase("V");
  EXPECT_EQ(described, taken);
}

// A line such as ".It Cm N Ar count Pq Cm d , x"; without brackets all operations are meant.
TEST_F(ArPage, SaysWhatEachModifierGoesWith) {
  std::map<std::string, Names> described;
  for (const std::string& item : itemsUnder("Modifiers")) {
    const size_t brackets = std::min(item.find(" Pq "), item.size());
    Names& operations = described[*wordsMarked(item.substr(0, brackets), "Cm").begin()];
    for (const char operation : Operations)
      operations.emplace(1, operation);
    if (brackets < item.size()) operations = wordsMarked("." + item.substr(brackets + 1), "Cm");
  }
  std::map<std::string, Names> taken;
  for (const char letter : Letters) {
    const std::string word(1, letter);
    if (letter != 's' && Operations.find(letter) != std::string_view::npos) continue;
    for (const char operation : Operations) {
      if (isTaken(Program::Ar, operation + word)) taken[word].emplace(1, operation);
    }
  }
  EXPECT_EQ(described, taken);
}

TEST_F(ArPage, HasAnItemForEachLetterOfRanlib) {
  Names described;
  for (const std::string& item : itemsUnder("Letters of quarn-ranlib"))
    add(described, wordsMarked(item, "Cm"));
  Names taken;
  for (const char letter : Letters) {
    if (isTaken(Program::Ranlib, std::string("-") + letter)) taken.emplace(1, letter);
  }
  EXPECT_EQ(described, taken);
}

TEST_F(ArPage, HasAnItemForEachLongOption) {
  Names described;
  for (const std::string& item : itemsUnder("Options"))
    add(described, optionsIn(item));
  const Names rows = inTheSource("\\n    \\{\"([a-z_-]+)\", +(?:true|false),");
  EXPECT_EQ(described, rows);
  for (const std::string& line : sourceOf(Page)) {
    for (const std::string& name : optionsIn(line))
      EXPECT_TRUE(rows.contains(name)) << line;
  }
}

// Every item under the headings of refusals is the sentence of one, and every sentence has an item.
TEST_F(ArPage, TellsOfEachRefusalInItsWords) {
  Names untold = inTheSource("\\brefuse\\(\\s*\"([^\"]+)\"");
  EXPECT_GT(untold.size(), 20u);
  const Lines page = renderedOf(Page);
  for (const char* heading :
       {"Refusals of words", "Refusals of response files", "Refusals of files"}) {
    const auto start = std::ranges::find(page, "   " + std::string(heading));
    ASSERT_NE(start, page.end()) << heading;
    size_t told = 0;
    for (auto line = start + 1; line != page.end() && !line->starts_with("   R"); ++line) {
      // Items have five blanks in front, and what is said of them more.
      if (!line->starts_with("     ") || line->starts_with("      ")) continue;
      const auto sentence = std::ranges::find_if(untold, [&](const std::string& text) {
        return std::regex_match(line->substr(5), patternOf(text));
      });
      if (sentence == untold.end()) break;
      untold.erase(sentence);
      ++told;
    }
    EXPECT_EQ(told, itemsUnder(heading).size()) << heading;
  }
  EXPECT_EQ(untold, Names());
}

} // namespace
} // namespace manuals
