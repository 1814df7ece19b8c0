// SPDX-License-Identifier: Apache-2.0
//
// The command line as it is written again. At the end, 4000 generated command lines must mean the
// same when their echo is parsed: words with blanks, letters with arguments behind them, lists,
// names that only look like options.

#include "tool_table.h"
#include "type_table.h"

#include "tabledrivenparser/interface/fallback_handler.h"
#include "tabledrivenparser/interface/option_report.h"
#include "tabledrivenparser/interface/text_sink.h"

#include <random>

namespace tabledrivenparser {

namespace {

std::string reportOf(std::initializer_list<const char*> words) {
  tool::Session session;
  session.parse(words);
  return session.commandLine();
}

std::string typeReportOf(std::initializer_list<const char*> words) {
  types::Session session;
  session.parse(words);
  return session.commandLine();
}

} // namespace

TEST(CommandLineReport, IsEmptyForNothing) {
  EXPECT_EQ(reportOf({}), "");
}

TEST(CommandLineReport, SeparatesEntriesByOneBlank) {
  EXPECT_EQ(reportOf({"--show_cmdline", "-t", "lib.a"}), "--show_cmdline -t lib.a");
}

TEST(CommandLineReport, GoesByIdsAndPutsPositionalWordsLast) {
  EXPECT_EQ(reportOf({"x.o", "--libattrmap=m", "-v", "--create", "y.o"}),
            "--create -v --libattrmap=m x.o y.o");
}

TEST(CommandLineReport, ShowsTheBestRowOfAnOption) {
  EXPECT_EQ(reportOf({"-V"}), "--vsn");
  EXPECT_EQ(reportOf({"-h"}), "--help");
  EXPECT_EQ(reportOf({"-q"}), "-r");
  EXPECT_EQ(reportOf({"-i", "x"}), "-bx");
  EXPECT_EQ(reportOf({"--no_normalise=0x10"}), "--normalise=16");
}

TEST(CommandLineReport, LeavesOutWhatIsTheDefaultAgain) {
  EXPECT_EQ(reportOf({"--no_debug_symbols", "--normalise=0", "--diag_style=zev"}), "");
  EXPECT_EQ(reportOf({"--debug_symbols", "--no_debug_symbols"}), "");
  EXPECT_EQ(reportOf({"--no_debug_symbols", "--debug_symbols"}), "--debug_symbols");
}

TEST(CommandLineReport, NamesEnumerators) {
  EXPECT_EQ(reportOf({"--diag_style=IDE"}), "--diag_style=ide");
  EXPECT_EQ(reportOf({"--diag_style=list"}), "--diag_style=list");
}

TEST(CommandLineReport, NamesAnEnumeratorAsItWouldBeTakenAgain) {
  static constexpr MatchString Entries[] = {
      {"hidden", 4, Kind_Required, {}, types::ExpertMask, 0},
      {"old", 4, Kind_Required, {}, nullptr, 1},
      {"new", 4},
      {"newer", 4},
  };
  static constexpr Enumeration Enumerators{Entries};
  types::Session session;
  session.m_Table.restrictionMask = 1;
  session.m_Definitions[types::Id_Enum].constraint.enumeration = &Enumerators;
  session.parse({"--enum=newer"});
  EXPECT_EQ(session.commandLine(), "--enum=new");
}

TEST(CommandLineReport, NamesADeprecatedEnumeratorThatHasNoOtherName) {
  static constexpr MatchString Entries[] = {{"old", 4, Kind_Required, {}, nullptr, 1}};
  static constexpr Enumeration Enumerators{Entries};
  types::Session session;
  session.m_Definitions[types::Id_Enum].constraint.enumeration = &Enumerators;
  session.parse({"--enum=old"});
  EXPECT_EQ(session.commandLine(), "--enum=old");
}

TEST(CommandLineReport, ShowsEachElementOfAVector) {
  EXPECT_EQ(reportOf({"--diag_error=L1,L2", "--diag_warning=w", "--diag_error", ""}),
            "--diag_error=L1 --diag_error=L2 --diag_error= --diag_warning=w");
}

TEST(CommandLineReport, ShowsViaFilesBesideTheirWords) {
  tool::Session session;
  session.m_Files.m_Contents["f"] = "-t word";
  session.m_Files.m_Contents["g"] = "";
  session.parse({"--via=f,g"});
  EXPECT_EQ(session.commandLine(), "-t --via=f --via=g word");
}

TEST(CommandLineReport, QuotesValuesWithBlanksAsAWhole) {
  EXPECT_EQ(reportOf({"-a", "x y", "--libattrmap=m\tm", "my lib.a", "a\"b"}),
            "-a\"x y\" --libattrmap=\"m\tm\" \"my lib.a\" a\"b");
}

TEST(CommandLineReport, ShowsEmptyTexts) {
  EXPECT_EQ(reportOf({"--libattrmap=", "", "x"}), "--libattrmap= \"\" x");
}

TEST(CommandLineReport, PartsALetterFromAValueThatWouldNotReadBack) {
  EXPECT_EQ(reportOf({"-a", ""}), "-a=");
  EXPECT_EQ(reportOf({"-a", "=x"}), "-a==x");
  EXPECT_EQ(reportOf({"-a", ",x"}), "-a=,x");
  EXPECT_EQ(reportOf({"-a", "-x"}), "-a-x");
}

TEST(CommandLineReport, MarksTheEndOfOptions) {
  EXPECT_EQ(reportOf({"-t", "x", "--", "-odd.a"}), "-t -- x -odd.a");
  EXPECT_EQ(reportOf({"-t", "-"}), "-t -");
}

TEST(CommandLineReport, LeavesOutWhatAListenerTook) {
  tool::Session session;
  session.m_Listener.m_Answer = [](Parser&, uint32_t id, const Value& value) {
    return id == tool::Id_DiagError && std::string_view(value.text) == "bad";
  };
  session.parse({"--diag_error=L1,bad,L2"});
  EXPECT_EQ(session.commandLine(), "--diag_error=L1 --diag_error=L2");
}

TEST(CommandLineReport, WritesEveryType) {
  EXPECT_EQ(typeReportOf({"--addr=255"}), "--addr=0xFF");
  EXPECT_EQ(typeReportOf({"--add64=0xABCDEF0123456789"}), "--add64=0xABCDEF0123456789");
  EXPECT_EQ(typeReportOf({"--int=-7"}), "--int=-7");
  EXPECT_EQ(typeReportOf({"--long=-9223372036854775808:3"}),
            "--long=-9223372036854775808 --long=3");
  EXPECT_EQ(typeReportOf({"--many=1,2"}), "--many=1 --many=2");
  EXPECT_EQ(typeReportOf({"--text=abc"}), "--text=abc");
  EXPECT_EQ(typeReportOf({"--enum=green", "--enum=choose"}), "--enum=Choose");
}

TEST(CommandLineReport, WritesBooleansAsWordsWhereARowWantsOne) {
  types::Session session;
  const auto onlyLong = rowsNamed(types::Rows, "bool");
  session.m_Definitions[types::Id_Boolean].rows = onlyLong.data();
  session.parse({"-x"});
  EXPECT_EQ(session.commandLine(), "--bool=true");
}

TEST(CommandLineReport, PrefersARowWithoutArgumentToALongName) {
  EXPECT_EQ(typeReportOf({"--bool", "y"}), "-x");
  EXPECT_EQ(typeReportOf({"--int=1"}), "--int1");
  EXPECT_EQ(typeReportOf({"--addr=0xABCDEF"}), "--address");
  EXPECT_EQ(typeReportOf({"--many=6,7"}), "--many6 --many=7");
  EXPECT_EQ(typeReportOf({"--enum=red"}), "--red");
}

TEST(CommandLineReport, PrefersARowThatIsNotDeprecated) {
  EXPECT_EQ(typeReportOf({"--text_x"}), "--text=x");
}

TEST(CommandLineReport, ShowsARestrictedRowOnlyWhereItIsUsable) {
  EXPECT_EQ(typeReportOf({"--texts=y"}), "--texts_y");
  types::Session session;
  session.m_Table.restrictionMask = 1;
  session.parse({"--texts=y"});
  EXPECT_EQ(session.commandLine(), "--texts=y");
}

TEST(CommandLineReport, LeavesOutAValueThatNoRowFits) {
  types::Session session;
  const auto onlyFlag = rowsNamed(types::Rows, "int1");
  session.m_Definitions[types::Id_Int].rows = onlyFlag.data();
  session.parse({"--int=2", "-x"});
  EXPECT_EQ(session.commandLine(), "-x");
  types::Session without;
  without.m_Definitions[types::Id_Int].rows = nullptr;
  without.parse({"--int=2"});
  EXPECT_EQ(without.commandLine(), "");
}

TEST(CommandLineReport, GivesTheFallbackHandlerItsTurnBeforeTheWords) {
  class Fallback final : public FallbackHandler {
  public:
    uint32_t takeWord(Parser&, const char*, const char*, uint32_t) override { return 1; }
    void printCommandLine(const Parser&, TextSink& sink) const override {
      sink.startEntry();
      sink.put("--mine");
    }
  };
  Fallback fallback;
  types::Session session;
  session.m_Table.fallback = &fallback;
  session.parse({"word", "--mine", "--int=2", "--"});
  EXPECT_EQ(session.commandLine(), "--int=2 --mine -- word");
}

TEST(CommandLineReport, HasNothingOfAFallbackHandlerThatKeepsNothing) {
  class Fallback final : public FallbackHandler {
  public:
    uint32_t takeWord(Parser&, const char*, const char*, uint32_t) override { return 1; }
  };
  Fallback fallback;
  types::Session session;
  session.m_Table.fallback = &fallback;
  session.parse({"--odd", "-x"});
  EXPECT_EQ(session.commandLine(), "-x");
}

TEST(CommandLineReport, HasTheOnlyWordOfATableThatKeepsOne) {
  types::Session session;
  session.m_Definitions[types::Id_Words].type = Type_String;
  session.parse({"first", "last word"});
  EXPECT_EQ(session.commandLine(), "\"last word\"");
}

TEST(CommandLineReport, TellsTheSizeNeeded) {
  tool::Session session;
  session.parse({"-t", "lib.a"});
  std::array<char, 9> enough{};
  enough.fill('?');
  TextSink sink(enough, TextSink::QuoteMode::Blanks, ' ');
  EXPECT_EQ(printCommandLine(session.parser(), sink), 9u);
  EXPECT_STREQ(enough.data(), "-t lib.a");

  std::array<char, 8> tooSmall{};
  tooSmall.fill('?');
  TextSink smallSink(tooSmall, TextSink::QuoteMode::Blanks, ' ');
  EXPECT_EQ(printCommandLine(session.parser(), smallSink), 9u);
  EXPECT_EQ(std::string(tooSmall.data(), tooSmall.size()), "-t lib.a");
}

// What a shell would make of a report without quotes inside words.
Lines splitReport(const std::string& report) {
  Lines words;
  bool isQuoted = false;
  bool isInWord = false;
  std::string word;
  for (char character : report + " ") {
    if (character == '"') {
      isQuoted = !isQuoted;
      isInWord = true;
    } else if ((character == ' ' || character == '\t') && !isQuoted) {
      if (isInWord) words.push_back(word);
      word.clear();
      isInWord = false;
    } else {
      word += character;
      isInWord = true;
    }
  }
  return words;
}

class WordMaker {
public:
  explicit WordMaker(uint32_t seed) : m_Random(seed) {}

