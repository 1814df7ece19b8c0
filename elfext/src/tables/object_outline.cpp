// SPDX-License-Identifier: Apache-2.0
//
// An object's tables, kept from one read to the next question: what the archive and its reports ask
// of each member. Names, categories and attributes are views and values taken from the tables when
// asked for; no model is made. The order of a read is that of a model's: headers, tables,
// attributes; so both roads reject the same objects with the same words.
//
// It is read once a member, ten thousand times a run, so memory is handed on: the image's from this
// object, the arrays' from the object before.
#include "elfext/interface/object_outline.h"

#include "elfext/interface/build_attributes.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/symbol_names.h"
#include "elfext/src/tables/build_attributes_reader.h"
#include "elfext/src/tables/loose_attribute_store.h"
#include "elfext/src/tables/object_tables.h"
#include "elfext/src/tables/sizes_source.h"

#include <algorithm>
#include <utility>

namespace elfext {

// Everything that refers to one image, made and dropped as one. The order of the fields is that of
// their dependence.
struct ObjectOutline::Content {
  Content(std::shared_ptr<support::SourceFile> file, uint64_t offset, uint64_t size,
          ErrorHandler* errorHandler, std::optional<std::string_view> objectName)
      : reporter(errorHandler, objectName), image(std::move(file), offset, size),
        tables(reporter, image) {}

  ReadReporter reporter;
  ImageBytes image;
  ObjectTables tables;
  std::optional<LooseAttributeStore> attributes = {};
  bool areAttributesWanted = false;
  bool isForeign = false;
};

namespace {

// False after a report, if the bytes can't be had.
bool lookForMagic(ObjectTables& tables, bool& hasMagic) {
  hasMagic = tables.image.contains(0, ElfMagic.size());
  if (!hasMagic) return true;
  const uint8_t* bytes = tables.view(0, ElfMagic.size());
  if (bytes == nullptr) return false;
  hasMagic = std::equal(ElfMagic.begin(), ElfMagic.end(), bytes);
  return true;
}

// Of a file with no overlapping sections.
template <class Function>
void forEachStaticSymbol(const ObjectTables& tables, Function function) {
  for (const SymbolTable& table : tables.symbolTables) {
    if (table.isDynamic) continue;
    tables.forEachSymbolRow(table, [&](uint32_t index, const SymbolRow& row) {
      function(table, index, row);
      return true;
    });
  }
}

size_t countRows(const ObjectTables& tables) {
  size_t count = 0;
  for (const SymbolTable& table : tables.symbolTables)
    count += table.rowCount;
  return count;
}

// Any section index but that of undefined symbols means a definition; what the reserved ones mean
// is each machine's own.
SymbolHome foreignHomeOf(const SymbolRow& row) {
  return {row.shndx == SHN_UNDEF ? Symbol::Category_Undefined : Symbol::Category_Hosted, 0};
}

// Bytes of a section as a model would have them.
uint64_t sizeOf(const ObjectTables& tables, uint32_t section) {
  if (tables.typeOf(section) == SHT_NULL) return 0;
  return tables.stringSize(section);
}

bool isCode(const SectionHeader& header) {
  constexpr uint64_t CodeFlags = SHF_ALLOC | SHF_EXECINSTR;
  return (header.flags & CodeFlags) == CodeFlags;
}

void addSections(const ObjectTables& tables, SizesSource& source) {
  source.sections.reserve(tables.getSectionCount());
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    const SectionHeader& header = tables.sectionHeaders[i];
    const uint64_t size = sizeOf(tables, i);
    source.sections.push_back(
        {tables.nameOf(i), header.type, static_cast<uint32_t>(header.flags), size, size});
  }
}

void addMappingSymbols(const ObjectTables& tables, SizesSource& source) {
  forEachStaticSymbol(tables, [&](const SymbolTable& table, uint32_t index, const SymbolRow& row) {
    const char* name = table.nameOf(row);
    if (!isMappingSymbolName(name)) return;
    const SymbolHome home = tables.homeOf(table, index, row);
    if (home.category != Symbol::Category_Hosted) return;
    const SectionHeader& header = tables.sectionHeaders[home.section];
    // Only executable sections are split by mapping symbols; the others count whole.
    if (!isCode(header)) return;
    source.mappingSymbols.push_back({home.section, tables.placeInHome(row, home), name});
  });
}

// False, after a report, if bytes can't be had.
bool addRawData(ObjectTables& tables, SizesSource& source) {
  for (const SegmentGap& gap : tables.gaps) {
    const uint64_t size = gap.end - gap.start;
    source.occupied.push_back({gap.start, size});
    const std::optional<bool> isZero = isAllZero(size, [&](uint64_t offset, uint64_t count) {
      return tables.view(gap.start + offset, count);
    });
    if (!isZero) return false;
    source.rawData.push_back({size, *isZero});
  }
  return true;
}

// What is in the segments, of which an object that is still to be linked has none.
bool addSegments(ObjectTables& tables, SizesSource& source) {
  if (tables.programHeaders.empty()) return true;
  for (const ProgramHeader& segment : tables.programHeaders) {
    source.segments.push_back(
        {segment.type, segment.flags, {segment.offset, segment.filesz}, segment.memsz});
  }
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    const uint64_t size = tables.typeOf(i) == SHT_NOBITS ? 0 : sizeOf(tables, i);
    if (size != 0) source.occupied.push_back({tables.sectionHeaders[i].offset, size});
  }
  const FileHeader& header = tables.fileHeader;
  source.occupied.push_back({0, header.ehsize});
  source.occupied.push_back({header.phoff, uint64_t{header.phentsize} * tables.getSegmentCount()});
  source.occupied.push_back({header.shoff, uint64_t{header.shentsize} * tables.getSectionCount()});
  return addRawData(tables, source);
}

} // namespace

