// SPDX-License-Identifier: Apache-2.0
//
// The list behind vector values: its order, its search, and removal, after which the first element
// must lie in the list object again, also when nothing is left.

#include "parser_session.h"

#include "tabledrivenparser/interface/linked_list.h"

namespace tabledrivenparser {

using testing::ElementsAre;
using testing::IsEmpty;

static_assert(sizeof(LinkedListNode<const char*>) == 16);

class LinkedListTest : public testing::Test {
protected:
  Lines strings() const {
    Lines lines;
    for (const char* text : m_Strings)
      lines.push_back(text);
    return lines;
  }
  std::vector<int> numbers() const {
    std::vector<int> result;
    for (int number : m_Numbers)
      result.push_back(number);
    return result;
  }
  void appendAll(std::initializer_list<const char*> texts) {
    for (const char* text : texts)
      m_Strings.append(text);
  }

  alloclib::RegionOwner m_Region = makeRegion();
  StrList m_Strings{*m_Region};
  IntegerList m_Numbers{*m_Region};
};

TEST_F(LinkedListTest, StartsEmpty) {
  EXPECT_TRUE(m_Strings.isEmpty());
  EXPECT_EQ(m_Strings.size(), 0u);
  EXPECT_THAT(strings(), IsEmpty());
}

TEST_F(LinkedListTest, KeepsTheOrderOfAppending) {
  for (int number : {3, 1, 2})
    m_Numbers.append(number);
  EXPECT_THAT(numbers(), ElementsAre(3, 1, 2));
  EXPECT_EQ(m_Numbers.size(), 3u);
  EXPECT_FALSE(m_Numbers.isEmpty());
}

TEST_F(LinkedListTest, FindsTheFirstEqualElement) {
  appendAll({"a", "b", "b"});
  EXPECT_EQ(m_Strings.indexOf(std::string("b").c_str()), 1u);
  EXPECT_EQ(m_Strings.indexOf("c"), 0xFFFFFFFFu);
}

TEST_F(LinkedListTest, RemovesAllEqualElements) {
  for (int number : {7, 1, 7, 2, 7})
    m_Numbers.append(number);
  m_Numbers.removeAll(7);
  EXPECT_THAT(numbers(), ElementsAre(1, 2));
  m_Numbers.append(3);
  EXPECT_THAT(numbers(), ElementsAre(1, 2, 3));
}

TEST_F(LinkedListTest, IsUsableAgainAfterItsLastElementWentAway) {
  m_Numbers.append(7);
  m_Numbers.removeAll(7);
  EXPECT_TRUE(m_Numbers.isEmpty());
  m_Numbers.removeAll(7);
  m_Numbers.append(8);
  EXPECT_THAT(numbers(), ElementsAre(8));
}

TEST_F(LinkedListTest, RemovesByPrefix) {
  appendAll({"no_a", "a", "no_", "n"});
  m_Strings.removeAllWithPrefix("no_");
  EXPECT_THAT(strings(), ElementsAre("a", "n"));
}

TEST_F(LinkedListTest, RemovesTextsByTheirCharacters) {
  appendAll({"a", "b"});
  m_Strings.removeAll(std::string("a").c_str());
  EXPECT_THAT(strings(), ElementsAre("b"));
}

TEST_F(LinkedListTest, ForgetsEverything) {
  appendAll({"a", "b"});
  m_Strings.clear();
  EXPECT_TRUE(m_Strings.isEmpty());
  appendAll({"c"});
  EXPECT_THAT(strings(), ElementsAre("c"));
}

} // namespace tabledrivenparser
