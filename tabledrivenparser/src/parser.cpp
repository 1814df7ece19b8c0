// SPDX-License-Identifier: Apache-2.0
//
// The road of one word: find its row, find its argument, check the letters run together, store.
// Each step may report and end it. What is stored and how is value_store's; here is decided how
// many words an option takes and what an unknown word becomes.
//
// The order of the checks is that of the reports: a word that no row accepts is told as unknown
// before anything is said about its argument, and an argument is looked for before the
// concatenation is judged, since that forbids arguments. A filtered parse passes over unknown words
// in silence: somebody else will parse them.

#include "tabledrivenparser/interface/parser.h"

#include "checking/interface/checking.h"
#include "tabledrivenparser/interface/call_back_handler.h"
#include "tabledrivenparser/interface/fallback_handler.h"
#include "tabledrivenparser/src/value_store.h"
#include "tabledrivenparser/src/value_text.h"
#include "tabledrivenparser/src/word_in_hand.h"

#include <algorithm>

namespace tabledrivenparser {

namespace {

std::string_view dashText(uint32_t dashes) {
  return std::string_view("--").substr(0, dashes);
}

// Whether text stands behind the name of a row that takes none.
bool hasUnexpectedArgument(const Match& match) {
  return match.row != nullptr && match.longName && match.row->kind == Kind_Implied &&
         !match.rest.empty();
}

bool isUnknown(const Match& match) {
  return match.row == nullptr || match.restricted || hasUnexpectedArgument(match);
}

bool isPassedOver(const Parser& parser, const MatchString& row, std::span<const uint32_t> filter) {
  if (filter.empty() || parser.getDefinition(row.id).type == Type_ViaFile) return false;
  return std::ranges::find(filter, row.id) == filter.end();
}

const DefaultNode* firstUsable(const DefaultNode* node, uint32_t tableMask) {
  while (node != nullptr && !restrictionsMet(node->masks, tableMask))
    node = node->next;
  return node;
}

} // namespace

Parser::Parser(const ParserTables& tables, Listener* listener, Reporter& reporter,
               ViaFileReader& files, alloclib::RegionGeneral& region)
    : m_Tables(tables), m_Listener(listener), m_Reporter(reporter), m_Files(files),
      m_Region(region), m_OwnedMemory(region) {
  QUARN_ASSERT(1, tables.definitions.size() == tables.values.size());
  for (uint32_t id = 0; id < getValueCount(); ++id) {
    ValueRecord& target = m_Tables.values[id];
    // The client's call backs in the record stay; defaults may be asked of them right away.
    target.firstSet = 0;
    target.lastSet = 0;
    target.value = getDefaultValue(id);
  }
}

uint32_t Parser::parseWord(const char* word, const char* next, std::span<const uint32_t> filter) {
  const std::string_view text = word;
  // A single dash is a word: by custom the name of a standard stream.
  if (m_EndOfOptions || text == "-") return parseArgument(word, next, 0, filter);
  if (text == "--") {
    if (!m_Failed) m_EndOfOptions = true;
    return 1;
  }
  const uint32_t dashes = text.starts_with("--") ? 2 : text.starts_with("-") ? 1 : 0;
  return parseArgument(word + dashes, next, dashes, filter);
}

uint32_t Parser::parseArgument(const char* word, const char* next, uint32_t dashes,
                               std::span<const uint32_t> filter) {
  WordInHand hand{word, next, dashes, filter, RowList(m_Region)};
  while (!m_Failed) {
    if (const auto wordsUsed = parseOneOf(hand)) return *wordsUsed;
    hand.moveOn();
  }
  return 1;
}

// Returns the number of words used, or nothing if the word in hand goes on with another letter.
std::optional<uint32_t> Parser::parseOneOf(WordInHand& hand) {
  hand.match = findRow(*this, hand.word, hand.dashes);
  if (isUnknown(hand.match)) return hand.filter.empty() ? refuse(hand) : 0;
  if (isPassedOver(*this, hand.getRow(), hand.filter)) return 1;
  if (!takeArgument(hand) || !checkConcatenation(hand)) return 1;

  ValueStore store(*this, hand.getRow(), hand.argument, hand.filter, hand.wordsUsed);
  const bool isStored = store.store();
  if (m_Failed) return 1;
  // A handler that has set the number to 0 says that the word is none of its options.
  if (!isStored && hand.wordsUsed != 0) {
    report(ReportLevel::Fatal, OptionMessage::ArgumentNotPermitted,
           {hand.argument != nullptr ? hand.argument : "", hand.getRow().name});
    return 1;
  }
  if (hand.goesOn()) return std::nullopt;
  return isStored ? hand.wordsUsed : refuse(hand);
}

// Finds the argument in the word or behind it; false after a fatal report.
bool Parser::takeArgument(WordInHand& hand) {
  hand.wordsUsed = 1;
  const Match& match = hand.match;
  const std::string_view rest = match.rest;
  if (match.row->kind == Kind_Implied) return true;
  if (match.row->kind == Kind_Optional && rest.empty()) return true;
  if (hand.dashes != 0 && rest.empty()) {
    hand.argument = hand.next;
    hand.wordsUsed = 2;
    if (hand.next != nullptr) return true;
    report(ReportLevel::Fatal, OptionMessage::MissingArgument, {hand.word});
    return false;
  }
  // The rest ends where the word does, with its NUL: no copy is needed.
  hand.argument = rest.data() + (match.hasSeparator ? 1 : 0);
  if (match.hasSeparator && rest.front() != '=') {
    report(ReportLevel::Warning, OptionMessage::OldSyntax,
           {"--", match.row->name, "=", hand.argument});
  }
  return true;
}

// False after a fatal report.
bool Parser::checkConcatenation(const WordInHand& hand) {
  if (!hand.isConcatenated()) return true;
  const std::string_view rest = hand.match.rest;
  if (hand.argument != nullptr) {
    report(ReportLevel::Fatal, OptionMessage::ConcatenatedArgument, {hand.getRow().name, rest});
    return false;
  }
  if (hand.isRepeated()) {
    report(ReportLevel::Warning, OptionMessage::RepeatedConcatenatedOption,
           {hand.getRow().name, hand.letters, hand.getRow().name, rest});
  }
  return true;
}

// The word is no option: the fallback handler may know it, or it is an error.
uint32_t Parser::refuse(const WordInHand& hand) {
  if (FallbackHandler* fallback = getOptions().fallback) {
    const uint32_t used = fallback->takeWord(*this, hand.word.data(), hand.next, hand.dashes);
    if (used != 0) return used;
  }
  if (hasUnexpectedArgument(hand.match)) {
    report(ReportLevel::Fatal, OptionMessage::UnexpectedArgument,
           {dashText(hand.dashes), hand.getRow().name});
  } else {
    report(ReportLevel::Fatal, OptionMessage::UnrecognizedOption,
           {dashText(hand.dashes), hand.word});
  }
  return 1;
}

void Parser::releaseValues() {
  for (uint32_t id = 0; id < getValueCount(); ++id) {
    Value& value = m_Tables.values[id].value;
    const ValueType type = getDefinition(id).type;
    if (isVector(type)) value = emptyValue(type);
    if (type == Type_CallBack && value.handler != nullptr) value.handler->releaseValues();
  }
  m_OwnedMemory.clear();
}

const ValueDefinition& Parser::getDefinition(uint32_t id) const {
  QUARN_ASSERT(1, id < getValueCount());
  return m_Tables.definitions[id];
}

const ValueRecord& Parser::getRecord(uint32_t id) const {
  QUARN_ASSERT(1, id < getValueCount());
  return m_Tables.values[id];
}

Value Parser::getDefaultValue(uint32_t id) const {
  const ValueDefinition& wanted = getDefinition(id);
  switch (wanted.defaultKind) {
  case Default_Fixed:
    return wanted.defaultValue;
  case Default_List: {
    const DefaultNode* node =
        firstUsable(wanted.defaultValue.defaults, getOptions().restrictionMask);
    return node != nullptr ? node->value : emptyValue(wanted.type);
  }
  case Default_Computed: {
    const DefaultCallBack compute = getRecord(id).defaultCallBack;
    return compute != nullptr ? compute(*this, id) : emptyValue(wanted.type);
  }
  case Default_None:
    break;
  }
  return emptyValue(wanted.type);
}

bool Parser::isDefault(uint32_t id) const {
  return areEqual(getDefinition(id).type, getRecord(id).value, getDefaultValue(id));
}

const ValueRecord& Parser::getRecordOfType(uint32_t id, ValueType type) const {
  QUARN_ASSERT(1, getDefinition(id).type == type);
  return getRecord(id);
}

bool Parser::getBoolean(uint32_t id) const {
  return getRecordOfType(id, Type_Boolean).value.integer != 0;
}

uint32_t Parser::getEnumerator(uint32_t id) const {
  return static_cast<uint32_t>(getRecordOfType(id, Type_Enum).value.integer);
}

int32_t Parser::getInteger(uint32_t id) const {
  return static_cast<int32_t>(getRecordOfType(id, Type_Int).value.integer);
}

uint64_t Parser::getAddress(uint32_t id) const {
  QUARN_ASSERT(1,
               getDefinition(id).type == Type_Address || getDefinition(id).type == Type_Address64);
  return static_cast<uint64_t>(getRecord(id).value.integer);
}

const char* Parser::getText(uint32_t id) const {
  return getRecordOfType(id, Type_String).value.text;
}

const StrList* Parser::getTexts(uint32_t id) const {
  QUARN_ASSERT(1, getDefinition(id).type == Type_StringVector ||
                      getDefinition(id).type == Type_ViaFile);
  return getRecord(id).value.strings;
}

const IntegerList* Parser::getIntegers(uint32_t id) const {
  return getRecordOfType(id, Type_IntVector).value.integers;
}

void Parser::report(ReportLevel level, OptionMessage message,
                    std::initializer_list<OptionMessageArgument> arguments) {
  if (m_Failed) return;
  m_Reporter.reportOptionMessage(level, message, {arguments.begin(), arguments.size()});
  if (level == ReportLevel::Fatal) m_Failed = true;
}

const char* Parser::copyText(std::string_view text) {
  const char* copy = alloclib::copyString(m_Region, text);
  m_OwnedMemory.append(const_cast<char*>(copy));
  return copy;
}

void Parser::countSet(uint32_t id) {
  ValueRecord& target = m_Tables.values[id];
  target.lastSet = ++m_SetCounter;
  if (target.firstSet == 0) target.firstSet = m_SetCounter;
}

} // namespace tabledrivenparser
