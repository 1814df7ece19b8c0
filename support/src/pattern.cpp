// SPDX-License-Identifier: Apache-2.0
//
// The matcher remembers only the last star: when a later character does not fit, that star takes
// one character more. What earlier stars took never has to be looked at again, so a pattern of many
// stars costs at most its length times that of the text. A recursive matcher would take longer than
// anyone waits for "*a*a*a*a*b" against a long row of "a", and names in archives are long if
// somebody wants them to be.

#include "support/interface/pattern.h"

#include "support/interface/letters.h"

namespace support {

namespace {

bool characterFits(char wanted, char character, bool caseSensitive) {
  if (wanted == '?' || wanted == character) return true;
  return !caseSensitive && lowered(wanted) == lowered(character);
}

} // namespace

bool matchesPattern(std::string_view pattern, std::string_view text, bool caseSensitive) {
  constexpr size_t NoStar = std::string_view::npos;
  size_t patternAt = 0;
  size_t textAt = 0;
  size_t behindStar = NoStar;
  size_t starTextEnd = 0;
  while (textAt < text.size()) {
    if (patternAt < pattern.size() && pattern[patternAt] == '*') {
      behindStar = ++patternAt;
      starTextEnd = textAt;
    } else if (patternAt < pattern.size() &&
               characterFits(pattern[patternAt], text[textAt], caseSensitive)) {
      ++patternAt;
      ++textAt;
    } else if (behindStar != NoStar) {
      patternAt = behindStar;
      textAt = ++starTextEnd;
    } else {
      return false;
    }
  }
  // The text is used up: stars that are left match nothing of it.
  return pattern.find_first_not_of('*', patternAt) == std::string_view::npos;
}

} // namespace support
