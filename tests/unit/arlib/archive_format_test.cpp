// SPDX-License-Identifier: Apache-2.0
//
// Numbers and headers of the file format, both ways. Fields are texts that anybody may have
// written: blanks, missing digits, digits beyond the base and numbers beyond 32 bits must come to
// the stated answer and never to a wrapped number.

#include "arlib/interface/archive_format.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace arlib {

namespace {

// The value, or "none".
std::string parsed(std::string_view text, uint32_t base) {
  uint32_t value = 99;
  const bool isGood = parseHeaderNumber(text, base, static_cast<uint32_t>(text.size()), value);
  return isGood ? std::to_string(value) : "none";
}

std::string header(std::string_view name, const MemberHeaderNumbers& numbers) {
  std::array<uint8_t, MemberHeaderSize> bytes;
  bytes.fill('?');
  putMemberHeader(bytes, name, numbers);
  return {bytes.begin(), bytes.end()};
}

} // namespace

TEST(HeaderNumber, FillsItsFieldWithBlanksDigitsAndBlanks) {
  EXPECT_EQ(parsed("123   ", 10), "123");
  EXPECT_EQ(parsed("   123", 10), "123");
  EXPECT_EQ(parsed(" 12 ", 10), "12");
  EXPECT_EQ(parsed("123456", 10), "123456");
  EXPECT_EQ(parsed("000123", 10), "123");
  EXPECT_EQ(parsed("100644  ", 8), "33188");
}

TEST(HeaderNumber, NeedsADigit) {
  EXPECT_EQ(parsed("      ", 10), "none");
  EXPECT_EQ(parsed("", 10), "none");
  EXPECT_EQ(parsed("x     ", 10), "none");
  EXPECT_EQ(parsed("-1    ", 10), "none");
  EXPECT_EQ(parsed("+1    ", 10), "none");
  EXPECT_EQ(parsed("\t1    ", 10), "none");
}

TEST(HeaderNumber, EndsWithBlanksAlone) {
  EXPECT_EQ(parsed("1 2   ", 10), "none");
  EXPECT_EQ(parsed("12x   ", 10), "none");
  EXPECT_EQ(parsed("12\t   ", 10), "none");
  EXPECT_EQ(parsed(std::string_view("12\0   ", 6), 10), "none");
  EXPECT_EQ(parsed(std::string_view("12   \0", 6), 10), "none");
}

// The digit is not one of the base, so it doesn't count; but it has been stepped over.
TEST(HeaderNumber, IsEndedByADigitBeyondItsBase) {
  EXPECT_EQ(parsed("1238    ", 8), std::to_string(0123));
  EXPECT_EQ(parsed("9       ", 8), "0");
  EXPECT_EQ(parsed("08  ", 8), "0");
  EXPECT_EQ(parsed("12389   ", 8), "none");
  EXPECT_EQ(parsed("12381   ", 8), "none");
}

TEST(HeaderNumber, HasThirtyTwoBits) {
  EXPECT_EQ(parsed("4294967295", 10), "4294967295");
  EXPECT_EQ(parsed("4294967296", 10), "none");
  EXPECT_EQ(parsed("9999999999", 10), "none");
  EXPECT_EQ(parsed("37777777777 ", 8), "4294967295");
  EXPECT_EQ(parsed("40000000000 ", 8), "none");
}

TEST(HeaderNumber, IsZeroAtFirstAndKeepsWhatWasReadWhenItFails) {
  uint32_t value = 99;
  EXPECT_FALSE(parseHeaderNumber("x     ", 10, 6, value));
  EXPECT_EQ(value, 0u);
  EXPECT_FALSE(parseHeaderNumber("12x   ", 10, 6, value));
  EXPECT_EQ(value, 12u);
}

TEST(HeaderNumber, MustBeAsWideAsItsField) {
  uint32_t value = 0;
  EXPECT_FALSE(parseHeaderNumber("123", 10, 6, value));
  EXPECT_TRUE(parseHeaderNumber("123", 10, 3, value));
}

TEST(MemberHeader, IsLeftJustifiedTextInFixedFields) {
  EXPECT_EQ(header("a.o/", {1000000000, 12, 34, 0100644, 56}),
            "a.o/            1000000000  12    34    100644  56        `\n");
  EXPECT_EQ(header("/", {}), "/               0           0     0     0       0         `\n");
}

TEST(MemberHeader, CutsWhatHasTooManyDigits) {
  EXPECT_EQ(header("n/", {4294967295, 4294967295, 1234567, 037777777777, 4294967295}),
            "n/              4294967295  42949612345637777777"
            "4294967295`\n");
}

TEST(MemberHeader, CutsANameToItsField) {
  EXPECT_EQ(header("exactly_15_char/", {}).substr(0, 16), "exactly_15_char/");
  EXPECT_EQ(header("more_than_16_characters/", {}).substr(0, 17), "more_than_16_cha0");
}

TEST(HeaderOffset, IsAlwaysEven) {
  EXPECT_EQ(nextHeaderOffset(8, 0), 68u);
  EXPECT_EQ(nextHeaderOffset(8, 1), 70u);
  EXPECT_EQ(nextHeaderOffset(8, 2), 70u);
  EXPECT_EQ(nextHeaderOffset(8, 0xFFFFFFFF), 0x100000044u);
}

TEST(BigEndian, PutsTheHighByteFirst) {
  std::array<uint8_t, 4> bytes;
  putBigEndian32(bytes.data(), 0x01A2B3F4);
  EXPECT_EQ(bytes, (std::array<uint8_t, 4>{0x01, 0xA2, 0xB3, 0xF4}));
  EXPECT_EQ(getBigEndian32(bytes.data()), 0x01A2B3F4u);
}

} // namespace arlib
