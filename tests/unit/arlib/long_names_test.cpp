// SPDX-License-Identifier: Apache-2.0
//
// Names by their indices, compared with what a plain search through the whole table says.
#include "arlib/src/long_names.h"
#include "support/interface/path.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

namespace arlib {

namespace {

std::optional<std::string_view> searched(std::string_view table, size_t index) {
  const size_t end = table.find("/\n", index);
  if (index >= table.size() || end == std::string_view::npos) return std::nullopt;
  if (index > 0 && table.substr(index - 1, 2) == "/\n") return std::nullopt;
  const std::string_view name = table.substr(index, end - index);
  return name.substr(0, name.find('\0'));
}

void expectAsSearched(const std::string& table) {
  LongNames names(table);
  for (size_t index = 0; index <= table.size() + 1; ++index) {
    const std::optional<std::string_view> wanted = searched(table, index);
    const std::optional<std::string_view> name = names.nameAt(index);
    ASSERT_EQ(name, wanted) << index;
    if (!wanted) continue;
    ASSERT_EQ(name->data(), wanted->data()) << index;
    ASSERT_EQ(names.leafOf(*name), support::lastPathComponent(*wanted)) << index;
  }
}

} // namespace

TEST(LongNamesTest, FindsNamesOfAllLengths) {
  std::string table;
  for (const uint32_t size : {0U, 1U, 16U, 254U, 255U, 256U, 257U, 511U, 512U, 513U, 5000U, 3U})
    table += std::string(size, 'n') + "/\n";
  expectAsSearched(table);
  expectAsSearched(table + std::string(2000, 'x'));
  expectAsSearched(table + std::string(2000, '\0'));
}

TEST(LongNamesTest, FindsNothingWhereNoEntryEnds) {
  expectAsSearched("");
  expectAsSearched("/");
  expectAsSearched("\n/");
  expectAsSearched(std::string(3000, 'n'));
  expectAsSearched(std::string(3000, '/'));
}

TEST(LongNamesTest, FindsLeavesFarInFrontAndFarBehind) {
  const std::string name(2000, 'n');
  expectAsSearched(name + "/" + name + "/\n");
  expectAsSearched(name + "\\" + name + "/" + name + "/\n/" + name + "/\n");
  expectAsSearched(std::string(3000, '/') + "\n" + name + "/\n");
}

// Few letters at random: ends of names and separators are everywhere, also at the ends of blocks.
TEST(LongNamesTest, FindsInAnyTableWhatAPlainSearchFinds) {
  uint32_t state = 1;
  for (const uint32_t rarity : {8U, 100U, 1000U}) {
    std::string table;
    for (int i = 0; i < 6000; ++i) {
      state = state * 1664525 + 1013904223;
      const uint32_t number = (state >> 8) % rarity;
      table += number < 5 ? std::string_view("/\n\\\0/", 5)[number] : 'n';
      if (number == 4) table += '\n';
    }
    expectAsSearched(table);
  }
}

} // namespace arlib
