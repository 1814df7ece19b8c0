// SPDX-License-Identifier: Apache-2.0
//
// Reading an archive's headers, and what each fault in them comes to: with a handler that goes on
// where it can, with one that gives up, and with none.
//
// Archives come from the archive builder, with one fault each in a good one, on a host in memory
// that counts what is read: getting past a member must cost its header and not its body. A name, a
// number or a table may be anything; what is taken is what a strict look at the bytes would find.

#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

namespace {

const std::string LongName = "a_name_of_seventeen.o";

// A fault that a handler may tolerate.
void expectTolerable(const ArchiveBuilder& builder, const std::string& report) {
  const Reading tolerant(builder);
  EXPECT_TRUE(tolerant.isRead);
  EXPECT_THAT(tolerant.handler.reports, ElementsAre(report));
  const Reading strict(builder, Answer::GiveUp);
  EXPECT_FALSE(strict.isRead);
  EXPECT_THAT(strict.handler.reports, ElementsAre(report));
  EXPECT_TRUE(strict.archive.getMembers().empty());
  EXPECT_EQ(strict.host.openHandles(), 0u);
  EXPECT_FALSE(isReadWithoutHandler(builder));
}

// A fault that ends the read, whatever the handler would like.
void expectFatal(const ArchiveBuilder& builder, const std::string& report) {
  const Reading reading(builder, Answer::GoOnIfPossible);
  EXPECT_FALSE(reading.isRead);
  EXPECT_THAT(reading.handler.reports, ElementsAre(report));
  EXPECT_TRUE(reading.archive.getMembers().empty());
  EXPECT_STREQ(reading.archive.getFileName(), "lib.a");
  EXPECT_EQ(reading.host.openHandles(), 0u);
  EXPECT_FALSE(isReadWithoutHandler(builder));
}

std::string atOffset8(std::string_view what) {
  return "Archive member header starting at offset 8 " + std::string(what);
}

} // namespace

TEST(ArchiveFileReader, TakesTheBareMagicForAnEmptyArchive) {
  const Reading reading(archive());
  EXPECT_TRUE(reading.isRead);
  EXPECT_TRUE(reading.archive.getMembers().empty());
  EXPECT_THAT(reading.handler.reports, IsEmpty());
}

