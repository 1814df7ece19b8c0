// SPDX-License-Identifier: Apache-2.0
//
// From an argument to a value. Each type has its way to read text; all but handlers and via files
// end at the same three gates (constraint, validator, listener) and at the same place where the
// value is kept. A list passes element by element, so that the listener hears each of them.
//
// Arguments come from argv, which lives as long as the process, or from a via file, whose words are
// gone two words later: the latter are copied into the parser's region before they are kept. A via
// file is read here too, as the value of its option: its words go back to the parser, one level
// deeper.

#include "tabledrivenparser/src/value_store.h"

#include "checking/interface/checking.h"
#include "tabledrivenparser/interface/call_back_handler.h"
#include "tabledrivenparser/interface/listener.h"
#include "tabledrivenparser/interface/via_file.h"
#include "tabledrivenparser/src/constraint_check.h"

#include <string>

namespace tabledrivenparser {

namespace {

// A list that is the default belongs to the client; the first element takes its place.
template <class List, class Element>
void appendTo(List*& list, const List* defaultList, Element element,
              alloclib::RegionGeneral& region) {
  if (list == nullptr || list == defaultList) list = alloclib::create<List>(region, region);
  list->append(element);
}

std::string namesOf(const Enumeration& enumeration, uint32_t tableMask) {
  std::string names;
  for (const MatchString& entry : enumeration.entries) {
    if (!restrictionsMet(entry.restrictions, tableMask)) continue;
    if (!names.empty()) names += ' ';
    names += entry.name;
  }
  return names;
}

} // namespace

ValueStore::ValueStore(Parser& parser, const MatchString& row, const char* argument,
                       std::span<const uint32_t> filter, uint32_t& wordsUsed)
    : m_Parser(parser), m_Row(row), m_Definition(parser.getDefinition(row.id)),
      m_Argument(argument), m_Filter(filter), m_WordsUsed(wordsUsed) {}

bool ValueStore::store() {
  switch (m_Definition.type) {
  case Type_Boolean: // takes no text, even where its row demands one
    return offerAndKeep(Value{.integer = m_Row.value.integer != 0});
  case Type_Enum:
    return storeEnumerator();
  case Type_Address:
  case Type_Address64:
  case Type_Int:
    return hasArgument() ? storeNumber() : offerAndKeep(m_Row.value);
  case Type_IntVector:
  case Type_Int64Vector:
    // Without a separator nothing could say where a number ends: the row speaks for itself.
    return hasArgument() && m_Row.separator != 0 ? storeNumbers() : offerAndKeep(m_Row.value);
  case Type_String:
    return storeText();
  case Type_StringVector:
    return storeTexts();
  case Type_CallBack:
    return storeThroughHandler();
  case Type_ViaFile:
    return readViaFiles();
  }
  return false;
}

ValueStore::Offer ValueStore::offer(const Value& value) {
  const uint32_t id = m_Row.id;
  if (!meetsConstraint(m_Definition, value, m_Parser.getOptions().restrictionMask)) {
    return Offer::Refused;
  }
  const Validator validator = m_Parser.getRecord(id).validator;
  if (validator != nullptr && !validator(m_Parser, id, value)) return Offer::Refused;
  Listener* listener = m_Parser.m_Listener;
  if (listener == nullptr || !listener->onOption(m_Parser, id, value)) return Offer::Open;
  m_Parser.countSet(id);
  return Offer::Taken;
}

void ValueStore::keep(const Value& value) {
  if (isVector(m_Definition.type)) {
    append(value);
  } else {
    m_Parser.m_Tables.values[m_Row.id].value = value;
  }
  m_Parser.countSet(m_Row.id);
}

void ValueStore::append(const Value& value) {
  Value& list = m_Parser.m_Tables.values[m_Row.id].value;
  // Asked each time: the list in the record may still be the client's constant.
  const Value base = m_Parser.getDefaultValue(m_Row.id);
  alloclib::RegionGeneral& region = m_Parser.getRegion();
  if (m_Definition.type == Type_IntVector) {
    appendTo(list.integers, base.integers, static_cast<int>(value.integer), region);
  } else if (m_Definition.type == Type_Int64Vector) {
    appendTo(list.longIntegers, base.longIntegers, static_cast<long long>(value.integer), region);
  } else {
    appendTo(list.strings, base.strings, value.text, region);
  }
}

bool ValueStore::offerAndKeep(const Value& value) {
  const Offer answer = offer(value);
  if (answer == Offer::Open) keep(value);
  return answer != Offer::Refused;
}

// An overflow is reported at once, whatever stands behind the number.
NumberText ValueStore::readNumberAt(const char* text) {
  const NumberText number = readNumber(text, m_Definition.type);
  if (number.result == NumberResult::Overflow) {
    m_Parser.report(ReportLevel::Fatal, OptionMessage::IntegerOverflow, {m_Argument});
  }
  return number;
}

bool ValueStore::storeNumber() {
  const NumberText number = readNumberAt(m_Argument);
  if (number.result != NumberResult::Good || *number.end != '\0') return false;
  return offerAndKeep(Value{.integer = number.value});
}

bool ValueStore::storeNumbers() {
  // A separator at the end is followed by no digits, and so refused like one between two.
  for (const char* text = m_Argument;; ++text) {
    const NumberText number = readNumberAt(text);
    if (number.result != NumberResult::Good) return false;
    text = number.end;
    if (*text != '\0' && *text != m_Row.separator) return false;
    if (!offerAndKeep(Value{.integer = number.value})) return false;
    if (*text == '\0') return true;
  }
}

bool ValueStore::storeEnumerator() {
  QUARN_ASSERT(1, m_Definition.constraint.enumeration != nullptr);
  if (hasArgument()) return storeNamedEnumerator();
  const Enumeration& enumeration = *m_Definition.constraint.enumeration;
  const uint32_t tableMask = m_Parser.getOptions().restrictionMask;
  if (findEnumerator(enumeration, m_Row.value.integer, tableMask) == nullptr) return false;
  return offerAndKeep(m_Row.value);
}

bool ValueStore::storeNamedEnumerator() {
  const MatchString* entry =
      findEnumerator(*m_Definition.constraint.enumeration, std::string_view(m_Argument),
                     m_Parser.getOptions().restrictionMask);
  if (entry == nullptr) return false;
  const Value value{.integer = entry->id};
  const Offer answer = offer(value);
  if (answer != Offer::Open) return answer == Offer::Taken;
  if (entry->separator != 0) {
    m_Parser.report(ReportLevel::Warning, OptionMessage::DeprecatedArgument,
                    {m_Argument, m_Row.name});
  }
  // By custom the enumerator 0 is the one with which a user asks for the list of names.
  if (entry->id == 0 && m_Filter.empty()) showChoices();
  keep(value);
  return true;
}

void ValueStore::showChoices() {
  const std::string names =
      namesOf(*m_Definition.constraint.enumeration, m_Parser.getOptions().restrictionMask);
  m_Parser.report(ReportLevel::Remark, OptionMessage::SelectableArguments, {m_Row.name, names});
  m_Parser.m_ChoicesShown = true;
}

// The words of a via file lie in its buffer and must be copied to last.
const char* ValueStore::lastingArgument() {
  return isInViaFile() ? m_Parser.copyText(m_Argument) : m_Argument;
}

bool ValueStore::storeText() {
  return offerAndKeep(hasArgument() ? Value{.text = lastingArgument()} : m_Row.value);
}

bool ValueStore::isArgumentAList() const {
  return m_Row.separator != 0 &&
         std::string_view(m_Argument).find(m_Row.separator) != std::string_view::npos;
}

// Gives a copy of each piece of the argument, empty ones too, to takePiece; true if it took all.
template <class TakePiece>
bool ValueStore::splitArgument(TakePiece takePiece) {
  bool isGood = true;
  std::string_view rest = m_Argument;
  for (;;) {
    const size_t end = rest.find(m_Row.separator);
    isGood = takePiece(m_Parser.copyText(rest.substr(0, end))) && isGood;
    if (end == std::string_view::npos || m_Parser.hasFailed()) return isGood;
    rest.remove_prefix(end + 1);
  }
}

bool ValueStore::storeTexts() {
  if (!hasArgument() || !isArgumentAList()) return storeText();
  return splitArgument([this](const char* piece) { return offerAndKeep(Value{.text = piece}); });
}

bool ValueStore::storeThroughHandler() {
  CallBackHandler* handler = m_Parser.getRecord(m_Row.id).value.handler;
  if (handler == nullptr) return false;
  if (!handler->takeArgument(m_Parser, m_Row, m_Argument, m_WordsUsed)) return false;
  m_Parser.countSet(m_Row.id);
  return true;
}

bool ValueStore::readViaFiles() {
  if (!hasArgument()) return false;
  if (!isArgumentAList()) return readViaFile(m_Argument, isInViaFile());
  return splitArgument([this](const char* piece) { return readViaFile(piece, false); });
}

bool ValueStore::readViaFile(const char* fileName, bool copy) {
  if (copy) fileName = m_Parser.copyText(fileName);
  // Before the file is opened: one that names itself holds an open file at each level.
  if (m_Parser.m_ViaFileDepth + 1 >= Parser::ViaFileDepthLimit) {
    m_Parser.report(ReportLevel::Fatal, OptionMessage::RecursiveViaFile,
                    {static_cast<int>(Parser::ViaFileDepthLimit), fileName});
    return false;
  }
  ++m_Parser.m_ViaFileDepth;
  // The name first, then its words: the list shows files in the order in which they were begun.
  append(Value{.text = fileName});
  ViaFile file(m_Parser, m_Parser.m_Files, fileName);
  parseWordsOf(file);
  m_Parser.countSet(m_Row.id);
  file.close();
  --m_Parser.m_ViaFileDepth;
  return !m_Parser.hasFailed();
}

// Looks one word ahead, and not beyond the end of the file: an option there finds no argument.
void ValueStore::parseWordsOf(ViaFile& file) {
  const char* word = file.nextToken();
  const char* next = file.nextToken();
  while (word != nullptr && !m_Parser.hasFailed()) {
    if (m_Parser.parseWord(word, next, m_Filter) > 1) next = file.nextToken();
    word = next;
    next = file.nextToken();
  }
}

} // namespace tabledrivenparser
