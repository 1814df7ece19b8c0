// SPDX-License-Identifier: Apache-2.0
//
// Words without dashes, and the mark that ends the options: their order, empty ones, a single dash,
// and words behind "--" that look like options.

#include "tool_table.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(PositionalWord, KeepsItsOrder) {
  Session session;
  session.parse({"tv", "-t", "lib.a", "x.o"});
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("tv", "lib.a", "x.o"));
}

TEST(PositionalWord, MayBeEmpty) {
  Session session;
  session.parse({"", "x", ""});
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("", "x", ""));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(PositionalWord, KeepsSignsAndSeparators) {
  Session session;
  session.parse({"=x.a", ",y", "a,b", "%s%n"});
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("=x.a", ",y", "a,b", "%s%n"));
}

TEST(PositionalWord, MayBeASingleDash) {
  Session session;
  session.parse({"-", "-t"});
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("-"));
  EXPECT_TRUE(session.parser().getBoolean(Id_List));
}

TEST(EndOfOptions, MakesEveryWordPositional) {
  Session session;
  session.parse({"-t", "--", "-odd.a", "--", "-", "=x", ""});
  EXPECT_TRUE(session.parser().isEndOfOptions());
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("-odd.a", "--", "-", "=x", ""));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(EndOfOptions, IsAWordOfItsOwn) {
  Session session;
  EXPECT_EQ(session.parser().parseWord("--", "next"), 1u);
  EXPECT_THAT(session.texts(Id_Words), IsEmpty());
}

} // namespace tabledrivenparser::tool
