// SPDX-License-Identifier: Apache-2.0
//
// Objects and texts in regions: made from their arguments, aligned for their type, and with a NUL
// behind a text whatever it holds.

#include "alloclib/interface/region_objects.h"

#include "region_fixture.h"

namespace alloclib {
namespace {

struct Point {
  Point(int x, std::string_view text) : m_X(x), m_Text(text) {}
  int m_X;
  std::string_view m_Text;
};

struct alignas(64) Line {
  char bytes[64];
};

class RegionObjectsTest : public RegionTest {
protected:
  void SetUp() override {
    RegionTest::SetUp();
    region.reset(RegionGeneral::Create(0, "objects"));
  }
  void TearDown() override {
    region.reset();
    RegionTest::TearDown();
  }

  RegionOwner region;
};

TEST_F(RegionObjectsTest, AnObjectIsMadeFromItsArguments) {
  Point* point = create<Point>(*region, 3, "three");
  EXPECT_EQ(point->m_X, 3);
  EXPECT_EQ(point->m_Text, "three");
}

TEST_F(RegionObjectsTest, AnObjectIsAlignedForItsType) {
  static_cast<void>(create<char>(*region, 'x'));
  EXPECT_EQ(reinterpret_cast<uintptr_t>(create<Line>(*region)) % 64, 0u);
}

TEST_F(RegionObjectsTest, ACopiedTextEndsWithNul) {
  const std::string_view whole = "abcdef";
  const char* copy = copyString(*region, whole.substr(1, 3));
  EXPECT_STREQ(copy, "bcd");
  EXPECT_NE(copy, whole.data() + 1);
}

TEST_F(RegionObjectsTest, AnEmptyTextHasACopyToo) {
  EXPECT_STREQ(copyString(*region, {}), "");
}

TEST_F(RegionObjectsTest, ATextKeepsItsOwnNuls) {
  const std::string_view text("a\0b", 3);
  EXPECT_EQ(std::string_view(copyString(*region, text), 4), std::string_view("a\0b", 4));
}

} // namespace
} // namespace alloclib
