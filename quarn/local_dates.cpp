// SPDX-License-Identifier: Apache-2.0
//
// A date is broken down by the host's time zone once, and then found again: members of a library
// mostly have the same few dates, and the break-down is what a long listing would spend its time
// on. A date that the host can't break down is shown as an empty text.
#include "quarn/local_dates.h"

#include "support/interface/local_time.h"

#include <ctime>

namespace quarn {

std::string_view LocalDates::textOf(int64_t date) {
  const auto [text, isNew] = m_Texts.try_emplace(date);
  if (isNew) text->second = computeText(date);
  return text->second.getText();
}

LocalDates::Text LocalDates::computeText(int64_t date) {
  Text text;
  std::tm brokenDown = {};
  if (!support::breakDownLocally(date, brokenDown)) return text;
  text.length = strftime(text.bytes.data(), TextSize, "%b %d %H:%M %Y", &brokenDown);
  return text;
}

} // namespace quarn
