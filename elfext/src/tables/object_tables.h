// SPDX-License-Identifier: Apache-2.0
//
// An object file as a set of tables, checked where they lie: the first half of a read. The checks
// stand here and nowhere else, each step of them in a file of its own. They are taken in one order,
// which also is the order of their reports: the first problem in that order is the one that is
// told. False from a step ends the read. What the handler lets pass is mended here, so whoever
// takes the tables afterwards, to make a model of them or to look for a few names, need not ask
// again.
//
// A hostile file can make a thousand sections of the same bytes. Whether sections overlap is found
// out beforehand, from the headers alone: the read of such a file is bound to fail at the place of
// that check, so until then its tables are only checked for what would be reported before.
#pragma once

#include "elfext/interface/elf_constants.h"
#include "elfext/interface/symbol.h"
#include "elfext/src/bytes/elf_records.h"
#include "elfext/src/bytes/image_bytes.h"
#include "elfext/src/reports/go_on.h"
#include "elfext/src/reports/low_level_result.h"

#include <cstdint>
#include <map>
#include <optional>
#include <span>
#include <utility>
#include <vector>

namespace elfext {

// What became of a section's link and info fields.
enum class LinkState : uint8_t {
  None, // the section names no other
  Whole,
  WithoutTarget, // the link is good, but what else the section names is not
  Broken,
};

// A symbol table whose rows are well.
struct SymbolTable {
  uint32_t section = 0;
  uint32_t stringSection = 0;
  uint64_t stringSize = 0;
  // These three are null in a table without rows.
  const char* strings = nullptr;
  const uint8_t* rows = nullptr;
  // The words of the index section; null without one.
  const uint8_t* indexes = nullptr;
  // The null symbol counts.
  uint32_t rowCount = 0;
  bool isDynamic = false;

  // Null for a symbol without a name.
  [[nodiscard]] const char* nameOf(const SymbolRow& row) const {
    return row.name == 0 ? nullptr : strings + row.name;
  }
};

// Where a row says that its symbol is; the section is that of a hosted one.
struct SymbolHome {
  Symbol::Category category;
  uint32_t section;
};

// A relocation table all of whose symbols there are.
struct RelocationTable {
  uint32_t section = 0;
  uint32_t symbolSection = 0;
  uint64_t symbolCount = 0;
  const uint8_t* rows = nullptr;
  uint32_t rowCount = 0;
  bool hasAddend = false;
};

// A group section, and where the list of all groups' members has its own.
struct GroupTable {
  uint32_t section = 0;
  uint32_t flags = 0;
  size_t firstMember = 0;
  size_t memberCount = 0;
};

// Bytes of a segment that belong to no section and no header; the offsets are those in the file.
struct SegmentGap {
  uint32_t segment;
  uint64_t start;
  uint64_t end;
};

// A tag and its value, of which only the first four bytes count in either class.
struct DynamicTag {
  uint32_t tag;
  uint32_t value;
};

struct DynamicTable {
  uint32_t section = 0;
  std::vector<DynamicTag> tags = {};
};

// The version sections that go together, and how many records of the first two kinds a dynamic
// section tells.
struct VersionTables {
  std::optional<uint32_t> definitions = {};
  std::optional<uint32_t> requirements = {};
  std::optional<uint32_t> symbolVersions = {};
  std::optional<uint32_t> dynamicSymbols = {};
  uint32_t definitionCount = 0;
  uint32_t requirementCount = 0;
};

// A preemption map, `start` bytes into a section, for a dynamic section.
struct PreemptionMapPlace {
  uint32_t section;
  uint64_t start;
  uint32_t dynamicSection;
};

// A record of a debug overlay section, both of whose sections there are.
struct DebugOverlayRow {
  uint64_t word;
  uint32_t debugSection;
  uint32_t section;
};

constexpr uint32_t NoSegment = 0xFFFFFFFF;

struct ObjectTables {
  ObjectTables(const ReadReporter& readReporter, ImageBytes& bytes)
      : reporter(readReporter), image(bytes) {}
  ObjectTables(const ObjectTables&) = delete;
  ObjectTables& operator=(const ObjectTables&) = delete;

  const ReadReporter& reporter;
  ImageBytes& image;

