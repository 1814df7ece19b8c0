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

class WindowsFileListTest : public FileListTest {
protected:
  WindowsFileListTest() {
    m_Host.setPathStyle(support::PathStyle_Windows);
    for (const char* name : {"out\\c.o", "out\\d.o", "c:e.o", "c:\\x\\f.o", "\\\\s\\h\\g.o"})
      m_Host.addFile(name, "");
  }
};

TEST_F(WindowsFileListTest, PutsOneKindOfSeparatorInWhatIsFound) {
  EXPECT_THAT(filesOf({"out/*.o"}), ElementsAre("out\\c.o", "out\\d.o"));
  EXPECT_THAT(filesOf({"out/c.o", "a.o"}), ElementsAre("out\\c.o", "a.o"));
}

TEST_F(WindowsFileListTest, KeepsDrivesAndShares) {
  EXPECT_THAT(filesOf({"c:?.o", "c:/x/*", "//s/h/*"}),
              ElementsAre("c:e.o", "c:\\x\\f.o", "\\\\s\\h\\g.o"));
}

TEST_F(WindowsFileListTest, LeavesAWordAsItIsThatMeansNoFile) {
  EXPECT_THAT(filesOf({"out/none.o", "*/x", "out/", ".", "..", "c:"}),
              ElementsAre("out/none.o", "*/x", "out/", ".", "..", "c:"));
  EXPECT_THAT(filesOf({"out/*.o"}, false), ElementsAre("out/*.o"));
}

TEST_F(FileListTest, TakesWildcardsInFoldersAsTheyStand) {
  EXPECT_THAT(filesOf({"o*/c.o"}), ElementsAre("o*/c.o"));
}

} // namespace quarn
