// SPDX-License-Identifier: Apache-2.0
//
// Letters that share a dash: which options they set, what is said of a letter that comes twice, and
// words of any length, in time that grows with it.

#include "tool_table.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(Concatenation, SetsEachLetter) {
  Session session;
  session.parse({"-tvC", "word"});
  EXPECT_TRUE(session.parser().getBoolean(Id_List));
  EXPECT_TRUE(session.parser().getBoolean(Id_Verbose));
  EXPECT_TRUE(session.parser().getBoolean(Id_KeepOld));
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("word"));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(Concatenation, WarnsOfARepeatedLetter) {
  EXPECT_THAT(reportsOf({"-tt"}),
              ElementsAre("warning: Option '-t' repeated in concatenated options '-tt'."));
  EXPECT_THAT(reportsOf({"-tvtC"}),
              ElementsAre("warning: Option '-t' repeated in concatenated options '-tvtC'."));
}

TEST(Concatenation, WarnsOfTwoLettersOfOneOption) {
  EXPECT_THAT(reportsOf({"-rq"}),
              ElementsAre("warning: Option '-q' repeated in concatenated options '-rq'."));
}

TEST(Concatenation, NamesTheRowsInTheWarning) {
  EXPECT_THAT(reportsOf({"-Xx"}),
              ElementsAre("warning: Old syntax, please use '-x'.",
                          "warning: Option '-x' repeated in concatenated options '-xx'."));
}

TEST(Concatenation, ForgetsTheLettersOfOtherWords) {
  EXPECT_THAT(reportsOf({"-tv", "-tv"}), IsEmpty());
}

TEST(Concatenation, AllowsNoArgument) {
  EXPECT_THAT(reportsOf({"-tapos"}),
              ElementsAre("fatal: Concatenated options cannot have arguments: -a pos"));
  EXPECT_THAT(reportsOf({"-ta", "pos"}),
              ElementsAre("fatal: Concatenated options cannot have arguments: -a "));
  EXPECT_THAT(reportsOf({"-ta=pos"}),
              ElementsAre("fatal: Concatenated options cannot have arguments: -a =pos"));
}

TEST(Concatenation, MissesAnArgumentFirst) {
  EXPECT_THAT(reportsOf({"-ta"}), ElementsAre("fatal: Missing argument for option 'a'."));
}

TEST(Concatenation, RefusesTheRestWithAnUnknownLetter) {
  EXPECT_THAT(reportsOf({"-tkv"}), ElementsAre("fatal: Unrecognized option '-kv'."));
  EXPECT_THAT(reportsOf({"-t-v"}), ElementsAre("fatal: Unrecognized option '--v'."));
  EXPECT_THAT(reportsOf({"-vt=1"}), ElementsAre("fatal: Unrecognized option '-t=1'."));
}

TEST(Concatenation, MayEndInAnOldLongName) {
  Session session;
  session.parse({"-tvsn"});
  EXPECT_TRUE(session.parser().getBoolean(Id_List));
  EXPECT_TRUE(session.parser().getBoolean(Id_Version));
  EXPECT_FALSE(session.parser().getBoolean(Id_Verbose));
  EXPECT_THAT(session.getReports(), ElementsAre("warning: Old syntax, please use '--vsn'."));
}

TEST(Concatenation, HasNoLimit) {
  constexpr size_t LetterCount = 2000;
  Session session;
  session.parse(Lines{"-" + std::string(LetterCount, 'v')});
  EXPECT_EQ(session.getReports().size(), LetterCount - 1);
  EXPECT_EQ(session.parser().getSetCounter(), LetterCount);
}

// A million letters would be 10^12 steps to anything quadratic.
TEST(Concatenation, IsLinearWithoutWarnings) {
  static constexpr MatchString LetterRows[] = {{"h", 0, Kind_Implied, On}};
  static constexpr ValueDefinition LetterDefinitions[] = {flagOf(nullptr)};
  static const OptionTable Letters{LetterRows, indexByFirstLetter(LetterRows)};
  class Silent final : public Reporter {
  public:
    void reportOptionMessage(ReportLevel, OptionMessage,
                             std::span<const OptionMessageArgument> arguments) override {
      ++m_Count;
      m_Size = std::get<std::string_view>(arguments[1]).size();
    }
    size_t m_Count = 0;
    size_t m_Size = 0;
  };
  Silent silent;
  MemoryFiles files;
  ValueRecord record;
  const auto region = makeRegion();
  Parser parser({Letters, LetterDefinitions, {&record, 1}}, nullptr, silent, files, *region);
  constexpr size_t LetterCount = 1000 * 1000;
  const std::string word = "-" + std::string(LetterCount, 'h');
  EXPECT_EQ(parser.parseWord(word.c_str(), nullptr), 1u);
  EXPECT_EQ(silent.m_Count, LetterCount - 1);
  EXPECT_EQ(silent.m_Size, LetterCount - 1);
}

} // namespace tabledrivenparser::tool
