// SPDX-License-Identifier: Apache-2.0
//
// What a command line comes to, as settings: one action, how much of the archive it touches, where
// things go, and what holds of two options that contradict each other, in whichever order they
// stand.

#include "quarn/process_options.h"

#include "quarn/option_listeners.h"
#include "quarn/option_reporter.h"
#include "quarn/option_table.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/stdio_via_file_reader.h"
#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

class ProcessOptionsTest : public DriverTest {
protected:
  Settings settingsOf(const Words& words) {
    const Arguments arguments(words);
    tabledrivenparser::Parser parser({getOptionTable(), getOptionDefinitions(), m_Values},
                                     &m_Listener, m_Reporter, m_ViaFiles, *m_Memory);
    for (int i = 1; i < arguments.count();)
      i += static_cast<int>(parser.parseWord(arguments.values()[i], arguments.values()[i + 1]));
    Settings settings;
    processOptions(parser, "quarn", settings);
    // Texts go with the parser's values, which the test's words outlive.
    m_Texts = {textOf(settings.positionName), textOf(settings.libraryAttributeMap)};
    settings.positionName = m_Texts[0].c_str();
    settings.libraryAttributeMap = m_Texts[1].c_str();
    parser.releaseValues();
    return settings;
  }

private:
  static std::string textOf(const char* text) { return text == nullptr ? "(none)" : text; }

  OptionValues m_Values;
  QuarnListener m_Listener;
  OptionReporter m_Reporter;
  tabledrivenparser::StdioViaFileReader m_ViaFiles;
  Words m_Texts;
};

struct ActionCase {
  const char* word;
  Action action;
  AccessMode accessMode;
};

class ActionOptionTest : public ProcessOptionsTest,
                         public testing::WithParamInterface<ActionCase> {};

TEST_P(ActionOptionTest, ChoosesTheActionAndHowMuchOfTheArchiveItTouches) {
  const Settings settings = settingsOf({GetParam().word, "lib.a"});
  EXPECT_EQ(settings.action, GetParam().action);
  EXPECT_EQ(settings.accessMode, GetParam().accessMode);
  EXPECT_EQ(getErrorText(), "");
}

// clang-format off
constexpr ActionCase ActionCases[] = {
    {"-r",        Action_Insert,      Access_Write},
    {"-q",        Action_Insert,      Access_Write},
    {"--create",  Action_Insert,      Access_Write},
    {"-d",        Action_Delete,      Access_Write},
    {"-m",        Action_Move,        Access_Write},
    {"-x",        Action_Extract,     Access_Members},
    {"-p",        Action_Print,       Access_Members},
    {"--entries", Action_Entries,     Access_Members},
    {"--sizes",   Action_Sizes,       Access_Members},
    {"--zt",      Action_Summary,     Access_Members},
    {"--zs",      Action_SymbolTable, Access_Members},
    {"-t",        Action_List,        Access_Headers},
    {"-tv",       Action_List,        Access_Members},
    {"-s",        Action_None,        Access_Write},
    {"-n",        Action_None,        Access_Write},
    {"-v",        Action_None,        Access_None},
};
// clang-format on
INSTANTIATE_TEST_SUITE_P(Words, ActionOptionTest, testing::ValuesIn(ActionCases),
                         [](const auto& given) {
                           std::string name = given.param.word;
                           std::erase(name, '-');
                           return name;
                         });

TEST_F(ProcessOptionsTest, RefusesASecondActionAndKeepsTheFirst) {
  EXPECT_EQ(settingsOf({"-x", "-d", "lib.a"}).action, Action_Delete);
  EXPECT_EQ(getErrorText(), "Error: L6840E: Only one action option may be specified\n");
}

TEST_F(ProcessOptionsTest, TakesTheSameActionTwice) {
  EXPECT_EQ(settingsOf({"-r", "--create", "lib.a"}).action, Action_Insert);
  EXPECT_EQ(getErrorText(), "");
}

TEST_F(ProcessOptionsTest, RaisesTheAccessForATableInAnyAction) {
  EXPECT_EQ(settingsOf({"-t", "-s", "lib.a"}).accessMode, Access_Write);
  EXPECT_EQ(settingsOf({"-n", "-t", "lib.a"}).accessMode, Access_Write);
}

TEST_F(ProcessOptionsTest, AsksForATableOrForNone) {
  EXPECT_TRUE(settingsOf({"-s", "lib.a"}).rebuildSymbolTable);
  EXPECT_FALSE(settingsOf({"-s", "lib.a"}).suppressSymbolTable);
  EXPECT_TRUE(settingsOf({"-n", "lib.a"}).suppressSymbolTable);
}

TEST_F(ProcessOptionsTest, TellsOfANewArchiveUnlessItIsWanted) {
  EXPECT_TRUE(settingsOf({"-r", "lib.a"}).warnOnCreate);
  EXPECT_FALSE(settingsOf({"-r", "-c", "lib.a"}).warnOnCreate);
  EXPECT_FALSE(settingsOf({"--create", "lib.a"}).warnOnCreate);
  EXPECT_TRUE(settingsOf({"--create", "lib.a"}).createArchive);
}

