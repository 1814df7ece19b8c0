// SPDX-License-Identifier: Apache-2.0
//
// The header tables, and what the section headers say of sizes, contents and names.
//
// The fields are those of Elf32_Shdr and Elf64_Shdr, Elf32_Phdr and Elf64_Phdr. Counts are compared
// with the bytes of the image before anything is reserved; extents are held against the image by
// subtraction. After these steps each section that has bytes has all of them in the image, every
// string table in use ends with a zero byte, each name lies in its table, and tables of fixed rows
// have whole rows. Section 0 of a good file is all zeros, and with extended numbering holds the
// section count (sh_size) and the index of the name table (sh_link).
#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/extents.h"
#include "elfext/src/tables/object_tables.h"

#include <limits>

namespace elfext {

namespace {

// The number of section headers, which is in the first of them when the ELF header's field is too
// small for it.
bool readSectionCount(ObjectTables& tables, uint64_t& count) {
  count = tables.fileHeader.shnum;
  if (count != 0) return true;
  const uint8_t* first =
      tables.view(tables.fileHeader.shoff, sectionHeaderSize(tables.format.isWide));
  if (first == nullptr) return false;
  SectionHeader header;
  getRecord(tables.format, first, header);
  count = header.size;
  return true;
}

// The rows of a header table, whose count is compared with the bytes before room is made for it.
// Rows have the size of the class, whatever the file says of it.
template <class Record>
bool readTable(ObjectTables& tables, uint64_t offset, uint64_t count, uint32_t rowSize,
               std::vector<Record>& records) {
  constexpr uint64_t MostRows = std::numeric_limits<uint32_t>::max();
  // The count may be 2^64 - 1, from the first section's sh_size; the product is made only behind
  // this.
  const bool fits = count <= tables.image.getSize() / rowSize && count < MostRows;
  if (!fits) return mapLowLevelResult(tables.reporter, LowLevelResult::OutsideImage);
  const uint8_t* bytes = tables.view(offset, count * rowSize);
  if (bytes == nullptr) return false;
  records.reserve(count);
  for (uint64_t i = 0; i < count; ++i, bytes += rowSize)
    getRecord(tables.format, bytes, records.emplace_back());
  return true;
}

// Sections whose extents leave the image end the read anyway.
void findOverlap(ObjectTables& tables) {
  std::vector<Extent> extents;
  extents.reserve(tables.sectionHeaders.size());
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    const SectionHeader& header = tables.sectionHeaders[i];
    const uint64_t end = endOf(header.offset, header.size);
    // From the headers alone and before anything is viewed: tables that share bytes are then
    // checked by other means, which don't take the product of all of them.
    if (hasFileBytes(header) && end > header.offset) extents.push_back({header.offset, end, i});
  }
  tables.overlap = findFirstOverlap(extents);
}

// Leaves the list empty if there are no such segments, as in objects that are still to be linked.
void findLoadSegments(ObjectTables& tables) {
  std::vector<Extent> loads;
  for (uint32_t i = 0; i < tables.getSegmentCount(); ++i) {
    const ProgramHeader& header = tables.programHeaders[i];
    if (header.type == PT_LOAD)
      loads.push_back({header.offset, endOf(header.offset, header.filesz), i});
  }
  if (loads.empty()) return;
  std::vector<Extent> sections;
  sections.reserve(tables.getSectionCount());
  for (const SectionHeader& header : tables.sectionHeaders)
    sections.push_back({header.offset, endOf(header.offset, header.size), 0});
  tables.loadSegments = findFirstHolders(loads, sections);
}

bool checkSectionBytes(ObjectTables& tables, uint32_t index) {
  const SectionHeader& header = tables.sectionHeaders[index];
  const uint32_t loadSegment = tables.loadSegments.empty() ? NoExtent : tables.loadSegments[index];
  if (loadSegment != NoExtent) {
    const ProgramHeader& segment = tables.programHeaders[loadSegment];
    // A section in a segment needs all of the segment, even where its own bytes are there.
    if (!tables.image.contains(segment.offset, segment.filesz))
      return mapLowLevelResult(tables.reporter, LowLevelResult::OutsideImage);
    tables.isSegmentThere[loadSegment] = true;
  }
  return tables.image.contains(header.offset, header.size) ||
         mapLowLevelResult(tables.reporter, LowLevelResult::OutsideImage);
}

// Finds the table of section names; 0 for none.
bool findNameTable(ObjectTables& tables) {
  uint32_t table = tables.fileHeader.shoff == 0 ? 0 : tables.fileHeader.shstrndx;
  // The index did not fit e_shstrndx.
  if (table == SHN_XINDEX) {
    if (tables.sectionHeaders.empty())
      return stop(tables.reporter, &ErrorHandler::emptySectionHeaderTable);
    table = tables.sectionHeaders[0].link;
  }
  tables.sectionNameTable = table;
  if (table == 0) return true;
  if (table >= tables.getSectionCount())
    return stop(tables.reporter, &ErrorHandler::sectionNameTableOutOfRange, table,
                tables.getLastSection());
  if (tables.typeOf(table) != SHT_STRTAB)
    return stop(tables.reporter, &ErrorHandler::sectionNameTableOfWrongType, table,
                tables.typeOf(table));
  return true;
}

// False only if the handler does not want to go on with sections that will stay nameless.
bool dropNames(ObjectTables& tables) {
  uint32_t index = 0;
  while (index < tables.getSectionCount() && tables.sectionHeaders[index].name == 0)
    ++index;
  return index == tables.getSectionCount() ||
         goOn(tables.reporter, &ErrorHandler::nameWithoutNameTable, index);
}

} // namespace

