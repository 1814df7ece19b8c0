// SPDX-License-Identifier: Apache-2.0
//
// What an edit does to an archive: to the list of members, and to what is derived from it. An edit
// only marks; the views that look-ups need are sorted when somebody asks, and the tables are made
// again by updateAuxiliaryMembers, which a write calls. Forgetting a mark would leave a symbol
// table whose offsets lead to other members, so which edit makes what stale stands in one table
// (StaleRows) and nowhere else.
//
// Thousands of members go or move in one call: these operations cost one pass over the list,
// however many members they are given. Members are then looked up by address, in an order that
// shows nowhere.
#include "arlib/interface/archive.h"

#include "arlib/interface/archive_format.h"
#include "arlib/interface/name_order.h"
#include "arlib/src/derived_tables.h"
#include "arlib/src/read_symbol_table.h"
#include "elfext/interface/sort.h"
#include "support/interface/path.h"

#include <algorithm>
#include <cstring>
#include <functional>
#include <string>
#include <type_traits>
#include <vector>

namespace arlib {

namespace {

constexpr size_t InitialRegionSize = 1024;

// What an edit makes stale. What is not marked stays as it is: a new name moves no member, so what
// the symbol table says stays true, unless the long-name table then moves them; a member without
// bytes has nothing to publish, and its offset is computed with the tables.
struct StaleRow {
  Edit edit;
  bool membersByName;  // findMembers
  bool sortedSymbols;  // findSymbols
  bool definedSymbols; // getDefinedSymbols
  bool offsets;        // updateAuxiliaryMembers, as the next two
  bool fileNameTable;
  bool symbolTable;
};

// clang-format off
constexpr bool Yes = true;
constexpr bool No = false;
constexpr StaleRow StaleRows[] = {
    //                   members  sorted   defined           long     symbol
    //                   by name  symbols  symbols  offsets  names    table
    {Edit::Publishing,   No,      No,      No,      No,      No,      Yes},
    {Edit::EmptyMember,  Yes,     No,      No,      No,      Yes,     Yes},
    {Edit::FileMember,   Yes,     No,      No,      Yes,     Yes,     Yes},
    {Edit::NewName,      Yes,     No,      No,      No,      Yes,     No },
    {Edit::NewBytes,     No,      No,      No,      Yes,     No,      Yes},
    {Edit::NewFile,      No,      No,      No,      Yes,     Yes,     Yes},
    {Edit::Move,         Yes,     No,      No,      No,      Yes,     Yes},
    {Edit::Removal,      Yes,     Yes,     Yes,     Yes,     Yes,     Yes},
    {Edit::ReadSymbols,  No,      Yes,     Yes,     No,      No,      No },
    {Edit::TableChange,  Yes,     No,      No,      No,      No,      No },
};
// clang-format on

consteval bool isInOrder(std::span<const StaleRow> rows) {
  for (size_t i = 0; i < rows.size(); ++i) {
    if (static_cast<size_t>(rows[i].edit) != i) return false;
  }
  return rows.size() == static_cast<size_t>(Edit::TableChange) + 1;
}
static_assert(isInOrder(StaleRows), "an edit's row is found by its number");

template <class Element, class List>
bool fill(std::span<Element* const> elements, List& list) {
  list.setSize(static_cast<uint32_t>(elements.size()));
  for (uint32_t i = 0; i < list.getSize(); ++i)
    list.set(i, elements[i]);
  return !elements.empty();
}

template <class T>
uint32_t indexOf(const elfext::FastArray<T*>& array, const T* element) {
  const auto found = std::find(array.begin(), array.end(), element);
  return found == array.end() ? Archive::NotFound : static_cast<uint32_t>(found - array.begin());
}

} // namespace

static_assert(std::is_trivially_destructible_v<Symbol>,
              "symbols die with their region, without a destructor run");

Archive::Archive(support::Host& host)
    : m_SourceFiles(host), m_ObjectRegion(alloclib::RegionGeneral::Create(
                               InitialRegionSize, "arlib::Archive::ObjectRegion")),
      m_ContainerRegion(
          alloclib::RegionGeneral::Create(InitialRegionSize, "arlib::Archive::ContainerRegion")),
      m_ArchiveMembers(m_ContainerRegion.get()), m_Symbols(m_ContainerRegion.get()),
      m_SortedSymbols(m_ContainerRegion.get()),
      m_DefinedSymbols{elfext::FastArray<Symbol*>(m_ContainerRegion.get()),
                       elfext::FastArray<Symbol*>(m_ContainerRegion.get())} {}

Archive::~Archive() = default;

const char* Archive::copyToRegion(std::string_view text) {
  return alloclib::copyString(*m_ObjectRegion, text);
}

void Archive::setLibraryAttributes(const elfext::FullAttr& attributes) {
  m_LibraryAttributes = attributes;
  noteEdit(Edit::Publishing);
}

void Archive::setSymbolTableMode(SymbolTableMode mode) {
  QUARN_ASSERT(1, !isReadOnly());
  m_SymbolTableMode = mode;
  noteEdit(Edit::Publishing);
}

void Archive::setFileName(const char* name) {
  if (name == m_FileName) return;
  m_ReadOnly = false;
  if (name != nullptr && m_FileName != nullptr && std::strcmp(name, m_FileName) == 0) return;
  m_FileName = name == nullptr ? nullptr : copyToRegion(name);
}

void Archive::letGo(std::span<ArchiveMember* const> archiveMembers) {
  for (ArchiveMember* archiveMember : archiveMembers) {
    archiveMember->releaseContentsLocation();
    archiveMember->freeContents();
  }
}

void Archive::clear() {
  letGo(getMembers());
  letGo(m_ForgottenTables);
  m_ForgottenTables.clear();
  m_MadeTables.clear();
  for (const std::span<uint8_t> bytes : m_ViewedBytes)
    m_ContainerRegion->discard(bytes.data(), bytes.size());
  m_ViewedBytes.clear();
  m_HeldFiles.clear();
  m_OwnFile.reset();
  m_ArchiveMembers.setSize(0);
  m_MembersByName = {};
  m_ReadSymbolTable.reset();
  m_Symbols.setSize(0);
  m_SortedSymbols.setSize(0);
  m_FileNameTable = nullptr;
  m_SymbolTable = nullptr;
  noteEdit(Edit::Removal);
  noteTablesUpToDate();
}

void Archive::noteEdit(Edit edit) {
  const StaleRow& stale = StaleRows[static_cast<size_t>(edit)];
  m_MembersByNameUpToDate &= !stale.membersByName;
  m_SortedSymbolsUpToDate &= !stale.sortedSymbols;
  m_DefinedSymbolsUpToDate &= !stale.definedSymbols;
  m_ArchiveMemberOffsetsUpToDate &= !stale.offsets;
  m_FileNameTableUpToDate &= !stale.fileNameTable;
  m_SymbolTableUpToDate &= !stale.symbolTable;
}

void Archive::noteTablesUpToDate() {
  m_ArchiveMemberOffsetsUpToDate = true;
  m_FileNameTableUpToDate = true;
  m_SymbolTableUpToDate = true;
}

std::string_view Archive::memberNameOf(std::string_view name) const {
  return m_KeepFolders ? name : support::lastPathComponent(name);
}

ArchiveMember* Archive::appendMember(std::string_view regionName) {
  auto* member = alloclib::create<ArchiveMember>(*m_ObjectRegion, this);
  member->m_Name = regionName;
  m_ArchiveMembers.append(member);
  return member;
}

support::SourceFile* Archive::hold(const std::shared_ptr<support::SourceFile>& file) {
  // Neighbours mostly come from one file.
  if (m_HeldFiles.empty() || m_HeldFiles.back() != file) m_HeldFiles.push_back(file);
  return file.get();
}

bool Archive::checkOwnFile() {
  if (m_OwnFile == nullptr) return true;
  const int error = m_OwnFile->checkUnchanged();
  return error == 0 || stop(&ErrorHandler::reportReadError, m_OwnFile->getName(), error);
}

int Archive::reportCloseErrors() {
  std::string name;
  const int error = m_SourceFiles.takeCloseError(name);
  if (error != 0) stop(&ErrorHandler::reportCloseError, name.c_str(), error);
  return error;
}

int Archive::closeInputs() {
  for (const auto& file : m_HeldFiles) {
    if (file != m_OwnFile) file->close();
  }
  return reportCloseErrors();
}

bool Archive::closeFiles() {
  for (const auto& file : m_HeldFiles)
    file->close();
  if (m_OwnFile != nullptr) m_OwnFile->close();
  return reportCloseErrors() == 0;
}

ArchiveMember* Archive::appendFileMember(std::string_view regionName,
                                         const std::shared_ptr<support::SourceFile>& file,
                                         uint32_t offset, uint32_t size) {
  ArchiveMember* member = appendMember(regionName);
  member->takeFile(file, offset, size);
  noteEdit(Edit::FileMember);
  return member;
}

bool Archive::cutToFile(const char* fileName, std::optional<std::string_view> reportedName,
                        uint32_t& offset, uint32_t& size, int64_t fileSize) const {
  const auto available = static_cast<uint64_t>(fileSize);
  if (offset <= available && size <= available - offset) return true;
  if (!goOn(&ErrorHandler::reportRegionOutsideFile, fileName, reportedName, offset, size,
            available)) {
    return false;
  }
  offset = static_cast<uint32_t>(std::min<uint64_t>(offset, available));
  size = static_cast<uint32_t>(std::min<uint64_t>(size, available - offset));
  return true;
}

ArchiveMember* Archive::addMember(std::string_view name, int64_t date, uint32_t uid, uint32_t gid,
                                  uint32_t mode) {
  QUARN_ASSERT(1, !m_ReadOnly);
  ArchiveMember* member = appendMember({copyToRegion(name), name.size()});
  member->m_Date = date;
  member->m_Uid = uid;
  member->m_Gid = gid;
  member->m_Mode = mode;
  member->replaceContents(0);
  member->m_Type = ArchiveMemberType::decide(member);
  noteEdit(Edit::EmptyMember);
  return member;
}

ArchiveMember* Archive::addMemberFromFile(const char* fileName) {
  QUARN_ASSERT(1, fileName != NULL);
  return addMemberFromFile(fileName, probeFile(m_SourceFiles, fileName));
}

ArchiveMember* Archive::addMemberFromFile(const char* fileName, const FileProbe& probe) {
  QUARN_ASSERT(1, fileName != NULL);
  QUARN_ASSERT(1, !m_ReadOnly);
  if (const int error = probe.getRefusal(); error != 0) {
    fail(&ErrorHandler::reportReadError, fileName, error);
    return nullptr;
  }
  const support::PathStyle style = getHost().getPathStyle();
  const std::string_view name = memberNameOf(support::withoutDrive(fileName, style));
  ArchiveMember* member = appendFileMember({copyToRegion(name), name.size()}, probe.file, 0,
                                           static_cast<uint32_t>(probe.status.size));
  member->m_Type = ArchiveMemberType::decide(probe.getFirstBytes());
  return member;
}

bool Archive::openRegion(const char* fileName, std::optional<std::string_view> reportedName,
                         uint32_t& offset, uint32_t& size, FileProbe& probe) {
  probe = openProbe(m_SourceFiles, fileName);
  int error = probe.getRefusal();
  if (error == 0) {
    if (!cutToFile(fileName, reportedName, offset, size, probe.status.size)) return false;
    probe.look(offset, size);
    error = probe.hostError;
  }
  return error == 0 || fail(&ErrorHandler::reportReadError, fileName, error);
}

ArchiveMember* Archive::addMemberFromFileRegion(std::string_view memberName, const char* fileName,
                                                uint32_t offset, uint32_t size,
                                                std::optional<std::string_view> reportedName) {
  QUARN_ASSERT(1, fileName != NULL);
  QUARN_ASSERT(1, !m_ReadOnly);
  FileProbe probe;
  if (!openRegion(fileName, reportedName, offset, size, probe)) return nullptr;
  const std::string_view name = memberNameOf(memberName);
  ArchiveMember* member =
      appendFileMember({copyToRegion(name), name.size()}, probe.file, offset, size);
  member->m_Type = ArchiveMemberType::decide(probe.getFirstBytes());
  return member;
}

CopiedNames::CopiedNames(const Archive& source) {
  const ArchiveMember* table = source.getFileNameTable();
  if (table == nullptr || !table->hasContents()) return;
  const std::span<const uint8_t> bytes = table->getContents();
  m_Table = {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

std::string_view Archive::copyName(std::string_view name, CopiedNames& names) {
  const std::less_equal<> isInFront;
  const char* table = names.m_Table.data();
  const char* tableEnd = table + names.m_Table.size();
  if (!isInFront(table, name.data()) || !isInFront(name.data() + name.size(), tableEnd))
    return {copyToRegion(name), name.size()};
  if (names.m_Copy == nullptr) names.m_Copy = copyToRegion(names.m_Table);
  return {names.m_Copy + (name.data() - table), name.size()};
}

ArchiveMember* Archive::addMemberFromMember(const ArchiveMember& source) {
  CopiedNames none;
  return addMemberFromMember(source, none);
}

ArchiveMember* Archive::addMemberFromMember(const ArchiveMember& source, CopiedNames& names) {
  QUARN_ASSERT(1, !m_ReadOnly);
  const std::string_view name =
      source.m_NameIsLeaf ? source.getName() : memberNameOf(source.getName());
  ArchiveMember* member = appendMember(copyName(name, names));
  member->setContentsFromMember(source);
  noteEdit(Edit::FileMember);
  return member;
}

std::vector<ArchiveMember*>
Archive::sortedByAddress(std::span<ArchiveMember* const> archiveMembers) const {
  std::vector<ArchiveMember*> sorted;
  for (ArchiveMember* archiveMember : archiveMembers) {
    QUARN_ASSERT(1, archiveMember->m_Archive == this);
    QUARN_ASSERT(2, m_ArchiveMembers.contains(archiveMember));
    sorted.push_back(archiveMember);
  }
  std::sort(sorted.begin(), sorted.end(), std::less<>());
  return sorted;
}

void Archive::takeOut(std::span<ArchiveMember* const> sortedMembers) {
  const auto end =
      std::remove_if(m_ArchiveMembers.begin(), m_ArchiveMembers.end(), [&](ArchiveMember* member) {
        return std::binary_search(sortedMembers.begin(), sortedMembers.end(), member,
                                  std::less<>());
      });
  m_ArchiveMembers.setSize(static_cast<uint32_t>(end - m_ArchiveMembers.begin()));
}

Symbol Archive::symbolOf(std::string_view name, ArchiveMember* member) const {
  const size_t marker = name.find(AttributeMarker);
  const std::string_view attributes = marker == std::string_view::npos
                                          ? std::string_view()
                                          : name.substr(marker + AttributeMarker.size());
  return {name.substr(0, marker), attributes, this, member};
}

// Asking for what was read changes nothing, though it is written down now.
void Archive::makeSymbols() const {
  const std::unique_ptr<ReadSymbolTable> table = std::move(m_ReadSymbolTable);
  const auto add = [this](std::string_view name, ArchiveMember* member) {
    m_Symbols.append(alloclib::create<Symbol>(*m_ObjectRegion, symbolOf(name, member)));
  };
  support::HostError error = 0;
  [[maybe_unused]] const bool isWhole = table->forEachSymbol(add, error);
  QUARN_ASSERT(1, isWhole);
}

bool Archive::visitSymbols(const std::function<void(const Symbol&)>& visit) const {
  if (m_ReadSymbolTable == nullptr) {
    for (const Symbol* symbol : m_Symbols)
      visit(*symbol);
    return true;
  }
  const auto hand = [&](std::string_view name, ArchiveMember* member) {
    visit(symbolOf(name, member));
  };
  support::HostError error = 0;
  bool isWhole = m_ReadSymbolTable->forEachSymbol(hand, error);
  if (isWhole && !m_AreSymbolsWanted) {
    error = m_OwnFile->checkUnchanged();
    isWhole = error == 0;
  }
  return isWhole || fail(&ErrorHandler::reportReadError, m_OwnFile->getName(), error);
}

void Archive::forgetSymbolsOf(std::span<ArchiveMember* const> sortedMembers) {
  if (m_ReadSymbolTable != nullptr) return m_ReadSymbolTable->forgetSymbolsOf(sortedMembers);
  const auto end = std::remove_if(m_Symbols.begin(), m_Symbols.end(), [&](const Symbol* symbol) {
    return std::binary_search(sortedMembers.begin(), sortedMembers.end(),
                              symbol->getDefiningMember(), std::less<>());
  });
  m_Symbols.setSize(static_cast<uint32_t>(end - m_Symbols.begin()));
}

void Archive::removeMember(ArchiveMember* archiveMember) {
  QUARN_ASSERT(1, archiveMember != NULL);
  removeMembers({&archiveMember, 1});
}

void Archive::removeMembers(std::span<ArchiveMember* const> archiveMembers) {
  QUARN_ASSERT(1, !m_ReadOnly);
  const std::vector<ArchiveMember*> gone = sortedByAddress(archiveMembers);
  takeOut(gone);
  forgetSymbolsOf(gone);
  noteEdit(Edit::Removal);
  letGo(archiveMembers);
}

void Archive::moveMember(ArchiveMember* archiveMember, uint32_t newIndex) {
  QUARN_ASSERT(1, archiveMember != NULL);
  QUARN_ASSERT(1, archiveMember->m_Archive == this);
  QUARN_ASSERT(2, m_ArchiveMembers.contains(archiveMember));
  QUARN_ASSERT(1, newIndex <= m_ArchiveMembers.getSize());
  const uint32_t oldIndex = getMemberIndex(archiveMember);
  if (oldIndex == newIndex) return;
  m_ArchiveMembers.remove(oldIndex);
  m_ArchiveMembers.insert(std::min(newIndex, m_ArchiveMembers.getSize()), archiveMember);
  noteEdit(Edit::Move);
}

void Archive::moveMembers(std::span<ArchiveMember* const> archiveMembers, uint32_t newIndex) {
  const uint32_t size = m_ArchiveMembers.getSize();
  QUARN_ASSERT(1, archiveMembers.size() <= size && newIndex <= size - archiveMembers.size());
  const std::vector<ArchiveMember*> before(m_ArchiveMembers.begin(), m_ArchiveMembers.end());
  takeOut(sortedByAddress(archiveMembers));
  m_ArchiveMembers.setSize(size);
  const auto place = m_ArchiveMembers.begin() + newIndex;
  std::copy_backward(place, m_ArchiveMembers.end() - archiveMembers.size(), m_ArchiveMembers.end());
  std::copy(archiveMembers.begin(), archiveMembers.end(), place);
  if (!std::equal(before.begin(), before.end(), m_ArchiveMembers.begin())) noteEdit(Edit::Move);
}

uint32_t Archive::getMemberIndex(const ArchiveMember* archiveMember) const {
  QUARN_ASSERT(1, archiveMember != NULL);
  QUARN_ASSERT(1, archiveMember->m_Archive == this);
  return indexOf(m_ArchiveMembers, archiveMember);
}

uint32_t Archive::getSymbolIndex(const Symbol* symbol) const {
  QUARN_ASSERT(1, symbol != NULL);
  const std::span<Symbol* const> symbols = getSymbols();
  const auto found = std::find(symbols.begin(), symbols.end(), symbol);
  return found == symbols.end() ? NotFound : static_cast<uint32_t>(found - symbols.begin());
}

bool Archive::findMembers(std::string_view name, ArchiveMemberList& list) {
  if (!m_MembersByNameUpToDate) {
    const std::span<ArchiveMember* const> members = getMembers();
    m_MembersByName = NameIndex({members.begin(), members.end()}, compareIgnoringCase);
    m_MembersByNameUpToDate = true;
  }
  return fill(m_MembersByName.getMembers(m_MembersByName.find(name)), list);
}

void Archive::sortSymbols() {
  if (m_SortedSymbolsUpToDate) return;
  static_cast<void>(getSymbols());
  m_SortedSymbols.assign(m_Symbols);
  elfext::mergeSort(m_SortedSymbols.getSpan(), [](const Symbol* left, const Symbol* right) {
    return left->getName().compare(right->getName());
  });
  m_SortedSymbolsUpToDate = true;
}

bool Archive::findSymbols(std::string_view name, SymbolList& list) {
  sortSymbols();
  const auto first =
      std::partition_point(m_SortedSymbols.begin(), m_SortedSymbols.end(),
                           [name](const Symbol* symbol) { return symbol->getName() < name; });
  const auto last =
      std::partition_point(first, m_SortedSymbols.end(),
                           [name](const Symbol* symbol) { return symbol->getName() == name; });
  return fill(std::span<Symbol* const>(first, last), list);
}

void Archive::groupSymbols() {
  if (m_DefinedSymbolsUpToDate) return;
  const auto byMember = [](const Symbol* left, const Symbol* right) {
    return std::less<>()(left->getDefiningMember(), right->getDefiningMember());
  };
  static_cast<void>(getSymbols());
  m_DefinedSymbols.byMember.assign(m_Symbols);
  std::stable_sort(m_DefinedSymbols.byMember.begin(), m_DefinedSymbols.byMember.end(), byMember);
  m_DefinedSymbols.byMemberAndName.assign(m_DefinedSymbols.byMember);
  std::stable_sort(m_DefinedSymbols.byMemberAndName.begin(), m_DefinedSymbols.byMemberAndName.end(),
                   [byMember](const Symbol* left, const Symbol* right) {
                     if (left->getDefiningMember() != right->getDefiningMember()) {
                       return byMember(left, right);
                     }
                     return left->getName() < right->getName();
                   });
  m_DefinedSymbolsUpToDate = true;
}

std::span<Symbol* const> Archive::symbolsOf(const elfext::FastArray<Symbol*>& symbols,
                                            const ArchiveMember* archiveMember) {
  const auto first =
      std::partition_point(symbols.begin(), symbols.end(), [&](const Symbol* symbol) {
        return std::less<>()(symbol->getDefiningMember(), archiveMember);
      });
  const auto last = std::partition_point(first, symbols.end(), [&](const Symbol* symbol) {
    return symbol->getDefiningMember() == archiveMember;
  });
  return {first, last};
}

std::span<Symbol* const> Archive::getDefinedSymbols(const ArchiveMember* archiveMember) {
  groupSymbols();
  return symbolsOf(m_DefinedSymbols.byMember, archiveMember);
}

std::span<Symbol* const> Archive::getSortedDefinedSymbols(const ArchiveMember* archiveMember) {
  groupSymbols();
  return symbolsOf(m_DefinedSymbols.byMemberAndName, archiveMember);
}

// Names and symbols may be views of the bytes of a table that is replaced: they are brought in, to
// stay. Bytes that nobody wanted at the read are not read to be replaced, nor are those of a table
// that was made itself.
bool Archive::rebuildLongNames(DerivedTables& tables) {
  if (!makeLongNameTable(*this, tables)) return false;
  // A table without names goes at once: the reports of the next step count members without it.
  if (tables.longNames.fate == DerivedTable::Fate::Dropped) forgetTable(m_FileNameTable);
  const bool isReplaced =
      m_FileNameTable != nullptr && tables.longNames.fate == DerivedTable::Fate::Made;
  return !isReplaced || m_FileNameTable->m_Made != nullptr || m_FileNameTable->loadContents();
}

bool Archive::rebuildSymbols(DerivedTables& tables) {
  if (!makeSymbolTable(*this, tables)) return false;
  const bool isReplaced =
      m_SymbolTable != nullptr && tables.symbols.fate == DerivedTable::Fate::Made;
  return !isReplaced || !m_AreSymbolsWanted || m_SymbolTable->m_Made != nullptr ||
         m_SymbolTable->loadContents();
}

// A long-name table that comes, goes or changes its size shifts all members behind it, and with
// them what the symbol table's offsets lead to. As long as that table counts as up to date, each
// member's offset is the one that it knows.
bool Archive::isLaidOutAs(const MemberLayout& layout) const {
  for (uint32_t i = 0; i < m_ArchiveMembers.getSize(); ++i) {
    const ArchiveMember* member = m_ArchiveMembers[i];
    if (!member->isAuxiliary() && member->m_Offset != layout.members[i]) return false;
  }
  return true;
}

bool Archive::updateAuxiliaryMembers() {
  for (ArchiveMember* member : m_ArchiveMembers) {
    if (member->m_Type == nullptr && !member->determineType()) return false;
  }
  DerivedTables tables;
  if (!m_FileNameTableUpToDate && !rebuildLongNames(tables)) return false;
  tables.layout = layOut(getMembers(), tables.symbols.getSizeAfter(m_SymbolTable),
                         tables.longNames.getSizeAfter(m_FileNameTable));
  const bool hasTrueSymbols =
      m_SymbolTableUpToDate && (m_SymbolTable == nullptr || isLaidOutAs(tables.layout));
  if (!hasTrueSymbols && !rebuildSymbols(tables)) return false;
  takeTables(tables);
  return true;
}

void Archive::takeTables(DerivedTables& tables) {
  auto nameOffset = tables.nameOffsets.begin();
  for (ArchiveMember* member : m_ArchiveMembers) {
    if (nameOffset == tables.nameOffsets.end()) break;
    if (isLongName(member->m_Name)) member->m_FileNameTableOffset = *nameOffset++;
  }
  for (uint32_t i = 0; i < m_ArchiveMembers.getSize(); ++i)
    m_ArchiveMembers[i]->m_Offset = tables.layout.members[i];
  takeTable(m_FileNameTable, FileNameTableArchiveMemberType::getInstance(), tables.longNames);
  takeTable(m_SymbolTable, SymbolTableArchiveMemberType::getInstance(), tables.symbols);
  if (m_SymbolTable != nullptr) m_SymbolTable->m_Offset = tables.layout.symbolTable;
  if (m_FileNameTable != nullptr) m_FileNameTable->m_Offset = tables.layout.longNameTable;
  putTablesInPlace();
  noteTablesUpToDate();
}

void Archive::takeTable(ArchiveMember*& table, const ArchiveMemberType* type,
                        DerivedTable& derived) {
  if (derived.fate == DerivedTable::Fate::Kept) return;
  if (derived.fate == DerivedTable::Fate::Dropped) return forgetTable(table);
  if (table == nullptr) {
    table = appendMember("");
    table->m_Type = type;
    noteEdit(Edit::TableChange);
  }
  const TableText* former = table->m_Made;
  table->takeMade(derived.text.get());
  std::erase_if(m_MadeTables, [former](const auto& text) { return text.get() == former; });
  m_MadeTables.push_back(std::move(derived.text));
}

// Once they are written, their bytes are in the file.
void Archive::dropMadeTables() {
  for (ArchiveMember* table : {m_SymbolTable, m_FileNameTable}) {
    if (table != nullptr) table->m_Made = nullptr;
  }
  // Of a table that has left the list nobody else has the bytes.
  std::erase_if(m_MadeTables, [this](const auto& text) {
    return std::none_of(m_ForgottenTables.begin(), m_ForgottenTables.end(),
                        [&](const ArchiveMember* table) { return table->m_Made == text.get(); });
  });
}

// The object is only forgotten until the archive is cleared: names and symbols may be views of its
// bytes.
void Archive::forgetTable(ArchiveMember*& table) {
  if (table == nullptr) return;
  m_ArchiveMembers.remove(getMemberIndex(table));
  m_ForgottenTables.push_back(table);
  table = nullptr;
  noteEdit(Edit::TableChange);
}

// They may stand anywhere: where a file had them, where members were moved in front of them, or at
// the end as they were made.
void Archive::putTablesInPlace() {
  uint32_t place = 0;
  for (ArchiveMember* table : {m_SymbolTable, m_FileNameTable}) {
    if (table != nullptr) moveMember(table, place++);
  }
}

uint64_t Archive::computeFileSize() const {
  uint64_t end = ArchiveMagic.size();
  for (const ArchiveMember* member : m_ArchiveMembers)
    end = nextHeaderOffset(end, member->m_Size);
  return end;
}

} // namespace arlib
