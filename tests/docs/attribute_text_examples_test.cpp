// SPDX-License-Identifier: Apache-2.0
//
// The attribute texts and the maps of docs/formats.md, as the object library reads them: the lists
// of tokens, what texts are read as and written as, and what maps say of names, the built-in one
// included.

#include "elfext/interface/attribute_string.h"
#include "elfext/interface/library_attribute_map.h"
#include "elfext/src/attributes/attribute_tokens.h"
#include "tests/docs/document.h"
#include "tests/support/memory_host.h"

#include <gtest/gtest.h>

namespace documents {
namespace {

using elfext::FeatureSet;
using elfext::FullAttr;
using elfext::LibraryAttributeMap;

// ---- Tokens

// The upper half in front, where there is one.
std::string setText(FeatureSet set) {
  constexpr size_t WordDigits = 16;
  const std::string low = hexadecimal(set.low);
  if (set.high == 0) return low;
  const std::string digits = low.substr(2);
  return hexadecimal(set.high) + std::string(WordDigits - digits.size(), '0') + digits;
}

std::string tokenLine(std::string_view token, const std::string& bits, std::string_view use = "") {
  const std::string line = padded(token, 15) + padded(bits, 20) + std::string(use);
  return line.substr(0, line.find_last_not_of(' ') + 1) + "\n";
}

template <size_t Count>
std::string tokenLines(const elfext::FlagToken (&tokens)[Count]) {
  std::string lines;
  for (const elfext::FlagToken& row : tokens)
    lines += tokenLine(row.token, hexadecimal(row.bits));
  return lines;
}

TEST(FormatsDocument, ListsTheTokensOfFeatures) {
  std::string lines;
  for (const elfext::FeatureToken& row : elfext::FeatureTokens) {
    const bool isRead = row.use != elfext::TokenUse::Print;
    const bool isWritten = row.use != elfext::TokenUse::Read;
    lines += tokenLine(row.token, setText(row.set),
                       !isWritten ? "read only" : (isRead ? "" : "written only"));
  }
  EXPECT_EQ(lines, example("feature-tokens"));
}

TEST(FormatsDocument, ListsTheTokensOfFlags) {
  EXPECT_EQ(tokenLines(elfext::FlagTokens), example("flag-tokens"));
  EXPECT_EQ(tokenLines(elfext::Stack8Tokens), example("stack-tokens"));
  EXPECT_EQ(tokenLines(elfext::AbiLevelTokens), example("abi-tokens"));
}

TEST(FormatsDocument, ListsTheNamesOfAccesses) {
  std::string lines;
  for (size_t bit = 0; bit < elfext::LoadNameCount; ++bit)
    lines += padded(elfext::AccessNames[bit], 6) +
             padded(elfext::AccessNames[bit + elfext::LoadNameCount], 6) +
             hexadecimal(uint64_t{1} << bit) + "\n";
  EXPECT_EQ(lines, example("access-names"));
}

// ---- Texts

std::string recordText(const FullAttr& record) {
  const elfext::AccessWords& access = record.m_Access;
  return "features " + setText(record.m_Features) + ", loads " + hexadecimal(access.code) + " " +
         hexadecimal(access.readOnlyData) + " " + hexadecimal(access.data) + ", stores " +
         hexadecimal(access.stores) + ", flags " + hexadecimal(record.m_Flags) + ", stack " +
         std::to_string(record.m_Stack8) + ", ABI " + std::to_string(record.m_AbiLevel);
}

// Each text stands in a line of its own, and what is said of it, behind blanks, below.
TEST(FormatsDocument, SaysWhatTextsAreReadAsAndWrittenAs) {
  const std::string given = example("attribute-texts");
  std::string lines;
  for (const std::string& line : linesOf(given)) {
    if (line.starts_with(' ')) continue;
    const FullAttr record = elfext::parseAttributeString(line);
    lines += line + "\n    " + recordText(record) + "\n    written " +
             elfext::printAttributeString(record) + "\n";
  }
  EXPECT_EQ(lines, given);
}

// ---- Maps

LibraryAttributeMap mapOf(const std::string& text) {
  testsupport::MemoryHost host;
  host.addFile("map", text);
  bool usedDefault = true;
  support::HostError error = 0;
  LibraryAttributeMap map = elfext::readLibraryAttributeMap(host, "map", usedDefault, error);
  EXPECT_FALSE(usedDefault);
  EXPECT_EQ(error, 0);
  return map;
}

// The name of a library, its attributes and its class.
std::string answerLine(const std::string& name, const LibraryAttributeMap& map) {
  FullAttr attributes;
  elfext::getLibraryAttributes(attributes, name, map);
  return padded(name, 14) + padded(elfext::printAttributeString(attributes), 26) +
         std::string(elfext::getLibraryClass(name, map)) + "\n";
}

TEST(FormatsDocument, SaysWhatAMapSaysOfNames) {
  const LibraryAttributeMap map = mapOf(example("attribute-map"));
  const std::string given = example("attribute-map-answers");
  std::string lines;
  for (const std::string& line : linesOf(given))
    lines += answerLine(line.substr(0, line.find(' ')), map);
  EXPECT_EQ(lines, given);
}

// The lines themselves: two that differ may be read alike.
TEST(FormatsDocument, ListsTheBuiltInMap) {
  std::string rows;
  for (const std::string& line : linesOf(example("attribute-map-built-in")))
    rows += "    " + inQuotes(line) + ",\n";
  const std::string source = contentsOf("elfext/src/attributes/library_attribute_map.cpp");
  EXPECT_NE(source.find("BuiltInLines[] = {\n" + rows + "};"), std::string::npos);
}

} // namespace
} // namespace documents
