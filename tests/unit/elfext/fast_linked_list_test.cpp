// SPDX-License-Identifier: Apache-2.0
//
// The list in a region: it grows at both ends, is edited under its iterator, and behaves as a plain
// list under random editing with a fixed seed. Its nodes come from the region and go back to it; a
// step beyond the end is an assertion.

#include "elfext/interface/fast_linked_list.h"

#include "counting_region.h"

#include <cstdint>
#include <list>
#include <random>
#include <vector>

namespace elfext {
namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;
using testing::IsEmpty;

class FastLinkedListTest : public testing::Test {
protected:
  std::vector<int> getElements() {
    std::vector<int> elements;
    for (int element : m_List)
      elements.push_back(element);
    EXPECT_EQ(elements.size(), m_List.getSize());
    EXPECT_EQ(elements.empty(), m_List.isEmpty());
    EXPECT_EQ(m_Region.getBlocks().size(), elements.size());
    return elements;
  }

  void appendAll(std::initializer_list<int> values) {
    for (int value : values)
      m_List.append(value);
  }

  FastLinkedList<int>::Iterator at(size_t position) {
    auto place = m_List.begin();
    for (; position != 0; --position)
      ++place;
    return place;
  }

  CountingRegion m_Region;
  FastLinkedList<int> m_List{&m_Region};
};

TEST_F(FastLinkedListTest, StartsEmptyAndWithoutMemory) {
  EXPECT_THAT(getElements(), IsEmpty());
  EXPECT_TRUE(m_List.begin() == m_List.end());
}

TEST_F(FastLinkedListTest, GrowsAtBothEnds) {
  appendAll({2, 3});
  m_List.prepend(1);
  m_List.append(4);
  EXPECT_THAT(getElements(), ElementsAre(1, 2, 3, 4));
}

TEST_F(FastLinkedListTest, GrowsFromAPrependedElement) {
  m_List.prepend(1);
  m_List.append(2);
  EXPECT_THAT(getElements(), ElementsAre(1, 2));
}

TEST_F(FastLinkedListTest, KeepsItsNodesInTheRegion) {
  m_List.append(1);
  ASSERT_EQ(m_Region.getBlocks().size(), 1u);
  EXPECT_EQ(m_Region.getBlocks().begin()->second.size, 16u);
  EXPECT_EQ(m_Region.getBlocks().begin()->second.alignment, 8u);
}

TEST_F(FastLinkedListTest, IsWrittenThroughItsIterator) {
  appendAll({1, 2});
  for (int& element : m_List)
    element *= 10;
  EXPECT_THAT(getElements(), ElementsAre(10, 20));
}

TEST_F(FastLinkedListTest, InsertsInFrontOfTheIteratorAndStandsThere) {
  appendAll({1, 2});
  auto place = at(1);
  place.insert(9);
  EXPECT_EQ(*place, 9);
  place.insert(8);
  EXPECT_EQ(*place, 8);
  EXPECT_THAT(getElements(), ElementsAre(1, 8, 9, 2));
  at(0).insert(7);
  EXPECT_THAT(getElements(), ElementsAre(7, 1, 8, 9, 2));
}

TEST_F(FastLinkedListTest, InsertsAtTheEnd) {
  m_List.end().insert(1);
  m_List.end().insert(2);
  at(2).insert(3);
  m_List.append(4);
  EXPECT_THAT(getElements(), ElementsAre(1, 2, 3, 4));
}

TEST_F(FastLinkedListTest, RemovesUnderTheIteratorAndMovesOn) {
  appendAll({1, 2, 3, 4});
  auto place = at(1);
  place.remove();
  EXPECT_EQ(*place, 3);
  place.remove();
  EXPECT_EQ(*place, 4);
  EXPECT_THAT(getElements(), ElementsAre(1, 4));
  at(0).remove();
  EXPECT_THAT(getElements(), ElementsAre(4));
}

TEST_F(FastLinkedListTest, GrowsBehindItsNewLastElement) {
  appendAll({1, 2, 3});
  auto place = at(2);
  place.remove();
  EXPECT_TRUE(place == m_List.end());
  m_List.append(4);
  EXPECT_THAT(getElements(), ElementsAre(1, 2, 4));
}

TEST_F(FastLinkedListTest, IsUsableAgainAfterItsLastElementWentAway) {
  m_List.append(1);
  at(0).remove();
  EXPECT_THAT(getElements(), IsEmpty());
  appendAll({2, 3});
  EXPECT_THAT(getElements(), ElementsAre(2, 3));
  m_List.clear();
  EXPECT_THAT(getElements(), IsEmpty());
  m_List.append(4);
  EXPECT_THAT(getElements(), ElementsAre(4));
}

TEST_F(FastLinkedListTest, GivesItsNodesBackWhenItGoes) {
  {
    FastLinkedList<int> list(&m_Region);
    list.append(1);
    list.append(2);
  }
  EXPECT_TRUE(m_Region.getBlocks().empty());
}

TEST_F(FastLinkedListTest, BehavesAsAPlainListUnderRandomEditing) {
  std::mt19937 random(7);
  std::list<int> model;
  for (int step = 0; step < 3000; ++step) {
    const int value = static_cast<int>(random() % 1000);
    const size_t position = random() % (model.size() + 1);
    auto place = at(position);
    auto modelPlace = std::next(model.begin(), static_cast<std::ptrdiff_t>(position));
    if (random() % 2 == 0) {
      place.insert(value);
      model.insert(modelPlace, value);
    } else if (modelPlace != model.end()) {
      place.remove();
      model.erase(modelPlace);
    } else {
      m_List.append(value);
      model.push_back(value);
    }
    ASSERT_THAT(getElements(), ElementsAreArray(model));
  }
}

TEST_F(FastLinkedListTest, HasNothingAtItsEnd) {
  m_List.append(1);
  EXPECT_FAILED_ASSERTION((void)*m_List.end(), "m_Current != nullptr");
  EXPECT_FAILED_ASSERTION(++m_List.end(), "m_Current != nullptr");
  EXPECT_FAILED_ASSERTION(m_List.end().remove(), "m_Current != nullptr");
}

TEST_F(FastLinkedListTest, MustHaveARegion) {
  EXPECT_FAILED_ASSERTION(FastLinkedList<int>{noRegion}, "region != NULL");
}

} // namespace
} // namespace elfext
