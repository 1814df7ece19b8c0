// SPDX-License-Identifier: Apache-2.0
//
// The list of members and the list of symbols: adding, removing, moving, finding. What can't be a
// member (no regular file, numbers that don't fit, a piece outside its file) must leave the list as
// it was.

#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>
#include <functional>

namespace arlib {

namespace {

class ArchiveListTest : public ArchiveTest {
protected:
  void readLetters() {
    read(archive()
             .symbolTable({{"s3", "c"}, {"s1", "a"}, {"s2", "b"}, {"s4", "c"}})
             .member("a", "")
             .member("b", "")
             .member("c", "")
             .member("d", ""));
  }

  std::vector<std::string> found(std::string_view name) {
    ArchiveMemberList list;
    const bool isFound = m_Archive.findMembers(name, list);
    EXPECT_EQ(isFound, list.getSize() != 0);
    std::vector<std::string> names;
    for (uint32_t i = 0; i < list.getSize(); ++i)
      names.push_back(std::to_string(m_Archive.getMemberIndex(list[i])));
    return names;
  }
};

} // namespace

TEST_F(ArchiveListTest, StartsEmpty) {
  EXPECT_TRUE(m_Archive.getMembers().empty());
  EXPECT_TRUE(m_Archive.getSymbols().empty());
  EXPECT_EQ(m_Archive.getFileName(), nullptr);
  EXPECT_FALSE(m_Archive.isReadOnly());
  EXPECT_EQ(m_Archive.getSymbolTableMode(), SymbolTableMode::IfSymbols);
  EXPECT_FALSE(m_Archive.getIncludeDebugSymbols());
  EXPECT_FALSE(m_Archive.getUniqueSymbolsOnly());
  EXPECT_FALSE(m_Archive.getUseObjectBuildAttributes());
  EXPECT_EQ(m_Archive.getClientData(), nullptr);
  EXPECT_EQ(m_Archive.computeFileSize(), 8u);
}

TEST_F(ArchiveListTest, CopiesItsFileNameAndClearsTheReadOnlyMark) {
  m_Host.addFile("lib.a", archive().bytes()).isReadOnly = true;
  ASSERT_TRUE(readFile("lib.a", m_Archive));
  ASSERT_TRUE(m_Archive.isReadOnly());
  const char* stored = m_Archive.getFileName();
  m_Archive.setFileName(stored);
  EXPECT_TRUE(m_Archive.isReadOnly());
  std::string same = "lib.a";
  m_Archive.setFileName(same.c_str());
  EXPECT_FALSE(m_Archive.isReadOnly());
  EXPECT_EQ(m_Archive.getFileName(), stored);
  same = "other";
  m_Archive.setFileName(same.c_str());
  same = "third";
  EXPECT_STREQ(m_Archive.getFileName(), "other");
  m_Archive.setFileName(nullptr);
  EXPECT_EQ(m_Archive.getFileName(), nullptr);
}

TEST_F(ArchiveListTest, AddsAnEmptyMember) {
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  ArchiveMember* added = m_Archive.addMember("dir/a.o", 1, 2, 3, 0644);
  EXPECT_EQ(added->getName(), "dir/a.o");
  EXPECT_EQ(added->getDate(), 1);
  EXPECT_EQ(added->getUid(), 2u);
  EXPECT_EQ(added->getGid(), 3u);
  EXPECT_EQ(added->getMode(), 0644u);
  EXPECT_EQ(added->getSize(), 0u);
  EXPECT_TRUE(added->hasContents());
  EXPECT_FALSE(added->isModified());
  EXPECT_EQ(added->getType(), UnknownArchiveMemberType::getInstance());
  EXPECT_EQ(m_Archive.getMemberIndex(added), 0u);
}

TEST_F(ArchiveListTest, AddsAFileUnderTheLastPartOfItsName) {
  testsupport::MemoryHost::File& file = m_Host.addFile("dir\\sub/a.o", object().bytes());
  file.modificationTime = 5;
  file.mode = 0100755;
  ArchiveMember* added = m_Archive.addMemberFromFile("dir\\sub/a.o");
  ASSERT_NE(added, nullptr);
  EXPECT_EQ(added->getName(), "a.o");
  EXPECT_EQ(added->getDate(), 5);
  EXPECT_EQ(added->getUid(), 1u);
  EXPECT_EQ(added->getGid(), 2u);
  EXPECT_EQ(added->getMode(), 0100755u);
  EXPECT_EQ(added->getSize(), 52u);
  EXPECT_TRUE(added->isModified());
  EXPECT_EQ(added->getType(), ElfImageArchiveMemberType::getInstance());
  EXPECT_STREQ(added->getContentsLocation()->fileName, "dir\\sub/a.o");
  EXPECT_EQ(added->getContentsLocation()->offset, 0u);
}

// A host that tells of no mode has told nothing of the file.
TEST_F(ArchiveListTest, RefusesAFileWithoutAMode) {
  m_Host.addFile("a.o", "x").mode = 0;
  EXPECT_EQ(m_Archive.addMemberFromFile("a.o"), nullptr);
  EXPECT_EQ(m_Archive.addMemberFromFileRegion("a.o", "a.o", 0, 1, std::nullopt), nullptr);
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o': Invalid argument",
                                     "0 I/O error reading file 'a.o': Invalid argument"));
}