TEST(ArchiveFileReader, FindsEachMembersHeaderAndContents) {
  Reading reading(archive()
                      .member("a.o", "odd")
                      .numbers(7, 8, 9, "640")
                      .member("b.o", "even")
                      .member("c.o", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("a.o", "b.o", "c.o"));
  ArchiveMember* first = reading.archive.getMembers()[0];
  EXPECT_EQ(first->getDate(), 7);
  EXPECT_EQ(first->getUid(), 8u);
  EXPECT_EQ(first->getGid(), 9u);
  EXPECT_EQ(first->getMode(), 0640u);
  EXPECT_EQ(first->getSize(), 3u);
  EXPECT_EQ(first->getOffset(), 8u);
  EXPECT_EQ(first->getFileNameTableOffset(), ArchiveMember::NoFileNameTableOffset);
  EXPECT_FALSE(first->isModified());
  EXPECT_FALSE(first->hasContents());
  EXPECT_EQ(contentsOf(first), "odd");
  EXPECT_EQ(reading.archive.getMembers()[1]->getOffset(), 72u);
  EXPECT_EQ(contentsOf(reading.archive.getMembers()[1]), "even");
  EXPECT_EQ(contentsOf(reading.archive.getMembers()[2]), "");
}

TEST(ArchiveFileReader, GivesOrdinaryMembersALocationInTheArchive) {
  const Reading reading(archive().member("a.o", "bytes"));
  ASSERT_TRUE(reading.isRead);
  const auto& location = reading.archive.getMembers()[0]->getContentsLocation();
  EXPECT_STREQ(location->fileName, "lib.a");
  EXPECT_EQ(location->offset, 68u);
  EXPECT_FALSE(location->isTemporary);
}

TEST(ArchiveFileReader, ReadsHeadersAndNotBodies) {
  ArchiveBuilder builder;
  const std::string body(1'000'000, 'x');
  for (int i = 0; i < 20; ++i)
    builder.member("m" + std::to_string(i), body);
  const Reading reading(builder);
  EXPECT_TRUE(reading.isRead);
  EXPECT_EQ(reading.archive.getMembers().size(), 20u);
  EXPECT_LT(reading.host.getBytesRead(), 60'000u);
  EXPECT_LT(reading.host.readCalls(), 50u);
}

TEST(ArchiveFileReader, TakesSmallNeighboursWithOneRead) {
  ArchiveBuilder builder;
  for (int i = 0; i < 200; ++i)
    builder.member("m" + std::to_string(i), "body");
  const Reading reading(builder);
  EXPECT_TRUE(reading.isRead);
  EXPECT_LT(reading.host.readCalls(), 6u);
}

TEST(ArchiveFileReader, PassesPlainLibrariesWithTheirTypes) {
  const Reading reading(
      archive()
          .member("elf.o", object().bytes())
          .member("text", "!<arch>\n")
          .member("empty", "")
          .member("last.o",
                  object(testsupport::ElfClass::Class64, testsupport::ElfData::Big).bytes()));
  ASSERT_TRUE(reading.isRead);
  const auto members = reading.archive.getMembers();
  EXPECT_EQ(members[0]->getType(), ElfImageArchiveMemberType::getInstance());
  EXPECT_EQ(members[1]->getType(), UnknownArchiveMemberType::getInstance());
  EXPECT_EQ(members[2]->getType(), UnknownArchiveMemberType::getInstance());
  EXPECT_EQ(members[3]->getType(), ElfImageArchiveMemberType::getInstance());
}

// What stands behind a short member must not make an object of it.
TEST(ArchiveFileReader, DecidesATypeByTheMembersOwnBytes) {
  const std::string image = object().bytes();
  const Reading reading(archive().member("cut.o", image.substr(0, 50)).member("b", image));
  ASSERT_TRUE(reading.isRead);
  EXPECT_EQ(reading.archive.getMembers()[0]->getType(), UnknownArchiveMemberType::getInstance());
}

TEST(ArchiveFileReader, ReadsBothTablesAndKeepsTheirBytes) {
  Reading reading(
      archive().symbolTable({{"alpha", LongName}}).longNames({LongName}).member(LongName, "body"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("", "", LongName));
  const auto members = reading.archive.getMembers();
  EXPECT_EQ(reading.archive.getSymbolTable(), members[0]);
  EXPECT_EQ(reading.archive.getFileNameTable(), members[1]);
  EXPECT_EQ(members[0]->getType(), SymbolTableArchiveMemberType::getInstance());
  EXPECT_EQ(members[1]->getType(), FileNameTableArchiveMemberType::getInstance());
  EXPECT_TRUE(members[0]->isAuxiliary());
  EXPECT_TRUE(members[1]->hasContents());
  EXPECT_EQ(textOf(members[1]->getContents()), LongName + "/\n");
  EXPECT_EQ(members[2]->getFileNameTableOffset(), 0u);
  EXPECT_FALSE(members[2]->isAuxiliary());
}

TEST(ArchiveFileReader, TakesALongNameTableInFirstPlace) {
  const Reading reading(archive().longNames({LongName}).member(LongName, "x").member("b", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("", LongName, "b"));
  EXPECT_NE(reading.archive.getFileNameTable(), nullptr);
  EXPECT_EQ(reading.archive.getSymbolTable(), nullptr);
}

TEST(ArchiveFileReader, TakesALongNameTableBehindAnOrdinaryMember) {
  const Reading reading(archive().member("a", "").longNames({LongName}).member(LongName, "x"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("a", "", LongName));
  EXPECT_EQ(reading.archive.getFileNameTable(), reading.archive.getMembers()[1]);
}

TEST(ArchiveFileReader, TakesMisplacedTablesForOrdinaryMembersWithoutAName) {
  const Reading reading(archive()
                            .member("a", "")
                            .memberWithNameField("/", "x")
                            .blankNumbers()
                            .memberWithNameField("//", "y")
                            .blankNumbers());
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(reading.handler.reports, IsEmpty());
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("a", "", ""));
  EXPECT_EQ(reading.archive.getSymbolTable(), nullptr);
  EXPECT_EQ(reading.archive.getFileNameTable(), nullptr);
  EXPECT_FALSE(reading.archive.getMembers()[1]->isAuxiliary());
  EXPECT_FALSE(reading.archive.getMembers()[2]->isAuxiliary());
}

TEST(ArchiveFileReader, TakesASecondLongNameTableForAnOrdinaryMember) {
  const Reading reading(archive().longNames({LongName}).memberWithNameField("//", "other/\n"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_EQ(reading.archive.getFileNameTable(), reading.archive.getMembers()[0]);
  EXPECT_FALSE(reading.archive.getMembers()[1]->isAuxiliary());
}

TEST(ArchiveFileReader, TakesEmptyTables) {
  const Reading reading(archive().memberWithNameField("//", "").blankNumbers());
  ASSERT_TRUE(reading.isRead);
  EXPECT_EQ(reading.archive.getFileNameTable()->getSize(), 0u);
}

TEST(ArchiveFileReader, CutsNamesBehindTheirLastSeparator) {
  const Reading reading(archive()
                            .longNames({"dir/sub_with_long_name.o", "c:\\x\\windows_name.o"})
                            .memberWithNameField("/0", "")
                            .memberWithNameField("/26", "")
                            .member("d\\e.o", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive),
              ElementsAre("", "sub_with_long_name.o", "windows_name.o", "e.o"));
}

TEST(ArchiveFileReader, EndsNamesAtANulByte) {
  const Reading reading(archive()
                            .longNamesText(std::string("long\0dir/name/\n", 15))
                            .memberWithNameField("/0", "")
                            .memberWithNameField(std::string_view("ab\0c/", 5), ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("", "long", "ab"));
}

TEST(ArchiveFileReader, TakesAnEmptyShortName) {
  const Reading reading(archive().member("a", "").memberWithNameField("/ ", "x"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("a", ""));
}

TEST(ArchiveFileReader, ReportsAFileThatIsNotThere) {
  MemoryHost host;
  RecordingHandler handler;
  Archive archive(host);
  archive.setErrorHandler(&handler);
  EXPECT_FALSE(readFile("lib.a", archive));
  EXPECT_THAT(handler.reports, ElementsAre("0 I/O error reading file: No such file or directory"));
  EXPECT_STREQ(archive.getFileName(), "lib.a");
}

TEST(ArchiveFileReader, ReportsADirectoryAndASpecialFileWithoutWaiting) {
  MemoryHost host;
  host.addDirectory("dir");
  host.addSpecial("fifo").isUnreadable = true;
  RecordingHandler handler;
  Archive archive(host);
  archive.setErrorHandler(&handler);
  EXPECT_FALSE(readFile("dir", archive));
  EXPECT_THAT(handler.take(), ElementsAre("0 I/O error reading file: Is a directory"));
  EXPECT_FALSE(readFile("fifo", archive));
  EXPECT_THAT(handler.take(), ElementsAre("0 I/O error reading file: Invalid argument"));
  EXPECT_EQ(host.openHandles(), 0u);
}

TEST(ArchiveFileReader, TakesAFileThatIsTooShortForAReadError) {
  for (const char* bytes : {"", "!", "!<arch>"}) {
    const Reading reading{std::string_view(bytes)};
    EXPECT_FALSE(reading.isRead);
    EXPECT_THAT(reading.handler.reports, ElementsAre("0 I/O error reading file")) << bytes;
  }
}

TEST(ArchiveFileReader, ReportsABadArchiveMagic) {
  const std::string report =
      "0 File does not begin with the archive magic number (not an archive file?)";
  expectFatal(archive().badMagic("!<thin>\n"), report);
  expectFatal(archive().badMagic("!<arch>\r").member("a", "x"), report);
}

TEST(ArchiveFileReader, ReportsATruncatedHeader) {
  const std::string whole = archive().member("a", "").bytes();
  for (size_t size = 9; size < whole.size(); ++size) {
    expectFatal(archive().tail(whole.substr(8, size - 8)),
                "0 End of file in the middle of archive member header starting at offset 8");
  }
  expectFatal(archive().member("a", "xy").tail("\n"),
              "0 End of file in the middle of archive member header starting at offset 70");
}

TEST(ArchiveFileReader, ReportsABadMemberMagicAndGoesOnIfTold) {
  const ArchiveBuilder builder = archive().member("a", "x").badMemberMagic("`\r").member("b", "");
  const std::string report = "0 " + atOffset8("contains incorrect archive-member magic number");
  const Reading daring(builder, Answer::GoOnIfPossible);
  EXPECT_TRUE(daring.isRead);
  EXPECT_THAT(daring.handler.reports, ElementsAre(report));
  EXPECT_THAT(namesOf(daring.archive), ElementsAre("a", "b"));
  const Reading tolerant(builder);
  EXPECT_FALSE(tolerant.isRead);
  EXPECT_THAT(tolerant.handler.reports, ElementsAre(report));
  EXPECT_FALSE(isReadWithoutHandler(builder));
}

TEST(ArchiveFileReader, ReportsBadNumbersAndTakesThemForZero) {
  expectTolerable(archive().member("a", "").badDate("12x"),
                  "1 " + atOffset8("contains invalid date string '12x         '"));
  expectTolerable(archive().member("a", "").badUid("-1"),
                  "1 " + atOffset8("contains invalid uid string '-1    '"));
  expectTolerable(archive().member("a", "").badGid("1 2"),
                  "1 " + atOffset8("contains invalid gid string '1 2   '"));
  expectTolerable(archive().member("a", "").badMode("12389"),
                  "1 " + atOffset8("contains invalid mode string '12389   '"));
  const Reading reading(
      archive().member("a", "").badDate("9x").badUid("9x").badGid("9x").badMode("7x"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_EQ(reading.handler.reports.size(), 4u);
  const ArchiveMember* member = reading.archive.getMembers()[0];
  EXPECT_EQ(member->getDate(), 0);
  EXPECT_EQ(member->getUid(), 0u);
  EXPECT_EQ(member->getGid(), 0u);
  EXPECT_EQ(member->getMode(), 0u);
}

TEST(ArchiveFileReader, ShowsAFieldUpToANul) {
  expectTolerable(archive().member("a", "").badDate(std::string_view("1\0"
                                                                     "2",
                                                                     3)),
                  "1 " + atOffset8("contains invalid date string '1'"));
}

TEST(ArchiveFileReader, LetsOnlyTheTablesHaveBlankNumbers) {
  const Reading tables(archive()
                           .memberWithNameField("/", bigEndian(0))
                           .blankNumbers()
                           .longNamesText("")
                           .blankNumbers());
  EXPECT_TRUE(tables.isRead);
  EXPECT_THAT(tables.handler.reports, IsEmpty());
  expectTolerable(archive().member("a", "").badDate(""),
                  "1 " + atOffset8("contains invalid date string '            '"));
  expectTolerable(archive().memberWithNameField("//", "").badUid("x"),
                  "1 " + atOffset8("contains invalid uid string 'x     '"));
}

TEST(ArchiveFileReader, ReportsABadSizeOfAnyMember) {
  const std::string report = "0 " + atOffset8("contains invalid size string ");
  expectFatal(archive().member("a", "").badSize("1x"), report + "'1x        '");
  expectFatal(archive().member("a", "").badSize(""), report + "'          '");
  expectFatal(archive().memberWithNameField("//", "").badSize(""), report + "'          '");
  expectFatal(archive().member("a", "").badSize("4294967296"), report + "'4294967296'");
}

// Magic, date, uid, gid, mode, size, name: the order of the field reports.
TEST(ArchiveFileReader, ReportsFieldsInAFixedOrder) {
  const Reading reading(archive()
                            .memberWithNameField("no slash", "")
                            .badMemberMagic("xx")
                            .badMode("x")
                            .badGid("x")
                            .badUid("x")
                            .badDate("x"),
                        Answer::GoOnIfPossible);
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(reading.handler.reports,
              ElementsAre(testing::HasSubstr("magic"), testing::HasSubstr("date"),
                          testing::HasSubstr("uid"), testing::HasSubstr("gid"),
                          testing::HasSubstr("mode"), testing::HasSubstr("no '/'")));
}

TEST(ArchiveFileReader, ReportsALongNameWithoutATable) {
  expectTolerable(archive().memberWithNameField("/0", ""),
                  "2 " + atOffset8("contains an index into the long name table, but this archive "
                                   "has no long name table"));
}

TEST(ArchiveFileReader, ReportsABadLongNameIndex) {
  expectTolerable(archive().longNames({LongName}).memberWithNameField("/1x", ""),
                  "2 Archive member header starting at offset 92 contains invalid long-name index "
                  "'1x             '");
  expectTolerable(archive().longNames({LongName}).memberWithNameField("/4294967296", ""),
                  "2 Archive member header starting at offset 92 contains invalid long-name index "
                  "'4294967296     '");
}

TEST(ArchiveFileReader, ReportsALongNameIndexOutsideTheTable) {
  const std::string report = "2 Archive member header starting at offset 92 contains out-of-range "
                             "long-name index ";
  const std::string tableSize = " (the long-name table is 23 bytes long)";
  const auto builder = [](const char* field) {
    return archive().longNames({LongName}).memberWithNameField(field, "");
  };
  expectTolerable(builder("/23"), report + "23" + tableSize);
  expectTolerable(builder("/4294967295"), report + "4294967295" + tableSize);
  // On the entry's own newline.
  expectTolerable(builder("/22"), report + "22" + tableSize);
}

TEST(ArchiveFileReader, TakesAnIndexIntoTheMiddleOfALongName) {
  const Reading reading(archive().longNames({LongName}).memberWithNameField("/7", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("", LongName.substr(7)));
}

TEST(ArchiveFileReader, TakesAnIndexOnATerminatorForAnEmptyName) {
  const Reading reading(archive().longNames({LongName}).memberWithNameField("/21", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(reading.handler.reports, IsEmpty());
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("", ""));
}

TEST(ArchiveFileReader, NeverRejectsIndexZeroForANewline) {
  const Reading reading(archive().longNamesText("\nab/\n").memberWithNameField("/0", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("", "\nab"));
}

TEST(ArchiveFileReader, ReportsALongNameThatNeverEnds) {
  const auto report = [](const char* index, const char* size) {
    return std::string("2 Archive member header starting at offset 80 contains out-of-range "
                       "long-name index ") +
           index + " (the long-name table is " + size + " bytes long)";
  };
  expectTolerable(archive().longNamesText("no_end_at_al").memberWithNameField("/0", ""),
                  report("0", "12"));
  expectTolerable(archive().longNamesText("one/\ntwo_two").memberWithNameField("/5", ""),
                  report("5", "12"));
}

TEST(ArchiveFileReader, GivesAnEmptyNameWhereALongNameIsBad) {
  const Reading reading(archive().longNames({LongName}).memberWithNameField("/99", "x"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("", ""));
}

TEST(ArchiveFileReader, ReportsANameFieldWithoutASlash) {
  expectTolerable(archive().memberWithNameField("sixteen_letters_", ""),
                  "2 " + atOffset8("has no '/' character in its name field"));
  const Reading reading(archive().memberWithNameField("sixteen_letters_", "x"));
  EXPECT_THAT(namesOf(reading.archive), ElementsAre(""));
}

TEST(ArchiveFileReader, ReportsWhatStandsBehindTheSlashAndGivesAnEmptyName) {
  expectTolerable(archive().memberWithNameField("a.o/ x", ""),
                  "1 " + atOffset8("has a trailing non-space character after the '/' character in "
                                   "its name field"));
  const Reading reading(archive().memberWithNameField("a.o/x", ""));
  EXPECT_THAT(namesOf(reading.archive), ElementsAre(""));
  // A slash and a letter is no long name; neither are three slashes a table.
  EXPECT_FALSE(isReadWithoutHandler(archive().memberWithNameField("/x", "")));
  EXPECT_FALSE(isReadWithoutHandler(archive().memberWithNameField("///", "")));
}

TEST(ArchiveFileReader, ReportsAMemberThatReachesBeyondTheFile) {
  const ArchiveBuilder builder = archive().member("a.o", "12345").badSize("7").noPadding();
  const std::string report = "0 Error reading member 'a.o': archive member is at offset 68 and has "
                             "size 7 but archive file is only 73 bytes long";
  const Reading tolerant(builder);
  EXPECT_FALSE(tolerant.isRead);
  EXPECT_THAT(tolerant.handler.reports, ElementsAre(report));
  // There is nothing behind it to go on with.
  const Reading daring(builder, Answer::GoOnIfPossible);
  EXPECT_FALSE(daring.isRead);
  EXPECT_THAT(daring.handler.reports, ElementsAre(report, "0 I/O error reading file"));
}

TEST(ArchiveFileReader, ReportsATableThatReachesBeyondTheFile) {
  for (const char* field : {"/", "//"}) {
    const ArchiveBuilder builder =
        archive().memberWithNameField(field, "1234").badSize("4294967295");
    const std::string report = "0 Error reading member '': archive member is at offset 68 and has "
                               "size 4294967295 but archive file is only 72 bytes long";
    const Reading tolerant(builder);
    EXPECT_FALSE(tolerant.isRead);
    EXPECT_THAT(tolerant.handler.reports, ElementsAre(report));
    const Reading daring(builder, Answer::GoOnIfPossible);
    EXPECT_FALSE(daring.isRead);
    EXPECT_THAT(daring.handler.reports, ElementsAre(report, "0 I/O error reading file"));
  }
}

TEST(ArchiveFileReader, TakesAnEmptyMemberAtTheVeryEnd) {
  const Reading reading(archive().member("a", "xy").member("b", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_EQ(reading.archive.getMembers()[1]->getSize(), 0u);
}

TEST(ArchiveFileReader, NeedsThePaddingByteOfTheLastMember) {
  expectFatal(archive().member("a", "odd").noPadding(), "0 I/O error reading file");
  expectFatal(archive().longNamesText("odd").noPadding(), "0 I/O error reading file");
}

TEST(ArchiveFileReader, ReportsABadPaddingByte) {
  expectTolerable(archive().member("a", "odd").badPadding(' ').member("b", ""),
                  "1 Padding byte at offset 71 has value 32 and not 0x0A as it should be");
  expectTolerable(archive().longNamesText("odd").badPadding('\0'),
                  "1 Padding byte at offset 71 has value 0 and not 0x0A as it should be");
  expectTolerable(archive().member("a", "odd").badPadding('\xFF'),
                  "1 Padding byte at offset 71 has value -1 and not 0x0A as it should be");
}

TEST(ArchiveFileReader, MarksAFileThatMayNotBeWritten) {
  MemoryHost host;
  host.addFile("lib.a", archive().bytes()).isReadOnly = true;
  host.addFile("other.a", archive().bytes());
  Archive archive(host);
  EXPECT_TRUE(readFile("lib.a", archive));
  EXPECT_TRUE(archive.isReadOnly());
  EXPECT_TRUE(readFile("other.a", archive));
  EXPECT_FALSE(archive.isReadOnly());
}

TEST(ArchiveFileReader, StartsAnew) {
  Reading reading(archive().symbolTable({{"s", "a"}}).member("a", "x"));
  reading.archive.setSymbolTableMode(SymbolTableMode::Never);
  reading.host.addFile("lib.a", archive().member("b", "yz").bytes());
  ASSERT_TRUE(readFile("lib.a", reading.archive));
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("b"));
  EXPECT_TRUE(reading.archive.getSymbols().empty());
  EXPECT_EQ(reading.archive.getSymbolTable(), nullptr);
  EXPECT_EQ(reading.archive.getSymbolTableMode(), SymbolTableMode::IfSymbols);
}

TEST(ArchiveFileReader, LeavesTheArchiveUsableAfterAFailure) {
  Reading reading(archive().member("a", "x").tail("junk"));
  EXPECT_FALSE(reading.isRead);
  reading.host.addFile("lib.a", archive().member("b", "yz").bytes());
  EXPECT_TRUE(readFile("lib.a", reading.archive));
  EXPECT_THAT(namesOf(reading.archive), ElementsAre("b"));
}

TEST(ArchiveFileReader, LeavesEverythingUpToDate) {
  Reading reading(archive().symbolTable({}).longNames({LongName}).member(LongName, "x"));
  ASSERT_TRUE(reading.isRead);
  const std::string before = reading.host.read("lib.a");
  EXPECT_TRUE(writeFile("lib.a", reading.archive));
  EXPECT_EQ(reading.host.read("lib.a"), before);
}

// Whatever doesn't fit a signed 32-bit value can't be a member; an archive without members doesn't
// ask.
TEST(ArchiveFileReader, RefusesAFileWhoseNumbersDontFit) {
  const std::string report = "0 I/O error reading file 'lib.a': Value too large for defined data "
                             "type";
  for (int64_t MemoryHost::File::*number :
       {&MemoryHost::File::modificationTime, &MemoryHost::File::uid, &MemoryHost::File::gid}) {
    for (const int64_t value : {int64_t{-1}, int64_t{0x80000000}, int64_t{0x100000001}}) {
      Reading reading(archive());
      reading.host.at("lib.a").*number = value;
      EXPECT_TRUE(readFile("lib.a", reading.archive));
      reading.host.at("lib.a").bytes = archive().member("a", "").bytes();
      EXPECT_FALSE(readFile("lib.a", reading.archive));
      EXPECT_THAT(reading.handler.reports, ElementsAre(report));
    }
  }
}

// Else it would be an archive without members, and be replaced by one with new ones alone.
TEST(ArchiveFileReader, RefusesAnArchiveThatSaysItIsEmpty) {
  Reading reading(archive().member("a", "x"));
  reading.host.at("lib.a").toldSize = 0;
  EXPECT_FALSE(readFile("lib.a", reading.archive));
  EXPECT_THAT(reading.handler.reports, ElementsAre("0 I/O error reading file: Invalid argument"));
}

TEST(ArchiveFileReader, RefusesAnArchiveOfTwoGibibytes) {
  Reading reading(archive().member("a", ""));
  reading.host.at("lib.a").toldSize = 0x80000000;
  EXPECT_FALSE(readFile("lib.a", reading.archive));
  EXPECT_THAT(reading.handler.reports,
              ElementsAre("0 I/O error reading file 'lib.a': Value too large for defined data "
                          "type"));
}

// The file stays open for the members' bytes, and is closed when nobody wants them any more.
TEST(ArchiveFileReader, ReportsAFailedCloseOfWhatWasRead) {
  MemoryHost disk;
  disk.addFile("lib.a", archive().member("a", "").bytes());
  FaultyHost host(disk);
  RecordingHandler handler;
  Archive archive(host);
  archive.setErrorHandler(&handler);
  ASSERT_TRUE(readFile("lib.a", archive));
  host.failCall(1, EIO);
  EXPECT_FALSE(archive.closeFiles());
  EXPECT_EQ(host.getFailedOperation(), "close");
  EXPECT_THAT(handler.take(), ElementsAre("0 I/O error closing file 'lib.a': Input/output error"));
  EXPECT_TRUE(archive.closeFiles());
  EXPECT_THAT(handler.reports, IsEmpty());
}

// What ended the read is told, and not that the file could not be closed either.
TEST(ArchiveFileReader, DoesNotReportAFailedCloseAfterAnotherFailure) {
  MemoryHost disk;
  disk.addFile("lib.a", "no archive");
  FaultyHost host(disk);
  RecordingHandler handler;
  Archive archive(host);
  archive.setErrorHandler(&handler);
  EXPECT_FALSE(readFile("lib.a", archive));
  host.failCall(host.getCallCount(), EIO);
  handler.take();
  EXPECT_FALSE(readFile("lib.a", archive));
  EXPECT_EQ(host.getFailedOperation(), "close");
  EXPECT_THAT(handler.reports,
              ElementsAre("0 File does not begin with the archive magic number (not an archive "
                          "file?)"));
}

} // namespace arlib
