// SPDX-License-Identifier: Apache-2.0
//
// The hashes, which decide the order of an export, and the text key with its stored hash. Exact
// values are held: they must be the same on every machine.

#include "elfext/interface/hash_functions.h"

#include "elfext/interface/stringlett.h"

#include <gtest/gtest.h>

#include <string>

namespace elfext {
namespace {

static_assert(hashText("") == 0);
static_assert(hashText("a") == 97);
static_assert(hashText("ab") == 97 * 31 + 98);
static_assert(hashText("Aa") == hashText("BB"));

static_assert(hashInteger(uint32_t{0xFFFFFFFF}) == 0xFFFFFFFF);
static_assert(hashInteger(uint64_t{0x12345678'0000FFFF}) == 0x1234A987);

template <class Key>
uint32_t hashOf(const Key& key) {
  return hashKey(&key);
}

TEST(HashTest, OfATextTakesItsBytesAsUnsigned) {
  EXPECT_EQ(hashText("\xff"), 255u);
  EXPECT_EQ(hashText("\x80\xff"), 128u * 31 + 255);
}

TEST(HashTest, OfATextWrapsAt32Bits) {
  uint64_t exact = 0;
  const std::string text = "a name that is long enough to wrap";
  for (char character : text)
    exact = (exact * 31 + static_cast<unsigned char>(character)) % (uint64_t{1} << 32);
  EXPECT_EQ(hashText(text), exact);
}

TEST(HashTest, OfATextCountsNulBytes) {
  EXPECT_EQ(hashText(std::string_view("a\0", 2)), 97u * 31);
  EXPECT_EQ(hashOf(std::string_view("ab")), hashText("ab"));
}

TEST(HashTest, OfAPointerIsItsLow32BitsWithoutTheLowestFour) {
  const auto* pointer = reinterpret_cast<const int*>(uintptr_t{0x7FFF'1234'5670});
  EXPECT_EQ(hashOf(pointer), 0xF1234567u & 0x0FFFFFFFu);
}

TEST(HashTest, OfAnIntegerOf32BitsIsTheInteger) {
  EXPECT_EQ(hashOf(uint32_t{17}), 17u);
  EXPECT_EQ(hashOf(int32_t{-1}), 0xFFFFFFFFu);
}

TEST(HashTest, OfAnIntegerOf64BitsFoldsItsHalves) {
  EXPECT_EQ(hashOf(uint64_t{0x00000001'00000002}), 3u);
  EXPECT_EQ(hashOf(int64_t{-1}), 0u);
}

TEST(StringlettTest, StoresTheHashOfItsText) {
  EXPECT_EQ(Stringlett("ab").getHash(), hashText("ab"));
  EXPECT_EQ(Stringlett("").getHash(), 0u);
  EXPECT_EQ(Stringlett(nullptr).getHash(), 0u);
  EXPECT_EQ(hashOf(Stringlett("ab")), hashText("ab"));
}

TEST(StringlettTest, EndsAtTheTerminator) {
  EXPECT_EQ(Stringlett("ab\0c").getHash(), hashText("ab"));
}

TEST(StringlettTest, KeepsThePointerItWasGiven) {
  const char* text = "text";
  EXPECT_EQ(Stringlett(text).getText(), text);
}

TEST(StringlettTest, IsEqualByItsBytes) {
  const std::string copy = "text";
  EXPECT_TRUE(Stringlett("text") == Stringlett(copy.c_str()));
  EXPECT_FALSE(Stringlett("text") == Stringlett("Text"));
  EXPECT_FALSE(Stringlett("Aa") == Stringlett("BB"));
}

TEST(StringlettTest, IsEqualToAnotherWithoutText) {
  EXPECT_TRUE(Stringlett(nullptr) == Stringlett(nullptr));
  EXPECT_FALSE(Stringlett(nullptr) == Stringlett(""));
  EXPECT_FALSE(Stringlett("") == Stringlett(nullptr));
}

} // namespace
} // namespace elfext
