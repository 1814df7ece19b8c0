// SPDX-License-Identifier: Apache-2.0
//
// The pages of formats have the tokens and the fields that the program has, in both directions.
#include "arlib/interface/archive_format.h"
#include "elfext/src/attributes/attribute_tokens.h"
#include "manual_page.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <regex>

namespace manuals {
namespace {

// ---- Tokens

Names tokensUnder(const char* heading) {
  Names tokens;
  for (const std::string& line : itemsIn(linesUnder(sourceOf("quarn-attributes.7"), heading)))
    add(tokens, wordsMarked(line, "Li"));
  return tokens;
}

template <class Rows>
void addTokens(Names& tokens, const Rows& rows) {
  for (const auto& row : rows)
    tokens.emplace(row.token);
}

TEST(FormatPages, ListsTheTokensOfFeatures) {
  Names tokens;
  addTokens(tokens, elfext::FeatureTokens);
  EXPECT_EQ(tokensUnder("Features"), tokens);
}

// In the order in which they are written, as the page says.
TEST(FormatPages, ListsTheTokensOfFeaturesInTheirOrder) {
  Lines listed;
  for (const std::string& line : itemsIn(linesUnder(sourceOf("quarn-attributes.7"), "Features")))
    listed.push_back(*wordsMarked(line, "Li").begin());
  Lines tokens;
  for (const elfext::FeatureToken& row : elfext::FeatureTokens)
    tokens.emplace_back(row.token);
  const auto repeated = std::unique(tokens.begin(), tokens.end());
  tokens.erase(repeated, tokens.end());
  EXPECT_EQ(listed, tokens);
}

TEST(FormatPages, ListsTheTokensOfFlags) {
  Names tokens = {std::string(elfext::ComplementToken.token)};
  addTokens(tokens, elfext::FlagTokens);
  EXPECT_EQ(tokensUnder("Flags"), tokens);
}

TEST(FormatPages, ListsTheTokensOfStackAndAbi) {
  Names tokens;
  addTokens(tokens, elfext::Stack8Tokens);
  addTokens(tokens, elfext::AbiLevelTokens);
  EXPECT_EQ(tokensUnder("Stack and ABI"), tokens);
}

TEST(FormatPages, ListsTheNamesOfAccesses) {
  EXPECT_EQ(tokensUnder("Accesses"),
            Names(std::begin(elfext::AccessNames), std::end(elfext::AccessNames)));
}

// The lines themselves: two that differ may be read alike.
TEST(FormatPages, ShowsTheBuiltInMap) {
  const Lines lines = linesUnder(sourceOf("quarn-attributes.7"), "The library attribute map");
  const auto start = std::ranges::find(lines, ".Bd -literal -offset indent");
  std::string rows;
  for (auto line = start + 1; line < lines.end() && *line != ".Ed"; ++line)
    rows += "    \"" + std::regex_replace(*line, std::regex("\\\\\\(ti"), "~") + "\",\n";
  const std::string source = contentsOf("elfext/src/attributes/library_attribute_map.cpp");
  EXPECT_NE(source.find("BuiltInLines[] = {\n" + rows + "};"), std::string::npos) << rows;
}

// ---- The archive format

TEST(FormatPages, HasTheFieldsOfAHeader) {
  constexpr arlib::HeaderField Fields[] = {arlib::NameField, arlib::DateField, arlib::UidField,
                                           arlib::GidField,  arlib::ModeField, arlib::SizeField,
                                           arlib::MagicField};
  const Lines items = itemsIn(linesUnder(sourceOf("quarn-archive.5"), "The header"));
  ASSERT_EQ(items.size(), std::size(Fields) + 1);
  for (size_t i = 0; i < std::size(Fields); ++i) {
    const std::string row = ".It " + std::to_string(Fields[i].position) + " Ta " +
                            std::to_string(Fields[i].width) + " Ta ";
    EXPECT_THAT(items[i + 1], testing::StartsWith(row));
  }
}

TEST(FormatPages, SaysWhatTheLimitsAre) {
  const Lines page = renderedOf("quarn-archive.5");
  const std::string largest = std::to_string(arlib::MaximumFileSize);
  EXPECT_THAT(page, testing::Contains(testing::HasSubstr("at most " + largest + " bytes")));
  EXPECT_THAT(page, testing::Contains(testing::HasSubstr(
                        "of up to " + std::to_string(arlib::MaximumShortName) + " bytes")));
}

} // namespace
} // namespace manuals
