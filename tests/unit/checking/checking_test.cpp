// SPDX-License-Identifier: Apache-2.0
//
// The levels, their text form, and what an assertion does: which texts of --db_check are taken and
// which leave the level alone, that an expression above the level is never evaluated, and that
// nothing runs on behind a failed one, whatever its handler does.

#include "checking/interface/checking.h"

#include "tests/support/test_host.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <string>

namespace checking {
namespace {

using testing::AllOf;
using testing::EndsWith;
using testing::ExitedWithCode;
using testing::Not;
using testing::StartsWith;

std::string shownText;

void collectText(std::string_view text) {
  shownText += text;
}

class CheckingTest : public testing::Test {
protected:
  void SetUp() override {
    shownText.clear();
    setTextSink(collectText);
  }
  void TearDown() override {
    setTextSink(nullptr);
    checkingLevel = Level_Low;
  }
};

TEST_F(CheckingTest, TheLevelIsLowAtTheStart) {
  EXPECT_EQ(checkingLevel, 1u);
  EXPECT_TRUE(checking(0));
  EXPECT_TRUE(checking(1));
}

TEST_F(CheckingTest, EachNameSetsItsLevel) {
  const char* names[] = {"none", "low", "medium", "high", "extravagant"};
  for (uint32_t level = 0; level < 5; ++level) {
    EXPECT_TRUE(set_checking_level(names[level]));
    EXPECT_EQ(checkingLevel, level);
  }
  EXPECT_EQ(shownText, "");
}

TEST_F(CheckingTest, NoneTurnsAssertionsOff) {
  ASSERT_TRUE(set_checking_level("none"));
  EXPECT_FALSE(checking(1));
  QUARN_ASSERT(1, false);
}

TEST_F(CheckingTest, AssertionsAboveLevelOneAreNeverEvaluated) {
  ASSERT_TRUE(set_checking_level("extravagant"));
  bool evaluated = false;
  QUARN_ASSERT(2, (evaluated = true));
  EXPECT_FALSE(evaluated);
  EXPECT_FALSE(checking(2));
  EXPECT_FALSE(checking(4));
  EXPECT_TRUE(checking(1));
}

TEST_F(CheckingTest, ANullTextIsTakenAndChangesNothing) {
  EXPECT_TRUE(set_checking_level(nullptr));
  EXPECT_EQ(checkingLevel, 1u);
}

TEST_F(CheckingTest, ShowAloneShowsAndKeepsTheLevel) {
  EXPECT_TRUE(set_checking_level("show"));
  EXPECT_EQ(checkingLevel, 1u);
  EXPECT_EQ(shownText, "COLD LOW checks enabled\nHOT LOW checks enabled\n");
}

TEST_F(CheckingTest, ShowWithALevelSetsFirstAndThenShows) {
  EXPECT_TRUE(set_checking_level("show,extravagant"));
  EXPECT_EQ(checkingLevel, 4u);
  EXPECT_EQ(shownText, "COLD LOW checks enabled\n"
                       "COLD MEDIUM checks enabled\n"
                       "COLD HIGH checks enabled\n"
                       "COLD EXTRAVAGANT checks enabled\n"
                       "HOT LOW checks enabled\n");
}

TEST_F(CheckingTest, EachLevelShowsTheLinesUpToIt) {
  ASSERT_TRUE(set_checking_level("show,medium"));
  EXPECT_EQ(shownText,
            "COLD LOW checks enabled\nCOLD MEDIUM checks enabled\nHOT LOW checks enabled\n");
  shownText.clear();
  ASSERT_TRUE(set_checking_level("show,high"));
  EXPECT_EQ(shownText, "COLD LOW checks enabled\nCOLD MEDIUM checks enabled\n"
                       "COLD HIGH checks enabled\nHOT LOW checks enabled\n");
}

TEST_F(CheckingTest, ShowWithACommaAndNoLevelStoresNone) {
  EXPECT_TRUE(set_checking_level("show,"));
  EXPECT_EQ(checkingLevel, 0u);
  EXPECT_EQ(shownText, "");
}

TEST_F(CheckingTest, AnythingElseIsRefusedAndLeavesTheLevel) {
  for (const char* text : {"", "lowx", "lo", "LOW", "bogus", "show,bogus", "show,lowx", "showlow",
                           "show,show", "low ", "nonelow"}) {
    EXPECT_FALSE(set_checking_level(text)) << text;
    EXPECT_EQ(checkingLevel, 1u) << text;
  }
  EXPECT_EQ(shownText, "");
}

TEST_F(CheckingTest, TextsGoToStandardOutputByDefault) {
  setTextSink(nullptr);
  testing::internal::CaptureStdout();
  showCheckingLevels();
  EXPECT_EQ(testing::internal::GetCapturedStdout(),
            "COLD LOW checks enabled\nHOT LOW checks enabled\n");
}

using CheckingDeathTest = CheckingTest;

TEST_F(CheckingDeathTest, AFailureNamesItsPlaceAndExpressionAndExitsWithOne) {
  static constexpr int index = 3;
  static constexpr int m_Used = 2;
  const std::string line = std::to_string(__LINE__ + 1);
  const auto fail = [] { QUARN_ASSERT(1, index < m_Used); };
  EXPECT_EXIT(fail(), ExitedWithCode(1),
              EndsWith("checking_test.cpp line " + line + " (index < m_Used)\n"));
}

TEST_F(CheckingDeathTest, TheExpressionIsQuotedAsItWasWritten) {
  const void* region = nullptr;
  EXPECT_EXIT(QUARN_ASSERT(1, region != NULL), ExitedWithCode(1), "\\(region != NULL\\)");
}

TEST_F(CheckingDeathTest, ThePathIsRelativeToTheTree) {
  EXPECT_EXIT(QUARN_ASSERT(1, false), ExitedWithCode(1),
              AllOf(StartsWith("Assertion failed: "), Not(StartsWith("Assertion failed: /"))));
}

TEST_F(CheckingDeathTest, AnInstalledHandlerGetsTheFailure) {
  const auto handler = [](const char* path, unsigned line, const char* expression) {
    std::fprintf(stderr, "%s|%u|%s", path, line, expression);
    std::exit(7);
  };
  EXPECT_EXIT(
      {
        setFailureHandler(handler);
        assertionFailed("a/b.cpp", 12, "x == y");
      },
      ExitedWithCode(7), "^a/b.cpp\\|12\\|x == y$");
}

TEST_F(CheckingDeathTest, AHandlerThatReturnsEndsInAnAbort) {
  EXPECT_EXIT(
      {
        setFailureHandler([](const char*, unsigned, const char*) {});
        QUARN_ASSERT(1, false);
      },
      testsupport::hasAborted, "");
  EXPECT_EXIT(
      {
        setFaultHandler([](const char*) {});
        reportFault("anything");
      },
      testsupport::hasAborted, "");
}

TEST_F(CheckingDeathTest, AFaultIsPrintedAndExitsWithOne) {
  EXPECT_EXIT(reportFault("Unreachable code: set_checking_level"), ExitedWithCode(1),
              "^Unreachable code: set_checking_level\n$");
}

TEST_F(CheckingDeathTest, AnInstalledFaultHandlerGetsTheText) {
  EXPECT_EXIT(
      {
        setFaultHandler([](const char* text) {
          std::fprintf(stderr, "<%s>", text);
          std::exit(3);
        });
        reportFault("text");
      },
      ExitedWithCode(3), "^<text>$");
}

TEST_F(CheckingTest, InstallingReturnsWhatWasThereAndNullBringsTheDefaultBack) {
  const FailureHandler handler = [](const char*, unsigned, const char*) {};
  const FailureHandler standard = setFailureHandler(handler);
  EXPECT_NE(standard, nullptr);
  EXPECT_EQ(setFailureHandler(nullptr), handler);
  EXPECT_EQ(setFailureHandler(nullptr), standard);
}

} // namespace
} // namespace checking
