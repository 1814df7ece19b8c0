// SPDX-License-Identifier: Apache-2.0
//
// The way from attribute texts to records and back. Texts come from symbol names, archive symbol
// tables and maps: anybody may have written them, and they never fail. A token says what it says by
// itself, whatever stands before it, but that features are completed at the end; so reading is one
// walk and its time is that of the text. The words are in attribute_tokens.h and found by
// attribute_words.h.
#include "elfext/interface/attribute_string.h"

#include "elfext/src/attributes/attribute_tokens.h"
#include "elfext/src/attributes/attribute_words.h"

#include <algorithm>
#include <cstring>
#include <iterator>
#include <span>

namespace elfext {

namespace {

// ---- Reading

// Hands each token to the function; empty ones are stepped over.
template <class Function>
void forEachToken(std::string_view text, Function function) {
  while (text.starts_with('$')) {
    text.remove_prefix(1);
    const std::string_view token = text.substr(0, text.find('$'));
    // Each byte is stepped over once, however many "$" there are.
    text.remove_prefix(token.size());
    if (!token.empty()) function(token);
  }
}

// The load words that a scope's letter touches. Stores are of no scope.
struct Scope {
  bool code;
  bool readOnlyData;
  bool data;
};

Scope scopeOf(char letter) {
  switch (letter) {
  case 'A':
  case 'C':
    return {true, true, true};
  case 'R':
    return {false, true, true};
  case 'W':
    return {false, false, true};
  case 'X':
    return {true, false, false};
  default:
    return {false, false, false};
  }
}

void addAccess(AccessWords& access, const Scope& scope, uint32_t bits) {
  const auto loads = static_cast<uint16_t>(bits);
  if (scope.code) access.code |= loads;
  if (scope.readOnlyData) access.readOnlyData |= loads;
  if (scope.data) access.data |= loads;
  // Names of stores are the upper half of the bits.
  access.stores |= static_cast<uint16_t>(bits >> LoadNameCount);
}

// The names stand in the order of their numbers; what breaks it, or is no name, ends them.
uint32_t readAccessNames(std::string_view names) {
  uint32_t bits = 0;
  for (uint32_t least = 0;;) {
    const uint32_t number = findAccessName(names);
    if (number < least || number == std::size(AccessNames)) return bits;
    bits |= uint32_t{1} << number;
    names.remove_prefix(AccessNames[number].size());
    least = number + 1;
  }
}

void readAccess(AccessWords& access, std::string_view token) {
  const bool hasScope = token.size() > 1 && token[1] == ':';
  const Scope scope = scopeOf(hasScope ? token[0] : '\0');
  addAccess(access, scope, readAccessNames(token.substr(hasScope ? 2 : 0)));
}

// ---- Printing

void printToken(std::string& text, std::string_view token) {
  text += '$';
  text += token;
}

void printFeatures(std::string& text, FeatureSet features) {
  for (const FeatureToken& row : FeatureTokens) {
    if (row.use == TokenUse::Read || !features.contains(row.set)) continue;
    printToken(text, row.token);
    // So a level hides the levels that it contains.
    features = features.without(row.set);
  }
}

void printAccessGroup(std::string& text, std::string_view scope, uint32_t bits) {
  if (bits == 0) return;
  printToken(text, scope);
  for (uint32_t i = 0; i < std::size(AccessNames); ++i) {
    if ((bits & uint32_t{1} << i) != 0) text += AccessNames[i];
  }
}

// What every target can do is left out. The scopes are not quite those of reading: a text that is
// read back may claim more accesses.
void printAccess(std::string& text, const AccessWords& access) {
  uint32_t code = access.code & ~uint32_t{Access_44};
  uint32_t readOnlyData = access.readOnlyData & ~uint32_t{AccessWord_Bytes};
  uint32_t data = access.data & ~uint32_t{AccessWord_Bytes};
  const uint32_t stores = access.stores & ~uint32_t{AccessWord_Bytes};
  const uint32_t everywhere = code & readOnlyData & data;
  printAccessGroup(text, "A:", everywhere);
  code &= ~everywhere;
  readOnlyData &= ~everywhere;
  data &= ~everywhere;
  const uint32_t constant = code & readOnlyData;
  printAccessGroup(text, "R:", constant);
  printAccessGroup(text, "C:", readOnlyData & ~constant);
  printAccessGroup(text, "X:", code & ~constant);
  printAccessGroup(text, "W:", data);
  printAccessGroup(text, "", stores << LoadNameCount);
}

void printFlags(std::string& text, std::span<const FlagToken> rows, uint64_t flags) {
  for (const FlagToken& row : rows) {
    if ((flags & row.bits) != row.bits) continue;
    printToken(text, row.token);
    flags &= ~row.bits;
  }
}

} // namespace

FullAttr parseAttributeString(std::string_view text) {
  // The accesses that printing leaves out are there from the start.
  FullAttr record = {.m_Access = LibraryFullAttr.m_Access};
  bool areFlagsTakenBack = false;
  forEachToken(text, [&](std::string_view token) {
    readAccess(record.m_Access, token);
    const AttributeWord* word = findAttributeWord(token);
    if (word == nullptr) return;
    record.m_Features |= word->features;
    record.m_Flags |= word->flags;
    record.m_Stack8 |= word->stack8;
    record.m_AbiLevel |= word->abiLevel;
    areFlagsTakenBack = areFlagsTakenBack || word->takesFlagsBack;
  });
  record.m_Features = closeFeatures(record.m_Features);
  // Last, as the token may stand anywhere in the text.
  if (!areFlagsTakenBack) record.m_Flags |= ComplementToken.bits;
  return record;
}

void addAttributeString(FullAttr& record, std::string_view text) {
  const FullAttr more = parseAttributeString(text);
  record.m_Features = closeFeatures(record.m_Features | more.m_Features);
  record.m_Access = record.m_Access | more.m_Access;
  record.m_Flags |= more.m_Flags;
  record.m_Stack8 |= more.m_Stack8;
  record.m_AbiLevel |= more.m_AbiLevel;
}

std::string printAttributeString(const FullAttr& record) {
  std::string text;
  printFeatures(text, record.m_Features);
  printAccess(text, record.m_Access);
  printToken(text, ComplementToken.token);
  printFlags(text, FlagTokens, record.m_Flags);
  printFlags(text, Stack8Tokens, record.m_Stack8);
  printFlags(text, AbiLevelTokens, record.m_AbiLevel);
  return text;
}

size_t printAttributeString(const FullAttr& record, char* buffer, size_t size) {
  const std::string text = printAttributeString(record);
  if (buffer == nullptr || size == 0) return text.size();
  // A byte is kept for the zero.
  const size_t fitting = std::min(text.size(), size - 1);
  std::memcpy(buffer, text.data(), fitting);
  buffer[fitting] = '\0';
  return text.size();
}

const char* buildDecorationName(alloclib::RegionGeneral& region, const FullAttr& record) {
  return alloclib::copyString(region, std::string(DecorationPrefix) + printAttributeString(record));
}

} // namespace elfext
