// SPDX-License-Identifier: Apache-2.0
//
// The tool's name from the name of its program file: extensions, separators, the letters in front
// that don't count, and arguments that are missing, empty or too long.

#include "support/interface/tool_name.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

namespace support {

namespace {

std::string nameOf(const char* argv0) {
  char buffer[ToolNameSize];
  std::fill(std::begin(buffer), std::end(buffer), '#');
  toolNameFrom(argv0, buffer);
  return buffer;
}

} // namespace

TEST(ToolName, IsTheLeafWithoutProgramExtension) {
  EXPECT_EQ(nameOf("quarn"), "quarn");
  EXPECT_EQ(nameOf("build/quarn/quarn"), "quarn");
  EXPECT_EQ(nameOf("C:\\tools\\quarn.EXE"), "quarn");
  EXPECT_EQ(nameOf("c:quarn.dll"), "quarn");
  EXPECT_EQ(nameOf("quarn.DLL"), "quarn");
}

TEST(ToolName, SkipsOneLeadingZq) {
  EXPECT_EQ(nameOf("C:\\tools\\zqquarn.exe"), "quarn");
  EXPECT_EQ(nameOf("zqzqx"), "zqx");
  EXPECT_EQ(nameOf("zq"), "");
}

TEST(ToolName, LosesOnlyOneExtensionAndIsThenCutAtTheLastDot) {
  EXPECT_EQ(nameOf("quarn.exe.dll"), "exe");
  EXPECT_EQ(nameOf("quarn.dll.exe"), "dll");
  EXPECT_EQ(nameOf("quarn-1.2"), "2");
  EXPECT_EQ(nameOf("a.b"), "b");
  EXPECT_EQ(nameOf("my.dir/quarn"), "quarn");
}

TEST(ToolName, KeepsAnExtensionThatIsTheWholeName) {
  EXPECT_EQ(nameOf(".exe"), "exe");
  EXPECT_EQ(nameOf("a.exe"), "a");
}

TEST(ToolName, KeepsAnExtensionOfMixedCase) {
  EXPECT_EQ(nameOf("quarn.Exe"), "Exe");
}

TEST(ToolName, IsEmptyForAMissingOrEmptyArgument) {
  EXPECT_EQ(nameOf(nullptr), "");
  EXPECT_EQ(nameOf(""), "");
  EXPECT_EQ(nameOf("dir/"), "");
}

TEST(ToolName, IsCutTo31Characters) {
  EXPECT_EQ(nameOf(std::string(31, 'n').c_str()), std::string(31, 'n'));
  EXPECT_EQ(nameOf(std::string(32, 'n').c_str()), std::string(31, 'n'));
}

} // namespace support
