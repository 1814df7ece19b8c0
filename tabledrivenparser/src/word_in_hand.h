// SPDX-License-Identifier: Apache-2.0
//
// The word that the parser is at, and how far it has got with it. A word of concatenated letters is
// handled in a loop, one letter and the rest at a time, as its length is up to the user: a call for
// each letter would end a run of a hundred thousand of them by the end of its stack.

#pragma once

#include "tabledrivenparser/interface/option_table.h"
#include "tabledrivenparser/src/find_row.h"

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace tabledrivenparser {

struct WordInHand {
  std::string_view word; // without dashes; NUL-terminated
  const char* next;      // the following word or null
  uint32_t dashes;
  std::span<const uint32_t> filter;
  RowList earlierRows;   // of the letters before this one, one row for each id
  std::string letters{}; // the names of all letters before this one
  Match match{};
  const char* argument = nullptr; // null if there is none
  uint32_t wordsUsed = 1;

  [[nodiscard]] const MatchString& getRow() const { return *match.row; }
  [[nodiscard]] bool isConcatenated() const { return !earlierRows.isEmpty(); }

  [[nodiscard]] bool isRepeated() const {
    for (const MatchString* earlier : earlierRows) {
      if (earlier->id == getRow().id) return true;
    }
    return false;
  }

  // Whether other letters follow this one.
  [[nodiscard]] bool goesOn() const {
    return getRow().kind == Kind_Implied && dashes == 1 && !match.rest.empty();
  }

  void moveOn() {
    if (!isRepeated()) earlierRows.append(match.row);
    letters += getRow().name;
    word = match.rest;
    argument = nullptr;
  }
};

} // namespace tabledrivenparser