// A table of fixed rows must have rows of the right size, and whole ones.
bool checkTableShape(ObjectTables& tables, uint32_t index) {
  SectionHeader& header = tables.sectionHeaders[index];
  const uint64_t expected = expectedEntrySize(header.type, tables.fileHeader.ident[EI_CLASS]);
  if (expected == 0) return true;
  if (header.entsize != 0 && header.entsize != expected) {
    if (!goOn(tables.reporter, &ErrorHandler::wrongEntrySize, index, header.entsize, expected))
      return false;
    // Mended as the handler's contract says: the row size is ours in any case.
    header.entsize = expected;
  }
  if (header.size % expected == 0) return true;
  if (!goOn(tables.reporter, &ErrorHandler::sizeNotMultiple, index, header.size, expected))
    return false;
  // Rows that are whole are still good; what is left of them is nobody's.
  header.size -= header.size % expected;
  return true;
}

// A string table must start and end with a zero byte: whoever looks for the end of a name in it
// finds one. Mending makes a copy, and overlapping tables might be many.
bool checkStringTable(ObjectTables& tables, uint32_t index) {
  const SectionHeader& header = tables.sectionHeaders[index];
  if (header.size == 0) {
    if (!goOn(tables.reporter, &ErrorHandler::emptyStringTable, index)) return false;
    tables.mendedStrings[index] = {0};
    return true;
  }
  // Names will be looked for all over the table, but for one that is not used in the end.
  if (!tables.overlap && tables.view(header.offset, header.size) == nullptr) return false;
  const uint8_t* first = tables.view(header.offset, 1);
  const uint8_t* last = tables.view(header.offset + header.size - 1, 1);
  if (first == nullptr || last == nullptr) return false;
  const bool isBadAtStart = *first != 0;
  const bool isBadAtEnd = *last != 0;
  if (!isBadAtStart && !isBadAtEnd) return true;
  if (!goOn(tables.reporter, &ErrorHandler::stringTableNotZeroEnded, index, isBadAtStart,
            isBadAtEnd))
    return false;
  // Nobody will look into it.
  if (tables.overlap) return true;
  std::vector<uint8_t>& mended = tables.mendedStrings[index];
  // The whole table has been viewed above, so its bytes follow the first one.
  mended.assign(first, first + header.size);
  mended.front() = 0;
  mended.back() = 0;
  return true;
}

bool checkSectionHeaders(ObjectTables& tables) {
  const uint64_t offset = tables.fileHeader.shoff;
  if (offset == 0) return true;
  uint64_t count = 0;
  if (!readSectionCount(tables, count)) return false;
  if (!readTable(tables, offset, count, sectionHeaderSize(tables.format.isWide),
                 tables.sectionHeaders))
    return false;
  // Not before the table was read: the count has been compared with the bytes by then.
  tables.links.resize(count);
  return true;
}

bool checkProgramHeaders(ObjectTables& tables) {
  const FileHeader& header = tables.fileHeader;
  if (header.phoff == 0 || header.phnum == 0) return true;
  // A count of that size stands for one that is kept elsewhere, which no file of ours has.
  if (header.phnum == PN_XNUM)
    return mapLowLevelResult(tables.reporter, LowLevelResult::OutsideImage);
  tables.isSegmentThere.resize(header.phnum);
  return readTable(tables, header.phoff, header.phnum, programHeaderSize(tables.format.isWide),
                   tables.programHeaders);
}

bool checkTableShapes(ObjectTables& tables) {
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (!checkTableShape(tables, i)) return false;
  }
  // Behind the loop, which may cut sizes.
  findOverlap(tables);
  return true;
}

bool checkContents(ObjectTables& tables) {
  findLoadSegments(tables);
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    const SectionHeader& header = tables.sectionHeaders[i];
    if (hasFileBytes(header) && !checkSectionBytes(tables, i)) return false;
    if (header.type == SHT_STRTAB && !checkStringTable(tables, i)) return false;
  }
  return true;
}

bool checkSectionNames(ObjectTables& tables) {
  if (!findNameTable(tables)) return false;
  const uint32_t table = tables.sectionNameTable;
  if (table == 0) return dropNames(tables);
  if (!tables.overlap) {
    tables.sectionNames = reinterpret_cast<const char*>(tables.viewSection(table));
    if (tables.sectionNames == nullptr) return false;
  }
  const uint64_t size = tables.stringSize(table);
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    SectionHeader& header = tables.sectionHeaders[i];
    if (header.name == 0 || header.name < size) continue;
    if (!goOn(tables.reporter, &ErrorHandler::sectionNameOutOfRange, i, header.name, size))
      return false;
    header.name = 0;
  }
  return true;
}

// Where nobody has seen to the bytes of all sections.
bool openSectionNames(ObjectTables& tables) {
  if (!findNameTable(tables)) return false;
  const uint32_t table = tables.sectionNameTable;
  return (table == 0 || checkStringTable(tables, table)) && checkSectionNames(tables);
}

} // namespace elfext