  RecordFormat format = {};
  FileHeader fileHeader = {};
  // A name that can't be had is 0.
  std::vector<SectionHeader> sectionHeaders = {};
  std::vector<ProgramHeader> programHeaders = {};
  // By segment: whether its bytes are known to be in the image.
  std::vector<bool> isSegmentThere = {};
  // By section: the first PT_LOAD segment that holds its bytes.
  std::vector<uint32_t> loadSegments = {};
  // The first two sections that overlap in the file; none for all good files.
  std::optional<std::pair<uint32_t, uint32_t>> overlap = {};
  // By section: string tables that the handler let pass, as they should have been.
  std::map<uint32_t, std::vector<uint8_t>> mendedStrings = {};
  // 0 for none.
  uint32_t sectionNameTable = 0;
  // Null for none, and for a file with overlapping sections.
  const char* sectionNames = nullptr;
  // By section: relocation, group and index sections that are not whole are passed over.
  std::vector<LinkState> links = {};
  // By symbol table: its index section.
  std::map<uint32_t, uint32_t> indexSections = {};
  // The tables with contents, in the order of their sections; none of them of a file with
  // overlapping sections, which are only checked.
  std::vector<SymbolTable> symbolTables = {};
  std::vector<RelocationTable> relocationTables = {};
  std::vector<GroupTable> groups = {};
  std::vector<uint32_t> groupMembers = {};
  std::vector<SegmentGap> gaps = {};
  std::vector<DynamicTable> dynamicTables = {};
  std::optional<VersionTables> versions = {};
  std::vector<PreemptionMapPlace> preemptionMaps = {};
  std::vector<DebugOverlayRow> debugOverlayRows = {};
  // Whether the object is one for the optimiser of a link alone, and the names that its records
  // define; asked for by checkLtoTables.
  bool isSlim = false;
  std::vector<const char*> ltoDefinitions = {};
  // By section, as a note says; NoSegment for sections of which none says it, and empty without
  // such notes.
  std::vector<uint32_t> notedSegments = {};

  // Takes over the memory of arrays that were those of another object, which then has none left.
  // Only of the large ones: without this, each object's arrays would be new memory to the process.
  void takeMemory(ObjectTables& former);

  [[nodiscard]] uint32_t getSectionCount() const {
    return static_cast<uint32_t>(sectionHeaders.size());
  }
  // What messages call the last section.
  [[nodiscard]] uint32_t getLastSection() const { return getSectionCount() - 1; }
  [[nodiscard]] uint32_t getSegmentCount() const {
    return static_cast<uint32_t>(programHeaders.size());
  }
  [[nodiscard]] uint32_t typeOf(uint32_t section) const { return sectionHeaders[section].type; }
  [[nodiscard]] bool isBroken(uint32_t section) const {
    return links[section] == LinkState::Broken || links[section] == LinkState::WithoutTarget;
  }
  // Whether the section's link field is that of a section that it may name.
  [[nodiscard]] bool hasLink(uint32_t section) const {
    return links[section] == LinkState::Whole || links[section] == LinkState::WithoutTarget;
  }
  // Rows of a table of fixed rows; the null symbol counts.
  [[nodiscard]] uint64_t rowCount(uint32_t section) const;
  // Bytes of a string table; that of an empty one which was mended is 1.
  [[nodiscard]] uint64_t stringSize(uint32_t section) const;
  // The string table that the section names, if it names one: that alone is sure to end with a
  // zero byte.
  [[nodiscard]] std::optional<uint32_t> stringTableOf(uint32_t section) const;
  // Null for a section without a name.
  [[nodiscard]] const char* nameOf(uint32_t section) const;
  // Whether symbols have addresses, and not places in their sections.
  [[nodiscard]] bool hasLaidOutAddresses() const;

  [[nodiscard]] SymbolRow getSymbolRow(const SymbolTable& table, uint32_t index) const {
    SymbolRow row;
    getRecord(format, table.rows + uint64_t{index} * symbolRowSize(format.isWide), row);
    return row;
  }
  // Calls the function with index and row of each symbol but the null one, as long as it answers
  // true. Answers whether it always did.
  template <class Function>
  // Who visits every row has no use for the answer. NOLINTNEXTLINE(modernize-use-nodiscard)
  bool forEachSymbolRow(const SymbolTable& table, Function function) const {
    return withFixedFormat(format, [&](auto fixedFormat) {
      constexpr RecordFormat RowFormat = fixedFormat;
      const uint8_t* bytes = table.rows;
      for (uint32_t index = 1; index < table.rowCount; ++index) {
        bytes += symbolRowSize(RowFormat.isWide);
        SymbolRow row;
        getRecord(RowFormat, bytes, row);
        if (!function(index, row)) return false;
      }
      return true;
    });
  }
  // Where the row of that index says that its symbol is. Only the four special indexes have a
  // meaning of their own; the rest of the reserved range names sections like any other number.
  [[nodiscard]] SymbolHome homeOf(const SymbolTable& table, uint32_t index,
                                  const SymbolRow& row) const {
    switch (row.shndx) {
    case SHN_UNDEF:
      return {Symbol::Category_Undefined, 0};
    case SHN_ABS:
      return {Symbol::Category_Absolute, 0};
    case SHN_COMMON:
      return {Symbol::Category_Common, 0};
    case SHN_XINDEX:
      return {Symbol::Category_Hosted, get<uint32_t>(table.indexes + uint64_t{index} * 4)};
    default:
      return {Symbol::Category_Hosted, row.shndx};
    }
  }

