// SPDX-License-Identifier: Apache-2.0
//
// Which row a word means: letter case, "-" for "_", abbreviation by a dot, one dash or two, old
// syntax under each policy, arguments behind a name or in the next word, and words that mean
// nothing, with bytes of any kind in them.

#include "tool_table.h"

#include "tabledrivenparser/interface/fallback_handler.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(RowLookup, TakesALongNameInAnyCase) {
  Session session;
  session.parse({"--CREATE", "--Help"});
  EXPECT_TRUE(session.parser().getBoolean(Id_Create));
  EXPECT_TRUE(session.parser().getBoolean(Id_Help));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(RowLookup, TakesAHyphenForAnUnderscore) {
  Session session;
  session.parse({"--new-files_only"});
  EXPECT_TRUE(session.parser().getBoolean(Id_NewFilesOnly));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(RowLookup, CompletesANameThatEndsInADot) {
  Session session;
  session.parse({"--cre."});
  EXPECT_TRUE(session.parser().getBoolean(Id_Create));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(RowLookup, RefusesADotBehindAWholeName) {
  EXPECT_THAT(reportsOf({"--create."}), ElementsAre("fatal: Unrecognized option '--create.'."));
}

TEST(RowLookup, RefusesAnUnfinishedNameWithoutADot) {
  EXPECT_THAT(reportsOf({"--creat"}), ElementsAre("fatal: Unrecognized option '--creat'."));
  EXPECT_THAT(reportsOf({"--created"}), ElementsAre("fatal: Unrecognized option '--created'."));
}

TEST(RowLookup, RefusesADotWithOneDash) {
  EXPECT_THAT(reportsOf({"-new."}), ElementsAre("fatal: Unrecognized option '-new.'."));
}

TEST(RowLookup, TakesAnArgumentBehindAnAbbreviation) {
  Session session;
  session.parse({"--db.=low"});
  EXPECT_STREQ(session.parser().getText(Id_CheckLevel), "low");
}

TEST(RowLookup, RefusesAnArgumentThatTouchesALongName) {
  EXPECT_THAT(reportsOf({"--db_checklow"}),
              ElementsAre("fatal: Unrecognized option '--db_checklow'."));
}

struct Ambiguity {
  const char* word;
  const char* first;
  const char* second;
};

class AmbiguousWord : public testing::TestWithParam<Ambiguity> {};

TEST_P(AmbiguousWord, NamesTheBestAndTheLastRowAndIsUnrecognized) {
  const std::string word = GetParam().word;
  const Lines reports = reportsOf({GetParam().word});
  EXPECT_THAT(reports,
              ElementsAre("remark: Possible matches for '" + word.substr(2) + "' include '" +
                              GetParam().first + "' and '" + GetParam().second + "'.",
                          "fatal: Unrecognized option '" + word + "'."));
}

INSTANTIATE_TEST_SUITE_P(RowLookup, AmbiguousWord,
                         testing::Values(Ambiguity{"--no.", "no_debug_symbols",
                                                   "no_unique_symbols"},
                                         Ambiguity{"--n.", "new_files_only", "no_unique_symbols"},
                                         Ambiguity{"--diag.", "diag_error", "diag_warning"},
                                         Ambiguity{"--s.", "show_cmdline", "sizes"},
                                         Ambiguity{"--v.", "version", "vsn"}));

TEST(RowLookup, PrefersARowWithoutArgumentWhereNoneIsGiven) {
  Session session;
  session.parse({"--d."});
  EXPECT_TRUE(session.parser().getBoolean(Id_DebugSymbols));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(RowLookup, PrefersARowWithArgumentWhereOneIsGiven) {
  Session session;
  session.parse({"--no_.=5", "--de.", "--no_d."});
  EXPECT_EQ(session.parser().getInteger(Id_Normalise), 5);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(RowLookup, PrefersTheLongerName) {
  Session session;
  session.parse({"--version."});
  EXPECT_TRUE(session.parser().getBoolean(Id_VersionNumber));
  EXPECT_FALSE(session.parser().getBoolean(Id_Version));
}

TEST(RowLookup, RefusesALetterWithTwoDashes) {
  EXPECT_THAT(reportsOf({"--d"}), ElementsAre("fatal: Unrecognized option '--d'."));
}

TEST(RowLookup, TellsTwinLettersApart) {
  Session session;
  session.parse({"-V", "-T", "-C"});
  EXPECT_TRUE(session.parser().getBoolean(Id_Version));
  EXPECT_FALSE(session.parser().getBoolean(Id_Verbose));
  EXPECT_TRUE(session.parser().getBoolean(Id_Truncate));
  EXPECT_FALSE(session.parser().getBoolean(Id_List));
  EXPECT_TRUE(session.parser().getBoolean(Id_KeepOld));
  EXPECT_FALSE(session.parser().getBoolean(Id_NoBanner));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(RowLookup, WarnsOfAnOldLetterInTheOtherCase) {
  Session session;
  session.parse({"-D", "-X"});
  EXPECT_TRUE(session.parser().getBoolean(Id_Delete));
  EXPECT_TRUE(session.parser().getBoolean(Id_Extract));
  EXPECT_THAT(session.getReports(), ElementsAre("warning: Old syntax, please use '-d'.",
                                                "warning: Old syntax, please use '-x'."));
}

TEST(RowLookup, WarnsOfAnOldLongNameWithOneDash) {
  Session session;
  session.parse({"-create"});
  EXPECT_TRUE(session.parser().getBoolean(Id_Create));
  EXPECT_THAT(session.getReports(), ElementsAre("warning: Old syntax, please use '--create'."));
}

TEST(RowLookup, RefusesANewLongNameWithOneDash) {
  EXPECT_THAT(reportsOf({"-libattrmap=x"}),
              ElementsAre("fatal: Unrecognized option '-libattrmap=x'."));
}

TEST(RowLookup, TakesOldSyntaxInSilenceWhereThePolicySaysSo) {
  OptionTable silent = Table;
  for (uint32_t policy : {0u, 3u}) {
    silent.oldSyntaxPolicy = static_cast<SyntaxPolicy>(policy);
    ParserSession session(silent, Definitions);
    session.parse({"-create", "-D"});
    EXPECT_TRUE(session.parser().getBoolean(Id_Create));
    EXPECT_TRUE(session.parser().getBoolean(Id_Delete));
    EXPECT_THAT(session.getReports(), IsEmpty());
  }
}

TEST(RowLookup, RefusesOldSyntaxWhereThePolicySaysSo) {
  OptionTable strict = Table;
  strict.oldSyntaxPolicy = Policy_Reject;
  ParserSession name(strict, Definitions);
  name.parse({"-help"});
  EXPECT_THAT(name.getReports(), ElementsAre("fatal: Unrecognized option '-elp'."));
  ParserSession letter(strict, Definitions);
  letter.parse({"-D"});
  EXPECT_THAT(letter.getReports(), ElementsAre("fatal: Unrecognized option '-D'."));
  ParserSession exact(strict, Definitions);
  exact.parse({"-d", "--help"});
  EXPECT_THAT(exact.getReports(), IsEmpty());
}

TEST(RowLookup, ComparesAWordThatStartsWithNoLetterToo) {
  EXPECT_THAT(reportsOf({"-1"}), ElementsAre("fatal: Unrecognized option '-1'."));
  EXPECT_THAT(reportsOf({"--."}), ElementsAre("fatal: Unrecognized option '--.'."));
  EXPECT_THAT(reportsOf({"---x"}), ElementsAre("fatal: Unrecognized option '---x'."));
  EXPECT_THAT(reportsOf({"---"}), ElementsAre("fatal: Unrecognized option '---'."));
}

TEST(RowLookup, TakesBytesAbove127AsPlainCharacters) {
  EXPECT_THAT(reportsOf({"-\xe9"}), ElementsAre("fatal: Unrecognized option '-\xe9'."));
  EXPECT_THAT(reportsOf({"--\xff\x80"}), ElementsAre("fatal: Unrecognized option '--\xff\x80'."));
}

TEST(RowLookup, RefusesALetterThatNoRowStartsWith) {
  EXPECT_THAT(reportsOf({"-k"}), ElementsAre("fatal: Unrecognized option '-k'."));
}

TEST(RowLookup, FindsNothingForAnEmptyWordWithDashes) {
  Session session;
  EXPECT_EQ(session.parser().parseArgument("", "next", 1), 1u);
  EXPECT_THAT(session.getReports(), ElementsAre("fatal: Unrecognized option '-'."));
}

TEST(RowLookup, FindsNothingForAPositionalWordWithoutItsRow) {
  OptionTable noWords = Table;
  noWords.rows = noWords.rows.subspan(1);
  noWords.firstRows = indexByFirstLetter(noWords.rows);
  ParserSession session(noWords, Definitions);
  session.parse({"word"});
  EXPECT_THAT(session.getReports(), ElementsAre("fatal: Unrecognized option 'word'."));
}

// Arguments.

TEST(RowArgument, StandsBehindALetterOrIsTheNextWord) {
  for (const auto& words : {Lines{"-apos"}, Lines{"-a", "pos"}, Lines{"-a=pos"}}) {
    Session session;
    session.parse(words);
    EXPECT_STREQ(session.parser().getText(Id_After), "pos");
    EXPECT_THAT(session.texts(Id_Words), IsEmpty());
    EXPECT_THAT(session.getReports(), IsEmpty());
  }
}

TEST(RowArgument, CountsTheWordsUsed) {
  Session session;
  EXPECT_EQ(session.parser().parseWord("-apos", "x", {}), 1u);
  EXPECT_EQ(session.parser().parseWord("-a", "x", {}), 2u);
  EXPECT_EQ(session.parser().parseWord("-t", "x", {}), 1u);
  EXPECT_EQ(session.parser().parseWord("x", "y", {}), 1u);
}

TEST(RowArgument, MayLookLikeAnOption) {
  Session session;
  session.parse({"-a", "-t", "--db_check", "--"});
  EXPECT_STREQ(session.parser().getText(Id_After), "-t");
  EXPECT_STREQ(session.parser().getText(Id_CheckLevel), "--");
  EXPECT_FALSE(session.parser().getBoolean(Id_List));
  EXPECT_FALSE(session.parser().isEndOfOptions());
}

TEST(RowArgument, MayBeEmptyBehindTheSign) {
  Session session;
  session.parse({"--db_check=", "-a=", "word"});
  EXPECT_STREQ(session.parser().getText(Id_CheckLevel), "");
  EXPECT_STREQ(session.parser().getText(Id_After), "");
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("word"));
}

TEST(RowArgument, IsMissedAtTheEnd) {
  EXPECT_THAT(reportsOf({"--via"}), ElementsAre("fatal: Missing argument for option 'via'."));
  EXPECT_THAT(reportsOf({"-a"}), ElementsAre("fatal: Missing argument for option 'a'."));
}

TEST(RowArgument, IsUnexpectedBehindALongFlag) {
  EXPECT_THAT(reportsOf({"--create=1"}),
              ElementsAre("fatal: Unexpected argument for option '--create'"));
  EXPECT_THAT(reportsOf({"--create,1"}),
              ElementsAre("fatal: Unexpected argument for option '--create'"));
  EXPECT_THAT(reportsOf({"-create=1"}),
              ElementsAre("warning: Old syntax, please use '--create'.",
                          "fatal: Unexpected argument for option '-create'"));
}

TEST(RowArgument, IsNoneForAFlagLetter) {
  EXPECT_THAT(reportsOf({"-t=1"}), ElementsAre("fatal: Unrecognized option '-t=1'."));
  EXPECT_THAT(reportsOf({"-t,1"}), ElementsAre("fatal: Unrecognized option '-t,1'."));
}

TEST(RowArgument, IsNotPartedFromALetterByTheSeparator) {
  EXPECT_THAT(reportsOf({"-a,pos"}), ElementsAre("fatal: Unrecognized option '-a,pos'."));
}

TEST(RowArgument, BehindTheSeparatorIsOldSyntax) {
  Session session;
  session.parse({"--diag_error,L6875,L1"});
  EXPECT_THAT(session.texts(Id_DiagError), ElementsAre("L6875", "L1"));
  EXPECT_THAT(session.getReports(),
              ElementsAre("warning: Old syntax, please use '--diag_error=L6875,L1'."));
}

TEST(RowArgument, IsTheLastOneGiven) {
  Session session;
  session.parse({"-b", "one", "-i", "two"});
  EXPECT_STREQ(session.parser().getText(Id_Before), "two");
}

// A small table with what the big one lacks.

constexpr uint32_t Red[] = {1, 0};
constexpr uint32_t RedAndGreen[] = {1, 2, 0};
// clang-format off
constexpr MatchString SpecialRows[] = {
  {"",        0, Kind_Required, {},     nullptr,       0,   Flag_Public},
  {"1st",     1, Kind_Implied,  On, nullptr,       ',', Flag_Public},
  {"aged",    2, Kind_Implied,  On, nullptr,       ',', Flag_Public | Flag_Deprecated | Flag_OldSyntax},
  {"hidden",  3, Kind_Implied,  On, Red,        ',', Flag_Public},
  {"hinted",  3, Kind_Implied,  On, RedAndGreen, ',', Flag_Public},
  {"O",       4, Kind_Optional, {.text = "implied"}, nullptr, ',', Flag_Public},
  {"other",   4, Kind_Optional, {.text = "implied"}, nullptr, ',', Flag_Public},
  {"private", 1, Kind_Implied,  On, nullptr,       ',', 0},
  {"w",       0, Kind_Required, {},     nullptr,       '=', Flag_Public},
};
constexpr ValueDefinition SpecialDefinitions[] = {
  textsOf(nullptr), flagOf(nullptr), flagOf(nullptr), flagOf(nullptr), textOf(nullptr),
};
// clang-format on
static_assert(areWellFormed(SpecialRows, std::size(SpecialDefinitions)));

OptionTable specialTable() {
  return {SpecialRows, indexByFirstLetter(SpecialRows), Policy_Warn, Policy_Warn};
}

Lines specialReports(const OptionTable& special, std::initializer_list<const char*> words) {
  ParserSession session(special, SpecialDefinitions);
  session.parse(words);
  return session.getReports();
}

TEST(SpecialRow, MayStartWithADigit) {
  const OptionTable special = specialTable();
  ParserSession session(special, SpecialDefinitions);
  session.parse({"--1ST"});
  EXPECT_TRUE(session.parser().getBoolean(1));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(SpecialRow, WarnsOfDeprecationAndThenNotOfOldSyntax) {
  OptionTable special = specialTable();
  EXPECT_THAT(specialReports(special, {"-aged"}),
              ElementsAre("warning: Option 'aged' is deprecated."));
  special.deprecatedPolicy = Policy_Accept;
  EXPECT_THAT(specialReports(special, {"-aged"}),
              ElementsAre("warning: Old syntax, please use '--aged'."));
  EXPECT_THAT(specialReports(special, {"--aged"}), IsEmpty());
}

TEST(SpecialRow, IsHiddenUnlessEveryMaskMeetsTheTables) {
  OptionTable special = specialTable();
  special.restrictionMask = 1;
  EXPECT_THAT(specialReports(special, {"--hidden"}), IsEmpty());
  EXPECT_THAT(specialReports(special, {"--hinted"}),
              ElementsAre("fatal: Unrecognized option '--hinted'."));
  EXPECT_THAT(specialReports(special, {"--hi."}), IsEmpty());
  special.restrictionMask = 2;
  EXPECT_THAT(specialReports(special, {"--hidden=1"}),
              ElementsAre("fatal: Unexpected argument for option '--hidden'"));
  special.restrictionMask = 3;
  EXPECT_THAT(specialReports(special, {"--hinted"}), IsEmpty());
}

TEST(SpecialRow, IsNotAbbreviatedUnlessPublic) {
  EXPECT_THAT(specialReports(specialTable(), {"--priv."}),
              ElementsAre("fatal: Unrecognized option '--priv.'."));
  EXPECT_THAT(specialReports(specialTable(), {"--private"}), IsEmpty());
}

TEST(SpecialRow, WithAnOptionalArgumentLeavesTheNextWord) {
  const OptionTable special = specialTable();
  ParserSession session(special, SpecialDefinitions);
  session.parse({"-O", "word"});
  EXPECT_STREQ(session.parser().getText(4), "implied");
  EXPECT_THAT(session.texts(0), ElementsAre("word"));
  session.parse({"-Onear"});
  EXPECT_STREQ(session.parser().getText(4), "near");
  session.parse({"--other"});
  EXPECT_STREQ(session.parser().getText(4), "implied");
  session.parse({"--other=far"});
  EXPECT_STREQ(session.parser().getText(4), "far");
  session.parse({"--other="});
  EXPECT_STREQ(session.parser().getText(4), "");
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(SpecialRow, TakesTheEqualsSignAlsoAsItsSeparator) {
  const OptionTable special = specialTable();
  ParserSession session(special, SpecialDefinitions);
  session.parse({"-w=x"});
  EXPECT_THAT(session.texts(0), ElementsAre("x"));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

// The last resort.

class Fallback final : public FallbackHandler {
public:
  uint32_t takeWord(Parser&, const char* word, const char* next, uint32_t dashes) override {
    m_Lines.push_back(std::to_string(dashes) + word + "/" + (next != nullptr ? next : "<null>"));
    return m_Answer;
  }

  Lines m_Lines;
  uint32_t m_Answer = 0;
};

TEST(FallbackHandling, IsOfferedWhatNoRowAccepts) {
  Fallback fallback;
  fallback.m_Answer = 2;
  OptionTable open = Table;
  open.fallback = &fallback;
  ParserSession session(open, Definitions);
  session.parse({"--odd", "word", "-t", "-k", "-tk", "last"});
  EXPECT_THAT(fallback.m_Lines, ElementsAre("2odd/word", "1k/-tk"));
  EXPECT_TRUE(session.parser().getBoolean(Id_List));
  EXPECT_THAT(session.texts(Id_Words), ElementsAre("last"));
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(FallbackHandling, MayDecline) {
  Fallback fallback;
  OptionTable open = Table;
  open.fallback = &fallback;
  ParserSession session(open, Definitions);
  session.parse({"--create=1"});
  EXPECT_THAT(fallback.m_Lines, ElementsAre("2create=1/<null>"));
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Unexpected argument for option '--create'"));
}

TEST(Failure, EndsAllParsing) {
  Session session;
  session.parse({"--nonsense", "-t", "--", "-a"});
  EXPECT_TRUE(session.parser().hasFailed());
  EXPECT_FALSE(session.parser().getBoolean(Id_List));
  EXPECT_FALSE(session.parser().isEndOfOptions());
  EXPECT_EQ(session.parser().parseWord("-t", "x"), 1u);
  EXPECT_EQ(session.getReports().size(), 1u);
}

} // namespace tabledrivenparser::tool
