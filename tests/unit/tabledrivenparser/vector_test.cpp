// SPDX-License-Identifier: Apache-2.0
//
// Options that collect values: where arguments are split and where not, empty pieces, pieces that
// are none, and that neither the argument nor the default list is changed by it.

#include "type_table.h"

namespace tabledrivenparser::types {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(IntVector, IsSplitAtTheSeparator) {
  Session session;
  session.parse({"--many=1,-2,0x10", "--many", "4"});
  EXPECT_THAT(session.numbers(Id_IntVector), ElementsAre(1, -2, 16, 4));
  EXPECT_THAT(session.m_Listener.m_Lines, ElementsAre("6=1", "6=-2", "6=16", "6=4"));
}

TEST(IntVector, AppendsTheRowsValueWhereNothingCanBeSplit) {
  Session session;
  session.parse({"--many6", "--many5=1,2", "--many6"});
  EXPECT_THAT(session.numbers(Id_IntVector), ElementsAre(6, 5, 6));
}

TEST(IntVector, AllowsOnlyNumbersAndSeparators) {
  for (const char* text : {"", "1,", ",1", "1,,2", "1:2", "1, x", "1,2 "}) {
    Session session;
    session.parse({"--many", text});
    EXPECT_THAT(session.getReports(), ElementsAre(std::string("fatal: Argument '") + text +
                                                  "' not permitted for option 'many'."));
  }
}

TEST(IntVector, OverflowsWithItsWholeText) {
  Session session;
  session.parse({"--many=1,2147483648,x"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Overflow: '1,2147483648,x' will not fit in an integer."));
}

TEST(Int64Vector, Is64BitsWide) {
  Session session;
  session.parse({"--long=9223372036854775807:-9223372036854775808", "--long_max"});
  EXPECT_THAT(session.numbers(Id_Int64Vector), ElementsAre(INT64_MAX, INT64_MIN, INT64_MAX));
  session.parse({"--long=9223372036854775808"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Overflow: '9223372036854775808' will not fit in an integer."));
}

TEST(StringVector, IsSplitAtTheSeparator) {
  Session session;
  session.parse({"--texts=a,b", "--texts", "c"});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("a", "b", "c"));
  EXPECT_THAT(session.m_Listener.m_Lines, ElementsAre("9=a", "9=b", "9=c"));
}

TEST(StringVector, KeepsEmptyPieces) {
  Session session;
  session.parse({"--texts=,a,", "--texts="});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("", "a", "", ""));
}

TEST(StringVector, IsNotSplitWithoutASeparatorInTheRow) {
  Session session;
  session.parse({"-ua,b"});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("a,b"));
}

TEST(StringVector, AppendsItsImpliedValue) {
  Session session;
  session.parse({"--texts_y", "--texts=z"});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("y", "z"));
}

TEST(StringVector, LeavesTheArgumentUntouched) {
  Session session;
  char word[] = "--texts=a,b";
  session.parser().parseWord(word, nullptr);
  EXPECT_STREQ(word, "--texts=a,b");
  word[8] = 'X';
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("a", "b"));
}

TEST(StringVector, FailsIfAnyPieceDoesAndTriesThemAll) {
  Session session;
  session.m_Records[Id_StringVector].validator = [](const Parser&, uint32_t, const Value& value) {
    return std::string_view(value.text) != "bad";
  };
  session.parse({"--texts=a,bad,b"});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("a", "b"));
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument 'a,bad,b' not permitted for option 'texts'."));
}

TEST(ListenerOfAVector, TakesSingleElements) {
  Session session;
  session.m_Listener.m_Answer = [](Parser&, uint32_t, const Value& value) {
    return std::string_view(value.text) == "b";
  };
  session.parse({"--texts=a,b,c"});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("a", "c"));
  EXPECT_EQ(session.parser().getSetCounter(), 3u);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(VectorDefault, GivesWayToTheFirstElementAndStaysWhole) {
  const auto region = makeRegion();
  StrList defaults(*region);
  defaults.append("preset");
  Session session;
  session.m_Definitions[Id_StringVector].defaultValue.strings = &defaults;
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("preset"));
  session.parse({"--texts=a,b"});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("a", "b"));
  EXPECT_EQ(defaults.size(), 1u);
}

} // namespace tabledrivenparser::types
