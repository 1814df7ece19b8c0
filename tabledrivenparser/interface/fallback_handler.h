// SPDX-License-Identifier: Apache-2.0
//
// The last resort of an option table: it is offered each word that no row accepts, before that word
// becomes a fatal report. It serves clients with options that no table can list; the tool has none.

#pragma once

#include <cstdint>

namespace tabledrivenparser {

class Parser;
class TextSink;

/// Belongs to the client and must outlive the parser; the option table holds the pointer.
class FallbackHandler {
public:
  virtual ~FallbackHandler() = default;
  /// word is without its dashes, of which there were 0, 1 or 2; next is the following word or null.
  /// Returns the number of words used, 0 if the word means nothing here either.
  [[nodiscard]] virtual uint32_t takeWord(Parser& parser, const char* word, const char* next,
                                          uint32_t dashes) = 0;
  /// Writes what it has taken as entries of a command line; the default has nothing to write.
  virtual void printCommandLine(const Parser&, TextSink&) const {}
};

} // namespace tabledrivenparser
