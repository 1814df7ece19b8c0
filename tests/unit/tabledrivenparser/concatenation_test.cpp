// SPDX-License-Identifier: Apache-2.0
// Letters that share a dash.
#include "tool_table.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(Concatenation, setsEachLetter) {
  Session session;
  session.parse({"-tvC", "word"});
  EXPECT_TRUE(session.parser().getBoolean(Id_List));
  EXPECT_TRUE(session.parser().getBoolean(Id_Verbose));
  EXPECT_TRUE(session.parser().getBoolean(Id_KeepOld));
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("word"));
  EXPECT_THAT(session.reports(), IsEmpty());
}

TEST(Concatenation, warnsOfARepeatedLetter) {
  EXPECT_THAT(reportsOf({"-tt"}),
              ElementsAre("warning: Option '-t' repeated in concatenated options '-tt'."));
  EXPECT_THAT(reportsOf({"-tvtC"}),
              ElementsAre("warning: Option '-t' repeated in concatenated options '-tvtC'."));
}

TEST(Concatenation, warnsOfTwoLettersOfOneOption) {
  EXPECT_THAT(reportsOf({"-rq"}),
              ElementsAre("warning: Option '-q' repeated in concatenated options '-rq'."));
}

TEST(Concatenation, namesTheRowsInTheWarning) {
  EXPECT_THAT(reportsOf({"-Xx"}),
              ElementsAre("warning: Old syntax, please use '-x'.",
                          "warning: Option '-x' repeated in concatenated options '-xx'."));
}

TEST(Concatenation, forgetsTheLettersOfOtherWords) {
  EXPECT_THAT(reportsOf({"-tv", "-tv"}), IsEmpty());
}

TEST(Concatenation, allowsNoArgument) {
  EXPECT_THAT(reportsOf({"-tapos"}),
              ElementsAre("fatal: Concatenated options cannot have arguments: -a pos"));
  EXPECT_THAT(reportsOf({"-ta", "pos"}),
              ElementsAre("fatal: Concatenated options cannot have arguments: -a "));
  EXPECT_THAT(reportsOf({"-ta=pos"}),
              ElementsAre("fatal: Concatenated options cannot have arguments: -a =pos"));
}

TEST(Concatenation, missesAnArgumentFirst) {
  EXPECT_THAT(reportsOf({"-ta"}), ElementsAre("fatal: Missing argument for option 'a'."));
}

TEST(Concatenation, refusesTheRestWithAnUnknownLetter) {
  EXPECT_THAT(reportsOf({"-tkv"}), ElementsAre("fatal: Unrecognized option '-kv'."));
  EXPECT_THAT(reportsOf({"-t-v"}), ElementsAre("fatal: Unrecognized option '--v'."));
  EXPECT_THAT(reportsOf({"-vt=1"}), ElementsAre("fatal: Unrecognized option '-t=1'."));
}

TEST(Concatenation, mayEndInAnOldLongName) {
  Session session;
  session.parse({"-tvsn"});
  EXPECT_TRUE(session.parser().getBoolean(Id_List));
  EXPECT_TRUE(session.parser().getBoolean(Id_Version));
  EXPECT_FALSE(session.parser().getBoolean(Id_Verbose));
  EXPECT_THAT(session.reports(), ElementsAre("warning: Old syntax, please use '--vsn'."));
}

TEST(Concatenation, hasNoLimit) {
  constexpr size_t letterCount = 2000;
  Session session;
  session.parse(Lines{"-" + std::string(letterCount, 'v')});
  EXPECT_EQ(session.reports().size(), letterCount - 1);
  EXPECT_EQ(session.parser().getSetCounter(), letterCount);
}

// A million letters would be 10^12 steps to anything quadratic.
TEST(Concatenation, isLinearWithoutWarnings) {
  static constexpr MatchString letterRows[] = {{"h", 0, Kind_Implied, on}};
  static constexpr ValueDefinition letterDefinitions[] = {flagOf(nullptr)};
  static const OptionTable letters{letterRows, indexByFirstLetter(letterRows)};
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
  Parser parser({letters, letterDefinitions, {&record, 1}}, nullptr, silent, files, *region);
  constexpr size_t letterCount = 1000 * 1000;
  const std::string word = "-" + std::string(letterCount, 'h');
  EXPECT_EQ(parser.parseWord(word.c_str(), nullptr), 1u);
  EXPECT_EQ(silent.m_Count, letterCount - 1);
  EXPECT_EQ(silent.m_Size, letterCount - 1);
}

} // namespace tabledrivenparser::tool
