// SPDX-License-Identifier: Apache-2.0
//
// Group sections: flags word, members and signature. A group may be empty, list the null section, a
// section twice or one of another group, or sections that there are not; each has its one answer.

#include "elfext/interface/group.h"
#include "tests/support/reader_fixture.h"

namespace elfext {

using ReadGroupsTest = ReaderTest;
using ReadGroupsOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadGroupsOfEachFormTest, testing::ValuesIn(AllForms), formName);

namespace {

// Sections 1 to 4: two of code, a symbol table, its strings; section 5 and on are for the test.
ObjectBuilder withCode(ObjectBuilder file) {
  file.section(".text.a", SHT_PROGBITS).zeros(4);
  file.section(".text.b", SHT_PROGBITS).zeros(4);
  file.section(".symtab", SHT_SYMTAB)
      .link(4)
      .symbol({.name = "signature", .section = 1})
      .symbol({});
  file.section(".strtab", SHT_STRTAB);
  return file;
}

} // namespace

TEST_P(ReadGroupsOfEachFormTest, HaveAFlagsWordAndMembers) {
  ObjectBuilder file = withCode(GetParam().object());
  file.section(".group", SHT_GROUP).link(3).info(1).word(GRP_COMDAT).word(2).word(1);
  const ReadResult result = readGood(file);
  ASSERT_EQ(result.module->getGroupCount(), 1U);
  const Group& group = *result.module->getGroup(0);
  EXPECT_STREQ(group.getSignature(), "signature");
  EXPECT_STREQ(group.getName(), ".group");
  EXPECT_EQ(group.getFlags(), GRP_COMDAT);
  EXPECT_EQ(group.getGroupSection(), result.section(5));
  ASSERT_EQ(group.getMemberCount(), 2U);
  EXPECT_EQ(group.getMember(0), result.section(2));
  EXPECT_EQ(group.getMember(1), result.section(1));
  EXPECT_EQ(result.section(1)->getGroup(), &group);
  EXPECT_EQ(result.module->findComdatGroup("signature"), &group);
}

TEST_F(ReadGroupsTest, WithoutSignatureSymbolHaveTheEmptySignature) {
  ObjectBuilder file = withCode(object());
  file.section(".group", SHT_GROUP).link(3).info(0).word(1);
  file.section(".group", SHT_GROUP).link(3).info(2).word(1);
  const ReadResult result = readGood(file);
  EXPECT_STREQ(result.module->getGroup(0)->getSignature(), "");
  EXPECT_STREQ(result.module->getGroup(1)->getSignature(), "");
}

TEST_F(ReadGroupsTest, MayHaveNoWordsAtAll) {
  ObjectBuilder file = withCode(object());
  file.section(".group", SHT_GROUP).link(3).info(1);
  const ReadResult result = readGood(file);
  EXPECT_EQ(result.module->getGroup(0)->getFlags(), 0U);
  EXPECT_EQ(result.module->getGroup(0)->getMemberCount(), 0U);
}

TEST_F(ReadGroupsTest, TheNullSectionIsPassedOverAsMember) {
  ObjectBuilder file = withCode(object());
  file.section(".group", SHT_GROUP).link(3).info(1).word(1).word(0).word(2).word(0);
  EXPECT_EQ(readGood(file).module->getGroup(0)->getMemberCount(), 1U);
}

TEST_F(ReadGroupsTest, SectionZeroOfAnotherTypeIsAMember) {
  ObjectBuilder file = withCode(object());
  file.section(".group", SHT_GROUP).link(3).info(1).word(1).word(0).word(0);
  file.byteAt(file.headerOffsetOf(0) + 4, SHT_PROGBITS);
  EXPECT_THAT(read(file).reports,
              ElementsAre("Section #0 belongs to group section #5 and also to group section #5"));
}

TEST_F(ReadGroupsTest, MembersAreSections) {
  ObjectBuilder file = withCode(object());
  file.section(".group", SHT_GROUP).link(3).info(1).word(1).word(1).word(7).word(2);
  const ReadResult mended =
      expectMended(file, "Group section #5 refers to member section #7 but the last section is #6");
  EXPECT_EQ(mended.module->getGroup(0)->getMemberCount(), 2U);
}

TEST_F(ReadGroupsTest, ASectionIsInOneGroupOnly) {
  ObjectBuilder file = withCode(object());
  file.section(".group", SHT_GROUP).link(3).info(1).word(1).word(1);
  file.section(".group", SHT_GROUP).link(3).info(1).word(1).word(1).word(2);
  const ReadResult mended =
      expectMended(file, "Section #1 belongs to group section #5 and also to group section #6");
  EXPECT_EQ(mended.section(1)->getGroup(), mended.module->getGroup(0));
  EXPECT_EQ(mended.section(2)->getGroup(), mended.module->getGroup(1));
}

TEST_F(ReadGroupsTest, ASectionIsListedOnceOnly) {
  ObjectBuilder file = withCode(object());
  file.section(".group", SHT_GROUP).link(3).info(1).word(1).word(1).word(1);
  expectMended(file, "Section #1 belongs to group section #5 and also to group section #5");
}

} // namespace elfext
