// SPDX-License-Identifier: Apache-2.0
//
// What a library's name says of its members: the built-in rows, and a map file in their place.
// Where the file is missing or fails the built-in rows hold, and of a failure the reason is told;
// an empty one has no rows, and a line without an end is cut into more of them, in time that grows
// with the file. Files are on the memory host and on the faulty one.

#include "elfext/interface/library_attribute_map.h"

#include "elfext/interface/attribute_string.h"
#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>

namespace elfext {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

class LibraryAttributeMapTest : public testing::Test {
protected:
  LibraryAttributeMap read(std::string_view text) {
    m_Host.addFile("map", text);
    bool usedDefault = true;
    support::HostError error = EIO;
    LibraryAttributeMap map = readLibraryAttributeMap(m_Host, "map", usedDefault, error);
    EXPECT_FALSE(usedDefault);
    EXPECT_EQ(error, 0);
    EXPECT_EQ(m_Host.openHandles(), 0u);
    return map;
  }

  LibraryAttributeMap readBuiltIn(support::Host& host, const char* path,
                                  support::HostError reason = 0) {
    bool usedDefault = false;
    support::HostError error = EDOM;
    LibraryAttributeMap map = readLibraryAttributeMap(host, path, usedDefault, error);
    EXPECT_TRUE(usedDefault);
    EXPECT_EQ(error, reason) << path;
    EXPECT_EQ(m_Host.openHandles(), 0u);
    return map;
  }
  LibraryAttributeMap builtIn() { return readBuiltIn(m_Host, nullptr); }

  static std::vector<std::string> patterns(const LibraryAttributeMap& map) {
    std::vector<std::string> result;
    for (const LibraryAttributeMap::Row& row : map.rows)
      result.push_back(row.pattern);
    return result;
  }

  static FullAttr attributesOf(std::string_view name, const LibraryAttributeMap& map) {
    FullAttr record;
    getLibraryAttributes(record, name, map);
    return record;
  }

