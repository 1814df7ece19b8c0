// SPDX-License-Identifier: Apache-2.0
//
// What an option accepts beyond its type: ranges and patterns, restricted or not, for single
// values, elements of lists and implied values; and that the order is constraint, validator,
// listener.

#include "type_table.h"

namespace tabledrivenparser::types {

using testing::ElementsAre;

constexpr uint32_t First[] = {1, 0};
constexpr uint32_t Second[] = {2, 0};
constexpr IntegerRange SmallRanges[] = {{1, 9}, {-20, -10}, {1, 0}};
constexpr IntegerRange Hundreds[] = {{100, 199}, {1, 0}};
constexpr IntegerRange UpperHalf[] = {{INT64_MIN, -1}, {1, 0}};

bool accepts(const IntegerConstraintNode& node, ValueType type, const char* text,
             uint32_t tableMask = 0xFFFFFFFF) {
  Session session;
  session.m_Table.restrictionMask = tableMask;
  session.m_Definitions[Id_Int].type = type;
  session.m_Definitions[Id_Int].constraint.integers = &node;
  session.parse({"--int", text});
  return session.getReports().empty();
}

bool accepts(const char* pattern, const char* text) {
  const StringConstraintNode node{nullptr, pattern, nullptr};
  Session session;
  session.m_Definitions[Id_String].constraint.strings = &node;
  session.parse({"--text", text});
  return session.getReports().empty();
}

TEST(IntegerConstraint, TakesBothEndsOfEachRange) {
  const IntegerConstraintNode node{nullptr, SmallRanges, nullptr};
  for (const char* text : {"1", "9", "-20", "-10", "5"}) {
    EXPECT_TRUE(accepts(node, Type_Int, text)) << text;
  }
  for (const char* text : {"0", "10", "-21", "-9"}) {
    EXPECT_FALSE(accepts(node, Type_Int, text)) << text;
  }
}

TEST(IntegerConstraint, TakesRangesOfAddressesAsUnsigned) {
  const IntegerConstraintNode node{nullptr, UpperHalf, nullptr};
  EXPECT_TRUE(accepts(node, Type_Address64, "0x8000000000000000"));
  EXPECT_TRUE(accepts(node, Type_Address64, "0xFFFFFFFFFFFFFFFF"));
  EXPECT_FALSE(accepts(node, Type_Address64, "0x7FFFFFFFFFFFFFFF"));
  const IntegerConstraintNode small{nullptr, Hundreds, nullptr};
  EXPECT_TRUE(accepts(small, Type_Address, "150"));
  EXPECT_FALSE(accepts(small, Type_Address, "0xFFFFFFFF"));
}

TEST(IntegerConstraint, PassesIfAnyUsableNodeDoes) {
  const IntegerConstraintNode rest{Second, Hundreds, nullptr};
  const IntegerConstraintNode node{First, SmallRanges, &rest};
  EXPECT_TRUE(accepts(node, Type_Int, "5", 1));
  EXPECT_FALSE(accepts(node, Type_Int, "150", 1));
  EXPECT_FALSE(accepts(node, Type_Int, "5", 2));
  EXPECT_TRUE(accepts(node, Type_Int, "150", 2));
  EXPECT_TRUE(accepts(node, Type_Int, "150", 3));
  EXPECT_FALSE(accepts(node, Type_Int, "50", 3));
}

TEST(IntegerConstraint, PassesEverythingWithoutAUsableNode) {
  const IntegerConstraintNode node{First, SmallRanges, nullptr};
  EXPECT_TRUE(accepts(node, Type_Int, "50", 4));
}

TEST(IntegerConstraint, HoldsForEachElementOfAVector) {
  const IntegerConstraintNode node{nullptr, SmallRanges, nullptr};
  Session session;
  session.m_Definitions[Id_IntVector].constraint.integers = &node;
  session.m_Definitions[Id_Int64Vector].constraint.integers = &node;
  session.parse({"--long=1:2", "--many=1,10,2"});
  EXPECT_THAT(session.numbers(Id_Int64Vector), ElementsAre(1, 2));
  EXPECT_THAT(session.numbers(Id_IntVector), ElementsAre(1));
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument '1,10,2' not permitted for option 'many'."));
}

TEST(IntegerConstraint, HoldsForImpliedValuesToo) {
  const IntegerConstraintNode node{nullptr, Hundreds, nullptr};
  Session session;
  session.m_Definitions[Id_Int].constraint.integers = &node;
  session.parse({"--int1"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument '' not permitted for option 'int1'."));
}

TEST(StringConstraint, ComparesWholeAlternatives) {
  EXPECT_TRUE(accepts("one|two", "one"));
  EXPECT_TRUE(accepts("one|two", "TWO"));
  EXPECT_FALSE(accepts("one|two", "on"));
  EXPECT_FALSE(accepts("one|two", "ones"));
  EXPECT_FALSE(accepts("one|two", "one|two"));
  EXPECT_FALSE(accepts("one|two", ""));
  EXPECT_TRUE(accepts("one||two", ""));
}

TEST(StringConstraint, MindsCaseBehindAC) {
  EXPECT_TRUE(accepts("COne|two", "One"));
  EXPECT_FALSE(accepts("COne|two", "one"));
  EXPECT_FALSE(accepts("COne|two", "COne"));
  EXPECT_TRUE(accepts("COne|two", "Two"));
}

TEST(StringConstraint, TakesWhateverIsLeftAtAStar) {
  EXPECT_TRUE(accepts("lib*|x", "lib"));
  EXPECT_TRUE(accepts("lib*|x", "LIB.a"));
  EXPECT_FALSE(accepts("lib*|x", "li"));
  EXPECT_FALSE(accepts("Clib*", "Lib"));
  EXPECT_TRUE(accepts("*", ""));
}

TEST(StringConstraint, HoldsForEachElementOfAVector) {
  const StringConstraintNode node{nullptr, "a*", nullptr};
  Session session;
  session.m_Definitions[Id_StringVector].constraint.strings = &node;
  session.parse({"--texts=a1,b1"});
  EXPECT_THAT(session.texts(Id_StringVector), ElementsAre("a1"));
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument 'a1,b1' not permitted for option 'texts'."));
}

TEST(StringConstraint, ChainsItsNodes) {
  const StringConstraintNode rest{Second, "b", nullptr};
  const StringConstraintNode node{First, "a", &rest};
  Session session;
  session.m_Table.restrictionMask = 2;
  session.m_Definitions[Id_String].constraint.strings = &node;
  session.parse({"--text=b", "--text=a"});
  EXPECT_STREQ(session.parser().getText(Id_String), "b");
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument 'a' not permitted for option 'text'."));
}

TEST(ValueOrder, IsConstraintThenValidatorThenListener) {
  static Lines calls;
  calls.clear();
  const IntegerConstraintNode node{nullptr, SmallRanges, nullptr};
  Session session;
  session.m_Definitions[Id_IntVector].constraint.integers = &node;
  session.m_Records[Id_IntVector].validator = [](const Parser&, uint32_t id, const Value& value) {
    calls.push_back("validator " + std::to_string(id) + "=" + std::to_string(value.integer));
    return value.integer != 2;
  };
  session.m_Listener.m_Answer = [](Parser& parser, uint32_t, const Value& value) {
    calls.push_back("listener " + std::to_string(value.integer));
    EXPECT_EQ(parser.getIntegers(Id_IntVector), nullptr);
    return false;
  };
  session.parse({"--many=1,2"});
  EXPECT_THAT(calls, ElementsAre("validator 6=1", "listener 1", "validator 6=2"));
  Session refused;
  refused.m_Definitions[Id_IntVector].constraint.integers = &node;
  refused.m_Records = session.m_Records;
  calls.clear();
  refused.parse({"--many=50"});
  EXPECT_THAT(calls, ElementsAre());
}

} // namespace tabledrivenparser::types
