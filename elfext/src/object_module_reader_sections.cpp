// SPDX-License-Identifier: Apache-2.0
//
// The header tables, and from the section headers the sections: their contents, which stay where
// they are until somebody looks, and their names.
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/deferred_contents.h"
#include "elfext/interface/deferred_contents_selector.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/reference_counted_file.h"
#include "elfext/src/extents.h"
#include "elfext/src/object_module_reader.h"

#include <limits>

namespace elfext {

namespace {

// The number of section headers, which is in the first of them when the ELF header's field is too
// small for it.
bool readSectionCount(ReadContext& context, uint64_t& count) {
  count = context.fileHeader.shnum;
  if (count != 0) return true;
  const uint8_t* first =
      context.view(context.fileHeader.shoff, sectionHeaderSize(context.format.isWide));
  if (first == nullptr) return false;
  SectionHeader header;
  getRecord(context.format, first, header);
  count = header.size;
  return true;
}

// The rows of a header table, whose count is compared with the bytes before room is made for it.
// Rows have the size of the class, whatever the file says of it.
template <class Record>
bool readTable(ReadContext& context, uint64_t offset, uint64_t count, uint32_t rowSize,
               std::span<Record>& records) {
  constexpr uint64_t mostRows = std::numeric_limits<uint32_t>::max();
  const bool fits = count <= context.image.getSize() / rowSize && count < mostRows;
  if (!fits) return mapLowLevelResult(context.module, LowLevelResult::OutsideImage);
  const uint8_t* bytes = context.view(offset, count * rowSize);
  if (bytes == nullptr) return false;
  records = {static_cast<Record*>(context.region.allocate(count * sizeof(Record))), count};
  for (Record& record : records) {
    getRecord(context.format, bytes, record);
    bytes += rowSize;
  }
  return true;
}

// A table of fixed rows must have rows of the right size, and whole ones.
bool checkTableShape(ReadContext& context, uint32_t index) {
  SectionHeader& header = context.sectionHeaders[index];
  const uint64_t expected = expectedEntrySize(header.type, context.module.getElfClass());
  if (expected == 0) return true;
  if (header.entsize != 0 && header.entsize != expected) {
    if (!goOn(context.module, &ErrorHandler::wrongEntrySize, index, header.entsize, expected))
      return false;
    header.entsize = expected;
  }
  if (header.size % expected == 0) return true;
  if (!goOn(context.module, &ErrorHandler::sizeNotMultiple, index, header.size, expected))
    return false;
  header.size -= header.size % expected;
  return true;
}

// Sections whose extents leave the image end the read anyway.
void findOverlap(ReadContext& context) {
  std::vector<Extent> extents;
  extents.reserve(context.sectionHeaders.size());
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    const SectionHeader& header = context.sectionHeaders[i];
    const uint64_t end = endOf(header.offset, header.size);
    if (hasFileBytes(header) && end > header.offset) extents.push_back({header.offset, end, i});
  }
  context.overlap = findFirstOverlap(extents);
}

// For each section the first PT_LOAD segment that holds its bytes.
std::vector<uint32_t> findLoadSegments(const ReadContext& context) {
  std::vector<Extent> loads;
  for (uint32_t i = 0; i < context.segmentCount(); ++i) {
    const ProgramHeader& header = context.programHeaders[i];
    if (header.type == PT_LOAD)
      loads.push_back({header.offset, endOf(header.offset, header.filesz), i});
  }
  if (loads.empty()) return std::vector<uint32_t>(context.sectionCount(), NoExtent);
  std::vector<Extent> sections;
  sections.reserve(context.sectionCount());
  for (const SectionHeader& header : context.sectionHeaders)
    sections.push_back({header.offset, endOf(header.offset, header.size), 0});
  return findFirstHolders(loads, sections);
}

bool mayBeDeferred(uint32_t type) {
  switch (type) {
  case SHT_SYMTAB:
  case SHT_STRTAB:
  case SHT_RELA:
  case SHT_HASH:
  case SHT_DYNAMIC:
  case SHT_NOTE:
  case SHT_REL:
  case SHT_DYNSYM:
  case SHT_GROUP:
  case SHT_SYMTAB_SHNDX:
  case SHT_GNU_verdef:
  case SHT_GNU_verneed:
  case SHT_GNU_versym:
  case SHT_ZEV_PREEMPTMAP:
  case SHT_ZEV_ATTRIBUTES:
  case SHT_ZEV_DEBUGOVERLAY:
    return false;
  default:
    return true;
  }
}

void deferSection(ReadContext& context, Section& section, const SectionHeader& header) {
  DeferralFile& deferral = *context.deferral;
  alloclib::RegionGeneral& region = section.getObjectModule()->getObjectRegion();
  if (deferral.shared == nullptr) {
    deferral.shared = alloclib::create<ReferenceCountedFile>(region, deferral.host, deferral.file);
    deferral.shared->addReference();
    context.image.leaveFileOpen();
  }
  section.deferContents(alloclib::create<DeferredContents>(region, deferral.shared, true, header));
}

// A string table must start and end with a zero byte: whoever looks for the end of a name in it
// finds one.
bool checkStringTable(ReadContext& context, uint32_t index) {
  const SectionHeader& header = context.sectionHeaders[index];
  Section* section = context.module.getSection(index);
  if (header.size == 0) {
    if (!goOn(context.module, &ErrorHandler::emptyStringTable, index)) return false;
    section->setAuxiliary(false);
    section->appendByte(0);
    section->setAuxiliary(true);
    return true;
  }
  // Names will be looked for all over the table, but for one that is not used in the end.
  if (!context.overlap && context.view(header.offset, header.size) == nullptr) return false;
  const uint8_t* first = context.view(header.offset, 1);
  const uint8_t* last = context.view(header.offset + header.size - 1, 1);
  if (first == nullptr || last == nullptr) return false;
  const bool isBadAtStart = *first != 0;
  const bool isBadAtEnd = *last != 0;
  if (!isBadAtStart && !isBadAtEnd) return true;
  if (!goOn(context.module, &ErrorHandler::stringTableNotZeroEnded, index, isBadAtStart,
            isBadAtEnd))
    return false;
  // Mending makes a copy, and overlapping tables might be many.
  if (context.overlap) return true;
  section->setAuxiliary(false);
  if (isBadAtStart) section->setByte(0, 0);
  if (isBadAtEnd) section->setByte(header.size - 1, 0);
  section->setAuxiliary(true);
  return true;
}

bool readSectionBytes(ReadContext& context, uint32_t index, uint32_t loadSegment) {
  const SectionHeader& header = context.sectionHeaders[index];
  Section* section = context.module.getSection(index);
  if (loadSegment != NoExtent) {
    const ProgramHeader& segment = context.programHeaders[loadSegment];
    if (!context.image.contains(segment.offset, segment.filesz))
      return mapLowLevelResult(context.module, LowLevelResult::OutsideImage);
    context.isSegmentThere[loadSegment] = true;
  }
  section->adoptSize(header.size);
  if (!context.image.contains(header.offset, header.size))
    return mapLowLevelResult(context.module, LowLevelResult::OutsideImage);
  if (context.deferral != nullptr && mayBeDeferred(header.type) &&
      context.deferral->selector.isDeferred(*section, header.size))
    deferSection(context, *section, header);
  else
    section->getBuffer().defer(context.image, header.offset, header.size);
  return true;
}

// Finds the table of section names; 0 for none.
bool findNameTable(ReadContext& context, uint32_t& table) {
  table = context.fileHeader.shstrndx;
  if (context.fileHeader.shoff == 0) table = 0;
  if (table == SHN_XINDEX) {
    if (context.sectionHeaders.empty())
      return stop(context.module, &ErrorHandler::emptySectionHeaderTable);
    table = context.sectionHeaders[0].link;
  }
  if (table == 0) return true;
  if (table >= context.sectionCount())
    return stop(context.module, &ErrorHandler::sectionNameTableOutOfRange, table,
                context.lastSection());
  if (context.typeOf(table) != SHT_STRTAB)
    return stop(context.module, &ErrorHandler::sectionNameTableOfWrongType, table,
                context.typeOf(table));
  QUARN_ASSERT(1, context.module.getSection(table)->getType() == SHT_STRTAB);
  static_cast<StringTableSection*>(context.module.getSection(table))->markSectionNameTable();
  return true;
}

// False only if the handler does not want to go on with a section that will stay nameless.
bool readName(ReadContext& context, uint32_t index, const Section& table, const char* names) {
  const uint32_t offset = context.sectionHeaders[index].name;
  if (offset == 0) return true;
  if (offset >= table.getSize())
    return goOn(context.module, &ErrorHandler::sectionNameOutOfRange, index, offset,
                table.getSize());
  if (names != nullptr) context.module.getSection(index)->adoptName(names + offset);
  return true;
}

} // namespace

