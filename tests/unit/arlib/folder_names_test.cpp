// SPDX-License-Identifier: Apache-2.0
//
// Members that keep the folders of their names: on the way in, through a file, and beside the rule
// for archives that keep none.

#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

struct Folders {
  Folders() {
    archive.setKeepFolders(true);
    for (const char* name : {"a/x.o", "b/x.o", "a/a_long_name_of_a_file.txt", "plain.o"}) {
      host.addFile(name, name);
      archive.addMemberFromFile(name);
    }
    EXPECT_TRUE(writeFile("lib.a", archive));
  }
  MemoryHost host;
  Archive archive{host};
};

std::vector<std::string> withoutTables(const std::vector<std::string>& names) {
  std::vector<std::string> named;
  for (const std::string& name : names)
    if (!name.empty()) named.push_back(name);
  return named;
}

TEST(FolderNames, AreKeptThroughAFile) {
  Folders folders;
  Archive again(folders.host);
  again.setKeepFolders(true);
  ASSERT_TRUE(readFile("lib.a", again));
  EXPECT_THAT(withoutTables(namesOf(again)),
              ElementsAre("a/x.o", "b/x.o", "a/a_long_name_of_a_file.txt", "plain.o"));
  ASSERT_TRUE(writeFile("lib2.a", again));
  EXPECT_EQ(folders.host.read("lib2.a"), folders.host.read("lib.a"));
}

// A "/" would end the name in a header.
TEST(FolderNames, StandInTheLongNameTableHoweverShort) {
  Folders folders;
  EXPECT_NE(folders.host.read("lib.a").find("a/x.o/\nb/x.o/\na/a_long_name_of_a_file.txt/\n"),
            std::string::npos);
}

TEST(FolderNames, AreCutElsewhere) {
  Folders folders;
  Archive again(folders.host);
  ASSERT_TRUE(readFile("lib.a", again));
  EXPECT_THAT(withoutTables(namesOf(again)),
              ElementsAre("x.o", "x.o", "a_long_name_of_a_file.txt", "plain.o"));
}

TEST(FolderNames, AreReadWhereOtherArchiversWriteThem) {
  MemoryHost host;
  host.addFile("lib.a", archive().member("a/x.o", "1").member("y.o", "2").bytes());
  Archive read(host);
  read.setKeepFolders(true);
  ASSERT_TRUE(readFile("lib.a", read));
  EXPECT_THAT(namesOf(read), ElementsAre("a/x.o", "y.o"));
  ASSERT_TRUE(writeFile("lib.a", read));
  Archive again(host);
  again.setKeepFolders(true);
  ASSERT_TRUE(readFile("lib.a", again));
  EXPECT_THAT(namesOf(again), ElementsAre("", "a/x.o", "y.o"));
}

// The long-name table, where it would stand, ends a name there.
TEST(FolderNames, AreNoneWithANewlineBehindASlash) {
  MemoryHost host;
  host.addFile("lib.a", archive().member("a/\nx.o", "1").bytes());
  RecordingHandler handler{Answer::GoOnIfTolerable};
  Archive read(host);
  read.setErrorHandler(&handler);
  read.setKeepFolders(true);
  ASSERT_TRUE(readFile("lib.a", read));
  EXPECT_THAT(namesOf(read), ElementsAre(""));
  EXPECT_EQ(handler.reports.size(), 1U);
}

TEST(FolderNames, ComeAlongFromAnotherArchive) {
  Folders folders;
  Archive source(folders.host);
  source.setKeepFolders(true);
  ASSERT_TRUE(readFile("lib.a", source));
  Archive target(folders.host);
  target.setKeepFolders(true);
  for (const ArchiveMember* member : source.getMembers())
    if (!member->isAuxiliary()) target.addMemberFromMember(*member);
  EXPECT_THAT(namesOf(target),
              ElementsAre("a/x.o", "b/x.o", "a/a_long_name_of_a_file.txt", "plain.o"));
}

} // namespace

} // namespace arlib