// Many input files must not need as many descriptors at once.
TEST_F(ArchiveListTest, KeepsNoMoreFilesOpenThanItsBound) {
  for (int i = 0; i < 300; ++i) {
    const std::string name = std::to_string(i);
    ASSERT_NE(add(name.c_str(), "contents of " + name), nullptr);
    ASSERT_LE(m_Host.openHandles(), support::SourceFiles::DefaultBound);
  }
  for (uint32_t i = 0; i < 300; ++i)
    EXPECT_EQ(contentsOf(member(i)), "contents of " + std::to_string(i));
  EXPECT_LE(m_Host.openHandles(), support::SourceFiles::DefaultBound);
}

TEST_F(ArchiveListTest, TakesAMemberOverThroughTheFileOfItsOwnArchive) {
  m_Host.addFile("source.a", archive().member("a.o", object().bytes()).bytes());
  {
    Archive source(m_Host);
    ASSERT_TRUE(readFile("source.a", source));
    m_Host.addFile("source.a", std::string(500, 'x'));
    const ArchiveMember* added = m_Archive.addMemberFromMember(*source.getMembers()[0]);
    EXPECT_EQ(added->getName(), "a.o");
    EXPECT_EQ(added->getType(), ElfImageArchiveMemberType::getInstance());
    EXPECT_EQ(added->getDate(), source.getMembers()[0]->getDate());
    EXPECT_TRUE(added->isModified());
  }
  EXPECT_EQ(contentsOf(member(0)), object().bytes());
}

// Nobody knows what it is.
TEST_F(ArchiveListTest, AddsNothingThatItCannotOpen) {
  m_Host.addFile("a.o", object().bytes()).isUnreadable = true;
  EXPECT_EQ(m_Archive.addMemberFromFile("a.o"), nullptr);
  EXPECT_EQ(m_Archive.addMemberFromFileRegion("m", "a.o", 0, 4, std::nullopt), nullptr);
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o': Permission denied",
                                     "0 I/O error reading file 'a.o': Permission denied"));
  EXPECT_TRUE(m_Archive.getMembers().empty());
}

// The reading ahead of a small file may fail; what decides the member's type may not.
TEST_F(ArchiveListTest, AddsAndReplacesNothingWhoseFirstBytesItCannotRead) {
  MemoryHost host;
  host.addFile("large.o", object().tail(std::string(100000, 'x')).bytes());
  host.addFile("a.o", "plain");
  FaultyHost faulty(host);
  RecordingHandler handler;
  Archive archive(faulty);
  archive.setErrorHandler(&handler);
  ArchiveMember* member = archive.addMemberFromFile("a.o");
  const std::vector<std::function<bool()>> operations = {
      [&] { return archive.addMemberFromFile("large.o") != nullptr; },
      [&] {
        return archive.addMemberFromFileRegion("m", "large.o", 0, 60, std::nullopt) != nullptr;
      },
      [&] { return member->setContentsFromFile("large.o"); },
      [&] { return member->setContentsFromFileRegion("large.o", 0, 60); }};
  for (const auto& operation : operations) {
    faulty.failCall(4, EIO);
    EXPECT_FALSE(operation());
    EXPECT_EQ(faulty.getFailedOperation(), "readAt");
    EXPECT_THAT(handler.take(),
                ElementsAre("0 I/O error reading file 'large.o': Input/output error"));
    EXPECT_THAT(namesOf(archive), ElementsAre("a.o"));
    EXPECT_EQ(contentsOf(member), "plain");
  }
}