  Lines makeCommandLine() {
    Lines words;
    for (uint32_t count = pick(8); count > 0; --count)
      addWords(words);
    return words;
  }

private:
  uint32_t pick(uint32_t bound) { return static_cast<uint32_t>(m_Random() % bound); }

  std::string text() {
    static constexpr std::string_view Letters = "atvx=,-. \t\n\x01\\%#(;'1A\xc3\xff";
    std::string result;
    for (uint32_t count = pick(5); count > 0; --count) {
      result += Letters[pick(static_cast<uint32_t>(Letters.size()))];
    }
    return result;
  }

  void addWords(Lines& words) {
    static const char* const Flags[] = {"-t",
                                        "-tvx",
                                        "--create",
                                        "-q",
                                        "--vsn",
                                        "--versio",
                                        "--no_debug_symbols",
                                        "--debug_symbols",
                                        "-D",
                                        "--no_u.",
                                        "-C",
                                        "-cT",
                                        "--"};
    static const char* const Options[] = {
        "-a", "-b", "-i", "--libattrmap", "--diag_error", "--diag_warning", "--db_check"};
    static const char* const Fixed[] = {"--diag_style=GNU", "--diag_style=list", "--normalise=0x10",
                                        "--no_normalise=-3", "--diag_error,a,b"};
    switch (pick(5)) {
    case 0:
      words.push_back(Fixed[pick(std::size(Fixed))]);
      return;
    case 1:
      words.push_back(text());
      return;
    case 2: {
      const std::string option = Options[pick(std::size(Options))];
      words.push_back(option + "=" + text());
      return;
    }
    case 3:
      words.push_back(Options[pick(std::size(Options))]);
      words.push_back(text());
      return;
    default:
      words.push_back(Flags[pick(std::size(Flags))]);
    }
  }

