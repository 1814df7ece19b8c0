// SPDX-License-Identifier: Apache-2.0
//
// Values as such: what an empty one is, when two are equal, and how one is written so that the
// parser would read it again. The union carries no tag; each function here goes by the definition's
// type and touches the one member that it names.

#include "tabledrivenparser/src/value_text.h"

#include <algorithm>
#include <cinttypes>
#include <cstdio>
#include <string_view>

namespace tabledrivenparser {

namespace {

bool isText(ValueType type) {
  return type == Type_String || type == Type_StringVector || type == Type_ViaFile;
}

bool sameText(const char* left, const char* right) {
  if (left == nullptr || right == nullptr) return left == right;
  return std::string_view(left) == std::string_view(right);
}

template <class List>
bool sameElements(const List* left, const List* right) {
  const bool isLeftEmpty = left == nullptr || left->isEmpty();
  const bool isRightEmpty = right == nullptr || right->isEmpty();
  if (isLeftEmpty || isRightEmpty) return isLeftEmpty == isRightEmpty;
  auto other = right->begin();
  for (auto element : *left) {
    if (other == right->end() || !detail::sameElement(element, *other)) return false;
    ++other;
  }
  return other == right->end();
}

std::string hexadecimal(uint64_t number) {
  char text[20];
  std::snprintf(text, sizeof text, "0x%" PRIX64, number);
  return text;
}

std::string enumeratorText(const Enumeration& enumeration, int64_t number, uint32_t tableMask) {
  const MatchString* best = nullptr;
  for (const MatchString& entry : enumeration.entries) {
    if (entry.id != number || !restrictionsMet(entry.restrictions, tableMask)) continue;
    // In an enumeration this marks a deprecated name, which is shown only where there is no other.
    if (entry.separator == 0) return std::string(entry.name);
    if (best == nullptr) best = &entry;
  }
  return best != nullptr ? std::string(best->name) : std::to_string(number);
}

} // namespace

Value emptyValue(ValueType type) {
  switch (type) {
  case Type_IntVector:
    return Value{.integers = nullptr};
  case Type_Int64Vector:
    return Value{.longIntegers = nullptr};
  case Type_String:
    return Value{.text = nullptr};
  case Type_StringVector:
  case Type_ViaFile:
    return Value{.strings = nullptr};
  case Type_CallBack:
    return Value{.handler = nullptr};
  default:
    return Value{};
  }
}

bool areEqual(ValueType type, const Value& left, const Value& right) {
  switch (type) {
  case Type_Boolean:
    return (left.integer != 0) == (right.integer != 0);
  case Type_IntVector:
    return sameElements(left.integers, right.integers);
  case Type_Int64Vector:
    return sameElements(left.longIntegers, right.longIntegers);
  case Type_String:
    return sameText(left.text, right.text);
  case Type_StringVector:
  case Type_ViaFile:
    return sameElements(left.strings, right.strings);
  case Type_CallBack:
    return left.handler == right.handler;
  default:
    return left.integer == right.integer;
  }
}

std::string argumentText(const ValueDefinition& definition, const Value& value,
                         uint32_t tableMask) {
  if (isText(definition.type)) return value.text != nullptr ? value.text : "";
  switch (definition.type) {
  case Type_Boolean:
    return value.integer != 0 ? "true" : "false";
  case Type_Enum:
    return enumeratorText(*definition.constraint.enumeration, value.integer, tableMask);
  case Type_Address:
  case Type_Address64:
    return hexadecimal(static_cast<uint64_t>(value.integer));
  default:
    return std::to_string(value.integer);
  }
}

} // namespace tabledrivenparser
