// SPDX-License-Identifier: Apache-2.0
//
// What both families' arrays promise: growth, insertion of an element of their own while they grow,
// removal, sorting; and against a plain list under random editing with a fixed seed. A position
// outside is an assertion.

#include "elfext/interface/array.h"

#include "counting_region.h"
#include "elfext/interface/fast_array.h"

#include <cstdint>
#include <random>
#include <vector>

namespace elfext {
namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;
using testing::IsEmpty;

template <class IntArray>
class ArrayTest : public testing::Test {
protected:
  void appendAll(std::initializer_list<int> values) {
    for (int value : values)
      m_Array.append(value);
  }

  CountingRegion m_Region;
  IntArray m_Array = makeContainer<IntArray>(m_Region);
};

using IntArrays = testing::Types<Array<int>, FastArray<int>>;
TYPED_TEST_SUITE(ArrayTest, IntArrays);

TYPED_TEST(ArrayTest, StartsEmptyWithRoomForOne) {
  EXPECT_EQ(this->m_Array.getSize(), 0u);
  EXPECT_TRUE(this->m_Array.isEmpty());
  EXPECT_EQ(this->m_Array.getCapacity(), 1u);
  EXPECT_THAT(this->m_Array.getSpan(), IsEmpty());
}

TYPED_TEST(ArrayTest, GrowsByHalfAndOneWhenItIsFull) {
  std::vector<uint32_t> capacities;
  for (int value = 0; value < 100; ++value) {
    this->m_Array.append(value);
    const uint32_t capacity = this->m_Array.getCapacity();
    if (capacities.empty() || capacities.back() != capacity) capacities.push_back(capacity);
  }
  EXPECT_THAT(capacities, ElementsAre(1, 2, 4, 7, 11, 17, 26, 40, 61, 92, 139));
  for (uint32_t index = 0; index < 100; ++index)
    EXPECT_EQ(this->m_Array[index], static_cast<int>(index));
}

TYPED_TEST(ArrayTest, AppendsAnElementOfItsOwnWhileItGrows) {
  this->m_Array.append(5);
  for (int round = 0; round < 20; ++round)
    this->m_Array.append(this->m_Array[0]);
  EXPECT_THAT(this->m_Array.getSpan(), testing::Each(5));
}

TYPED_TEST(ArrayTest, AppendsManyAsIfOneByOne) {
  const std::vector<int> values{1, 2, 3, 4, 5};
  this->m_Array.append(0);
  this->m_Array.append(values.data(), 5);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(0, 1, 2, 3, 4, 5));
  EXPECT_EQ(this->m_Array.getCapacity(), 7u);
}

TYPED_TEST(ArrayTest, AppendsNothingForACountOfZero) {
  const int value = 1;
  this->m_Array.append(&value, 0);
  EXPECT_EQ(this->m_Array.getSize(), 0u);
}

TYPED_TEST(ArrayTest, InsertsInFrontOfAnElement) {
  this->appendAll({1, 2, 3});
  this->m_Array.insert(0, 10);
  this->m_Array.insert(2, 20);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(10, 1, 20, 2, 3));
}

TYPED_TEST(ArrayTest, InsertsBehindTheLastElement) {
  this->m_Array.insert(0, 1);
  this->m_Array.insert(1, 2);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 2));
}

TYPED_TEST(ArrayTest, InsertsAnElementOfItsOwn) {
  this->appendAll({1, 2, 3, 4});
  this->m_Array.insert(0, this->m_Array[3]);
  this->m_Array.insert(1, this->m_Array[2]);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(4, 2, 1, 2, 3, 4));
}

TYPED_TEST(ArrayTest, RemovesAndKeepsTheOrder) {
  this->appendAll({1, 2, 3, 4});
  this->m_Array.remove(1);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 3, 4));
  this->m_Array.remove(2);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 3));
  this->m_Array.remove(0);
  this->m_Array.remove(0);
  EXPECT_TRUE(this->m_Array.isEmpty());
}

TYPED_TEST(ArrayTest, RemovesTheFirstOfEqualValues) {
  this->appendAll({1, 2, 3, 2});
  this->m_Array.removeValue(2);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 3, 2));
}

TYPED_TEST(ArrayTest, RemovesNothingForAnAbsentValue) {
  this->appendAll({1, 2});
  this->m_Array.removeValue(3);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 2));
}

TYPED_TEST(ArrayTest, FindsWhatItContains) {
  EXPECT_FALSE(this->m_Array.contains(1));
  this->appendAll({1, 2});
  EXPECT_TRUE(this->m_Array.contains(1));
  EXPECT_TRUE(this->m_Array.contains(2));
  this->m_Array.remove(1);
  EXPECT_FALSE(this->m_Array.contains(2));
}

TYPED_TEST(ArrayTest, ExposesTheOldElementsWhenItShrinksAndGrowsInPlace) {
  this->appendAll({1, 2, 3});
  this->m_Array.setSize(1);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1));
  this->m_Array.setSize(3);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 2, 3));
  EXPECT_EQ(this->m_Array.getCapacity(), 4u);
}