  std::mt19937 m_Random;
};

Lines valuesOf(tool::Session& session) {
  Lines lines;
  for (uint32_t id = 0; id < tool::Id_Count; ++id) {
    const ValueDefinition& definition = session.parser().getDefinition(id);
    const Value& value = session.parser().getRecord(id).value;
    std::string line = std::to_string(id) + ":";
    if (definition.type == Type_StringVector) {
      for (const std::string& text : session.texts(id))
        line += "<" + text + ">";
    } else if (definition.type == Type_String) {
      line += value.text != nullptr ? "<" + std::string(value.text) + ">" : "null";
    } else if (definition.type != Type_ViaFile) {
      line += std::to_string(value.integer);
    }
    lines.push_back(line);
  }
  return lines;
}

TEST(CommandLineReport, MeansTheSameWhenItIsParsedAgain) {
  uint32_t accepted = 0;
  for (uint32_t seed = 0; seed < 4000; ++seed) {
    const Lines words = WordMaker(seed).makeCommandLine();
    tool::Session session;
    session.parse(words);
    if (session.parser().hasFailed()) continue;
    ++accepted;
    const std::string report = session.commandLine();
    tool::Session again;
    again.parse(splitReport(report));
    ASSERT_EQ(valuesOf(again), valuesOf(session)) << seed << ": " << report;
    EXPECT_EQ(again.commandLine(), report);
    EXPECT_FALSE(again.parser().hasFailed()) << report;
  }
  EXPECT_GT(accepted, 1000u);
}

} // namespace tabledrivenparser
