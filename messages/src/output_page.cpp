// SPDX-License-Identifier: Apache-2.0
//
// ASCII is the same in every page that is taken, and nearly every text is nothing else: it is not
// even copied.

#include "messages/src/output_page.h"

#include "support/interface/code_page.h"
#include "support/interface/descriptor.h"

#include <algorithm>
#include <string>

namespace messages {

namespace {

constexpr uint32_t Gb2312CodePage = 20936;
constexpr size_t LineCapacity = 10240; // bytes; enough for all but the oddest names

constinit support::CodePage page;
constinit uint32_t pageNumber = support::Utf8CodePage;

// Keeps its memory, as "Out of memory" must come out without any.
std::string& pageLine() {
  static std::string line;
  return line;
}

bool isAscii(std::string_view text) {
  uint8_t bits = 0;
  for (const char character : text)
    bits |= static_cast<uint8_t>(character);
  return bits < 0x80;
}

} // namespace

bool setOutputPage(uint32_t number) {
  if (number == support::Utf8CodePage) {
    resetOutputPage();
    return true;
  }
  const bool isOpened = page.open(number);
  if (!isOpened && number != Gb2312CodePage) return false;
  if (!isOpened) page.close();
  if (isOpened) pageLine().reserve(LineCapacity);
  support::setConsolePage(isOpened ? number : support::Utf8CodePage);
  pageNumber = number;
  return true;
}

void resetOutputPage() {
  page.close();
  support::setConsolePage(support::Utf8CodePage);
  pageNumber = support::Utf8CodePage;
}

uint32_t getOutputPage() {
  return pageNumber;
}

std::string_view inOutputPage(std::string_view text) {
  if (!page.isOpen() || isAscii(text)) return text;
  std::string& line = pageLine();
  line.clear();
  page.append(line, text);
  return line;
}

} // namespace messages
