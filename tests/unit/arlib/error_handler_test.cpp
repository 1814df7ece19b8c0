// SPDX-License-Identifier: Apache-2.0
//
// The words and the severity of every failure, for clients that only override `report`. Users and
// scripts know these texts, so each is compared to the letter, with and without the parts that may
// be unknown.

#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

class ErrorHandlerText : public ArchiveTest {
protected:
  // The attributes are not part of any text.
  static const elfext::FullAttr& attributes() {
    alignas(16) static const unsigned char Bytes[64] = {};
    return reinterpret_cast<const elfext::FullAttr&>(Bytes);
  }

  std::string last() {
    EXPECT_EQ(m_Handler.reports.size(), 1u);
    return reports().back();
  }
};

TEST_F(ErrorHandlerText, OfMissingMemory) {
  EXPECT_FALSE(m_Handler.reportOutOfMemory(m_Archive));
  EXPECT_EQ(last(), "0 Out of memory");
}

TEST_F(ErrorHandlerText, OfHostFailuresNamesTheFileAndTheReason) {
  EXPECT_FALSE(m_Handler.reportReadError(m_Archive, "x.o", ENOENT));
  EXPECT_EQ(last(), "0 I/O error reading file 'x.o': No such file or directory");
  EXPECT_FALSE(m_Handler.reportSeekError(m_Archive, "x.o", EINVAL));
  EXPECT_EQ(last(), "0 I/O error seeking in file 'x.o': Invalid argument");
  EXPECT_FALSE(m_Handler.reportCloseError(m_Archive, "x.o", EIO));
  EXPECT_EQ(last(), "0 I/O error closing file 'x.o': Input/output error");
  EXPECT_FALSE(m_Handler.reportDeleteError(m_Archive, "x.o", EACCES));
  EXPECT_EQ(last(), "0 I/O error deleting file 'x.o': Permission denied");
  EXPECT_FALSE(m_Handler.reportWriteError(m_Archive, "x.o", ENOSPC));
  EXPECT_EQ(last(), "0 I/O error writing file 'x.o': No space left on device");
}

TEST_F(ErrorHandlerText, OfHostFailuresLeavesOutWhatIsNotKnown) {
  m_Handler.reportReadError(m_Archive, nullptr, EIO);
  EXPECT_EQ(last(), "0 I/O error reading file: Input/output error");
  m_Handler.reportSeekError(m_Archive, "x.o", 0);
  EXPECT_EQ(last(), "0 I/O error seeking in file 'x.o'");
  m_Handler.reportWriteError(m_Archive, nullptr, 0);
  EXPECT_EQ(last(), "0 I/O error writing file");
}

TEST_F(ErrorHandlerText, OfAReadOnlyOutput) {
  EXPECT_FALSE(m_Handler.reportReadOnlyOutput(m_Archive, "lib.a"));
  EXPECT_EQ(last(), "0 Output file 'lib.a' is read-only");
}

TEST_F(ErrorHandlerText, OfABadArchiveMagic) {
  EXPECT_FALSE(m_Handler.reportBadArchiveMagic(m_Archive));
  EXPECT_EQ(last(), "0 File does not begin with the archive magic number (not an archive file?)");
}

TEST_F(ErrorHandlerText, OfATruncatedHeader) {
  EXPECT_FALSE(m_Handler.reportTruncatedMemberHeader(m_Archive, 8));
  EXPECT_EQ(last(), "0 End of file in the middle of archive member header starting at offset 8");
}

TEST_F(ErrorHandlerText, OfBadHeaderNumbers) {
  EXPECT_TRUE(m_Handler.reportBadDate(m_Archive, 68, "12x         "));
  EXPECT_EQ(last(), "1 Archive member header starting at offset 68 contains invalid date string "
                    "'12x         '");
  EXPECT_TRUE(m_Handler.reportBadUid(m_Archive, 68, "x     "));
  EXPECT_EQ(last(),
            "1 Archive member header starting at offset 68 contains invalid uid string 'x     '");
  EXPECT_TRUE(m_Handler.reportBadGid(m_Archive, 68, "y     "));
  EXPECT_EQ(last(),
            "1 Archive member header starting at offset 68 contains invalid gid string 'y     '");
  EXPECT_TRUE(m_Handler.reportBadMode(m_Archive, 68, "z       "));
  EXPECT_EQ(last(), "1 Archive member header starting at offset 68 contains invalid mode string "
                    "'z       '");
  EXPECT_FALSE(m_Handler.reportBadSize(m_Archive, 68, ""));
  EXPECT_EQ(last(),
            "0 Archive member header starting at offset 68 contains invalid size string ''");
}

TEST_F(ErrorHandlerText, OfABadMemberMagic) {
  m_Handler.reportBadMemberMagic(m_Archive, 8);
  EXPECT_EQ(last(), "0 Archive member header starting at offset 8 contains incorrect "
                    "archive-member magic number");
}

TEST_F(ErrorHandlerText, OfBadNames) {
  EXPECT_TRUE(m_Handler.reportNoLongNameTable(m_Archive, 8));
  EXPECT_EQ(last(), "2 Archive member header starting at offset 8 contains an index into the long "
                    "name table, but this archive has no long name table");
  EXPECT_TRUE(m_Handler.reportBadLongNameIndex(m_Archive, 8, "1x"));
  EXPECT_EQ(last(),
            "2 Archive member header starting at offset 8 contains invalid long-name index '1x'");
  EXPECT_TRUE(m_Handler.reportLongNameIndexOutOfRange(m_Archive, 8, 77, 20));
  EXPECT_EQ(last(), "2 Archive member header starting at offset 8 contains out-of-range long-name "
                    "index 77 (the long-name table is 20 bytes long)");
  EXPECT_TRUE(m_Handler.reportNoNameTerminator(m_Archive, 8));
  EXPECT_EQ(last(),
            "2 Archive member header starting at offset 8 has no '/' character in its name field");
  EXPECT_TRUE(m_Handler.reportTrailingNameCharacter(m_Archive, 8));
  EXPECT_EQ(last(), "1 Archive member header starting at offset 8 has a trailing non-space "
                    "character after the '/' character in its name field");
}

