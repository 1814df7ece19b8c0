// SPDX-License-Identifier: Apache-2.0
//
// Each letter and option, what it asks for, and what is refused.

#include "quarn-ar/command_line.h"

#include "tests/unit/quarn-ar/ar_fixture.h"

namespace quarn_ar {

namespace {

class CommandLineTest : public ArTest {
protected:
  Answer read(const Words& words, Program program = Program::Ar) {
    m_Request = {};
    return readCommandLine(program, words, m_Request);
  }
  Request m_Request;
};

TEST_F(CommandLineTest, KnowsEachOperationWithAndWithoutADash) {
  for (const char letter : std::string("dmpqrtxs")) {
    for (const std::string dash : {"", "-"}) {
      ASSERT_EQ(read({dash + letter, "lib.a"}), Answer::Run) << letter;
      EXPECT_EQ(m_Request.operation, static_cast<Operation>(letter));
      EXPECT_THAT(m_Request.archives, ElementsAre("lib.a"));
    }
  }
}

TEST_F(CommandLineTest, TakesWhereAttributesComeFrom) {
  const Words words = {"--qobix_buildattr", "rc", "--libattrmap", "map", "lib.a", "a.o"};
  ASSERT_EQ(read(words), Answer::Run);
  EXPECT_TRUE(m_Request.settings.useObjectBuildAttributes);
  EXPECT_STREQ(m_Request.settings.libraryAttributeMap, "map");
  const Words others = {"s", "--libattrmap=other", "lib.a"};
  ASSERT_EQ(read(others), Answer::Run);
  EXPECT_FALSE(m_Request.settings.useObjectBuildAttributes);
  EXPECT_STREQ(m_Request.settings.libraryAttributeMap, "other");
}

struct Form {
  Words words;
  Operation operation;
};

// As they stand in the rules of build systems.
TEST_F(CommandLineTest, TakesOptionsWhereverTheyStand) {
  const Form forms[] = {
      {{"qc", "lib.a", "a.o"}, Operation::Append},
      {{"csr", "lib.a", "a.o"}, Operation::Replace},
      {{"csrD", "lib.a", "a.o"}, Operation::Replace},
      {{"cru", "lib.a", "a.o"}, Operation::Replace},
      {{"-rv", "lib.a", "a.o"}, Operation::Replace},
      {{"-r", "-c", "-s", "lib.a", "a.o"}, Operation::Replace},
      {{"-c", "r", "lib.a", "a.o"}, Operation::Replace},
      {{"--plugin", "p.so", "cr", "lib.a", "a.o"}, Operation::Replace},
      {{"cr", "--plugin=p.so", "lib.a", "a.o"}, Operation::Replace},
      {{"cr", "--target=elf32-little", "lib.a", "a.o"}, Operation::Replace},
      {{"cr", "lib.a", "a.o", "-v"}, Operation::Replace},
      {{"cr", "--", "lib.a", "a.o"}, Operation::Replace},
      {{"-s", "-r", "lib.a", "a.o"}, Operation::Replace},
  };
  for (const Form& form : forms) {
    const std::string text = testing::PrintToString(form.words);
    ASSERT_EQ(read(form.words), Answer::Run) << text;
    EXPECT_EQ(m_Request.operation, form.operation) << text;
    EXPECT_THAT(m_Request.archives, ElementsAre("lib.a")) << text;
    EXPECT_THAT(m_Request.files, ElementsAre("a.o")) << text;
  }
  EXPECT_EQ(getErrorText(), "");
}

TEST_F(CommandLineTest, TakesWordsAsTheyAreBehindTwoDashes) {
  ASSERT_EQ(read({"rc", "lib.a", "--", "-x.o", "--help"}), Answer::Run);
  EXPECT_THAT(m_Request.files, ElementsAre("-x.o", "--help"));
}

struct Effect {
  const char* letters;
  bool (*isThere)(const Request& request);
};

TEST_F(CommandLineTest, HearsEachModifier) {
  const Effect effects[] = {
      {"rc", [](const Request& request) { return !request.settings.warnOnCreate; }},
      {"r", [](const Request& request) { return request.settings.warnOnCreate; }},
      {"xC", [](const Request& request) { return !request.settings.overwriteOnExtract; }},
      {"r", [](const Request& request) { return !request.realNumbers; }},
      {"rU", [](const Request& request) { return request.realNumbers; }},
      {"rUD", [](const Request& request) { return !request.realNumbers; }},
      {"rf", [](const Request& request) { return request.shortNames; }},
      {"rl", [](const Request& request) { return request.operation == Operation::Replace; }},
      {"xo", [](const Request& request) { return request.settings.restoreDates; }},
      {"rP", [](const Request& request) { return request.fullNames; }},
      {"rs", [](const Request& request) { return !request.settings.suppressSymbolTable; }},
      {"rS", [](const Request& request) { return request.settings.suppressSymbolTable; }},
      {"rSs", [](const Request& request) { return !request.settings.suppressSymbolTable; }},
      {"tS", [](const Request& request) { return !request.settings.suppressSymbolTable; }},
      {"xT", [](const Request& request) { return request.settings.truncateNames; }},
      {"ru", [](const Request& request) { return request.newerOnly; }},
      {"tv", [](const Request& request) { return request.settings.verbose; }},
  };
  for (const Effect& effect : effects) {
    ASSERT_EQ(read({effect.letters, "lib.a"}), Answer::Run) << effect.letters;
    EXPECT_TRUE(effect.isThere(m_Request)) << effect.letters;
  }
}

TEST_F(CommandLineTest, TakesAPlaceAndACount) {
  for (const std::string letters : {"ra", "ma"}) {
    ASSERT_EQ(read({letters, "p.o", "lib.a", "a.o"}), Answer::Run);
    EXPECT_EQ(m_Request.place, Place::After);
    EXPECT_EQ(m_Request.placeName, "p.o");
    EXPECT_THAT(m_Request.archives, ElementsAre("lib.a"));
  }
  for (const std::string letters : {"rb", "ri"}) {
    ASSERT_EQ(read({letters, "p.o", "lib.a", "a.o"}), Answer::Run);
    EXPECT_EQ(m_Request.place, Place::Before);
  }
  ASSERT_EQ(read({"xN", "3", "lib.a", "a.o"}), Answer::Run);
  EXPECT_EQ(m_Request.instance, 3U);
  EXPECT_THAT(m_Request.archives, ElementsAre("lib.a"));
}

TEST_F(CommandLineTest, AnswersQuestionsWhateverElseIsAsked) {
  EXPECT_EQ(read({"--version"}), Answer::Version);
  EXPECT_EQ(read({"-V"}), Answer::Version);
  EXPECT_EQ(read({"rV", "lib.a"}), Answer::Version);
  EXPECT_EQ(read({"--help"}), Answer::Help);
  EXPECT_EQ(read({"-h"}), Answer::Help);
  for (const char* word : {"-v", "-V", "--version"})
    EXPECT_EQ(read({word}, Program::Ranlib), Answer::Version);
  EXPECT_EQ(read({"-h"}, Program::Ranlib), Answer::Help);
}

TEST_F(CommandLineTest, TakesSeveralArchivesForRanlib) {
  ASSERT_EQ(read({"-D", "a.a", "-t", "b.a", "-U", "--plugin", "p.so"}, Program::Ranlib),
            Answer::Run);
  EXPECT_EQ(m_Request.operation, Operation::Index);
  EXPECT_THAT(m_Request.archives, ElementsAre("a.a", "b.a"));
}

struct Refused {
  Words words;
  const char* sentence;
  Program program = Program::Ar;
};

TEST_F(CommandLineTest, RefusesWhatItCannotHonour) {
  const Refused all[] = {
      {{}, "L6839E: One of the actions -[dmpqrstx] must be specified"},
      {{"c", "lib.a"}, "L6839E: One of the actions -[dmpqrstx] must be specified"},
      {{"r"}, "L6838E: No archive specified"},
      {{"r", ""}, "L6838E: No archive specified"},
      {{"rx", "lib.a"}, "two operations: 'r' and 'x'"},
      {{"-t", "-d", "lib.a"}, "two operations: 't' and 'd'"},
      {{"rz", "lib.a"}, "there is no letter 'z', as in 'rz'"},
      {{"-k", "lib.a"}, "there is no letter 'k', as in '-k'"},
      {{"lib.a"}, "there is no letter '.', as in 'lib.a'"},
      {{"M"}, "scripts are not read ('M'): give the operations as words"},
      {{"-M"}, "scripts are not read ('M'): give the operations as words"},
      {{"rT", "lib.a"}, "thin archives are not made ('T')"},
      {{"qT", "lib.a"}, "thin archives are not made ('T')"},
      {{"--thin", "rc", "lib.a"}, "thin archives are not made"},
      {{"qa", "p.o", "lib.a"}, "'a' can't be honoured with the operation 'q'"},
      {{"tb", "p.o", "lib.a"}, "'b' can't be honoured with the operation 't'"},
      {{"rab", "p.o", "lib.a"}, "two places: 'a' and 'b'"},
      {{"qu", "lib.a"}, "'u' can't be honoured with the operation 'q'"},
      {{"rN", "1", "lib.a"}, "'N' can't be honoured with the operation 'r'"},
      {{"rC", "lib.a"}, "'C' can't be honoured with the operation 'r'"},
      {{"to", "lib.a"}, "'o' can't be honoured with the operation 't'"},
      {{"xP", "lib.a"}, "'P' can't be honoured with the operation 'x'"},
      {{"sS", "lib.a"}, "'S' can't be honoured with the operation 's'"},
      {{"ra"}, "'a' wants a member's name in front of the archive"},
      {{"mb"}, "'b' wants a member's name in front of the archive"},
      {{"xN"}, "'N' wants a number from 1 on in front of the archive, not ''"},
      {{"xN", "0", "lib.a"}, "'N' wants a number from 1 on in front of the archive, not '0'"},
      {{"xN", "2x", "lib.a"}, "'N' wants a number from 1 on in front of the archive, not '2x'"},
      {{"xN", "4294967296", "lib.a"},
       "'N' wants a number from 1 on in front of the archive, not '4294967296'"},
      {{"s", "a.a", "b.a"}, "'s' alone takes one archive, and no 'b.a'"},
      {{"--odd", "rc", "lib.a"}, "there is no option '--odd'"},
      {{"--odd=1", "rc", "lib.a"}, "there is no option '--odd'"},
      {{"rc", "lib.a", "--plugin"}, "the option '--plugin' wants a value"},
      {{"--help=x"}, "the option '--help' takes no value"},
      {{"--target=pe-x", "rc", "lib.a"}, "archives for the target 'pe-x' are not made"},
      {{"--diag_style=odd", "rc", "lib.a"}, "there is no diagnostic style 'odd'"},
      {{}, "L6838E: No archive specified", Program::Ranlib},
      {{"-r", "lib.a"}, "there is no letter 'r', as in '-r'", Program::Ranlib},
  };
  for (const Refused& refused : all) {
    SetUp();
    EXPECT_EQ(read(refused.words, refused.program), Answer::Refused);
    EXPECT_THAT(messages::getErrorCount(), 1U);
  }
  for (const Refused& refused : all) {
    const bool isAr = refused.program == Program::Ar;
    const RunOutcome outcome = isAr ? ar(refused.words) : ranlib(refused.words);
    EXPECT_EQ(outcome.errors, std::string(isAr ? "quarn-ar" : "quarn-ranlib") +
                                  ": Error: " + refused.sentence + "\n");
    EXPECT_EQ(outcome.status, 1);
  }
}

TEST_F(CommandLineTest, MovesDiagnosticsAsTheToolDoes) {
  givenLibrary({"a.o"});
  EXPECT_EQ(ar({"d", "lib.a", "b.o"}).errors,
            "quarn-ar: Warning: L6831E: 'b.o' not present in archive 'lib.a'\n");
  EXPECT_EQ(ar({"--diag_suppress=6831,L6875", "d", "lib.a", "b.o"}).errors, "");
  EXPECT_EQ(ar({"--diag_error=6831", "d", "lib.a", "b.o"}).status, 1);
  EXPECT_EQ(ar({"--diag_style=ide", "d", "lib.a", "b.o"}).errors,
            "lib.a : warning L6831:  'b.o' not present in archive 'lib.a'\n");
  EXPECT_EQ(ar({"--diag_error=99999", "t", "lib.a"}).errors,
            "quarn-ar: Warning: L9962I: Unknown diagnostic number 99999\n");
}

} // namespace

} // namespace quarn_ar
