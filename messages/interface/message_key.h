// SPDX-License-Identifier: Apache-2.0
//
// The 32-bit name of a message. Bits 18 to 24 hold a letter (L for the tool, X for its libraries),
// bits 4 to 17 the number, bits 1 to 3 the place of the severity letter in "?IWE?U??", bit 0
// nothing. Keys sort by letter, then number, then severity letter, which is the order of the
// catalogues.
//
// The number is what users meet: they look it up, and name it in --diag_suppress. So a number stays
// with its message, and those of messages that were given up stay unused.

#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace messages {

enum class Key : uint32_t {};

inline constexpr std::string_view SeverityLetters = "?IWE?U??";
inline constexpr uint32_t LargestNumber = 16383;

/// What doesn't fit is cut to its bits; a severity letter that is none counts as "?".
[[nodiscard]] constexpr Key makeKey(char letter, uint32_t number, char severityLetter) {
  const size_t severityPlace = SeverityLetters.find(severityLetter);
  const uint32_t place =
      severityPlace == std::string_view::npos ? 0 : static_cast<uint32_t>(severityPlace);
  return Key{(static_cast<uint32_t>(letter) & 0x7F) << 18 | (number & LargestNumber) << 4 |
             place << 1};
}

/// The key as it is shown where a text is missing.
[[nodiscard]] constexpr uint32_t valueOf(Key key) {
  return static_cast<uint32_t>(key);
}
/// From 0 to LargestNumber.
[[nodiscard]] constexpr uint32_t numberOf(Key key) {
  return valueOf(key) >> 4 & LargestNumber;
}
[[nodiscard]] constexpr char severityLetterOf(Key key) {
  return SeverityLetters[valueOf(key) >> 1 & 7];
}

/// "?" where the key holds no letter: a key made of anything can be printed.
[[nodiscard]] constexpr char letterOf(Key key) {
  const char letter = static_cast<char>(valueOf(key) >> 18 & 0x7F);
  const bool isLetter = (letter >= 'A' && letter <= 'Z') || (letter >= 'a' && letter <= 'z');
  return isLetter ? letter : '?';
}

/// The printed form of a key: "L6839E". It owns its characters.
class KeyText {
public:
  explicit KeyText(Key key);
  /// Both views live as long as this object.
  [[nodiscard]] std::string_view getText() const { return {m_Characters, m_Length}; }
  [[nodiscard]] std::string_view getTextBehindLetter() const { return getText().substr(1); }

private:
  char m_Characters[8]; ///< a letter, four or five digits, a letter
  size_t m_Length;
};

} // namespace messages
