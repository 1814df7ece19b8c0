// SPDX-License-Identifier: Apache-2.0
//
// Dates of members as a listing shows them: "Nov 14 22:13 2023", in local time. The host takes as
// long for one as the rest of its line, and members that were made together have few.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <map>
#include <string_view>

namespace quarn {

class LocalDates {
public:
  // `date` is in seconds since 1970. Empty where the host can't break the date down, or where the
  // text needs more room than there is. Good for as long as this object.
  [[nodiscard]] std::string_view textOf(int64_t date);

private:
  static constexpr size_t TextSize = 18; // bytes, the NUL included

  struct Text {
    std::array<char, TextSize> bytes;
    size_t length = 0;

    [[nodiscard]] std::string_view getText() const { return {bytes.data(), length}; }
  };
  [[nodiscard]] static Text computeText(int64_t date);

  // By the second, as the offset from universal time may change with any. Dates come from the
  // archive: in a hash table they could be made to lie in one chain.
  std::map<int64_t, Text> m_Texts;
};

} // namespace quarn
