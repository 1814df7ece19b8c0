// SPDX-License-Identifier: Apache-2.0
//
// Numbers in arguments: which texts are numbers, decimal and hexadecimal, with signs and white
// space; which are none; and that what doesn't fit its type is an overflow and never cut.

#include "type_table.h"

namespace tabledrivenparser::types {

using testing::ElementsAre;
using testing::IsEmpty;

struct GoodNumber {
  const char* text;
  int64_t value;
};

class GoodInt : public testing::TestWithParam<GoodNumber> {};

TEST_P(GoodInt, IsStored) {
  Session session;
  session.parse({"--int", GetParam().text});
  EXPECT_EQ(session.parser().getInteger(Id_Int), GetParam().value);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(
    Number, GoodInt,
    testing::Values(GoodNumber{"0", 0}, GoodNumber{"100", 100}, GoodNumber{"0x100", 256},
                    GoodNumber{"0XfF", 255}, GoodNumber{"010", 10}, GoodNumber{"+5", 5},
                    GoodNumber{"-5", -5}, GoodNumber{" \t\n\v\f\r7", 7}, GoodNumber{"0x-5", -5},
                    GoodNumber{"2147483647", 2147483647}, GoodNumber{"-2147483648", -2147483648LL},
                    GoodNumber{"0x7FFFFFFF", 2147483647}, GoodNumber{"0x-80000000", -2147483648LL},
                    GoodNumber{"00000000000000000000000000007", 7}));

class BadInt : public testing::TestWithParam<const char*> {};

TEST_P(BadInt, IsNotPermitted) {
  Session session;
  session.parse({"--int", GetParam()});
  EXPECT_THAT(session.getReports(), ElementsAre(std::string("fatal: Argument '") + GetParam() +
                                                "' not permitted for option 'int'."));
  EXPECT_EQ(session.parser().getInteger(Id_Int), -1);
}

INSTANTIATE_TEST_SUITE_P(Number, BadInt,
                         testing::Values("", "abc", "0x", "0xg", "-", "+", "- 5", "-+5", "5 ", "5x",
                                         "1,2", "-0x5", " 0x5", "\xe9", "%d"));

class TooLargeInt : public testing::TestWithParam<const char*> {};

TEST_P(TooLargeInt, IsAnOverflow) {
  Session session;
  session.parse({"--int", GetParam()});
  EXPECT_THAT(session.getReports(), ElementsAre(std::string("fatal: Overflow: '") + GetParam() +
                                                "' will not fit in an integer."));
}

INSTANTIATE_TEST_SUITE_P(Number, TooLargeInt,
                         testing::Values("2147483648", "-2147483649", "5000000000", "0xFFFFFFFF",
                                         "99999999999999999999999999", "5000000000x"));

TEST(Address, IsUnsignedAnd32BitsWide) {
  Session session;
  session.parse({"--addr", "4294967295"});
  EXPECT_EQ(session.parser().getAddress(Id_Address), 0xFFFFFFFFu);
  session.parse({"--addr=-1"});
  EXPECT_EQ(session.parser().getAddress(Id_Address), 0xFFFFFFFFu);
  session.parse({"--addr=-0x1"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument '-0x1' not permitted for option 'addr'."));
}

TEST(Address, OverflowsBeyond32Bits) {
  Session session;
  session.parse({"--addr=0x100000000"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Overflow: '0x100000000' will not fit in an integer."));
}

TEST(Address, TakesItsImpliedValue) {
  Session session;
  session.parse({"--address"});
  EXPECT_EQ(session.parser().getAddress(Id_Address), 0xABCDEFu);
  session.parse({"--address=0x1F"});
  EXPECT_EQ(session.parser().getAddress(Id_Address), 0x1Fu);
}

TEST(Address64, Is64BitsWide) {
  Session session;
  session.parse({"--add64=0xFFFFFFFFFFFFFFFF"});
  EXPECT_EQ(session.parser().getAddress(Id_Address64), 0xFFFFFFFFFFFFFFFFu);
  session.parse({"--add64=18446744073709551616"});
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Overflow: '18446744073709551616' will not fit in an integer."));
}

TEST(ImpliedInt, IsStoredAsItStands) {
  Session session;
  session.parse({"--int1"});
  EXPECT_EQ(session.parser().getInteger(Id_Int), 1);
}

} // namespace tabledrivenparser::types
