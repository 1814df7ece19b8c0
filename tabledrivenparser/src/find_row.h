// SPDX-License-Identifier: Apache-2.0
//
// From a word to the row that it means. The parser calls findRow for each word and each letter of a
// word; the report asks searchRows how a word that it is about to write would be read.

#pragma once

#include "tabledrivenparser/interface/option_table.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace tabledrivenparser {

class Parser;

// The result of comparing a word with a row.
struct Match {
  const MatchString* row = nullptr;
  std::string_view rest; // of the word, after the match
  size_t length = 0;     // matched characters of the word, a "." included
  bool matched = false;
  bool restricted = false;
  bool dotted = false;       // ended by "."
  bool complete = false;     // the whole name of the row was there
  bool hasSeparator = false; // the rest starts with "=" or with the row's separator
  bool firstCharExact = false;
  bool oldSyntaxRow = false;
  bool longName = false;
};

// What a look-up found. Neither row nor ambiguity is set if nothing fits.
struct RowSearch {
  Match best;
  const MatchString* ambiguity = nullptr; // the last of the other rows that fit as well as best
};

// The look-up without a word to the user. The word is without its dashes.
RowSearch searchRows(const OptionTable& table, std::string_view word, uint32_t dashes);

// The look-up with its reports: ambiguity, deprecated rows, old syntax. The match's row is null if
// no row, or more than one, is meant.
Match findRow(Parser& parser, std::string_view word, uint32_t dashes);

} // namespace tabledrivenparser