TEST_F(ArchiveListTest, AddsNothingThatIsNoRegularFile) {
  m_Host.addDirectory("dir");
  m_Host.addSpecial("fifo");
  EXPECT_EQ(m_Archive.addMemberFromFile("gone"), nullptr);
  EXPECT_EQ(m_Archive.addMemberFromFile("dir"), nullptr);
  EXPECT_EQ(m_Archive.addMemberFromFile("fifo"), nullptr);
  EXPECT_EQ(m_Archive.addMemberFromFileRegion("m", "gone", 0, 0, std::nullopt), nullptr);
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'gone': No such file or directory",
                                     "0 I/O error reading file 'dir': Is a directory",
                                     "0 I/O error reading file 'fifo': Invalid argument",
                                     "0 I/O error reading file 'gone': No such file or directory"));
  EXPECT_TRUE(m_Archive.getMembers().empty());
}

TEST_F(ArchiveListTest, AddsNothingWhoseNumbersDontFit) {
  const std::string report =
      "0 I/O error reading file 'a.o': Value too large for defined data type";
  for (int64_t MemoryHost::File::*number :
       {&MemoryHost::File::modificationTime, &MemoryHost::File::uid, &MemoryHost::File::gid}) {
    for (const int64_t value : {int64_t{-1}, int64_t{0x80000000}, int64_t{0x100000000}}) {
      m_Host.addFile("a.o", "x").*number = value;
      EXPECT_EQ(m_Archive.addMemberFromFile("a.o"), nullptr);
      EXPECT_THAT(reports(), ElementsAre(report));
    }
    m_Host.addFile("a.o", "x").*number = 0x7FFFFFFF;
    EXPECT_NE(m_Archive.addMemberFromFile("a.o"), nullptr);
  }
  for (const int64_t size : {int64_t{0x80000000}, int64_t{0x100000001}}) {
    m_Host.addFile("a.o", "x").toldSize = size;
    EXPECT_EQ(m_Archive.addMemberFromFile("a.o"), nullptr);
    EXPECT_THAT(reports(), ElementsAre(report));
  }
}

TEST_F(ArchiveListTest, AddsAPieceOfAFile) {
  m_Host.addFile("src", "ab" + object().bytes() + "c");
  ArchiveMember* added = m_Archive.addMemberFromFileRegion("dir/m.o", "src", 2, 52, std::nullopt);
  ASSERT_NE(added, nullptr);
  EXPECT_EQ(added->getName(), "m.o");
  EXPECT_EQ(added->getType(), ElfImageArchiveMemberType::getInstance());
  EXPECT_EQ(added->getDate(), 1'000'000'000);
  EXPECT_TRUE(added->isModified());
  EXPECT_EQ(contentsOf(added), object().bytes());
  const ArchiveMember* none = m_Archive.addMemberFromFileRegion("n", "src", 55, 0, std::nullopt);
  ASSERT_NE(none, nullptr);
  EXPECT_EQ(none->getSize(), 0u);
}

TEST_F(ArchiveListTest, RefusesAPieceOutsideItsFile) {
  m_Host.addFile("src", "12345");
  EXPECT_EQ(m_Archive.addMemberFromFileRegion("m", "src", 6, 0, std::nullopt), nullptr);
  EXPECT_EQ(m_Archive.addMemberFromFileRegion("m", "src", 0, 6, std::nullopt), nullptr);
  EXPECT_EQ(m_Archive.addMemberFromFileRegion("m", "src", 3, 0xFFFFFFFE, "shown"), nullptr);
  EXPECT_THAT(reports(),
              ElementsAre("0 Error reading region from file 'src' at offset 6 with size 0: file is "
                          "only 5 bytes long",
                          "0 Error reading region from file 'src' at offset 0 with size 6: file is "
                          "only 5 bytes long",
                          "0 Error reading member 'shown': archive member is at offset 3 and has "
                          "size 4294967294 but archive file is only 5 bytes long"));
  EXPECT_TRUE(m_Archive.getMembers().empty());
}

TEST_F(ArchiveListTest, CutsAPieceToItsFileIfTold) {
  RecordingHandler daring(Answer::GoOnIfPossible);
  m_Archive.setErrorHandler(&daring);
  m_Host.addFile("src", "12345");
  ArchiveMember* cut = m_Archive.addMemberFromFileRegion("m", "src", 3, 10, std::nullopt);
  ASSERT_NE(cut, nullptr);
  EXPECT_EQ(contentsOf(cut), "45");
  ArchiveMember* nothing = m_Archive.addMemberFromFileRegion("m", "src", 9, 10, std::nullopt);
  ASSERT_NE(nothing, nullptr);
  EXPECT_EQ(nothing->getSize(), 0u);
  EXPECT_EQ(nothing->getContentsLocation()->offset, 5u);
}

TEST_F(ArchiveListTest, RemovesAMemberAndItsSymbolsAndKeepsTheOrderOfTheRest) {
  readLetters();
  SymbolList list;
  EXPECT_TRUE(m_Archive.findSymbols("s3", list));
  EXPECT_EQ(m_Archive.getDefinedSymbols(member(3)).size(), 2u);
  const ArchiveMember* gone = member(3);
  m_Archive.removeMember(member(3));
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "a", "b", "d"));
  EXPECT_THAT(symbolNamesOf(m_Archive), ElementsAre("s1", "s2"));
  EXPECT_FALSE(m_Archive.findSymbols("s3", list));
  EXPECT_TRUE(m_Archive.getDefinedSymbols(gone).empty());
  EXPECT_THAT(found("c"), IsEmpty());
}

