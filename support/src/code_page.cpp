// SPDX-License-Identifier: Apache-2.0
//
// What all hosts do alike: which pages are taken, and the walk over a text. It goes character by
// character, as the hosts' functions do different things for whole texts: one gives "??" for what
// is two units of UTF-16, another drops what it takes for a mark without a meaning, and no two
// agree on how much of a text a malformed byte spoils.

#include "support/interface/code_page.h"

#include <algorithm>
#include <array>

namespace support {

namespace {

constexpr char Lacking = '?';

// The lowest numbers aren't pages, but whatever the machine happens to be set to.
constexpr uint32_t FirstNumber = 4;
constexpr uint32_t LastNumber = 0xFFFF;

// Some of each script that has pages; a page need not have any of them.
constexpr std::string_view Samples[] = {"\u00e9", "\u0416", "\u03a9", "\u05d0", "\u0627",
                                        "\u0e01", "\u30a2", "\u4e2d", "\uac00", "\u20ac"};

bool isAscii(char byte) {
  return static_cast<unsigned char>(byte) < 0x80;
}

bool isContinuation(char byte) {
  return (static_cast<unsigned char>(byte) & 0xC0) == 0x80;
}

struct LeadRow {
  unsigned char first;
  unsigned char last;
  unsigned char length;
  // Of the byte behind it: longer forms than needed, surrogates, and what is beyond Unicode.
  unsigned char lowestSecond;
  unsigned char highestSecond;
};

// clang-format off
constexpr LeadRow LeadRows[] = {
    {0x00, 0x7F, 1, 0x80, 0xBF},
    {0xC2, 0xDF, 2, 0x80, 0xBF},
    {0xE0, 0xE0, 3, 0xA0, 0xBF},
    {0xE1, 0xEC, 3, 0x80, 0xBF},
    {0xED, 0xED, 3, 0x80, 0x9F},
    {0xEE, 0xEF, 3, 0x80, 0xBF},
    {0xF0, 0xF0, 4, 0x90, 0xBF},
    {0xF1, 0xF3, 4, 0x80, 0xBF},
    {0xF4, 0xF4, 4, 0x80, 0x8F},
};
// clang-format on

// How long the character is that the text begins with; 0 if it is no UTF-8.
size_t lengthOfFirst(std::string_view text) {
  const auto lead = static_cast<unsigned char>(text[0]);
  const auto* const row = std::find_if(std::begin(LeadRows), std::end(LeadRows), [lead](auto& r) {
    return lead >= r.first && lead <= r.last;
  });
  if (row == std::end(LeadRows) || text.size() < row->length) return 0;
  if (row->length == 1) return 1;
  const auto second = static_cast<unsigned char>(text[1]);
  if (second < row->lowestSecond || second > row->highestSecond) return 0;
  const std::string_view rest = text.substr(1, row->length - 1);
  return std::all_of(rest.begin(), rest.end(), isContinuation) ? row->length : 0;
}

// U+0080 to U+009F. In UTF-8 these are two bytes that nobody obeys; in some pages they would be the
// one byte that begins a command to a terminal.
bool isControl(std::string_view character) {
  return character[0] == '\xC2' && static_cast<unsigned char>(character[1]) < 0xA0;
}

} // namespace

bool CodePage::open(uint32_t number) {
  if (number < FirstNumber || number > LastNumber || number == Utf8CodePage) return false;
  CodePage page;
  if (!page.openConverter(number)) return false;
  page.m_Number = number;
  if (!page.isForTexts()) {
    page.closeConverter();
    return false;
  }
  close();
  *this = page;
  return true;
}

void CodePage::close() {
  if (isOpen()) closeConverter();
  *this = {};
}

bool CodePage::isForTexts() const {
  std::array<char, LargestCharacter> bytes{};
  for (char character = '\t'; character < '\x7F'; ++character) {
    const bool isText = character >= ' ' || character <= '\n';
    if (isText && (encode({&character, 1}, bytes) != 1 || bytes[0] != character)) return false;
  }
  return std::none_of(std::begin(Samples), std::end(Samples), [&](std::string_view sample) {
    return encode(sample, bytes) != 0 && isAscii(bytes[0]);
  });
}

void CodePage::append(std::string& result, std::string_view text) const {
  while (!text.empty()) {
    const auto* const asciiEnd = std::find_if_not(text.begin(), text.end(), isAscii);
    const auto asciiSize = static_cast<size_t>(asciiEnd - text.begin());
    result += text.substr(0, asciiSize);
    text.remove_prefix(asciiSize);
    if (text.empty()) return;
    const size_t length = lengthOfFirst(text);
    appendCharacter(result, text.substr(0, length));
    text.remove_prefix(std::max<size_t>(length, 1));
  }
}

// An empty one stands for a malformed byte.
void CodePage::appendCharacter(std::string& result, std::string_view character) const {
  std::array<char, LargestCharacter> bytes{};
  const bool mayPass = !character.empty() && !isControl(character);
  const size_t size = mayPass ? encode(character, bytes) : 0;
  if (size == 0 || isAscii(bytes[0])) {
    result += Lacking;
    return;
  }
  result.append(bytes.data(), size);
}

} // namespace support
