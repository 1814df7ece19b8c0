// SPDX-License-Identifier: Apache-2.0
//
// The command line, written again from the values. Fed back to the parser it means the same, as far
// as values go: the order between options is lost. Options at their defaults are left out. The
// shape of an entry: "-x" and its value directly behind, "--name=value", or the name alone where
// the row implies the value; positional words come last, behind "--" if the user had written one.
//
// Values are the user's. One with blanks is quoted, and a text that would be read as something
// else behind a single letter is parted from it by "="; see readsBack.

#include "tabledrivenparser/interface/option_report.h"

#include "tabledrivenparser/interface/call_back_handler.h"
#include "tabledrivenparser/interface/fallback_handler.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/text_sink.h"
#include "tabledrivenparser/src/find_row.h"
#include "tabledrivenparser/src/value_text.h"

#include <string>

namespace tabledrivenparser {

namespace {

// The type of one element, as far as equality of values is concerned.
ValueType elementType(ValueType type) {
  switch (type) {
  case Type_IntVector:
  case Type_Int64Vector:
    return Type_Int;
  case Type_StringVector:
  case Type_ViaFile:
    return Type_String;
  default:
    return type;
  }
}

bool impliesValue(const ValueDefinition& definition, const MatchString& row, const Value& value) {
  return row.kind != Kind_Required && areEqual(elementType(definition.type), row.value, value);
}

// What makes a row the better one to show, the weightiest reason first.
uint32_t merit(const ValueDefinition& definition, const MatchString& row, const Value& value) {
  const bool isLasting = !row.has(Flag_Deprecated);
  const bool needsNoArgument = impliesValue(definition, row, value);
  return (isLasting ? 4u : 0u) + (needsNoArgument ? 2u : 0u) + (row.hasLongName() ? 1u : 0u);
}

bool canShow(const Parser& parser, const ValueDefinition& definition, const MatchString& row,
             const Value& value) {
  if (!restrictionsMet(row.restrictions, parser.getOptions().restrictionMask)) return false;
  return row.kind != Kind_Implied || impliesValue(definition, row, value);
}

const MatchString* rowToShow(const Parser& parser, const ValueDefinition& definition,
                             const Value& value) {
  const MatchString* best = nullptr;
  uint32_t bestMerit = 0;
  for (auto row = definition.rows; row != nullptr && *row != nullptr; ++row) {
    if (!canShow(parser, definition, **row, value)) continue;
    const uint32_t rowMerit = merit(definition, **row, value);
    if (best != nullptr && rowMerit <= bestMerit) continue;
    best = *row;
    bestMerit = rowMerit;
  }
  return best;
}

// Whether the parser would find the letter, and the whole text as its argument, in "-xtext".
// The two could come together to the name of another row, or the text begin with a separator, which
// would be taken off.
bool readsBack(const OptionTable& table, const MatchString& row, std::string_view text) {
  const std::string word = std::string(row.name).append(text);
  const RowSearch search = searchRows(table, word, 1);
  return search.best.row == &row && search.ambiguity == nullptr && !search.best.hasSeparator &&
         !search.best.rest.empty();
}

std::string optionPrefix(const OptionTable& table, const MatchString& row, std::string_view text) {
  if (row.hasLongName()) return std::string("--").append(row.name).append("=");
  std::string prefix = std::string("-").append(row.name);
  if (!readsBack(table, row, text)) prefix += '=';
  return prefix;
}

void printEntry(const Parser& parser, TextSink& sink, const ValueDefinition& definition,
                const Value& value) {
  const MatchString* row = rowToShow(parser, definition, value);
  if (row == nullptr) return;
  sink.startEntry();
  if (impliesValue(definition, *row, value)) {
    sink.put(row->hasLongName() ? "--" : "-");
    sink.put(row->name);
    return;
  }
  const OptionTable& table = parser.getOptions();
  const std::string text = argumentText(definition, value, table.restrictionMask);
  sink.putValue(optionPrefix(table, *row, text), text);
}

void printOption(const Parser& parser, TextSink& sink, uint32_t id) {
  const ValueDefinition& definition = parser.getDefinition(id);
  const Value& value = parser.getRecord(id).value;
  if (!parser.isSet(id)) return;
  if (definition.type == Type_CallBack) {
    if (value.handler != nullptr) value.handler->printCommandLine(parser, sink);
    return;
  }
  if (parser.isDefault(id)) return;
  if (!isVector(definition.type)) return printEntry(parser, sink, definition, value);
  forEachElement(definition.type, value,
                 [&](const Value& element) { printEntry(parser, sink, definition, element); });
}

void printPositional(const Parser& parser, TextSink& sink, uint32_t id) {
  const ValueDefinition& definition = parser.getDefinition(id);
  const Value& value = parser.getRecord(id).value;
  if (!parser.isSet(id)) return;
  const auto print = [&](const Value& element) {
    sink.startEntry();
    sink.putValue("", argumentText(definition, element, parser.getOptions().restrictionMask));
  };
  // An empty word is a word here, and would be lost without quotes.
  sink.setQuoteEmpty(true);
  if (isVector(definition.type)) {
    forEachElement(definition.type, value, print);
  } else {
    print(value);
  }
  sink.setQuoteEmpty(false);
}

} // namespace

size_t printCommandLine(const Parser& parser, TextSink& sink) {
  const OptionTable& table = parser.getOptions();
  const bool hasPositional = !table.rows.empty() && table.rows.front().name.empty();
  // The positional words' id may stand anywhere among the others.
  for (uint32_t id = 0; id < parser.getValueCount(); ++id) {
    if (!hasPositional || id != table.rows.front().id) printOption(parser, sink, id);
  }
  if (table.fallback != nullptr) table.fallback->printCommandLine(parser, sink);
  if (parser.isEndOfOptions()) {
    sink.startEntry();
    sink.put("--");
  }
  if (hasPositional) printPositional(parser, sink, table.rows.front().id);
  sink.put('\0');
  return sink.getUsed();
}

} // namespace tabledrivenparser