TYPED_TEST(ArrayTest, ReservesBeforeItsSizeGrows) {
  this->appendAll({1, 2});
  this->m_Array.setSize(50);
  EXPECT_EQ(this->m_Array.getSize(), 50u);
  EXPECT_EQ(this->m_Array.getCapacity(), 50u);
  EXPECT_EQ(this->m_Array[0], 1);
  EXPECT_EQ(this->m_Array[1], 2);
}

TYPED_TEST(ArrayTest, TakesTheLargerOfRequestAndRule) {
  this->m_Array.reserve(11);
  EXPECT_EQ(this->m_Array.getCapacity(), 11u);
  this->m_Array.reserve(12);
  EXPECT_EQ(this->m_Array.getCapacity(), 17u);
  this->m_Array.reserve(26);
  EXPECT_EQ(this->m_Array.getCapacity(), 26u);
  this->m_Array.reserve(26);
  this->m_Array.reserve(0);
  EXPECT_EQ(this->m_Array.getCapacity(), 26u);
  EXPECT_EQ(this->m_Array.getSize(), 0u);
}

TYPED_TEST(ArrayTest, BecomesTheCopyOfAnother) {
  this->appendAll({1, 2, 3});
  TypeParam other = makeContainer<TypeParam>(this->m_Region);
  other.append(9);
  other.assign(this->m_Array);
  EXPECT_THAT(other.getSpan(), ElementsAre(1, 2, 3));
  other[0] = 7;
  EXPECT_EQ(this->m_Array[0], 1);
  this->m_Array.setSize(1);
  other.assign(this->m_Array);
  EXPECT_THAT(other.getSpan(), ElementsAre(1));
}

TYPED_TEST(ArrayTest, IsUnchangedByItself) {
  this->appendAll({1, 2, 3});
  this->m_Array.assign(this->m_Array);
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 2, 3));
}

TYPED_TEST(ArrayTest, SortsInPlace) {
  this->appendAll({3, 1, 2, 5, 4});
  this->m_Array.sort([](int left, int right) { return left < right; });
  EXPECT_THAT(this->m_Array.getSpan(), ElementsAre(1, 2, 3, 4, 5));
  EXPECT_EQ(this->m_Array.getCapacity(), 7u);
}

TYPED_TEST(ArrayTest, IsReadThroughAConstant) {
  this->appendAll({1, 2});
  const TypeParam& array = this->m_Array;
  EXPECT_EQ(array[1], 2);
  EXPECT_THAT(array.getSpan(), ElementsAre(1, 2));
  EXPECT_EQ(array.end() - array.begin(), 2);
}

TYPED_TEST(ArrayTest, BehavesAsAPlainListUnderRandomEditing) {
  std::mt19937 random(20240131);
  std::vector<int> model;
  for (int step = 0; step < 5000; ++step) {
    const int value = static_cast<int>(random() % 50);
    const auto size = static_cast<uint32_t>(model.size());
    switch (random() % 6) {
    case 0:
    case 1:
      this->m_Array.append(value);
      model.push_back(value);
      break;
    case 2: {
      const uint32_t index = static_cast<uint32_t>(random()) % (size + 1);
      this->m_Array.insert(index, value);
      model.insert(model.begin() + index, value);
      break;
    }
    case 3: {
      if (size == 0) break;
      const uint32_t index = static_cast<uint32_t>(random()) % size;
      this->m_Array.remove(index);
      model.erase(model.begin() + index);
      break;
    }
    case 4:
      this->m_Array.removeValue(value);
      if (const auto found = std::ranges::find(model, value); found != model.end())
        model.erase(found);
      break;
    default:
      EXPECT_EQ(this->m_Array.contains(value), std::ranges::find(model, value) != model.end());
    }
    ASSERT_THAT(this->m_Array.getSpan(), ElementsAreArray(model));
  }
}

template <class IntArray>
class ArrayMisuseTest : public ArrayTest<IntArray> {};
TYPED_TEST_SUITE(ArrayMisuseTest, IntArrays);

TYPED_TEST(ArrayMisuseTest, IsReadOutsideItsElements) {
  this->appendAll({1, 2, 3});
  this->m_Array.setSize(2);
  EXPECT_FAILED_ASSERTION((void)this->m_Array[2], "index < m_Used");
  EXPECT_FAILED_ASSERTION((void)std::as_const(this->m_Array)[2], "index < m_Used");
}

TYPED_TEST(ArrayMisuseTest, RemovesOutsideItsElements) {
  EXPECT_FAILED_ASSERTION(this->m_Array.remove(0), "index < m_Used");
}

TYPED_TEST(ArrayMisuseTest, InsertsBehindItsEnd) {
  this->m_Array.append(1);
  EXPECT_FAILED_ASSERTION(this->m_Array.insert(2, 1), "index <= m_Used");
}

TYPED_TEST(ArrayMisuseTest, AppendsFromNowhere) {
  EXPECT_FAILED_ASSERTION(this->m_Array.append(nullptr, 0), "elements != NULL");
}

// The capacity is a 32-bit number, and so is three times the old one.
TEST(ArrayMisuseTest, GrowsWhereTheRuleWraps) {
  EXPECT_FAILED_ASSERTION(
      {
        Array<char> array;
        array.reserve(0x60000000);
        array.reserve(0x60000001);
      },
      "newAllocated > m_Allocated");
}

} // namespace
} // namespace elfext