TEST_F(ArchiveListTest, RemovesManyMembersAtOnce) {
  readLetters();
  const std::vector<ArchiveMember*> doomed = {member(4), member(1), member(3)};
  m_Archive.removeMembers(doomed);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "b"));
  EXPECT_THAT(symbolNamesOf(m_Archive), ElementsAre("s2"));
  m_Archive.removeMembers({});
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "b"));
}

TEST_F(ArchiveListTest, DeletesTheTemporaryFileOfARemovedMember) {
  ArchiveMember* added = m_Archive.addMember("a", 0, 0, 0, 0);
  added->setContents("x", 1);
  added->discardContents();
  EXPECT_EQ(m_Host.getNames().size(), 1u);
  m_Archive.removeMember(added);
  EXPECT_THAT(m_Host.getNames(), IsEmpty());
}

TEST_F(ArchiveListTest, LeavesTheFileOfARemovedMember) {
  readLetters();
  m_Archive.removeMember(member(1));
  EXPECT_TRUE(m_Host.has("lib.a"));
}

TEST_F(ArchiveListTest, ClearsMembersAndTheirTemporaryFiles) {
  readLetters();
  ArchiveMember* added = m_Archive.addMember("e", 0, 0, 0, 0);
  added->discardContents();
  m_Archive.clear();
  EXPECT_TRUE(m_Archive.getMembers().empty());
  EXPECT_TRUE(m_Archive.getSymbols().empty());
  EXPECT_EQ(m_Archive.getSymbolTable(), nullptr);
  EXPECT_THAT(found("a"), IsEmpty());
  EXPECT_THAT(m_Host.getNames(), ElementsAre("lib.a"));
}

TEST_F(ArchiveListTest, LeavesTemporaryFilesOnDiskWhenItGoes) {
  {
    Archive archive(m_Host);
    archive.addMember("a", 0, 0, 0, 0)->discardContents();
  }
  EXPECT_THAT(m_Host.getNames(), ElementsAre("/tmp/quarn.0"));
}

TEST_F(ArchiveListTest, MovesAMemberToAPlaceCountedWithoutIt) {
  readLetters();
  m_Archive.moveMember(member(1), 3);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "b", "c", "a", "d"));
  m_Archive.moveMember(member(3), 0);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("a", "", "b", "c", "d"));
  m_Archive.moveMember(member(0), 5);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "b", "c", "d", "a"));
}

// Nothing is stale after it, so the tables stay byte by byte as they are.
TEST_F(ArchiveListTest, ChangesNothingForAMoveToTheSamePlace) {
  readLetters();
  const std::string before = m_Host.read("lib.a");
  m_Archive.moveMember(member(2), 2);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), before);
  m_Archive.moveMember(member(2), 3);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_NE(m_Host.read("lib.a"), before);
}

TEST_F(ArchiveListTest, MovesManyMembersTogetherInTheOrderGiven) {
  readLetters();
  const std::vector<ArchiveMember*> lastTwo = {member(3), member(4)};
  m_Archive.moveMembers(lastTwo, 1);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "c", "d", "a", "b"));
  m_Archive.moveMembers({}, 0);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "c", "d", "a", "b"));
  EXPECT_THAT(found("b"), ElementsAre("4"));
  const std::vector<ArchiveMember*> twoOthers = {member(4), member(1)};
  m_Archive.moveMembers(twoOthers, 3);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", "d", "a", "b", "c"));
}

TEST_F(ArchiveListTest, TellsPositions) {
  readLetters();
  EXPECT_EQ(m_Archive.getMemberIndex(member(2)), 2u);
  ArchiveMember* gone = member(2);
  const Symbol* symbol = m_Archive.getSymbols()[2];
  EXPECT_EQ(m_Archive.getSymbolIndex(symbol), 2u);
  m_Archive.removeMember(gone);
  EXPECT_EQ(m_Archive.getMemberIndex(gone), 0x80000000u);
  EXPECT_EQ(m_Archive.getSymbolIndex(symbol), 0x80000000u);
}

