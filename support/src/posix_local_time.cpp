// SPDX-License-Identifier: Apache-2.0
//
// The C library knows the time zone, from TZ or from the machine's settings.

#include "support/interface/local_time.h"

namespace support {

bool breakDownLocally(int64_t seconds, std::tm& date) {
  const auto time = static_cast<time_t>(seconds);
  return localtime_r(&time, &date) != nullptr;
}

} // namespace support
