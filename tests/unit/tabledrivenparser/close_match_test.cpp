// SPDX-License-Identifier: Apache-2.0
//
// Words that come close to more than one row, or to another way of writing one: a longer match
// wins, and what stays ambiguous means nothing.

#include "tool_table.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

// clang-format off
constexpr MatchString RivalRows[] = {
  {"A",   0, Kind_Required, {}, nullptr, ',', Flag_OldSyntax | Flag_Public},
  {"a",   0, Kind_Required, {}, nullptr, ',', Flag_OldSyntax | Flag_Public},
  {"abc", 1, Kind_Implied,  On, nullptr, ',', Flag_OldSyntax | Flag_Public},
  {"ne1", 0, Kind_Required, {}, nullptr, ',', Flag_Public},
  {"ne2", 0, Kind_Required, {}, nullptr, ',', Flag_Public},
  {"ne3", 1, Kind_Implied,  On, nullptr, ',', Flag_Public},
};
// clang-format on
constexpr ValueDefinition RivalDefinitions[] = {textOf(nullptr), flagOf(nullptr)};
static_assert(areWellFormed(RivalRows, std::size(RivalDefinitions)));

Lines rivalReports(std::initializer_list<const char*> words) {
  const OptionTable rivals{RivalRows, indexByFirstLetter(RivalRows)};
  ParserSession session(rivals, RivalDefinitions);
  session.parse(words);
  return session.getReports();
}

TEST(RivalRows, GiveWayToALongerMatch) {
  EXPECT_THAT(rivalReports({"-abx"}),
              ElementsAre("remark: Possible matches for 'abx' include 'A' and 'a'.",
                          "fatal: Unrecognized option '-abx'."));
  EXPECT_THAT(rivalReports({"-abc"}), ElementsAre("warning: Old syntax, please use '--abc'."));
}

TEST(RivalRows, StayAmbiguousWhenABetterKindTakesTheFirstPlace) {
  EXPECT_THAT(rivalReports({"--ne."}),
              ElementsAre("remark: Possible matches for 'ne.' include 'ne3' and 'ne2'.",
                          "fatal: Unrecognized option '--ne.'."));
}

TEST(LetterBeforeADot, IsNoAbbreviation) {
  Session session;
  session.parse({"-a.o"});
  EXPECT_STREQ(session.parser().getText(Id_After), ".o");
  EXPECT_THAT(session.getReports(), IsEmpty());
}

} // namespace tabledrivenparser::tool
