// SPDX-License-Identifier: Apache-2.0
//
// What build systems read of the version and the help.

#include "quarn-ar/usage.h"

#include "tests/unit/quarn-ar/ar_fixture.h"

#include <regex>

namespace quarn_ar {

namespace {

using testing::Not;

TEST(Usage, KnowsTheProgramByTheEndOfItsName) {
  EXPECT_EQ(programNamed("quarn-ar"), Program::Ar);
  EXPECT_EQ(programNamed("quarn-ranlib"), Program::Ranlib);
  EXPECT_EQ(programNamed("zev-none-elf-ranlib"), Program::Ranlib);
  EXPECT_EQ(programNamed("ranlib-ar"), Program::Ar);
  EXPECT_EQ(programNamed(""), Program::Ar);
}

TEST(Usage, SaysWhatItIsCompatibleWith) {
  const auto isVersion = [](const std::string& text, const char* pattern) {
    return std::regex_match(text, std::regex(pattern));
  };
  EXPECT_TRUE(
      isVersion(versionText(Program::Ar), "quarn-ar [0-9.]+ \\(compatible with GNU ar\\)\n"));
  EXPECT_TRUE(isVersion(versionText(Program::Ranlib),
                        "quarn-ranlib [0-9.]+ \\(compatible with GNU ranlib\\)\n"));
}

// Archives without dates and response files are there, thin archives are not.
TEST(Usage, NamesTheLettersThatBuildSystemsLookFor) {
  const std::string help = helpText(Program::Ar, "quarn-ar");
  EXPECT_THAT(help, HasSubstr("Usage: quarn-ar [-]{dmpqrstx}"));
  EXPECT_THAT(help, HasSubstr("[D]"));
  EXPECT_THAT(help, HasSubstr("@<"));
  EXPECT_THAT(help, Not(HasSubstr("[T]")));
  EXPECT_THAT(helpText(Program::Ranlib, "quarn-ranlib"), HasSubstr("-D"));
}

class UsageTest : public ArTest {};

TEST_F(UsageTest, IsShownToWhoAsks) {
  const RunOutcome help = ar({"--help"});
  EXPECT_EQ(help.status, 0);
  EXPECT_EQ(help.output, helpText(Program::Ar, "quarn-ar"));
  EXPECT_EQ(help.errors, "");
  const RunOutcome version = ranlib({"--version"});
  EXPECT_EQ(version.status, 0);
  EXPECT_EQ(version.output, versionText(Program::Ranlib));
  EXPECT_EQ(version.errors, "");
}

} // namespace

} // namespace quarn_ar
