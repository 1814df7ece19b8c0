// SPDX-License-Identifier: Apache-2.0
//
// Dates in local time, as a listing shows them. A date is broken down once for all members that
// have it, so many dates in any order, most of them twice, are held against the host's own answers,
// in several time zones and around the change of an offset; and numbers that are no date have no
// text.

#include "quarn/local_dates.h"

#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <ctime>
#include <limits>
#include <optional>
#include <string>

namespace quarn {

namespace {

// The local time of the process, for as long as this lives.
class TimeZone {
public:
  explicit TimeZone(const char* name) {
    if (const char* before = std::getenv("TZ")) m_Before = before;
    testsupport::setTimeZone(name);
  }
  ~TimeZone() { testsupport::setTimeZone(m_Before ? m_Before->c_str() : nullptr); }

private:
  std::optional<std::string> m_Before;
};

std::string byTheHost(int64_t date) {
  const auto seconds = static_cast<time_t>(date);
  const tm* brokenDown = std::localtime(&seconds);
  if (brokenDown == nullptr) return {};
  char text[18];
  return {text, strftime(text, sizeof text, "%b %d %H:%M %Y", brokenDown)};
}

// The offset of this one changes on the second Sunday of March and the first one of November.
constexpr const char* Eastern = "EST5EDT,M3.2.0,M11.1.0";
constexpr int64_t SpringOf2023 = 1678604400; // its first second of summer time
constexpr int64_t AutumnOf2023 = 1699164000; // its first second of winter time

} // namespace

TEST(LocalDatesTest, ShowsEachDateInLocalTime) {
  LocalDates dates;
  {
    const TimeZone zone("UTC");
    EXPECT_EQ(dates.textOf(0), "Jan 01 00:00 1970");
    EXPECT_EQ(dates.textOf(1700000000), "Nov 14 22:13 2023");
    EXPECT_EQ(dates.textOf(951826500), "Feb 29 12:15 2000");
    EXPECT_EQ(dates.textOf(-1), "Dec 31 23:59 1969");
  }
  const TimeZone zone("XYZ-5:30");
  EXPECT_EQ(LocalDates().textOf(1700000000), "Nov 15 03:43 2023");
}

TEST(LocalDatesTest, ChangesTheOffsetWithTheSecond) {
  const TimeZone zone(Eastern);
  LocalDates dates;
  for (int round = 0; round < 2; ++round) {
    EXPECT_EQ(dates.textOf(SpringOf2023 - 1), "Mar 12 01:59 2023");
    EXPECT_EQ(dates.textOf(SpringOf2023), "Mar 12 03:00 2023");
    EXPECT_EQ(dates.textOf(AutumnOf2023), "Nov 05 01:00 2023");
    EXPECT_EQ(dates.textOf(AutumnOf2023 - 1), "Nov 05 01:59 2023");
    EXPECT_EQ(dates.textOf(AutumnOf2023 - 3600), "Nov 05 01:00 2023");
  }
}

TEST(LocalDatesTest, ShowsManyDatesAsTheHostDoesWhateverTheirOrder) {
  // The last one's offset is not of whole minutes.
  for (const char* name : {"UTC", Eastern, "XYZ-5:30", "LMT+4:56:02"}) {
    const TimeZone zone(name);
    LocalDates dates;
    for (int round = 0; round < 2; ++round) {
      for (int64_t i = 0; i < 5000; ++i) {
        const int64_t date = i * 7919 % 5000 * 20011 + 1650000000;
        ASSERT_EQ(dates.textOf(date), byTheHost(date)) << date;
        ASSERT_EQ(dates.textOf(AutumnOf2023 + i - 2500), byTheHost(AutumnOf2023 + i - 2500));
      }
    }
  }
}

TEST(LocalDatesTest, KeepsEachTextWhereItIs) {
  const TimeZone zone("UTC");
  LocalDates dates;
  const std::string_view first = dates.textOf(0);
  for (int64_t date = 1; date < 1000; ++date)
    static_cast<void>(dates.textOf(date * 60));
  EXPECT_EQ(first, "Jan 01 00:00 1970");
  EXPECT_EQ(dates.textOf(0).data(), first.data()) << "it is not broken down again";
}

TEST(LocalDatesTest, LeavesADateEmptyThatHasNoText) {
  const TimeZone zone("UTC");
  LocalDates dates;
  // A year of five digits needs more room than there is; the last one no calendar has.
  for (const int64_t date : {int64_t{253402300800}, std::numeric_limits<int64_t>::max()}) {
    EXPECT_EQ(dates.textOf(date), "");
    EXPECT_EQ(dates.textOf(date), "");
  }
  EXPECT_EQ(dates.textOf(253402300799), "Dec 31 23:59 9999");
}

} // namespace quarn
