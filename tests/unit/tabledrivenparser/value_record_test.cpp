// SPDX-License-Identifier: Apache-2.0
//
// Values: their defaults, their counters, who else may take them, and how they end. Each kind of
// default is tested, with restrictions and without.

#include "type_table.h"

namespace tabledrivenparser::types {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(ValueRecordTest, StartsAsItsDefaultAndUnset) {
  Session session;
  session.m_Records[Id_Int].value.integer = 99;
  session.m_Records[Id_Int].lastSet = 99;
  EXPECT_EQ(session.parser().getInteger(Id_Int), -1);
  EXPECT_EQ(session.parser().getEnumerator(Id_Enum), 1u);
  EXPECT_EQ(session.parser().getTexts(Id_StringVector), nullptr);
  EXPECT_FALSE(session.parser().isSet(Id_Int));
  EXPECT_TRUE(session.parser().isDefault(Id_Int));
}

TEST(ValueRecordTest, OfAListIsItsDefaultWhereAllElementsAre) {
  const alloclib::RegionOwner region = makeRegion();
  const auto list = [&region](std::initializer_list<int> numbers) {
    auto* numbersOfList = alloclib::create<IntegerList>(*region, *region);
    for (const int number : numbers)
      numbersOfList->append(number);
    return numbersOfList;
  };
  Session session;
  session.m_Definitions[Id_IntVector].defaultValue.integers = list({1, 2});
  const Parser& parser = session.parser();
  const auto isDefault = [&](IntegerList* value) {
    session.m_Records[Id_IntVector].value.integers = value;
    return parser.isDefault(Id_IntVector);
  };
  EXPECT_TRUE(isDefault(list({1, 2})));
  EXPECT_FALSE(isDefault(list({1})));
  EXPECT_FALSE(isDefault(list({1, 3})));
  EXPECT_FALSE(isDefault(list({1, 2, 3})));
  EXPECT_FALSE(isDefault(nullptr));
}

TEST(ValueRecordTest, CountsTheFirstAndTheLastTimeItWasSet) {
  Session session;
  session.parse({"--int=1", "-x", "--int=2"});
  EXPECT_EQ(session.parser().getRecord(Id_Int).firstSet, 1u);
  EXPECT_EQ(session.parser().getRecord(Id_Int).lastSet, 3u);
  EXPECT_EQ(session.parser().getRecord(Id_Boolean).firstSet, 2u);
  EXPECT_EQ(session.parser().getRecord(Id_Boolean).lastSet, 2u);
  EXPECT_EQ(session.parser().getSetCounter(), 3u);
}

TEST(ValueRecordTest, StaysUnsetWhenTheStoreFails) {
  Session session;
  session.parse({"--int=x"});
  EXPECT_FALSE(session.parser().isSet(Id_Int));
  EXPECT_EQ(session.parser().getSetCounter(), 0u);
}

TEST(ValueRecordTest, CountsAsSetWhenTheListenerTookTheValue) {
  Session session;
  session.m_Listener.m_Answer = [](Parser&, uint32_t id, const Value&) { return id == Id_Int; };
  session.parse({"--int=5", "--text=t"});
  EXPECT_EQ(session.parser().getInteger(Id_Int), -1);
  EXPECT_TRUE(session.parser().isSet(Id_Int));
  EXPECT_STREQ(session.parser().getText(Id_String), "t");
  EXPECT_THAT(session.m_Listener.m_Lines, ElementsAre("5=5", "8=t"));
}

TEST(ValueRecordTest, IsRefusedByItsValidator) {
  Session session;
  session.m_Records[Id_String].validator = [](const Parser&, uint32_t, const Value&) {
    return false;
  };
  session.parse({"--text=t"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument 't' not permitted for option 'text'."));
  EXPECT_THAT(session.m_Listener.m_Lines, IsEmpty());
}

TEST(BooleanOption, TakesTheRowsValueWhateverTheText) {
  Session session;
  session.parse({"--bool", "false"});
  EXPECT_EQ(session.parser().getRecord(Id_Boolean).value.integer, 1);
  EXPECT_TRUE(session.parser().getBoolean(Id_Boolean));
}

TEST(StringOption, TakesItsImpliedValue) {
  Session session;
  session.parse({"--text_x"});
  EXPECT_STREQ(session.parser().getText(Id_String), "x");
}

TEST(StringOption, PointsIntoTheCommandLine) {
  Session session;
  const char word[] = "--text=abc";
  session.parser().parseWord(word, nullptr);
  EXPECT_EQ(session.parser().getText(Id_String), word + 7);
}

TEST(BadType, IsNeverStored) {
  Session session;
  session.parse({"--bad=1"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument '1' not permitted for option 'bad'."));
}

TEST(DefaultOfAValue, MayBeNone) {
  Session session;
  EXPECT_EQ(session.parser().getAddress(Id_Address64), 0u);
}

TEST(DefaultOfAValue, IsTheFirstUsableNode) {
  static constexpr uint32_t Both[] = {1, 2, 0};
  const DefaultNode last{nullptr, {.integer = 30}, nullptr};
  const DefaultNode middle{ExpertMask, {.integer = 20}, &last};
  const DefaultNode head{Both, {.integer = 10}, &middle};
  const auto defaultUnder = [&](uint32_t tableMask) {
    Session session;
    session.m_Table.restrictionMask = tableMask;
    session.m_Definitions[Id_Int].defaultKind = Default_List;
    session.m_Definitions[Id_Int].defaultValue.defaults = &head;
    return session.parser().getInteger(Id_Int);
  };
  EXPECT_EQ(defaultUnder(3), 10);
  EXPECT_EQ(defaultUnder(2), 20);
  EXPECT_EQ(defaultUnder(1), 30);
}

TEST(DefaultOfAValue, IsNoneWithoutAUsableNode) {
  const DefaultNode node{ExpertMask, {.text = "x"}, nullptr};
  Session session;
  session.m_Table.restrictionMask = 1;
  session.m_Definitions[Id_String].defaultKind = Default_List;
  session.m_Definitions[Id_String].defaultValue.defaults = &node;
  EXPECT_EQ(session.parser().getText(Id_String), nullptr);
}

TEST(DefaultOfAValue, MayBeComputed) {
  Session session;
  session.m_Definitions[Id_Int].defaultKind = Default_Computed;
  session.m_Definitions[Id_String].defaultKind = Default_Computed;
  session.m_Records[Id_Int].defaultCallBack = [](const Parser&, uint32_t id) {
    return Value{.integer = 100 + id};
  };
  EXPECT_EQ(session.parser().getInteger(Id_Int), 100 + static_cast<int>(Id_Int));
  EXPECT_EQ(session.parser().getText(Id_String), nullptr);
  session.parse({"--int=105"});
  EXPECT_TRUE(session.parser().isDefault(Id_Int));
}

TEST(Release, EmptiesVectorsAndLeavesOtherValues) {
  Session session;
  session.m_Files.m_Contents["f"] = "--texts=b --text=c";
  session.parse({"--texts=a", "--many=1", "--long=2", "--int=3", "--via=f"});
  session.parser().releaseValues();
  EXPECT_THAT(session.texts(Id_StringVector), IsEmpty());
  EXPECT_THAT(session.texts(Id_Via), IsEmpty());
  EXPECT_THAT(session.numbers(Id_IntVector), IsEmpty());
  EXPECT_THAT(session.numbers(Id_Int64Vector), IsEmpty());
  EXPECT_EQ(session.parser().getInteger(Id_Int), 3);
  EXPECT_STREQ(session.parser().getText(Id_String), "c");
}

} // namespace tabledrivenparser::types
