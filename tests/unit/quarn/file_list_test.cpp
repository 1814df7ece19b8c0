// SPDX-License-Identifier: Apache-2.0
//
// Which files on disk a word stands for: patterns and plain words, in which order their files come,
// and when a pattern is left as it is.

#include "quarn/file_list.h"

#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

class FileListTest : public DriverTest {
protected:
  FileListTest() {
    m_Host.addDirectory("out");
    for (const char* name : {"b.o", "a.o", "a.txt", "out/c.o", "out/B.o"})
      m_Host.addFile(name, "");
  }

  Words filesOf(const Words& words, bool expand = true) {
    Words files;
    for (const std::string& word : words)
      addFileArgument(m_Host, word, expand, files);
    return files;
  }
};

TEST_F(FileListTest, KeepsAWordWithoutWildcards) {
  EXPECT_THAT(filesOf({"none.o", "out/c.o"}), ElementsAre("none.o", "out/c.o"));
}

TEST_F(FileListTest, PutsTheMatchesOfAPatternInByteOrder) {
  EXPECT_THAT(filesOf({"*.o"}), ElementsAre("a.o", "b.o"));
  EXPECT_THAT(filesOf({"out/?.o"}), ElementsAre("out/B.o", "out/c.o"));
}

TEST_F(FileListTest, KeepsTheOrderOfTheWords) {
  EXPECT_THAT(filesOf({"b.o", "a.*", "b.o"}), ElementsAre("b.o", "a.o", "a.txt", "b.o"));
}

TEST_F(FileListTest, KeepsAPatternThatMatchesNothing) {
  EXPECT_THAT(filesOf({"*.c"}), ElementsAre("*.c"));
}

TEST_F(FileListTest, KeepsAPatternWhereItMeansMembers) {
  EXPECT_THAT(filesOf({"*.o"}, false), ElementsAre("*.o"));
}

TEST_F(FileListTest, TakesWildcardsInFoldersAsTheyStand) {
  EXPECT_THAT(filesOf({"o*/c.o"}), ElementsAre("o*/c.o"));
}

} // namespace quarn