  testsupport::MemoryHost m_Host;
};

TEST_F(LibraryAttributeMapTest, HasBuiltInRowsForANullPath) {
  EXPECT_THAT(patterns(builtIn()),
              ElementsAre("*_a*", "*_t*", "*_w*", "*_?f*", "*_?v*", "*_??p*", "*_??m*", "*_???s*",
                          "*_???u*", "*_????e*", "*_????n*", "g_*", "f_*", "fj_*"));
}

TEST_F(LibraryAttributeMapTest, TakesTheBuiltInRowsForWhatIsNoFile) {
  m_Host.addDirectory("folder");
  m_Host.addSpecial("device");
  for (const char* path : {"nothing", "folder", "device", ""})
    EXPECT_THAT(readBuiltIn(m_Host, path).rows, SizeIs(14)) << path;
}

TEST_F(LibraryAttributeMapTest, TakesTheBuiltInRowsAndTellsWhyForWhatCannotBeRead) {
  m_Host.addFile("locked", "a $IEEE1").isUnreadable = true;
  EXPECT_THAT(readBuiltIn(m_Host, "locked", EACCES).rows, SizeIs(14));
}

TEST_F(LibraryAttributeMapTest, TakesTheBuiltInRowsAndTellsWhenTheHostFails) {
  m_Host.addFile("map", "a $IEEE1\nb $IEEE1\n");
  testsupport::FaultyHost host(m_Host);
  for (uint64_t call = 1; call <= 3; ++call) {
    host.failCall(call, EIO);
    EXPECT_THAT(readBuiltIn(host, "map", EIO).rows, SizeIs(14)) << host.getFailedOperation();
  }
  host.failCall(4, EIO);
  bool usedDefault = true;
  support::HostError error = EDOM;
  EXPECT_THAT(readLibraryAttributeMap(host, "map", usedDefault, error).rows, SizeIs(2));
  EXPECT_EQ(host.getFailedOperation(), "close");
  EXPECT_FALSE(usedDefault);
  EXPECT_EQ(error, 0);
}

TEST_F(LibraryAttributeMapTest, ReadsPatternAttributesAndClass) {
  const LibraryAttributeMap map = read("*_x* $ZEV_ISAv4$IEEE1 fz more words\n");
  ASSERT_THAT(map.rows, SizeIs(1));
  EXPECT_EQ(map.rows[0].pattern, "*_x*");
  EXPECT_EQ(map.rows[0].attributes, parseAttributeString("$ZEV_ISAv4$IEEE1"));
  EXPECT_EQ(map.rows[0].className, "fz");
}

TEST_F(LibraryAttributeMapTest, DividesWordsAtAnyWhiteSpace) {
  const LibraryAttributeMap map = read(" \t*\v\f$IEEE1$IW\r \tclass\r\n");
  ASSERT_THAT(map.rows, SizeIs(1));
  EXPECT_EQ(map.rows[0].pattern, "*");
  EXPECT_EQ(map.rows[0].attributes, parseAttributeString("$IEEE1$IW"));
  EXPECT_EQ(map.rows[0].className, "class");
}

TEST_F(LibraryAttributeMapTest, SkipsCommentsAndLinesWithoutASecondWord) {
  const LibraryAttributeMap map =
      read("# $IEEE1\n#x $IEEE1\n\n   \nword\n word \n #a $IEEE1\nb $IW");
  EXPECT_THAT(patterns(map), ElementsAre("#a", "b"));
}

TEST_F(LibraryAttributeMapTest, HasNoRowsOfAnEmptyFile) {
  EXPECT_THAT(read("").rows, IsEmpty());
}

TEST_F(LibraryAttributeMapTest, TakesTheRestOfALongLineForAFurtherLine) {
  const std::string blanks(LibraryAttributeLineLimit - 8, ' ');
  EXPECT_THAT(patterns(read("a $IEEE1" + blanks + "b $IW\nc $IW\n")), ElementsAre("a", "b", "c"));
  // Cut in the middle of a word.
  const LibraryAttributeMap map =
      read(std::string(LibraryAttributeLineLimit - 4, ' ') + "a $IEEE1 x");
  EXPECT_THAT(patterns(map), ElementsAre("a", "EEE1"));
  EXPECT_EQ(map.rows[0].attributes, parseAttributeString("$I"));
}

TEST_F(LibraryAttributeMapTest, ReadsALineOfExactlyTheLimitAsOne) {
  const std::string line = "a $IEEE1" + std::string(LibraryAttributeLineLimit - 10, ' ') + "fz";
  const LibraryAttributeMap map = read(line + "\n# $IW\n");
  ASSERT_THAT(map.rows, SizeIs(1));
  EXPECT_EQ(map.rows[0].className, "fz");
}

TEST_F(LibraryAttributeMapTest, ReadsMapsThatAreLargerThanItsBuffer) {
  std::string text;
  for (int i = 0; i < 20000; ++i)
    text += "pattern" + std::to_string(i) + "_x $IEEE1 class\n";
  const LibraryAttributeMap map = read(text);
  ASSERT_THAT(map.rows, SizeIs(20000));
  EXPECT_EQ(map.rows[19999].pattern, "pattern19999_x");
  EXPECT_EQ(map.rows[19999].className, "class");
  EXPECT_LE(m_Host.getBytesRead(), text.size() + 0x10000);
}

TEST_F(LibraryAttributeMapTest, ReadsAnEndlessLineInLinearTime) {
  EXPECT_THAT(read(std::string(size_t{16} << 20, 'x')).rows, IsEmpty());
}

TEST_F(LibraryAttributeMapTest, StartsFromALibrarysRecordWhenNothingMatches) {
  FullAttr record = DefaultFullAttr;
  record.m_TargetClass = {5, 6};
  getLibraryAttributes(record, "plain.a", builtIn());
  FullAttr expected = LibraryFullAttr;
  expected.m_TargetClass = {5, 6};
  EXPECT_EQ(record, expected);
}

TEST_F(LibraryAttributeMapTest, MergesAllRowsThatMatch) {
  const FullAttr record = attributesOf("lib_avps.a", builtIn());
  EXPECT_TRUE(record.m_Features.contains(features::ZEV_ISAv4));
  EXPECT_TRUE(record.m_Features.contains(features::HFU_ISAv1 | features::PURE_DOUBLES));
  EXPECT_EQ(record.m_Flags, uint64_t{Flag_StackChecked});
}

TEST_F(LibraryAttributeMapTest, KeepsAMergeThatClashes) {
  const LibraryAttributeMap map = read("* $IEEE1$STKCKD\n* $IEEE1$~STKCKD\n");
  EXPECT_EQ(attributesOf("x", map).m_Flags, uint64_t{Flag_StackChecked} | Flag_NotStackChecked);
}

TEST_F(LibraryAttributeMapTest, LosesTheAbiLevelAndThePreservedStack) {
  const FullAttr record = attributesOf("x", read("* $IEEE1$REQ8$PRES8$EABIv2\n"));
  EXPECT_EQ(record.m_Stack8, uint64_t{Stack8_Requires});
  EXPECT_EQ(record.m_AbiLevel, 0u);
}

TEST_F(LibraryAttributeMapTest, ClaimsIeeeFlagsWithoutTheTokenAgainstThem) {
  EXPECT_EQ(attributesOf("x", read("* $IW\n")).m_Flags, uint64_t{Flag_Interwork} | Flag_IeeePart);
  EXPECT_EQ(attributesOf("x", read("* nothing\n")).m_Flags, uint64_t{Flag_IeeePart});
}

TEST_F(LibraryAttributeMapTest, AddsNothingForTheBuiltInRowOfUnknownTokens) {
  EXPECT_EQ(attributesOf("lib_w.a", builtIn()), LibraryFullAttr);
}

TEST_F(LibraryAttributeMapTest, MatchesInAnyLetterCase) {
  EXPECT_EQ(attributesOf("G_LIB.A", builtIn()).m_Flags, uint64_t{Flag_IeeeFull});
}

TEST_F(LibraryAttributeMapTest, MatchesFromTheLastBackslashAndNotFromASlash) {
  const LibraryAttributeMap map = builtIn();
  EXPECT_EQ(attributesOf("g_x.a", map).m_Flags, uint64_t{Flag_IeeeFull});
  EXPECT_EQ(attributesOf("dir/g_x.a", map), LibraryFullAttr);
  EXPECT_EQ(attributesOf("dir\\g_x.a", map), LibraryFullAttr);
  EXPECT_EQ(attributesOf("x", read("\\g_* $IEEE1$IW\n")), LibraryFullAttr);
  EXPECT_EQ(attributesOf("a\\b\\g_x", read("\\g_* $IEEE1$IW\n")).m_Flags, uint64_t{Flag_Interwork});
  EXPECT_EQ(attributesOf("out_all/x.a", map).m_Features, features::ZEV_ISAv4);
  EXPECT_EQ(attributesOf("out_all\\x.a", map), LibraryFullAttr);
}

TEST_F(LibraryAttributeMapTest, TakesTheClassOfTheFirstMatchingRowThatHasOne) {
  const LibraryAttributeMap map = read("a* $IEEE1\nab* $IEEE1 first\na* $IEEE1 second\n");
  EXPECT_EQ(getLibraryClass("abc", map), "first");
  EXPECT_EQ(getLibraryClass("acc", map), "second");
  EXPECT_EQ(getLibraryClass("bcc", map), "bcc");
  EXPECT_EQ(getLibraryClass("dir\\abc", map), "dir\\abc");
}

TEST_F(LibraryAttributeMapTest, ComparesTheClassesOfTwoLibraries) {
  const LibraryAttributeMap map = builtIn();
  EXPECT_TRUE(isSameLibraryClass("g_x.a", "fj_y.a", map));
  EXPECT_TRUE(isSameLibraryClass("x.a", "x.a", map));
  EXPECT_FALSE(isSameLibraryClass("x.a", "y.a", map));
  EXPECT_FALSE(isSameLibraryClass("g_x.a", "x.a", map));
}

} // namespace
} // namespace elfext
