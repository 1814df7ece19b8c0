// SPDX-License-Identifier: Apache-2.0
//
// Texts are UTF-8 in the program, and leave it in a code page where somebody asks for one: a
// console of the older kind shows Japanese from Shift JIS alone. Pages go by the numbers that they
// are known by, 932 for that one; the tables are the host's.
//
// A page is taken only if whoever reads the output can still rely on what a text is made of: ASCII
// stays as it is, byte by byte, and what isn't ASCII never begins with an ASCII byte. So wide
// pages, those of mainframes, and those that switch by escape sequences are refused, even where the
// host has them; and no character of a name turns into a quote, a separator or a control byte. The
// same text gives the same bytes on each host, as far as the hosts' tables agree.

#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace support {

inline constexpr uint32_t Utf8CodePage = 65001;

/// The way from UTF-8 into one code page. Holds the host's converter from `open` to `close`; a copy
/// is another name for the same one.
class CodePage {
public:
  constexpr CodePage() = default;

  /// Takes up the page in place of the one so far. False, and nothing has changed, if the host
  /// lacks it, or it is none for texts. UTF-8 is no page to be opened, since nothing is converted.
  [[nodiscard]] bool open(uint32_t number);
  void close();
  [[nodiscard]] bool isOpen() const { return m_Number != 0; }

  /// Appends the text in this page, which is open. A character that the page lacks comes out as
  /// "?", and so does each byte that is no UTF-8. Needs no memory but what the result needs.
  void append(std::string& result, std::string_view text) const;

private:
  // Bytes; no page has as many for one character.
  static constexpr size_t LargestCharacter = 16;
  using Encoded = std::span<char, LargestCharacter>;

  // The three parts that each host has.
  [[nodiscard]] bool openConverter(uint32_t number);
  void closeConverter() const;
  // Of one character in well-formed UTF-8. The number of bytes, or 0 if the page lacks it.
  [[nodiscard]] size_t encode(std::string_view character, Encoded bytes) const;

  [[nodiscard]] bool isForTexts() const;
  void appendCharacter(std::string& result, std::string_view character) const;

  uint32_t m_Number = 0; // 0: not open
  void* m_Converter = nullptr;
};

} // namespace support
