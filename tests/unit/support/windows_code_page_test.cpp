// SPDX-License-Identifier: Apache-2.0
//
// From the bytes of a page to what a console takes.

#include "support/src/windows_code_page.h"

#include <gtest/gtest.h>

namespace support {

TEST(WideFromPage, IsUtf16) {
  EXPECT_EQ(wideFromPage(932, "\x83\x41 \x95\x5c"), L"\u30a2 \u8868");
  EXPECT_EQ(wideFromPage(1252, "caf\xe9\n"), L"caf\u00e9\n");
  EXPECT_EQ(wideFromPage(65001, "\u30a2\U0001F600"), L"\u30a2\xd83d\xde00");
}

TEST(WideFromPage, IsEmptyForNothing) {
  EXPECT_EQ(wideFromPage(932, ""), L"");
}

TEST(WideFromPage, HasAPlaceForAMalformedByte) {
  EXPECT_EQ(wideFromPage(65001, "a\xff"
                                "b"),
            L"a\ufffd"
            L"b");
}

} // namespace support
