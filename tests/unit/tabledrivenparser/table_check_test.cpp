// SPDX-License-Identifier: Apache-2.0
// The checks that clients make at compile time.
#include "tool_table.h"
#include "type_table.h"

namespace tabledrivenparser {

constexpr MatchString sorted[] = {{"", 0}, {"1a", 0}, {"C", 0}, {"c", 1}, {"c_d", 1}, {"cat", 0}};
constexpr MatchString twinsTurned[] = {{"c", 0}, {"C", 0}};
constexpr MatchString unsorted[] = {{"b", 0}, {"a", 0}};
constexpr MatchString twice[] = {{"a", 0}, {"a", 0}};
constexpr MatchString emptyLast[] = {{"a", 0}, {"", 0}};

static_assert(areSorted(sorted));
static_assert(!areSorted(twinsTurned));
static_assert(!areSorted(unsorted));
static_assert(!areSorted(twice));
static_assert(!areSorted(emptyLast));

static_assert(areWellFormed(sorted, 2));
static_assert(!areWellFormed(sorted, 1));
static_assert(!areWellFormed(unsorted, 1));

static_assert(isFindable("") && isFindable("V") && isFindable("Ab_c") && isFindable("1"));
static_assert(!isFindable("aB"));
static_assert(!isFindable("a-b"));
static_assert(!isFindable("~a"));
static_assert(!isFindable("\xe9"));

static_assert(indexByFirstLetter(sorted)['a' - 'a'] == NoRow);
static_assert(indexByFirstLetter(sorted)['c' - 'a'] == 2);
static_assert(indexByFirstLetter(sorted)['z' - 'a'] == NoRow);

static_assert(rowNamed(sorted, "c") == &sorted[3]);
static_assert(rowNamed(sorted, "no") == nullptr);
static_assert(rowsNamed(sorted, "c", "C")[1] == &sorted[2]);
static_assert(rowsNamed(sorted, "c", "C")[2] == nullptr);

constexpr auto firstRows = rowsNamed(sorted, "", "1a", "C", "cat");
constexpr auto secondRows = rowsNamed(sorted, "c_d", "c");
constexpr auto tooFewRows = rowsNamed(sorted, "c");
constexpr ValueDefinition definitions[] = {
    {Type_Boolean, Default_Fixed, {}, {}, firstRows.data()},
    {Type_Boolean, Default_Fixed, {}, {}, secondRows.data()}};
constexpr ValueDefinition lackingDefinitions[] = {
    {Type_Boolean, Default_Fixed, {}, {}, firstRows.data()},
    {Type_Boolean, Default_Fixed, {}, {}, tooFewRows.data()}};
constexpr ValueDefinition turnedDefinitions[] = {
    {Type_Boolean, Default_Fixed, {}, {}, secondRows.data()},
    {Type_Boolean, Default_Fixed, {}, {}, firstRows.data()}};
static_assert(listEveryRow(definitions, sorted));
static_assert(!listEveryRow(lackingDefinitions, sorted));
static_assert(!listEveryRow(turnedDefinitions, sorted));

constexpr uint32_t masks[] = {1, 6, 0};
static_assert(restrictionsMet(nullptr, 0));
static_assert(restrictionsMet(masks, 5));
static_assert(restrictionsMet(masks, 0xFFFFFFFF));
static_assert(!restrictionsMet(masks, 1));
static_assert(!restrictionsMet(masks, 6));

static_assert(support::isWhiteSpace(' ') && support::isWhiteSpace('\t') &&
              support::isWhiteSpace('\v') && support::isWhiteSpace('\r'));
static_assert(!support::isWhiteSpace('\b') && !support::isWhiteSpace('\x0e') &&
              !support::isWhiteSpace('\x85'));
static_assert(support::isLetter('A') && support::isLetter('z') && !support::isLetter('@') &&
              !support::isLetter('\xe9'));
static_assert(support::lowered('Z') == 'z' && support::lowered('[') == '[' &&
              support::lowered('\xc0') == '\xc0');

// The addresses of inline variables are no constants to every compiler under its sanitizers.
TEST(TableCheck, holdsForTheTablesOfTheTests) {
  EXPECT_TRUE(listEveryRow(tool::definitions, tool::rows));
  EXPECT_TRUE(listEveryRow(types::definitions, types::rows));
}

TEST(TableCheck, alsoRunsAtRunTime) {
  const std::vector<MatchString> rows(std::begin(sorted), std::end(sorted));
  EXPECT_TRUE(areWellFormed(rows, 2));
  EXPECT_EQ(indexByFirstLetter(rows)[2], 2u);
}

} // namespace tabledrivenparser
