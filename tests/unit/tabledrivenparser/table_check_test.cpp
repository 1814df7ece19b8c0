// SPDX-License-Identifier: Apache-2.0
//
// The checks that clients make at compile time, mostly as static assertions: good tables pass, and
// each of the bad ones is bad in one way, by which some row would never be found.

#include "tool_table.h"
#include "type_table.h"

namespace tabledrivenparser {

constexpr MatchString Sorted[] = {{"", 0}, {"1a", 0}, {"C", 0}, {"c", 1}, {"c_d", 1}, {"cat", 0}};
constexpr MatchString TwinsTurned[] = {{"c", 0}, {"C", 0}};
constexpr MatchString Unsorted[] = {{"b", 0}, {"a", 0}};
constexpr MatchString Twice[] = {{"a", 0}, {"a", 0}};
constexpr MatchString EmptyLast[] = {{"a", 0}, {"", 0}};

static_assert(areSorted(Sorted));
static_assert(!areSorted(TwinsTurned));
static_assert(!areSorted(Unsorted));
static_assert(!areSorted(Twice));
static_assert(!areSorted(EmptyLast));

static_assert(areWellFormed(Sorted, 2));
static_assert(!areWellFormed(Sorted, 1));
static_assert(!areWellFormed(Unsorted, 1));

static_assert(isFindable("") && isFindable("V") && isFindable("Ab_c") && isFindable("1"));
static_assert(!isFindable("aB"));
static_assert(!isFindable("a-b"));
static_assert(!isFindable("~a"));
static_assert(!isFindable("\xe9"));

static_assert(indexByFirstLetter(Sorted)['a' - 'a'] == NoRow);
static_assert(indexByFirstLetter(Sorted)['c' - 'a'] == 2);
static_assert(indexByFirstLetter(Sorted)['z' - 'a'] == NoRow);

static_assert(rowNamed(Sorted, "c") == &Sorted[3]);
static_assert(rowNamed(Sorted, "no") == nullptr);
static_assert(rowsNamed(Sorted, "c", "C")[1] == &Sorted[2]);
static_assert(rowsNamed(Sorted, "c", "C")[2] == nullptr);

constexpr auto FirstRows = rowsNamed(Sorted, "", "1a", "C", "cat");
constexpr auto SecondRows = rowsNamed(Sorted, "c_d", "c");
constexpr auto TooFewRows = rowsNamed(Sorted, "c");
constexpr ValueDefinition Definitions[] = {
    {Type_Boolean, Default_Fixed, {}, {}, FirstRows.data()},
    {Type_Boolean, Default_Fixed, {}, {}, SecondRows.data()}};
constexpr ValueDefinition LackingDefinitions[] = {
    {Type_Boolean, Default_Fixed, {}, {}, FirstRows.data()},
    {Type_Boolean, Default_Fixed, {}, {}, TooFewRows.data()}};
constexpr ValueDefinition TurnedDefinitions[] = {
    {Type_Boolean, Default_Fixed, {}, {}, SecondRows.data()},
    {Type_Boolean, Default_Fixed, {}, {}, FirstRows.data()}};
static_assert(listEveryRow(Definitions, Sorted));
static_assert(!listEveryRow(LackingDefinitions, Sorted));
static_assert(!listEveryRow(TurnedDefinitions, Sorted));

constexpr uint32_t Masks[] = {1, 6, 0};
static_assert(restrictionsMet(nullptr, 0));
static_assert(restrictionsMet(Masks, 5));
static_assert(restrictionsMet(Masks, 0xFFFFFFFF));
static_assert(!restrictionsMet(Masks, 1));
static_assert(!restrictionsMet(Masks, 6));

static_assert(support::isWhiteSpace(' ') && support::isWhiteSpace('\t') &&
              support::isWhiteSpace('\v') && support::isWhiteSpace('\r'));
static_assert(!support::isWhiteSpace('\b') && !support::isWhiteSpace('\x0e') &&
              !support::isWhiteSpace('\x85'));
static_assert(support::isLetter('A') && support::isLetter('z') && !support::isLetter('@') &&
              !support::isLetter('\xe9'));
static_assert(support::lowered('Z') == 'z' && support::lowered('[') == '[' &&
              support::lowered('\xc0') == '\xc0');

// The addresses of inline variables are no constants to every compiler under its sanitizers.
TEST(TableCheck, HoldsForTheTablesOfTheTests) {
  EXPECT_TRUE(listEveryRow(tool::Definitions, tool::Rows));
  EXPECT_TRUE(listEveryRow(types::Definitions, types::Rows));
}

TEST(TableCheck, AlsoRunsAtRunTime) {
  const std::vector<MatchString> rows(std::begin(Sorted), std::end(Sorted));
  EXPECT_TRUE(areWellFormed(rows, 2));
  EXPECT_EQ(indexByFirstLetter(rows)[2], 2u);
}

} // namespace tabledrivenparser