TEST_F(ErrorHandlerText, OfABadPaddingByte) {
  EXPECT_TRUE(m_Handler.reportBadPadding(m_Archive, 71, 32));
  EXPECT_EQ(last(), "1 Padding byte at offset 71 has value 32 and not 0x0A as it should be");
  EXPECT_TRUE(m_Handler.reportBadPadding(m_Archive, 71, -1));
  EXPECT_EQ(last(), "1 Padding byte at offset 71 has value -1 and not 0x0A as it should be");
}

TEST_F(ErrorHandlerText, OfARegionOutsideItsFileDependsOnWhetherItIsAMember) {
  m_Handler.reportRegionOutsideFile(m_Archive, "lib.a", "a.o", 68, 100, 90);
  EXPECT_EQ(last(), "0 Error reading member 'a.o': archive member is at offset 68 and has size 100 "
                    "but archive file is only 90 bytes long");
  m_Handler.reportRegionOutsideFile(m_Archive, "lib.a", "", 68, 100, 90);
  EXPECT_EQ(last(), "0 Error reading member '': archive member is at offset 68 and has size 100 "
                    "but archive file is only 90 bytes long");
  m_Handler.reportRegionOutsideFile(m_Archive, "src.a", std::nullopt, 68, 100, 90);
  EXPECT_EQ(last(), "0 Error reading region from file 'src.a' at offset 68 with size 100: file is "
                    "only 90 bytes long");
}

TEST_F(ErrorHandlerText, OfADamagedSymbolTable) {
  EXPECT_FALSE(m_Handler.reportSymbolTableTooShort(m_Archive, 3));
  EXPECT_EQ(last(),
            "0 Archive symbol table is 3 bytes long, but should contain at least a 4-byte symbol "
            "count");
  EXPECT_FALSE(m_Handler.reportSymbolTableCountTooLarge(m_Archive, 4, 0x40000000, 4294967300));
  EXPECT_EQ(last(),
            "0 Archive symbol table is 4 bytes long, but claims to contain 1073741824 symbols so "
            "it should be at least 4294967300 bytes long");
  EXPECT_FALSE(m_Handler.reportSymbolNameUnterminated(m_Archive, 2, 5));
  EXPECT_EQ(last(),
            "0 Archive symbol table ends in the middle of the name of symbol #2 (out of 5)");
}

TEST_F(ErrorHandlerText, OfDoubtfulSymbolTableEntries) {
  EXPECT_TRUE(m_Handler.reportSymbolAtNoMember(m_Archive, 3, "alpha", 66));
  EXPECT_EQ(last(), "2 Archive symbol table says symbol #3 'alpha' is defined in the archive "
                    "member starting at offset 66 but no archive member starts there");
  EXPECT_TRUE(m_Handler.reportSymbolInNonObject(m_Archive, 3, "alpha", 8));
  EXPECT_EQ(last(), "2 Archive symbol table says symbol #3 'alpha' is defined in the archive "
                    "member starting at offset 8, but that member is not an object file");
  EXPECT_TRUE(m_Handler.reportSymbolTableTrailingData(m_Archive, 40, 38));
  EXPECT_EQ(last(), "1 Archive symbol table contains unexpected data at offset 40, after all the "
                    "expected data has finished at offset 38");
}

// Positions count the tables, too.
TEST_F(ErrorHandlerText, OfMembersGivesTheirPositionInTheWholeList) {
  read(archive().symbolTable({}).member("a.o", "").member("b.o", ""));
  const std::vector<const ArchiveMember*> group = {member(2), member(1)};

  EXPECT_TRUE(m_Handler.reportUnreadableMemberSymbols(m_Archive, *member(1), "no reason"));
  EXPECT_EQ(last(), "2 Unable to read symbols defined in archive member #1 'a.o': no reason");
  EXPECT_TRUE(m_Handler.reportUnreadableMemberSymbols(m_Archive, *member(1), ""));
  EXPECT_EQ(last(), "2 Unable to read symbols defined in archive member #1 'a.o'");
  EXPECT_TRUE(m_Handler.reportNoBaseVariant(m_Archive, group));
  EXPECT_EQ(last(),
            "1 Minor variant group containing archive member #2 'b.o' includes no base variant");
  EXPECT_TRUE(m_Handler.reportMultipleBaseVariants(m_Archive, group));
  EXPECT_EQ(last(), "1 Minor variant group containing archive member #2 'b.o' includes multiple "
                    "base variants");
  EXPECT_TRUE(m_Handler.reportUndecoratableDifference(m_Archive, *member(1), group));
  EXPECT_EQ(last(),
            "1 Member #1 'a.o' of minor variant group beginning witharchive member #2 'b.o' "
            "includes attribute(s) with nosymbol decoration representation");
  EXPECT_TRUE(m_Handler.reportCommonAttributesIncompatible(m_Archive, group, attributes()));
  EXPECT_EQ(last(), "1 Common attributes of minor variant group beginning with archive member #2 "
                    "'b.o' are incompatible with library attributes");
  EXPECT_TRUE(m_Handler.reportMemberAttributesIncompatible(m_Archive, *member(1), attributes()));
  EXPECT_EQ(last(), "1 Attributes of minor variant member object 'a.o' are incompatible with "
                    "library attributes");
}

} // namespace arlib
