// SPDX-License-Identifier: Apache-2.0
//
// The C library breaks dates from 1970 to 3000 down. The calendar is the same every 400 years, to
// the day of the week, so any other date is moved by as many of these as it takes, and back.

#include "support/interface/local_time.h"

namespace support {

namespace {

constexpr int64_t YearsOfCalendar = 400;
constexpr int64_t SecondsOfCalendar = int64_t{146097} * 24 * 60 * 60;
// A year has passed by then in every time zone, and a whole calendar fits in front of 3000.
constexpr int64_t FirstSecond = int64_t{2} * 365 * 24 * 60 * 60;

} // namespace

bool breakDownLocally(int64_t seconds, std::tm& date) {
  int64_t calendars = (seconds - FirstSecond) / SecondsOfCalendar;
  if (seconds < FirstSecond) --calendars;
  // The host's own rules for the years that it knows.
  if (seconds >= FirstSecond && seconds < FirstSecond + 2 * SecondsOfCalendar) calendars = 0;
  const __time64_t time = seconds - calendars * SecondsOfCalendar;
  if (_localtime64_s(&date, &time) != 0) return false;
  date.tm_year += static_cast<int>(calendars * YearsOfCalendar);
  return true;
}

} // namespace support
