// SPDX-License-Identifier: Apache-2.0
//
// What a member is, and what its type can tell: the kinds are one object each, compared by
// identity, and decided by the bytes, wherever these are.

#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

using ArchiveMemberTypeTest = ArchiveTest;

} // namespace

TEST_F(ArchiveMemberTypeTest, HasOneObjectForEachKind) {
  EXPECT_EQ(UnknownArchiveMemberType::getInstance(), UnknownArchiveMemberType::getInstance());
  EXPECT_EQ(ElfImageArchiveMemberType::getInstance(), ElfImageArchiveMemberType::getInstance());
  const std::vector<const ArchiveMemberType*> all = {
      UnknownArchiveMemberType::getInstance(), SymbolTableArchiveMemberType::getInstance(),
      FileNameTableArchiveMemberType::getInstance(), ElfImageArchiveMemberType::getInstance()};
  for (size_t i = 0; i < all.size(); ++i) {
    EXPECT_EQ(all[i]->isObjectModule(), i == 3);
    EXPECT_EQ(all[i]->isAuxiliaryType(), i == 1 || i == 2);
    for (size_t j = 0; j < i; ++j)
      EXPECT_NE(all[i], all[j]);
  }
}

TEST_F(ArchiveMemberTypeTest, OnlyTheElfTypeKnowsElfImages) {
  const ArchiveMember* image = add("a.o", object().bytes());
  EXPECT_TRUE(ElfImageArchiveMemberType::getInstance()->isElfImage(image));
  EXPECT_FALSE(UnknownArchiveMemberType::getInstance()->isElfImage(image));
  EXPECT_FALSE(SymbolTableArchiveMemberType::getInstance()->isElfImage(image));
  EXPECT_FALSE(FileNameTableArchiveMemberType::getInstance()->isElfImage(image));
}

TEST_F(ArchiveMemberTypeTest, IsDecidedByTheBytesWhereverTheyAre) {
  ArchiveMember* onDisk = add("a.o", object().bytes());
  EXPECT_EQ(ArchiveMemberType::decide(onDisk), ElfImageArchiveMemberType::getInstance());
  EXPECT_TRUE(onDisk->loadContents());
  m_Host.remove("a.o");
  EXPECT_EQ(ArchiveMemberType::decide(onDisk), ElfImageArchiveMemberType::getInstance());
  onDisk->discardContents();
  EXPECT_EQ(ArchiveMemberType::decide(onDisk), ElfImageArchiveMemberType::getInstance());
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(ArchiveMemberTypeTest, IsNotDecidedWithoutTheBytes) {
  ArchiveMember* onDisk = add("a.o", object().bytes());
  m_Host.remove("a.o");
  m_Archive.closeFiles();
  EXPECT_EQ(ArchiveMemberType::decide(onDisk), nullptr);
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o': No such file or directory"));
  EXPECT_FALSE(ElfImageArchiveMemberType::getInstance()->isElfImage(onDisk));
  EXPECT_EQ(onDisk->getType(), ElfImageArchiveMemberType::getInstance());
}

TEST_F(ArchiveMemberTypeTest, IsElfForAnyMachineAndKindOfImage) {
  for (const uint16_t machine : {uint16_t{3}, uint16_t{40}, uint16_t{183}}) {
    for (const uint16_t type : {uint16_t{1}, uint16_t{2}, uint16_t{99}}) {
      const ArchiveMember* added = add("a.o", object().machine(machine).type(type).bytes());
      EXPECT_EQ(added->getType(), ElfImageArchiveMemberType::getInstance());
    }
  }
}

TEST_F(ArchiveMemberTypeTest, IsUnknownForNoBytesAtAll) {
  EXPECT_EQ(add("a.o", "")->getType(), UnknownArchiveMemberType::getInstance());
}

} // namespace arlib