TEST_F(ArchiveListTest, FindsAllMembersOfANameInFileOrderIgnoringCase) {
  read(archive()
           .member("b.o", "")
           .member("Foo.o", "")
           .member("foo.O", "")
           .member("a.o", "")
           .member("FOO.O", "")
           .member("fop.o", "")
           .member("foo.o", ""));
  EXPECT_THAT(found("foo.o"), ElementsAre("1", "2", "4", "6"));
  EXPECT_THAT(found("FOO.o"), ElementsAre("1", "2", "4", "6"));
  EXPECT_THAT(found("foo."), IsEmpty());
  EXPECT_THAT(found("foo.oo"), IsEmpty());
  EXPECT_THAT(found("a.o"), ElementsAre("3"));
  EXPECT_THAT(found("zz"), IsEmpty());
}

TEST_F(ArchiveListTest, FoldsAsciiLettersOnly) {
  read(archive().member("\xC4.o", "").member("[.o", ""));
  EXPECT_THAT(found("\xE4.o"), IsEmpty());
  EXPECT_THAT(found("{.o"), IsEmpty());
  EXPECT_THAT(found("[.O"), ElementsAre("1"));
}

TEST_F(ArchiveListTest, FindsTablesUnderTheEmptyNameAlone) {
  readLetters();
  EXPECT_THAT(found(""), ElementsAre("0"));
}

TEST_F(ArchiveListTest, FindsWhatWasAddedSince) {
  readLetters();
  EXPECT_THAT(found("e"), IsEmpty());
  add("e", "");
  EXPECT_THAT(found("e"), ElementsAre("5"));
  m_Archive.addMember("E", 0, 0, 0, 0);
  EXPECT_THAT(found("e"), ElementsAre("5", "6"));
}

TEST_F(ArchiveListTest, FindsMembersInTheirOrderAfterAMove) {
  read(archive().member("x", "1").member("y", "").member("X", "2"));
  EXPECT_THAT(found("x"), ElementsAre("0", "2"));
  m_Archive.moveMember(member(2), 0);
  EXPECT_THAT(found("x"), ElementsAre("0", "1"));
  ArchiveMemberList list;
  m_Archive.findMembers("x", list);
  EXPECT_EQ(list[0]->getName(), "X");
}

TEST_F(ArchiveListTest, FindsSymbolsByExactNameInTableOrder) {
  read(archive()
           .symbolTable({{"foo", "b"}, {"Foo", "a"}, {"foo", "a"}, {"\xFF", "a"}, {"bar", "a"}})
           .member("a", "")
           .member("b", ""));
  SymbolList list;
  EXPECT_TRUE(m_Archive.findSymbols("foo", list));
  ASSERT_EQ(list.getSize(), 2u);
  EXPECT_EQ(list[0], m_Archive.getSymbols()[0]);
  EXPECT_EQ(list[1], m_Archive.getSymbols()[2]);
  EXPECT_TRUE(m_Archive.findSymbols("\xFF", list));
  EXPECT_FALSE(m_Archive.findSymbols("FOO", list));
  EXPECT_EQ(list.getSize(), 0u);
}

TEST_F(ArchiveListTest, SumsItsSizeInSixtyFourBits) {
  for (const char* name : {"a", "b", "c"}) {
    m_Host.addFile(name, std::string(elfext::RecognizedBytes, 'x')).toldSize = 0x7FFFFFFF;
    ASSERT_NE(m_Archive.addMemberFromFile(name), nullptr);
  }
  EXPECT_EQ(m_Archive.computeFileSize(), 8 + 3 * (60 + 0x80000000ull));
}

TEST_F(ArchiveListTest, TellsTheHandlerOrAnswersNo) {
  m_Archive.setErrorHandler(nullptr);
  EXPECT_FALSE(m_Archive.goOn(&ErrorHandler::reportNoLongNameTable, uint64_t{8}));
  RecordingHandler strict(Answer::GiveUp);
  m_Archive.setErrorHandler(&strict);
  EXPECT_FALSE(m_Archive.goOn(&ErrorHandler::reportNoLongNameTable, uint64_t{8}));
  m_Archive.setErrorHandler(&m_Handler);
  EXPECT_TRUE(m_Archive.goOn(&ErrorHandler::reportNoLongNameTable, uint64_t{8}));
}

} // namespace arlib
