// SPDX-License-Identifier: Apache-2.0
//
// The parser of command lines. It is fed one word after the other, resolves each to a row, checks
// and converts the argument, offers the value to the listener, stores it, and reports misuse:
//
//   Parser parser(tables, nullptr, reporter, files, region);
//   while (*words != nullptr) words += parser.parseWord(words[0], words[1]);
//
// Its words come from argv and from via files, and may be anything: empty, or long without an end,
// or via files that name each other. Nesting has a bound, letters are gone through in a loop, and
// no word is ever a format.
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

/// All that the client owns; it must outlive the parser. definitions and values have the same
/// length, which every row's id is below.
struct ParserTables {
  const OptionTable& options;
  std::span<const ValueDefinition> definitions;
  std::span<ValueRecord> values;
};

/// One parse of one command line. Values point into its region and into the words: both must live
/// for as long as they are read.
class Parser {
public:
  /// A via file at this depth is refused: nine nest. It stops a file that names itself, directly or
  /// through others, before the process runs out of open files.
  static constexpr uint32_t ViaFileDepthLimit = 10;

  /// Sets every value to its default. listener may be null. Everything that the parser copies or
  /// allocates comes from region and goes with it.
  Parser(const ParserTables& tables, Listener* listener, Reporter& reporter, ViaFileReader& files,
         alloclib::RegionGeneral& region);
  Parser(const Parser&) = delete;
  Parser& operator=(const Parser&) = delete;

  /// Handles one word with its dashes; next is the following word or null. "--" alone ends the
  /// options. The words must stay where they are for as long as values are looked at. With a filter
  /// only the ids listed there and via files are processed. Returns the number of words used: 1 or
  /// 2, or 0 if a filtered parse found no row for the word.
  uint32_t parseWord(const char* word, const char* next, std::span<const uint32_t> filter = {});
  /// The same for a word without its dashes, of which there were 0, 1 or 2. With 0 dashes the word
  /// is a positional one.
  uint32_t parseArgument(const char* word, const char* next, uint32_t dashes,
                         std::span<const uint32_t> filter = {});

  /// Forgets every vector, what call-back handlers hold, and the list of the parser's copies.
  /// Vectors read as empty afterwards; the memory itself goes with the region.
  void releaseValues();

  /// True after a fatal report that returned: later words do nothing and count as one used word.
  [[nodiscard]] bool hasFailed() const { return m_Failed; }
  [[nodiscard]] bool isEndOfOptions() const { return m_EndOfOptions; }
  /// Whether the names of some enumeration were listed for the user.
  [[nodiscard]] bool hasShownChoices() const { return m_ChoicesShown; }
  [[nodiscard]] uint32_t getViaFileDepth() const { return m_ViaFileDepth; }
  [[nodiscard]] uint32_t getSetCounter() const { return m_SetCounter; }

  [[nodiscard]] const OptionTable& getOptions() const { return m_Tables.options; }
  [[nodiscard]] uint32_t getValueCount() const {
    return static_cast<uint32_t>(m_Tables.definitions.size());
  }
  /// The id must be below getValueCount(); another one is a programming fault.
  [[nodiscard]] const ValueDefinition& getDefinition(uint32_t id) const;
  [[nodiscard]] const ValueRecord& getRecord(uint32_t id) const;
  [[nodiscard]] bool isSet(uint32_t id) const { return getRecord(id).lastSet != 0; }
  /// The default by the definition's rule; null or zero if it has none.
  [[nodiscard]] Value getDefaultValue(uint32_t id) const;
  /// Whether the value says the same as its default, set or not.
  [[nodiscard]] bool isDefault(uint32_t id) const;

  /// The value of an option of that type; asking for another type is a programming fault.
  [[nodiscard]] bool getBoolean(uint32_t id) const;
  [[nodiscard]] uint32_t getEnumerator(uint32_t id) const;
  [[nodiscard]] int32_t getInteger(uint32_t id) const;
  [[nodiscard]] uint64_t getAddress(uint32_t id) const; ///< both widths
  [[nodiscard]] const char* getText(uint32_t id) const; ///< may be null
  /// Both null for an empty list; the texts are of STRING_VECTOR and VIA_FILE.
  [[nodiscard]] const StrList* getTexts(uint32_t id) const;
  [[nodiscard]] const IntegerList* getIntegers(uint32_t id) const;

  // The rest serves handlers, listeners and the parser's own rooms.

  /// Passes a message to the client. Nothing more is passed after a fatal one. Texts in the
  /// arguments are only viewed.
  void report(ReportLevel level, OptionMessage message,
              std::initializer_list<OptionMessageArgument> arguments);
  /// A NUL-terminated copy in the parser's region.
  [[nodiscard]] const char* copyText(std::string_view text);
  [[nodiscard]] alloclib::RegionGeneral& getRegion() { return m_Region; }

private:
  friend class ValueStore;

  std::optional<uint32_t> parseOneOf(WordInHand& hand);
  bool takeArgument(WordInHand& hand);
  bool checkConcatenation(const WordInHand& hand);
  uint32_t refuse(const WordInHand& hand);
  [[nodiscard]] const ValueRecord& getRecordOfType(uint32_t id, ValueType type) const;
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
