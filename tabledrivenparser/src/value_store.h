// SPDX-License-Identifier: Apache-2.0
//
// The last step of an option: its argument becomes a value of the option's type. The order is
// always constraint, validator, listener, store: a listener acts at once and can't take it back, so
// it hears only what has passed the checks. The parser makes one of these for each option that it
// meets.

#pragma once

#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/src/number.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace tabledrivenparser {

class ViaFile;

class ValueStore {
public:
  // argument is NUL-terminated, or null if the row was given none. A call-back handler may change
  // wordsUsed.
  ValueStore(Parser& parser, const MatchString& row, const char* argument,
             std::span<const uint32_t> filter, uint32_t& wordsUsed);

  // False if the argument is no value of this option.
  bool store();

private:
  enum class Offer { Refused, Taken, Open };

  Offer offer(const Value& value);
  void keep(const Value& value);
  bool offerAndKeep(const Value& value);
  void append(const Value& value);

  bool storeNumber();
  bool storeNumbers();
  bool storeEnumerator();
  bool storeNamedEnumerator();
  bool storeText();
  bool storeTexts();
  bool storeThroughHandler();
  bool readViaFiles();
  bool readViaFile(const char* fileName, bool copy);
  void parseWordsOf(ViaFile& file);
  template <class TakePiece>
  bool splitArgument(TakePiece takePiece);

  [[nodiscard]] bool hasArgument() const { return m_Argument != nullptr; }
  [[nodiscard]] bool isArgumentAList() const;
  [[nodiscard]] bool isInViaFile() const { return m_Parser.getViaFileDepth() > 0; }
  const char* lastingArgument();
  NumberText readNumberAt(const char* text);
  void showChoices();

  Parser& m_Parser;
  const MatchString& m_Row;
  const ValueDefinition& m_Definition;
  const char* m_Argument;
  std::span<const uint32_t> m_Filter;
  uint32_t& m_WordsUsed;
};

} // namespace tabledrivenparser
