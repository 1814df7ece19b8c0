// SPDX-License-Identifier: Apache-2.0
//
// Puts characters while there is room, and counts them all. Each character is compared with the end
// of the buffer by itself: reports are short and made once a run, and there is one place to be
// right.
//
// Quotes go round the value, not round the entry, and are not escaped inside it: a value that holds
// both blanks and quotes is shown for the eye, and not for a shell.

#include "tabledrivenparser/interface/text_sink.h"

namespace tabledrivenparser {

void TextSink::put(char character) {
  if (m_Used < m_Buffer.size()) m_Buffer[m_Used] = character;
  ++m_Used;
}

void TextSink::put(std::string_view text) {
  for (char character : text)
    put(character);
}

void TextSink::putValue(std::string_view prefix, std::string_view value) {
  put(prefix);
  const bool hasBlank = value.find_first_of(" \t") != std::string_view::npos;
  const bool isQuoted =
      m_QuoteMode == QuoteMode::Blanks && (value.empty() ? m_QuoteEmpty : hasBlank);
  if (isQuoted) put('"');
  put(value);
  if (isQuoted) put('"');
}

void TextSink::startEntry() {
  if (m_HasEntries) put(m_Separator);
  m_HasEntries = true;
}

} // namespace tabledrivenparser
