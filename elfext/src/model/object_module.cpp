// SPDX-License-Identifier: Apache-2.0
//
// The module as a whole: its birth and end, its names, and what its headers say.
//
// A module owns two regions, in which everything that it contains is made and dies; only what holds
// something outside them is destroyed one by one. Each change marks the auxiliary sections as out
// of date. Clearing is pruning with a criterion that takes everything, so that there is one way in
// which objects go.
#include "elfext/interface/object_module.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/file_version_definition.h"
#include "elfext/interface/group.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "elfext/src/model/pruner.h"
#include "elfext/src/reports/go_on.h"

#include <algorithm>
#include <cstring>
#include <memory>
#include <string>

namespace elfext {
namespace {

bool isSameText(const char* left, const char* right) {
  if (left == nullptr || right == nullptr) return left == right;
  return std::strcmp(left, right) == 0;
}

} // namespace

ObjectModule::ObjectModule()
    : ObjectWithBuildAttributes(this), m_Sections(&getContainerRegion()),
      m_Groups(&getContainerRegion()), m_Segments(&getContainerRegion()),
      m_Symbols(&getContainerRegion()), m_DynamicSymbols(&getContainerRegion()),
      m_NeededLibraries(&getContainerRegion()), m_LibrarySearchPaths(&getContainerRegion()),
      m_Preemptions(&getContainerRegion()), m_RawDataBlocks(&getContainerRegion()),
      m_DebugOverlayRecords(&getContainerRegion()), m_AbsoluteSymbols(&getContainerRegion()),
      m_CommonSymbols(&getContainerRegion()), m_UndefinedSymbols(&getContainerRegion()),
      m_AbsoluteDynamicSymbols(&getContainerRegion()),
      m_CommonDynamicSymbols(&getContainerRegion()),
      m_UndefinedDynamicSymbols(&getContainerRegion()),
      m_StringTableSections(&getContainerRegion()), m_SymtabSections(&getContainerRegion()),
      m_DynsymSections(&getContainerRegion()), m_GroupSections(&getContainerRegion()),
      m_HashSections(&getContainerRegion()), m_ShndxSections(&getContainerRegion()),
      m_PreemptionMapSections(&getContainerRegion()), m_VerdefSections(&getContainerRegion()),
      m_VerneedSections(&getContainerRegion()), m_VersymSections(&getContainerRegion()),
      m_DynamicSections(&getContainerRegion()), m_DebugOverlaySections(&getContainerRegion()),
      m_BuildAttributesSections(&getContainerRegion()),
      m_SymbolsSortedByAddress(&getContainerRegion()),
      m_DynamicSymbolsSortedByAddress(&getContainerRegion()),
      m_SymbolsSortedByName(&getContainerRegion()),
      m_DynamicSymbolsSortedByName(&getContainerRegion()),
      m_MapSignaturesToComdatGroups(&getContainerRegion()), m_UnnotedGroups(&getContainerRegion()) {
}

// Most modules have nothing that must end before their regions do; deferred contents hold a file
// open.
ObjectModule::~ObjectModule() {
  forgetPlacement();
  if (hasDeferredContents())
    for (Section* section : m_Sections)
      std::destroy_at(section);
  for (RawDataBlock* block : m_RawDataBlocks)
    std::destroy_at(block);
}

// All trees go at once, and not region by region.
void ObjectModule::forgetPlacement() {
  for (Section* section : m_Sections)
    section->getPlacement().forget();
  for (Segment* segment : m_Segments)
    segment->getPlacement().forget();
  for (RawDataBlock* block : m_RawDataBlocks)
    block->getPlacement().forget();
  m_ElfHeader.getPlacement().forget();
  m_SectionHeaderTable.getPlacement().forget();
  m_ProgramHeaderTable.getPlacement().forget();
}

// ---- Names

const char* ObjectModule::keepText(const char* text) const {
  // During a read: names are views of the image, which the module owns.
  return m_AreNamesInBuffer ? text : copyText(text);
}

const char* ObjectModule::copyText(const char* text) const {
  return text == nullptr ? nullptr : alloclib::copyString(getObjectRegion(), text);
}

void ObjectModule::setFileName(const char* name) {
  if (isSameText(name, m_FileName)) return;
  // Their bytes are still in the file of the old name.
  QUARN_ASSERT(1, !hasDeferredContents());
  m_FileName = copyText(name);
}

void ObjectModule::setObjectName(const char* name) {
  m_ObjectName = copyText(name);
}

void ObjectModule::setObjectName(const char* archiveName, const char* memberName) {
  QUARN_ASSERT(1, archiveName != NULL);
  QUARN_ASSERT(1, memberName != NULL);
  const std::string name = std::string(archiveName) + "(" + memberName + ")";
  setObjectName(name.c_str());
}

void ObjectModule::setSoname(const char* soname) {
  m_Soname = keepText(soname);
  markChanged();
}

// ---- Header fields

void ObjectModule::setElfClass(uint32_t elfClass) {
  const bool isNarrow = elfClass == ELFCLASS32;
  m_ElfClass = elfClass;
  setElfHeaderSize(isNarrow ? NewElfHeaderSize32 : ElfHeaderSize64);
  setSectionHeaderEntrySize(isNarrow ? SectionHeaderSize32 : SectionHeaderSize64);
  m_SectionHeaderTable.setAlignment(isNarrow ? 4 : 8);
  m_ProgramHeaderEntrySize = isNarrow ? ProgramHeaderSize32 : ProgramHeaderSize64;
  // Objects that are still to be linked have no program headers to place.
  if (m_FileType == ET_REL) return;
  m_ProgramHeaderTable.setEntrySize(m_ProgramHeaderEntrySize);
  m_ProgramHeaderTable.setAlignment(isNarrow ? 4 : 8);
}

void ObjectModule::setElfHeaderSize(uint32_t size) {
  change(m_ElfHeaderSize, size);
  m_ElfHeader.setSize(size);
}

void ObjectModule::setSectionHeaderEntrySize(uint32_t size) {
  change(m_SectionHeaderEntrySize, size);
  m_SectionHeaderTable.setEntrySize(size);
}

void ObjectModule::setProgramHeaderEntrySize(uint32_t size) {
  change(m_ProgramHeaderEntrySize, size);
  m_ProgramHeaderTable.setEntrySize(size);
}

void ObjectModule::setDataEncoding(uint32_t encoding) {
  change(m_DataEncoding, encoding);
  m_LittleEndian = encoding == ELFDATA2LSB ? 1 : 0;
}

void ObjectModule::setLittleEndian(uint32_t flag) {
  QUARN_ASSERT(1, !hasDeferredContents());
  change(m_LittleEndian, flag);
  m_DataEncoding = flag == 1 ? ELFDATA2LSB : ELFDATA2MSB;
}

bool ObjectModule::hasLaidOutAddresses() const {
  return m_FileType == ET_EXEC || m_FileType == ET_DYN || m_FileType == ET_CORE;
}

// ---- Dynamic data

void ObjectModule::setDynamicValue(DynamicValue which, uint64_t value) {
  m_DynamicValues[which] = {value, true};
  markChanged();
}

void ObjectModule::addDynamicFlags(uint32_t flags) {
  m_DynamicFlagsExists = true;
  change(m_DynamicFlags, m_DynamicFlags | flags);
}

void ObjectModule::setFileVersionDefinition(const FileVersionDefinition* version) {
  change(m_FileVersionDefinition, version);
}

FileVersionDefinition* ObjectModule::createFileVersionDefinition(const char* name, uint32_t index,
                                                                 uint32_t flags) {
  QUARN_ASSERT(1, name != NULL);
  return alloclib::create<FileVersionDefinition>(
      getObjectRegion(), FileVersionDefinition{keepText(name), index, flags});
}

void ObjectModule::addDebugOverlayRecord(const DebugOverlayRecord& record) {
  m_DebugOverlayRecords.append(record);
  markChanged();
}

// ---- State

bool ObjectModule::isEmpty() const {
  return m_Sections.isEmpty() && m_Groups.isEmpty() && m_Symbols.isEmpty() &&
         m_DynamicSymbols.isEmpty() && m_NeededLibraries.isEmpty() &&
         m_LibrarySearchPaths.isEmpty() && m_Preemptions.isEmpty() &&
         m_FileVersionDefinition == nullptr;
}

bool ObjectModule::hasDeferredContents() const {
  return std::any_of(m_Sections.begin(), m_Sections.end(),
                     [](const Section* section) { return section->isContentsDeferred(); });
}

bool ObjectModule::loadDeferredContents() {
  return std::all_of(m_Sections.begin(), m_Sections.end(),
                     [](Section* section) { return section->loadDeferredContents(); });
}

void ObjectModule::materializeAllRelocations() {
  for (Section* section : m_Sections)
    section->materializeRelocations();
}

// ---- Build attributes

BuildAttributesCache& ObjectModule::getBuildAttributesCache() {
  // Most modules never ask.
  if (m_BuildAttributesCache == nullptr)
    m_BuildAttributesCache = std::make_unique<BuildAttributesCache>();
  return *m_BuildAttributesCache;
}

void ObjectModule::getInheritedBuildAttributes(BuildAttributes& result) const {
  result = BuildAttributes();
}

void ObjectModule::dropBuildAttributes() {
  setOwnBuildAttributes(nullptr);
  for (Section* section : m_Sections)
    section->setOwnBuildAttributes(nullptr);
  for (Symbol* symbol : m_Symbols)
    symbol->setOwnBuildAttributes(nullptr);
  m_HighestTagsVersion = 0;
}

// ---- Deletion

void ObjectModule::prune(const PruneCriterion& criterion) {
  QUARN_ASSERT(1, !m_IndexesFrozen);
  Pruner(*this, criterion).run();
}

void ObjectModule::clear() {
  struct Everything final : PruneCriterion {
    [[nodiscard]] bool goes(const Section&) const override { return true; }
    [[nodiscard]] bool goes(const Group&) const override { return true; }
    [[nodiscard]] bool goes(const Segment&) const override { return true; }
    [[nodiscard]] bool goes(const Symbol&) const override { return true; }
    [[nodiscard]] bool goes(const NeededLibrary&) const override { return true; }
    [[nodiscard]] bool goes(const LibrarySearchPath&) const override { return true; }
    [[nodiscard]] bool goes(const Preemption&) const override { return true; }
  };
  prune(Everything());
  m_HasLostContents = false;
  // The headers stay, but not where they were.
  forgetPlacement();
  clearDynamicData();
  clearHeaderTables();
  clearBuildAttributes();
  m_ReadConditions = 0;
  m_ReadBuffer = nullptr;
  m_AreNamesInBuffer = false;
  // Last: the names and contents of all that went were views of it.
  m_ImageSource.reset();
}

void ObjectModule::reportLostContents(support::HostError error) {
  // Noted whatever the handler answers: who needs all contents asks afterwards.
  m_HasLostContents = true;
  static_cast<void>(goOn(*this, &ErrorHandler::ioErrorReading, error));
}

void ObjectModule::clearDynamicData() {
  m_Soname = nullptr;
  m_DynamicValues = {};
  m_DynamicFlags = 0;
  m_DynamicFlagsExists = false;
  m_FileVersionDefinition = nullptr;
  m_DebugOverlayRecords.setSize(0);
}

void ObjectModule::clearBuildAttributes() {
  forgetBuildAttributes();
  m_HighestTagsVersion = 0;
  m_IsBuildAttributesSectionUpToDate = false;
  m_BuildAttributesCache.reset();
}

void ObjectModule::clearHeaderTables() {
  m_SectionHeaderOffset = 0;
  m_ProgramHeaderOffset = 0;
  m_StoredSectionCount = 0;
  m_StoredProgramHeaderCount = 0;
  m_SectionHeaderTable.setEntryCount(0);
  m_ProgramHeaderTable.setEntryCount(0);
  m_SectionHeaderTable.clearFileOffset();
  m_ProgramHeaderTable.clearFileOffset();
}

template <class Object>
void ObjectModule::deleteOne(const Object* object) {
  struct TheOne final : PruneCriterion {
    explicit TheOne(const Object* doomed) : m_Object(doomed) {}
    using PruneCriterion::goes;
    [[nodiscard]] bool goes(const Object& other) const override { return &other == m_Object; }

  private:
    const Object* m_Object;
  };
  QUARN_ASSERT(1, object != NULL);
  QUARN_ASSERT(1, object->getObjectModule() == this);
  prune(TheOne(object));
}

void ObjectModule::deleteSection(Section* section) {
  deleteOne(section);
}

void ObjectModule::deleteGroup(Group* group) {
  deleteOne(group);
}

void ObjectModule::deleteSegment(Segment* segment) {
  deleteOne(segment);
}

void ObjectModule::deleteSymbol(Symbol* symbol) {
  deleteOne(symbol);
}

void ObjectModule::deleteNeededLibrary(NeededLibrary* neededLibrary) {
  deleteOne(neededLibrary);
}

void ObjectModule::deleteLibrarySearchPath(LibrarySearchPath* librarySearchPath) {
  deleteOne(librarySearchPath);
}

void ObjectModule::deletePreemption(Preemption* preemption) {
  deleteOne(preemption);
}

} // namespace elfext
