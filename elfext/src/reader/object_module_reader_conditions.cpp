// SPDX-License-Identifier: Apache-2.0
//
// What the read has seen, as the writer and the validation want to know it.
//
// They are the bits of ReadCondition: which headers the first PT_LOAD segment overlaps, whether
// attributes come as symbols or as a section, and what in the file is unusual. They are computed
// once, at the end of a read, and never change with the model.
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/segment.h"
#include "elfext/src/bytes/extents.h"
#include "elfext/src/reader/object_module_reader.h"

#include <algorithm>
#include <cstring>
#include <functional>
#include <utility>
#include <vector>

namespace elfext {

namespace {

bool overlaps(const ProgramHeader& segment, uint64_t offset, uint64_t size) {
  // Two extents share a byte when each starts before the other ends; ends beyond all numbers are
  // cut.
  return size != 0 && segment.filesz != 0 && offset < endOf(segment.offset, segment.filesz) &&
         segment.offset < endOf(offset, size);
}

uint64_t sectionHeaderTableSize(const ReadContext& context) {
  return uint64_t{context.fileHeader.shentsize} * context.getSectionCount();
}

uint32_t headersInFirstLoad(const ReadContext& context) {
  const auto load =
      std::find_if(context.programHeaders.begin(), context.programHeaders.end(),
                   [](const ProgramHeader& header) { return header.type == PT_LOAD; });
  if (load == context.programHeaders.end()) return 0;
  const FileHeader& header = context.fileHeader;
  uint32_t conditions = 0;
  if (overlaps(*load, 0, header.ehsize)) conditions |= ReadCondition_LoadOverlapsElfHeader;
  if (overlaps(*load, header.shoff, sectionHeaderTableSize(context)))
    conditions |= ReadCondition_LoadOverlapsSectionHeaderTable;
  if (overlaps(*load, header.phoff, uint64_t{header.phentsize} * context.getSegmentCount()))
    conditions |= ReadCondition_LoadOverlapsProgramHeaderTable;
  return conditions;
}

bool isIncongruent(const ProgramHeader& header) {
  // p_align of 0 means no alignment, by which nobody should divide. The difference may wrap:
  // alignments that are powers of two divide 2^64.
  return header.align != 0 && (header.vaddr - header.offset) % header.align != 0;
}

// Absolute symbols are searched for it all over their names, of which there may be thousands that
// are ends of one long text. Only the longest of these is searched.
bool hasAbsoluteBuildAttributesSymbol(std::vector<const Symbol*> symbols) {
  // By address of the text: names that share their end then follow one another. The order decides
  // nothing but the cost.
  std::sort(symbols.begin(), symbols.end(), [](const Symbol* left, const Symbol* right) {
    return std::less<>()(left->getName(), right->getName());
  });
  const char* searchedEnd = nullptr;
  for (const Symbol* symbol : symbols) {
    const char* name = symbol->getName();
    if (name == nullptr) continue;
    // A name that starts before the end of the text searched last is an end of that text, in which
    // there was none.
    const bool isSearched = searchedEnd != nullptr && !std::less<>()(searchedEnd, name);
    if (isSearched ? symbol->startsAsBuildAttributes() : symbol->isBuildAttributesSymbol())
      return true;
    if (!isSearched) searchedEnd = name + std::strlen(name);
  }
  return false;
}

bool hasBuildAttributesSymbol(const ObjectModule& module) {
  std::vector<const Symbol*> absoluteSymbols;
  for (const Symbol* symbol : module.getSymbols()) {
    if (symbol->getCategory() == Symbol::Category_Absolute)
      absoluteSymbols.push_back(symbol);
    else if (symbol->startsAsBuildAttributes())
      return true;
  }
  return hasAbsoluteBuildAttributesSymbol(std::move(absoluteSymbols));
}

uint32_t conditionsOfSegments(const ReadContext& context) {
  const ObjectModule& module = context.module;
  uint32_t conditions = headersInFirstLoad(context);
  if (hasBuildAttributesSymbol(module)) conditions |= ReadCondition_HasBuildAttributesSymbol;
  if (!module.getBuildAttributesSections().empty())
    conditions |= ReadCondition_HasBuildAttributesSection;
  if (module.getReadBuffer() == nullptr) conditions |= ReadCondition_HasCopiedStrings;
  if (context.hasSymbolTableSizeTag) conditions |= ReadCondition_HasSymbolTableSizeTag;
  if (std::any_of(context.programHeaders.begin(), context.programHeaders.end(), isIncongruent))
    conditions |= ReadCondition_HasIncongruentSegment;
  return conditions;
}

uint32_t conditionsOfSections(const ObjectModule& module) {
  uint32_t conditions = 0;
  for (const Section* section : module.getSections()) {
    if (!section->isAuxiliary()) continue;
    if (section->getHostedSymbolCount() != 0 || section->getHostedDynamicSymbolCount() != 0)
      conditions |= ReadCondition_HasSymbolInAuxiliarySection;
    if (section->getRelocationCount() != 0)
      conditions |= ReadCondition_HasRelocationInAuxiliarySection;
  }
  return conditions;
}

} // namespace

uint32_t computeReadConditions(const ReadContext& context) {
  uint32_t conditions = ReadCondition_WasRead;
  if (sectionHeaderTableSize(context) == 0) conditions |= ReadCondition_HasEmptySectionHeaderTable;
  if (!context.programHeaders.empty()) conditions |= conditionsOfSegments(context);
  return conditions | conditionsOfSections(context.module);
}

} // namespace elfext