TEST_F(ProcessOptionsTest, HasNoPositionUnlessOneIsGiven) {
  EXPECT_EQ(settingsOf({"-r", "lib.a"}).positionKind, Position_None);
}

TEST_F(ProcessOptionsTest, TakesThePositionBeforeOrAfterAMember) {
  const Settings after = settingsOf({"-r", "-a", "x.o", "lib.a"});
  EXPECT_EQ(after.positionKind, Position_After);
  EXPECT_STREQ(after.positionName, "x.o");
  for (const char* letter : {"-b", "-i"}) {
    const Settings before = settingsOf({"-r", letter, "y.o", "lib.a"});
    EXPECT_EQ(before.positionKind, Position_Before);
    EXPECT_STREQ(before.positionName, "y.o");
  }
}

TEST_F(ProcessOptionsTest, PrefersBeforeToAfterInAnyOrder) {
  EXPECT_STREQ(settingsOf({"-b", "y.o", "-a", "x.o", "-r", "lib.a"}).positionName, "y.o");
  EXPECT_STREQ(settingsOf({"-a", "x.o", "-b", "y.o", "-r", "lib.a"}).positionName, "y.o");
}

TEST_F(ProcessOptionsTest, ReplacesAlwaysUnlessAskedForNewerFiles) {
  EXPECT_EQ(settingsOf({"-r", "lib.a"}).updateMode, Update_Always);
  EXPECT_EQ(settingsOf({"-r", "-u", "lib.a"}).updateMode, Update_IfNotNewer);
  EXPECT_EQ(settingsOf({"-r", "--new_files_only", "lib.a"}).updateMode, Update_IfOlder);
}

TEST_F(ProcessOptionsTest, PrefersNewFilesOnlyToUpdateInAnyOrder) {
  EXPECT_EQ(settingsOf({"-r", "-u", "--new_files_only", "lib.a"}).updateMode, Update_IfOlder);
  EXPECT_EQ(settingsOf({"-r", "--new_files_only", "-u", "lib.a"}).updateMode, Update_IfOlder);
}

TEST_F(ProcessOptionsTest, NormalisesToATimeOtherThanZero) {
  EXPECT_FALSE(settingsOf({"-r", "lib.a"}).normaliseHeaders);
  EXPECT_FALSE(settingsOf({"-r", "--normalise=0", "lib.a"}).normaliseHeaders);
  const Settings settings = settingsOf({"-r", "--normalise=86400", "lib.a"});
  EXPECT_TRUE(settings.normaliseHeaders);
  EXPECT_EQ(settings.normaliseTime, 86400);
}

TEST_F(ProcessOptionsTest, SwitchesWhatIsReadOfObjects) {
  const Settings plain = settingsOf({"-s", "lib.a"});
  EXPECT_FALSE(plain.includeDebugSymbols || plain.uniqueSymbolsOnly ||
               plain.useObjectBuildAttributes);
  EXPECT_STREQ(plain.libraryAttributeMap, "(none)");
  EXPECT_TRUE(settingsOf({"-s", "--debug_symbols", "lib.a"}).includeDebugSymbols);
  EXPECT_TRUE(settingsOf({"-s", "--unique_symbols", "lib.a"}).uniqueSymbolsOnly);
  EXPECT_TRUE(settingsOf({"-s", "--qobix_buildattr", "lib.a"}).useObjectBuildAttributes);
  EXPECT_STREQ(settingsOf({"-s", "--libattrmap=map", "lib.a"}).libraryAttributeMap, "map");
}

TEST_F(ProcessOptionsTest, TakesTheLastOfASwitchAndItsOpposite) {
  EXPECT_FALSE(settingsOf({"-s", "--debug_symbols", "--no_debug_symbols"}).includeDebugSymbols);
  EXPECT_TRUE(settingsOf({"-s", "--no_debug_symbols", "--debug_symbols"}).includeDebugSymbols);
}

TEST_F(ProcessOptionsTest, OverwritesOnExtractionUnlessFilesAreToBeKept) {
  EXPECT_TRUE(settingsOf({"-x", "lib.a"}).overwriteOnExtract);
  EXPECT_FALSE(settingsOf({"-x", "-C", "lib.a"}).overwriteOnExtract);
  EXPECT_FALSE(settingsOf({"-x", "lib.a"}).truncateNames);
  EXPECT_TRUE(settingsOf({"-x", "-T", "lib.a"}).truncateNames);
}

TEST(Settings, NeverLowersTheAccess) {
  Settings settings;
  settings.raiseAccessMode(Access_Write);
  settings.raiseAccessMode(Access_Headers);
  EXPECT_EQ(settings.accessMode, Access_Write);
}

} // namespace quarn
