// SPDX-License-Identifier: Apache-2.0
//
// The words in an order in which they are soon found. A word is compared as two numbers, not byte
// by byte: texts come by the thousand, one for each member or symbol.
//
// The tables are sorted by the compiler and looked through by halving. A key holds a whole word, so
// equal keys are equal words.
#include "elfext/src/attributes/attribute_words.h"

#include "elfext/src/attributes/attribute_tokens.h"
#include "support/interface/letters.h"

#include <algorithm>
#include <array>
#include <compare>
#include <iterator>

namespace elfext {

namespace {

// ---- Words

constexpr size_t LongestWord = 15; // bytes

// A word in small letters, and its length in the last byte.
struct WordKey {
  uint64_t beginning = 0;
  uint64_t rest = 0;

  constexpr explicit WordKey(std::string_view word) : rest(word.size()) {
    for (size_t at = 0; at < word.size(); ++at) {
      const uint64_t byte = static_cast<uint8_t>(support::lowered(word[at]));
      // The first byte on top, so that keys compare as words do.
      (at < 8 ? beginning : rest) |= byte << (56 - 8 * (at % 8));
    }
  }
  [[nodiscard]] constexpr size_t getLength() const { return rest & 0xFF; }
  constexpr auto operator<=>(const WordKey&) const = default;
};

struct WordRow {
  WordKey key{""};
  AttributeWord word;
};

constexpr size_t WordCount =
    std::ranges::count_if(FeatureTokens,
                          [](const FeatureToken& row) { return row.use != TokenUse::Print; }) +
    std::size(FlagTokens) + std::size(Stack8Tokens) + std::size(AbiLevelTokens) + 1;

consteval std::array<WordRow, WordCount> sortWords() {
  std::array<WordRow, WordCount> rows;
  auto next = rows.begin();
  for (const FeatureToken& row : FeatureTokens) {
    if (row.use != TokenUse::Print) *next++ = {WordKey(row.token), {.features = row.set}};
  }
  for (const FlagToken& row : FlagTokens)
    *next++ = {WordKey(row.token), {.flags = row.bits}};
  for (const FlagToken& row : Stack8Tokens)
    *next++ = {WordKey(row.token), {.stack8 = row.bits}};
  for (const FlagToken& row : AbiLevelTokens)
    *next++ = {WordKey(row.token), {.abiLevel = row.bits}};
  *next++ = {WordKey(ComplementToken.token), {.takesFlagsBack = true}};
  std::ranges::sort(rows, {}, &WordRow::key);
  return rows;
}

constexpr std::array<WordRow, WordCount> Words = sortWords();

// Then it doesn't matter which of the vocabularies, or which row of one, is looked at first.
static_assert(std::ranges::adjacent_find(Words, std::ranges::greater_equal(), &WordRow::key) ==
              Words.end());

// A longer word would not be in its key whole.
static_assert(std::ranges::all_of(Words, [](const WordRow& row) {
  return row.key.getLength() <= LongestWord;
}));

// ---- Access names

constexpr uint32_t AccessNameCount = std::size(AccessNames);
constexpr size_t LongestAccessName = 4; // bytes

// The first bytes of a text, or all of a name.
constexpr uint32_t accessKeyOf(std::string_view text) {
  uint32_t key = 0;
  for (size_t at = 0; at < LongestAccessName; ++at)
    key = key << 8 | (at < text.size() ? static_cast<uint8_t>(text[at]) : 0);
  return key;
}

struct AccessRow {
  uint32_t key = 0;
  uint32_t number = 0;
};

consteval std::array<AccessRow, AccessNameCount> sortAccessNames() {
  std::array<AccessRow, AccessNameCount> rows;
  for (uint32_t number = 0; number < AccessNameCount; ++number)
    rows[number] = {accessKeyOf(AccessNames[number]), number};
  std::ranges::sort(rows, {}, &AccessRow::key);
  return rows;
}

constexpr std::array<AccessRow, AccessNameCount> SortedAccessNames = sortAccessNames();

// No name begins another one. Then, of all names, only the last that is not behind a text can begin
// it.
static_assert(std::ranges::adjacent_find(SortedAccessNames, [](const AccessRow& row,
                                                               const AccessRow& next) {
                const std::string_view name = AccessNames[row.number];
                return row.key >= next.key || AccessNames[next.number].starts_with(name);
              }) == SortedAccessNames.end());
static_assert(std::ranges::none_of(AccessNames, [](std::string_view name) {
  return name.size() > LongestAccessName;
}));

} // namespace

const AttributeWord* findAttributeWord(std::string_view word) {
  // Its last bytes would run into the length.
  if (word.size() > LongestWord) return nullptr;
  const WordKey key(word);
  const auto row = std::ranges::lower_bound(Words, key, {}, &WordRow::key);
  return row != Words.end() && row->key == key ? &row->word : nullptr;
}

uint32_t findAccessName(std::string_view text) {
  const auto behind =
      std::ranges::upper_bound(SortedAccessNames, accessKeyOf(text), {}, &AccessRow::key);
  if (behind == SortedAccessNames.begin()) return AccessNameCount;
  const uint32_t number = std::prev(behind)->number;
  return text.starts_with(AccessNames[number]) ? number : AccessNameCount;
}

} // namespace elfext
