// SPDX-License-Identifier: Apache-2.0
//
// Taking file names apart and putting them together again, in both styles: a POSIX name comes back
// byte for byte, and a leaf is cut where it is longer than a component may be.

#include "support/interface/path.h"

#include <gtest/gtest.h>

namespace support {

TEST(PathStyle, IsWindowsForADriveAShareOrALeadingBackslash) {
  EXPECT_EQ(detectPathStyle("c:x.o"), PathStyle_Windows);
  EXPECT_EQ(detectPathStyle("\\\\server\\share\\x.o"), PathStyle_Windows);
  EXPECT_EQ(detectPathStyle("//server/share/x.o"), PathStyle_Windows);
  EXPECT_EQ(detectPathStyle("\\x.o"), PathStyle_Windows);
}

TEST(PathStyle, IsPosixForALeadingSlashEvenWithABackslashInside) {
  EXPECT_EQ(detectPathStyle("/lib/x.o"), PathStyle_Posix);
  EXPECT_EQ(detectPathStyle("/lib\\x.o"), PathStyle_Posix);
}

TEST(PathStyle, IsWindowsForABackslashInsideElseUndetermined) {
  EXPECT_EQ(detectPathStyle("dir\\x.o"), PathStyle_Windows);
  EXPECT_EQ(detectPathStyle("dir/x.o"), PathStyle_Undetermined);
  EXPECT_EQ(detectPathStyle("x.o"), PathStyle_Undetermined);
  EXPECT_EQ(detectPathStyle(""), PathStyle_Undetermined);
}

TEST(PathStyle, HasTheStyleNumbersOfItsFormat) {
  EXPECT_EQ(path("c:\\x").getStyle(), 2u);
  EXPECT_EQ(path("/x").getStyle(), 3u);
  EXPECT_EQ(path("x").getStyle(), 5u);
}

TEST(Path, SplitsAWindowsNameIntoFourStrings) {
  const path name("c:/lib/sub\\mem.v1.o");
  EXPECT_EQ(name.getDrive(), "c:");
  EXPECT_EQ(name.getDirectory(), "\\lib\\sub\\");
  EXPECT_EQ(name.getBase(), "mem.v1");
  EXPECT_EQ(name.getExtension(), ".o");
  EXPECT_EQ(name.toString(), "c:\\lib\\sub\\mem.v1.o");
}

TEST(Path, SplitsAShareFromItsDirectory) {
  const path name("//server/share/dir/x.o");
  EXPECT_EQ(name.getDrive(), "\\\\server\\share");
  EXPECT_EQ(name.getDirectory(), "\\dir\\");
  EXPECT_EQ(name.getLeaf(), "x.o");
  EXPECT_EQ(path("\\\\server").getDrive(), "\\\\server");
  EXPECT_EQ(path("\\\\").toString(), "\\\\");
}

TEST(Path, TreatsAnUndeterminedNameAsAWindowsName) {
  const path name("dir/x.o");
  EXPECT_EQ(name.getStyle(), PathStyle_Undetermined);
  EXPECT_EQ(name.getDirectory(), "dir\\");
}

TEST(Path, KeepsAPosixDirectoryByteForByte) {
  path name("a:b//./c\\d*/x?.o", PathStyle_Posix);
  EXPECT_EQ(name.getDrive(), "");
  EXPECT_EQ(name.getDirectory(), "a:b//./c\\d*/");
  name.replaceLeaf("x1.o");
  EXPECT_EQ(name.toString(), "a:b//./c\\d*/x1.o");
}

TEST(Path, ReplacesOnlyTheLeaf) {
  path name("c:dir\\*.o");
  name.replaceLeaf("new");
  EXPECT_EQ(name.getBase(), "new");
  EXPECT_EQ(name.getExtension(), "");
  EXPECT_EQ(name.toString(), "c:dir\\new");
}

TEST(Path, GivesBackEveryPosixNameUnchanged) {
  for (const char* text :
       {"", ".", "..", "/", "a.", ".a", "a..b", "dir/", "dir/.x", "a\\b", "\xff"}) {
    EXPECT_EQ(path(text, PathStyle_Posix).toString(), text);
  }
}

TEST(Path, CutsALeafBeyondTheLongestComponent) {
  const path name(std::string("d/") + std::string(5000, 'x'), PathStyle_Posix);
  EXPECT_EQ(name.getLeaf(), std::string(LongestPathComponent, 'x'));
}

TEST(DriveName, IsALetterAndAColon) {
  for (const char* name : {"c:", "Z:"})
    EXPECT_TRUE(isDriveName(name)) << name;
  for (const char* name : {"", "c", ":", "1:", "c:/", "c:x", "cc:"})
    EXPECT_FALSE(isDriveName(name)) << name;
}

TEST(WithoutDrive, CutsOneOnHostsThatHaveThem) {
  EXPECT_EQ(withoutDrive("c:x.o", PathStyle_Windows), "x.o");
  EXPECT_EQ(withoutDrive("c:\\x.o", PathStyle_Windows), "\\x.o");
  EXPECT_EQ(withoutDrive("1:x.o", PathStyle_Windows), "1:x.o");
  EXPECT_EQ(withoutDrive("c:x.o", PathStyle_Posix), "c:x.o");
}

TEST(LeafOf, GoesByTheHost) {
  EXPECT_EQ(leafOf("d/a\\b.o", PathStyle_Posix), "a\\b.o");
  EXPECT_EQ(leafOf("d/a\\b.o", PathStyle_Windows), "b.o");
  EXPECT_EQ(leafOf("c:b.o", PathStyle_Posix), "c:b.o");
  EXPECT_EQ(leafOf("c:b.o", PathStyle_Windows), "b.o");
}

TEST(PlainLeaf, IsEveryOneOnPosix) {
  for (const char* leaf : {"con", "a:b", "x.", "x ", ""})
    EXPECT_TRUE(isPlainLeaf(leaf, PathStyle_Posix)) << leaf;
}

TEST(PlainLeaf, IsNoDeviceOnWindows) {
  for (const char* leaf :
       {"con", "CON", "nul", "Nul.o", "aux.tar.gz", "prn .txt", "com1", "COM9.x", "lpt0", "lpt3 ",
        "com\xC2\xB9", "LPT\xC2\xB3.o", "conin$", "CONOUT$.o", "clock$"})
    EXPECT_FALSE(isPlainLeaf(leaf, PathStyle_Windows)) << leaf;
  for (const char* leaf :
       {"cons", "com", "com10", "com\xC2\xB4", "xcon", "a.nul", "lptx", "conin", "co", "nul_.o"})
    EXPECT_TRUE(isPlainLeaf(leaf, PathStyle_Windows)) << leaf;
}

TEST(PlainLeaf, IsNoStreamAndNoNameWithAnEndThatIsDroppedOnWindows) {
  for (const char* leaf : {"a:b", "c:", ":x", "x.", "x ", "x. .", "...", " "})
    EXPECT_FALSE(isPlainLeaf(leaf, PathStyle_Windows)) << leaf;
  // Folders in every folder, which can't be opened for files.
  for (const char* leaf : {".", "..", ".x", " x", "a b.o"})
    EXPECT_TRUE(isPlainLeaf(leaf, PathStyle_Windows)) << leaf;
}

TEST(PlainLeaf, HasNoCharacterThatNamesCannotHaveOnWindows) {
  for (const char* leaf : {"a*b", "?", "a<b", "a>b", "a|b", "\"a\"", "a\tb", "\x01", "a\n"}) {
    EXPECT_FALSE(isPlainLeaf(leaf, PathStyle_Windows)) << leaf;
    EXPECT_TRUE(isPlainLeaf(leaf, PathStyle_Posix)) << leaf;
  }
}

TEST(LastPathComponent, StandsBehindTheLastSeparatorOfEitherKind) {
  EXPECT_EQ(lastPathComponent("a/b\\c.o"), "c.o");
  EXPECT_EQ(lastPathComponent("a\\b/c.o"), "c.o");
  EXPECT_EQ(lastPathComponent("c:x.o"), "c:x.o");
  EXPECT_EQ(lastPathComponent("dir/"), "");
  EXPECT_EQ(lastPathComponent("x"), "x");
  EXPECT_EQ(lastPathComponent(""), "");
}

} // namespace support
