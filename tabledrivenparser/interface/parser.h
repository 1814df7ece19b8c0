// SPDX-License-Identifier: Apache-2.0
// The parser of command lines. It is fed one word after the other, resolves each to a row, checks
// and converts the argument, offers the value to the listener, stores it, and reports misuse:
//
//   Parser parser(tables, nullptr, reporter, files, region);
//   while (*words != nullptr) words += parser.parseWord(words[0], words[1]);
//
// Nothing is thrown and nothing recovers: a fatal report normally ends the process. If it returns,
// the parser has failed.
#pragma once

#include "alloclib/interface/region.h"
#include "tabledrivenparser/interface/option_table.h"
#include "tabledrivenparser/interface/reporter.h"
#include "tabledrivenparser/interface/value.h"

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <span>
#include <string_view>

namespace tabledrivenparser {

class Listener;
class ViaFileReader;
struct WordInHand;

// All that the client owns; it must outlive the parser. definitions and values have the same
// length, which every row's id is below.
struct ParserTables {
  const OptionTable& options;
  std::span<const ValueDefinition> definitions;
  std::span<ValueRecord> values;
};

class Parser {
public:
  static constexpr uint32_t viaFileDepthLimit = 10;

  // Sets every value to its default. listener may be null. Everything that the parser copies or
  // allocates comes from region and goes with it.
  Parser(const ParserTables& tables, Listener* listener, Reporter& reporter, ViaFileReader& files,
         alloclib::RegionGeneral& region);
  Parser(const Parser&) = delete;
  Parser& operator=(const Parser&) = delete;

  // Handles one word with its dashes; next is the following word or null. "--" alone ends the
  // options. The words must stay where they are for as long as values are looked at. With a filter
  // only the ids listed there and via files are processed. Returns the number of words used: 1 or
  // 2, or 0 if a filtered parse found no row for the word.
  uint32_t parseWord(const char* word, const char* next, std::span<const uint32_t> filter = {});
  // The same for a word without its dashes, of which there were 0, 1 or 2. With 0 dashes the word
  // is a positional one.
  uint32_t parseArgument(const char* word, const char* next, uint32_t dashes,
                         std::span<const uint32_t> filter = {});

  // Forgets every vector, what call-back handlers hold, and the list of the parser's copies.
  // Vectors read as empty afterwards; the memory itself goes with the region.
  void releaseValues();

  // True after a fatal report that returned: later words do nothing and count as one used word.
  bool hasFailed() const { return m_Failed; }
  bool isEndOfOptions() const { return m_EndOfOptions; }
  // Whether the names of some enumeration were listed for the user.
  bool hasShownChoices() const { return m_ChoicesShown; }
  uint32_t viaFileDepth() const { return m_ViaFileDepth; }
  uint32_t setCounter() const { return m_SetCounter; }

  const OptionTable& options() const { return m_Tables.options; }
  uint32_t valueCount() const { return static_cast<uint32_t>(m_Tables.definitions.size()); }
  const ValueDefinition& definition(uint32_t id) const;
  const ValueRecord& record(uint32_t id) const;
  bool isSet(uint32_t id) const { return record(id).lastSet != 0; }
  // The default by the definition's rule; null or zero if it has none.
  Value defaultValue(uint32_t id) const;
  bool isDefault(uint32_t id) const;

  // The value of an option of that type; asking for another type is a programming fault.
  bool booleanValue(uint32_t id) const;
  uint32_t enumeratorValue(uint32_t id) const;
  int32_t integerValue(uint32_t id) const;
  uint64_t addressValue(uint32_t id) const;     // both widths
  const char* textValue(uint32_t id) const;     // may be null
  const StrList* textsValue(uint32_t id) const; // STRING_VECTOR, VIA_FILE; null for an empty one
  const IntegerList* integersValue(uint32_t id) const; // null for an empty one

  // The rest serves handlers, listeners and the parser's own rooms.

  void report(ReportLevel level, OptionMessage message,
              std::initializer_list<OptionMessageArgument> arguments);
  // A NUL-terminated copy in the parser's region.
  const char* copyText(std::string_view text);
  alloclib::RegionGeneral& region() { return m_Region; }

private:
  friend class ValueStore;

  std::optional<uint32_t> parseOneOf(WordInHand& hand);
  bool takeArgument(WordInHand& hand);
  bool checkConcatenation(const WordInHand& hand);
  uint32_t refuse(const WordInHand& hand);
  const ValueRecord& recordOfType(uint32_t id, ValueType type) const;
  void countSet(uint32_t id);

  ParserTables m_Tables;
  Listener* m_Listener;
  Reporter& m_Reporter;
  ViaFileReader& m_Files;
  alloclib::RegionGeneral& m_Region;
  OwnedMemory m_OwnedMemory;
  uint32_t m_SetCounter = 0;
  uint32_t m_ViaFileDepth = 0;
  bool m_EndOfOptions = false;
  bool m_ChoicesShown = false;
  bool m_Failed = false;
};

} // namespace tabledrivenparser