  // Where a hosted symbol starts, counted from the start of its section.
  [[nodiscard]] uint64_t placeInHome(const SymbolRow& row, const SymbolHome& home) const {
    return hasLaidOutAddresses() ? row.value - sectionHeaders[home.section].addr : row.value;
  }

  // The bytes, or null after a report that they can't be had.
  [[nodiscard]] const uint8_t* view(uint64_t offset, uint64_t size);
  // The contents of a section, of a mended table as it should have been. Null, after a report, if
  // they can't be had; also null for a section without bytes.
  [[nodiscard]] const uint8_t* viewSection(uint32_t section);
  // Reports that the image could not give bytes, and why. Always false.
  [[nodiscard]] bool failRead() const;

  template <class Word>
  [[nodiscard]] Word get(const uint8_t* bytes) const {
    return getWord<Word>(bytes, format.isLittle);
  }
};

// Whether a section of that type and size has bytes in the file.
[[nodiscard]] bool hasFileBytes(const SectionHeader& header);
[[nodiscard]] bool isSymbolTable(uint32_t type);
[[nodiscard]] bool isRelocationTable(uint32_t type);
// Whether sections of the type have a rule of their own for what they may name.
[[nodiscard]] bool isLinkedByType(uint32_t type);

// The end of an extent, or the largest number where it lies beyond.
[[nodiscard]] constexpr uint64_t endOf(uint64_t offset, uint64_t size) {
  return size > UINT64_MAX - offset ? UINT64_MAX : offset + size;
}

// The file header and the two tables of headers. A handler that lets a foreign machine pass ends
// this with `isForeign` and true, and there is nothing more to read.
[[nodiscard]] bool checkHeaders(ObjectTables& tables, bool& isForeign);
// The file header of an object of any machine.
[[nodiscard]] bool checkHeaderOfAnyMachine(ObjectTables& tables, bool& isForeign);
// What follows it in a foreign object: the section headers, and the one symbol table.
[[nodiscard]] bool checkForeignTables(ObjectTables& tables);
// Behind either: the records of an object that is for the optimiser of a link alone.
[[nodiscard]] bool checkLtoTables(ObjectTables& tables);
// Whether the symbol says that the object is such a one, and nothing more.
[[nodiscard]] bool isSlimMarker(const char* name);
// All that the headers lead to, but for build attributes.
[[nodiscard]] bool checkTables(ObjectTables& tables);

// ---- The steps

[[nodiscard]] bool checkSectionHeaders(ObjectTables& tables);
[[nodiscard]] bool checkProgramHeaders(ObjectTables& tables);
[[nodiscard]] bool checkTableShapes(ObjectTables& tables);
[[nodiscard]] bool checkContents(ObjectTables& tables);
[[nodiscard]] bool checkSectionNames(ObjectTables& tables);
[[nodiscard]] bool checkLinks(ObjectTables& tables);
[[nodiscard]] bool checkSymbols(ObjectTables& tables);
[[nodiscard]] bool checkRelocations(ObjectTables& tables);
[[nodiscard]] bool checkGroups(ObjectTables& tables);
[[nodiscard]] bool checkPlacement(ObjectTables& tables);
[[nodiscard]] bool checkDynamicSections(ObjectTables& tables);
[[nodiscard]] bool checkDebugOverlays(ObjectTables& tables);
[[nodiscard]] bool checkSegmentMaps(ObjectTables& tables);

// ---- The steps for one section

[[nodiscard]] bool checkTableShape(ObjectTables& tables, uint32_t index);
[[nodiscard]] bool checkStringTable(ObjectTables& tables, uint32_t index);
// The section names of an object of which only single tables are looked at.
[[nodiscard]] bool openSectionNames(ObjectTables& tables);
[[nodiscard]] bool checkSymbolTableLink(ObjectTables& tables, uint32_t index);
// Fills the table for its rows to be checked.
[[nodiscard]] bool openSymbolTable(ObjectTables& tables, uint32_t index, SymbolTable& table);

} // namespace elfext
