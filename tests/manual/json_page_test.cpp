// SPDX-License-Identifier: Apache-2.0
//
// The page of quarn-json has its options, and page and document have the fields of the schema, each
// of them, and no others.
#include "manual_page.h"
#include "quarn-json/command_line.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <regex>

namespace manuals {
namespace {

using nlohmann::json;

const json& schema() {
  static const json Schema = json::parse(contentsOf("docs/quarn-json.schema.json"));
  return Schema;
}

// The names of all properties, at whatever depth.
void addFields(const json& part, Names& fields) {
  if (part.contains("properties")) {
    for (const auto& [name, value] : part.at("properties").items())
      fields.insert(name);
  }
  for (const json& inner : part) {
    if (inner.is_structured()) addFields(inner, fields);
  }
}

Names allFields() {
  Names fields;
  addFields(schema(), fields);
  return fields;
}

TEST(JsonPage, HasAnItemForEachOption) {
  Names options;
  for (const tabledrivenparser::MatchString& row : quarn_json::getOptionRows()) {
    if (!row.name.empty()) options.emplace(row.name);
  }
  Names described;
  for (const std::string& line : itemsIn(linesUnder(sourceOf("quarn-json.1"), "DESCRIPTION")))
    add(described, optionsIn(line));
  EXPECT_EQ(described, options);
}

TEST(JsonPage, HasEachFieldOfTheSchema) {
  Names described;
  for (const std::string& line : sourceOf("quarn-json.1"))
    add(described, wordsMarked(line, "Va"));
  EXPECT_EQ(described, allFields());
}

TEST(JsonPage, HasEachKindOfMember) {
  Names kinds;
  for (const json& kind : schema().at("$defs").at("member").at("properties").at("kind").at("enum"))
    kinds.insert(kind.get<std::string>());
  Names described;
  for (const std::string& line : linesUnder(sourceOf("quarn-json.1"), "Fields of a member"))
    add(described, wordsMarked(line, "Cm"));
  EXPECT_EQ(described, kinds);
}

// The second form of a name and the parts of sizes are told of there in a sentence.
TEST(JsonDocument, HasARowForEachField) {
  const std::string document = contentsOf("docs/quarn-json.md");
  Names described;
  const std::regex row("\n\\|([^|]*)\\|");
  const std::regex field("`([a-zA-Z]+)`");
  for (std::sregex_iterator at(document.begin(), document.end(), row), end; at != end; ++at) {
    const std::string cell = (*at)[1];
    for (std::sregex_iterator name(cell.begin(), cell.end(), field); name != end; ++name)
      described.insert((*name)[1]);
  }
  Names fields = allFields();
  for (const char* told : {"formatVersion", "libraries", "fileBytes", "nameBytes", "code",
                           "readOnlyData", "readWriteData", "zeroInitialised", "debug"})
    EXPECT_EQ(fields.erase(told), 1u) << told;
  for (const char* kind : {"object", "foreign", "unreadable"})
    EXPECT_EQ(described.erase(kind), 1u) << kind;
  EXPECT_TRUE(described.contains("reason"));
  EXPECT_EQ(described, fields);
}

} // namespace
} // namespace manuals
