// SPDX-License-Identifier: Apache-2.0
//
// The page of the program has its options, enumerations and diagnostics, each of them, and no
// others.
#include "checking/src/level_names.h"
#include "manual_page.h"
#include "messages/interface/catalogue.h"
#include "messages/interface/message_keys.h"
#include "quarn/option_table.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <regex>

namespace manuals {
namespace {

using tabledrivenparser::MatchString;

// Those that name options of the program.
const char* const Pages[] = {"quarn.1", "quarn-archive.5", "quarn-attributes.7"};

template <class IsWanted>
Names rowsWhere(IsWanted isWanted) {
  Names names;
  for (const MatchString& row : quarn::getOptionTable().rows) {
    if (!row.name.empty() && isWanted(row)) names.emplace(row.name);
  }
  return names;
}

Names allRows() {
  return rowsWhere([](const MatchString&) { return true; });
}

// The lines of a list's item, up to the next one.
Lines itemOf(const Lines& source, const std::string& tag) {
  const auto start = std::find(source.begin(), source.end(), tag);
  EXPECT_NE(start, source.end()) << tag;
  if (start == source.end()) return {};
  return {start + 1, std::find_if(start + 1, source.end(), [](const std::string& line) {
            return line.starts_with(".It Fl");
          })};
}

// ---- Options

TEST(QuarnPage, HasAnItemForEachOption) {
  const Lines source = sourceOf("quarn.1");
  Names described;
  for (const char* heading : {"Actions", "Options of actions", "Options for diagnostics",
                              "Information and other options"}) {
    for (const std::string& line : itemsIn(linesUnder(source, heading)))
      add(described, optionsIn(line));
  }
  EXPECT_EQ(described, allRows());
}

TEST(QuarnPage, SpeaksOfNoOtherOption) {
  const Names known = allRows();
  for (const char* page : Pages) {
    for (const std::string& line : sourceOf(page)) {
      for (const std::string& name : optionsIn(line))
        EXPECT_TRUE(known.contains(name)) << page << ": " << line;
    }
  }
}

TEST(QuarnPage, ListsTheLettersThatMayBeWrittenTogether) {
  Names listed;
  for (const std::string& line : marksBehind(sourceOf("quarn.1"), "Those are"))
    add(listed, optionsIn(line));
  EXPECT_EQ(listed, rowsWhere([](const MatchString& row) {
              return !row.hasLongName() && row.kind == tabledrivenparser::Kind_Implied;
            }));
}

TEST(QuarnPage, ListsTheOlderSpellings) {
  const auto isOld = [](const MatchString& row) {
    return (row.flags & tabledrivenparser::Flag_OldSyntax) != 0;
  };
  const Lines source = sourceOf("quarn.1");
  Names names;
  for (const std::string& line : marksBehind(source, "There the long names"))
    add(names, wordsMarked(line, "Cm"));
  EXPECT_EQ(names,
            rowsWhere([&](const MatchString& row) { return row.hasLongName() && isOld(row); }));
  Names letters;
  for (const std::string& line : marksBehind(source, "The letters"))
    add(letters, wordsMarked(line, "Cm"));
  EXPECT_EQ(letters,
            rowsWhere([&](const MatchString& row) { return !row.hasLongName() && isOld(row); }));
}

TEST(QuarnPage, NamesTheStylesOfDiagnostics) {
  const auto& definition = quarn::getOptionDefinitions()[quarn::Option_DiagnosticStyle];
  Names styles;
  for (const MatchString& entry : definition.constraint.enumeration->entries)
    styles.emplace(entry.name);
  Names described;
  for (const std::string& line :
       itemOf(sourceOf("quarn.1"), ".It Fl Fl diag_style Ns = Ns Ar style")) {
    if (line.starts_with(".It")) add(described, wordsMarked(line, "Cm"));
  }
  EXPECT_EQ(described, styles);
}

TEST(QuarnPage, NamesTheLevelsOfChecking) {
  Names levels(std::begin(checking::LevelNames), std::end(checking::LevelNames));
  levels.insert("show");
  Names described;
  const Lines others = linesUnder(sourceOf("quarn.1"), "Information and other options");
  for (const std::string& line : itemOf(others, ".It Fl Fl db_check Ns = Ns Ar level"))
    add(described, wordsMarked(line, "Cm"));
  EXPECT_EQ(described, levels);
}

TEST(QuarnPage, NamesLocalesThatAreTaken) {
  size_t count = 0;
  const Lines options = linesUnder(sourceOf("quarn.1"), "Options for diagnostics");
  for (const std::string& line : itemOf(options, ".It Fl Fl message_locale Ns = Ns Ar locale")) {
    for (const std::string& name : wordsMarked(line, "Cm")) {
      EXPECT_TRUE(messages::setLocale(name)) << name;
      ++count;
    }
  }
  messages::resetLocale();
  EXPECT_GT(count, 5u);
}

TEST(QuarnPage, ShowsEachActionAtWork) {
  const Lines lines = linesUnder(sourceOf("quarn.1"), "Actions");
  for (const std::string& item : itemsIn(lines)) {
    const std::string name = *optionsIn(item).rbegin();
    const std::string word = name.size() == 1 ? "\\\\-[a-z]*" + name : "\\\\-\\\\-" + name;
    const std::regex command("\\$ quarn (.* )?" + word + "\\b.*|\\$ quarn " + word + "[a-z]*\\b.*");
    const Lines shown = itemOf(lines, item);
    EXPECT_TRUE(std::ranges::any_of(shown, [&](const std::string& line) {
      return std::regex_match(line, command);
    })) << item;
  }
}

// ---- Diagnostics

// Those that are printed without a code are lines of listings and of the help.
bool hasCode(messages::Key key) {
  return key < messages::HelpCommandFormat || key > messages::AttributeClash;
}

// The letter in front is the tool's own for all of them.
std::string codeOf(messages::Key key) {
  return "L" + std::string(messages::KeyText(key).getTextBehindLetter());
}

TEST(QuarnPage, TellsOfEachDiagnosticInItsWords) {
  const Lines page = renderedOf("quarn.1");
  for (const messages::CatalogueRow& row : messages::getCatalogueRows(messages::EnglishCatalogue)) {
    if (!hasCode(row.key)) continue;
    const std::string lead = codeOf(row.key) + ": ";
    const auto item = std::ranges::find_if(page, [&](const std::string& line) {
      return line.find(lead) != std::string::npos && line.find_first_not_of(' ') == line.find(lead);
    });
    ASSERT_NE(item, page.end()) << lead;
    const std::string words = item->substr(item->find(lead) + lead.size());
    EXPECT_TRUE(std::regex_match(words, patternOf(row.text))) << words << " is not " << row.text;
  }
}

TEST(QuarnPage, TellsOfNoOtherDiagnostic) {
  Names known;
  for (const messages::CatalogueRow& row : messages::getCatalogueRows(messages::EnglishCatalogue))
    known.insert(codeOf(row.key));
  const std::regex code("\\bL[0-9]{4}[A-Z]\\b");
  for (const char* page : {"quarn.1", "quarn-archive.5", "quarn-attributes.7", "quarn-ar.1"}) {
    for (const std::string& line : renderedOf(page)) {
      for (std::sregex_iterator match(line.begin(), line.end(), code), end; match != end; ++match)
        EXPECT_TRUE(known.contains(match->str())) << page << ": " << line;
    }
  }
}

} // namespace
} // namespace manuals
