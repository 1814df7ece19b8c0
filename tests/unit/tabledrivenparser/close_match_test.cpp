// SPDX-License-Identifier: Apache-2.0
// Words that come close to more than one row, or to another way of writing one.
#include "tool_table.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

// clang-format off
constexpr MatchString rivalRows[] = {
  {"A",   0, Kind_Required, {}, nullptr, ',', Flag_OldSyntax | Flag_Public},
  {"a",   0, Kind_Required, {}, nullptr, ',', Flag_OldSyntax | Flag_Public},
  {"abc", 1, Kind_Implied,  on, nullptr, ',', Flag_OldSyntax | Flag_Public},
  {"ne1", 0, Kind_Required, {}, nullptr, ',', Flag_Public},
  {"ne2", 0, Kind_Required, {}, nullptr, ',', Flag_Public},
  {"ne3", 1, Kind_Implied,  on, nullptr, ',', Flag_Public},
};
// clang-format on
constexpr ValueDefinition rivalDefinitions[] = {textOf(nullptr), flagOf(nullptr)};
static_assert(areWellFormed(rivalRows, std::size(rivalDefinitions)));

Lines rivalReports(std::initializer_list<const char*> words) {
  const OptionTable rivals{rivalRows, indexByFirstLetter(rivalRows)};
  ParserSession session(rivals, rivalDefinitions);
  session.parse(words);
  return session.reports();
}

TEST(RivalRows, giveWayToALongerMatch) {
  EXPECT_THAT(rivalReports({"-abx"}),
              ElementsAre("remark: Possible matches for 'abx' include 'A' and 'a'.",
                          "fatal: Unrecognized option '-abx'."));
  EXPECT_THAT(rivalReports({"-abc"}), ElementsAre("warning: Old syntax, please use '--abc'."));
}

TEST(RivalRows, stayAmbiguousWhenABetterKindTakesTheFirstPlace) {
  EXPECT_THAT(rivalReports({"--ne."}),
              ElementsAre("remark: Possible matches for 'ne.' include 'ne3' and 'ne2'.",
                          "fatal: Unrecognized option '--ne.'."));
}

TEST(LetterBeforeADot, isNoAbbreviation) {
  Session session;
  session.parse({"-a.o"});
  EXPECT_STREQ(session.parser().getText(Id_After), ".o");
  EXPECT_THAT(session.reports(), IsEmpty());
}

} // namespace tabledrivenparser::tool
