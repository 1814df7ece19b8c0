// SPDX-License-Identifier: Apache-2.0
//
// Options that take a name from a list: in any letter case, whole names only, restricted and
// deprecated ones, and the list that enumerator 0 shows.

#include "type_table.h"

namespace tabledrivenparser::types {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(EnumerationOption, TakesANameInAnyCase) {
  Session session;
  session.parse({"--enum=rED"});
  EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 2u);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(EnumerationOption, WantsTheWholeName) {
  for (const char* text : {"re", "reds", "", "red "}) {
    Session session;
    session.parse({"--enum", text});
    EXPECT_THAT(session.getReports(), ElementsAre(std::string("fatal: Argument '") + text +
                                                  "' not permitted for option 'enum'."));
    EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 1u);
  }
}

TEST(EnumerationOption, PassesOverRestrictedNames) {
  Session session;
  session.m_Table.restrictionMask = 1;
  session.parse({"--enum=violet"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument 'violet' not permitted for option 'enum'."));
}

TEST(EnumerationOption, WarnsOfADeprecatedName) {
  Session session;
  session.parse({"--enum=CRIMSON"});
  EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 2u);
  EXPECT_THAT(session.getReports(),
              ElementsAre("warning: Argument 'CRIMSON' to option 'enum' is deprecated"));
}

TEST(EnumerationOption, ListsTheNamesForEnumeratorZeroAndStoresIt) {
  Session session;
  EXPECT_FALSE(session.parser().hasShownChoices());
  session.parse({"--enum=choose"});
  EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 0u);
  EXPECT_TRUE(session.parser().hasShownChoices());
  EXPECT_THAT(session.getReports(),
              ElementsAre("remark: The following arguments to option 'enum' can be selected:\n "
                          "Choose green Red crimson violet"));
}

TEST(EnumerationOption, ListsOnlyUsableNames) {
  Session session;
  session.m_Table.restrictionMask = 1;
  session.parse({"--enum=choose"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("remark: The following arguments to option 'enum' can be selected:\n "
                          "Choose green Red crimson"));
}

TEST(EnumerationOption, ListsNothingInAFilteredParse) {
  Session session;
  const uint32_t filter[] = {Id_Enum};
  session.parser().parseWord("--enum=choose", nullptr, filter);
  EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 0u);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(EnumerationOption, ListsEveryNameHoweverMany) {
  std::vector<std::string> names(1000);
  std::vector<MatchString> entries;
  std::string joined;
  for (uint32_t number = 0; number < 1000; ++number) {
    names[number] = "name" + std::to_string(number);
    entries.push_back({names[number], number});
    joined += (number == 0 ? "" : " ") + names[number];
  }
  const Enumeration enumeration{entries};
  Session session;
  session.m_Definitions[Id_Enum].constraint.enumeration = &enumeration;
  session.parse({"--enum=name0"});
  EXPECT_THAT(
      session.getReports(),
      ElementsAre("remark: The following arguments to option 'enum' can be selected:\n " + joined));
}

TEST(EnumerationOption, TakesAnImpliedEnumerator) {
  Session session;
  session.parse({"--red"});
  EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 2u);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(EnumerationOption, RefusesAnImpliedValueThatIsNoEnumerator) {
  Session session;
  session.parse({"--redder"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument '' not permitted for option 'redder'."));
}

TEST(ListenerOfAnEnumeration, MayTakeTheValueBeforeAnyRemark) {
  Session session;
  session.m_Listener.m_Answer = [](Parser&, uint32_t, const Value&) { return true; };
  session.parse({"--enum=choose", "--enum=crimson"});
  EXPECT_THAT(session.m_Listener.m_Lines, ElementsAre("2=0", "2=2"));
  EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 1u);
  EXPECT_EQ(session.parser().getRecord(Id_Enum).lastSet, 2u);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(ListenerOfAnEnumeration, ActsBeforeTheRemark) {
  Session session;
  session.m_Listener.m_Answer = [&](Parser&, uint32_t, const Value&) {
    EXPECT_THAT(session.getReports(), IsEmpty());
    return false;
  };
  session.parse({"--enum=choose"});
  EXPECT_EQ(session.getReports().size(), 1u);
}

} // namespace tabledrivenparser::types