ObjectOutline::ObjectOutline() : m_Memory(std::make_unique<ImageMemory>()) {}
ObjectOutline::~ObjectOutline() = default;

bool ObjectOutline::read(std::shared_ptr<support::SourceFile> file, uint64_t offset, uint64_t size,
                         ErrorHandler* errorHandler, std::optional<std::string_view> objectName,
                         bool wantsAttributes) {
  // The window serves one file; members of one archive come from the same.
  if (m_File != file) m_Memory->window.setFile(file.get());
  m_File = file;
  // Asked before the file goes to the content, and told after the reporter is there.
  const bool isInFile = file->getStatus().holds(offset, size);
  auto content = std::make_unique<Content>(std::move(file), offset, size, errorHandler, objectName);
  ObjectTables& tables = content->tables;
  if (m_Content != nullptr) tables.takeMemory(m_Content->tables);
  // The former image used the same memory; from here on its views would be wrong.
  m_Content.reset();
  if (!isInFile) return refuse(tables.reporter, &ErrorHandler::ioErrorReading, 0);
  if (!content->image.prepare(*m_Memory)) return tables.failRead();
  if (m_Machines == Machines::Any) {
    bool hasMagic = false;
    if (!lookForMagic(tables, hasMagic)) return false;
    if (!hasMagic) return true;
    if (!checkHeaderOfAnyMachine(tables, content->isForeign)) return false;
    if (content->isForeign) return readForeign(std::move(content));
  }
  if (!checkHeaders(tables, content->isForeign)) return false;
  // The handler let it pass: an object about which nothing is known, and no error.
  if (content->isForeign) return true;
  return readOwn(std::move(content), wantsAttributes);
}

bool ObjectOutline::readForeign(std::unique_ptr<Content> content) {
  if (!checkForeignTables(content->tables) || !checkLtoTables(content->tables)) return false;
  m_Content = std::move(content);
  return true;
}

bool ObjectOutline::readOwn(std::unique_ptr<Content> content, bool wantsAttributes) {
  ObjectTables& tables = content->tables;
  if (!checkTables(tables)) return false;
  if (m_Machines == Machines::Any && !checkLtoTables(tables)) return false;
  content->attributes.emplace(tables, wantsAttributes);
  content->areAttributesWanted = wantsAttributes;
  if (!readBuildAttributes(tables, *content->attributes)) return false;
  m_Content = std::move(content);
  return true;
}

bool ObjectOutline::isForeign() const {
  return m_Content != nullptr && m_Content->isForeign;
}

std::vector<ObjectOutline::OutlinedSection> ObjectOutline::getSections() const {
  std::vector<OutlinedSection> sections;
  if (m_Content == nullptr || m_Content->isForeign) return sections;
  const ObjectTables& tables = m_Content->tables;
  sections.reserve(tables.getSectionCount());
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    const SectionHeader& header = tables.sectionHeaders[i];
    sections.push_back({tables.nameOf(i), header.type, header.flags});
  }
  return sections;
}

std::span<const ObjectOutline::OutlinedSymbol> ObjectOutline::getSymbols() {
  m_Symbols.clear();
  if (m_Content == nullptr) return {};
  const ObjectTables& tables = m_Content->tables;
  const bool isForeign = m_Content->isForeign;
  m_Symbols.reserve(isForeign ? countRows(tables) : m_Content->attributes->getSymbolCount());
  forEachStaticSymbol(tables, [&](const SymbolTable& table, uint32_t index, const SymbolRow& row) {
    const SymbolHome home = isForeign ? foreignHomeOf(row) : tables.homeOf(table, index, row);
    const bool isHosted = home.category == Symbol::Category_Hosted && !isForeign;
    m_Symbols.push_back({table.nameOf(row), home.category, row.getBinding(),
                         isHosted ? tables.nameOf(home.section) : nullptr});
  });
  takeLtoSymbols();
  return m_Symbols;
}

// What they define counts like ELF symbols, in the place of the one that only says that there are
// no others.
void ObjectOutline::takeLtoSymbols() {
  const ObjectTables& tables = m_Content->tables;
  if (!tables.isSlim) return;
  std::erase_if(m_Symbols, [](const OutlinedSymbol& symbol) { return isSlimMarker(symbol.name); });
  m_Symbols.reserve(m_Symbols.size() + tables.ltoDefinitions.size());
  for (const char* name : tables.ltoDefinitions)
    m_Symbols.push_back({name, Symbol::Category_Hosted, STB_GLOBAL, nullptr});
}

uint64_t ObjectOutline::getEntry() const {
  return m_Content == nullptr ? 0 : m_Content->tables.fileHeader.entry;
}

const FullAttr* ObjectOutline::getOwnAttributes() const {
  if (m_Content == nullptr || !m_Content->areAttributesWanted) return nullptr;
  const BuildAttributes* own = m_Content->attributes->getOwnOfFile();
  return own == nullptr ? nullptr : &own->getFullAttr();
}

std::optional<SizesStatistics> ObjectOutline::computeSizes() {
  if (m_Content == nullptr || m_Content->isForeign) return SizesStatistics();
  ObjectTables& tables = m_Content->tables;
  SizesSource source;
  addSections(tables, source);
  addMappingSymbols(tables, source);
  if (!addSegments(tables, source)) return std::nullopt;
  return computeSizesStatistics(std::move(source));
}

} // namespace elfext
