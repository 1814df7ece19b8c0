// SPDX-License-Identifier: Apache-2.0
//
// From a word to its row, in two steps. searchRows compares the word with each row that starts with
// its first letter, drops those that this way of writing (one dash or two, an argument behind the
// name, a "." for the rest of it) doesn't allow, and weighs what is left by the length of the
// match. findRow then says what is to be said about the result.
//
// A longer match wins over a shorter, and of two equally long ones that which suits an argument, if
// there is one, and else that which needs none. What still stands side by side is ambiguous, and
// then nothing is meant: a guess would run another action than the one that was wanted.
//
// Words may have any length and any bytes; a comparison never goes beyond the end of either text.

#include "tabledrivenparser/src/find_row.h"

#include "tabledrivenparser/interface/parser.h"

namespace tabledrivenparser {

namespace {

bool startsWith(std::string_view text, char character) {
  return !text.empty() && text.front() == character;
}

// The number of characters that word and name have in common, the first ones being so already. A
// name has "_" where the word may also have "-".
size_t commonLength(std::string_view word, std::string_view name) {
  size_t at = 1;
  for (; at < word.size() && at < name.size(); ++at) {
    const char character = word[at] == '-' ? '_' : support::lowered(word[at]);
    if (character != name[at]) break;
  }
  return at;
}

Match compareWord(std::string_view word, const MatchString& row) {
  Match match;
  match.row = &row;
  match.rest = word;
  match.oldSyntaxRow = row.has(Flag_OldSyntax);
  match.longName = row.hasLongName();
  if (word.empty() || row.name.empty()) return match;
  match.firstCharExact = word.front() == row.name.front();
  if (support::lowered(word.front()) != support::lowered(row.name.front())) return match;

  match.length = commonLength(word, row.name);
  match.complete = match.length == row.name.size();
  match.dotted =
      match.longName && row.has(Flag_Public) && startsWith(word.substr(match.length), '.');
  match.matched = match.complete || match.dotted;
  if (match.dotted) ++match.length;
  match.rest = word.substr(match.length);
  match.hasSeparator =
      startsWith(match.rest, '=') || (row.separator != 0 && startsWith(match.rest, row.separator));
  return match;
}

bool fitsLongName(const Match& match) {
  // "--create." abbreviates nothing.
  if (match.complete && match.dotted) return false;
  return match.hasSeparator || match.rest.empty();
}

// A letter that takes an argument may be parted from it by "=", though not by its separator.
bool fitsShortName(const Match& match, uint32_t dashes) {
  // Two dashes belong to long names: "--d" is no way to write "-d".
  if (dashes >= 2) return false;
  if (!match.hasSeparator) return true;
  return match.row->kind != Kind_Implied && match.rest.front() == '=';
}

bool fitsSingleDash(const Match& match, SyntaxPolicy oldSyntaxPolicy) {
  if (match.dotted) return false;
  if (match.oldSyntaxRow && oldSyntaxPolicy != Policy_Reject) return true;
  // Without the old syntax "-create" is no option, and "-T" is not "-t".
  return !match.longName && match.firstCharExact;
}

bool fits(const Match& match, uint32_t dashes, SyntaxPolicy oldSyntaxPolicy) {
  if (match.longName ? !fitsLongName(match) : !fitsShortName(match, dashes)) return false;
  return dashes >= 2 || fitsSingleDash(match, oldSyntaxPolicy);
}

// Between matches of one length: a rest wants a row with an argument, no rest one without.
bool suitsBetter(const Match& match, const Match& other) {
  const RowKind wanted = match.rest.empty() ? Kind_Implied : Kind_Required;
  const RowKind unwanted = match.rest.empty() ? Kind_Required : Kind_Implied;
  return match.row->kind == wanted && other.row->kind == unwanted;
}

void weigh(const Match& match, RowSearch& search) {
  if (search.best.row == nullptr || match.length > search.best.length) {
    search.best = match;
    search.ambiguity = nullptr;
    return;
  }
  if (match.length < search.best.length || suitsBetter(search.best, match)) return;
  if (suitsBetter(match, search.best)) {
    search.best = match;
    return;
  }
  search.ambiguity = match.row;
}

Match positionalMatch(const OptionTable& table, std::string_view word) {
  Match match;
  if (table.rows.empty() || !table.rows.front().name.empty()) return match;
  match.row = &table.rows.front();
  match.rest = word;
  match.matched = true;
  match.complete = true;
  return match;
}

// The rows that start with the word's first letter; for other words those before all letters.
std::span<const MatchString> candidateRows(const OptionTable& table, std::string_view word) {
  const char first = word.empty() ? '\0' : support::lowered(word.front());
  uint32_t start = 0;
  if (support::isLetter(first)) start = table.firstRows[static_cast<size_t>(first - 'a')];
  if (start == NoRow) return {};
  uint32_t end = start;
  for (; end < table.rows.size(); ++end) {
    const std::string_view name = table.rows[end].name;
    const char letter =
        !name.empty() && support::isLetter(name.front()) ? support::lowered(name.front()) : '\0';
    // The rows are sorted, so the first of another letter ends them.
    if (letter != (support::isLetter(first) ? first : '\0')) break;
  }
  return table.rows.subspan(start, end - start);
}

void warnOfOldSyntax(Parser& parser, const Match& match, uint32_t dashes) {
  if (parser.getOptions().oldSyntaxPolicy != Policy_Warn || dashes >= 2) return;
  if (!match.longName && match.firstCharExact) return;
  parser.report(ReportLevel::Warning, OptionMessage::OldSyntax,
                {match.longName ? "--" : "-", match.row->name, "", ""});
}

} // namespace

RowSearch searchRows(const OptionTable& table, std::string_view word, uint32_t dashes) {
  RowSearch search;
  if (dashes == 0) {
    search.best = positionalMatch(table, word);
    return search;
  }
  Match restricted;
  for (const MatchString& row : candidateRows(table, word)) {
    Match match = compareWord(word, row);
    if (!match.matched) continue;
    if (!restrictionsMet(row.restrictions, table.restrictionMask)) {
      // Kept for the caller, who refuses it like an unknown word.
      restricted = match;
      restricted.restricted = true;
      continue;
    }
    if (fits(match, dashes, table.oldSyntaxPolicy)) weigh(match, search);
  }
  if (search.best.row == nullptr) search.best = restricted;
  return search;
}

Match findRow(Parser& parser, std::string_view word, uint32_t dashes) {
  const RowSearch search = searchRows(parser.getOptions(), word, dashes);
  const Match& best = search.best;
  if (dashes == 0 || best.row == nullptr || best.restricted) return best;
  if (search.ambiguity != nullptr) {
    parser.report(ReportLevel::Remark, OptionMessage::PossibleMatches,
                  {word, best.row->name, search.ambiguity->name});
    return Match{};
  }
  if (best.row->has(Flag_Deprecated) && parser.getOptions().deprecatedPolicy == Policy_Warn) {
    parser.report(ReportLevel::Warning, OptionMessage::DeprecatedOption, {best.row->name});
    return best;
  }
  warnOfOldSyntax(parser, best, dashes);
  return best;
}

} // namespace tabledrivenparser
