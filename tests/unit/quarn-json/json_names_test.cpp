// SPDX-License-Identifier: Apache-2.0
//
// Which bytes are UTF-8: exactly those that the JSON library passes on as they are. If the two
// disagreed, a name would lose bytes without a word.
#include "quarn-json/json_names.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <string>
#include <vector>

namespace quarn_json {

namespace {

bool passesAsItIs(const std::string& text) {
  const std::string line = lineOf(Json(text));
  return Json::parse(line).get<std::string>() == text;
}

// The bounds that the standard draws, and the bytes beside them.
std::vector<std::string> boundaryBytes() {
  std::vector<std::string> bytes;
  for (const int byte :
       {0x00, 0x41, 0x7F, 0x80, 0x8F, 0x90, 0x9F, 0xA0, 0xBF, 0xC0, 0xC1, 0xC2, 0xDF, 0xE0,
        0xE1, 0xEC, 0xED, 0xEE, 0xEF, 0xF0, 0xF1, 0xF3, 0xF4, 0xF5, 0xF8, 0xFE, 0xFF})
    bytes.emplace_back(1, static_cast<char>(byte));
  return bytes;
}

// Each with one more byte.
std::vector<std::string> longer(const std::vector<std::string>& texts) {
  std::vector<std::string> all;
  for (const std::string& text : texts) {
    for (const std::string& byte : boundaryBytes())
      all.push_back(text + byte);
  }
  return all;
}

void expectUtf8WherePassed(const std::vector<std::string>& texts) {
  for (const std::string& text : texts)
    ASSERT_EQ(isUtf8(text), passesAsItIs(text)) << Json::binary({text.begin(), text.end()});
}

TEST(JsonNames, AreUtf8WhereTheyPassAsTheyAre) {
  const std::vector<std::string> pairs = longer(boundaryBytes());
  std::vector<std::string> triples = longer(pairs);
  expectUtf8WherePassed(boundaryBytes());
  expectUtf8WherePassed(pairs);
  expectUtf8WherePassed(triples);
  // Of four bytes those that may be one character, or nearly.
  std::erase_if(triples, [](const std::string& text) {
    return static_cast<uint8_t>(text[0]) < 0xEF || static_cast<uint8_t>(text[2]) < 0x7F;
  });
  expectUtf8WherePassed(longer(triples));
}

TEST(JsonNames, AreUtf8ToTheLastByte) {
  EXPECT_TRUE(isUtf8(""));
  EXPECT_TRUE(isUtf8("caf\xC3\xA9"));
  EXPECT_TRUE(isUtf8("\xF0\x9F\x8D\xB0 cake"));
  EXPECT_FALSE(isUtf8("caf\xC3"));
  EXPECT_FALSE(isUtf8("caf\xE9"));
}

std::string rowWith(std::string_view name) {
  Json row;
  putName(row, "name", name);
  return lineOf(row);
}

TEST(JsonNames, HaveTheirBytesOnlyWhereTheTextIsNotEnough) {
  EXPECT_EQ(rowWith("a.o"), R"({"name":"a.o"})");
  EXPECT_EQ(rowWith("caf\xC3\xA9"), "{\"name\":\"caf\xC3\xA9\"}");
  EXPECT_EQ(rowWith("a\"\\\n\x01"), R"({"name":"a\"\\\n\u0001"})");
  EXPECT_EQ(rowWith("b\xFF.o"), "{\"name\":\"b\xEF\xBF\xBD.o\",\"nameBytes\":\"62ff2e6f\"}");
}

TEST(JsonNames, ThatOnlyLookAlikeAreToldApart) {
  EXPECT_NE(rowWith("b\xFF"), rowWith("b\xFE"));
  EXPECT_NE(rowWith("b\xFF"), rowWith("b\xEF\xBF\xBD"));
}

} // namespace

} // namespace quarn_json
