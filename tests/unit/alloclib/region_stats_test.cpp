// SPDX-License-Identifier: Apache-2.0
//
// The records: counts, trace lines, the two lists and the report. The report is compared to the
// letter, as its columns are its format; lists that were written over must be a fault and not a
// crash.

#include "region_fixture.h"

namespace alloclib {
namespace {

using testing::ExitedWithCode;
using testing::HasSubstr;
using testing::Not;

class RegionStatsTest : public RegionTest {
protected:
  // Every test leaves no live record of its own.
  RegionStats* start(const char* name, bool accurate = true) {
    return RegionStats::start(name, 0, accurate);
  }

  static std::string line(const std::string& number, const std::string& name, const char* rest) {
    std::string text = number + ", " + name + ",";
    text.resize(25, ' ');
    return text + rest + "\n";
  }
};

using RegionStatsDeathTest = RegionStatsTest;

TEST_F(RegionStatsTest, TheSizeIsWhatIsAllocatedWithOverheadWithoutPadding) {
  RegionStats* stats = start("sizes");
  stats->allocated(nullptr, 104, 4);
  EXPECT_EQ(stats->getCurrentSize(), 100u);
  stats->overheadIncreased(16);
  stats->fragmentationIncreased(8);
  EXPECT_EQ(stats->getCurrentSize(), 124u);
  stats->overheadDecreased(6);
  stats->fragmentationDecreased(3);
  stats->discarded(nullptr, 50, 6);
  EXPECT_EQ(stats->getCurrentSize(), 65u);
  EXPECT_EQ(stats->getMaximumSize(), 124u);
  EXPECT_EQ(stats->getAllocations(), 1u);
  EXPECT_EQ(stats->getFrees(), 1u);
  stats->finish();
}

TEST_F(RegionStatsTest, TheReportAlignsItsColumns) {
  RegionStats* stats = start("region name");
  stats->allocated(nullptr, 8, 0);
  stats->allocated(nullptr, 16, 0);
  stats->discarded(nullptr, 16, 0);
  EXPECT_EQ(
      getReport(true, false),
      "\nNum,RegionName,          FinalSz, MaxSz,   NAllocs, NFrees,  Al,Frag,  Uses, Ac\n" +
          line(" 1", "System region", "16,      16,      1,       0,       16,0,     1,    Y") +
          line(" 2", "region name", "8,       24,      2,       1,       24,0,     1,    Y"));
  stats->finish();
}

TEST_F(RegionStatsTest, AFieldThatIsTooLongIsCutAtTheNextColumn) {
  RegionStats* stats = start("a region with a name that is longer than its column");
  stats->allocated(nullptr, 123456, 0);
  EXPECT_THAT(
      getReport(true, false),
      HasSubstr(
          "\n 2, a region with a name 123456,  123456,  1,       0,       1230,     1,    Y\n"));
  stats->finish();
}

TEST_F(RegionStatsTest, AnInaccurateRegionSaysSo) {
  RegionStats* stats = start("plain", false);
  EXPECT_THAT(getReport(true, false), HasSubstr("1,    n\n"));
  stats->finish();
}

TEST_F(RegionStatsTest, FinishedRegionsComeFirstAndCanBeLeftOut) {
  RegionStats* finished = start("finished");
  RegionStats* live = start("live");
  finished->finish();
  const std::string report = getReport(true, false);
  EXPECT_LT(report.find(" 2, finished,"), report.find(" 1, System region,"));
  EXPECT_LT(report.find(" 1, System region,"), report.find(" 3, live,"));
  EXPECT_THAT(getReport(false, false), Not(HasSubstr("finished")));
  live->finish();
}

TEST_F(RegionStatsTest, LiveRegionsButTheRootAreFlaggedOnRequest) {
  const std::string complaint =
      "ERROR: Following region was not destroyed before program termination!\n";
  RegionStats* finished = start("finished");
  finished->finish();
  RegionStats* live = start("live");
  const std::string report = getReport(true, true);
  EXPECT_THAT(report, HasSubstr(complaint + " 3, live,"));
  EXPECT_EQ(report.find(complaint), report.rfind(complaint));
  EXPECT_THAT(getReport(true, false), Not(HasSubstr("ERROR")));
  live->finish();
}

TEST_F(RegionStatsTest, FinishedRecordsOfOneNameAreMerged) {
  RegionStats* first = start("twin");
  first->allocated(nullptr, 100, 0);
  first->finish();
  RegionStats* second = start("twin", false);
  second->allocated(nullptr, 30, 0);
  second->discarded(nullptr, 10, 0);
  second->finish();
  start("other")->finish();
  const std::string report = getReport(true, false);
  EXPECT_THAT(report, HasSubstr(line(" 2", "twin",
                                     "120,     100,     2,       1,       1300,     2,    n")));
  EXPECT_THAT(report, Not(HasSubstr(" 3, twin")));
  EXPECT_THAT(report, HasSubstr(" 4, other"));
}

TEST_F(RegionStatsTest, ALimitAboveTenLeavesSeveralRecordsOfOneName) {
  RegionStats::setFinishedLimit(12);
  for (int count = 0; count < 2; ++count)
    start("twin")->finish();
  EXPECT_THAT(getReport(true, false), HasSubstr(" 3, twin"));
  start("twin")->finish();
  const std::string report = getReport(true, false);
  EXPECT_THAT(report, Not(HasSubstr(" 4, twin")));
  EXPECT_THAT(report, HasSubstr("2,    Y\n"));
}

TEST_F(RegionStatsTest, ALimitOfTenKeepsOneRecordOfAName) {
  RegionStats::setFinishedLimit(10);
  for (int count = 0; count < 2; ++count)
    start("twin")->finish();
  EXPECT_THAT(getReport(true, false), Not(HasSubstr(" 3, twin")));
}

TEST_F(RegionStatsTest, OnceMergedANameIsAlwaysMerged) {
  for (int count = 0; count < 2; ++count)
    start("twin")->finish();
  RegionStats::setFinishedLimit(100);
  start("twin")->finish();
  const std::string report = getReport(true, false);
  EXPECT_THAT(report, Not(HasSubstr(" 4, twin")));
  EXPECT_THAT(report, HasSubstr("3,    Y\n"));
}

TEST_F(RegionStatsDeathTest, ABrokenListIsAFault) {
  EXPECT_EXIT(
      {
        RegionStats* stats = start("broken");
        RegionStatsPeer::breakList(stats);
        stats->finish();
      },
      ExitedWithCode(1), "^Internal alloclib error: RegionStats list is inconsistent\n$");
}

TEST_F(RegionStatsDeathTest, RecordsAreNotFreedUnderALiveRegion) {
  EXPECT_EXIT(
      {
        start("live");
        RegionStats::freeAll();
      },
      ExitedWithCode(1), "^Internal alloclib error: FreeAllStats called with live region\n$");
}

TEST_F(RegionStatsTest, NothingIsTracedByDefault) {
  testing::internal::CaptureStderr();
  RegionStats* stats = start("quiet");
  stats->allocated(nullptr, 8, 0);
  stats->overheadIncreased(8);
  stats->finish();
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}

std::string traceAll(uint32_t level, bool accurate) {
  setTraceLevel(level);
  testing::internal::CaptureStderr();
  RegionStats* stats = RegionStats::start("loud", 4096, accurate);
  stats->extended();
  stats->allocated(reinterpret_cast<void*>(0x1000), 16, 6);
  stats->discarded(reinterpret_cast<void*>(0x1000), 10, 6);
  stats->overheadIncreased(24);
  stats->overheadDecreased(20);
  stats->fragmentationIncreased(9);
  stats->fragmentationDecreased(1);
  stats->finish();
  return testing::internal::GetCapturedStderr();
}

const std::string Created = "(loud:2) New region (4096) initial_size. Tracing is ACCURATE\n"
                            "(loud:2) region extended\n";
// As the host's C library writes it.
std::string pointerText() {
  char text[32];
  std::snprintf(text, sizeof text, "%p", reinterpret_cast<void*>(0x1000));
  return text;
}

const std::string Used =
    "(loud:2) Allocation at (" + pointerText() + ") (10) bytes (6) padding (unknown) type\n" +
    "(loud:2) Discarded block at (" + pointerText() + ") (10) bytes (6) padding\n";
const std::string Moved = "(loud:2) overhead increased (24) bytes \n"
                          "(loud:2) overhead decreased (20) bytes \n"
                          "(loud:2) fragmentation increased (9) bytes\n"
                          "(loud:2) fragmentation decreased (1) bytes \n";
const std::string Destroyed = "(loud:2) Destroyed region with final size (12) after (1) allocs. "
                              "Maximum size was (24). Tracing was ACCURATE\n";

TEST_F(RegionStatsTest, LevelOneTracesTheLifeOfARegion) {
  EXPECT_EQ(traceAll(1, true), Created + Destroyed);
}

TEST_F(RegionStatsTest, LevelTwoTracesAllocationsToo) {
  EXPECT_EQ(traceAll(2, true), Created + Used + Destroyed);
}

TEST_F(RegionStatsTest, LevelThreeTracesOverheadAndFragmentationToo) {
  EXPECT_EQ(traceAll(3, true), Created + Used + Moved + Destroyed);
}

TEST_F(RegionStatsTest, AnInaccurateTraceSaysSo) {
  const std::string trace = traceAll(1, false);
  EXPECT_THAT(trace, HasSubstr("Tracing is INACCURATE\n"));
  EXPECT_THAT(trace, HasSubstr("Tracing was INACCURATE\n"));
}

} // namespace
} // namespace alloclib
