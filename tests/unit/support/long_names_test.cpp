// SPDX-License-Identifier: Apache-2.0
//
// Names of just under and just over the limit, which is what decides; and all kinds of beginnings,
// since a name that is resolved against the wrong folder is another file's.

#include "support/interface/long_names.h"

#include <gtest/gtest.h>

namespace support {

namespace {

constexpr std::string_view Here = "C:\\work\\now";

// So many times "x\..\", which leads nowhere.
std::string detours(size_t count) {
  std::string text;
  for (size_t i = 0; i < count; ++i)
    text += "x\\..\\";
  return text;
}

std::string shortened(const std::string& name) {
  return shortenLongName(name, Here);
}

} // namespace

TEST(LongNames, AreThoseOf260Characters) {
  const std::string longest = detours(51) + "a.o1"; // 259
  EXPECT_EQ(shortened(longest), longest);
  EXPECT_EQ(shortened(longest + "2"), "C:\\work\\now\\a.o12");
}

TEST(LongNames, CountUnitsOfUtf16) {
  std::string twoBytes;
  for (int i = 0; i < 200; ++i)
    twoBytes += "\u00e9";
  const std::string below = detours(11) + twoBytes + "1234";
  EXPECT_EQ(shortened(below), below);
  EXPECT_EQ(shortened(below + "5"), "C:\\work\\now\\" + twoBytes + "12345");
  std::string pairs;
  for (int i = 0; i < 100; ++i)
    pairs += "\U0001F600";
  EXPECT_EQ(shortened(detours(12) + pairs), "C:\\work\\now\\" + pairs);
}

TEST(LongNames, AreResolvedFromTheirDrive) {
  EXPECT_EQ(shortened("D:\\lib\\" + detours(60) + ".\\a.o"), "D:\\lib\\a.o");
  EXPECT_EQ(shortened("d:/lib/" + detours(60) + "./a.o"), "d:\\lib\\a.o");
}

TEST(LongNames, AreResolvedFromTheirShare) {
  EXPECT_EQ(shortened("\\\\server\\share\\" + detours(60) + "a.o"), "\\\\server\\share\\a.o");
}

TEST(LongNames, AreResolvedFromTheCurrentFolderAndDrive) {
  EXPECT_EQ(shortened("..\\" + detours(60) + "a.o"), "C:\\work\\a.o");
  EXPECT_EQ(shortened("\\" + detours(60) + "a.o"), "C:\\a.o");
}

TEST(LongNames, DoNotClimbAboveTheRoot) {
  EXPECT_EQ(shortened("..\\..\\..\\..\\" + detours(60) + "a.o"), "C:\\a.o");
  EXPECT_EQ(shortened("\\\\server\\share\\..\\..\\" + detours(60) + "a.o"),
            "\\\\server\\share\\a.o");
}

TEST(LongNames, StayWhereResolvingDoesNotShorten) {
  const std::string plain(300, 'a');
  EXPECT_EQ(shortened(plain), plain);
  const std::string oneDot = ".\\" + plain;
  EXPECT_EQ(shortened(oneDot), oneDot);
}

TEST(LongNames, StayWhereTheHostResolvesDifferently) {
  const std::string verbatim = "\\\\?\\C:\\" + detours(60) + "a.o";
  EXPECT_EQ(shortened(verbatim), verbatim);
  const std::string device = "\\\\.\\C:\\" + detours(60) + "a.o";
  EXPECT_EQ(shortened(device), device);
  const std::string driveAlone = "D:" + detours(60) + "a.o";
  EXPECT_EQ(shortened(driveAlone), driveAlone);
}

} // namespace support
