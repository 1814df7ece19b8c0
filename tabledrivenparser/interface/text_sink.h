// SPDX-License-Identifier: Apache-2.0
//
// A bounded text that goes on counting when it is full, so that the caller learns the size that
// would have been enough and can try again. Reports on a parsed command line are written through
// it; their length is the user's choice, and the buffer's end is the one bound that a write here
// knows.

#pragma once

#include <cstddef>
#include <span>
#include <string_view>

namespace tabledrivenparser {

/// Writes to a buffer that it doesn't own, and never beyond its end.
class TextSink {
public:
  enum class QuoteMode : bool { Never, Blanks };

  /// The buffer is the caller's. With QuoteMode::Blanks, putValue puts double quotes round a value
  /// that holds a blank or a tab.
  TextSink(std::span<char> buffer, QuoteMode quoteMode, char separator)
      : m_Buffer(buffer), m_QuoteMode(quoteMode), m_Separator(separator) {}

  /// Unquoted, as it stands.
  void put(char character);
  void put(std::string_view text);
  /// A value, after what belongs to it in front.
  void putValue(std::string_view prefix, std::string_view value);
  /// Puts the separator, except before the first entry.
  void startEntry();
  /// The next entry is the first one again.
  void startList() { m_HasEntries = false; }
  /// Whether putValue writes an empty value as a pair of quotes; false at the start.
  void setQuoteEmpty(bool quoteEmpty) { m_QuoteEmpty = quoteEmpty; }

  /// The characters put so far, also those beyond the buffer.
  [[nodiscard]] size_t getUsed() const { return m_Used; }

private:
  std::span<char> m_Buffer;
  size_t m_Used = 0;
  QuoteMode m_QuoteMode;
  char m_Separator;
  bool m_QuoteEmpty = false;
  bool m_HasEntries = false;
};

} // namespace tabledrivenparser