bool readSectionHeaders(ReadContext& context) {
  const uint64_t offset = context.fileHeader.shoff;
  if (offset == 0) return true;
  uint64_t count = 0;
  if (!readSectionCount(context, count)) return false;
  if (!readTable(context, offset, count, sectionHeaderSize(context.format.isWide),
                 context.sectionHeaders))
    return false;
  context.isBroken.resize(count);
  context.symbols.resize(count);
  return true;
}

bool readProgramHeaders(ReadContext& context) {
  const FileHeader& header = context.fileHeader;
  if (header.phoff == 0 || header.phnum == 0) return true;
  // A count of that size stands for one that is kept elsewhere, which no file of ours has.
  if (header.phnum == PN_XNUM)
    return mapLowLevelResult(context.module, LowLevelResult::OutsideImage);
  context.isSegmentThere.resize(header.phnum);
  return readTable(context, header.phoff, header.phnum, programHeaderSize(context.format.isWide),
                   context.programHeaders);
}

bool createSections(ReadContext& context) {
  ObjectModule& module = context.module;
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (!checkTableShape(context, i)) return false;
    const SectionHeader& header = context.sectionHeaders[i];
    module.createSectionOfType(nullptr, header.type, static_cast<uint32_t>(header.flags))
        ->adoptHeader(header);
  }
  QUARN_ASSERT(1, module.getSectionCount() == context.sectionHeaders.size());
  findOverlap(context);
  return true;
}

bool readContents(ReadContext& context) {
  const std::vector<uint32_t> loadSegments = findLoadSegments(context);
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    const SectionHeader& header = context.sectionHeaders[i];
    if (header.type == SHT_NOBITS) context.module.getSection(i)->adoptSize(header.size);
    if (hasFileBytes(header) && !readSectionBytes(context, i, loadSegments[i])) return false;
    if (header.type == SHT_STRTAB && !checkStringTable(context, i)) return false;
  }
  return true;
}

bool readSectionNames(ReadContext& context) {
  uint32_t table = 0;
  if (!findNameTable(context, table)) return false;
  if (table == 0) {
    for (uint32_t i = 0; i < context.sectionCount(); ++i) {
      if (context.sectionHeaders[i].name != 0)
        return goOn(context.module, &ErrorHandler::nameWithoutNameTable, i);
    }
    return true;
  }
  const uint8_t* names = nullptr;
  if (!context.overlap) {
    names = context.viewSection(table);
    if (names == nullptr) return false;
  }
  const Section& section = *context.module.getSection(table);
  for (uint32_t i = 0; i < context.sectionCount(); ++i) {
    if (!readName(context, i, section, reinterpret_cast<const char*>(names))) return false;
  }
  return true;
}

} // namespace elfext
