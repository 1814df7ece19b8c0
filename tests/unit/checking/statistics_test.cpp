// SPDX-License-Identifier: Apache-2.0
//
// The count of evaluated assertions; this program is built with the counting macro. The order of
// the report is part of the promise: by falling count, and then by place.

#include "checking/interface/checking.h"

#include <gtest/gtest.h>

#include <string>

namespace checking {
namespace {

std::string shownText;

class StatisticsTest : public testing::Test {
protected:
  void SetUp() override {
    shownText.clear();
    setTextSink([](std::string_view text) { shownText += text; });
  }
  void TearDown() override {
    setTextSink(nullptr);
    checkingLevel = Level_Low;
  }
};

const char* const EmptyTotals = "\nTotals:\n"
                                "cold none: 0\ncold low: 0\ncold medium: 0\ncold high: 0\n"
                                "cold extravagant: 0\n"
                                "hot none: 0\nhot low: 0\nhot medium: 0\nhot high: 0\n"
                                "hot extravagant: 0\n";

TEST_F(StatisticsTest, StartAndFinishAreAnnounced) {
  startStatistics();
  EXPECT_EQ(shownText, "Collecting checking statistics\n");
  shownText.clear();
  finishStatistics();
  EXPECT_EQ(shownText, std::string("Finished checking statistics\n") + EmptyTotals);
}

TEST_F(StatisticsTest, SitesComeByFallingCountAndThenInOrder) {
  startStatistics();
  countCheck("b.cpp", 7, Temperature_Cold, 1);
  countCheck("a.cpp", 9, Temperature_Cold, 1);
  for (int round = 0; round < 12; ++round)
    countCheck("c.cpp", 3, Temperature_Hot, 1);
  shownText.clear();
  finishStatistics();
  EXPECT_EQ(shownText, "Finished checking statistics\n"
                       "c.cpp 3 (hot low): 12\n"
                       "a.cpp 9 (cold low): 1\n"
                       "b.cpp 7 (cold low): 1\n"
                       "\nTotals:\n"
                       "cold none: 0\ncold low: 2\ncold medium: 0\ncold high: 0\n"
                       "cold extravagant: 0\n"
                       "hot none: 0\nhot low: 12\nhot medium: 0\nhot high: 0\n"
                       "hot extravagant: 0\n");
}

TEST_F(StatisticsTest, TheMacroCountsWhatItEvaluates) {
  startStatistics();
  for (int round = 0; round < 3; ++round)
    QUARN_ASSERT(1, round >= 0);
  QUARN_ASSERT(2, false);
  shownText.clear();
  finishStatistics();
  EXPECT_NE(shownText.find("(cold low): 3\n"), std::string::npos) << shownText;
  EXPECT_NE(shownText.find("cold medium: 0\n"), std::string::npos);
}

TEST_F(StatisticsTest, NothingIsCountedOutsideOfStartAndFinish) {
  QUARN_ASSERT(1, true);
  startStatistics();
  finishStatistics();
  QUARN_ASSERT(1, true);
  shownText.clear();
  finishStatistics();
  EXPECT_EQ(shownText, std::string("Finished checking statistics\n") + EmptyTotals);
}

TEST_F(StatisticsTest, AStartForgetsWhatWasCounted) {
  startStatistics();
  countCheck("a.cpp", 1, Temperature_Cold, 1);
  startStatistics();
  shownText.clear();
  finishStatistics();
  EXPECT_EQ(shownText, std::string("Finished checking statistics\n") + EmptyTotals);
}

} // namespace
} // namespace checking
