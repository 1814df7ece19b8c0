// SPDX-License-Identifier: Apache-2.0
//
// Code pages as the host has them, under their own numbers. There is nothing to hold: its functions
// take the number each time. Approximate characters are refused ("8" for an infinity), as they
// could turn a harmless name into another one.

#include "support/src/windows_code_page.h"

#include "support/interface/code_page.h"

#include <array>
#include <windows.h>

namespace support {

namespace {

// Has every character there is. The host takes neither flags nor a default for it.
constexpr uint32_t Gb18030 = 54936;

} // namespace

std::wstring wideFromPage(uint32_t number, std::string_view bytes) {
  const int size = static_cast<int>(bytes.size());
  const int needed = MultiByteToWideChar(number, 0, bytes.data(), size, nullptr, 0);
  std::wstring wide(static_cast<size_t>(needed), L'\0');
  MultiByteToWideChar(number, 0, bytes.data(), size, wide.data(), needed);
  return wide;
}

bool CodePage::openConverter(uint32_t number) {
  return IsValidCodePage(number) != 0;
}

void CodePage::closeConverter() const {}

size_t CodePage::encode(std::string_view character, Encoded bytes) const {
  std::array<wchar_t, 2> wide{};
  const int units =
      MultiByteToWideChar(Utf8CodePage, MB_ERR_INVALID_CHARS, character.data(),
                          static_cast<int>(character.size()), wide.data(), wide.size());
  if (units == 0) return 0;
  const bool hasAll = m_Number == Gb18030;
  BOOL isLacking = FALSE;
  const int size = WideCharToMultiByte(m_Number, hasAll ? 0 : WC_NO_BEST_FIT_CHARS, wide.data(),
                                       units, bytes.data(), static_cast<int>(bytes.size()),
                                       hasAll ? nullptr : "?", hasAll ? nullptr : &isLacking);
  return isLacking ? 0 : static_cast<size_t>(size);
}

} // namespace support
