// SPDX-License-Identifier: Apache-2.0
//
// The small lists: search results, and the names that an object publishes. A few elements lie
// inside the list and the rest in its overflow; the border between the two is where they could get
// lost.

#include "arlib/interface/result_list.h"

#include "arlib/interface/name_order.h"
#include "arlib/interface/symbol_name_list.h"
#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

class ResultListTest : public ArchiveTest {
protected:
  ResultListTest() {
    for (int i = 0; i < 20; ++i)
      m_Members.push_back(m_Archive.addMember(std::to_string(i), 0, 0, 0, 0));
  }

  void fill(uint32_t size) {
    m_List.setSize(size);
    ASSERT_EQ(m_List.getSize(), size);
    for (uint32_t i = 0; i < size; ++i)
      m_List.set(i, m_Members[i]);
    for (uint32_t i = 0; i < size; ++i)
      EXPECT_EQ(m_List[i], m_Members[i]);
  }

  std::vector<ArchiveMember*> m_Members;
  ArchiveMemberList m_List;
};

} // namespace

TEST_F(ResultListTest, HoldsAnyNumberInlineAndBeyond) {
  EXPECT_EQ(m_List.getSize(), 0u);
  for (const uint32_t size : {1u, 3u, 4u, 20u, 5u, 3u, 0u, 7u, 20u})
    fill(size);
}

TEST_F(ResultListTest, KeepsItsElementsWhenTheOverflowServesAgain) {
  fill(10);
  m_List.setSize(6);
  for (uint32_t i = 0; i < 6; ++i)
    EXPECT_EQ(m_List[i], m_Members[i]);
}

TEST_F(ResultListTest, HoldsSymbolsAlike) {
  Symbol symbol("s", {}, &m_Archive, m_Members[0]);
  SymbolList list;
  list.setSize(5);
  list.set(4, &symbol);
  EXPECT_EQ(list[4], &symbol);
}

TEST(SymbolNameListTest, CopiesNamesAndKeepsTheirOrder) {
  const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(1024, "names"));
  SymbolNameList names(region.get());
  std::string name = "zeta";
  names.add(name.c_str());
  name = "XXXX";
  names.add(std::string_view("alpha"));
  names.add("");
  ASSERT_EQ(names.getSize(), 3u);
  EXPECT_EQ(names[0], "zeta");
  EXPECT_EQ(names[1], "alpha");
  EXPECT_EQ(names[2], "");
  EXPECT_EQ(names[1].data()[5], '\0');
  names.clear();
  EXPECT_EQ(names.getSize(), 0u);
}

TEST(NameOrder, ComparesBytesUnsignedWithLettersFolded) {
  EXPECT_EQ(compareIgnoringCase("Foo.O", "fOO.o"), 0);
  EXPECT_LT(compareIgnoringCase("a", "B"), 0);
  EXPECT_GT(compareIgnoringCase("\xFF", "z"), 0);
  EXPECT_LT(compareIgnoringCase("a", "ab"), 0);
  EXPECT_GT(compareIgnoringCase("ab", "A"), 0);
  EXPECT_EQ(compareIgnoringCase("", ""), 0);
  // "_" stands between the upper-case and the lower-case letters.
  EXPECT_LT(compareIgnoringCase("_", "A"), 0);
}

} // namespace arlib
