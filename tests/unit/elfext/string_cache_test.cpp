// SPDX-License-Identifier: Apache-2.0
//
// Interned texts: equal texts have one pointer, which stays where it is while the cache grows, and
// texts that only share a hash are told apart.

#include "elfext/interface/string_cache.h"

#include "counting_region.h"

#include <set>
#include <string>
#include <vector>

namespace elfext {
namespace {

TEST(StringCacheTest, YieldsTheSamePointerForEqualTexts) {
  StringCache cache;
  const std::string first = "text";
  const std::string second = "text";
  const char* cached = cache.lookup(first.c_str());
  EXPECT_STREQ(cached, "text");
  EXPECT_EQ(cache.lookup(second.c_str()), cached);
  EXPECT_EQ(cache.lookup(cached), cached);
}

TEST(StringCacheTest, YieldsItsOwnCopy) {
  StringCache cache;
  std::string text = "text";
  const char* cached = cache.lookup(text.c_str());
  EXPECT_NE(cached, text.c_str());
  text[0] = 'T';
  EXPECT_STREQ(cached, "text");
  EXPECT_EQ(cache.lookup("text"), cached);
}

TEST(StringCacheTest, TellsTextsOfOneHashApart) {
  StringCache cache;
  EXPECT_NE(cache.lookup("Aa"), cache.lookup("BB"));
  EXPECT_STREQ(cache.lookup("Aa"), "Aa");
  EXPECT_STREQ(cache.lookup("BB"), "BB");
}

TEST(StringCacheTest, KnowsTheEmptyText) {
  StringCache cache;
  const char* cached = cache.lookup("");
  EXPECT_STREQ(cached, "");
  EXPECT_EQ(cache.lookup(""), cached);
}

TEST(StringCacheTest, KeepsItsPointersWhileItGrows) {
  StringCache cache;
  std::vector<const char*> cached;
  for (int number = 0; number < 1000; ++number)
    cached.push_back(cache.lookup(std::to_string(number).c_str()));
  EXPECT_EQ(std::set<const char*>(cached.begin(), cached.end()).size(), 1000u);
  for (size_t number = 0; number < 1000; ++number) {
    ASSERT_EQ(cache.lookup(std::to_string(number).c_str()), cached[number]);
    ASSERT_EQ(cached[number], std::to_string(number));
  }
}

TEST(StringCacheTest, MustBeGivenAText) {
  StringCache cache;
  EXPECT_FAILED_ASSERTION((void)cache.lookup(nullptr), "s != NULL");
}

} // namespace
} // namespace elfext
