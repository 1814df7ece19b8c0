// SPDX-License-Identifier: Apache-2.0
//
// Tables that are made piece by piece: pieces of any size come to the same bytes.
#include "arlib/src/table_text.h"

#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

using namespace std::string_view_literals;

// Each piece has room for so many bytes, and the last one for more than there are.
std::string inPieces(const TableText& text, size_t pieceSize) {
  TableText::Place place;
  std::string bytes;
  for (;;) {
    std::vector<uint8_t> piece(pieceSize);
    const size_t count = text.take(piece, place);
    bytes += textOf(std::span(piece).first(count));
    if (count < pieceSize) return bytes;
  }
}

class TableTextTest : public testing::Test {
protected:
  void expectBytes(std::string_view wanted) {
    EXPECT_EQ(m_Text.getSize(), wanted.size());
    for (size_t pieceSize = 1; pieceSize < wanted.size() + 2; ++pieceSize)
      EXPECT_EQ(inPieces(m_Text, pieceSize), wanted) << pieceSize;
  }

  TableText m_Text{alloclib::RegionOwner(alloclib::RegionGeneral::Create(1024, "a test's region"))};
};

constexpr std::string_view Plain[] = {"first", "", "second"};
constexpr std::string_view Decorated[] = {"third", "fourth"};

} // namespace

TEST_F(TableTextTest, MayBeEmpty) {
  expectBytes("");
}

TEST_F(TableTextTest, BeginsWithBytesAsTheyAre) {
  m_Text.addHead({'h', 'e', 'a', 'd'});
  expectBytes("head");
}

TEST_F(TableTextTest, GivesEachTextItsEnding) {
  m_Text.addHead({'h', 'e', 'a', 'd'});
  m_Text.addTexts(Plain, 11, "\0"sv);
  m_Text.addTexts({}, 0, "none"sv);
  m_Text.addTexts(Decorated, 11, "$more\0"sv);
  expectBytes("headfirst\0\0second\0third$more\0fourth$more\0"sv);
}

class MadeTableTest : public ArchiveTest {
protected:
  MadeTableTest() {
    add("a_name_that_is_not_short.o", "bytes");
    m_Archive.setSymbolTableMode(SymbolTableMode::Always);
    EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  }
  static constexpr std::string_view Names = "a_name_that_is_not_short.o/\n";
};

TEST_F(MadeTableTest, IsNotInMemoryUntilSomebodyAsks) {
  EXPECT_FALSE(member(1)->hasContents());
  EXPECT_EQ(member(1)->getSize(), Names.size());
  EXPECT_EQ(contentsOf(m_Archive, member(1)), Names);
  EXPECT_FALSE(member(1)->hasContents());
  EXPECT_EQ(contentsOf(member(1)), Names);
  EXPECT_TRUE(member(1)->hasContents());
}

TEST_F(MadeTableTest, IsInItsFileOnceItIsWritten) {
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_FALSE(member(1)->hasContents());
  ASSERT_TRUE(member(1)->getContentsLocation().has_value());
  EXPECT_EQ(contentsOf(member(1)), Names);
}

TEST_F(MadeTableTest, CanBeMadeAgain) {
  member(2)->setName("another_name_that_is_not_short.o");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(contentsOf(member(1)), "another_name_that_is_not_short.o/\n");
}

TEST_F(MadeTableTest, KeepsItsBytesWhenItIsForgotten) {
  ArchiveMember* table = member(1);
  member(2)->setName("short.o");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(contentsOf(table), Names);
}

TEST_F(MadeTableTest, CanBeFlushedAndReplaced) {
  ArchiveMember* table = member(1);
  table->discardContents();
  EXPECT_EQ(contentsOf(table), Names);
  table->setContents("bytes", 5);
  EXPECT_EQ(contentsOf(table), "bytes");
  table->releaseContentsLocation();
}

} // namespace arlib
